// KVXLongEdit: entry field for one signed 32-bit integer.
//
// Shows the value in decimal, binary ("0b") or hexadecimal ("0x"); accepts input in any
// of the three bases unless fixed input is on; checks the value against its range and
// steps it by whole units with the spin.
#pragma once

#include "KVXNumericEdit.h"

class AFX_EXT_CLASS KVXLongEdit : public KVXNumericEdit
{
public:
    enum DISPLAYTYPE
    {
        DECIMAL = 1,
        BINARY = 2,
        HEXADECIMAL = 3
    };

// Constructors
public:
    KVXLongEdit(DISPLAYTYPE eDisplay = DECIMAL);
    virtual ~KVXLongEdit();

// Attributes
public:
    void SetDisplayType(long lDisplay);
    DISPLAYTYPE GetDisplayType();
    void SetFixedInput(bool bFixed);
    bool GetFixedInput();

// Operations
public:
    // The value of the field; an invalid or empty field reads as its committed value.
    long GetValue(int bCommit);
    int SetValue(long lValue, int bCommit);
    int EnableWindow(int bEnable);

// Overridables
public:
    virtual int SetValueAsVariant(KVXVariant varValue, int bCommit);
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
    long m_lMiddleVal;
    DISPLAYTYPE m_eDisplayType;
    bool m_bFixedInput;

private:
    void BinaryToKVXString(long lValue, KVXString& strOut);
    // Shows middle value + offset, or the given range end when the sum falls outside.
    int StepTo(long lOffset, bool bUpward);
};
