// CString: one pointer to the characters, preceded by a reference-counted
// header; copies share the buffer until one of them writes.
#include <afx.h>
#include <oleauto.h>
#include <limits.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <wchar.h>

namespace {

// The shared empty string: never freed, never written (nRefs == -1).
struct NilString
{
    CStringData header;
    TCHAR chars[2];
};
NilString g_nil = { { -1, 0, 0 }, { 0, 0 } };

inline LPTSTR NilChars()
{
    return g_nil.header.data();
}

// Largest length whose allocation size still fits in an int.
const int kMaxLength = (INT_MAX - (int)sizeof(CStringData)) / (int)sizeof(TCHAR) - 1;

int AnsiLength(LPCSTR lpsz, int nBytes)
{
    if (nBytes <= 0)
        return 0;
    return ::MultiByteToWideChar(CP_ACP, 0, lpsz, nBytes, NULL, 0);
}

bool InSet(TCHAR ch, LPCTSTR lpszSet)
{
    return ch != 0 && lpszSet != NULL && wcschr(lpszSet, ch) != NULL;
}

} // namespace

/////////////////////////////////////////////////////////////////////////////
// Allocation

void CString::Init()
{
    m_pchData = NilChars();
}

int PASCAL CString::SafeStrlen(LPCTSTR lpsz)
{
    if (lpsz == NULL || IS_INTRESOURCE(lpsz))
        return 0;
    size_t n = wcslen(lpsz);
    if (n > (size_t)kMaxLength)
        AfxThrowMemoryException();
    return (int)n;
}

void CString::AllocBuffer(int nLen)
{
    if (nLen <= 0)
    {
        Init();
        return;
    }
    if (nLen > kMaxLength)
        AfxThrowMemoryException();
    size_t cb = sizeof(CStringData) + ((size_t)nLen + 1) * sizeof(TCHAR);
    CStringData* pData = (CStringData*)malloc(cb);
    if (pData == NULL)
        AfxThrowMemoryException();
    pData->nRefs = 1;
    pData->nDataLength = nLen;
    pData->nAllocLength = nLen;
    pData->data()[nLen] = 0;
    m_pchData = pData->data();
}

void PASCAL CString::FreeData(CStringData* pData)
{
    free(pData);
}

void PASCAL CString::Release(CStringData* pData)
{
    if (pData == &g_nil.header)
        return;
    // A locked buffer (nRefs == -1) has exactly one owner.
    if (pData->nRefs < 0 || InterlockedDecrement(&pData->nRefs) <= 0)
        FreeData(pData);
}

void CString::Release()
{
    Release(GetData());
    Init();
}

void CString::CopyBeforeWrite()
{
    CStringData* pData = GetData();
    if (pData->nRefs > 1)
    {
        AllocBuffer(pData->nDataLength);
        memcpy(m_pchData, pData->data(), ((size_t)pData->nDataLength + 1) * sizeof(TCHAR));
        Release(pData);
    }
}

void CString::AllocBeforeWrite(int nLen)
{
    CStringData* pData = GetData();
    if (pData->nRefs > 1 || nLen > pData->nAllocLength || pData == &g_nil.header)
    {
        Release();
        AllocBuffer(nLen);
    }
}

void CString::AssignCopy(int nSrcLen, LPCTSTR lpszSrcData)
{
    if (nSrcLen <= 0)
    {
        Empty();
        return;
    }
    // The source may live inside this string's own buffer.
    if (lpszSrcData >= m_pchData && lpszSrcData <= m_pchData + GetData()->nAllocLength)
    {
        CString copy(lpszSrcData, nSrcLen);
        *this = copy;
        return;
    }
    AllocBeforeWrite(nSrcLen);
    memcpy(m_pchData, lpszSrcData, (size_t)nSrcLen * sizeof(TCHAR));
    GetData()->nDataLength = nSrcLen;
    m_pchData[nSrcLen] = 0;
}

void CString::AllocCopy(CString& dest, int nCopyLen, int nCopyIndex, int nExtraLen) const
{
    int nNewLen = nCopyLen + nExtraLen;
    if (nNewLen <= 0)
    {
        dest.Init();
        return;
    }
    dest.AllocBuffer(nNewLen);
    if (nCopyLen > 0)
        memcpy(dest.m_pchData, m_pchData + nCopyIndex, (size_t)nCopyLen * sizeof(TCHAR));
}

