// Spin arrows driven the way the system drives them (sent mouse messages, WM_TIMER
// sent by the test to count ticks), with a real integer edit as buddy:
//  - placement beside the edit; creation without buddy or parent;
//  - a click steps once; a held arrow over 60 ticks with and without acceleration,
//    up and down, compared as whole sequences of values shown;
//  - key presses step at the key rate and never reach the repeat ticks;
//  - a double click is a second press;
//  - dragging off a half held by the mouse posts a release; a key's hold ignores it;
//  - the release posted by a failing text check ends the repeat;
//  - a press whose capture is taken away (another window, disabling) stops repeating;
//  - a spin whose buddy is gone ignores every message.
#include "spin_test_fixture.h"

namespace spin_test {
namespace {

using SpinGeometry::SpinArea;
using orvane_test::PumpUntilIdle;

using SpinArrow = SpinFixture;

TEST_F(SpinArrow, SitsBesideTheEditWithoutBorder)
{
    RECT rc;
    ::GetWindowRect(hSpin, &rc);
    ::MapWindowPoints(NULL, host->hwnd(), reinterpret_cast<POINT*>(&rc), 2);
    EXPECT_EQ(110, rc.left);
    EXPECT_EQ(19, rc.top);
    EXPECT_EQ(125, rc.right);
    EXPECT_EQ(41, rc.bottom);
    const LONG style = ::GetWindowLongW(hSpin, GWL_STYLE);
    EXPECT_EQ(0, style & WS_BORDER);
    EXPECT_EQ(WS_CHILD | WS_VISIBLE, style & (WS_CHILD | WS_VISIBLE | WS_POPUP));
    EXPECT_EQ(0, ::GetDlgCtrlID(hSpin));
    EXPECT_EQ(host->hwnd(), ::GetParent(hSpin));
}

TEST_F(SpinArrow, CreateNeedsBuddyAndParent)
{
    KVXSpin spin;
    EXPECT_FALSE(spin.Create(&hostWnd, NULL, CRect(200, 10, 215, 32)));
    EXPECT_EQ(NULL, spin.GetSafeHwnd());
    EXPECT_FALSE(spin.Create(NULL, edit.get(), CRect(200, 10, 215, 32)));
    EXPECT_EQ(NULL, spin.GetSafeHwnd());
}

TEST_F(SpinArrow, ClickStepsOnceAndGivesTheBuddyFocus)
{
    ::SetFocus(host->hwnd());
    Press(SpinArea::Up);
    EXPECT_EQ(edit->GetSafeHwnd(), ::GetFocus());
    EXPECT_TRUE(Captured());
    Release(SpinArea::Up);
    EXPECT_FALSE(Captured());
    // A late tick after the release (the timer is gone) moves nothing.
    Ticks(10);
    EXPECT_EQ(std::vector<std::string>({ "101" }), edit->shown);
}

struct HoldCase
{
    const char* name;
    bool up;
    bool acceleration;
    std::vector<std::string> shown;   // press, then ticks 1-60
};

void PrintTo(const HoldCase& c, std::ostream* os) { *os << c.name; }

const HoldCase kHoldCases[] = {
    // Press: 1; ticks 6-20: +1 each; two-second call after the step of tick 20;
    // ticks 21-50: +5; five-second call after tick 50; ticks 51-60: +20.
    { "UpAccelerated", true, true, Concat({ Values(101, 1, 1), Values(102, 1, 15), Values(121, 5, 30), Values(286, 20, 10) }) },
    { "DownAccelerated", false, true, Concat({ Values(99, -1, 1), Values(98, -1, 15), Values(79, -5, 30), Values(-86, -20, 10) }) },
    { "UpPlain", true, false, Concat({ Values(101, 1, 1), Values(102, 1, 55) }) },
    { "DownPlain", false, false, Concat({ Values(99, -1, 1), Values(98, -1, 55) }) },
};

class SpinHold : public SpinFixture, public ::testing::WithParamInterface<HoldCase> {};

TEST_P(SpinHold, SixtyTicks)
{
    const HoldCase& c = GetParam();
    edit->SetSpinButtonAccelerationEnabled(c.acceleration);
    const SpinArea area = c.up ? SpinArea::Up : SpinArea::Down;
    Press(area);
    std::vector<int> stepAt;   // step factor after ticks 19, 20, 49, 50
    for (int tick = 1; tick <= 60; ++tick)
    {
        Ticks(1);
        if (tick == 19 || tick == 20 || tick == 49 || tick == 50)
            stepAt.push_back(edit->SpinStep());
    }
    EXPECT_EQ(c.shown, edit->shown);
    if (c.acceleration)
        EXPECT_EQ(std::vector<int>({ 1, 5, 5, 20 }), stepAt);
    else
        EXPECT_EQ(std::vector<int>({ 1, 1, 1, 1 }), stepAt);
    EXPECT_TRUE(Captured());

    Release(area);
    EXPECT_FALSE(Captured());
    EXPECT_EQ(1, edit->SpinStep());
    const size_t before = edit->shown.size();
    Ticks(6);
    EXPECT_EQ(before, edit->shown.size());
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinHold, ::testing::ValuesIn(kHoldCases),
                         [](const ::testing::TestParamInfo<HoldCase>& i) { return std::string(i.param.name); });

TEST_F(SpinArrow, RealTimerRepeatsAfterSixHundredMilliseconds)
{
    Press(SpinArea::Up);
    const DWORD start = ::GetTickCount();
    ASSERT_TRUE(orvane_test::WaitFor([&] { return edit->shown.size() >= 2; }, 2000));
    const DWORD elapsed = ::GetTickCount() - start;
    EXPECT_GE(elapsed, 500u);
    EXPECT_LE(elapsed, 1200u);
    Release(SpinArea::Up);
    const size_t count = edit->shown.size();
    PumpUntilIdle(300);
    EXPECT_EQ(count, edit->shown.size());
}

TEST_F(SpinArrow, KeyAutoRepeatStepsPerPressAndRestartsTheTickCount)
{
    HWND hEdit = edit->GetSafeHwnd();
    ::SetFocus(hEdit);
    // Three key-downs (the keyboard's repeat), five ticks after each: the sixth tick
    // that would start the timer's repeat is never reached.
    for (int i = 0; i < 3; ++i)
    {
        ::SendMessageW(hEdit, WM_KEYDOWN, VK_UP, 1);
        Ticks(5);
    }
    EXPECT_EQ(std::vector<std::string>({ "101", "102", "103" }), edit->shown);
    EXPECT_TRUE(Captured());
    ::SendMessageW(hEdit, WM_KEYUP, VK_UP, 0xC0000001);
    EXPECT_FALSE(Captured());

    ::SendMessageW(hEdit, WM_KEYDOWN, VK_DOWN, 1);
    ::SendMessageW(hEdit, WM_KEYUP, VK_DOWN, 0xC0000001);
    EXPECT_EQ(std::vector<std::string>({ "101", "102", "103", "102" }), edit->shown);
}

TEST_F(SpinArrow, DoubleClickIsASecondPress)
{
    Press(SpinArea::Up);
    Release(SpinArea::Up);
    Press(SpinArea::Up, WM_LBUTTONDBLCLK);
    EXPECT_TRUE(Captured());
    Ticks(6);
    Release(SpinArea::Up);
    EXPECT_EQ(std::vector<std::string>({ "101", "102", "103" }), edit->shown);
}

TEST_F(SpinArrow, DraggingOffAMouseHeldHalfPostsARelease)
{
    Press(SpinArea::Down);
    const POINT up = In(SpinArea::Up);
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, up.x, up.y);
    // Still held until the posted release arrives.
    EXPECT_TRUE(ReleaseQueued());
    EXPECT_TRUE(Captured());
    PumpUntilIdle();
    EXPECT_FALSE(Captured());
    EXPECT_FALSE(ReleaseQueued());
    Ticks(10);
    EXPECT_EQ(std::vector<std::string>({ "99" }), edit->shown);
}

TEST_F(SpinArrow, MovingWithinTheHeldHalfPostsNothing)
{
    Press(SpinArea::Up);
    const POINT pt = In(SpinArea::Up);
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, 0, pt.y);
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, cx - 1, 0);
    EXPECT_FALSE(ReleaseQueued());
    EXPECT_TRUE(Captured());
}

