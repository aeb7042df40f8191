// What every benchmark shares: a millisecond clock, the median of repeated runs, and the
// start-up of the framework and the library with a hidden parent window.
#pragma once

#include <afxwin.h>

#include "OrvaneControls.h"

#include <algorithm>
#include <cstdio>
#include <vector>

namespace bench {

inline double NowMs()
{
    static LARGE_INTEGER frequency = {};
    if (frequency.QuadPart == 0)
        ::QueryPerformanceFrequency(&frequency);
    LARGE_INTEGER counter;
    ::QueryPerformanceCounter(&counter);
    return static_cast<double>(counter.QuadPart) * 1000.0 / static_cast<double>(frequency.QuadPart);
}

inline double Median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

// Starts the framework, loads the library and creates the hidden parent of the measured
// controls; false (with a line printed) when the framework does not start.
inline bool Start(CWnd& parent, LPCTSTR pszTitle, int cx, int cy)
{
    if (!AfxWinInit(::GetModuleHandle(NULL), NULL, ::GetCommandLine(), SW_HIDE))
    {
        std::printf("framework start-up failed\n");
        return false;
    }
    LoadOrvaneControlsLibrary();
    return parent.CreateEx(0, AfxRegisterWndClass(0), pszTitle, WS_POPUP, 0, 0, cx, cy, NULL, NULL) != FALSE;
}

} // namespace bench
