// CHandleMap: per-thread map from window handles to CWnd objects.
#include "wndimpl.h"

CHandleMap::~CHandleMap()
{
    DeleteTemp();
}

CWnd* CHandleMap::LookupPermanent(HWND hWnd) const
{
    auto it = m_permanentMap.find(hWnd);
    return it == m_permanentMap.end() ? NULL : it->second;
}

CWnd* CHandleMap::LookupTemporary(HWND hWnd) const
{
    auto it = m_temporaryMap.find(hWnd);
    return it == m_temporaryMap.end() ? NULL : it->second;
}

CWnd* CHandleMap::FromHandle(HWND hWnd)
{
    if (hWnd == NULL)
        return NULL;
    if (CWnd* pWnd = LookupPermanent(hWnd))
        return pWnd;
    if (CWnd* pWnd = LookupTemporary(hWnd))
        return pWnd;

    CWnd* pTemp = new CWnd;
    pTemp->m_hWnd = hWnd;
    m_temporaryMap[hWnd] = pTemp;
    return pTemp;
}

void CHandleMap::SetPermanent(HWND hWnd, CWnd* pWnd)
{
    m_permanentMap[hWnd] = pWnd;
}

void CHandleMap::RemoveHandle(HWND hWnd)
{
    m_permanentMap.erase(hWnd);
}

void CHandleMap::DeleteTemp()
{
    // Taken out first: a destructor must not see the map half-changed.
    std::unordered_map<HWND, CWnd*> doomed;
    doomed.swap(m_temporaryMap);
    for (auto& entry : doomed)
    {
        entry.second->m_hWnd = NULL;   // the window is not ours to destroy
        delete entry.second;
    }
}

CHandleMap* AFXAPI afxMapHWND(BOOL bCreate)
{
    AFX_MODULE_THREAD_STATE* pState = AfxGetModuleThreadState();
    if (pState->m_pmapHWND == NULL && bCreate)
        pState->m_pmapHWND = new CHandleMap;
    return pState->m_pmapHWND;
}
