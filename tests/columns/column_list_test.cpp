// The list and its chooser without drags: InsertColumn by title (refusals, two records
// of one title, shown columns and the sort column moving along, no cell filled); the
// header's sort arrow where WM_USER+1 puts it; F1 in the chooser, closing hides it,
// Customize shows it again, it dies with the list; a chooser whose sheet cannot be
// made is deleted once and made by the next Customize.
#include "ColumnsTestSupport.h"

#include "Pixels.h"

namespace columns_test {
namespace {

class ColumnListTest : public ColumnsFixture {};

TEST_F(ColumnListTest, InsertColumnShowsHiddenRecordsByTitle)
{
    EXPECT_EQ(-1, CTestList().InsertColumn(L"Alpha", 0));
    EXPECT_EQ(-1, m_pList->InsertColumn(L"", 0));
    EXPECT_EQ(-1, m_pList->InsertColumn(L"Zeta", -1));
    EXPECT_EQ(-1, m_pList->InsertColumn(L"zeta", 0));
    EXPECT_EQ(-1, m_pList->InsertColumn(L"Beta", 0));
    EXPECT_EQ("Alpha|Beta|Gamma|Delta", Layout());

    m_pList->SortList(1, true);
    KVXColumnInfo* pTwin = new KVXColumnInfo(-1, L"Zeta", -1, 40, LVCFMT_LEFT);
    m_pList->AddColumn(pTwin);
    EXPECT_EQ(0, m_pList->InsertColumn(L"Zeta", 0));
    EXPECT_EQ(0, pTwin->GetIndex());
    EXPECT_EQ("Zeta*|Zeta*|Alpha*|Beta|Gamma|Delta", Layout());
    EXPECT_EQ("0,4,1,2,3,0", m_pList->Types());
    EXPECT_EQ(3, m_pList->m_nSortColumn);
    EXPECT_EQ("", m_filler.m_trace);
}

// The arrow's dark edge inside the item (its frame left out) after WM_USER+1.
TEST_F(ColumnListTest, SortArrowOnTheItemTheListNames)
{
    CRect rectItem;
    m_pList->m_HeaderCtrl.GetItemRect(2, &rectItem);
    rectItem.DeflateRect(3, 3);
    for (int nColumn : { 2, -1 })
    {
        m_pList->m_HeaderCtrl.SendMessage(WM_USER + 1, static_cast<WPARAM>(nColumn), 0);
        const int nDark = orvane_test::ClientCapture(m_pList->m_HeaderCtrl).Count(rectItem, ::GetSysColor(COLOR_3DDKSHADOW));
        EXPECT_EQ(nColumn == 2, nDark > 0) << nColumn << ": " << nDark;
    }
}

struct CHelpTarget : CCmdTarget
{
    void Help(CString strTopic, UINT nId, HWND hWnd)
    {
        m_calls += "'" + Narrow(strTopic) + "' " + std::to_string(nId) + (hWnd == m_hPage ? " page;" : " other;");
    }
    HWND m_hPage = NULL;
    std::string m_calls;
};

int TopLevelWindows()
{
    int n = 0;
    ::EnumThreadWindows(::GetCurrentThreadId(), [](HWND, LPARAM p) -> BOOL { return ++*reinterpret_cast<int*>(p); },
        reinterpret_cast<LPARAM>(&n));
    return n;
}

TEST_F(ColumnListTest, ChooserHelpsHidesShowsAgainAndDiesWithTheList)
{
    const int nWindows = TopLevelWindows();
    CHelpTarget help;
    auto pfnHelp = static_cast<void (CCmdTarget::*)(CString, UINT, HWND)>(&CHelpTarget::Help);
    m_pList->GetPropPageData().m_pHelpTarget = &help;
    m_pList->GetPropPageData().m_pfnDisplayHelp = pfnHelp;
    OpenChooser();
    KVXColumnsPropPage* pPage = m_pList->Page();
    help.m_hPage = pPage->m_hWnd;
    HELPINFO info = { sizeof info, HELPINFO_WINDOW, 0, pPage->m_hWnd, 0, { 0, 0 } };
    pPage->SendMessage(WM_HELP, 0, reinterpret_cast<LPARAM>(&info));
    pPage->SetDisplayHelp(NULL, pfnHelp);
    pPage->SendMessage(WM_HELP, 0, reinterpret_cast<LPARAM>(&info));
    EXPECT_EQ("'' 5105 page;", help.m_calls);

    CWnd* pFrame = m_pList->m_pPropFrame;
    const HWND hFrame = pFrame->m_hWnd;
    pFrame->SendMessage(WM_SYSCOMMAND, SC_CLOSE);
    EXPECT_EQ(std::make_pair(TRUE, FALSE), std::make_pair(::IsWindow(hFrame), pFrame->IsWindowVisible()));
    m_pList->Customize();
    EXPECT_EQ(std::make_pair(pFrame, TRUE), std::make_pair(static_cast<CWnd*>(m_pList->m_pPropFrame), pFrame->IsWindowVisible()));
    EXPECT_EQ("Epsilon:60|Zeta:110", Strips());

    m_pList->DestroyWindow();
    EXPECT_FALSE(::IsWindow(hFrame));
    EXPECT_EQ(nWindows, TopLevelWindows());
}

// Refuses the creation of every dialog window of this thread: the chooser's sheet.
LRESULT CALLBACK RefuseDialogs(int code, WPARAM wParam, LPARAM lParam)
{
    WCHAR szClass[16] = {};
    if (code == HCBT_CREATEWND && ::GetClassNameW(reinterpret_cast<HWND>(wParam), szClass, 16) > 0
        && lstrcmpW(szClass, L"#32770") == 0)
        return 1;
    return ::CallNextHookEx(NULL, code, wParam, lParam);
}

TEST_F(ColumnListTest, ChooserThatCannotBeMadeIsDeletedOnceAndMadeNextTime)
{
    const int nWindows = TopLevelWindows();
    HHOOK hHook = ::SetWindowsHookExW(WH_CBT, &RefuseDialogs, NULL, ::GetCurrentThreadId());
    m_pList->Customize();
    ::UnhookWindowsHookEx(hHook);
    EXPECT_EQ(nullptr, m_pList->m_pPropFrame);
    EXPECT_EQ(nWindows, TopLevelWindows());
    OpenChooser();
    EXPECT_EQ("Epsilon:60|Zeta:110", Strips());
}

} // namespace
} // namespace columns_test
