// afxwin.h - windows part of the framework layer: command targets and message
// maps, CWnd, dialogs, the standard controls, threads and the application object.
#pragma once

#ifndef __AFXWIN_H__
#define __AFXWIN_H__

#ifndef __AFX_H__
#include <afx.h>
#endif
#include <atltypes.h>
#include <commctrl.h>
#include <objbase.h>
#include "afxres.h"

#ifndef RT_DLGINIT
#define RT_DLGINIT MAKEINTRESOURCE(240)
#endif
#include "afxcoll.h"

class CCmdTarget;
class CCmdUI;
class CWnd;
class CDialog;
class CDataExchange;
class CWinThread;
class CWinApp;
class CScrollBar;
class CListBox;
class CMenu;
class CDC;
class CRgn;
class CFont;
class CBitmap;
class CFrameWnd;
class CView;
class CDocument;
class CDocTemplate;
class COleDropTarget;
struct CCreateContext;

#include "afxgdi_.h"

#define afx_msg

// winuser.h defines GetNextWindow as a macro; CWnd has a member of that name.
#ifdef GetNextWindow
#undef GetNextWindow
#endif
#define AFX_MSG_CALL

/////////////////////////////////////////////////////////////////////////////
// Message maps

typedef void (AFX_MSG_CALL CCmdTarget::*AFX_PMSG)(void);
typedef void (AFX_MSG_CALL CWnd::*AFX_PMSGW)(void);
typedef void (AFX_MSG_CALL CWinThread::*AFX_PMSGT)(void);

struct AFX_MSGMAP_ENTRY
{
    UINT nMessage;      // window message
    UINT nCode;         // control code or WM_NOTIFY code
    UINT nID;           // control ID (or 0 for window messages)
    UINT nLastID;       // used for entries specifying a range of control id's
    UINT_PTR nSig;      // signature type (action) or pointer to message #
    AFX_PMSG pfn;       // routine to call (or special value)
};

// Shared-DLL form: the base map is reached through a function, so a map in one
// module can chain to a base class's map in another.
struct AFX_MSGMAP
{
    const AFX_MSGMAP* (PASCAL* pfnGetBaseMap)();
    const AFX_MSGMAP_ENTRY* lpEntries;
};

// The entries are a static member of a nested type, whose scope gives the
// ON_WM_* macros the name ThisClass for the class being mapped.
#define DECLARE_MESSAGE_MAP() \
private: \
    struct _messageEntries; \
protected: \
    static const AFX_MSGMAP messageMap; \
    static const AFX_MSGMAP* PASCAL _GetBaseMessageMap(); \
    virtual const AFX_MSGMAP* GetMessageMap() const;

#define BEGIN_MESSAGE_MAP(theClass, baseClass) \
    const AFX_MSGMAP* PASCAL theClass::_GetBaseMessageMap() \
        { return &baseClass::messageMap; } \
    const AFX_MSGMAP* theClass::GetMessageMap() const \
        { return &theClass::messageMap; } \
    struct theClass::_messageEntries \
    { \
        typedef theClass ThisClass; \
        typedef baseClass TheBaseClass; \
        static const AFX_MSGMAP_ENTRY entries[]; \
    }; \
    const AFX_MSGMAP theClass::messageMap = \
        { &theClass::_GetBaseMessageMap, &theClass::_messageEntries::entries[0] }; \
    const AFX_MSGMAP_ENTRY theClass::_messageEntries::entries[] = \
    {

#define END_MESSAGE_MAP() \
        { 0, 0, 0, 0, AfxSig_end, (AFX_PMSG)0 } \
    };

#include "afxmsg_.h"

// Parameter blocks of the routed notifications
struct AFX_NOTIFY
{
    LRESULT* pResult;
    NMHDR* pNMHDR;
};

struct AFX_CTLCOLOR
{
    HWND hWnd;
    HDC hDC;
    UINT nCtlType;
};

struct AFX_CMDHANDLERINFO
{
    CCmdTarget* pTarget;
    AFX_PMSG pmf;
};

struct CCreateContext
{
    CRuntimeClass* m_pNewViewClass;
    CDocument* m_pCurrentDoc;
    CDocTemplate* m_pNewDocTemplate;
    CView* m_pLastView;
    CFrameWnd* m_pCurrentFrame;

    CCreateContext() { memset(this, 0, sizeof(*this)); }
};

/////////////////////////////////////////////////////////////////////////////
// Interface maps: the COM interfaces a CCmdTarget implements as nested parts

struct AFX_INTERFACEMAP_ENTRY
{
    const void* piid;       // the interface id (NULL ends the map)
    size_t nOffset;         // offset of the interface part within the object
};

struct AFX_INTERFACEMAP
{
    const AFX_INTERFACEMAP* (PASCAL* pfnGetBaseMap)();  // NULL for CCmdTarget's own map
    const AFX_INTERFACEMAP_ENTRY* pEntry;
};

#define DECLARE_INTERFACE_MAP() \
private: \
    static const AFX_INTERFACEMAP_ENTRY _interfaceEntries[]; \
protected: \
    static const AFX_INTERFACEMAP interfaceMap; \
    static const AFX_INTERFACEMAP* PASCAL GetThisInterfaceMap(); \
    virtual const AFX_INTERFACEMAP* GetInterfaceMap() const;

