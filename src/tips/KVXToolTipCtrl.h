// KVXToolTipCtrl: a popup with a thin border that shows a text beside a point of its owner
// window, by default only when the text does not fit into an area of the owner (a cell, a
// label). While shown it holds the mouse capture; it hides itself as soon as the mouse
// leaves the area, a button or modifier key is held, or a button is pressed, and hands the
// move or the click on, so the popup never stands in the user's way. Texts wider than the
// monitor are wrapped by characters and then placed above the area where there is room.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXToolTipCtrl : public CWnd
{
// Constructors
public:
    // Registers the window class "ZKVXToolTip" if needed; throws CResourceException
    // when that fails.
    KVXToolTipCtrl();
    virtual ~KVXToolTipCtrl();

    // Creates the hidden popup; pParentWnd gives the font, the coordinates of Show and
    // receives the clicks.
    virtual BOOL Create(CWnd* pParentWnd);

// Operations
public:
    // Shows text at point, as high as rect (both in the parent's client coordinates),
    // unless the tip is visible already, no window of this thread has the focus, the text
    // is empty, or (without bShowAlways) the text fits into rect.
    void Show(CRect rect, CPoint point, const wchar_t* text, bool bShowAlways);
    void Hide();

// Implementation
protected:
    virtual BOOL PreCreateWindow(CREATESTRUCT& cs);

    CWnd* m_pParentWnd;
    CRect m_rectHover;   // the area of Show in the tip's client coordinates

// Message map
protected:
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnMButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnRButtonDown(UINT nFlags, CPoint point);
    DECLARE_MESSAGE_MAP()
};
