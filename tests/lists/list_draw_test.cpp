// The extended list on screen under a framework parent: highlight pixels per type, focus and
// LVS_SHOWSELALWAYS; the invalid colour, images, the ellipsis; the abbreviate callback; no
// repaint for focus into a child edit; hit tests; the fill width; check boxes; IterateItems;
// title tips over cut-off cells; painted lists made and destroyed many times, no leaks.
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "Input.h"
#include "KVXListCtrlEx.h"
#include "Checks.h"
#include "Pixels.h"

#include <string>
#include <tuple>
#include <vector>

namespace {

using namespace orvane_test;
using orvane_test::Narrow;

// The list's parent: a framework window, so that WM_DRAWITEM is reflected to the list, and
// the target of the abbreviate callback.
class CParent : public CWnd
{
public:
    CParent()
    {
        CreateEx(0, AfxRegisterWndClass(0), _T("list host"), WS_POPUP | WS_VISIBLE | WS_CLIPCHILDREN,
                 CRect(100, 100, 600, 400), NULL, 0);
    }
    // Texts starting with '~' are shortened to nothing.
    CString Abbreviate(CString text, int first, int second)
    {
        m_calls.push_back(Narrow(text) + " " + std::to_string(first) + " " + std::to_string(second));
        return text.Left(1) == _T("~") ? CString() : text;
    }
    std::vector<std::string> m_calls;
};

class CTestList : public KVXListCtrlEx
{
public:
    KVXTitleTipCtrl& Tip() { return m_ctlTitleTip; }
    void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct) override
    {
        m_entireDraws += lpDrawItemStruct->itemAction == ODA_DRAWENTIRE;
        KVXListCtrlEx::DrawItem(lpDrawItemStruct);
    }
    int m_entireDraws = 0;
};

const COLORREF kInvalid = RGB(255, 0, 0);   // the list's default invalid colour
const wchar_t kLongText[] = L"A text far too long for its column";

// Three columns of 100 in a list 400 wide: the rows end before the client's edge.
const LPCTSTR kCells[3][3] = {
    { _T("Alpha"), _T("One"), _T("") },
    { _T("Beta"), _T("Two"), _T("Three") },
    { kLongText, kLongText, _T("~hidden") },
};

class ListDrawTest : public testing::Test
{
protected:
    void SetUp() override
    {
        ::SetForegroundWindow(m_parent.m_hWnd);
        ::SetCursorPos(50, 900);   // away from the list
        ASSERT_TRUE(m_list.Create(WS_CHILD | WS_VISIBLE | LVS_REPORT | LVS_OWNERDRAWFIXED, CRect(10, 10, 410, 250),
                                  &m_parent, 7));
        for (int c = 0; c < 3; ++c)
            m_list.InsertColumn(c, _T("Column"), LVCFMT_LEFT, 100, c);
        m_list.SetRedraw(FALSE);
        for (int r = 0; r < 3; ++r)
        {
            m_list.InsertItem(r, kCells[r][0]);
            for (int c = 1; c < 3; ++c)
                m_list.SetItemText(r, c, kCells[r][c]);
        }
        m_list.SetRedraw(TRUE);
        m_parent.SetFocus();
        PumpUntilIdle();
    }
    void TearDown() override { m_list.DestroyWindow(); }

