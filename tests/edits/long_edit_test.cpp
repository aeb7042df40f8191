// The integer edit in a dialog:
//  - a new field shows 0 (created, and subclassed over a template text);
//  - the value shown in each display base; negative values read back from hex and binary;
//  - display changes re-show the value; invalid display numbers are ignored;
//  - input in any base without fixed input, the fixed-input messages per display base;
//  - stored messages: range texts with included and excluded ends, overflow, underflow,
//    syntax per base with the error position, no number at all;
//  - spinning into the range end; range changes moving the value to the nearer end
//    (exact distances) and committing it;
//  - Ctrl+Z undo, the character filter, pasted text judged by the text check only;
//  - GetValue of an invalid field, non-convertible variants.
#include "numeric_probes.h"

#include "resource.h"

#include <climits>

namespace {

using namespace edit_test;
using orvane_test::KeyStateGuard;
using orvane_test::SendChars;

class LongEdit : public NumericFixture
{
protected:
    void SetUp() override
    {
        NumericFixture::SetUp();
        CreateIn(edit, CRect(10, 20, 140, 41));
        edit.SetFocus();
    }

    void Type(const wchar_t* text)
    {
        edit.SetSel(0, -1);
        SendChars(edit, text);
    }

    // The message stored for a text, and whether the text passed.
    bool Check(const wchar_t* text)
    {
        edit.SetWindowText(text);
        return edit.SyntaxCheck(FALSE) != FALSE;
    }

