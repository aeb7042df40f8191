// Reflection of control notifications to the control's own object.
// Covers:
// - EN_CHANGE: ON_CONTROL_REFLECT_EX returning FALSE lets the parent's
//   ON_EN_CHANGE run as well, TRUE stops it; ON_CONTROL_REFLECT always stops it;
//   a control without a framework object notifies the parent directly
// - WM_NOTIFY: ON_NOTIFY_REFLECT_EX with both results, the result value seen by
//   the sender, ON_NOTIFY_RANGE at the parent
// - ON_WM_DRAWITEM_REFLECT in a plain CWnd child
// - WM_CTLCOLOR*: without a brush from ON_WM_CTLCOLOR_REFLECT the parent's own
//   processing runs
// - UpdateData locks control notifications out of the dialog window
#include <afxwin.h>

#include <gtest/gtest.h>

#include "Input.h"

#include <string>

namespace {

const UINT kEditId = 100;
const UINT kPlainEditId = 101;
const UINT kChildId = 102;
const int kCustomNotify = -1234;

class CParentWnd : public CWnd
{
public:
    std::string m_trace;
    LRESULT m_lNotifyResult = 0;

    afx_msg void OnEditChange() { m_trace += "P:change;"; }
    afx_msg void OnPlainEditChange() { m_trace += "P:plain;"; }
    afx_msg void OnChildNotify(UINT nID, NMHDR* pNMHDR, LRESULT* pResult)
    {
        m_trace += "P:notify" + std::to_string(nID) + ";";
        (void)pNMHDR;
        *pResult = m_lNotifyResult;
    }

    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CParentWnd, CWnd)
    ON_EN_CHANGE(kEditId, &CParentWnd::OnEditChange)
    ON_EN_CHANGE(kPlainEditId, &CParentWnd::OnPlainEditChange)
    ON_NOTIFY_RANGE(kCustomNotify, kChildId, kChildId + 5, &CParentWnd::OnChildNotify)
END_MESSAGE_MAP()

// One object for every reflected entry; created as an edit, a static or a plain window.
class CReflector : public CWnd
{
public:
    std::string* m_pTrace = nullptr;
    BOOL m_bStop = FALSE;
    int m_nDraws = 0;
    UINT m_nCtlColor = 0xFFFF;

    afx_msg BOOL OnChange() { *m_pTrace += "E:change;"; return m_bStop; }
    afx_msg BOOL OnCustom(NMHDR* pNMHDR, LRESULT* pResult)
    {
        *m_pTrace += "C:notify" + std::to_string((int)pNMHDR->code) + ";";
        *pResult = 42;
        return m_bStop;
    }
    afx_msg void DrawItem(LPDRAWITEMSTRUCT) { ++m_nDraws; }
    afx_msg HBRUSH CtlColor(CDC*, UINT nCtlColor)
    {
        m_nCtlColor = nCtlColor;
        return NULL;
    }

    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CReflector, CWnd)
    ON_CONTROL_REFLECT_EX(EN_CHANGE, &CReflector::OnChange)
    ON_NOTIFY_REFLECT_EX(kCustomNotify, &CReflector::OnCustom)
    ON_WM_DRAWITEM_REFLECT()
    ON_WM_CTLCOLOR_REFLECT()
END_MESSAGE_MAP()

class CEatingEdit : public CEdit
{
public:
    int m_nChanges = 0;
    afx_msg void OnChange() { ++m_nChanges; }
    DECLARE_MESSAGE_MAP()
};

BEGIN_MESSAGE_MAP(CEatingEdit, CEdit)
    ON_CONTROL_REFLECT(EN_CHANGE, &CEatingEdit::OnChange)
END_MESSAGE_MAP()

struct WndReflect : testing::Test
{
    CParentWnd parent;

