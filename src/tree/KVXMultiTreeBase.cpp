#include "KVXMultiTreeBase.h"

IMPLEMENT_DYNCREATE(KVXMultiTreeBase, CTreeCtrl)

BEGIN_MESSAGE_MAP(KVXMultiTreeBase, CTreeCtrl)
END_MESSAGE_MAP()

KVXMultiTreeBase::KVXMultiTreeBase()
{
}

KVXMultiTreeBase::~KVXMultiTreeBase()
{
}

BOOL KVXMultiTreeBase::SetItemState(HTREEITEM hItem, UINT nState, UINT nStateMask)
{
    if (hItem == NULL)
        return FALSE;
    const UINT nOldState = CTreeCtrl::GetItemState(hItem, nStateMask);
    const BOOL bResult = CTreeCtrl::SetItem(hItem, TVIF_STATE, NULL, 0, 0, nState, nStateMask, 0);
    if (!bResult || !(nStateMask & TVIS_SELECTED))
        return bResult;

    const bool bWasSelected = (nOldState & TVIS_SELECTED) != 0;
    const bool bIsSelected = (nState & TVIS_SELECTED) != 0;
    if (bIsSelected != bWasSelected)
        OnItemSelected(hItem, bIsSelected);
    return bResult;
}

void KVXMultiTreeBase::OnItemSelected(HTREEITEM /*hItem*/, bool /*bSelected*/)
{
}