#define BEGIN_INTERFACE_MAP(theClass, theBase) \
    const AFX_INTERFACEMAP* PASCAL theClass::GetThisInterfaceMap() \
        { return &theClass::interfaceMap; } \
    const AFX_INTERFACEMAP* theClass::GetInterfaceMap() const \
        { return &theClass::interfaceMap; } \
    const AFX_INTERFACEMAP theClass::interfaceMap = \
        { &theBase::GetThisInterfaceMap, &theClass::_interfaceEntries[0] }; \
    const AFX_INTERFACEMAP_ENTRY theClass::_interfaceEntries[] = \
    {

#define INTERFACE_PART(theClass, iid, localClass) \
        { &iid, offsetof(theClass, m_x##localClass) },

#define END_INTERFACE_MAP() \
        { NULL, (size_t)-1 } \
    };

// One nested class per interface; its IUnknown methods delegate to the object.
#define BEGIN_INTERFACE_PART(localClass, baseClass) \
    class X##localClass : public baseClass \
    { \
    public: \
        STDMETHOD_(ULONG, AddRef)(); \
        STDMETHOD_(ULONG, Release)(); \
        STDMETHOD(QueryInterface)(REFIID iid, LPVOID* ppvObj);

#define END_INTERFACE_PART(localClass) \
    } m_x##localClass; \
    friend class X##localClass;

// Inside a method of an interface part: pThis is the object that contains it.
#define METHOD_PROLOGUE(theClass, localClass) \
    theClass* pThis = ((theClass*)((BYTE*)this - offsetof(theClass, m_x##localClass))); \
    (void)pThis;
#define METHOD_PROLOGUE_EX(theClass, localClass) METHOD_PROLOGUE(theClass, localClass)
#define METHOD_PROLOGUE_EX_(theClass, localClass) METHOD_PROLOGUE(theClass, localClass)

/////////////////////////////////////////////////////////////////////////////
// CCmdTarget: an object that receives commands through its message map

class CCmdTarget : public CObject
{
    DECLARE_DYNAMIC(CCmdTarget)
protected:

public:
// Constructors
    CCmdTarget();

// Operations
    void BeginWaitCursor();
    void EndWaitCursor();
    void RestoreWaitCursor();

// Overridables
    // route and dispatch standard command message types
    virtual BOOL OnCmdMsg(UINT nID, int nCode, void* pExtra, AFX_CMDHANDLERINFO* pHandlerInfo);

// Implementation
public:
    virtual ~CCmdTarget();

    DECLARE_MESSAGE_MAP()

// OLE: reference count and the interfaces of the interface map. An object starts
// with one reference (its own); the last Release calls OnFinalRelease.
public:
    DWORD InternalQueryInterface(const void* iid, LPVOID* ppvObj);
    DWORD InternalAddRef();
    DWORD InternalRelease();
    DWORD ExternalQueryInterface(const void* iid, LPVOID* ppvObj);
    DWORD ExternalAddRef();
    DWORD ExternalRelease();
    LPUNKNOWN GetInterface(const void* iid);

    virtual void OnFinalRelease();      // default: delete this

    long m_dwRef = 1;

    DECLARE_INTERFACE_MAP()
};

// The entry for nMsg/nCode/nID in one map's entries, or NULL.
const AFX_MSGMAP_ENTRY* AFXAPI AfxFindMessageEntry(const AFX_MSGMAP_ENTRY* lpEntry,
    UINT nMsg, UINT nCode, UINT nID);

/////////////////////////////////////////////////////////////////////////////
// CCmdUI: state of a user-interface item during idle updates

class CCmdUI
{
public:
// Attributes
    UINT m_nID;
    UINT m_nIndex;
    CMenu* m_pMenu;
    CMenu* m_pSubMenu;
    CWnd* m_pOther;

// Operations to do in ON_UPDATE_COMMAND_UI
    virtual void Enable(BOOL bOn = TRUE);
    virtual void SetCheck(int nCheck = 1);
    virtual void SetRadio(BOOL bOn = TRUE);
    virtual void SetText(LPCTSTR lpszText);

// Advanced operation
    void ContinueRouting();

// Implementation
    CCmdUI();
    virtual ~CCmdUI() {}
    BOOL m_bEnableChanged;
    BOOL m_bContinueRouting;
    UINT m_nIndexMax;
    CMenu* m_pParentMenu;

    BOOL DoUpdate(CCmdTarget* pTarget, BOOL bDisableIfNoHndler);
};

/////////////////////////////////////////////////////////////////////////////
// CWnd: one window, its message map and the thin wrappers of the window API

// m_nFlags
#define WF_TOOLTIPS         0x0001
#define WF_TEMPHIDE         0x0002
#define WF_STAYDISABLED     0x0004
#define WF_MODALLOOP        0x0008
#define WF_CONTINUEMODAL    0x0010
#define WF_OLECTLCONTAINER  0x0100
#define WF_TRACKINGTOOLTIPS 0x0400

// RunModalLoop flags
#define MLF_NOIDLEMSG       0x0001
#define MLF_NOKICKIDLE      0x0002
#define MLF_SHOWONIDLE      0x0004

class CWnd : public CCmdTarget
{
    DECLARE_DYNCREATE(CWnd)
protected:
    static const MSG* PASCAL GetCurrentMessage();

// Attributes
public:
    HWND m_hWnd;
    operator HWND() const { return GetSafeHwnd(); }
    BOOL operator==(const CWnd& wnd) const { return wnd.m_hWnd == m_hWnd; }
    BOOL operator!=(const CWnd& wnd) const { return wnd.m_hWnd != m_hWnd; }

    HWND GetSafeHwnd() const;
    DWORD GetStyle() const;
    DWORD GetExStyle() const;
    BOOL ModifyStyle(DWORD dwRemove, DWORD dwAdd, UINT nFlags = 0);
    BOOL ModifyStyleEx(DWORD dwRemove, DWORD dwAdd, UINT nFlags = 0);

    CWnd* GetOwner() const;
    void SetOwner(CWnd* pOwnerWnd);

// Constructors and other creation
    CWnd();

    static CWnd* PASCAL FromHandle(HWND hWnd);
    static CWnd* PASCAL FromHandlePermanent(HWND hWnd);
    static void PASCAL DeleteTempMap();
    BOOL Attach(HWND hWndNew);
    HWND Detach();

    virtual BOOL Create(LPCTSTR lpszClassName, LPCTSTR lpszWindowName, DWORD dwStyle,
        const RECT& rect, CWnd* pParentWnd, UINT nID, CCreateContext* pContext = NULL);
    virtual BOOL CreateEx(DWORD dwExStyle, LPCTSTR lpszClassName, LPCTSTR lpszWindowName,
        DWORD dwStyle, int x, int y, int nWidth, int nHeight, HWND hWndParent,
        HMENU nIDorHMenu, LPVOID lpParam = NULL);
    virtual BOOL CreateEx(DWORD dwExStyle, LPCTSTR lpszClassName, LPCTSTR lpszWindowName,
        DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID, LPVOID lpParam = NULL);

    virtual BOOL DestroyWindow();

    // special pre-creation and window rect adjustment hooks
    virtual BOOL PreCreateWindow(CREATESTRUCT& cs);

    // Advanced: virtual AdjustWindowRect
    enum AdjustType { adjustBorder = 0, adjustOutside = 1 };
    virtual void CalcWindowRect(LPRECT lpClientRect, UINT nAdjustType = adjustBorder);

// Window tree access
    int GetDlgCtrlID() const;
    int SetDlgCtrlID(int nID);
    CWnd* GetDlgItem(int nID) const;
    void GetDlgItem(int nID, HWND* phWnd) const;
    CWnd* GetDescendantWindow(int nID, BOOL bOnlyPerm = FALSE) const;
    void SendMessageToDescendants(UINT message, WPARAM wParam = 0, LPARAM lParam = 0,
        BOOL bDeep = TRUE, BOOL bOnlyPerm = FALSE);
    CWnd* GetTopLevelParent() const;
    CWnd* GetTopLevelOwner() const;
    CWnd* GetParentOwner() const;
    static CWnd* PASCAL GetSafeOwner(CWnd* pParent = NULL, HWND* pWndTop = NULL);

// Message functions
    LRESULT SendMessage(UINT message, WPARAM wParam = 0, LPARAM lParam = 0);
    BOOL PostMessage(UINT message, WPARAM wParam = 0, LPARAM lParam = 0);
    BOOL SendNotifyMessage(UINT message, WPARAM wParam, LPARAM lParam);

// Window text functions
    void SetWindowText(LPCTSTR lpszString);
    int GetWindowText(LPTSTR lpszStringBuf, int nMaxCount) const;
    void GetWindowText(CString& rString) const;
    int GetWindowTextLength() const;
    void SetFont(CFont* pFont, BOOL bRedraw = TRUE);
    CFont* GetFont() const;

// Menu bar functions - non-Child windows only
    void DrawMenuBar();

// Window size and position functions
    BOOL IsIconic() const;
    BOOL IsZoomed() const;
    void MoveWindow(int x, int y, int nWidth, int nHeight, BOOL bRepaint = TRUE);
    void MoveWindow(LPCRECT lpRect, BOOL bRepaint = TRUE);
    int SetWindowRgn(HRGN hRgn, BOOL bRedraw);
    int GetWindowRgn(HRGN hRgn) const;

    static const CWnd wndTop;           // SetWindowPos's pWndInsertAfter
    static const CWnd wndBottom;
    static const CWnd wndTopMost;
    static const CWnd wndNoTopMost;

    BOOL SetWindowPos(const CWnd* pWndInsertAfter, int x, int y, int cx, int cy, UINT nFlags);
    UINT ArrangeIconicWindows();
    void BringWindowToTop();
    void GetWindowRect(LPRECT lpRect) const;
    void GetClientRect(LPRECT lpRect) const;

    BOOL GetWindowPlacement(WINDOWPLACEMENT* lpwndpl) const;
    BOOL SetWindowPlacement(const WINDOWPLACEMENT* lpwndpl);

// Coordinate Mapping Functions
    void ClientToScreen(LPPOINT lpPoint) const;
    void ClientToScreen(LPRECT lpRect) const;
    void ScreenToClient(LPPOINT lpPoint) const;
    void ScreenToClient(LPRECT lpRect) const;
    void MapWindowPoints(CWnd* pwndTo, LPPOINT lpPoint, UINT nCount) const;
    void MapWindowPoints(CWnd* pwndTo, LPRECT lpRect) const;

// Update/Painting Functions
    CDC* BeginPaint(LPPAINTSTRUCT lpPaint);
    void EndPaint(LPPAINTSTRUCT lpPaint);
    CDC* GetDC();
    CDC* GetWindowDC();
    int ReleaseDC(CDC* pDC);
    CDC* GetDCEx(CRgn* prgnClip, DWORD flags);

    void UpdateWindow();
    void SetRedraw(BOOL bRedraw = TRUE);
    BOOL GetUpdateRect(LPRECT lpRect, BOOL bErase = FALSE);
    int GetUpdateRgn(CRgn* pRgn, BOOL bErase = FALSE);
    void Invalidate(BOOL bErase = TRUE);
    void InvalidateRect(LPCRECT lpRect, BOOL bErase = TRUE);
    void InvalidateRgn(CRgn* pRgn, BOOL bErase = TRUE);
    void ValidateRect(LPCRECT lpRect);
    void ValidateRgn(CRgn* pRgn);
    BOOL ShowWindow(int nCmdShow);
    BOOL IsWindowVisible() const;
    void ShowOwnedPopups(BOOL bShow = TRUE);

    BOOL RedrawWindow(LPCRECT lpRectUpdate = NULL, CRgn* prgnUpdate = NULL,
        UINT flags = RDW_INVALIDATE | RDW_UPDATENOW | RDW_ERASE);
    BOOL EnableScrollBar(int nSBFlags, UINT nArrowFlags = ESB_ENABLE_BOTH);

// Timer Functions
    UINT_PTR SetTimer(UINT_PTR nIDEvent, UINT nElapse,
        void (CALLBACK* lpfnTimer)(HWND, UINT, UINT_PTR, DWORD));
    BOOL KillTimer(UINT_PTR nIDEvent);

// Window State Functions
    BOOL IsWindowEnabled() const;
    BOOL EnableWindow(BOOL bEnable = TRUE);

    // the active window applies only to top-level (frame windows)
    static CWnd* PASCAL GetActiveWindow();
    CWnd* SetActiveWindow();

    // the foreground window applies only to top-level windows (frame windows)
    BOOL SetForegroundWindow();
    static CWnd* PASCAL GetForegroundWindow();

    // capture and focus apply to all windows
    static CWnd* PASCAL GetCapture();
    CWnd* SetCapture();
    static CWnd* PASCAL GetFocus();
    CWnd* SetFocus();

    static CWnd* PASCAL GetDesktopWindow();

// Dialog-Box Item Functions
    void CheckDlgButton(int nIDButton, UINT nCheck);
    void CheckRadioButton(int nIDFirstButton, int nIDLastButton, int nIDCheckButton);
    int GetCheckedRadioButton(int nIDFirstButton, int nIDLastButton);
    UINT GetDlgItemInt(int nID, BOOL* lpTrans = NULL, BOOL bSigned = TRUE) const;
    int GetDlgItemText(int nID, LPTSTR lpStr, int nMaxCount) const;
    int GetDlgItemText(int nID, CString& rString) const;
    CWnd* GetNextDlgGroupItem(CWnd* pWndCtl, BOOL bPrevious = FALSE) const;
    CWnd* GetNextDlgTabItem(CWnd* pWndCtl, BOOL bPrevious = FALSE) const;
    UINT IsDlgButtonChecked(int nIDButton) const;
    LRESULT SendDlgItemMessage(int nID, UINT message, WPARAM wParam = 0, LPARAM lParam = 0);
    void SetDlgItemInt(int nID, UINT nValue, BOOL bSigned = TRUE);
    void SetDlgItemText(int nID, LPCTSTR lpszString);

// Scrolling Functions
    int GetScrollPos(int nBar) const;
    void GetScrollRange(int nBar, LPINT lpMinPos, LPINT lpMaxPos) const;
    void ScrollWindow(int xAmount, int yAmount, LPCRECT lpRect = NULL, LPCRECT lpClipRect = NULL);
    int SetScrollPos(int nBar, int nPos, BOOL bRedraw = TRUE);
    void SetScrollRange(int nBar, int nMinPos, int nMaxPos, BOOL bRedraw = TRUE);
    void ShowScrollBar(UINT nBar, BOOL bShow = TRUE);
    void EnableScrollBarCtrl(int nBar, BOOL bEnable = TRUE);
    virtual CScrollBar* GetScrollBarCtrl(int nBar) const;
    int ScrollWindowEx(int dx, int dy, LPCRECT lpRectScroll, LPCRECT lpRectClip,
        CRgn* prgnUpdate, LPRECT lpRectUpdate, UINT flags);
    BOOL SetScrollInfo(int nBar, LPSCROLLINFO lpScrollInfo, BOOL bRedraw = TRUE);
    BOOL GetScrollInfo(int nBar, LPSCROLLINFO lpScrollInfo, UINT nMask = SIF_ALL);
    int GetScrollLimit(int nBar);

// Window Access Functions
    CWnd* ChildWindowFromPoint(POINT point) const;
    CWnd* ChildWindowFromPoint(POINT point, UINT nFlags) const;
    static CWnd* PASCAL FindWindow(LPCTSTR lpszClassName, LPCTSTR lpszWindowName);
    CWnd* GetNextWindow(UINT nFlag = GW_HWNDNEXT) const;
    CWnd* GetTopWindow() const;
    CWnd* GetWindow(UINT nCmd) const;
    CWnd* GetLastActivePopup() const;
    BOOL IsChild(const CWnd* pWnd) const;
    CWnd* GetParent() const;
    CWnd* SetParent(CWnd* pWndNewParent);
    static CWnd* PASCAL WindowFromPoint(POINT point);

// Alert Functions
    BOOL FlashWindow(BOOL bInvert);
    int MessageBox(LPCTSTR lpszText, LPCTSTR lpszCaption = NULL, UINT nType = MB_OK);

// Clipboard Functions
    BOOL ChangeClipboardChain(HWND hWndNext);
    HWND SetClipboardViewer();
    BOOL OpenClipboard();
    static CWnd* PASCAL GetClipboardOwner();
    static CWnd* PASCAL GetClipboardViewer();
    static CWnd* PASCAL GetOpenClipboardWindow();

// Caret Functions
    void CreateSolidCaret(int nWidth, int nHeight);
    void CreateGrayCaret(int nWidth, int nHeight);
    static CPoint PASCAL GetCaretPos();
    static void PASCAL SetCaretPos(POINT point);
    void HideCaret();
    void ShowCaret();

// Shell Interaction Functions
    void DragAcceptFiles(BOOL bAccept = TRUE);

// Icon Functions
    HICON SetIcon(HICON hIcon, BOOL bBigIcon);
    HICON GetIcon(BOOL bBigIcon) const;

// Context Help Functions
    BOOL SetWindowContextHelpId(DWORD dwContextHelpId);
    DWORD GetWindowContextHelpId() const;

// Dialog Data support
public:
    BOOL UpdateData(BOOL bSaveAndValidate = TRUE);
            // data wnd must be same type as this

// Layout and other functions
public:
    void CenterWindow(CWnd* pAlternateOwner = NULL);
    int RunModalLoop(DWORD dwFlags = 0);
    virtual BOOL ContinueModal();
    virtual void EndModalLoop(int nResult);

// Window-Management message handler member functions
protected:
    virtual BOOL OnCommand(WPARAM wParam, LPARAM lParam);
    virtual BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult);

    afx_msg void OnActivate(UINT nState, CWnd* pWndOther, BOOL bMinimized);
    afx_msg void OnActivateApp(BOOL bActive, DWORD dwThreadID);
    afx_msg void OnCancelMode();
    afx_msg void OnChildActivate();
    afx_msg void OnClose();
    afx_msg void OnContextMenu(CWnd* pWnd, CPoint pos);
    afx_msg int OnCreate(LPCREATESTRUCT lpCreateStruct);

    afx_msg HBRUSH OnCtlColor(CDC* pDC, CWnd* pWnd, UINT nCtlColor);

    afx_msg void OnDestroy();
    afx_msg void OnEnable(BOOL bEnable);
    afx_msg BOOL OnEraseBkgnd(CDC* pDC);
    afx_msg void OnGetMinMaxInfo(MINMAXINFO* lpMMI);
    afx_msg void OnKillFocus(CWnd* pNewWnd);
    afx_msg void OnMove(int x, int y);
    afx_msg void OnPaint();
    afx_msg void OnParentNotify(UINT message, LPARAM lParam);
    afx_msg BOOL OnSetCursor(CWnd* pWnd, UINT nHitTest, UINT message);
    afx_msg void OnSetFocus(CWnd* pOldWnd);
    afx_msg void OnShowWindow(BOOL bShow, UINT nStatus);
    afx_msg void OnSize(UINT nType, int cx, int cy);
    afx_msg void OnWindowPosChanging(WINDOWPOS* lpwndpos);
    afx_msg void OnWindowPosChanged(WINDOWPOS* lpwndpos);
    afx_msg void OnStyleChanged(int nStyleType, LPSTYLESTRUCT lpStyleStruct);
    afx_msg void OnCaptureChanged(CWnd* pWnd);
    afx_msg BOOL OnHelpInfo(HELPINFO* lpHelpInfo);

// Nonclient-Area message handler member functions
    afx_msg BOOL OnNcActivate(BOOL bActive);
    afx_msg void OnNcCalcSize(BOOL bCalcValidRects, NCCALCSIZE_PARAMS* lpncsp);
    afx_msg BOOL OnNcCreate(LPCREATESTRUCT lpCreateStruct);
    afx_msg void OnNcDestroy();
    afx_msg LRESULT OnNcHitTest(CPoint point);
    afx_msg void OnNcPaint();

// System message handler member functions
    afx_msg void OnSysColorChange();
    afx_msg void OnSettingChange(UINT uFlags, LPCTSTR lpszSection);

// Input message handler member functions
    afx_msg void OnChar(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnHScroll(UINT nSBCode, UINT nPos, CScrollBar* pScrollBar);
    afx_msg void OnVScroll(UINT nSBCode, UINT nPos, CScrollBar* pScrollBar);
    afx_msg void OnKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnKeyUp(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnLButtonDblClk(UINT nFlags, CPoint point);
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnLButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnMButtonDblClk(UINT nFlags, CPoint point);
    afx_msg void OnMButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnMButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg BOOL OnMouseWheel(UINT nFlags, short zDelta, CPoint pt);
    afx_msg void OnRButtonDblClk(UINT nFlags, CPoint point);
    afx_msg void OnRButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnRButtonUp(UINT nFlags, CPoint point);
    afx_msg void OnSysChar(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnSysKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnSysKeyUp(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnTimer(UINT_PTR nIDEvent);
    afx_msg UINT OnGetDlgCode();

// Control message handler member functions
    afx_msg int OnCompareItem(int nIDCtl, LPCOMPAREITEMSTRUCT lpCompareItemStruct);
    afx_msg void OnDeleteItem(int nIDCtl, LPDELETEITEMSTRUCT lpDeleteItemStruct);
    afx_msg void OnDrawItem(int nIDCtl, LPDRAWITEMSTRUCT lpDrawItemStruct);
    afx_msg void OnMeasureItem(int nIDCtl, LPMEASUREITEMSTRUCT lpMeasureItemStruct);
    afx_msg int OnCharToItem(UINT nChar, CListBox* pListBox, UINT nIndex);
    afx_msg int OnVKeyToItem(UINT nKey, CListBox* pListBox, UINT nIndex);

// Overridables and other helpers (for implementation of derived classes)
protected:
    // for deriving from a standard control
    virtual WNDPROC* GetSuperWndProcAddr();

    // for dialog data exchange and validation
    virtual void DoDataExchange(CDataExchange* pDX);

public:
    // for modality
    virtual void BeginModalState();
    virtual void EndModalState();

    // for translating Windows messages in main message pump
    virtual BOOL PreTranslateMessage(MSG* pMsg);

    // keyboard and mouse input through the dialog manager
    BOOL IsDialogMessage(LPMSG lpMsg);
    BOOL PreTranslateInput(LPMSG lpMsg);

protected:
    // for processing Windows messages
    virtual LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam);
    virtual BOOL OnWndMsg(UINT message, WPARAM wParam, LPARAM lParam, LRESULT* pResult);

    // for handling default processing
    LRESULT Default();
    virtual LRESULT DefWindowProc(UINT message, WPARAM wParam, LPARAM lParam);

    // for custom cleanup after WM_NCDESTROY
    virtual void PostNcDestroy();

    // for notifications from parent
    virtual BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT* pResult);
            // return TRUE if parent should not process this message
    BOOL ReflectChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT* pResult);
    static BOOL PASCAL ReflectLastMsg(HWND hWndChild, LRESULT* pResult = NULL);

// Implementation
public:
    virtual ~CWnd();
    virtual BOOL OnCmdMsg(UINT nID, int nCode, void* pExtra, AFX_CMDHANDLERINFO* pHandlerInfo);

    // subclassing/unsubclassing functions
    virtual void PreSubclassWindow();
    BOOL SubclassWindow(HWND hWnd);
    BOOL SubclassDlgItem(UINT nID, CWnd* pParent);
    HWND UnsubclassWindow();

    // handling of RT_DLGINIT resource (extension to RT_DIALOG)
    BOOL ExecuteDlgInit(LPCTSTR lpszResourceName);
    BOOL ExecuteDlgInit(LPVOID lpResource);

    // the original window procedure of a subclassed window
    WNDPROC m_pfnSuper;
    // owner set by SetOwner; a child window's Win32 owner slot is its parent, so it is kept here
    HWND m_hWndOwner;
    UINT m_nFlags;                      // see WF_ flags above
    int m_nModalResult;                 // for return values from CWnd::RunModalLoop
    // registered by COleDropTarget::Register; OnNcDestroy revokes it
    COleDropTarget* m_pDropTarget = NULL;

    static BOOL PASCAL WalkPreTranslateTree(HWND hWndStop, MSG* pMsg);
    static HWND PASCAL GetSafeOwner_(HWND hWnd, HWND* pWndTop);

    BOOL SendChildNotifyLastMsg(LRESULT* pResult = NULL);

protected:
    explicit CWnd(HWND hWnd);           // just for special initialization

    friend LRESULT AFXAPI AfxCallWndProc(CWnd*, HWND, UINT, WPARAM, LPARAM);
    friend LRESULT CALLBACK _AfxCbtFilterHook(int, WPARAM, LPARAM);
    friend class CWinThread;
    friend class CDialog;

    // CWnd's own map: reflection of the owner-draw family to controls, clean-up
    DECLARE_MESSAGE_MAP()

private:
    CWnd(const CWnd&);
    void operator=(const CWnd&);
};

// Window procedure of every framework window, and the dispatch it performs.
LRESULT CALLBACK AfxWndProc(HWND, UINT, WPARAM, LPARAM);
WNDPROC AFXAPI AfxGetAfxWndProc();
LRESULT AFXAPI AfxCallWndProc(CWnd* pWnd, HWND hWnd, UINT nMsg, WPARAM wParam = 0, LPARAM lParam = 0);

// Creation hook: the next window created on this thread is attached to pWnd.
void AFXAPI AfxHookWindowCreate(CWnd* pWnd);
BOOL AFXAPI AfxUnhookWindowCreate();

// Window classes
BOOL AFXAPI AfxRegisterClass(WNDCLASS* lpWndClass);
LPCTSTR AFXAPI AfxRegisterWndClass(UINT nClassStyle, HCURSOR hCursor = 0,
    HBRUSH hbrBackground = 0, HICON hIcon = 0);

// Temporary objects (FromHandle) live until the lock count returns to zero.
void AFXAPI AfxLockTempMaps();
BOOL AFXAPI AfxUnlockTempMaps(BOOL bDeleteTemps = TRUE);

/////////////////////////////////////////////////////////////////////////////
// CDialog

class CDialog : public CWnd
{
    DECLARE_DYNAMIC(CDialog)

    // Modeless construct
public:
    CDialog();

    virtual BOOL Create(LPCTSTR lpszTemplateName, CWnd* pParentWnd = NULL);
    virtual BOOL Create(UINT nIDTemplate, CWnd* pParentWnd = NULL);
    virtual BOOL CreateIndirect(LPCDLGTEMPLATE lpDialogTemplate, CWnd* pParentWnd = NULL,
        void* lpDialogInit = NULL);
    virtual BOOL CreateIndirect(HGLOBAL hDialogTemplate, CWnd* pParentWnd = NULL);

    // Modal construct
public:
    explicit CDialog(LPCTSTR lpszTemplateName, CWnd* pParentWnd = NULL);
    explicit CDialog(UINT nIDTemplate, CWnd* pParentWnd = NULL);
    BOOL InitModalIndirect(LPCDLGTEMPLATE lpDialogTemplate, CWnd* pParentWnd = NULL,
        void* lpDialogInit = NULL);
    BOOL InitModalIndirect(HGLOBAL hDialogTemplate, CWnd* pParentWnd = NULL);

// Attributes
public:
    void MapDialogRect(LPRECT lpRect) const;
    void SetHelpID(UINT nIDR);

// Operations
public:
    // modal processing
    virtual INT_PTR DoModal();

    // support for passing on tab control - use 'PostMessage' if needed
    void NextDlgCtrl() const;
    void PrevDlgCtrl() const;
    void GotoDlgCtrl(CWnd* pWndCtrl);

    // default button access
    void SetDefID(UINT nID);
    DWORD GetDefID() const;

    // termination
    void EndDialog(int nResult);

// Overridables (special message map entries)
    virtual BOOL OnInitDialog();
    virtual void OnSetFont(CFont* pFont);
protected:
    virtual void OnOK();
    virtual void OnCancel();

// Implementation
public:
    virtual ~CDialog();
    virtual BOOL OnCmdMsg(UINT nID, int nCode, void* pExtra, AFX_CMDHANDLERINFO* pHandlerInfo);
    virtual BOOL CheckAutoCenter();

protected:
    UINT m_nIDHelp;                     // Help ID (0 for none, see HID_BASE_RESOURCE)

    // parameters for 'DoModal'
    LPCTSTR m_lpszTemplateName;         // name or MAKEINTRESOURCE
    HGLOBAL m_hDialogTemplate;          // indirect (m_lpDialogTemplate == NULL)
    LPCDLGTEMPLATE m_lpDialogTemplate;  // indirect if (m_lpszTemplateName == NULL)
    void* m_lpDialogInit;               // DLGINIT resource data
    CWnd* m_pParentWnd;                 // parent/owner window
    HWND m_hWndTop;                     // top level parent window (may be disabled)

    virtual void PreInitDialog();

    // implementation helpers
    HWND PreModal();
    void PostModal();

    BOOL CreateIndirect(LPCDLGTEMPLATE lpDialogTemplate, CWnd* pParentWnd,
        void* lpDialogInit, HINSTANCE hInst);
    BOOL CreateDlgIndirect(LPCDLGTEMPLATE lpDialogTemplate, CWnd* pParentWnd, HINSTANCE hInst);

public:
    virtual BOOL PreTranslateMessage(MSG* pMsg);

protected:
    friend class CWnd;
    afx_msg LRESULT HandleInitDialog(WPARAM, LPARAM);
    afx_msg LRESULT HandleSetFont(WPARAM, LPARAM);

    DECLARE_MESSAGE_MAP()
};

INT_PTR CALLBACK AfxDlgProc(HWND, UINT, WPARAM, LPARAM);

/////////////////////////////////////////////////////////////////////////////
// Dialog data exchange

class CDataExchange
{
// Attributes
public:
    BOOL m_bSaveAndValidate;    // TRUE => save and validate data
    CWnd* m_pDlgWnd;            // container usually a dialog

// Operations (for implementors of DDX and DDV procs)
    HWND PrepareCtrl(int nIDC);     // return HWND of control
    HWND PrepareEditCtrl(int nIDC); // return HWND of control
    void Fail();                    // will throw exception

    CDataExchange(CWnd* pDlgWnd, BOOL bSaveAndValidate);

// Implementation
    UINT m_idLastControl;       // last control used (for validation)
    BOOL m_bEditLastControl;    // last control was an edit item
};

void AFXAPI DDX_Control(CDataExchange* pDX, int nIDC, CWnd& rControl);
void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, int& value);
void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, UINT& value);
void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, long& value);
void AFXAPI DDX_Text(CDataExchange* pDX, int nIDC, CString& value);
void AFXAPI DDX_Check(CDataExchange* pDX, int nIDC, int& value);
void AFXAPI DDX_Radio(CDataExchange* pDX, int nIDC, int& value);
void AFXAPI DDV_MaxChars(CDataExchange* pDX, CString const& value, int nChars);
void AFXAPI DDV_MinMaxInt(CDataExchange* pDX, int value, int minVal, int maxVal);

/////////////////////////////////////////////////////////////////////////////
// Standard controls

class CStatic : public CWnd
{
    DECLARE_DYNAMIC(CStatic)

// Constructors
public:
    CStatic();
    virtual BOOL Create(LPCTSTR lpszText, DWORD dwStyle, const RECT& rect, CWnd* pParentWnd,
        UINT nID = 0xffff);

// Operations
    HICON SetIcon(HICON hIcon);
    HICON GetIcon() const;
    HBITMAP SetBitmap(HBITMAP hBitmap);
    HBITMAP GetBitmap() const;
    HCURSOR SetCursor(HCURSOR hCursor);
    HCURSOR GetCursor();

// Overridables (for owner draw only)
    virtual void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct);

// Implementation
public:
    virtual ~CStatic();
protected:
    virtual BOOL OnChildNotify(UINT, WPARAM, LPARAM, LRESULT*);
};

class CButton : public CWnd
{
    DECLARE_DYNAMIC(CButton)

// Constructors
public:
    CButton();
    virtual BOOL Create(LPCTSTR lpszCaption, DWORD dwStyle, const RECT& rect, CWnd* pParentWnd,
        UINT nID);

// Attributes
    UINT GetState() const;
    void SetState(BOOL bHighlight);
    int GetCheck() const;
    void SetCheck(int nCheck);
    UINT GetButtonStyle() const;
    void SetButtonStyle(UINT nStyle, BOOL bRedraw = TRUE);
    HICON SetIcon(HICON hIcon);
    HICON GetIcon() const;
    HBITMAP SetBitmap(HBITMAP hBitmap);
    HBITMAP GetBitmap() const;
    HCURSOR SetCursor(HCURSOR hCursor);
    HCURSOR GetCursor();

// Overridables (for owner draw only)
    virtual void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct);

// Implementation
public:
    virtual ~CButton();
protected:
    virtual BOOL OnChildNotify(UINT, WPARAM, LPARAM, LRESULT*);
};

