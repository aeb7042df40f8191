// In-memory dialog templates (DLGTEMPLATE with DS_SETFONT and its items) for dialogs
// created with CreateIndirect or InitModalIndirect.
#pragma once

#include <windows.h>

#include <vector>

namespace orvane_test {

class DialogTemplate
{
public:
    // Class atoms of the predefined controls.
    enum : WORD { Button = 0x0080, Edit = 0x0081, Static = 0x0082, ListBox = 0x0083 };

    DialogTemplate(const wchar_t* caption, short cx, short cy,
                   DWORD style = WS_POPUP | WS_CAPTION | WS_VISIBLE)
    {
        AddDword(style | DS_SETFONT);
        AddDword(0);
        m_countIndex = m_words.size();
        m_words.insert(m_words.end(), { 0, 10, 10, static_cast<WORD>(cx), static_cast<WORD>(cy), 0, 0 });
        AddString(caption);
        m_words.push_back(8);
        AddString(L"MS Shell Dlg");
    }

    void AddItem(WORD id, WORD classAtom, const wchar_t* text, short x, short y, short cx, short cy, DWORD style)
    {
        if (m_words.size() % 2 != 0)
            m_words.push_back(0);   // items start on a DWORD boundary
        AddDword(style | WS_CHILD | WS_VISIBLE);
        AddDword(0);
        m_words.insert(m_words.end(), { static_cast<WORD>(x), static_cast<WORD>(y), static_cast<WORD>(cx),
                                        static_cast<WORD>(cy), id, 0xFFFF, classAtom });
        AddString(text);
        m_words.push_back(0);       // no creation data
        ++m_words[m_countIndex];
    }

    LPCDLGTEMPLATE Get() const { return reinterpret_cast<LPCDLGTEMPLATE>(m_words.data()); }

private:
    void AddDword(DWORD value)
    {
        m_words.push_back(LOWORD(value));
        m_words.push_back(HIWORD(value));
    }
    void AddString(const wchar_t* text)
    {
        for (; text && *text; ++text)
            m_words.push_back(static_cast<WORD>(*text));
        m_words.push_back(0);
    }

    std::vector<WORD> m_words;
    size_t m_countIndex = 0;
};

} // namespace orvane_test
