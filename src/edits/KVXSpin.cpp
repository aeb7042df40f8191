#include "KVXSpin.h"

#include "KVXNumericEdit.h"
#include "SpinGeometry.h"
#include "resource.h"

using SpinGeometry::SpinArea;

/////////////////////////////////////////////////////////////////////////////
// Constructors

KVXSpin::KVXSpin()
    : m_rcClient(0, 0, 0, 0),
      m_pParentWnd(NULL),
      m_pNumericEdit(NULL),
      m_ptPress(0, 0),
      m_nTimerTicks(0),
      m_bCaptured(FALSE),
      m_bSpinUp(FALSE),
      m_bSliding(FALSE),
      m_bUpPressed(FALSE),
      m_bDownPressed(FALSE),
      m_bSliderCursor(FALSE),
      m_bTimerRunning(FALSE),
      m_bEnabled(TRUE),
      m_bKeyDown(false),
      m_hWndBuddy(NULL)
{
}

KVXSpin::~KVXSpin()
{
}

BOOL KVXSpin::Create(CWnd* pParentWnd, KVXNumericEdit* pNumericEdit, CRect rect)
{
    m_pParentWnd = pParentWnd;
    m_pNumericEdit = pNumericEdit;
    m_hWndBuddy = pNumericEdit != NULL ? pNumericEdit->GetSafeHwnd() : NULL;
    if (pNumericEdit == NULL || pParentWnd == NULL)
        return FALSE;
    // A live window is not replaced: the old one would be orphaned.
    if (::IsWindow(m_hWnd))
        return FALSE;

    // A new window starts idle, whatever the previous one was doing when it died.
    m_nTimerTicks = 0;
    m_bCaptured = m_bSliding = m_bUpPressed = m_bDownPressed = FALSE;
    m_bSliderCursor = m_bTimerRunning = FALSE;
    m_bKeyDown = false;

    // No class name: the framework's default class, which delivers double clicks.
    const BOOL bCreated = CWnd::Create(NULL, _T(""), WS_CHILD | WS_VISIBLE | WS_BORDER, rect, pParentWnd, 0);
    if (bCreated && ::IsWindow(m_hWndBuddy) && !pNumericEdit->IsWindowEnabled())
        EnableWindow(FALSE);
    if (bCreated)
        GetClientRect(&m_rcClient);
    return bCreated;
}

/////////////////////////////////////////////////////////////////////////////
// Operations

BOOL KVXSpin::EnableWindow(BOOL bEnable)
{
    m_bEnabled = bEnable;
    if (!::IsWindow(m_hWnd))
        return FALSE;
    InvalidateRect(NULL, TRUE);
    UpdateWindow();
    return CWnd::EnableWindow(bEnable);
}

void KVXSpin::SetKeyDown(bool bKeyDown)
{
    m_bKeyDown = bKeyDown;
}

/////////////////////////////////////////////////////////////////////////////
// Implementation

KVXNumericEdit* KVXSpin::GetBuddy() const
{
    if (m_pNumericEdit == NULL || m_hWndBuddy == NULL || !::IsWindow(m_hWndBuddy))
        return NULL;
    // Compared without touching the buddy object, which may already be gone.
    if (CWnd::FromHandlePermanent(m_hWndBuddy) != static_cast<CWnd*>(m_pNumericEdit))
        return NULL;
    return m_pNumericEdit;
}

void KVXSpin::EndPress(KVXNumericEdit* pBuddy, BOOL bReleaseCapture)
{
    // A running timer always ends here, even when a slider drag started while a key
    // held an arrow: otherwise nothing would ever stop it.
    const BOOL bArrowEnds = m_bTimerRunning || (!m_bSliding && m_bCaptured);
    if (m_bTimerRunning)
    {
        KillTimer(SpinGeometry::kTimerId);
        m_bTimerRunning = FALSE;
    }
    if (bArrowEnds)
        pBuddy->OnSpinTimerKill();
    if (m_bCaptured)
    {
        // Cleared before releasing: the release reports WM_CAPTURECHANGED at once.
        m_bSliderCursor = FALSE;
        m_bCaptured = FALSE;
        m_bSliding = FALSE;
        if (bReleaseCapture && ::GetCapture() == m_hWnd)
            ::ReleaseCapture();
        pBuddy->OnSliderSet(FALSE);
    }
}

void KVXSpin::InvalidateAll()
{
    InvalidateRect(CRect(0, 0, m_rcClient.Width(), m_rcClient.Height()), TRUE);
}

void KVXSpin::SetSliderCursor()
{
    HINSTANCE hInst = AfxFindResourceHandle(MAKEINTRESOURCE(IDC_SLIDER_CURSOR), RT_GROUP_CURSOR);
    HCURSOR hCursor = ::LoadCursor(hInst, MAKEINTRESOURCE(IDC_SLIDER_CURSOR));
    // Without the library's resources keep the current cursor rather than hide it.
    if (hCursor != NULL)
        ::SetCursor(hCursor);
}

