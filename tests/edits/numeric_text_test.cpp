// Window-free rules of the numeric edits:
//  - character filters of the integer and floating-point edits (every code unit 0..0x17F);
//  - integer display texts in the three bases, binary digits of negative values;
//  - range texts with included and excluded ends;
//  - message numbers per conversion code and number base, fixed-input messages;
//  - the nearer range end (ties, distances beyond 32 bits), integer steps without wrap-around;
//  - the automatic delta table, exponent formats and a middle value of 0;
//  - which printf formats take exactly one double.
#include "NumberFormat.h"

#include "resource.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>

namespace {

using namespace NumberFormat;

std::string Narrow(const std::wstring& w)
{
    return std::string(w.begin(), w.end());
}

// --- character filters ------------------------------------------------------

TEST(NumericCharFilter, IntegerAlphabetIsTheSameForEveryBase)
{
    const std::wstring accepted = L"0123456789abcdefABCDEFxXbB#$-";
    for (unsigned c = 0; c < 0x180; ++c)
    {
        const bool expected = accepted.find(static_cast<wchar_t>(c)) != std::wstring::npos
            || c == 8 || c == 16 || c == 17 || c == 19;
        EXPECT_EQ(expected, IsLongEditChar(static_cast<WCHAR>(c))) << "code " << c;
    }
}

TEST(NumericCharFilter, FloatingPointAlphabet)
{
    const std::wstring accepted = L"0123456789+-.eE";
    for (unsigned c = 0; c < 0x180; ++c)
    {
        const bool expected = accepted.find(static_cast<wchar_t>(c)) != std::wstring::npos || c == 8;
        EXPECT_EQ(expected, IsDoubleEditChar(static_cast<WCHAR>(c))) << "code " << c;
    }
}

// --- integer display texts ----------------------------------------------------

struct DisplayCase
{
    const char* name;
    long value;
    const wchar_t* decimal;
    const wchar_t* binary;
    const wchar_t* hexadecimal;
};

const DisplayCase kDisplayCases[] = {
    { "Zero", 0, L"0", L"0b0", L"0x0" },
    { "Ten", 10, L"10", L"0b1010", L"0xA" },
    { "ByteMax", 255, L"255", L"0b11111111", L"0xFF" },
    { "MinusOne", -1, L"-1", L"0b11111111111111111111111111111111", L"0xFFFFFFFF" },
    { "LongMax", LONG_MAX, L"2147483647", L"0b1111111111111111111111111111111", L"0x7FFFFFFF" },
    { "LongMin", LONG_MIN, L"-2147483648", L"0b10000000000000000000000000000000", L"0x80000000" },
    { "MinusTwo", -2, L"-2", L"0b11111111111111111111111111111110", L"0xFFFFFFFE" },
};

class LongDisplay : public testing::TestWithParam<DisplayCase> {};

TEST_P(LongDisplay, TextInEachBase)
{
    const DisplayCase& c = GetParam();
    EXPECT_EQ(Narrow(c.decimal), Narrow(LongDisplayText(c.value, kDecimal)));
    EXPECT_EQ(Narrow(c.binary), Narrow(LongDisplayText(c.value, kBinary)));
    EXPECT_EQ(Narrow(c.hexadecimal), Narrow(LongDisplayText(c.value, kHexadecimal)));
    EXPECT_EQ(Narrow(c.binary + 2), Narrow(BinaryDigits(c.value)));
}

INSTANTIATE_TEST_SUITE_P(Table, LongDisplay, testing::ValuesIn(kDisplayCases),
    [](const testing::TestParamInfo<DisplayCase>& info) { return std::string(info.param.name); });

TEST(LongDisplayText, UnknownDisplayIsDecimal)
{
    EXPECT_EQ("255", Narrow(LongDisplayText(255, 0)));
    EXPECT_EQ("255", Narrow(LongDisplayText(255, 4)));
}

// --- range texts ----------------------------------------------------------------

TEST(RangeText, BracketsFollowTheIncludedEnds)
{
    EXPECT_EQ(" [ 1 , 10 ] ", Narrow(RangeText(L"1", L"10", true, true)));
    EXPECT_EQ(" ( 1 , 10 ] ", Narrow(RangeText(L"1", L"10", false, true)));
    EXPECT_EQ(" [ 1 , 10 ) ", Narrow(RangeText(L"1", L"10", true, false)));
    EXPECT_EQ(" ( -2147483648 , 2147483647 ) ", Narrow(RangeText(L"-2147483648", L"2147483647", false, false)));
}

// --- message numbers ------------------------------------------------------------

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
    { "NotSupported", -1, 10, IDS_CANNOT_CONVERT, IDS_CANNOT_CONVERT },
    { "UnknownCode", -42, 16, IDS_CANNOT_CONVERT, IDS_CANNOT_CONVERT },
};

