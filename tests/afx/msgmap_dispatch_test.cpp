// Message-map dispatch as MFC does it: every kind of window-message entry (one per
// handler signature, the reflected scroll and control-colour entries among them) is
// sent with known arguments; the table says what the handler receives and what the
// message returns. (The creation hook's order is checked by the numeric edit's test.)
#include <afxwin.h>

#include <gtest/gtest.h>

#include <string>
#include <type_traits>

namespace {

// Handles and pointers are named in the table and replaced when the row is sent.
enum Ref : LPARAM { kSelf = -7001, kParent, kDc, kData, kText };
HWND g_hSelf, g_hParent;
HDC g_hDC;
char g_data[64];            // stands for every structure passed by address
const wchar_t kPolicy[] = L"Policy";

LPARAM Resolve(LPARAM value)
{
    const LPARAM refs[] = { (LPARAM)g_hSelf, (LPARAM)g_hParent, (LPARAM)g_hDC, (LPARAM)g_data, (LPARAM)kPolicy };
    return value >= kSelf && value <= kText ? refs[value - kSelf] : value;
}

std::string Arg(const void* p)
{
    const void* named[] = { g_hSelf, g_hParent, g_hDC, g_data, nullptr };
    const char* names[] = { "self", "parent", "dc", "data", "null" };
    for (int i = 0; i < 5; ++i)
        if (p == named[i])
            return names[i];
    return "unknown";
}
std::string Arg(const CWnd* p) { return Arg(p != nullptr ? (const void*)p->m_hWnd : nullptr); }
std::string Arg(const CDC* p) { return Arg(p != nullptr ? (const void*)p->m_hDC : nullptr); }
std::string Arg(const wchar_t* p) { return std::string(p, p + wcslen(p)); }
std::string Arg(CPoint pt) { return "(" + std::to_string(pt.x) + "," + std::to_string(pt.y) + ")"; }
template<class T, class = std::enable_if_t<std::is_arithmetic_v<T>>>
std::string Arg(T value) { return std::to_string(value); }

struct CDispatchWnd : CWnd
{
    std::string m_log;
    template<class... A> void Log(const char* name, A... args)
    {
        std::string text;
        ((text += (text.empty() ? "" : ",") + Arg(args)), ...);
        m_log += std::string(name) + "(" + text + ")";
    }

