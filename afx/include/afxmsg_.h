// afxmsg_.h - message map entry macros and the handler signature codes.
// Included by afxwin.h; handlers named in the macros keep MFC's signatures, so a
// wrong signature fails to compile at the entry.
#pragma once

#ifndef __AFXMSG_H__
#define __AFXMSG_H__

// Signature codes: how OnWndMsg and OnCmdMsg unpack wParam/lParam for a handler.
// Letters: b BOOL, D CDC*, W CWnd*, w UINT, i int, l LPARAM/LRESULT, p CPoint,
// s pointer from lParam, h HBRUSH, v void.
enum AfxSig
{
    AfxSig_end = 0,     // end of a message map

    AfxSig_bD,          // BOOL (CDC*)
    AfxSig_bb,          // BOOL (BOOL)
    AfxSig_bWww,        // BOOL (CWnd*, UINT, UINT)
    AfxSig_hDWw,        // HBRUSH (CDC*, CWnd*, UINT)
    AfxSig_hDw,         // HBRUSH (CDC*, UINT)
    AfxSig_iwWw,        // int (UINT, CWnd*, UINT)
    AfxSig_is,          // int (LPCREATESTRUCT)
    AfxSig_iis,         // int (int, LPCOMPAREITEMSTRUCT)
    AfxSig_lwl,         // LRESULT (WPARAM, LPARAM)
    AfxSig_l_p,         // LRESULT (CPoint)
    AfxSig_vv,          // void ()
    AfxSig_vw,          // void (UINT)
    AfxSig_vb,          // void (BOOL)
    AfxSig_vt,          // void (UINT_PTR)
    AfxSig_vwwx,        // void (UINT, UINT)        LOWORD, HIWORD of wParam
    AfxSig_vbw,         // void (BOOL, UINT)
    AfxSig_vvii,        // void (int, int)          from lParam
    AfxSig_vwww,        // void (UINT, UINT, UINT)  key messages
    AfxSig_vwii,        // void (UINT, int, int)    WM_SIZE
    AfxSig_vwl,         // void (UINT, LPARAM)
    AfxSig_vW,          // void (CWnd*)             from wParam
    AfxSig_vW2,         // void (CWnd*)             from lParam
    AfxSig_vWp,         // void (CWnd*, CPoint)
    AfxSig_vwWb,        // void (UINT, CWnd*, BOOL) WM_ACTIVATE
    AfxSig_vwwW,        // void (UINT, UINT, CScrollBar*)
    AfxSig_vwp,         // void (UINT, CPoint)      mouse messages
    AfxSig_bwsp,        // BOOL (UINT, short, CPoint) WM_MOUSEWHEEL
    AfxSig_vws,         // void (UINT, LPCTSTR)     WM_SETTINGCHANGE
    AfxSig_vs,          // void (T*)                pointer in lParam
    AfxSig_vOWNER,      // void (int, T*)           owner-draw family, result TRUE
    AfxSig_wv,          // UINT ()
    AfxSig_bv,          // BOOL ()
    AfxSig_vCALC,       // void (BOOL, NCCALCSIZE_PARAMS*)
    AfxSig_bHELPINFO,   // BOOL (HELPINFO*)       WM_HELP

    // command and notification routing (OnCmdMsg)
    AfxSig_vNMHDRpl,    // void (NMHDR*, LRESULT*)
    AfxSig_bNMHDRpl,    // BOOL (NMHDR*, LRESULT*)
    AfxSig_vwNMHDRpl,   // void (UINT, NMHDR*, LRESULT*)
    AfxSig_bwNMHDRpl,   // BOOL (UINT, NMHDR*, LRESULT*)
    AfxSig_cmdui,       // void (CCmdUI*)
    AfxSig_cmduiw,      // void (CCmdUI*, UINT)
    AfxSig_bw,          // BOOL (UINT)

    AfxSigCmd_v = AfxSig_vv,
    AfxSigCmd_b = AfxSig_bv,
    AfxSigCmd_RANGE = AfxSig_vw,
    AfxSigCmd_EX = AfxSig_bw,
    AfxSigNotify_v = AfxSig_vNMHDRpl,
    AfxSigNotify_b = AfxSig_bNMHDRpl,
    AfxSigNotify_RANGE = AfxSig_vwNMHDRpl,
    AfxSigNotify_EX = AfxSig_bwNMHDRpl
};