class ErrorMessage : public testing::TestWithParam<MessageCase> {};

TEST_P(ErrorMessage, NumberPerCode)
{
    const MessageCase& c = GetParam();
    EXPECT_EQ(c.longId, LongErrorMessageId(c.code, c.base));
    EXPECT_EQ(c.doubleId, DoubleErrorMessageId(c.code));
}

INSTANTIATE_TEST_SUITE_P(Table, ErrorMessage, testing::ValuesIn(kMessageCases),
    [](const testing::TestParamInfo<MessageCase>& info) { return std::string(info.param.name); });

TEST(FixedInputMessage, OnlyAMismatchedBaseIsReported)
{
    EXPECT_EQ(0u, FixedInputMessageId(kDecimal, 10));
    EXPECT_EQ(static_cast<UINT>(IDS_MUST_BE_DECIMAL), FixedInputMessageId(kDecimal, 16));
    EXPECT_EQ(static_cast<UINT>(IDS_MUST_BE_DECIMAL), FixedInputMessageId(kDecimal, 2));
    EXPECT_EQ(0u, FixedInputMessageId(kBinary, 2));
    EXPECT_EQ(static_cast<UINT>(IDS_MUST_BE_BINARY), FixedInputMessageId(kBinary, 10));
    EXPECT_EQ(0u, FixedInputMessageId(kHexadecimal, 16));
    EXPECT_EQ(static_cast<UINT>(IDS_MUST_BE_HEXADECIMAL), FixedInputMessageId(kHexadecimal, 2));
}

// --- range ends and steps -------------------------------------------------------

TEST(NearerEnd, TiesPickTheUpperEnd)
{
    EXPECT_TRUE(LowerEndIsNearer(0L, 10L, -5L));
    EXPECT_FALSE(LowerEndIsNearer(0L, 10L, 20L));
    EXPECT_FALSE(LowerEndIsNearer(0L, 10L, 5L));
    EXPECT_TRUE(LowerEndIsNearer(0.0, 1.0, 0.25));
    EXPECT_FALSE(LowerEndIsNearer(0.0, 1.0, 0.5));
}

TEST(NearerEnd, DistancesDoNotWrapAround)
{
    // 32-bit differences would wrap: LONG_MIN - 1 and 1 - LONG_MAX.
    EXPECT_FALSE(LowerEndIsNearer(LONG_MIN, 1L, LONG_MAX));
    EXPECT_TRUE(LowerEndIsNearer(-1L, LONG_MAX, LONG_MIN));
    EXPECT_TRUE(LowerEndIsNearer(LONG_MIN, LONG_MAX, -2L));
}

TEST(AddSteps, SumsOutsideThirtyTwoBitsAreRefused)
{
    long result = 7;
    EXPECT_TRUE(AddSteps(9, 1, result));
    EXPECT_EQ(10, result);
    EXPECT_TRUE(AddSteps(9, -20, result));
    EXPECT_EQ(-11, result);
    EXPECT_TRUE(AddSteps(LONG_MAX - 1, 1, result));
    EXPECT_EQ(LONG_MAX, result);
    result = 7;
    EXPECT_FALSE(AddSteps(LONG_MAX, 1, result));
    EXPECT_FALSE(AddSteps(LONG_MIN, -1, result));
    EXPECT_EQ(7, result);
}

