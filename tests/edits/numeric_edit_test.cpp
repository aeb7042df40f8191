// The integer and floating-point edits on a page. The rules behind them (texts, messages,
// range ends, deltas, formats, the grammar) are tested as plain functions in
// numeric_text_test.cpp and the values family; here each is wired once:
//  - a new field shows 0, created or subclassed, with one spin beside it;
//  - display bases, fixed input, stored messages, range texts, the nearer range end;
//  - one user event end to end: 0b102 typed in binary display, Tab, the box, the fix;
//  - stepping: one sequence shares its offset, acceleration, the range ends, the slider's
//    middle value, refused while a page has an error, out of an undefined field;
//  - the floating-point format, delta and rounding; Ctrl+Z, the filters, pasted text;
//  - the spin's ownership: switching off and on, destroying, disabled creation.
#include "edit_harness.h"

#include "resource.h"

#include <climits>
#include <cmath>

namespace {

using namespace edit_test;
using orvane_test::KeyStateGuard;
using orvane_test::SendChars;

class LongEdit : public PageFixture
{
protected:
    void SetUp() override
    {
        PageFixture::SetUp();
        CreateIn(edit, CRect(10, 20, 140, 41));
        edit.SetFocus();
    }
    // Sets the text and reports whether it passed the text check.
    bool Check(const wchar_t* text)
    {
        edit.SetWindowText(text);
        return edit.SyntaxCheck(FALSE) != FALSE;
    }
    void CtrlZ(HWND hwnd)
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessageW(hwnd, WM_CHAR, 26, 1);
    }

    LongProbe edit;
};

TEST_F(LongEdit, NewFieldShowsZeroWithOneSpinBesideIt)
{
    EXPECT_EQ("0", edit.Text());
    EXPECT_EQ(0, edit.GetValue(FALSE));
    EXPECT_FALSE(edit.GetModified());
    EXPECT_EQ(1, CountSpins(dlg));
    EXPECT_EQ(RectText(SpinGeometry::SpinRectBesideEdit(RectInParent(edit))), RectText(RectInParent(edit.SpinHwnd())));
    EXPECT_EQ(0, ::GetWindowLongW(edit.SpinHwnd(), GWL_STYLE) & WS_BORDER);

    ::SetWindowTextW(dlg.Item(kIdEdit1), L"77");
    LongProbe subclassed;
    ASSERT_TRUE(subclassed.SubclassDlgItem(kIdEdit1, &dlg));
    EXPECT_EQ("0", subclassed.Text());
    EXPECT_EQ(2, CountSpins(dlg));
    EXPECT_EQ(RectText(SpinGeometry::SpinRectBesideEdit(RectInParent(subclassed))),
              RectText(RectInParent(subclassed.SpinHwnd())));
}

TEST_F(LongEdit, DisplayBaseShowsTheValueAndReadsItBack)
{
    LongProbe hex(KVXLongEdit::HEXADECIMAL);
    CreateIn(hex, CRect(10, 50, 240, 71), 2002);
    EXPECT_TRUE(hex.SetValue(-1, TRUE));
    EXPECT_EQ("0xFFFFFFFF", hex.Text());
    EXPECT_EQ(-1, hex.CurrentLong());
    EXPECT_TRUE(hex.SyntaxCheck(FALSE));
    EXPECT_FALSE(hex.GetModified());
    EXPECT_EQ(KVXLongEdit::DECIMAL, LongProbe(static_cast<KVXLongEdit::DISPLAYTYPE>(7)).GetDisplayType());
    hex.SetDisplayType(2);   // the binary display has digits of its own
    EXPECT_EQ("0b11111111111111111111111111111111", hex.Text());
    EXPECT_EQ(-1, hex.CurrentLong());

    // A display change re-shows the value uncommitted; unknown display numbers are ignored.
    edit.SetValue(255, TRUE);
    Type(edit, L"254");
    edit.SetDisplayType(3);
    EXPECT_EQ("0xFE", edit.Text());
    EXPECT_EQ(255, edit.CommittedLong());
    EXPECT_TRUE(edit.GetModified());
    edit.SetDisplayType(4);
    edit.SetDisplayType(0);
    EXPECT_EQ(KVXLongEdit::HEXADECIMAL, edit.GetDisplayType());
    edit.SetDisplayType(2);
    EXPECT_EQ("0b11111110", edit.Text());
}