// Command notification codes (the nCode of OnCmdMsg)
#define CN_COMMAND              0
#define CN_UPDATE_COMMAND_UI    ((UINT)(-1))

// Messages reflected to the child that sent them arrive as WM_REFLECT_BASE + message.
#define WM_REFLECT_BASE         0xBC00

// Pre-Win32 control-colour message; WM_CTLCOLOR* are funnelled through it.
#ifndef WM_CTLCOLOR
#define WM_CTLCOLOR             0x0019
#endif

// The handler casts: a handler of the wrong signature is a compile error here.
#define AFX_WNDMSG(sig, fn)     ((AFX_PMSG)(AFX_PMSGW)(static_cast< sig >(fn)))
#define AFX_CMDMSG(sig, fn)     ((AFX_PMSG)(static_cast< sig >(fn)))

/////////////////////////////////////////////////////////////////////////////
// Window messages; the handler is the member of the mapping class with MFC's name.

#define ON_WM_CREATE() \
    { WM_CREATE, 0, 0, 0, AfxSig_is, \
      AFX_WNDMSG(int (AFX_MSG_CALL CWnd::*)(LPCREATESTRUCT), &ThisClass::OnCreate) },
#define ON_WM_NCCREATE() \
    { WM_NCCREATE, 0, 0, 0, AfxSig_is, \
      AFX_WNDMSG(BOOL (AFX_MSG_CALL CWnd::*)(LPCREATESTRUCT), &ThisClass::OnNcCreate) },
#define ON_WM_DESTROY() \
    { WM_DESTROY, 0, 0, 0, AfxSig_vv, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnDestroy) },
#define ON_WM_NCDESTROY() \
    { WM_NCDESTROY, 0, 0, 0, AfxSig_vv, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnNcDestroy) },
#define ON_WM_CLOSE() \
    { WM_CLOSE, 0, 0, 0, AfxSig_vv, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnClose) },
#define ON_WM_PAINT() \
    { WM_PAINT, 0, 0, 0, AfxSig_vv, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnPaint) },
#define ON_WM_NCPAINT() \
    { WM_NCPAINT, 0, 0, 0, AfxSig_vv, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnNcPaint) },
#define ON_WM_ERASEBKGND() \
    { WM_ERASEBKGND, 0, 0, 0, AfxSig_bD, \
      AFX_WNDMSG(BOOL (AFX_MSG_CALL CWnd::*)(CDC*), &ThisClass::OnEraseBkgnd) },
#define ON_WM_SIZE() \
    { WM_SIZE, 0, 0, 0, AfxSig_vwii, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, int, int), &ThisClass::OnSize) },
#define ON_WM_MOVE() \
    { WM_MOVE, 0, 0, 0, AfxSig_vvii, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(int, int), &ThisClass::OnMove) },
#define ON_WM_TIMER() \
    { WM_TIMER, 0, 0, 0, AfxSig_vt, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT_PTR), &ThisClass::OnTimer) },
#define ON_WM_SETFOCUS() \
    { WM_SETFOCUS, 0, 0, 0, AfxSig_vW, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(CWnd*), &ThisClass::OnSetFocus) },
#define ON_WM_KILLFOCUS() \
    { WM_KILLFOCUS, 0, 0, 0, AfxSig_vW, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(CWnd*), &ThisClass::OnKillFocus) },
#define ON_WM_ENABLE() \
    { WM_ENABLE, 0, 0, 0, AfxSig_vb, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(BOOL), &ThisClass::OnEnable) },
#define ON_WM_CHAR() \
    { WM_CHAR, 0, 0, 0, AfxSig_vwww, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, UINT), &ThisClass::OnChar) },
#define ON_WM_KEYDOWN() \
    { WM_KEYDOWN, 0, 0, 0, AfxSig_vwww, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, UINT), &ThisClass::OnKeyDown) },
#define ON_WM_KEYUP() \
    { WM_KEYUP, 0, 0, 0, AfxSig_vwww, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, UINT), &ThisClass::OnKeyUp) },