void CString::ConcatCopy(int nSrc1Len, LPCTSTR lpszSrc1Data, int nSrc2Len, LPCTSTR lpszSrc2Data)
{
    if (nSrc1Len > kMaxLength - nSrc2Len)
        AfxThrowMemoryException();
    int nNewLen = nSrc1Len + nSrc2Len;
    if (nNewLen <= 0)
        return;
    AllocBuffer(nNewLen);
    if (nSrc1Len > 0)
        memcpy(m_pchData, lpszSrc1Data, (size_t)nSrc1Len * sizeof(TCHAR));
    if (nSrc2Len > 0)
        memcpy(m_pchData + nSrc1Len, lpszSrc2Data, (size_t)nSrc2Len * sizeof(TCHAR));
}

void CString::ConcatInPlace(int nSrcLen, LPCTSTR lpszSrcData)
{
    if (nSrcLen <= 0)
        return;
    CStringData* pData = GetData();
    if (pData->nRefs > 1 || pData->nDataLength + nSrcLen > pData->nAllocLength
        || pData == &g_nil.header)
    {
        // Builds the result in a fresh buffer; lpszSrcData may point into the old one.
        CString result;
        result.ConcatCopy(pData->nDataLength, m_pchData, nSrcLen, lpszSrcData);
        *this = result;
        return;
    }
    memmove(m_pchData + pData->nDataLength, lpszSrcData, (size_t)nSrcLen * sizeof(TCHAR));
    pData->nDataLength += nSrcLen;
    m_pchData[pData->nDataLength] = 0;
}

/////////////////////////////////////////////////////////////////////////////
// Construction

CString::CString()
{
    Init();
}

CString::CString(const CString& stringSrc)
{
    CStringData* pSrc = stringSrc.GetData();
    if (pSrc->nRefs >= 0)
    {
        m_pchData = stringSrc.m_pchData;
        InterlockedIncrement(&pSrc->nRefs);
    }
    else
    {
        Init();
        *this = stringSrc.m_pchData;
    }
}

CString::CString(TCHAR ch, int nRepeat)
{
    Init();
    if (nRepeat >= 1)
    {
        AllocBuffer(nRepeat);
        for (int i = 0; i < nRepeat; i++)
            m_pchData[i] = ch;
    }
}

CString::CString(LPCWSTR lpsz)
{
    Init();
    if (lpsz != NULL && IS_INTRESOURCE(lpsz))
    {
        LoadString(LOWORD((ULONG_PTR)lpsz));
        return;
    }
    int nLen = SafeStrlen(lpsz);
    if (nLen != 0)
    {
        AllocBuffer(nLen);
        memcpy(m_pchData, lpsz, (size_t)nLen * sizeof(TCHAR));
    }
}

CString::CString(LPCSTR lpsz)
{
    Init();
    if (lpsz != NULL && IS_INTRESOURCE(lpsz))
    {
        LoadString(LOWORD((ULONG_PTR)lpsz));
        return;
    }
    *this = lpsz;
}

CString::CString(const unsigned char* psz)
{
    Init();
    *this = (LPCSTR)psz;
}

CString::CString(LPCWSTR lpch, int nLength)
{
    Init();
    if (lpch != NULL && nLength > 0)
    {
        AllocBuffer(nLength);
        memcpy(m_pchData, lpch, (size_t)nLength * sizeof(TCHAR));
    }
}

CString::CString(LPCSTR lpch, int nLength)
{
    Init();
    if (lpch == NULL || nLength <= 0)
        return;
    int nLen = AnsiLength(lpch, nLength);
    if (nLen > 0)
    {
        AllocBuffer(nLen);
        ::MultiByteToWideChar(CP_ACP, 0, lpch, nLength, m_pchData, nLen);
    }
}

CString::~CString()
{
    Release(GetData());
}

void CString::Empty()
{
    CStringData* pData = GetData();
    if (pData->nDataLength == 0 && pData->nRefs < 0)
        return;
    if (pData->nRefs >= 0)
    {
        Release();
        return;
    }
    // A locked buffer stays with its owner.
    pData->nDataLength = 0;
    m_pchData[0] = 0;
}

