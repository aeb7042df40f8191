// CWnd core: creation through the CBT hook, subclassing, the handle map, the
// window procedure, message map dispatch and reflection to child controls.
#include "wndimpl.h"

#include <afxole.h>

IMPLEMENT_DYNCREATE(CWnd, CCmdTarget)

const CWnd CWnd::wndTop(HWND_TOP);
const CWnd CWnd::wndBottom(HWND_BOTTOM);
const CWnd CWnd::wndTopMost(HWND_TOPMOST);
const CWnd CWnd::wndNoTopMost(HWND_NOTOPMOST);

const TCHAR _afxWnd[] = _T("AfxWnd");
const TCHAR _afxWndControlBar[] = _T("AfxControlBar");
const TCHAR _afxWndMDIFrame[] = _T("AfxMDIFrame");
const TCHAR _afxWndFrameOrView[] = _T("AfxFrameOrView");

// CWnd's own entries: the owner-draw family, scrolling and control colours are
// reflected to the control that sent them; WM_NCDESTROY detaches the object.
BEGIN_MESSAGE_MAP(CWnd, CCmdTarget)
    ON_WM_DRAWITEM()
    ON_WM_MEASUREITEM()
    ON_WM_COMPAREITEM()
    ON_WM_DELETEITEM()
    ON_WM_CTLCOLOR()
    ON_WM_HSCROLL()
    ON_WM_VSCROLL()
    ON_WM_CHARTOITEM()
    ON_WM_VKEYTOITEM()
    ON_WM_PARENTNOTIFY()
    ON_WM_NCDESTROY()
END_MESSAGE_MAP()

/////////////////////////////////////////////////////////////////////////////
// Construction, handle map

CWnd::CWnd()
    : m_hWnd(NULL), m_pfnSuper(NULL), m_hWndOwner(NULL), m_nFlags(0), m_nModalResult(0)
{
}

CWnd::CWnd(HWND hWnd)
    : m_hWnd(hWnd), m_pfnSuper(NULL), m_hWndOwner(NULL), m_nFlags(0), m_nModalResult(0)
{
}

CWnd::~CWnd()
{
    // A window that outlives its object is destroyed here; the derived class's
    // OnDestroy and PostNcDestroy no longer run at this point.
    if (m_hWnd != NULL && this != &wndTop && this != &wndBottom
        && this != &wndTopMost && this != &wndNoTopMost)
        DestroyWindow();
}

CWnd* PASCAL CWnd::FromHandle(HWND hWnd)
{
    if (hWnd == NULL)
        return NULL;
    return afxMapHWND(TRUE)->FromHandle(hWnd);
}

CWnd* PASCAL CWnd::FromHandlePermanent(HWND hWnd)
{
    if (hWnd == NULL)
        return NULL;
    CHandleMap* pMap = afxMapHWND();
    return pMap != NULL ? pMap->LookupPermanent(hWnd) : NULL;
}

void PASCAL CWnd::DeleteTempMap()
{
    if (CHandleMap* pMap = afxMapHWND())
        pMap->DeleteTemp();
}

BOOL CWnd::Attach(HWND hWndNew)
{
    if (hWndNew == NULL || m_hWnd != NULL || FromHandlePermanent(hWndNew) != NULL)
        return FALSE;
    afxMapHWND(TRUE)->SetPermanent(hWndNew, this);
    m_hWnd = hWndNew;
    return TRUE;
}

HWND CWnd::Detach()
{
    HWND hWnd = m_hWnd;
    if (hWnd != NULL)
    {
        CHandleMap* pMap = afxMapHWND();
        if (pMap != NULL && pMap->LookupPermanent(hWnd) == this)
            pMap->RemoveHandle(hWnd);
        m_hWnd = NULL;
    }
    return hWnd;
}

/////////////////////////////////////////////////////////////////////////////
// Window classes

BOOL AFXAPI AfxRegisterClass(WNDCLASS* lpWndClass)
{
    WNDCLASS wndcls;
    if (::GetClassInfo(lpWndClass->hInstance, lpWndClass->lpszClassName, &wndcls))
        return TRUE;    // already registered
    return ::RegisterClass(lpWndClass) != 0;
}

LPCTSTR AFXAPI AfxRegisterWndClass(UINT nClassStyle, HCURSOR hCursor, HBRUSH hbrBackground, HICON hIcon)
{
    LPTSTR lpszName = AfxGetThreadState()->m_szTempClassName;
    HINSTANCE hInst = AfxGetInstanceHandle();
    if (hCursor == NULL && hbrBackground == NULL && hIcon == NULL)
        wsprintf(lpszName, _T("Afx:%p:%x"), (void*)hInst, nClassStyle);
    else
        wsprintf(lpszName, _T("Afx:%p:%x:%p:%p:%p"), (void*)hInst, nClassStyle,
            (void*)hCursor, (void*)hbrBackground, (void*)hIcon);

    WNDCLASS wndcls;
    if (::GetClassInfo(hInst, lpszName, &wndcls))
        return lpszName;

    memset(&wndcls, 0, sizeof(wndcls));
    wndcls.style = nClassStyle;
    wndcls.lpfnWndProc = ::DefWindowProc;
    wndcls.hInstance = hInst;
    wndcls.hIcon = hIcon;
    wndcls.hCursor = hCursor;
    wndcls.hbrBackground = hbrBackground;
    wndcls.lpszClassName = lpszName;
    if (!AfxRegisterClass(&wndcls))
        AfxThrowResourceException();
    return lpszName;
}

