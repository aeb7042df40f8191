// The spin driven the way the system drives it (sent mouse messages, WM_TIMER sent by the
// test to count ticks) with an integer edit as buddy. Its arithmetic (areas, ticks, the
// slider curve, glyph places) is tested in spin_geometry_test.cpp; here it is wired once:
//  - creation needs buddy and parent; a click steps once and gives the buddy the focus;
//  - a held arrow over 60 ticks, compared as the whole sequence of values shown; the real
//    timer's first repeat; key repeat restarting the tick count; a double click;
//  - releases: dragging off a mouse-held half, a failing text check, a capture taken away,
//    disabling; a key-held half ignores the pointer; a spin whose buddy is gone;
//  - the slider band: drags measured from the press point, hover capture and cursor;
//  - painted pixels: raised and sunken halves, glyphs in the text and the shadow colour.
#include "edit_harness.h"

#include "Pixels.h"
#include "SpinGeometry.h"
#include "resource.h"

#include <cstdio>
#include <set>
#include <sstream>

namespace {

using namespace edit_test;
using SpinGeometry::SpinArea;
using orvane_test::ClientCapture;
using orvane_test::PointParam;
using orvane_test::PumpUntilIdle;

// The values shown by runs of equal steps, each { first, step, count }.
struct Run
{
    long first, step;
    int count;
};
std::vector<std::string> Shown(std::initializer_list<Run> runs)
{
    std::vector<std::string> shown;
    for (const Run& r : runs)
        for (int i = 0; i < r.count; ++i)
            shown.push_back(std::to_string(r.first + r.step * i));
    return shown;
}

// An integer edit at (10, 20, 110, 41) showing 100, with its spin.
class Spin : public PageFixture
{
protected:
    void SetUp() override
    {
        PageFixture::SetUp();
        CreateIn(edit, CRect(10, 20, 110, 41), 100);
        hSpin = edit.SpinHwnd();
        ASSERT_TRUE(::IsWindow(hSpin));
        edit.SetValue(100, TRUE);
        RECT rc;
        ::GetClientRect(hSpin, &rc);
        cx = rc.right;
        cy = rc.bottom;
        PumpUntilIdle(50);
        Clear();
    }
    void TearDown() override
    {
        if (::IsWindow(hSpin))
            ::SendMessageW(hSpin, WM_LBUTTONUP, 0, 0);
        PageFixture::TearDown();
    }

    void Clear()
    {
        edit.calls.clear();
        edit.shown.clear();
    }
    // A point in the middle column of an area of the spin.
    POINT In(SpinArea area) const
    {
        RECT r = area == SpinArea::Up     ? SpinGeometry::UpHitRect(cx, cy)
                 : area == SpinArea::Band ? SpinGeometry::SliderBandRect(cx, cy)
                                          : SpinGeometry::DownHitRect(cx, cy);
        return POINT{ cx / 2, (r.top + r.bottom) / 2 };
    }
    void Send(UINT message, WPARAM keys, POINT pt) { ::SendMessageW(hSpin, message, keys, PointParam(pt.x, pt.y)); }
    void Press(SpinArea area, UINT message = WM_LBUTTONDOWN) { Send(message, MK_LBUTTON, In(area)); }
    void Release(SpinArea area) { Send(WM_LBUTTONUP, 0, In(area)); }
    void Ticks(int n)
    {
        for (int i = 0; i < n; ++i)
            ::SendMessageW(hSpin, WM_TIMER, SpinGeometry::kTimerId, 0);
    }
    bool Captured() const { return ::GetCapture() == hSpin; }
    // Whether a release the spin posted to itself is waiting in the queue.
    bool ReleaseQueued() const
    {
        MSG msg;
        return ::PeekMessageW(&msg, hSpin, WM_LBUTTONUP, WM_LBUTTONUP, PM_NOREMOVE) && msg.wParam == 0
            && msg.lParam == 0;
    }

