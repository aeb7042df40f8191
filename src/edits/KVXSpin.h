// KVXSpin: the up/down control a numeric edit places beside itself.
//
// A plain child window that paints two arrow halves and a narrow slider band between
// them and turns mouse input into calls on its buddy edit: a press on a half steps
// once and then auto-repeats from timer 1 (the buddy accelerates after 2 s and 5 s);
// a press in the band followed by vertical dragging moves the value by the distance
// dragged. The buddy also presses the halves for its Up and Down keys. The spin holds
// no value of its own; the buddy creates, disables and destroys it.
#pragma once

#include <afxwin.h>

class KVXNumericEdit;

class AFX_EXT_CLASS KVXSpin : public CWnd
{
// Constructors
public:
    KVXSpin();
    virtual ~KVXSpin();

    // Creates the window at rect (parent coordinates). Fails without a buddy or a parent.
    BOOL Create(CWnd* pParentWnd, KVXNumericEdit* pNumericEdit, CRect rect);

// Operations
public:
    // Stores the state the glyphs are painted in, repaints at once, then enables or
    // disables the window.
    BOOL EnableWindow(BOOL bEnable = TRUE);
    // Set by the buddy while one of its keys, not the mouse, holds a half pressed.
    void SetKeyDown(bool bKeyDown);

// Implementation
protected:
    // The buddy, or NULL once its window is gone or no longer belongs to it: every
    // handler then does nothing, so a spin outliving its buddy cannot call into it.
    KVXNumericEdit* GetBuddy() const;
    // Ends an arrow press or a slider drag: timer, step factor, capture, slider state.
    void EndPress(KVXNumericEdit* pBuddy, BOOL bReleaseCapture);
    void InvalidateAll();
    void SetSliderCursor();

    void drawButton(CDC* pDC, CRect rect, BOOL bPressed);
    void drawTriangle(CDC* pDC, CRect rect);
    void drawInvertTriangle(CDC* pDC, CRect rect);
    void drawGlyph(CDC* pDC, const POINT points[3]);

protected:
    CRect m_rcClient;
    CWnd* m_pParentWnd;
    KVXNumericEdit* m_pNumericEdit;
    CPoint m_ptPress;
    int m_nTimerTicks;
    BOOL m_bCaptured;
    BOOL m_bSpinUp;
    BOOL m_bSliding;
    BOOL m_bUpPressed;
    BOOL m_bDownPressed;
    BOOL m_bSliderCursor;
    BOOL m_bTimerRunning;
    BOOL m_bEnabled;
    bool m_bKeyDown;
    // The buddy's window at creation; the buddy counts as present only while this
    // window lives and is still attached to m_pNumericEdit.
    HWND m_hWndBuddy;

// Message map
protected:
    afx_msg void OnPaint();
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnLButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnLButtonDblClk(UINT nFlags, CPoint point);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnTimer(UINT_PTR nIDEvent);
    afx_msg void OnCaptureChanged(CWnd* pWnd);
    afx_msg void OnSize(UINT nType, int cx, int cy);
    DECLARE_MESSAGE_MAP()
};