/////////////////////////////////////////////////////////////////////////////
// Element access

TCHAR CString::GetAt(int nIndex) const
{
    ASSERT(nIndex >= 0 && nIndex < GetData()->nDataLength);
    if (nIndex < 0 || nIndex > GetData()->nDataLength)
        return 0;
    return m_pchData[nIndex];
}

TCHAR CString::operator[](int nIndex) const
{
    return GetAt(nIndex);
}

void CString::SetAt(int nIndex, TCHAR ch)
{
    ASSERT(nIndex >= 0 && nIndex < GetData()->nDataLength);
    if (nIndex < 0 || nIndex >= GetData()->nDataLength)
        return;
    CopyBeforeWrite();
    m_pchData[nIndex] = ch;
}

/////////////////////////////////////////////////////////////////////////////
// Assignment and concatenation

const CString& CString::operator=(const CString& stringSrc)
{
    if (m_pchData != stringSrc.m_pchData)
    {
        CStringData* pSrc = stringSrc.GetData();
        if ((GetData()->nRefs < 0 && GetData() != &g_nil.header) || pSrc->nRefs < 0)
        {
            // Locked buffers are never shared: copy the characters.
            AssignCopy(pSrc->nDataLength, stringSrc.m_pchData);
        }
        else
        {
            InterlockedIncrement(&pSrc->nRefs);
            Release();
            m_pchData = stringSrc.m_pchData;
        }
    }
    return *this;
}

const CString& CString::operator=(LPCWSTR lpsz)
{
    AssignCopy(SafeStrlen(lpsz), lpsz);
    return *this;
}

const CString& CString::operator=(LPCSTR lpsz)
{
    int nBytes = (lpsz != NULL) ? (int)strnlen(lpsz, (size_t)kMaxLength) : 0;
    int nLen = AnsiLength(lpsz, nBytes);
    if (nLen <= 0)
    {
        Empty();
        return *this;
    }
    AllocBeforeWrite(nLen);
    ::MultiByteToWideChar(CP_ACP, 0, lpsz, nBytes, m_pchData, nLen);
    GetData()->nDataLength = nLen;
    m_pchData[nLen] = 0;
    return *this;
}

const CString& CString::operator=(const unsigned char* psz)
{
    return *this = (LPCSTR)psz;
}

const CString& CString::operator=(TCHAR ch)
{
    AssignCopy(1, &ch);
    return *this;
}

const CString& CString::operator=(char ch)
{
    char sz[2] = { ch, 0 };
    return *this = (LPCSTR)sz;
}

const CString& CString::operator+=(const CString& string)
{
    ConcatInPlace(string.GetData()->nDataLength, string.m_pchData);
    return *this;
}

const CString& CString::operator+=(TCHAR ch)
{
    ConcatInPlace(1, &ch);
    return *this;
}

const CString& CString::operator+=(char ch)
{
    char sz[2] = { ch, 0 };
    return *this += CString((LPCSTR)sz);
}

const CString& CString::operator+=(LPCTSTR lpsz)
{
    ConcatInPlace(SafeStrlen(lpsz), lpsz);
    return *this;
}

CString AFXAPI operator+(const CString& string1, const CString& string2)
{
    CString s;
    s.ConcatCopy(string1.GetData()->nDataLength, string1.m_pchData,
        string2.GetData()->nDataLength, string2.m_pchData);
    return s;
}

CString AFXAPI operator+(const CString& string, TCHAR ch)
{
    CString s;
    s.ConcatCopy(string.GetData()->nDataLength, string.m_pchData, 1, &ch);
    return s;
}

CString AFXAPI operator+(TCHAR ch, const CString& string)
{
    CString s;
    s.ConcatCopy(1, &ch, string.GetData()->nDataLength, string.m_pchData);
    return s;
}

CString AFXAPI operator+(const CString& string, char ch)
{
    char sz[2] = { ch, 0 };
    return string + CString((LPCSTR)sz);
}

CString AFXAPI operator+(char ch, const CString& string)
{
    char sz[2] = { ch, 0 };
    return CString((LPCSTR)sz) + string;
}

