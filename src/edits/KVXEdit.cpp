#include "KVXEdit.h"

#include "NumberFormat.h"

// m_cmapError is defined with the library's other process-wide objects, in the order
// they must be constructed (frame/ProcessObjects.cpp).
HHOOK KVXEdit::m_hHookGet = NULL;
HHOOK KVXEdit::m_hHookRet = NULL;
int KVXEdit::m_iErrorPagesCount = 0;

// Edits alive in the process. The hooks run code of this library, so the last edit to go
// takes them along; an edit of one page must not take away another page's hooks.
static int s_nLiveEdits = 0;

BEGIN_MESSAGE_MAP(KVXEdit, CEdit)
    ON_WM_CHAR()
    ON_WM_KILLFOCUS()
    ON_WM_SETFOCUS()
    ON_CONTROL_REFLECT_EX(EN_CHANGE, &KVXEdit::OnChange)
    ON_MESSAGE(WM_KVX_SHOWERRORMESSAGE, &KVXEdit::OnShowErrorMessage)
END_MESSAGE_MAP()

/////////////////////////////////////////////////////////////////////////////
// Constructors

KVXEdit::KVXEdit()
    : m_bSyntaxOk(TRUE),
      m_bShowingError(FALSE),
      m_bFocusSet(FALSE),
      m_bOwnMessage(FALSE),
      m_nErrorPos(0),
      m_bUndefined(FALSE),
      m_rectCreate(0, 0, 0, 0),
      m_pParentWnd(NULL)
{
    ++s_nLiveEdits;
}

KVXEdit::~KVXEdit()
{
    // The registry keeps raw pointers: drop every entry that still names this edit.
    for (;;)
    {
        HWND hParent = NULL;
        KVXEdit* pEdit = NULL;
        bool bFound = false;
        POSITION pos = m_cmapError.GetStartPosition();
        while (pos != NULL)
        {
            m_cmapError.GetNextAssoc(pos, hParent, pEdit);
            if (pEdit == this)
            {
                bFound = true;
                break;
            }
        }
        if (!bFound)
            break;
        m_cmapError.RemoveKey(hParent);
    }

    if (--s_nLiveEdits <= 0)
    {
        s_nLiveEdits = 0;
        RemoveHooks();
        m_iErrorPagesCount = 0;
    }
}

/////////////////////////////////////////////////////////////////////////////
// Operations

void KVXEdit::InitErrorHandling(HWND hParent, int bInit)
{
    if (bInit)
    {
        if (m_iErrorPagesCount <= 0)
        {
            RemoveHooks();
            m_hHookGet = ::SetWindowsHookEx(WH_GETMESSAGE, GetMsgProc, NULL, ::GetCurrentThreadId());
            m_hHookRet = ::SetWindowsHookEx(WH_CALLWNDPROCRET, CallWndRetProc, NULL, ::GetCurrentThreadId());
            m_iErrorPagesCount = 0;
        }
        ++m_iErrorPagesCount;
    }
    else if (m_iErrorPagesCount > 0)
    {
        // An unbalanced release neither drives the count below zero nor unhooks twice.
        if (--m_iErrorPagesCount == 0)
            RemoveHooks();
    }
    if (hParent != NULL)
        m_cmapError.RemoveKey(hParent);
}

KVXEdit* PASCAL KVXEdit::FindErrorOnPage(HWND hParent)
{
    KVXEdit* pEdit = NULL;
    if (hParent == NULL || !m_cmapError.Lookup(hParent, pEdit))
        return NULL;
    // A registration is only good while its edit's window still lives on that page; the
    // parent's handle may meanwhile belong to another window.
    if (pEdit == NULL || !::IsWindow(pEdit->m_hWnd) || ::GetParent(pEdit->m_hWnd) != hParent)
    {
        m_cmapError.RemoveKey(hParent);
        return NULL;
    }
    return pEdit;
}

int KVXEdit::ShowErrorMessage()
{
    KVXEdit* pEdit = FindErrorOnPage(::GetParent(m_hWnd));
    if (pEdit == NULL)
        return FALSE;
    PostShowError(pEdit);
    return TRUE;
}

void KVXEdit::SetOwnMessage(CString& strMessage)
{
    m_strErrorMessage = strMessage;
    Register();
    m_bOwnMessage = TRUE;
}

