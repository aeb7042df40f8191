// Shared set-up of the edits family: a modeless framework dialog (a host's page) built
// from an in-memory template, a recorder of the message boxes the edits show, and test
// subclasses of the numeric edits that reach the protected operations the spin calls and
// log the value operations the spin's calls end in.
#pragma once

#include <afxwin.h>

#include "DialogTemplate.h"
#include "Input.h"
#include "KVXDoubleEdit.h"
#include "KVXLongEdit.h"
#include "KVXSpin.h"
#include "OrvaneLibrary.h"
#include "SpinGeometry.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace edit_test {

using orvane_test::PumpDialog;
using orvane_test::WindowText;

inline std::string Narrow(const std::wstring& text)
{
    std::string out;
    for (wchar_t c : text)
        out += (c < 0x80) ? static_cast<char>(c) : '?';
    return out;
}

inline std::string LoadText(UINT id)
{
    CString text;
    text.LoadString(id);
    return Narrow(static_cast<LPCTSTR>(text));
}

// Current selection of an edit as "start-end".
inline std::string Selection(HWND edit)
{
    DWORD start = 0, end = 0;
    ::SendMessageW(edit, EM_GETSEL, reinterpret_cast<WPARAM>(&start), reinterpret_cast<LPARAM>(&end));
    return std::to_string(start) + "-" + std::to_string(end);
}

enum : UINT { kIdEdit1 = 1001, kIdEdit2 = 1002, kIdButton = 1003, kIdEdit3 = 1004 };

// A modeless dialog with three plain edits (to be subclassed or left alone) and a button.
class TestDialog : public CDialog
{
public:
    bool Open(const wchar_t* caption = L"Edits")
    {
        using orvane_test::DialogTemplate;
        DialogTemplate t(caption, 220, 100);
        const DWORD style = WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL;
        t.AddItem(kIdEdit1, DialogTemplate::Edit, L"", 10, 10, 80, 12, style);
        t.AddItem(kIdEdit2, DialogTemplate::Edit, L"", 10, 30, 80, 12, style);
        t.AddItem(kIdButton, DialogTemplate::Button, L"Other", 120, 10, 50, 14, WS_TABSTOP | BS_PUSHBUTTON);
        t.AddItem(kIdEdit3, DialogTemplate::Edit, L"", 10, 50, 80, 12, style);
        return CreateIndirect(t.Get(), NULL) != FALSE;
    }
    HWND Item(UINT id) const { return ::GetDlgItem(m_hWnd, id); }

    // EN_CHANGE notifications that reached the dialog's own command handling, by control id.
    std::vector<UINT> changes;
    BOOL OnCmdMsg(UINT nID, int nCode, void* pExtra, AFX_CMDHANDLERINFO* pHandlerInfo) override
    {
        if (pHandlerInfo == NULL && nCode == EN_CHANGE)
            changes.push_back(nID);
        return CDialog::OnCmdMsg(nID, nCode, pExtra, pHandlerInfo);
    }
    ~TestDialog() override
    {
        if (::IsWindow(m_hWnd))
            DestroyWindow();
    }

protected:
    // Enter and Escape must not end a modeless test dialog.
    void OnOK() override {}
    void OnCancel() override {}
};

// Keeps the text and window of every message box and answers it with OK while `answer`
// is set; dialogs without the message box's text static (the test dialogs themselves) are
// left alone.
class BoxRecorder
{
public:
    BoxRecorder()
        : m_answerer([this](const orvane_test::DialogAnswerer::Seen& seen) {
              if (::GetDlgItem(seen.hwnd, 0xFFFF) == NULL)
                  return 0;
              m_texts.push_back(Narrow(seen.text));
              hwnds.push_back(seen.hwnd);
              return answer ? static_cast<int>(IDOK) : 0;
          })
    {
    }
    int count() const { return static_cast<int>(m_texts.size()); }
    std::string last() const { return m_texts.empty() ? std::string("<no box>") : m_texts.back(); }

    bool answer = true;
    std::vector<HWND> hwnds;

private:
    std::vector<std::string> m_texts;
    orvane_test::DialogAnswerer m_answerer;
};

// "mid(1)" for SetMiddleVal(TRUE), "inc(3)=103" for IncreaseValue(3) that showed "103".
template <class Base>
class NumericProbe : public Base
{
public:
    using Base::Base;

