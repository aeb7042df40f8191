// Dialog data exchange: CDataExchange and the DDX/DDV routines.
#include "wndimpl.h"
#include <errno.h>
#include <stdlib.h>

CDataExchange::CDataExchange(CWnd* pDlgWnd, BOOL bSaveAndValidate)
    : m_bSaveAndValidate(bSaveAndValidate), m_pDlgWnd(pDlgWnd),
      m_idLastControl(0), m_bEditLastControl(FALSE)
{
}

HWND CDataExchange::PrepareCtrl(int nIDC)
{
    HWND hWndCtrl = NULL;
    m_pDlgWnd->GetDlgItem(nIDC, &hWndCtrl);
    if (hWndCtrl == NULL)
        AfxThrowNotSupportedException();    // no such control in the dialog
    m_idLastControl = (UINT)nIDC;
    m_bEditLastControl = FALSE;
    return hWndCtrl;
}

HWND CDataExchange::PrepareEditCtrl(int nIDC)
{
    HWND hWndCtrl = PrepareCtrl(nIDC);
    m_bEditLastControl = TRUE;
    return hWndCtrl;
}

// Puts the focus back on the offending control and abandons the exchange.
void CDataExchange::Fail()
{
    if (!m_bSaveAndValidate)
        return;     // nothing to validate when loading the controls
    HWND hWndLastControl = NULL;
    m_pDlgWnd->GetDlgItem((int)m_idLastControl, &hWndLastControl);
    if (hWndLastControl != NULL)
    {
        ::SetFocus(hWndLastControl);
        if (m_bEditLastControl)
            ::SendMessage(hWndLastControl, EM_SETSEL, 0, -1);
    }
    AfxThrowUserException();
}

/////////////////////////////////////////////////////////////////////////////

static void FailWithMessage(CDataExchange* pDX, UINT nIDPrompt, LPCTSTR lpszDefault)
{
    CString strPrompt;
    if (!strPrompt.LoadString(nIDPrompt))
        strPrompt = lpszDefault;
    AfxMessageBox(strPrompt, MB_ICONEXCLAMATION, nIDPrompt);
    pDX->Fail();
}

static CString ControlText(HWND hWndCtrl)
{
    CString str;
    int nLen = ::GetWindowTextLength(hWndCtrl);
    LPTSTR pBuffer = str.GetBufferSetLength(nLen);
    int nCopied = ::GetWindowText(hWndCtrl, pBuffer, nLen + 1);
    str.ReleaseBuffer(nCopied);
    return str;
}

// Whole text must be a number in range, blanks around it allowed.
static BOOL ParseLong(LPCTSTR psz, BOOL bSigned, long long& value)
{
    while (*psz == ' ' || *psz == '\t')
        ++psz;
    if (*psz == 0 || (!bSigned && *psz == '-'))
        return FALSE;
    wchar_t* pEnd = NULL;
    errno = 0;
    value = wcstoll(psz, &pEnd, 10);
    if (errno != 0 || pEnd == psz)
        return FALSE;
    while (*pEnd == ' ' || *pEnd == '\t')
        ++pEnd;
    return *pEnd == 0;
}

void AFXAPI DDX_Control(CDataExchange* pDX, int nIDC, CWnd& rControl)
{
    if (rControl.m_hWnd == NULL)
    {
        HWND hWndCtrl = pDX->PrepareCtrl(nIDC);
        if (!rControl.SubclassWindow(hWndCtrl))
            AfxThrowNotSupportedException();
    }
}

void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, int& value)
{
    HWND hWndCtrl = pDX->PrepareEditCtrl(nIDC);
    if (pDX->m_bSaveAndValidate)
    {
        long long parsed = 0;
        if (!ParseLong(ControlText(hWndCtrl), TRUE, parsed) || parsed < INT_MIN || parsed > INT_MAX)
            FailWithMessage(pDX, AFX_IDP_PARSE_INT, _T("Please enter an integer."));
        value = (int)parsed;
    }
    else
    {
        TCHAR szBuffer[32];
        wsprintf(szBuffer, _T("%d"), value);
        ::SetWindowText(hWndCtrl, szBuffer);
    }
}

