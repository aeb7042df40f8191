// The floating-point edit in a dialog:
//  - a new field shows 0; the range message of the default range;
//  - stored messages per conversion result, the syntax error position;
//  - range changes to the nearer end, with excluded ends and with integer ends;
//  - SetFormat with "%.2f": shown, current and committed values and GetModified;
//    refused formats; ResetFormat taking effect at the next SetValue;
//  - GetValueAsVariant committing whatever its argument;
//  - the automatic delta per format and typed value, spinning with automatic and fixed
//    delta, the delta staying fixed during a sequence;
//  - Ctrl+Z, the character filter.
#include "numeric_probes.h"

#include "resource.h"

#include <cmath>

namespace {

using namespace edit_test;
using orvane_test::KeyStateGuard;
using orvane_test::SendChars;

class DoubleEdit : public NumericFixture
{
protected:
    void SetUp() override
    {
        NumericFixture::SetUp();
        CreateIn(edit, CRect(10, 20, 240, 41));
        edit.SetFocus();
    }

    void Type(const wchar_t* text)
    {
        edit.SetSel(0, -1);
        SendChars(edit, text);
    }

    bool Check(const wchar_t* text)
    {
        edit.SetWindowText(text);
        return edit.SyntaxCheck(FALSE) != FALSE;
    }

