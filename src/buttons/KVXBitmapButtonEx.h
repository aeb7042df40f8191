// KVXBitmapButtonEx: a push button drawn from the host's bitmaps, built on a static
// control with SS_NOTIFY. A press (and the second press of a double click) sends the
// owner WM_COMMAND with the control's identifier; the button looks pressed while it
// holds the mouse capture.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXBitmapButtonEx : public CStatic
{
// Constructors
public:
    KVXBitmapButtonEx();
    virtual ~KVXBitmapButtonEx();

// Operations
public:
    // Bitmap resources for the normal, pressed and disabled looks (note the order) and
    // the key colour painted as button face (0xFFFFFFFF: the face colour itself).
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
    afx_msg void OnCaptureChanged(CWnd* pWnd);
    afx_msg void OnPaint();
    DECLARE_MESSAGE_MAP()
};
