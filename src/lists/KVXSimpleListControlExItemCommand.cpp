// KVXSimpleListControlExItemCommand: rows selected by their state.
#include "KVXSimpleListControlExItemCommand.h"

#include "KVXListCtrlEx.h"

KVXSimpleListControlExItemCommand::KVXSimpleListControlExItemCommand(KVXListCtrlEx& list)
    : m_pList(&list), m_nIdle(1), m_nStateMask(0), m_bSelect(true)
{
}

KVXSimpleListControlExItemCommand::KVXSimpleListControlExItemCommand(const KVXSimpleListControlExItemCommand& other)
    : KVXListCtrlExItemCommand(other), m_pList(other.m_pList), m_nIdle(other.m_nIdle),
      m_nStateMask(other.m_nStateMask), m_bSelect(other.m_bSelect)
{
}

KVXSimpleListControlExItemCommand::~KVXSimpleListControlExItemCommand()
{
}

bool KVXSimpleListControlExItemCommand::DoForItem(int nItem, bool&)
{
    if (m_nIdle)
        return true;
    const bool bMatches = m_pList->GetItemState(nItem, m_nStateMask) == m_nStateMask;
    m_pList->SetItemState(nItem, bMatches && m_bSelect ? LVIS_SELECTED : 0, LVIS_SELECTED);
    return true;
}

void KVXSimpleListControlExItemCommand::SelectItemsByState(unsigned int nStateMask, bool bSelect)
{
    m_nStateMask = nStateMask;
    m_bSelect = bSelect;
    m_nIdle = 0;
    m_pList->IterateItems(this);
    m_pList->RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_UPDATENOW | RDW_ERASE);
}
