#include "TipWindowSupport.h"

namespace TipWindowSupport {

namespace {

// Any object of the library will do to find its module.
const char s_moduleAnchor = 0;

} // namespace

HINSTANCE LibraryInstance()
{
    HMODULE hModule = NULL;
    ::GetModuleHandleExW(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                         reinterpret_cast<LPCWSTR>(&s_moduleAnchor), &hModule);
    return hModule;
}

void RegisterTipClass(LPCTSTR lpszClassName)
{
    const HINSTANCE hInstance = LibraryInstance();
    WNDCLASS wndcls;
    if (::GetClassInfo(hInstance, lpszClassName, &wndcls))
        return;
    memset(&wndcls, 0, sizeof(wndcls));
    wndcls.style = CS_SAVEBITS;
    wndcls.lpfnWndProc = ::DefWindowProc;
    wndcls.hInstance = hInstance;
    wndcls.hCursor = ::LoadCursor(NULL, IDC_ARROW);
    wndcls.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_INFOBK + 1);
    wndcls.lpszClassName = lpszClassName;
    if (!AfxRegisterClass(&wndcls))
        AfxThrowResourceException();
}

TipFont::TipFont(CDC& dc, CWnd* pOwner)
    : m_dc(dc), m_pOldFont(NULL)
{
    CFont* pFont = NULL;
    HFONT hFont = pOwner != NULL ? reinterpret_cast<HFONT>(pOwner->SendMessage(WM_GETFONT)) : NULL;
    if (hFont != NULL)
    {
        pFont = CFont::FromHandle(hFont);
    }
    else
    {
        LOGFONT lf;
        memset(&lf, 0, sizeof(lf));
        lf.lfHeight = -11;
        lf.lfWeight = FW_NORMAL;
        lstrcpyn(lf.lfFaceName, _T("MS Shell Dlg"), LF_FACESIZE);
        if (m_fontTemporary.CreateFontIndirect(&lf))
            pFont = &m_fontTemporary;
    }
    if (pFont != NULL)
        m_pOldFont = m_dc.SelectObject(pFont);
}

TipFont::~TipFont()
{
    if (m_pOldFont != NULL)
        m_dc.SelectObject(m_pOldFont);
}

void ShowPlacement(CWnd* pTip, CDC& dc, const CString& strText, const TipLayout::Placement& placement)
{
    const RECT& rc = placement.window;
    pTip->SetWindowPos(&CWnd::wndTop, rc.left, rc.top, rc.right - rc.left, rc.bottom - rc.top,
                       SWP_SHOWWINDOW | SWP_NOACTIVATE);
    dc.SetBkMode(TRANSPARENT);
    if (!placement.wrapped)
    {
        dc.TextOut(0, 0, strText);
        return;
    }
    const LPCTSTR pszText = strText;
    int y = 0;
    for (const TipLayout::Line& line : placement.lines)
    {
        dc.TextOut(0, y, pszText + line.start, line.length);
        y += line.height;
    }
}

BOOL CreateTip(CWnd* pTip, LPCTSTR lpszClassName)
{
    return pTip->CreateEx(WS_EX_TOPMOST | WS_EX_TOOLWINDOW, lpszClassName, NULL, WS_POPUP | WS_BORDER,
                          0, 0, 0, 0, NULL, NULL);
}

bool TextToShow(CWnd* pTip, CWnd* pOwner, const wchar_t* text, CString& strText)
{
    if (pTip->m_hWnd == NULL || pOwner == NULL || pTip->IsWindowVisible())
        return false;
    if (CWnd::GetFocus() == NULL)
        return false;   // tips only appear in the active application
    strText = text != NULL ? text : L"";
    return !strText.IsEmpty();
}

void Hide(CWnd* pTip)
{
    ::ReleaseCapture();
    pTip->ShowWindow(SW_HIDE);
}

CWnd* WindowUnder(CWnd* pTip, CWnd* pOwner, CPoint ptScreen)
{
    CWnd* pWnd = CWnd::WindowFromPoint(ptScreen);
    if (pWnd != NULL && pWnd->m_hWnd == pTip->m_hWnd)
        pWnd = pOwner;
    return pWnd;
}

void HandOverMouseMove(CWnd* pTip, CWnd* pOwner, UINT nFlags, CPoint point)
{
    CPoint ptScreen = point;
    pTip->ClientToScreen(&ptScreen);
    CWnd* pTarget = WindowUnder(pTip, pOwner, ptScreen);
    if (pTarget == NULL)
        return;
    const LRESULT nHitTest = pTarget->SendMessage(WM_NCHITTEST, 0, MAKELPARAM(ptScreen.x, ptScreen.y));
    if (nHitTest == HTCLIENT)
    {
        CPoint ptClient = ptScreen;
        pTarget->ScreenToClient(&ptClient);
        pTarget->PostMessage(WM_MOUSEMOVE, nFlags, MAKELPARAM(ptClient.x, ptClient.y));
    }
    else
    {
        pTarget->PostMessage(WM_NCMOUSEMOVE, static_cast<WPARAM>(nHitTest), MAKELPARAM(ptScreen.x, ptScreen.y));
    }
}

void HandOverClick(CWnd* pTip, CWnd* pOwner, UINT message, UINT nFlags, CPoint point)
{
    if (pOwner == NULL)
        return;
    CPoint pt = point;
    pTip->ClientToScreen(&pt);
    pOwner->ScreenToClient(&pt);
    pOwner->PostMessage(message, nFlags, MAKELPARAM(pt.x, pt.y));
}

} // namespace TipWindowSupport
