// KVXListCtrlEx: sorting, the embedded header, drawing, hit testing, title tips, check
// boxes, item iteration and column moves.
#include "KVXListCtrlEx.h"

#include "ListGeometry.h"
#include "ListSortKeys.h"

#include <algorithm>
#include <new>
#include <vector>

BEGIN_MESSAGE_MAP(KVXListCtrlEx, CListCtrl)
    ON_WM_PARENTNOTIFY()
    ON_WM_PAINT()
    ON_WM_SETFOCUS()
    ON_WM_KILLFOCUS()
    ON_WM_MOUSEMOVE()
    ON_WM_LBUTTONDOWN()
    ON_WM_NCDESTROY()
    ON_NOTIFY(HDN_ITEMCLICKA, 0, &KVXListCtrlEx::OnHeaderClicked)
    ON_NOTIFY(HDN_ITEMCLICKW, 0, &KVXListCtrlEx::OnHeaderClicked)
    ON_MESSAGE(WM_SETREDRAW, &KVXListCtrlEx::OnSetRedraw)
END_MESSAGE_MAP()

namespace {

// What one sort keeps of every row. The rows' key texts (the cell text, or the cell's
// image index as "%d") lie side by side in one buffer.
struct SortRecord
{
    DWORD_PTR dwItemData;   // the row's own item data, restored after the sort
    size_t nKeyStart;       // where the row's key text starts in the buffer
};

// Key texts up to this length are fetched without a heap buffer.
const int kKeyBufferLength = 260;
// LVM_GETCOLUMN's text buffer when a column is moved.
const int kColumnTitleLength = 159;

// What the abbreviate callback is called with besides the text.
const int kAbbreviateFirst = 40;
const int kAbbreviateSecond = 1;

void FillWithSysColor(CDC& dc, const RECT& rc, int nColor)
{
    // The system's own brushes: nothing to create per row.
    ::FillRect(dc.m_hDC, &rc, ::GetSysColorBrush(nColor));
}

} // namespace

// What the steps of DrawItem share about the row being drawn.
struct KVXListCtrlEx::DrawnRow
{
    int nItem;
    UINT nState;            // the row's state (sub-item 0)
    bool bFocus;            // the list has the focus
    bool bHighlighted;
    CRect rectBounds;
    CRect rectLabel;
    CRect rectIcon;
    CRect rectHighlight;
    int nOffset;            // text margin: two blanks
    CWnd* pParent;
    CImageList* pStateImages;
    CImageList* pSmallImages;
    bool bSubItemImages;    // LVS_EX_SUBITEMIMAGES
    int nImageShift;        // how far the text of a cell with an image moves right
};

KVXListCtrlEx::KVXListCtrlEx()
    : m_nHighlightType(0), m_bSortEnabled(false), m_pColumnTypes(NULL), m_nColumnTypes(0),
      m_nSortColumn(-1), m_bSortAscending(TRUE),
      m_ctlHeader(this, static_cast<void (CWnd::*)(int, int)>(&KVXListCtrlEx::DragColumn)),
      m_pfnAbbreviate(NULL), m_crInvalid(RGB(255, 0, 0)), m_bTitleTipsEnabled(false), m_bRedraw(TRUE)
{
    m_dtBaseTime.SetStatus(COleDateTime::invalid);
}

KVXListCtrlEx::~KVXListCtrlEx()
{
    delete[] m_pColumnTypes;
}

/////////////////////////////////////////////////////////////////////////////
// The embedded header

void KVXListCtrlEx::PreSubclassWindow()
{
    CListCtrl::PreSubclassWindow();
    SubclassHeader();
}

void KVXListCtrlEx::OnParentNotify(UINT message, LPARAM lParam)
{
    CListCtrl::OnParentNotify(message, lParam);
    // A list made with Create meets PreSubclassWindow before it has a header: the list
    // view makes it during its own WM_CREATE, or with the first column when hidden.
    if (LOWORD(message) == WM_CREATE)
        SubclassHeader();
}