    CRect Rect(int row, UINT code) { CRect rc; m_list.GetItemRect(row, &rc, code); return rc; }
    CRect Cell(int row, int column)
    {
        const CRect bounds = Rect(row, LVIR_BOUNDS);
        return CRect(bounds.left + 100 * column, bounds.top, bounds.left + 100 * (column + 1), bounds.bottom);
    }
    static COLORREF Sys(int index) { return ::GetSysColor(index); }
    void Select(int row) { m_list.SetItemState(row, LVIS_SELECTED | LVIS_FOCUSED, LVIS_SELECTED | LVIS_FOCUSED); }
    // An image list whose images (count of them) are one solid colour.
    void SolidImages(CImageList& images, COLORREF colour, int count = 1)
    {
        CClientDC screen(&m_list);
        CDC dc;
        dc.CreateCompatibleDC(&screen);
        CBitmap bitmap;
        bitmap.CreateCompatibleBitmap(&screen, 16 * count, 16);
        CBitmap* old = dc.SelectObject(&bitmap);
        dc.FillSolidRect(0, 0, 16 * count, 16, colour);
        dc.SelectObject(old);
        images.Create(16, 16, ILC_COLOR24 | ILC_MASK, count, 0);
        images.Add(&bitmap, Sys(COLOR_WINDOWTEXT));
    }
    // Pixels of a cell that are not the window colour (its text, its images).
    int Ink(const ClientCapture& capture, int row, int column)
    {
        const CRect cell = Cell(row, column);
        return cell.Width() * cell.Height() - capture.Count(cell, Sys(COLOR_WINDOW));
    }

    CParent m_parent;
    CTestList m_list;
};

TEST_F(ListDrawTest, HighlightTypeSetting)
{
    m_list.ModifyStyle(LVS_OWNERDRAWFIXED, 0);
    // Argument, previous type returned, owner-drawn afterwards.
    const struct { int type, previous; bool ownerDrawn; } steps[] = { { 3, 0, false }, { -1, 0, false },
        { 2, -1, true }, { 3, 2, true }, { 0, 2, true } };
    for (const auto& step : steps)
    {
        EXPECT_EQ(step.previous, m_list.SetHighlightType(step.type)) << step.type;
        EXPECT_EQ(step.ownerDrawn, (m_list.GetStyle() & LVS_OWNERDRAWFIXED) != 0) << step.type;
    }
}

TEST_F(ListDrawTest, HighlightPerTypeFocusAndShowSelectionAlways)
{
    Select(1);
    CRect client;
    m_list.GetClientRect(&client);
    const CRect label = Rect(1, LVIR_LABEL);
    const int y = label.top + 1;   // above the text, inside any focus rectangle
    // Points: in the label, in the second column, right of the last column.
    const struct { int type; bool focus, showSelectionAlways; bool inLabel, inColumn, inStrip; } cases[] = {
        { 0, true, false, true, false, false },
        { 0, false, false, false, false, false },
        { 0, false, true, true, false, false },
        { 1, true, false, true, true, false },
        { 1, false, false, false, false, false },
        { 1, false, true, true, true, false },
        { 2, true, false, true, true, true },
        { 2, false, false, false, false, false },
        { 2, false, true, true, true, true },
    };
    for (const auto& c : cases)
    {
        SCOPED_TRACE(testing::Message() << "type " << c.type << " focus " << c.focus << " showsel " << c.showSelectionAlways);
        m_list.SetHighlightType(c.type);
        m_list.ModifyStyle(c.showSelectionAlways ? 0 : LVS_SHOWSELALWAYS, c.showSelectionAlways ? LVS_SHOWSELALWAYS : 0);
        c.focus ? m_list.SetFocus() : m_parent.SetFocus();
        const ClientCapture capture(m_list);
        auto expected = [](bool highlighted) { return Sys(highlighted ? COLOR_HIGHLIGHT : COLOR_WINDOW); };
        EXPECT_EQ(expected(c.inLabel), capture.At(label.left + 2, y));
        EXPECT_EQ(expected(c.inColumn), capture.At(150, y));
        EXPECT_EQ(expected(c.inStrip), capture.At(client.right - 3, y));
    }

    // Selecting another row invalidates its columns only; the whole row is drawn anyway.
    m_list.SetFocus();
    Select(0);
    m_list.SetItemState(1, 0, LVIS_SELECTED);
    m_list.UpdateWindow();
    CClientDC dc(&m_list);
    EXPECT_EQ(Sys(COLOR_HIGHLIGHT), dc.GetPixel(client.right - 3, Rect(0, LVIR_BOUNDS).top + 1));
    EXPECT_EQ(Sys(COLOR_WINDOW), dc.GetPixel(client.right - 3, y));

    // The focused row of this three-column list has its focus rectangle on the highlight's edge.
    const ClientCapture capture(m_list);
    const CRect top(label.left, Rect(0, LVIR_BOUNDS).top, client.right, Rect(0, LVIR_BOUNDS).top + 1);
    EXPECT_LT(0, top.Width() - capture.Count(top, Sys(COLOR_HIGHLIGHT))) << "dotted frame";
}