BOOL AFXAPI AfxEndDeferRegisterClass(LONG fToRegister)
{
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    fToRegister &= ~(LONG)pModuleState->m_fRegisteredClasses;
    if (fToRegister == 0)
        return TRUE;

    LONG fRegisteredClasses = 0;
    WNDCLASS wndcls;
    memset(&wndcls, 0, sizeof(wndcls));
    wndcls.lpfnWndProc = ::DefWindowProc;
    wndcls.hInstance = AfxGetInstanceHandle();
    wndcls.hCursor = ::LoadCursor(NULL, IDC_ARROW);

    if (fToRegister & AFX_WND_REG)
    {
        // Child windows: no brush, no icon, double clicks delivered
        wndcls.style = CS_DBLCLKS | CS_HREDRAW | CS_VREDRAW;
        wndcls.lpszClassName = _afxWnd;
        if (AfxRegisterClass(&wndcls))
            fRegisteredClasses |= AFX_WND_REG;
    }
    if (fToRegister & AFX_WNDCONTROLBAR_REG)
    {
        wndcls.style = 0;
        wndcls.lpszClassName = _afxWndControlBar;
        wndcls.hbrBackground = (HBRUSH)(COLOR_BTNFACE + 1);
        if (AfxRegisterClass(&wndcls))
            fRegisteredClasses |= AFX_WNDCONTROLBAR_REG;
        wndcls.hbrBackground = NULL;
    }
    if (fToRegister & AFX_WNDMDIFRAME_REG)
    {
        wndcls.style = CS_DBLCLKS;
        wndcls.lpszClassName = _afxWndMDIFrame;
        wndcls.hIcon = ::LoadIcon(NULL, IDI_APPLICATION);
        if (AfxRegisterClass(&wndcls))
            fRegisteredClasses |= AFX_WNDMDIFRAME_REG;
        wndcls.hIcon = NULL;
    }
    if (fToRegister & AFX_WNDFRAMEORVIEW_REG)
    {
        wndcls.style = CS_DBLCLKS | CS_HREDRAW | CS_VREDRAW;
        wndcls.hbrBackground = (HBRUSH)(COLOR_WINDOW + 1);
        wndcls.hIcon = ::LoadIcon(NULL, IDI_APPLICATION);
        wndcls.lpszClassName = _afxWndFrameOrView;
        if (AfxRegisterClass(&wndcls))
            fRegisteredClasses |= AFX_WNDFRAMEORVIEW_REG;
    }

    // The common controls register their classes in InitCommonControlsEx.
    static const struct { LONG fClass; DWORD dwICC; } s_commonControls[] =
    {
        { AFX_WNDCOMMCTLS_REG, ICC_WIN95_CLASSES },
        { AFX_WNDCOMMCTL_UPDOWN_REG, ICC_UPDOWN_CLASS },
        { AFX_WNDCOMMCTL_TREEVIEW_REG, ICC_TREEVIEW_CLASSES },
        { AFX_WNDCOMMCTL_TAB_REG, ICC_TAB_CLASSES },
        { AFX_WNDCOMMCTL_PROGRESS_REG, ICC_PROGRESS_CLASS },
        { AFX_WNDCOMMCTL_LISTVIEW_REG, ICC_LISTVIEW_CLASSES },
        { AFX_WNDCOMMCTL_HOTKEY_REG, ICC_HOTKEY_CLASS },
        { AFX_WNDCOMMCTL_BAR_REG, ICC_BAR_CLASSES },
        { AFX_WNDCOMMCTL_ANIMATE_REG, ICC_ANIMATE_CLASS },
        { AFX_WNDCOMMCTL_INTERNET_REG, ICC_INTERNET_CLASSES },
        { AFX_WNDCOMMCTL_COOL_REG, ICC_COOL_CLASSES },
        { AFX_WNDCOMMCTL_USEREX_REG, ICC_USEREX_CLASSES },
        { AFX_WNDCOMMCTL_DATE_REG, ICC_DATE_CLASSES },
    };
    for (const auto& entry : s_commonControls)
    {
        if (fToRegister & entry.fClass)
        {
            INITCOMMONCONTROLSEX init = { sizeof(init), entry.dwICC };
            if (::InitCommonControlsEx(&init))
                fRegisteredClasses |= entry.fClass;
        }
    }

    pModuleState->m_fRegisteredClasses |= (DWORD)fRegisteredClasses;
    return (fToRegister & fRegisteredClasses) == fToRegister;
}

/////////////////////////////////////////////////////////////////////////////
// Creation hook: the object waiting in m_pWndInit takes the next window created
// on this thread, before its first message, so that it sees WM_NCCREATE and
// WM_CREATE (and WM_GETMINMAXINFO before them) through its own map.

LRESULT CALLBACK _AfxCbtFilterHook(int code, WPARAM wParam, LPARAM lParam)
{
    _AFX_THREAD_STATE* pThreadState = AfxGetThreadState();
    if (code == HCBT_CREATEWND && pThreadState->m_pWndInit != NULL)
    {
        HWND hWnd = (HWND)wParam;
        TCHAR szClassName[8];
        // The input method window the system may create first is not ours.
        BOOL bIme = ::GetClassName(hWnd, szClassName, _countof(szClassName)) > 0
            && lstrcmpi(szClassName, _T("IME")) == 0;
        if (!bIme)
        {
            // m_pWndInit stays set until the window is subclassed: PreSubclassWindow
            // tells creation (still set) from subclassing an existing window (NULL).
            CWnd* pWndInit = pThreadState->m_pWndInit;
            if (pWndInit->Attach(hWnd))
            {
                pWndInit->PreSubclassWindow();
                WNDPROC* pOldWndProc = pWndInit->GetSuperWndProcAddr();
                WNDPROC oldWndProc = (WNDPROC)::SetWindowLongPtr(hWnd, GWLP_WNDPROC,
                    (LONG_PTR)&AfxWndProc);
                if (oldWndProc != &AfxWndProc)
                    *pOldWndProc = oldWndProc;
            }
            pThreadState->m_pWndInit = NULL;
        }
    }
    return ::CallNextHookEx(pThreadState->m_hHookOldCbtFilter, code, wParam, lParam);
}

