// KVXColorDialog: the standard colour dialog with a caption of the host's choosing.
// The caption holds string 5101 ("Color") after construction and again after every
// run, so SetWindowName applies to the next run only.
#pragma once

#include <afxwin.h>
#include <afxdlgs.h>

class AFX_EXT_CLASS KVXColorDialog : public CColorDialog
{
    DECLARE_DYNAMIC(KVXColorDialog)

// Constructors
public:
    KVXColorDialog(COLORREF clrInit = 0, DWORD dwFlags = 0, CWnd* pParentWnd = NULL);
    virtual ~KVXColorDialog();

// Operations
public:
    // Caption of the next run.
    void SetWindowName(CString strWindowName);

// Overridables
public:
    virtual INT_PTR DoModal();
protected:
    virtual BOOL OnInitDialog();

// Implementation
protected:
    CString m_strWindowName;
};