    DoubleProbe edit;
};

TEST_F(DoubleEdit, NewFieldShowsZeroAndTheDefaultRange)
{
    EXPECT_EQ("0", edit.Text());
    EXPECT_EQ(0.0, edit.GetValue(FALSE));
    EXPECT_EQ("%.16g", Narrow((LPCTSTR)edit.GetFormat()));
    EXPECT_FALSE(Check(L"1e301"));
    EXPECT_EQ("Double value not in range ! [ -1e+300 , 1e+300 ] ", edit.Message());
    EXPECT_TRUE(Check(L"1e300"));
    EXPECT_TRUE(Check(L"-1e300"));
}

struct MessageCase
{
    const char* name;
    const wchar_t* text;
    UINT message;
    int errorPos;
};

const MessageCase kMessageCases[] = {
    { "Overflow", L"1e400", IDS_DOUBLE_OVERFLOW, 0 },
    { "Underflow", L"-1e400", IDS_DOUBLE_UNDERFLOW, 0 },
    { "TooSmall", L"1e-400", IDS_CANNOT_CONVERT, 0 },
    { "LonePoint", L".", IDS_NOT_A_NUMBER, 0 },
    { "LoneSign", L"-", IDS_NOT_A_NUMBER, 0 },
    { "ExponentWithoutDigits", L"1e", IDS_DOUBLE_SYNTAX, 1 },
    { "TwoPoints", L"1.2.3", IDS_DOUBLE_SYNTAX, 3 },
    { "SignInside", L"12-3", IDS_DOUBLE_SYNTAX, 2 },
};

class DoubleEditMessages : public DoubleEdit, public testing::WithParamInterface<MessageCase> {};

TEST_P(DoubleEditMessages, StoredMessageAndPosition)
{
    const MessageCase& c = GetParam();
    Type(L"2.5");
    EXPECT_FALSE(Check(c.text));
    EXPECT_EQ(Narrow(LoadText(c.message)), edit.Message());
    EXPECT_EQ(c.errorPos, edit.ErrorPos());
    EXPECT_EQ(2.5, edit.CurrentDouble());
    EXPECT_EQ(&edit, KVXEdit::FindErrorOnPage(dlg));
}

INSTANTIATE_TEST_SUITE_P(Table, DoubleEditMessages, testing::ValuesIn(kMessageCases),
    [](const testing::TestParamInfo<MessageCase>& info) { return std::string(info.param.name); });

TEST_F(DoubleEdit, RangeTextUsesTheFormat)
{
    edit.SetValue(1.0, TRUE);
    edit.SetRange(KVXVariant(0.5), KVXVariant(2.25), FALSE, TRUE);
    edit.SetFormat(_T("%.2f"));
    Check(L"3");
    EXPECT_EQ("Double value not in range ! ( 0.50 , 2.25 ] ", edit.Message());
}

TEST_F(DoubleEdit, NewRangeMovesTheValueToTheNearerEnd)
{
    edit.SetValue(5.0, FALSE);
    edit.SetRange(KVXVariant(0.0), KVXVariant(1.0), TRUE, TRUE);
    EXPECT_EQ(1.0, edit.CurrentDouble());
    EXPECT_EQ(1.0, edit.CommittedDouble());
    EXPECT_EQ("1", edit.Text());

    edit.SetValue(-0.25, FALSE);
    edit.SetRange(KVXVariant(0.0), KVXVariant(1.0), TRUE, TRUE);
    EXPECT_EQ(0.0, edit.CurrentDouble());
}

TEST_F(DoubleEdit, ExcludedMaximumGivesTheLargestValueBelowIt)
{
    edit.SetValue(5.0, FALSE);
    edit.SetRange(KVXVariant(0.0), KVXVariant(1.0), TRUE, FALSE);
    EXPECT_EQ(std::nextafter(1.0, 0.0), edit.CommittedDouble());
    EXPECT_EQ(std::nextafter(1.0, 0.0), edit.CurrentDouble());
    EXPECT_TRUE(edit.IsInRange(edit.GetValueAsVariant(FALSE)));
}

TEST_F(DoubleEdit, IntegerEndsMakeAFloatingPointRange)
{
    // Given as longs, an excluded maximum of 1 must still admit 0.5 and stop just below 1.
    edit.SetValue(5.0, FALSE);
    edit.SetRange(KVXVariant(0L), KVXVariant(1L), TRUE, FALSE);
    EXPECT_EQ(std::nextafter(1.0, 0.0), edit.CurrentDouble());
    EXPECT_TRUE(Check(L"0.5"));
}

TEST_F(DoubleEdit, ShortFormatRoundsTheCurrentButNotTheCommittedValue)
{
    edit.SetValue(3.14159, TRUE);
    EXPECT_TRUE(edit.SetFormat(_T("%.2f")));
    EXPECT_EQ("3.14", edit.Text());
    EXPECT_EQ(3.14, edit.CurrentDouble());
    EXPECT_EQ(3.14159, edit.CommittedDouble());
    EXPECT_TRUE(edit.GetModified());
    EXPECT_EQ("%.2f", Narrow((LPCTSTR)edit.GetFormat()));
}

TEST_F(DoubleEdit, ReadingTheVariantAlwaysCommits)
{
    edit.SetValue(3.14159, TRUE);
    edit.SetFormat(_T("%.2f"));
    ASSERT_TRUE(edit.GetModified());
    KVXVariant read = edit.GetValueAsVariant(FALSE);
    EXPECT_EQ(3.14, DoubleProbe::AsDouble(read));
    EXPECT_FALSE(edit.GetModified());
    EXPECT_EQ(3.14, edit.CommittedDouble());
}

TEST_F(DoubleEdit, FormatsThatDoNotTakeOneDoubleAreRefused)
{
    edit.SetValue(1.5, TRUE);
    EXPECT_FALSE(edit.SetFormat(_T("")));
    EXPECT_FALSE(edit.SetFormat(_T("%s")));
    EXPECT_FALSE(edit.SetFormat(_T("%g and %g")));
    EXPECT_EQ("%.16g", Narrow((LPCTSTR)edit.GetFormat()));
    EXPECT_EQ("1.5", edit.Text());
}

TEST_F(DoubleEdit, ResetFormatTakesEffectAtTheNextValue)
{
    edit.SetValue(2.0, TRUE);
    edit.SetFormat(_T("%.3f"));
    EXPECT_EQ("2.000", edit.Text());
    edit.ResetFormat();
    EXPECT_EQ("2.000", edit.Text());
    edit.SetValue(2.5, TRUE);
    EXPECT_EQ("2.5", edit.Text());
}

struct DeltaCase
{
    const char* name;
    const wchar_t* format;
    const wchar_t* typed;
    double delta;
    double afterOneStep;
};

const DeltaCase kDeltaCases[] = {
    { "OneDecimal", L"%.16g", L"12.5", 0.1, 12.6 },
    { "TwoDecimals", L"%.16g", L"-2.25", 0.01, -2.24 },
    { "Integer", L"%.16g", L"100", 1.0, 101.0 },
    { "FixedFormat", L"%.2f", L"12.5", 0.01, 12.51 },
    { "ExponentFormat", L"%.1e", L"1.5e10", 1e9, 1.6e10 },
};

class DoubleEditDelta : public DoubleEdit, public testing::WithParamInterface<DeltaCase> {};

TEST_P(DoubleEditDelta, StepIsOneUnitOfTheLastDigitShown)
{
    const DeltaCase& c = GetParam();
    ASSERT_TRUE(edit.SetFormat(c.format));
    Type(c.typed);
    edit.SpinUp();
    EXPECT_DOUBLE_EQ(c.delta, edit.GetDelta());
    EXPECT_DOUBLE_EQ(c.afterOneStep, edit.CurrentDouble());
}

INSTANTIATE_TEST_SUITE_P(Table, DoubleEditDelta, testing::ValuesIn(kDeltaCases),
    [](const testing::TestParamInfo<DeltaCase>& info) { return std::string(info.param.name); });

TEST_F(DoubleEdit, SpinningWithAutomaticDelta)
{
    Type(L"12.5");
    std::vector<std::string> shown;
    for (int i = 0; i < 4; ++i)
    {
        edit.SpinUp();
        shown.push_back(edit.Text());
    }
    EXPECT_EQ((std::vector<std::string>{ "12.6", "12.7", "12.8", "12.9" }), shown);
    // The delta stays fixed during the sequence although "12.9" has the same digits.
    EXPECT_EQ(12.5, edit.Middle());
}

TEST_F(DoubleEdit, SpinningWithAFixedDelta)
{
    edit.SetAutomaticDeltaDeterminationEnabled(false);
    EXPECT_FALSE(edit.GetAutomaticDeltaDeterminationEnabled());
    edit.SetDelta(0.25);
    Type(L"12.5");
    edit.SpinUp();
    EXPECT_EQ("12.75", edit.Text());
    edit.SpinUp();
    EXPECT_EQ("13", edit.Text());
    EXPECT_EQ(0.25, edit.GetDelta());
}

TEST_F(DoubleEdit, LongSpinDoesNotAccumulateRoundingErrors)
{
    Type(L"0.1");
    for (int i = 0; i < 1000; ++i)
        edit.SpinUp();
    // 0.1 + 1000 * 0.1 computed from the middle value, not by adding 0.1 a thousand times.
    EXPECT_EQ("100.1", edit.Text());
}

TEST_F(DoubleEdit, SpinningClampsAtTheRangeEnd)
{
    edit.SetRange(KVXVariant(0.0), KVXVariant(1.0), TRUE, TRUE);
    Type(L"0.9");
    edit.SpinUp();
    EXPECT_EQ("1", edit.Text());
    edit.SpinUp();
    EXPECT_EQ("1", edit.Text());
    EXPECT_EQ(1.0, edit.Middle());
    EXPECT_EQ(0, edit.Offset());
}

TEST_F(DoubleEdit, CtrlZShowsTheCommittedValueOrEmptiesAnUndefinedField)
{
    edit.SetValue(1.25, TRUE);
    Type(L"7.5");
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessageW(edit, WM_CHAR, 26, 1);
    }
    EXPECT_EQ("1.25", edit.Text());
    EXPECT_FALSE(edit.GetModified());
    edit.SetUndefined(TRUE);
    Type(L"3");
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessageW(edit, WM_CHAR, 26, 1);
    }
    EXPECT_EQ("", edit.Text());
}

TEST_F(DoubleEdit, FilterPassesTheNumberAlphabetOnly)
{
    Type(L"-1a.5 E+2x");
    EXPECT_EQ("-1.5E+2", edit.Text());
    EXPECT_EQ(-150.0, edit.CurrentDouble());
}

TEST_F(DoubleEdit, NonConvertibleVariantChangesNothing)
{
    edit.SetValue(0.5, TRUE);
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(KVXString(_T("x"))), TRUE));
    EXPECT_EQ("0.5", edit.Text());
    EXPECT_TRUE(edit.SetValueAsVariant(KVXVariant(7L), TRUE));
    EXPECT_EQ("7", edit.Text());
}

} // namespace
