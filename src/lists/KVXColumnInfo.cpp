// KVXColumnInfo: the column record and its byte format.
#include "KVXColumnInfo.h"

#include <afxcoll.h>

namespace {

// One ANSI byte per character, so that a record is always title length + 18 bytes:
// a character the code page cannot hold (or a zero, which would end the title
// early) is stored as '?'.
BYTE AnsiByteOf(WCHAR ch)
{
    char buffer[4];
    BOOL bDefaultUsed = FALSE;
    const int n = ::WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, &ch, 1, buffer, sizeof buffer, NULL,
        &bDefaultUsed);
    if (n != 1 || bDefaultUsed || buffer[0] == 0)
        return '?';
    return static_cast<BYTE>(buffer[0]);
}

WCHAR CharOfAnsiByte(BYTE b)
{
    WCHAR ch = L'?';
    ::MultiByteToWideChar(CP_ACP, 0, reinterpret_cast<LPCSTR>(&b), 1, &ch, 1);
    return ch;
}

void WriteInt(CFile* pFile, int nValue)
{
    const BYTE bytes[4] = { static_cast<BYTE>(nValue), static_cast<BYTE>(nValue >> 8),
        static_cast<BYTE>(nValue >> 16), static_cast<BYTE>(nValue >> 24) };
    pFile->Write(bytes, sizeof bytes);
}

void ReadInt(CFile* pFile, int& nValue)
{
    BYTE bytes[4];
    if (pFile->Read(bytes, sizeof bytes) != sizeof bytes)
        return;
    nValue = static_cast<int>(static_cast<UINT>(bytes[0]) | static_cast<UINT>(bytes[1]) << 8
        | static_cast<UINT>(bytes[2]) << 16 | static_cast<UINT>(bytes[3]) << 24);
}

} // namespace

KVXColumnInfo::KVXColumnInfo()
    : m_nSortType(0), m_nFormat(0), m_nWidth(0), m_nSubItem(-1), m_nIndex(-1)
{
}

KVXColumnInfo::KVXColumnInfo(int nIndex, CString strTitle, int nSubItem, int nWidth, int nFormat)
    : m_nSortType(0), m_nFormat(nFormat), m_nWidth(nWidth), m_nSubItem(nSubItem), m_nIndex(nIndex),
      m_strTitle(strTitle)
{
}

KVXColumnInfo::~KVXColumnInfo()
{
}

KVXColumnInfo& KVXColumnInfo::operator=(const KVXColumnInfo& other)
{
    m_strTitle = other.m_strTitle;
    m_nIndex = other.m_nIndex;
    m_nSubItem = other.m_nSubItem;
    m_nWidth = other.m_nWidth;
    m_nFormat = other.m_nFormat;
    m_nSortType = other.m_nSortType;
    return *this;
}

void KVXColumnInfo::SetTitle(CString strTitle)
{
    m_strTitle = strTitle;
}

CString KVXColumnInfo::GetTitle() const
{
    return m_strTitle;
}

void KVXColumnInfo::SetIndex(int nIndex)
{
    m_nIndex = nIndex;
}

int KVXColumnInfo::GetIndex() const
{
    return m_nIndex;
}

void KVXColumnInfo::SetSubItem(int nSubItem)
{
    m_nSubItem = nSubItem;
}

int KVXColumnInfo::GetSubItem() const
{
    return m_nSubItem;
}

void KVXColumnInfo::SetWidth(int nWidth)
{
    m_nWidth = nWidth;
}

int KVXColumnInfo::GetWidth() const
{
    return m_nWidth;
}

void KVXColumnInfo::SetFormat(int nFormat)
{
    m_nFormat = nFormat;
}

int KVXColumnInfo::GetFormat() const
{
    return m_nFormat;
}

void KVXColumnInfo::SetSortType(unsigned char nSortType)
{
    m_nSortType = nSortType;
}

unsigned char KVXColumnInfo::GetSortType() const
{
    return m_nSortType;
}

void KVXColumnInfo::Write(CFile* pFile)
{
    const int nLength = m_strTitle.GetLength();
    CByteArray title;
    title.SetSize(nLength + 1);
    for (int i = 0; i < nLength; ++i)
        title[i] = AnsiByteOf(m_strTitle[i]);
    title[nLength] = 0;
    pFile->Write(title.GetData(), static_cast<UINT>(nLength + 1));

    WriteInt(pFile, m_nIndex);
    WriteInt(pFile, m_nSubItem);
    WriteInt(pFile, m_nWidth);
    WriteInt(pFile, m_nFormat);
    pFile->Write(&m_nSortType, 1);
}

void KVXColumnInfo::Read(CFile* pFile)
{
    BYTE b = 0;
    while (pFile->Read(&b, 1) == 1 && b != 0)
        m_strTitle += CharOfAnsiByte(b);

    ReadInt(pFile, m_nIndex);
    ReadInt(pFile, m_nSubItem);
    ReadInt(pFile, m_nWidth);
    ReadInt(pFile, m_nFormat);
    BYTE nSortType;
    if (pFile->Read(&nSortType, 1) == 1)
        m_nSortType = nSortType;
}
