// KVXDragHeaderCtrl: column drags over OLE and the sort arrow.
#include "KVXDragHeaderCtrl.h"

#include "ColumnDragGeometry.h"
#include "ColumnDragSupport.h"
#include "KVXColumnNotify.h"
#include "KVXHeaderCtrlClipboardFormats.h"
#include "KVXHeaderCtrlDataSource.h"

BEGIN_MESSAGE_MAP(KVXDragHeaderCtrl, CHeaderCtrl)
    ON_WM_LBUTTONDOWN()
    ON_WM_LBUTTONUP()
    ON_WM_MOUSEMOVE()
    ON_MESSAGE(WM_USER + 1, &KVXDragHeaderCtrl::OnSetsortedcolumn)
    ON_WM_PAINT()
END_MESSAGE_MAP()

namespace {

// HDM_GETITEM's text buffer for the sorted item's title.
const int kTitleBufferLength = 254;

} // namespace

KVXDragHeaderCtrl::KVXDragHeaderCtrl()
    : m_nSortedColumn(-1), m_bAscending(true), m_pMessageWnd(NULL), m_ColumnInfos(10), m_pDragColumn(NULL)
{
}

KVXDragHeaderCtrl::~KVXDragHeaderCtrl()
{
}

void KVXDragHeaderCtrl::AddColumn(KVXColumnInfo* pColumnInfo)
{
    if (pColumnInfo != NULL)
        m_ColumnInfos.AddTail(pColumnInfo);
}

void KVXDragHeaderCtrl::RemoveColumn(KVXColumnInfo* pColumnInfo)
{
    POSITION pos = m_ColumnInfos.GetHeadPosition();
    while (pos != NULL)
    {
        const POSITION current = pos;
        if (m_ColumnInfos.GetNext(pos) == pColumnInfo)
            m_ColumnInfos.RemoveAt(current);
    }
    if (m_pDragColumn == pColumnInfo)
        m_pDragColumn = NULL;
}

bool KVXDragHeaderCtrl::InitDragDrop()
{
    return m_DropTarget.Register(this) != FALSE;
}

void KVXDragHeaderCtrl::SetMessageWnd(CWnd* pWnd)
{
    m_pMessageWnd = pWnd;
    m_DropTarget.SetMessageWnd(pWnd);
}

int KVXDragHeaderCtrl::HitTest(CPoint point)
{
    CRect rectClient;
    GetClientRect(&rectClient);
    const std::vector<int> widths = HeaderItemWidths(this);
    return ColumnDragGeometry::HitTestItems(point, rectClient, widths.data(), static_cast<int>(widths.size()));
}

/////////////////////////////////////////////////////////////////////////////
// Column drags: idle -> (press well inside an item that has a record) pressed ->
// (first move with the button held) DoDragDrop's loop -> idle; a release ends a press.

void KVXDragHeaderCtrl::OnLButtonDown(UINT, CPoint point)
{
    m_pDragColumn = NULL;
    const std::vector<int> widths = HeaderItemWidths(this);
    const int nItem = ColumnDragGeometry::FindPressedItem(point.x, widths.data(), static_cast<int>(widths.size()));
    if (nItem != -1)
    {
        for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
        {
            KVXColumnInfo* pColumnInfo = m_ColumnInfos.GetNext(pos);
            if (pColumnInfo->GetIndex() == nItem)
            {
                m_pDragColumn = pColumnInfo;
                break;
            }
        }
    }
    Default();
}

void KVXDragHeaderCtrl::OnLButtonUp(UINT, CPoint)
{
    m_pDragColumn = NULL;
    Default();
}

void KVXDragHeaderCtrl::OnMouseMove(UINT nFlags, CPoint)
{
    if (m_pDragColumn != NULL)
    {
        // A press whose release went elsewhere (the capture taken away) starts nothing.
        if ((nFlags & MK_LBUTTON) == 0)
            m_pDragColumn = NULL;
        else if (!DragColumn())
            return;
    }
    Default();
}