#define ON_WM_SYSKEYDOWN() \
    { WM_SYSKEYDOWN, 0, 0, 0, AfxSig_vwww, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, UINT), &ThisClass::OnSysKeyDown) },
#define ON_WM_SYSKEYUP() \
    { WM_SYSKEYUP, 0, 0, 0, AfxSig_vwww, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, UINT), &ThisClass::OnSysKeyUp) },
#define ON_WM_SYSCHAR() \
    { WM_SYSCHAR, 0, 0, 0, AfxSig_vwww, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, UINT), &ThisClass::OnSysChar) },
#define ON_WM_LBUTTONDOWN() \
    { WM_LBUTTONDOWN, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnLButtonDown) },
#define ON_WM_LBUTTONUP() \
    { WM_LBUTTONUP, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnLButtonUp) },
#define ON_WM_LBUTTONDBLCLK() \
    { WM_LBUTTONDBLCLK, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnLButtonDblClk) },
#define ON_WM_RBUTTONDOWN() \
    { WM_RBUTTONDOWN, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnRButtonDown) },
#define ON_WM_RBUTTONUP() \
    { WM_RBUTTONUP, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnRButtonUp) },
#define ON_WM_RBUTTONDBLCLK() \
    { WM_RBUTTONDBLCLK, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnRButtonDblClk) },
#define ON_WM_MBUTTONDOWN() \
    { WM_MBUTTONDOWN, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnMButtonDown) },
#define ON_WM_MBUTTONUP() \
    { WM_MBUTTONUP, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnMButtonUp) },
#define ON_WM_MOUSEMOVE() \
    { WM_MOUSEMOVE, 0, 0, 0, AfxSig_vwp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CPoint), &ThisClass::OnMouseMove) },
#define ON_WM_MOUSEWHEEL() \
    { WM_MOUSEWHEEL, 0, 0, 0, AfxSig_bwsp, \
      AFX_WNDMSG(BOOL (AFX_MSG_CALL CWnd::*)(UINT, short, CPoint), &ThisClass::OnMouseWheel) },
#define ON_WM_CAPTURECHANGED() \
    { WM_CAPTURECHANGED, 0, 0, 0, AfxSig_vW2, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(CWnd*), &ThisClass::OnCaptureChanged) },
#define ON_WM_CANCELMODE() \
    { WM_CANCELMODE, 0, 0, 0, AfxSig_vv, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnCancelMode) },
#define ON_WM_SETCURSOR() \
    { WM_SETCURSOR, 0, 0, 0, AfxSig_bWww, \
      AFX_WNDMSG(BOOL (AFX_MSG_CALL CWnd::*)(CWnd*, UINT, UINT), &ThisClass::OnSetCursor) },
#define ON_WM_GETDLGCODE() \
    { WM_GETDLGCODE, 0, 0, 0, AfxSig_wv, \
      AFX_WNDMSG(UINT (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnGetDlgCode) },
#define ON_WM_HSCROLL() \
    { WM_HSCROLL, 0, 0, 0, AfxSig_vwwW, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, CScrollBar*), &ThisClass::OnHScroll) },
#define ON_WM_VSCROLL() \
    { WM_VSCROLL, 0, 0, 0, AfxSig_vwwW, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT, CScrollBar*), &ThisClass::OnVScroll) },
#define ON_WM_CTLCOLOR() \
    { WM_CTLCOLOR, 0, 0, 0, AfxSig_hDWw, \
      AFX_WNDMSG(HBRUSH (AFX_MSG_CALL CWnd::*)(CDC*, CWnd*, UINT), &ThisClass::OnCtlColor) },
#define ON_WM_DRAWITEM() \
    { WM_DRAWITEM, 0, 0, 0, AfxSig_vOWNER, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(int, LPDRAWITEMSTRUCT), &ThisClass::OnDrawItem) },
#define ON_WM_MEASUREITEM() \
    { WM_MEASUREITEM, 0, 0, 0, AfxSig_vOWNER, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(int, LPMEASUREITEMSTRUCT), &ThisClass::OnMeasureItem) },
#define ON_WM_DELETEITEM() \
    { WM_DELETEITEM, 0, 0, 0, AfxSig_vOWNER, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(int, LPDELETEITEMSTRUCT), &ThisClass::OnDeleteItem) },
