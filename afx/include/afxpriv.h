// afxpriv.h - framework messages and helpers used between framework classes.
#pragma once

#ifndef __AFXPRIV_H__
#define __AFXPRIV_H__

#ifndef __AFXWIN_H__
#include <afxwin.h>
#endif

// Private framework window messages
#define WM_QUERYAFXWNDPROC  0x0360  // answered with 1 by every framework window
#define WM_SIZEPARENT       0x0361
#define WM_SETMESSAGESTRING 0x0362
#define WM_IDLEUPDATECMDUI  0x0363  // wParam: bDisableIfNoHandler
#define WM_INITIALUPDATE    0x0364
#define WM_COMMANDHELP      0x0365
#define WM_HELPHITTEST      0x0366
#define WM_EXITHELPMODE     0x0367
#define WM_RECALCPARENT     0x0368
#define WM_SIZECHILD        0x0369
#define WM_KICKIDLE         0x036A  // wParam: MSGF_*, lParam: idle count
#define WM_QUERYCENTERWND   0x036B
#define WM_DISABLEMODAL     0x036C
#define WM_FLOATSTATUS      0x036D
#define WM_ACTIVATETOPLEVEL 0x036E

// Window classes registered on first use (AfxDeferRegisterClass)
#define AFX_WND_REG                 0x00001
#define AFX_WNDCONTROLBAR_REG       0x00002
#define AFX_WNDMDIFRAME_REG         0x00004
#define AFX_WNDFRAMEORVIEW_REG      0x00008
#define AFX_WNDCOMMCTLS_REG         0x00010 // standard common controls
#define AFX_WNDOLECONTROL_REG       0x00020
#define AFX_WNDCOMMCTL_UPDOWN_REG   0x00040
#define AFX_WNDCOMMCTL_TREEVIEW_REG 0x00080
#define AFX_WNDCOMMCTL_TAB_REG      0x00100
#define AFX_WNDCOMMCTL_PROGRESS_REG 0x00200
#define AFX_WNDCOMMCTL_LISTVIEW_REG 0x00400
#define AFX_WNDCOMMCTL_HOTKEY_REG   0x00800
#define AFX_WNDCOMMCTL_BAR_REG      0x01000
#define AFX_WNDCOMMCTL_ANIMATE_REG  0x02000
#define AFX_WNDCOMMCTL_INTERNET_REG 0x04000
#define AFX_WNDCOMMCTL_COOL_REG     0x08000
#define AFX_WNDCOMMCTL_USEREX_REG   0x10000
#define AFX_WNDCOMMCTL_DATE_REG     0x20000

BOOL AFXAPI AfxEndDeferRegisterClass(LONG fToRegister);
#define AfxDeferRegisterClass(fClass) \
    ((AfxGetModuleState()->m_fRegisteredClasses & (fClass)) ? TRUE : AfxEndDeferRegisterClass(fClass))

// Window class names registered by the framework
extern const TCHAR _afxWnd[];
extern const TCHAR _afxWndControlBar[];
extern const TCHAR _afxWndMDIFrame[];
extern const TCHAR _afxWndFrameOrView[];

#endif // __AFXPRIV_H__