int KVXEdit::GetModified()
{
    if (GetUndefined())
        return FALSE;
    return m_varCommitted != m_varValue;
}

void KVXEdit::SetUndefined(int bUndefined)
{
    m_bUndefined = bUndefined;
    if (bUndefined && ::IsWindow(m_hWnd))
        SetWindowText(_T(""));
}

int KVXEdit::GetUndefined()
{
    return m_bUndefined && m_strText.IsEmpty();
}

int KVXEdit::IsFocusSet()
{
    return m_bFocusSet;
}

/////////////////////////////////////////////////////////////////////////////
// Overridables

int KVXEdit::SyntaxCheck(int bShow)
{
    if (!m_strText.IsEmpty() && bShow && !m_bSyntaxOk && ::IsWindow(m_hWnd))
        ::PostMessage(m_hWnd, WM_KVX_SHOWERRORMESSAGE, 0, 0);
    return m_bSyntaxOk;
}

/////////////////////////////////////////////////////////////////////////////
// Implementation for the subclasses

void KVXEdit::SetErrorMessage(CString& strMessage)
{
    m_strErrorMessage = strMessage;
}

void KVXEdit::SetErrorPos(int nPos)
{
    m_nErrorPos = nPos;
}

void KVXEdit::ResetOwnMessage()
{
    if (!m_bOwnMessage)
        return;
    m_bOwnMessage = FALSE;
    HWND hParent = ::IsWindow(m_hWnd) ? ::GetParent(m_hWnd) : NULL;
    if (hParent != NULL)
        m_cmapError.RemoveKey(hParent);
}

KVXVariant KVXEdit::GetValueAsVariant(int bCommit)
{
    if (bCommit)
    {
        SetUndefined(FALSE);
        m_varCommitted = m_varValue;
    }
    return m_varValue;
}

int KVXEdit::IsEmpty()
{
    return m_strText.IsEmpty();
}

void KVXEdit::Register()
{
    HWND hParent = ::IsWindow(m_hWnd) ? ::GetParent(m_hWnd) : NULL;
    // Without a parent there is no page to keep the user in; a NULL key would match
    // every top-level window of the thread.
    if (hParent != NULL)
        m_cmapError[hParent] = this;
}

void PASCAL KVXEdit::RemoveHooks()
{
    if (m_hHookGet != NULL)
        ::UnhookWindowsHookEx(m_hHookGet);
    if (m_hHookRet != NULL)
        ::UnhookWindowsHookEx(m_hHookRet);
    m_hHookGet = NULL;
    m_hHookRet = NULL;
}

void PASCAL KVXEdit::PostShowError(KVXEdit* pEdit)
{
    if (pEdit != NULL && ::IsWindow(pEdit->m_hWnd))
        ::PostMessage(pEdit->m_hWnd, WM_KVX_SHOWERRORMESSAGE, 0, 0);
}

// The window is gone, possibly while this edit's message box is up: the object may get
// a new window (a dialog opened again), which starts without a box and without focus.
void KVXEdit::PostNcDestroy()
{
    m_bShowingError = FALSE;
    m_bFocusSet = FALSE;
    CEdit::PostNcDestroy();
}

/////////////////////////////////////////////////////////////////////////////
// Thread hooks

LRESULT CALLBACK KVXEdit::GetMsgProc(int nCode, WPARAM wParam, LPARAM lParam)
{
    // Peeks that leave the message in the queue (PM_NOREMOVE) come through here too;
    // acting on them would post the display twice for one key.
    if (nCode >= 0 && wParam == PM_REMOVE && lParam != 0)
    {
        MSG* pMsg = reinterpret_cast<MSG*>(lParam);
        const bool bLeaveKey = (pMsg->message == WM_KEYDOWN && pMsg->wParam == VK_TAB) || pMsg->message == WM_SYSKEYDOWN;
        if (bLeaveKey && pMsg->hwnd != NULL)
        {
            KVXEdit* pEdit = FindErrorOnPage(::GetParent(pMsg->hwnd));
            if (pEdit != NULL)
            {
                PostShowError(pEdit);
                pMsg->message = WM_NULL;
            }
        }
    }
    return ::CallNextHookEx(m_hHookGet, nCode, wParam, lParam);
}