bool KVXDragHeaderCtrl::DragColumn()
{
    KVXColumnInfo* pColumnInfo = m_pDragColumn;
    const bool bSortedColumn = m_nSortedColumn == pColumnInfo->GetIndex();
    KVXHeaderCtrlDataSource source;
    source.DelayRenderFileData(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem));
    source.SetData(*pColumnInfo, bSortedColumn);

    // The host may destroy the header (with its list) while DoDragDrop's loop runs:
    // the drop source then ends the drag, and this object is not touched again.
    const HWND hWnd = m_hWnd;
    ColumnDropSource dropSource(hWnd);
    const DROPEFFECT dropEffect = source.DoDragDrop(DROPEFFECT_COPY | DROPEFFECT_MOVE | DROPEFFECT_LINK, NULL,
        &dropSource);
    if (!IsStillAttached(hWnd, this))
        return false;

    if (dropEffect == DROPEFFECT_MOVE)
    {
        CWnd* pMessageWnd = m_pMessageWnd != NULL ? m_pMessageWnd : GetParent();
        if (pMessageWnd != NULL)
        {
            KVXColumnNotify notify = {};
            notify.hdr.hwndFrom = m_hWnd;
            notify.hdr.idFrom = 0;
            notify.hdr.code = KVXN_DELETECOLUMN;
            notify.pColumnInfo = pColumnInfo;
            notify.bSortedColumn = bSortedColumn;
            pMessageWnd->SendMessage(WM_NOTIFY, 0, reinterpret_cast<LPARAM>(&notify));
            if (!IsStillAttached(hWnd, this))
                return false;
        }
    }
    else
    {
        RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
    }
    m_pDragColumn = NULL;
    return true;
}

/////////////////////////////////////////////////////////////////////////////
// Sort arrow

LRESULT KVXDragHeaderCtrl::OnSetsortedcolumn(WPARAM wParam, LPARAM lParam)
{
    m_nSortedColumn = static_cast<int>(wParam);
    m_bAscending = lParam != 0;
    RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
    return 0;
}

void KVXDragHeaderCtrl::OnPaint()
{
    Default();
    DrawSortArrow();
}

void KVXDragHeaderCtrl::DrawSortArrow()
{
    if (m_nSortedColumn < 0 || m_nSortedColumn >= GetItemCount())
        return;

    CClientDC dc(this);
    CRect rectClient;
    GetClientRect(&rectClient);
    TCHAR szTitle[kTitleBufferLength] = {};
    HDITEM item = {};
    int nLeft = 0;
    for (int i = 0; i <= m_nSortedColumn; ++i)
    {
        if (i > 0)
            nLeft += item.cxy;
        item = HDITEM();
        item.mask = HDI_WIDTH | HDI_TEXT | HDI_FORMAT;
        item.pszText = szTitle;
        item.cchTextMax = kTitleBufferLength;
        szTitle[0] = 0;
        if (!GetItem(i, &item))
            return;
    }
    // The title is measured in the DC as it comes, without the header's font.
    const CSize title = dc.GetTextExtent(szTitle, lstrlen(szTitle));
    const CRect rectItem(nLeft, rectClient.top, nLeft + item.cxy, rectClient.bottom);
    const ColumnDragGeometry::SortArrow arrow = ColumnDragGeometry::PlaceSortArrow(rectItem, title.cx,
        (item.fmt & HDF_RIGHT) != 0, m_bAscending);
    if (!arrow.visible)
        return;

    // Left edge dark, right edge light; the base light when ascending, dark when descending.
    CPen penDark(PS_SOLID, 1, ::GetSysColor(COLOR_3DDKSHADOW));
    CPen penLight(PS_SOLID, 1, ::GetSysColor(COLOR_3DHILIGHT));
    CPen* pOldPen = dc.SelectObject(&penDark);
    dc.MoveTo(arrow.x, arrow.baseY);
    dc.LineTo(arrow.x + ColumnDragGeometry::kArrowWidth / 2, arrow.apexY);
    dc.SelectObject(&penLight);
    dc.LineTo(arrow.x + ColumnDragGeometry::kArrowWidth, arrow.baseY);
    if (!m_bAscending)
        dc.SelectObject(&penDark);
    dc.LineTo(arrow.x, arrow.baseY);
    dc.SelectObject(pOldPen);
}
