// COleDateTime and COleDateTimeSpan: calendar arithmetic on OLE DATE values, with the
// platform's parser and formatter for texts.
#include <afx.h>
#include <afxdisp.h>

#include <math.h>

namespace {

// Day numbers of the first and the last day the types accept (1 January 100 and
// 31 December 9999), counted from 30 December 1899.
const double kMinDay = -657434.0;
const double kMaxDay = 2958465.0;
// The longest span between two such days.
const double kMaxDaysInSpan = 3615897.0;
const double kSecondsPerDay = 86400.0;
// 30 December 1899 counted from 1 January 1970.
const long long kOleEpochFromUnix = -25569;

// A DATE before day 0 keeps its time as a positive fraction after a negative day;
// the linear value counts straight through midnight 30 December 1899.
double LinearFromDate(DATE dt)
{
    if (dt >= 0)
        return dt;
    const double day = ceil(dt);
    return day + (day - dt);
}

DATE DateFromLinear(double value)
{
    if (value >= 0)
        return value;
    const double day = floor(value);
    return day + (day - value);
}

bool IsDayInRange(double linear)
{
    const double day = floor(linear);
    return day >= kMinDay && day <= kMaxDay;
}

// Day count from 1 January 1970 in the proleptic Gregorian calendar, and back.
long long DaysFromCivil(long long y, unsigned m, unsigned d)
{
    y -= m <= 2 ? 1 : 0;
    const long long era = (y >= 0 ? y : y - 399) / 400;
    const unsigned yoe = static_cast<unsigned>(y - era * 400);
    const unsigned doy = (153 * (m > 2 ? m - 3 : m + 9) + 2) / 5 + d - 1;
    const unsigned doe = yoe * 365 + yoe / 4 - yoe / 100 + doy;
    return era * 146097 + static_cast<long long>(doe) - 719468;
}

void CivilFromDays(long long z, int& y, unsigned& m, unsigned& d)
{
    z += 719468;
    const long long era = (z >= 0 ? z : z - 146096) / 146097;
    const unsigned doe = static_cast<unsigned>(z - era * 146097);
    const unsigned yoe = (doe - doe / 1460 + doe / 36524 - doe / 146096) / 365;
    const unsigned doy = doe - (365 * yoe + yoe / 4 - yoe / 100);
    const unsigned mp = (5 * doy + 2) / 153;
    d = doy - (153 * mp + 2) / 5 + 1;
    m = mp < 10 ? mp + 3 : mp - 9;
    y = static_cast<int>(static_cast<long long>(yoe) + era * 400 + (m <= 2 ? 1 : 0));
}

bool IsLeapYear(int y)
{
    return (y % 4 == 0 && y % 100 != 0) || y % 400 == 0;
}

int DaysInMonth(int y, int m)
{
    static const int kDays[12] = { 31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31 };
    return m == 2 && IsLeapYear(y) ? 29 : kDays[m - 1];
}

// The calendar parts of a valid date, rounded to the nearest second.
struct DateParts
{
    int year;
    int month;
    int day;
    int hour;
    int minute;
    int second;
    int dayOfWeek;  // 0 = Sunday
    int dayOfYear;  // 1-based
};

bool SplitDate(const COleDateTime& date, DateParts& parts)
{
    if (date.GetStatus() != COleDateTime::valid)
        return false;
    const double linear = LinearFromDate(date.m_dt);
    if (!IsDayInRange(linear))
        return false;
    const long long totalSeconds = static_cast<long long>(floor(linear * kSecondsPerDay + 0.5));
    long long day = totalSeconds / 86400;
    long long secondOfDay = totalSeconds % 86400;
    if (secondOfDay < 0)
    {
        secondOfDay += 86400;
        --day;
    }
    int y;
    unsigned m, d;
    CivilFromDays(day + kOleEpochFromUnix, y, m, d);
    parts.year = y;
    parts.month = static_cast<int>(m);
    parts.day = static_cast<int>(d);
    parts.hour = static_cast<int>(secondOfDay / 3600);
    parts.minute = static_cast<int>(secondOfDay / 60 % 60);
    parts.second = static_cast<int>(secondOfDay % 60);
    // Day 0 was a Saturday.
    parts.dayOfWeek = static_cast<int>(((day + 6) % 7 + 7) % 7);
    parts.dayOfYear = static_cast<int>(DaysFromCivil(y, m, d) - DaysFromCivil(y, 1, 1)) + 1;
    return true;
}

} // namespace