TEST_F(LongEdit, AnyBaseIsAcceptedUnlessTheInputIsFixed)
{
    Type(edit, L"0x1F");
    EXPECT_EQ(31, edit.CurrentLong());
    EXPECT_EQ("0x1F", edit.Text());
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
    edit.SetFixedInput(true);
    EXPECT_TRUE(edit.GetFixedInput());
    EXPECT_FALSE(Check(L"0x1F"));
    EXPECT_EQ("Value must be inserted in decimal !", edit.Message());
    EXPECT_TRUE(Check(L"31"));
}

TEST_F(LongEdit, RangeTextsAreDecimalWithTheIncludedEnds)
{
    edit.SetRange(KVXVariant(1L), KVXVariant(10L), FALSE, TRUE);
    Type(edit, L"5");
    EXPECT_FALSE(Check(L"1"));
    EXPECT_EQ("Long value not in Range ! ( 1 , 10 ] ", edit.Message());
    EXPECT_EQ(5, edit.CurrentLong());
    EXPECT_FALSE(edit.GetMinimumInclude());
    EXPECT_TRUE(edit.GetMaximumInclude());
    edit.SetDisplayType(3);
    edit.SetRange(KVXVariant(-16L), KVXVariant(255L), TRUE, TRUE);
    Check(L"0x100");
    EXPECT_EQ("Long value not in Range ! [ -16 , 255 ] ", edit.Message());
}

TEST_F(LongEdit, NewRangeMovesTheValueToTheNearerEndAndCommitsIt)
{
    struct { long value, min, max, expected; } cases[] = { { 20, 0, 10, 10 }, { -5, 10, 0, 0 } };
    for (const auto& c : cases)
    {
        edit.SetValue(c.value, FALSE);
        edit.SetRange(KVXVariant(c.min), KVXVariant(c.max), TRUE, TRUE);
        EXPECT_EQ(c.expected, edit.CurrentLong()) << c.value;
        EXPECT_EQ(c.expected, edit.CommittedLong()) << c.value;
        EXPECT_FALSE(edit.GetModified());
    }
    LongProbe early;
    early.SetRange(KVXVariant(5L), KVXVariant(9L), TRUE, TRUE);
    CreateIn(early, CRect(10, 50, 140, 71), 2002);
    EXPECT_EQ("5", early.Text());
}

TEST_F(LongEdit, SpinningStopsAtTheRangeEnds)
{
    edit.SetRange(KVXVariant(1L), KVXVariant(10L), FALSE, TRUE);
    Type(edit, L"9");
    edit.SpinUp();
    edit.SpinUp();
    EXPECT_EQ("10", edit.Text());
    EXPECT_EQ(10, edit.Middle());
    EXPECT_EQ(0, edit.Offset());
    Type(edit, L"3");
    edit.SpinDown();
    edit.SpinDown();
    EXPECT_EQ("2", edit.Text());
}

// One user event end to end, in a dialog that starts error handling in OnInitDialog.
class RoadDialog : public TestDialog
{
public:
    RoadDialog() : edit(KVXLongEdit::BINARY) {}
    BOOL OnInitDialog() override
    {
        CDialog::OnInitDialog();
        edit.SubclassDlgItem(kIdEdit1, this);
        edit.InitErrorHandling(m_hWnd, TRUE);
        return TRUE;
    }
    LongProbe edit;
};

