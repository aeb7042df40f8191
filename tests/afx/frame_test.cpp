// Frame windows and the wait cursor.
// Covers:
// - CMiniFrameWnd::Create as a column chooser makes it: a tool window without a
//   client edge, its children made in OnCreate, owned by the top-level window of
//   the child given as parent
// - CalcWindowRect(adjustBorder) gives the window rect of a wanted client area
// - a frame deletes itself when its window goes with its owner, and when its
//   creation fails
// - CWaitCursor: nested waits, Restore after the cursor was changed, the
//   cursor from before the first wait comes back after the last; an unbalanced
//   end leaves the count at zero
#include <afxwin.h>

#include <gtest/gtest.h>

#include "Input.h"

namespace {

// Notes its destruction; OnCreate makes a child as a frame's client would.
class CProbeFrame : public CMiniFrameWnd
{
public:
    explicit CProbeFrame(bool* pbDeleted, bool bFailCreate = false)
        : m_pbDeleted(pbDeleted), m_bFailCreate(bFailCreate) {}
    ~CProbeFrame() override { *m_pbDeleted = true; }

    CWnd m_child;

protected:
    afx_msg int OnCreate(LPCREATESTRUCT lpcs)
    {
        if (CMiniFrameWnd::OnCreate(lpcs) == -1 || m_bFailCreate)
            return -1;
        return m_child.CreateEx(0, NULL, L"client", WS_CHILD | WS_VISIBLE, CRect(0, 0, 40, 30), this, 1) ? 0 : -1;
    }
    DECLARE_MESSAGE_MAP()

private:
    bool* m_pbDeleted;
    bool m_bFailCreate;
};

BEGIN_MESSAGE_MAP(CProbeFrame, CMiniFrameWnd)
    ON_WM_CREATE()
END_MESSAGE_MAP()

const DWORD kChooserStyle = WS_POPUP | WS_CAPTION | WS_SYSMENU;

TEST(FrameMini, CreatedOwnedByTheTopLevelWindowOfItsParent)
{
    orvane_test::HostWindow host(300, 200);
    CWnd list;
    ASSERT_TRUE(list.CreateEx(0, NULL, L"list", WS_CHILD | WS_VISIBLE, CRect(10, 10, 110, 60),
        CWnd::FromHandle(host), 5));
    bool bDeleted = false;
    CProbeFrame* pFrame = new CProbeFrame(&bDeleted);
    ASSERT_TRUE(pFrame->Create(NULL, L"Columns", kChooserStyle, CRect(0, 0, 0, 0), &list, 0));

    EXPECT_EQ(kChooserStyle, pFrame->GetStyle() & kChooserStyle);
    EXPECT_EQ((DWORD)WS_EX_TOOLWINDOW, pFrame->GetExStyle() & (WS_EX_TOOLWINDOW | WS_EX_CLIENTEDGE));
    EXPECT_TRUE(::IsWindow(pFrame->m_child.m_hWnd));
    EXPECT_EQ(pFrame, pFrame->m_child.GetParent());
    EXPECT_EQ(CString(L"Columns"), pFrame->GetTitle());
    // a pop-up cannot be owned by a child: the system takes the child's top-level window
    EXPECT_EQ((HWND)host, ::GetWindow(pFrame->m_hWnd, GW_OWNER));

    // the window rect for a client area of 180 x 120
    CRect rect(0, 0, 180, 120);
    pFrame->CalcWindowRect(&rect, CWnd::adjustBorder);
    pFrame->MoveWindow(&rect);
    CRect client;
    pFrame->GetClientRect(&client);
    EXPECT_EQ(180, client.Width());
    EXPECT_EQ(120, client.Height());

    list.DestroyWindow();
    EXPECT_FALSE(bDeleted);     // the owner is the host, not the list
    ::DestroyWindow(host);
    EXPECT_TRUE(bDeleted);
}

TEST(FrameWnd, FailedCreationHasDeletedTheFrame)
{
    // PostNcDestroy has run when Create fails: the caller must not delete it again
    bool bDeleted = false;
    CProbeFrame* pFrame = new CProbeFrame(&bDeleted, true);
    EXPECT_FALSE(pFrame->Create(NULL, L"fails", kChooserStyle, CRect(0, 0, 50, 50), NULL, 0));
    EXPECT_TRUE(bDeleted);
}

TEST(WaitCursor, NestedWaitsKeepItUntilTheLastEnds)
{
    HCURSOR hArrow = ::LoadCursor(NULL, IDC_ARROW);
    HCURSOR hWait = ::LoadCursor(NULL, IDC_WAIT);
    ::SetCursor(hArrow);
    {
        CWaitCursor outer;
        EXPECT_EQ(hWait, ::GetCursor());
        {
            CWaitCursor inner;
            ::SetCursor(hArrow);    // as a message box would
            inner.Restore();
            EXPECT_EQ(hWait, ::GetCursor());
            EXPECT_EQ(2, AfxGetApp()->m_nWaitCursorCount);
        }
        EXPECT_EQ(hWait, ::GetCursor());
    }
    EXPECT_EQ(hArrow, ::GetCursor());
    EXPECT_EQ(0, AfxGetApp()->m_nWaitCursorCount);
    CCmdTarget().EndWaitCursor();
    EXPECT_EQ(0, AfxGetApp()->m_nWaitCursorCount);
}

} // namespace