    LongProbe edit;
};

TEST_F(LongEdit, NewFieldShowsZero)
{
    EXPECT_EQ("0", edit.Text());
    EXPECT_EQ(0, edit.GetValue(FALSE));
    EXPECT_FALSE(edit.GetModified());
}

TEST_F(LongEdit, SubclassedControlReplacesTheTemplateText)
{
    ::SetWindowTextW(dlg.Item(kIdEdit1), L"77");
    LongProbe subclassed;
    ASSERT_TRUE(subclassed.SubclassDlgItem(kIdEdit1, &dlg));
    EXPECT_EQ("0", subclassed.Text());
}

struct BaseCase
{
    const char* name;
    KVXLongEdit::DISPLAYTYPE display;
    long value;
    const char* shown;
};

const BaseCase kBaseCases[] = {
    { "Decimal255", KVXLongEdit::DECIMAL, 255, "255" },
    { "Binary10", KVXLongEdit::BINARY, 10, "0b1010" },
    { "HexMinusOne", KVXLongEdit::HEXADECIMAL, -1, "0xFFFFFFFF" },
    { "BinaryMinusOne", KVXLongEdit::BINARY, -1, "0b11111111111111111111111111111111" },
    { "HexLongMin", KVXLongEdit::HEXADECIMAL, LONG_MIN, "0x80000000" },
    { "DecimalLongMin", KVXLongEdit::DECIMAL, LONG_MIN, "-2147483648" },
};

class LongEditBases : public LongEdit, public testing::WithParamInterface<BaseCase> {};

TEST_P(LongEditBases, ShownInTheDisplayBaseAndReadBack)
{
    const BaseCase& c = GetParam();
    LongProbe shown(c.display);
    CreateIn(shown, CRect(10, 50, 240, 71), 2002);
    EXPECT_EQ(c.display, shown.GetDisplayType());
    EXPECT_TRUE(shown.SetValue(c.value, TRUE));
    EXPECT_EQ(c.shown, shown.Text());
    // The change check reads the shown text back as the same value.
    EXPECT_EQ(c.value, shown.CurrentLong());
    EXPECT_TRUE(shown.SyntaxCheck(FALSE));
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_FALSE(shown.GetModified());
}

INSTANTIATE_TEST_SUITE_P(Table, LongEditBases, testing::ValuesIn(kBaseCases),
    [](const testing::TestParamInfo<BaseCase>& info) { return std::string(info.param.name); });

TEST_F(LongEdit, ConstructorFallsBackToDecimal)
{
    LongProbe odd(static_cast<KVXLongEdit::DISPLAYTYPE>(7));
    EXPECT_EQ(KVXLongEdit::DECIMAL, odd.GetDisplayType());
}

TEST_F(LongEdit, DisplayChangeReShowsTheValueUncommitted)
{
    edit.SetValue(255, TRUE);
    Type(L"254");
    edit.SetDisplayType(3);
    EXPECT_EQ("0xFE", edit.Text());
    EXPECT_EQ(255, edit.CommittedLong());
    EXPECT_TRUE(edit.GetModified());
    edit.SetDisplayType(4);
    edit.SetDisplayType(0);
    EXPECT_EQ("0xFE", edit.Text());
    EXPECT_EQ(KVXLongEdit::HEXADECIMAL, edit.GetDisplayType());
    edit.SetDisplayType(2);
    EXPECT_EQ("0b11111110", edit.Text());
}

TEST_F(LongEdit, AnyBaseIsAcceptedAndStaysAsTyped)
{
    Type(L"0b101");
    EXPECT_EQ(5, edit.CurrentLong());
    EXPECT_EQ("0b101", edit.Text());
    Type(L"0x1F");
    EXPECT_EQ(31, edit.CurrentLong());
    EXPECT_EQ("0x1F", edit.Text());
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
}

struct FixedCase
{
    const char* name;
    KVXLongEdit::DISPLAYTYPE display;
    const wchar_t* text;
    UINT message;   // 0: accepted
};

const FixedCase kFixedCases[] = {
    { "DecimalRefusesHex", KVXLongEdit::DECIMAL, L"0x1F", IDS_MUST_BE_DECIMAL },
    { "DecimalRefusesBinary", KVXLongEdit::DECIMAL, L"0b1", IDS_MUST_BE_DECIMAL },
    { "DecimalTakesDecimal", KVXLongEdit::DECIMAL, L"31", 0 },
    { "BinaryRefusesDecimal", KVXLongEdit::BINARY, L"12", IDS_MUST_BE_BINARY },
    { "BinaryTakesBinary", KVXLongEdit::BINARY, L"0b11", 0 },
    { "HexRefusesBinary", KVXLongEdit::HEXADECIMAL, L"0b1", IDS_MUST_BE_HEXADECIMAL },
    { "HexTakesHex", KVXLongEdit::HEXADECIMAL, L"0xff", 0 },
};

class LongEditFixedInput : public LongEdit, public testing::WithParamInterface<FixedCase> {};

TEST_P(LongEditFixedInput, TextMustUseTheDisplayBase)
{
    const FixedCase& c = GetParam();
    edit.SetDisplayType(c.display);
    edit.SetFixedInput(true);
    EXPECT_TRUE(edit.GetFixedInput());
    EXPECT_EQ(c.message == 0, Check(c.text));
    if (c.message != 0)
    {
        EXPECT_EQ(Narrow(LoadText(c.message)), edit.Message());
    }
}

INSTANTIATE_TEST_SUITE_P(Table, LongEditFixedInput, testing::ValuesIn(kFixedCases),
    [](const testing::TestParamInfo<FixedCase>& info) { return std::string(info.param.name); });

TEST_F(LongEdit, FixedInputMessageText)
{
    edit.SetFixedInput(true);
    Check(L"0x1F");
    EXPECT_EQ("Value must be inserted in decimal !", edit.Message());
}

struct MessageCase
{
    const char* name;
    const wchar_t* text;
    UINT message;
    int errorPos;
};

const MessageCase kMessageCases[] = {
    { "Overflow", L"2147483648", IDS_LONG_OVERFLOW, 0 },
    { "Underflow", L"-2147483649", IDS_LONG_UNDERFLOW, 0 },
    { "HexOverflow", L"0x100000000", IDS_LONG_OVERFLOW, 0 },
    { "DecimalSyntax", L"12#4", IDS_DECIMAL_SYNTAX, 2 },
    { "BinarySyntax", L"0b102", IDS_BINARY_SYNTAX, 4 },
    { "HexSyntax", L"0x1G", IDS_HEXADECIMAL_SYNTAX, 3 },
    { "DollarIsSyntax", L"$5", IDS_DECIMAL_SYNTAX, 0 },
    { "LoneMinus", L"-", IDS_NOT_A_NUMBER, 0 },
    { "LonePrefix", L"0x", IDS_NOT_A_NUMBER, 0 },
};

class LongEditMessages : public LongEdit, public testing::WithParamInterface<MessageCase> {};

TEST_P(LongEditMessages, StoredMessageAndPosition)
{
    const MessageCase& c = GetParam();
    Type(L"17");
    EXPECT_FALSE(Check(c.text));
    EXPECT_EQ(Narrow(LoadText(c.message)), edit.Message());
    EXPECT_EQ(c.errorPos, edit.ErrorPos());
    EXPECT_EQ(17, edit.CurrentLong());   // invalid text never changes the value
    EXPECT_EQ(&edit, KVXEdit::FindErrorOnPage(dlg));
}

INSTANTIATE_TEST_SUITE_P(Table, LongEditMessages, testing::ValuesIn(kMessageCases),
    [](const testing::TestParamInfo<MessageCase>& info) { return std::string(info.param.name); });

TEST_F(LongEdit, RangeTextsFollowTheIncludedEnds)
{
    edit.SetRange(KVXVariant(1L), KVXVariant(10L), TRUE, TRUE);
    Type(L"5");
    Check(L"11");
    EXPECT_EQ("Long value not in Range ! [ 1 , 10 ] ", edit.Message());
    EXPECT_EQ(5, edit.CurrentLong());

    edit.SetRange(KVXVariant(1L), KVXVariant(10L), FALSE, TRUE);
    Check(L"1");
    EXPECT_EQ("Long value not in Range ! ( 1 , 10 ] ", edit.Message());
    edit.SetRange(KVXVariant(1L), KVXVariant(10L), TRUE, FALSE);
    Check(L"10");
    EXPECT_EQ("Long value not in Range ! [ 1 , 10 ) ", edit.Message());
    EXPECT_FALSE(edit.GetMaximumInclude());
    EXPECT_TRUE(edit.GetMinimumInclude());
}

TEST_F(LongEdit, DefaultRangeTextIsInDecimalWhateverTheDisplay)
{
    edit.SetDisplayType(3);
    edit.SetRange(KVXVariant(-16L), KVXVariant(255L), TRUE, TRUE);
    Check(L"0x100");
    EXPECT_EQ("Long value not in Range ! [ -16 , 255 ] ", edit.Message());
}

TEST_F(LongEdit, SpinningIntoTheRangeEndKeepsTheEnd)
{
    edit.SetRange(KVXVariant(1L), KVXVariant(10L), TRUE, TRUE);
    Type(L"9");
    edit.SpinUp();
    EXPECT_EQ("10", edit.Text());
    edit.SpinUp();
    EXPECT_EQ("10", edit.Text());
    EXPECT_EQ(10, edit.Middle());
    EXPECT_EQ(0, edit.Offset());
    edit.SpinDown();
    EXPECT_EQ("9", edit.Text());
}

TEST_F(LongEdit, SpinningDownToAnExcludedEnd)
{
    edit.SetRange(KVXVariant(1L), KVXVariant(10L), FALSE, TRUE);
    Type(L"3");
    edit.SpinDown();
    edit.SpinDown();
    EXPECT_EQ("2", edit.Text());
}

struct NearerCase
{
    const char* name;
    long value;
    long min;
    long max;
    long expected;
};

const NearerCase kNearerCases[] = {
    { "BelowGoesToMin", -5, 0, 10, 0 },
    { "AboveGoesToMax", 20, 0, 10, 10 },
    { "ReversedEndsAreOrdered", -5, 10, 0, 0 },
    { "ExactDistances", LONG_MAX, LONG_MIN, -2147483640L, -2147483640L },
    { "ExactDistancesLow", LONG_MIN, 2147483640L, LONG_MAX, 2147483640L },
};

class LongEditNewRange : public LongEdit, public testing::WithParamInterface<NearerCase> {};

TEST_P(LongEditNewRange, ValueMovesToTheNearerEndAndIsCommitted)
{
    const NearerCase& c = GetParam();
    edit.SetValue(c.value, FALSE);
    edit.SetRange(KVXVariant(c.min), KVXVariant(c.max), TRUE, TRUE);
    EXPECT_EQ(c.expected, edit.CurrentLong());
    EXPECT_EQ(c.expected, edit.CommittedLong());
    EXPECT_FALSE(edit.GetModified());
}

INSTANTIATE_TEST_SUITE_P(Table, LongEditNewRange, testing::ValuesIn(kNearerCases),
    [](const testing::TestParamInfo<NearerCase>& info) { return std::string(info.param.name); });

TEST_F(LongEdit, RangeSetBeforeTheWindowExistsIsShownAtCreation)
{
    LongProbe early;
    early.SetRange(KVXVariant(5L), KVXVariant(9L), TRUE, TRUE);
    CreateIn(early, CRect(10, 50, 140, 71), 2002);
    EXPECT_EQ("5", early.Text());
}

TEST_F(LongEdit, CtrlZShowsTheCommittedValueOrEmptiesAnUndefinedField)
{
    edit.SetValue(5, TRUE);
    Type(L"57");
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessageW(edit, WM_CHAR, 26, 1);
    }
    EXPECT_EQ("5", edit.Text());
    EXPECT_FALSE(edit.GetModified());