TEST_F(LongEdit, RoadOfOneEventBinaryTypoTabMessageCorrectionTab)
{
    RoadDialog road;
    ASSERT_TRUE(road.Open(L"Road"));
    LongProbe& field = road.edit;
    ASSERT_EQ("0b0", field.Text());
    field.SetFocus();
    field.SetSel(0, -1);
    road.changes.clear();
    BoxRecorder boxes;
    std::vector<std::string> texts;
    for (wchar_t c : std::wstring(L"0b102"))
    {
        ::SendMessageW(field, WM_CHAR, c, 1);
        texts.push_back(field.Text());
    }
    EXPECT_EQ((std::vector<std::string>{ "0", "0b", "0b1", "0b10", "0b102" }), texts);
    EXPECT_EQ(std::vector<UINT>(5, kIdEdit1), road.changes);
    EXPECT_EQ(&field, KVXEdit::FindErrorOnPage(road));
    EXPECT_EQ(4, field.ErrorPos());
    EXPECT_EQ(2, field.CurrentLong());

    orvane_test::PostKey(field, VK_TAB);
    PumpDialog(road, 300);
    EXPECT_EQ(1, boxes.count());
    EXPECT_EQ(LoadText(IDS_BINARY_SYNTAX), boxes.last());
    EXPECT_EQ(field.m_hWnd, ::GetFocus());
    EXPECT_EQ("4-5", Selection(field));

    ::SendMessageW(field, WM_CHAR, 8, 1);
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(road));
    orvane_test::PostKey(field, VK_TAB);
    PumpDialog(road);
    EXPECT_EQ(road.Item(kIdEdit2), ::GetFocus());
    EXPECT_EQ(1, boxes.count());
    EXPECT_EQ(2, field.GetValue(TRUE));
    field.InitErrorHandling(road.m_hWnd, FALSE);
}

TEST_F(LongEdit, UpAndDownShareTheOffsetOfOneSequenceATypedChangeStartsANewOne)
{
    Type(edit, L"5");
    std::vector<long> shown;
    for (bool up : { true, true, false, false, false })
    {
        up ? edit.SpinUp() : edit.SpinDown();
        shown.push_back(edit.CurrentLong());
    }
    EXPECT_EQ((std::vector<long>{ 6, 7, 6, 5, 4 }), shown);
    EXPECT_EQ(-1, edit.Offset());
    EXPECT_EQ(5, edit.Middle());
    Type(edit, L"20");
    edit.SpinUp();
    EXPECT_EQ(21, edit.CurrentLong());
    EXPECT_EQ(20, edit.Middle());
    EXPECT_EQ(1, edit.Offset());
}

TEST_F(LongEdit, AccelerationRaisesTheStepFactorUntilRelease)
{
    Type(edit, L"0");
    edit.SpinUp();
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
}

TEST_F(LongEdit, SliderClampsAndLeavesItsValueAsTheNextMiddle)
{
    edit.SetRange(KVXVariant(0L), KVXVariant(200L), TRUE, TRUE);
    Type(edit, L"190");
    edit.SliderSet(TRUE);
    edit.SliderMove(20);
    EXPECT_EQ(200, edit.CurrentLong());
    edit.SliderMove(-400);
    EXPECT_EQ(0, edit.CurrentLong());
    edit.SliderSet(FALSE);
    Type(edit, L"100");
    edit.SliderSet(TRUE);
    edit.SliderMove(10);
    edit.SliderSet(FALSE);
    EXPECT_EQ(100, edit.Middle());
    edit.SpinUp();   // the value came from the slider: the sequence starts at the shown 110
    EXPECT_EQ(111, edit.CurrentLong());
}

TEST_F(LongEdit, SteppingIsRefusedWhileAnotherEditOfThePageHasAnError)
{
    LongProbe other;
    CreateIn(other, CRect(10, 60, 110, 81), 2002);
    edit.InitErrorHandling(dlg.m_hWnd, TRUE);
    Type(edit, L"5");
    Type(other, L"1#");
    ASSERT_EQ(&other, KVXEdit::FindErrorOnPage(dlg));
    edit.SpinUp();
    edit.SpinDown();
    EXPECT_EQ("5", edit.Text());
    edit.InitErrorHandling(dlg.m_hWnd, FALSE);
}

