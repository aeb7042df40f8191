#include "KVXCheckButtonEx.h"

#include "BitmapButtonSupport.h"

// A double click is left to the static control, which reports STN_DBLCLK: ignored, so
// the second press neither toggles nor notifies.
BEGIN_MESSAGE_MAP(KVXCheckButtonEx, CStatic)
    ON_CONTROL_REFLECT(STN_CLICKED, &KVXCheckButtonEx::OnClicked)
    ON_WM_LBUTTONUP()
    ON_WM_MOUSEMOVE()
    ON_WM_KILLFOCUS()
    ON_WM_ENABLE()
    ON_WM_CAPTURECHANGED()
    ON_WM_PAINT()
END_MESSAGE_MAP()

KVXCheckButtonEx::KVXCheckButtonEx()
    : m_nBitmapNormal(0), m_nBitmapDisabled(0), m_nBitmapPressed(0), m_bChecked(FALSE),
      m_clrKey(ButtonLook::kKeyIsButtonFace)
{
}

KVXCheckButtonEx::~KVXCheckButtonEx()
{
}

void KVXCheckButtonEx::SetCheck(int nCheck)
{
    m_bChecked = nCheck;
    if (::IsWindow(GetSafeHwnd()))
        Invalidate(FALSE);
}

int KVXCheckButtonEx::GetCheck() const
{
    return m_bChecked;
}

void KVXCheckButtonEx::SetBitmaps(UINT nBitmapNormal, UINT nBitmapPressed, UINT nBitmapDisabled, DWORD clrKey)
{
    m_nBitmapNormal = nBitmapNormal;
    m_nBitmapPressed = nBitmapPressed;
    m_nBitmapDisabled = nBitmapDisabled;
    m_clrKey = clrKey;
}

void KVXCheckButtonEx::OnClicked()
{
    m_bChecked = !m_bChecked;
    BitmapButtonSupport::Press(this);
}

void KVXCheckButtonEx::OnLButtonUp(UINT nFlags, CPoint point)
{
    CStatic::OnLButtonUp(nFlags, point);
    BitmapButtonSupport::ReleaseOwnCapture(this);
}

void KVXCheckButtonEx::OnMouseMove(UINT nFlags, CPoint point)
{
    BitmapButtonSupport::ReleaseWhenLeft(this, point);
    CStatic::OnMouseMove(nFlags, point);
}

void KVXCheckButtonEx::OnKillFocus(CWnd* pNewWnd)
{
    CStatic::OnKillFocus(pNewWnd);
    BitmapButtonSupport::ReleaseOwnCapture(this);
}

void KVXCheckButtonEx::OnEnable(BOOL bEnable)
{
    if (!bEnable)
        BitmapButtonSupport::ReleaseOwnCapture(this);
    CStatic::OnEnable(bEnable);
    Invalidate(FALSE);
}

void KVXCheckButtonEx::OnCaptureChanged(CWnd* pWnd)
{
    CStatic::OnCaptureChanged(pWnd);
    Invalidate(FALSE);
}

void KVXCheckButtonEx::OnPaint()
{
    const BOOL bPressed = m_bChecked || BitmapButtonSupport::HoldsCapture(this);
    BitmapButtonSupport::Paint(this, ButtonLook::Kind::Check, bPressed, m_nBitmapNormal, m_nBitmapPressed,
                               m_nBitmapDisabled, m_clrKey);
}