CString AFXAPI operator+(const CString& string, LPCTSTR lpsz)
{
    CString s;
    s.ConcatCopy(string.GetData()->nDataLength, string.m_pchData,
        CString::SafeStrlen(lpsz), lpsz);
    return s;
}

CString AFXAPI operator+(LPCTSTR lpsz, const CString& string)
{
    CString s;
    s.ConcatCopy(CString::SafeStrlen(lpsz), lpsz,
        string.GetData()->nDataLength, string.m_pchData);
    return s;
}

/////////////////////////////////////////////////////////////////////////////
// Comparison

int CString::Compare(LPCTSTR lpsz) const
{
    return wcscmp(m_pchData, lpsz ? lpsz : L"");
}

int CString::CompareNoCase(LPCTSTR lpsz) const
{
    return _wcsicmp(m_pchData, lpsz ? lpsz : L"");
}

int CString::Collate(LPCTSTR lpsz) const
{
    return wcscoll(m_pchData, lpsz ? lpsz : L"");
}

int CString::CollateNoCase(LPCTSTR lpsz) const
{
    return _wcsicoll(m_pchData, lpsz ? lpsz : L"");
}

BOOL AFXAPI operator==(const CString& s1, const CString& s2) { return s1.Compare(s2) == 0; }
BOOL AFXAPI operator==(const CString& s1, LPCTSTR s2) { return s1.Compare(s2) == 0; }
BOOL AFXAPI operator==(LPCTSTR s1, const CString& s2) { return s2.Compare(s1) == 0; }
BOOL AFXAPI operator!=(const CString& s1, const CString& s2) { return s1.Compare(s2) != 0; }
BOOL AFXAPI operator!=(const CString& s1, LPCTSTR s2) { return s1.Compare(s2) != 0; }
BOOL AFXAPI operator!=(LPCTSTR s1, const CString& s2) { return s2.Compare(s1) != 0; }
BOOL AFXAPI operator<(const CString& s1, const CString& s2) { return s1.Compare(s2) < 0; }
BOOL AFXAPI operator<(const CString& s1, LPCTSTR s2) { return s1.Compare(s2) < 0; }
BOOL AFXAPI operator<(LPCTSTR s1, const CString& s2) { return s2.Compare(s1) > 0; }
BOOL AFXAPI operator>(const CString& s1, const CString& s2) { return s1.Compare(s2) > 0; }
BOOL AFXAPI operator>(const CString& s1, LPCTSTR s2) { return s1.Compare(s2) > 0; }
BOOL AFXAPI operator>(LPCTSTR s1, const CString& s2) { return s2.Compare(s1) < 0; }
BOOL AFXAPI operator<=(const CString& s1, const CString& s2) { return s1.Compare(s2) <= 0; }
BOOL AFXAPI operator<=(const CString& s1, LPCTSTR s2) { return s1.Compare(s2) <= 0; }
BOOL AFXAPI operator<=(LPCTSTR s1, const CString& s2) { return s2.Compare(s1) >= 0; }
BOOL AFXAPI operator>=(const CString& s1, const CString& s2) { return s1.Compare(s2) >= 0; }
BOOL AFXAPI operator>=(const CString& s1, LPCTSTR s2) { return s1.Compare(s2) >= 0; }
BOOL AFXAPI operator>=(LPCTSTR s1, const CString& s2) { return s2.Compare(s1) <= 0; }

/////////////////////////////////////////////////////////////////////////////
// Extraction: out-of-range arguments are clamped to the string

CString CString::Mid(int nFirst) const
{
    return Mid(nFirst, GetData()->nDataLength);
}

CString CString::Mid(int nFirst, int nCount) const
{
    int nLength = GetData()->nDataLength;
    if (nFirst < 0)
        nFirst = 0;
    if (nCount < 0)
        nCount = 0;
    if (nFirst > nLength)
        nFirst = nLength;
    if (nCount > nLength - nFirst)
        nCount = nLength - nFirst;
    if (nFirst == 0 && nCount == nLength)
        return *this;
    CString dest;
    AllocCopy(dest, nCount, nFirst, 0);
    return dest;
}

CString CString::Left(int nCount) const
{
    return Mid(0, nCount);
}

