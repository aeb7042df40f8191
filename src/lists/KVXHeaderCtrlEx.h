// KVXHeaderCtrlEx: the header of the extended list control. It paints a small etched
// triangle beside the title of the sorted column (set with WM_USER+1) and, when
// enabled, lets the user drag a column title to a new place, marking the insertion
// point while the pointer moves and reporting the move to a callback. The header
// moves nothing itself.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>

// wParam: the sorted column (-1 for none); lParam: non-zero when ascending.
#define WM_KVX_SETSORTEDCOLUMN (WM_USER + 1)

class AFX_EXT_CLASS KVXHeaderCtrlEx : public CHeaderCtrl
{
// Constructors
public:
    KVXHeaderCtrlEx();
    KVXHeaderCtrlEx(CWnd* pCallbackTarget, void (CWnd::*pfnCallback)(int, int));
    virtual ~KVXHeaderCtrlEx();

// Operations
    // After a drag that really moves a column, the header calls
    // (pCallbackTarget->*pfnCallback)(dragged item, insertion position).
    void SetCallback(CWnd* pCallbackTarget, void (CWnd::*pfnCallback)(int, int));
    // Returns the previous setting.
    bool EnableDrag(bool bEnable);

// Message map and handlers
protected:
    afx_msg void OnPaint();
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnLButtonUp(UINT nFlags, CPoint point);
    afx_msg LRESULT OnSetsortedcolumn(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

// Implementation
protected:
    int m_nSortedColumn;            // -1: no indicator
    bool m_bAscending;
    bool m_bDragEnabled;
    BOOL m_bButtonDown;             // pressed on an item: a drag may start
    BOOL m_bDragging;               // a drag is in progress, the mouse captured
    int* m_pItemWidths;             // the items' widths when the drag started
    int m_nDragItem;
    int m_nDropPosition;            // the item before which the column would go, or the count
    RECT m_rcMarker;                // covered by the insertion marker last drawn
    void (CWnd::*m_pfnDragCallback)(int, int);
    CWnd* m_pCallbackTarget;
    int m_nItemWidthCount;          // entries in m_pItemWidths

private:
    void DrawSortIndicator();
    void StartDrag();
    void MoveDropMarker(int x);
    // Frees the widths, lets the mouse go and erases the marker.
    void EndDrag();
};
