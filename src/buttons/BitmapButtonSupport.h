// Shared window code of the three bitmap buttons: the owner notification and the
// painting of the bitmap chosen for the current state. Internal to the library.
#pragma once

#include <afxwin.h>

#include "ButtonLook.h"

namespace BitmapButtonSupport {

// WM_COMMAND with the control's identifier (code 0) and lParam 0, sent to the owner,
// or to the parent when there is no owner.
void NotifyOwner(CWnd* pButton);

// TRUE when pWnd's window exists and holds the mouse capture.
BOOL HoldsCapture(const CWnd* pWnd);

// The handler behaviours the three buttons share. Pressed is the capture. The handlers
// do their default processing themselves (CWnd::Default is protected).

// Press: take the capture, repaint, notify the owner.
void Press(CWnd* pButton);
// Releases the capture when pWnd holds it; another window's capture is left alone.
// TRUE when it was released here.
BOOL ReleaseOwnCapture(const CWnd* pWnd);
// Leave: the pointer at point (client coordinates) is outside a button that holds the
// capture; the capture is released. TRUE when it was.
BOOL ReleaseWhenLeft(CWnd* pButton, CPoint point);

// Paints the button: face when there is no normal bitmap, then the bitmap of the state
// with its colour map, centred. pressed: the checked look for the check button.
void Paint(CWnd* pButton, ButtonLook::Kind kind, BOOL bPressed, UINT nBitmapNormal,
           UINT nBitmapPressed, UINT nBitmapDisabled, COLORREF clrKey);

} // namespace BitmapButtonSupport
