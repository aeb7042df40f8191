#include "KVXBitmapButtonEx.h"

#include "BitmapButtonSupport.h"

BEGIN_MESSAGE_MAP(KVXBitmapButtonEx, CStatic)
    ON_CONTROL_REFLECT(STN_CLICKED, &KVXBitmapButtonEx::OnClicked)
    ON_WM_LBUTTONDBLCLK()
    ON_WM_LBUTTONUP()
    ON_WM_MOUSEMOVE()
    ON_WM_KILLFOCUS()
    ON_WM_ENABLE()
    ON_WM_CAPTURECHANGED()
    ON_WM_PAINT()
END_MESSAGE_MAP()

KVXBitmapButtonEx::KVXBitmapButtonEx()
    : m_nBitmapNormal(0), m_nBitmapDisabled(0), m_nBitmapPressed(0), m_clrKey(ButtonLook::kKeyIsButtonFace)
{
}

KVXBitmapButtonEx::~KVXBitmapButtonEx()
{
}

void KVXBitmapButtonEx::SetBitmaps(UINT nBitmapNormal, UINT nBitmapPressed, UINT nBitmapDisabled, DWORD clrKey)
{
    m_nBitmapNormal = nBitmapNormal;
    m_nBitmapPressed = nBitmapPressed;
    m_nBitmapDisabled = nBitmapDisabled;
    m_clrKey = clrKey;
}

// The static control reports STN_CLICKED on the button-down: that is the press.
void KVXBitmapButtonEx::OnClicked()
{
    BitmapButtonSupport::Press(this);
}

// The second press of a double click counts as a press of its own.
void KVXBitmapButtonEx::OnLButtonDblClk(UINT nFlags, CPoint point)
{
    OnClicked();
}

void KVXBitmapButtonEx::OnLButtonUp(UINT nFlags, CPoint point)
{
    CStatic::OnLButtonUp(nFlags, point);
    BitmapButtonSupport::ReleaseOwnCapture(this);
}

void KVXBitmapButtonEx::OnMouseMove(UINT nFlags, CPoint point)
{
    BitmapButtonSupport::ReleaseWhenLeft(this, point);
    CStatic::OnMouseMove(nFlags, point);
}

void KVXBitmapButtonEx::OnKillFocus(CWnd* pNewWnd)
{
    CStatic::OnKillFocus(pNewWnd);
    BitmapButtonSupport::ReleaseOwnCapture(this);
}

void KVXBitmapButtonEx::OnEnable(BOOL bEnable)
{
    if (!bEnable)
        BitmapButtonSupport::ReleaseOwnCapture(this);
    CStatic::OnEnable(bEnable);
    Invalidate(FALSE);
}

// Pressed is the capture: every change of it changes the look.
void KVXBitmapButtonEx::OnCaptureChanged(CWnd* pWnd)
{
    CStatic::OnCaptureChanged(pWnd);
    Invalidate(FALSE);
}

void KVXBitmapButtonEx::OnPaint()
{
    BitmapButtonSupport::Paint(this, ButtonLook::Kind::Push, BitmapButtonSupport::HoldsCapture(this),
                               m_nBitmapNormal, m_nBitmapPressed, m_nBitmapDisabled, m_clrKey);
}
