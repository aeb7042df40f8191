// KVXComboBoxListCtrlEx: an extended report-view list whose cells in one column (the
// combo column) carry drop-down list combo boxes, one per row that the host equips with
// its choices (SetSubItems). The list keeps the boxes over their cells when columns are
// resized, when it scrolls and when the keyboard moves the view, and hides those of rows
// out of view. A picked entry reaches the list's parent as LVN_ENDLABELEDITW from the
// combo box (KVXSubItemComboBox); the title tip asks the parent for its text with
// LVN_GETDISPINFOW.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxcoll.h>

#include "KVXListCtrlEx.h"

class KVXSubItemComboBox;

// Posted by the list to itself: lay the combo boxes over their cells again.
#define WM_KVX_RESIZECOLUMN (WM_USER + 2)
// Posted by the list to itself: show the combo boxes of the rows in view, hide the others.
// wParam non-zero: lParam is the first row in view (else the list's top row).
#define WM_KVX_ENSUREVISIBILITY (WM_USER + 3)

class AFX_EXT_CLASS KVXComboBoxListCtrlEx : public KVXListCtrlEx
{
// Constructors
public:
    KVXComboBoxListCtrlEx();
    virtual ~KVXComboBoxListCtrlEx();

// Attributes
    // The column that carries the combo boxes (-1: none). Boxes already made stay where they are.
    void SetComboBoxColID(int nColumn);
    int GetComboBoxColID() const;

// Operations
    // Equips a row with a combo box of the strings (nCount of them, the array's size),
    // entry nSelect selected. A row's previous box goes first; NULL strings only remove
    // it. Nothing is made without a combo column, for a count other than the array's
    // size, or for a row outside 0 to 65535.
    void SetSubItems(int nRow, int nCount, CStringArray* pStrings, int nSelect);

// Overridables
protected:
    // Header notifications: tracking or double-clicking a divider up to the combo column
    // re-lays the combo boxes.
    virtual BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult);

// Implementation
protected:
    afx_msg LRESULT OnResizeColumn(WPARAM wParam, LPARAM lParam);
    afx_msg LRESULT OnEnsureVisibility(WPARAM wParam, LPARAM lParam);
    afx_msg void OnHScroll(UINT nSBCode, UINT nPos, CScrollBar* pScrollBar);
    afx_msg void OnVScroll(UINT nSBCode, UINT nPos, CScrollBar* pScrollBar);
    afx_msg BOOL OnMouseWheel(UINT nFlags, short zDelta, CPoint pt);
    afx_msg void OnKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnParentNotify(UINT message, LPARAM lParam);
    afx_msg void OnDestroy();
    DECLARE_MESSAGE_MAP()

    int m_nComboColumn;
    CMapWordToPtr m_mapComboBoxes;  // row -> KVXSubItemComboBox*; the windows delete their objects

private:
    KVXSubItemComboBox* CreateSubItemComboBox(int nRow, int nColumn);
    CRect GetComboBoxRect(int nRow, int nColumn, long lUnused);
    // Lays the box over its row's cell of the combo column.
    void PlaceComboBox(int nRow, KVXSubItemComboBox* pCombo);
    void HScrollComboBoxesIntoView();
    KVXSubItemComboBox* FindComboBox(int nRow) const;
    void PostRelayout();
};
