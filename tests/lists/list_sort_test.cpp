// The extended list sorting, with a parent on screen: the header taken over (created or
// subclassed); SortList per column type with item data following; PreSort/PostSort and the
// header's message as one trace (same column skips, -1 clears, ResortList); header clicks;
// SetColumnTypes with 9 or too few codes; refused item changes; drawing left as the host
// had it; DragColumn directly and from a header drag.
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "Input.h"
#include "KVXListCtrlEx.h"
#include "Checks.h"
#include "MsgSequence.h"

#include <commctrl.h>

#include <memory>
#include <string>
#include <vector>

namespace {

class CTestList : public KVXListCtrlEx
{
public:
    using KVXListCtrlEx::DragColumn;
    KVXHeaderCtrlEx& Header() { return m_ctlHeader; }
    void PreSort() override { m_trace += "("; }
    void PostSort() override { m_trace += ")"; }
    std::string m_trace;
};

// A parent that refuses every item change.
LRESULT CALLBACK RefusingParent(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam, UINT_PTR, DWORD_PTR)
{
    if (message == WM_NOTIFY && reinterpret_cast<NMHDR*>(lParam)->code == LVN_ITEMCHANGING)
        return TRUE;
    return ::DefSubclassProc(hwnd, message, wParam, lParam);
}

const LPCTSTR kColumns[] = { _T("Name"), _T("Size"), _T("Date"), _T("Time"), _T("Flag") };
unsigned char kTypes[] = { 0, 2, 3, 6, 7 };

// The rows' texts, item data 100, 101, 102 in this order, and the flag column's images.
const LPCTSTR kCells[3][4] = {
    { _T("b"), _T("10"), _T("3/1/2024"), _T("7:00 AM") },
    { _T("a"), _T("9"), _T("1/1/2024"), _T("5:00 AM") },
    { _T("c"), _T("10"), _T("2/1/2024"), _T("11:00 PM") },
};
const int kImages[3] = { 1, 2, 0 };

class ListFixture : public testing::Test
{
protected:
    void SetUp() override
    {
        m_host.reset(new orvane_test::HostWindow(600, 300));
        ASSERT_TRUE(m_list.Create(WS_CHILD | WS_VISIBLE | LVS_REPORT, CRect(0, 0, 560, 260),
            CWnd::FromHandle(*m_host), 7));
        m_list.SetExtendedStyle(LVS_EX_SUBITEMIMAGES);
        for (int c = 0; c < 5; ++c)
            m_list.InsertColumn(c, kColumns[c], LVCFMT_LEFT, 80);
        m_list.SetRedraw(FALSE);
        for (int r = 0; r < 3; ++r)
        {
            m_list.InsertItem(LVIF_TEXT | LVIF_PARAM, r, kCells[r][0], 0, 0, 0, 100 + r);
            for (int c = 1; c < 4; ++c)
                m_list.SetItemText(r, c, kCells[r][c]);
            m_list.SetItem(r, 4, LVIF_IMAGE, NULL, kImages[r], 0, 0, 0);
        }
        m_list.SetRedraw(TRUE);
        ASSERT_TRUE(m_list.SetColumnTypes(kTypes, 5));
        ASSERT_TRUE(m_list.SetBaseTime(_T("6:00 AM")));
        ASSERT_FALSE(m_list.SetBaseTime(_T("soon")));
        // The header's sort message joins the trace as [column,ascending].
        m_log.SpyWindow(m_list.Header(), 1);
        m_log.onRecord = [this](int, const orvane_test::MsgEntry& e) {
            if (e.message == WM_KVX_SETSORTEDCOLUMN)
                m_list.m_trace += "[" + std::to_string(static_cast<int>(e.wParam)) + "," + std::to_string(e.lParam) + "]";
        };
    }

    void TearDown() override
    {
        m_log.Unspy(m_list.Header());
        m_list.DestroyWindow();
        m_host.reset();
    }

    // The names of the rows in their order, e.g. "bac".
    std::string Names()
    {
        std::string names;
        for (int i = 0; i < m_list.GetItemCount(); ++i)
            names += static_cast<char>(m_list.GetItemText(i, 0)[0]);
        return names;
    }

    // Every row still carries the item data it was inserted with: 100 + its place in "bac".
    void ExpectItemDataFollowsRows()
    {
        for (int i = 0; i < m_list.GetItemCount(); ++i)
        {
            const size_t original = std::string("bac").find(static_cast<char>(m_list.GetItemText(i, 0)[0]));
            EXPECT_EQ(100 + original, m_list.GetItemData(i)) << "row " << i;
        }
    }