#define ON_WM_COMPAREITEM() \
    { WM_COMPAREITEM, 0, 0, 0, AfxSig_iis, \
      AFX_WNDMSG(int (AFX_MSG_CALL CWnd::*)(int, LPCOMPAREITEMSTRUCT), &ThisClass::OnCompareItem) },
#define ON_WM_CHARTOITEM() \
    { WM_CHARTOITEM, 0, 0, 0, AfxSig_iwWw, \
      AFX_WNDMSG(int (AFX_MSG_CALL CWnd::*)(UINT, CListBox*, UINT), &ThisClass::OnCharToItem) },
#define ON_WM_VKEYTOITEM() \
    { WM_VKEYTOITEM, 0, 0, 0, AfxSig_iwWw, \
      AFX_WNDMSG(int (AFX_MSG_CALL CWnd::*)(UINT, CListBox*, UINT), &ThisClass::OnVKeyToItem) },
#define ON_WM_PARENTNOTIFY() \
    { WM_PARENTNOTIFY, 0, 0, 0, AfxSig_vwl, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, LPARAM), &ThisClass::OnParentNotify) },
#define ON_WM_SHOWWINDOW() \
    { WM_SHOWWINDOW, 0, 0, 0, AfxSig_vbw, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(BOOL, UINT), &ThisClass::OnShowWindow) },
#define ON_WM_ACTIVATE() \
    { WM_ACTIVATE, 0, 0, 0, AfxSig_vwWb, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, CWnd*, BOOL), &ThisClass::OnActivate) },
#define ON_WM_NCACTIVATE() \
    { WM_NCACTIVATE, 0, 0, 0, AfxSig_bb, \
      AFX_WNDMSG(BOOL (AFX_MSG_CALL CWnd::*)(BOOL), &ThisClass::OnNcActivate) },
#define ON_WM_NCHITTEST() \
    { WM_NCHITTEST, 0, 0, 0, AfxSig_l_p, \
      AFX_WNDMSG(LRESULT (AFX_MSG_CALL CWnd::*)(CPoint), &ThisClass::OnNcHitTest) },
#define ON_WM_NCCALCSIZE() \
    { WM_NCCALCSIZE, 0, 0, 0, AfxSig_vCALC, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(BOOL, NCCALCSIZE_PARAMS*), &ThisClass::OnNcCalcSize) },
#define ON_WM_CONTEXTMENU() \
    { WM_CONTEXTMENU, 0, 0, 0, AfxSig_vWp, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(CWnd*, CPoint), &ThisClass::OnContextMenu) },
#define ON_WM_HELPINFO() \
    { WM_HELP, 0, 0, 0, AfxSig_bHELPINFO, \
      AFX_WNDMSG(BOOL (AFX_MSG_CALL CWnd::*)(HELPINFO*), &ThisClass::OnHelpInfo) },
#define ON_WM_SYSCOLORCHANGE() \
    { WM_SYSCOLORCHANGE, 0, 0, 0, AfxSig_vv, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(), &ThisClass::OnSysColorChange) },
#define ON_WM_SETTINGCHANGE() \
    { WM_SETTINGCHANGE, 0, 0, 0, AfxSig_vws, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, LPCTSTR), &ThisClass::OnSettingChange) },
#define ON_WM_WINDOWPOSCHANGED() \
    { WM_WINDOWPOSCHANGED, 0, 0, 0, AfxSig_vs, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(WINDOWPOS*), &ThisClass::OnWindowPosChanged) },
#define ON_WM_WINDOWPOSCHANGING() \
    { WM_WINDOWPOSCHANGING, 0, 0, 0, AfxSig_vs, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(WINDOWPOS*), &ThisClass::OnWindowPosChanging) },
#define ON_WM_GETMINMAXINFO() \
    { WM_GETMINMAXINFO, 0, 0, 0, AfxSig_vs, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(MINMAXINFO*), &ThisClass::OnGetMinMaxInfo) },
#define ON_WM_STYLECHANGED() \
    { WM_STYLECHANGED, 0, 0, 0, AfxSig_vwl, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(int, LPSTYLESTRUCT), &ThisClass::OnStyleChanged) },

/////////////////////////////////////////////////////////////////////////////
// Reflected messages: handled by the control that sent them

