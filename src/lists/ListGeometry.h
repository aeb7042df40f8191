// Geometry of the extended list control without a window: the rectangle a row's
// highlight covers per highlight type, the cell a point falls in, where a cell's text
// goes and where its title tip starts, the check-box state cycle, and the widths that
// make the columns fill the client area.
#pragma once

#include <windows.h>

#include <climits>

namespace ListGeometry {

// Highlight types of SetHighlightType.
enum HighlightType { kLabelOnly = 0, kAllColumns = 1, kWholeRow = 2 };

// The rectangle a row's highlight fills. bounds, label: the row's LVIR_BOUNDS and
// LVIR_LABEL rectangles; textWidth: the width of the row's own text; offset: the text
// margin (two blanks); clientRight: the client area's right edge.
//   kLabelOnly   the label, ending offset behind the text where that is further left;
//   kAllColumns  the bounds from the label's left edge;
//   kWholeRow    as kAllColumns, reaching the client's right edge where that is further right;
//   other types  the label.
RECT HighlightRect(int type, const RECT& bounds, const RECT& label, int textWidth, int offset, int clientRight);

// The highlight shows on a dropped-on row, and on a selected one while the list has the
// focus or keeps its selection visible (LVS_SHOWSELALWAYS).
bool IsRowHighlighted(UINT state, bool hasFocus, bool showSelectionAlways);

// DrawText's alignment for a column format: DT_RIGHT, DT_CENTER or DT_LEFT.
UINT TextAlignment(int format);

// ImageList_Draw's style for a cell's small image: transparent, with the state's overlay
// image, blended while the row is highlighted.
UINT SmallImageStyle(UINT state, bool highlighted);

// Where a cell draws its text: the cell, after imageShift when the cell has an image,
// inset by offset on both sides. imageShift is the width of the row's icon, plus that of
// a state icon when the list has state images (the images of all columns lie that much
// further in, and the text must not cover them).
RECT CellTextRect(const RECT& cell, bool hasImage, int imageShift, int offset);

// The rows a point can fall in: the top row to the one below the last fully visible
// row (partly visible), at most the last row. last < first when there are no rows.
struct RowRange
{
    int first;
    int last;
};

RowRange ScannedRows(int topIndex, int countPerPage, int itemCount);

// The column under x, walking the columns from rowLeft with the given widths. Both
// edges of a column belong to it, so a point on a border is in the left column. With
// clientRight given (not kNoClientEdge), a point right of it is in no column and the
// cell ends at the client's edge.
const int kNoClientEdge = INT_MAX;

struct ColumnHit
{
    int column;     // -1: none
    int left;
    int right;
};

ColumnHit FindColumn(int x, int rowLeft, const int* widths, int count, int clientRight);

// Where the title tip of a cell goes for a mouse move at x: the text starts 6 pixels into
// a sub-item's cell, and 3 pixels into the label of the first column (labelLeft). Before
// the text start there is no tip. The tip gets the cell raised by one pixel and the
// text offset less one.
struct TitleTipPlacement
{
    bool atText;    // x is at or right of the text start
    RECT rect;
    int textOffset;
};

TitleTipPlacement PlaceTitleTip(int column, const RECT& cell, int labelLeft, int x);

// The state image a click on the state icon gives: a checked box (2) or anything but a
// clear one turns clear (1); a clear box turns checked.
int NextCheckBoxImage(int stateImage);

// The column that shows sub-item 0 gets the client width that the other columns leave.
struct ColumnFacts
{
    bool fetched;   // LVM_GETCOLUMN succeeded
    int subItem;
    int width;
};

struct FitResult
{
    int column;
    int width;      // never below 0
};

FitResult FitColumn(const ColumnFacts* columns, int count, int clientWidth);

// For the whole-row highlight: the part of the client that a paint must also cover so
// that the highlight right of the last column is drawn with the rows. Empty (false)
// when the columns reach the client's right edge.
bool WholeRowRepaintRect(const RECT& rowBounds, const RECT& client, const RECT& clipBox, RECT* pRepaint);

} // namespace ListGeometry