void AFXAPI AfxHookWindowCreate(CWnd* pWnd)
{
    _AFX_THREAD_STATE* pThreadState = AfxGetThreadState();
    if (pThreadState->m_pWndInit == pWnd)
        return;
    if (pThreadState->m_hHookOldCbtFilter == NULL)
    {
        pThreadState->m_hHookOldCbtFilter = ::SetWindowsHookEx(WH_CBT, _AfxCbtFilterHook,
            NULL, ::GetCurrentThreadId());
        if (pThreadState->m_hHookOldCbtFilter == NULL)
            AfxThrowMemoryException();
    }
    pThreadState->m_pWndInit = pWnd;
}

// FALSE when the hooked object never received its window (creation failed
// before the window existed).
BOOL AFXAPI AfxUnhookWindowCreate()
{
    _AFX_THREAD_STATE* pThreadState = AfxGetThreadState();
    if (pThreadState->m_pWndInit != NULL)
    {
        pThreadState->m_pWndInit = NULL;
        return FALSE;
    }
    return TRUE;
}

BOOL CWnd::CreateEx(DWORD dwExStyle, LPCTSTR lpszClassName, LPCTSTR lpszWindowName,
    DWORD dwStyle, int x, int y, int nWidth, int nHeight, HWND hWndParent,
    HMENU nIDorHMenu, LPVOID lpParam)
{
    if (m_hWnd != NULL)
        return FALSE;   // one window per object

    CREATESTRUCT cs;
    cs.dwExStyle = dwExStyle;
    cs.lpszClass = lpszClassName;
    cs.lpszName = lpszWindowName;
    cs.style = (LONG)dwStyle;
    cs.x = x;
    cs.y = y;
    cs.cx = nWidth;
    cs.cy = nHeight;
    cs.hwndParent = hWndParent;
    cs.hMenu = nIDorHMenu;
    cs.hInstance = AfxGetInstanceHandle();
    cs.lpCreateParams = lpParam;

    if (!PreCreateWindow(cs))
    {
        PostNcDestroy();
        return FALSE;
    }

    AfxHookWindowCreate(this);
    HWND hWnd = ::CreateWindowEx(cs.dwExStyle, cs.lpszClass, cs.lpszName, (DWORD)cs.style,
        cs.x, cs.y, cs.cx, cs.cy, cs.hwndParent, cs.hMenu, cs.hInstance, cs.lpCreateParams);
    if (!AfxUnhookWindowCreate())
        PostNcDestroy();    // creation failed before the object got a window

    return hWnd != NULL;
}

BOOL CWnd::CreateEx(DWORD dwExStyle, LPCTSTR lpszClassName, LPCTSTR lpszWindowName,
    DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID, LPVOID lpParam)
{
    return CreateEx(dwExStyle, lpszClassName, lpszWindowName, dwStyle, rect.left, rect.top,
        rect.right - rect.left, rect.bottom - rect.top, pParentWnd->GetSafeHwnd(),
        (HMENU)(UINT_PTR)nID, lpParam);
}

BOOL CWnd::Create(LPCTSTR lpszClassName, LPCTSTR lpszWindowName, DWORD dwStyle,
    const RECT& rect, CWnd* pParentWnd, UINT nID, CCreateContext* pContext)
{
    return CreateEx(0, lpszClassName, lpszWindowName, dwStyle | WS_CHILD, rect.left, rect.top,
        rect.right - rect.left, rect.bottom - rect.top, pParentWnd->GetSafeHwnd(),
        (HMENU)(UINT_PTR)nID, (LPVOID)pContext);
}

BOOL CWnd::PreCreateWindow(CREATESTRUCT& cs)
{
    if (cs.lpszClass == NULL)
    {
        if (!AfxDeferRegisterClass(AFX_WND_REG))
            return FALSE;
        cs.lpszClass = _afxWnd;
    }
    return TRUE;
}

void CWnd::CalcWindowRect(LPRECT lpClientRect, UINT nAdjustType)
{
    DWORD dwExStyle = GetExStyle();
    if (nAdjustType == 0)
        dwExStyle &= ~WS_EX_CLIENTEDGE;
    ::AdjustWindowRectEx(lpClientRect, GetStyle(), FALSE, dwExStyle);
}

BOOL CWnd::DestroyWindow()
{
    if (m_hWnd == NULL)
        return FALSE;

    CHandleMap* pMap = afxMapHWND();
    CWnd* pWnd = pMap != NULL ? pMap->LookupPermanent(m_hWnd) : NULL;
    HWND hWndOrig = m_hWnd;
    BOOL bResult = ::DestroyWindow(m_hWnd);

    // A permanent object was detached by OnNcDestroy and may be deleted by now.
    if (pWnd == NULL && m_hWnd == hWndOrig)
        Detach();
    return bResult;
}

/////////////////////////////////////////////////////////////////////////////
// Subclassing

void CWnd::PreSubclassWindow()
{
}

WNDPROC* CWnd::GetSuperWndProcAddr()
{
    return &m_pfnSuper;
}

BOOL CWnd::SubclassWindow(HWND hWnd)
{
    if (!::IsWindow(hWnd) || !Attach(hWnd))
        return FALSE;

    PreSubclassWindow();

    WNDPROC* lplpfn = GetSuperWndProcAddr();
    WNDPROC oldWndProc = (WNDPROC)::SetWindowLongPtr(hWnd, GWLP_WNDPROC, (LONG_PTR)&AfxWndProc);
    if (oldWndProc != &AfxWndProc)
        *lplpfn = oldWndProc;
    return TRUE;
}

BOOL CWnd::SubclassDlgItem(UINT nID, CWnd* pParent)
{
    HWND hWndControl = ::GetDlgItem(pParent->GetSafeHwnd(), (int)nID);
    if (hWndControl == NULL)
        return FALSE;
    return SubclassWindow(hWndControl);
}

HWND CWnd::UnsubclassWindow()
{
    if (m_hWnd == NULL)
        return NULL;
    WNDPROC* lplpfn = GetSuperWndProcAddr();
    if (*lplpfn != NULL)
        ::SetWindowLongPtr(m_hWnd, GWLP_WNDPROC, (LONG_PTR)*lplpfn);
    *lplpfn = NULL;
    return Detach();
}

