// KVXCheckButtonEx: a two-state button drawn from the host's bitmaps, built on a static
// control with SS_NOTIFY. Each press toggles the check state and sends the owner
// WM_COMMAND with the control's identifier; the pressed bitmap shows while the button is
// held and while it is checked.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXCheckButtonEx : public CStatic
{
// Constructors
public:
    KVXCheckButtonEx();
    virtual ~KVXCheckButtonEx();

// Attributes
public:
    // The state lives in the object only; setting it repaints without notifying.
    void SetCheck(int nCheck);
    int GetCheck() const;

// Operations
public:
    // Bitmap resources for the normal, pressed (also checked) and disabled looks (note
    // the order) and the key colour (0xFFFFFFFF: the face colour itself).
    void SetBitmaps(UINT nBitmapNormal, UINT nBitmapPressed, UINT nBitmapDisabled, DWORD clrKey);

// Implementation
protected:
    UINT m_nBitmapNormal;
    UINT m_nBitmapDisabled;
    UINT m_nBitmapPressed;
    BOOL m_bChecked;
    COLORREF m_clrKey;

// Message map
protected:
    afx_msg void OnClicked();
    afx_msg void OnLButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnKillFocus(CWnd* pNewWnd);
    afx_msg void OnEnable(BOOL bEnable);
    afx_msg void OnCaptureChanged(CWnd* pWnd);
    afx_msg void OnPaint();
    DECLARE_MESSAGE_MAP()
};