#define ON_WM_CTLCOLOR_REFLECT() \
    { WM_CTLCOLOR + WM_REFLECT_BASE, 0, 0, 0, AfxSig_hDw, \
      AFX_WNDMSG(HBRUSH (AFX_MSG_CALL CWnd::*)(CDC*, UINT), &ThisClass::CtlColor) },
#define ON_WM_DRAWITEM_REFLECT() \
    { WM_DRAWITEM + WM_REFLECT_BASE, 0, 0, 0, AfxSig_vs, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(LPDRAWITEMSTRUCT), &ThisClass::DrawItem) },
#define ON_WM_MEASUREITEM_REFLECT() \
    { WM_MEASUREITEM + WM_REFLECT_BASE, 0, 0, 0, AfxSig_vs, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(LPMEASUREITEMSTRUCT), &ThisClass::MeasureItem) },
#define ON_WM_DELETEITEM_REFLECT() \
    { WM_DELETEITEM + WM_REFLECT_BASE, 0, 0, 0, AfxSig_vs, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(LPDELETEITEMSTRUCT), &ThisClass::DeleteItem) },
#define ON_WM_COMPAREITEM_REFLECT() \
    { WM_COMPAREITEM + WM_REFLECT_BASE, 0, 0, 0, AfxSig_is, \
      AFX_WNDMSG(int (AFX_MSG_CALL CWnd::*)(LPCOMPAREITEMSTRUCT), &ThisClass::CompareItem) },
#define ON_WM_HSCROLL_REFLECT() \
    { WM_HSCROLL + WM_REFLECT_BASE, 0, 0, 0, AfxSig_vwwx, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT), &ThisClass::HScroll) },
#define ON_WM_VSCROLL_REFLECT() \
    { WM_VSCROLL + WM_REFLECT_BASE, 0, 0, 0, AfxSig_vwwx, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, UINT), &ThisClass::VScroll) },
#define ON_WM_PARENTNOTIFY_REFLECT() \
    { WM_PARENTNOTIFY + WM_REFLECT_BASE, 0, 0, 0, AfxSig_vwl, \
      AFX_WNDMSG(void (AFX_MSG_CALL CWnd::*)(UINT, LPARAM), &ThisClass::ParentNotify) },

#define ON_CONTROL_REFLECT(wNotifyCode, memberFxn) \
    { WM_COMMAND + WM_REFLECT_BASE, (WORD)(wNotifyCode), 0, 0, AfxSigCmd_v, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(), memberFxn) },
#define ON_CONTROL_REFLECT_EX(wNotifyCode, memberFxn) \
    { WM_COMMAND + WM_REFLECT_BASE, (WORD)(wNotifyCode), 0, 0, AfxSigCmd_b, \
      AFX_CMDMSG(BOOL (AFX_MSG_CALL CCmdTarget::*)(), memberFxn) },
#define ON_NOTIFY_REFLECT(wNotifyCode, memberFxn) \
    { WM_NOTIFY + WM_REFLECT_BASE, (WORD)(int)(wNotifyCode), 0, 0, AfxSigNotify_v, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(NMHDR*, LRESULT*), memberFxn) },
#define ON_NOTIFY_REFLECT_EX(wNotifyCode, memberFxn) \
    { WM_NOTIFY + WM_REFLECT_BASE, (WORD)(int)(wNotifyCode), 0, 0, AfxSigNotify_b, \
      AFX_CMDMSG(BOOL (AFX_MSG_CALL CCmdTarget::*)(NMHDR*, LRESULT*), memberFxn) },

/////////////////////////////////////////////////////////////////////////////
// User messages, commands and control notifications. memberFxn is a pointer
// to member: &CMyClass::OnSomething.

#define ON_MESSAGE(message, memberFxn) \
    { (UINT)(message), 0, 0, 0, AfxSig_lwl, \
      AFX_WNDMSG(LRESULT (AFX_MSG_CALL CWnd::*)(WPARAM, LPARAM), memberFxn) },
#define ON_REGISTERED_MESSAGE(nMessageVariable, memberFxn) \
    { 0xC000, 0, 0, 0, (UINT_PTR)(UINT*)(&nMessageVariable), \
      AFX_WNDMSG(LRESULT (AFX_MSG_CALL CWnd::*)(WPARAM, LPARAM), memberFxn) },