/////////////////////////////////////////////////////////////////////////////
// The window procedure

WNDPROC AFXAPI AfxGetAfxWndProc()
{
    return &AfxWndProc;
}

LRESULT CALLBACK AfxWndProc(HWND hWnd, UINT nMsg, WPARAM wParam, LPARAM lParam)
{
    if (nMsg == WM_QUERYAFXWNDPROC)
        return 1;

    CWnd* pWnd = CWnd::FromHandlePermanent(hWnd);
    if (pWnd == NULL || pWnd->m_hWnd != hWnd)
        return ::DefWindowProc(hWnd, nMsg, wParam, lParam);
    return AfxCallWndProc(pWnd, hWnd, nMsg, wParam, lParam);
}

// A top-level dialog that did not move itself in WM_INITDIALOG is centred over
// its (disabled) owner, as a modal dialog should be.
static void AfxPostInitDialog(CWnd* pWnd, const RECT& rectOld, DWORD dwStyleOld)
{
    if (dwStyleOld & WS_VISIBLE)
        return;
    if (pWnd->GetStyle() & (WS_VISIBLE | WS_CHILD))
        return;
    RECT rect;
    pWnd->GetWindowRect(&rect);
    if (rectOld.left != rect.left || rectOld.top != rect.top)
        return;
    HWND hWndOwner = ::GetWindow(pWnd->m_hWnd, GW_OWNER);
    if (hWndOwner != NULL && ::IsWindowEnabled(hWndOwner))
        return;
    if (pWnd->IsKindOf(RUNTIME_CLASS(CDialog)) && !((CDialog*)pWnd)->CheckAutoCenter())
        return;
    pWnd->CenterWindow();
}

LRESULT AFXAPI AfxCallWndProc(CWnd* pWnd, HWND hWnd, UINT nMsg, WPARAM wParam, LPARAM lParam)
{
    _AFX_THREAD_STATE* pThreadState = AfxGetThreadState();
    MSG oldState = pThreadState->m_lastSentMsg;     // save for nesting
    pThreadState->m_lastSentMsg.hwnd = hWnd;
    pThreadState->m_lastSentMsg.message = nMsg;
    pThreadState->m_lastSentMsg.wParam = wParam;
    pThreadState->m_lastSentMsg.lParam = lParam;

    LRESULT lResult = 0;
    TRY
    {
        RECT rectOld = { 0, 0, 0, 0 };
        DWORD dwStyle = 0;
        if (nMsg == WM_INITDIALOG)
        {
            pWnd->GetWindowRect(&rectOld);
            dwStyle = pWnd->GetStyle();
        }

        lResult = pWnd->WindowProc(nMsg, wParam, lParam);

        if (nMsg == WM_INITDIALOG && ::IsWindow(hWnd))
            AfxPostInitDialog(pWnd, rectOld, dwStyle);
    }
    CATCH_ALL(e)
    {
        // An exception must not unwind through the system's frames.
        CWinThread* pWinThread = AfxGetThread();
        if (pWinThread != NULL)
            lResult = pWinThread->ProcessWndProcException(e, &pThreadState->m_lastSentMsg);
    }
    END_CATCH_ALL

    pThreadState->m_lastSentMsg = oldState;
    return lResult;
}

const MSG* PASCAL CWnd::GetCurrentMessage()
{
    _AFX_THREAD_STATE* pThreadState = AfxGetThreadState();
    pThreadState->m_lastSentMsg.time = (DWORD)::GetMessageTime();
    DWORD dwPos = ::GetMessagePos();
    pThreadState->m_lastSentMsg.pt.x = GET_X_LPARAM(dwPos);
    pThreadState->m_lastSentMsg.pt.y = GET_Y_LPARAM(dwPos);
    return &pThreadState->m_lastSentMsg;
}

LRESULT CWnd::Default()
{
    _AFX_THREAD_STATE* pThreadState = AfxGetThreadState();
    return DefWindowProc(pThreadState->m_lastSentMsg.message,
        pThreadState->m_lastSentMsg.wParam, pThreadState->m_lastSentMsg.lParam);
}

LRESULT CWnd::DefWindowProc(UINT nMsg, WPARAM wParam, LPARAM lParam)
{
    WNDPROC pfnWndProc = *GetSuperWndProcAddr();
    if (pfnWndProc == NULL)
        return ::DefWindowProc(m_hWnd, nMsg, wParam, lParam);
    return ::CallWindowProc(pfnWndProc, m_hWnd, nMsg, wParam, lParam);
}

LRESULT CWnd::WindowProc(UINT message, WPARAM wParam, LPARAM lParam)
{
    LRESULT lResult = 0;
    if (!OnWndMsg(message, wParam, lParam, &lResult))
        lResult = DefWindowProc(message, wParam, lParam);
    return lResult;
}

/////////////////////////////////////////////////////////////////////////////
// Message map dispatch

static CPoint PointFromLParam(LPARAM lParam)
{
    return CPoint(GET_X_LPARAM(lParam), GET_Y_LPARAM(lParam));
}

