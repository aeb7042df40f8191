// Test harness of the buttons family: a framework parent window that reflects control
// notifications (as a host's dialog does), a recorder of the colour well's message, and
// a driver that runs scripted steps while a modal popup is up.
#pragma once

#include <afxwin.h>

#include <functional>
#include <string>
#include <vector>

#include "KVXColorWell.h"

namespace buttons_test {

// Loads the library's resources into the chain once per process.
void EnsureLibraryLoaded();

// A visible top-level framework window at a given screen place; being a CWnd, it
// reflects WM_COMMAND and WM_DRAWITEM to the controls' own objects.
class TestParent : public CWnd
{
public:
    TestParent(int x = 100, int y = 100, int width = 400, int height = 300);
    virtual ~TestParent();
    // Moves the window so that its client area's top-left corner is at (x, y) on screen.
    void MoveClientTo(int x, int y);
};

// Copies every colour-well message reaching a window, while it is being sent.
class ColorNotifyRecorder
{
public:
    struct Record
    {
        WPARAM wParam;
        HWND hwndFrom;
        UINT_PTR idFrom;
        UINT code;
        COLORREF clrColor;
    };

    explicit ColorNotifyRecorder(HWND hParent);
    ~ColorNotifyRecorder();
    const std::vector<Record>& records() const { return m_records; }
    int count() const { return static_cast<int>(m_records.size()); }

private:
    static LRESULT CALLBACK Proc(HWND, UINT, WPARAM, LPARAM, UINT_PTR, DWORD_PTR);
    HWND m_hParent;
    std::vector<Record> m_records;
};

// Runs steps, one per timer tick (the modal loops of this thread dispatch the timer),
// against the active window while it is a dialog (#32770). A step returns false to be
// retried at the next tick (e.g. while waiting for a nested dialog). Actions that open
// nested modal loops must be posted, not sent. When the steps are not done within the
// time limit, every dialog of the thread is cancelled so the test cannot hang.
class ModalScript
{
public:
    using Step = std::function<bool(HWND hDialog)>;

    explicit ModalScript(std::vector<Step> steps, DWORD timeLimitMs = 5000);
    ~ModalScript();
    bool finished() const { return m_next >= m_steps.size(); }
    bool timedOut() const { return m_timedOut; }
    size_t stepsDone() const { return m_next; }

private:
    static void CALLBACK TimerProc(HWND, UINT, UINT_PTR, DWORD);
    void Tick();

    std::vector<Step> m_steps;
    size_t m_next = 0;
    UINT_PTR m_timer = 0;
    DWORD m_start = 0;
    DWORD m_limit = 0;
    bool m_busy = false;
    bool m_timedOut = false;
};

// The well's popup while it is up: the active dialog of this thread.
HWND ActiveDialog();
std::wstring WindowClass(HWND hwnd);

} // namespace buttons_test
