// The application object and its message loop.
// Covers:
// - the start-up done by the test main: AfxGetApp, AfxGetThread, the instance and
//   resource handles, the application name
// - PumpMessage: PreTranslateMessage from the message's window up through its
//   parents and a pop-up's owner (child, parent, top); a window that takes the
//   message stops the walk and the dispatch
// - AfxMessageBox: shown with the application name as caption and the exact
//   text, owned by the active top-level window (disabled meanwhile), returning
//   the button that answered it
#include <afxwin.h>

#include <gtest/gtest.h>

#include "AfxTestSupport.h"
#include "Input.h"

#include <string>

namespace {

using afx_test::CWalkWnd;

TEST(AppStartup, FrameworkKnowsTheApplication)
{
    CWinApp* pApp = AfxGetApp();
    ASSERT_NE(nullptr, pApp);
    EXPECT_EQ(pApp, AfxGetThread());
    EXPECT_EQ(::GetModuleHandleW(NULL), AfxGetInstanceHandle());
    EXPECT_EQ(::GetModuleHandleW(NULL), AfxGetResourceHandle());
    EXPECT_EQ(::GetModuleHandleW(NULL), pApp->m_hInstance);
    ASSERT_NE(nullptr, AfxGetAppName());
    EXPECT_STREQ(L"afx_tests", AfxGetAppName());
    EXPECT_EQ(AfxGetAppName(), pApp->m_pszAppName);
    EXPECT_TRUE(pApp->IsKindOf(RUNTIME_CLASS(CWinApp)));
    EXPECT_EQ(::GetCurrentThreadId(), pApp->m_nThreadID);
}

struct AppPumpMessage : testing::Test
{
    std::string trace;
    CWalkWnd top, parent, child;

    void SetUp() override
    {
        top.m_pTrace = parent.m_pTrace = child.m_pTrace = &trace;
        top.m_pszName = "top";
        parent.m_pszName = "parent";
        child.m_pszName = "child";
        ASSERT_TRUE(top.CreateEx(0, NULL, L"top", WS_OVERLAPPEDWINDOW, CRect(0, 0, 300, 200), NULL, 0));
        ASSERT_TRUE(parent.Create(NULL, L"", WS_VISIBLE, CRect(0, 0, 200, 100), &top, 1));
        ASSERT_TRUE(child.Create(NULL, L"", WS_VISIBLE, CRect(0, 0, 50, 50), &parent, 2));
        orvane_test::PumpUntilIdle(50);
    }
    void TearDown() override { top.DestroyWindow(); }

    void PumpOne()
    {
        // only the message posted by the test is in the queue
        MSG msg;
        ASSERT_TRUE(::PeekMessageW(&msg, NULL, 0, 0, PM_NOREMOVE));
        ASSERT_TRUE(AfxGetApp()->PumpMessage());
    }
};

TEST_F(AppPumpMessage, WalksFromTheWindowUpToItsTopLevelWindow)
{
    child.PostMessage(WM_KEYDOWN, 'A', 1);
    PumpOne();
    EXPECT_EQ("child;parent;top;", trace);
    EXPECT_EQ(1, child.m_nKeyDowns);
    EXPECT_EQ(&AfxGetThreadState()->m_msgCur, CWinThread::GetCurrentMessage());
}

TEST_F(AppPumpMessage, AWindowThatTakesTheMessageEndsTheWalkAndTheDispatch)
{
    parent.m_bEat = TRUE;
    child.PostMessage(WM_KEYDOWN, 'A', 1);
    PumpOne();
    EXPECT_EQ("child;parent;", trace);
    EXPECT_EQ(0, child.m_nKeyDowns);
}

TEST_F(AppPumpMessage, WalkGoesOnFromAPopupToItsOwner)
{
    // ::GetParent of a pop-up is its owner: the owner takes part in the walk.
    CWalkWnd popup;
    popup.m_pTrace = &trace;
    popup.m_pszName = "popup";
    ASSERT_TRUE(popup.CreateEx(0, NULL, L"popup", WS_POPUP, CRect(0, 0, 50, 50), &top, 0));
    popup.PostMessage(WM_KEYDOWN, 'A', 1);
    PumpOne();
    EXPECT_EQ("popup;top;", trace);
    EXPECT_EQ(1, popup.m_nKeyDowns);
    popup.DestroyWindow();
}

/////////////////////////////////////////////////////////////////////////////

struct BoxSeen
{
    std::wstring caption;
    std::wstring text;
    HWND hWndOwner = NULL;
    BOOL bOwnerEnabled = TRUE;
};

TEST(AppMessageBox, ShownWithAppCaptionOwnedByActiveWindowAndAnswered)
{
    CWnd frame;
    ASSERT_TRUE(frame.CreateEx(0, NULL, L"frame", WS_OVERLAPPEDWINDOW | WS_VISIBLE, CRect(0, 0, 300, 200), NULL, 0));
    frame.SetActiveWindow();
    frame.SetFocus();
    orvane_test::PumpUntilIdle(50);

    std::vector<BoxSeen> boxes;
    int nAnswer = IDNO;
    orvane_test::DialogAnswerer answerer([&](const orvane_test::DialogAnswerer::Seen& seen) {
        BoxSeen box;
        box.caption = seen.caption;
        box.text = seen.text;
        box.hWndOwner = ::GetWindow(seen.hwnd, GW_OWNER);
        box.bOwnerEnabled = box.hWndOwner != NULL && ::IsWindowEnabled(box.hWndOwner);
        boxes.push_back(box);
        return nAnswer;
    });

    const wchar_t* kText = L"Line one !\nLine two ";
    EXPECT_EQ(IDNO, AfxMessageBox(kText, MB_YESNO));
    ASSERT_EQ(1u, boxes.size());
    EXPECT_EQ(std::wstring(AfxGetAppName()), boxes[0].caption);
    EXPECT_EQ(std::wstring(kText), boxes[0].text);
    EXPECT_EQ(frame.m_hWnd, boxes[0].hWndOwner);
    EXPECT_FALSE(boxes[0].bOwnerEnabled);
    EXPECT_TRUE(frame.IsWindowEnabled());

    nAnswer = IDOK;
    EXPECT_EQ(IDOK, AfxMessageBox(L"second"));
    ASSERT_EQ(2u, boxes.size());
    EXPECT_EQ(L"second", boxes[1].text);
    frame.DestroyWindow();
}

TEST(AppMessageBox, WithoutAnActiveWindowTheBoxHasNoOwner)
{
    ::SetActiveWindow(NULL);
    std::vector<HWND> owners;
    orvane_test::DialogAnswerer answerer([&](const orvane_test::DialogAnswerer::Seen& seen) {
        owners.push_back(::GetWindow(seen.hwnd, GW_OWNER));
        return IDCANCEL;
    });
    if (::GetActiveWindow() != NULL)
        GTEST_SKIP() << "another window of this thread stays active";
    EXPECT_EQ(IDCANCEL, AfxMessageBox(L"alone", MB_OKCANCEL));
    ASSERT_EQ(1u, owners.size());
    EXPECT_EQ(nullptr, owners[0]);
}

} // namespace