class CListBox : public CWnd
{
    DECLARE_DYNAMIC(CListBox)

// Constructors
public:
    CListBox();
    virtual BOOL Create(DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID);

// Attributes
    int GetCount() const;
    int GetHorizontalExtent() const;
    void SetHorizontalExtent(int cxExtent);
    int GetTopIndex() const;
    int SetTopIndex(int nIndex);
    LCID GetLocale() const;
    LCID SetLocale(LCID nNewLocale);
    int InitStorage(int nItems, UINT nBytes);
    UINT ItemFromPoint(CPoint pt, BOOL& bOutside) const;

    // for single-selection listboxes
    int GetCurSel() const;
    int SetCurSel(int nSelect);

    // for multiple-selection listboxes
    int GetSel(int nIndex) const;
    int SetSel(int nIndex, BOOL bSelect = TRUE);
    int GetSelCount() const;
    int GetSelItems(int nMaxItems, LPINT rgIndex) const;
    void SetAnchorIndex(int nIndex);
    int GetAnchorIndex() const;

    // for listbox items
    DWORD_PTR GetItemData(int nIndex) const;
    int SetItemData(int nIndex, DWORD_PTR dwItemData);
    void* GetItemDataPtr(int nIndex) const;
    int SetItemDataPtr(int nIndex, void* pData);
    int GetItemRect(int nIndex, LPRECT lpRect) const;
    int GetText(int nIndex, LPTSTR lpszBuffer) const;
    void GetText(int nIndex, CString& rString) const;
    int GetTextLen(int nIndex) const;

    // Settable only attributes
    void SetColumnWidth(int cxWidth);
    BOOL SetTabStops(int nTabStops, LPINT rgTabStops);
    void SetTabStops();
    BOOL SetTabStops(const int& cxEachStop);

    int SetItemHeight(int nIndex, UINT cyItemHeight);
    int GetItemHeight(int nIndex) const;
    int FindStringExact(int nIndexStart, LPCTSTR lpszFind) const;
    int GetCaretIndex() const;
    int SetCaretIndex(int nIndex, BOOL bScroll = TRUE);

// Operations
    // manipulating listbox items
    int AddString(LPCTSTR lpszItem);
    int DeleteString(UINT nIndex);
    int InsertString(int nIndex, LPCTSTR lpszItem);
    void ResetContent();
    int Dir(UINT attr, LPCTSTR lpszWildCard);