    edit.SetUndefined(TRUE);
    Type(L"8");
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessageW(edit, WM_CHAR, 26, 1);
    }
    EXPECT_EQ("", edit.Text());
    EXPECT_TRUE(edit.GetUndefined());
}

TEST_F(LongEdit, FilterPassesHashAndDollarButNotBlanksOrOtherLetters)
{
    Type(L"1#");
    EXPECT_EQ("1#", edit.Text());
    EXPECT_EQ(&edit, KVXEdit::FindErrorOnPage(dlg));
    Type(L"2 g$");
    EXPECT_EQ("2$", edit.Text());
    Type(L"-0xaB");
    EXPECT_EQ("-0xaB", edit.Text());
    EXPECT_EQ(-171, edit.CurrentLong());
}

TEST_F(LongEdit, PastedTextIsJudgedOnlyByTheTextCheck)
{
    ASSERT_TRUE(::OpenClipboard(dlg));
    ::EmptyClipboard();
    const wchar_t text[] = L"1 2";
    HGLOBAL memory = ::GlobalAlloc(GMEM_MOVEABLE, sizeof text);
    memcpy(::GlobalLock(memory), text, sizeof text);
    ::GlobalUnlock(memory);
    ::SetClipboardData(CF_UNICODETEXT, memory);
    ::CloseClipboard();

    edit.SetSel(0, -1);
    ::SendMessageW(edit, WM_PASTE, 0, 0);
    EXPECT_EQ("1 2", edit.Text());
    EXPECT_EQ(Narrow(LoadText(IDS_DECIMAL_SYNTAX)), edit.Message());
    EXPECT_EQ(1, edit.ErrorPos());
}

TEST_F(LongEdit, InvalidFieldReadsAsItsCommittedValue)
{
    edit.SetValue(12, TRUE);
    Type(L"13#");
    EXPECT_EQ(12, edit.GetValue(FALSE));
    Type(L"14");
    EXPECT_EQ(14, edit.GetValue(TRUE));
    EXPECT_EQ(14, edit.CommittedLong());
    KVXVariant v = edit.GetValueAsVariant(FALSE);
    EXPECT_EQ(14, LongProbe::AsLong(v));
}

TEST_F(LongEdit, NonConvertibleVariantChangesNothing)
{
    edit.SetValue(3, TRUE);
    VARIANT null;
    ::VariantInit(&null);
    null.vt = VT_NULL;
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(null), TRUE));
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(KVXString(_T("abc"))), TRUE));
    EXPECT_EQ("3", edit.Text());
    EXPECT_EQ(3, edit.CommittedLong());
}

TEST_F(LongEdit, DisablingAnInvalidFieldRestoresTheCommittedValue)
{
    edit.SetValue(8, TRUE);
    Type(L"9#");
    edit.EnableWindow(FALSE);
    EXPECT_EQ("8", edit.Text());
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
}

} // namespace
