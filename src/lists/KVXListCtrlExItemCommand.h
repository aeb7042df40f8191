// KVXListCtrlExItemCommand: what KVXListCtrlEx::IterateItems runs once per row.
#pragma once

class KVXListCtrlExItemCommand
{
public:
    // nItem: the row. Returning false, or setting bContinue to false, ends the iteration
    // after this row; the iteration returns the last result.
    virtual bool DoForItem(int nItem, bool& bContinue) = 0;

protected:
    // Commands are not deleted through this interface.
    ~KVXListCtrlExItemCommand() {}
};