// --- automatic delta --------------------------------------------------------------

struct DeltaCase
{
    const char* name;
    double middle;
    const wchar_t* shown;
    double delta;
};

const DeltaCase kDeltaCases[] = {
    { "OneDecimal", 12.5, L"12.5", 0.1 },
    { "NegativeTwoDecimals", -2.25, L"-2.25", 0.01 },
    { "Integer", 100.0, L"100", 1.0 },
    { "FixedTwoDecimals", 12.5, L"12.50", 0.01 },
    { "ExponentThreeDigits", 1.5e10, L"1.5e+010", 1e9 },
    { "ExponentTwoDigits", 1.5e10, L"1.5e+10", 1e9 },
    { "UpperExponent", 2.5e-3, L"2.50E-003", 1e-5 },
    { "ExponentWithoutPoint", 3e7, L"3e+007", 1e7 },
    { "SmallNegativeExponent", -4.25e-7, L"-4.25e-007", 1e-9 },
    { "ZeroPlain", 0.0, L"0", 1.0 },
    { "ZeroWithExponent", 0.0, L"0.0e+000", 0.1 },
    { "TrailingPoint", 7.0, L"7.", 1.0 },
};

class AutoDeltaTable : public testing::TestWithParam<DeltaCase> {};

TEST_P(AutoDeltaTable, OneUnitOfTheLastDigitShown)
{
    const DeltaCase& c = GetParam();
    EXPECT_DOUBLE_EQ(c.delta, AutoDelta(c.shown, c.middle));
}

INSTANTIATE_TEST_SUITE_P(Table, AutoDeltaTable, testing::ValuesIn(kDeltaCases),
    [](const testing::TestParamInfo<DeltaCase>& info) { return std::string(info.param.name); });

TEST(AutoDelta, TenthIsTheNearestDouble)
{
    // Steps are middle + offset * delta: an inexact tenth would show 12.600000000000001.
    EXPECT_EQ(0.1, AutoDelta(L"12.5", 12.5));
    EXPECT_EQ(0.01, AutoDelta(L"3.14", 3.14));
}

// --- formats -----------------------------------------------------------------------

struct FormatCase
{
    const char* name;
    const wchar_t* format;
    bool ok;
};

const FormatCase kFormatCases[] = {
    { "Default", L"%.16g", true },
    { "Fixed", L"%.2f", true },
    { "Exponent", L"%.1e", true },
    { "UpperG", L"%G", true },
    { "FlagsAndWidth", L"%+08.3f", true },
    { "LongPrefix", L"%lf", true },
    { "WithText", L"x = %g mm", true },
    { "PercentLiteral", L"%g %%", true },
    { "NoConversion", L"value", false },
    { "OnlyPercentLiteral", L"100%%", false },
    { "TwoConversions", L"%g %g", false },
    { "StringConversion", L"%s", false },
    { "IntegerConversion", L"%d", false },
    { "StarWidth", L"%*g", false },
    { "StarPrecision", L"%.*f", false },
    { "TrailingPercent", L"%g%", false },
    { "Pointer", L"%p", false },
    { "Empty", L"", false },
};

class DoubleFormat : public testing::TestWithParam<FormatCase> {};

TEST_P(DoubleFormat, ExactlyOneDoubleConversion)
{
    const FormatCase& c = GetParam();
    EXPECT_EQ(c.ok, IsSingleDoubleFormat(c.format));
}

INSTANTIATE_TEST_SUITE_P(Table, DoubleFormat, testing::ValuesIn(kFormatCases),
    [](const testing::TestParamInfo<FormatCase>& info) { return std::string(info.param.name); });

} // namespace