TEST_F(SpinArrow, AKeyHeldHalfIgnoresThePointer)
{
    HWND hEdit = edit->GetSafeHwnd();
    ::SetFocus(hEdit);
    ::SendMessageW(hEdit, WM_KEYDOWN, VK_UP, 1);
    const POINT down = In(SpinArea::Down);
    Send(hSpin, WM_MOUSEMOVE, 0, down.x, down.y);
    Send(hSpin, WM_MOUSEMOVE, 0, -40, 300);
    EXPECT_FALSE(ReleaseQueued());
    EXPECT_TRUE(Captured());
    Ticks(6);
    EXPECT_EQ(std::vector<std::string>({ "101", "102" }), edit->shown);
    ::SendMessageW(hEdit, WM_KEYUP, VK_UP, 0xC0000001);
    EXPECT_FALSE(Captured());
}

TEST_F(SpinArrow, FailingTextCheckPostsAReleaseThatEndsTheRepeat)
{
    orvane_test::DialogAnswerer answerer(IDOK);
    ::SetWindowTextW(edit->GetSafeHwnd(), L"12z");
    edit->Clear();

    Press(SpinArea::Up);
    // The check refused the step and posted a release; until it arrives the arrow is held.
    EXPECT_TRUE(ReleaseQueued());
    EXPECT_TRUE(Captured());
    PumpUntilIdle(500);
    EXPECT_FALSE(Captured());
    EXPECT_FALSE(ReleaseQueued());
    Ticks(10);
    EXPECT_EQ(std::vector<std::string>(), edit->shown);
    EXPECT_EQ(1, edit->SpinStep());
}

