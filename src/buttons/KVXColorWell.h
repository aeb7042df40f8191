// KVXColorWell: a drop-down colour picker on an owner-drawn push button (create it with
// BS_OWNERDRAW). The button shows the colour as a swatch beside a drop-down arrow, or a
// cross-hatched swatch while the colour is undefined; a click opens the palette popup
// right below it. After the popup closes with OK the parent receives WM_USER+42
// (WM_KVX_COLORWELLCHANGED) with wParam = the control identifier and lParam = the address
// of a KVXColorWellNotify, valid during the call.
#pragma once

#include <afxwin.h>
#include <afxtempl.h>

#include "KVXColorPopup.h"

#define WM_KVX_COLORWELLCHANGED (WM_USER + 42)

struct KVXColorWellNotify
{
    NMHDR hdr;          // hwndFrom: the well, idFrom: its identifier, code: WM_KVX_COLORWELLCHANGED
    COLORREF clrColor;  // the colour now shown
};

class AFX_EXT_CLASS KVXColorWell : public CButton
{
    friend class KVXColorPopup;

// Constructors
public:
    KVXColorWell();
    virtual ~KVXColorWell();

// Attributes
public:
    // Setting a colour makes it defined; both setters redraw the well at once.
    void SetColor(COLORREF clr);
    COLORREF GetColor();
    void SetColorUndefined(BOOL bUndefined);
    BOOL GetColorUndefined();

    // Palette settings; values outside the accepted range are ignored.
    void SetHasOtherButton(BOOL bHasOtherButton);
    BOOL GetHasOtherButton();
    void SetRowCount(long nRows);                 // 1 to 20
    long GetRowCount();
    void SetColumnCount(long nColumns);           // 1 to 20
    long GetColumnCount();
    void SetButtonWidth(long nWidth);             // 10 to 100
    long GetButtonWidth();
    void SetButtonHeight(long nHeight);           // 10 to 100
    long GetButtonHeight();
    void SetButtonGapHorizontal(long nGap);       // 0 to 100
    long GetButtonGapHorizontal();
    void SetButtonGapVertical(long nGap);         // 0 to 100
    long GetButtonGapVertical();
    void SetBorderWidth(long nBorder);            // 0 to 100
    long GetBorderWidth();
    // The palette itself: cell i shows entry i; the host may replace or extend it.
    CArray<COLORREF, COLORREF>* GetColorArray();

    // Caption of the standard colour dialog opened through Other...
    void SetColorName(CString strColorName);
    CString GetColorName();

// Operations
public:
    // Runs the popup; after OK notifies the parent.
    void DoColorWellDlg();

// Overridables
protected:
    virtual void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct);
    virtual void PostNcDestroy();

// Implementation
protected:
    void Redraw();

    CString m_strColorName;
    KVXColorPopup m_popup;

// Message map
protected:
    afx_msg void OnClicked();
    DECLARE_MESSAGE_MAP()
};
