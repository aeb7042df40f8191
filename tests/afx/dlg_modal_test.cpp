// CDialog: modal dialogs from in-memory templates (modeless ones with subclassed items
// are every edits test's page).
// Covers:
// - DoModal: OnInitDialog runs, EndDialog from a posted message ends it with
//   that result, the owner is disabled meanwhile and enabled after
// - PreTranslateMessage order inside the modal loop: control, its parent, the
//   dialog (whose IsDialogMessage then handles the key)
// - temporary objects live through the modal loop (as in MFC, only the thread's
//   idle time frees them), those made inside it and those made before
// - OnOK with DDX_Text: invalid input keeps the dialog open with a message box,
//   valid input ends it with IDOK and the value
// - EndDialog from OnInitDialog ends DoModal at once
#include <afxwin.h>

#include <gtest/gtest.h>

#include "AfxTestSupport.h"
#include "Input.h"
#include "DialogTemplate.h"

#include <string>

using orvane_test::DialogTemplate;

namespace {

const WORD kEditId = 1001;
const UINT kEndMsg = WM_USER + 5;

DialogTemplate MakeTemplate()
{
    DialogTemplate tmpl(L"Test dialog", 160, 80, WS_POPUP | WS_CAPTION | WS_SYSMENU);
    tmpl.AddItem(kEditId, DialogTemplate::Edit, L"", 10, 10, 100, 14, WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL);
    tmpl.AddItem(IDOK, DialogTemplate::Button, L"OK", 10, 40, 50, 14, BS_DEFPUSHBUTTON | WS_TABSTOP);
    tmpl.AddItem(IDCANCEL, DialogTemplate::Button, L"Cancel", 70, 40, 50, 14, BS_PUSHBUTTON | WS_TABSTOP);
    return tmpl;
}

/////////////////////////////////////////////////////////////////////////////

class CModalDlg : public CDialog
{
public:
    std::string m_trace;
    int m_nEndResult = 77;
    UINT m_nTimerMs = 0;
    BOOL m_bEndInInit = FALSE;
    BOOL m_bPanel = FALSE;
    BOOL m_bOwnerDisabledInLoop = FALSE;
    HWND m_hWndOwnerSeen = NULL;
    afx_test::CWalkWnd m_panel;
    afx_test::CWalkWnd m_panelEdit;
    // temporaries
    HWND m_hWndTempInner = NULL;
    HWND m_hWndTempOuter = NULL;
    UINT m_nInnerFlagsAtTimer = 0xFFFF;
    UINT m_nOuterFlagsAtTimer = 0xFFFF;

    explicit CModalDlg(CWnd* pParent = NULL) : CDialog() { m_pParentWnd = pParent; }

    BOOL OnInitDialog() override
    {
        CDialog::OnInitDialog();
        m_hWndOwnerSeen = ::GetWindow(m_hWnd, GW_OWNER);
        if (m_hWndOwnerSeen != NULL)
            m_bOwnerDisabledInLoop = !::IsWindowEnabled(m_hWndOwnerSeen);
        if (m_bEndInInit)
        {
            EndDialog(5);
            return TRUE;
        }
        if (m_bPanel)
        {
            m_panel.m_pTrace = &m_trace;
            m_panel.m_pszName = "parent";
            m_panel.Create(NULL, L"", WS_VISIBLE, CRect(0, 0, 200, 60), this, 2000);
            m_panelEdit.m_pTrace = &m_trace;
            m_panelEdit.m_pszName = "child";
            m_panelEdit.CreateEx(0, L"EDIT", L"", WS_CHILD | WS_VISIBLE, CRect(0, 0, 100, 20), &m_panel, 2001);
            m_panelEdit.PostMessage(WM_KEYDOWN, 'A', 1);
        }
        if (m_hWndTempInner != NULL)
            CWnd::FromHandle(m_hWndTempInner)->m_nFlags = 0x4000;
        if (m_nTimerMs != 0)
            SetTimer(1, m_nTimerMs, NULL);
        else
            PostMessage(kEndMsg);
        return TRUE;
    }

    BOOL PreTranslateMessage(MSG* pMsg) override
    {
        if (pMsg->message == WM_KEYDOWN)
            m_trace += "top;";
        return CDialog::PreTranslateMessage(pMsg);
    }

    afx_msg LRESULT OnEnd(WPARAM, LPARAM) { EndDialog(m_nEndResult); return 0; }
    afx_msg void OnTimer(UINT_PTR)
    {
        KillTimer(1);
        if (m_hWndTempInner != NULL)
            m_nInnerFlagsAtTimer = CWnd::FromHandle(m_hWndTempInner)->m_nFlags;
        if (m_hWndTempOuter != NULL)
            m_nOuterFlagsAtTimer = CWnd::FromHandle(m_hWndTempOuter)->m_nFlags;
        EndDialog(m_nEndResult);
    }

    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CModalDlg, CDialog)
    ON_MESSAGE(kEndMsg, &CModalDlg::OnEnd)
    ON_WM_TIMER()
END_MESSAGE_MAP()

struct DlgModal : testing::Test
{
    DialogTemplate tmpl = MakeTemplate();
    CWnd owner;

