// The combo list in a modeless dialog: a row's combo box equipped, replaced and removed;
// keys, scrolling and the wheel placing the boxes of the rows in view; dividers up to the
// combo column re-laying them; picked entries, Enter and Esc; the title tip's text from the
// parent; SelectItemsByState with LVIS_FOCUSED; lists destroyed with open boxes, no leaks.
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "DialogTemplate.h"
#include "Input.h"
#include "KVXComboBoxListCtrlEx.h"
#include "KVXSimpleListControlExItemCommand.h"
#include "Checks.h"
#include "MsgSequence.h"

#include <string>
#include <vector>

namespace {

using namespace orvane_test;
using orvane_test::Narrow;

const UINT kListId = 7;
const int kComboBase = 5106;
const int kRows = 60;
// The columns fit into the list until a test widens them.
const int kWidths[] = { 120, 100, 150 };
const int kComboColumn = 1;

class CTestList : public KVXComboBoxListCtrlEx
{
public:
    KVXTitleTipCtrl& Tip() { return m_ctlTitleTip; }
};

class ComboListTest : public testing::Test
{
protected:
    void SetUp() override
    {
        DialogTemplate tmpl(L"combo list", 300, 220);
        tmpl.AddItem(IDOK, DialogTemplate::Button, L"OK", 240, 200, 50, 14, BS_DEFPUSHBUTTON | WS_TABSTOP);
        tmpl.AddItem(IDCANCEL, DialogTemplate::Button, L"Cancel", 180, 200, 50, 14, WS_TABSTOP);
        ASSERT_TRUE(m_dialog.CreateIndirect(tmpl.Get(), NULL));
        ASSERT_TRUE(m_list.Create(WS_CHILD | WS_VISIBLE | WS_TABSTOP | LVS_REPORT, CRect(10, 10, 410, 260), &m_dialog,
                                  kListId));
        m_list.SetFont(m_dialog.GetFont());
        for (int c = 0; c < 3; ++c)
            m_list.InsertColumn(c, _T("Column"), LVCFMT_LEFT, kWidths[c], c);
        m_list.SetRedraw(FALSE);
        for (int r = 0; r < kRows; ++r)
            m_list.InsertItem(r, _T("Task"));
        m_list.SetRedraw(TRUE);
        m_list.SetComboBoxColID(kComboColumn);
        for (LPCTSTR choice : { _T("Open"), _T("Doing"), _T("Done") })
            m_choices.Add(choice);
        // The dialog's notifications: picked entries, and the title tip's question answered.
        m_log.SpyParent(m_dialog.m_hWnd, 1);
        m_log.onRecord = [this](int, const MsgEntry& e) {
            if (e.message == WM_COMMAND && (LOWORD(e.wParam) == IDOK || LOWORD(e.wParam) == IDCANCEL))
                m_reports.push_back("dialog command " + std::to_string(LOWORD(e.wParam)));
            // The list view asks for texts itself while it paints: only the title tip's question counts.
            if (e.message != WM_NOTIFY || (e.id != LVN_ENDLABELEDITW && !(e.id == LVN_GETDISPINFOW && m_moving)))
                return;
            NMLVDISPINFOW* info = reinterpret_cast<NMLVDISPINFOW*>(e.lParam);
            m_reports.push_back((e.id == LVN_ENDLABELEDITW ? "end edit w " : "get text w ") + std::to_string(e.wParam)
                + " from " + std::to_string(info->hdr.idFrom) + (info->hdr.hwndFrom == m_list.m_hWnd ? " (list)" : "")
                + " mask " + std::to_string(info->item.mask) + " row " + std::to_string(info->item.iItem) + " column "
                + std::to_string(info->item.iSubItem) + " text " + Narrow(info->item.pszText) + " size "
                + std::to_string(info->item.cchTextMax));
            if (e.id == LVN_GETDISPINFOW && m_answer != nullptr)
                info->item.pszText = const_cast<LPWSTR>(m_answer);
        };
        m_list.SetFocus();
        PumpUntilIdle();
    }
    void TearDown() override
    {
        m_log.Unspy(m_dialog.m_hWnd);
        m_list.DestroyWindow();
        m_dialog.DestroyWindow();
    }

