// Tip windows driven as the system drives them: class under the library's instance; Show
// refuses while visible, without focus, for empty or fitting texts; at the monitor's edge the
// tool tip is clamped and wrapped, every line drawn and kept after the system's paint; hover
// edges; held buttons; clicks, keys and moves handed on (non-client form over a scroll bar),
// the title tip's through the message loop; no GDI object or window left behind.
#include <afxwin.h>

#include <gtest/gtest.h>

#include <utility>
#include <vector>

#include "Checks.h"
#include "Input.h"
#include "KVXTitleTipCtrl.h"
#include "KVXToolTipCtrl.h"
#include "MsgSequence.h"

namespace {

using namespace orvane_test;

// A borderless framework window (client = window rectangle) that answers WM_GETFONT.
class Owner : public CWnd
{
public:
    explicit Owner(const CRect& rc)
    {
        CreateEx(0, AfxRegisterWndClass(0), _T("tip owner"), WS_POPUP | WS_VISIBLE, rc, NULL, 0);
    }
    HFONT m_hFont = NULL;

protected:
    afx_msg LRESULT OnGetFont(WPARAM, LPARAM) { return reinterpret_cast<LRESULT>(m_hFont); }
    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(Owner, CWnd)
    ON_MESSAGE(WM_GETFONT, &Owner::OnGetFont)
END_MESSAGE_MAP()

const wchar_t kText[] = L"The whole text of a label that is cut off";
enum { kOwnerStream = 1, kNeighbourStream = 2 };


class TipWindowTest : public testing::Test
{
protected:
    void SetUp() override
    {
        ::GetMonitorInfo(::MonitorFromPoint(CPoint(0, 0), MONITOR_DEFAULTTOPRIMARY), &m_monitor);
        ::SetForegroundWindow(m_owner.m_hWnd);
        m_owner.SetFocus();
        ::SetCursorPos(100, 900);   // away from every window of the tests
        // The font of an owner without one.
        m_font.CreateFont(-11, 0, 0, 0, FW_NORMAL, 0, 0, 0, 0, 0, 0, 0, 0, _T("MS Shell Dlg"));
        PumpUntilIdle();
    }

    CSize Measure(const CString& text)
    {
        CClientDC dc(&m_owner);
        CFont* old = dc.SelectObject(&m_font);
        const CSize size = dc.GetTextExtent(text);
        dc.SelectObject(old);
        return size;
    }
    CRect Screen(CRect rc) const { m_owner.ClientToScreen(&rc); return rc; }
    static CRect WindowRect(CWnd& wnd) { CRect rc; wnd.GetWindowRect(&rc); return rc; }
    static LPARAM ClientParam(CWnd& wnd, CPoint pt) { wnd.ScreenToClient(&pt); return PointParam(pt.x, pt.y); }

    // A mouse move at a point of the owner's client area, as the capture delivers it to the
    // tip; returns whether the tip is still shown.
    bool MoveStays(CWnd& tip, CPoint point, UINT flags = 0)
    {
        m_owner.ClientToScreen(&point);
        tip.SendMessage(WM_MOUSEMOVE, flags, ClientParam(tip, point));
        return tip.IsWindowVisible() != FALSE;
    }

