// CHandleMap: per-thread map from window handles to CWnd objects.
#include "wndimpl.h"
#include <vector>

CHandleMap::~CHandleMap()
{
    DeleteTemp(0);
}

CWnd* CHandleMap::LookupPermanent(HWND hWnd) const
{
    auto it = m_permanentMap.find(hWnd);
    return it == m_permanentMap.end() ? NULL : it->second;
}

CWnd* CHandleMap::LookupTemporary(HWND hWnd) const
{
    auto it = m_temporaryMap.find(hWnd);
    return it == m_temporaryMap.end() ? NULL : it->second.pWnd;
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
    m_temporaryMap[hWnd] = TempEntry{pTemp, ++m_nGeneration};
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

void CHandleMap::DeleteTemp(unsigned nAfter)
{
    // Collect first: a destructor must not see the map half-changed.
    std::vector<CWnd*> doomed;
    for (auto it = m_temporaryMap.begin(); it != m_temporaryMap.end();)
    {
        if (it->second.nGeneration > nAfter)
        {
            doomed.push_back(it->second.pWnd);
            it = m_temporaryMap.erase(it);
        }
        else
            ++it;
    }
    for (CWnd* pTemp : doomed)
    {
        pTemp->m_hWnd = NULL;   // the window is not ours to destroy
        delete pTemp;
    }
}

CHandleMap* AFXAPI afxMapHWND(BOOL bCreate)
{
    AFX_MODULE_THREAD_STATE* pState = AfxGetModuleThreadState();
    if (pState->m_pmapHWND == NULL && bCreate)
        pState->m_pmapHWND = new CHandleMap;
    return pState->m_pmapHWND;
}
