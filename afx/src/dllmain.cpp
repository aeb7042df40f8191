// Entry point of the framework DLL: per-thread state is freed as threads end,
// and whatever the extension chain still holds is freed at unload.
#include "wndimpl.h"

BOOL WINAPI DllMain(HINSTANCE, DWORD dwReason, LPVOID)
{
    switch (dwReason)
    {
    case DLL_THREAD_DETACH:
        AfxTermThreadState();
        break;
    case DLL_PROCESS_DETACH:
        AfxTermModuleState();
        break;
    default:
        break;
    }
    return TRUE;
}
