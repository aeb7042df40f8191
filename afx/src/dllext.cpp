// Extension DLLs: the module record and the CDynLinkLibrary chain.
#include "wndimpl.h"

IMPLEMENT_DYNAMIC(CDynLinkLibrary, CCmdTarget)

// Moves the classes registered by the DLL's static constructors (collected in an
// emptied list by the raw entry point of afxdllx.h) into the record, and gives the
// host its own lists back.
BOOL AFXAPI AfxInitExtensionModule(AFX_EXTENSION_MODULE& state, HMODULE hModule)
{
    if (state.bInitialized)
        return TRUE;
    state.bInitialized = TRUE;
    state.hModule = hModule;
    state.hResource = hModule;

    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    state.pFirstSharedClass = pModuleState->m_classList.GetHead();
    pModuleState->m_classList.m_pHead = pModuleState->m_pClassInit;
    state.pFirstSharedFactory = pModuleState->m_factoryList.GetHead();
    pModuleState->m_factoryList.m_pHead = pModuleState->m_pFactoryInit;
    return TRUE;
}

// Frees the CDynLinkLibrary objects of this module (of every module with bAll).
void AFXAPI AfxTermExtensionModule(AFX_EXTENSION_MODULE& state, BOOL bAll)
{
    if (!state.bInitialized)
        return;
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    CDynLinkLibrary* pDLL = pModuleState->m_libraryList;
    while (pDLL != NULL)
    {
        CDynLinkLibrary* pNextDLL = pDLL->m_pNextDLL;
        if (bAll || pDLL->m_hModule == state.hModule)
            delete pDLL;    // unlinks itself
        pDLL = pNextDLL;
    }
}

CDynLinkLibrary::CDynLinkLibrary(AFX_EXTENSION_MODULE& state, BOOL bSystem)
    : m_hModule(state.hModule), m_hResource(state.hResource), m_bSystem(bSystem),
      m_pNextDLL(NULL)
{
    m_classList.Construct(offsetof(CRuntimeClass, m_pNextClass));
    m_classList.m_pHead = state.pFirstSharedClass;
    m_factoryList.m_pHead = state.pFirstSharedFactory;

    // Extensions go in front: the newest DLL is searched first.
    AfxGetModuleState()->m_libraryList.AddHead(this);
}

CDynLinkLibrary::~CDynLinkLibrary()
{
    AfxGetModuleState()->m_libraryList.Remove(this);
}