    // selection helpers
    int FindString(int nStartAfter, LPCTSTR lpszItem) const;
    int SelectString(int nStartAfter, LPCTSTR lpszItem);
    int SelItemRange(BOOL bSelect, int nFirstItem, int nLastItem);

// Overridables (must override draw, measure and compare for owner draw)
    virtual void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct);
    virtual void MeasureItem(LPMEASUREITEMSTRUCT lpMeasureItemStruct);
    virtual int CompareItem(LPCOMPAREITEMSTRUCT lpCompareItemStruct);
    virtual void DeleteItem(LPDELETEITEMSTRUCT lpDeleteItemStruct);
    virtual int VKeyToItem(UINT nKey, UINT nIndex);
    virtual int CharToItem(UINT nKey, UINT nIndex);

// Implementation
public:
    virtual ~CListBox();
protected:
    virtual BOOL OnChildNotify(UINT, WPARAM, LPARAM, LRESULT*);
};

class CComboBox : public CWnd
{
    DECLARE_DYNAMIC(CComboBox)

// Constructors
public:
    CComboBox();
    virtual BOOL Create(DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID);

// Attributes
    // for entire combo box
    int GetCount() const;
    int GetCurSel() const;
    int SetCurSel(int nSelect);
    LCID GetLocale() const;
    LCID SetLocale(LCID nNewLocale);
    int GetTopIndex() const;
    int SetTopIndex(int nIndex);
    int InitStorage(int nItems, UINT nBytes);
    void SetHorizontalExtent(UINT nExtent);
    UINT GetHorizontalExtent() const;
    int SetDroppedWidth(UINT nWidth);
    int GetDroppedWidth() const;

    // for edit control
    DWORD GetEditSel() const;
    BOOL LimitText(int nMaxChars);
    BOOL SetEditSel(int nStartChar, int nEndChar);

    // for combobox item
    DWORD_PTR GetItemData(int nIndex) const;
    int SetItemData(int nIndex, DWORD_PTR dwItemData);
    void* GetItemDataPtr(int nIndex) const;
    int SetItemDataPtr(int nIndex, void* pData);
    int GetLBText(int nIndex, LPTSTR lpszText) const;
    void GetLBText(int nIndex, CString& rString) const;
    int GetLBTextLen(int nIndex) const;

    int SetItemHeight(int nIndex, UINT cyItemHeight);
    int GetItemHeight(int nIndex) const;
    int FindStringExact(int nIndexStart, LPCTSTR lpszFind) const;
    int SetExtendedUI(BOOL bExtended = TRUE);
    BOOL GetExtendedUI() const;
    void GetDroppedControlRect(LPRECT lprect) const;
    BOOL GetDroppedState() const;

// Operations
    // for drop-down combo boxes
    void ShowDropDown(BOOL bShowIt = TRUE);

    // manipulating listbox items
    int AddString(LPCTSTR lpszString);
    int DeleteString(UINT nIndex);
    int InsertString(int nIndex, LPCTSTR lpszString);
    void ResetContent();
    int Dir(UINT attr, LPCTSTR lpszWildCard);

    // selection helpers
    int FindString(int nStartAfter, LPCTSTR lpszString) const;
    int SelectString(int nStartAfter, LPCTSTR lpszString);

    // Clipboard operations
    void Clear();
    void Copy();
    void Cut();
    void Paste();

// Overridables (must override draw, measure and compare for owner draw)
    virtual void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct);
    virtual void MeasureItem(LPMEASUREITEMSTRUCT lpMeasureItemStruct);
    virtual int CompareItem(LPCOMPAREITEMSTRUCT lpCompareItemStruct);
    virtual void DeleteItem(LPDELETEITEMSTRUCT lpDeleteItemStruct);

// Implementation
public:
    virtual ~CComboBox();
protected:
    virtual BOOL OnChildNotify(UINT, WPARAM, LPARAM, LRESULT*);
};

class CEdit : public CWnd
{
    DECLARE_DYNAMIC(CEdit)

// Constructors
public:
    CEdit();
    virtual BOOL Create(DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID);

// Attributes
    BOOL CanUndo() const;
    int GetLineCount() const;
    BOOL GetModify() const;
    void SetModify(BOOL bModified = TRUE);
    void GetRect(LPRECT lpRect) const;
    DWORD GetSel() const;
    void GetSel(int& nStartChar, int& nEndChar) const;
    HLOCAL GetHandle() const;
    void SetHandle(HLOCAL hBuffer);
    void SetMargins(UINT nLeft, UINT nRight);
    DWORD GetMargins() const;
    void SetLimitText(UINT nMax);
    UINT GetLimitText() const;
    CPoint PosFromChar(UINT nChar) const;
    int CharFromPos(CPoint pt) const;

    // NOTE: first word in lpszBuffer must contain the size of the buffer!
    int GetLine(int nIndex, LPTSTR lpszBuffer) const;
    int GetLine(int nIndex, LPTSTR lpszBuffer, int nMaxLength) const;

// Operations
    void EmptyUndoBuffer();
    BOOL FmtLines(BOOL bAddEOL);

    void LimitText(int nChars = 0);
    int LineFromChar(int nIndex = -1) const;
    int LineIndex(int nLine = -1) const;
    int LineLength(int nLine = -1) const;
    void LineScroll(int nLines, int nChars = 0);
    void ReplaceSel(LPCTSTR lpszNewText, BOOL bCanUndo = FALSE);
    void SetPasswordChar(TCHAR ch);
    void SetRect(LPCRECT lpRect);
    void SetRectNP(LPCRECT lpRect);
    void SetSel(DWORD dwSelection, BOOL bNoScroll = FALSE);
    void SetSel(int nStartChar, int nEndChar, BOOL bNoScroll = FALSE);
    BOOL SetTabStops(int nTabStops, LPINT rgTabStops);
    void SetTabStops();
    BOOL SetTabStops(const int& cxEachStop);

    // Clipboard operations
    BOOL Undo();
    void Clear();
    void Copy();
    void Cut();
    void Paste();

    BOOL SetReadOnly(BOOL bReadOnly = TRUE);
    int GetFirstVisibleLine() const;
    TCHAR GetPasswordChar() const;

// Implementation
public:
    virtual ~CEdit();
};

class CScrollBar : public CWnd
{
    DECLARE_DYNAMIC(CScrollBar)

// Constructors
public:
    CScrollBar();
    virtual BOOL Create(DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID);

// Attributes
    int GetScrollPos() const;
    int SetScrollPos(int nPos, BOOL bRedraw = TRUE);
    void GetScrollRange(LPINT lpMinPos, LPINT lpMaxPos) const;
    void SetScrollRange(int nMinPos, int nMaxPos, BOOL bRedraw = TRUE);
    void ShowScrollBar(BOOL bShow = TRUE);
    BOOL EnableScrollBar(UINT nArrowFlags = ESB_ENABLE_BOTH);
    BOOL SetScrollInfo(LPSCROLLINFO lpScrollInfo, BOOL bRedraw = TRUE);
    BOOL GetScrollInfo(LPSCROLLINFO lpScrollInfo, UINT nMask = SIF_ALL);
    int GetScrollLimit();

// Implementation
public:
    virtual ~CScrollBar();
};

/////////////////////////////////////////////////////////////////////////////
// CWinThread and CWinApp

class CWinThread : public CCmdTarget
{
    DECLARE_DYNAMIC(CWinThread)

public:
// Constructors
    CWinThread();

// Attributes
    CWnd* m_pMainWnd;       // main window (usually same AfxGetApp()->m_pMainWnd)
    CWnd* m_pActiveWnd;     // active main window (may not be m_pMainWnd)
    BOOL m_bAutoDelete;     // enables 'delete this' after thread termination

    // only valid while running
    HANDLE m_hThread;       // this thread's HANDLE
    operator HANDLE() const { return m_hThread; }
    DWORD m_nThreadID;      // this thread's ID

    int GetThreadPriority();
    BOOL SetThreadPriority(int nPriority);

// Operations
    DWORD SuspendThread();
    DWORD ResumeThread();
    BOOL PostThreadMessage(UINT message, WPARAM wParam, LPARAM lParam);

// Overridables
    // thread initialization
    virtual BOOL InitInstance();

    // running and idle processing
    virtual int Run();
    virtual BOOL PreTranslateMessage(MSG* pMsg);
    virtual BOOL PumpMessage();     // low level message pump
    virtual BOOL OnIdle(LONG lCount); // return TRUE if more idle processing
    virtual BOOL IsIdleMessage(MSG* pMsg);  // checks for special messages

    // thread termination
    virtual int ExitInstance(); // default will 'delete this'

    // Advanced: exception handling
    virtual LRESULT ProcessWndProcException(CException* e, const MSG* pMsg);

    // Advanced: handling messages sent to message filter hook
    virtual BOOL ProcessMessageFilter(int code, LPMSG lpMsg);

    // Advanced: access to GetMainWnd()
    virtual CWnd* GetMainWnd();

// Implementation
public:
    virtual ~CWinThread();
    virtual void Delete();
    static const MSG* PASCAL GetCurrentMessage();

    // set by AfxOleInit: AfxWinTerm calls it with bTerm TRUE to end OLE
    void (AFXAPI* m_lpfnOleTermOrFreeLib)(BOOL bTerm, BOOL bJustRevoke) = NULL;
};

class CWinApp : public CWinThread
{
    DECLARE_DYNAMIC(CWinApp)
public:

// Constructor
    explicit CWinApp(LPCTSTR lpszAppName = NULL);   // app name defaults to EXE name

// Attributes
    // Startup args (do not change)
    HINSTANCE m_hInstance;
    HINSTANCE m_hPrevInstance;
    LPTSTR m_lpCmdLine;
    int m_nCmdShow;

    // Running args (can be changed in InitInstance)
    LPCTSTR m_pszAppName;   // human readable name (from constructor or AFX_IDS_APP_TITLE)
    LPCTSTR m_pszRegistryKey;   // used for registry entries
    LPCTSTR m_pszExeName;       // executable name (no spaces)
    LPCTSTR m_pszHelpFilePath;  // default based on module path
    LPCTSTR m_pszProfileName;   // default based on app name

// Operations
    // Cursors
    HCURSOR LoadCursor(LPCTSTR lpszResourceName) const;
    HCURSOR LoadCursor(UINT nIDResource) const;
    HCURSOR LoadStandardCursor(LPCTSTR lpszCursorName) const; // for IDC_ values
    HCURSOR LoadOEMCursor(UINT nIDCursor) const;             // for OCR_ values

    // Icons
    HICON LoadIcon(LPCTSTR lpszResourceName) const;
    HICON LoadIcon(UINT nIDResource) const;
    HICON LoadStandardIcon(LPCTSTR lpszIconName) const;       // for IDI_ values
    HICON LoadOEMIcon(UINT nIDIcon) const;                   // for OIC_ values

// Overridables
    // hooks for your initialization code
    virtual BOOL InitApplication();

    // exiting
    virtual BOOL SaveAllModified(); // save before exit

    // Advanced: to override message boxes and other hooks
    virtual int DoMessageBox(LPCTSTR lpszPrompt, UINT nType, UINT nIDPrompt);
    virtual void DoWaitCursor(int nCode); // 0 => restore, 1=> begin, -1=> end

    // Advanced: process async DDE request
    virtual BOOL OnDDECommand(LPTSTR lpszCommand);

    // Advanced: Help support
    virtual void WinHelp(DWORD_PTR dwData, UINT nCmd = HELP_CONTEXT);

// Command Handlers
protected:
    afx_msg void OnAppExit();

// Implementation
public:
    virtual BOOL InitInstance();
    virtual int ExitInstance(); // return app exit code
    virtual int Run();
    virtual BOOL OnIdle(LONG lCount); // return TRUE if more idle processing
    virtual LRESULT ProcessWndProcException(CException* e, const MSG* pMsg);

    virtual ~CWinApp();

    void SetCurrentHandles();
    void EnableModeless(BOOL bEnable); // to disable OLE in-place dialogs

    int m_nWaitCursorCount;         // for wait cursor (>0 => waiting)
    HCURSOR m_hcurWaitCursorRestore; // old cursor to restore after wait cursor

protected:
    BOOL m_bAppNameAllocated;
    BOOL m_bExeNameAllocated;

    DECLARE_MESSAGE_MAP()
};

/////////////////////////////////////////////////////////////////////////////
// Frame windows and the wait cursor

// CFrameWnd styles
#define FWS_ADDTOTITLE      0x00008000L
#define FWS_PREFIXTITLE     0x00040000L
#define FWS_SNAPTOBARS      0x00080000L

// CMiniFrameWnd styles
#define MFS_SYNCACTIVE      0x00000100L
#define MFS_4THICKFRAME     0x00000200L
#define MFS_THICKFRAME      0x00000400L
#define MFS_MOVEFRAME       0x00000800L
#define MFS_BLOCKSYSMENU    0x00001000L

#ifndef AFX_IDW_PANE_FIRST
#define AFX_IDW_PANE_FIRST  0xE900      // the child that fills the frame's client area
#endif

// A frame window lives on the heap: its window's destruction deletes it.
class CFrameWnd : public CWnd
{
    DECLARE_DYNCREATE(CFrameWnd)

// Constructors
public:
    static const CRect rectDefault;
    CFrameWnd();