#define ON_COMMAND(id, memberFxn) \
    { WM_COMMAND, CN_COMMAND, (WORD)(id), (WORD)(id), AfxSigCmd_v, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(), memberFxn) },
#define ON_COMMAND_EX(id, memberFxn) \
    { WM_COMMAND, CN_COMMAND, (WORD)(id), (WORD)(id), AfxSigCmd_EX, \
      AFX_CMDMSG(BOOL (AFX_MSG_CALL CCmdTarget::*)(UINT), memberFxn) },
#define ON_COMMAND_RANGE(id, idLast, memberFxn) \
    { WM_COMMAND, CN_COMMAND, (WORD)(id), (WORD)(idLast), AfxSigCmd_RANGE, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(UINT), memberFxn) },
#define ON_COMMAND_EX_RANGE(id, idLast, memberFxn) \
    { WM_COMMAND, CN_COMMAND, (WORD)(id), (WORD)(idLast), AfxSigCmd_EX, \
      AFX_CMDMSG(BOOL (AFX_MSG_CALL CCmdTarget::*)(UINT), memberFxn) },
#define ON_UPDATE_COMMAND_UI(id, memberFxn) \
    { WM_COMMAND, CN_UPDATE_COMMAND_UI, (WORD)(id), (WORD)(id), AfxSig_cmdui, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(CCmdUI*), memberFxn) },
#define ON_UPDATE_COMMAND_UI_RANGE(id, idLast, memberFxn) \
    { WM_COMMAND, CN_UPDATE_COMMAND_UI, (WORD)(id), (WORD)(idLast), AfxSig_cmdui, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(CCmdUI*), memberFxn) },

#define ON_CONTROL(wNotifyCode, id, memberFxn) \
    { WM_COMMAND, (WORD)(wNotifyCode), (WORD)(id), (WORD)(id), AfxSigCmd_v, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(), memberFxn) },
#define ON_CONTROL_RANGE(wNotifyCode, id, idLast, memberFxn) \
    { WM_COMMAND, (WORD)(wNotifyCode), (WORD)(id), (WORD)(idLast), AfxSigCmd_RANGE, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(UINT), memberFxn) },

#define ON_NOTIFY(wNotifyCode, id, memberFxn) \
    { WM_NOTIFY, (WORD)(int)(wNotifyCode), (WORD)(id), (WORD)(id), AfxSigNotify_v, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(NMHDR*, LRESULT*), memberFxn) },
#define ON_NOTIFY_RANGE(wNotifyCode, id, idLast, memberFxn) \
    { WM_NOTIFY, (WORD)(int)(wNotifyCode), (WORD)(id), (WORD)(idLast), AfxSigNotify_RANGE, \
      AFX_CMDMSG(void (AFX_MSG_CALL CCmdTarget::*)(UINT, NMHDR*, LRESULT*), memberFxn) },
#define ON_NOTIFY_EX(wNotifyCode, id, memberFxn) \
    { WM_NOTIFY, (WORD)(int)(wNotifyCode), (WORD)(id), (WORD)(id), AfxSigNotify_EX, \
      AFX_CMDMSG(BOOL (AFX_MSG_CALL CCmdTarget::*)(UINT, NMHDR*, LRESULT*), memberFxn) },
#define ON_NOTIFY_EX_RANGE(wNotifyCode, id, idLast, memberFxn) \
    { WM_NOTIFY, (WORD)(int)(wNotifyCode), (WORD)(id), (WORD)(idLast), AfxSigNotify_EX, \
      AFX_CMDMSG(BOOL (AFX_MSG_CALL CCmdTarget::*)(UINT, NMHDR*, LRESULT*), memberFxn) },

// Button notifications
#define ON_BN_CLICKED(id, memberFxn)        ON_CONTROL(BN_CLICKED, id, memberFxn)
#define ON_BN_DOUBLECLICKED(id, memberFxn)  ON_CONTROL(BN_DOUBLECLICKED, id, memberFxn)
#define ON_BN_SETFOCUS(id, memberFxn)       ON_CONTROL(BN_SETFOCUS, id, memberFxn)
#define ON_BN_KILLFOCUS(id, memberFxn)      ON_CONTROL(BN_KILLFOCUS, id, memberFxn)

