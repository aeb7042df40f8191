// KVXListCtrlPropSheetData: what a host sets for the column chooser of a column-
// customising list before the chooser first opens: the help target and method called
// when the user presses F1 in it, and the caption of its window.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXListCtrlPropSheetData
{
public:
    KVXListCtrlPropSheetData();
    virtual ~KVXListCtrlPropSheetData();

    // (m_pHelpTarget->*m_pfnDisplayHelp)(_T(""), 5105, page window) on F1; both or nothing.
    CCmdTarget* m_pHelpTarget;                              // not owned
    void (CCmdTarget::*m_pfnDisplayHelp)(CString, UINT, HWND);
    CString m_strCaption;
};