    virtual BOOL Create(LPCTSTR lpszClassName, LPCTSTR lpszWindowName,
        DWORD dwStyle = WS_OVERLAPPEDWINDOW, const RECT& rect = rectDefault,
        CWnd* pParentWnd = NULL, LPCTSTR lpszMenuName = NULL, DWORD dwExStyle = 0,
        CCreateContext* pContext = NULL);

// Attributes
    CString GetTitle() const;
    void SetTitle(LPCTSTR lpszTitle);

// Operations
    // sizes the pane (child AFX_IDW_PANE_FIRST) to the client area
    virtual void RecalcLayout(BOOL bNotify = TRUE);

// Overridables
protected:
    virtual BOOL OnCreateClient(LPCREATESTRUCT lpcs, CCreateContext* pContext);

// Implementation
public:
    virtual ~CFrameWnd();
    virtual BOOL PreCreateWindow(CREATESTRUCT& cs);

protected:
    CString m_strTitle;
    BOOL m_bInRecalcLayout;

    virtual void PostNcDestroy();       // delete this
    int OnCreateHelper(LPCREATESTRUCT lpcs, CCreateContext* pContext);

    afx_msg int OnCreate(LPCREATESTRUCT lpCreateStruct);
    afx_msg void OnClose();
    afx_msg void OnSetFocus(CWnd* pOldWnd);
    afx_msg void OnSize(UINT nType, int cx, int cy);
    afx_msg void OnActivate(UINT nState, CWnd* pWndOther, BOOL bMinimized);

    DECLARE_MESSAGE_MAP()
};

// A tool window with a small caption (WS_EX_TOOLWINDOW), e.g. a floating palette.
class CMiniFrameWnd : public CFrameWnd
{
    DECLARE_DYNCREATE(CMiniFrameWnd)

// Constructors
public:
    CMiniFrameWnd();
    virtual BOOL Create(LPCTSTR lpClassName, LPCTSTR lpWindowName, DWORD dwStyle,
        const RECT& rect, CWnd* pParentWnd = NULL, UINT nID = 0);
    virtual BOOL CreateEx(DWORD dwExStyle, LPCTSTR lpClassName, LPCTSTR lpWindowName,
        DWORD dwStyle, const RECT& rect, CWnd* pParentWnd = NULL, UINT nID = 0);

// Implementation
public:
    virtual ~CMiniFrameWnd();
    virtual BOOL PreCreateWindow(CREATESTRUCT& cs);

protected:
    CString m_strCaption;

    DECLARE_MESSAGE_MAP()
};

// Shows the wait cursor for its lifetime (the application's DoWaitCursor).
class CWaitCursor
{
// Construction/Destruction
public:
    CWaitCursor();
    ~CWaitCursor();

// Operations
public:
    void Restore();
};

/////////////////////////////////////////////////////////////////////////////
// Global functions

CWinApp* AFXAPI AfxGetApp();
CWinThread* AFXAPI AfxGetThread();
CWnd* AFXAPI AfxGetMainWnd();
HINSTANCE AFXAPI AfxGetInstanceHandle();
void AFXAPI AfxSetResourceHandle(HINSTANCE hInstResource);
LPCTSTR AFXAPI AfxGetAppName();
void AFXAPI AfxPostQuitMessage(int nExitCode);

int AFXAPI AfxMessageBox(LPCTSTR lpszText, UINT nType = MB_OK, UINT nIDHelp = 0);
int AFXAPI AfxMessageBox(UINT nIDPrompt, UINT nType = MB_OK, UINT nIDHelp = (UINT)-1);

BOOL AFXAPI AfxWinInit(HINSTANCE hInstance, HINSTANCE hPrevInstance, LPTSTR lpCmdLine,
    int nCmdShow);
void AFXAPI AfxWinTerm();
int AFXAPI AfxWinMain(HINSTANCE hInstance, HINSTANCE hPrevInstance, LPTSTR lpCmdLine,
    int nCmdShow);

#include "afxstat_.h"
#include "afxdll_.h"

/////////////////////////////////////////////////////////////////////////////
// Inline wrappers

// Calling GetSafeHwnd through a null pointer is an established idiom; the empty
// asm hides 'this' from the optimiser, which may otherwise assume it non-null.
inline HWND CWnd::GetSafeHwnd() const
    { const CWnd* p = this; __asm__("" : "+r"(p)); return p == NULL ? NULL : p->m_hWnd; }
inline DWORD CWnd::GetStyle() const
    { return (DWORD)::GetWindowLongPtr(m_hWnd, GWL_STYLE); }
inline DWORD CWnd::GetExStyle() const
    { return (DWORD)::GetWindowLongPtr(m_hWnd, GWL_EXSTYLE); }
inline CWnd* CWnd::GetOwner() const
    { return m_hWndOwner != NULL ? CWnd::FromHandle(m_hWndOwner) : GetParent(); }
inline void CWnd::SetOwner(CWnd* pOwnerWnd)
    { m_hWndOwner = pOwnerWnd != NULL ? pOwnerWnd->m_hWnd : NULL; }
inline LRESULT CWnd::SendMessage(UINT message, WPARAM wParam, LPARAM lParam)
    { return ::SendMessage(m_hWnd, message, wParam, lParam); }
inline BOOL CWnd::PostMessage(UINT message, WPARAM wParam, LPARAM lParam)
    { return ::PostMessage(m_hWnd, message, wParam, lParam); }
inline BOOL CWnd::SendNotifyMessage(UINT message, WPARAM wParam, LPARAM lParam)
    { return ::SendNotifyMessage(m_hWnd, message, wParam, lParam); }
inline void CWnd::SetWindowText(LPCTSTR lpszString)
    { ::SetWindowText(m_hWnd, lpszString); }
inline int CWnd::GetWindowText(LPTSTR lpszString, int nMaxCount) const
    { return ::GetWindowText(m_hWnd, lpszString, nMaxCount); }
inline int CWnd::GetWindowTextLength() const
    { return ::GetWindowTextLength(m_hWnd); }
inline void CWnd::DrawMenuBar()
    { ::DrawMenuBar(m_hWnd); }
inline BOOL CWnd::IsIconic() const
    { return ::IsIconic(m_hWnd); }
inline BOOL CWnd::IsZoomed() const
    { return ::IsZoomed(m_hWnd); }
inline void CWnd::MoveWindow(int x, int y, int nWidth, int nHeight, BOOL bRepaint)
    { ::MoveWindow(m_hWnd, x, y, nWidth, nHeight, bRepaint); }
inline void CWnd::MoveWindow(LPCRECT lpRect, BOOL bRepaint)
    { MoveWindow(lpRect->left, lpRect->top, lpRect->right - lpRect->left,
        lpRect->bottom - lpRect->top, bRepaint); }
inline int CWnd::SetWindowRgn(HRGN hRgn, BOOL bRedraw)
    { return ::SetWindowRgn(m_hWnd, hRgn, bRedraw); }
inline int CWnd::GetWindowRgn(HRGN hRgn) const
    { return ::GetWindowRgn(m_hWnd, hRgn); }
inline BOOL CWnd::SetWindowPos(const CWnd* pWndInsertAfter, int x, int y, int cx, int cy, UINT nFlags)
    { return ::SetWindowPos(m_hWnd, pWndInsertAfter->GetSafeHwnd(), x, y, cx, cy, nFlags); }
inline UINT CWnd::ArrangeIconicWindows()
    { return ::ArrangeIconicWindows(m_hWnd); }
inline void CWnd::BringWindowToTop()
    { ::BringWindowToTop(m_hWnd); }
inline void CWnd::GetWindowRect(LPRECT lpRect) const
    { ::GetWindowRect(m_hWnd, lpRect); }
inline void CWnd::GetClientRect(LPRECT lpRect) const
    { ::GetClientRect(m_hWnd, lpRect); }
inline BOOL CWnd::GetWindowPlacement(WINDOWPLACEMENT* lpwndpl) const
    { return ::GetWindowPlacement(m_hWnd, lpwndpl); }
inline BOOL CWnd::SetWindowPlacement(const WINDOWPLACEMENT* lpwndpl)
    { return ::SetWindowPlacement(m_hWnd, lpwndpl); }
inline void CWnd::ClientToScreen(LPPOINT lpPoint) const
    { ::ClientToScreen(m_hWnd, lpPoint); }
inline void CWnd::ClientToScreen(LPRECT lpRect) const
    { ::ClientToScreen(m_hWnd, (LPPOINT)lpRect); ::ClientToScreen(m_hWnd, ((LPPOINT)lpRect) + 1);
      if (GetExStyle() & WS_EX_LAYOUTRTL) { LONG t = lpRect->left; lpRect->left = lpRect->right; lpRect->right = t; } }
inline void CWnd::ScreenToClient(LPPOINT lpPoint) const
    { ::ScreenToClient(m_hWnd, lpPoint); }
inline void CWnd::ScreenToClient(LPRECT lpRect) const
    { ::ScreenToClient(m_hWnd, (LPPOINT)lpRect); ::ScreenToClient(m_hWnd, ((LPPOINT)lpRect) + 1);
      if (GetExStyle() & WS_EX_LAYOUTRTL) { LONG t = lpRect->left; lpRect->left = lpRect->right; lpRect->right = t; } }
inline void CWnd::MapWindowPoints(CWnd* pwndTo, LPPOINT lpPoint, UINT nCount) const
    { ::MapWindowPoints(m_hWnd, pwndTo->GetSafeHwnd(), lpPoint, nCount); }
inline void CWnd::MapWindowPoints(CWnd* pwndTo, LPRECT lpRect) const
    { ::MapWindowPoints(m_hWnd, pwndTo->GetSafeHwnd(), (LPPOINT)lpRect, 2); }
inline void CWnd::UpdateWindow()
    { ::UpdateWindow(m_hWnd); }
inline void CWnd::SetRedraw(BOOL bRedraw)
    { ::SendMessage(m_hWnd, WM_SETREDRAW, bRedraw, 0); }
inline BOOL CWnd::GetUpdateRect(LPRECT lpRect, BOOL bErase)
    { return ::GetUpdateRect(m_hWnd, lpRect, bErase); }
inline void CWnd::Invalidate(BOOL bErase)
    { ::InvalidateRect(m_hWnd, NULL, bErase); }
inline void CWnd::InvalidateRect(LPCRECT lpRect, BOOL bErase)
    { ::InvalidateRect(m_hWnd, lpRect, bErase); }
inline void CWnd::ValidateRect(LPCRECT lpRect)
    { ::ValidateRect(m_hWnd, lpRect); }
inline BOOL CWnd::ShowWindow(int nCmdShow)
    { return ::ShowWindow(m_hWnd, nCmdShow); }
inline BOOL CWnd::IsWindowVisible() const
    { return ::IsWindowVisible(m_hWnd); }
inline void CWnd::ShowOwnedPopups(BOOL bShow)
    { ::ShowOwnedPopups(m_hWnd, bShow); }
inline BOOL CWnd::EnableScrollBar(int nSBFlags, UINT nArrowFlags)
    { return ::EnableScrollBar(m_hWnd, nSBFlags, nArrowFlags); }
inline UINT_PTR CWnd::SetTimer(UINT_PTR nIDEvent, UINT nElapse,
        void (CALLBACK* lpfnTimer)(HWND, UINT, UINT_PTR, DWORD))
    { return ::SetTimer(m_hWnd, nIDEvent, nElapse, lpfnTimer); }
inline BOOL CWnd::KillTimer(UINT_PTR nIDEvent)
    { return ::KillTimer(m_hWnd, nIDEvent); }
inline BOOL CWnd::IsWindowEnabled() const
    { return ::IsWindowEnabled(m_hWnd); }
inline BOOL CWnd::EnableWindow(BOOL bEnable)
    { return ::EnableWindow(m_hWnd, bEnable); }
inline CWnd* PASCAL CWnd::GetActiveWindow()
    { return CWnd::FromHandle(::GetActiveWindow()); }
inline CWnd* CWnd::SetActiveWindow()
    { return CWnd::FromHandle(::SetActiveWindow(m_hWnd)); }
inline BOOL CWnd::SetForegroundWindow()
    { return ::SetForegroundWindow(m_hWnd); }
inline CWnd* PASCAL CWnd::GetForegroundWindow()
    { return CWnd::FromHandle(::GetForegroundWindow()); }
inline CWnd* PASCAL CWnd::GetCapture()
    { return CWnd::FromHandle(::GetCapture()); }
inline CWnd* CWnd::SetCapture()
    { return CWnd::FromHandle(::SetCapture(m_hWnd)); }
inline CWnd* PASCAL CWnd::GetFocus()
    { return CWnd::FromHandle(::GetFocus()); }
inline CWnd* CWnd::SetFocus()
    { return CWnd::FromHandle(::SetFocus(m_hWnd)); }
inline CWnd* PASCAL CWnd::GetDesktopWindow()
    { return CWnd::FromHandle(::GetDesktopWindow()); }
inline void CWnd::CheckDlgButton(int nIDButton, UINT nCheck)
    { ::CheckDlgButton(m_hWnd, nIDButton, nCheck); }
inline void CWnd::CheckRadioButton(int nIDFirstButton, int nIDLastButton, int nIDCheckButton)
    { ::CheckRadioButton(m_hWnd, nIDFirstButton, nIDLastButton, nIDCheckButton); }
inline UINT CWnd::GetDlgItemInt(int nID, BOOL* lpTrans, BOOL bSigned) const
    { return ::GetDlgItemInt(m_hWnd, nID, lpTrans, bSigned); }
inline int CWnd::GetDlgItemText(int nID, LPTSTR lpStr, int nMaxCount) const
    { return ::GetDlgItemText(m_hWnd, nID, lpStr, nMaxCount); }