    std::string SortInfo()
    {
        int nColumn = 99;
        bool bAscending = false;
        if (!m_list.GetSortInfo(nColumn, bAscending))
            return "none";
        return std::to_string(nColumn) + (bAscending ? " asc" : " desc");
    }

    void ClickHeader(int item)
    {
        CRect rc;
        m_list.Header().GetItemRect(item, &rc);
        orvane_test::SendClick(m_list.Header(), rc.CenterPoint().x, rc.CenterPoint().y);
    }

    // The texts of a row, "a|b|...", or with -1 the column titles.
    std::string Texts(int row)
    {
        std::string texts;
        for (int c = 0; c < m_list.GetHeaderCtrl()->GetItemCount(); ++c)
        {
            TCHAR title[16] = {};
            LVCOLUMN column = { LVCF_TEXT, 0, 0, title, 16 };
            m_list.GetColumn(c, &column);
            texts += (c > 0 ? "|" : "") + orvane_test::Narrow(row < 0 ? title : static_cast<LPCTSTR>(m_list.GetItemText(row, c)));
        }
        return texts;
    }

    std::unique_ptr<orvane_test::HostWindow> m_host;
    CTestList m_list;
    orvane_test::MsgLog m_log;
};

TEST_F(ListFixture, HeaderTakenOverWhenCreatedOrSubclassed)
{
    EXPECT_EQ(&m_list.Header(), CWnd::FromHandlePermanent(::GetDlgItem(m_list, 0)));

    // Hidden, the list view makes its header only with the first column.
    CTestList hidden;
    ASSERT_TRUE(hidden.Create(WS_CHILD | LVS_REPORT, CRect(0, 0, 200, 100), CWnd::FromHandle(*m_host), 8));
    hidden.InsertColumn(0, _T("Name"));
    EXPECT_EQ(&hidden.Header(), CWnd::FromHandlePermanent(::GetDlgItem(hidden, 0)));
    hidden.DestroyWindow();

    // As a dialog control: the list view and its header exist before the object.
    HWND hList = ::CreateWindowExW(0, WC_LISTVIEWW, L"", WS_CHILD | WS_VISIBLE | LVS_REPORT, 0, 0, 200, 100,
        *m_host, NULL, NULL, NULL);
    ASSERT_NE(nullptr, ::GetDlgItem(hList, 0));
    CTestList subclassed;
    ASSERT_TRUE(subclassed.SubclassWindow(hList));
    EXPECT_EQ(&subclassed.Header(), CWnd::FromHandlePermanent(::GetDlgItem(hList, 0)));
    subclassed.DestroyWindow();
}

struct SortCase { const char* name; int column; bool ascending; const char* names; };

// The rules are tested without a window; these show each kind of key reaching them.
const SortCase kSortCases[] = {
    { "TextDescending", 0, false, "cba" },
    { "IntegerDescendingEqualKeepOrder", 1, false, "bca" },
    { "Date", 2, true, "acb" },
    { "TimeOfDayAfterBaseTime", 3, true, "bca" },
    { "ImageIndex", 4, true, "cba" },
};

class SortListTest : public ListFixture, public testing::WithParamInterface<SortCase> {};

TEST_P(SortListTest, RowsAndItemData)
{
    const SortCase& c = GetParam();
    m_list.SortList(c.column, c.ascending);
    EXPECT_EQ(c.names, Names());
    ExpectItemDataFollowsRows();
    EXPECT_EQ(std::to_string(c.column) + (c.ascending ? " asc" : " desc"), SortInfo());
}

INSTANTIATE_TEST_SUITE_P(Columns, SortListTest, testing::ValuesIn(kSortCases), orvane_test::CaseName<SortCase>);

// Steps: SortList(column, ascending), or ResortList for column -2; then the trace, the rows
// and the sort state. Before the second step a row "d" sorting first by size is added.
const struct { int column; bool ascending; const char* trace; const char* names; const char* info; } kSortSteps[] = {
    { 1, true, "([1,1])", "abc", "1 asc" },
    { 1, true, "()", "abcd", "1 asc" },        // the current column and direction: no sort, no header
    { -2, true, "([1,1])", "dabc", "1 asc" },
    { -1, false, "([-1,1])", "dabc", "none" },
    { -2, true, "()", "dabc", "none" },
};

TEST_F(ListFixture, SortStateAndHeaderTrace)
{
    for (const auto& step : kSortSteps)
    {
        if (&step == &kSortSteps[1])
        {
            m_list.InsertItem(LVIF_TEXT | LVIF_PARAM, 3, _T("d"), 0, 0, 0, 103);
            m_list.SetItemText(3, 1, _T("1"));
        }
        m_list.m_trace.clear();
        step.column == -2 ? m_list.ResortList() : m_list.SortList(step.column, step.ascending);
        EXPECT_EQ(testing::PrintToString(std::vector<std::string>{ step.trace, step.names, step.info }),
                  testing::PrintToString(std::vector<std::string>{ m_list.m_trace, Names(), SortInfo() }))
            << "step " << &step - kSortSteps;
    }
}

TEST_F(ListFixture, HeaderClicksSortWhenEnabled)
{
    ClickHeader(1);
    EXPECT_EQ("none", SortInfo());

    EXPECT_FALSE(m_list.EnableSort(true));
    ClickHeader(1);
    EXPECT_EQ("1 asc", SortInfo());
    ClickHeader(1);
    EXPECT_EQ("1 desc", SortInfo());
    EXPECT_EQ("bca", Names());
    ClickHeader(0);
    EXPECT_EQ("0 asc", SortInfo());

    // Only the left button sorts.
    NMHEADER notify = { { m_list.Header(), 0, HDN_ITEMCLICKW }, 2, 1, NULL };
    m_list.SendMessage(WM_NOTIFY, 0, reinterpret_cast<LPARAM>(&notify));
    EXPECT_EQ("0 asc", SortInfo());

    EXPECT_TRUE(m_list.EnableSort(false));
    ClickHeader(2);
    EXPECT_EQ("0 asc", SortInfo());
}

TEST_F(ListFixture, ColumnsWithoutTypeSortAsText)
{
    unsigned char withNine[] = { 0, 2, 9 };
    EXPECT_FALSE(m_list.SetColumnTypes(withNine, 3));
    m_list.SortList(1, true);
    EXPECT_EQ("bca", Names());      // "10" before "9"

    EXPECT_TRUE(m_list.SetColumnTypes(kTypes, 1));
    m_list.SortList(2, true);
    EXPECT_EQ("acb", Names());
    m_list.SortList(1, true);
    EXPECT_EQ("cba", Names());

    EXPECT_TRUE(m_list.SetColumnTypes(kTypes, 5));
    m_list.ResortList();
    EXPECT_EQ("acb", Names());
    EXPECT_TRUE(m_list.SetColumnTypes(NULL, 0));
}

TEST_F(ListFixture, RefusedItemChangesLeaveRowsAlone)
{
    ::SetWindowSubclass(*m_host, RefusingParent, 1, 0);
    m_list.SortList(0, true);
    ::RemoveWindowSubclass(*m_host, RefusingParent, 1);
    EXPECT_EQ("bac", Names());
    ExpectItemDataFollowsRows();
}

TEST_F(ListFixture, DrawingLeftAsTheHostHadIt)
{
    // A list that draws invalidates itself for a new row; one whose drawing is off does not.
    m_list.SortList(0, true);
    m_list.UpdateWindow();
    m_list.InsertItem(3, _T("d"));
    EXPECT_TRUE(m_list.GetUpdateRect(NULL));

    m_list.SetRedraw(FALSE);
    m_list.UpdateWindow();
    m_list.SortList(0, false);
    m_list.ValidateRect(NULL);
    m_list.InsertItem(4, _T("e"));
    EXPECT_FALSE(m_list.GetUpdateRect(NULL));
    m_list.SetRedraw(TRUE);
}

TEST_F(ListFixture, DragColumnMovesColumnsWithTheirTexts)
{
    m_list.DragColumn(2, 0);
    EXPECT_EQ("Date|Name|Size|Time|Flag", Texts(-1));
    EXPECT_EQ("3/1/2024|b|10|7:00 AM|", Texts(0));

    // From the header: Date dragged two places to the right.
    m_list.Header().EnableDrag(true);
    CRect first, third;
    m_list.Header().GetItemRect(0, &first);
    m_list.Header().GetItemRect(2, &third);
    const int y = first.CenterPoint().y;
    m_list.Header().SendMessage(WM_LBUTTONDOWN, MK_LBUTTON, orvane_test::PointParam(first.CenterPoint().x, y));
    m_list.Header().SendMessage(WM_MOUSEMOVE, MK_LBUTTON, orvane_test::PointParam(first.CenterPoint().x + 5, y));
    m_list.Header().SendMessage(WM_MOUSEMOVE, MK_LBUTTON, orvane_test::PointParam(third.CenterPoint().x, y));
    m_list.Header().SendMessage(WM_LBUTTONUP, 0, orvane_test::PointParam(third.CenterPoint().x, y));
    EXPECT_EQ("Name|Date|Size|Time|Flag", Texts(-1));
    EXPECT_EQ("b|3/1/2024|10|7:00 AM|", Texts(0));
    EXPECT_EQ("a|1/1/2024|9|5:00 AM|", Texts(1));
    EXPECT_EQ("none", SortInfo());
}

} // namespace