    void Equip(int row, int select = 0, int count = 3) { m_list.SetSubItems(row, count, &m_choices, select); }
    HWND Box(int row) const { return ::GetDlgItem(m_list.m_hWnd, row + kComboBase); }
    CRect RowRect(int row) { CRect rc; m_list.GetItemRect(row, &rc, LVIR_BOUNDS); return rc; }
    CRect BoxRect(HWND box) { CRect rc; ::GetWindowRect(box, &rc); m_list.ScreenToClient(&rc); return rc; }
    // The equipped rows whose boxes are not as they should be: shown and over their cells
    // for the rows in view (to the partly visible one), hidden for the others.
    std::vector<std::string> Misplaced(int rows)
    {
        std::vector<std::string> wrong;
        const int top = m_list.GetTopIndex(), last = top + m_list.GetCountPerPage();
        for (int r = 0; r < rows; ++r)
        {
            const bool inView = r >= top && r <= last;
            const bool shown = (::GetWindowLongW(Box(r), GWL_STYLE) & WS_VISIBLE) != 0;
            const CPoint expected(RowRect(r).left + m_list.GetColumnWidth(0) + 4, RowRect(r).top);
            if (shown != inView || (inView && BoxRect(Box(r)).TopLeft() != expected))
                wrong.push_back(std::to_string(r) + (shown ? " shown at " : " hidden at ") + std::to_string(BoxRect(Box(r)).left)
                                + "," + std::to_string(BoxRect(Box(r)).top));
        }
        return wrong;
    }
    // The host's loop: every framework window from the message's one up takes its look.
    static void PumpApplication()
    {
        const DWORD start = ::GetTickCount();
        MSG msg;
        while (::PeekMessage(&msg, NULL, 0, 0, PM_NOREMOVE) && ::GetTickCount() - start < 1000)
            AfxGetApp()->PumpMessage();
    }

