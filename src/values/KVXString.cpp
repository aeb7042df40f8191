// KVXString.cpp - text with number conversions.
#include "KVXString.h"

#include "NumberText.h"

KVXString::KVXString() {}
KVXString::KVXString(const KVXString& stringSrc) : CString(stringSrc) {}
KVXString::KVXString(const CString& stringSrc) : CString(stringSrc) {}
KVXString::KVXString(TCHAR ch, int nRepeat) : CString(ch, nRepeat) {}
KVXString::KVXString(LPCSTR lpsz) : CString(lpsz) {}
KVXString::KVXString(LPCWSTR lpsz) : CString(lpsz) {}
KVXString::KVXString(LPCSTR lpch, int nLength) : CString(lpch, nLength) {}
KVXString::KVXString(LPCWSTR lpch, int nLength) : CString(lpch, nLength) {}
KVXString::KVXString(const unsigned char* psz) : CString(psz) {}

const KVXString& KVXString::operator=(const KVXString& stringSrc)
{
    CString::operator=(stringSrc);
    return *this;
}

const KVXString& KVXString::operator=(const CString& stringSrc)
{
    CString::operator=(stringSrc);
    return *this;
}

const KVXString& KVXString::operator=(TCHAR ch)
{
    CString::operator=(ch);
    return *this;
}

const KVXString& KVXString::operator=(char ch)
{
    CString::operator=(ch);
    return *this;
}

const KVXString& KVXString::operator=(LPCSTR lpsz)
{
    CString::operator=(lpsz);
    return *this;
}

const KVXString& KVXString::operator=(LPCWSTR lpsz)
{
    CString::operator=(lpsz);
    return *this;
}

const KVXString& KVXString::operator=(const unsigned char* psz)
{
    CString::operator=(psz);
    return *this;
}

KVTEnumConvertType KVXString::GetAs(long& lValue, int& nErrorPos) const
{
    return KvtParseLong(static_cast<LPCTSTR>(*this), GetLength(), lValue, nErrorPos);
}

KVTEnumConvertType KVXString::GetAs(double& dValue, int& nErrorPos) const
{
    return KvtParseDouble(static_cast<LPCTSTR>(*this), GetLength(), dValue, nErrorPos);
}

int KVXString::GetBase() const
{
    return KvtNumberBase(static_cast<LPCTSTR>(*this), GetLength());
}

void AFX_CDECL KVXString::Format(LPCTSTR lpszFormat, ...)
{
    if (lpszFormat == NULL)
    {
        Empty();
        return;
    }
    va_list argList;
    va_start(argList, lpszFormat);
    FormatV(lpszFormat, argList);
    va_end(argList);
}

BOOL KVXString::IsFmtType(const WCHAR& ch) const
{
    return KvtIsFormatType(ch) ? TRUE : FALSE;
}
