#include "KVXStringEdit.h"

#include "StringEscapes.h"

#include <string>

namespace {

std::wstring ToStd(const CString& str)
{
    return std::wstring(static_cast<LPCTSTR>(str), static_cast<size_t>(str.GetLength()));
}

KVXString FromStd(const std::wstring& str)
{
    return KVXString(str.c_str(), static_cast<int>(str.size()));
}

// Text of the clipboard: Unicode when offered (the system converts CF_TEXT to it), so
// that characters outside the ANSI code page survive; CF_TEXT read with that code page
// otherwise. The data is read within its global block, terminated or not.
bool ReadClipboardText(std::wstring& text, HANDLE& hLocked)
{
    HANDLE hData = ::GetClipboardData(CF_UNICODETEXT);
    if (hData != NULL)
    {
        const WCHAR* p = static_cast<const WCHAR*>(::GlobalLock(hData));
        if (p == NULL)
            return false;
        hLocked = hData;
        const size_t nMax = ::GlobalSize(hData) / sizeof(WCHAR);
        size_t n = 0;
        while (n < nMax && p[n] != L'\0')
            ++n;
        text.assign(p, n);
        return true;
    }
    hData = ::GetClipboardData(CF_TEXT);
    if (hData == NULL)
        return false;
    const char* p = static_cast<const char*>(::GlobalLock(hData));
    if (p == NULL)
        return false;
    hLocked = hData;
    const size_t nMax = ::GlobalSize(hData);
    size_t n = 0;
    while (n < nMax && p[n] != '\0')
        ++n;
    text.clear();
    if (n > 0)
    {
        const int nWide = ::MultiByteToWideChar(CP_ACP, 0, p, static_cast<int>(n), NULL, 0);
        if (nWide > 0)
        {
            text.resize(static_cast<size_t>(nWide));
            ::MultiByteToWideChar(CP_ACP, 0, p, static_cast<int>(n), &text[0], nWide);
        }
    }
    return true;
}

} // namespace

BEGIN_MESSAGE_MAP(KVXStringEdit, KVXEdit)
    ON_MESSAGE(WM_PASTE, &KVXStringEdit::OnPaste)
END_MESSAGE_MAP()

KVXStringEdit::KVXStringEdit(int bReplaceSpecialChars, int bAcceptSingleBackslash)
    : m_nCharacterCount(255),
      m_bReplaceSpecialChars(bReplaceSpecialChars),
      m_bAcceptSingleBackslash(bAcceptSingleBackslash)
{
}

KVXStringEdit::~KVXStringEdit()
{
}

void KVXStringEdit::SetCharacterCount(int nCharacterCount)
{
    m_nCharacterCount = nCharacterCount;
}

int KVXStringEdit::GetCharacterCount()
{
    return m_nCharacterCount;
}

void KVXStringEdit::SetReplaceSpecialChars(int bReplaceSpecialChars)
{
    m_bReplaceSpecialChars = bReplaceSpecialChars;
}

void KVXStringEdit::SetAcceptSingleBackslash(int bAcceptSingleBackslash)
{
    m_bAcceptSingleBackslash = bAcceptSingleBackslash;
}

KVXString KVXStringEdit::GetValue(int bCommit)
{
    KVXString strValue;
    m_varValue.GetAs(strValue);
    if (bCommit)
        m_varCommitted = m_varValue;
    if (m_bReplaceSpecialChars)
        ReplaceSpecialCharacters(strValue);
    return strValue;
}

int KVXStringEdit::SetValue(KVXString strValue, int bCommit)
{
    if (!m_bAcceptSingleBackslash)
        GetStrWithoutBackslash(strValue);
    const int nLength = strValue.GetLength();
    if (nLength > m_nCharacterCount)
        strValue = KVXString(strValue.Left(m_nCharacterCount > 0 ? m_nCharacterCount : 0));

    m_varValue = strValue;
    const BOOL bWindow = ::IsWindow(GetSafeHwnd());
    if (bWindow)
        SetWindowText(strValue);
    if (bCommit)
        m_varCommitted = m_varValue;
    if (bWindow)
    {
        // Selects the last character; positions beyond a shortened text land at its end.
        SendMessage(EM_SETSEL, static_cast<WPARAM>(nLength - 1), static_cast<LPARAM>(nLength));
        SendMessage(EM_SCROLLCARET, 0, 0);
    }
    return TRUE;
}

