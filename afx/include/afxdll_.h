// afxdll_.h - extension DLLs: the module record and the chain of loaded libraries
// searched for resources and run-time classes. Included by afxwin.h.
#pragma once

#ifndef __AFXDLL_H__
#define __AFXDLL_H__

// Filled by AfxInitExtensionModule from the DLL's entry point.
struct AFX_EXTENSION_MODULE
{
    BOOL bInitialized;
    HMODULE hModule;
    HMODULE hResource;
    CRuntimeClass* pFirstSharedClass;
    COleObjectFactory* pFirstSharedFactory;
};

// One per extension DLL inserted into the module state's chain.
class CDynLinkLibrary : public CCmdTarget
{
    DECLARE_DYNAMIC(CDynLinkLibrary)
public:
// Constructor
    explicit CDynLinkLibrary(AFX_EXTENSION_MODULE& state, BOOL bSystem = FALSE);

// Attributes
    HMODULE m_hModule;
    HMODULE m_hResource;                // for shared resources
    CTypedSimpleList<CRuntimeClass*> m_classList;
    CTypedSimpleList<COleObjectFactory*> m_factoryList;
    BOOL m_bSystem;                     // TRUE only for the framework's own record

// Implementation
public:
    CDynLinkLibrary* m_pNextDLL;        // simple singly linked list
    virtual ~CDynLinkLibrary();
};

BOOL AFXAPI AfxInitExtensionModule(AFX_EXTENSION_MODULE&, HMODULE hMod);
void AFXAPI AfxTermExtensionModule(AFX_EXTENSION_MODULE&, BOOL bAll = FALSE);

#endif // __AFXDLL_H__
