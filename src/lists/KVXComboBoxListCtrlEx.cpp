// KVXComboBoxListCtrlEx: the combo boxes of the combo column, their places while the
// list scrolls and its columns change, and the title tip's text from the parent.
#include "KVXComboBoxListCtrlEx.h"

#include "ComboListGeometry.h"
#include "KVXSubItemComboBox.h"
#include "resource.h"

#include <vector>

BEGIN_MESSAGE_MAP(KVXComboBoxListCtrlEx, KVXListCtrlEx)
    ON_MESSAGE(WM_KVX_RESIZECOLUMN, &KVXComboBoxListCtrlEx::OnResizeColumn)
    ON_MESSAGE(WM_KVX_ENSUREVISIBILITY, &KVXComboBoxListCtrlEx::OnEnsureVisibility)
    ON_WM_HSCROLL()
    ON_WM_VSCROLL()
    ON_WM_MOUSEWHEEL()
    ON_WM_KEYDOWN()
    ON_WM_MOUSEMOVE()
    ON_WM_PARENTNOTIFY()
    ON_WM_DESTROY()
END_MESSAGE_MAP()

namespace {

// WS_CHILD | WS_VISIBLE | WS_BORDER | WS_VSCROLL | WS_HSCROLL | CBS_DROPDOWNLIST | CBS_DISABLENOSCROLL
const DWORD kComboBoxStyle = 0x50B00803;
// The map's keys are 16 bits wide.
const int kLastRow = 0xFFFF;

} // namespace

KVXComboBoxListCtrlEx::KVXComboBoxListCtrlEx()
    : m_nComboColumn(-1), m_mapComboBoxes(10)
{
}

KVXComboBoxListCtrlEx::~KVXComboBoxListCtrlEx()
{
}

/////////////////////////////////////////////////////////////////////////////
// The combo column and its boxes

void KVXComboBoxListCtrlEx::SetComboBoxColID(int nColumn)
{
    m_nComboColumn = nColumn;
}

int KVXComboBoxListCtrlEx::GetComboBoxColID() const
{
    return m_nComboColumn;
}

KVXSubItemComboBox* KVXComboBoxListCtrlEx::FindComboBox(int nRow) const
{
    void* pValue = NULL;
    if (nRow < 0 || nRow > kLastRow || !m_mapComboBoxes.Lookup(static_cast<WORD>(nRow), pValue))
        return NULL;
    return static_cast<KVXSubItemComboBox*>(pValue);
}

void KVXComboBoxListCtrlEx::SetSubItems(int nRow, int nCount, CStringArray* pStrings, int nSelect)
{
    if (m_hWnd == NULL || m_nComboColumn == -1 || nRow < 0 || nRow > kLastRow)
        return;
    if (KVXSubItemComboBox* pOld = FindComboBox(nRow))
    {
        // Out of the map first: the window's end deletes the object.
        m_mapComboBoxes.RemoveKey(static_cast<WORD>(nRow));
        if (pOld->m_hWnd != NULL)
            pOld->DestroyWindow();
    }
    if (pStrings == NULL || nCount != pStrings->GetSize())
        return;

    KVXSubItemComboBox* pCombo = CreateSubItemComboBox(nRow, m_nComboColumn);
    if (pCombo == NULL)
        return;
    for (int i = 0; i < nCount; ++i)
    {
        const int nIndex = pCombo->AddString(pStrings->GetAt(i));
        if (nIndex >= 0)
            pCombo->SetItemData(nIndex, static_cast<DWORD_PTR>(i));
    }
    pCombo->SetCurSel(nSelect);
    m_mapComboBoxes.SetAt(static_cast<WORD>(nRow), pCombo);
    // A row out of view would show its box over the header or below the rows.
    const ComboListGeometry::RowRange rows =
        ComboListGeometry::VisibleRows(GetTopIndex(), GetCountPerPage(), GetItemCount());
    if (!ComboListGeometry::IsInRange(rows, nRow))
        pCombo->ShowWindow(SW_HIDE);
}

