// What the tool tip and the title tip share as windows: their window class, the font
// they measure and draw with, drawing a layout, and handing mouse input on to the window
// underneath once they have hidden themselves.
#pragma once

#include <afxwin.h>

#include "TipLayout.h"

namespace TipWindowSupport {

// The library module's instance: the tips' classes are registered and created with it.
HINSTANCE LibraryInstance();

// Registers the class of a tip window under the library's instance unless it exists:
// save-bits, DefWindowProc, the arrow cursor and the tool-tip background.
// Throws CResourceException when the registration fails.
void RegisterTipClass(LPCTSTR lpszClassName);

// Creates a tip window of the class: a topmost, bordered pop-up without owner.
BOOL CreateTip(CWnd* pTip, LPCTSTR lpszClassName);

// The text a tip may show now: false (nothing to show) for a tip without window or owner,
// one already visible, while another application is active, or for a null or empty text.
bool TextToShow(CWnd* pTip, CWnd* pOwner, const wchar_t* text, CString& strText);

// Selects the owner's font (WM_GETFONT) into a DC for the lifetime of the object; an
// owner without a font gets a temporary 8-point "MS Shell Dlg", deleted afterwards.
class TipFont
{
public:
    TipFont(CDC& dc, CWnd* pOwner);
    ~TipFont();
    TipFont(const TipFont&) = delete;
    TipFont& operator=(const TipFont&) = delete;

private:
    CDC& m_dc;
    CFont m_fontTemporary;
    CFont* m_pOldFont;
};

// Places and shows the tip (topmost, not activated) and draws the text once.
void ShowPlacement(CWnd* pTip, CDC& dc, const CString& strText, const TipLayout::Placement& placement);

// Releases the capture and hides the tip.
void Hide(CWnd* pTip);

// The window under a screen point, the owner where that is the tip itself; NULL where
// there is no window at all.
CWnd* WindowUnder(CWnd* pTip, CWnd* pOwner, CPoint ptScreen);

// Posts a mouse move at a point of the tip's client area to the window under it (the
// owner where that is the tip itself): WM_MOUSEMOVE in client coordinates over a client
// area, otherwise WM_NCMOUSEMOVE with the hit-test code and the screen point.
void HandOverMouseMove(CWnd* pTip, CWnd* pOwner, UINT nFlags, CPoint point);

// Posts a button-down at a point of the tip's client area to the owner, in its client
// coordinates.
void HandOverClick(CWnd* pTip, CWnd* pOwner, UINT message, UINT nFlags, CPoint point);

} // namespace TipWindowSupport
