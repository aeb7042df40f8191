// KVXHeaderCtrlDropTarget: insertion marker and drops on a drag header.
#include "KVXHeaderCtrlDropTarget.h"

#include "ColumnDragGeometry.h"
#include "ColumnDragSupport.h"
#include "KVXColumnInfo.h"
#include "KVXColumnNotify.h"
#include "KVXHeaderCtrlClipboardFormats.h"

#include <vector>

namespace {

CHeaderCtrl* AsHeader(CWnd* pWnd)
{
    return pWnd != NULL && pWnd->IsKindOf(RUNTIME_CLASS(CHeaderCtrl)) ? static_cast<CHeaderCtrl*>(pWnd) : NULL;
}

} // namespace

KVXHeaderCtrlDropTarget::KVXHeaderCtrlDropTarget()
    : m_pMessageWnd(NULL), m_rectMarkTop(0, 0, 0, 0), m_rectMarkBottom(0, 0, 0, 0)
{
}

KVXHeaderCtrlDropTarget::~KVXHeaderCtrlDropTarget()
{
}

void KVXHeaderCtrlDropTarget::SetMessageWnd(CWnd* pWnd)
{
    m_pMessageWnd = pWnd;
}

DROPEFFECT KVXHeaderCtrlDropTarget::OnDragEnter(CWnd* pWnd, COleDataObject* pDataObject, DWORD dwKeyState,
    CPoint point)
{
    m_rectMarkTop.SetRectEmpty();
    m_rectMarkBottom.SetRectEmpty();
    return OnDragOver(pWnd, pDataObject, dwKeyState, point);
}

DROPEFFECT KVXHeaderCtrlDropTarget::OnDragOver(CWnd* pWnd, COleDataObject* pDataObject, DWORD, CPoint point)
{
    CHeaderCtrl* pHeader = AsHeader(pWnd);
    CWnd* pParent = pHeader != NULL ? pHeader->GetParent() : NULL;
    if (pParent == NULL || pDataObject == NULL
        || !pDataObject->IsDataAvailable(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem)))
        return DROPEFFECT_NONE;

    int nIndex;
    CRect rectLine;
    if (!CheckPositionForHeader(pHeader, point, nIndex, rectLine))
    {
        EraseMarker(pParent);
        return DROPEFFECT_NONE;
    }

    const ColumnDragGeometry::InsertionMarker marker =
        ColumnDragGeometry::MakeInsertionMarker(rectLine.left, rectLine.top, rectLine.bottom);
    {
        CClientDC dc(pParent);
        CBrush brush(ColumnDragGeometry::kMarkerColor);
        dc.SelectObject(&brush);
        dc.SetPolyFillMode(WINDING);
        dc.Polygon(marker.top, 3);
        dc.Polygon(marker.bottom, 3);
        // the brush is deleted on leaving this block: the DC lets go of it first
        dc.SelectStockObject(NULL_BRUSH);
    }

    // The new triangles are drawn before the old areas are repainted.
    if (!m_rectMarkTop.EqualRect(&marker.topArea))
    {
        pParent->InvalidateRect(&m_rectMarkTop, TRUE);
        m_rectMarkTop = marker.topArea;
    }
    if (!m_rectMarkBottom.EqualRect(&marker.bottomArea))
    {
        pParent->InvalidateRect(&m_rectMarkBottom, TRUE);
        m_rectMarkBottom = marker.bottomArea;
    }
    pParent->UpdateWindow();
    return DROPEFFECT_MOVE;
}

BOOL KVXHeaderCtrlDropTarget::OnDrop(CWnd* pWnd, COleDataObject* pDataObject, DROPEFFECT dropEffect, CPoint point)
{
    CHeaderCtrl* pHeader = AsHeader(pWnd);
    if (pHeader == NULL || pDataObject == NULL || dropEffect != DROPEFFECT_MOVE)
        return FALSE;

    KVXColumnInfo column;
    bool bSortedColumn = false;
    const bool bRead = ReadDroppedColumn(pDataObject, column, &bSortedColumn);

    CWnd* pParent = pHeader->GetParent();
    if (pParent != NULL)
        EraseMarker(pParent);

    int nIndex;
    CRect rectLine;
    if (!bRead || !CheckPositionForHeader(pHeader, point, nIndex, rectLine))
        return FALSE;

    CWnd* pTarget = m_pMessageWnd != NULL ? m_pMessageWnd : pParent;
    if (pTarget == NULL)
        return FALSE;
    column.SetIndex(nIndex);
    KVXColumnNotify notify = {};
    notify.hdr.code = WM_KVX_INSERTCOLUMN;
    notify.pColumnInfo = &column;
    notify.bSortedColumn = bSortedColumn;
    pTarget->SendMessage(WM_KVX_INSERTCOLUMN, 0, reinterpret_cast<LPARAM>(&notify));
    return TRUE;
}

void KVXHeaderCtrlDropTarget::OnDragLeave(CWnd* pWnd)
{
    CHeaderCtrl* pHeader = AsHeader(pWnd);
    CWnd* pParent = pHeader != NULL ? pHeader->GetParent() : NULL;
    if (pParent != NULL)
        EraseMarker(pParent);
}

void KVXHeaderCtrlDropTarget::EraseMarker(CWnd* pParent)
{
    pParent->InvalidateRect(&m_rectMarkTop, TRUE);
    pParent->InvalidateRect(&m_rectMarkBottom, TRUE);
    pParent->UpdateWindow();
    m_rectMarkTop.SetRectEmpty();
    m_rectMarkBottom.SetRectEmpty();
}

bool KVXHeaderCtrlDropTarget::CheckPositionForHeader(CHeaderCtrl* pHeader, CPoint point, int& nIndex, CRect& rect)
{
    if (pHeader == NULL || !::IsWindow(pHeader->m_hWnd) || !pHeader->IsKindOf(RUNTIME_CLASS(CHeaderCtrl)))
        return false;

    CRect rectWindow;
    pHeader->GetWindowRect(&rectWindow);
    CPoint ptScreen = point;
    pHeader->ClientToScreen(&ptScreen);
    if (!rectWindow.PtInRect(ptScreen))
        return false;

    CWnd* pParent = pHeader->GetParent();
    const int nScroll = pParent != NULL ? pParent->GetScrollPos(SB_HORZ) : 0;
    rect = rectWindow;
    pHeader->ScreenToClient(&rect);

    const std::vector<int> widths = HeaderItemWidths(pHeader);
    const ColumnDragGeometry::InsertionPoint insertion = ColumnDragGeometry::FindInsertionPoint(point.x,
        widths.data(), static_cast<int>(widths.size()), nScroll);
    nIndex = insertion.index;
    rect.left = rect.right = insertion.lineX;
    return true;
}