CString CString::Right(int nCount) const
{
    int nLength = GetData()->nDataLength;
    if (nCount < 0)
        nCount = 0;
    if (nCount > nLength)
        nCount = nLength;
    return Mid(nLength - nCount, nCount);
}

CString CString::SpanIncluding(LPCTSTR lpszCharSet) const
{
    int nLength = GetData()->nDataLength;
    int n = 0;
    while (n < nLength && InSet(m_pchData[n], lpszCharSet))
        n++;
    return Left(n);
}

CString CString::SpanExcluding(LPCTSTR lpszCharSet) const
{
    int nLength = GetData()->nDataLength;
    int n = 0;
    while (n < nLength && !InSet(m_pchData[n], lpszCharSet))
        n++;
    return Left(n);
}

/////////////////////////////////////////////////////////////////////////////
// Case and order

void CString::MakeUpper()
{
    if (IsEmpty())
        return;
    CopyBeforeWrite();
    ::CharUpperBuffW(m_pchData, (DWORD)GetData()->nDataLength);
}

void CString::MakeLower()
{
    if (IsEmpty())
        return;
    CopyBeforeWrite();
    ::CharLowerBuffW(m_pchData, (DWORD)GetData()->nDataLength);
}

void CString::MakeReverse()
{
    if (IsEmpty())
        return;
    CopyBeforeWrite();
    for (int i = 0, j = GetData()->nDataLength - 1; i < j; i++, j--)
    {
        TCHAR ch = m_pchData[i];
        m_pchData[i] = m_pchData[j];
        m_pchData[j] = ch;
    }
}

/////////////////////////////////////////////////////////////////////////////
// Modification

int CString::Replace(TCHAR chOld, TCHAR chNew)
{
    if (chOld == chNew)
        return 0;
    int nLength = GetData()->nDataLength;
    int nCount = 0;
    for (int i = 0; i < nLength; i++)
    {
        if (m_pchData[i] == chOld)
        {
            if (nCount == 0)
                CopyBeforeWrite();
            m_pchData[i] = chNew;
            nCount++;
        }
    }
    return nCount;
}

int CString::Replace(LPCTSTR lpszOld, LPCTSTR lpszNew)
{
    int nOldLen = SafeStrlen(lpszOld);
    if (nOldLen == 0)
        return 0;
    int nNewLen = SafeStrlen(lpszNew);
    int nLength = GetData()->nDataLength;

    int nCount = 0;
    for (LPCTSTR p = wcsstr(m_pchData, lpszOld); p != NULL; p = wcsstr(p + nOldLen, lpszOld))
        nCount++;
    if (nCount == 0)
        return 0;

    long long nNewLength = (long long)nLength + (long long)(nNewLen - nOldLen) * nCount;
    if (nNewLength > kMaxLength)
        AfxThrowMemoryException();

    // Built into a new buffer: lpszOld or lpszNew may point into this string.
    CString result;
    result.AllocBuffer((int)nNewLength);
    LPTSTR pDest = result.m_pchData;
    LPCTSTR pSrc = m_pchData;
    for (LPCTSTR p = wcsstr(pSrc, lpszOld); p != NULL; p = wcsstr(pSrc, lpszOld))
    {
        size_t nKeep = (size_t)(p - pSrc);
        memcpy(pDest, pSrc, nKeep * sizeof(TCHAR));
        pDest += nKeep;
        memcpy(pDest, lpszNew, (size_t)nNewLen * sizeof(TCHAR));
        pDest += nNewLen;
        pSrc = p + nOldLen;
    }
    memcpy(pDest, pSrc, (size_t)(m_pchData + nLength - pSrc) * sizeof(TCHAR));
    if (nNewLength == 0)
        result.Empty();
    *this = result;
    return nCount;
}

int CString::Remove(TCHAR chRemove)
{
    int nLength = GetData()->nDataLength;
    int nFirst = 0;
    while (nFirst < nLength && m_pchData[nFirst] != chRemove)
        nFirst++;
    if (nFirst == nLength)
        return 0;
    CopyBeforeWrite();
    int nDest = nFirst;
    for (int i = nFirst; i < nLength; i++)
    {
        if (m_pchData[i] != chRemove)
            m_pchData[nDest++] = m_pchData[i];
    }
    m_pchData[nDest] = 0;
    GetData()->nDataLength = nDest;
    return nLength - nDest;
}