// Unpacks wParam/lParam for the handler's signature and calls it.
static BOOL DispatchWndMsg(CWnd* pThis, const AFX_MSGMAP_ENTRY* lpEntry, UINT_PTR nSig,
    WPARAM wParam, LPARAM lParam, LRESULT& lResult)
{
    AFX_PMSG pfn = lpEntry->pfn;
    lResult = 0;
    switch (nSig)
    {
    case AfxSig_bD:
        lResult = (pThis->*AfxWndHandler<BOOL (CWnd::*)(CDC*)>(pfn))(AfxDCFromHandle((HDC)wParam));
        break;
    case AfxSig_bb:
        lResult = (pThis->*AfxWndHandler<BOOL (CWnd::*)(BOOL)>(pfn))((BOOL)wParam);
        break;
    case AfxSig_bWww:
        lResult = (pThis->*AfxWndHandler<BOOL (CWnd::*)(CWnd*, UINT, UINT)>(pfn))(
            CWnd::FromHandle((HWND)wParam), LOWORD(lParam), HIWORD(lParam));
        break;
    case AfxSig_hDWw:
        {
            AFX_CTLCOLOR* pCtl = (AFX_CTLCOLOR*)lParam;
            lResult = (LRESULT)(pThis->*AfxWndHandler<HBRUSH (CWnd::*)(CDC*, CWnd*, UINT)>(pfn))(
                AfxDCFromHandle(pCtl->hDC), CWnd::FromHandle(pCtl->hWnd), pCtl->nCtlType);
        }
        break;
    case AfxSig_hDw:
        {
            AFX_CTLCOLOR* pCtl = (AFX_CTLCOLOR*)lParam;
            lResult = (LRESULT)(pThis->*AfxWndHandler<HBRUSH (CWnd::*)(CDC*, UINT)>(pfn))(
                AfxDCFromHandle(pCtl->hDC), pCtl->nCtlType);
        }
        break;
    case AfxSig_iwWw:
        lResult = (pThis->*AfxWndHandler<int (CWnd::*)(UINT, CWnd*, UINT)>(pfn))(
            LOWORD(wParam), CWnd::FromHandle((HWND)lParam), HIWORD(wParam));
        break;
    case AfxSig_is:
        lResult = (pThis->*AfxWndHandler<int (CWnd::*)(void*)>(pfn))((void*)lParam);
        break;
    case AfxSig_iis:
        lResult = (pThis->*AfxWndHandler<int (CWnd::*)(int, void*)>(pfn))((int)wParam, (void*)lParam);
        break;
    case AfxSig_lwl:
        lResult = (pThis->*AfxWndHandler<LRESULT (CWnd::*)(WPARAM, LPARAM)>(pfn))(wParam, lParam);
        break;
    case AfxSig_l_p:
        lResult = (pThis->*AfxWndHandler<LRESULT (CWnd::*)(CPoint)>(pfn))(PointFromLParam(lParam));
        break;
    case AfxSig_vv:
        (pThis->*AfxWndHandler<void (CWnd::*)()>(pfn))();
        break;
    case AfxSig_vw:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT)>(pfn))((UINT)wParam);
        break;
    case AfxSig_vb:
        (pThis->*AfxWndHandler<void (CWnd::*)(BOOL)>(pfn))((BOOL)wParam);
        break;
    case AfxSig_vt:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT_PTR)>(pfn))((UINT_PTR)wParam);
        break;
    case AfxSig_vwwx:
        // reflected scrolling: the code and the position, without the scroll bar
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, UINT)>(pfn))(LOWORD(wParam), HIWORD(wParam));
        break;
    case AfxSig_vbw:
        (pThis->*AfxWndHandler<void (CWnd::*)(BOOL, UINT)>(pfn))((BOOL)wParam, (UINT)lParam);
        break;
    case AfxSig_vvii:
        (pThis->*AfxWndHandler<void (CWnd::*)(int, int)>(pfn))(GET_X_LPARAM(lParam), GET_Y_LPARAM(lParam));
        break;
    case AfxSig_vwww:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, UINT, UINT)>(pfn))(
            (UINT)wParam, LOWORD(lParam), HIWORD(lParam));
        break;
    case AfxSig_vwii:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, int, int)>(pfn))(
            (UINT)wParam, LOWORD(lParam), HIWORD(lParam));
        break;
    case AfxSig_vwl:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, LPARAM)>(pfn))((UINT)wParam, lParam);
        break;
    case AfxSig_vW:
        (pThis->*AfxWndHandler<void (CWnd::*)(CWnd*)>(pfn))(CWnd::FromHandle((HWND)wParam));
        break;
    case AfxSig_vW2:
        (pThis->*AfxWndHandler<void (CWnd::*)(CWnd*)>(pfn))(CWnd::FromHandle((HWND)lParam));
        break;
    case AfxSig_vWp:
        (pThis->*AfxWndHandler<void (CWnd::*)(CWnd*, CPoint)>(pfn))(
            CWnd::FromHandle((HWND)wParam), PointFromLParam(lParam));
        break;
    case AfxSig_vwWb:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, CWnd*, BOOL)>(pfn))(
            LOWORD(wParam), CWnd::FromHandle((HWND)lParam), (BOOL)HIWORD(wParam));
        break;
    case AfxSig_vwwW:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, UINT, CScrollBar*)>(pfn))(
            LOWORD(wParam), HIWORD(wParam), (CScrollBar*)CWnd::FromHandle((HWND)lParam));
        break;
    case AfxSig_vwp:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, CPoint)>(pfn))((UINT)wParam, PointFromLParam(lParam));
        break;
    case AfxSig_bwsp:
        lResult = (pThis->*AfxWndHandler<BOOL (CWnd::*)(UINT, short, CPoint)>(pfn))(
            LOWORD(wParam), (short)HIWORD(wParam), PointFromLParam(lParam));
        break;
    case AfxSig_vws:
        (pThis->*AfxWndHandler<void (CWnd::*)(UINT, LPCTSTR)>(pfn))((UINT)wParam, (LPCTSTR)lParam);
        break;
    case AfxSig_vs:
        (pThis->*AfxWndHandler<void (CWnd::*)(void*)>(pfn))((void*)lParam);
        break;
    case AfxSig_vOWNER:
        (pThis->*AfxWndHandler<void (CWnd::*)(int, void*)>(pfn))((int)wParam, (void*)lParam);
        lResult = TRUE;
        break;
    case AfxSig_wv:
        lResult = (pThis->*AfxWndHandler<UINT (CWnd::*)()>(pfn))();
        break;
    case AfxSig_bv:
        lResult = (pThis->*AfxWndHandler<BOOL (CWnd::*)()>(pfn))();
        break;
    case AfxSig_vCALC:
        (pThis->*AfxWndHandler<void (CWnd::*)(BOOL, NCCALCSIZE_PARAMS*)>(pfn))(
            (BOOL)wParam, (NCCALCSIZE_PARAMS*)lParam);
        break;
    case AfxSig_bHELPINFO:
        lResult = (pThis->*AfxWndHandler<BOOL (CWnd::*)(HELPINFO*)>(pfn))((HELPINFO*)lParam);
        break;
    default:
        return FALSE;
    }
    return TRUE;
}

