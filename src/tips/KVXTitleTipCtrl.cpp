#include "KVXTitleTipCtrl.h"

#include "TipLayout.h"
#include "TipWindowSupport.h"

namespace {

const TCHAR kClassName[] = _T("ZTitleTip");

UINT NonClientButtonDown(UINT message)
{
    switch (message)
    {
    case WM_LBUTTONDOWN: return WM_NCLBUTTONDOWN;
    case WM_RBUTTONDOWN: return WM_NCRBUTTONDOWN;
    default: return WM_NCMBUTTONDOWN;
    }
}

} // namespace

KVXTitleTipCtrl::KVXTitleTipCtrl()
    : m_pParentWnd(NULL), m_rectHover(0, 0, 0, 0)
{
    TipWindowSupport::RegisterTipClass(kClassName);
}

KVXTitleTipCtrl::~KVXTitleTipCtrl()
{
}

BEGIN_MESSAGE_MAP(KVXTitleTipCtrl, CWnd)
    ON_WM_MOUSEMOVE()
    ON_WM_LBUTTONDOWN()
    ON_WM_MBUTTONDOWN()
    ON_WM_RBUTTONDOWN()
END_MESSAGE_MAP()

BOOL KVXTitleTipCtrl::Create(CWnd* pParentWnd)
{
    m_pParentWnd = pParentWnd;
    return TipWindowSupport::CreateTip(this, kClassName);
}

BOOL KVXTitleTipCtrl::PreCreateWindow(CREATESTRUCT& cs)
{
    // The class is the library's own, so the window must be created with its instance.
    if (!CWnd::PreCreateWindow(cs))
        return FALSE;
    cs.hInstance = TipWindowSupport::LibraryInstance();
    return TRUE;
}

void KVXTitleTipCtrl::Show(CRect rect, const wchar_t* text, int nTextOffset)
{
    CString strText;
    if (!TipWindowSupport::TextToShow(this, m_pParentWnd, text, strText))
        return;

    CRect rectScreen = rect;
    m_pParentWnd->ClientToScreen(&rectScreen);
    CClientDC dc(this);
    TipWindowSupport::TipFont font(dc, m_pParentWnd);
    TipLayout::DcTextMeasurer measurer(dc.m_hAttribDC);
    MONITORINFO mi = { sizeof(mi) };
    if (!::GetMonitorInfo(::MonitorFromPoint(rectScreen.TopLeft(), MONITOR_DEFAULTTONEAREST), &mi))
        return;

    const TipLayout::Placement placement = TipLayout::LayoutTitleTip(
        rectScreen, nTextOffset, strText, strText.GetLength(), mi.rcMonitor, measurer);
    // Written before the fit is known, as the list's next mouse move expects.
    m_rectHover = placement.hover;
    if (!placement.show)
        return;
    TipWindowSupport::ShowPlacement(this, dc, strText, placement);
    SetCapture();
}

BOOL KVXTitleTipCtrl::PreTranslateMessage(MSG* pMsg)
{
    switch (pMsg->message)
    {
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
        TipWindowSupport::Hide(this);
        if (m_pParentWnd != NULL)
            m_pParentWnd->PostMessage(pMsg->message, pMsg->wParam, pMsg->lParam);
        return TRUE;

    case WM_LBUTTONDOWN:
    case WM_RBUTTONDOWN:
    case WM_MBUTTONDOWN:
    {
        CPoint point(static_cast<short>(LOWORD(pMsg->lParam)), static_cast<short>(HIWORD(pMsg->lParam)));
        ClientToScreen(&point);
        CWnd* pTarget = TipWindowSupport::WindowUnder(this, m_pParentWnd, point);
        if (pTarget == NULL)
        {
            TipWindowSupport::Hide(this);
            return TRUE;
        }
        const LRESULT nHitTest = pTarget->SendMessage(WM_NCHITTEST, 0, MAKELPARAM(point.x, point.y));
        if (nHitTest == HTCLIENT)
        {
            pTarget->ScreenToClient(&point);
            pMsg->lParam = MAKELPARAM(point.x, point.y);
        }
        else
        {
            pMsg->message = NonClientButtonDown(pMsg->message);
            pMsg->wParam = static_cast<WPARAM>(nHitTest);
            pMsg->lParam = MAKELPARAM(point.x, point.y);
        }
        TipWindowSupport::Hide(this);
        pTarget->PostMessage(pMsg->message, pMsg->wParam, pMsg->lParam);
        return TRUE;
    }

    default:
        if (CWnd::GetFocus() == NULL)
        {
            TipWindowSupport::Hide(this);
            return TRUE;
        }
        return CWnd::PreTranslateMessage(pMsg);
    }
}

void KVXTitleTipCtrl::OnMouseMove(UINT nFlags, CPoint point)
{
    // Held buttons or keys do not hide the title tip: only leaving the cell does.
    if (m_rectHover.PtInRect(point))
        return;
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverMouseMove(this, m_pParentWnd, nFlags, point);
}

void KVXTitleTipCtrl::OnLButtonDown(UINT nFlags, CPoint point)
{
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverClick(this, m_pParentWnd, WM_LBUTTONDOWN, nFlags, point);
}

void KVXTitleTipCtrl::OnMButtonDown(UINT nFlags, CPoint point)
{
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverClick(this, m_pParentWnd, WM_MBUTTONDOWN, nFlags, point);
}

void KVXTitleTipCtrl::OnRButtonDown(UINT nFlags, CPoint point)
{
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverClick(this, m_pParentWnd, WM_RBUTTONDOWN, nFlags, point);
}