void KVXListCtrlEx::SubclassHeader()
{
    if (m_ctlHeader.m_hWnd != NULL)
        return;
    HWND hHeader = ::GetDlgItem(m_hWnd, 0);
    if (hHeader != NULL)
        m_ctlHeader.SubclassWindow(hHeader);
}

LRESULT KVXListCtrlEx::OnSetRedraw(WPARAM wParam, LPARAM)
{
    m_bRedraw = wParam != 0;
    return Default();
}

void KVXListCtrlEx::OnNcDestroy()
{
    // The tip is a top-level window of its own: it goes with the list it shows cells of.
    if (m_ctlTitleTip.m_hWnd != NULL)
        m_ctlTitleTip.DestroyWindow();
    m_bTitleTipsEnabled = false;
    CListCtrl::OnNcDestroy();
}

bool KVXListCtrlEx::IsReportView() const
{
    return (GetStyle() & LVS_TYPEMASK) == LVS_REPORT;
}

int KVXListCtrlEx::GetColumnCount() const
{
    HWND hHeader = ::GetDlgItem(m_hWnd, 0);
    return hHeader != NULL ? static_cast<int>(::SendMessage(hHeader, HDM_GETITEMCOUNT, 0, 0)) : 0;
}

bool KVXListCtrlEx::EnableHeaderDrag(bool bEnable)
{
    return m_ctlHeader.EnableDrag(bEnable);
}

/////////////////////////////////////////////////////////////////////////////
// Drawing options

int KVXListCtrlEx::SetHighlightType(int nType)
{
    const int nPrevious = m_nHighlightType;
    if (nType > ListGeometry::kWholeRow)
        return nPrevious;
    m_nHighlightType = nType;
    if (nType > ListGeometry::kLabelOnly)
        ModifyStyle(0, LVS_OWNERDRAWFIXED);
    Invalidate(TRUE);
    return nPrevious;
}

void KVXListCtrlEx::SetInvalidColor(unsigned long crInvalid)
{
    m_crInvalid = crInvalid;
}

void KVXListCtrlEx::SetAbbreviateName(CString (CWnd::*pfnAbbreviate)(CString, int, int))
{
    m_pfnAbbreviate = pfnAbbreviate;
}

/////////////////////////////////////////////////////////////////////////////
// Drawing

void KVXListCtrlEx::DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct)
{
    if (lpDrawItemStruct == NULL || lpDrawItemStruct->hDC == NULL)
        return;
    CDC dc;
    dc.Attach(lpDrawItemStruct->hDC);
    const int nSavedDC = dc.SaveDC();

    DrawnRow row;
    row.nItem = static_cast<int>(lpDrawItemStruct->itemID);
    BeginRow(dc, row);
    FillHighlight(dc, row);

    // The cells, column by column for as long as the list has columns; the small image
    // of each sits as far into its cell as the row's icon sits in the first.
    LVCOLUMN column = {};
    column.mask = LVCF_FMT | LVCF_WIDTH;
    CRect rectCell(row.rectBounds.left, row.rectBounds.top, row.rectBounds.left, row.rectBounds.bottom);
    CRect rectImage = row.rectIcon;
    for (int nColumn = 0; GetColumn(nColumn, &column); ++nColumn)
    {
        rectCell.left = rectCell.right;
        rectCell.right = rectCell.left + column.cx;
        DrawCell(dc, row, nColumn, column, rectCell, rectImage);
        rectImage.OffsetRect(column.cx, 0);
        if (m_nHighlightType == ListGeometry::kLabelOnly)
        {
            // Only the first column shows the highlight and the invalid colour.
            dc.SetTextColor(::GetSysColor(COLOR_WINDOWTEXT));
            dc.SetBkColor(::GetSysColor(COLOR_WINDOW));
        }
    }

    dc.RestoreDC(nSavedDC);
    // The row's own state: sub-items have none, so the last cell's would never show it.
    if ((row.nState & LVIS_FOCUSED) && row.bFocus)
        dc.DrawFocusRect(&row.rectHighlight);
    dc.Detach();
}

