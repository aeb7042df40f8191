// Input without a user: pumping with bounds, modifier keys, mouse messages in client
// coordinates, and answering message boxes and modal dialogs from a hook.
#pragma once

#include <windows.h>

#include <functional>
#include <string>
#include <vector>

namespace orvane_test {

// Dispatches everything queued for this thread until the queue stays empty, at most
// maxMs milliseconds. Returns the number of messages dispatched.
int PumpUntilIdle(DWORD maxMs = 200);
// The same, run the way a host's loop with a modeless dialog runs it: the dialog manager
// sees each message first (Tab and Return move the focus or press buttons).
int PumpDialog(HWND dialog, DWORD maxMs = 200);

// Pumps until pred() holds or timeoutMs elapses; returns pred().
bool WaitFor(const std::function<bool()>& pred, DWORD timeoutMs = 2000);

// Sets the thread's key state for the given virtual keys (VK_CONTROL, VK_SHIFT, VK_MENU
// also set their left-hand variants) and restores the previous state on destruction.
class KeyStateGuard
{
public:
    KeyStateGuard(std::initializer_list<int> keysDown);
    ~KeyStateGuard();
    KeyStateGuard(const KeyStateGuard&) = delete;
    KeyStateGuard& operator=(const KeyStateGuard&) = delete;

private:
    BYTE m_saved[256];
};

LPARAM PointParam(int x, int y);
// Sends WM_KEYDOWN then WM_KEYUP with a plausible lParam.
void SendKey(HWND hwnd, UINT vk);
// Sends one WM_CHAR per character.
void SendChars(HWND hwnd, const std::wstring& text);
// Sends the button-down and button-up of a left click at client point (x, y).
void SendClick(HWND hwnd, int x, int y, WPARAM keys = 0);
// Posts a key press through the queue (where message hooks see it), as WM_SYSKEY* with alt.
void PostKey(HWND hwnd, UINT vk, bool alt = false);

std::wstring WindowText(HWND hwnd);
// The clipboard with one text format: CF_UNICODETEXT, or CF_TEXT bytes in the code page.
bool SetClipboardText(HWND owner, const std::wstring& text);
bool SetClipboardAnsi(HWND owner, const std::string& bytes);
std::wstring ClipboardText(HWND owner);

// Answers message boxes and modal dialogs from a WH_CBT hook on this thread. Each
// #32770 window activated for the first time is recorded with its caption and
// message text (the static with id 0xFFFF) and answered by posting WM_COMMAND with
// the button id the handler returns (0 leaves it alone, for the test to handle).
class DialogAnswerer
{
public:
    struct Seen
    {
        HWND hwnd;
        std::wstring caption;
        std::wstring text;
    };
    using Handler = std::function<int(const Seen&)>;

    explicit DialogAnswerer(int button = IDOK);
    explicit DialogAnswerer(Handler handler);
    ~DialogAnswerer();
    DialogAnswerer(const DialogAnswerer&) = delete;
    DialogAnswerer& operator=(const DialogAnswerer&) = delete;

    const std::vector<Seen>& seen() const { return m_seen; }
    int count() const { return static_cast<int>(m_seen.size()); }
    std::wstring lastText() const { return m_seen.empty() ? std::wstring() : m_seen.back().text; }
    void clear() { m_seen.clear(); }

private:
    static LRESULT CALLBACK CbtProc(int code, WPARAM wParam, LPARAM lParam);
    void OnActivate(HWND hwnd);

    HHOOK m_hook = nullptr;
    Handler m_handler;
    std::vector<Seen> m_seen;
    std::vector<HWND> m_answered;
    DialogAnswerer* m_previous = nullptr;
};

// Runs steps against modal dialogs: one step per tick of a thread timer, which every modal
// loop of this thread dispatches, while the active window is a visible dialog (#32770).
// A step returns false to be retried at the next tick (waiting for a nested dialog).
// Actions that open nested modal loops must be posted, not sent. Past the time limit
// every dialog of the thread is cancelled (also one still up after the last step), so
// that a test cannot hang.
class ModalScript
{
public:
    using Step = std::function<bool(HWND dialog)>;

    explicit ModalScript(std::vector<Step> steps, DWORD timeLimitMs = 5000);
    ~ModalScript();
    ModalScript(const ModalScript&) = delete;
    ModalScript& operator=(const ModalScript&) = delete;

    bool finished() const { return m_next >= m_steps.size() && !m_timedOut; }
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
    ModalScript* m_previous = nullptr;
};

// A visible top-level window that hosts controls under test (parent and notification
// target); its procedure is DefWindowProc, spies attach to it.
class HostWindow
{
public:
    HostWindow(int width = 640, int height = 480, DWORD style = WS_OVERLAPPEDWINDOW | WS_VISIBLE | WS_CLIPCHILDREN);
    ~HostWindow();
    HWND hwnd() const { return m_hwnd; }
    operator HWND() const { return m_hwnd; }

private:
    HWND m_hwnd;
};

} // namespace orvane_test