TEST_F(LongEdit, FocusLossAndSteppingOutOfAnEmptyField)
{
    edit.SetValue(33, TRUE);
    edit.SetWindowText(_T(""));
    ::SetFocus(dlg.Item(kIdButton));
    PumpDialog(dlg);
    EXPECT_EQ("33", edit.Text());
    EXPECT_FALSE(edit.GetModified());

    edit.SetUndefined(TRUE);
    edit.SetFocus();
    ::SetFocus(dlg.Item(kIdButton));
    PumpDialog(dlg);
    EXPECT_EQ("", edit.Text());
    EXPECT_TRUE(edit.GetUndefined());
    edit.SpinUp();
    EXPECT_EQ("1", edit.Text());
    edit.SetRange(KVXVariant(5L), KVXVariant(10L), TRUE, TRUE);
    edit.SetUndefined(TRUE);
    edit.SpinUp();
    EXPECT_EQ("6", edit.Text());
}

TEST_F(LongEdit, InvalidFieldReadsAsItsCommittedValueAndIsRestoredWhenDisabled)
{
    edit.SetValue(12, TRUE);
    Type(edit, L"13#");
    EXPECT_EQ(12, edit.GetValue(FALSE));
    Type(edit, L"14");
    EXPECT_EQ(14, edit.GetValue(TRUE));
    EXPECT_EQ(14, LongProbe::AsLong(edit.GetValueAsVariant(FALSE)));
    Type(edit, L"9#");
    edit.EnableWindow(FALSE);
    EXPECT_EQ("14", edit.Text());
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
}

// --- the spin's ownership -------------------------------------------------------

TEST_F(LongEdit, SpinSwitchedOffAndOnKeepsOneObject)
{
    DoubleProbe early;
    early.SetSpinButtonFlag(FALSE);   // before the window: changes nothing
    EXPECT_TRUE(early.GetSpinButtonFlag());
    CreateIn(early, CRect(10, 50, 110, 71), 2002);
    EXPECT_EQ(2, CountSpins(dlg));

    KVXSpin* spin = edit.Spin();
    edit.SetSpinButtonFlag(FALSE);
    EXPECT_FALSE(edit.GetSpinButtonFlag());
    EXPECT_EQ(1, CountSpins(dlg));
    EXPECT_EQ(spin, edit.Spin());
    // With the spin off, the keys reach the control itself and step nothing.
    edit.SetValue(42, TRUE);
    ::SendMessageW(edit, EM_SETSEL, 2, 2);
    orvane_test::SendKey(edit, VK_UP);
    EXPECT_EQ(42, edit.CurrentLong());
    EXPECT_NE("2-2", Selection(edit));
    ::SetFocus(dlg.Item(kIdButton));
    PumpDialog(dlg);
    EXPECT_EQ("42", edit.Text());

    edit.SetSpinButtonFlag(TRUE);
    edit.SetSpinButtonFlag(TRUE);
    EXPECT_EQ(2, CountSpins(dlg));
    EXPECT_EQ(spin, edit.Spin());
    EXPECT_EQ("(140,19,155,41)", RectText(RectInParent(edit.SpinHwnd())));
}

TEST_F(LongEdit, DestroyingTheEditDestroysAndDeletesTheSpin)
{
    const HWND spin = edit.SpinHwnd();
    edit.DestroyWindow();
    EXPECT_FALSE(::IsWindow(spin));
    EXPECT_EQ(nullptr, edit.Spin());
    for (int round = 0; round < 25; ++round)
    {
        DoubleProbe other;
        CreateIn(other, CRect(10, 20 + round, 110, 41 + round));
        ASSERT_EQ(1, CountSpins(dlg)) << round;
        if (round % 2 == 0)
            other.DestroyWindow();   // odd rounds: the destructor takes window and spin along
    }
    EXPECT_EQ(0, CountSpins(dlg));
}

// --- the floating-point edit --------------------------------------------------------

