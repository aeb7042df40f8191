// KVXSimpleListControlExItemCommand: selects the rows of a list by their state. Run
// through KVXListCtrlEx::IterateItems by SelectItemsByState, it selects (or unselects)
// every row that has all bits of a state mask and unselects the others.
#pragma once

#include <afxwin.h>

#include "KVXListCtrlExItemCommand.h"

class KVXListCtrlEx;

class AFX_EXT_CLASS KVXSimpleListControlExItemCommand : public KVXListCtrlExItemCommand
{
// Constructors
public:
    explicit KVXSimpleListControlExItemCommand(KVXListCtrlEx& list);
    KVXSimpleListControlExItemCommand(const KVXSimpleListControlExItemCommand& other);
    ~KVXSimpleListControlExItemCommand();

// Operations
    // With bSelect true exactly the rows that have all bits of nStateMask end selected;
    // with false every row ends unselected. The list is redrawn at once.
    void SelectItemsByState(unsigned int nStateMask, bool bSelect);

// Overridables
    // Nothing until SelectItemsByState: then selects the row as above. Never stops the walk.
    virtual bool DoForItem(int nItem, bool& bContinue);

// Implementation
protected:
    KVXListCtrlEx* m_pList;
    int m_nIdle;
    unsigned int m_nStateMask;
    bool m_bSelect;

private:
    KVXSimpleListControlExItemCommand& operator=(const KVXSimpleListControlExItemCommand&);
};