/////////////////////////////////////////////////////////////////////////////
// Painting

void KVXSpin::drawButton(CDC* pDC, CRect rect, BOOL bPressed)
{
    if (pDC == NULL)
        return;
    const COLORREF clrLight = ::GetSysColor(COLOR_BTNHIGHLIGHT);
    const COLORREF clrShadow = ::GetSysColor(COLOR_BTNSHADOW);
    if (bPressed)
        pDC->Draw3dRect(rect, clrShadow, clrLight);
    else
        pDC->Draw3dRect(rect, clrLight, clrShadow);
}

void KVXSpin::drawGlyph(CDC* pDC, const POINT points[3])
{
    if (pDC == NULL)
        return;
    const COLORREF clr = ::GetSysColor(m_bEnabled ? COLOR_BTNTEXT : COLOR_BTNSHADOW);
    CPen pen(PS_SOLID, 1, clr);
    CBrush brush(clr);
    CPen* pOldPen = pDC->SelectObject(&pen);
    CBrush* pOldBrush = pDC->SelectObject(&brush);
    pDC->Polygon(points, 3);
    pDC->SelectObject(pOldPen);
    pDC->SelectObject(pOldBrush);
}

void KVXSpin::drawTriangle(CDC* pDC, CRect rect)
{
    POINT points[3];
    SpinGeometry::UpGlyphPoints(rect, points);
    drawGlyph(pDC, points);
}

void KVXSpin::drawInvertTriangle(CDC* pDC, CRect rect)
{
    POINT points[3];
    SpinGeometry::DownGlyphPoints(rect, points);
    drawGlyph(pDC, points);
}

/////////////////////////////////////////////////////////////////////////////
// Message map

BEGIN_MESSAGE_MAP(KVXSpin, CWnd)
    ON_WM_PAINT()
    ON_WM_LBUTTONDOWN()
    ON_WM_LBUTTONUP()
    ON_WM_LBUTTONDBLCLK()
    ON_WM_MOUSEMOVE()
    ON_WM_TIMER()
    ON_WM_CAPTURECHANGED()
    ON_WM_SIZE()
END_MESSAGE_MAP()

void KVXSpin::OnPaint()
{
    CPaintDC dc(this);
    const int cx = m_rcClient.Width();
    const int cy = m_rcClient.Height();

    dc.FillSolidRect(0, 0, cx, cy, ::GetSysColor(COLOR_BTNFACE));
    const CRect rectUpper(SpinGeometry::UpperHalfRect(cx, cy));
    const CRect rectLower(SpinGeometry::LowerHalfRect(cx, cy));
    const COLORREF clrFace = ::GetSysColor(COLOR_3DFACE);
    const COLORREF clrDark = ::GetSysColor(COLOR_3DDKSHADOW);
    dc.Draw3dRect(rectUpper, clrFace, clrDark);
    dc.Draw3dRect(rectLower, clrFace, clrDark);

    CRect rectButton(rectUpper);
    rectButton.InflateRect(-1, -1);
    drawButton(&dc, rectButton, m_bUpPressed);
    drawTriangle(&dc, CRect(SpinGeometry::GlyphRect(rectUpper, m_bUpPressed != FALSE)));

    rectButton = rectLower;
    rectButton.InflateRect(-1, -1);
    drawButton(&dc, rectButton, m_bDownPressed);
    drawInvertTriangle(&dc, CRect(SpinGeometry::GlyphRect(rectLower, m_bDownPressed != FALSE)));
}

// A step changes the buddy's text, and the host's EN_CHANGE handler may destroy the
// buddy, which destroys and deletes this spin: the handlers look at their window again
// after every step and leave the object alone once it is gone.

void KVXSpin::OnLButtonDown(UINT nFlags, CPoint point)
{
    KVXNumericEdit* pBuddy = GetBuddy();
    if (pBuddy == NULL)
        return;
    const HWND hWnd = m_hWnd;
    pBuddy->SetFocus();
    if (!::IsWindow(hWnd))
        return;

    const SpinArea area = SpinGeometry::HitTest(m_rcClient.Width(), m_rcClient.Height(), point);
    if (area == SpinArea::Up || area == SpinArea::Down)
    {
        // Every press restarts the count, so keyboard auto-repeat (faster than the
        // timer) steps at the key rate and never reaches the acceleration ticks.
        SetCapture();
        m_bCaptured = TRUE;
        m_bSpinUp = area == SpinArea::Up;
        m_nTimerTicks = 0;
        m_bTimerRunning = TRUE;
        if (m_bSpinUp)
            m_bUpPressed = TRUE;
        else
            m_bDownPressed = TRUE;
        SetTimer(SpinGeometry::kTimerId, SpinGeometry::kTimerPeriodMs, NULL);
        InvalidateAll();
        if (m_bSpinUp)
            pBuddy->OnSpinUpButton();
        else
            pBuddy->OnSpinDownButton();
    }
    else if (area == SpinArea::Band)
    {
        SetCapture();
        m_bCaptured = TRUE;
        m_bSliding = TRUE;
        m_ptPress = point;
        pBuddy->OnSliderSet(TRUE);
    }
    if (::IsWindow(hWnd))
        Default();
}

