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

// Releases the capture when pWnd holds it; another window's capture is left alone.
void ReleaseOwnCapture(const CWnd* pWnd);

// Paints the button: face when there is no normal bitmap, then the bitmap of the state
// with its colour map, centred. pressed: the checked look for the check button.
void Paint(CWnd* pButton, ButtonLook::Kind kind, BOOL bPressed, UINT nBitmapNormal,
           UINT nBitmapPressed, UINT nBitmapDisabled, COLORREF clrKey);

} // namespace BitmapButtonSupport