void KVXListCtrlEx::BeginRow(CDC& dc, DrawnRow& row) const
{
    LVITEM item = {};
    item.mask = LVIF_IMAGE | LVIF_STATE;
    item.iItem = row.nItem;
    item.stateMask = 0xFFFF;
    GetItem(&item);
    row.nState = item.state;
    if (item.state & LVIS_GLOW)
        dc.SetTextColor(m_crInvalid);   // the host's marker of an invalid row
    row.bFocus = ::GetFocus() == m_hWnd;
    row.bHighlighted = ListGeometry::IsRowHighlighted(item.state, row.bFocus, (GetStyle() & LVS_SHOWSELALWAYS) != 0);

    GetItemRect(row.nItem, &row.rectBounds, LVIR_BOUNDS);
    GetItemRect(row.nItem, &row.rectLabel, LVIR_LABEL);
    GetItemRect(row.nItem, &row.rectIcon, LVIR_ICON);
    row.nOffset = 2 * dc.GetTextExtent(_T(" "), 1).cx;
    const CString strLabel = GetItemText(row.nItem, 0);
    CRect rectClient;
    GetClientRect(&rectClient);
    row.rectHighlight = ListGeometry::HighlightRect(m_nHighlightType, row.rectBounds, row.rectLabel,
                                                    dc.GetTextExtent(strLabel).cx, row.nOffset, rectClient.right);
    row.pParent = GetParent();
    row.pStateImages = GetImageList(LVSIL_STATE);
    row.pSmallImages = GetImageList(LVSIL_SMALL);
    // The row's icon, and with it every column's image, lies past the state icon.
    int cxState = 0, cyState = 0;
    if (row.pStateImages == NULL || !row.pStateImages->GetIconSize(&cxState, &cyState))
        cxState = 0;
    row.nImageShift = row.rectIcon.Width() + cxState;
    row.bSubItemImages = (GetExtendedStyle() & LVS_EX_SUBITEMIMAGES) != 0;
}

void KVXListCtrlEx::FillHighlight(CDC& dc, const DrawnRow& row) const
{
    if (row.bHighlighted)
    {
        dc.SetTextColor(::GetSysColor(COLOR_HIGHLIGHTTEXT));
        dc.SetBkColor(::GetSysColor(COLOR_HIGHLIGHT));
        FillWithSysColor(dc, row.rectHighlight, COLOR_HIGHLIGHT);
    }
    else
    {
        FillWithSysColor(dc, row.rectHighlight, COLOR_WINDOW);
    }
}

void KVXListCtrlEx::DrawCell(CDC& dc, const DrawnRow& row, int nColumn, const LVCOLUMN& column,
                             const CRect& rectCell, const CRect& rectImage) const
{
    const int nSavedDC = dc.SaveDC();
    dc.IntersectClipRect(&rectCell);
    if (m_nHighlightType == ListGeometry::kLabelOnly && nColumn != 0)
        FillWithSysColor(dc, rectCell, COLOR_WINDOW);

    LVITEM cell = {};
    cell.mask = LVIF_IMAGE | LVIF_STATE;
    cell.iItem = row.nItem;
    cell.iSubItem = nColumn;
    cell.stateMask = 0xFFFF;
    cell.iImage = -1;
    GetItem(&cell);
    // Without sub-item images the list view reports image 0 for every sub-item.
    if (nColumn != 0 && !row.bSubItemImages)
        cell.iImage = -1;
    DrawCellImages(dc, row, cell, rectCell, rectImage);
    DrawCellText(dc, row, nColumn, column, cell, rectCell);
    dc.RestoreDC(nSavedDC);
}

void KVXListCtrlEx::DrawCellImages(CDC& dc, const DrawnRow& row, const LVITEM& cell, const CRect& rectCell,
                                   const CRect& rectImage) const
{
    const int nStateImage = static_cast<int>((cell.state & LVIS_STATEIMAGEMASK) >> 12);
    if (nStateImage != 0 && row.pStateImages != NULL)
        row.pStateImages->Draw(&dc, nStateImage - 1, rectCell.TopLeft(), ILD_TRANSPARENT);
    if (row.pSmallImages != NULL && cell.iImage >= 0)
        row.pSmallImages->Draw(&dc, cell.iImage, rectImage.TopLeft(),
                               ListGeometry::SmallImageStyle(cell.state, row.bHighlighted));
}