// Edit notifications
#define ON_EN_SETFOCUS(id, memberFxn)   ON_CONTROL(EN_SETFOCUS, id, memberFxn)
#define ON_EN_KILLFOCUS(id, memberFxn)  ON_CONTROL(EN_KILLFOCUS, id, memberFxn)
#define ON_EN_CHANGE(id, memberFxn)     ON_CONTROL(EN_CHANGE, id, memberFxn)
#define ON_EN_UPDATE(id, memberFxn)     ON_CONTROL(EN_UPDATE, id, memberFxn)
#define ON_EN_ERRSPACE(id, memberFxn)   ON_CONTROL(EN_ERRSPACE, id, memberFxn)
#define ON_EN_MAXTEXT(id, memberFxn)    ON_CONTROL(EN_MAXTEXT, id, memberFxn)
#define ON_EN_HSCROLL(id, memberFxn)    ON_CONTROL(EN_HSCROLL, id, memberFxn)
#define ON_EN_VSCROLL(id, memberFxn)    ON_CONTROL(EN_VSCROLL, id, memberFxn)

// Static notifications
#define ON_STN_CLICKED(id, memberFxn)   ON_CONTROL(STN_CLICKED, id, memberFxn)
#define ON_STN_DBLCLK(id, memberFxn)    ON_CONTROL(STN_DBLCLK, id, memberFxn)
#define ON_STN_ENABLE(id, memberFxn)    ON_CONTROL(STN_ENABLE, id, memberFxn)
#define ON_STN_DISABLE(id, memberFxn)   ON_CONTROL(STN_DISABLE, id, memberFxn)

// List box notifications
#define ON_LBN_ERRSPACE(id, memberFxn)  ON_CONTROL(LBN_ERRSPACE, id, memberFxn)
#define ON_LBN_SELCHANGE(id, memberFxn) ON_CONTROL(LBN_SELCHANGE, id, memberFxn)
#define ON_LBN_DBLCLK(id, memberFxn)    ON_CONTROL(LBN_DBLCLK, id, memberFxn)
#define ON_LBN_SELCANCEL(id, memberFxn) ON_CONTROL(LBN_SELCANCEL, id, memberFxn)
#define ON_LBN_SETFOCUS(id, memberFxn)  ON_CONTROL(LBN_SETFOCUS, id, memberFxn)
#define ON_LBN_KILLFOCUS(id, memberFxn) ON_CONTROL(LBN_KILLFOCUS, id, memberFxn)

// Combo box notifications
#define ON_CBN_ERRSPACE(id, memberFxn)     ON_CONTROL(CBN_ERRSPACE, id, memberFxn)
#define ON_CBN_SELCHANGE(id, memberFxn)    ON_CONTROL(CBN_SELCHANGE, id, memberFxn)
#define ON_CBN_DBLCLK(id, memberFxn)       ON_CONTROL(CBN_DBLCLK, id, memberFxn)
#define ON_CBN_SETFOCUS(id, memberFxn)     ON_CONTROL(CBN_SETFOCUS, id, memberFxn)
#define ON_CBN_KILLFOCUS(id, memberFxn)    ON_CONTROL(CBN_KILLFOCUS, id, memberFxn)
#define ON_CBN_EDITCHANGE(id, memberFxn)   ON_CONTROL(CBN_EDITCHANGE, id, memberFxn)
#define ON_CBN_EDITUPDATE(id, memberFxn)   ON_CONTROL(CBN_EDITUPDATE, id, memberFxn)
#define ON_CBN_DROPDOWN(id, memberFxn)     ON_CONTROL(CBN_DROPDOWN, id, memberFxn)
#define ON_CBN_CLOSEUP(id, memberFxn)      ON_CONTROL(CBN_CLOSEUP, id, memberFxn)
#define ON_CBN_SELENDOK(id, memberFxn)     ON_CONTROL(CBN_SELENDOK, id, memberFxn)
#define ON_CBN_SELENDCANCEL(id, memberFxn) ON_CONTROL(CBN_SELENDCANCEL, id, memberFxn)

#endif // __AFXMSG_H__
