// KVXHeaderCtrlEx: sort indicator and column dragging.
#include "KVXHeaderCtrlEx.h"

#include "HeaderGeometry.h"

BEGIN_MESSAGE_MAP(KVXHeaderCtrlEx, CHeaderCtrl)
    ON_WM_PAINT()
    ON_WM_LBUTTONDOWN()
    ON_WM_MOUSEMOVE()
    ON_WM_LBUTTONUP()
    ON_MESSAGE(WM_KVX_SETSORTEDCOLUMN, &KVXHeaderCtrlEx::OnSetsortedcolumn)
END_MESSAGE_MAP()

namespace {

// HDM_GETITEM's text buffer for the sorted column's title.
const int kTitleBufferLength = 254;

} // namespace

KVXHeaderCtrlEx::KVXHeaderCtrlEx()
    : m_nSortedColumn(-1), m_bAscending(true), m_bDragEnabled(false), m_bButtonDown(FALSE),
      m_bDragging(FALSE), m_pItemWidths(NULL), m_nDragItem(-1), m_nDropPosition(-1), m_rcMarker(),
      m_pfnDragCallback(NULL), m_pCallbackTarget(NULL), m_nItemWidthCount(0)
{
}

KVXHeaderCtrlEx::KVXHeaderCtrlEx(CWnd* pCallbackTarget, void (CWnd::*pfnCallback)(int, int))
    : KVXHeaderCtrlEx()
{
    SetCallback(pCallbackTarget, pfnCallback);
}

KVXHeaderCtrlEx::~KVXHeaderCtrlEx()
{
    delete[] m_pItemWidths;
}

void KVXHeaderCtrlEx::SetCallback(CWnd* pCallbackTarget, void (CWnd::*pfnCallback)(int, int))
{
    m_pCallbackTarget = pCallbackTarget;
    m_pfnDragCallback = pfnCallback;
}

bool KVXHeaderCtrlEx::EnableDrag(bool bEnable)
{
    const bool bPrevious = m_bDragEnabled;
    m_bDragEnabled = bEnable;
    return bPrevious;
}

/////////////////////////////////////////////////////////////////////////////
// Sort indicator

LRESULT KVXHeaderCtrlEx::OnSetsortedcolumn(WPARAM wParam, LPARAM lParam)
{
    m_nSortedColumn = static_cast<int>(wParam);
    m_bAscending = lParam != 0;
    RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_UPDATENOW | RDW_ERASE);
    return 0;
}

void KVXHeaderCtrlEx::OnPaint()
{
    Default();
    DrawSortIndicator();
}

void KVXHeaderCtrlEx::DrawSortIndicator()
{
    if (m_nSortedColumn < 0 || m_nSortedColumn >= GetItemCount())
        return;

    // The title is measured in the DC as it comes, without the header's font.
    CClientDC dc(this);
    CRect rcColumn;
    GetClientRect(&rcColumn);
    rcColumn.left = rcColumn.right = 0;
    TCHAR szTitle[kTitleBufferLength] = {};
    HDITEM item = {};
    for (int i = 0; i <= m_nSortedColumn && i < GetItemCount(); ++i)
    {
        item.mask = HDI_WIDTH | HDI_TEXT | HDI_FORMAT;
        item.pszText = szTitle;
        item.cchTextMax = kTitleBufferLength;
        szTitle[0] = 0;
        GetItem(i, &item);
        if (rcColumn.right != 0)
            rcColumn.left = rcColumn.right;
        rcColumn.right += item.cxy;
    }
    const CSize title = dc.GetTextExtent(szTitle, lstrlen(szTitle));
    const HeaderGeometry::SortArrow arrow = HeaderGeometry::PlaceSortArrow(rcColumn, title.cx,
        (item.fmt & HDF_RIGHT) != 0, m_bAscending);
    if (!arrow.visible)
        return;

    // Left edge dark, right edge light; the base dark when ascending, light when descending.
    CPen penDark(PS_SOLID, 1, ::GetSysColor(COLOR_3DDKSHADOW));
    CPen penLight(PS_SOLID, 1, ::GetSysColor(COLOR_3DHILIGHT));
    CPen* pOldPen = dc.SelectObject(&penDark);
    dc.MoveTo(arrow.x0, arrow.baseY);
    dc.LineTo(arrow.apexX, arrow.apexY);
    dc.SelectObject(&penLight);
    dc.LineTo(arrow.x0 + HeaderGeometry::kArrowWidth, arrow.baseY);
    if (m_bAscending)
        dc.SelectObject(&penDark);
    dc.LineTo(arrow.x0, arrow.baseY);
    dc.SelectObject(pOldPen);
}

