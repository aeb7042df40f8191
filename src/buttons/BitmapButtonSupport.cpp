#include "BitmapButtonSupport.h"

#include <commctrl.h>

namespace BitmapButtonSupport {

void NotifyOwner(CWnd* pButton)
{
    HWND hButton = pButton->GetSafeHwnd();
    if (!::IsWindow(hButton))
        return;
    HWND hOwner = ::GetWindow(hButton, GW_OWNER);
    if (hOwner == NULL)
        hOwner = ::GetParent(hButton);
    if (hOwner == NULL)
        return;
    ::SendMessage(hOwner, WM_COMMAND, MAKEWPARAM(::GetDlgCtrlID(hButton), 0), 0);
}

BOOL HoldsCapture(const CWnd* pWnd)
{
    HWND hWnd = pWnd->GetSafeHwnd();
    return hWnd != NULL && ::IsWindow(hWnd) && ::GetCapture() == hWnd;
}

void Press(CWnd* pButton)
{
    pButton->SetCapture();
    pButton->Invalidate(FALSE);
    NotifyOwner(pButton);
}

BOOL ReleaseOwnCapture(const CWnd* pWnd)
{
    if (!HoldsCapture(pWnd))
        return FALSE;
    ::ReleaseCapture();
    return TRUE;
}

BOOL ReleaseWhenLeft(CWnd* pButton, CPoint point)
{
    CRect rcClient;
    pButton->GetClientRect(&rcClient);
    return !rcClient.PtInRect(point) && ReleaseOwnCapture(pButton);
}

void Paint(CWnd* pButton, ButtonLook::Kind kind, BOOL bPressed, UINT nBitmapNormal,
           UINT nBitmapPressed, UINT nBitmapDisabled, COLORREF clrKey)
{
    CPaintDC dc(pButton);
    CRect rcClient;
    pButton->GetClientRect(&rcClient);
    if (nBitmapNormal == 0)
        dc.FillSolidRect(&rcClient, ::GetSysColor(COLOR_BTNFACE));

    const ButtonLook::SysColors colors = { ::GetSysColor(COLOR_BTNFACE), ::GetSysColor(COLOR_BTNHIGHLIGHT),
                                           ::GetSysColor(COLOR_BTNSHADOW) };
    ButtonLook::Look look = ButtonLook::Choose(kind, bPressed != FALSE, pButton->IsWindowEnabled() != FALSE,
                                               nBitmapNormal, nBitmapPressed, nBitmapDisabled, clrKey, colors);
    if (look.bitmap == 0)
        return;

    HINSTANCE hInst = AfxFindResourceHandle(MAKEINTRESOURCE(look.bitmap), RT_BITMAP);
    // Loaded for every paint (the system colours may have changed); released with the object.
    CBitmap bitmap;
    if (!bitmap.Attach(::CreateMappedBitmap(hInst, look.bitmap, 0, look.map, look.mapCount)))
        return;   // no such bitmap: this state draws nothing

    BITMAP bm;
    CDC dcMem;
    if (bitmap.GetBitmap(&bm) == 0 || !dcMem.CreateCompatibleDC(&dc))
        return;
    CBitmap* pOld = dcMem.SelectObject(&bitmap);
    const POINT pt = ButtonLook::CenteredOrigin(rcClient, bm.bmWidth, bm.bmHeight);
    dc.BitBlt(pt.x, pt.y, bm.bmWidth, bm.bmHeight, &dcMem, 0, 0, SRCCOPY);
    dcMem.SelectObject(pOld);
}

} // namespace BitmapButtonSupport