/////////////////////////////////////////////////////////////////////////////
// COleDateTime

COleDateTime PASCAL COleDateTime::GetCurrentTime()
{
    SYSTEMTIME now;
    ::GetLocalTime(&now);
    return COleDateTime(now);
}

COleDateTime::COleDateTime()
    : m_dt(0), m_status(valid)
{
}

COleDateTime::COleDateTime(DATE dtSrc)
    : m_dt(dtSrc), m_status(valid)
{
}

COleDateTime::COleDateTime(const SYSTEMTIME& systimeSrc)
    : m_dt(0), m_status(valid)
{
    *this = systimeSrc;
}

COleDateTime::COleDateTime(int nYear, int nMonth, int nDay, int nHour, int nMin, int nSec)
    : m_dt(0), m_status(valid)
{
    SetDateTime(nYear, nMonth, nDay, nHour, nMin, nSec);
}

void COleDateTime::SetStatus(DateTimeStatus status)
{
    m_status = status;
}

COleDateTime::DateTimeStatus COleDateTime::GetStatus() const
{
    return m_status;
}

bool COleDateTime::GetAsSystemTime(SYSTEMTIME& sysTime) const
{
    DateParts parts;
    if (!SplitDate(*this, parts))
        return false;
    sysTime.wYear = static_cast<WORD>(parts.year);
    sysTime.wMonth = static_cast<WORD>(parts.month);
    sysTime.wDay = static_cast<WORD>(parts.day);
    sysTime.wHour = static_cast<WORD>(parts.hour);
    sysTime.wMinute = static_cast<WORD>(parts.minute);
    sysTime.wSecond = static_cast<WORD>(parts.second);
    sysTime.wDayOfWeek = static_cast<WORD>(parts.dayOfWeek);
    sysTime.wMilliseconds = 0;
    return true;
}

int COleDateTime::GetYear() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.year : AFX_OLE_DATETIME_ERROR;
}

int COleDateTime::GetMonth() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.month : AFX_OLE_DATETIME_ERROR;
}

int COleDateTime::GetDay() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.day : AFX_OLE_DATETIME_ERROR;
}

int COleDateTime::GetHour() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.hour : AFX_OLE_DATETIME_ERROR;
}

int COleDateTime::GetMinute() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.minute : AFX_OLE_DATETIME_ERROR;
}

int COleDateTime::GetSecond() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.second : AFX_OLE_DATETIME_ERROR;
}

int COleDateTime::GetDayOfWeek() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.dayOfWeek + 1 : AFX_OLE_DATETIME_ERROR;
}

int COleDateTime::GetDayOfYear() const
{
    DateParts parts;
    return SplitDate(*this, parts) ? parts.dayOfYear : AFX_OLE_DATETIME_ERROR;
}

COleDateTime& COleDateTime::operator=(DATE dtSrc)
{
    m_dt = dtSrc;
    m_status = valid;
    return *this;
}

COleDateTime& COleDateTime::operator=(const SYSTEMTIME& systimeSrc)
{
    SetDateTime(systimeSrc.wYear, systimeSrc.wMonth, systimeSrc.wDay, systimeSrc.wHour,
        systimeSrc.wMinute, systimeSrc.wSecond);
    return *this;
}

bool COleDateTime::operator==(const COleDateTime& date) const
{
    if (m_status == valid && date.m_status == valid)
        return LinearFromDate(m_dt) == LinearFromDate(date.m_dt);
    return m_status == date.m_status;
}

bool COleDateTime::operator!=(const COleDateTime& date) const
{
    return !(*this == date);
}

bool COleDateTime::operator<(const COleDateTime& date) const
{
    ASSERT(m_status == valid && date.m_status == valid);
    return LinearFromDate(m_dt) < LinearFromDate(date.m_dt);
}

bool COleDateTime::operator>(const COleDateTime& date) const
{
    return date < *this;
}

bool COleDateTime::operator<=(const COleDateTime& date) const
{
    return !(date < *this);
}

bool COleDateTime::operator>=(const COleDateTime& date) const
{
    return !(*this < date);
}

