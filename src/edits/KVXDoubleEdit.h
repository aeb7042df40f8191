// KVXDoubleEdit: entry field for one double-precision value.
//
// Shows the value through a printf-style format (default "%.16g"), checks typed text
// against its range, and steps the value with the spin by a delta that it can derive by
// itself from the number of digits shown.
#pragma once

#include "KVXNumericEdit.h"

class AFX_EXT_CLASS KVXDoubleEdit : public KVXNumericEdit
{
// Constructors
public:
    KVXDoubleEdit();
    virtual ~KVXDoubleEdit();

// Attributes
public:
    CString GetFormat();
    // A format with exactly one double conversion; re-shows and commits the value.
    int SetFormat(CString strFormat);
    void ResetFormat();
    void SetAutomaticDeltaDeterminationEnabled(bool bEnable);
    bool GetAutomaticDeltaDeterminationEnabled();
    void SetDelta(double dDelta);
    double GetDelta();

// Operations
public:
    // The value of the field; an invalid or empty field reads as its committed value.
    double GetValue(int bCommit);
    int SetValue(double dValue, int bCommit);
    int EnableWindow(int bEnable);

// Overridables
public:
    virtual int SetValueAsVariant(KVXVariant varValue, int bCommit);
    // Reading the value through this operation always commits it.
    virtual KVXVariant GetValueAsVariant(int bCommit);
    virtual void SetRange(KVXVariant varMin, KVXVariant varMax, int bMinInclude, int bMaxInclude);
    virtual KVXVariant GetMinimum();
    virtual KVXVariant GetMaximum();
    virtual int GetMinimumInclude();
    virtual int GetMaximumInclude();
    virtual int SyntaxCheck(int bShow);

protected:
    virtual int CharCheck(WCHAR c);
    virtual int SyntaxCheck(KVXString strText);
    virtual void SetMiddleVal(int bDetermineStep);
    virtual int IncreaseValue(long lOffset);
    virtual int DecreaseValue(long lOffset);

// Implementation
protected:
    bool m_bAutoDelta;
    KVXString m_strFormat;
    double m_dDelta;
    double m_dMiddleVal;

private:
    KVXString FormatValue(double dValue);
    // Shows lOffset deltas from the middle value, or the given range end outside the range.
    int StepTo(long lOffset, bool bUpward);
};