void KVXListCtrlEx::DrawCellText(CDC& dc, const DrawnRow& row, int nColumn, const LVCOLUMN& column,
                                 const LVITEM& cell, const CRect& rectCell) const
{
    CString strText = GetItemText(row.nItem, nColumn);
    if (strText.IsEmpty())
        return;
    if (row.pParent != NULL && m_pfnAbbreviate != NULL)
        strText = (row.pParent->*m_pfnAbbreviate)(strText, kAbbreviateFirst, kAbbreviateSecond);
    CRect rectText = ListGeometry::CellTextRect(rectCell, cell.iImage != -1, row.nImageShift, row.nOffset);
    dc.DrawText(strText, &rectText, DT_SINGLELINE | DT_NOPREFIX | DT_VCENTER | DT_END_ELLIPSIS |
                                    ListGeometry::TextAlignment(column.fmt));
}

void KVXListCtrlEx::OnPaint()
{
    // The whole-row highlight reaches past the last column: whatever part of the rows a
    // paint covers, it covers the rest of those rows to the client's edge too.
    CRect rectRow, rectClient;
    GetClientRect(&rectClient);
    if (m_nHighlightType == ListGeometry::kWholeRow && IsReportView() && GetItemRect(0, &rectRow, LVIR_BOUNDS)
        && rectRow.right < rectClient.right)
    {
        CRect rectClip;
        {
            CPaintDC dc(this);
            dc.GetClipBox(&rectClip);
        }
        CRect rectRepaint;
        if (ListGeometry::WholeRowRepaintRect(rectRow, rectClient, rectClip, &rectRepaint))
            InvalidateRect(&rectRepaint, FALSE);
    }
    Default();
}

/////////////////////////////////////////////////////////////////////////////
// Focus

void KVXListCtrlEx::OnSetFocus(CWnd* pOldWnd)
{
    CListCtrl::OnSetFocus(pOldWnd);
    RepaintOnFocusChange(pOldWnd);
}

void KVXListCtrlEx::OnKillFocus(CWnd* pNewWnd)
{
    CListCtrl::OnKillFocus(pNewWnd);
    RepaintOnFocusChange(pNewWnd);
}

void KVXListCtrlEx::RepaintOnFocusChange(CWnd* pOtherWnd)
{
    // The focus moving to or from one of the list's own windows (a label edit) leaves
    // the highlight as it is.
    if (pOtherWnd != NULL && IsChild(pOtherWnd))
        return;
    if (IsReportView())
        RepaintSelectedItems();
}

void KVXListCtrlEx::RepaintSelectedItems()
{
    auto invalidateRow = [this](int nItem) {
        CRect rectBounds, rectLabel;
        if (nItem != -1 && GetItemRect(nItem, &rectBounds, LVIR_BOUNDS) && GetItemRect(nItem, &rectLabel, LVIR_LABEL))
            InvalidateRect(CRect(rectLabel.left, rectBounds.top, rectBounds.right, rectBounds.bottom), FALSE);
    };
    invalidateRow(GetNextItem(-1, LVNI_FOCUSED));
    if ((GetStyle() & LVS_SHOWSELALWAYS) == 0)
    {
        // Rows out of view have nothing to repaint: only the ones in view are visited.
        const int nFirst = GetTopIndex();
        const int nLast = nFirst + GetCountPerPage();
        for (int nItem = GetNextItem(nFirst - 1, LVNI_SELECTED); nItem != -1 && nItem <= nLast;
             nItem = GetNextItem(nItem, LVNI_SELECTED))
            invalidateRow(nItem);
    }
    UpdateWindow();
}

/////////////////////////////////////////////////////////////////////////////
// Hit testing and columns

