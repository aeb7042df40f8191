// Number grammar as plain functions, at the boundaries the random differential test
// (grammar_random_test.cpp) seldom reaches:
//  - long: the ends of the type, 32-bit patterns of unsigned prefixed text and magnitudes of
//    signed ones, the words, an explicit length, a NULL text;
//  - double: the ends of the type, rounding to infinity and to zero, subnormals, huge exponents;
//  - base detection; formatting of long (three bases) and double, and the round trip back;
//  - the printf conversion letters.
#include <gtest/gtest.h>

#include <cfloat>
#include <climits>
#include <cmath>
#include <cstring>
#include <iterator>
#include <random>
#include <string>

#include "NumberText.h"

namespace
{

// One boundary row of the grammar for values of type T.
template<class T>
struct GrammarCase
{
    const char* name;
    const wchar_t* text;
    KVTEnumConvertType code;
    T value;        // checked for KVT_CONVERT_OK
    int errorPos;   // checked always (0 unless a syntax error)
};

// A failed conversion leaves the value as it was.
template<class T>
void ExpectRows(const GrammarCase<T>* rows, size_t count,
                KVTEnumConvertType (*parse)(const wchar_t*, int, T&, int&))
{
    for (const GrammarCase<T>* c = rows; c != rows + count; ++c)
    {
        SCOPED_TRACE(c->name);
        T value = T(12345);
        int errorPos = -99;
        EXPECT_EQ(c->code, parse(c->text, -1, value, errorPos));
        EXPECT_EQ(c->errorPos, errorPos);
        EXPECT_EQ(c->code == KVT_CONVERT_OK ? c->value : T(12345), value);
    }
}

using LongCase = GrammarCase<long>;
using DoubleCase = GrammarCase<double>;

const LongCase kLongCases[] = {
    { "Max", L"2147483647", KVT_CONVERT_OK, LONG_MAX, 0 },
    { "Min", L"-2147483648", KVT_CONVERT_OK, LONG_MIN, 0 },
    { "MaxManyZeros", L"0000000000002147483647", KVT_CONVERT_OK, LONG_MAX, 0 },
    { "AboveMax", L"2147483648", KVT_CONVERT_OVERFLOW, 0, 0 },
    { "FarAboveMax", L"99999999999999999999999999", KVT_CONVERT_OVERFLOW, 0, 0 },
    { "BelowMin", L"-2147483649", KVT_CONVERT_UNDERFLOW, 0, 0 },
    { "NanWord", L"nan", KVT_CONVERT_NOT_A_NUMBER, 0, 0 },
    { "InfWord", L"-Inf", KVT_CONVERT_NOT_A_NUMBER, 0, 0 },
    { "InfinityWord", L" INFINITY ", KVT_CONVERT_NOT_A_NUMBER, 0, 0 },
    { "WordPrefix", L"info", KVT_CONVERT_SYNTAX_ERROR, 0, 0 },
    { "SyntaxBeforeRange", L"99999999999#", KVT_CONVERT_SYNTAX_ERROR, 0, 11 },
    { "BinAllOnes", L"0b11111111111111111111111111111111", KVT_CONVERT_OK, -1, 0 },
    { "BinTopBit", L"0b10000000000000000000000000000000", KVT_CONVERT_OK, LONG_MIN, 0 },
    { "Bin33Bits", L"0b100000000000000000000000000000000", KVT_CONVERT_OVERFLOW, 0, 0 },
    { "BinLeadingZeros", L"0b0000000000000000000000000000000000000001", KVT_CONVERT_OK, 1, 0 },
    { "BinPlusTopBit", L"+0b10000000000000000000000000000000", KVT_CONVERT_OVERFLOW, 0, 0 },
    { "HexAllOnes", L"0xFFFFFFFF", KVT_CONVERT_OK, -1, 0 },
    { "HexTopBit", L"0x80000000", KVT_CONVERT_OK, LONG_MIN, 0 },
    { "Hex33Bits", L"0x100000000", KVT_CONVERT_OVERFLOW, 0, 0 },
    { "HexNegativeMin", L"-0x80000000", KVT_CONVERT_OK, LONG_MIN, 0 },
    { "HexNegativeBelowMin", L"-0x80000001", KVT_CONVERT_UNDERFLOW, 0, 0 },
    { "HexPlusTopBit", L"+0x80000000", KVT_CONVERT_OVERFLOW, 0, 0 },
    { "HexPlusMax", L"+0x7FFFFFFF", KVT_CONVERT_OK, LONG_MAX, 0 },
};

TEST(LongGrammar, BoundaryRows)
{
    ExpectRows(kLongCases, std::size(kLongCases), KvtParseLong);
}

const DoubleCase kDoubleCases[] = {
    { "LargestDouble", L"1.7976931348623157e308", KVT_CONVERT_OK, DBL_MAX, 0 },
    { "LargestDoubleNegative", L"-1.7976931348623157e308", KVT_CONVERT_OK, -DBL_MAX, 0 },
    { "RoundsToInfinity", L"1.7976931348623159e308", KVT_CONVERT_OVERFLOW, 0.0, 0 },
    { "Underflow", L"-1e309", KVT_CONVERT_UNDERFLOW, 0.0, 0 },
    { "HugeExponent", L"1e99999999999999999999", KVT_CONVERT_OVERFLOW, 0.0, 0 },
    { "HugeMantissaTinyExponent", L"100000000000000000000e-330", KVT_CONVERT_OK, 1e-310, 0 },
    { "TooSmallNegative", L"-1e-400", KVT_CONVERT_PRECISION_LOSS, 0.0, 0 },
    { "TinyExponentHuge", L"1e-99999999999999999999", KVT_CONVERT_PRECISION_LOSS, 0.0, 0 },
    { "TooSmallWithZeros", L"0.0001e-322", KVT_CONVERT_PRECISION_LOSS, 0.0, 0 },
    { "RoundsDownToZero", L"2e-324", KVT_CONVERT_PRECISION_LOSS, 0.0, 0 },
    { "SmallestSubnormal", L"4.9406564584124654e-324", KVT_CONVERT_OK, 4.9406564584124654e-324, 0 },
    { "RoundsUpToSubnormal", L"3e-324", KVT_CONVERT_OK, 4.9406564584124654e-324, 0 },
    { "ZeroHugeExponent", L"0e999999999999", KVT_CONVERT_OK, 0.0, 0 },
    { "ZerosTinyExponent", L"0.000e-99999", KVT_CONVERT_OK, 0.0, 0 },
    { "NanWord", L"NaN", KVT_CONVERT_NOT_A_NUMBER, 0.0, 0 },
    { "InfinityWord", L"+Infinity", KVT_CONVERT_NOT_A_NUMBER, 0.0, 0 },
    { "WordPrefix", L"infinite", KVT_CONVERT_SYNTAX_ERROR, 0.0, 0 },
    { "SyntaxBeforeRange", L"1e309x", KVT_CONVERT_SYNTAX_ERROR, 0.0, 5 },
};

TEST(DoubleGrammar, BoundaryRows)
{
    ExpectRows(kDoubleCases, std::size(kDoubleCases), KvtParseDouble);
}

TEST(GrammarLength, ExplicitLengthStopsBeforeTheRest)
{
    long value = 0;
    int errorPos = -1;
    EXPECT_EQ(KVT_CONVERT_OK, KvtParseLong(L"12345", 2, value, errorPos));
    EXPECT_EQ(12, value);
    // An embedded NUL is an ordinary offending character when the length includes it.
    EXPECT_EQ(KVT_CONVERT_SYNTAX_ERROR, KvtParseLong(L"1\0" L"2", 3, value, errorPos));
    EXPECT_EQ(1, errorPos);
    double d = 0.0;
    EXPECT_EQ(KVT_CONVERT_NOT_A_NUMBER, KvtParseDouble(nullptr, 5, d, errorPos));
    EXPECT_EQ(KVT_CONVERT_NOT_A_NUMBER, KvtParseLong(nullptr, -1, value, errorPos));
}

struct BaseCase
{
    const wchar_t* text;
    int base;
};

const BaseCase kBaseCases[] = {
    { L"0B1", 2 },  { L"0b", 2 },  { L" +0b102 ", 2 }, { L"0X", 16 },  { L"-0xFF", 16 },
    { L"b1", 10 },  { L"00b1", 10 }, { L"", 10 },    { L"- 0b1", 10 }, { L"0c1", 10 },
};

TEST(NumberBase, FromPrefix)
{
    for (const BaseCase& c : kBaseCases)
        EXPECT_EQ(c.base, KvtNumberBase(c.text, -1)) << "text \"" << testing::PrintToString(std::wstring(c.text)) << "\"";
}

struct LongFormatCase
{
    long value;
    int base;
    const wchar_t* text;
};

const LongFormatCase kLongFormatCases[] = {
    { 0, 10, L"0" },
    { -1, 10, L"-1" },
    { LONG_MIN, 10, L"-2147483648" },
    { 0, 2, L"0b0" },
    { 10, 2, L"0b1010" },
    { -1, 2, L"0b11111111111111111111111111111111" },
    { 0, 16, L"0x0" },
    { 255, 16, L"0xFF" },
    { LONG_MIN, 16, L"0x80000000" },
};

TEST(FormatLong, TableAndABufferTooSmallGivesEmptyText)
{
    for (const LongFormatCase& c : kLongFormatCases)
    {
        wchar_t buffer[KVT_NUMBER_TEXT_MAX];
        EXPECT_EQ(int(std::wcslen(c.text)), KvtFormatLong(c.value, c.base, buffer, KVT_NUMBER_TEXT_MAX));
        EXPECT_EQ(std::wstring(c.text), std::wstring(buffer)) << c.value << " base " << c.base;
    }
    wchar_t buffer[5] = { L'x', L'x', L'x', L'x' };
    EXPECT_EQ(0, KvtFormatLong(255, 16, buffer, 4));   // "0xFF" needs 5 with the terminator
    EXPECT_EQ(0, buffer[0]);
    EXPECT_EQ(4, KvtFormatLong(255, 16, buffer, 5));
}

TEST(FormatLong, RoundTripInEveryBase)
{
    std::mt19937 random(20240611);
    std::uniform_int_distribution<long> any(LONG_MIN, LONG_MAX);
    for (int i = 0; i < 3000; ++i)
    {
        long value = i < 3 ? (i == 0 ? LONG_MIN : (i == 1 ? LONG_MAX : 0)) : any(random);
        for (int base : { 2, 10, 16 })
        {
            wchar_t buffer[KVT_NUMBER_TEXT_MAX];
            ASSERT_GT(KvtFormatLong(value, base, buffer, KVT_NUMBER_TEXT_MAX), 0);
            long back = 0;
            int errorPos = -1;
            ASSERT_EQ(KVT_CONVERT_OK, KvtParseLong(buffer, -1, back, errorPos)) << testing::PrintToString(std::wstring(buffer));
            ASSERT_EQ(value, back) << testing::PrintToString(std::wstring(buffer));
            ASSERT_EQ(base, KvtNumberBase(buffer, -1));
        }
    }
}

TEST(FormatDouble, ShortestText)
{
    struct { double value; const wchar_t* text; } cases[] = {
        { 0.1, L"0.1" }, { -2.5, L"-2.5" }, { 1e300, L"1e+300" }, { 0.0, L"0" },
        { 12.5, L"12.5" }, { NAN, L"nan" }, { HUGE_VAL, L"inf" }, { -HUGE_VAL, L"-inf" },
    };
    for (const auto& c : cases)
    {
        wchar_t buffer[KVT_NUMBER_TEXT_MAX];
        KvtFormatDouble(c.value, buffer, KVT_NUMBER_TEXT_MAX);
        EXPECT_EQ(std::wstring(c.text), std::wstring(buffer)) << c.value;
    }
    wchar_t small[3] = { L'x' };
    EXPECT_EQ(0, KvtFormatDouble(12.5, small, 3));
    EXPECT_EQ(0, small[0]);
}

TEST(FormatDouble, RoundTripOfRandomBitPatterns)
{
    std::mt19937_64 random(77);
    int checked = 0;
    for (int i = 0; i < 5000; ++i)
    {
        uint64_t bits = random();
        double value;
        std::memcpy(&value, &bits, sizeof(value));
        if (!std::isfinite(value))
            continue;
        wchar_t buffer[KVT_NUMBER_TEXT_MAX];
        ASSERT_GT(KvtFormatDouble(value, buffer, KVT_NUMBER_TEXT_MAX), 0);
        double back = 0.0;
        int errorPos = -1;
        ASSERT_EQ(KVT_CONVERT_OK, KvtParseDouble(buffer, -1, back, errorPos)) << testing::PrintToString(std::wstring(buffer));
        uint64_t backBits;
        std::memcpy(&backBits, &back, sizeof(back));
        ASSERT_EQ(bits, backBits) << testing::PrintToString(std::wstring(buffer));
        ++checked;
    }
    EXPECT_GT(checked, 4000);
}

TEST(FormatType, ExactlyTheListedLetters)
{
    const std::wstring listed = L"%BCEGTXbcdefgiopstux";
    for (wchar_t ch = 0; ch < 0x180; ++ch)
    {
        bool expected = ch != 0 && listed.find(ch) != std::wstring::npos;
        EXPECT_EQ(expected, KvtIsFormatType(ch)) << "character " << int(ch);
    }
}

} // namespace