BOOL CWnd::OnWndMsg(UINT message, WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    LRESULT lResult = 0;

    // Commands and notifications are routed by id through OnCmdMsg.
    if (message == WM_COMMAND)
    {
        if (!OnCommand(wParam, lParam))
            return FALSE;
        if (pResult != NULL)
            *pResult = 1;
        return TRUE;
    }
    if (message == WM_NOTIFY)
    {
        NMHDR* pNMHDR = (NMHDR*)lParam;
        if (pNMHDR == NULL || pNMHDR->hwndFrom == NULL || !OnNotify(wParam, lParam, &lResult))
            return FALSE;
        if (pResult != NULL)
            *pResult = lResult;
        return TRUE;
    }

    const AFX_MSGMAP_ENTRY* lpEntry = NULL;
    UINT_PTR nSig = AfxSig_end;
    for (const AFX_MSGMAP* pMessageMap = GetMessageMap(); pMessageMap != NULL && lpEntry == NULL;
         pMessageMap = (*pMessageMap->pfnGetBaseMap)())
    {
        if (message < 0xC000)
        {
            lpEntry = AfxFindMessageEntry(pMessageMap->lpEntries, message, 0, 0);
            if (lpEntry != NULL)
                nSig = lpEntry->nSig;
        }
        else
        {
            // Registered messages: nSig points at the variable holding the number.
            for (const AFX_MSGMAP_ENTRY* p = pMessageMap->lpEntries; p->nSig != AfxSig_end; ++p)
            {
                if (p->nMessage == 0xC000 && *(const UINT*)p->nSig == message)
                {
                    lpEntry = p;
                    nSig = AfxSig_lwl;
                    break;
                }
            }
        }
    }

    if (lpEntry == NULL)
    {
        // The Win32 control-colour messages reach the map as WM_CTLCOLOR.
        if (message >= WM_CTLCOLORMSGBOX && message <= WM_CTLCOLORSTATIC)
        {
            AFX_CTLCOLOR ctl;
            ctl.hWnd = (HWND)lParam;
            ctl.hDC = (HDC)wParam;
            ctl.nCtlType = message - WM_CTLCOLORMSGBOX;
            return OnWndMsg(WM_CTLCOLOR, 0, (LPARAM)&ctl, pResult);
        }
        return FALSE;
    }

    if (!DispatchWndMsg(this, lpEntry, nSig, wParam, lParam, lResult))
        return FALSE;
    if (pResult != NULL)
        *pResult = lResult;
    return TRUE;
}

BOOL CWnd::OnCmdMsg(UINT nID, int nCode, void* pExtra, AFX_CMDHANDLERINFO* pHandlerInfo)
{
    return CCmdTarget::OnCmdMsg(nID, nCode, pExtra, pHandlerInfo);
}

BOOL CWnd::OnCommand(WPARAM wParam, LPARAM lParam)
{
    UINT nID = LOWORD(wParam);
    HWND hWndCtrl = (HWND)lParam;
    int nCode = HIWORD(wParam);

    if (hWndCtrl == NULL)
    {
        // menu or accelerator: zero ids are not commands
        if (nID == 0)
            return FALSE;
        // a command whose user-interface item went disabled is not routed
        struct CTestCmdUI : CCmdUI
        {
            BOOL m_bEnabled = TRUE;
            void Enable(BOOL bOn) override { m_bEnabled = bOn; m_bEnableChanged = TRUE; }
            void SetCheck(int) override {}
            void SetRadio(BOOL) override {}
            void SetText(LPCTSTR) override {}
        } test;
        test.m_nID = nID;
        OnCmdMsg(nID, (int)CN_UPDATE_COMMAND_UI, &test, NULL);
        if (!test.m_bEnabled)
            return TRUE;
        nCode = CN_COMMAND;
    }
    else
    {
        // control notification; UpdateData locks them out of its window
        if (AfxGetThreadState()->m_hLockoutNotifyWindow == m_hWnd)
            return TRUE;
        // the control may handle its own notification
        if (ReflectLastMsg(hWndCtrl))
            return TRUE;
        if (nID == 0)
            return FALSE;
    }
    return OnCmdMsg(nID, nCode, NULL, NULL);
}

BOOL CWnd::OnNotify(WPARAM, LPARAM lParam, LRESULT* pResult)
{
    NMHDR* pNMHDR = (NMHDR*)lParam;
    HWND hWndCtrl = pNMHDR->hwndFrom;
    UINT nID = (UINT)::GetDlgCtrlID(hWndCtrl);
    int nCode = (int)pNMHDR->code;

    if (AfxGetThreadState()->m_hLockoutNotifyWindow == m_hWnd)
        return TRUE;
    if (ReflectLastMsg(hWndCtrl, pResult))
        return TRUE;

    AFX_NOTIFY notify;
    notify.pResult = pResult;
    notify.pNMHDR = pNMHDR;
    return OnCmdMsg(nID, MAKELONG(nCode, WM_NOTIFY), &notify, NULL);
}

/////////////////////////////////////////////////////////////////////////////
// Reflection: the parent offers a control's notification to the control first.

BOOL PASCAL CWnd::ReflectLastMsg(HWND hWndChild, LRESULT* pResult)
{
    CWnd* pWnd = CWnd::FromHandlePermanent(hWndChild);
    if (pWnd == NULL)
        return FALSE;
    return pWnd->SendChildNotifyLastMsg(pResult);
}

BOOL CWnd::SendChildNotifyLastMsg(LRESULT* pResult)
{
    const MSG& msg = AfxGetThreadState()->m_lastSentMsg;
    return OnChildNotify(msg.message, msg.wParam, msg.lParam, pResult);
}

BOOL CWnd::OnChildNotify(UINT uMsg, WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    return ReflectChildNotify(uMsg, wParam, lParam, pResult);
}

