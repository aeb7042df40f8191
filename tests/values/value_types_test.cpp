// The classes of the value-types module:
//  - KVXString: GetAs and GetBase reach the grammar with the whole text (the grammar itself is
//    tested in number_text_test.cpp), Format, the grammar characters;
//  - KVXVariant: COleVariant equality, copies that own their text, conversions (empty -> 0,
//    rounding, overflow, text through the grammar, by-reference values), failures leave the
//    out value alone;
//  - KVXRange: membership at both ends included and excluded for long and double, the in-range
//    ends (next integer, next double), reversed ends, empty and incomparable ranges, Adjust.
#include <gtest/gtest.h>

#include <cfloat>
#include <climits>
#include <cstdint>
#include <cmath>
#include <string>

#include "KVXRange.h"
#include "KVXString.h"
#include "KVXVariant.h"

namespace
{

std::wstring Text(const CString& s)
{
    return std::wstring(static_cast<LPCTSTR>(s), size_t(s.GetLength()));
}

/////////////////////////////////////////////////////////////////////////////
// KVXString

TEST(KVXStringGetAs, PassesTheWholeTextToTheGrammar)
{
    KVXString text(L"0b102");
    long value = 99;
    int errorPos = -1;
    EXPECT_EQ(KVT_CONVERT_SYNTAX_ERROR, text.GetAs(value, errorPos));
    EXPECT_EQ(4, errorPos);
    EXPECT_EQ(2, text.GetBase());
    EXPECT_EQ(99, value);
    text = L"-0x1F";
    EXPECT_EQ(KVT_CONVERT_OK, text.GetAs(value, errorPos));
    EXPECT_EQ(-31, value);
    EXPECT_EQ(0, errorPos);
    double d = 0.0;
    EXPECT_EQ(KVT_CONVERT_UNDERFLOW, KVXString(L"-1e309").GetAs(d, errorPos));
    EXPECT_EQ(KVT_CONVERT_OK, KVXString(L"1e301").GetAs(d, errorPos));
    EXPECT_EQ(1e301, d);
    // The length is the object's: an embedded NUL is an offending character.
    KVXString withNul(L"12\0" L"3", 4);
    EXPECT_EQ(KVT_CONVERT_SYNTAX_ERROR, withNul.GetAs(value, errorPos));
    EXPECT_EQ(2, errorPos);
    EXPECT_EQ(KVT_CONVERT_SYNTAX_ERROR, withNul.GetAs(d, errorPos));
}

class FormatTypeProbe : public KVXString
{
public:
    BOOL Probe(WCHAR ch) const { return IsFmtType(ch); }
};

TEST(KVXStringFormat, PrintfStyleAndTheGrammarCharacters)
{
    KVXString text;
    text.Format(L"%ld|%X|%s", -2147483647L - 1, 255, L"ab");
    EXPECT_EQ(L"-2147483648|FF|ab", Text(text));
    text.Format(static_cast<LPCTSTR>(NULL));
    EXPECT_EQ(L"", Text(text));

    EXPECT_EQ(L'E', KVXString::GetUpperEngDeli());
    EXPECT_EQ(L'e', KVXString::GetLowerEngDeli());
    EXPECT_EQ(L'B', KVXString::GetUpperBinary());
    EXPECT_EQ(L'b', KVXString::GetLowerBinary());
    EXPECT_EQ(L'r', KVXString::GetRealFlagFloat());
    EXPECT_EQ(L'R', KVXString::GetRealFlagDouble());
    FormatTypeProbe probe;
    EXPECT_EQ(TRUE, probe.Probe(L'T'));
    EXPECT_EQ(FALSE, probe.Probe(L'a'));
    EXPECT_EQ(L"xxx", Text(KVXString(L'x', 3)));
}

/////////////////////////////////////////////////////////////////////////////
// KVXVariant

// A raw variant of any type; the bits fill the union from its first byte.
VARIANT MakeVariant(VARTYPE vt, LONGLONG bits)
{
    VARIANT var;
    VariantInit(&var);
    var.vt = vt;
    var.llVal = bits;
    return var;
}

VARIANT MakeSingle(float value)
{
    VARIANT var = MakeVariant(VT_R4, 0);
    var.fltVal = value;
    return var;
}

LONG g_referenced = 1234;

VARIANT MakeReference()
{
    VARIANT var = MakeVariant(VT_I4 | VT_BYREF, 0);
    var.plVal = &g_referenced;
    return var;
}

struct EqualityCase
{
    const char* name;
    KVXVariant a, b;
    bool equal;
};

const EqualityCase kEqualityCases[] = {
    { "BothEmpty", KVXVariant(), KVXVariant(), true },
    { "SameLong", 5L, 5L, true },
    { "OtherLong", 5L, 6L, false },
    { "TypeCounts", 1L, 1.0, false },
    { "EmptyIsNotZero", KVXVariant(), 0L, false },
    { "NanIsNotNan", NAN, NAN, false },
    { "SameText", KVXString(L"abc"), KVXString(L"abc"), true },
    { "OtherText", KVXString(L"ab"), KVXString(L"abc"), false },
    { "BothNull", MakeVariant(VT_NULL, 0), MakeVariant(VT_NULL, 0), true },
    { "OtherBool", MakeVariant(VT_BOOL, VARIANT_TRUE), MakeVariant(VT_BOOL, VARIANT_FALSE), false },
    { "SameCurrency", MakeVariant(VT_CY, 12345), MakeVariant(VT_CY, 12345), true },
    { "SameShort", MakeVariant(VT_I2, 7), MakeVariant(VT_I2, 7), true },
    { "ShortIsNotLong", MakeVariant(VT_I2, 7), MakeVariant(VT_I4, 7), false },
    { "SameReference", MakeReference(), MakeReference(), true },
};

TEST(KVXVariantEquality, AsCOleVariant)
{
    for (const EqualityCase& c : kEqualityCases)
    {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(c.equal, KvtVariantEqual(c.a.GetVariant(), c.b.GetVariant()));
        EXPECT_EQ(c.equal, c.a == c.b);
        EXPECT_EQ(!c.equal, c.a != c.b);
    }
}

TEST(KVXVariantLifetime, CopiesOwnTheirText)
{
    KVXVariant original(KVXString(L"first"));
    KVXVariant copy(original);
    original = KVXString(L"second");
    KVXString text;
    ASSERT_EQ(KVT_VARIANT_OK, copy.GetAs(text));
    EXPECT_EQ(L"first", Text(text));
    ASSERT_EQ(KVT_VARIANT_OK, original.GetAs(text));
    EXPECT_EQ(L"second", Text(text));

    KVXVariant assigned;
    assigned = copy;
    EXPECT_EQ(copy, assigned);
    EXPECT_NE(copy.GetVariant().bstrVal, assigned.GetVariant().bstrVal) << "deep copy";

    const KVXVariant& alias = assigned;
    assigned = alias;  // self-assignment keeps the value
    ASSERT_EQ(VT_BSTR, assigned.GetType());
    ASSERT_EQ(KVT_VARIANT_OK, assigned.GetAs(text));
    EXPECT_EQ(L"first", Text(text));

    assigned = 4;
    EXPECT_EQ(VT_I4, assigned.GetType());
    assigned = 2.0;
    EXPECT_EQ(VT_R8, assigned.GetType());
    assigned.Clear();
    EXPECT_EQ(VT_EMPTY, assigned.GetType());
}

struct ToLongCase
{
    const char* name;
    KVXVariant value;
    KVTEnumVariantError result;
    long expected;
};

const ToLongCase kToLongCases[] = {
    { "EmptyIsZero", KVXVariant(), KVT_VARIANT_OK, 0 },
    { "Long", KVXVariant(-42L), KVT_VARIANT_OK, -42 },
    { "WholeDouble", KVXVariant(7.0), KVT_VARIANT_OK, 7 },
    { "HalfRoundsToEvenDown", KVXVariant(2.5), KVT_VARIANT_OK, 2 },
    { "HalfRoundsToEvenUp", KVXVariant(3.5), KVT_VARIANT_OK, 4 },
    { "DoubleAtMin", KVXVariant(-2147483648.0), KVT_VARIANT_OK, LONG_MIN },
    { "DoubleAboveMax", KVXVariant(2147483648.0), KVT_VARIANT_OVERFLOW, 0 },
    { "DoubleNan", KVXVariant(NAN), KVT_VARIANT_NOT_A_NUMBER, 0 },
    { "TextHex", KVXVariant(KVXString(L"0x1F")), KVT_VARIANT_OK, 31 },
    { "TextFraction", KVXVariant(KVXString(L"12.5")), KVT_VARIANT_NOT_A_NUMBER, 0 },
    { "TextOverflow", KVXVariant(KVXString(L"2147483648")), KVT_VARIANT_OVERFLOW, 0 },
    { "TextEmpty", KVXVariant(KVXString(L"")), KVT_VARIANT_NOT_A_NUMBER, 0 },
    { "Short", KVXVariant(MakeVariant(VT_I2, 300)), KVT_VARIANT_OK, 300 },
    { "Bool", KVXVariant(MakeVariant(VT_BOOL, VARIANT_TRUE)), KVT_VARIANT_OK, -1 },
    { "Null", KVXVariant(MakeVariant(VT_NULL, 0)), KVT_VARIANT_TYPE_MISMATCH, 0 },
    { "UnsignedTooBig", KVXVariant(MakeVariant(VT_UI4, 0xFFFFFFFF)), KVT_VARIANT_OVERFLOW, 0 },
    { "UnsignedFits", KVXVariant(MakeVariant(VT_UI4, 0x7FFFFFFF)), KVT_VARIANT_OK, LONG_MAX },
    { "ByReference", KVXVariant(MakeReference()), KVT_VARIANT_OK, 1234 },
    { "Int64Fits", KVXVariant(MakeVariant(VT_I8, -5)), KVT_VARIANT_OK, -5 },
    { "Int64TooBig", KVXVariant(MakeVariant(VT_I8, 1LL << 40)), KVT_VARIANT_OVERFLOW, 0 },
    { "Int64TooSmall", KVXVariant(MakeVariant(VT_I8, -(1LL << 31) - 1)), KVT_VARIANT_OVERFLOW, 0 },
    { "Unsigned64Huge", KVXVariant(MakeVariant(VT_UI8, -1)), KVT_VARIANT_OVERFLOW, 0 },
};

TEST(KVXVariantConversion, ToLong)
{
    for (const ToLongCase& c : kToLongCases)
    {
        long value = 12345;
        EXPECT_EQ(c.result, c.value.GetAs(value, 1)) << c.name;
        EXPECT_EQ(c.result == KVT_VARIANT_OK ? c.expected : 12345, value) << c.name;
    }
}

TEST(KVXVariantConversion, ToDoubleAndToText)
{
    const struct { const char* name; KVXVariant value; KVTEnumVariantError result; double expected; } doubles[] = {
        { "EmptyIsZero", KVXVariant(), KVT_VARIANT_OK, 0.0 },
        { "Long", KVXVariant(-3L), KVT_VARIANT_OK, -3.0 },
        { "TextExponent", KVXVariant(KVXString(L"1.5e3")), KVT_VARIANT_OK, 1500.0 },
        { "TextOverflow", KVXVariant(KVXString(L"1e309")), KVT_VARIANT_OVERFLOW, 0 },
        { "TextTooSmall", KVXVariant(KVXString(L"1e-400")), KVT_VARIANT_OVERFLOW, 0 },
        { "TextComma", KVXVariant(KVXString(L"1,5")), KVT_VARIANT_NOT_A_NUMBER, 0 },
        { "Null", KVXVariant(MakeVariant(VT_NULL, 0)), KVT_VARIANT_TYPE_MISMATCH, 0 },
        { "UnsignedAllBits", KVXVariant(MakeVariant(VT_UI4, 0xFFFFFFFF)), KVT_VARIANT_OK, 4294967295.0 },
        { "Unsigned64AllBits", KVXVariant(MakeVariant(VT_UI8, -1)), KVT_VARIANT_OK, 18446744073709551616.0 },
    };
    for (const auto& c : doubles)
    {
        double value = 7.0;
        EXPECT_EQ(c.result, c.value.GetAs(value)) << c.name;
        EXPECT_EQ(c.result == KVT_VARIANT_OK ? c.expected : 7.0, value) << c.name;
    }
    // A failed conversion leaves the text as it was.
    const struct { KVXVariant value; KVTEnumVariantError result; const wchar_t* text; } texts[] = {
        { KVXVariant(), KVT_VARIANT_OK, L"" },
        { KVXVariant(-42L), KVT_VARIANT_OK, L"-42" },
        { KVXVariant(0.1), KVT_VARIANT_OK, L"0.1" },
        { KVXVariant(1e300), KVT_VARIANT_OK, L"1e+300" },
        { KVXVariant(MakeSingle(0.1f)), KVT_VARIANT_OK, L"0.1" },
        { KVXVariant(MakeVariant(VT_I2, -7)), KVT_VARIANT_OK, L"-7" },
        { KVXVariant(MakeReference()), KVT_VARIANT_OK, L"1234" },
        { KVXVariant(MakeVariant(VT_UI4, 0xFFFFFFFF)), KVT_VARIANT_OK, L"4294967295" },
        { KVXVariant(MakeVariant(VT_I8, INT64_MIN)), KVT_VARIANT_OK, L"-9223372036854775808" },
        { KVXVariant(MakeVariant(VT_UI8, -1)), KVT_VARIANT_OK, L"18446744073709551615" },
        { KVXVariant(MakeVariant(VT_NULL, 0)), KVT_VARIANT_TYPE_MISMATCH, L"unset" },
    };
    for (const auto& c : texts)
    {
        KVXString text(L"unset");
        EXPECT_EQ(c.result, c.value.GetAs(text)) << Text(KVXString(c.text));
        EXPECT_EQ(std::wstring(c.text), Text(text));
    }
}

/////////////////////////////////////////////////////////////////////////////
// KVXRange

KVXRange MakeRange(const KVXVariant& minimum, const KVXVariant& maximum, bool minInclude, bool maxInclude)
{
    KVXRange range;
    range.Empty(minimum);
    range.Adjust(maximum);
    range.SetMinimumInclude(minInclude);
    range.SetMaximumInclude(maxInclude);
    return range;
}

struct MembershipCase
{
    const char* name;
    KVXVariant minimum, maximum;
    bool minInclude, maxInclude;
    KVXVariant value;
    bool inside;
};

const double kNextAboveOne = std::nextafter(1.0, 2.0);
const double kNextBelowTen = std::nextafter(10.0, 0.0);

const MembershipCase kMembershipCases[] = {
    { "LongMinIncluded", 1L, 10L, true, true, 1L, true },
    { "LongMaxIncluded", 1L, 10L, true, true, 10L, true },
    { "LongAbove", 1L, 10L, true, true, 11L, false },
    { "LongMinExcluded", 1L, 10L, false, true, 1L, false },
    { "LongMaxExcluded", 1L, 10L, true, false, 10L, false },
    { "LongFullRangeMax", LONG_MIN, LONG_MAX, true, true, LONG_MAX, true },
    { "LongRangeDoubleInside", 1L, 10L, false, false, 1.5, true },
    { "LongRangeDoubleJustAbove", 1L, 10L, true, true, 10.000001, false },
    { "LongRangeEmptyValueIsZero", -1L, 1L, true, true, KVXVariant(), true },
    { "LongRangeText", 1L, 10L, true, true, KVXString(L"5"), true },
    { "LongRangeNotANumber", 1L, 10L, true, true, KVXString(L"x"), false },
    { "DoubleMinExcluded", 1.0, 10.0, false, true, 1.0, false },
    { "DoubleNextAboveExcludedMin", 1.0, 10.0, false, true, kNextAboveOne, true },
    { "DoubleMaxExcluded", 1.0, 10.0, true, false, 10.0, false },
    { "DoubleNextBelowExcludedMax", 1.0, 10.0, true, false, kNextBelowTen, true },
    { "DoubleLongValue", 1.0, 10.0, true, true, 10L, true },
    { "DoubleNan", 1.0, 10.0, true, true, NAN, false },
    { "DoubleEditDefault", -1e300, 1e300, true, true, 1e301, false },
    { "ReversedEnds", 10L, 1L, true, true, 5L, true },
    { "NanEndContainsNothing", NAN, 10.0, true, true, 5.0, false },
    { "TextEndThatIsNoNumber", KVXString(L"abc"), 10L, true, true, 5L, false },
    { "PointRangeExcluded", 5L, 5L, false, true, 5L, false },
};

TEST(KVXRangeTable, IsInRange)
{
    for (const MembershipCase& c : kMembershipCases)
        EXPECT_EQ(c.inside, MakeRange(c.minimum, c.maximum, c.minInclude, c.maxInclude).IsInRange(c.value)) << c.name;
}

struct InRangeCase
{
    const char* name;
    KVXVariant minimum, maximum;
    bool minInclude, maxInclude;
    KVXVariant lowest, highest;
    bool anyInside;  // false: no value lies in the range, the ends come back as set
};

const InRangeCase kInRangeCases[] = {
    { "LongExcluded", 1L, 10L, false, false, 2L, 9L, true },
    { "LongFullRangeExcluded", LONG_MIN, LONG_MAX, false, false, LONG_MIN + 1, LONG_MAX - 1, true },
    { "LongReversed", 10L, 1L, true, false, 1L, 9L, true },
    { "LongSingleValue", 5L, 5L, true, true, 5L, 5L, true },
    { "LongNothingInside", 5L, 6L, false, false, 5L, 6L, false },
    { "LongNothingInsideAtTop", LONG_MAX, LONG_MAX, false, true, LONG_MAX, LONG_MAX, false },
    { "DoubleIncluded", 0.0, 1.0, true, true, 0.0, 1.0, true },
    { "DoubleExcluded", 1.0, 10.0, false, false, kNextAboveOne, kNextBelowTen, true },
    { "DoubleExcludedZero", 0.0, 1.0, false, true, std::nextafter(0.0, 1.0), 1.0, true },
    { "DoubleExcludedLargest", -DBL_MAX, DBL_MAX, false, false, std::nextafter(-DBL_MAX, 0.0), std::nextafter(DBL_MAX, 0.0), true },
    { "DoubleNothingInside", 1.0, kNextAboveOne, false, false, 1.0, kNextAboveOne, false },
    { "MixedEndsCompareAsDouble", 1L, 2.5, false, true, kNextAboveOne, 2.5, true },
    { "NanEnd", NAN, 1.0, true, true, NAN, 1.0, false },
};

// Type and shortest exact text of a value (NaN as "nan").
std::wstring Shown(const KVXVariant& value)
{
    KVXString text;
    value.GetAs(text);
    return std::to_wstring(value.GetType()) + L": " + Text(text);
}

TEST(KVXRangeTable, InRangeValues)
{
    for (const InRangeCase& c : kInRangeCases)
    {
        SCOPED_TRACE(c.name);
        const KVXRange range = MakeRange(c.minimum, c.maximum, c.minInclude, c.maxInclude);
        const KVXVariant lowest = range.GetMinimumInRange(), highest = range.GetMaximumInRange();
        EXPECT_EQ(Shown(c.lowest), Shown(lowest));
        EXPECT_EQ(Shown(c.highest), Shown(highest));
        EXPECT_EQ(c.anyInside, range.IsInRange(lowest));
        EXPECT_EQ(c.anyInside, range.IsInRange(highest));
    }
}

TEST(KVXRangeBuilding, EmptyThenAdjust)
{
    KVXRange range;
    EXPECT_TRUE(range.IsInRange(KVXVariant(0L))) << "a new range is [0, 0]";
    EXPECT_FALSE(range.IsInRange(KVXVariant(1L)));
    EXPECT_TRUE(range.GetMinimumInclude());
    EXPECT_TRUE(range.GetMaximumInclude());

    range.Empty(KVXVariant(5L));
    EXPECT_EQ(KVXVariant(5L), range.GetMinimum());
    EXPECT_EQ(KVXVariant(5L), range.GetMaximum());
    EXPECT_EQ(0, range.Adjust(KVXVariant(5L)));
    EXPECT_EQ(2, range.Adjust(KVXVariant(9L)));
    EXPECT_EQ(1, range.Adjust(KVXVariant(-3L)));
    EXPECT_EQ(0, range.Adjust(KVXVariant(4L)));
    EXPECT_EQ(KVXVariant(-3L), range.GetMinimum());
    EXPECT_EQ(KVXVariant(9L), range.GetMaximum());

    range.SetMinimumInclude(false);
    range.Empty(KVXVariant(1.5));
    EXPECT_FALSE(range.GetMinimumInclude()) << "Empty keeps the flags";
    EXPECT_EQ(KVXVariant(1.5), range.GetMinimum());
}

TEST(KVXRangeBuilding, NotANumberContainsNothingUntilEmpty)
{
    KVXRange range;
    range.Empty(KVXVariant(1L));
    EXPECT_EQ(2, range.Adjust(KVXVariant(NAN)));
    EXPECT_FALSE(range.IsInRange(KVXVariant(1L)));
    EXPECT_EQ(2, range.Adjust(KVXVariant(5L)));
    EXPECT_TRUE(range.IsInRange(KVXVariant(3L))) << "a number replaces the bad maximum";
    range.Empty(KVXVariant(KVXString(L"x")));
    EXPECT_FALSE(range.IsInRange(KVXVariant(0L)));
    range.Empty(KVXVariant(0L));
    EXPECT_TRUE(range.IsInRange(KVXVariant(0L)));
}

TEST(KVXRangeBuilding, CopyIsIndependent)
{
    KVXRange range = MakeRange(1L, 10L, true, false);
    KVXRange copy(range);
    range.Empty(KVXVariant(100L));
    range.SetMaximumInclude(true);
    EXPECT_TRUE(copy.IsInRange(KVXVariant(9L)));
    EXPECT_FALSE(copy.IsInRange(KVXVariant(10L)));
    EXPECT_FALSE(copy.GetMaximumInclude());
    KVXRange assigned;
    assigned = copy;
    EXPECT_EQ(KVXVariant(1L), assigned.GetMinimum());
    EXPECT_EQ(KVXVariant(10L), assigned.GetMaximum());
    EXPECT_EQ(KVXVariant(9L), assigned.GetMaximumInRange());
}

} // namespace
