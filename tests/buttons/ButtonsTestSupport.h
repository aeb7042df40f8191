// Test harness of the buttons family: a framework parent window that reflects control
// notifications (as a host's dialog does) and colours printed as hex in failures.
#pragma once

#include <afxwin.h>

#include <cstdio>
#include <string>

#include "OrvaneLibrary.h"

namespace buttons_test {

// A visible top-level framework window whose client area's top-left corner is at (x, y)
// on screen; being a CWnd, it reflects WM_COMMAND and WM_DRAWITEM to the controls' objects.
class TestParent : public CWnd
{
public:
    explicit TestParent(int x = 100, int y = 100)
    {
        orvane_test::LoadLibraryOnce();
        CreateEx(0, AfxRegisterWndClass(CS_DBLCLKS, ::LoadCursor(NULL, IDC_ARROW), HBRUSH(COLOR_BTNFACE + 1)),
                 _T("buttons test parent"), WS_OVERLAPPEDWINDOW | WS_VISIBLE | WS_CLIPCHILDREN, 0, 0, 400, 300, NULL, NULL);
        MoveClientTo(x, y);
        ::SetForegroundWindow(m_hWnd);
        UpdateWindow();
    }
    ~TestParent() override
    {
        if (::IsWindow(m_hWnd))
            DestroyWindow();
    }
    void MoveClientTo(int x, int y)
    {
        CRect rc;
        GetWindowRect(&rc);
        CPoint client(0, 0);
        ClientToScreen(&client);
        SetWindowPos(NULL, rc.left + x - client.x, rc.top + y - client.y, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
    }
};

inline std::string Hex(COLORREF c)
{
    char buf[16];
    snprintf(buf, sizeof buf, "%06lX", static_cast<unsigned long>(c));
    return buf;
}

inline COLORREF Face() { return ::GetSysColor(COLOR_BTNFACE); }
inline COLORREF Hi() { return ::GetSysColor(COLOR_BTNHIGHLIGHT); }
inline COLORREF Sh() { return ::GetSysColor(COLOR_BTNSHADOW); }

} // namespace buttons_test
