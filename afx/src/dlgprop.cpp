// CPropertyPage and CPropertySheet over COMCTL32's PropertySheet.
//
// The sheet window is attached to its object by the creation hook installed
// around PropertySheet; each page window by the hook the page's PSPCB_CREATE
// callback installs just before the system creates it. Pages use AfxDlgProc as
// their dialog procedure, so WM_INITDIALOG reaches the page's OnInitDialog.
#include "wndimpl.h"

#include <afxdlgs.h>

// The buttons a modeless sheet does without; the help button is IDHELP in the
// system's template and ID_HELP in older ones.
static const UINT _afxStandardButtons[] = { IDOK, IDCANCEL, IDHELP, ID_HELP, ID_APPLY_NOW };

// The style Create asks for, read by the pre-create callback on the same thread.
static thread_local DWORD t_dwPropStyle = 0;
static thread_local DWORD t_dwPropExStyle = 0;

static UINT CALLBACK AfxPropPageCallback(HWND, UINT message, LPPROPSHEETPAGE pPropPage)
{
    switch (message)
    {
    case PSPCB_CREATE:
        {
            CObject* pObject = (CObject*)pPropPage->lParam;
            if (pObject == NULL || !pObject->IsKindOf(RUNTIME_CLASS(CPropertyPage)))
                return FALSE;
            TRY
            {
                AfxHookWindowCreate((CPropertyPage*)pObject);
            }
            CATCH_ALL(e)
            {
                return FALSE;
            }
            END_CATCH_ALL
        }
        return TRUE;

    case PSPCB_RELEASE:
        AfxUnhookWindowCreate();
        break;
    }
    return 0;
}

// The sheet's template gets the style and extended style Create was given.
static int CALLBACK AfxPropSheetCallback(HWND, UINT message, LPARAM lParam)
{
    if (message != PSCB_PRECREATE || lParam == 0)
        return 0;

    BYTE* pTemplate = (BYTE*)lParam;
    DWORD* pdwStyle;
    DWORD* pdwExStyle;
    if (*(const WORD*)(pTemplate + 2) == 0xFFFF)
    {
        // DLGTEMPLATEEX: dlgVer, signature, helpID, exStyle, style
        pdwExStyle = (DWORD*)(pTemplate + 8);
        pdwStyle = (DWORD*)(pTemplate + 12);
    }
    else
    {
        pdwStyle = &((DLGTEMPLATE*)pTemplate)->style;
        pdwExStyle = &((DLGTEMPLATE*)pTemplate)->dwExtendedStyle;
    }

    // the font the template names stays
    DWORD dwStyle = (*pdwStyle & DS_SETFONT) ? (t_dwPropStyle | DS_SETFONT) : (t_dwPropStyle & ~DS_SETFONT);
    if (*pdwStyle == dwStyle && *pdwExStyle == t_dwPropExStyle)
        return FALSE;
    // the template may lie in read-only resource memory
    DWORD dwOldProtect;
    ::VirtualProtect(pTemplate, 16, PAGE_READWRITE, &dwOldProtect);
    *pdwStyle = dwStyle;
    *pdwExStyle = t_dwPropExStyle;
    return TRUE;
}

/////////////////////////////////////////////////////////////////////////////
// CPropertyPage

IMPLEMENT_DYNAMIC(CPropertyPage, CDialog)

BEGIN_MESSAGE_MAP(CPropertyPage, CDialog)
END_MESSAGE_MAP()

CPropertyPage::CPropertyPage()
{
    CommonConstruct(NULL, 0);
}

CPropertyPage::CPropertyPage(UINT nIDTemplate, UINT nIDCaption, DWORD dwSize)
{
    CommonConstruct(MAKEINTRESOURCE(nIDTemplate), nIDCaption);
    if (dwSize >= PROPSHEETPAGE_V1_SIZE && dwSize <= sizeof(PROPSHEETPAGE))
        m_psp.dwSize = dwSize;
}

CPropertyPage::CPropertyPage(LPCTSTR lpszTemplateName, UINT nIDCaption, DWORD dwSize)
{
    CommonConstruct(lpszTemplateName, nIDCaption);
    if (dwSize >= PROPSHEETPAGE_V1_SIZE && dwSize <= sizeof(PROPSHEETPAGE))
        m_psp.dwSize = dwSize;
}

