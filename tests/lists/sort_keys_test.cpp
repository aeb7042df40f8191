// Sorting without a window, one named case per rule and type (texts in the en-US test
// locale): equal keys keep their previous order for every type in both directions; a text
// that is no date compares equal and keeps its place; unknown and unsortable types.
#include <afx.h>
#include <afxdisp.h>

#include <gtest/gtest.h>

#include "ListSortKeys.h"
#include "Checks.h"

#include <vector>

using namespace ListSortKeys;

namespace {

// baseTime NULL: no valid base time; expected: the rows in sorted order.
struct OrderCase { const char* name; unsigned char type; std::vector<LPCWSTR> texts; bool ascending;
                   LPCWSTR baseTime; std::vector<int> expected; };

const bool Asc = true;
const bool Desc = false;

const OrderCase kOrderCases[] = {
    { "TextCaseSensitiveCapitalsFirst", kText, { L"beta", L"Beta", L"alpha" }, Asc, NULL, { 1, 2, 0 } },
    { "TextEqualKeepOrder", kText, { L"a", L"b", L"a" }, Desc, NULL, { 1, 0, 2 } },
    { "TextNoCaseEqualKeepOrder", kTextNoCase, { L"beta", L"Alpha", L"BETA", L"alpha" }, Asc, NULL, { 1, 3, 0, 2 } },
    { "TextNoCaseFoldsToLowerCase", kTextNoCase, { L"AX", L"_x" }, Asc, NULL, { 1, 0 } },   // '_' < 'a'
    { "TextNoCaseDescendingEqualKeepOrder", kTextNoCase, { L"beta", L"Alpha", L"BETA", L"alpha" }, Desc, NULL, { 0, 2, 1, 3 } },
    { "IntegerTenAfterNine", kInteger, { L"10", L"9" }, Asc, NULL, { 1, 0 } },
    { "IntegerLettersCountAsZero", kInteger, { L"3", L"abc", L"-2" }, Asc, NULL, { 2, 1, 0 } },
    { "IntegerLeadingBlanksSignAndPrefix", kInteger, { L"  +7 apples", L"-8", L"7" }, Asc, NULL, { 1, 0, 2 } },
    { "IntegerFarApartValues", kInteger, { L"2000000000", L"-2000000000", L"0" }, Asc, NULL, { 1, 2, 0 } },
    { "IntegerDescendingEqualKeepOrder", kInteger, { L"07", L"5", L"7" }, Desc, NULL, { 0, 2, 1 } },
    { "FloatTwoPointFiveBeforeTen", kFloat, { L"10", L"2.5" }, Asc, NULL, { 1, 0 } },
    { "FloatEqualKeepOrderAndNoNumberIsZero", kFloat, { L"2.50", L"1e1", L"2.5", L"x" }, Asc, NULL, { 3, 0, 2, 1 } },
    { "FloatDescendingEqualKeepOrder", kFloat, { L"2.5", L"1", L"2.50" }, Desc, NULL, { 0, 2, 1 } },
    { "DateAndTimeOrder", kDate, { L"3/1/2024", L"12/31/2023", L"3/1/2024 6:00 AM" }, Asc, NULL, { 1, 0, 2 } },
    { "DateEqualKeepOrder", kDate, { L"2024-03-01", L"3/1/2024", L"1/1/2024", L"3/1/2024" }, Asc, NULL, { 2, 0, 1, 3 } },
    { "DateDescendingEqualKeepOrder", kDate, { L"2024-03-01", L"1/1/2024", L"3/1/2024" }, Desc, NULL, { 0, 2, 1 } },
    { "DateNotADateComparesEqualAndKeepsItsPlace", kDate, { L"3/1/2024", L"soon", L"1/1/2024", L"" }, Asc, NULL, { 2, 1, 0, 3 } },
    { "TimeOfDayBeforeBaseTimeLast", kTimeOfDay, { L"5:00 AM", L"7:00 AM", L"11:00 PM" }, Asc, L"6:00 AM", { 1, 2, 0 } },
    { "TimeOfDayAtBaseTimeFirst", kTimeOfDay, { L"5:59 AM", L"6:00 AM" }, Asc, L"6:00 AM", { 1, 0 } },
    { "TimeOfDayEqualKeepOrder", kTimeOfDay, { L"06:30", L"5:00 AM", L"6:30 AM" }, Desc, L"6:00 AM", { 1, 0, 2 } },
    { "TimeOfDayWithoutBaseTimeNoShift", kTimeOfDay, { L"7:00 AM", L"5:00 AM" }, Asc, NULL, { 1, 0 } },
    { "ImageIndexesAsNumbers", kImage, { L"10", L"9", L"-1" }, Asc, NULL, { 2, 1, 0 } },
    { "ImageAltEqualKeepOrder", kImageAlt, { L"5", L"3", L"5" }, Desc, NULL, { 0, 2, 1 } },
    { "NotSortableKeepsOrder", kNotSortable, { L"b", L"a", L"c" }, Desc, NULL, { 0, 1, 2 } },
    { "UnknownTypeKeepsOrder", 9, { L"b", L"a" }, Asc, NULL, { 0, 1 } },
};

class SortOrderTest : public testing::TestWithParam<OrderCase> {};

TEST_P(SortOrderTest, RowsInOrder)
{
    const OrderCase& c = GetParam();
    COleDateTime baseTime;
    baseTime.SetStatus(COleDateTime::invalid);
    if (c.baseTime != NULL)
    {
        ASSERT_TRUE(baseTime.ParseDateTime(c.baseTime));
    }
    EXPECT_EQ(c.expected, SortKeys(c.type, c.texts, baseTime).Order(c.ascending));
}

INSTANTIATE_TEST_SUITE_P(Rules, SortOrderTest, testing::ValuesIn(kOrderCases), orvane_test::CaseName<OrderCase>);

} // namespace
