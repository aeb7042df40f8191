// afxdisp.h - OLE automation value types: COleDateTime and COleDateTimeSpan.
// A date is an OLE DATE, days since 30 December 1899 with the time of day as the
// fraction; before that day the fraction still counts forward from midnight
// (-1.25 is 29 December 1899, 6:00). Comparisons and arithmetic therefore work
// on the linear value, not on the raw DATE.
#pragma once

#ifndef __AFXDISP_H__
#define __AFXDISP_H__

#ifndef __AFX_H__
#include <afx.h>
#endif

#include <oleauto.h>

// winbase.h maps GetCurrentTime to GetTickCount; COleDateTime has a member of that name.
#ifdef GetCurrentTime
#undef GetCurrentTime
#endif

// What the date parts return for a date that is not valid.
#define AFX_OLE_DATETIME_ERROR (-1)

class COleDateTimeSpan;

/////////////////////////////////////////////////////////////////////////////
// OLE initialisation of the application

// Initialises OLE for this thread once; AfxWinTerm ends it again (AfxOleTerm).
BOOL AFXAPI AfxOleInit();
void AFXAPI AfxOleTerm(BOOL bJustRevoke = FALSE);
void AFXAPI AfxOleTermOrFreeLib(BOOL bTerm = TRUE, BOOL bJustRevoke = FALSE);

/////////////////////////////////////////////////////////////////////////////
// COleDateTime: a point in time, with a status saying whether it holds one

class COleDateTime
{
public:
    static COleDateTime PASCAL GetCurrentTime();

// Constructors
    COleDateTime();
    COleDateTime(DATE dtSrc);
    COleDateTime(const SYSTEMTIME& systimeSrc);
    COleDateTime(int nYear, int nMonth, int nDay, int nHour, int nMin, int nSec);

// Attributes
    enum DateTimeStatus
    {
        error = -1,
        valid = 0,
        invalid = 1,    // invalid date (out of range, not parsed, ...)
        null = 2,       // literally has no value
    };

    DATE m_dt;
    DateTimeStatus m_status;

    void SetStatus(DateTimeStatus status);
    DateTimeStatus GetStatus() const;

    bool GetAsSystemTime(SYSTEMTIME& sysTime) const;

    // Parts rounded to the second; AFX_OLE_DATETIME_ERROR unless valid.
    int GetYear() const;
    int GetMonth() const;       // 1 to 12
    int GetDay() const;         // 1 to 31
    int GetHour() const;        // 0 to 23
    int GetMinute() const;      // 0 to 59
    int GetSecond() const;      // 0 to 59
    int GetDayOfWeek() const;   // 1 = Sunday to 7 = Saturday
    int GetDayOfYear() const;   // 1 to 366

// Operations
    COleDateTime& operator=(DATE dtSrc);
    COleDateTime& operator=(const SYSTEMTIME& systimeSrc);

    // Equal when both are valid and hold the same time, or share a status that is not valid.
    bool operator==(const COleDateTime& date) const;
    bool operator!=(const COleDateTime& date) const;
    // Both operands must be valid.
    bool operator<(const COleDateTime& date) const;
    bool operator>(const COleDateTime& date) const;
    bool operator<=(const COleDateTime& date) const;
    bool operator>=(const COleDateTime& date) const;

    // A null operand gives null, else an invalid one invalid; a result outside
    // the years 100 to 9999 is invalid.
    COleDateTime operator+(COleDateTimeSpan dateSpan) const;
    COleDateTime operator-(COleDateTimeSpan dateSpan) const;
    COleDateTime& operator+=(COleDateTimeSpan dateSpan);
    COleDateTime& operator-=(COleDateTimeSpan dateSpan);
    COleDateTimeSpan operator-(const COleDateTime& date) const;

    operator DATE() const;

    // Return the resulting status: 0 valid, 1 invalid (a part out of range).
    int SetDateTime(int nYear, int nMonth, int nDay, int nHour, int nMin, int nSec);
    int SetDate(int nYear, int nMonth, int nDay);
    int SetTime(int nHour, int nMin, int nSec);

    // The platform's parser (VarDateFromStr) with its flags (VAR_DATEVALUEONLY,
    // VAR_TIMEVALUEONLY, LOCALE_NOUSEROVERRIDE) in the given locale. A text that
    // is no date leaves the value 0 and the status invalid.
    bool ParseDateTime(LPCTSTR lpszDate, DWORD dwFlags = 0, LCID lcid = LANG_USER_DEFAULT);

    // The platform's formatting (VarBstrFromDate); empty when null.
    CString Format(DWORD dwFlags = 0, LCID lcid = LANG_USER_DEFAULT) const;
};

/////////////////////////////////////////////////////////////////////////////
// COleDateTimeSpan: a length of time in days, with a status

class COleDateTimeSpan
{
public:
// Constructors
    COleDateTimeSpan();
    COleDateTimeSpan(double dblSpanSrc);
    COleDateTimeSpan(LONG lDays, int nHours, int nMins, int nSecs);

// Attributes
    enum DateTimeSpanStatus
    {
        valid = 0,
        invalid = 1,
        null = 2,
    };

    double m_span;
    DateTimeSpanStatus m_status;

    void SetStatus(DateTimeSpanStatus status);
    DateTimeSpanStatus GetStatus() const;

    double GetTotalDays() const;
    double GetTotalHours() const;
    double GetTotalMinutes() const;
    double GetTotalSeconds() const;

    // Parts of the span rounded to the second, each with the sign of the span.
    LONG GetDays() const;
    LONG GetHours() const;      // -23 to 23
    LONG GetMinutes() const;    // -59 to 59
    LONG GetSeconds() const;    // -59 to 59

// Operations
    COleDateTimeSpan& operator=(double dblSpanSrc);

    bool operator==(const COleDateTimeSpan& dateSpan) const;
    bool operator!=(const COleDateTimeSpan& dateSpan) const;
    bool operator<(const COleDateTimeSpan& dateSpan) const;
    bool operator>(const COleDateTimeSpan& dateSpan) const;
    bool operator<=(const COleDateTimeSpan& dateSpan) const;
    bool operator>=(const COleDateTimeSpan& dateSpan) const;

    // Status as for dates; a span longer than the representable range is invalid.
    COleDateTimeSpan operator+(const COleDateTimeSpan& dateSpan) const;
    COleDateTimeSpan operator-(const COleDateTimeSpan& dateSpan) const;
    COleDateTimeSpan& operator+=(const COleDateTimeSpan dateSpan);
    COleDateTimeSpan& operator-=(const COleDateTimeSpan dateSpan);
    COleDateTimeSpan operator-() const;

    operator double() const;

    void SetDateTimeSpan(LONG lDays, int nHours, int nMins, int nSecs);
};

#endif // __AFXDISP_H__
