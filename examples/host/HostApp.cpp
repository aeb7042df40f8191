// A host application of OrvaneControls: one dialog, run as the whole application.
//   OrvaneHost.exe             shows the dialog, then what was chosen
//   OrvaneHost.exe /selfcheck  shows the dialog, checks and prints its controls, exits
//                              with 0 when all are there, 1 otherwise
#include <afxwin.h>
#include <commctrl.h>

#include <cwchar>

#include "HostDialog.h"
#include "OrvaneControls.h"

class CHostApp : public CWinApp
{
public:
    CHostApp() : CWinApp(_T("OrvaneControls host")), m_nExitCode(0) {}

    BOOL InitInstance() override;
    int ExitInstance() override;

private:
    int m_nExitCode;
};

CHostApp theApp;

BOOL CHostApp::InitInstance()
{
    INITCOMMONCONTROLSEX icc = { sizeof icc, ICC_TREEVIEW_CLASSES };
    ::InitCommonControlsEx(&icc);
    // The controls find their strings, dialog templates and cursor through this.
    LoadOrvaneControlsLibrary();

    const bool bSelfCheck = m_lpCmdLine != NULL && std::wcsstr(m_lpCmdLine, L"/selfcheck") != NULL;
    CHostDialog dlg(bSelfCheck);
    const INT_PTR nResult = dlg.DoModal();
    if (bSelfCheck)
    {
        m_nExitCode = nResult == IDOK ? 0 : 1;
    }
    else if (nResult == IDOK)
    {
        CString text;
        text.Format(_T("Count %ld, colour #%02X%02X%02X, %u tree items selected."), dlg.m_lCount,
                    GetRValue(dlg.m_clrColour), GetGValue(dlg.m_clrColour), GetBValue(dlg.m_clrColour),
                    dlg.m_nSelected);
        AfxMessageBox(text, MB_OK | MB_ICONINFORMATION);
    }
    // The dialog was the application: no message loop follows.
    return FALSE;
}

int CHostApp::ExitInstance()
{
    CWinApp::ExitInstance();
    return m_nExitCode;
}
