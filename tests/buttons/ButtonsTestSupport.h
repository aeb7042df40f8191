// Test harness of the buttons family: a framework parent window that reflects control
// notifications (as a host's dialog does), a colour well on one with a spy for its colour
// messages, and colours named by letters and printed as hex in failures.
#pragma once

#include <afxwin.h>

#include <gtest/gtest.h>

#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "Input.h"
#include "KVXColorWell.h"
#include "MsgSequence.h"
#include "OrvaneLibrary.h"
#include "Pixels.h"

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

// r g b pure red, green, blue; F face, H highlight, S shadow; y grey 0x808080, k black, w white.
inline COLORREF Colour(char c)
{
    switch (c)
    {
    case 'r': return RGB(255, 0, 0);
    case 'g': return RGB(0, 255, 0);
    case 'b': return RGB(0, 0, 255);
    case 'F': return Face();
    case 'H': return Hi();
    case 'S': return Sh();
    case 'y': return 0x808080;
    case 'k': return 0;
    default: return 0xFFFFFF;
    }
}

// An 80 x 24 colour well at (20, 20) on a parent whose client area starts at (100, 100) on
// screen, with a spy for its WM_KVX_COLORWELLCHANGED; Close and Open make both again.
class WellFixture : public ::testing::Test
{
protected:
    static constexpr UINT kWellId = 2001;

    void SetUp() override { Open(); }
    void TearDown() override
    {
        Close();
        ::ReleaseCapture();
    }
    void Open()
    {
        m_parent = std::make_unique<TestParent>(100, 100);
        ASSERT_TRUE(m_well.Create(_T(""), WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_OWNERDRAW, CRect(20, 20, 100, 44),
                                  m_parent.get(), kWellId));
        m_spy = std::make_unique<orvane_test::NotifySpy>(m_parent->m_hWnd, WM_KVX_COLORWELLCHANGED,
                                                         sizeof(KVXColorWellNotify), false, WM_KVX_COLORWELLCHANGED);
    }
    void Close()
    {
        m_spy.reset();
        m_well.DestroyWindow();
        m_parent.reset();
    }
    // The colour of the i-th message and its record; the well's own handle and id in it.
    COLORREF Notified(size_t i) const
    {
        const auto* n = reinterpret_cast<const KVXColorWellNotify*>(m_spy->payloads().at(i).data());
        EXPECT_EQ(kWellId, m_spy->senders().at(i));
        EXPECT_EQ(m_well.m_hWnd, n->hdr.hwndFrom);
        EXPECT_EQ(kWellId, n->hdr.idFrom);
        return n->clrColor;
    }

    std::unique_ptr<TestParent> m_parent;
    KVXColorWell m_well;
    std::unique_ptr<orvane_test::NotifySpy> m_spy;
};

} // namespace buttons_test
