// Window-free rules of the numeric edits, as named tables:
//  - character filters of the integer and floating-point edits (every code unit 0..0x17F);
//  - integer display texts in the three bases, binary digits of negative values;
//  - range texts with included and excluded ends;
//  - message numbers per conversion code and number base, fixed-input messages;
//  - the nearer range end (ties, distances beyond 32 bits), integer steps without wrap-around;
//  - the automatic delta table, exponent formats and a middle value of 0;
//  - which printf formats take exactly one double.
#include "NumberFormat.h"
#include "edit_harness.h"
#include "resource.h"

#include <climits>

namespace {

using namespace NumberFormat;
using edit_test::Narrow;

TEST(NumericCharFilter, IntegerAlphabetIsTheSameForEveryBaseFloatingPointItsOwn)
{
    const std::wstring longChars = L"0123456789abcdefABCDEFxXbB#$-\x08\x10\x11\x13";
    const std::wstring doubleChars = L"0123456789+-.eE\x08";
    for (unsigned c = 1; c < 0x180; ++c)
    {
        EXPECT_EQ(longChars.find(wchar_t(c)) != std::wstring::npos, IsLongEditChar(WCHAR(c))) << "code " << c;
        EXPECT_EQ(doubleChars.find(wchar_t(c)) != std::wstring::npos, IsDoubleEditChar(WCHAR(c))) << "code " << c;
    }
    EXPECT_FALSE(IsLongEditChar(0));
    for (WCHAR c : { 3, 22, 24 })
        EXPECT_TRUE(IsClipboardChar(c)) << int(c);
    EXPECT_FALSE(IsClipboardChar(26));
}

struct DisplayCase
{
    long value;
    const wchar_t* decimal;
    const wchar_t* binary;
    const wchar_t* hexadecimal;
};

const DisplayCase kDisplayCases[] = {
    { 0, L"0", L"0b0", L"0x0" },
    { 10, L"10", L"0b1010", L"0xA" },
    { -1, L"-1", L"0b11111111111111111111111111111111", L"0xFFFFFFFF" },
    { LONG_MAX, L"2147483647", L"0b1111111111111111111111111111111", L"0x7FFFFFFF" },
    { LONG_MIN, L"-2147483648", L"0b10000000000000000000000000000000", L"0x80000000" },
    { -2, L"-2", L"0b11111111111111111111111111111110", L"0xFFFFFFFE" },
};

TEST(LongDisplayText, TextInEachBaseUnknownDisplayIsDecimal)
{
    for (const DisplayCase& c : kDisplayCases)
    {
        SCOPED_TRACE(c.value);
        EXPECT_EQ(Narrow(c.decimal), Narrow(LongDisplayText(c.value, kDecimal)));
        EXPECT_EQ(Narrow(c.binary), Narrow(LongDisplayText(c.value, kBinary)));
        EXPECT_EQ(Narrow(c.hexadecimal), Narrow(LongDisplayText(c.value, kHexadecimal)));
        EXPECT_EQ(Narrow(c.binary + 2), Narrow(BinaryDigits(c.value)));
    }
    EXPECT_EQ("255", Narrow(LongDisplayText(255, 0)));
    EXPECT_EQ("255", Narrow(LongDisplayText(255, 4)));
}

TEST(RangeText, BracketsFollowTheIncludedEnds)
{
    EXPECT_EQ(" [ 1 , 10 ] ", Narrow(RangeText(L"1", L"10", true, true)));
    EXPECT_EQ(" ( 1 , 10 ] ", Narrow(RangeText(L"1", L"10", false, true)));
    EXPECT_EQ(" [ -2 , 2 ) ", Narrow(RangeText(L"-2", L"2", true, false)));
}

struct MessageCase
{
    const char* name;
    int code;
    int base;
    UINT longId;
    UINT doubleId;
};

const MessageCase kMessageCases[] = {
    { "OutOfRange", 0, 10, IDS_LONG_NOT_IN_RANGE, IDS_DOUBLE_NOT_IN_RANGE },
    { "NotANumber", -7, 10, IDS_NOT_A_NUMBER, IDS_NOT_A_NUMBER },
    { "Overflow", -5, 10, IDS_LONG_OVERFLOW, IDS_DOUBLE_OVERFLOW },
    { "Underflow", -4, 10, IDS_LONG_UNDERFLOW, IDS_DOUBLE_UNDERFLOW },
    { "SyntaxDecimal", -3, 10, IDS_DECIMAL_SYNTAX, IDS_DOUBLE_SYNTAX },
    { "SyntaxBinary", -3, 2, IDS_BINARY_SYNTAX, IDS_DOUBLE_SYNTAX },
    { "SyntaxHexadecimal", -3, 16, IDS_HEXADECIMAL_SYNTAX, IDS_DOUBLE_SYNTAX },
    { "PrecisionLoss", -6, 10, IDS_CANNOT_CONVERT, IDS_CANNOT_CONVERT },
    { "BadArgument", -2, 10, IDS_CANNOT_CONVERT, IDS_CANNOT_CONVERT },
    { "UnknownCode", -42, 16, IDS_CANNOT_CONVERT, IDS_CANNOT_CONVERT },
};

TEST(ErrorMessage, NumberPerCodeAndBase)
{
    for (const MessageCase& c : kMessageCases)
    {
        EXPECT_EQ(c.longId, LongErrorMessageId(c.code, c.base)) << c.name;
        EXPECT_EQ(c.doubleId, DoubleErrorMessageId(c.code)) << c.name;
    }
    EXPECT_EQ(0u, FixedInputMessageId(kDecimal, 10));
    EXPECT_EQ(UINT(IDS_MUST_BE_DECIMAL), FixedInputMessageId(kDecimal, 16));
    EXPECT_EQ(UINT(IDS_MUST_BE_DECIMAL), FixedInputMessageId(kDecimal, 2));
    EXPECT_EQ(0u, FixedInputMessageId(kBinary, 2));
    EXPECT_EQ(UINT(IDS_MUST_BE_BINARY), FixedInputMessageId(kBinary, 10));
    EXPECT_EQ(0u, FixedInputMessageId(kHexadecimal, 16));
    EXPECT_EQ(UINT(IDS_MUST_BE_HEXADECIMAL), FixedInputMessageId(kHexadecimal, 2));
}

TEST(NearerEnd, TiesPickTheUpperEndDistancesDoNotWrapAround)
{
    EXPECT_TRUE(LowerEndIsNearer(0L, 10L, -5L));
    EXPECT_FALSE(LowerEndIsNearer(0L, 10L, 20L));
    EXPECT_FALSE(LowerEndIsNearer(0L, 10L, 5L));
    EXPECT_TRUE(LowerEndIsNearer(0.0, 1.0, 0.25));
    EXPECT_FALSE(LowerEndIsNearer(0.0, 1.0, 0.5));
    // 32-bit differences would wrap: LONG_MIN - 1 and 1 - LONG_MAX.
    EXPECT_FALSE(LowerEndIsNearer(LONG_MIN, 1L, LONG_MAX));
    EXPECT_TRUE(LowerEndIsNearer(-1L, LONG_MAX, LONG_MIN));
    EXPECT_TRUE(LowerEndIsNearer(LONG_MIN, LONG_MAX, -2L));
}

TEST(AddSteps, SumsOutsideThirtyTwoBitsAreRefused)
{
    long result = 7;
    EXPECT_TRUE(AddSteps(9, -20, result));
    EXPECT_EQ(-11, result);
    EXPECT_TRUE(AddSteps(LONG_MAX - 1, 1, result));
    EXPECT_EQ(LONG_MAX, result);
    result = 7;
    EXPECT_FALSE(AddSteps(LONG_MAX, 1, result));
    EXPECT_FALSE(AddSteps(LONG_MIN, -1, result));
    EXPECT_EQ(7, result);
}

struct DeltaCase
{
    double middle;
    const wchar_t* shown;
    double delta;
};

const DeltaCase kDeltaCases[] = {
    { 12.5, L"12.5", 0.1 },           { -2.25, L"-2.25", 0.01 },      { 100.0, L"100", 1.0 },
    { 12.5, L"12.50", 0.01 },         { 1.5e10, L"1.5e+010", 1e9 },   { 1.5e10, L"1.5e+10", 1e9 },
    { 2.5e-3, L"2.50E-003", 1e-5 },   { 3e7, L"3e+007", 1e7 },        { -4.25e-7, L"-4.25e-007", 1e-9 },
    { 0.0, L"0", 1.0 },               { 0.0, L"0.0e+000", 0.1 },      { 7.0, L"7.", 1.0 },
};

TEST(AutoDelta, OneUnitOfTheLastDigitShown)
{
    for (const DeltaCase& c : kDeltaCases)
        EXPECT_DOUBLE_EQ(c.delta, AutoDelta(c.shown, c.middle)) << Narrow(c.shown);
    // Steps are middle + offset * delta: an inexact tenth would show 12.600000000000001.
    EXPECT_EQ(0.1, AutoDelta(L"12.5", 12.5));
    EXPECT_EQ(0.01, AutoDelta(L"3.14", 3.14));
}

TEST(DoubleFormat, ExactlyOneDoubleConversion)
{
    for (const wchar_t* ok : { L"%.16g", L"%.2f", L"%.1e", L"%G", L"%+08.3f", L"%lf", L"x = %g mm", L"%g %%" })
        EXPECT_TRUE(IsSingleDoubleFormat(ok)) << Narrow(ok);
    for (const wchar_t* bad : { L"value", L"100%%", L"%g %g", L"%s", L"%d", L"%*g", L"%.*f", L"%g%", L"%p", L"" })
        EXPECT_FALSE(IsSingleDoubleFormat(bad)) << Narrow(bad);
}

} // namespace
