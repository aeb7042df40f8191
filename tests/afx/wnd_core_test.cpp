// CWnd core.
// Covers:
// - message maps: a derived map is searched first, then its base's; ON_MESSAGE,
//   ON_REGISTERED_MESSAGE, ON_COMMAND_RANGE; unmapped messages reach the procedure
// - creation through the hook: the object sees WM_NCCREATE and WM_CREATE, its
//   PreCreateWindow can change the style, a failing OnCreate fails Create and
//   runs PostNcDestroy once
// - Default() reaches the original procedure of a subclassed control;
//   UnsubclassWindow restores it
// - Attach/Detach and the permanent map; temporary objects freed at idle
// - a window outliving its object (PostNcDestroy deleting the object: the mini
//   frame's test)
#include <afxwin.h>
#include <afxpriv.h>

#include <gtest/gtest.h>

#include "Input.h"

#include <string>
#include <vector>

using orvane_test::PumpUntilIdle;

namespace {

const UINT kRegisteredMsg = ::RegisterWindowMessageW(L"OrvaneAfxTestRegistered");

class CBaseWnd : public CWnd
{
public:
    std::string m_trace;

    afx_msg void OnTimer(UINT_PTR nIDEvent) { m_trace += "B:timer" + std::to_string(nIDEvent) + ";"; }
    afx_msg LRESULT OnUser1(WPARAM, LPARAM) { m_trace += "B:user1;"; return 11; }
    afx_msg LRESULT OnUser2(WPARAM wParam, LPARAM lParam) { m_trace += "B:user2;"; return (LRESULT)(wParam + lParam); }
    afx_msg void OnCommandRange(UINT nID) { m_trace += "B:cmd" + std::to_string(nID) + ";"; }

    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CBaseWnd, CWnd)
    ON_WM_TIMER()
    ON_MESSAGE(WM_USER + 1, &CBaseWnd::OnUser1)
    ON_MESSAGE(WM_USER + 2, &CBaseWnd::OnUser2)
    ON_COMMAND_RANGE(1000, 1009, &CBaseWnd::OnCommandRange)
END_MESSAGE_MAP()

class CDerivedWnd : public CBaseWnd
{
public:
    afx_msg LRESULT OnUser1(WPARAM, LPARAM) { m_trace += "D:user1;"; return 21; }
    afx_msg LRESULT OnRegistered(WPARAM wParam, LPARAM) { m_trace += "D:reg;"; return (LRESULT)wParam * 2; }
    afx_msg void OnCommand1005() { m_trace += "D:cmd1005;"; }

    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CDerivedWnd, CBaseWnd)
    ON_MESSAGE(WM_USER + 1, &CDerivedWnd::OnUser1)
    ON_REGISTERED_MESSAGE(kRegisteredMsg, &CDerivedWnd::OnRegistered)
    ON_COMMAND(1005, &CDerivedWnd::OnCommand1005)
END_MESSAGE_MAP()

CRect PopupRect()
{
    return CRect(10, 10, 210, 160);
}

// Sent in this order to one CDerivedWnd: what each returns (a handled command: 1) and
// adds to the trace.
const struct { const char* name; UINT message; WPARAM wParam; LPARAM lParam; LRESULT result; const char* trace; }
kMapRows[] = {
    { "derived entry first", WM_USER + 1, 0, 0, 21, "D:user1;" },
    { "base entry", WM_USER + 2, 3, 4, 7, "B:user2;" },
    { "unmapped: DefWindowProc", WM_USER + 3, 0, 0, 0, "" },
    { "base timer", WM_TIMER, 42, 0, 0, "B:timer42;" },
    { "registered", kRegisteredMsg, 5, 0, 10, "D:reg;" },
    { "range start", WM_COMMAND, MAKEWPARAM(1000, 0), 0, 1, "B:cmd1000;" },
    { "derived single id wins", WM_COMMAND, MAKEWPARAM(1005, 0), 0, 1, "D:cmd1005;" },
    { "range end", WM_COMMAND, MAKEWPARAM(1009, 0), 0, 1, "B:cmd1009;" },
    { "outside the range", WM_COMMAND, MAKEWPARAM(1010, 0), 0, 0, "" },
};

TEST(WndMessageMap, DerivedEntriesComeFirstBaseEntriesAndRangesStillApply)
{
    CDerivedWnd wnd;
    ASSERT_TRUE(wnd.CreateEx(0, NULL, L"map", WS_POPUP, PopupRect(), NULL, 0));
    for (const auto& row : kMapRows)
    {
        SCOPED_TRACE(row.name);
        wnd.m_trace.clear();
        EXPECT_EQ(row.result, wnd.SendMessage(row.message, row.wParam, row.lParam));
        EXPECT_EQ(row.trace, wnd.m_trace);
    }
    wnd.DestroyWindow();
}

/////////////////////////////////////////////////////////////////////////////
// Creation

class CCreateWnd : public CWnd
{
public:
    std::vector<UINT> m_seen;
    DWORD m_dwAddStyle = 0;
    DWORD m_dwStyleAtNcCreate = 0;
    int m_nCreateResult = 0;
    int m_nPostNcDestroy = 0;
    HWND m_hWndAtNcCreate = NULL;