/////////////////////////////////////////////////////////////////////////////
// Column dragging: idle -> (press on an item) armed -> (move with the button held)
// dragging -> (release) idle, calling back when the column really moves.

void KVXHeaderCtrlEx::OnLButtonDown(UINT nFlags, CPoint point)
{
    if (m_bDragEnabled)
    {
        HDHITTESTINFO hitTest = {};
        hitTest.pt = point;
        const int nItem = HitTest(&hitTest);
        if (hitTest.flags == HHT_ONHEADER)
        {
            m_bButtonDown = TRUE;
            m_nDragItem = nItem;
        }
    }
    CHeaderCtrl::OnLButtonDown(nFlags, point);
}

void KVXHeaderCtrlEx::OnMouseMove(UINT nFlags, CPoint point)
{
    if (!m_bDragEnabled)
    {
        CHeaderCtrl::OnMouseMove(nFlags, point);
        return;
    }
    if ((nFlags & MK_LBUTTON) == 0)
    {
        // The button went up where we did not see it: the drag is over.
        m_bButtonDown = FALSE;
        if (m_bDragging)
        {
            m_bDragging = FALSE;
            EndDrag();
        }
        CHeaderCtrl::OnMouseMove(nFlags, point);
        return;
    }
    if (m_bDragging)
        MoveDropMarker(point.x);
    else if (m_bButtonDown)
        StartDrag();
    else
        CHeaderCtrl::OnMouseMove(nFlags, point);
}

void KVXHeaderCtrlEx::OnLButtonUp(UINT nFlags, CPoint point)
{
    // A press that never moved ends here as well, so that no later move starts a drag.
    m_bButtonDown = FALSE;
    if (m_bDragEnabled && m_bDragging)
    {
        m_bDragging = FALSE;
        EndDrag();
        Invalidate(TRUE);
        // Dropped on its own item or just behind it, the column stays where it is.
        const bool bMoved = m_nDropPosition != m_nDragItem && m_nDropPosition != m_nDragItem + 1;
        if (bMoved && m_pCallbackTarget != NULL && m_pfnDragCallback != NULL)
            (m_pCallbackTarget->*m_pfnDragCallback)(m_nDragItem, m_nDropPosition);
    }
    CHeaderCtrl::OnLButtonUp(nFlags, point);
}

void KVXHeaderCtrlEx::StartDrag()
{
    m_bButtonDown = FALSE;
    m_bDragging = TRUE;
    m_nDropPosition = m_nDragItem;
    SetCapture();
    delete[] m_pItemWidths;
    m_nItemWidthCount = GetItemCount();
    m_pItemWidths = new int[m_nItemWidthCount > 0 ? m_nItemWidthCount : 1];
    for (int i = 0; i < m_nItemWidthCount; ++i)
    {
        HDITEM item = {};
        item.mask = HDI_WIDTH;
        m_pItemWidths[i] = GetItem(i, &item) ? item.cxy : 0;
    }
}

void KVXHeaderCtrlEx::MoveDropMarker(int x)
{
    const HeaderGeometry::DropPosition drop = HeaderGeometry::FindDropPosition(x, m_pItemWidths,
        m_nItemWidthCount);
    if (drop.position == m_nDropPosition)
        return;
    m_nDropPosition = drop.position;
    InvalidateRect(&m_rcMarker, TRUE);

    CRect rcWindow;
    GetWindowRect(&rcWindow);
    const HeaderGeometry::DropMarker marker = HeaderGeometry::MakeDropMarker(drop.edge, rcWindow.Height());
    CClientDC dc(this);
    dc.Polygon(marker.points, 3);
    m_rcMarker = marker.bounds;
}

void KVXHeaderCtrlEx::EndDrag()
{
    delete[] m_pItemWidths;
    m_pItemWidths = NULL;
    m_nItemWidthCount = 0;
    if (GetCapture() == this)
        ::ReleaseCapture();
    InvalidateRect(&m_rcMarker, TRUE);
    ::SetRectEmpty(&m_rcMarker);
}