void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, long& value)
{
    int n = (int)value;
    DDX_Text(pDX, nIDC, n);
    value = n;
}

void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, UINT& value)
{
    HWND hWndCtrl = pDX->PrepareEditCtrl(nIDC);
    if (pDX->m_bSaveAndValidate)
    {
        long long parsed = 0;
        if (!ParseLong(ControlText(hWndCtrl), FALSE, parsed) || parsed > UINT_MAX)
            FailWithMessage(pDX, AFX_IDP_PARSE_UINT, _T("Please enter a positive integer."));
        value = (UINT)parsed;
    }
    else
    {
        TCHAR szBuffer[32];
        wsprintf(szBuffer, _T("%u"), value);
        ::SetWindowText(hWndCtrl, szBuffer);
    }
}

void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, CString& value)
{
    HWND hWndCtrl = pDX->PrepareEditCtrl(nIDC);
    if (pDX->m_bSaveAndValidate)
        value = ControlText(hWndCtrl);
    else
        ::SetWindowText(hWndCtrl, value);
}

void AFXAPI DDX_Check(CDataExchange* pDX, int nIDC, int& value)
{
    HWND hWndCtrl = pDX->PrepareCtrl(nIDC);
    if (pDX->m_bSaveAndValidate)
        value = (int)::SendMessage(hWndCtrl, BM_GETCHECK, 0, 0);
    else
    {
        if (value < 0 || value > 2)
            value = 0;  // only unchecked, checked and indeterminate exist
        ::SendMessage(hWndCtrl, BM_SETCHECK, (WPARAM)value, 0);
    }
}

// nIDC is the first button of a group; value is the index of the checked one
// (-1 for none).
void AFXAPI DDX_Radio(CDataExchange* pDX, int nIDC, int& value)
{
    HWND hWndCtrl = pDX->PrepareCtrl(nIDC);
    if (pDX->m_bSaveAndValidate)
        value = -1;
    int iButton = 0;
    do
    {
        if (::SendMessage(hWndCtrl, WM_GETDLGCODE, 0, 0) & DLGC_RADIOBUTTON)
        {
            if (pDX->m_bSaveAndValidate)
            {
                if (::SendMessage(hWndCtrl, BM_GETCHECK, 0, 0) != 0)
                    value = iButton;
            }
            else
                ::SendMessage(hWndCtrl, BM_SETCHECK, (iButton == value), 0);
            iButton++;
        }
        hWndCtrl = ::GetWindow(hWndCtrl, GW_HWNDNEXT);
    } while (hWndCtrl != NULL && !(::GetWindowLongPtr(hWndCtrl, GWL_STYLE) & WS_GROUP));
}

void AFXAPI DDV_MaxChars(CDataExchange* pDX, CString const& value, int nChars)
{
    if (pDX->m_bSaveAndValidate && value.GetLength() > nChars)
    {
        CString strPrompt;
        strPrompt.Format(_T("Enter no more than %d characters."), nChars);
        AfxMessageBox(strPrompt, MB_ICONEXCLAMATION, AFX_IDP_PARSE_STRING_SIZE);
        pDX->Fail();
    }
    else if (!pDX->m_bSaveAndValidate && pDX->m_idLastControl != 0 && pDX->m_bEditLastControl)
    {
        HWND hWndLastControl = NULL;
        pDX->m_pDlgWnd->GetDlgItem((int)pDX->m_idLastControl, &hWndLastControl);
        if (hWndLastControl != NULL)
            ::SendMessage(hWndLastControl, EM_LIMITTEXT, (WPARAM)nChars, 0);
    }
}

void AFXAPI DDV_MinMaxInt(CDataExchange* pDX, int value, int minVal, int maxVal)
{
    if (!pDX->m_bSaveAndValidate || (value >= minVal && value <= maxVal))
        return;
    CString strPrompt;
    strPrompt.Format(_T("Enter an integer between %d and %d."), minVal, maxVal);
    AfxMessageBox(strPrompt, MB_ICONEXCLAMATION, AFX_IDP_PARSE_INT_RANGE);
    pDX->Fail();
}
