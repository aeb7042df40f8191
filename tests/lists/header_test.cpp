// The extended header: the sort indicator's place and drop positions as tables; the indicator
// as painted (ascending, descending, right-aligned, too narrow, none) against system colours;
// column drags as step tables (click, release on own and next item, moves both ways, moves
// without the button, dragging disabled).
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "HeaderGeometry.h"
#include "Input.h"
#include "KVXHeaderCtrlEx.h"
#include "Checks.h"
#include "Pixels.h"

#include <memory>
#include <tuple>
#include <utility>
#include <sstream>
#include <string>

using namespace HeaderGeometry;

namespace {

// ---------------------------------------------------------------------------------
// Geometry

// Input: the column's edges, the title's width and alignment, the direction; then the arrow.
struct ArrowCase { const char* name; RECT column; int textWidth; bool rightAligned; bool ascending;
                   bool visible; int x0; int apexY; int baseY; };

const ArrowCase kArrowCases[] = {
    // Inside the 3-pixel margin: left 103, right 197, top 3, bottom 17.
    { "ShortTitleElevenInsideRightEdge", { 100, 0, 200, 20 }, 30, false, true, true, 186, 14, 5 },
    { "LongTitleJustBehindText", { 100, 0, 200, 20 }, 85, false, true, true, 188, 14, 5 },
    { "DescendingPointsUp", { 100, 0, 200, 20 }, 30, false, false, true, 186, 5, 14 },
    { "RightAlignedAtLeftEdge", { 100, 0, 200, 20 }, 30, true, true, true, 103, 14, 5 },
    { "ReachingTheLimitIsTooNarrow", { 0, 0, 100, 20 }, 86, false, true, false, 89, 14, 5 },
    { "OnePixelBeforeTheLimit", { 0, 0, 100, 20 }, 85, false, true, true, 88, 14, 5 },
    { "RightAlignedTooNarrow", { 0, 0, 40, 20 }, 28, true, true, false, 3, 14, 5 },
};

class SortArrowTest : public testing::TestWithParam<ArrowCase> {};

TEST_P(SortArrowTest, Placement)
{
    const ArrowCase& c = GetParam();
    const SortArrow arrow = PlaceSortArrow(c.column, c.textWidth, c.rightAligned, c.ascending);
    EXPECT_EQ(testing::PrintToString(std::make_tuple(c.visible, c.x0, c.x0 + 4, c.apexY, c.baseY)),
        testing::PrintToString(std::make_tuple(arrow.visible, arrow.x0, arrow.apexX, arrow.apexY, arrow.baseY)));
}

INSTANTIATE_TEST_SUITE_P(Cases, SortArrowTest, testing::ValuesIn(kArrowCases), orvane_test::CaseName<ArrowCase>);

TEST(DropPositionTest, ItemUnderThePointerOrTheEnd)
{
    const int widths[] = { 50, 0, 70, 30 };
    struct { int x; int position; int edge; } cases[] = {
        { -5, 0, 0 }, { 0, 0, 0 }, { 49, 0, 0 },
        { 50, 2, 50 },      // a zero-width item is never under the pointer
        { 119, 2, 50 }, { 120, 3, 120 }, { 149, 3, 120 }, { 150, 4, 150 }, { 900, 4, 150 },
    };
    for (const auto& c : cases)
    {
        const DropPosition drop = FindDropPosition(c.x, widths, 4);
        EXPECT_EQ(std::make_pair(c.position, c.edge), std::make_pair(drop.position, drop.edge)) << "x " << c.x;
    }
    EXPECT_EQ(0, FindDropPosition(10, widths, 0).position);
}

// ---------------------------------------------------------------------------------
// A header on screen with four items: Name, Size (right-aligned), Type (too narrow
// for title and indicator) and Date.

const LPCTSTR kTitles[] = { _T("Name"), _T("Size"), _T("Type"), _T("Date") };

class CDragRecorder : public CWnd
{
public:
    void OnColumnDragged(int nItem, int nPosition)
    {
        m_trace += "(" + std::to_string(nItem) + "," + std::to_string(nPosition) + ")";
    }
    std::string m_trace;
};

class HeaderFixture : public testing::Test
{
protected:
    void SetUp() override
    {
        m_host.reset(new orvane_test::HostWindow(600, 200));
        ASSERT_TRUE(m_header.Create(WS_CHILD | WS_VISIBLE | HDS_HORZ | HDS_BUTTONS, CRect(0, 0, 560, 24),
            CWnd::FromHandle(*m_host), 10));
        const int widths[] = { 120, 100, TitleWidth(kTitles[2]) + 12, 100 };
        for (int i = 0; i < 4; ++i)
        {
            HDITEM item = {};
            item.mask = HDI_TEXT | HDI_WIDTH | HDI_FORMAT;
            item.pszText = const_cast<LPTSTR>(kTitles[i]);
            item.cxy = widths[i];
            item.fmt = (i == 1 ? HDF_RIGHT : HDF_LEFT) | HDF_STRING;
            m_header.InsertItem(i, &item);
        }
        m_header.SetCallback(&m_recorder, static_cast<void (CWnd::*)(int, int)>(&CDragRecorder::OnColumnDragged));
    }

