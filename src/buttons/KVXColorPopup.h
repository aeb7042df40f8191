// KVXColorPopup: the colour well's palette popup (private to the library; embedded in
// KVXColorWell, which configures it). A modal dialog from template 5103 that holds the
// mouse capture while open, shows a grid of colour buttons and optionally an
// "&Other..." button that opens the standard colour dialog.
#pragma once

#include <afxwin.h>
#include <afxtempl.h>

namespace ColorGridGeometry { struct ColorGridLayout; }

class KVXColorWell;

class AFX_EXT_CLASS KVXColorPopup : public CDialog
{
    friend class KVXColorWell;

// Constructors
public:
    KVXColorPopup();
    virtual ~KVXColorPopup();

// Overridables
public:
    virtual BOOL OnInitDialog();
    virtual BOOL PreTranslateMessage(MSG* pMsg);
protected:
    // Both end the popup through EndPopup, which releases the capture first.
    virtual void OnOK();
    virtual void OnCancel();

// Implementation
protected:
    ColorGridGeometry::ColorGridLayout GetLayout() const;
    // Palette colour of a cell; black beyond the palette.
    COLORREF GetCellColor(int nIndex) const;
    void DrawCell(CDC* pDC, const CRect& rcButton, COLORREF clr, BOOL bCurrent, BOOL bHover);
    void RedrawCell(int nIndex);
    void SetHover(int nIndex);
    // Focus follows the hover: the Other... button for -1, the invisible Dummy otherwise.
    void FocusForHover();
    void MoveFocusTo(CWnd* pTarget);
    void PickColor(int nIndex);
    void EndPopup(int nResult);
    BOOL IsOutsideWindow(CPoint ptClient);

    COLORREF m_clrColor;
    KVXColorWell* m_pColorWell;
    int m_nCurrent;
    int m_nHover;
    int m_nRows;
    int m_nColumns;
    int m_nButtonWidth;
    int m_nButtonHeight;
    int m_nGapHorizontal;
    int m_nGapVertical;
    int m_nBorderWidth;
    CArray<COLORREF, COLORREF> m_arrColors;
    BOOL m_bHasOtherButton;
    BOOL m_bColorUndefined;

// Message map
protected:
    afx_msg void OnPaint();
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnLButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnOther();
    afx_msg void OnCancelMode();
    DECLARE_MESSAGE_MAP()
};