int KVXStringEdit::SetValueAsVariant(KVXVariant varValue, int bCommit)
{
    if (varValue.GetType() != VT_BSTR)
        return FALSE;
    KVXString strValue;
    varValue.GetAs(strValue);
    return SetValue(strValue, bCommit);
}

int KVXStringEdit::SyntaxCheck(int bShow)
{
    return KVXEdit::SyntaxCheck(bShow);
}

int KVXStringEdit::SyntaxCheck(KVXString strText)
{
    m_varValue = strText;
    return TRUE;
}

int KVXStringEdit::CharCheck(WCHAR c)
{
    if (c < 0x20)
        return TRUE;

    CString strText;
    GetWindowText(strText);
    DWORD dwStart = 0;
    DWORD dwEnd = 0;
    SendMessage(EM_GETSEL, reinterpret_cast<WPARAM>(&dwStart), reinterpret_cast<LPARAM>(&dwEnd));
    std::wstring prospective = StringEscapes::ProspectiveTypedText(ToStd(strText), static_cast<int>(dwStart), c);
    // Backslashes that will be dropped do not count.
    if (!m_bAcceptSingleBackslash)
        prospective = StringEscapes::RemoveStrayBackslashes(prospective);
    if (static_cast<long long>(prospective.size()) > m_nCharacterCount)
    {
        ::MessageBeep(0xFFFFFFFF);
        return FALSE;
    }
    return TRUE;
}

void KVXStringEdit::ReplaceSpecialCharacters(KVXString& str)
{
    str = FromStd(StringEscapes::ReplaceSpecialCharacters(ToStd(str), m_bAcceptSingleBackslash != FALSE));
}

void KVXStringEdit::GetStrWithoutBackslash(KVXString& str)
{
    str = FromStd(StringEscapes::RemoveStrayBackslashes(ToStd(str)));
}

LRESULT KVXStringEdit::OnPaste(WPARAM wParam, LPARAM lParam)
{
    // The edit control ignores a paste into a read-only field; so does this one.
    if (GetStyle() & ES_READONLY)
        return 0;

    DWORD dwStart = 0;
    DWORD dwEnd = 0;
    SendMessage(EM_GETSEL, reinterpret_cast<WPARAM>(&dwStart), reinterpret_cast<LPARAM>(&dwEnd));
    CString strText;
    GetWindowText(strText);
    const std::wstring text = ToStd(strText);

    // A full field (without the selection) takes nothing; the clipboard is not opened.
    StringEscapes::PasteResult probe;
    if (!StringEscapes::ComposePaste(text, static_cast<int>(dwStart), static_cast<int>(dwEnd), std::wstring(),
                                     m_nCharacterCount, probe))
        return 0;

    if (!::OpenClipboard(m_hWnd))
        return 0;
    std::wstring clip;
    HANDLE hLocked = NULL;
    if (ReadClipboardText(clip, hLocked))
    {
        StringEscapes::PasteResult result;
        if (StringEscapes::ComposePaste(text, static_cast<int>(dwStart), static_cast<int>(dwEnd), clip,
                                        m_nCharacterCount, result))
        {
            SetWindowText(FromStd(result.text));
            SendMessage(EM_SETSEL, static_cast<WPARAM>(result.caret), static_cast<LPARAM>(result.caret));
            SendMessage(EM_SCROLLCARET, 0, 0);
        }
    }
    if (hLocked != NULL)
        ::GlobalUnlock(hLocked);
    ::CloseClipboard();
    return 0;
}
