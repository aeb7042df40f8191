// KVXListCtrlEx: the extended report-view list control. It sorts its rows by one
// column with the column's comparison rule (when the user clicks a header item or the
// host asks) and shows the sort in its header; it owner-draws its rows with one of
// three highlight styles, draws rows the host marks invalid (state bit 0x0010) in their
// own colour and lets the host shorten cell texts before they are drawn; it shows the
// whole text of a cut-off cell in a title tip while the mouse rests on it, toggles
// state-image check boxes on a click, and moves a column when the header reports a
// finished column drag.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxdisp.h>

#include "KVXHeaderCtrlEx.h"
#include "KVXListCtrlExItemCommand.h"
#include "KVXTitleTipCtrl.h"

#include <vector>

class AFX_EXT_CLASS KVXListCtrlEx : public CListCtrl
{
// Constructors
public:
    KVXListCtrlEx();
    virtual ~KVXListCtrlEx();

// Sorting
    // Header clicks sort the list; returns the previous setting.
    bool EnableSort(bool bEnable);
    // One column type code (0 to 8, see ListSortKeys.h) per column position. A code
    // above 8 leaves the list without types and returns false. A column without an
    // entry sorts as case-sensitive text.
    bool SetColumnTypes(unsigned char* pTypes, unsigned int nCount);
    // The reference time of type 6 columns, parsed like a cell; false keeps the old one.
    bool SetBaseTime(CString strTime);
    // Sorts by the column position (-1: no sort) in the direction. With the current
    // column and direction nothing is sorted and the header is not told again.
    void SortList(int nColumn, bool bAscending);
    // Sorts again by the current column and direction, e.g. after rows were added.
    void ResortList();
    // false when the list is not sorted (the arguments are left alone).
    bool GetSortInfo(int& nColumn, bool& bAscending);

// Drawing
    // 0 highlights the label only, 1 all columns, 2 the whole row to the client's right
    // edge. Types above 2 are refused; types above 0 make the list owner-drawn (the
    // style is not taken away again). Returns the type in force before the call.
    int SetHighlightType(int nType);
    // Text colour of rows whose state has bit 0x0010 (LVIS_GLOW); shown from the next paint.
    void SetInvalidColor(unsigned long crInvalid);
    // Called on the list's parent with (cell text, 40, 1) for every non-empty cell text
    // before it is drawn; the result is drawn instead. NULL switches it off.
    void SetAbbreviateName(CString (CWnd::*pfnAbbreviate)(CString, int, int));

// Hit testing and columns
    // The row under the point (-1: none, or not in report view), its cell, cut at the
    // client's right edge, and its column. A point on a column border belongs to the left
    // column; the row below the last fully visible one counts.
    int CellRectFromPoint(CPoint& point, RECT* pCellRect, int* pColumn) const;
    // The row under the point and its column (0 outside report view, where the row is the
    // list view's own hit test).
    int HitTestEx(CPoint& point, int* pColumn) const;
    // The header's item count.
    int GetColumnCount() const;
    // Gives the column showing sub-item 0 the client width the other columns leave.
    void ResizeColumnsToFit();
    // true creates the title tip window (once) and enables it when that worked; false
    // disables it.
    void EnableTitleTip(bool bEnable);
    // Lets the user drag columns in the header; returns the previous setting.
    bool EnableHeaderDrag(bool bEnable);
    // Runs the command for the rows from the first until it returns false or clears its
    // continue flag. Returns the last result: true for an empty list, false without command.
    bool IterateItems(KVXListCtrlExItemCommand* pCommand);

// Overridables
protected:
    virtual void PreSubclassWindow();
public:
    // Draws one row as the owner-drawn list view asks; see SetHighlightType.
    virtual void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct);
    // Called at the start and at the end of every SortList, also when nothing is sorted.
    virtual void PreSort();
    virtual void PostSort();

// Implementation
protected:
    // The LVM_SORTITEMS callback: during a sort every row's item data is its rank in
    // the order the column's rule gives. lParamSort is the column type code times 256
    // plus the direction (1 ascending).
    static int CALLBACK Compare(LPARAM lParam1, LPARAM lParam2, LPARAM lParamSort);
    // The header's drag callback: moves column nSource before position nTarget (or
    // to the end when nTarget is the column count), cell texts included.
    void DragColumn(int nSource, int nTarget);

    // Invalidates the focused row and, unless the selection always shows, the selected
    // rows in view, from their labels to their ends, and repaints them at once.
    void RepaintSelectedItems();

    // The title tip of a mouse move, in two steps so that a list taking its cell texts
    // elsewhere shows it the same way: FindTitleTipCell finds the cell whose text the
    // pointer is over (title tips enabled, no button or key down, at or right of where the
    // text starts); ShowTitleTip lets the tip show the text over that cell when it is cut off.
    // Such a list handles WM_MOUSEMOVE with these two and CListCtrl::OnMouseMove, not with
    // this class's OnMouseMove, which shows the cell's own text.
    struct TitleTipCell
    {
        int nItem;
        int nColumn;
        CRect rect;         // raised by one pixel, as the tip expects
        int nTextOffset;
    };
    bool FindTitleTipCell(UINT nFlags, CPoint point, TitleTipCell& cell) const;
    void ShowTitleTip(const TitleTipCell& cell, LPCTSTR pszText);

    afx_msg void OnParentNotify(UINT message, LPARAM lParam);
    afx_msg void OnPaint();
    afx_msg void OnSetFocus(CWnd* pOldWnd);
    afx_msg void OnKillFocus(CWnd* pNewWnd);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnNcDestroy();
    afx_msg void OnHeaderClicked(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg LRESULT OnSetRedraw(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

    int m_nHighlightType;
    bool m_bSortEnabled;
    unsigned char* m_pColumnTypes;
    unsigned int m_nColumnTypes;
    COleDateTime m_dtBaseTime;
    int m_nSortColumn;
    BOOL m_bSortAscending;
    KVXHeaderCtrlEx m_ctlHeader;
    CString (CWnd::*m_pfnAbbreviate)(CString, int, int);
    COLORREF m_crInvalid;
    KVXTitleTipCtrl m_ctlTitleTip;
    bool m_bTitleTipsEnabled;
    BOOL m_bRedraw;             // as the last WM_SETREDRAW left it

private:
    struct DrawnRow;

    void SubclassHeader();
    bool IsReportView() const;
    // Shared by CellRectFromPoint (cut at the client's edge) and HitTestEx (not cut).
    int FindCell(const CPoint& point, bool bClientEdge, RECT* pCellRect, int* pColumn) const;
    void RepaintOnFocusChange(CWnd* pOtherWnd);
    // The steps of DrawItem.
    void BeginRow(CDC& dc, DrawnRow& row) const;
    void FillHighlight(CDC& dc, const DrawnRow& row) const;
    void DrawCell(CDC& dc, const DrawnRow& row, int nColumn, const LVCOLUMN& column, const CRect& rectCell,
                  const CRect& rectImage) const;
    void DrawCellImages(CDC& dc, const DrawnRow& row, const LVITEM& cell, const CRect& rectCell,
                        const CRect& rectImage) const;
    void DrawCellText(CDC& dc, const DrawnRow& row, int nColumn, const LVCOLUMN& column, const LVITEM& cell,
                      const CRect& rectCell) const;
    unsigned char GetColumnType(int nColumn) const;
    // Appends the row's key text for a column of the type, and a terminating zero.
    void AppendKeyText(int nItem, int nColumn, unsigned char nType, std::vector<TCHAR>& keys) const;
    void SortRows(int nColumn, bool bAscending);
};