    void SetUp() override
    {
        ASSERT_TRUE(parent.CreateEx(0, NULL, L"parent", WS_POPUP | WS_VISIBLE, CRect(20, 20, 320, 220), NULL, 0));
    }
    void TearDown() override
    {
        parent.DestroyWindow();
        orvane_test::PumpUntilIdle(50);
    }
};

TEST_F(WndReflect, EnChangeReachesEditThenParentWhenNotStopped)
{
    CReflector edit;
    edit.m_pTrace = &parent.m_trace;
    ASSERT_TRUE(edit.CreateEx(0, L"EDIT", L"", WS_CHILD | WS_VISIBLE, CRect(0, 0, 100, 20), &parent, kEditId));

    edit.SetWindowText(L"1");
    EXPECT_EQ("E:change;P:change;", parent.m_trace);

    parent.m_trace.clear();
    edit.m_bStop = TRUE;
    edit.SetWindowText(L"2");
    EXPECT_EQ("E:change;", parent.m_trace);
}

TEST_F(WndReflect, PlainReflectHandlerAlwaysEatsTheNotification)
{
    CEatingEdit edit;
    ASSERT_TRUE(edit.Create(WS_CHILD | WS_VISIBLE, CRect(0, 0, 100, 20), &parent, kEditId));
    edit.SetWindowText(L"x");
    orvane_test::SendChars(edit.m_hWnd, L"yz");
    EXPECT_EQ(3, edit.m_nChanges);
    EXPECT_EQ("", parent.m_trace);
}

TEST_F(WndReflect, ControlWithoutObjectNotifiesTheParentDirectly)
{
    HWND hEdit = ::CreateWindowExW(0, L"EDIT", L"", WS_CHILD | WS_VISIBLE, 0, 30, 100, 20,
        parent.m_hWnd, (HMENU)(UINT_PTR)kPlainEditId, NULL, NULL);
    ASSERT_NE(nullptr, hEdit);
    ::SetWindowTextW(hEdit, L"a");
    EXPECT_EQ("P:plain;", parent.m_trace);
}

// The parent's range handler answers 7, the child's reflected one 42; another code is
// not reflected, and the parent's range does not cover it.
const struct { BOOL bStop; UINT code; const char* trace; LRESULT result; } kNotifySteps[] = {
    { FALSE, (UINT)kCustomNotify, "C:notify-1234;P:notify104;", 7 },
    { TRUE, (UINT)kCustomNotify, "C:notify-1234;", 42 },
    { FALSE, NM_CLICK, "", 0 },
};

TEST_F(WndReflect, NotifyReachesChildThenParentWhenNotStopped)
{
    CReflector child;
    child.m_pTrace = &parent.m_trace;
    ASSERT_TRUE(child.Create(NULL, L"", WS_VISIBLE, CRect(0, 60, 50, 80), &parent, kChildId + 2));
    parent.m_lNotifyResult = 7;
    for (const auto& step : kNotifySteps)
    {
        SCOPED_TRACE(step.trace);
        parent.m_trace.clear();
        child.m_bStop = step.bStop;
        NMHDR nmhdr = { child.m_hWnd, kChildId + 2, step.code };
        EXPECT_EQ(step.result, parent.SendMessage(WM_NOTIFY, nmhdr.idFrom, (LPARAM)&nmhdr));
        EXPECT_EQ(step.trace, parent.m_trace);
    }
}

TEST_F(WndReflect, DrawItemReflectMacroReachesPlainWindow)
{
    CReflector child;
    ASSERT_TRUE(child.Create(NULL, L"", WS_VISIBLE, CRect(0, 0, 20, 20), &parent, 104));
    DRAWITEMSTRUCT dis = {};
    dis.CtlType = ODT_STATIC;
    dis.CtlID = 104;
    dis.hwndItem = child.m_hWnd;
    parent.SendMessage(WM_DRAWITEM, 104, (LPARAM)&dis);
    EXPECT_EQ(1, child.m_nDraws);

    // an item of another window is not drawn by this object
    dis.hwndItem = parent.m_hWnd;
    parent.SendMessage(WM_DRAWITEM, 104, (LPARAM)&dis);
    EXPECT_EQ(1, child.m_nDraws);
}

TEST_F(WndReflect, CtlColorReflectWithoutABrushLeavesItToTheParent)
{
    // The reflected brush itself is a row of the dispatch table.
    CReflector label;
    ASSERT_TRUE(label.CreateEx(0, L"STATIC", L"text", WS_CHILD | WS_VISIBLE, CRect(0, 140, 80, 160), &parent, 105));
    HDC hDC = ::GetDC(label.m_hWnd);
    const LRESULT lResult = parent.SendMessage(WM_CTLCOLORSTATIC, (WPARAM)hDC, (LPARAM)label.m_hWnd);
    EXPECT_EQ((UINT)CTLCOLOR_STATIC, label.m_nCtlColor);
    EXPECT_EQ(::DefWindowProcW(parent.m_hWnd, WM_CTLCOLORSTATIC, (WPARAM)hDC, (LPARAM)label.m_hWnd), lResult);
    ::ReleaseDC(label.m_hWnd, hDC);
}

class CDataParent : public CParentWnd
{
public:
    CString m_strValue;
    void DoDataExchange(CDataExchange* pDX) override { DDX_Text(pDX, kEditId, m_strValue); }
};

TEST(WndReflectLockout, UpdateDataDoesNotRouteTheChangesItCauses)
{
    CDataParent parent;
    ASSERT_TRUE(parent.CreateEx(0, NULL, L"data", WS_POPUP, CRect(0, 0, 200, 100), NULL, 0));
    CReflector edit;
    edit.m_pTrace = &parent.m_trace;
    ASSERT_TRUE(edit.CreateEx(0, L"EDIT", L"", WS_CHILD | WS_VISIBLE, CRect(0, 0, 100, 20), &parent, kEditId));

    parent.m_strValue = L"loaded";
    EXPECT_TRUE(parent.UpdateData(FALSE));
    EXPECT_EQ("", parent.m_trace);
    CString text;
    edit.GetWindowText(text);
    EXPECT_STREQ(L"loaded", (LPCTSTR)text);

    edit.SetWindowText(L"typed");   // outside UpdateData: routed again
    EXPECT_EQ("E:change;P:change;", parent.m_trace);
    EXPECT_TRUE(parent.UpdateData(TRUE));
    EXPECT_STREQ(L"typed", (LPCTSTR)parent.m_strValue);
    parent.DestroyWindow();
}

} // namespace