KVXSubItemComboBox* KVXComboBoxListCtrlEx::CreateSubItemComboBox(int nRow, int nColumn)
{
    // SetSubItems has let go of the row's previous box: every box is new.
    KVXSubItemComboBox* pCombo = new KVXSubItemComboBox(nRow, nColumn);
    const CRect rect = GetComboBoxRect(nRow, nColumn, 0);
    const int nFieldHeight = rect.Height();
    // A failed creation has deleted the object already (KVXSubItemComboBox::PostNcDestroy).
    if (!pCombo->Create(kComboBoxStyle, ComboListGeometry::DropDownWindowRect(rect), this,
                        static_cast<UINT>(nRow + IDC_COMBO_BASE)))
        return NULL;
    pCombo->SetItemHeight(-1, static_cast<UINT>(nFieldHeight));
    pCombo->SetHorizontalExtent(static_cast<UINT>(GetColumnWidth(nColumn)));
    return pCombo;
}

CRect KVXComboBoxListCtrlEx::GetComboBoxRect(int nRow, int nColumn, long)
{
    const int nColumns = GetColumnCount();
    if (nRow == -1 || ::GetDlgItem(m_hWnd, 0) == NULL || nColumn >= nColumns || nColumn < 0)
        return CRect(0, 0, 0, 0);

    // Sub-items have images only with LVS_EX_SUBITEMIMAGES (the list view reports image 0
    // for them otherwise), as the list draws them.
    int nImageWidth = 0;
    LVITEM item = {};
    item.mask = LVIF_IMAGE;
    item.iItem = nRow;
    item.iSubItem = nColumn;
    item.iImage = -1;
    CImageList* pImages = GetImageList(LVSIL_SMALL);
    IMAGEINFO info = {};
    const bool bHasImage = nColumn == 0 || (GetExtendedStyle() & LVS_EX_SUBITEMIMAGES) != 0;
    if (bHasImage && GetItem(&item) && item.iImage != -1 && pImages != NULL && pImages->GetImageInfo(item.iImage, &info))
        nImageWidth = info.rcImage.right - info.rcImage.left;

    CRect rectBounds(0, 0, 0, 0);
    if (!GetItemRect(nRow, &rectBounds, LVIR_BOUNDS))
        return CRect(0, 0, 0, 0);
    std::vector<int> widths(static_cast<size_t>(nColumns));
    for (int c = 0; c < nColumns; ++c)
        widths[c] = GetColumnWidth(c);
    const int cxEdge = ::GetSystemMetrics(SM_CXEDGE);
    const ComboListGeometry::ComboRect combo = ComboListGeometry::ComboBoxRect(rectBounds, widths.data(), nColumns,
        nColumn, nImageWidth, ComboListGeometry::MinimumWidth(::GetSystemMetrics(SM_CXVSCROLL), cxEdge), cxEdge);
    if (combo.widen)
        SetColumnWidth(m_nComboColumn, static_cast<int>(static_cast<WORD>(combo.widenedWidth)));
    return CRect(combo.rect);
}

/////////////////////////////////////////////////////////////////////////////
// Keeping the boxes over their cells

void KVXComboBoxListCtrlEx::PlaceComboBox(int nRow, KVXSubItemComboBox* pCombo)
{
    const CRect rect = GetComboBoxRect(nRow, m_nComboColumn, 0);
    if (rect.IsRectEmpty())
        return;     // no combo column any more, or no such row: the box stays as it is
    // The same extent as at creation: the column's width.
    pCombo->SetHorizontalExtent(static_cast<UINT>(GetColumnWidth(m_nComboColumn)));
    const CRect rectWindow = ComboListGeometry::DropDownWindowRect(rect);
    pCombo->MoveWindow(rectWindow.left, rectWindow.top, rectWindow.Width(), rectWindow.Height(), TRUE);
    pCombo->SetItemHeight(-1, static_cast<UINT>(rect.Height()));
}

LRESULT KVXComboBoxListCtrlEx::OnResizeColumn(WPARAM, LPARAM)
{
    // Moving a combo box costs about a millisecond: only the boxes in view are moved, the
    // others when they come into view (OnEnsureVisibility).
    const ComboListGeometry::RowRange rows =
        ComboListGeometry::VisibleRows(GetTopIndex(), GetCountPerPage(), GetItemCount());
    for (int nRow = rows.first; nRow <= rows.last; ++nRow)
    {
        KVXSubItemComboBox* pCombo = FindComboBox(nRow);
        if (pCombo != NULL && pCombo->m_hWnd != NULL && (pCombo->GetStyle() & WS_VISIBLE))
            PlaceComboBox(nRow, pCombo);
    }
    Invalidate(TRUE);
    UpdateWindow();
    return 0;
}