    void TearDown() override
    {
        m_header.DestroyWindow();
        m_host.reset();
    }

    // Measured like the header measures: in its client DC as it comes.
    int TitleWidth(LPCTSTR title)
    {
        HDC dc = ::GetDC(m_header);
        SIZE size = {};
        ::GetTextExtentPoint32W(dc, title, lstrlen(title), &size);
        ::ReleaseDC(m_header, dc);
        return size.cx;
    }

    CRect ItemRect(int item)
    {
        CRect rc;
        m_header.GetItemRect(item, &rc);
        return rc;
    }

    std::unique_ptr<orvane_test::HostWindow> m_host;
    KVXHeaderCtrlEx m_header;
    CDragRecorder m_recorder;
};

// ---------------------------------------------------------------------------------
// The indicator as painted

struct PaintCase { const char* name; int column; bool ascending; bool drawn; };

const PaintCase kPaintCases[] = {
    { "Ascending", 0, true, true },
    { "Descending", 0, false, true },
    { "RightAligned", 1, true, true },
    { "TooNarrow", 2, true, false },
    { "NoneForMinusOne", -1, true, false },
    { "NoneOutOfRange", 4, true, false },
};

// The header's themed face is white like COLOR_3DHILIGHT: both edge colours are made
// distinct from it while the test runs.
class EdgeColorsGuard
{
public:
    EdgeColorsGuard() : m_saved{ ::GetSysColor(COLOR_3DDKSHADOW), ::GetSysColor(COLOR_3DHILIGHT) }
    {
        const COLORREF colors[2] = { RGB(128, 0, 0), RGB(0, 160, 0) };
        ::SetSysColors(2, kElements, colors);
    }
    ~EdgeColorsGuard() { ::SetSysColors(2, kElements, m_saved); }

private:
    static constexpr INT kElements[2] = { COLOR_3DDKSHADOW, COLOR_3DHILIGHT };
    COLORREF m_saved[2];
};

class SortIndicatorPaintTest : public HeaderFixture, public testing::WithParamInterface<PaintCase>
{
protected:
    EdgeColorsGuard m_colors;
};

TEST_P(SortIndicatorPaintTest, Pixels)
{
    const PaintCase& c = GetParam();
    m_header.SendMessage(WM_KVX_SETSORTEDCOLUMN, static_cast<WPARAM>(-1), 1);
    orvane_test::ClientCapture unsorted(m_header);
    m_header.SendMessage(WM_KVX_SETSORTEDCOLUMN, static_cast<WPARAM>(c.column), c.ascending);
    orvane_test::ClientCapture sorted(m_header);

    if (!c.drawn)
    {
        int changed = 0;
        for (int y = 0; y < sorted.height(); ++y)
            for (int x = 0; x < sorted.width(); ++x)
                changed += sorted.At(x, y) != unsorted.At(x, y) ? 1 : 0;
        EXPECT_EQ(0, changed);
        return;
    }
    const SortArrow arrow = PlaceSortArrow(ItemRect(c.column), TitleWidth(kTitles[c.column]), c.column == 1,
        c.ascending);
    ASSERT_TRUE(arrow.visible);
    const COLORREF dark = ::GetSysColor(COLOR_3DDKSHADOW);
    const COLORREF light = ::GetSysColor(COLOR_3DHILIGHT);
    EXPECT_EQ(dark, sorted.At(arrow.x0, arrow.baseY));                   // left edge starts dark
    EXPECT_EQ(light, sorted.At(arrow.apexX, arrow.apexY));               // right edge light from the apex
    EXPECT_EQ(c.ascending ? dark : light, sorted.At(arrow.x0 + 4, arrow.baseY));
    EXPECT_NE(sorted.At(arrow.apexX, arrow.apexY), unsorted.At(arrow.apexX, arrow.apexY));
}

INSTANTIATE_TEST_SUITE_P(Cases, SortIndicatorPaintTest, testing::ValuesIn(kPaintCases), orvane_test::CaseName<PaintCase>);

// ---------------------------------------------------------------------------------
// Column dragging. Steps: dN press on item N, mN move there with the button held,
// hN move there without a button, uN release there; E is right of the last item.

// trace: the callback's calls.
struct DragCase { const char* name; const char* steps; bool enabled; const char* trace; };

// The first move with the button held starts the drag; later moves mark positions.
const DragCase kDragCases[] = {
    { "ClickWithoutMove", "d0 u0", true, "" },
    { "ReleaseOnOwnItem", "d1 m1 m2 m1 u1", true, "" },
    { "ReleaseOnNextItem", "d0 m0 m1 u1", true, "" },
    { "TwoToTheRight", "d0 m0 m1 m2 u2", true, "(0,2)" },
    { "ToTheFront", "d2 m2 m0 u0", true, "(2,0)" },
    { "PastTheLastItem", "d1 m1 mE uE", true, "(1,4)" },
    { "MoveWithoutButtonEndsTheDrag", "d0 m0 m2 h2 m3 u3", true, "" },
    { "MoveWithoutButtonDisarms", "d0 h0 m0 m2 u2", true, "" },
    { "ClickDisarms", "d0 u0 m1 m2 u2", true, "" },
    { "DraggingDisabled", "d0 m0 m2 u2", false, "" },
};

class ColumnDragTest : public HeaderFixture, public testing::WithParamInterface<DragCase> {};

TEST_P(ColumnDragTest, Callbacks)
{
    const DragCase& c = GetParam();
    EXPECT_FALSE(m_header.EnableDrag(c.enabled));
    const int y = ItemRect(0).CenterPoint().y;
    std::istringstream steps(c.steps);
    std::string step;
    while (steps >> step)
    {
        const int x = step[1] == 'E' ? ItemRect(3).right + 10 : ItemRect(step[1] - '0').CenterPoint().x;
        switch (step[0])
        {
        case 'd': m_header.SendMessage(WM_LBUTTONDOWN, MK_LBUTTON, orvane_test::PointParam(x, y)); break;
        case 'm': m_header.SendMessage(WM_MOUSEMOVE, MK_LBUTTON, orvane_test::PointParam(x, y)); break;
        case 'h': m_header.SendMessage(WM_MOUSEMOVE, 0, orvane_test::PointParam(x, y)); break;
        case 'u': m_header.SendMessage(WM_LBUTTONUP, 0, orvane_test::PointParam(x, y)); break;
        }
    }
    EXPECT_EQ(c.trace, m_recorder.m_trace);
    EXPECT_EQ(nullptr, ::GetCapture());
}

INSTANTIATE_TEST_SUITE_P(Cases, ColumnDragTest, testing::ValuesIn(kDragCases), orvane_test::CaseName<DragCase>);

} // namespace