    CDialog m_dialog;
    CTestList m_list;
    CStringArray m_choices;
    MsgLog m_log;
    std::vector<std::string> m_reports;
    LPCWSTR m_answer = nullptr;
    bool m_moving = false;      // the mouse moves over the list
};

TEST_F(ComboListTest, EquippingReplacingAndRemovingARow)
{
    m_list.SetComboBoxColID(-1);
    Equip(2);
    EXPECT_EQ(nullptr, Box(2)) << "no combo column";
    m_list.SetComboBoxColID(kComboColumn);

    // The style asked for; the combo box then hands its border and scroll bars to its list.
    static LONG style = 0;
    const HHOOK hook = ::SetWindowsHookExW(WH_CBT, [](int code, WPARAM wParam, LPARAM lParam) -> LRESULT {
        const CREATESTRUCTW* cs = code == HCBT_CREATEWND ? reinterpret_cast<CBT_CREATEWNDW*>(lParam)->lpcs : nullptr;
        if (cs != nullptr && reinterpret_cast<UINT_PTR>(cs->hMenu) == 2 + kComboBase)
            style = cs->style;
        return ::CallNextHookEx(NULL, code, wParam, lParam);
    }, NULL, ::GetCurrentThreadId());
    Equip(2, 1);
    ::UnhookWindowsHookEx(hook);
    const HWND box = Box(2);
    ASSERT_NE(nullptr, box);
    EXPECT_EQ(m_list.m_hWnd, ::GetParent(box));
    EXPECT_EQ(0x50B00803, style);
    EXPECT_EQ(m_list.SendMessage(WM_GETFONT), ::SendMessageW(box, WM_GETFONT, 0, 0));
    // Entries, the selected one, the last one's data, the list's horizontal extent.
    EXPECT_EQ(testing::PrintToString(std::vector<LRESULT>{ 3, 1, 2, kWidths[kComboColumn] }),
              testing::PrintToString(std::vector<LRESULT>{ ::SendMessageW(box, CB_GETCOUNT, 0, 0),
                  ::SendMessageW(box, CB_GETCURSEL, 0, 0), ::SendMessageW(box, CB_GETITEMDATA, 2, 0),
                  ::SendMessageW(box, CB_GETHORIZONTALEXTENT, 0, 0) }));
    EXPECT_EQ(CPoint(RowRect(2).left + kWidths[0] + 4, RowRect(2).top), BoxRect(box).TopLeft());
    // Known deviation: Wine 8 reads the selection field's height back two pixels higher than set.
    EXPECT_EQ(RowRect(2).Height() - 2 * ::GetSystemMetrics(SM_CXEDGE) + 2, ::SendMessageW(box, CB_GETITEMHEIGHT, -1, 0));

    Equip(2);
    EXPECT_FALSE(::IsWindow(box)) << "replaced";
    ASSERT_NE(nullptr, Box(2));
    const HWND second = Box(2);
    Equip(2, 0, 2);
    EXPECT_FALSE(::IsWindow(second)) << "a count unlike the array's size";
    EXPECT_EQ(nullptr, Box(2));
    Equip(2);
    m_list.SetSubItems(2, 0, NULL, 0);
    EXPECT_EQ(nullptr, Box(2)) << "removed";
    Equip(0x10000);
    EXPECT_EQ(nullptr, Box(0x10000)) << "a row the map cannot hold";

    Equip(kRows - 1);
    EXPECT_FALSE(::GetWindowLongW(Box(kRows - 1), GWL_STYLE) & WS_VISIBLE) << "out of view";
    // A box destroyed by someone else leaves the list: its row is equipped again safely.
    ::DestroyWindow(Box(kRows - 1));
    Equip(kRows - 1);
    EXPECT_NE(nullptr, Box(kRows - 1));

    m_list.SetColumnWidth(kComboColumn, 10);
    Equip(0);
    EXPECT_EQ(::GetSystemMetrics(SM_CXVSCROLL) + 2 * ::GetSystemMetrics(SM_CXEDGE) + 8,
              m_list.GetColumnWidth(kComboColumn)) << "widened";
}

TEST_F(ComboListTest, KeysScrollingAndTheWheelPlaceTheBoxesInView)
{
    m_list.SetColumnWidth(2, 300);   // wider than the list: it scrolls sideways
    for (int r = 0; r < kRows; ++r)
        Equip(r);
    const std::vector<std::string> none;
    EXPECT_EQ(none, Misplaced(kRows)) << "equipped";
    // The first Page Down moves the focus to the page's end, the second scrolls.
    SendKey(m_list.m_hWnd, VK_NEXT);
    SendKey(m_list.m_hWnd, VK_NEXT);
    PumpUntilIdle(1000);
    EXPECT_LT(0, m_list.GetTopIndex());
    EXPECT_EQ(none, Misplaced(kRows)) << "Page Down";
    const int top = m_list.GetTopIndex();
    for (int i = 0; i <= m_list.GetCountPerPage(); ++i)
        SendKey(m_list.m_hWnd, VK_DOWN);
    PumpUntilIdle(1000);
    EXPECT_LT(top, m_list.GetTopIndex());
    EXPECT_EQ(none, Misplaced(kRows)) << "Down";
    m_list.SendMessage(WM_VSCROLL, SB_PAGEDOWN);
    m_list.SendMessage(WM_VSCROLL, SB_ENDSCROLL);
    PumpUntilIdle(1000);
    EXPECT_EQ(none, Misplaced(kRows)) << "scroll bar";
    const int beforeWheel = m_list.GetTopIndex();
    m_list.SendMessage(WM_MOUSEWHEEL, MAKEWPARAM(0, WHEEL_DELTA));
    EXPECT_GT(beforeWheel, m_list.GetTopIndex());
    PumpUntilIdle(1000);
    EXPECT_EQ(none, Misplaced(kRows)) << "wheel";
    const int rowLeft = RowRect(0).left;
    m_list.SendMessage(WM_HSCROLL, SB_PAGERIGHT);
    m_list.SendMessage(WM_HSCROLL, SB_ENDSCROLL);
    EXPECT_GT(rowLeft, RowRect(0).left);
    EXPECT_EQ(none, Misplaced(kRows)) << "sideways";
}

TEST_F(ComboListTest, DividersUpToTheComboColumnReLayTheBoxes)
{
    Equip(0);
    int relays = 0;
    MsgLog list;
    list.SpyWindow(m_list.m_hWnd, 1);
    list.onRecord = [&relays](int, const MsgEntry& e) { relays += e.message == WM_KVX_RESIZECOLUMN; };
    const HWND header = ::GetDlgItem(m_list.m_hWnd, 0);
    // The user drags the divider right of a column 30 pixels to the right.
    auto drag = [&](int column) {
        relays = 0;
        CRect item;
        Header_GetItemRect(header, column, &item);
        const int y = item.CenterPoint().y;
        ::SendMessageW(header, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(item.right - 1, y));
        ::SendMessageW(header, WM_MOUSEMOVE, MK_LBUTTON, PointParam(item.right + 29, y));
        ::SendMessageW(header, WM_LBUTTONUP, 0, PointParam(item.right + 29, y));
        PumpUntilIdle();
        return m_list.GetColumnWidth(column);
    };
    EXPECT_EQ(kWidths[2] + 30, drag(2));
    EXPECT_EQ(0, relays) << "right of the combo column";
    EXPECT_EQ(kWidths[0] + 30, drag(0));
    EXPECT_EQ(2, relays) << "begin and end of the track";
    EXPECT_EQ(RowRect(0).left + kWidths[0] + 30 + 4, BoxRect(Box(0)).left);
    EXPECT_EQ(kWidths[1] + 30, drag(1));
    EXPECT_EQ(2, relays) << "the combo column";
    list.Unspy(m_list.m_hWnd);
}

TEST_F(ComboListTest, PickedEntriesReachTheDialogEnterAndEscDoNot)
{
    Equip(3);
    const HWND box = Box(3);
    ::SetFocus(box);
    SendKey(box, VK_DOWN);
    // Enter and Esc through the host's loop, as typed.
    for (UINT key : { VK_RETURN, VK_ESCAPE })
    {
        ::SetFocus(box);
        ::PostMessageW(box, WM_KEYDOWN, key, 1);
        ::PostMessageW(box, WM_KEYUP, key, 0xC0000001);
        PumpApplication();
        EXPECT_EQ(m_list.m_hWnd, ::GetFocus()) << "key " << key;
    }
    EXPECT_TRUE(m_dialog.IsWindowVisible());
    ::SetFocus(box);
    SendKey(box, VK_DOWN);
    const std::vector<std::string> expected = {
        "end edit w 7 from 5109 (list) mask 1 row 3 column 1 text Doing size 5",
        "end edit w 7 from 5109 (list) mask 1 row 3 column 1 text (null) size 4",
    };
    EXPECT_EQ(expected, m_reports);
}

TEST_F(ComboListTest, TitleTipTextComesFromTheParent)
{
    m_list.EnableTitleTip(true);
    m_list.SetItemText(1, 2, _T("x"));
    const CPoint point(RowRect(1).left + kWidths[0] + kWidths[1] + 10, RowRect(1).top + 3);
    auto tipWidth = [&] {
        m_moving = true;
        m_list.SendMessage(WM_MOUSEMOVE, 0, PointParam(point.x, point.y));
        m_moving = false;
        CRect rc;
        m_list.Tip().GetWindowRect(&rc);
        const bool shown = m_list.Tip().IsWindowVisible() != FALSE;
        m_list.Tip().ShowWindow(SW_HIDE);
        ::ReleaseCapture();
        return shown ? rc.Width() : 0;
    };
    const wchar_t kParentsText[] = L"What the parent keeps for this cell, far longer than it";
    m_answer = kParentsText;
    // The cell's own text fits: only the parent's is cut off.
    EXPECT_LT(kWidths[2], tipWidth()) << "the parent's text over a cell of one letter";

    m_answer = nullptr;
    m_list.SetItemText(1, 2, kParentsText);
    EXPECT_EQ(0, tipWidth()) << "no answer: an empty text";
    const std::vector<std::string> expected(2, "get text w 7 from 7 (list) mask 1 row 1 column 2 text (null) size 0");
    EXPECT_EQ(expected, m_reports);
}

std::string SelectedRows(CListCtrl& list)
{
    std::string rows;
    for (int r = list.GetNextItem(-1, LVNI_SELECTED); r != -1; r = list.GetNextItem(r, LVNI_SELECTED))
        rows += std::to_string(r) + " ";
    return rows;
}

TEST_F(ComboListTest, SelectItemsByStateWithTheFocusedRow)
{
    for (int r : { 1, 2, 5 })
        m_list.SetItemState(r, LVIS_SELECTED, LVIS_SELECTED);
    m_list.SetItemState(3, LVIS_FOCUSED, LVIS_FOCUSED);
    KVXSimpleListControlExItemCommand command(m_list);
    KVXSimpleListControlExItemCommand copy(command);
    EXPECT_TRUE(m_list.IterateItems(&copy));
    EXPECT_EQ("1 2 5 ", SelectedRows(m_list)) << "idle until told what to select";
    command.SelectItemsByState(LVIS_FOCUSED, true);
    EXPECT_EQ("3 ", SelectedRows(m_list));
    command.SelectItemsByState(LVIS_FOCUSED, false);
    EXPECT_EQ("", SelectedRows(m_list));
}

TEST_F(ComboListTest, ListsDestroyedWithOpenBoxesLeaveNothing)
{
    auto cycles = [&](int count) {
        for (int i = 0; i < count; ++i)
        {
            KVXComboBoxListCtrlEx list;
            list.Create(WS_CHILD | WS_VISIBLE | LVS_REPORT, CRect(10, 10, 410, 260), &m_dialog, 8);
            list.InsertColumn(0, _T("Task"), LVCFMT_LEFT, 100, 0);
            list.InsertColumn(1, _T("Status"), LVCFMT_LEFT, 100, 1);
            list.SetRedraw(FALSE);
            for (int r = 0; r < 12; ++r)
                list.InsertItem(r, _T("Task"));
            list.SetRedraw(TRUE);
            list.SetComboBoxColID(1);
            for (int r = 0; r < 12; ++r)
                list.SetSubItems(r, 3, &m_choices, r % 3);
            list.SetSubItems(0, 3, &m_choices, 2);      // re-equipped
            list.SetSubItems(1, 0, NULL, 0);            // removed
            ::SendMessageW(::GetDlgItem(list.m_hWnd, 2 + kComboBase), CB_SHOWDROPDOWN, TRUE, 0);
            list.DestroyWindow();
            PumpUntilIdle(20);
        }
    };
    // A box left behind would leave several heap blocks per cycle.
    orvane_test::ExpectNoLeaks(cycles, 3, 10, 10);
}

} // namespace
