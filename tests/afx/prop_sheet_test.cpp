// Property sheets and pages.
// Covers:
// - a modeless child sheet (Create(pParent, WS_CHILD | WS_VISIBLE, 0)) with a page
//   whose template lies in an extension DLL of the resource chain: the page
//   window is attached to its object, OnInitDialog and DoDataExchange run once,
//   the standard buttons are hidden and the sheet ends above them
// - GetPage, GetActivePage, GetPageCount before and after the window exists
// - the sheet's PostNcDestroy when its parent goes; a failed Create runs it too
#include <afxdlgs.h>

#include <gtest/gtest.h>

#include "Input.h"
#include "ext_testdll.h"

#include <memory>

namespace {

class CProbePage : public CPropertyPage
{
public:
    CProbePage() : CPropertyPage(IDD_EXT_TEST_PAGE) {}

    CEdit m_edit;
    int m_nInits = 0;
    int m_nExchanges = 0;

    BOOL OnInitDialog() override
    {
        ++m_nInits;
        return CPropertyPage::OnInitDialog();
    }
    void DoDataExchange(CDataExchange* pDX) override
    {
        ++m_nExchanges;
        DDX_Control(pDX, IDC_EXT_TEST_EDIT, m_edit);
    }
};

// Owns itself as a sheet inside a frame does.
class CProbeSheet : public CPropertySheet
{
public:
    CProbeSheet(CWnd* pParentWnd, bool* pbDeleted)
        : CPropertySheet(L"Probe sheet", pParentWnd), m_pbDeleted(pbDeleted)
    {
        AddPage(&m_page);
    }
    ~CProbeSheet() override { *m_pbDeleted = true; }

    CProbePage m_page;

protected:
    void PostNcDestroy() override
    {
        CPropertySheet::PostNcDestroy();
        delete this;
    }

private:
    bool* m_pbDeleted;
};

TEST(PropSheet, ChildSheetShowsAPageFromTheExtensionChain)
{
    const std::unique_ptr<CDynLinkLibrary> chain(new CDynLinkLibrary(*ExtTestModule()));   // for this test
    orvane_test::HostWindow host(500, 400);
    CWnd* pHost = CWnd::FromHandle(host);
    bool bDeleted = false;
    CProbeSheet* pSheet = new CProbeSheet(pHost, &bDeleted);
    EXPECT_EQ(1, pSheet->GetPageCount());
    EXPECT_EQ(&pSheet->m_page, pSheet->GetActivePage());    // before the window: the start page
    ASSERT_TRUE(pSheet->Create(pHost, WS_CHILD | WS_VISIBLE, 0));

    HWND hSheet = pSheet->m_hWnd;
    EXPECT_EQ((DWORD)WS_CHILD, pSheet->GetStyle() & (WS_CHILD | WS_POPUP | WS_CAPTION));
    EXPECT_EQ((HWND)host, ::GetParent(hSheet));
    CProbePage& page = pSheet->m_page;
    ASSERT_TRUE(::IsWindow(page.m_hWnd));
    EXPECT_EQ(hSheet, ::GetParent(page.m_hWnd));
    EXPECT_EQ(&page, pSheet->GetActivePage());
    EXPECT_EQ(&page, pSheet->GetPage(0));
    EXPECT_EQ((HINSTANCE)ExtTestModule()->hResource,
        (HINSTANCE)::GetWindowLongPtr(page.m_hWnd, GWLP_HINSTANCE));
    EXPECT_EQ(1, page.m_nInits);
    EXPECT_EQ(1, page.m_nExchanges);    // the first activation does not exchange again
    EXPECT_EQ(::GetDlgItem(page.m_hWnd, IDC_EXT_TEST_EDIT), page.m_edit.m_hWnd);

    // without its buttons, and no taller than the part above them
    HWND hOK = ::GetDlgItem(hSheet, IDOK);
    ASSERT_NE(nullptr, hOK);
    EXPECT_FALSE(::IsWindowVisible(hOK));
    EXPECT_FALSE(::IsWindowEnabled(hOK));
    CRect rectSheet, rectOK;
    pSheet->GetWindowRect(&rectSheet);
    ::GetWindowRect(hOK, &rectOK);
    EXPECT_EQ(rectOK.top, rectSheet.bottom);

    ::DestroyWindow(host);
    EXPECT_TRUE(bDeleted);
    EXPECT_FALSE(::IsWindow(hSheet));
}

TEST(PropSheet, FailedCreateHasRunPostNcDestroy)
{
    const std::unique_ptr<CDynLinkLibrary> chain(new CDynLinkLibrary(*ExtTestModule()));   // for this test
    bool bDeleted = false;
    CProbeSheet* pSheet = new CProbeSheet(NULL, &bDeleted);
    // a child sheet needs a parent
    EXPECT_FALSE(pSheet->Create(NULL, WS_CHILD | WS_VISIBLE, 0));
    EXPECT_TRUE(bDeleted);
}

} // namespace