void CPropertyPage::Construct(UINT nIDTemplate, UINT nIDCaption)
{
    CommonConstruct(MAKEINTRESOURCE(nIDTemplate), nIDCaption);
}

void CPropertyPage::Construct(LPCTSTR lpszTemplateName, UINT nIDCaption)
{
    CommonConstruct(lpszTemplateName, nIDCaption);
}

void CPropertyPage::CommonConstruct(LPCTSTR lpszTemplateName, UINT nIDCaption)
{
    memset(&m_psp, 0, sizeof(m_psp));
    m_psp.dwSize = sizeof(m_psp);
    m_psp.dwFlags = PSP_USECALLBACK;
    m_psp.pszTemplate = lpszTemplateName;
    m_psp.pfnDlgProc = AfxDlgProc;
    m_psp.lParam = (LPARAM)this;
    m_psp.pfnCallback = AfxPropPageCallback;
    if (nIDCaption != 0 && m_strCaption.LoadString(nIDCaption))
    {
        m_psp.pszTitle = m_strCaption;
        m_psp.dwFlags |= PSP_USETITLE;
    }
    if (IS_INTRESOURCE(lpszTemplateName))
        m_nIDHelp = LOWORD((DWORD_PTR)lpszTemplateName);
    m_lpszTemplateName = lpszTemplateName;
    m_bFirstSetActive = TRUE;
}

CPropertyPage::~CPropertyPage()
{
}

void CPropertyPage::PreProcessPageTemplate(PROPSHEETPAGE& psp, BOOL)
{
    psp.dwSize = sizeof(PROPSHEETPAGE);
    if (!(psp.dwFlags & PSP_DLGINDIRECT) && psp.pszTemplate != NULL)
        psp.hInstance = AfxFindResourceHandle(psp.pszTemplate, RT_DIALOG);
}

void CPropertyPage::CancelToClose()
{
    if (HWND hWndSheet = ::GetParent(m_hWnd))
        ::SendMessage(hWndSheet, PSM_CANCELTOCLOSE, 0, 0);
}

void CPropertyPage::SetModified(BOOL bChanged)
{
    if (HWND hWndSheet = ::GetParent(m_hWnd))
        ::SendMessage(hWndSheet, bChanged ? PSM_CHANGED : PSM_UNCHANGED, (WPARAM)m_hWnd, 0);
}

BOOL CPropertyPage::OnApply()
{
    OnOK();
    return TRUE;
}

void CPropertyPage::OnReset()
{
    OnCancel();
}

// A page does not end like a dialog: OK and Cancel belong to the sheet.
void CPropertyPage::OnOK()
{
}

void CPropertyPage::OnCancel()
{
}

// The first activation follows OnInitDialog, which has exchanged the data already.
BOOL CPropertyPage::OnSetActive()
{
    if (m_bFirstSetActive)
        m_bFirstSetActive = FALSE;
    else
        UpdateData(FALSE);
    return TRUE;
}

BOOL CPropertyPage::OnKillActive()
{
    return UpdateData(TRUE);
}

BOOL CPropertyPage::OnQueryCancel()
{
    return TRUE;
}

BOOL CPropertyPage::OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    if (CDialog::OnNotify(wParam, lParam, pResult))
        return TRUE;

    // only the sheet's notifications to this page
    NMHDR* pNMHDR = (NMHDR*)lParam;
    if (pNMHDR->hwndFrom != m_hWnd && pNMHDR->hwndFrom != ::GetParent(m_hWnd))
        return FALSE;

    switch (pNMHDR->code)
    {
    case PSN_SETACTIVE:
        *pResult = OnSetActive() ? 0 : -1;
        break;
    case PSN_KILLACTIVE:
        *pResult = !OnKillActive();
        break;
    case PSN_APPLY:
        *pResult = OnApply() ? PSNRET_NOERROR : PSNRET_INVALID_NOCHANGEPAGE;
        break;
    case PSN_RESET:
        OnReset();
        break;
    case PSN_QUERYCANCEL:
        *pResult = !OnQueryCancel();
        break;
    default:
        return FALSE;
    }
    return TRUE;
}