TEST_F(ListDrawTest, InvalidColourImagesAndEllipsis)
{
    m_list.SetItemState(0, LVIS_GLOW, LVIS_GLOW);
    m_list.SetItemState(1, LVIS_GLOW, LVIS_GLOW);
    Select(1);
    m_list.SetFocus();
    {
        const ClientCapture capture(m_list);
        EXPECT_LT(0, capture.Count(Cell(0, 0), kInvalid)) << "type 0: first column";
        EXPECT_EQ(0, capture.Count(Cell(0, 1), kInvalid)) << "type 0: second column";
        EXPECT_EQ(0, capture.Count(Cell(1, 0), kInvalid)) << "highlighted";
        EXPECT_LT(0, capture.Count(Cell(1, 0), Sys(COLOR_HIGHLIGHTTEXT)));
    }
    m_list.SetHighlightType(1);
    {
        const ClientCapture capture(m_list);
        EXPECT_LT(0, capture.Count(Cell(0, 1), kInvalid)) << "type 1: second column";
    }

    // The ellipsis: the cut-off cell looks like a cell showing what the system's end
    // ellipsis makes of its text in the cell's text rectangle.
    {
        CClientDC dc(&m_list);
        CFont* oldFont = dc.SelectObject(m_list.GetFont());
        CRect text = Cell(2, 1);
        text.DeflateRect(2 * dc.GetTextExtent(_T(" ")).cx, 0);
        wchar_t shown[64] = {};
        wcscpy(shown, kLongText);
        dc.DrawText(shown, -1, &text, DT_SINGLELINE | DT_VCENTER | DT_NOPREFIX | DT_END_ELLIPSIS | DT_MODIFYSTRING);
        dc.SelectObject(oldFont);
        EXPECT_EQ(L"...", std::wstring(shown).substr(wcslen(shown) - 3));
        m_list.SetItemText(0, 1, shown);
        const ClientCapture capture(m_list);
        int differing = 0;
        for (int y = 0; y < Cell(0, 1).Height(); ++y)
            for (int x = Cell(0, 1).left; x < Cell(0, 1).right; ++x)
                differing += (capture.At(x, Cell(0, 1).top + y) == Sys(COLOR_WINDOW)) != (capture.At(x, Cell(2, 1).top + y) == Sys(COLOR_WINDOW));
        EXPECT_EQ(0, differing) << "pixels unlike \"" << Narrow(CString(shown)) << "\"";
    }

    // Images: a state image list and a small one, each image one solid system colour.
    const COLORREF stateColour = Sys(COLOR_INFOBK), smallColour = Sys(COLOR_BTNSHADOW);
    CImageList states, smalls;
    SolidImages(states, stateColour);
    SolidImages(smalls, smallColour);
    m_list.SetImageList(&states, LVSIL_STATE);
    m_list.SetImageList(&smalls, LVSIL_SMALL);
    m_list.SetItemState(0, INDEXTOSTATEIMAGEMASK(1), LVIS_STATEIMAGEMASK);
    for (int r = 0; r < 2; ++r)
        m_list.SetItem(r, 1, LVIF_IMAGE, NULL, 0, 0, 0, 0);
    const CRect icon = Rect(0, LVIR_ICON);
    const int y = icon.top + 8;
    {
        const ClientCapture capture(m_list);
        EXPECT_EQ(stateColour, capture.At(Cell(0, 0).left + 8, y));
        EXPECT_EQ(smallColour, capture.At(icon.left + 8, y)) << "the row's image";
        EXPECT_EQ(Sys(COLOR_WINDOW), capture.At(icon.left + 108, y)) << "no sub-item images";
    }
    m_list.SetExtendedStyle(LVS_EX_SUBITEMIMAGES);
    {
        const ClientCapture capture(m_list);
        EXPECT_EQ(smallColour, capture.At(icon.left + 108, y));
        // Known deviation: Wine 8's ImageList_Draw ignores ILD_BLEND50 (the style is in the
        // geometry table), so the highlighted row's image shows unblended.
        EXPECT_EQ(smallColour, capture.At(icon.left + 108, Rect(1, LVIR_ICON).top + 8)) << "highlighted row";
    }
    m_list.SetImageList(NULL, LVSIL_STATE);
    m_list.SetImageList(NULL, LVSIL_SMALL);
}