    LongProbe edit;
    HWND hSpin = NULL;
    int cx = 0;
    int cy = 0;
};

TEST_F(Spin, CreateNeedsBuddyAndParent)
{
    KVXSpin spin;
    EXPECT_FALSE(spin.Create(&dlg, NULL, CRect(200, 10, 215, 32)));
    EXPECT_FALSE(spin.Create(NULL, &edit, CRect(200, 10, 215, 32)));
    EXPECT_EQ(NULL, spin.GetSafeHwnd());
}

// Scripts of mouse, key and timer input, each token one step:
//   U D B      button down in the up, down or band area (the pointer's new anchor)
//   2U         double click in the up area        u   button up at the pointer
//   >U >D >B   move into an area; >o far outside, >^ above the spin
//   ~dx,up     move relative to the anchor, up counted upwards
//   k^ kv      key down Up or Down at the edit (a repeat when already down); K^ Kv key up
//   t6         six timer ticks                    p   pump the queue
//   X x        another window takes the capture, and lets it go
//   s5         the five-times step factor, as the spin's two-second call gives it
//   ?C ?c      the spin holds the capture, or not;  ?R ?r a posted release waits, or not
//   ?f1 ?f5    the step factor;  ?K the slider cursor is shown
// Expected: the value operations the edit performed ("mid(1) inc(1)=101 ...").
struct ScriptCase
{
    const char* name;
    const char* script;
    const char* calls;
};

const ScriptCase kScriptCases[] = {
    { "ClickStepsOnceAndGivesTheBuddyFocus", "U ~-2,-1 ?r ?C u ?c t10", "mid(1) inc(1)=101" },
    { "DoubleClickIsASecondPress", "U u 2U ?C t6 u", "mid(1) inc(1)=101 inc(2)=102 inc(3)=103" },
    { "KeyRepeatStepsPerPressAndRestartsTheTickCount", "k^ t5 k^ t5 k^ t5 ?C K^ ?c kv Kv ?c",
      "mid(1) inc(1)=101 inc(2)=102 inc(3)=103 dec(2)=102" },
    { "DraggingOffAMouseHeldHalfPostsARelease", "D ~-2,-1 ?r >U ?R ?C p ?c t10", "mid(1) dec(-1)=99" },
    { "AKeyHeldHalfIgnoresThePointer", "k^ >D >o ?r ?C t6 K^ ?c", "mid(1) inc(1)=101 inc(2)=102" },
    { "CaptureTakenByAnotherWindowEndsTheRepeat", "U t6 s5 X ?f1 t10 x u ?c", "mid(1) inc(1)=101 inc(2)=102" },
    // A drag measures from the press point, repeats the distance for a move without vertical
    // change, runs no timer and keeps the step factor; afterwards moves and releases do nothing.
    { "DragMeasuresFromThePressPoint", "s5 B ?C ~0,15 ~0,-5 ~300,-5 ?C t10 u ?c ?f5 >U u",
      "mid(1) inc(16)=116 dec(-5)=95 dec(-5)=95" },
    // The arrow's sequence takes the middle with step detection, the band without.
    { "DragAfterArrowStepsContinuesFromTheSteppedValue", "U u B ~0,2 u", "mid(1) inc(1)=101 mid(0) inc(2)=103" },
    { "HoveringTheBandCapturesAndShowsTheSliderCursor", ">B ?C ?K ~-2,-1 ?C >D ?c >B >^ ?c", "" },
    { "PressWhileHoveringStartsADragThatKeepsTheCapture", ">B B ~0,-40 ?C u ?c", "mid(1) dec(-85)=15" },
    { "CaptureTakenDuringADragEndsIt", "B X x ~0,10 u", "mid(1)" },
};

class SpinScript : public Spin, public ::testing::WithParamInterface<ScriptCase>
{
protected:
    void Run(const std::string& script)
    {
        std::istringstream tokens(script);
        std::string t;
        POINT anchor = In(SpinArea::Band), pointer = anchor;
        bool held = false;
        std::set<UINT> keysDown;
        auto area = [this](char c) { return c == 'U' ? SpinArea::Up : c == 'D' ? SpinArea::Down : SpinArea::Band; };
        while (tokens >> t)
        {
            SCOPED_TRACE("at " + t);
            const char c = t[0];
            const UINT vk = t.size() > 1 && t[1] == 'v' ? VK_DOWN : VK_UP;
            if (c == 'U' || c == 'D' || c == 'B' || c == '2')
            {
                anchor = pointer = In(area(t.back()));
                Send(c == '2' ? WM_LBUTTONDBLCLK : WM_LBUTTONDOWN, MK_LBUTTON, pointer);
                held = pressed = true;
            }
            else if (c == 'u')
            {
                Send(WM_LBUTTONUP, 0, pointer);
                held = false;
            }
            else if (c == '>' || c == '~')
            {
                int dx = 0, up = 0;
                if (c == '~' && sscanf(t.c_str() + 1, "%d,%d", &dx, &up) == 2)
                    pointer = POINT{ anchor.x + dx, anchor.y - up };
                else if (c == '>')
                    pointer = t[1] == 'o' ? POINT{ -40, 300 } : t[1] == '^' ? POINT{ cx / 2, -10 } : In(area(t[1]));
                if (c == '>')
                    anchor = pointer;
                Send(WM_MOUSEMOVE, held ? MK_LBUTTON : 0, pointer);
            }
            else if (c == 'k')
            {
                ::SendMessageW(edit, WM_KEYDOWN, vk, 1 | (keysDown.insert(vk).second ? 0 : 0x40000000));
                pressed = true;
            }
            else if (c == 'K')
            {
                keysDown.erase(vk);
                ::SendMessageW(edit, WM_KEYUP, vk, 0xC0000001);
            }
            else if (c == 't')
                Ticks(std::stoi(t.substr(1)));
            else if (c == 'p')
                PumpUntilIdle();
            else if (c == 'X')
                ::SetCapture(dlg);
            else if (c == 'x')
                ::ReleaseCapture();
            else if (c == 's')
                edit.TwoSeconds();
            else if (t == "?C" || t == "?c")
                EXPECT_EQ(t[1] == 'C', Captured());
            else if (t == "?R" || t == "?r")
                EXPECT_EQ(t[1] == 'R', ReleaseQueued());
            else if (t.compare(0, 2, "?f") == 0)
                EXPECT_EQ(std::stoi(t.substr(2)), edit.StepFactor());
            else if (t == "?K")
                EXPECT_EQ(::LoadCursorW(AfxFindResourceHandle(MAKEINTRESOURCE(IDC_SLIDER_CURSOR), RT_GROUP_CURSOR),
                              MAKEINTRESOURCEW(IDC_SLIDER_CURSOR)),
                          ::GetCursor());
            else
                ADD_FAILURE() << "unknown token";
        }
    }
    bool pressed = false;
};

TEST_P(SpinScript, Runs)
{
    ::SetFocus(dlg.Item(kIdButton));
    Run(GetParam().script);
    std::string calls;
    for (const std::string& call : edit.calls)
        calls += (calls.empty() ? "" : " ") + call;
    EXPECT_EQ(GetParam().calls, calls);
    if (pressed)
        EXPECT_EQ(edit.m_hWnd, ::GetFocus()) << "a press gives the buddy the focus";
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinScript, ::testing::ValuesIn(kScriptCases),
                         [](const ::testing::TestParamInfo<ScriptCase>& i) { return std::string(i.param.name); });

struct HoldCase
{
    const char* name;
    bool up;
    bool acceleration;
    std::vector<std::string> shown;   // press, then ticks 1-60
};

// Press: one step; ticks 6-20 one each; the two-second call after the step of tick 20;
// ticks 21-50 five each; the five-second call after tick 50; ticks 51-60 twenty each.
const HoldCase kHoldCases[] = {
    { "UpAccelerated", true, true, Shown({ { 101, 1, 1 }, { 102, 1, 15 }, { 121, 5, 30 }, { 286, 20, 10 } }) },
    { "DownPlain", false, false, Shown({ { 99, -1, 1 }, { 98, -1, 55 } }) },
};

class SpinHold : public Spin, public ::testing::WithParamInterface<HoldCase> {};

TEST_P(SpinHold, SixtyTicks)
{
    const HoldCase& c = GetParam();
    edit.SetSpinButtonAccelerationEnabled(c.acceleration);
    const SpinArea area = c.up ? SpinArea::Up : SpinArea::Down;
    Press(area);
    Ticks(60);
    EXPECT_EQ(c.shown, edit.shown);
    EXPECT_TRUE(Captured());
    Release(area);
    EXPECT_FALSE(Captured());
    EXPECT_EQ(1, edit.StepFactor());
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinHold, ::testing::ValuesIn(kHoldCases),
                         [](const ::testing::TestParamInfo<HoldCase>& i) { return std::string(i.param.name); });

TEST_F(Spin, RealTimerRepeatsAfterSixHundredMilliseconds)
{
    Press(SpinArea::Up);
    const DWORD start = ::GetTickCount();
    ASSERT_TRUE(orvane_test::WaitFor([&] { return edit.shown.size() >= 2; }, 2000));
    const DWORD elapsed = ::GetTickCount() - start;
    EXPECT_GE(elapsed, 500u);
    EXPECT_LE(elapsed, 1200u);
    Release(SpinArea::Up);
    const size_t count = edit.shown.size();
    PumpUntilIdle(300);
    EXPECT_EQ(count, edit.shown.size());
}

TEST_F(Spin, FailingTextCheckShowsTheMessageAndPostsAReleaseThatEndsTheRepeat)
{
    BoxRecorder boxes;
    ::SetWindowTextW(edit, L"12z");
    Clear();
    Press(SpinArea::Up);
    EXPECT_TRUE(ReleaseQueued());
    EXPECT_TRUE(Captured());
    PumpUntilIdle(500);
    EXPECT_FALSE(Captured());
    Ticks(10);
    EXPECT_EQ(std::vector<std::string>(), edit.shown);
    EXPECT_EQ("12z", edit.Text());
    EXPECT_EQ(1, boxes.count());
    EXPECT_EQ(1, edit.StepFactor());
}

TEST_F(Spin, DisablingTheBuddyDisablesTheSpinAndEndsTheRepeat)
{
    Press(SpinArea::Down);
    Ticks(6);
    ASSERT_EQ(2u, edit.shown.size());
    edit.EnableWindow(FALSE);
    EXPECT_FALSE(::IsWindowEnabled(hSpin));
    EXPECT_FALSE(Captured());
    Ticks(10);
    EXPECT_EQ(2u, edit.shown.size());
    // A spin made while the buddy is disabled starts disabled.
    edit.SetSpinButtonFlag(FALSE);
    EXPECT_FALSE(::IsWindow(hSpin));
    edit.SetSpinButtonFlag(TRUE);
    hSpin = edit.SpinHwnd();
    EXPECT_FALSE(::IsWindowEnabled(hSpin));
    edit.EnableWindow(TRUE);
    EXPECT_TRUE(::IsWindowEnabled(hSpin));
}

TEST_F(Spin, SwitchingTheSpinOffWhileHeldLeavesNoWindowTimerOrCapture)
{
    std::vector<HWND> old;
    for (int i = 0; i < 20; ++i)
    {
        old.push_back(edit.SpinHwnd());
        Press(SpinArea::Up);
        edit.SetSpinButtonFlag(FALSE);
        EXPECT_FALSE(Captured());
        edit.SetSpinButtonFlag(TRUE);
        hSpin = edit.SpinHwnd();
    }
    for (HWND h : old)
        EXPECT_FALSE(::IsWindow(h));
    Clear();
    Press(SpinArea::Up);
    Ticks(6);
    Release(SpinArea::Up);
    EXPECT_EQ(2u, edit.shown.size());
}

TEST_F(Spin, ASpinWhoseBuddyIsGoneIgnoresEveryMessage)
{
    auto* buddy = new LongProbe;
    CreateIn(*buddy, CRect(10, 60, 110, 81), 101);
    KVXSpin orphan;
    ASSERT_TRUE(orphan.Create(&dlg, buddy, CRect(200, 60, 215, 82)));
    const HWND hOrphan = orphan.GetSafeHwnd();
    const LPARAM top = PointParam(7, 1);
    ::SendMessageW(hOrphan, WM_LBUTTONDOWN, MK_LBUTTON, top);
    ::SendMessageW(hOrphan, WM_LBUTTONUP, 0, top);
    EXPECT_EQ(1u, buddy->shown.size()) << "alive, an extra spin drives the buddy like its own";

    buddy->DestroyWindow();
    delete buddy;
    ::SendMessageW(hOrphan, WM_LBUTTONDOWN, MK_LBUTTON, top);
    ::SendMessageW(hOrphan, WM_TIMER, SpinGeometry::kTimerId, 0);
    ::SendMessageW(hOrphan, WM_LBUTTONDBLCLK, MK_LBUTTON, PointParam(7, 20));
    ::SendMessageW(hOrphan, WM_MOUSEMOVE, 0, PointParam(7, 11));
    EXPECT_NE(hOrphan, ::GetCapture());
    ::SendMessageW(hOrphan, WM_LBUTTONUP, 0, 0);
    ::RedrawWindow(hOrphan, NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
    PumpUntilIdle();
    EXPECT_TRUE(::IsWindow(hOrphan));
    orphan.DestroyWindow();
}

// --- painted pixels -----------------------------------------------------------------

class SpinPaint : public Spin
{
protected:
    // The glyph's tip and its base row (two pixels high, three wide).
    std::vector<POINT> Glyph(bool upper, bool pressed) const
    {
        const RECT half = upper ? SpinGeometry::UpperHalfRect(cx, cy) : SpinGeometry::LowerHalfRect(cx, cy);
        const RECT r = SpinGeometry::GlyphRect(half, pressed);
        POINT pts[3];
        upper ? SpinGeometry::UpGlyphPoints(r, pts) : SpinGeometry::DownGlyphPoints(r, pts);
        return { pts[1], pts[0], POINT{ pts[1].x, pts[0].y }, pts[2] };
    }
    void ExpectGlyph(const ClientCapture& cap, const std::vector<POINT>& g, COLORREF colour, const char* what)
    {
        SCOPED_TRACE(what);
        for (const POINT& p : g)
            EXPECT_EQ(colour, cap.At(p.x, p.y)) << p.x << "," << p.y;
        const COLORREF face = ::GetSysColor(COLOR_BTNFACE);
        EXPECT_EQ(face, cap.At(g[0].x - 1, g[0].y));
        EXPECT_EQ(face, cap.At(g[0].x + 1, g[0].y));
        EXPECT_EQ(face, cap.At(g[1].x - 1, g[1].y));
        EXPECT_EQ(face, cap.At(g[3].x + 1, g[3].y));
    }
    // Highlight at the inner top-left and shadow at the inner bottom-right: raised.
    void ExpectRaised(const ClientCapture& cap, const RECT& half, bool raised)
    {
        const COLORREF hi = ::GetSysColor(COLOR_BTNHIGHLIGHT), sh = ::GetSysColor(COLOR_BTNSHADOW);
        EXPECT_EQ(raised ? hi : sh, cap.At(half.left + 1, half.top + 1));
        EXPECT_EQ(raised ? sh : hi, cap.At(half.right - 2, half.bottom - 2));
    }
};

TEST_F(SpinPaint, RaisedFramedHalvesAHeldHalfSunkenWithItsGlyphOnePixelLower)
{
    const COLORREF text = ::GetSysColor(COLOR_BTNTEXT), dark = ::GetSysColor(COLOR_3DDKSHADOW);
    const RECT upper = SpinGeometry::UpperHalfRect(cx, cy);
    const RECT lower = SpinGeometry::LowerHalfRect(cx, cy);
    {
        ClientCapture cap(hSpin);
        ExpectGlyph(cap, Glyph(true, false), text, "up glyph");
        ExpectGlyph(cap, Glyph(false, false), text, "down glyph");
        EXPECT_EQ(dark, cap.At(upper.right - 1, upper.top + 2));
        EXPECT_EQ(dark, cap.At(upper.left + 2, upper.bottom - 1));
        EXPECT_EQ(dark, cap.At(lower.right - 1, lower.bottom - 2));
        ExpectRaised(cap, upper, true);
        ExpectRaised(cap, lower, true);
    }
    Press(SpinArea::Up);
    {
        ClientCapture cap(hSpin);
        ExpectRaised(cap, upper, false);
        EXPECT_EQ(Glyph(true, false)[0].y + 1, Glyph(true, true)[0].y);
        ExpectGlyph(cap, Glyph(true, true), text, "pressed up glyph");
        ExpectRaised(cap, lower, true);
    }
    Release(SpinArea::Up);
    ClientCapture after(hSpin);
    ExpectRaised(after, upper, true);
    ExpectGlyph(after, Glyph(true, false), text, "released up glyph");
}

// A pixel as it is on the window's surface right now, without repainting first.
COLORREF PixelNow(HWND hwnd, POINT p)
{
    HDC hdc = ::GetDC(hwnd);
    const COLORREF c = ::GetPixel(hdc, p.x, p.y);
    ::ReleaseDC(hwnd, hdc);
    return c;
}

TEST_F(SpinPaint, DisablingRepaintsTheGlyphsInTheShadowColourAtOnce)
{
    PumpUntilIdle();
    const POINT up = Glyph(true, false)[0], down = Glyph(false, false)[0];
    ASSERT_EQ(::GetSysColor(COLOR_BTNTEXT), PixelNow(hSpin, up));
    edit.EnableWindow(FALSE);
    const COLORREF shadow = ::GetSysColor(COLOR_BTNSHADOW);
    EXPECT_EQ(shadow, PixelNow(hSpin, up));
    EXPECT_EQ(shadow, PixelNow(hSpin, down));
    ExpectGlyph(ClientCapture(hSpin), Glyph(false, false), shadow, "disabled down glyph");
    edit.EnableWindow(TRUE);
    EXPECT_EQ(::GetSysColor(COLOR_BTNTEXT), PixelNow(hSpin, up));
    EXPECT_EQ(::GetSysColor(COLOR_BTNTEXT), PixelNow(hSpin, down));
}

} // namespace