int KVXListCtrlEx::FindCell(const CPoint& point, bool bClientEdge, RECT* pCellRect, int* pColumn) const
{
    const ListGeometry::RowRange rows = ListGeometry::ScannedRows(GetTopIndex(), GetCountPerPage(), GetItemCount());
    for (int nItem = rows.first; nItem <= rows.last; ++nItem)
    {
        CRect rectBounds;
        if (!GetItemRect(nItem, &rectBounds, LVIR_BOUNDS) || !rectBounds.PtInRect(point))
            continue;
        const int nColumns = GetColumnCount();
        std::vector<int> widths(static_cast<size_t>((std::max)(nColumns, 0)));
        for (int c = 0; c < nColumns; ++c)
            widths[c] = GetColumnWidth(c);
        CRect rectClient;
        GetClientRect(&rectClient);
        const ListGeometry::ColumnHit hit = ListGeometry::FindColumn(point.x, rectBounds.left, widths.data(),
            nColumns, bClientEdge ? rectClient.right : ListGeometry::kNoClientEdge);
        // Rows do not overlap: no other row holds the point.
        if (hit.column == -1)
            return -1;
        if (pColumn != NULL)
            *pColumn = hit.column;
        if (pCellRect != NULL)
            ::SetRect(pCellRect, hit.left, rectBounds.top, hit.right, rectBounds.bottom);
        return nItem;
    }
    return -1;
}

int KVXListCtrlEx::CellRectFromPoint(CPoint& point, RECT* pCellRect, int* pColumn) const
{
    if (!IsReportView())
        return -1;
    return FindCell(point, true, pCellRect, pColumn);
}

int KVXListCtrlEx::HitTestEx(CPoint& point, int* pColumn) const
{
    const int nItem = HitTest(point);
    if (pColumn != NULL)
        *pColumn = 0;
    if (!IsReportView())
        return nItem;
    return FindCell(point, false, NULL, pColumn);
}

void KVXListCtrlEx::ResizeColumnsToFit()
{
    const int nColumns = GetColumnCount();
    if (nColumns < 1)
        return;
    std::vector<ListGeometry::ColumnFacts> columns(static_cast<size_t>(nColumns));
    for (int c = 0; c < nColumns; ++c)
    {
        LVCOLUMN column = {};
        column.mask = LVCF_WIDTH | LVCF_SUBITEM;
        columns[c].fetched = GetColumn(c, &column) != FALSE;
        columns[c].subItem = column.iSubItem;
        columns[c].width = columns[c].fetched && column.iSubItem != 0 ? GetColumnWidth(c) : 0;
    }
    CRect rectClient;
    GetClientRect(&rectClient);
    const ListGeometry::FitResult fit = ListGeometry::FitColumn(columns.data(), nColumns, rectClient.Width());
    LVCOLUMN column = {};
    column.mask = LVCF_WIDTH | LVCF_SUBITEM;
    if (GetColumn(fit.column, &column))
        SetColumnWidth(fit.column, fit.width);
}

/////////////////////////////////////////////////////////////////////////////
// Title tips

void KVXListCtrlEx::EnableTitleTip(bool bEnable)
{
    if (!bEnable)
    {
        m_bTitleTipsEnabled = false;
        return;
    }
    // Enabled again, the list keeps the window it has.
    m_bTitleTipsEnabled = m_ctlTitleTip.m_hWnd != NULL || m_ctlTitleTip.Create(this);
}

bool KVXListCtrlEx::FindTitleTipCell(UINT nFlags, CPoint point, TitleTipCell& cell) const
{
    if (nFlags != 0 || !m_bTitleTipsEnabled)
        return false;
    CRect rectCell;
    int nColumn = 0;
    const int nItem = CellRectFromPoint(point, &rectCell, &nColumn);
    if (nItem == -1)
        return false;
    CRect rectLabel(rectCell);
    if (nColumn == 0)
        GetItemRect(nItem, &rectLabel, LVIR_LABEL);
    const ListGeometry::TitleTipPlacement tip = ListGeometry::PlaceTitleTip(nColumn, rectCell, rectLabel.left, point.x);
    if (!tip.atText)
        return false;
    cell.nItem = nItem;
    cell.nColumn = nColumn;
    cell.rect = tip.rect;
    cell.nTextOffset = tip.textOffset;
    return true;
}

