#include "KVXToolTipCtrl.h"

#include "TipLayout.h"
#include "TipWindowSupport.h"

namespace {

const TCHAR kClassName[] = _T("ZKVXToolTip");

} // namespace

KVXToolTipCtrl::KVXToolTipCtrl()
    : m_pParentWnd(NULL), m_rectHover(0, 0, 0, 0)
{
    TipWindowSupport::RegisterTipClass(kClassName);
}

KVXToolTipCtrl::~KVXToolTipCtrl()
{
}

BEGIN_MESSAGE_MAP(KVXToolTipCtrl, CWnd)
    ON_WM_MOUSEMOVE()
    ON_WM_LBUTTONDOWN()
    ON_WM_MBUTTONDOWN()
    ON_WM_RBUTTONDOWN()
END_MESSAGE_MAP()

BOOL KVXToolTipCtrl::Create(CWnd* pParentWnd)
{
    m_pParentWnd = pParentWnd;
    return TipWindowSupport::CreateTip(this, kClassName);
}

BOOL KVXToolTipCtrl::PreCreateWindow(CREATESTRUCT& cs)
{
    // The class is the library's own, so the window must be created with its instance.
    if (!CWnd::PreCreateWindow(cs))
        return FALSE;
    cs.hInstance = TipWindowSupport::LibraryInstance();
    return TRUE;
}

void KVXToolTipCtrl::Show(CRect rect, CPoint point, const wchar_t* text, bool bShowAlways)
{
    CString strText;
    if (!TipWindowSupport::TextToShow(this, m_pParentWnd, text, strText))
        return;

    CClientDC dc(this);
    TipWindowSupport::TipFont font(dc, m_pParentWnd);
    TipLayout::DcTextMeasurer measurer(dc.m_hAttribDC);

    CRect rectScreen = rect;
    CPoint pointScreen = point;
    m_pParentWnd->ClientToScreen(&rectScreen);
    m_pParentWnd->ClientToScreen(&pointScreen);
    MONITORINFO mi = { sizeof(mi) };
    if (!::GetMonitorInfo(::MonitorFromRect(&rectScreen, MONITOR_DEFAULTTONEAREST), &mi))
        return;

    const TipLayout::Placement placement = TipLayout::LayoutToolTip(
        rectScreen, pointScreen, strText, strText.GetLength(), bShowAlways, mi.rcMonitor, measurer);
    if (!placement.show)
        return;
    TipWindowSupport::ShowPlacement(this, dc, strText, placement);
    m_rectHover = placement.hover;
    SetCapture();
}

void KVXToolTipCtrl::Hide()
{
    TipWindowSupport::Hide(this);
}

void KVXToolTipCtrl::OnMouseMove(UINT nFlags, CPoint point)
{
    if (nFlags == 0 && m_rectHover.PtInRect(point))
        return;
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverMouseMove(this, m_pParentWnd, nFlags, point);
}

void KVXToolTipCtrl::OnLButtonDown(UINT nFlags, CPoint point)
{
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverClick(this, m_pParentWnd, WM_LBUTTONDOWN, nFlags, point);
}

void KVXToolTipCtrl::OnMButtonDown(UINT nFlags, CPoint point)
{
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverClick(this, m_pParentWnd, WM_MBUTTONDOWN, nFlags, point);
}

void KVXToolTipCtrl::OnRButtonDown(UINT nFlags, CPoint point)
{
    TipWindowSupport::Hide(this);
    TipWindowSupport::HandOverClick(this, m_pParentWnd, WM_RBUTTONDOWN, nFlags, point);
}