// The sheet above runs the dialog keys for all its pages.
BOOL CPropertyPage::PreTranslateMessage(MSG* pMsg)
{
    CWnd::PreTranslateMessage(pMsg);
    return FALSE;
}

/////////////////////////////////////////////////////////////////////////////
// CPropertySheet

IMPLEMENT_DYNAMIC(CPropertySheet, CWnd)

BEGIN_MESSAGE_MAP(CPropertySheet, CWnd)
    ON_WM_NCCREATE()
    ON_MESSAGE(WM_INITDIALOG, &CPropertySheet::HandleInitDialog)
    ON_WM_CLOSE()
END_MESSAGE_MAP()

CPropertySheet::CPropertySheet()
{
    CommonConstruct(NULL, 0);
}

CPropertySheet::CPropertySheet(UINT nIDCaption, CWnd* pParentWnd, UINT iSelectPage)
{
    m_strCaption.LoadString(nIDCaption);
    CommonConstruct(pParentWnd, iSelectPage);
}

CPropertySheet::CPropertySheet(LPCTSTR pszCaption, CWnd* pParentWnd, UINT iSelectPage)
{
    m_strCaption = pszCaption;
    CommonConstruct(pParentWnd, iSelectPage);
}

void CPropertySheet::Construct(UINT nIDCaption, CWnd* pParentWnd, UINT iSelectPage)
{
    m_strCaption.LoadString(nIDCaption);
    CommonConstruct(pParentWnd, iSelectPage);
}

void CPropertySheet::Construct(LPCTSTR pszCaption, CWnd* pParentWnd, UINT iSelectPage)
{
    m_strCaption = pszCaption;
    CommonConstruct(pParentWnd, iSelectPage);
}

void CPropertySheet::CommonConstruct(CWnd* pParentWnd, UINT iSelectPage)
{
    memset(&m_psh, 0, sizeof(m_psh));
    m_psh.dwSize = sizeof(m_psh);
    m_psh.dwFlags = PSH_PROPSHEETPAGE;
    m_psh.pszCaption = m_strCaption;
    m_psh.nStartPage = iSelectPage;
    m_pParentWnd = pParentWnd;
    m_bStacked = TRUE;
    m_bModeless = FALSE;
}

CPropertySheet::~CPropertySheet()
{
    delete[] (PROPSHEETPAGE*)m_psh.ppsp;
}

BOOL CPropertySheet::IsWizard() const
{
    return (m_psh.dwFlags & (PSH_WIZARD | PSH_WIZARD97)) != 0;
}

void CPropertySheet::BuildPropPageArray()
{
    delete[] (PROPSHEETPAGE*)m_psh.ppsp;
    m_psh.ppsp = NULL;

    INT_PTR nPages = m_pages.GetSize();
    PROPSHEETPAGE* ppsp = new PROPSHEETPAGE[nPages > 0 ? nPages : 1];
    for (INT_PTR i = 0; i < nPages; ++i)
    {
        CPropertyPage* pPage = GetPage((int)i);
        memcpy(&ppsp[i], &pPage->m_psp, sizeof(PROPSHEETPAGE));
        pPage->PreProcessPageTemplate(ppsp[i], IsWizard());
    }
    m_psh.ppsp = ppsp;
    m_psh.nPages = (UINT)nPages;
}

BOOL CPropertySheet::Create(CWnd* pParentWnd, DWORD dwStyle, DWORD dwExStyle)
{
    if (m_hWnd != NULL)
        return FALSE;

    if (dwStyle == (DWORD)-1)
    {
        t_dwPropStyle = DS_MODALFRAME | DS_3DLOOK | DS_CONTEXTHELP | DS_SETFONT | WS_POPUP
            | WS_VISIBLE | WS_CAPTION;
        if (!IsWizard())
            t_dwPropStyle |= WS_SYSMENU;
    }
    else
        t_dwPropStyle = dwStyle;
    t_dwPropExStyle = dwExStyle;

    AfxDeferRegisterClass(AFX_WNDCOMMCTLS_REG);
    BuildPropPageArray();
    m_bModeless = TRUE;
    m_psh.dwFlags |= PSH_MODELESS | PSH_USECALLBACK;
    m_psh.pfnCallback = AfxPropSheetCallback;
    m_psh.hwndParent = pParentWnd->GetSafeHwnd();
    m_psh.pszCaption = m_strCaption;
    if (m_pParentWnd == NULL)
        m_pParentWnd = pParentWnd;

    AfxHookWindowCreate(this);
    HWND hWnd = (HWND)::PropertySheet(&m_psh);
    if (!AfxUnhookWindowCreate())
        PostNcDestroy();    // the sheet's window was never made
    return hWnd != NULL && hWnd != (HWND)-1;
}