    void SetUp() override
    {
        ASSERT_TRUE(owner.CreateEx(0, NULL, L"owner", WS_OVERLAPPEDWINDOW | WS_VISIBLE,
            CRect(0, 0, 400, 300), NULL, 0));
        owner.SetActiveWindow();
    }
    void TearDown() override
    {
        owner.DestroyWindow();
        orvane_test::PumpUntilIdle(50);
    }
};

TEST_F(DlgModal, EndDialogFromPostedMessageEndsTheLoopWithItsResult)
{
    CModalDlg dlg(&owner);
    ASSERT_TRUE(dlg.InitModalIndirect(tmpl.Get(), &owner));
    EXPECT_EQ(77, dlg.DoModal());
    EXPECT_EQ(NULL, dlg.m_hWnd);
    EXPECT_EQ(owner.m_hWnd, dlg.m_hWndOwnerSeen);
    EXPECT_TRUE(dlg.m_bOwnerDisabledInLoop);
    EXPECT_TRUE(owner.IsWindowEnabled());
}

TEST_F(DlgModal, EndDialogInOnInitDialogEndsAtOnce)
{
    CModalDlg dlg(&owner);
    dlg.m_bEndInInit = TRUE;
    ASSERT_TRUE(dlg.InitModalIndirect(tmpl.Get(), &owner));
    EXPECT_EQ(5, dlg.DoModal());
    EXPECT_EQ(NULL, dlg.m_hWnd);
    EXPECT_TRUE(owner.IsWindowEnabled());
}

TEST_F(DlgModal, NoTemplateFails)
{
    CModalDlg dlg(&owner);
    EXPECT_EQ(-1, dlg.DoModal());
    EXPECT_TRUE(owner.IsWindowEnabled());
    CDialog missing(31999u, &owner);
    EXPECT_EQ(-1, missing.DoModal());
}

TEST_F(DlgModal, PreTranslateMessageWalksControlParentDialog)
{
    CModalDlg dlg(&owner);
    dlg.m_bPanel = TRUE;
    dlg.m_nTimerMs = 30;
    ASSERT_TRUE(dlg.InitModalIndirect(tmpl.Get(), &owner));
    EXPECT_EQ(77, dlg.DoModal());
    EXPECT_EQ("child;parent;top;", dlg.m_trace);
    // the dialog manager dispatched the key after the walk
    EXPECT_EQ(1, dlg.m_panelEdit.m_nKeyDowns);
}

TEST_F(DlgModal, TemporariesLiveThroughTheModalLoop)
{
    HWND hOuter = ::CreateWindowExW(0, L"STATIC", L"o", WS_POPUP, 0, 0, 5, 5, NULL, NULL, NULL, NULL);
    HWND hInner = ::CreateWindowExW(0, L"STATIC", L"i", WS_POPUP, 0, 0, 5, 5, NULL, NULL, NULL, NULL);
    CWnd* pOuter = CWnd::FromHandle(hOuter);   // held by this frame across DoModal
    pOuter->m_nFlags = 0x4000;

    CModalDlg dlg(&owner);
    dlg.m_hWndTempInner = hInner;
    dlg.m_hWndTempOuter = hOuter;
    dlg.m_nTimerMs = 60;
    ASSERT_TRUE(dlg.InitModalIndirect(tmpl.Get(), &owner));
    EXPECT_EQ(77, dlg.DoModal());
    EXPECT_EQ(0x4000u, dlg.m_nInnerFlagsAtTimer);   // not freed while the loop idled
    EXPECT_EQ(0x4000u, dlg.m_nOuterFlagsAtTimer);   // kept for this frame
    EXPECT_EQ(0x4000u, pOuter->m_nFlags);
    ::DestroyWindow(hOuter);
    ::DestroyWindow(hInner);
    CWnd::DeleteTempMap();
}

/////////////////////////////////////////////////////////////////////////////

class CDataDlg : public CDialog
{
public:
    int m_nValue = 12;
    CString m_strTyped;
    void DoDataExchange(CDataExchange* pDX) override
    {
        DDX_Text(pDX, kEditId, m_nValue);
    }
    BOOL OnInitDialog() override
    {
        BOOL bResult = CDialog::OnInitDialog();
        GetDlgItemText(kEditId, m_strTyped);
        // invalid text first: OK must keep the dialog open
        SetDlgItemText(kEditId, L"12x");
        PostMessage(WM_COMMAND, IDOK);
        PostMessage(WM_USER + 6);
        return bResult;
    }
    afx_msg LRESULT OnFix(WPARAM, LPARAM)
    {
        SetDlgItemText(kEditId, L" -345 ");
        PostMessage(WM_COMMAND, IDOK);
        return 0;
    }
    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CDataDlg, CDialog)
    ON_MESSAGE(WM_USER + 6, &CDataDlg::OnFix)
END_MESSAGE_MAP()

TEST_F(DlgModal, OnOkValidatesWithDataExchange)
{
    std::wstring appName = AfxGetAppName();
    orvane_test::DialogAnswerer answerer([&](const orvane_test::DialogAnswerer::Seen& seen) {
        return seen.caption == appName ? IDOK : 0;
    });
    CDataDlg dlg;
    ASSERT_TRUE(dlg.InitModalIndirect(tmpl.Get(), &owner));
    EXPECT_EQ(IDOK, dlg.DoModal());
    EXPECT_STREQ(L"12", (LPCTSTR)dlg.m_strTyped);   // UpdateData(FALSE) in OnInitDialog
    EXPECT_EQ(-345, dlg.m_nValue);
    int nBoxes = 0;
    for (const auto& seen : answerer.seen())
    {
        if (seen.caption == appName)
        {
            ++nBoxes;
            EXPECT_EQ(L"Please enter an integer.", seen.text);
        }
    }
    EXPECT_EQ(1, nBoxes);
}

} // namespace
