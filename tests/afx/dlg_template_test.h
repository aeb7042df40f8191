// In-memory dialog templates for the dialog tests (DLGTEMPLATE with DS_SETFONT).
#pragma once

#include <windows.h>

#include <vector>

namespace afx_test {

class DialogTemplate
{
public:
    // Predefined control classes of a DLGITEMTEMPLATE
    enum ControlClass : WORD { Button = 0x0080, Edit = 0x0081, Static = 0x0082, ListBox = 0x0083 };

    DialogTemplate(DWORD style, short cx, short cy, const wchar_t* caption)
    {
        AppendDword(style | DS_SETFONT);
        AppendDword(0);             // extended style
        m_countIndex = m_words.size();
        m_words.push_back(0);       // control count
        m_words.push_back(0);       // x
        m_words.push_back(0);       // y
        m_words.push_back((WORD)cx);
        m_words.push_back((WORD)cy);
        m_words.push_back(0);       // no menu
        m_words.push_back(0);       // default class
        AppendString(caption);
        m_words.push_back(8);       // point size
        AppendString(L"MS Shell Dlg");
    }

    void AddControl(ControlClass cls, DWORD style, short x, short y, short cx, short cy, WORD id,
        const wchar_t* text)
    {
        Align();
        AppendDword(style | WS_CHILD | WS_VISIBLE);
        AppendDword(0);
        m_words.push_back((WORD)x);
        m_words.push_back((WORD)y);
        m_words.push_back((WORD)cx);
        m_words.push_back((WORD)cy);
        m_words.push_back(id);
        m_words.push_back(0xFFFF);
        m_words.push_back(cls);
        AppendString(text);
        m_words.push_back(0);       // no creation data
        ++m_words[m_countIndex];
    }

    LPCDLGTEMPLATE get() const { return reinterpret_cast<LPCDLGTEMPLATE>(m_words.data()); }

private:
    void AppendDword(DWORD value)
    {
        m_words.push_back(LOWORD(value));
        m_words.push_back(HIWORD(value));
    }
    void AppendString(const wchar_t* text)
    {
        for (; text != nullptr && *text != 0; ++text)
            m_words.push_back((WORD)*text);
        m_words.push_back(0);
    }
    void Align()
    {
        if (m_words.size() % 2 != 0)
            m_words.push_back(0);
    }

    std::vector<WORD> m_words;
    size_t m_countIndex = 0;
};

} // namespace afx_test