    afx_msg int OnCreate(LPCREATESTRUCT p) { Log("Create", p); return 7; }
    afx_msg BOOL OnEraseBkgnd(CDC* pDC) { Log("EraseBkgnd", pDC); return 3; }
    afx_msg BOOL OnNcActivate(BOOL b) { Log("NcActivate", b); return 4; }
    afx_msg BOOL OnSetCursor(CWnd* p, UINT nHit, UINT nMsg) { Log("SetCursor", p, nHit, nMsg); return 5; }
    afx_msg HBRUSH OnCtlColor(CDC* pDC, CWnd* p, UINT n) { Log("CtlColor", pDC, p, n); return (HBRUSH)(UINT_PTR)0x55; }
    afx_msg HBRUSH CtlColor(CDC* pDC, UINT n) { Log("CtlColorReflect", pDC, n); return (HBRUSH)(UINT_PTR)0x66; }
    afx_msg int OnVKeyToItem(UINT k, CListBox* p, UINT i) { Log("VKeyToItem", k, (CWnd*)p, i); return -2; }
    afx_msg int OnCompareItem(int id, LPCOMPAREITEMSTRUCT p) { Log("CompareItem", id, p); return -1; }
    afx_msg LRESULT OnUser(WPARAM w, LPARAM l) { Log("User", w, l); return 8; }
    afx_msg LRESULT OnNcHitTest(CPoint pt) { Log("NcHitTest", pt); return HTCAPTION; }
    afx_msg void OnCancelMode() { Log("CancelMode"); }
    afx_msg void OnEnable(BOOL b) { Log("Enable", b); }
    afx_msg void OnTimer(UINT_PTR n) { Log("Timer", n); }
    afx_msg void HScroll(UINT nCode, UINT nPos) { Log("HScrollReflect", nCode, nPos); }
    afx_msg void VScroll(UINT nCode, UINT nPos) { Log("VScrollReflect", nCode, nPos); }
    afx_msg void OnShowWindow(BOOL b, UINT n) { Log("ShowWindow", b, n); }
    afx_msg void OnMove(int x, int y) { Log("Move", x, y); }
    afx_msg void OnKeyDown(UINT c, UINT r, UINT f) { Log("KeyDown", c, r, f); }
    afx_msg void OnSize(UINT t, int cx, int cy) { Log("Size", t, cx, cy); }
    afx_msg void OnParentNotify(UINT m, LPARAM l) { Log("ParentNotify", m, l); }
    afx_msg void OnSetFocus(CWnd* p) { Log("SetFocus", p); }
    afx_msg void OnCaptureChanged(CWnd* p) { Log("CaptureChanged", p); }
    afx_msg void OnContextMenu(CWnd* p, CPoint pt) { Log("ContextMenu", p, pt); }
    afx_msg void OnActivate(UINT s, CWnd* p, BOOL b) { Log("Activate", s, p, b); }
    afx_msg void OnVScroll(UINT c, UINT n, CScrollBar* p) { Log("VScroll", c, n, (CWnd*)p); }
    afx_msg void OnLButtonDown(UINT f, CPoint pt) { Log("LButtonDown", f, pt); }
    afx_msg BOOL OnMouseWheel(UINT f, short d, CPoint pt) { Log("MouseWheel", f, d, pt); return 9; }
    afx_msg void OnSettingChange(UINT f, LPCTSTR s) { Log("SettingChange", f, s); }
    afx_msg void OnGetMinMaxInfo(MINMAXINFO* p) { Log("GetMinMaxInfo", p); }
    afx_msg void OnDrawItem(int id, LPDRAWITEMSTRUCT p) { Log("DrawItem", id, p); }
    afx_msg UINT OnGetDlgCode() { Log("GetDlgCode"); return DLGC_WANTALLKEYS; }
    afx_msg void OnNcCalcSize(BOOL b, NCCALCSIZE_PARAMS* p) { Log("NcCalcSize", b, p); }
    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CDispatchWnd, CWnd)
    ON_WM_CREATE()
    ON_WM_ERASEBKGND()
    ON_WM_NCACTIVATE()
    ON_WM_SETCURSOR()
    ON_WM_CTLCOLOR()
    ON_WM_CTLCOLOR_REFLECT()
    ON_WM_VKEYTOITEM()
    ON_WM_COMPAREITEM()
    ON_MESSAGE(WM_USER + 7, &CDispatchWnd::OnUser)
    ON_WM_NCHITTEST()
    ON_WM_CANCELMODE()
    ON_WM_ENABLE()
    ON_WM_TIMER()
    ON_WM_HSCROLL_REFLECT()
    ON_WM_VSCROLL_REFLECT()
    ON_WM_SHOWWINDOW()
    ON_WM_MOVE()
    ON_WM_KEYDOWN()
    ON_WM_SIZE()
    ON_WM_PARENTNOTIFY()
    ON_WM_SETFOCUS()
    ON_WM_CAPTURECHANGED()
    ON_WM_CONTEXTMENU()
    ON_WM_ACTIVATE()
    ON_WM_VSCROLL()
    ON_WM_LBUTTONDOWN()
    ON_WM_MOUSEWHEEL()
    ON_WM_SETTINGCHANGE()
    ON_WM_GETMINMAXINFO()
    ON_WM_DRAWITEM()
    ON_WM_GETDLGCODE()
    ON_WM_NCCALCSIZE()
END_MESSAGE_MAP()

// toParent: a reflected entry, whose message the parent receives. wParam, lParam: a Ref or a value.
struct EntryCase { bool toParent; UINT message; LPARAM wParam, lParam; const char* received; LRESULT result; };

const EntryCase kEntries[] = {
    { false, WM_CREATE, 0, kData, "Create(data)", 7 },
    { false, WM_ERASEBKGND, kDc, 0, "EraseBkgnd(dc)", 3 },
    { false, WM_NCACTIVATE, TRUE, 0, "NcActivate(1)", 4 },
    { false, WM_SETCURSOR, kParent, MAKELPARAM(HTCLIENT, WM_MOUSEMOVE), "SetCursor(parent,1,512)", 5 },
    { false, WM_CTLCOLOREDIT, kDc, kParent, "CtlColor(dc,parent,1)", 0x55 },
    { true, WM_CTLCOLORSTATIC, kDc, kSelf, "CtlColorReflect(dc,6)", 0x66 },
    { false, WM_VKEYTOITEM, MAKEWPARAM(VK_DOWN, 3), kParent, "VKeyToItem(40,parent,3)", -2 },
    { false, WM_COMPAREITEM, 12, kData, "CompareItem(12,data)", -1 },
    { false, WM_USER + 7, 11, -12, "User(11,-12)", 8 },
    { false, WM_NCHITTEST, 0, MAKELPARAM(-5, 7), "NcHitTest((-5,7))", HTCAPTION },
    { false, WM_CANCELMODE, 0, 0, "CancelMode()", 0 },
    { false, WM_ENABLE, FALSE, 0, "Enable(0)", 0 },
    { false, WM_TIMER, 0x123456789, 0, "Timer(4886718345)", 0 },
    { true, WM_HSCROLL, MAKEWPARAM(SB_THUMBTRACK, 300), kSelf, "HScrollReflect(5,300)", 0 },
    { true, WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, 65535), kSelf, "VScrollReflect(4,65535)", 0 },
    { false, WM_SHOWWINDOW, TRUE, SW_PARENTOPENING, "ShowWindow(1,3)", 0 },
    { false, WM_MOVE, 0, MAKELPARAM(-3, 40), "Move(-3,40)", 0 },
    { false, WM_KEYDOWN, VK_F5, MAKELPARAM(2, 0x4041), "KeyDown(116,2,16449)", 0 },
    { false, WM_SIZE, SIZE_MAXIMIZED, MAKELPARAM(640, 480), "Size(2,640,480)", 0 },
    { false, WM_PARENTNOTIFY, WM_LBUTTONDOWN, MAKELPARAM(3, 4), "ParentNotify(513,262147)", 0 },
    { false, WM_SETFOCUS, kParent, 0, "SetFocus(parent)", 0 },
    { false, WM_CAPTURECHANGED, 0, kParent, "CaptureChanged(parent)", 0 },
    { false, WM_CONTEXTMENU, kSelf, MAKELPARAM(100, -2), "ContextMenu(self,(100,-2))", 0 },
    { false, WM_ACTIVATE, MAKEWPARAM(WA_CLICKACTIVE, 1), kParent, "Activate(2,parent,1)", 0 },
    { false, WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, 77), 0, "VScroll(4,77,null)", 0 },
    { false, WM_LBUTTONDOWN, MK_LBUTTON | MK_SHIFT, MAKELPARAM(-1, 2), "LButtonDown(5,(-1,2))", 0 },
    { false, WM_MOUSEWHEEL, MAKEWPARAM(MK_CONTROL, -120), MAKELPARAM(300, 200), "MouseWheel(8,-120,(300,200))", 9 },
    { false, WM_SETTINGCHANGE, SPI_SETWORKAREA, kText, "SettingChange(47,Policy)", 0 },
    { false, WM_GETMINMAXINFO, 0, kData, "GetMinMaxInfo(data)", 0 },
    { false, WM_DRAWITEM, 12, kData, "DrawItem(12,data)", TRUE },
    { false, WM_GETDLGCODE, 0, 0, "GetDlgCode()", DLGC_WANTALLKEYS },
    { false, WM_NCCALCSIZE, TRUE, kData, "NcCalcSize(1,data)", 0 },
};

TEST(MsgMapDispatch, EveryEntryKindGetsItsArgumentsCrackedAsInMfc)
{
    CWnd parent;
    ASSERT_TRUE(parent.CreateEx(0, NULL, L"parent", WS_POPUP, CRect(0, 0, 200, 100), NULL, 0));
    CDispatchWnd wnd;
    ASSERT_TRUE(wnd.Create(NULL, L"", WS_CHILD, CRect(0, 0, 50, 20), &parent, 3));
    g_hSelf = wnd.m_hWnd;
    g_hParent = parent.m_hWnd;
    g_hDC = ::CreateCompatibleDC(NULL);

    for (const EntryCase& row : kEntries)
    {
        SCOPED_TRACE(row.received);
        wnd.m_log.clear();
        const LRESULT lResult = ::SendMessageW(row.toParent ? parent.m_hWnd : wnd.m_hWnd, row.message,
            (WPARAM)Resolve(row.wParam), Resolve(row.lParam));
        EXPECT_EQ(row.received, wnd.m_log);
        EXPECT_EQ(row.result, lResult);
    }
    parent.DestroyWindow();
    ::DeleteDC(g_hDC);
    CDC::DeleteTempMap();
    CWnd::DeleteTempMap();
}

} // namespace
