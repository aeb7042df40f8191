// The extended list's geometry without a window, as named tables: the highlight rectangle
// per type; highlighted rows, alignment, image styles, the text rectangle; the column under
// a point (borders, client edge); where a title tip starts; the check-box cycle; the fill
// width; the whole-row repaint.
#include <gtest/gtest.h>

#include "ListGeometry.h"
#include "Checks.h"

#include <commctrl.h>

#include <string>
#include <vector>

using namespace ListGeometry;

namespace {

using orvane_test::CaseName;
using orvane_test::Str;

// Row from 0 to boundsRight, label (34, 20, 100, 37), offset 6, client right 400.
struct HighlightCase { const char* name; int type; int boundsRight; int textWidth; RECT expected; };

const HighlightCase kHighlightCases[] = {
    { "LabelPulledInBehindItsText", kLabelOnly, 300, 30, { 34, 20, 70, 37 } },
    { "LabelWhoseTextFillsItKeepsItsEdge", kLabelOnly, 300, 61, { 34, 20, 100, 37 } },
    { "AllColumnsFromTheLabel", kAllColumns, 300, 30, { 34, 20, 300, 37 } },
    { "WholeRowToTheClientEdge", kWholeRow, 300, 30, { 34, 20, 400, 37 } },
    { "WholeRowOfColumnsWiderThanTheClient", kWholeRow, 500, 30, { 34, 20, 500, 37 } },
    { "NegativeTypeIsTheLabel", -1, 300, 30, { 34, 20, 100, 37 } },
};

class HighlightRectTest : public testing::TestWithParam<HighlightCase> {};

TEST_P(HighlightRectTest, Rectangle)
{
    const HighlightCase& c = GetParam();
    EXPECT_EQ(Str(c.expected), Str(HighlightRect(c.type, { 0, 20, c.boundsRight, 37 }, { 34, 20, 100, 37 }, c.textWidth, 6, 400)));
}

INSTANTIATE_TEST_SUITE_P(Types, HighlightRectTest, testing::ValuesIn(kHighlightCases), CaseName<HighlightCase>);

TEST(ListGeometryTest, HighlightedRows)
{
    const struct { UINT state; bool focus, showSelectionAlways, highlighted; } cases[] = {
        { LVIS_SELECTED, true, false, true }, { LVIS_SELECTED, false, false, false },
        { LVIS_SELECTED, false, true, true }, { LVIS_DROPHILITED, false, false, true },
        { LVIS_FOCUSED, true, true, false },
    };
    for (const auto& c : cases)
        EXPECT_EQ(c.highlighted, IsRowHighlighted(c.state, c.focus, c.showSelectionAlways))
            << "state " << c.state << " focus " << c.focus << " showsel " << c.showSelectionAlways;
}

TEST(ListGeometryTest, AlignmentImageStyleAndTextRectangle)
{
    EXPECT_EQ(static_cast<UINT>(DT_RIGHT), TextAlignment(LVCFMT_RIGHT));
    EXPECT_EQ(static_cast<UINT>(DT_RIGHT), TextAlignment(LVCFMT_RIGHT | LVCFMT_COL_HAS_IMAGES));
    EXPECT_EQ(static_cast<UINT>(DT_CENTER), TextAlignment(LVCFMT_CENTER));
    EXPECT_EQ(static_cast<UINT>(DT_LEFT), TextAlignment(LVCFMT_LEFT | LVCFMT_IMAGE));

    const UINT overlay2 = INDEXTOOVERLAYMASK(2);
    EXPECT_EQ(static_cast<UINT>(ILD_TRANSPARENT | overlay2),
              SmallImageStyle(overlay2 | LVIS_SELECTED | INDEXTOSTATEIMAGEMASK(1), false));
    EXPECT_EQ(static_cast<UINT>(ILD_TRANSPARENT | ILD_BLEND50), SmallImageStyle(LVIS_SELECTED, true));

    EXPECT_EQ(Str({ 126, 20, 194, 37 }), Str(CellTextRect({ 100, 20, 200, 37 }, true, 20, 6)));
    EXPECT_EQ(Str({ 106, 20, 194, 37 }), Str(CellTextRect({ 100, 20, 200, 37 }, false, 20, 6)));
}

// Columns 50, 0, 70 and 40 wide from row left 10: borders at 60, 130 and 170.
struct ColumnCase { const char* name; int x; int clientRight; int column; int left; int right; };

const ColumnCase kColumnCases[] = {
    { "LeftEdgeOfTheRow", 10, kNoClientEdge, 0, 10, 60 },
    { "BorderBelongsToTheLeftColumn", 60, kNoClientEdge, 0, 10, 60 },
    { "ZeroWidthColumnNeverHit", 61, kNoClientEdge, 2, 60, 130 },
    { "LastColumnsRightEdge", 170, kNoClientEdge, 3, 130, 170 },
    { "PastTheLastColumn", 171, kNoClientEdge, -1, 0, 0 },
    { "LeftOfTheRow", 9, kNoClientEdge, -1, 0, 0 },
    { "CellCutAtTheClientEdge", 150, 155, 3, 130, 155 },
    { "OnTheClientEdge", 155, 155, 3, 130, 155 },
    { "RightOfTheClientEdge", 156, 155, -1, 0, 0 },
};

class FindColumnTest : public testing::TestWithParam<ColumnCase> {};

TEST_P(FindColumnTest, Hit)
{
    const ColumnCase& c = GetParam();
    const int widths[] = { 50, 0, 70, 40 };
    const ColumnHit hit = FindColumn(c.x, 10, widths, 4, c.clientRight);
    EXPECT_EQ(testing::PrintToString(std::vector<int>{ c.column, c.left, c.right }),
              testing::PrintToString(std::vector<int>{ hit.column, hit.left, hit.right }));
}

INSTANTIATE_TEST_SUITE_P(Points, FindColumnTest, testing::ValuesIn(kColumnCases), CaseName<ColumnCase>);

TEST(ListGeometryTest, TitleTipStartsAtTheText)
{
    // Cell (100, 20, 200, 37); the first column's label starts at 134.
    const struct { const char* name; int column; int x; bool atText; int textOffset; } cases[] = {
        { "SubItemTextStart", 2, 106, true, 5 },
        { "SubItemBeforeTheText", 2, 105, false, 5 },
        { "LabelTextStart", 0, 137, true, 36 },
        { "LabelBeforeTheText", 0, 136, false, 36 },
    };
    for (const auto& c : cases)
    {
        const TitleTipPlacement tip = PlaceTitleTip(c.column, { 100, 20, 200, 37 }, 134, c.x);
        EXPECT_EQ(std::make_pair(c.atText, c.textOffset), std::make_pair(tip.atText, tip.textOffset)) << c.name;
        EXPECT_EQ(Str({ 100, 19, 200, 37 }), Str(tip.rect)) << c.name;
    }
}

TEST(ListGeometryTest, CheckBoxCycle)
{
    const int cases[][2] = { { 2, 1 }, { 1, 2 }, { 0, 1 }, { 3, 1 } };
    for (const auto& c : cases)
        EXPECT_EQ(c[1], NextCheckBoxImage(c[0])) << "state image " << c[0];
}

TEST(ListGeometryTest, FitColumnGetsTheRestOfTheClient)
{
    const struct { const char* name; std::vector<ColumnFacts> columns; int clientWidth; int column; int width; } cases[] = {
        { "FirstColumnShowsTheItem", { { true, 0, 80 }, { true, 1, 100 }, { true, 2, 50 } }, 400, 0, 250 },
        { "ItemShownByAMovedColumn", { { true, 2, 80 }, { true, 0, 100 }, { true, 1, 50 } }, 400, 1, 270 },
        { "LastSuchColumnWins", { { true, 0, 80 }, { false, 0, 0 }, { true, 1, 50 } }, 400, 1, 350 },
        { "NoneShowsTheItem", { { true, 1, 80 }, { true, 2, 100 } }, 400, 0, 220 },
        { "NothingLeftIsNothing", { { true, 0, 80 }, { true, 1, 399 }, { true, 2, 2 } }, 400, 0, 0 },
    };
    for (const auto& c : cases)
    {
        const FitResult fit = FitColumn(c.columns.data(), static_cast<int>(c.columns.size()), c.clientWidth);
        EXPECT_EQ(std::make_pair(c.column, c.width), std::make_pair(fit.column, fit.width)) << c.name;
    }
}

TEST(ListGeometryTest, WholeRowRepaintReachesTheClientEdge)
{
    const RECT client = { 0, 0, 400, 200 };
    RECT repaint = {};
    EXPECT_FALSE(WholeRowRepaintRect({ 0, 20, 400, 37 }, client, { 10, 20, 50, 37 }, &repaint));
    ASSERT_TRUE(WholeRowRepaintRect({ 0, 20, 300, 37 }, client, { 10, 20, 50, 54 }, &repaint));
    EXPECT_EQ(Str({ 10, 20, 400, 54 }), Str(repaint));
    ASSERT_TRUE(WholeRowRepaintRect({ 0, 20, 300, 37 }, client, { 320, 0, 380, 30 }, &repaint));
    EXPECT_EQ(Str({ 299, 0, 400, 30 }), Str(repaint));
}

} // namespace
