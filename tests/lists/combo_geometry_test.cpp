// The combo list's geometry without a window, as named tables: the combo box over a cell
// (after the image, a scrolled row, the narrow column widened, no such column), the
// drop-down window, the rows in view, and which header notifications move the boxes.
#include <gtest/gtest.h>

#include "ComboListGeometry.h"
#include "Checks.h"

#include <commctrl.h>

#include <string>
#include <vector>

using namespace ComboListGeometry;

namespace {

using orvane_test::Str;

// Rows 17 high from y 40; three columns; edges of 2, a minimum width of 21.
struct ComboRectCase { const char* name; int rowLeft; int secondWidth; int column; int imageWidth; RECT expected; int widenedTo; };

const ComboRectCase kComboRectCases[] = {
    { "FourIntoTheCellEndingThreeShortOfItsWidth", 0, 80, 1, 0, { 104, 40, 181, 53 }, 0 },
    { "AfterTheCellImage", 0, 80, 1, 16, { 120, 40, 197, 53 }, 0 },
    { "FirstColumn", 0, 80, 0, 0, { 4, 40, 101, 53 }, 0 },
    { "RowScrolledLeft", -50, 80, 1, 0, { 54, 40, 131, 53 }, 0 },
    { "MinimumWidthFitsExactly", 0, 24, 1, 0, { 104, 40, 125, 53 }, 0 },
    { "NarrowColumnWidenedToTheMinimumPlusEight", 0, 20, 1, 0, { 104, 40, 130, 53 }, 29 },
    { "ColumnPastTheLast", 0, 80, 3, 0, { 0, 0, 0, 0 }, 0 },
    { "NoColumn", 0, 80, -1, 0, { 0, 0, 0, 0 }, 0 },
};

class ComboRectTest : public testing::TestWithParam<ComboRectCase> {};

TEST_P(ComboRectTest, Rectangle)
{
    const ComboRectCase& c = GetParam();
    const int widths[] = { 100, c.secondWidth, 120 };
    const ComboRect combo = ComboBoxRect({ c.rowLeft, 40, c.rowLeft + 400, 57 }, widths, 3, c.column, c.imageWidth,
                                         MinimumWidth(17, 2), 2);
    EXPECT_EQ(Str(c.expected), Str(combo.rect));
    EXPECT_EQ(c.widenedTo, combo.widen ? combo.widenedWidth : 0);
}

INSTANTIATE_TEST_SUITE_P(Cells, ComboRectTest, testing::ValuesIn(kComboRectCases), orvane_test::CaseName<ComboRectCase>);

TEST(ComboListGeometryTest, WindowsAndRowsInView)
{
    EXPECT_EQ(Str({ 104, 40, 181, 118 }), Str(DropDownWindowRect({ 104, 40, 181, 53 }))) << "six fields high";
    EXPECT_EQ(Str({ 104, 74, 181, 87 }), Str(RowComboRect({ 104, 40, 181, 53 }, 5, 7, 17)));

    // Top row, rows per page, row count: first and last row in view.
    const struct { int top, perPage, count, first, last; } cases[] = {
        { 0, 10, 100, 0, 10 },      // the partly visible row counts
        { 95, 10, 100, 95, 99 },    // at most the last row
        { 0, 10, 0, 0, -1 },        // no rows
    };
    for (const auto& c : cases)
    {
        const RowRange rows = VisibleRows(c.top, c.perPage, c.count);
        EXPECT_EQ(testing::PrintToString(std::vector<int>{ c.first, c.last }),
                  testing::PrintToString(std::vector<int>{ rows.first, rows.last })) << c.top << " " << c.count;
    }
    EXPECT_TRUE(IsInRange({ 3, 13 }, 13));
    EXPECT_FALSE(IsInRange({ 3, 13 }, 14));
}

TEST(ComboListGeometryTest, HeaderNotificationsUpToTheComboColumn)
{
    // Code, header item, combo column, whether the boxes move.
    const struct { UINT code; int item, comboColumn; bool moves; } cases[] = {
        { HDN_ENDTRACKW, 0, 2, true }, { HDN_ENDTRACKA, 2, 2, true }, { HDN_BEGINTRACKW, 1, 2, true },
        { HDN_BEGINTRACKA, 1, 2, true }, { HDN_DIVIDERDBLCLICKW, 2, 2, true }, { HDN_DIVIDERDBLCLICKA, 0, 2, true },
        { HDN_ENDTRACKW, 3, 2, false },                 // right of the combo column
        { HDN_ENDTRACKW, 0, -1, false },                // no combo column
        { HDN_TRACKW, 0, 2, false }, { HDN_ITEMCHANGEDW, 0, 2, false }, { HDN_ITEMCLICKW, 0, 2, false },
    };
    for (const auto& c : cases)
        EXPECT_EQ(c.moves, MovesComboBoxes(c.code, c.item, c.comboColumn))
            << "code " << static_cast<int>(c.code) << " item " << c.item << " combo column " << c.comboColumn;
}

} // namespace
