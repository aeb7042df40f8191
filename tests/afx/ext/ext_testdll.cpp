// The test extension DLL: raw entry from afxdllx.h, module record filled on
// process attach, released on detach.
#include <afxdllx.h>

#include "ext_testdll.h"

static AFX_EXTENSION_MODULE extTestDLL = { FALSE, NULL, NULL, NULL, NULL };

IMPLEMENT_DYNCREATE(CExtTestObject, CObject)

CExtTestObject::CExtTestObject() : m_nMagic(4711)
{
}

extern "C" BOOL WINAPI DllMain(HINSTANCE hInstance, DWORD dwReason, LPVOID)
{
    if (dwReason == DLL_PROCESS_ATTACH)
    {
        if (!AfxInitExtensionModule(extTestDLL, hInstance))
            return FALSE;
    }
    else if (dwReason == DLL_PROCESS_DETACH)
    {
        AfxTermExtensionModule(extTestDLL);
    }
    return TRUE;
}

extern "C" void ExtTestLoad()
{
    new CDynLinkLibrary(extTestDLL);
}

extern "C" AFX_EXTENSION_MODULE* ExtTestModule()
{
    return &extTestDLL;
}
