#include "KVXUncheckButton.h"

#include "BitmapButtonSupport.h"

BEGIN_MESSAGE_MAP(KVXUncheckButton, CStatic)
    ON_CONTROL_REFLECT(STN_CLICKED, &KVXUncheckButton::OnClicked)
    ON_WM_LBUTTONDBLCLK()
    ON_WM_LBUTTONUP()
    ON_WM_MOUSEMOVE()
    ON_WM_KILLFOCUS()
    ON_WM_ENABLE()
    ON_WM_CANCELMODE()
    ON_WM_CAPTURECHANGED()
    ON_WM_PAINT()
END_MESSAGE_MAP()

KVXUncheckButton::KVXUncheckButton()
    : m_nBitmapNormal(0), m_nBitmapDisabled(0), m_nBitmapPressed(0), m_clrKey(ButtonLook::kKeyIsButtonFace)
{
}

KVXUncheckButton::~KVXUncheckButton()
{
}

BOOL KVXUncheckButton::IsPressed() const
{
    return BitmapButtonSupport::HoldsCapture(this);
}

void KVXUncheckButton::SetBitmaps(UINT nBitmapNormal, UINT nBitmapPressed, UINT nBitmapDisabled, DWORD clrKey)
{
    m_nBitmapNormal = nBitmapNormal;
    m_nBitmapPressed = nBitmapPressed;
    m_nBitmapDisabled = nBitmapDisabled;
    m_clrKey = clrKey;
}

// Capture first, so that the owner sees IsPressed TRUE during the notification.
void KVXUncheckButton::OnClicked()
{
    BitmapButtonSupport::Press(this);
}

// The second click of a double click is swallowed: no press, no static notification.
void KVXUncheckButton::OnLButtonDblClk(UINT nFlags, CPoint point)
{
}

void KVXUncheckButton::OnLButtonUp(UINT nFlags, CPoint point)
{
    CStatic::OnLButtonUp(nFlags, point);
    BitmapButtonSupport::ReleaseOwnCapture(this);
    BitmapButtonSupport::NotifyOwner(this);
}

void KVXUncheckButton::OnMouseMove(UINT nFlags, CPoint point)
{
    if (BitmapButtonSupport::ReleaseWhenLeft(this, point))
        BitmapButtonSupport::NotifyOwner(this);
    CStatic::OnMouseMove(nFlags, point);
}

void KVXUncheckButton::OnKillFocus(CWnd* pNewWnd)
{
    CStatic::OnKillFocus(pNewWnd);
    BitmapButtonSupport::ReleaseOwnCapture(this);
    BitmapButtonSupport::NotifyOwner(this);
}

void KVXUncheckButton::OnEnable(BOOL bEnable)
{
    if (!bEnable && BitmapButtonSupport::ReleaseOwnCapture(this))
        BitmapButtonSupport::NotifyOwner(this);
    CStatic::OnEnable(bEnable);
    Invalidate(FALSE);
}

// EnableWindow(FALSE) sends WM_CANCELMODE before WM_ENABLE, and its default processing
// takes the capture away: the release is reported here, so that disabling (or a modal
// box) ends a hold with a notification. OnEnable then finds the button released.
void KVXUncheckButton::OnCancelMode()
{
    if (BitmapButtonSupport::ReleaseOwnCapture(this))
        BitmapButtonSupport::NotifyOwner(this);
    CStatic::OnCancelMode();
}

void KVXUncheckButton::OnCaptureChanged(CWnd* pWnd)
{
    CStatic::OnCaptureChanged(pWnd);
    Invalidate(FALSE);
}

void KVXUncheckButton::OnPaint()
{
    BitmapButtonSupport::Paint(this, ButtonLook::Kind::Momentary, IsPressed(), m_nBitmapNormal,
                               m_nBitmapPressed, m_nBitmapDisabled, m_clrKey);
}