    MONITORINFO m_monitor = { sizeof(MONITORINFO) };
    Owner m_owner{ CRect(200, 200, 600, 500) };
    CFont m_font;
    MsgLog m_log;
};

TEST_F(TipWindowTest, ToolTipShowsOnlyWhenTheTextDoesNotFit)
{
    KVXToolTipCtrl tip;
    ASSERT_TRUE(tip.Create(&m_owner));
    TCHAR name[32];
    ::GetClassName(tip.m_hWnd, name, 32);
    EXPECT_STREQ(_T("ZKVXToolTip"), name);
    EXPECT_EQ(reinterpret_cast<ULONG_PTR>(::GetModuleHandle(_T("OrvaneControlsU.dll"))),
              ::GetClassLongPtr(tip.m_hWnd, GCLP_HMODULE));
    EXPECT_FALSE(tip.IsWindowVisible());

    const CSize text = Measure(kText);
    CRect area(10, 10, 10 + text.cx + 3, 30);
    tip.Show(area, area.TopLeft(), kText, false);
    EXPECT_FALSE(tip.IsWindowVisible()) << "fits";
    tip.Show(area, area.TopLeft(), L"", true);
    tip.Show(area, area.TopLeft(), nullptr, true);
    EXPECT_FALSE(tip.IsWindowVisible()) << "empty";
    ::SetFocus(NULL);
    tip.Show(area, area.TopLeft(), kText, true);
    EXPECT_FALSE(tip.IsWindowVisible()) << "no focus window";
    m_owner.SetFocus();

    area.right -= 1;
    tip.Show(area, area.TopLeft(), kText, false);
    ASSERT_TRUE(tip.IsWindowVisible()) << "one pixel wider than the area";
    const CRect screen = Screen(area);
    EXPECT_EQ(Str(CRect(screen.TopLeft(), CSize(text.cx + 3, area.Height()))), Str(WindowRect(tip)));
    EXPECT_EQ(tip.m_hWnd, ::GetCapture());
    tip.Show(area + CPoint(50, 50), area.TopLeft() + CPoint(50, 50), kText, true);
    EXPECT_EQ(screen.left, WindowRect(tip).left) << "a Show while visible does nothing";
    tip.Hide();
    EXPECT_FALSE(tip.IsWindowVisible());
    EXPECT_EQ(NULL, ::GetCapture());
}

TEST_F(TipWindowTest, AtTheMonitorEdgeTheToolTipIsClampedWrappedAndDrawn)
{
    const CRect& monitor = m_monitor.rcMonitor;
    m_owner.MoveWindow(monitor.right - 150, 300, 300, 200);
    const int lineHeight = Measure(kText).cy;
    // A text wider than the monitor: the tool tip gets the monitor's width and goes above the area.
    CString wide;
    while (Measure(wide).cx <= 3 * monitor.Width())
        wide += kText;
    const CRect area(0, 100, 100, 117);
    ::SetCursorPos(Screen(area).left + 5, Screen(area).top + 5);   // system moves keep the tip
    PumpUntilIdle();
    KVXToolTipCtrl tool;
    ASSERT_TRUE(tool.Create(&m_owner));
    tool.Show(area, area.TopLeft(), wide, false);
    ASSERT_TRUE(tool.IsWindowVisible());
    const CRect rcTool = WindowRect(tool);
    EXPECT_EQ(Str(CRect(monitor.left, rcTool.top, monitor.right, Screen(area).top - 5)), Str(rcTool));
    EXPECT_LE(4 * lineHeight + 1, rcTool.Height()) << "more than three monitor widths of text";

    // Every line is drawn and stays after the system has painted the tip.
    PumpUntilIdle();
    ASSERT_TRUE(tool.IsWindowVisible());
    CClientDC screen(NULL);
    CDC copy;
    CBitmap bitmap;
    copy.CreateCompatibleDC(&screen);
    bitmap.CreateCompatibleBitmap(&screen, rcTool.Width(), rcTool.Height());
    CBitmap* oldBitmap = copy.SelectObject(&bitmap);
    copy.BitBlt(0, 0, rcTool.Width(), rcTool.Height(), &screen, rcTool.left, rcTool.top, SRCCOPY);
    for (int line = 0; line < 4; ++line)
    {
        int textPixels = 0, backgroundPixels = 0;
        for (int y = 1 + line * lineHeight; y < 1 + (line + 1) * lineHeight; ++y)
            for (int x = 1; x < rcTool.Width() - 1; ++x)
            {
                const COLORREF c = copy.GetPixel(x, y);
                textPixels += c == screen.GetTextColor();   // the DC's default text colour
                backgroundPixels += c == ::GetSysColor(COLOR_INFOBK);
            }
        EXPECT_LT(line < 3 ? 100 : 1, textPixels) << "line " << line;
        EXPECT_LT(textPixels, backgroundPixels) << "line " << line;
    }
    copy.SelectObject(oldBitmap);
}

TEST_F(TipWindowTest, HoverEdgesHeldButtonsAndClicks)
{
    m_owner.m_hFont = static_cast<HFONT>(m_font.m_hObject);   // the owner's own font this time
    const CRect area(20, 40, 120, 57);
    KVXToolTipCtrl tool;
    KVXTitleTipCtrl title;
    ASSERT_TRUE(tool.Create(&m_owner));
    ASSERT_TRUE(title.Create(&m_owner));
    auto showTool = [&] { tool.Show(area, area.TopLeft(), kText, false); return tool.IsWindowVisible() != FALSE; };
    // The list passes the cell raised by one pixel: the title tip reaches one pixel below it.
    auto showTitle = [&] { title.Show(area, kText, 6); return title.IsWindowVisible() != FALSE; };
    const CPoint inside(area.left + 30, area.top + 5);
    const struct { CPoint point; UINT flags; bool toolStays, titleStays; } probes[] = {
        { CPoint(area.right, area.bottom), 0, true, true },
        { CPoint(area.left, area.top), 0, true, false },   // left of the title tip's text
        { CPoint(area.right + 1, area.top + 5), 0, false, false },
        { CPoint(area.left + 10, area.bottom + 1), 0, false, true },
        { CPoint(area.left + 10, area.bottom + 2), 0, false, false },
        { inside, MK_SHIFT, false, true },
        { inside, MK_LBUTTON, false, true },   // its hand-over is checked below
    };
    for (const auto& p : probes)
    {
        if (&p == &probes[6])
        {
            PumpUntilIdle();
            m_log.SpyWindow(m_owner.m_hWnd, kOwnerStream);
        }
        ASSERT_TRUE(showTitle());
        EXPECT_EQ(p.titleStays, MoveStays(title, p.point, p.flags)) << p.point.x << "," << p.point.y;
        title.ShowWindow(SW_HIDE);
        ASSERT_TRUE(showTool());
        EXPECT_EQ(p.toolStays, MoveStays(tool, p.point, p.flags)) << p.point.x << "," << p.point.y;
    }
    ASSERT_TRUE(showTool());
    tool.SendMessage(WM_RBUTTONDOWN, MK_RBUTTON, ClientParam(tool, Screen(area).TopLeft() + CPoint(34, 7)));
    EXPECT_FALSE(tool.IsWindowVisible());
    PumpUntilIdle();
    const MsgEntry handedOver[] = {
        { WM_GETFONT, Sent }, { WM_GETFONT, Sent }, { WM_GETFONT, Sent },   // one per Show
        { WM_MOUSEMOVE, WParam | LParam, MK_LBUTTON, PointParam(inside.x, inside.y) },
        { WM_RBUTTONDOWN, WParam | LParam, MK_RBUTTON, PointParam(area.left + 34, area.top + 7) },
        { 0 }
    };
    EXPECT_MSGS(m_log, kOwnerStream, handedOver);
    EXPECT_EQ(OBJ_FONT, static_cast<int>(::GetObjectType(m_font.m_hObject))) << "the owner's font is kept";
}

TEST_F(TipWindowTest, InTheMessageLoopKeysClicksAndMovesAreHandedOn)
{
    // A window beside the owner; a right click on its scroll bar opens no menu loop.
    HostWindow neighbour(300, 200, WS_OVERLAPPEDWINDOW | WS_VSCROLL | WS_VISIBLE);
    ::MoveWindow(neighbour, 650, 200, 300, 200, TRUE);
    CRect rcNeighbour;
    ::GetClientRect(neighbour, &rcNeighbour);
    ::MapWindowPoints(neighbour, NULL, reinterpret_cast<LPPOINT>(&rcNeighbour), 2);
    const CPoint bar(rcNeighbour.right + ::GetSystemMetrics(SM_CXVSCROLL) / 2, rcNeighbour.CenterPoint().y);
    m_owner.SetFocus();
    PumpUntilIdle();
    KVXTitleTipCtrl tip;
    ASSERT_TRUE(tip.Create(&m_owner));
    m_log.SpyWindow(m_owner.m_hWnd, kOwnerStream);
    m_log.SpyWindow(neighbour, kNeighbourStream);
    const CRect cell(20, 40, 120, 57);
    tip.Show(cell, kText, 6);
    const LPARAM keyParam = 0x00500001;
    const struct { UINT message; WPARAM wParam; LPARAM lParam; bool focus; } posted[] = {
        { WM_KEYDOWN, VK_DOWN, keyParam, true },
        { WM_LBUTTONDOWN, MK_LBUTTON, ClientParam(tip, Screen(cell).TopLeft() + CPoint(30, 5)), true },   // on the tip
        { WM_RBUTTONDOWN, MK_RBUTTON, ClientParam(tip, bar), true },
        { WM_MOUSEMOVE, 0, ClientParam(tip, bar), true },   // not pre-translated
        { WM_USER, 0, 0, false },
    };
    for (const auto& p : posted)
    {
        tip.Show(cell, kText, 6);
        ASSERT_TRUE(tip.IsWindowVisible());
        if (!p.focus)
            ::SetFocus(NULL);
        tip.PostMessage(p.message, p.wParam, p.lParam);
        MSG msg;   // the framework's loop, pre-translation included
        for (int i = 0; i < 100 && ::PeekMessage(&msg, NULL, 0, 0, PM_NOREMOVE); ++i)
            AfxGetThread()->PumpMessage();
        EXPECT_FALSE(tip.IsWindowVisible()) << MessageName(p.message);
    }
    PumpUntilIdle();

    const MsgEntry toOwner[] = {
        { WM_GETFONT, Sent },   // each Show that gets past its first tests
        { WM_KEYDOWN, WParam | LParam, VK_DOWN, keyParam },
        { WM_GETFONT, Sent },
        { WM_LBUTTONDOWN, WParam | LParam, MK_LBUTTON, PointParam(cell.left + 30, cell.top + 5) },
        { WM_GETFONT, Sent },
        { WM_GETFONT, Sent },
        { WM_GETFONT, Sent },
        { WM_KILLFOCUS, Sent | WParam, 0 },
        { WM_IME_SETCONTEXT, Sent | Optional },
        { 0 }
    };
    const MsgEntry toNeighbour[] = {   // non-client forms with the hit-test code
        { WM_NCRBUTTONDOWN, WParam | LParam, HTVSCROLL, PointParam(bar.x, bar.y) },
        { WM_NCMOUSEMOVE, WParam | LParam, HTVSCROLL, PointParam(bar.x, bar.y) },
        {}
    };
    EXPECT_MSGS(m_log, kOwnerStream, toOwner);
    EXPECT_MSGS(m_log, kNeighbourStream, toNeighbour);
}

TEST_F(TipWindowTest, ShowingAndHidingManyTimesLeavesNothingBehind)
{
    const CRect area(20, 40, 60, 57);
    auto cycles = [&](int count) {
        for (int i = 0; i < count; ++i)
        {
            KVXToolTipCtrl tool;
            KVXTitleTipCtrl title;
            tool.Create(&m_owner);
            title.Create(&m_owner);
            tool.Show(area, area.TopLeft(), kText, false);
            title.Show(area, kText, 6);
            EXPECT_TRUE(tool.IsWindowVisible() && title.IsWindowVisible()) << "cycle " << i;
            tool.Hide();
            MoveStays(title, CPoint(area.right + 5, area.top));
            PumpUntilIdle(20);
        }
    };
    ExpectNoLeaks(cycles, 10, 50, 0);
}

} // namespace
