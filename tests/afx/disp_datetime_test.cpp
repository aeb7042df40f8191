// afxdisp.h: COleDateTime and COleDateTimeSpan.
// - ParseDateTime: status and value of a text that is no date; flags and locale reach
//   the platform's parser;
// - SetDateTime checks every part; the parts come back on both sides of 30 December 1899;
// - comparisons and arithmetic on the linear value across day 0; null and invalid
//   operands; results out of range;
// - span parts with their sign; Format by status and as the parser's counterpart.
#include <afx.h>
#include <afxdisp.h>

#include <gtest/gtest.h>

namespace {

TEST(OleDateTimeTest, ParseDateTimeStatusFlagsAndLocale)
{
    COleDateTime date;
    EXPECT_TRUE(date.ParseDateTime(_T("3/1/2024 6:00 AM")));
    EXPECT_EQ(COleDateTime::valid, date.GetStatus());
    EXPECT_DOUBLE_EQ(45352.25, date.m_dt);

    EXPECT_FALSE(date.ParseDateTime(_T("soon")));
    EXPECT_EQ(COleDateTime::invalid, date.GetStatus());
    EXPECT_DOUBLE_EQ(0.0, date.m_dt);
    EXPECT_FALSE(date.ParseDateTime(NULL));
    EXPECT_EQ(COleDateTime::invalid, date.GetStatus());

    EXPECT_TRUE(date.ParseDateTime(_T("3/1/2024 6:00 AM"), VAR_DATEVALUEONLY));
    EXPECT_DOUBLE_EQ(45352.0, date.m_dt);
    EXPECT_TRUE(date.ParseDateTime(_T("3/1/2024 6:00 AM"), VAR_TIMEVALUEONLY));
    EXPECT_DOUBLE_EQ(0.25, date.m_dt);
    // Day before month in German.
    EXPECT_TRUE(date.ParseDateTime(_T("1.3.2024"), 0, MAKELCID(MAKELANGID(LANG_GERMAN, SUBLANG_GERMAN), SORT_DEFAULT)));
    EXPECT_EQ(3, date.GetMonth());
}

TEST(OleDateTimeTest, SetDateTimeChecksEveryPart)
{
    struct { int y, mo, d, h, mi, s; bool valid; } cases[] = {
        { 2024, 2, 29, 0, 0, 0, true }, { 2023, 2, 29, 0, 0, 0, false }, { 1900, 2, 29, 0, 0, 0, false },
        { 100, 1, 1, 0, 0, 0, true }, { 99, 12, 31, 0, 0, 0, false }, { 9999, 12, 31, 23, 59, 59, true },
        { 10000, 1, 1, 0, 0, 0, false }, { 2024, 13, 1, 0, 0, 0, false }, { 2024, 4, 31, 0, 0, 0, false },
        { 2024, 1, 1, 24, 0, 0, false }, { 2024, 1, 1, 0, 60, 0, false }, { 2024, 1, 1, 0, 0, -1, false },
    };
    for (const auto& c : cases)
    {
        COleDateTime date;
        const int status = date.SetDateTime(c.y, c.mo, c.d, c.h, c.mi, c.s);
        EXPECT_EQ(c.valid ? COleDateTime::valid : COleDateTime::invalid, status) << c.y << "-" << c.mo << "-" << c.d;
        EXPECT_EQ(c.valid ? c.y : AFX_OLE_DATETIME_ERROR, date.GetYear());
    }
    EXPECT_DOUBLE_EQ(-657434.0, COleDateTime(100, 1, 1, 0, 0, 0).m_dt);
}

TEST(OleDateTimeTest, PartsOnBothSidesOfDayZero)
{
    // Before day 0 the time still counts forward from midnight: 29 December 1899, 6:00.
    const COleDateTime before(1899, 12, 29, 6, 0, 0);
    EXPECT_DOUBLE_EQ(-1.25, before.m_dt);
    EXPECT_EQ(29, before.GetDay());
    EXPECT_EQ(6, before.GetHour());
    EXPECT_EQ(6, before.GetDayOfWeek());        // a Friday

    const COleDateTime after(2024, 3, 1, 14, 32, 5);
    SYSTEMTIME st = {};
    ASSERT_TRUE(after.GetAsSystemTime(st));
    CString parts;
    parts.Format(_T("%d-%d-%d %d:%d:%d day %d"), st.wYear, st.wMonth, st.wDay, st.wHour, st.wMinute, st.wSecond,
        st.wDayOfWeek);
    EXPECT_STREQ(_T("2024-3-1 14:32:5 day 5"), parts);     // a Friday, counted from Sunday = 0
    EXPECT_EQ(61, after.GetDayOfYear());
    EXPECT_EQ(after, COleDateTime(st));
}

TEST(OleDateTimeTest, ComparisonsAndArithmeticAcrossDayZero)
{
    const COleDateTime midnight29(-1.0);
    const COleDateTime six29(-1.25);
    const COleDateTime midnight30(0.0);
    EXPECT_TRUE(midnight29 < six29);
    EXPECT_TRUE(six29 < midnight30);
    EXPECT_TRUE(midnight30 >= six29);

    EXPECT_EQ(midnight30, six29 + COleDateTimeSpan(0, 18, 0, 0));
    EXPECT_EQ(six29, midnight30 - COleDateTimeSpan(0, 18, 0, 0));
    EXPECT_DOUBLE_EQ(-0.75, (six29 - midnight30).GetTotalDays());
    COleDateTime moved = midnight29;
    moved += COleDateTimeSpan(0, 30, 0, 0);
    EXPECT_DOUBLE_EQ(0.25, moved.m_dt);

    // A null operand wins over an invalid one.
    COleDateTime null, invalid;
    null.SetStatus(COleDateTime::null);
    invalid.SetStatus(COleDateTime::invalid);
    COleDateTimeSpan invalidSpan;
    invalidSpan.SetStatus(COleDateTimeSpan::invalid);
    EXPECT_EQ(COleDateTime::null, (null + invalidSpan).GetStatus());
    EXPECT_EQ(COleDateTime::invalid, (midnight30 + invalidSpan).GetStatus());
    EXPECT_EQ(COleDateTimeSpan::invalid, (invalid - midnight30).GetStatus());
    EXPECT_EQ(COleDateTime::invalid, (COleDateTime(9999, 12, 31, 0, 0, 0) + COleDateTimeSpan(1, 0, 0, 0)).GetStatus());
    EXPECT_TRUE(null == null);
    EXPECT_TRUE(null != invalid);
}

TEST(OleDateTimeTest, SpanPartsCarryTheSign)
{
    const COleDateTimeSpan back(-1, -6, -30, -15);
    EXPECT_EQ(-1, back.GetDays());
    EXPECT_EQ(-6, back.GetHours());
    EXPECT_EQ(-30, back.GetMinutes());
    EXPECT_EQ(-15, back.GetSeconds());
    const COleDateTimeSpan carried(0, 25, 0, 0);
    EXPECT_EQ(1, carried.GetDays());
    EXPECT_EQ(1, carried.GetHours());
    EXPECT_DOUBLE_EQ(25.0, carried.GetTotalHours());
    EXPECT_EQ(-carried, COleDateTimeSpan(0, 0, 0, 0) - carried);
    EXPECT_TRUE(back < carried);
    EXPECT_EQ(COleDateTimeSpan::invalid, (COleDateTimeSpan(3000000.0) + COleDateTimeSpan(3000000.0)).GetStatus());
}

TEST(OleDateTimeTest, FormatByStatusAndBackThroughTheParser)
{
    COleDateTime date(2024, 3, 1, 14, 32, 0);
    COleDateTime back;
    ASSERT_TRUE(back.ParseDateTime(date.Format()));
    EXPECT_EQ(date, back);
    date.SetStatus(COleDateTime::null);
    EXPECT_STREQ(_T(""), date.Format());
    date.SetStatus(COleDateTime::invalid);
    EXPECT_STREQ(_T("Invalid DateTime"), date.Format());
}

} // namespace
