// Shared set-up of the spin tests: a real integer edit in a visible host window, with
// the spin it creates, recording what the spin makes it do.
#pragma once

#include <afxwin.h>

#include "Input.h"
#include "KVXLongEdit.h"
#include "KVXSpin.h"
#include "OrvaneControls.h"
#include "SpinGeometry.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace spin_test {

// The integer edit as buddy, logging the value operations the spin's calls end in:
// "mid(1)" for SetMiddleVal(TRUE), "inc(3)=103" for IncreaseValue(3) that showed
// "103", "dec(-16)=84" likewise. The texts shown are kept separately as well.
class RecordingLongEdit : public KVXLongEdit
{
public:
    std::vector<std::string> calls;
    std::vector<std::string> shown;

    KVXSpin* Spin() const { return m_pSpin; }
    HWND SpinHwnd() const { return m_pSpin != NULL ? m_pSpin->GetSafeHwnd() : NULL; }
    int SpinStep() const { return m_nSpinStep; }
    void SetSpinStep(int nStep) { m_nSpinStep = nStep; }
    void Clear()
    {
        calls.clear();
        shown.clear();
    }

protected:
    void SetMiddleVal(int bDetermineStep) override
    {
        calls.push_back("mid(" + std::to_string(bDetermineStep) + ")");
        KVXLongEdit::SetMiddleVal(bDetermineStep);
    }
    int IncreaseValue(long lOffset) override
    {
        const int result = KVXLongEdit::IncreaseValue(lOffset);
        Record("inc", lOffset);
        return result;
    }
    int DecreaseValue(long lOffset) override
    {
        const int result = KVXLongEdit::DecreaseValue(lOffset);
        Record("dec", lOffset);
        return result;
    }

private:
    void Record(const char* op, long lOffset)
    {
        const std::string text = Text();
        shown.push_back(text);
        calls.push_back(std::string(op) + "(" + std::to_string(lOffset) + ")=" + text);
    }
    std::string Text() const
    {
        wchar_t buffer[64] = {};
        ::GetWindowTextW(m_hWnd, buffer, 64);
        std::string narrow;
        for (const wchar_t* p = buffer; *p; ++p)
            narrow += static_cast<char>(*p);
        return narrow;
    }
};

inline void LoadLibraryResourcesOnce()
{
    static bool loaded = false;
    if (!loaded)
    {
        LoadOrvaneControlsLibrary();
        loaded = true;
    }
}

inline void Send(HWND hwnd, UINT message, WPARAM wParam, int x, int y)
{
    ::SendMessageW(hwnd, message, wParam, orvane_test::PointParam(x, y));
}

// An integer edit at (10, 20, 110, 41) showing 100, with its spin.
class SpinFixture : public ::testing::Test
{
protected:
    static void SetUpTestSuite() { LoadLibraryResourcesOnce(); }

    void SetUp() override
    {
        host.reset(new orvane_test::HostWindow(320, 200));
        // The parent must be a framework window: it reflects EN_CHANGE back to the edit,
        // which is how the edit tells its own spin steps from typed changes.
        ASSERT_TRUE(hostWnd.SubclassWindow(host->hwnd()));
        edit.reset(new RecordingLongEdit);
        ASSERT_TRUE(edit->Create(WS_CHILD | WS_VISIBLE | WS_BORDER, CRect(10, 20, 110, 41), &hostWnd, 100));
        hSpin = edit->SpinHwnd();
        ASSERT_TRUE(::IsWindow(hSpin));
        edit->SetValue(100, TRUE);
        RECT rc;
        ::GetClientRect(hSpin, &rc);
        cx = rc.right;
        cy = rc.bottom;
        orvane_test::PumpUntilIdle(50);
        edit->Clear();
    }

    void TearDown() override
    {
        if (::IsWindow(hSpin))
            ::SendMessageW(hSpin, WM_LBUTTONUP, 0, 0);
        if (::GetCapture() != NULL)
            ::ReleaseCapture();
        if (edit && ::IsWindow(edit->GetSafeHwnd()))
            edit->DestroyWindow();
        edit.reset();
        if (hostWnd.GetSafeHwnd() != NULL)
            hostWnd.UnsubclassWindow();
        host.reset();
        orvane_test::PumpUntilIdle(50);
    }

    // A point in the middle column of an area of the spin.
    POINT In(SpinGeometry::SpinArea area) const
    {
        RECT r = area == SpinGeometry::SpinArea::Up     ? SpinGeometry::UpHitRect(cx, cy)
                 : area == SpinGeometry::SpinArea::Band ? SpinGeometry::SliderBandRect(cx, cy)
                                                        : SpinGeometry::DownHitRect(cx, cy);
        return POINT{ cx / 2, (r.top + r.bottom) / 2 };
    }

    void Press(SpinGeometry::SpinArea area, UINT message = WM_LBUTTONDOWN)
    {
        const POINT pt = In(area);
        Send(hSpin, message, MK_LBUTTON, pt.x, pt.y);
    }
    void Release(SpinGeometry::SpinArea area) { Send(hSpin, WM_LBUTTONUP, 0, In(area).x, In(area).y); }
    void Ticks(int n)
    {
        for (int i = 0; i < n; ++i)
            ::SendMessageW(hSpin, WM_TIMER, SpinGeometry::kTimerId, 0);
    }
    bool Captured() const { return ::GetCapture() == hSpin; }
    // Whether a release the spin posted to itself is waiting in the queue.
    bool ReleaseQueued() const
    {
        MSG msg;
        return ::PeekMessageW(&msg, hSpin, WM_LBUTTONUP, WM_LBUTTONUP, PM_NOREMOVE) != FALSE && msg.wParam == 0 &&
               msg.lParam == 0;
    }

    std::unique_ptr<orvane_test::HostWindow> host;
    CWnd hostWnd;
    std::unique_ptr<RecordingLongEdit> edit;
    HWND hSpin = NULL;
    int cx = 0;
    int cy = 0;
};

// Strings "a", "b" ... from a list, for readable sequence comparisons.
inline std::vector<std::string> Values(long first, long step, int count)
{
    std::vector<std::string> v;
    for (int i = 0; i < count; ++i)
        v.push_back(std::to_string(first + step * i));
    return v;
}

inline std::vector<std::string> Concat(std::initializer_list<std::vector<std::string>> parts)
{
    std::vector<std::string> all;
    for (const auto& p : parts)
        all.insert(all.end(), p.begin(), p.end());
    return all;
}

} // namespace spin_test
