// Shared set-up of the validated edit tests: modeless dialogs of the framework layer built
// from in-memory templates, a pump that runs the dialog manager like a host's message
// loop, and a recorder of the message boxes the edits show.
#pragma once

#include <afxwin.h>

#include "Input.h"
#include "OrvaneControls.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace edit_test {

// The library's strings (the messages) are found only after this.
inline void EnsureLibraryLoaded()
{
    static bool s_loaded = false;
    if (!s_loaded)
    {
        LoadOrvaneControlsLibrary();
        s_loaded = true;
    }
}

inline std::string Narrow(const std::wstring& text)
{
    std::string out;
    for (wchar_t c : text)
        out += (c < 0x80) ? static_cast<char>(c) : '?';
    return out;
}

inline std::wstring WindowText(HWND hwnd)
{
    if (hwnd == NULL)
        return std::wstring();
    const int length = ::GetWindowTextLengthW(hwnd);
    std::wstring text(static_cast<size_t>(length) + 1, L'\0');
    const int got = ::GetWindowTextW(hwnd, &text[0], length + 1);
    text.resize(got > 0 ? static_cast<size_t>(got) : 0);
    return text;
}

inline std::wstring LoadText(UINT id)
{
    CString text;
    text.LoadString(id);
    return std::wstring((LPCTSTR)text);
}

// Current selection of an edit as "start-end".
inline std::string Selection(HWND edit)
{
    DWORD start = 0;
    DWORD end = 0;
    ::SendMessageW(edit, EM_GETSEL, reinterpret_cast<WPARAM>(&start), reinterpret_cast<LPARAM>(&end));
    return std::to_string(start) + "-" + std::to_string(end);
}

// Builds a DLGTEMPLATE with its items in memory (class atoms: 0x80 button, 0x81 edit).
class DialogTemplate
{
public:
    enum : WORD { Button = 0x0080, Edit = 0x0081, Static = 0x0082 };

    DialogTemplate(const wchar_t* caption, short cx, short cy,
        DWORD style = WS_POPUP | WS_CAPTION | WS_VISIBLE | DS_SETFONT)
    {
        AddDword(style);
        AddDword(0);
        m_countIndex = m_words.size();
        m_words.push_back(0);   // number of items
        m_words.push_back(10);  // x
        m_words.push_back(10);  // y
        m_words.push_back(static_cast<WORD>(cx));
        m_words.push_back(static_cast<WORD>(cy));
        m_words.push_back(0);   // no menu
        m_words.push_back(0);   // default class
        AddString(caption);
        if (style & DS_SETFONT)
        {
            m_words.push_back(8);
            AddString(L"MS Sans Serif");
        }
    }

    void AddItem(WORD id, WORD classAtom, const wchar_t* text, short x, short y, short cx, short cy, DWORD style)
    {
        if (m_words.size() % 2 != 0)
            m_words.push_back(0);   // items start on a DWORD boundary
        AddDword(style | WS_CHILD | WS_VISIBLE);
        AddDword(0);
        m_words.push_back(static_cast<WORD>(x));
        m_words.push_back(static_cast<WORD>(y));
        m_words.push_back(static_cast<WORD>(cx));
        m_words.push_back(static_cast<WORD>(cy));
        m_words.push_back(id);
        m_words.push_back(0xFFFF);
        m_words.push_back(classAtom);
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
        for (const wchar_t* p = text; *p; ++p)
            m_words.push_back(static_cast<WORD>(*p));
        m_words.push_back(0);
    }

    std::vector<WORD> m_words;
    size_t m_countIndex = 0;
};

// Control ids of the standard test dialog.
enum : UINT
{
    kIdEdit1 = 1001,
    kIdEdit2 = 1002,
    kIdButton = 1003,
    kIdEdit3 = 1004,
};