BOOL CPropertySheet::OnNcCreate(LPCREATESTRUCT)
{
    // the caption's help button would need help support of the derived class
    ModifyStyleEx(WS_EX_CONTEXTHELP, 0);
    return (BOOL)Default();
}

LRESULT CPropertySheet::HandleInitDialog(WPARAM, LPARAM)
{
    return OnInitDialog();
}

BOOL CPropertySheet::OnInitDialog()
{
    HWND hWndTab = ::GetDlgItem(m_hWnd, AFX_IDC_TAB_CONTROL);
    if (!m_bStacked && hWndTab != NULL)
    {
        LONG_PTR lStyle = ::GetWindowLongPtr(hWndTab, GWL_STYLE);
        ::SetWindowLongPtr(hWndTab, GWL_STYLE, (lStyle & ~TCS_MULTILINE) | TCS_SINGLELINE);
    }

    if (!IsWizard() && hWndTab != NULL)
    {
        // A small tab control lets the system size it to the largest page
        // (it only ever grows it); the buttons and the sheet follow.
        CRect rectOld;
        ::GetWindowRect(hWndTab, &rectOld);
        ScreenToClient(&rectOld);
        CRect rectNew(0, 0, 0, 32);
        ::MapDialogRect(m_hWnd, &rectNew);
        if (rectNew.bottom < rectOld.bottom)
        {
            int cyDiff = rectOld.Height() - rectNew.bottom;
            ::SetWindowPos(hWndTab, NULL, 0, 0, rectOld.Width(), rectNew.bottom,
                SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
            for (UINT nID : _afxStandardButtons)
            {
                HWND hWndButton = ::GetDlgItem(m_hWnd, (int)nID);
                if (hWndButton == NULL)
                    continue;
                CRect rectButton;
                ::GetWindowRect(hWndButton, &rectButton);
                ScreenToClient(&rectButton);
                ::SetWindowPos(hWndButton, NULL, rectButton.left, rectButton.top - cyDiff, 0, 0,
                    SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
            }
            CRect rectWnd;
            GetWindowRect(&rectWnd);
            SetWindowPos(NULL, 0, 0, rectWnd.Width(), rectWnd.Height() - cyDiff,
                SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
        }
    }

    BOOL bResult = (BOOL)Default();

    if (m_bModeless && !IsWizard())
    {
        // the sheet ends above its buttons, which go
        CRect rectWnd;
        GetWindowRect(&rectWnd);
        HWND hWndOK = ::GetDlgItem(m_hWnd, IDOK);
        if (hWndOK != NULL)
        {
            CRect rectButton;
            ::GetWindowRect(hWndOK, &rectButton);
            SetWindowPos(NULL, 0, 0, rectWnd.Width(), rectButton.top - rectWnd.top,
                SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
        }
        for (UINT nID : _afxStandardButtons)
        {
            HWND hWndButton = ::GetDlgItem(m_hWnd, (int)nID);
            if (hWndButton != NULL)
            {
                ::ShowWindow(hWndButton, SW_HIDE);
                ::EnableWindow(hWndButton, FALSE);
            }
        }
    }

    if (!(GetStyle() & WS_CHILD))
        CenterWindow();
    return bResult;
}

void CPropertySheet::OnClose()
{
    m_nModalResult = IDCANCEL;
    if (m_bModeless)
        DestroyWindow();
    else
        Default();
}

BOOL CPropertySheet::PreTranslateMessage(MSG* pMsg)
{
    if (CWnd::PreTranslateMessage(pMsg))
        return TRUE;
    // Ctrl+Tab, Ctrl+Shift+Tab, Ctrl+PageUp and Ctrl+PageDown change pages
    if (pMsg->message == WM_KEYDOWN && ::GetKeyState(VK_CONTROL) < 0
        && (pMsg->wParam == VK_TAB || pMsg->wParam == VK_PRIOR || pMsg->wParam == VK_NEXT))
    {
        if (SendMessage(PSM_ISDIALOGMESSAGE, 0, (LPARAM)pMsg))
            return TRUE;
    }
    return PreTranslateInput(pMsg);
}

int CPropertySheet::GetPageCount() const
{
    if (m_hWnd == NULL)
        return (int)m_pages.GetSize();
    HWND hWndTab = (HWND)::SendMessage(m_hWnd, PSM_GETTABCONTROL, 0, 0);
    return hWndTab != NULL ? TabCtrl_GetItemCount(hWndTab) : 0;
}

int CPropertySheet::GetActiveIndex() const
{
    if (m_hWnd == NULL)
        return (int)m_psh.nStartPage;
    HWND hWndTab = (HWND)::SendMessage(m_hWnd, PSM_GETTABCONTROL, 0, 0);
    return hWndTab != NULL ? TabCtrl_GetCurSel(hWndTab) : -1;
}

CPropertyPage* CPropertySheet::GetActivePage() const
{
    if (m_hWnd == NULL)
        return GetPage(GetActiveIndex());
    CWnd* pWnd = CWnd::FromHandlePermanent((HWND)::SendMessage(m_hWnd, PSM_GETCURRENTPAGEHWND, 0, 0));
    return pWnd != NULL && pWnd->IsKindOf(RUNTIME_CLASS(CPropertyPage)) ? (CPropertyPage*)pWnd : NULL;
}

CPropertyPage* CPropertySheet::GetPage(int nPage) const
{
    if (nPage < 0 || nPage >= m_pages.GetSize())
        return NULL;
    return (CPropertyPage*)m_pages.GetAt(nPage);
}

int CPropertySheet::GetPageIndex(CPropertyPage* pPage)
{
    for (INT_PTR i = 0; i < m_pages.GetSize(); ++i)
    {
        if (m_pages.GetAt(i) == pPage)
            return (int)i;
    }
    return -1;
}

BOOL CPropertySheet::SetActivePage(int nPage)
{
    if (m_hWnd == NULL)
    {
        m_psh.nStartPage = (UINT)nPage;
        return TRUE;
    }
    return (BOOL)SendMessage(PSM_SETCURSEL, (WPARAM)nPage, 0);
}

BOOL CPropertySheet::SetActivePage(CPropertyPage* pPage)
{
    int nPage = GetPageIndex(pPage);
    return nPage >= 0 && SetActivePage(nPage);
}

void CPropertySheet::SetTitle(LPCTSTR lpszText, UINT nStyle)
{
    m_psh.dwFlags = (m_psh.dwFlags & ~PSH_PROPTITLE) | (nStyle & PSH_PROPTITLE);
    m_strCaption = lpszText;
    m_psh.pszCaption = m_strCaption;
    if (m_hWnd != NULL)
        SendMessage(PSM_SETTITLE, nStyle, (LPARAM)lpszText);
}

void CPropertySheet::AddPage(CPropertyPage* pPage)
{
    if (pPage == NULL)
        return;
    m_pages.Add(pPage);
    if (m_hWnd == NULL)
        return;

    // a sheet that exists gets the page at once
    PROPSHEETPAGE psp;
    memcpy(&psp, &pPage->m_psp, sizeof(psp));
    pPage->PreProcessPageTemplate(psp, IsWizard());
    HPROPSHEETPAGE hPSP = ::CreatePropertySheetPage(&psp);
    if (hPSP == NULL || !SendMessage(PSM_ADDPAGE, 0, (LPARAM)hPSP))
    {
        if (hPSP != NULL)
            ::DestroyPropertySheetPage(hPSP);
        m_pages.RemoveAt(m_pages.GetSize() - 1);
        AfxThrowMemoryException();
    }
}

void CPropertySheet::RemovePage(CPropertyPage* pPage)
{
    int nPage = GetPageIndex(pPage);
    if (nPage >= 0)
        RemovePage(nPage);
}

void CPropertySheet::RemovePage(int nPage)
{
    if (nPage < 0 || nPage >= m_pages.GetSize())
        return;
    if (m_hWnd != NULL)
        SendMessage(PSM_REMOVEPAGE, (WPARAM)nPage, 0);
    m_pages.RemoveAt(nPage);
}
