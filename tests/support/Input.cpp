#include "Input.h"

namespace orvane_test {

int PumpUntilIdle(DWORD maxMs)
{
    return PumpDialog(nullptr, maxMs);
}

int PumpDialog(HWND dialog, DWORD maxMs)
{
    DWORD start = GetTickCount();
    int dispatched = 0;
    MSG msg;
    while (GetTickCount() - start < maxMs)
    {
        if (!PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE))
        {
            // Give posted and timer-generated messages one more chance to arrive.
            Sleep(1);
            if (!PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE))
                break;
        }
        ++dispatched;
        if (dialog && IsWindow(dialog) && IsDialogMessageW(dialog, &msg))
            continue;
        TranslateMessage(&msg);
        DispatchMessageW(&msg);
    }
    return dispatched;
}

bool WaitFor(const std::function<bool()>& pred, DWORD timeoutMs)
{
    DWORD start = GetTickCount();
    while (!pred())
    {
        if (GetTickCount() - start >= timeoutMs)
            return pred();
        MSG msg;
        if (PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE))
        {
            TranslateMessage(&msg);
            DispatchMessageW(&msg);
        }
        else
            MsgWaitForMultipleObjects(0, nullptr, FALSE, 10, QS_ALLINPUT);
    }
    return true;
}

KeyStateGuard::KeyStateGuard(std::initializer_list<int> keysDown)
{
    GetKeyboardState(m_saved);
    BYTE state[256];
    memcpy(state, m_saved, sizeof state);
    for (int vk : keysDown)
    {
        state[vk & 0xFF] = 0x80;
        switch (vk)
        {
        case VK_CONTROL: state[VK_LCONTROL] = 0x80; break;
        case VK_SHIFT: state[VK_LSHIFT] = 0x80; break;
        case VK_MENU: state[VK_LMENU] = 0x80; break;
        default: break;
        }
    }
    SetKeyboardState(state);
}

KeyStateGuard::~KeyStateGuard()
{
    SetKeyboardState(m_saved);
}

LPARAM PointParam(int x, int y)
{
    return MAKELPARAM(static_cast<WORD>(static_cast<short>(x)), static_cast<WORD>(static_cast<short>(y)));
}

void SendKey(HWND hwnd, UINT vk)
{
    UINT scan = MapVirtualKeyW(vk, MAPVK_VK_TO_VSC);
    SendMessageW(hwnd, WM_KEYDOWN, vk, 1 | (scan << 16));
    SendMessageW(hwnd, WM_KEYUP, vk, 1 | (scan << 16) | 0xC0000000);
}

void SendChars(HWND hwnd, const std::wstring& text)
{
    for (wchar_t ch : text)
        SendMessageW(hwnd, WM_CHAR, ch, 1);
}

void SendClick(HWND hwnd, int x, int y, WPARAM keys)
{
    SendMessageW(hwnd, WM_LBUTTONDOWN, keys | MK_LBUTTON, PointParam(x, y));
    SendMessageW(hwnd, WM_LBUTTONUP, keys, PointParam(x, y));
}

void PostKey(HWND hwnd, UINT vk, bool alt)
{
    const LPARAM lParam = 1 | (MapVirtualKeyW(vk, MAPVK_VK_TO_VSC) << 16) | (alt ? 1 << 29 : 0);
    PostMessageW(hwnd, alt ? WM_SYSKEYDOWN : WM_KEYDOWN, vk, lParam);
    PostMessageW(hwnd, alt ? WM_SYSKEYUP : WM_KEYUP, vk, lParam | 0xC0000000);
}

std::wstring WindowText(HWND hwnd)
{
    if (!hwnd)
        return std::wstring();
    int len = GetWindowTextLengthW(hwnd);
    std::wstring s(static_cast<size_t>(len) + 1, L'\0');
    int got = GetWindowTextW(hwnd, &s[0], len + 1);
    s.resize(got > 0 ? static_cast<size_t>(got) : 0);
    return s;
}

namespace {

bool SetClipboardBytes(HWND owner, UINT format, const void* bytes, size_t size)
{
    if (!OpenClipboard(owner))
        return false;
    EmptyClipboard();
    HGLOBAL data = GlobalAlloc(GMEM_MOVEABLE, size);
    if (data)
    {
        memcpy(GlobalLock(data), bytes, size);
        GlobalUnlock(data);
    }
    const bool ok = data && SetClipboardData(format, data);
    CloseClipboard();
    return ok;
}

thread_local DialogAnswerer* t_answerer = nullptr;
thread_local ModalScript* t_script = nullptr;

} // namespace

bool SetClipboardText(HWND owner, const std::wstring& text)
{
    return SetClipboardBytes(owner, CF_UNICODETEXT, text.c_str(), (text.size() + 1) * sizeof(wchar_t));
}

bool SetClipboardAnsi(HWND owner, const std::string& bytes)
{
    return SetClipboardBytes(owner, CF_TEXT, bytes.c_str(), bytes.size() + 1);
}

