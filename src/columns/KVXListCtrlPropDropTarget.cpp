// KVXListCtrlPropDropTarget: drops on the column chooser.
#include "KVXListCtrlPropDropTarget.h"

#include "ColumnDragSupport.h"
#include "KVXColumnInfo.h"
#include "KVXColumnsPropPage.h"
#include "KVXHeaderCtrlClipboardFormats.h"

namespace {

// The page under the point (page client coordinates) if it is exactly a column
// chooser page (no derived class) whose list exists and holds the point.
KVXColumnsPropPage* PageAt(CWnd* pWnd, CPoint point)
{
    if (pWnd == NULL || pWnd->GetRuntimeClass() != RUNTIME_CLASS(KVXColumnsPropPage))
        return NULL;
    KVXColumnsPropPage* pPage = static_cast<KVXColumnsPropPage*>(pWnd);
    if (!::IsWindow(pPage->m_listColumns.m_hWnd))
        return NULL;
    CRect rectList;
    pPage->m_listColumns.GetWindowRect(&rectList);
    pPage->ClientToScreen(&point);
    return rectList.PtInRect(point) ? pPage : NULL;
}

} // namespace

KVXListCtrlPropDropTarget::KVXListCtrlPropDropTarget()
{
}

KVXListCtrlPropDropTarget::~KVXListCtrlPropDropTarget()
{
}

DROPEFFECT KVXListCtrlPropDropTarget::OnDragEnter(CWnd* pWnd, COleDataObject* pDataObject, DWORD dwKeyState,
    CPoint point)
{
    return OnDragOver(pWnd, pDataObject, dwKeyState, point);
}

DROPEFFECT KVXListCtrlPropDropTarget::OnDragOver(CWnd* pWnd, COleDataObject* pDataObject, DWORD, CPoint point)
{
    if (pDataObject == NULL
        || !pDataObject->IsDataAvailable(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem)))
        return DROPEFFECT_NONE;
    return PageAt(pWnd, point) != NULL ? DROPEFFECT_MOVE : DROPEFFECT_NONE;
}

BOOL KVXListCtrlPropDropTarget::OnDrop(CWnd* pWnd, COleDataObject* pDataObject, DROPEFFECT, CPoint point)
{
    KVXColumnsPropPage* pPage = PageAt(pWnd, point);
    if (pPage == NULL || pDataObject == NULL)
        return FALSE;
    KVXColumnInfo column;
    if (!ReadDroppedColumn(pDataObject, column, NULL))
        return FALSE;
    pPage->AddColumn(column);
    return TRUE;
}