LRESULT KVXComboBoxListCtrlEx::OnEnsureVisibility(WPARAM wParam, LPARAM lParam)
{
    const int nFirst = wParam != 0 ? static_cast<int>(lParam) : GetTopIndex();
    const ComboListGeometry::RowRange rows = ComboListGeometry::VisibleRows(nFirst, GetCountPerPage(), GetItemCount());
    POSITION pos = m_mapComboBoxes.GetStartPosition();
    while (pos != NULL)
    {
        WORD nRow = 0;
        void* pValue = NULL;
        m_mapComboBoxes.GetNextAssoc(pos, nRow, pValue);
        KVXSubItemComboBox* pCombo = static_cast<KVXSubItemComboBox*>(pValue);
        if (pCombo->m_hWnd == NULL)
            continue;
        // The box's own style: the list itself is invisible while its redraw is off.
        const bool bShown = (pCombo->GetStyle() & WS_VISIBLE) != 0;
        if (!ComboListGeometry::IsInRange(rows, nRow))
        {
            if (bShown)
                pCombo->ShowWindow(SW_HIDE);
        }
        else if (!bShown)
        {
            PlaceComboBox(nRow, pCombo);
            pCombo->ShowWindow(SW_SHOW);
            RedrawItems(nRow, nRow);
        }
    }
    return 0;
}

void KVXComboBoxListCtrlEx::HScrollComboBoxesIntoView()
{
    const ComboListGeometry::RowRange rows =
        ComboListGeometry::VisibleRows(GetTopIndex(), GetCountPerPage(), GetItemCount());
    CRect rectFirst;
    if (rows.last < rows.first || !GetItemRect(rows.first, &rectFirst, LVIR_BOUNDS))
        return;
    const int nRowHeight = rectFirst.Height();
    const CRect rect = GetComboBoxRect(rows.first, m_nComboColumn, 0);
    if (rect.IsRectEmpty())
        return;
    for (int nRow = rows.first; nRow <= rows.last; ++nRow)
    {
        KVXSubItemComboBox* pCombo = FindComboBox(nRow);
        if (pCombo == NULL || pCombo->m_hWnd == NULL)
            continue;
        // With the room for its list, as everywhere else: a box only one field high
        // would drop down an empty list.
        const CRect rectWindow =
            ComboListGeometry::DropDownWindowRect(ComboListGeometry::RowComboRect(rect, rows.first, nRow, nRowHeight));
        pCombo->MoveWindow(rectWindow.left, rectWindow.top, rectWindow.Width(), rectWindow.Height(), TRUE);
        // The field height again, so that the box lays out its field for the new place;
        // from the row, as Wine reads it back two pixels higher than it was set.
        pCombo->SetItemHeight(-1, static_cast<UINT>(rect.Height()));
    }
    RedrawItems(rows.first, rows.last + 1);
}

void KVXComboBoxListCtrlEx::PostRelayout()
{
    PostMessage(WM_KVX_RESIZECOLUMN, 0, 0);
    PostMessage(WM_KVX_ENSUREVISIBILITY, 0, 0);
}

void KVXComboBoxListCtrlEx::OnVScroll(UINT nSBCode, UINT nPos, CScrollBar* pScrollBar)
{
    KVXListCtrlEx::OnVScroll(nSBCode, nPos, pScrollBar);
    if (nSBCode == SB_ENDSCROLL)
        PostRelayout();
}

void KVXComboBoxListCtrlEx::OnHScroll(UINT nSBCode, UINT nPos, CScrollBar* pScrollBar)
{
    KVXListCtrlEx::OnHScroll(nSBCode, nPos, pScrollBar);
    if (nSBCode == SB_ENDSCROLL)
        HScrollComboBoxesIntoView();
}

BOOL KVXComboBoxListCtrlEx::OnMouseWheel(UINT nFlags, short zDelta, CPoint pt)
{
    // The wheel scrolls without an end-of-scroll message.
    const BOOL bResult = KVXListCtrlEx::OnMouseWheel(nFlags, zDelta, pt);
    PostRelayout();
    return bResult;
}

