// Test subclasses of the numeric edits: they reach the protected spin operations the
// spin itself calls, and read the state the tests check.
#pragma once

#include "edit_harness.h"

#include "KVXDoubleEdit.h"
#include "KVXLongEdit.h"
#include "KVXSpin.h"

namespace edit_test {

template <class Base>
class NumericProbe : public Base
{
public:
    using Base::Base;

    // What the spin calls.
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
    std::string Message() const { return Narrow((LPCTSTR)this->m_strErrorMessage); }
    std::wstring WideMessage() const { return std::wstring((LPCTSTR)this->m_strErrorMessage); }
    int ErrorPos() const { return this->m_nErrorPos; }
    std::string Text() const { return Narrow(WindowText(this->m_hWnd)); }
    const KVXVariant& Current() const { return this->m_varValue; }
    const KVXVariant& CommittedValue() const { return this->m_varCommitted; }
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
    {
        if (dynamic_cast<KVXSpin*>(CWnd::FromHandlePermanent(child)) != nullptr)
            ++count;
    }
    return count;
}

// A window's rectangle in its parent's client coordinates.
inline RECT RectInParent(HWND hwnd)
{
    RECT r = {};
    ::GetWindowRect(hwnd, &r);
    ::MapWindowPoints(NULL, ::GetParent(hwnd), reinterpret_cast<POINT*>(&r), 2);
    return r;
}

inline std::string RectText(const RECT& r)
{
    return "(" + std::to_string(r.left) + "," + std::to_string(r.top) + "," + std::to_string(r.right) + ","
        + std::to_string(r.bottom) + ")";
}

// Fixture base: a modeless dialog whose page runs error handling, as a host page does.
class NumericFixture : public testing::Test
{
protected:
    static void SetUpTestSuite() { EnsureLibraryLoaded(); }

    void SetUp() override { ASSERT_TRUE(dlg.Open()); }

    void TearDown() override
    {
        if (::IsWindow(dlg.m_hWnd))
            dlg.DestroyWindow();
        PumpDialog(NULL);
    }

    // Creates a numeric edit with Create at a rectangle of the dialog's client area.
    template <class Edit>
    void CreateIn(Edit& edit, const RECT& rect, UINT id = 2001)
    {
        ASSERT_TRUE(edit.Create(WS_CHILD | WS_VISIBLE | WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL, rect, &dlg, id));
    }

    TestDialog dlg;
};

} // namespace edit_test