void KVXListCtrlEx::ShowTitleTip(const TitleTipCell& cell, LPCTSTR pszText)
{
    m_ctlTitleTip.Show(cell.rect, pszText, cell.nTextOffset);
}

void KVXListCtrlEx::OnMouseMove(UINT nFlags, CPoint point)
{
    TitleTipCell cell;
    if (FindTitleTipCell(nFlags, point, cell))
        ShowTitleTip(cell, GetItemText(cell.nItem, cell.nColumn));
    CListCtrl::OnMouseMove(nFlags, point);
}

/////////////////////////////////////////////////////////////////////////////
// Check boxes and item iteration

void KVXListCtrlEx::OnLButtonDown(UINT nFlags, CPoint point)
{
    UINT nHitFlags = 0;
    const int nItem = HitTest(point, &nHitFlags);
    // With full-row selection a click on a sub-item hits LVHT_ONITEM, which holds the
    // state icon's bit: only the state icon alone toggles.
    if (nItem != -1 && (nHitFlags & LVHT_ONITEM) == LVHT_ONITEMSTATEICON)
    {
        const int nImage = static_cast<int>((GetItemState(nItem, LVIS_STATEIMAGEMASK) & LVIS_STATEIMAGEMASK) >> 12);
        SetItemState(nItem, INDEXTOSTATEIMAGEMASK(ListGeometry::NextCheckBoxImage(nImage)), LVIS_STATEIMAGEMASK);
    }
    CListCtrl::OnLButtonDown(nFlags, point);
}

bool KVXListCtrlEx::IterateItems(KVXListCtrlExItemCommand* pCommand)
{
    if (pCommand == NULL)
        return false;
    bool bResult = true;
    bool bContinue = true;
    const int nCount = GetItemCount();
    for (int nItem = 0; nItem < nCount && bResult && bContinue; ++nItem)
        bResult = pCommand->DoForItem(nItem, bContinue);
    return bResult;
}

/////////////////////////////////////////////////////////////////////////////
// Sort state

bool KVXListCtrlEx::EnableSort(bool bEnable)
{
    const bool bPrevious = m_bSortEnabled;
    m_bSortEnabled = bEnable;
    return bPrevious;
}

bool KVXListCtrlEx::SetColumnTypes(unsigned char* pTypes, unsigned int nCount)
{
    delete[] m_pColumnTypes;
    m_pColumnTypes = NULL;
    m_nColumnTypes = 0;
    if (nCount == 0)
        return true;
    if (pTypes == NULL)
        return false;
    for (unsigned int i = 0; i < nCount; ++i)
    {
        if (pTypes[i] > ListSortKeys::kLastColumnType)
            return false;
    }
    m_pColumnTypes = new (std::nothrow) unsigned char[nCount];
    if (m_pColumnTypes == NULL)
        return false;
    for (unsigned int i = 0; i < nCount; ++i)
        m_pColumnTypes[i] = pTypes[i];
    m_nColumnTypes = nCount;
    return true;
}

bool KVXListCtrlEx::SetBaseTime(CString strTime)
{
    COleDateTime baseTime;
    if (!baseTime.ParseDateTime(strTime, 0, LANG_USER_DEFAULT))
        return false;
    m_dtBaseTime = baseTime;
    return true;
}

bool KVXListCtrlEx::GetSortInfo(int& nColumn, bool& bAscending)
{
    if (m_nSortColumn == -1)
        return false;
    nColumn = m_nSortColumn;
    bAscending = m_bSortAscending != FALSE;
    return true;
}

unsigned char KVXListCtrlEx::GetColumnType(int nColumn) const
{
    if (m_pColumnTypes == NULL || nColumn < 0 || static_cast<unsigned int>(nColumn) >= m_nColumnTypes)
        return ListSortKeys::kDefaultColumnType;
    return m_pColumnTypes[nColumn];
}

void KVXListCtrlEx::PreSort()
{
}

void KVXListCtrlEx::PostSort()
{
}

/////////////////////////////////////////////////////////////////////////////
// Sorting