int CString::Insert(int nIndex, TCHAR ch)
{
    TCHAR sz[2] = { ch, 0 };
    return Insert(nIndex, sz);
}

int CString::Insert(int nIndex, LPCTSTR pstr)
{
    int nLength = GetData()->nDataLength;
    int nInsertLength = SafeStrlen(pstr);
    if (nIndex < 0)
        nIndex = 0;
    if (nIndex > nLength)
        nIndex = nLength;
    if (nInsertLength == 0)
        return nLength;
    if (nInsertLength > kMaxLength - nLength)
        AfxThrowMemoryException();

    CString result;
    result.AllocBuffer(nLength + nInsertLength);
    memcpy(result.m_pchData, m_pchData, (size_t)nIndex * sizeof(TCHAR));
    memcpy(result.m_pchData + nIndex, pstr, (size_t)nInsertLength * sizeof(TCHAR));
    memcpy(result.m_pchData + nIndex + nInsertLength, m_pchData + nIndex,
        (size_t)(nLength - nIndex) * sizeof(TCHAR));
    *this = result;
    return GetData()->nDataLength;
}

int CString::Delete(int nIndex, int nCount)
{
    int nLength = GetData()->nDataLength;
    if (nIndex < 0)
        nIndex = 0;
    if (nCount > 0 && nIndex < nLength)
    {
        if (nCount > nLength - nIndex)
            nCount = nLength - nIndex;
        CopyBeforeWrite();
        int nTail = nLength - (nIndex + nCount);
        memmove(m_pchData + nIndex, m_pchData + nIndex + nCount,
            ((size_t)nTail + 1) * sizeof(TCHAR));
        GetData()->nDataLength = nLength - nCount;
    }
    return GetData()->nDataLength;
}

/////////////////////////////////////////////////////////////////////////////
// Trimming

void CString::TrimRight()
{
    int nLength = GetData()->nDataLength;
    int n = nLength;
    while (n > 0 && iswspace(m_pchData[n - 1]))
        n--;
    if (n < nLength)
        Delete(n, nLength - n);
}

void CString::TrimRight(TCHAR chTarget)
{
    int nLength = GetData()->nDataLength;
    int n = nLength;
    while (n > 0 && m_pchData[n - 1] == chTarget)
        n--;
    if (n < nLength)
        Delete(n, nLength - n);
}

void CString::TrimRight(LPCTSTR lpszTargets)
{
    int nLength = GetData()->nDataLength;
    int n = nLength;
    while (n > 0 && InSet(m_pchData[n - 1], lpszTargets))
        n--;
    if (n < nLength)
        Delete(n, nLength - n);
}

void CString::TrimLeft()
{
    int nLength = GetData()->nDataLength;
    int n = 0;
    while (n < nLength && iswspace(m_pchData[n]))
        n++;
    if (n > 0)
        Delete(0, n);
}

void CString::TrimLeft(TCHAR chTarget)
{
    int nLength = GetData()->nDataLength;
    int n = 0;
    while (n < nLength && m_pchData[n] == chTarget)
        n++;
    if (n > 0)
        Delete(0, n);
}

void CString::TrimLeft(LPCTSTR lpszTargets)
{
    int nLength = GetData()->nDataLength;
    int n = 0;
    while (n < nLength && InSet(m_pchData[n], lpszTargets))
        n++;
    if (n > 0)
        Delete(0, n);
}

/////////////////////////////////////////////////////////////////////////////
// Searching

int CString::Find(TCHAR ch) const
{
    return Find(ch, 0);
}

int CString::Find(TCHAR ch, int nStart) const
{
    int nLength = GetData()->nDataLength;
    if (nStart < 0)
        nStart = 0;
    for (int i = nStart; i < nLength; i++)
    {
        if (m_pchData[i] == ch)
            return i;
    }
    return -1;
}

int CString::Find(LPCTSTR lpszSub) const
{
    return Find(lpszSub, 0);
}