inline CWnd* CWnd::GetNextDlgGroupItem(CWnd* pWndCtl, BOOL bPrevious) const
    { return CWnd::FromHandle(::GetNextDlgGroupItem(m_hWnd, pWndCtl->GetSafeHwnd(), bPrevious)); }
inline CWnd* CWnd::GetNextDlgTabItem(CWnd* pWndCtl, BOOL bPrevious) const
    { return CWnd::FromHandle(::GetNextDlgTabItem(m_hWnd, pWndCtl->GetSafeHwnd(), bPrevious)); }
inline UINT CWnd::IsDlgButtonChecked(int nIDButton) const
    { return ::IsDlgButtonChecked(m_hWnd, nIDButton); }
inline LRESULT CWnd::SendDlgItemMessage(int nID, UINT message, WPARAM wParam, LPARAM lParam)
    { return ::SendDlgItemMessage(m_hWnd, nID, message, wParam, lParam); }
inline void CWnd::SetDlgItemInt(int nID, UINT nValue, BOOL bSigned)
    { ::SetDlgItemInt(m_hWnd, nID, nValue, bSigned); }
inline void CWnd::SetDlgItemText(int nID, LPCTSTR lpszString)
    { ::SetDlgItemText(m_hWnd, nID, lpszString); }
inline int CWnd::GetScrollPos(int nBar) const
    { return ::GetScrollPos(m_hWnd, nBar); }
inline void CWnd::GetScrollRange(int nBar, LPINT lpMinPos, LPINT lpMaxPos) const
    { ::GetScrollRange(m_hWnd, nBar, lpMinPos, lpMaxPos); }
inline void CWnd::ScrollWindow(int xAmount, int yAmount, LPCRECT lpRect, LPCRECT lpClipRect)
    { ::ScrollWindow(m_hWnd, xAmount, yAmount, lpRect, lpClipRect); }
inline int CWnd::SetScrollPos(int nBar, int nPos, BOOL bRedraw)
    { return ::SetScrollPos(m_hWnd, nBar, nPos, bRedraw); }
inline void CWnd::SetScrollRange(int nBar, int nMinPos, int nMaxPos, BOOL bRedraw)
    { ::SetScrollRange(m_hWnd, nBar, nMinPos, nMaxPos, bRedraw); }
inline void CWnd::ShowScrollBar(UINT nBar, BOOL bShow)
    { ::ShowScrollBar(m_hWnd, nBar, bShow); }
inline CWnd* CWnd::ChildWindowFromPoint(POINT point) const
    { return CWnd::FromHandle(::ChildWindowFromPoint(m_hWnd, point)); }
inline CWnd* CWnd::ChildWindowFromPoint(POINT point, UINT nFlags) const
    { return CWnd::FromHandle(::ChildWindowFromPointEx(m_hWnd, point, nFlags)); }
inline CWnd* PASCAL CWnd::FindWindow(LPCTSTR lpszClassName, LPCTSTR lpszWindowName)
    { return CWnd::FromHandle(::FindWindow(lpszClassName, lpszWindowName)); }
inline CWnd* CWnd::GetNextWindow(UINT nFlag) const
    { return CWnd::FromHandle(::GetWindow(m_hWnd, nFlag)); }
inline CWnd* CWnd::GetTopWindow() const
    { return CWnd::FromHandle(::GetTopWindow(m_hWnd)); }
inline CWnd* CWnd::GetWindow(UINT nCmd) const
    { return CWnd::FromHandle(::GetWindow(m_hWnd, nCmd)); }
inline CWnd* CWnd::GetLastActivePopup() const
    { return CWnd::FromHandle(::GetLastActivePopup(m_hWnd)); }
inline BOOL CWnd::IsChild(const CWnd* pWnd) const
    { return ::IsChild(m_hWnd, pWnd->GetSafeHwnd()); }
inline CWnd* CWnd::GetParent() const
    { return CWnd::FromHandle(::GetParent(m_hWnd)); }
inline CWnd* CWnd::SetParent(CWnd* pWndNewParent)
    { return CWnd::FromHandle(::SetParent(m_hWnd, pWndNewParent->GetSafeHwnd())); }
inline CWnd* PASCAL CWnd::WindowFromPoint(POINT point)
    { return CWnd::FromHandle(::WindowFromPoint(point)); }
inline BOOL CWnd::FlashWindow(BOOL bInvert)
    { return ::FlashWindow(m_hWnd, bInvert); }
inline BOOL CWnd::ChangeClipboardChain(HWND hWndNext)
    { return ::ChangeClipboardChain(m_hWnd, hWndNext); }
inline HWND CWnd::SetClipboardViewer()
    { return ::SetClipboardViewer(m_hWnd); }
inline BOOL CWnd::OpenClipboard()
    { return ::OpenClipboard(m_hWnd); }
inline CWnd* PASCAL CWnd::GetClipboardOwner()
    { return CWnd::FromHandle(::GetClipboardOwner()); }
inline CWnd* PASCAL CWnd::GetClipboardViewer()
    { return CWnd::FromHandle(::GetClipboardViewer()); }
inline CWnd* PASCAL CWnd::GetOpenClipboardWindow()
    { return CWnd::FromHandle(::GetOpenClipboardWindow()); }
inline void CWnd::CreateSolidCaret(int nWidth, int nHeight)
    { ::CreateCaret(m_hWnd, (HBITMAP)0, nWidth, nHeight); }
inline void CWnd::CreateGrayCaret(int nWidth, int nHeight)
    { ::CreateCaret(m_hWnd, (HBITMAP)1, nWidth, nHeight); }
inline CPoint PASCAL CWnd::GetCaretPos()
    { CPoint point; ::GetCaretPos((LPPOINT)&point); return point; }
inline void PASCAL CWnd::SetCaretPos(POINT point)
    { ::SetCaretPos(point.x, point.y); }
inline void CWnd::HideCaret()
    { ::HideCaret(m_hWnd); }
inline void CWnd::ShowCaret()
    { ::ShowCaret(m_hWnd); }
inline void CWnd::DragAcceptFiles(BOOL bAccept)
    { ::DragAcceptFiles(m_hWnd, bAccept); }
inline HICON CWnd::SetIcon(HICON hIcon, BOOL bBigIcon)
    { return (HICON)::SendMessage(m_hWnd, WM_SETICON, bBigIcon, (LPARAM)hIcon); }
inline HICON CWnd::GetIcon(BOOL bBigIcon) const
    { return (HICON)::SendMessage(m_hWnd, WM_GETICON, bBigIcon, 0); }
inline BOOL CWnd::SetWindowContextHelpId(DWORD dwContextHelpId)
    { return ::SetWindowContextHelpId(m_hWnd, dwContextHelpId); }
inline DWORD CWnd::GetWindowContextHelpId() const
    { return ::GetWindowContextHelpId(m_hWnd); }

// Default message handlers: the original window procedure does the work.
inline void CWnd::OnActivate(UINT, CWnd*, BOOL) { Default(); }
inline void CWnd::OnActivateApp(BOOL, DWORD) { Default(); }
inline void CWnd::OnCancelMode() { Default(); }
inline void CWnd::OnChildActivate() { Default(); }
inline void CWnd::OnClose() { Default(); }
inline void CWnd::OnContextMenu(CWnd*, CPoint) { Default(); }
inline int CWnd::OnCreate(LPCREATESTRUCT) { return (int)Default(); }
inline void CWnd::OnDestroy() { Default(); }
inline void CWnd::OnEnable(BOOL) { Default(); }
inline BOOL CWnd::OnEraseBkgnd(CDC*) { return (BOOL)Default(); }
inline void CWnd::OnGetMinMaxInfo(MINMAXINFO*) { Default(); }
inline void CWnd::OnKillFocus(CWnd*) { Default(); }
inline void CWnd::OnMove(int, int) { Default(); }
inline void CWnd::OnPaint() { Default(); }
inline BOOL CWnd::OnSetCursor(CWnd*, UINT, UINT) { return (BOOL)Default(); }
inline void CWnd::OnSetFocus(CWnd*) { Default(); }
inline void CWnd::OnShowWindow(BOOL, UINT) { Default(); }
inline void CWnd::OnSize(UINT, int, int) { Default(); }
inline void CWnd::OnWindowPosChanging(WINDOWPOS*) { Default(); }
inline void CWnd::OnWindowPosChanged(WINDOWPOS*) { Default(); }
inline void CWnd::OnStyleChanged(int, LPSTYLESTRUCT) { Default(); }
inline void CWnd::OnCaptureChanged(CWnd*) { Default(); }
inline BOOL CWnd::OnNcActivate(BOOL) { return (BOOL)Default(); }
inline void CWnd::OnNcCalcSize(BOOL, NCCALCSIZE_PARAMS*) { Default(); }
inline BOOL CWnd::OnNcCreate(LPCREATESTRUCT) { return (BOOL)Default(); }
inline LRESULT CWnd::OnNcHitTest(CPoint) { return Default(); }
inline void CWnd::OnNcPaint() { Default(); }
inline void CWnd::OnSysColorChange() { Default(); }
inline void CWnd::OnSettingChange(UINT, LPCTSTR) { Default(); }
inline void CWnd::OnChar(UINT, UINT, UINT) { Default(); }
inline void CWnd::OnKeyDown(UINT, UINT, UINT) { Default(); }
inline void CWnd::OnKeyUp(UINT, UINT, UINT) { Default(); }
inline void CWnd::OnLButtonDblClk(UINT, CPoint) { Default(); }
inline void CWnd::OnLButtonDown(UINT, CPoint) { Default(); }
inline void CWnd::OnLButtonUp(UINT, CPoint) { Default(); }
inline void CWnd::OnMButtonDblClk(UINT, CPoint) { Default(); }
inline void CWnd::OnMButtonDown(UINT, CPoint) { Default(); }
inline void CWnd::OnMButtonUp(UINT, CPoint) { Default(); }
inline void CWnd::OnMouseMove(UINT, CPoint) { Default(); }
inline BOOL CWnd::OnMouseWheel(UINT, short, CPoint) { return (BOOL)Default(); }
inline void CWnd::OnRButtonDblClk(UINT, CPoint) { Default(); }
inline void CWnd::OnRButtonDown(UINT, CPoint) { Default(); }
inline void CWnd::OnRButtonUp(UINT, CPoint) { Default(); }
inline void CWnd::OnSysChar(UINT, UINT, UINT) { Default(); }
inline void CWnd::OnSysKeyDown(UINT, UINT, UINT) { Default(); }
inline void CWnd::OnSysKeyUp(UINT, UINT, UINT) { Default(); }
inline void CWnd::OnTimer(UINT_PTR) { Default(); }
inline UINT CWnd::OnGetDlgCode() { return (UINT)Default(); }

// CDialog
inline void CDialog::MapDialogRect(LPRECT lpRect) const
    { ::MapDialogRect(m_hWnd, lpRect); }
inline void CDialog::SetHelpID(UINT nIDR)
    { m_nIDHelp = nIDR; }
inline void CDialog::NextDlgCtrl() const
    { ::SendMessage(m_hWnd, WM_NEXTDLGCTL, 0, 0); }
inline void CDialog::PrevDlgCtrl() const
    { ::SendMessage(m_hWnd, WM_NEXTDLGCTL, 1, 0); }
inline void CDialog::GotoDlgCtrl(CWnd* pWndCtrl)
    { ::SendMessage(m_hWnd, WM_NEXTDLGCTL, (WPARAM)pWndCtrl->GetSafeHwnd(), 1L); }
inline void CDialog::SetDefID(UINT nID)
    { ::SendMessage(m_hWnd, DM_SETDEFID, nID, 0); }
inline DWORD CDialog::GetDefID() const
    { return (DWORD)::SendMessage(m_hWnd, DM_GETDEFID, 0, 0); }

// CStatic
inline HICON CStatic::SetIcon(HICON hIcon)
    { return (HICON)::SendMessage(m_hWnd, STM_SETICON, (WPARAM)hIcon, 0L); }
inline HICON CStatic::GetIcon() const
    { return (HICON)::SendMessage(m_hWnd, STM_GETICON, 0, 0L); }
inline HBITMAP CStatic::SetBitmap(HBITMAP hBitmap)
    { return (HBITMAP)::SendMessage(m_hWnd, STM_SETIMAGE, IMAGE_BITMAP, (LPARAM)hBitmap); }
inline HBITMAP CStatic::GetBitmap() const
    { return (HBITMAP)::SendMessage(m_hWnd, STM_GETIMAGE, IMAGE_BITMAP, 0L); }
inline HCURSOR CStatic::SetCursor(HCURSOR hCursor)
    { return (HCURSOR)::SendMessage(m_hWnd, STM_SETIMAGE, IMAGE_CURSOR, (LPARAM)hCursor); }
inline HCURSOR CStatic::GetCursor()
    { return (HCURSOR)::SendMessage(m_hWnd, STM_GETIMAGE, IMAGE_CURSOR, 0L); }

// CButton
inline UINT CButton::GetState() const
    { return (UINT)::SendMessage(m_hWnd, BM_GETSTATE, 0, 0); }
inline void CButton::SetState(BOOL bHighlight)
    { ::SendMessage(m_hWnd, BM_SETSTATE, bHighlight, 0); }
inline int CButton::GetCheck() const
    { return (int)::SendMessage(m_hWnd, BM_GETCHECK, 0, 0); }
inline void CButton::SetCheck(int nCheck)
    { ::SendMessage(m_hWnd, BM_SETCHECK, nCheck, 0); }