class DoubleEdit : public LongEdit
{
protected:
    void SetUp() override
    {
        LongEdit::SetUp();
        CreateIn(real, CRect(10, 50, 240, 71), 2002);
        real.SetFocus();
    }
    bool CheckReal(const wchar_t* text)
    {
        real.SetWindowText(text);
        return real.SyntaxCheck(FALSE) != FALSE;
    }
    DoubleProbe real;
};

TEST_F(DoubleEdit, NewFieldShowsZeroDefaultRangeAndStoredMessages)
{
    EXPECT_EQ("0", real.Text());
    EXPECT_EQ("%.16g", Narrow(static_cast<LPCTSTR>(real.GetFormat())));
    EXPECT_FALSE(CheckReal(L"1e301"));
    EXPECT_EQ("Double value not in range ! [ -1e+300 , 1e+300 ] ", real.Message());
    EXPECT_TRUE(CheckReal(L"-1e300"));
    EXPECT_FALSE(CheckReal(L"1.2.3"));
    EXPECT_EQ(LoadText(IDS_DOUBLE_SYNTAX), real.Message());
    EXPECT_EQ(3, real.ErrorPos());
    EXPECT_EQ(-1e300, real.CurrentDouble()) << "invalid text never changes the value";
    EXPECT_EQ(&real, KVXEdit::FindErrorOnPage(dlg));
}

TEST_F(DoubleEdit, NewRangesMoveTheValueToTheNearestValueInside)
{
    real.SetValue(5.0, FALSE);
    real.SetRange(KVXVariant(0.0), KVXVariant(1.0), TRUE, TRUE);
    EXPECT_EQ("1", real.Text());
    EXPECT_EQ(1.0, real.CommittedDouble());
    real.SetValue(5.0, FALSE);
    real.SetRange(KVXVariant(0.0), KVXVariant(1.0), TRUE, FALSE);
    EXPECT_EQ(std::nextafter(1.0, 0.0), real.CommittedDouble());
    EXPECT_TRUE(real.IsInRange(real.GetValueAsVariant(FALSE)));
    // Integer ends make a floating-point range: 0.5 lies inside [0, 1).
    real.SetRange(KVXVariant(0L), KVXVariant(1L), TRUE, FALSE);
    EXPECT_TRUE(CheckReal(L"0.5"));
    real.SetRange(KVXVariant(0.5), KVXVariant(2.25), FALSE, TRUE);
    real.SetFormat(_T("%.2f"));
    CheckReal(L"3");
    EXPECT_EQ("Double value not in range ! ( 0.50 , 2.25 ] ", real.Message());
}

TEST_F(DoubleEdit, FormatRoundsTheShownValueReadingCommits)
{
    real.SetValue(3.14159, TRUE);
    EXPECT_FALSE(real.SetFormat(_T("%s")));
    EXPECT_EQ("3.14159", real.Text());
    EXPECT_TRUE(real.SetFormat(_T("%.2f")));
    EXPECT_EQ("3.14", real.Text());
    EXPECT_EQ(3.14, real.CurrentDouble());
    EXPECT_EQ(3.14159, real.CommittedDouble());
    EXPECT_TRUE(real.GetModified());
    EXPECT_EQ(3.14, DoubleProbe::AsDouble(real.GetValueAsVariant(FALSE)));
    EXPECT_FALSE(real.GetModified());
    EXPECT_EQ(3.14, real.CommittedDouble());
    real.ResetFormat();
    EXPECT_EQ("3.14", real.Text()) << "a reset format takes effect at the next value";
    real.SetValue(2.5, TRUE);
    EXPECT_EQ("2.5", real.Text());
}