std::wstring ClipboardText(HWND owner)
{
    std::wstring text = L"<none>";
    if (!OpenClipboard(owner))
        return L"<locked>";
    if (HANDLE data = GetClipboardData(CF_UNICODETEXT))
    {
        text = static_cast<const wchar_t*>(GlobalLock(data));
        GlobalUnlock(data);
    }
    CloseClipboard();
    return text;
}

DialogAnswerer::DialogAnswerer(int button)
    : DialogAnswerer(Handler([button](const Seen&) { return button; }))
{
}

DialogAnswerer::DialogAnswerer(Handler handler) : m_handler(std::move(handler))
{
    m_previous = t_answerer;
    t_answerer = this;
    m_hook = SetWindowsHookExW(WH_CBT, CbtProc, nullptr, GetCurrentThreadId());
}

DialogAnswerer::~DialogAnswerer()
{
    if (m_hook)
        UnhookWindowsHookEx(m_hook);
    t_answerer = m_previous;
}

LRESULT CALLBACK DialogAnswerer::CbtProc(int code, WPARAM wParam, LPARAM lParam)
{
    DialogAnswerer* self = t_answerer;
    if (code == HCBT_ACTIVATE && self)
        self->OnActivate(reinterpret_cast<HWND>(wParam));
    return CallNextHookEx(self ? self->m_hook : nullptr, code, wParam, lParam);
}

void DialogAnswerer::OnActivate(HWND hwnd)
{
    wchar_t cls[64] = {};
    GetClassNameW(hwnd, cls, 64);
    if (lstrcmpW(cls, L"#32770") != 0)
        return;
    // When a nested box closes its owner is activated again: answer each window once.
    for (HWND done : m_answered)
        if (done == hwnd)
            return;
    m_answered.push_back(hwnd);
    Seen seen{ hwnd, WindowText(hwnd), WindowText(GetDlgItem(hwnd, 0xFFFF)) };
    m_seen.push_back(seen);
    int button = m_handler ? m_handler(seen) : 0;
    if (button)
        PostMessageW(hwnd, WM_COMMAND, MAKEWPARAM(button, BN_CLICKED), 0);
}

ModalScript::ModalScript(std::vector<Step> steps, DWORD timeLimitMs)
    : m_steps(std::move(steps)), m_start(GetTickCount()), m_limit(timeLimitMs), m_previous(t_script)
{
    t_script = this;
    m_timer = SetTimer(nullptr, 0, 15, TimerProc);
}

ModalScript::~ModalScript()
{
    KillTimer(nullptr, m_timer);
    t_script = m_previous;
}

void CALLBACK ModalScript::TimerProc(HWND, UINT, UINT_PTR, DWORD)
{
    if (t_script)
        t_script->Tick();
}

namespace {

bool IsVisibleDialog(HWND hwnd)
{
    wchar_t cls[16] = {};
    GetClassNameW(hwnd, cls, 16);
    return hwnd && IsWindowVisible(hwnd) && lstrcmpW(cls, L"#32770") == 0;
}

BOOL CALLBACK CancelDialog(HWND hwnd, LPARAM)
{
    if (IsVisibleDialog(hwnd))
        PostMessageW(hwnd, WM_COMMAND, IDCANCEL, 0);
    return TRUE;
}

} // namespace

void ModalScript::Tick()
{
    if (m_busy || (m_timedOut && m_next >= m_steps.size()))
        return;
    m_busy = true;
    // Past the limit a dialog still up is cancelled, also one that outlives the last step.
    if (GetTickCount() - m_start > m_limit && (m_next < m_steps.size() || IsVisibleDialog(GetActiveWindow())))
    {
        m_timedOut = true;
        m_next = m_steps.size();
        ReleaseCapture();
        EnumThreadWindows(GetCurrentThreadId(), CancelDialog, 0);
    }
    else if (m_next < m_steps.size())
    {
        HWND active = GetActiveWindow();
        if (IsVisibleDialog(active) && m_steps[m_next](active))
            ++m_next;
    }
    m_busy = false;
}

HostWindow::HostWindow(int width, int height, DWORD style)
{
    static ATOM atom = [] {
        WNDCLASSW wc = {};
        wc.lpfnWndProc = DefWindowProcW;
        wc.hInstance = GetModuleHandleW(nullptr);
        wc.hCursor = LoadCursorW(nullptr, IDC_ARROW);
        wc.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_BTNFACE + 1);
        wc.lpszClassName = L"OrvaneTestHost";
        return RegisterClassW(&wc);
    }();
    (void)atom;
    m_hwnd = CreateWindowExW(0, L"OrvaneTestHost", L"test host", style, 0, 0, width, height,
                             nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    if (style & WS_VISIBLE)
    {
        SetForegroundWindow(m_hwnd);
        UpdateWindow(m_hwnd);
    }
}

HostWindow::~HostWindow()
{
    if (IsWindow(m_hwnd))
        DestroyWindow(m_hwnd);
}

} // namespace orvane_test
