// afxdlgs.h - standard dialog wrappers: the common dialogs of COMDLG32.
//
// A common dialog object runs the system's dialog modally and receives its messages
// through the hook MFC installs: the dialog window is attached to the object when it is
// created, so OnInitDialog, the message map and the virtual OnOK/OnCancel apply to it.
#pragma once

#ifndef __AFXDLGS_H__
#define __AFXDLGS_H__

#ifndef __AFXWIN_H__
#include <afxwin.h>
#endif

#include <commdlg.h>

/////////////////////////////////////////////////////////////////////////////
// CCommonDialog: base of the common dialog wrappers

class CCommonDialog : public CDialog
{
public:
    explicit CCommonDialog(CWnd* pParentWnd);

// Implementation
protected:
    // The system dialog ends itself: OK and Cancel go to its own procedure.
    virtual void OnOK();
    virtual void OnCancel();
};

/////////////////////////////////////////////////////////////////////////////
// CColorDialog: the standard colour dialog (ChooseColor)

class CColorDialog : public CCommonDialog
{
    DECLARE_DYNAMIC(CColorDialog)

public:
// Attributes
    // Passed to ChooseColor; change it between construction and DoModal.
    CHOOSECOLOR m_cc;

// Constructors
    CColorDialog(COLORREF clrInit = 0, DWORD dwFlags = 0, CWnd* pParentWnd = NULL);

// Operations
    virtual INT_PTR DoModal();

    // Selects a colour in the running dialog.
    void SetCurrentColor(COLORREF clr);

    // The colour chosen by the user after DoModal returned IDOK.
    COLORREF GetColor() const;
    // The 16 custom colours shared by every colour dialog of the process.
    static COLORREF* PASCAL GetSavedCustomColors();

// Overridables
protected:
    // Called when the user presses OK; return TRUE to keep the dialog open.
    virtual BOOL OnColorOK();

// Implementation
    friend UINT_PTR CALLBACK _AfxCommDlgProc(HWND, UINT, WPARAM, LPARAM);
};

// Hook procedure the common dialog wrappers install (m_cc.lpfnHook and the like).
UINT_PTR CALLBACK _AfxCommDlgProc(HWND hWnd, UINT message, WPARAM wParam, LPARAM lParam);

#endif // __AFXDLGS_H__