inline UINT CButton::GetButtonStyle() const
    { return (UINT)::GetWindowLongPtr(m_hWnd, GWL_STYLE) & 0xff; }
inline void CButton::SetButtonStyle(UINT nStyle, BOOL bRedraw)
    { ::SendMessage(m_hWnd, BM_SETSTYLE, nStyle, (LPARAM)bRedraw); }
inline HICON CButton::SetIcon(HICON hIcon)
    { return (HICON)::SendMessage(m_hWnd, BM_SETIMAGE, IMAGE_ICON, (LPARAM)hIcon); }
inline HICON CButton::GetIcon() const
    { return (HICON)::SendMessage(m_hWnd, BM_GETIMAGE, IMAGE_ICON, 0L); }
inline HBITMAP CButton::SetBitmap(HBITMAP hBitmap)
    { return (HBITMAP)::SendMessage(m_hWnd, BM_SETIMAGE, IMAGE_BITMAP, (LPARAM)hBitmap); }
inline HBITMAP CButton::GetBitmap() const
    { return (HBITMAP)::SendMessage(m_hWnd, BM_GETIMAGE, IMAGE_BITMAP, 0L); }
inline HCURSOR CButton::SetCursor(HCURSOR hCursor)
    { return (HCURSOR)::SendMessage(m_hWnd, BM_SETIMAGE, IMAGE_CURSOR, (LPARAM)hCursor); }
inline HCURSOR CButton::GetCursor()
    { return (HCURSOR)::SendMessage(m_hWnd, BM_GETIMAGE, IMAGE_CURSOR, 0L); }

// CListBox
inline int CListBox::GetCount() const
    { return (int)::SendMessage(m_hWnd, LB_GETCOUNT, 0, 0); }
inline int CListBox::GetCurSel() const
    { return (int)::SendMessage(m_hWnd, LB_GETCURSEL, 0, 0); }
inline int CListBox::SetCurSel(int nSelect)
    { return (int)::SendMessage(m_hWnd, LB_SETCURSEL, nSelect, 0); }
inline int CListBox::GetHorizontalExtent() const
    { return (int)::SendMessage(m_hWnd, LB_GETHORIZONTALEXTENT, 0, 0); }
inline void CListBox::SetHorizontalExtent(int cxExtent)
    { ::SendMessage(m_hWnd, LB_SETHORIZONTALEXTENT, cxExtent, 0); }
inline int CListBox::GetSelCount() const
    { return (int)::SendMessage(m_hWnd, LB_GETSELCOUNT, 0, 0); }
inline int CListBox::GetSelItems(int nMaxItems, LPINT rgIndex) const
    { return (int)::SendMessage(m_hWnd, LB_GETSELITEMS, nMaxItems, (LPARAM)rgIndex); }
inline int CListBox::GetTopIndex() const
    { return (int)::SendMessage(m_hWnd, LB_GETTOPINDEX, 0, 0); }
inline int CListBox::SetTopIndex(int nIndex)
    { return (int)::SendMessage(m_hWnd, LB_SETTOPINDEX, nIndex, 0); }
inline LCID CListBox::GetLocale() const
    { return (LCID)::SendMessage(m_hWnd, LB_GETLOCALE, 0, 0); }
inline LCID CListBox::SetLocale(LCID nNewLocale)
    { return (LCID)::SendMessage(m_hWnd, LB_SETLOCALE, (WPARAM)nNewLocale, 0); }
inline int CListBox::InitStorage(int nItems, UINT nBytes)
    { return (int)::SendMessage(m_hWnd, LB_INITSTORAGE, (WPARAM)nItems, nBytes); }
inline UINT CListBox::ItemFromPoint(CPoint pt, BOOL& bOutside) const
    { DWORD dw = (DWORD)::SendMessage(m_hWnd, LB_ITEMFROMPOINT, 0, MAKELPARAM(pt.x, pt.y));
      bOutside = !!HIWORD(dw); return LOWORD(dw); }
inline DWORD_PTR CListBox::GetItemData(int nIndex) const
    { return (DWORD_PTR)::SendMessage(m_hWnd, LB_GETITEMDATA, nIndex, 0); }
inline int CListBox::SetItemData(int nIndex, DWORD_PTR dwItemData)
    { return (int)::SendMessage(m_hWnd, LB_SETITEMDATA, nIndex, (LPARAM)dwItemData); }
inline void* CListBox::GetItemDataPtr(int nIndex) const
    { return (void*)::SendMessage(m_hWnd, LB_GETITEMDATA, nIndex, 0); }
inline int CListBox::SetItemDataPtr(int nIndex, void* pData)
    { return SetItemData(nIndex, (DWORD_PTR)pData); }
inline int CListBox::GetItemRect(int nIndex, LPRECT lpRect) const
    { return (int)::SendMessage(m_hWnd, LB_GETITEMRECT, nIndex, (LPARAM)lpRect); }
inline int CListBox::GetSel(int nIndex) const
    { return (int)::SendMessage(m_hWnd, LB_GETSEL, nIndex, 0); }
inline int CListBox::SetSel(int nIndex, BOOL bSelect)
    { return (int)::SendMessage(m_hWnd, LB_SETSEL, bSelect, nIndex); }
inline int CListBox::GetText(int nIndex, LPTSTR lpszBuffer) const
    { return (int)::SendMessage(m_hWnd, LB_GETTEXT, nIndex, (LPARAM)lpszBuffer); }
inline int CListBox::GetTextLen(int nIndex) const
    { return (int)::SendMessage(m_hWnd, LB_GETTEXTLEN, nIndex, 0); }
inline void CListBox::SetColumnWidth(int cxWidth)
    { ::SendMessage(m_hWnd, LB_SETCOLUMNWIDTH, cxWidth, 0); }
inline BOOL CListBox::SetTabStops(int nTabStops, LPINT rgTabStops)
    { return (BOOL)::SendMessage(m_hWnd, LB_SETTABSTOPS, nTabStops, (LPARAM)rgTabStops); }
inline void CListBox::SetTabStops()
    { ::SendMessage(m_hWnd, LB_SETTABSTOPS, 0, 0); }
inline BOOL CListBox::SetTabStops(const int& cxEachStop)
    { return (BOOL)::SendMessage(m_hWnd, LB_SETTABSTOPS, 1, (LPARAM)(LPINT)&cxEachStop); }
inline int CListBox::SetItemHeight(int nIndex, UINT cyItemHeight)
    { return (int)::SendMessage(m_hWnd, LB_SETITEMHEIGHT, nIndex, MAKELONG(cyItemHeight, 0)); }
inline int CListBox::GetItemHeight(int nIndex) const
    { return (int)::SendMessage(m_hWnd, LB_GETITEMHEIGHT, nIndex, 0L); }
inline int CListBox::FindStringExact(int nIndexStart, LPCTSTR lpszFind) const
    { return (int)::SendMessage(m_hWnd, LB_FINDSTRINGEXACT, nIndexStart, (LPARAM)lpszFind); }
inline int CListBox::GetCaretIndex() const
    { return (int)::SendMessage(m_hWnd, LB_GETCARETINDEX, 0, 0L); }
inline int CListBox::SetCaretIndex(int nIndex, BOOL bScroll)
    { return (int)::SendMessage(m_hWnd, LB_SETCARETINDEX, nIndex, MAKELONG(bScroll, 0)); }
inline int CListBox::AddString(LPCTSTR lpszItem)
    { return (int)::SendMessage(m_hWnd, LB_ADDSTRING, 0, (LPARAM)lpszItem); }
inline int CListBox::DeleteString(UINT nIndex)
    { return (int)::SendMessage(m_hWnd, LB_DELETESTRING, nIndex, 0); }
inline int CListBox::InsertString(int nIndex, LPCTSTR lpszItem)
    { return (int)::SendMessage(m_hWnd, LB_INSERTSTRING, nIndex, (LPARAM)lpszItem); }
inline void CListBox::ResetContent()
    { ::SendMessage(m_hWnd, LB_RESETCONTENT, 0, 0); }
inline int CListBox::Dir(UINT attr, LPCTSTR lpszWildCard)
    { return (int)::SendMessage(m_hWnd, LB_DIR, attr, (LPARAM)lpszWildCard); }
inline int CListBox::FindString(int nStartAfter, LPCTSTR lpszItem) const
    { return (int)::SendMessage(m_hWnd, LB_FINDSTRING, nStartAfter, (LPARAM)lpszItem); }
inline int CListBox::SelectString(int nStartAfter, LPCTSTR lpszItem)
    { return (int)::SendMessage(m_hWnd, LB_SELECTSTRING, nStartAfter, (LPARAM)lpszItem); }
inline int CListBox::SelItemRange(BOOL bSelect, int nFirstItem, int nLastItem)
    { return bSelect ? (int)::SendMessage(m_hWnd, LB_SELITEMRANGEEX, nFirstItem, nLastItem)
                     : (int)::SendMessage(m_hWnd, LB_SELITEMRANGEEX, nLastItem, nFirstItem); }
inline void CListBox::SetAnchorIndex(int nIndex)
    { ::SendMessage(m_hWnd, LB_SETANCHORINDEX, nIndex, 0); }
inline int CListBox::GetAnchorIndex() const
    { return (int)::SendMessage(m_hWnd, LB_GETANCHORINDEX, 0, 0); }

// CComboBox
inline int CComboBox::GetCount() const
    { return (int)::SendMessage(m_hWnd, CB_GETCOUNT, 0, 0); }
inline int CComboBox::GetCurSel() const
    { return (int)::SendMessage(m_hWnd, CB_GETCURSEL, 0, 0); }
inline int CComboBox::SetCurSel(int nSelect)
    { return (int)::SendMessage(m_hWnd, CB_SETCURSEL, nSelect, 0); }
inline LCID CComboBox::GetLocale() const
    { return (LCID)::SendMessage(m_hWnd, CB_GETLOCALE, 0, 0); }
inline LCID CComboBox::SetLocale(LCID nNewLocale)
    { return (LCID)::SendMessage(m_hWnd, CB_SETLOCALE, (WPARAM)nNewLocale, 0); }
inline int CComboBox::GetTopIndex() const
    { return (int)::SendMessage(m_hWnd, CB_GETTOPINDEX, 0, 0); }
inline int CComboBox::SetTopIndex(int nIndex)
    { return (int)::SendMessage(m_hWnd, CB_SETTOPINDEX, nIndex, 0); }
inline int CComboBox::InitStorage(int nItems, UINT nBytes)
    { return (int)::SendMessage(m_hWnd, CB_INITSTORAGE, (WPARAM)nItems, nBytes); }
inline void CComboBox::SetHorizontalExtent(UINT nExtent)
    { ::SendMessage(m_hWnd, CB_SETHORIZONTALEXTENT, nExtent, 0); }
inline UINT CComboBox::GetHorizontalExtent() const
    { return (UINT)::SendMessage(m_hWnd, CB_GETHORIZONTALEXTENT, 0, 0); }
inline int CComboBox::SetDroppedWidth(UINT nWidth)
    { return (int)::SendMessage(m_hWnd, CB_SETDROPPEDWIDTH, nWidth, 0); }
inline int CComboBox::GetDroppedWidth() const
    { return (int)::SendMessage(m_hWnd, CB_GETDROPPEDWIDTH, 0, 0); }
inline DWORD CComboBox::GetEditSel() const
    { return (DWORD)::SendMessage(m_hWnd, CB_GETEDITSEL, 0, 0); }
inline BOOL CComboBox::LimitText(int nMaxChars)
    { return (BOOL)::SendMessage(m_hWnd, CB_LIMITTEXT, nMaxChars, 0); }
inline BOOL CComboBox::SetEditSel(int nStartChar, int nEndChar)
    { return (BOOL)::SendMessage(m_hWnd, CB_SETEDITSEL, 0, MAKELONG(nStartChar, nEndChar)); }
inline DWORD_PTR CComboBox::GetItemData(int nIndex) const
    { return (DWORD_PTR)::SendMessage(m_hWnd, CB_GETITEMDATA, nIndex, 0); }
inline int CComboBox::SetItemData(int nIndex, DWORD_PTR dwItemData)
    { return (int)::SendMessage(m_hWnd, CB_SETITEMDATA, nIndex, (LPARAM)dwItemData); }
inline void* CComboBox::GetItemDataPtr(int nIndex) const
    { return (void*)GetItemData(nIndex); }
inline int CComboBox::SetItemDataPtr(int nIndex, void* pData)
    { return SetItemData(nIndex, (DWORD_PTR)pData); }
inline int CComboBox::GetLBText(int nIndex, LPTSTR lpszText) const
    { return (int)::SendMessage(m_hWnd, CB_GETLBTEXT, nIndex, (LPARAM)lpszText); }
inline int CComboBox::GetLBTextLen(int nIndex) const
    { return (int)::SendMessage(m_hWnd, CB_GETLBTEXTLEN, nIndex, 0); }
inline void CComboBox::ShowDropDown(BOOL bShowIt)
    { ::SendMessage(m_hWnd, CB_SHOWDROPDOWN, bShowIt, 0); }
inline int CComboBox::AddString(LPCTSTR lpszString)
    { return (int)::SendMessage(m_hWnd, CB_ADDSTRING, 0, (LPARAM)lpszString); }
inline int CComboBox::DeleteString(UINT nIndex)
    { return (int)::SendMessage(m_hWnd, CB_DELETESTRING, nIndex, 0); }
