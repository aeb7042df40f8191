// KVXListCtrlPropFrame: the column chooser's window, a small tool window with caption
// and system menu around the chooser's sheet. Closing it only hides it; it deletes
// itself when its window is destroyed (the column-customising list destroys it with
// its own window).
#pragma once

#include <afxwin.h>

#include "KVXListCtrlPropSheet.h"

class AFX_EXT_CLASS KVXListCtrlPropFrame : public CMiniFrameWnd
{
    DECLARE_DYNCREATE(KVXListCtrlPropFrame)

// Constructors
public:
    KVXListCtrlPropFrame();
    virtual ~KVXListCtrlPropFrame();

// Attributes
    KVXListCtrlPropSheet* m_pSheet;     // made in OnCreate; deletes itself

// Message map and handlers
protected:
    afx_msg int OnCreate(LPCREATESTRUCT lpCreateStruct);
    afx_msg void OnClose();
    afx_msg void OnSetFocus(CWnd* pOldWnd);
    afx_msg void OnActivate(UINT nState, CWnd* pWndOther, BOOL bMinimized);
    DECLARE_MESSAGE_MAP()
};
