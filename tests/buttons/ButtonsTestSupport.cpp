#include "ButtonsTestSupport.h"

#include <commctrl.h>

#include "OrvaneControls.h"

namespace buttons_test {

void EnsureLibraryLoaded()
{
    static bool loaded = false;
    if (!loaded)
    {
        LoadOrvaneControlsLibrary();
        loaded = true;
    }
}

TestParent::TestParent(int x, int y, int width, int height)
{
    LPCTSTR lpszClass = AfxRegisterWndClass(CS_DBLCLKS, ::LoadCursor(NULL, IDC_ARROW),
                                            reinterpret_cast<HBRUSH>(COLOR_BTNFACE + 1));
    CreateEx(0, lpszClass, _T("buttons test parent"), WS_OVERLAPPEDWINDOW | WS_VISIBLE | WS_CLIPCHILDREN, x, y,
             width, height, NULL, NULL);
    ::SetForegroundWindow(m_hWnd);
    UpdateWindow();
}

TestParent::~TestParent()
{
    if (::IsWindow(m_hWnd))
        DestroyWindow();
}

void TestParent::MoveClientTo(int x, int y)
{
    CRect rcWindow;
    GetWindowRect(&rcWindow);
    CPoint ptClient(0, 0);
    ClientToScreen(&ptClient);
    SetWindowPos(NULL, rcWindow.left + x - ptClient.x, rcWindow.top + y - ptClient.y, 0, 0,
                 SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

ColorNotifyRecorder::ColorNotifyRecorder(HWND hParent) : m_hParent(hParent)
{
    ::SetWindowSubclass(m_hParent, Proc, reinterpret_cast<UINT_PTR>(this), reinterpret_cast<DWORD_PTR>(this));
}

ColorNotifyRecorder::~ColorNotifyRecorder()
{
    if (::IsWindow(m_hParent))
        ::RemoveWindowSubclass(m_hParent, Proc, reinterpret_cast<UINT_PTR>(this));
}

LRESULT CALLBACK ColorNotifyRecorder::Proc(HWND hwnd, UINT msg, WPARAM wParam, LPARAM lParam, UINT_PTR,
                                           DWORD_PTR refData)
{
    if (msg == WM_KVX_COLORWELLCHANGED)
    {
        auto* self = reinterpret_cast<ColorNotifyRecorder*>(refData);
        Record r = { wParam, NULL, 0, 0, 0xFFFFFFFF };
        if (lParam != 0)
        {
            const KVXColorWellNotify* p = reinterpret_cast<const KVXColorWellNotify*>(lParam);
            r.hwndFrom = p->hdr.hwndFrom;
            r.idFrom = p->hdr.idFrom;
            r.code = p->hdr.code;
            r.clrColor = p->clrColor;
        }
        self->m_records.push_back(r);
    }
    return ::DefSubclassProc(hwnd, msg, wParam, lParam);
}

namespace {
ModalScript* g_pScript = nullptr;
}

ModalScript::ModalScript(std::vector<Step> steps, DWORD timeLimitMs)
    : m_steps(std::move(steps)), m_start(::GetTickCount()), m_limit(timeLimitMs)
{
    g_pScript = this;
    m_timer = ::SetTimer(NULL, 0, 15, TimerProc);
}

ModalScript::~ModalScript()
{
    if (m_timer != 0)
        ::KillTimer(NULL, m_timer);
    g_pScript = nullptr;
}

void CALLBACK ModalScript::TimerProc(HWND, UINT, UINT_PTR, DWORD)
{
    if (g_pScript != nullptr)
        g_pScript->Tick();
}

namespace {

BOOL CALLBACK CancelDialog(HWND hwnd, LPARAM)
{
    if (::IsWindowVisible(hwnd) && WindowClass(hwnd) == L"#32770")
        ::PostMessage(hwnd, WM_COMMAND, IDCANCEL, 0);
    return TRUE;
}

} // namespace

void ModalScript::Tick()
{
    if (m_busy || finished())
        return;
    m_busy = true;
    if (::GetTickCount() - m_start > m_limit)
    {
        m_timedOut = true;
        m_next = m_steps.size();
        ::ReleaseCapture();
        ::EnumThreadWindows(::GetCurrentThreadId(), CancelDialog, 0);
    }
    else
    {
        HWND hDialog = ActiveDialog();
        if (hDialog != NULL && m_steps[m_next](hDialog))
            ++m_next;
    }
    m_busy = false;
}

HWND ActiveDialog()
{
    HWND hwnd = ::GetActiveWindow();
    if (hwnd != NULL && ::IsWindowVisible(hwnd) && WindowClass(hwnd) == L"#32770")
        return hwnd;
    return NULL;
}

std::wstring WindowClass(HWND hwnd)
{
    wchar_t cls[64] = {};
    ::GetClassNameW(hwnd, cls, 64);
    return cls;
}

} // namespace buttons_test
