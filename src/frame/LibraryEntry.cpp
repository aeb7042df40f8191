// Joins the library to the host process and to the framework's module chain.
#include <afxwin.h>
#include <afxdllx.h>

#include "OrvaneControls.h"

static AFX_EXTENSION_MODULE OrvaneControlsDLL = { FALSE, NULL };

extern "C" BOOL WINAPI DllMain(HINSTANCE hInstance, DWORD dwReason, LPVOID)
{
    if (dwReason == DLL_PROCESS_ATTACH)
    {
        if (!AfxInitExtensionModule(OrvaneControlsDLL, hInstance))
            return FALSE;
    }
    else if (dwReason == DLL_PROCESS_DETACH)
    {
        AfxTermExtensionModule(OrvaneControlsDLL);
    }
    return TRUE;
}

void LoadOrvaneControlsLibrary()
{
    // The framework's module chain owns and frees this object.
    new CDynLinkLibrary(OrvaneControlsDLL);
}