TEST_F(DoubleEdit, AutomaticDeltaIsOneUnitOfTheLastDigitShownFixedForTheSequence)
{
    Type(real, L"12.5");
    std::vector<std::string> shown;
    for (int i = 0; i < 4; ++i)
    {
        real.SpinUp();
        shown.push_back(real.Text());
    }
    EXPECT_EQ((std::vector<std::string>{ "12.6", "12.7", "12.8", "12.9" }), shown);
    EXPECT_DOUBLE_EQ(0.1, real.GetDelta());
    EXPECT_EQ(12.5, real.Middle());
    ASSERT_TRUE(real.SetFormat(_T("%.2f")));
    Type(real, L"12.5");
    real.SpinUp();
    EXPECT_EQ("12.51", real.Text());
    // 0.1 + 1000 steps of 0.1, from the middle value: no accumulated rounding error.
    real.SetFormat(_T("%.16g"));
    Type(real, L"0.1");
    for (int i = 0; i < 1000; ++i)
        real.SpinUp();
    EXPECT_EQ("100.1", real.Text());
}

TEST_F(DoubleEdit, FixedDeltaAndTheRangeEnd)
{
    real.SetAutomaticDeltaDeterminationEnabled(false);
    EXPECT_FALSE(real.GetAutomaticDeltaDeterminationEnabled());
    real.SetDelta(0.25);
    real.SetRange(KVXVariant(0.0), KVXVariant(13.0), TRUE, TRUE);
    Type(real, L"12.5");
    real.SpinUp();
    EXPECT_EQ("12.75", real.Text());
    real.SpinUp();
    real.SpinUp();
    EXPECT_EQ("13", real.Text());
    EXPECT_EQ(13.0, real.Middle());
    EXPECT_EQ(0, real.Offset());
    EXPECT_EQ(0.25, real.GetDelta());
}

TEST_F(DoubleEdit, CtrlZShowsTheCommittedValueOrEmptiesAnUndefinedField)
{
    edit.SetValue(5, TRUE);
    real.SetValue(1.25, TRUE);
    Type(edit, L"57");
    Type(real, L"7.5");
    CtrlZ(edit);
    CtrlZ(real);
    EXPECT_EQ("5", edit.Text());
    EXPECT_EQ("1.25", real.Text());
    EXPECT_FALSE(edit.GetModified());
    EXPECT_FALSE(real.GetModified());

    edit.SetUndefined(TRUE);
    real.SetUndefined(TRUE);
    Type(edit, L"8");
    Type(real, L"3");
    CtrlZ(edit);
    CtrlZ(real);
    EXPECT_EQ("", edit.Text());
    EXPECT_EQ("", real.Text());
    EXPECT_TRUE(edit.GetUndefined());
}

TEST_F(DoubleEdit, FiltersPassTheirAlphabetPastedTextOnlyMeetsTheCheck)
{
    Type(edit, L"-0x2 g$aB");
    EXPECT_EQ("-0x2$aB", edit.Text());
    Type(real, L"-1a.5 E+2x");
    EXPECT_EQ("-1.5E+2", real.Text());
    EXPECT_EQ(-150.0, real.CurrentDouble());

    ASSERT_TRUE(orvane_test::SetClipboardText(dlg, L"1 2"));
    edit.SetSel(0, -1);
    ::SendMessageW(edit, WM_PASTE, 0, 0);
    EXPECT_EQ("1 2", edit.Text());
    EXPECT_EQ(LoadText(IDS_DECIMAL_SYNTAX), edit.Message());
    EXPECT_EQ(1, edit.ErrorPos());
}

TEST_F(DoubleEdit, NonConvertibleVariantsChangeNothing)
{
    edit.SetValue(3, TRUE);
    real.SetValue(0.5, TRUE);
    VARIANT null;
    ::VariantInit(&null);
    null.vt = VT_NULL;
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(null), TRUE));
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(KVXString(_T("abc"))), TRUE));
    EXPECT_FALSE(real.SetValueAsVariant(KVXVariant(KVXString(_T("x"))), TRUE));
    EXPECT_EQ("3", edit.Text());
    EXPECT_EQ(3, edit.CommittedLong());
    EXPECT_EQ("0.5", real.Text());
    EXPECT_TRUE(real.SetValueAsVariant(KVXVariant(7L), TRUE));
    EXPECT_EQ("7", real.Text());
}

} // namespace
