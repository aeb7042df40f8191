// What the column drags of the header and of the chooser share: the drop source that
// ends a drag whose window went away, and the reading of a dropped column.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxole.h>

#include <vector>

class KVXColumnInfo;

// The default drop source (the button that began the drag drops, Escape or the other
// button cancels), which also cancels as soon as the window the drag started from
// is destroyed: DoDragDrop asks it at every mouse move and timer tick of its loop,
// so a window destroyed by the host during the drag ends the drag at once.
class ColumnDropSource : public COleDropSource
{
public:
    explicit ColumnDropSource(HWND hWndSource);

    virtual SCODE QueryContinueDrag(BOOL bEscapePressed, DWORD dwKeyState);

private:
    HWND m_hWndSource;
};

// Whether pWnd still owns the window hWnd after a nested loop: if not, the window
// was destroyed meanwhile and the object may be gone too.
bool IsStillAttached(HWND hWnd, const CWnd* pWnd);

// Reads the column a data object carries into column (a fresh record) and, when
// pbSortedColumn is given, the flag after it. False, with column untouched, when
// the object offers no "HeaderCtrl Item" or its bytes are not one whole record a
// list can show (ColumnPayload).
bool ReadDroppedColumn(COleDataObject* pDataObject, KVXColumnInfo& column, bool* pbSortedColumn);

// The widths of a header's items in index order, up to the first that cannot be read.
std::vector<int> HeaderItemWidths(CHeaderCtrl* pHeader);