void KVXListCtrlEx::OnHeaderClicked(NMHDR* pNMHDR, LRESULT* pResult)
{
    *pResult = 0;
    const NMHEADER* pHeader = reinterpret_cast<const NMHEADER*>(pNMHDR);
    if (pHeader->iButton != 0 || !m_bSortEnabled)
        return;
    // A new column sorts ascending; the sorted one turns round.
    const bool bAscending = pHeader->iItem != m_nSortColumn || !m_bSortAscending;
    SortList(pHeader->iItem, bAscending);
}

void KVXListCtrlEx::ResortList()
{
    const int nColumn = m_nSortColumn;
    m_nSortColumn = -1;
    if (nColumn == -1)
    {
        PreSort();
        PostSort();
        return;
    }
    SortList(nColumn, m_bSortAscending != FALSE);
}

void KVXListCtrlEx::SortList(int nColumn, bool bAscending)
{
    PreSort();
    if (nColumn < 0)
        nColumn = -1;
    // The list is taken to be sorted already: nothing to do, not even for the header.
    if (nColumn == m_nSortColumn && bAscending == (m_bSortAscending != FALSE))
    {
        PostSort();
        return;
    }
    m_nSortColumn = nColumn;
    if (nColumn != -1)
    {
        m_bSortAscending = bAscending;
        SortRows(nColumn, bAscending);
    }
    // Should the header have come without telling its parent, it is taken now.
    SubclassHeader();
    HWND hHeader = ::GetDlgItem(m_hWnd, 0);
    if (hHeader != NULL)
        ::SendMessage(hHeader, WM_KVX_SETSORTEDCOLUMN, (WPARAM)m_nSortColumn, (LPARAM)m_bSortAscending);
    PostSort();
}

void KVXListCtrlEx::AppendKeyText(int nItem, int nColumn, unsigned char nType, std::vector<TCHAR>& keys) const
{
    TCHAR szText[kKeyBufferLength];
    szText[0] = 0;
    int nLength;
    if (nType == ListSortKeys::kImage || nType == ListSortKeys::kImageAlt)
    {
        LVITEM item = {};
        item.mask = LVIF_IMAGE;
        item.iItem = nItem;
        item.iSubItem = nColumn;
        GetItem(&item);
        nLength = ::wsprintf(szText, _T("%d"), item.iImage);
    }
    else
    {
        nLength = GetItemText(nItem, nColumn, szText, kKeyBufferLength);
    }
    if (nLength >= 0 && nLength < kKeyBufferLength - 1)
    {
        keys.insert(keys.end(), szText, szText + nLength);
    }
    else
    {
        // The text filled the buffer: it may be longer.
        const CString strText = GetItemText(nItem, nColumn);
        keys.insert(keys.end(), static_cast<LPCTSTR>(strText), static_cast<LPCTSTR>(strText) + strText.GetLength());
    }
    keys.push_back(0);
}

