// KVXDragHeaderCtrl: the header of the column-customising list. It knows which column
// record belongs to which item (by the record's index), lets the user drag a column
// by its title to another place of a header or into the column chooser over OLE drag
// and drop ("HeaderCtrl Item", see KVXHeaderCtrlDataSource), asks its message window
// to delete the column when the drag moved it (KVXN_DELETECOLUMN, KVXColumnNotify.h),
// takes dropped columns with its KVXHeaderCtrlDropTarget and paints the sort arrow
// set with WM_USER+1 (wParam the item, -1 for none; lParam non-zero when ascending).
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxtempl.h>

#include "KVXColumnInfo.h"
#include "KVXHeaderCtrlDropTarget.h"

class AFX_EXT_CLASS KVXDragHeaderCtrl : public CHeaderCtrl
{
// Constructors
public:
    KVXDragHeaderCtrl();
    virtual ~KVXDragHeaderCtrl();

// Operations
    // The header keeps pointers to records it does not own; the owner keeps the list in
    // step with its own. A null pointer is ignored.
    void AddColumn(KVXColumnInfo* pColumnInfo);
    void RemoveColumn(KVXColumnInfo* pColumnInfo);
    // Registers the drop target for this header window (OLE must be initialised,
    // AfxOleInit); false when that failed.
    bool InitDragDrop();
    // The window that gets the delete and insert messages instead of the parent.
    void SetMessageWnd(CWnd* pWnd);
    // The item under a point in client coordinates, -1 if none.
    int HitTest(CPoint point);

// Message map and handlers
protected:
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnLButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg LRESULT OnSetsortedcolumn(WPARAM wParam, LPARAM lParam);
    afx_msg void OnPaint();
    DECLARE_MESSAGE_MAP()

// Implementation
protected:
    int m_nSortedColumn;                            // item with the arrow, -1: none
    bool m_bAscending;
    CWnd* m_pMessageWnd;                            // not owned
    CList<KVXColumnInfo*, KVXColumnInfo*> m_ColumnInfos;   // not owned
    KVXHeaderCtrlDropTarget m_DropTarget;
    KVXColumnInfo* m_pDragColumn;                   // pressed, a drag may start

private:
    void DrawSortArrow();
    // Runs the drag of m_pDragColumn; false when this object is gone afterwards.
    bool DragColumn();
};