void KVXComboBoxListCtrlEx::OnKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags)
{
    KVXListCtrlEx::OnKeyDown(nChar, nRepCnt, nFlags);
    switch (nChar)
    {
    case VK_PRIOR: case VK_NEXT: case VK_END: case VK_HOME: case VK_UP: case VK_DOWN:
        PostRelayout();
        break;
    case VK_LEFT: case VK_RIGHT:
        HScrollComboBoxesIntoView();
        break;
    default:
        break;
    }
}

BOOL KVXComboBoxListCtrlEx::OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    const BOOL bResult = KVXListCtrlEx::OnNotify(wParam, lParam, pResult);
    const NMHDR* pHeader = reinterpret_cast<const NMHDR*>(lParam);
    // Only header notifications carry an item; the code says which ones.
    if (pHeader != NULL && ComboListGeometry::IsDividerNotification(pHeader->code)
        && ComboListGeometry::MovesComboBoxes(pHeader->code, reinterpret_cast<const NMHEADER*>(lParam)->iItem,
                                              m_nComboColumn))
        PostMessage(WM_KVX_RESIZECOLUMN, wParam, lParam);
    return bResult;
}

/////////////////////////////////////////////////////////////////////////////
// Title tip

void KVXComboBoxListCtrlEx::OnMouseMove(UINT nFlags, CPoint point)
{
    TitleTipCell cell;
    if (FindTitleTipCell(nFlags, point, cell))
    {
        CString strText = GetItemText(cell.nItem, cell.nColumn);
        CWnd* pParent = GetParent();
        if (pParent != NULL)
        {
            // The parent tells the text; one that does not answer leaves it empty.
            NMLVDISPINFOW info = {};
            info.hdr.hwndFrom = m_hWnd;
            info.hdr.idFrom = static_cast<UINT_PTR>(GetDlgCtrlID());
            info.hdr.code = LVN_GETDISPINFOW;
            info.item.mask = LVIF_TEXT;
            info.item.iItem = cell.nItem;
            info.item.iSubItem = cell.nColumn;
            pParent->SendMessage(WM_NOTIFY, static_cast<WPARAM>(GetDlgCtrlID()), reinterpret_cast<LPARAM>(&info));
            strText = info.item.pszText != NULL ? info.item.pszText : L"";
        }
        ShowTitleTip(cell, strText);
    }
    CListCtrl::OnMouseMove(nFlags, point);
}

/////////////////////////////////////////////////////////////////////////////
// Destruction

void KVXComboBoxListCtrlEx::OnParentNotify(UINT message, LPARAM lParam)
{
    KVXListCtrlEx::OnParentNotify(message, lParam);
    // A combo box destroyed by someone else: its object is about to go, so the map lets go.
    if (LOWORD(message) == WM_DESTROY)
    {
        // The identifier from the window: the message's copy has 16 bits only.
        const int nRow = ::GetDlgCtrlID(reinterpret_cast<HWND>(lParam)) - IDC_COMBO_BASE;
        KVXSubItemComboBox* pCombo = FindComboBox(nRow);
        if (pCombo != NULL && pCombo->m_hWnd == reinterpret_cast<HWND>(lParam))
            m_mapComboBoxes.RemoveKey(static_cast<WORD>(nRow));
    }
}

void KVXComboBoxListCtrlEx::OnDestroy()
{
    // The map is emptied first: each window's end deletes its object.
    std::vector<KVXSubItemComboBox*> boxes;
    POSITION pos = m_mapComboBoxes.GetStartPosition();
    while (pos != NULL)
    {
        WORD nRow = 0;
        void* pValue = NULL;
        m_mapComboBoxes.GetNextAssoc(pos, nRow, pValue);
        boxes.push_back(static_cast<KVXSubItemComboBox*>(pValue));
    }
    m_mapComboBoxes.RemoveAll();
    for (KVXSubItemComboBox* pCombo : boxes)
    {
        if (pCombo->m_hWnd != NULL)
            pCombo->DestroyWindow();
    }
    KVXListCtrlEx::OnDestroy();
}
