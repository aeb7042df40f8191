// Module state, thread state and the look-ups that walk the extension DLL chain.
#include "wndimpl.h"
#include <afxcmn.h>
#include <string>

/////////////////////////////////////////////////////////////////////////////
// Module state: one for the process. Built on first use, because static
// constructors of this DLL register their classes before anything else runs.

AFX_MODULE_STATE::AFX_MODULE_STATE()
    : m_pCurrentWinApp(NULL), m_hCurrentInstanceHandle(::GetModuleHandleW(NULL)),
      m_hCurrentResourceHandle(::GetModuleHandleW(NULL)), m_lpszCurrentAppName(NULL),
      m_bDLL(FALSE), m_bSystem(FALSE), m_pClassInit(NULL), m_pFactoryInit(NULL),
      m_nObjectCount(0), m_bUserCtrl(FALSE), m_fRegisteredClasses(0)
{
    m_classList.Construct(offsetof(CRuntimeClass, m_pNextClass));
    m_libraryList.Construct(offsetof(CDynLinkLibrary, m_pNextDLL));
    // The factory list's link offset is set by the OLE classes; only its head is
    // saved and restored here.
}

AFX_MODULE_STATE* AFXAPI AfxGetModuleState()
{
    static AFX_MODULE_STATE s_moduleState;
    return &s_moduleState;
}

AFX_MODULE_STATE* AFXAPI AfxGetAppModuleState()
{
    return AfxGetModuleState();
}

AFX_MODULE_STATE* AFXAPI AfxGetStaticModuleState()
{
    return AfxGetModuleState();
}

/////////////////////////////////////////////////////////////////////////////
// Thread state: allocated on first use per thread, freed at thread detach.

static DWORD s_tlsIndex = TLS_OUT_OF_INDEXES;

static DWORD TlsIndex()
{
    if (s_tlsIndex == TLS_OUT_OF_INDEXES)
    {
        DWORD dwIndex = ::TlsAlloc();
        if (dwIndex == TLS_OUT_OF_INDEXES)
            AfxThrowMemoryException();
        if (::InterlockedCompareExchange((LONG*)&s_tlsIndex, (LONG)dwIndex,
                (LONG)TLS_OUT_OF_INDEXES) != (LONG)TLS_OUT_OF_INDEXES)
            ::TlsFree(dwIndex);
    }
    return s_tlsIndex;
}

AFX_MODULE_THREAD_STATE::AFX_MODULE_THREAD_STATE()
    : m_pCurrentWinThread(NULL), m_pmapHWND(NULL), m_nTempMapLock(0)
{
}

_AFX_THREAD_STATE::_AFX_THREAD_STATE()
    : m_pWndInit(NULL), m_hHookOldCbtFilter(NULL), m_nMsgLast(0),
      m_hLockoutNotifyWindow(NULL)
{
    memset(&m_lastSentMsg, 0, sizeof(m_lastSentMsg));
    memset(&m_msgCur, 0, sizeof(m_msgCur));
    m_ptCursorLast.x = m_ptCursorLast.y = 0;
    m_szTempClassName[0] = 0;
}

_AFX_THREAD_STATE* AFXAPI AfxGetThreadState()
{
    DWORD dwIndex = TlsIndex();
    _AFX_THREAD_STATE* pState = (_AFX_THREAD_STATE*)::TlsGetValue(dwIndex);
    if (pState == NULL)
    {
        pState = new _AFX_THREAD_STATE;
        ::TlsSetValue(dwIndex, pState);
    }
    return pState;
}

AFX_MODULE_THREAD_STATE* AFXAPI AfxGetModuleThreadState()
{
    return &AfxGetThreadState()->m_moduleThreadState;
}

void AFXAPI AfxTermThreadState()
{
    if (s_tlsIndex == TLS_OUT_OF_INDEXES)
        return;
    _AFX_THREAD_STATE* pState = (_AFX_THREAD_STATE*)::TlsGetValue(s_tlsIndex);
    if (pState == NULL)
        return;
    if (pState->m_hHookOldCbtFilter != NULL)
    {
        ::UnhookWindowsHookEx(pState->m_hHookOldCbtFilter);
        pState->m_hHookOldCbtFilter = NULL;
    }
    delete pState->m_moduleThreadState.m_pmapHWND;
    pState->m_moduleThreadState.m_pmapHWND = NULL;
    ::TlsSetValue(s_tlsIndex, NULL);
    delete pState;
}

void AFXAPI AfxTermModuleState()
{
    // CDynLinkLibrary objects still in the chain (inserted by DLLs that never
    // removed them) are freed here; their destructors unlink them.
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    while (CDynLinkLibrary* pDLL = pModuleState->m_libraryList.GetHead())
        delete pDLL;
    AfxTermThreadState();
    if (s_tlsIndex != TLS_OUT_OF_INDEXES)
    {
        ::TlsFree(s_tlsIndex);
        s_tlsIndex = TLS_OUT_OF_INDEXES;
    }
}

