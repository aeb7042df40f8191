// Stepping of the numeric edits, through the operations the spin calls and through the
// spin itself:
//  - up and down presses of one sequence share the offset from the middle value;
//  - acceleration (step factors 1, 5, 20, back to 1 on release; off when disabled);
//  - an arrow held on the spin: values after the press and after each timer tick;
//  - stepping refused while the own text or another edit of the page is invalid;
//  - slider distances and their curve, not accumulated; a typed change starting a new
//    sequence;
//  - Up and Down keys pressing the spin; focus loss restoring an emptied field;
//  - stepping out of an undefined field.
#include "numeric_probes.h"

namespace {

using namespace edit_test;
using orvane_test::SendChars;

class NumericStepping : public NumericFixture
{
protected:
    void SetUp() override
    {
        NumericFixture::SetUp();
        CreateIn(edit, CRect(10, 20, 110, 41), 2001);
        CreateIn(other, CRect(10, 60, 110, 81), 2002);
        edit.InitErrorHandling(dlg.m_hWnd, TRUE);
        edit.SetFocus();
    }

    void TearDown() override
    {
        edit.InitErrorHandling(dlg.m_hWnd, FALSE);
        NumericFixture::TearDown();
    }

    void Type(const wchar_t* text)
    {
        edit.SetSel(0, -1);
        SendChars(edit, text);
    }