COleDateTime COleDateTime::operator+(COleDateTimeSpan dateSpan) const
{
    COleDateTime result;
    if (m_status == null || dateSpan.GetStatus() == COleDateTimeSpan::null)
    {
        result.SetStatus(null);
        return result;
    }
    if (m_status == invalid || dateSpan.GetStatus() == COleDateTimeSpan::invalid)
    {
        result.SetStatus(invalid);
        return result;
    }
    const double linear = LinearFromDate(m_dt) + dateSpan.m_span;
    result.m_dt = DateFromLinear(linear);
    if (!IsDayInRange(linear))
        result.SetStatus(invalid);
    return result;
}

COleDateTime COleDateTime::operator-(COleDateTimeSpan dateSpan) const
{
    return *this + (-dateSpan);
}

COleDateTime& COleDateTime::operator+=(COleDateTimeSpan dateSpan)
{
    *this = *this + dateSpan;
    return *this;
}

COleDateTime& COleDateTime::operator-=(COleDateTimeSpan dateSpan)
{
    *this = *this - dateSpan;
    return *this;
}

COleDateTimeSpan COleDateTime::operator-(const COleDateTime& date) const
{
    COleDateTimeSpan result;
    if (m_status == null || date.m_status == null)
    {
        result.SetStatus(COleDateTimeSpan::null);
        return result;
    }
    if (m_status == invalid || date.m_status == invalid)
    {
        result.SetStatus(COleDateTimeSpan::invalid);
        return result;
    }
    result.m_span = LinearFromDate(m_dt) - LinearFromDate(date.m_dt);
    return result;
}

COleDateTime::operator DATE() const
{
    return m_dt;
}

int COleDateTime::SetDateTime(int nYear, int nMonth, int nDay, int nHour, int nMin, int nSec)
{
    const bool bValid = nYear >= 100 && nYear <= 9999 && nMonth >= 1 && nMonth <= 12 && nDay >= 1
        && nDay <= DaysInMonth(nYear, nMonth) && nHour >= 0 && nHour <= 23 && nMin >= 0 && nMin <= 59
        && nSec >= 0 && nSec <= 59;
    if (!bValid)
    {
        m_dt = 0;
        m_status = invalid;
        return m_status;
    }
    const double day = static_cast<double>(DaysFromCivil(nYear, static_cast<unsigned>(nMonth),
        static_cast<unsigned>(nDay)) - kOleEpochFromUnix);
    const double time = (nHour * 3600 + nMin * 60 + nSec) / kSecondsPerDay;
    m_dt = day >= 0 ? day + time : day - time;
    m_status = valid;
    return m_status;
}

int COleDateTime::SetDate(int nYear, int nMonth, int nDay)
{
    return SetDateTime(nYear, nMonth, nDay, 0, 0, 0);
}

int COleDateTime::SetTime(int nHour, int nMin, int nSec)
{
    // A time alone lies on day 0, 30 December 1899.
    return SetDateTime(1899, 12, 30, nHour, nMin, nSec);
}

bool COleDateTime::ParseDateTime(LPCTSTR lpszDate, DWORD dwFlags, LCID lcid)
{
    LPCWSTR text = lpszDate != NULL ? lpszDate : L"";
    DATE dt = 0;
    const HRESULT hr = ::VarDateFromStr(const_cast<LPOLESTR>(text), lcid, dwFlags, &dt);
    if (FAILED(hr))
    {
        // A text that is no date leaves 0; one out of range or another failure -1.
        m_dt = hr == DISP_E_TYPEMISMATCH ? 0 : -1;
        m_status = invalid;
        return false;
    }
    m_dt = dt;
    m_status = valid;
    return true;
}

CString COleDateTime::Format(DWORD dwFlags, LCID lcid) const
{
    if (m_status == null)
        return CString();
    if (m_status == invalid)
        return CString(_T("Invalid DateTime"));
    BSTR bstr = NULL;
    if (FAILED(::VarBstrFromDate(m_dt, lcid, dwFlags, &bstr)))
        return CString();
    CString text(bstr);
    ::SysFreeString(bstr);
    return text;
}

/////////////////////////////////////////////////////////////////////////////
// COleDateTimeSpan

COleDateTimeSpan::COleDateTimeSpan()
    : m_span(0), m_status(valid)
{
}

COleDateTimeSpan::COleDateTimeSpan(double dblSpanSrc)
    : m_span(dblSpanSrc), m_status(valid)
{
}

COleDateTimeSpan::COleDateTimeSpan(LONG lDays, int nHours, int nMins, int nSecs)
    : m_span(0), m_status(valid)
{
    SetDateTimeSpan(lDays, nHours, nMins, nSecs);
}