void KVXListCtrlEx::SortRows(int nColumn, bool bAscending)
{
    const int nCount = GetItemCount();
    const unsigned char nType = GetColumnType(nColumn);

    // Every key is fetched and parsed once; the rows are ordered here and the list
    // view only applies that order, comparing ranks.
    std::vector<SortRecord> records(static_cast<size_t>(nCount));
    std::vector<TCHAR> keys;
    keys.reserve(static_cast<size_t>(nCount) * 16);
    for (int i = 0; i < nCount; ++i)
    {
        records[i].dwItemData = GetItemData(i);
        records[i].nKeyStart = keys.size();
        AppendKeyText(i, nColumn, nType, keys);
    }
    std::vector<LPCWSTR> texts(static_cast<size_t>(nCount));
    for (int i = 0; i < nCount; ++i)
        texts[i] = keys.data() + records[i].nKeyStart;
    const std::vector<int> order = ListSortKeys::SortKeys(nType, texts, m_dtBaseTime).Order(bAscending);
    std::vector<int> ranks(static_cast<size_t>(nCount));
    for (int k = 0; k < nCount; ++k)
        ranks[order[k]] = k;

    // Each item data write repaints a visible row while drawing is on; the order
    // shows once drawing resumes.
    const bool bSuspendRedraw = m_bRedraw && IsWindowVisible();
    if (bSuspendRedraw)
        SetRedraw(FALSE);

    // During the sort every row's item data is its rank. The parent may refuse a
    // change (LVN_ITEMCHANGING): then nothing is sorted and the rows written get
    // their own data back.
    int nWritten = 0;
    while (nWritten < nCount && SetItemData(nWritten, static_cast<DWORD_PTR>(ranks[nWritten])))
        ++nWritten;
    bool bSorted = false;
    if (nWritten == nCount && GetItemCount() == nCount)
        bSorted = SortItems(&KVXListCtrlEx::Compare, (static_cast<DWORD_PTR>(nType) << 8) | (bAscending ? 1 : 0)) != FALSE;
    if (!bSorted)
    {
        for (int i = 0; i < nWritten && i < GetItemCount(); ++i)
            SetItemData(i, records[i].dwItemData);
    }
    else
    {
        // The ranks are distinct, so one order is possible: row k holds rank k. Should
        // a few rows say otherwise, every row is read.
        bool bAsExpected = true;
        for (int k : { 0, nCount / 2, nCount - 1 })
            bAsExpected = bAsExpected && (k < 0 || GetItemData(k) == static_cast<DWORD_PTR>(k));
        for (int k = 0; k < nCount; ++k)
        {
            const DWORD_PTR nRank = bAsExpected ? static_cast<DWORD_PTR>(k) : GetItemData(k);
            if (nRank < static_cast<DWORD_PTR>(nCount))
                SetItemData(k, records[order[nRank]].dwItemData);
        }
    }

    if (bSuspendRedraw)
    {
        SetRedraw(TRUE);
        Invalidate();
    }
}

int CALLBACK KVXListCtrlEx::Compare(LPARAM lParam1, LPARAM lParam2, LPARAM)
{
    // The ranks hold the column's rule and direction already, and keep equal keys in
    // their previous order.
    return lParam1 < lParam2 ? -1 : (lParam1 > lParam2 ? 1 : 0);
}

/////////////////////////////////////////////////////////////////////////////
// Column move

void KVXListCtrlEx::DragColumn(int nSource, int nTarget)
{
    TCHAR szTitle[kColumnTitleLength];
    LVCOLUMN column = {};
    column.mask = LVCF_FMT | LVCF_WIDTH | LVCF_TEXT | LVCF_SUBITEM;
    column.pszText = szTitle;
    column.cchTextMax = kColumnTitleLength;
    if (!GetColumn(nSource, &column))
        return;
    // The copy goes in first; the list view shifts the sub-items at and behind it.
    column.iSubItem = nTarget;
    if (InsertColumn(nTarget, &column) < 0)
        return;

    const int nFrom = nSource > nTarget ? nSource + 1 : nSource;
    const int nRows = GetItemCount();
    if (nTarget == 0)
    {
        // Sub-item 0 is the item itself, which no insertion moves.
        for (int i = nRows - 1; i >= 0; --i)
            SetItemText(i, 1, GetItemText(i, 0));
    }
    for (int i = nRows - 1; i >= 0; --i)
        SetItemText(i, nTarget, GetItemText(i, nFrom));

    if (nFrom == 0)
    {
        // The item's own text stays in column 0: column 0 takes over the title and
        // the texts of column 1, which goes instead.
        LVCOLUMN next = {};
        next.mask = LVCF_FMT | LVCF_WIDTH | LVCF_TEXT | LVCF_SUBITEM;
        next.pszText = szTitle;
        next.cchTextMax = kColumnTitleLength;
        if (GetColumn(1, &next))
        {
            next.iSubItem = 0;
            SetColumn(0, &next);
            for (int i = nRows - 1; i >= 0; --i)
                SetItemText(i, 0, GetItemText(i, 1));
            DeleteColumn(1);
        }
    }
    else
    {
        DeleteColumn(nFrom);
    }
    Invalidate(TRUE);
}