    LongProbe edit;
    LongProbe other;
};

TEST_F(NumericStepping, UpAndDownShareTheOffsetOfOneSequence)
{
    Type(L"5");
    std::vector<long> shown;
    std::vector<int> offsets;
    auto record = [&] {
        shown.push_back(edit.CurrentLong());
        offsets.push_back(edit.Offset());
    };
    edit.SpinUp(); record();
    edit.SpinUp(); record();
    edit.SpinDown(); record();
    edit.SpinDown(); record();
    edit.SpinDown(); record();
    EXPECT_EQ((std::vector<long>{ 6, 7, 6, 5, 4 }), shown);
    EXPECT_EQ((std::vector<int>{ 1, 2, 1, 0, -1 }), offsets);
    EXPECT_EQ(5, edit.Middle());
    EXPECT_EQ("4", edit.Text());
}

TEST_F(NumericStepping, ATypedChangeStartsANewSequence)
{
    Type(L"5");
    edit.SpinUp();
    edit.SpinUp();
    Type(L"20");
    edit.SpinUp();
    EXPECT_EQ(21, edit.CurrentLong());
    EXPECT_EQ(20, edit.Middle());
    EXPECT_EQ(1, edit.Offset());
}

TEST_F(NumericStepping, AccelerationRaisesTheStepFactorUntilRelease)
{
    Type(L"0");
    edit.SpinUp();
    EXPECT_EQ(1, edit.CurrentLong());
    edit.TwoSeconds();
    EXPECT_EQ(5, edit.StepFactor());
    edit.SpinUp();
    EXPECT_EQ(6, edit.CurrentLong());
    edit.FiveSeconds();
    edit.SpinUp();
    EXPECT_EQ(26, edit.CurrentLong());
    edit.Released();
    EXPECT_EQ(1, edit.StepFactor());
    EXPECT_EQ(26, edit.Offset());   // the offset survives the release
    edit.SpinUp();
    EXPECT_EQ(27, edit.CurrentLong());
}

// Holds the upper half of the spin: the press, then `ticks` timer ticks sent to it.
std::vector<long> HoldUpArrow(LongProbe& edit, int ticks)
{
    std::vector<long> shown;
    const HWND spin = edit.SpinHwnd();
    ::SendMessageW(spin, WM_LBUTTONDOWN, MK_LBUTTON, orvane_test::PointParam(0, 0));
    shown.push_back(edit.CurrentLong());
    for (int tick = 1; tick <= ticks; ++tick)
    {
        ::SendMessageW(spin, WM_TIMER, 1, 0);
        shown.push_back(edit.CurrentLong());
    }
    ::SendMessageW(spin, WM_LBUTTONUP, 0, orvane_test::PointParam(0, 0));
    return shown;
}

TEST_F(NumericStepping, HeldArrowStepsAfterTheFifthTickAndAccelerates)
{
    Type(L"0");
    const std::vector<long> shown = HoldUpArrow(edit, 60);
    ASSERT_EQ(61u, shown.size());
    // Index = tick (0 = the press). Ticks 1-5 rest, then +1 per tick; tick 20 steps and
    // then switches to 5; tick 50 steps and then switches to 20.
    EXPECT_EQ(1, shown[0]);
    EXPECT_EQ(1, shown[5]);
    EXPECT_EQ(2, shown[6]);
    EXPECT_EQ(16, shown[20]);
    EXPECT_EQ(21, shown[21]);
    EXPECT_EQ(166, shown[50]);
    EXPECT_EQ(186, shown[51]);
    EXPECT_EQ(366, shown[60]);
    EXPECT_EQ(1, edit.StepFactor());   // released
}

TEST_F(NumericStepping, HeldArrowWithoutAccelerationStepsByOne)
{
    Type(L"0");
    edit.SetSpinButtonAccelerationEnabled(false);
    const std::vector<long> shown = HoldUpArrow(edit, 60);
    EXPECT_EQ(56, shown.back());
}

TEST_F(NumericStepping, RefusedWhileAnotherEditOfThePageHasAnError)
{
    Type(L"5");
    other.SetSel(0, -1);
    SendChars(other, L"1#");
    ASSERT_EQ(&other, KVXEdit::FindErrorOnPage(dlg));
    edit.SpinUp();
    edit.SpinDown();
    EXPECT_EQ(5, edit.CurrentLong());
    EXPECT_EQ("5", edit.Text());
}

TEST_F(NumericStepping, RefusedWhileTheOwnTextIsInvalidAndTheMessageIsShown)
{
    BoxRecorder boxes;
    Type(L"5");
    SendChars(edit, L"#");
    edit.SpinUp();
    EXPECT_EQ("5#", edit.Text());
    EXPECT_EQ(5, edit.CurrentLong());
    PumpDialog(dlg);
    EXPECT_EQ(1, boxes.count());
}

struct SliderCase
{
    long distance;
    long shown;
};

TEST_F(NumericStepping, SliderMovesFollowTheDistanceCurveFromTheMiddleValue)
{
    Type(L"100");
    edit.SliderSet(TRUE);
    EXPECT_EQ(100, edit.Middle());
    const SliderCase cases[] = { { 10, 110 }, { 11, 111 }, { 20, 125 }, { 40, 185 }, { -15, 84 }, { 0, 100 }, { 3, 103 } };
    for (const SliderCase& c : cases)
    {
        edit.SliderMove(c.distance);
        EXPECT_EQ(c.shown, edit.CurrentLong()) << "distance " << c.distance;
    }
    edit.SliderSet(FALSE);
    EXPECT_EQ(100, edit.Middle());
}

TEST_F(NumericStepping, SliderClampsAtTheRangeEnds)
{
    edit.SetRange(KVXVariant(0L), KVXVariant(50L), TRUE, TRUE);
    Type(L"45");
    edit.SliderSet(TRUE);
    edit.SliderMove(20);
    EXPECT_EQ(50, edit.CurrentLong());
    edit.SliderMove(-40);
    EXPECT_EQ(0, edit.CurrentLong());
}

TEST_F(NumericStepping, SpinAfterSliderKeepsTheSlidersMiddleValue)
{
    Type(L"100");
    edit.SliderSet(TRUE);
    edit.SliderMove(10);
    edit.SliderSet(FALSE);
    // The value came from the slider: the next sequence starts at the shown 110.
    edit.SpinUp();
    EXPECT_EQ(111, edit.CurrentLong());
}

TEST_F(NumericStepping, ArrowKeysPressTheSpinOnceEach)
{
    Type(L"7");
    orvane_test::SendKey(edit, VK_UP);
    EXPECT_EQ(8, edit.CurrentLong());
    orvane_test::SendKey(edit, VK_UP);
    EXPECT_EQ(9, edit.CurrentLong());
    orvane_test::SendKey(edit, VK_DOWN);
    EXPECT_EQ(8, edit.CurrentLong());
    EXPECT_EQ(edit.m_hWnd, ::GetFocus());
    EXPECT_EQ(HWND(NULL), ::GetCapture());
}

TEST_F(NumericStepping, HeldKeyRepeatsAsNewPresses)
{
    Type(L"7");
    const UINT scan = ::MapVirtualKeyW(VK_UP, MAPVK_VK_TO_VSC);
    for (int i = 0; i < 4; ++i)
        ::SendMessageW(edit, WM_KEYDOWN, VK_UP, 1 | (scan << 16) | (i ? 0x40000000 : 0));
    ::SendMessageW(edit, WM_KEYUP, VK_UP, 1 | (scan << 16) | 0xC0000000);
    EXPECT_EQ(11, edit.CurrentLong());
}

TEST_F(NumericStepping, EmptiedFieldShowsTheCommittedValueAfterFocusLoss)
{
    edit.SetValue(33, TRUE);
    edit.SetWindowText(_T(""));
    ::SetFocus(dlg.Item(kIdButton));
    PumpDialog(dlg);
    EXPECT_EQ("33", edit.Text());
    EXPECT_FALSE(edit.GetModified());
}

TEST_F(NumericStepping, UndefinedFieldStaysEmptyAfterFocusLoss)
{
    edit.SetUndefined(TRUE);
    ::SetFocus(dlg.Item(kIdButton));
    PumpDialog(dlg);
    EXPECT_EQ("", edit.Text());
    EXPECT_TRUE(edit.GetUndefined());
}

TEST_F(NumericStepping, SteppingOutOfAnUndefinedFieldStartsAtZeroOrTheLowestValue)
{
    edit.SetUndefined(TRUE);
    edit.SpinUp();
    EXPECT_EQ("1", edit.Text());

    edit.SetRange(KVXVariant(5L), KVXVariant(10L), TRUE, TRUE);
    edit.SetUndefined(TRUE);
    edit.SpinUp();
    EXPECT_EQ("6", edit.Text());
}

} // namespace