BOOL CWnd::ReflectChildNotify(UINT uMsg, WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    switch (uMsg)
    {
    case WM_HSCROLL:
    case WM_VSCROLL:
    case WM_PARENTNOTIFY:
    case WM_DRAWITEM:
    case WM_MEASUREITEM:
    case WM_DELETEITEM:
    case WM_VKEYTOITEM:
    case WM_CHARTOITEM:
    case WM_COMPAREITEM:
        // through the map as WM_REFLECT_BASE + message
        return CWnd::OnWndMsg(WM_REFLECT_BASE + uMsg, wParam, lParam, pResult);

    case WM_COMMAND:
        {
            int nCode = HIWORD(wParam);
            if (CWnd::OnCmdMsg(0, MAKELONG(nCode, WM_REFLECT_BASE + WM_COMMAND), NULL, NULL))
            {
                if (pResult != NULL)
                    *pResult = 1;
                return TRUE;
            }
        }
        break;

    case WM_NOTIFY:
        {
            NMHDR* pNMHDR = (NMHDR*)lParam;
            if (pNMHDR == NULL)
                return FALSE;
            int nCode = (int)pNMHDR->code;
            AFX_NOTIFY notify;
            LRESULT lResultDummy = 0;
            notify.pResult = pResult != NULL ? pResult : &lResultDummy;
            notify.pNMHDR = pNMHDR;
            return CWnd::OnCmdMsg(0, MAKELONG(nCode, WM_REFLECT_BASE + WM_NOTIFY), &notify, NULL);
        }

    default:
        if (uMsg >= WM_CTLCOLORMSGBOX && uMsg <= WM_CTLCOLORSTATIC)
        {
            AFX_CTLCOLOR ctl;
            ctl.hDC = (HDC)wParam;
            ctl.nCtlType = uMsg - WM_CTLCOLORMSGBOX;
            ctl.hWnd = (HWND)lParam;
            LRESULT lResult = 0;
            BOOL bResult = CWnd::OnWndMsg(WM_REFLECT_BASE + WM_CTLCOLOR, 0, (LPARAM)&ctl, &lResult);
            if ((HBRUSH)lResult == NULL)
                bResult = FALSE;    // no brush: the parent decides
            if (bResult && pResult != NULL)
                *pResult = lResult;
            return bResult;
        }
        break;
    }
    return FALSE;
}

/////////////////////////////////////////////////////////////////////////////
// CWnd's own handlers: reflection first, then the original procedure

HBRUSH CWnd::OnCtlColor(CDC*, CWnd* pWnd, UINT)
{
    LRESULT lResult = 0;
    if (pWnd != NULL && pWnd->SendChildNotifyLastMsg(&lResult))
        return (HBRUSH)lResult;
    return (HBRUSH)Default();
}

void CWnd::OnDrawItem(int, LPDRAWITEMSTRUCT lpDrawItemStruct)
{
    if (lpDrawItemStruct != NULL && lpDrawItemStruct->CtlType != ODT_MENU
        && ReflectLastMsg(lpDrawItemStruct->hwndItem))
        return;
    Default();
}

void CWnd::OnMeasureItem(int, LPMEASUREITEMSTRUCT lpMeasureItemStruct)
{
    if (lpMeasureItemStruct != NULL && lpMeasureItemStruct->CtlType != ODT_MENU)
    {
        CWnd* pChild = GetDescendantWindow((int)lpMeasureItemStruct->CtlID, TRUE);
        if (pChild != NULL && pChild->SendChildNotifyLastMsg())
            return;
    }
    Default();
}

int CWnd::OnCompareItem(int, LPCOMPAREITEMSTRUCT lpCompareItemStruct)
{
    LRESULT lResult = 0;
    if (lpCompareItemStruct != NULL && ReflectLastMsg(lpCompareItemStruct->hwndItem, &lResult))
        return (int)lResult;
    return (int)Default();
}

void CWnd::OnDeleteItem(int, LPDELETEITEMSTRUCT lpDeleteItemStruct)
{
    if (lpDeleteItemStruct != NULL && ReflectLastMsg(lpDeleteItemStruct->hwndItem))
        return;
    Default();
}

int CWnd::OnCharToItem(UINT, CListBox* pWnd, UINT)
{
    LRESULT lResult = 0;
    if (pWnd != NULL && ReflectLastMsg(((CWnd*)pWnd)->m_hWnd, &lResult))
        return (int)lResult;
    return (int)Default();
}

int CWnd::OnVKeyToItem(UINT, CListBox* pWnd, UINT)
{
    LRESULT lResult = 0;
    if (pWnd != NULL && ReflectLastMsg(((CWnd*)pWnd)->m_hWnd, &lResult))
        return (int)lResult;
    return (int)Default();
}

void CWnd::OnHScroll(UINT, UINT, CScrollBar* pScrollBar)
{
    if (pScrollBar != NULL && ReflectLastMsg(((CWnd*)pScrollBar)->m_hWnd))
        return;
    Default();
}

void CWnd::OnVScroll(UINT, UINT, CScrollBar* pScrollBar)
{
    if (pScrollBar != NULL && ReflectLastMsg(((CWnd*)pScrollBar)->m_hWnd))
        return;
    Default();
}

void CWnd::OnParentNotify(UINT message, LPARAM lParam)
{
    if ((LOWORD(message) == WM_CREATE || LOWORD(message) == WM_DESTROY)
        && ReflectLastMsg((HWND)lParam))
        return;
    Default();
}