TEST_F(ListDrawTest, AbbreviateCallbackGetsEveryNonEmptyText)
{
    m_list.SetAbbreviateName(static_cast<CString (CWnd::*)(CString, int, int)>(&CParent::Abbreviate));
    const ClientCapture capture(m_list);
    const std::string longText = Narrow(kLongText);
    const std::vector<std::string> expected = { "Alpha 40 1", "One 40 1", "Beta 40 1", "Two 40 1", "Three 40 1",
        longText + " 40 1", longText + " 40 1", "~hidden 40 1" };
    EXPECT_EQ(expected, m_parent.m_calls);
    EXPECT_EQ(0, Ink(capture, 2, 2)) << "the callback's empty result is drawn";
    EXPECT_LT(0, Ink(capture, 1, 2));
    m_list.SetAbbreviateName(NULL);
    EXPECT_LT(0, Ink(ClientCapture(m_list), 2, 2)) << "switched off";
}

TEST_F(ListDrawTest, FocusIntoAChildEditRepaintsNothing)
{
    Select(1);
    CWnd edit;
    edit.Create(_T("EDIT"), _T(""), WS_CHILD | WS_VISIBLE, CRect(0, 0, 60, 20), &m_list, 1);
    m_list.SetFocus();
    PumpUntilIdle();
    // Repainting happens at once, before anything is pumped.
    m_list.m_entireDraws = 0;
    edit.SetFocus();
    EXPECT_EQ(0, m_list.m_entireDraws);
    m_list.SetFocus();
    EXPECT_EQ(0, m_list.m_entireDraws);
    m_parent.SetFocus();
    EXPECT_LT(0, m_list.m_entireDraws);
    edit.DestroyWindow();
}