void COleDateTimeSpan::SetStatus(DateTimeSpanStatus status)
{
    m_status = status;
}

COleDateTimeSpan::DateTimeSpanStatus COleDateTimeSpan::GetStatus() const
{
    return m_status;
}

double COleDateTimeSpan::GetTotalDays() const
{
    return m_span;
}

double COleDateTimeSpan::GetTotalHours() const
{
    return m_span * 24;
}

double COleDateTimeSpan::GetTotalMinutes() const
{
    return m_span * 24 * 60;
}

double COleDateTimeSpan::GetTotalSeconds() const
{
    return m_span * kSecondsPerDay;
}

namespace {

// The span in whole seconds, rounded half away from zero so both signs split alike.
long long RoundedSeconds(double span)
{
    const double seconds = span * kSecondsPerDay;
    return static_cast<long long>(seconds < 0 ? ceil(seconds - 0.5) : floor(seconds + 0.5));
}

} // namespace

LONG COleDateTimeSpan::GetDays() const
{
    return static_cast<LONG>(RoundedSeconds(m_span) / 86400);
}

LONG COleDateTimeSpan::GetHours() const
{
    return static_cast<LONG>(RoundedSeconds(m_span) / 3600 % 24);
}

LONG COleDateTimeSpan::GetMinutes() const
{
    return static_cast<LONG>(RoundedSeconds(m_span) / 60 % 60);
}

LONG COleDateTimeSpan::GetSeconds() const
{
    return static_cast<LONG>(RoundedSeconds(m_span) % 60);
}

COleDateTimeSpan& COleDateTimeSpan::operator=(double dblSpanSrc)
{
    m_span = dblSpanSrc;
    m_status = valid;
    return *this;
}

bool COleDateTimeSpan::operator==(const COleDateTimeSpan& dateSpan) const
{
    return m_status == dateSpan.m_status && m_span == dateSpan.m_span;
}

bool COleDateTimeSpan::operator!=(const COleDateTimeSpan& dateSpan) const
{
    return !(*this == dateSpan);
}

bool COleDateTimeSpan::operator<(const COleDateTimeSpan& dateSpan) const
{
    ASSERT(m_status == valid && dateSpan.m_status == valid);
    return m_span < dateSpan.m_span;
}

bool COleDateTimeSpan::operator>(const COleDateTimeSpan& dateSpan) const
{
    return dateSpan < *this;
}

bool COleDateTimeSpan::operator<=(const COleDateTimeSpan& dateSpan) const
{
    return !(dateSpan < *this);
}

bool COleDateTimeSpan::operator>=(const COleDateTimeSpan& dateSpan) const
{
    return !(*this < dateSpan);
}

COleDateTimeSpan COleDateTimeSpan::operator+(const COleDateTimeSpan& dateSpan) const
{
    COleDateTimeSpan result;
    if (m_status == null || dateSpan.m_status == null)
    {
        result.SetStatus(null);
        return result;
    }
    if (m_status == invalid || dateSpan.m_status == invalid)
    {
        result.SetStatus(invalid);
        return result;
    }
    result.m_span = m_span + dateSpan.m_span;
    if (fabs(result.m_span) > kMaxDaysInSpan)
        result.SetStatus(invalid);
    return result;
}

COleDateTimeSpan COleDateTimeSpan::operator-(const COleDateTimeSpan& dateSpan) const
{
    return *this + (-dateSpan);
}

COleDateTimeSpan& COleDateTimeSpan::operator+=(const COleDateTimeSpan dateSpan)
{
    *this = *this + dateSpan;
    return *this;
}

COleDateTimeSpan& COleDateTimeSpan::operator-=(const COleDateTimeSpan dateSpan)
{
    *this = *this - dateSpan;
    return *this;
}

COleDateTimeSpan COleDateTimeSpan::operator-() const
{
    COleDateTimeSpan result(-m_span);
    result.SetStatus(m_status);
    return result;
}

COleDateTimeSpan::operator double() const
{
    return m_span;
}

void COleDateTimeSpan::SetDateTimeSpan(LONG lDays, int nHours, int nMins, int nSecs)
{
    m_span = lDays + (nHours * 3600.0 + nMins * 60.0 + nSecs) / kSecondsPerDay;
    m_status = fabs(m_span) > kMaxDaysInSpan ? invalid : valid;
}