/////////////////////////////////////////////////////////////////////////////
// Temporary objects

void AFXAPI AfxDeleteTempObjects()
{
    if (CHandleMap* pMap = afxMapHWND())
        pMap->DeleteTemp();
    CImageList::DeleteTempMap();
    CDC::DeleteTempMap();
    CGdiObject::DeleteTempMap();
}

void AFXAPI AfxLockTempMaps()
{
    ++AfxGetModuleThreadState()->m_nTempMapLock;
}

BOOL AFXAPI AfxUnlockTempMaps(BOOL bDeleteTemps)
{
    AFX_MODULE_THREAD_STATE* pState = AfxGetModuleThreadState();
    if (pState->m_nTempMapLock == 0)
        return FALSE;
    if (--pState->m_nTempMapLock == 0)
    {
        if (bDeleteTemps)
            AfxDeleteTempObjects();
        return TRUE;
    }
    return FALSE;
}

/////////////////////////////////////////////////////////////////////////////
// Instance and resource handles

HINSTANCE AFXAPI AfxGetInstanceHandle()
{
    return AfxGetModuleState()->m_hCurrentInstanceHandle;
}

HINSTANCE AFXAPI AfxGetResourceHandle()
{
    return AfxGetModuleState()->m_hCurrentResourceHandle;
}

void AFXAPI AfxSetResourceHandle(HINSTANCE hInstResource)
{
    AfxGetModuleState()->m_hCurrentResourceHandle = hInstResource;
}

LPCTSTR AFXAPI AfxGetAppName()
{
    return AfxGetModuleState()->m_lpszCurrentAppName;
}

// The current resource handle first, then every extension DLL in the chain
// (most recently inserted first), then the framework's own record; the
// application's handle if nobody has the resource.
HINSTANCE AFXAPI AfxFindResourceHandle(LPCTSTR lpszName, LPCTSTR lpszType)
{
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    HINSTANCE hInst = AfxGetResourceHandle();
    if (hInst != NULL && ::FindResource(hInst, lpszName, lpszType) != NULL)
        return hInst;

    for (int nPass = 0; nPass < 2; ++nPass)
    {
        BOOL bSystem = (nPass == 1);
        for (CDynLinkLibrary* pDLL = pModuleState->m_libraryList; pDLL != NULL;
             pDLL = pDLL->m_pNextDLL)
        {
            if (!pDLL->m_bSystem != !bSystem || pDLL->m_hResource == NULL)
                continue;
            if (::FindResource(pDLL->m_hResource, lpszName, lpszType) != NULL)
                return pDLL->m_hResource;
        }
    }
    return AfxGetResourceHandle();
}

/////////////////////////////////////////////////////////////////////////////
// Run-time class registration and look-up by name

void AFXAPI AfxClassInit(CRuntimeClass* pNewClass)
{
    if (pNewClass != NULL)
        AfxGetModuleState()->m_classList.AddHead(pNewClass);
}

static CRuntimeClass* FindClassInList(const CTypedSimpleList<CRuntimeClass*>& list, LPCSTR lpszClassName)
{
    for (CRuntimeClass* pClass = list; pClass != NULL; pClass = pClass->m_pNextClass)
    {
        if (pClass->m_lpszClassName != NULL && lstrcmpA(lpszClassName, pClass->m_lpszClassName) == 0)
            return pClass;
    }
    return NULL;
}

CRuntimeClass* PASCAL CRuntimeClass::FromName(LPCSTR lpszClassName)
{
    if (lpszClassName == NULL)
        return NULL;
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    if (CRuntimeClass* pClass = FindClassInList(pModuleState->m_classList, lpszClassName))
        return pClass;
    for (CDynLinkLibrary* pDLL = pModuleState->m_libraryList; pDLL != NULL; pDLL = pDLL->m_pNextDLL)
    {
        if (CRuntimeClass* pClass = FindClassInList(pDLL->m_classList, lpszClassName))
            return pClass;
    }
    return NULL;
}

CRuntimeClass* PASCAL CRuntimeClass::FromName(LPCWSTR lpszClassName)
{
    if (lpszClassName == NULL)
        return NULL;
    int nLen = ::WideCharToMultiByte(CP_ACP, 0, lpszClassName, -1, NULL, 0, NULL, NULL);
    if (nLen <= 0)
        return NULL;
    std::string strName((size_t)nLen, '\0');
    ::WideCharToMultiByte(CP_ACP, 0, lpszClassName, -1, &strName[0], nLen, NULL, NULL);
    return FromName(strName.c_str());
}
