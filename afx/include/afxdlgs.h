// afxdlgs.h - standard dialog wrappers: the common dialogs of COMDLG32, and the
// property sheet and its pages (COMCTL32's PropertySheet).
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
#include <prsht.h>

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

/////////////////////////////////////////////////////////////////////////////
// CPropertyPage and CPropertySheet
//
// Each page is a dialog template found through the resource chain; the system
// creates the page's window when the page is first shown, and the creation hook
// attaches it to the page object, so OnInitDialog and DoDataExchange run as for
// any dialog. The sheet is the system's property sheet window attached to the
// sheet object; it does not own its pages.

#ifndef AFX_IDC_TAB_CONTROL
#define AFX_IDC_TAB_CONTROL     0x3020  // the sheet's tab control
#endif
#ifndef ID_APPLY_NOW
#define ID_APPLY_NOW            0x3021  // the sheet's Apply button
#endif

class CPropertySheet;

class CPropertyPage : public CDialog
{
    DECLARE_DYNAMIC(CPropertyPage)

// Construction
public:
    CPropertyPage();
    explicit CPropertyPage(UINT nIDTemplate, UINT nIDCaption = 0, DWORD dwSize = sizeof(PROPSHEETPAGE));
    explicit CPropertyPage(LPCTSTR lpszTemplateName, UINT nIDCaption = 0,
        DWORD dwSize = sizeof(PROPSHEETPAGE));
    void Construct(UINT nIDTemplate, UINT nIDCaption = 0);
    void Construct(LPCTSTR lpszTemplateName, UINT nIDCaption = 0);

// Attributes
    PROPSHEETPAGE m_psp;

// Operations
    void CancelToClose();
    void SetModified(BOOL bChanged = TRUE);

// Overridables
public:
    virtual BOOL OnApply();
    virtual void OnReset();
    virtual void OnOK();
    virtual void OnCancel();
    virtual BOOL OnSetActive();
    virtual BOOL OnKillActive();
    virtual BOOL OnQueryCancel();

// Implementation
public:
    virtual ~CPropertyPage();
    virtual BOOL PreTranslateMessage(MSG* pMsg);

protected:
    CString m_strCaption;
    BOOL m_bFirstSetActive;

    void CommonConstruct(LPCTSTR lpszTemplateName, UINT nIDCaption);
    virtual BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult);
    // the sheet's copy of m_psp, with the template's module from the resource chain
    void PreProcessPageTemplate(PROPSHEETPAGE& psp, BOOL bWizard);

    DECLARE_MESSAGE_MAP()

    friend class CPropertySheet;
};

class CPropertySheet : public CWnd
{
    DECLARE_DYNAMIC(CPropertySheet)

// Construction
public:
    CPropertySheet();
    explicit CPropertySheet(UINT nIDCaption, CWnd* pParentWnd = NULL, UINT iSelectPage = 0);
    explicit CPropertySheet(LPCTSTR pszCaption, CWnd* pParentWnd = NULL, UINT iSelectPage = 0);
    void Construct(UINT nIDCaption, CWnd* pParentWnd = NULL, UINT iSelectPage = 0);
    void Construct(LPCTSTR pszCaption, CWnd* pParentWnd = NULL, UINT iSelectPage = 0);

    // Modeless creation. The default style (-1) is a pop-up with caption and
    // system menu; WS_CHILD | WS_VISIBLE makes a sheet inside pParentWnd, shown
    // without its OK, Cancel, Apply and Help buttons and sized to exclude them.
    virtual BOOL Create(CWnd* pParentWnd = NULL, DWORD dwStyle = (DWORD)-1, DWORD dwExStyle = 0);

// Attributes
public:
    PROPSHEETHEADER m_psh;

    int GetPageCount() const;
    CPropertyPage* GetActivePage() const;
    int GetActiveIndex() const;
    CPropertyPage* GetPage(int nPage) const;
    int GetPageIndex(CPropertyPage* pPage);
    BOOL SetActivePage(int nPage);
    BOOL SetActivePage(CPropertyPage* pPage);
    void SetTitle(LPCTSTR lpszText, UINT nStyle = 0);

// Operations
public:
    void AddPage(CPropertyPage* pPage);
    void RemovePage(CPropertyPage* pPage);
    void RemovePage(int nPage);

// Implementation
public:
    virtual ~CPropertySheet();
    void CommonConstruct(CWnd* pParentWnd, UINT iSelectPage);
    virtual BOOL PreTranslateMessage(MSG* pMsg);
    virtual void BuildPropPageArray();
    virtual BOOL OnInitDialog();
    BOOL IsWizard() const;

protected:
    CPtrArray m_pages;          // CPropertyPage*, not owned
    CString m_strCaption;
    CWnd* m_pParentWnd;
    BOOL m_bStacked;            // the tabs wrap onto several rows
    BOOL m_bModeless;           // created by Create

    afx_msg BOOL OnNcCreate(LPCREATESTRUCT lpcs);
    afx_msg LRESULT HandleInitDialog(WPARAM, LPARAM);
    afx_msg void OnClose();

    DECLARE_MESSAGE_MAP()

    friend class CPropertyPage;
};

#endif // __AFXDLGS_H__