void KVXSpin::OnLButtonDblClk(UINT nFlags, CPoint point)
{
    // A double click is a second press: a second immediate step, the timer restarted.
    OnLButtonDown(nFlags, point);
}

void KVXSpin::OnTimer(UINT_PTR nIDEvent)
{
    KVXNumericEdit* pBuddy = GetBuddy();
    if (pBuddy == NULL)
        return;
    // Only our own running timer steps: a stray or late WM_TIMER after the release
    // must not move the value.
    if (nIDEvent != SpinGeometry::kTimerId || !m_bTimerRunning)
    {
        Default();
        return;
    }

    m_nTimerTicks = SpinGeometry::NextTick(m_nTimerTicks);
    const SpinGeometry::TickActions actions = SpinGeometry::TickRule(m_nTimerTicks);
    if (actions.step)
    {
        const HWND hWnd = m_hWnd;
        if (m_bSpinUp)
            pBuddy->OnSpinUpButton();
        else
            pBuddy->OnSpinDownButton();
        if (!::IsWindow(hWnd))
            return;
    }
    if (actions.twoSecs)
        pBuddy->OnSpinTimerTwoSecs();
    if (actions.fiveSecs)
        pBuddy->OnSpinTimerFiveSecs();
    Default();
}

void KVXSpin::OnLButtonUp(UINT nFlags, CPoint point)
{
    KVXNumericEdit* pBuddy = GetBuddy();
    if (pBuddy == NULL)
        return;

    m_bUpPressed = FALSE;
    m_bDownPressed = FALSE;
    InvalidateAll();

    // A second release (a posted one after a real one) finds nothing to end.
    if (!m_bSliding && !m_bCaptured && !m_bTimerRunning)
    {
        Default();
        return;
    }
    EndPress(pBuddy, TRUE);
    Default();
}

void KVXSpin::OnMouseMove(UINT nFlags, CPoint point)
{
    KVXNumericEdit* pBuddy = GetBuddy();
    if (pBuddy == NULL)
        return;

    const int cx = m_rcClient.Width();
    const int cy = m_rcClient.Height();
    if (SpinGeometry::InArea(cx, cy, point, SpinArea::Band))
    {
        if (!m_bSliderCursor)
        {
            // Hovering captures the mouse even with no button down, so that leaving the
            // band is seen (and no WM_SETCURSOR takes the cursor back meanwhile).
            SetSliderCursor();
            m_bSliderCursor = TRUE;
            SetCapture();
            m_bCaptured = TRUE;
        }
    }
    else if (m_bCaptured && m_bSliderCursor && !m_bSliding)
    {
        m_bCaptured = FALSE;
        m_bSliderCursor = FALSE;
        if (::GetCapture() == m_hWnd)
            ::ReleaseCapture();
    }

    if (m_bCaptured && m_bSliding)
    {
        const HWND hWnd = m_hWnd;
        pBuddy->OnSliderMove(SpinGeometry::SliderDistance(m_ptPress, point));
        if (!::IsWindow(hWnd))
            return;
    }

    // Dragging off a half held by the mouse ends its repeat; a key's hold ignores the pointer.
    if (m_bCaptured && !m_bKeyDown)
    {
        if ((m_bUpPressed && !SpinGeometry::InArea(cx, cy, point, SpinArea::Up)) ||
            (m_bDownPressed && !SpinGeometry::InArea(cx, cy, point, SpinArea::Down)))
            PostMessage(WM_LBUTTONUP, 0, 0);
    }
    Default();
}

void KVXSpin::OnCaptureChanged(CWnd* pWnd)
{
    // The capture taken away by another window (a message box, a disabled spin, a
    // window that captures for itself) ends the press as a release would; otherwise
    // the timer would go on stepping with no release ever reaching the spin.
    const HWND hWndNew = pWnd != NULL ? pWnd->GetSafeHwnd() : NULL;
    if (m_bCaptured && hWndNew != m_hWnd)
    {
        KVXNumericEdit* pBuddy = GetBuddy();
        m_bUpPressed = FALSE;
        m_bDownPressed = FALSE;
        if (::IsWindow(m_hWnd))
            InvalidateAll();
        if (pBuddy != NULL)
        {
            EndPress(pBuddy, FALSE);
        }
        else
        {
            if (m_bTimerRunning)
                KillTimer(SpinGeometry::kTimerId);
            m_bTimerRunning = m_bCaptured = m_bSliding = m_bSliderCursor = FALSE;
        }
    }
    Default();
}

void KVXSpin::OnSize(UINT nType, int cx, int cy)
{
    CWnd::OnSize(nType, cx, cy);
    // Geometry follows the window should the buddy ever resize it.
    if (nType != SIZE_MINIMIZED)
        GetClientRect(&m_rcClient);
}