// A modeless dialog with three plain edits (to be subclassed or left alone) and a button.
class TestDialog : public CDialog
{
public:
    bool Open(const wchar_t* caption = L"Edits")
    {
        DialogTemplate t(caption, 220, 100);
        t.AddItem(kIdEdit1, DialogTemplate::Edit, L"", 10, 10, 80, 12, WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL);
        t.AddItem(kIdEdit2, DialogTemplate::Edit, L"", 10, 30, 80, 12, WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL);
        t.AddItem(kIdButton, DialogTemplate::Button, L"Other", 120, 10, 50, 14, WS_TABSTOP | BS_PUSHBUTTON);
        t.AddItem(kIdEdit3, DialogTemplate::Edit, L"", 10, 50, 80, 12, WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL);
        return CreateIndirect(t.Get(), NULL) != FALSE;
    }

    HWND Item(UINT id) const { return ::GetDlgItem(m_hWnd, id); }

    // EN_CHANGE notifications that reached the dialog's own command handling, by control id.
    std::vector<UINT> changes;

    virtual BOOL OnCmdMsg(UINT nID, int nCode, void* pExtra, AFX_CMDHANDLERINFO* pHandlerInfo)
    {
        if (pHandlerInfo == NULL && nCode == EN_CHANGE)
            changes.push_back(nID);
        return CDialog::OnCmdMsg(nID, nCode, pExtra, pHandlerInfo);
    }

    virtual ~TestDialog()
    {
        if (::IsWindow(m_hWnd))
            DestroyWindow();
    }

protected:
    // Enter and Escape must not end a modeless test dialog.
    virtual void OnOK() {}
    virtual void OnCancel() {}
};

// Runs the queue the way a host's loop with a modeless dialog does: the dialog manager
// sees keyboard messages first (Tab moves the focus). Bounded.
inline int PumpDialog(HWND dialog, DWORD maxMs = 150)
{
    const DWORD start = ::GetTickCount();
    int dispatched = 0;
    MSG msg;
    while (::GetTickCount() - start < maxMs)
    {
        if (!::PeekMessageW(&msg, NULL, 0, 0, PM_REMOVE))
        {
            ::Sleep(1);
            if (!::PeekMessageW(&msg, NULL, 0, 0, PM_REMOVE))
                break;
        }
        ++dispatched;
        if (dialog != NULL && ::IsWindow(dialog) && ::IsDialogMessageW(dialog, &msg))
            continue;
        ::TranslateMessage(&msg);
        ::DispatchMessageW(&msg);
    }
    return dispatched;
}

// Posts a key press the way the keyboard delivers it: through the queue, where the
// edits' message hook sees it.
inline void PostKey(HWND hwnd, UINT vk, bool alt = false)
{
    const UINT scan = ::MapVirtualKeyW(vk, MAPVK_VK_TO_VSC);
    const UINT down = alt ? WM_SYSKEYDOWN : WM_KEYDOWN;
    const UINT up = alt ? WM_SYSKEYUP : WM_KEYUP;
    const LPARAM context = alt ? (1 << 29) : 0;
    ::PostMessageW(hwnd, down, vk, 1 | (scan << 16) | context);
    ::PostMessageW(hwnd, up, vk, 1 | (scan << 16) | context | 0xC0000000);
}

// Answers every message box with OK and keeps its text; dialogs without the message
// box's text static (the test dialogs themselves) are left alone.
class BoxRecorder
{
public:
    BoxRecorder()
        : m_answerer([this](const orvane_test::DialogAnswerer::Seen& seen) {
              if (::GetDlgItem(seen.hwnd, 0xFFFF) == NULL)
                  return 0;
              m_texts.push_back(seen.text);
              return static_cast<int>(IDOK);
          })
    {
    }

    int count() const { return static_cast<int>(m_texts.size()); }
    std::string last() const { return m_texts.empty() ? std::string("<no box>") : Narrow(m_texts.back()); }
    const std::vector<std::wstring>& texts() const { return m_texts; }
    void clear() { m_texts.clear(); }

private:
    std::vector<std::wstring> m_texts;
    orvane_test::DialogAnswerer m_answerer;
};

} // namespace edit_test