    void SpinUp() { this->OnSpinUpButton(); }
    void SpinDown() { this->OnSpinDownButton(); }
    void TwoSeconds() { this->OnSpinTimerTwoSecs(); }
    void FiveSeconds() { this->OnSpinTimerFiveSecs(); }
    void Released() { this->OnSpinTimerKill(); }
    void SliderSet(int pressed) { this->OnSliderSet(pressed); }
    void SliderMove(long distance) { this->OnSliderMove(distance); }

    KVXSpin* Spin() const { return this->m_pSpin; }
    HWND SpinHwnd() const { return this->GetSpinHwnd(); }
    int Offset() const { return this->m_nSpinOffset; }
    int StepFactor() const { return this->m_nSpinStep; }
    std::string Message() const { return Narrow(static_cast<LPCTSTR>(this->m_strErrorMessage)); }
    int ErrorPos() const { return this->m_nErrorPos; }
    std::string Text() const { return Narrow(WindowText(this->m_hWnd)); }

    std::vector<std::string> calls;
    std::vector<std::string> shown;

protected:
    void SetMiddleVal(int bDetermineStep) override
    {
        calls.push_back("mid(" + std::to_string(bDetermineStep) + ")");
        Base::SetMiddleVal(bDetermineStep);
    }
    int IncreaseValue(long lOffset) override { return Record("inc", lOffset, Base::IncreaseValue(lOffset)); }
    int DecreaseValue(long lOffset) override { return Record("dec", lOffset, Base::DecreaseValue(lOffset)); }

private:
    int Record(const char* op, long lOffset, int result)
    {
        shown.push_back(Text());
        calls.push_back(std::string(op) + "(" + std::to_string(lOffset) + ")=" + Text());
        return result;
    }
};

class LongProbe : public NumericProbe<KVXLongEdit>
{
public:
    using NumericProbe<KVXLongEdit>::NumericProbe;
    long CurrentLong() const { return AsLong(m_varValue); }
    long CommittedLong() const { return AsLong(m_varCommitted); }
    long Middle() const { return m_lMiddleVal; }
    static long AsLong(const KVXVariant& v)
    {
        long value = -999999;
        v.GetAs(value, 1);
        return value;
    }
};

class DoubleProbe : public NumericProbe<KVXDoubleEdit>
{
public:
    double CurrentDouble() const { return AsDouble(m_varValue); }
    double CommittedDouble() const { return AsDouble(m_varCommitted); }
    double Middle() const { return m_dMiddleVal; }
    static double AsDouble(const KVXVariant& v)
    {
        double value = -999999.0;
        v.GetAs(value);
        return value;
    }
};

// Spin windows among the children of a parent.
inline int CountSpins(HWND parent)
{
    int count = 0;
    for (HWND child = ::GetWindow(parent, GW_CHILD); child != NULL; child = ::GetWindow(child, GW_HWNDNEXT))
        count += dynamic_cast<KVXSpin*>(CWnd::FromHandlePermanent(child)) != nullptr ? 1 : 0;
    return count;
}

inline std::string RectText(const RECT& r)
{
    return "(" + std::to_string(r.left) + "," + std::to_string(r.top) + "," + std::to_string(r.right) + ","
        + std::to_string(r.bottom) + ")";
}

// A window's rectangle in its parent's client coordinates.
inline RECT RectInParent(HWND hwnd)
{
    RECT r = {};
    ::GetWindowRect(hwnd, &r);
    ::MapWindowPoints(NULL, ::GetParent(hwnd), reinterpret_cast<POINT*>(&r), 2);
    return r;
}

// A page with the library loaded; edits are created with Create at a rectangle of it.
class PageFixture : public testing::Test
{
protected:
    static void SetUpTestSuite() { orvane_test::LoadLibraryOnce(); }
    void SetUp() override { ASSERT_TRUE(dlg.Open()); }
    void TearDown() override
    {
        if (::GetCapture() != NULL)
            ::ReleaseCapture();
        if (::IsWindow(dlg.m_hWnd))
            dlg.DestroyWindow();
        orvane_test::PumpUntilIdle(50);
    }

    template <class Edit>
    void CreateIn(Edit& edit, const RECT& rect, UINT id = 2001)
    {
        ASSERT_TRUE(edit.Create(WS_CHILD | WS_VISIBLE | WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL, rect, &dlg, id));
    }
    template <class Edit>
    void Type(Edit& edit, const wchar_t* text)
    {
        edit.SetSel(0, -1);
        orvane_test::SendChars(edit, text);
    }

    TestDialog dlg;
};

} // namespace edit_test