inline int CComboBox::InsertString(int nIndex, LPCTSTR lpszString)
    { return (int)::SendMessage(m_hWnd, CB_INSERTSTRING, nIndex, (LPARAM)lpszString); }
inline void CComboBox::ResetContent()
    { ::SendMessage(m_hWnd, CB_RESETCONTENT, 0, 0); }
inline int CComboBox::Dir(UINT attr, LPCTSTR lpszWildCard)
    { return (int)::SendMessage(m_hWnd, CB_DIR, attr, (LPARAM)lpszWildCard); }
inline int CComboBox::FindString(int nStartAfter, LPCTSTR lpszString) const
    { return (int)::SendMessage(m_hWnd, CB_FINDSTRING, nStartAfter, (LPARAM)lpszString); }
inline int CComboBox::SelectString(int nStartAfter, LPCTSTR lpszString)
    { return (int)::SendMessage(m_hWnd, CB_SELECTSTRING, nStartAfter, (LPARAM)lpszString); }
inline void CComboBox::Clear()
    { ::SendMessage(m_hWnd, WM_CLEAR, 0, 0); }
inline void CComboBox::Copy()
    { ::SendMessage(m_hWnd, WM_COPY, 0, 0); }
inline void CComboBox::Cut()
    { ::SendMessage(m_hWnd, WM_CUT, 0, 0); }
inline void CComboBox::Paste()
    { ::SendMessage(m_hWnd, WM_PASTE, 0, 0); }
inline int CComboBox::SetItemHeight(int nIndex, UINT cyItemHeight)
    { return (int)::SendMessage(m_hWnd, CB_SETITEMHEIGHT, nIndex, MAKELONG(cyItemHeight, 0)); }
inline int CComboBox::GetItemHeight(int nIndex) const
    { return (int)::SendMessage(m_hWnd, CB_GETITEMHEIGHT, nIndex, 0L); }
inline int CComboBox::FindStringExact(int nIndexStart, LPCTSTR lpszFind) const
    { return (int)::SendMessage(m_hWnd, CB_FINDSTRINGEXACT, nIndexStart, (LPARAM)lpszFind); }
inline int CComboBox::SetExtendedUI(BOOL bExtended)
    { return (int)::SendMessage(m_hWnd, CB_SETEXTENDEDUI, bExtended, 0L); }
inline BOOL CComboBox::GetExtendedUI() const
    { return (BOOL)::SendMessage(m_hWnd, CB_GETEXTENDEDUI, 0, 0L); }
inline void CComboBox::GetDroppedControlRect(LPRECT lprect) const
    { ::SendMessage(m_hWnd, CB_GETDROPPEDCONTROLRECT, 0, (LPARAM)lprect); }
inline BOOL CComboBox::GetDroppedState() const
    { return (BOOL)::SendMessage(m_hWnd, CB_GETDROPPEDSTATE, 0, 0L); }

// CEdit
inline BOOL CEdit::CanUndo() const
    { return (BOOL)::SendMessage(m_hWnd, EM_CANUNDO, 0, 0); }
inline int CEdit::GetLineCount() const
    { return (int)::SendMessage(m_hWnd, EM_GETLINECOUNT, 0, 0); }
inline BOOL CEdit::GetModify() const
    { return (BOOL)::SendMessage(m_hWnd, EM_GETMODIFY, 0, 0); }
inline void CEdit::SetModify(BOOL bModified)
    { ::SendMessage(m_hWnd, EM_SETMODIFY, bModified, 0); }
inline void CEdit::GetRect(LPRECT lpRect) const
    { ::SendMessage(m_hWnd, EM_GETRECT, 0, (LPARAM)lpRect); }
inline DWORD CEdit::GetSel() const
    { return (DWORD)::SendMessage(m_hWnd, EM_GETSEL, 0, 0); }
inline void CEdit::GetSel(int& nStartChar, int& nEndChar) const
    { DWORD dwStart = 0, dwEnd = 0;
      ::SendMessage(m_hWnd, EM_GETSEL, (WPARAM)&dwStart, (LPARAM)&dwEnd);
      nStartChar = (int)dwStart; nEndChar = (int)dwEnd; }
inline HLOCAL CEdit::GetHandle() const
    { return (HLOCAL)::SendMessage(m_hWnd, EM_GETHANDLE, 0, 0); }
inline void CEdit::SetHandle(HLOCAL hBuffer)
    { ::SendMessage(m_hWnd, EM_SETHANDLE, (WPARAM)hBuffer, 0); }
inline void CEdit::SetMargins(UINT nLeft, UINT nRight)
    { ::SendMessage(m_hWnd, EM_SETMARGINS, EC_LEFTMARGIN | EC_RIGHTMARGIN, MAKELONG(nLeft, nRight)); }
inline DWORD CEdit::GetMargins() const
    { return (DWORD)::SendMessage(m_hWnd, EM_GETMARGINS, 0, 0); }
inline void CEdit::SetLimitText(UINT nMax)
    { ::SendMessage(m_hWnd, EM_SETLIMITTEXT, nMax, 0); }
inline UINT CEdit::GetLimitText() const
    { return (UINT)::SendMessage(m_hWnd, EM_GETLIMITTEXT, 0, 0); }
inline CPoint CEdit::PosFromChar(UINT nChar) const
    { return CPoint((LPARAM)(DWORD)::SendMessage(m_hWnd, EM_POSFROMCHAR, nChar, 0)); }
inline int CEdit::CharFromPos(CPoint pt) const
    { return (int)::SendMessage(m_hWnd, EM_CHARFROMPOS, 0, MAKELPARAM(pt.x, pt.y)); }
inline int CEdit::GetLine(int nIndex, LPTSTR lpszBuffer) const
    { return (int)::SendMessage(m_hWnd, EM_GETLINE, nIndex, (LPARAM)lpszBuffer); }
inline void CEdit::EmptyUndoBuffer()
    { ::SendMessage(m_hWnd, EM_EMPTYUNDOBUFFER, 0, 0); }
inline BOOL CEdit::FmtLines(BOOL bAddEOL)
    { return (BOOL)::SendMessage(m_hWnd, EM_FMTLINES, bAddEOL, 0); }
inline void CEdit::LimitText(int nChars)
    { ::SendMessage(m_hWnd, EM_LIMITTEXT, nChars, 0); }
inline int CEdit::LineFromChar(int nIndex) const
    { return (int)::SendMessage(m_hWnd, EM_LINEFROMCHAR, nIndex, 0); }
inline int CEdit::LineIndex(int nLine) const
    { return (int)::SendMessage(m_hWnd, EM_LINEINDEX, nLine, 0); }
inline int CEdit::LineLength(int nLine) const
    { return (int)::SendMessage(m_hWnd, EM_LINELENGTH, nLine, 0); }
inline void CEdit::LineScroll(int nLines, int nChars)
    { ::SendMessage(m_hWnd, EM_LINESCROLL, nChars, nLines); }
inline void CEdit::ReplaceSel(LPCTSTR lpszNewText, BOOL bCanUndo)
    { ::SendMessage(m_hWnd, EM_REPLACESEL, (WPARAM)bCanUndo, (LPARAM)lpszNewText); }
inline void CEdit::SetPasswordChar(TCHAR ch)
    { ::SendMessage(m_hWnd, EM_SETPASSWORDCHAR, ch, 0); }
inline void CEdit::SetRect(LPCRECT lpRect)
    { ::SendMessage(m_hWnd, EM_SETRECT, 0, (LPARAM)lpRect); }
inline void CEdit::SetRectNP(LPCRECT lpRect)
    { ::SendMessage(m_hWnd, EM_SETRECTNP, 0, (LPARAM)lpRect); }
inline void CEdit::SetSel(DWORD dwSelection, BOOL bNoScroll)
    { ::SendMessage(m_hWnd, EM_SETSEL, LOWORD(dwSelection), HIWORD(dwSelection));
      if (!bNoScroll) ::SendMessage(m_hWnd, EM_SCROLLCARET, 0, 0); }
inline void CEdit::SetSel(int nStartChar, int nEndChar, BOOL bNoScroll)
    { ::SendMessage(m_hWnd, EM_SETSEL, nStartChar, nEndChar);
      if (!bNoScroll) ::SendMessage(m_hWnd, EM_SCROLLCARET, 0, 0); }
inline BOOL CEdit::SetTabStops(int nTabStops, LPINT rgTabStops)
    { return (BOOL)::SendMessage(m_hWnd, EM_SETTABSTOPS, nTabStops, (LPARAM)rgTabStops); }
inline void CEdit::SetTabStops()
    { ::SendMessage(m_hWnd, EM_SETTABSTOPS, 0, 0); }
inline BOOL CEdit::SetTabStops(const int& cxEachStop)
    { return (BOOL)::SendMessage(m_hWnd, EM_SETTABSTOPS, 1, (LPARAM)(LPINT)&cxEachStop); }
inline BOOL CEdit::Undo()
    { return (BOOL)::SendMessage(m_hWnd, EM_UNDO, 0, 0); }
inline void CEdit::Clear()
    { ::SendMessage(m_hWnd, WM_CLEAR, 0, 0); }
inline void CEdit::Copy()
    { ::SendMessage(m_hWnd, WM_COPY, 0, 0); }
inline void CEdit::Cut()
    { ::SendMessage(m_hWnd, WM_CUT, 0, 0); }
inline void CEdit::Paste()
    { ::SendMessage(m_hWnd, WM_PASTE, 0, 0); }
inline BOOL CEdit::SetReadOnly(BOOL bReadOnly)
    { return (BOOL)::SendMessage(m_hWnd, EM_SETREADONLY, bReadOnly, 0L); }
inline int CEdit::GetFirstVisibleLine() const
    { return (int)::SendMessage(m_hWnd, EM_GETFIRSTVISIBLELINE, 0, 0L); }
inline TCHAR CEdit::GetPasswordChar() const
    { return (TCHAR)::SendMessage(m_hWnd, EM_GETPASSWORDCHAR, 0, 0L); }

// CScrollBar
inline int CScrollBar::GetScrollPos() const
    { return ::GetScrollPos(m_hWnd, SB_CTL); }
inline int CScrollBar::SetScrollPos(int nPos, BOOL bRedraw)
    { return ::SetScrollPos(m_hWnd, SB_CTL, nPos, bRedraw); }
inline void CScrollBar::GetScrollRange(LPINT lpMinPos, LPINT lpMaxPos) const
    { ::GetScrollRange(m_hWnd, SB_CTL, lpMinPos, lpMaxPos); }
inline void CScrollBar::SetScrollRange(int nMinPos, int nMaxPos, BOOL bRedraw)
    { ::SetScrollRange(m_hWnd, SB_CTL, nMinPos, nMaxPos, bRedraw); }
inline void CScrollBar::ShowScrollBar(BOOL bShow)
    { ::ShowScrollBar(m_hWnd, SB_CTL, bShow); }
inline BOOL CScrollBar::EnableScrollBar(UINT nArrowFlags)
    { return ::EnableScrollBar(m_hWnd, SB_CTL, nArrowFlags); }
inline BOOL CScrollBar::SetScrollInfo(LPSCROLLINFO lpScrollInfo, BOOL bRedraw)
    { return CWnd::SetScrollInfo(SB_CTL, lpScrollInfo, bRedraw); }
inline BOOL CScrollBar::GetScrollInfo(LPSCROLLINFO lpScrollInfo, UINT nMask)
    { return CWnd::GetScrollInfo(SB_CTL, lpScrollInfo, nMask); }
inline int CScrollBar::GetScrollLimit()
    { return CWnd::GetScrollLimit(SB_CTL); }

// CWinThread / CWinApp
inline HCURSOR CWinApp::LoadCursor(LPCTSTR lpszResourceName) const
    { return ::LoadCursor(AfxFindResourceHandle(lpszResourceName, RT_GROUP_CURSOR), lpszResourceName); }
inline HCURSOR CWinApp::LoadCursor(UINT nIDResource) const
    { return LoadCursor(MAKEINTRESOURCE(nIDResource)); }
inline HCURSOR CWinApp::LoadStandardCursor(LPCTSTR lpszCursorName) const
    { return ::LoadCursor(NULL, lpszCursorName); }
inline HCURSOR CWinApp::LoadOEMCursor(UINT nIDCursor) const
    { return ::LoadCursor(NULL, MAKEINTRESOURCE(nIDCursor)); }
inline HICON CWinApp::LoadIcon(LPCTSTR lpszResourceName) const
    { return ::LoadIcon(AfxFindResourceHandle(lpszResourceName, RT_GROUP_ICON), lpszResourceName); }
inline HICON CWinApp::LoadIcon(UINT nIDResource) const
    { return LoadIcon(MAKEINTRESOURCE(nIDResource)); }
inline HICON CWinApp::LoadStandardIcon(LPCTSTR lpszIconName) const
    { return ::LoadIcon(NULL, lpszIconName); }
inline HICON CWinApp::LoadOEMIcon(UINT nIDIcon) const
    { return ::LoadIcon(NULL, MAKEINTRESOURCE(nIDIcon)); }

// CFrameWnd / CWaitCursor
inline CString CFrameWnd::GetTitle() const
    { return m_strTitle; }
inline void CFrameWnd::SetTitle(LPCTSTR lpszTitle)
    { m_strTitle = lpszTitle; }
inline CWaitCursor::CWaitCursor()
    { AfxGetApp()->BeginWaitCursor(); }
inline CWaitCursor::~CWaitCursor()
    { AfxGetApp()->EndWaitCursor(); }
inline void CWaitCursor::Restore()
    { AfxGetApp()->RestoreWaitCursor(); }

#endif // __AFXWIN_H__
