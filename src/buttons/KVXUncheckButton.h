// KVXUncheckButton: a momentary button drawn from the host's bitmaps, built on a static
// control with SS_NOTIFY. It is on only while held: the owner gets WM_COMMAND with the
// control's identifier on the press (IsPressed TRUE) and again on the release, on
// leaving the control with the button held, on losing the focus and on being disabled
// or otherwise interrupted (WM_CANCELMODE) while held (IsPressed FALSE).
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXUncheckButton : public CStatic
{
// Constructors
public:
    KVXUncheckButton();
    virtual ~KVXUncheckButton();

// Attributes
public:
    // TRUE while the button is held (the control holds the mouse capture).
    BOOL IsPressed() const;

// Operations
public:
    // Bitmap resources for the normal, pressed and disabled looks (note the order) and
    // the key colour (0xFFFFFFFF: the face colour itself).
    void SetBitmaps(UINT nBitmapNormal, UINT nBitmapPressed, UINT nBitmapDisabled, DWORD clrKey);

// Implementation
protected:
    UINT m_nBitmapNormal;
    UINT m_nBitmapDisabled;
    UINT m_nBitmapPressed;
    COLORREF m_clrKey;

// Message map
protected:
    afx_msg void OnClicked();
    afx_msg void OnLButtonDblClk(UINT nFlags, CPoint point);
    afx_msg void OnLButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnKillFocus(CWnd* pNewWnd);
    afx_msg void OnEnable(BOOL bEnable);
    afx_msg void OnCancelMode();
    afx_msg void OnCaptureChanged(CWnd* pWnd);
    afx_msg void OnPaint();
    DECLARE_MESSAGE_MAP()
};
