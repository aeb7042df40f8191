// CCmdTarget's COM side (reference count, interface look-up) and the OLE
// initialisation of the application.
#include "wndimpl.h"

#include <afxole.h>

/////////////////////////////////////////////////////////////////////////////
// CCmdTarget: interfaces and reference count

const AFX_INTERFACEMAP_ENTRY CCmdTarget::_interfaceEntries[] =
{
    { NULL, (size_t)-1 }
};

const AFX_INTERFACEMAP CCmdTarget::interfaceMap =
{
    NULL, &CCmdTarget::_interfaceEntries[0]
};

const AFX_INTERFACEMAP* PASCAL CCmdTarget::GetThisInterfaceMap()
{
    return &CCmdTarget::interfaceMap;
}

const AFX_INTERFACEMAP* CCmdTarget::GetInterfaceMap() const
{
    return &CCmdTarget::interfaceMap;
}

// IUnknown is the first interface of the most derived map that has one: no
// part implements IUnknown alone.
LPUNKNOWN CCmdTarget::GetInterface(const void* iid)
{
    if (iid == NULL)
        return NULL;
    const IID& riid = *(const IID*)iid;
    BOOL bUnknown = IsEqualIID(riid, IID_IUnknown);
    for (const AFX_INTERFACEMAP* pMap = GetInterfaceMap(); pMap != NULL;
         pMap = pMap->pfnGetBaseMap != NULL ? (*pMap->pfnGetBaseMap)() : NULL)
    {
        for (const AFX_INTERFACEMAP_ENTRY* pEntry = pMap->pEntry; pEntry->piid != NULL; ++pEntry)
        {
            if (bUnknown || IsEqualIID(riid, *(const IID*)pEntry->piid))
                return (LPUNKNOWN)((BYTE*)this + pEntry->nOffset);
        }
    }
    return NULL;
}

DWORD CCmdTarget::InternalQueryInterface(const void* iid, LPVOID* ppvObj)
{
    if (ppvObj == NULL)
        return (DWORD)E_POINTER;
    *ppvObj = GetInterface(iid);
    if (*ppvObj == NULL)
        return (DWORD)E_NOINTERFACE;
    ExternalAddRef();
    return S_OK;
}

DWORD CCmdTarget::InternalAddRef()
{
    return (DWORD)::InterlockedIncrement(&m_dwRef);
}

DWORD CCmdTarget::InternalRelease()
{
    if (m_dwRef == 0)
        return 0;   // an unbalanced Release after the final one
    LONG lResult = ::InterlockedDecrement(&m_dwRef);
    if (lResult == 0)
        OnFinalRelease();
    return (DWORD)lResult;
}

// Not aggregated: the external and internal counts are one.
DWORD CCmdTarget::ExternalQueryInterface(const void* iid, LPVOID* ppvObj)
{
    return InternalQueryInterface(iid, ppvObj);
}

DWORD CCmdTarget::ExternalAddRef()
{
    return InternalAddRef();
}

DWORD CCmdTarget::ExternalRelease()
{
    return InternalRelease();
}

void CCmdTarget::OnFinalRelease()
{
    // temporary objects made while the object goes must not be freed under it
    AfxLockTempMaps();
    delete this;
    AfxUnlockTempMaps();
}

/////////////////////////////////////////////////////////////////////////////
// OLE initialisation

// Whether AfxOleInit initialised OLE on this thread (and AfxOleTerm must end it).
static thread_local BOOL t_bOleNeedTerm = FALSE;

BOOL AFXAPI AfxOleInit()
{
    // OleInitialize counts its calls: a second AfxOleInit would need a second
    // AfxOleTerm that nothing makes, so it only confirms the first.
    if (t_bOleNeedTerm)
        return TRUE;
    if (FAILED(::OleInitialize(NULL)))
        return FALSE;
    t_bOleNeedTerm = TRUE;

    // AfxWinTerm ends OLE through the thread object.
    if (CWinThread* pThread = AfxGetThread())
        pThread->m_lpfnOleTermOrFreeLib = &AfxOleTermOrFreeLib;
    return TRUE;
}

void AFXAPI AfxOleTerm(BOOL bJustRevoke)
{
    if (bJustRevoke || !t_bOleNeedTerm)
        return;
    t_bOleNeedTerm = FALSE;
    ::OleUninitialize();
}

// bTerm FALSE: the idle-time call, which frees the COM libraries no longer used.
void AFXAPI AfxOleTermOrFreeLib(BOOL bTerm, BOOL bJustRevoke)
{
    if (bTerm)
        AfxOleTerm(bJustRevoke);
    else
        ::CoFreeUnusedLibraries();
}