LRESULT CALLBACK KVXEdit::CallWndRetProc(int nCode, WPARAM wParam, LPARAM lParam)
{
    if (nCode >= 0 && lParam != 0)
    {
        const CWPRETSTRUCT* pRet = reinterpret_cast<const CWPRETSTRUCT*>(lParam);
        // Only controls of the page count: GetParent of a pop-up (the message box itself
        // when it takes the focus) is its owner. Focus changes caused by the box are not
        // tracked either.
        if (pRet->message == WM_SETFOCUS && pRet->hwnd != NULL && (::GetWindowLong(pRet->hwnd, GWL_STYLE) & WS_CHILD))
        {
            KVXEdit* pEdit = FindErrorOnPage(::GetParent(pRet->hwnd));
            if (pEdit != NULL && !pEdit->m_bShowingError && (pEdit->m_bOwnMessage || pEdit->m_hWnd != pRet->hwnd))
                PostShowError(pEdit);
        }
    }
    return ::CallNextHookEx(m_hHookRet, nCode, wParam, lParam);
}

/////////////////////////////////////////////////////////////////////////////
// Message handlers

void KVXEdit::OnChar(UINT nChar, UINT nRepCnt, UINT nFlags)
{
    const WCHAR c = static_cast<WCHAR>(nChar);
    if ((::GetKeyState(VK_CONTROL) & 0x8000) && NumberFormat::IsClipboardChar(c))
    {
        CEdit::OnChar(nChar, nRepCnt, nFlags);
        return;
    }
    if (CharCheck(c))
        CEdit::OnChar(nChar, nRepCnt, nFlags);
}

void KVXEdit::OnKillFocus(CWnd* pNewWnd)
{
    if (!m_bShowingError)
        m_bFocusSet = FALSE;
    CEdit::OnKillFocus(pNewWnd);
}

void KVXEdit::OnSetFocus(CWnd* pOldWnd)
{
    if (!m_bShowingError)
    {
        GetWindowText(m_strText);
        if (m_strText.IsEmpty())
            m_bSyntaxOk = TRUE;
        else
            m_bSyntaxOk = SyntaxCheck(m_strText);
        m_bFocusSet = TRUE;
    }
    CEdit::OnSetFocus(pOldWnd);
}

BOOL KVXEdit::OnChange()
{
    const HWND hParent = ::GetParent(m_hWnd);
    KVXEdit* pRegistered = FindErrorOnPage(hParent);

    m_bSyntaxOk = TRUE;
    GetWindowText(m_strText);
    m_bSyntaxOk = SyntaxCheck(m_strText);
    // An empty field is never an error; the check's message is simply not used.
    if (m_strText.IsEmpty())
        m_bSyntaxOk = TRUE;

    if (!m_bSyntaxOk)
    {
        Register();
        return FALSE;
    }
    if (pRegistered != NULL && pRegistered->m_hWnd == m_hWnd)
        m_cmapError.RemoveKey(hParent);
    return FALSE;
}

LRESULT KVXEdit::OnShowErrorMessage(WPARAM, LPARAM)
{
    if (m_bShowingError)
        return 0;
    if (!m_bOwnMessage && SyntaxCheck(FALSE))
        return 0;

    if (!IsWindowEnabled())
    {
        // A disabled field never shows a box: it goes back to its committed value.
        ResetOwnMessage();
        if (SyntaxCheck(FALSE))
            return 0;
        m_varValue = m_varCommitted;
        SetValueAsVariant(m_varValue, FALSE);
        return 0;
    }

    const HWND hWnd = m_hWnd;
    SetFocus();
    ResetOwnMessage();
    m_bShowingError = TRUE;
    AfxMessageBox(m_strErrorMessage, 0, 0);
    // The host may have destroyed the field (and this object with it) from inside the
    // box's message loop: PostNcDestroy has then ended the showing state already.
    if (!::IsWindow(hWnd) || m_hWnd != hWnd)
        return 0;
    m_bShowingError = FALSE;
    SendMessage(EM_SETSEL, (WPARAM)m_nErrorPos, (LPARAM)-1);
    SendMessage(EM_SCROLLCARET, 0, 0);
    return 0;
}