TEST_F(ListDrawTest, CellsUnderPoints)
{
    // The client holds ten and a half rows below the header; the last column reaches past it.
    const int rowHeight = Rect(0, LVIR_BOUNDS).Height();
    const int headerHeight = Rect(0, LVIR_BOUNDS).top;
    m_list.SetWindowPos(NULL, 0, 0, 250, headerHeight + 10 * rowHeight + rowHeight / 2 + ::GetSystemMetrics(SM_CYHSCROLL),
                        SWP_NOMOVE | SWP_NOZORDER);
    m_list.SetRedraw(FALSE);
    for (int r = 3; r < 20; ++r)
        m_list.InsertItem(r, _T("more"));
    m_list.SetRedraw(TRUE);
    CRect client;
    m_list.GetClientRect(&client);
    ASSERT_EQ(10, m_list.GetCountPerPage());
    EXPECT_EQ(3, m_list.GetColumnCount());

    const struct { CPoint point; int row, column; CRect cell; int rowEx, columnEx; } cases[] = {
        { CPoint(100, Cell(1, 0).top), 1, 0, Cell(1, 0), 1, 0 },                     // on the border
        { CPoint(5, Cell(10, 0).top + 1), 10, 0, Cell(10, 0), 10, 0 },               // partly visible
        { CPoint(client.right - 1, Cell(2, 0).top), 2, 2, CRect(200, Cell(2, 0).top, client.right, Cell(2, 0).bottom), 2, 2 },
        { CPoint(client.right + 5, Cell(2, 0).top), -1, 99, CRect(), 2, 2 },         // right of the client
    };
    for (const auto& c : cases)
    {
        CPoint point = c.point;
        CRect cell;
        int column = 99, columnEx = 99;
        const int row = m_list.CellRectFromPoint(point, &cell, &column);
        const int rowEx = m_list.HitTestEx(point, &columnEx);
        EXPECT_EQ(testing::PrintToString(std::make_tuple(c.row, c.column, c.rowEx, c.columnEx)),
                  testing::PrintToString(std::make_tuple(row, column, rowEx, columnEx))) << point.x << "," << point.y;
        EXPECT_TRUE(row == -1 || cell == c.cell) << cell.left << "," << cell.top << "," << cell.right << "," << cell.bottom;
    }

    // Below the last row, then outside report view.
    for (int r = m_list.GetItemCount() - 1; r >= 3; --r)
        m_list.DeleteItem(r);
    CPoint below(5, Cell(2, 0).bottom + 1);
    int column = 99;
    EXPECT_EQ(-1, m_list.CellRectFromPoint(below, NULL, &column));
    EXPECT_EQ(-1, m_list.HitTestEx(below, &column));
    m_list.ModifyStyle(LVS_TYPEMASK, LVS_LIST);
    CPoint onItem = Rect(1, LVIR_LABEL).CenterPoint();
    EXPECT_EQ(-1, m_list.CellRectFromPoint(onItem, NULL, &column));
    column = 99;
    EXPECT_EQ(1, m_list.HitTestEx(onItem, &column));
    EXPECT_EQ(0, column);
    m_list.ModifyStyle(LVS_TYPEMASK, LVS_REPORT);

    m_list.GetClientRect(&client);   // no vertical scroll bar any more
    m_list.ResizeColumnsToFit();
    EXPECT_EQ(client.Width() - 200, m_list.GetColumnWidth(0));
    EXPECT_FALSE(m_list.EnableHeaderDrag(true));
    EXPECT_TRUE(m_list.EnableHeaderDrag(false));
}

TEST_F(ListDrawTest, StateIconClicksToggleCheckBoxes)
{
    CImageList states;
    SolidImages(states, Sys(COLOR_INFOBK), 3);
    m_list.SetImageList(&states, LVSIL_STATE);
    m_list.SetExtendedStyle(LVS_EX_FULLROWSELECT);
    m_list.SetItemState(1, INDEXTOSTATEIMAGEMASK(2), LVIS_STATEIMAGEMASK);
    auto click = [&](CPoint point) {
        m_list.PostMessage(WM_LBUTTONUP, 0, PointParam(point.x, point.y));
        m_list.SendMessage(WM_LBUTTONDOWN, MK_LBUTTON, PointParam(point.x, point.y));
        PumpUntilIdle();
        return static_cast<int>(m_list.GetItemState(1, LVIS_STATEIMAGEMASK) >> 12);
    };
    const CPoint stateIcon(Cell(1, 0).left + 8, Cell(1, 0).CenterPoint().y);
    EXPECT_EQ(1, click(stateIcon));
    EXPECT_EQ(2, click(stateIcon));
    EXPECT_EQ(2, click(Cell(1, 1).CenterPoint())) << "a sub-item of a fully selected row";
    m_list.SetImageList(NULL, LVSIL_STATE);
}

// Visits rows into a trace; returns false at stopAt, or clears the flag at clearAt.
struct CTraceCommand : KVXListCtrlExItemCommand
{
    CTraceCommand(int stopAt, int clearAt) : m_stopAt(stopAt), m_clearAt(clearAt) {}
    bool DoForItem(int nItem, bool& bContinue) override
    {
        m_trace += std::to_string(nItem);
        bContinue = nItem != m_clearAt;
        return nItem != m_stopAt;
    }
    int m_stopAt, m_clearAt;
    std::string m_trace;
};

