// KVXString.h - a CString that converts itself into numbers.
//
// KVXString adds no data to CString: it copies, compares and formats exactly like it. GetAs
// parses the whole text with the grammar described in NumberText.h:
//   - blanks around the number are ignored, one sign '+' or '-' is allowed;
//   - long: decimal, or "0b"/"0B" binary and "0x"/"0X" hexadecimal; an unsigned prefixed number is
//     the 32-bit pattern ("0xFFFFFFFF" is -1), a signed one a magnitude ("-0x10" is -16);
//   - double: digits with one optional '.', an optional exponent 'e'/'E' with optional sign;
//   - 0 converted; -3 syntax error at errorPos; -4 below, -5 above the type's range; -6 a nonzero
//     double too small to represent; -7 no number at all (empty, lone sign or prefix, nan, inf).
#pragma once

#include <afx.h>

#include "KVTEnums.h"

class KVT_API KVXString : public CString
{
public:
// Constructors
    KVXString();
    KVXString(const KVXString& stringSrc);
    KVXString(const CString& stringSrc);
    KVXString(TCHAR ch, int nRepeat = 1);
    KVXString(LPCSTR lpsz);
    KVXString(LPCWSTR lpsz);
    KVXString(LPCSTR lpch, int nLength);
    KVXString(LPCWSTR lpch, int nLength);
    KVXString(const unsigned char* psz);

    const KVXString& operator=(const KVXString& stringSrc);
    const KVXString& operator=(const CString& stringSrc);
    const KVXString& operator=(TCHAR ch);
    const KVXString& operator=(char ch);
    const KVXString& operator=(LPCSTR lpsz);
    const KVXString& operator=(LPCWSTR lpsz);
    const KVXString& operator=(const unsigned char* psz);

// Conversion
    // The value is written only when the result is KVT_CONVERT_OK; nErrorPos is the index of the
    // offending character for KVT_CONVERT_SYNTAX_ERROR and 0 otherwise.
    KVTEnumConvertType GetAs(long& lValue, int& nErrorPos) const;
    KVTEnumConvertType GetAs(double& dValue, int& nErrorPos) const;
    // 2 after the prefix "0b", 16 after "0x" (either letter case, blanks and a sign skipped), else 10.
    int GetBase() const;

// Formatting (printf semantics of CString::Format; a NULL format gives an empty text)
    using CString::Format;
    void AFX_CDECL Format(LPCTSTR lpszFormat, ...);

// Characters of the number grammar
    static WCHAR GetUpperEngDeli() { return L'E'; }
    static WCHAR GetLowerEngDeli() { return L'e'; }
    static WCHAR GetUpperBinary() { return L'B'; }
    static WCHAR GetLowerBinary() { return L'b'; }
    static WCHAR GetRealFlagFloat() { return L'r'; }
    static WCHAR GetRealFlagDouble() { return L'R'; }

protected:
    // True for the conversion letters % B C E G T X b c d e f g i o p s t u x.
    BOOL IsFmtType(const WCHAR& ch) const;
};