int CString::Find(LPCTSTR lpszSub, int nStart) const
{
    if (lpszSub == NULL)
        return -1;
    int nLength = GetData()->nDataLength;
    if (nStart < 0)
        nStart = 0;
    if (nStart > nLength)
        return -1;
    LPCTSTR p = wcsstr(m_pchData + nStart, lpszSub);
    return (p == NULL) ? -1 : (int)(p - m_pchData);
}

int CString::ReverseFind(TCHAR ch) const
{
    for (int i = GetData()->nDataLength - 1; i >= 0; i--)
    {
        if (m_pchData[i] == ch)
            return i;
    }
    return -1;
}

int CString::FindOneOf(LPCTSTR lpszCharSet) const
{
    int nLength = GetData()->nDataLength;
    for (int i = 0; i < nLength; i++)
    {
        if (InSet(m_pchData[i], lpszCharSet))
            return i;
    }
    return -1;
}

/////////////////////////////////////////////////////////////////////////////
// Formatting

void CString::FormatV(LPCTSTR lpszFormat, va_list argList)
{
    if (lpszFormat == NULL)
    {
        Empty();
        return;
    }
    // The runtime's own printf (msvcrt), so %s means a wide string as on Windows.
    va_list argCount;
    va_copy(argCount, argList);
    int nLength = _vscwprintf(lpszFormat, argCount);
    va_end(argCount);
    if (nLength <= 0)
    {
        Empty();
        return;
    }
    CString result;
    result.AllocBuffer(nLength);
    va_list argWrite;
    va_copy(argWrite, argList);
    int nWritten = _vsnwprintf(result.m_pchData, (size_t)nLength + 1, lpszFormat, argWrite);
    va_end(argWrite);
    if (nWritten < 0 || nWritten > nLength)
        nWritten = 0;
    result.m_pchData[nWritten] = 0;
    result.GetData()->nDataLength = nWritten;
    if (nWritten == 0)
        result.Empty();
    *this = result;
}

void AFX_CDECL CString::Format(LPCTSTR lpszFormat, ...)
{
    va_list argList;
    va_start(argList, lpszFormat);
    FormatV(lpszFormat, argList);
    va_end(argList);
}

void AFX_CDECL CString::Format(UINT nFormatID, ...)
{
    CString strFormat;
    strFormat.LoadString(nFormatID);
    va_list argList;
    va_start(argList, nFormatID);
    FormatV(strFormat, argList);
    va_end(argList);
}

void AFX_CDECL CString::FormatMessage(LPCTSTR lpszFormat, ...)
{
    va_list argList;
    va_start(argList, lpszFormat);
    LPTSTR lpszTemp = NULL;
    DWORD n = ::FormatMessageW(FORMAT_MESSAGE_FROM_STRING | FORMAT_MESSAGE_ALLOCATE_BUFFER,
        lpszFormat, 0, 0, (LPTSTR)&lpszTemp, 0, &argList);
    va_end(argList);
    if (n == 0 || lpszTemp == NULL)
        AfxThrowMemoryException();
    *this = lpszTemp;
    ::LocalFree(lpszTemp);
}

void AFX_CDECL CString::FormatMessage(UINT nFormatID, ...)
{
    CString strFormat;
    strFormat.LoadString(nFormatID);
    va_list argList;
    va_start(argList, nFormatID);
    LPTSTR lpszTemp = NULL;
    DWORD n = ::FormatMessageW(FORMAT_MESSAGE_FROM_STRING | FORMAT_MESSAGE_ALLOCATE_BUFFER,
        (LPCTSTR)strFormat, 0, 0, (LPTSTR)&lpszTemp, 0, &argList);
    va_end(argList);
    if (n == 0 || lpszTemp == NULL)
        AfxThrowMemoryException();
    *this = lpszTemp;
    ::LocalFree(lpszTemp);
}

/////////////////////////////////////////////////////////////////////////////
// Resources

BOOL CString::LoadString(UINT nID)
{
    HINSTANCE hInst = AfxFindResourceHandle(MAKEINTRESOURCE((nID >> 4) + 1), RT_STRING);
    // With a zero buffer size the call returns a read-only pointer into the
    // resource, so strings of any length load without a fixed buffer.
    LPCWSTR pRes = NULL;
    int nLen = (hInst != NULL) ? ::LoadStringW(hInst, nID, (LPWSTR)&pRes, 0) : 0;
    if (nLen <= 0 || pRes == NULL)
    {
        Empty();
        return FALSE;
    }
    AssignCopy(nLen, pRes);
    return TRUE;
}