TEST_F(ListDrawTest, IterateItemsStops)
{
    const struct { int stopAt, clearAt; bool result; const char* trace; } cases[] = {
        { -1, -1, true, "012" }, { 1, -1, false, "01" }, { -1, 0, true, "0" },
    };
    for (const auto& c : cases)
    {
        CTraceCommand command(c.stopAt, c.clearAt);
        EXPECT_EQ(c.result, m_list.IterateItems(&command)) << c.trace;
        EXPECT_EQ(c.trace, command.m_trace);
    }
    EXPECT_FALSE(m_list.IterateItems(NULL));
    m_list.DeleteAllItems();
    CTraceCommand command(0, 0);
    EXPECT_TRUE(m_list.IterateItems(&command)) << "no rows";
}

TEST_F(ListDrawTest, TitleTipOverCutOffCells)
{
    m_list.EnableTitleTip(true);
    m_list.SetFocus();
    const HWND hTip = m_list.Tip().m_hWnd;
    ASSERT_NE(nullptr, hTip);
    auto shownAt = [&](CPoint point, UINT flags = 0) {
        m_list.SendMessage(WM_MOUSEMOVE, flags, PointParam(point.x, point.y));
        CRect rc;
        m_list.Tip().GetWindowRect(&rc);
        m_list.ScreenToClient(&rc);
        const bool shown = m_list.Tip().IsWindowVisible() != FALSE;
        m_list.Tip().ShowWindow(SW_HIDE);
        ::ReleaseCapture();
        return shown ? rc.TopLeft() : CPoint(-1, -1);
    };
    const CRect cut = Cell(2, 1), label = Rect(2, LVIR_LABEL);
    EXPECT_EQ(CPoint(cut.left + 5, cut.top - 1), shownAt(CPoint(cut.left + 6, cut.top + 3)));
    EXPECT_EQ(CPoint(label.left + 2, cut.top - 1), shownAt(CPoint(label.left + 3, cut.top + 3))) << "first column";
    EXPECT_EQ(CPoint(-1, -1), shownAt(Cell(0, 1).CenterPoint())) << "fits";
    EXPECT_EQ(CPoint(-1, -1), shownAt(cut.CenterPoint(), MK_LBUTTON)) << "button held";
    m_list.EnableTitleTip(false);
    EXPECT_EQ(CPoint(-1, -1), shownAt(cut.CenterPoint())) << "disabled";
    m_list.EnableTitleTip(true);
    EXPECT_EQ(hTip, m_list.Tip().m_hWnd) << "enabled again: the same window";
    EXPECT_NE(CPoint(-1, -1), shownAt(cut.CenterPoint()));
    m_list.DestroyWindow();
    EXPECT_FALSE(::IsWindow(hTip)) << "the tip goes with the list";
}

TEST_F(ListDrawTest, PaintedListsLeaveNothingBehind)
{
    auto cycles = [&](int count) {
        for (int i = 0; i < count; ++i)
        {
            CTestList list;
            list.Create(WS_CHILD | WS_VISIBLE | LVS_REPORT | LVS_OWNERDRAWFIXED, CRect(10, 10, 410, 250), &m_parent, 8);
            list.InsertColumn(0, _T("Column"), LVCFMT_LEFT, 60);
            list.SetRedraw(FALSE);
            for (int r = 0; r < 3; ++r)
                list.InsertItem(r, kLongText);
            list.SetRedraw(TRUE);
            list.SetHighlightType(i % 3);
            list.SetItemState(1, LVIS_SELECTED | LVIS_FOCUSED | LVIS_GLOW, 0xFF);
            list.EnableTitleTip(true);
            list.SetFocus();
            list.RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
            CRect row;
            list.GetItemRect(1, &row, LVIR_BOUNDS);
            list.SendMessage(WM_MOUSEMOVE, 0, PointParam(row.left + 30, row.top + 3));
            EXPECT_TRUE(list.Tip().IsWindowVisible()) << "cycle " << i;
            list.DestroyWindow();
            PumpUntilIdle(20);
            CWnd::DeleteTempMap();
            CDC::DeleteTempMap();
            CGdiObject::DeleteTempMap();
        }
    };
    orvane_test::ExpectNoLeaks(cycles, 5, 25, 10);
}

} // namespace