TEST_F(SpinArrow, CaptureTakenByAnotherWindowEndsTheRepeat)
{
    Press(SpinArea::Up);
    Ticks(20);
    ASSERT_EQ(5, edit->SpinStep());
    const size_t count = edit->shown.size();
    ::SetCapture(host->hwnd());
    EXPECT_EQ(1, edit->SpinStep());
    Ticks(10);
    EXPECT_EQ(count, edit->shown.size());
    ::ReleaseCapture();
    // The real button-up then reaches someone else; a late one at the spin is harmless.
    Release(SpinArea::Up);
    EXPECT_EQ(count, edit->shown.size());
}

TEST_F(SpinArrow, DisablingTheBuddyWhileHeldEndsTheRepeat)
{
    Press(SpinArea::Down);
    Ticks(6);
    const size_t count = edit->shown.size();
    ASSERT_EQ(2u, count);
    edit->EnableWindow(FALSE);
    EXPECT_FALSE(::IsWindowEnabled(hSpin));
    EXPECT_FALSE(Captured());
    Ticks(10);
    EXPECT_EQ(count, edit->shown.size());
}

TEST_F(SpinArrow, SpinOfADisabledBuddyIsCreatedDisabled)
{
    edit->EnableWindow(FALSE);
    edit->SetSpinButtonFlag(FALSE);
    EXPECT_FALSE(::IsWindow(hSpin));
    edit->SetSpinButtonFlag(TRUE);
    HWND hNew = edit->SpinHwnd();
    ASSERT_TRUE(::IsWindow(hNew));
    EXPECT_FALSE(::IsWindowEnabled(hNew));
    hSpin = hNew;
}

TEST_F(SpinArrow, SpinWhoseBuddyIsGoneIgnoresEveryMessage)
{
    std::unique_ptr<RecordingLongEdit> buddy(new RecordingLongEdit);
    ASSERT_TRUE(buddy->Create(WS_CHILD | WS_VISIBLE | WS_BORDER, CRect(10, 60, 110, 81),
                              &hostWnd, 101));
    KVXSpin orphan;
    ASSERT_TRUE(orphan.Create(&hostWnd, buddy.get(), CRect(200, 60, 215, 82)));
    HWND hOrphan = orphan.GetSafeHwnd();

    // Alive, the extra spin drives the buddy like its own.
    RECT rc;
    ::GetClientRect(hOrphan, &rc);
    Send(hOrphan, WM_LBUTTONDOWN, MK_LBUTTON, rc.right / 2, 1);
    Send(hOrphan, WM_LBUTTONUP, 0, rc.right / 2, 1);
    EXPECT_EQ(1u, buddy->shown.size());

    buddy->DestroyWindow();
    buddy.reset();
    Send(hOrphan, WM_LBUTTONDOWN, MK_LBUTTON, rc.right / 2, 1);
    EXPECT_NE(hOrphan, ::GetCapture());
    ::SendMessageW(hOrphan, WM_TIMER, SpinGeometry::kTimerId, 0);
    Send(hOrphan, WM_LBUTTONDBLCLK, MK_LBUTTON, rc.right / 2, rc.bottom - 1);
    Send(hOrphan, WM_MOUSEMOVE, 0, rc.right / 2, rc.bottom / 2);
    EXPECT_NE(hOrphan, ::GetCapture());
    Send(hOrphan, WM_LBUTTONUP, 0, 0, 0);
    ::RedrawWindow(hOrphan, NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
    PumpUntilIdle();
    EXPECT_TRUE(::IsWindow(hOrphan));
    orphan.DestroyWindow();
}

TEST_F(SpinArrow, SwitchingSpinButtonsOffAndOnLeavesNoWindowBehind)
{
    std::vector<HWND> old;
    for (int i = 0; i < 20; ++i)
    {
        old.push_back(edit->SpinHwnd());
        Press(SpinArea::Up);   // destroyed while held: must not leave a timer or capture
        edit->SetSpinButtonFlag(FALSE);
        EXPECT_FALSE(Captured());
        edit->SetSpinButtonFlag(TRUE);
    }
    for (HWND h : old)
        EXPECT_FALSE(::IsWindow(h));
    hSpin = edit->SpinHwnd();
    ASSERT_TRUE(::IsWindow(hSpin));
    edit->Clear();
    Press(SpinArea::Up);
    Ticks(6);
    Release(SpinArea::Up);
    EXPECT_EQ(2u, edit->shown.size());
}

} // namespace
} // namespace spin_test