void AFXAPI AfxFormatString1(CString& rString, UINT nIDS, LPCTSTR lpsz1)
{
    AfxFormatString2(rString, nIDS, lpsz1, NULL);
}

void AFXAPI AfxFormatString2(CString& rString, UINT nIDS, LPCTSTR lpsz1, LPCTSTR lpsz2)
{
    CString strFormat;
    strFormat.LoadString(nIDS);
    // Replaces %1 and %2 in one pass, so that inserted text is never rescanned.
    CString strResult;
    int nLength = strFormat.GetLength();
    for (int i = 0; i < nLength; i++)
    {
        TCHAR ch = strFormat[i];
        if (ch == '%' && i + 1 < nLength && (strFormat[i + 1] == '1' || strFormat[i + 1] == '2'))
        {
            LPCTSTR lpszInsert = (strFormat[i + 1] == '1') ? lpsz1 : lpsz2;
            if (lpszInsert != NULL)
                strResult += lpszInsert;
            i++;
            continue;
        }
        strResult += ch;
    }
    rString = strResult;
}

/////////////////////////////////////////////////////////////////////////////
// OLE strings

BSTR CString::AllocSysString() const
{
    BSTR bstr = ::SysAllocStringLen(m_pchData, (UINT)GetData()->nDataLength);
    if (bstr == NULL)
        AfxThrowMemoryException();
    return bstr;
}

BSTR CString::SetSysString(BSTR* pbstr) const
{
    if (pbstr == NULL)
        return NULL;
    if (!::SysReAllocStringLen(pbstr, m_pchData, (UINT)GetData()->nDataLength))
        AfxThrowMemoryException();
    return *pbstr;
}

/////////////////////////////////////////////////////////////////////////////
// Raw buffer access

LPTSTR CString::GetBuffer(int nMinBufLength)
{
    if (nMinBufLength < 0)
        nMinBufLength = 0;
    CStringData* pData = GetData();
    if (pData->nRefs > 1 || nMinBufLength > pData->nAllocLength)
    {
        int nOldLen = pData->nDataLength;
        if (nMinBufLength < nOldLen)
            nMinBufLength = nOldLen;
        if (nMinBufLength == 0)
        {
            // Nothing to hold: the shared empty string, never written through.
            Release();
            return m_pchData;
        }
        AllocBuffer(nMinBufLength);
        memcpy(m_pchData, pData->data(), ((size_t)nOldLen + 1) * sizeof(TCHAR));
        GetData()->nDataLength = nOldLen;
        Release(pData);
    }
    return m_pchData;
}

void CString::ReleaseBuffer(int nNewLength)
{
    CopyBeforeWrite();
    if (GetData() == &g_nil.header)
        return;
    int nAlloc = GetData()->nAllocLength;
    if (nNewLength < 0)
        nNewLength = (int)wcsnlen(m_pchData, (size_t)nAlloc);
    if (nNewLength > nAlloc)
        nNewLength = nAlloc;
    GetData()->nDataLength = nNewLength;
    m_pchData[nNewLength] = 0;
}

LPTSTR CString::GetBufferSetLength(int nNewLength)
{
    if (nNewLength < 0)
        nNewLength = 0;
    GetBuffer(nNewLength);
    if (GetData() != &g_nil.header)
    {
        GetData()->nDataLength = nNewLength;
        m_pchData[nNewLength] = 0;
    }
    return m_pchData;
}

void CString::FreeExtra()
{
    CStringData* pData = GetData();
    if (pData->nDataLength != pData->nAllocLength && pData->nRefs >= 0)
    {
        CString copy(m_pchData, pData->nDataLength);
        *this = copy;
    }
}

LPTSTR CString::LockBuffer()
{
    LPTSTR lpsz = GetBuffer(0);
    if (GetData() != &g_nil.header)
        GetData()->nRefs = -1;
    return lpsz;
}

void CString::UnlockBuffer()
{
    if (GetData() != &g_nil.header && GetData()->nRefs < 0)
        GetData()->nRefs = 1;
}