// The last message a window gets: the object lets go of the handle and may
// delete itself in PostNcDestroy.
void CWnd::OnNcDestroy()
{
    CWinThread* pThread = AfxGetThread();
    if (pThread != NULL)
    {
        if (pThread->m_pMainWnd == this)
        {
            // closing the main window of a running thread ends the thread
            if (pThread->m_nThreadID == ::GetCurrentThreadId())
                AfxPostQuitMessage(0);
            pThread->m_pMainWnd = NULL;
        }
        if (pThread->m_pActiveWnd == this)
            pThread->m_pActiveWnd = NULL;
    }

    // the drop target lets go of the window before it goes
    if (m_pDropTarget != NULL)
    {
        m_pDropTarget->Revoke();
        m_pDropTarget = NULL;
    }

    WNDPROC pfnWndProc = (WNDPROC)::GetWindowLongPtr(m_hWnd, GWLP_WNDPROC);
    Default();
    if ((WNDPROC)::GetWindowLongPtr(m_hWnd, GWLP_WNDPROC) == pfnWndProc)
    {
        WNDPROC pfnSuper = *GetSuperWndProcAddr();
        if (pfnSuper != NULL)
            ::SetWindowLongPtr(m_hWnd, GWLP_WNDPROC, (LONG_PTR)pfnSuper);
    }
    Detach();
    PostNcDestroy();
}

void CWnd::PostNcDestroy()
{
}

/////////////////////////////////////////////////////////////////////////////
// Message pre-translation

BOOL CWnd::PreTranslateMessage(MSG*)
{
    return FALSE;
}

// Offers the message to each framework object from its window up to hWndStop.
// ::GetParent leads from a pop-up to its owner, so a dialog's controls, the dialog
// and the window that owns it all get their look.
BOOL PASCAL CWnd::WalkPreTranslateTree(HWND hWndStop, MSG* pMsg)
{
    for (HWND hWnd = pMsg->hwnd; hWnd != NULL; hWnd = ::GetParent(hWnd))
    {
        CWnd* pWnd = CWnd::FromHandlePermanent(hWnd);
        if (pWnd != NULL && pWnd->PreTranslateMessage(pMsg))
            return TRUE;
        if (hWnd == hWndStop)
            break;
    }
    return FALSE;
}

HWND AFXAPI AfxGetTopLevelWindow(HWND hWnd)
{
    while (hWnd != NULL && (::GetWindowLongPtr(hWnd, GWL_STYLE) & WS_CHILD))
    {
        HWND hWndParent = ::GetParent(hWnd);
        if (hWndParent == NULL)
            break;
        hWnd = hWndParent;
    }
    return hWnd;
}

/////////////////////////////////////////////////////////////////////////////
// Modal loop

BOOL CWnd::ContinueModal()
{
    return (m_nFlags & WF_CONTINUEMODAL) != 0;
}

void CWnd::EndModalLoop(int nResult)
{
    m_nModalResult = nResult;
    if (m_nFlags & WF_CONTINUEMODAL)
    {
        m_nFlags &= ~WF_CONTINUEMODAL;
        PostMessage(WM_NULL);   // wakes the loop up
    }
}

void CWnd::BeginModalState()
{
}

void CWnd::EndModalState()
{
}

// Runs until EndModalLoop, or until the window is gone. The thread's
// PreTranslateMessage sees every message, so the controls' own pre-translation
// works inside the loop. As in MFC, temporary objects are not freed here but at
// the thread's next idle time: a handler of the modal window may keep a pointer
// from FromHandle for as long as the message it handles.
int CWnd::RunModalLoop(DWORD dwFlags)
{
    BOOL bIdle = TRUE;
    LONG lIdleCount = 0;
    BOOL bShowIdle = (dwFlags & MLF_SHOWONIDLE) && !(GetStyle() & WS_VISIBLE);
    HWND hWndParent = ::GetParent(m_hWnd);
    HWND hWndThis = m_hWnd;
    m_nFlags |= (WF_MODALLOOP | WF_CONTINUEMODAL);

    MSG* pMsg = &AfxGetThreadState()->m_msgCur;
    CWinThread* pThread = AfxGetThread();
    int nResult = -1;
    for (;;)
    {
        // phase 1: idle work while the queue is empty
        while (bIdle && !::PeekMessage(pMsg, NULL, 0, 0, PM_NOREMOVE))
        {
            if (bShowIdle)
            {
                ShowWindow(SW_SHOWNORMAL);
                UpdateWindow();
                bShowIdle = FALSE;
            }
            if (!(dwFlags & MLF_NOIDLEMSG) && hWndParent != NULL && lIdleCount == 0)
                ::SendMessage(hWndParent, WM_ENTERIDLE, MSGF_DIALOGBOX, (LPARAM)hWndThis);
            if ((dwFlags & MLF_NOKICKIDLE) || !::SendMessage(hWndThis, WM_KICKIDLE, MSGF_DIALOGBOX, lIdleCount++))
                bIdle = FALSE;
        }

        // phase 2: pump while messages are available
        do
        {
            BOOL bPumped = pThread != NULL ? pThread->PumpMessage() : FALSE;
            if (pThread == NULL)
            {
                // no thread object: the same pump, walking the tree directly
                bPumped = ::GetMessage(pMsg, NULL, 0, 0);
                if (bPumped && !CWnd::WalkPreTranslateTree(NULL, pMsg))
                {
                    ::TranslateMessage(pMsg);
                    ::DispatchMessage(pMsg);
                }
            }
            if (!bPumped)
            {
                AfxPostQuitMessage(0);
                goto ExitModal;
            }

            if (bShowIdle && (pMsg->message == 0x118 || pMsg->message == WM_SYSKEYDOWN))
            {
                ShowWindow(SW_SHOWNORMAL);
                UpdateWindow();
                bShowIdle = FALSE;
            }

            // A window destroyed from outside (with its owner, say) ends the loop too.
            if (!::IsWindow(hWndThis) || !ContinueModal())
            {
                nResult = m_nModalResult;
                goto ExitModal;
            }

            if (pThread != NULL ? pThread->IsIdleMessage(pMsg) : TRUE)
            {
                bIdle = TRUE;
                lIdleCount = 0;
            }
        } while (::PeekMessage(pMsg, NULL, 0, 0, PM_NOREMOVE));
    }

ExitModal:
    m_nFlags &= ~(WF_MODALLOOP | WF_CONTINUEMODAL);
    return nResult;
}
