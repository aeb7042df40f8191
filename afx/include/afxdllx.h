// afxdllx.h - raw entry point of an extension DLL. Include it in exactly one
// source file of the DLL and link the DLL with -Wl,-e,ExtRawDllMain.
//
// The raw entry runs before the DLL's static constructors: it sets the shared
// module state's class and factory lists aside and empties them, so that the
// classes those constructors register are collected for this DLL alone;
// AfxInitExtensionModule (called from DllMain) moves them into the DLL's record
// and puts the saved lists back. The C runtime's own entry then runs the
// constructors and DllMain.
#pragma once

#ifndef __AFXDLLX_H__
#define __AFXDLLX_H__

#include <afxwin.h>

extern "C" BOOL WINAPI DllMainCRTStartup(HANDLE hDllHandle, DWORD dwReason, LPVOID lpReserved);

extern "C" BOOL WINAPI ExtRawDllMain(HINSTANCE hInstance, DWORD dwReason, LPVOID lpReserved)
{
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    if (dwReason == DLL_PROCESS_ATTACH)
    {
        // Keep the framework loaded for as long as this DLL is.
        ::LoadLibraryW(L"OrvaneAfxU.dll");
        pModuleState->m_pClassInit = pModuleState->m_classList;
        pModuleState->m_pFactoryInit = pModuleState->m_factoryList;
        pModuleState->m_classList.m_pHead = NULL;
        pModuleState->m_factoryList.m_pHead = NULL;
    }

    BOOL bResult = DllMainCRTStartup(hInstance, dwReason, lpReserved);

    if (dwReason == DLL_PROCESS_ATTACH && !bResult)
    {
        // The load fails: give the host its lists back, whatever DllMain did.
        pModuleState->m_classList.m_pHead = pModuleState->m_pClassInit;
        pModuleState->m_factoryList.m_pHead = pModuleState->m_pFactoryInit;
        ::FreeLibrary(::GetModuleHandleW(L"OrvaneAfxU.dll"));
    }
    else if (dwReason == DLL_PROCESS_DETACH)
    {
        ::FreeLibrary(::GetModuleHandleW(L"OrvaneAfxU.dll"));
    }
    return bResult;
}

#endif // __AFXDLLX_H__
