// CWinThread: the message pump, idle processing and pre-translation walk.
#include "wndimpl.h"

IMPLEMENT_DYNAMIC(CWinThread, CCmdTarget)

CWinThread::CWinThread()
    : m_pMainWnd(NULL), m_pActiveWnd(NULL), m_bAutoDelete(TRUE),
      m_hThread(NULL), m_nThreadID(0)
{
}

CWinThread::~CWinThread()
{
    AFX_MODULE_THREAD_STATE* pState = AfxGetModuleThreadState();
    if (pState->m_pCurrentWinThread == this)
        pState->m_pCurrentWinThread = NULL;
}

void CWinThread::Delete()
{
    if (m_bAutoDelete)
        delete this;
}

int CWinThread::GetThreadPriority()
{
    return ::GetThreadPriority(m_hThread);
}

BOOL CWinThread::SetThreadPriority(int nPriority)
{
    return ::SetThreadPriority(m_hThread, nPriority);
}

DWORD CWinThread::SuspendThread()
{
    return ::SuspendThread(m_hThread);
}

DWORD CWinThread::ResumeThread()
{
    return ::ResumeThread(m_hThread);
}

BOOL CWinThread::PostThreadMessage(UINT message, WPARAM wParam, LPARAM lParam)
{
    return ::PostThreadMessage(m_nThreadID, message, wParam, lParam);
}

BOOL CWinThread::InitInstance()
{
    return FALSE;   // a thread without its own InitInstance has no loop to run
}

CWnd* CWinThread::GetMainWnd()
{
    if (m_pActiveWnd != NULL)
        return m_pActiveWnd;
    return m_pMainWnd;
}

const MSG* PASCAL CWinThread::GetCurrentMessage()
{
    return &AfxGetThreadState()->m_msgCur;
}

int CWinThread::Run()
{
    _AFX_THREAD_STATE* pState = AfxGetThreadState();
    BOOL bIdle = TRUE;
    LONG lIdleCount = 0;
    for (;;)
    {
        while (bIdle && !::PeekMessage(&pState->m_msgCur, NULL, 0, 0, PM_NOREMOVE))
        {
            if (!OnIdle(lIdleCount++))
                bIdle = FALSE;
        }
        do
        {
            if (!PumpMessage())
                return ExitInstance();
            if (IsIdleMessage(&pState->m_msgCur))
            {
                bIdle = TRUE;
                lIdleCount = 0;
            }
        } while (::PeekMessage(&pState->m_msgCur, NULL, 0, 0, PM_NOREMOVE));
    }
}

// Retrieves one message and dispatches it unless PreTranslateMessage took it.
// FALSE on WM_QUIT.
BOOL CWinThread::PumpMessage()
{
    _AFX_THREAD_STATE* pState = AfxGetThreadState();
    MSG* pMsg = &pState->m_msgCur;
    if (!::GetMessage(pMsg, NULL, 0, 0))
        return FALSE;
    if (pMsg->message != WM_KICKIDLE && !PreTranslateMessage(pMsg))
    {
        ::TranslateMessage(pMsg);
        ::DispatchMessage(pMsg);
    }
    return TRUE;
}

// From the message's window up through parents and owners to the main window,
// each framework object may take the message. A window whose chain does not reach
// the main window (a modeless dialog of its own) gives the main window a last look.
BOOL CWinThread::PreTranslateMessage(MSG* pMsg)
{
    if (pMsg->hwnd == NULL)
        return FALSE;   // thread messages are dispatched as they are
    CWnd* pMainWnd = AfxGetMainWnd();
    HWND hWndMain = pMainWnd != NULL ? pMainWnd->m_hWnd : NULL;
    if (CWnd::WalkPreTranslateTree(hWndMain, pMsg))
        return TRUE;
    if (hWndMain != NULL && ::IsWindow(hWndMain))
    {
        // the top of the parent-and-owner chain
        HWND hWndTop = pMsg->hwnd;
        for (;;)
        {
            HWND hWndNext = (::GetWindowLongPtr(hWndTop, GWL_STYLE) & WS_CHILD)
                ? ::GetParent(hWndTop) : ::GetWindow(hWndTop, GW_OWNER);
            if (hWndNext == NULL)
                break;
            hWndTop = hWndNext;
        }
        if (hWndTop != hWndMain)
            return pMainWnd->PreTranslateMessage(pMsg);
    }
    return FALSE;
}

BOOL CWinThread::ProcessMessageFilter(int, LPMSG lpMsg)
{
    if (lpMsg == NULL)
        return FALSE;
    return PreTranslateMessage(lpMsg);
}

// Repeated mouse moves at the same place and the caret blink do not end the
// idle state.
BOOL CWinThread::IsIdleMessage(MSG* pMsg)
{
    _AFX_THREAD_STATE* pState = AfxGetThreadState();
    if (pMsg->message == WM_MOUSEMOVE || pMsg->message == WM_NCMOUSEMOVE)
    {
        if (pState->m_ptCursorLast.x == pMsg->pt.x && pState->m_ptCursorLast.y == pMsg->pt.y
            && pMsg->message == pState->m_nMsgLast)
            return FALSE;
        pState->m_ptCursorLast = pMsg->pt;
        pState->m_nMsgLast = pMsg->message;
        return TRUE;
    }
    return pMsg->message != WM_PAINT && pMsg->message != 0x0118;   // WM_SYSTIMER (caret)
}

// Count 0: idle updates of the main window's controls; count 1 and later: the
// temporary objects made since the last idle time are freed.
BOOL CWinThread::OnIdle(LONG lCount)
{
    if (lCount <= 0)
    {
        CWnd* pMainWnd = m_pMainWnd;
        if (pMainWnd != NULL && pMainWnd->m_hWnd != NULL && pMainWnd->IsWindowVisible())
        {
            AfxCallWndProc(pMainWnd, pMainWnd->m_hWnd, WM_IDLEUPDATECMDUI, (WPARAM)TRUE, 0);
            pMainWnd->SendMessageToDescendants(WM_IDLEUPDATECMDUI, (WPARAM)TRUE, 0, TRUE, TRUE);
        }
    }
    else
    {
        if (AfxGetModuleThreadState()->m_nTempMapLock == 0)
        {
            AfxLockTempMaps();
            AfxUnlockTempMaps();
        }
    }
    return lCount < 1;
}

int CWinThread::ExitInstance()
{
    return (int)AfxGetThreadState()->m_msgCur.wParam;
}

LRESULT CWinThread::ProcessWndProcException(CException* e, const MSG* pMsg)
{
    if (pMsg->message == WM_CREATE)
        return -1;  // creation fails
    if (pMsg->message == WM_PAINT)
    {
        // validate, or the window is painted again and again
        ::ValidateRect(pMsg->hwnd, NULL);
        return 0;
    }
    if (!e->IsKindOf(RUNTIME_CLASS(CUserException)))
        e->ReportError(MB_ICONEXCLAMATION | MB_SYSTEMMODAL, AFX_IDP_INTERNAL_FAILURE);
    return 0;
}
