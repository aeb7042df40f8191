// AfxMessageBox and CWinApp::DoMessageBox.
#include "wndimpl.h"

// The box is owned by the thread's active top-level window (or the main
// window's last active pop-up), which is disabled meanwhile; the caption is the
// application's name. Without an icon in nType one is chosen by the buttons.
int CWinApp::DoMessageBox(LPCTSTR lpszPrompt, UINT nType, UINT)
{
    EnableModeless(FALSE);
    HWND hWndTop = NULL;
    HWND hWnd = CWnd::GetSafeOwner_(NULL, &hWndTop);

    // With the owner itself enabled the focus returns to it when the box closes.
    if (hWnd != hWndTop && hWnd != NULL)
        ::EnableWindow(hWnd, TRUE);

    if ((nType & MB_ICONMASK) == 0)
    {
        switch (nType & MB_TYPEMASK)
        {
        case MB_OK:
        case MB_OKCANCEL:
            nType |= MB_ICONEXCLAMATION;
            break;
        case MB_YESNO:
        case MB_YESNOCANCEL:
            nType |= MB_ICONQUESTION;
            break;
        default:
            break;
        }
    }

    LPCTSTR pszAppName = m_pszAppName != NULL ? m_pszAppName : AfxGetAppName();
    int nResult = ::MessageBox(hWnd, lpszPrompt != NULL ? lpszPrompt : _T(""), pszAppName, nType);

    if (hWndTop != NULL)
        ::EnableWindow(hWndTop, TRUE);
    EnableModeless(TRUE);
    return nResult;
}

int AFXAPI AfxMessageBox(LPCTSTR lpszText, UINT nType, UINT nIDHelp)
{
    CWinApp* pApp = AfxGetApp();
    if (pApp != NULL)
        return pApp->DoMessageBox(lpszText, nType, nIDHelp);

    // No application object: a plain box with the same owner rules
    HWND hWndTop = NULL;
    HWND hWnd = CWnd::GetSafeOwner_(NULL, &hWndTop);
    if (hWnd != hWndTop && hWnd != NULL)
        ::EnableWindow(hWnd, TRUE);
    int nResult = ::MessageBox(hWnd, lpszText != NULL ? lpszText : _T(""), AfxGetAppName(), nType);
    if (hWndTop != NULL)
        ::EnableWindow(hWndTop, TRUE);
    return nResult;
}

int AFXAPI AfxMessageBox(UINT nIDPrompt, UINT nType, UINT nIDHelp)
{
    CString string;
    string.LoadString(nIDPrompt);
    if (nIDHelp == (UINT)-1)
        nIDHelp = nIDPrompt;
    return AfxMessageBox(string, nType, nIDHelp);
}
