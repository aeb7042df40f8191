// KVXTitleTipCtrl: shows the whole text of a cut-off list cell laid exactly over the cell,
// starting where the cell draws its text, while the mouse rests on the cell. It is cut at
// the monitor's right edge and wraps downward when the text is longer than the room left.
// While shown it holds the mouse capture and hides itself when the mouse leaves the cell;
// in the host's message loop its PreTranslateMessage hands key presses to the list and
// clicks to the window under the mouse (in non-client form where needed), so a click on
// the tip lands where it would have without it.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXTitleTipCtrl : public CWnd
{
// Constructors
public:
    // Registers the window class "ZTitleTip" if needed; throws CResourceException when
    // that fails.
    KVXTitleTipCtrl();
    virtual ~KVXTitleTipCtrl();

    virtual BOOL PreTranslateMessage(MSG* pMsg);

    // Creates the hidden popup; pParentWnd is the list that owns it.
    virtual BOOL Create(CWnd* pParentWnd);

// Operations
public:
    // rect: the cell in the parent's client coordinates; nTextOffset: the distance from
    // the cell's left edge to its text. Shows nothing while visible, without a focus
    // window in this thread, for an empty text or a text that fits into the cell.
    void Show(CRect rect, const wchar_t* text, int nTextOffset);

// Implementation
protected:
    virtual BOOL PreCreateWindow(CREATESTRUCT& cs);

    CWnd* m_pParentWnd;
    CRect m_rectHover;   // the cell in the tip's client coordinates

// Message map
protected:
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnMButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnRButtonDown(UINT nFlags, CPoint point);
    DECLARE_MESSAGE_MAP()
};