    BOOL PreCreateWindow(CREATESTRUCT& cs) override
    {
        cs.style |= (LONG)m_dwAddStyle;
        return CWnd::PreCreateWindow(cs);
    }
    void PostNcDestroy() override { ++m_nPostNcDestroy; }

    afx_msg BOOL OnNcCreate(LPCREATESTRUCT lpcs)
    {
        m_seen.push_back(WM_NCCREATE);
        m_dwStyleAtNcCreate = (DWORD)lpcs->style;
        m_hWndAtNcCreate = m_hWnd;
        return CWnd::OnNcCreate(lpcs);
    }
    afx_msg int OnCreate(LPCREATESTRUCT lpcs)
    {
        m_seen.push_back(WM_CREATE);
        if (m_nCreateResult != 0)
            return m_nCreateResult;
        return CWnd::OnCreate(lpcs);
    }
    afx_msg void OnDestroy() { m_seen.push_back(WM_DESTROY); CWnd::OnDestroy(); }

    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CCreateWnd, CWnd)
    ON_WM_NCCREATE()
    ON_WM_CREATE()
    ON_WM_DESTROY()
END_MESSAGE_MAP()

TEST(WndCreate, ObjectSeesNcCreateAndCreateThroughItsMap)
{
    orvane_test::HostWindow host;
    CCreateWnd wnd;
    ASSERT_TRUE(wnd.Create(NULL, L"child", WS_VISIBLE, CRect(0, 0, 50, 20), CWnd::FromHandle(host), 7));
    ASSERT_EQ(2u, wnd.m_seen.size());
    EXPECT_EQ((UINT)WM_NCCREATE, wnd.m_seen[0]);
    EXPECT_EQ((UINT)WM_CREATE, wnd.m_seen[1]);
    EXPECT_EQ(wnd.m_hWnd, wnd.m_hWndAtNcCreate);
    EXPECT_EQ(&wnd, CWnd::FromHandlePermanent(wnd.m_hWnd));
    EXPECT_EQ(7, wnd.GetDlgCtrlID());
    EXPECT_TRUE(wnd.GetStyle() & WS_CHILD);

    // The framework's default class delivers double clicks.
    EXPECT_TRUE(::GetClassLongPtrW(wnd.m_hWnd, GCL_STYLE) & CS_DBLCLKS);

    HWND hWnd = wnd.m_hWnd;
    EXPECT_TRUE(wnd.DestroyWindow());
    EXPECT_EQ(NULL, wnd.m_hWnd);
    EXPECT_FALSE(::IsWindow(hWnd));
    EXPECT_EQ(1, wnd.m_nPostNcDestroy);
    EXPECT_EQ(nullptr, CWnd::FromHandlePermanent(hWnd));
    EXPECT_EQ((UINT)WM_DESTROY, wnd.m_seen.back());
}

TEST(WndCreate, PreCreateWindowChangesTheStyle)
{
    CCreateWnd wnd;
    wnd.m_dwAddStyle = WS_VSCROLL | WS_BORDER;
    ASSERT_TRUE(wnd.CreateEx(0, NULL, L"styled", WS_POPUP, PopupRect(), NULL, 0));
    EXPECT_EQ((DWORD)(WS_VSCROLL | WS_BORDER), wnd.m_dwStyleAtNcCreate & (WS_VSCROLL | WS_BORDER));
    EXPECT_EQ((DWORD)(WS_VSCROLL | WS_BORDER), wnd.GetStyle() & (WS_VSCROLL | WS_BORDER));
    wnd.DestroyWindow();
}

// A creation that fails in OnCreate or for want of a class: no window, PostNcDestroy
// once, and the hook not left armed (the next plain window is not captured).
const struct { const char* name; LPCTSTR pszClass; int nCreateResult; std::vector<UINT> seen; } kFailedCreations[] = {
    { "OnCreate fails", NULL, -1, { WM_NCCREATE, WM_CREATE } },
    { "unknown class", L"NoSuchClass_Orvane", 0, {} },
};

TEST(WndCreate, FailedCreationCleansUpOnceAndDisarmsTheHook)
{
    for (const auto& c : kFailedCreations)
    {
        SCOPED_TRACE(c.name);
        CCreateWnd wnd;
        wnd.m_nCreateResult = c.nCreateResult;
        EXPECT_FALSE(wnd.CreateEx(0, c.pszClass, L"fails", WS_POPUP, PopupRect(), NULL, 0));
        EXPECT_EQ(NULL, wnd.m_hWnd);
        EXPECT_EQ(1, wnd.m_nPostNcDestroy);
        EXPECT_EQ(c.seen, wnd.m_seen);
        HWND hPlain = ::CreateWindowExW(0, L"STATIC", L"plain", WS_POPUP, 0, 0, 10, 10, NULL, NULL, NULL, NULL);
        ASSERT_NE(nullptr, hPlain);
        EXPECT_EQ(nullptr, CWnd::FromHandlePermanent(hPlain));
        EXPECT_EQ(NULL, wnd.m_hWnd);
        ::DestroyWindow(hPlain);
    }
}

TEST(WndCreate, SecondCreateOnTheSameObjectFails)
{
    CCreateWnd wnd;
    ASSERT_TRUE(wnd.CreateEx(0, NULL, L"once", WS_POPUP, PopupRect(), NULL, 0));
    HWND hWnd = wnd.m_hWnd;
    EXPECT_FALSE(wnd.CreateEx(0, NULL, L"twice", WS_POPUP, PopupRect(), NULL, 0));
    EXPECT_EQ(hWnd, wnd.m_hWnd);
    wnd.DestroyWindow();
}

/////////////////////////////////////////////////////////////////////////////
// Subclassing and Default

class CFilterEdit : public CWnd
{
public:
    std::wstring m_rejected;
    afx_msg void OnChar(UINT nChar, UINT, UINT)
    {
        if (nChar == 'b')
            m_rejected += (wchar_t)nChar;
        else
            Default();  // the edit control inserts the character
    }
    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CFilterEdit, CWnd)
    ON_WM_CHAR()
END_MESSAGE_MAP()

TEST(WndSubclass, DefaultReachesTheOriginalProcedure)
{
    orvane_test::HostWindow host;
    HWND hEdit = ::CreateWindowExW(0, L"EDIT", L"", WS_CHILD | WS_VISIBLE, 0, 0, 100, 20, host, (HMENU)5, NULL, NULL);
    ASSERT_NE(nullptr, hEdit);
    WNDPROC pfnOriginal = (WNDPROC)::GetWindowLongPtrW(hEdit, GWLP_WNDPROC);

    CFilterEdit edit;
    ASSERT_TRUE(edit.SubclassWindow(hEdit));
    EXPECT_EQ((LONG_PTR)AfxGetAfxWndProc(), ::GetWindowLongPtrW(hEdit, GWLP_WNDPROC));
    EXPECT_EQ(1, ::SendMessageW(hEdit, WM_QUERYAFXWNDPROC, 0, 0));

    orvane_test::SendChars(hEdit, L"abcb");
    CString text;
    edit.GetWindowText(text);
    EXPECT_STREQ(L"ac", (LPCTSTR)text);
    EXPECT_EQ(L"bb", edit.m_rejected);

    EXPECT_EQ(hEdit, edit.UnsubclassWindow());
    EXPECT_EQ((LONG_PTR)pfnOriginal, ::GetWindowLongPtrW(hEdit, GWLP_WNDPROC));
    EXPECT_EQ(nullptr, CWnd::FromHandlePermanent(hEdit));
    orvane_test::SendChars(hEdit, L"b");
    edit.Attach(hEdit);
    edit.GetWindowText(text);
    edit.Detach();
    EXPECT_STREQ(L"acb", (LPCTSTR)text);
    ::DestroyWindow(hEdit);
}

TEST(WndSubclass, SubclassingTwiceOrANonWindowFails)
{
    orvane_test::HostWindow host;
    HWND hEdit = ::CreateWindowExW(0, L"EDIT", L"", WS_CHILD, 0, 0, 100, 20, host, (HMENU)5, NULL, NULL);
    CFilterEdit first, second;
    ASSERT_TRUE(first.SubclassWindow(hEdit));
    EXPECT_FALSE(second.SubclassWindow(hEdit));
    EXPECT_EQ(NULL, second.m_hWnd);
    EXPECT_FALSE(second.SubclassWindow(NULL));
    EXPECT_FALSE(second.SubclassWindow((HWND)(ULONG_PTR)0x12345678));
    EXPECT_FALSE(second.SubclassDlgItem(999, CWnd::FromHandle(host)));
    ::DestroyWindow(hEdit);
    // WM_NCDESTROY detached the object.
    EXPECT_EQ(NULL, first.m_hWnd);
}

/////////////////////////////////////////////////////////////////////////////
// Handle maps

TEST(WndHandleMap, AttachDetach)
{
    HWND hWnd = ::CreateWindowExW(0, L"STATIC", L"s", WS_POPUP, 0, 0, 10, 10, NULL, NULL, NULL, NULL);
    ASSERT_NE(nullptr, hWnd);
    CWnd wnd;
    ASSERT_TRUE(wnd.Attach(hWnd));
    EXPECT_EQ(&wnd, CWnd::FromHandlePermanent(hWnd));
    EXPECT_EQ(&wnd, CWnd::FromHandle(hWnd));

    CWnd other;
    EXPECT_FALSE(other.Attach(hWnd));       // one object per handle
    EXPECT_FALSE(wnd.Attach(hWnd));         // one handle per object

    EXPECT_EQ(hWnd, wnd.Detach());
    EXPECT_EQ(NULL, wnd.m_hWnd);
    EXPECT_EQ(nullptr, CWnd::FromHandlePermanent(hWnd));
    EXPECT_TRUE(::IsWindow(hWnd));          // Detach leaves the window alone
    EXPECT_EQ(NULL, wnd.Detach());
    ::DestroyWindow(hWnd);
}

TEST(WndHandleMap, TemporaryObjectsAreFreedAtIdle)
{
    HWND hWnd = ::CreateWindowExW(0, L"STATIC", L"s", WS_POPUP, 0, 0, 10, 10, NULL, NULL, NULL, NULL);
    ASSERT_NE(nullptr, hWnd);
    CWnd* pTemp = CWnd::FromHandle(hWnd);
    ASSERT_NE(nullptr, pTemp);
    EXPECT_EQ(hWnd, pTemp->m_hWnd);
    EXPECT_EQ(nullptr, CWnd::FromHandlePermanent(hWnd));
    EXPECT_EQ(pTemp, CWnd::FromHandle(hWnd));   // one temporary per handle
    pTemp->m_nFlags = 0x4000;                   // mark this object
    EXPECT_EQ(nullptr, CWnd::FromHandle(NULL));

    CWinApp* pApp = AfxGetApp();
    ASSERT_NE(nullptr, pApp);
    EXPECT_TRUE(pApp->OnIdle(0));               // more idle work to do
    EXPECT_EQ(0x4000u, CWnd::FromHandle(hWnd)->m_nFlags);
    EXPECT_FALSE(pApp->OnIdle(1));

    // A new object now stands for the handle; the window itself is untouched.
    CWnd* pFresh = CWnd::FromHandle(hWnd);
    EXPECT_EQ(0u, pFresh->m_nFlags);
    EXPECT_TRUE(::IsWindow(hWnd));

    // A lock keeps temporaries alive through idle time.
    pFresh->m_nFlags = 0x4000;
    AfxLockTempMaps();
    pApp->OnIdle(1);
    EXPECT_EQ(0x4000u, CWnd::FromHandle(hWnd)->m_nFlags);
    EXPECT_TRUE(AfxUnlockTempMaps());
    EXPECT_EQ(0u, CWnd::FromHandle(hWnd)->m_nFlags);
    EXPECT_FALSE(AfxUnlockTempMaps());          // unbalanced unlock is refused
    ::DestroyWindow(hWnd);
    CWnd::DeleteTempMap();
}

/////////////////////////////////////////////////////////////////////////////
// Object lifetime

TEST(WndLifetime, DestroyingTheObjectDestroysItsWindow)
{
    HWND hWnd = NULL;
    {
        CCreateWnd wnd;
        ASSERT_TRUE(wnd.CreateEx(0, NULL, L"scoped", WS_POPUP, PopupRect(), NULL, 0));
        hWnd = wnd.m_hWnd;
    }
    EXPECT_FALSE(::IsWindow(hWnd));
    EXPECT_EQ(nullptr, CWnd::FromHandlePermanent(hWnd));
}

/////////////////////////////////////////////////////////////////////////////
// Ownership: the layer keeps the owner of a child itself

TEST(WndWrappers, OwnerDefaultsToTheParentAndSetOwnerKeepsTheParent)
{
    CCreateWnd parent;
    ASSERT_TRUE(parent.CreateEx(0, NULL, L"parent", WS_POPUP, PopupRect(), NULL, 0));
    CCreateWnd other;
    ASSERT_TRUE(other.CreateEx(0, NULL, L"other", WS_POPUP, PopupRect(), NULL, 0));
    CEdit edit;
    ASSERT_TRUE(edit.Create(WS_CHILD, CRect(0, 0, 100, 20), &parent, 13));

    EXPECT_EQ(&parent, edit.GetOwner());
    edit.SetOwner(&other);
    EXPECT_EQ(&other, edit.GetOwner());
    EXPECT_EQ(&parent, edit.GetParent()) << "a child's owner is not its Win32 parent slot";
    EXPECT_EQ(parent.m_hWnd, ::GetParent(edit.m_hWnd));
    edit.SetOwner(NULL);
    EXPECT_EQ(&parent, edit.GetOwner());
}

TEST(WndWrappers, TreeWalksStyleChangesAndLinesAreTheLayersOwn)
{
    CCreateWnd parent;
    ASSERT_TRUE(parent.CreateEx(0, NULL, L"parent", WS_POPUP, PopupRect(), NULL, 0));
    CEdit edit;
    ASSERT_TRUE(edit.Create(WS_CHILD | WS_VISIBLE, CRect(0, 0, 100, 20), &parent, 12));
    EXPECT_EQ(&parent, edit.GetTopLevelParent());
    EXPECT_EQ(&edit, parent.GetDescendantWindow(12, TRUE));
    EXPECT_TRUE(edit.ModifyStyle(0, ES_UPPERCASE));
    EXPECT_FALSE(edit.ModifyStyle(0, ES_UPPERCASE)) << "no change";
    TCHAR szLine[2] = { 'x', 'x' };
    EXPECT_EQ(0, edit.GetLine(0, szLine, 0));   // no room: nothing written
    EXPECT_EQ('x', szLine[0]);
}

/////////////////////////////////////////////////////////////////////////////
// Exceptions thrown by handlers stop at the window procedure

class CThrowingWnd : public CWnd
{
public:
    BOOL m_bThrowOnCreate = FALSE;
    afx_msg int OnCreate(LPCREATESTRUCT lpcs)
    {
        if (m_bThrowOnCreate)
            AfxThrowResourceException();
        return CWnd::OnCreate(lpcs);
    }
    afx_msg LRESULT OnUserException(WPARAM, LPARAM) { AfxThrowUserException(); return 1; }
    afx_msg LRESULT OnResourceException(WPARAM, LPARAM) { AfxThrowResourceException(); return 1; }
    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CThrowingWnd, CWnd)
    ON_WM_CREATE()
    ON_MESSAGE(WM_USER + 10, &CThrowingWnd::OnUserException)
    ON_MESSAGE(WM_USER + 11, &CThrowingWnd::OnResourceException)
END_MESSAGE_MAP()

TEST(WndExceptions, HandlerExceptionsAreCaughtAndReported)
{
    // The report box is system-modal: it activates before its text is set, so the
    // text is read (and the box answered) from the script's timer inside its loop.
    std::wstring caption, text;
    orvane_test::ModalScript script({ [&](HWND box) {
        caption = orvane_test::WindowText(box);
        text = orvane_test::WindowText(::GetDlgItem(box, 0xFFFF));
        ::PostMessageW(box, WM_COMMAND, IDOK, 0);
        return true;
    } });

    CThrowingWnd wnd;
    ASSERT_TRUE(wnd.CreateEx(0, NULL, L"throws", WS_POPUP, PopupRect(), NULL, 0));
    EXPECT_EQ(0, wnd.SendMessage(WM_USER + 10));    // user exceptions are silent
    EXPECT_EQ(0u, script.stepsDone());
    EXPECT_EQ(0, wnd.SendMessage(WM_USER + 11));    // others are reported
    EXPECT_EQ(1u, script.stepsDone());
    EXPECT_EQ(std::wstring(AfxGetAppName()), caption);
    EXPECT_EQ(L"A required resource was unavailable.", text);
    wnd.DestroyWindow();

    // An exception in WM_CREATE fails the creation.
    CThrowingWnd failing;
    failing.m_bThrowOnCreate = TRUE;
    EXPECT_FALSE(failing.CreateEx(0, NULL, L"fails", WS_POPUP, PopupRect(), NULL, 0));
    EXPECT_EQ(NULL, failing.m_hWnd);
}

} // namespace
