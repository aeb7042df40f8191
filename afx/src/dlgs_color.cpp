// CCommonDialog and CColorDialog: the standard colour dialog run through ChooseColor.
//
// As in MFC, DoModal hooks window creation (PreModal) so that the dialog window
// ChooseColor creates is attached to the object at once; the dialog's own procedure
// calls the hook below, which hands WM_INITDIALOG to the object's OnInitDialog and the
// colour-OK notification to OnColorOK.
#include <afxdlgs.h>

namespace {

// The custom colours every colour dialog of the process shows and updates.
COLORREF g_clrSavedCustom[16] = {
    RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255),
    RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255),
    RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255),
    RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255), RGB(255, 255, 255),
};

UINT ColorOkMessage()
{
    static const UINT nMsg = ::RegisterWindowMessage(COLOROKSTRING);
    return nMsg;
}

UINT SetRgbMessage()
{
    static const UINT nMsg = ::RegisterWindowMessage(SETRGBSTRING);
    return nMsg;
}

} // namespace

UINT_PTR CALLBACK _AfxCommDlgProc(HWND hWnd, UINT message, WPARAM wParam, LPARAM lParam)
{
    if (hWnd == NULL)
        return 0;
    if (message == WM_INITDIALOG)
        return static_cast<UINT_PTR>(AfxDlgProc(hWnd, message, wParam, lParam));
    if (message == ColorOkMessage())
    {
        CWnd* pWnd = CWnd::FromHandlePermanent(hWnd);
        if (pWnd != NULL && pWnd->IsKindOf(RUNTIME_CLASS(CColorDialog)))
        {
            CColorDialog* pDlg = static_cast<CColorDialog*>(pWnd);
            // lParam carries the colour about to be returned; GetColor shows it.
            if (lParam != 0)
                pDlg->m_cc.rgbResult = reinterpret_cast<LPCHOOSECOLOR>(lParam)->rgbResult;
            return pDlg->OnColorOK();
        }
    }
    return 0;
}

/////////////////////////////////////////////////////////////////////////////
// CCommonDialog

CCommonDialog::CCommonDialog(CWnd* pParentWnd)
    : CDialog(static_cast<UINT>(0), pParentWnd)
{
}

void CCommonDialog::OnOK()
{
    if (!UpdateData(TRUE))
        return;
    Default();
}

void CCommonDialog::OnCancel()
{
    Default();
}

/////////////////////////////////////////////////////////////////////////////
// CColorDialog

IMPLEMENT_DYNAMIC(CColorDialog, CDialog)

CColorDialog::CColorDialog(COLORREF clrInit, DWORD dwFlags, CWnd* pParentWnd)
    : CCommonDialog(pParentWnd)
{
    memset(&m_cc, 0, sizeof(m_cc));
    m_cc.lStructSize = sizeof(m_cc);
    m_cc.lpCustColors = GetSavedCustomColors();
    m_cc.Flags = dwFlags | CC_ENABLEHOOK;
    m_cc.lpfnHook = _AfxCommDlgProc;
    if ((m_cc.rgbResult = clrInit) != 0)
        m_cc.Flags |= CC_RGBINIT;
}

INT_PTR CColorDialog::DoModal()
{
    ASSERT(m_cc.Flags & CC_ENABLEHOOK);
    ASSERT(m_cc.lpfnHook != NULL);

    m_cc.hwndOwner = PreModal();
    // The dialog window ChooseColor creates is attached to this object as it is born.
    AfxHookWindowCreate(this);
    const BOOL bResult = ::ChooseColor(&m_cc);
    PostModal();
    return bResult ? IDOK : IDCANCEL;
}

void CColorDialog::SetCurrentColor(COLORREF clr)
{
    ASSERT(::IsWindow(m_hWnd));
    SendMessage(SetRgbMessage(), 0, static_cast<LPARAM>(clr));
}

COLORREF CColorDialog::GetColor() const
{
    return m_cc.rgbResult;
}

COLORREF* PASCAL CColorDialog::GetSavedCustomColors()
{
    return g_clrSavedCustom;
}

BOOL CColorDialog::OnColorOK()
{
    return FALSE;
}
