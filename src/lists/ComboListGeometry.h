// Geometry of the combo list without a window: where a row's combo box lies over its
// cell (and when the combo column must widen to hold it), the rows whose combo boxes
// show, and which header notifications move the combo boxes.
#pragma once

#include <windows.h>

namespace ComboListGeometry {

// A combo box needs room for its drop-down button: a scroll bar's width and two edges.
int MinimumWidth(int cxVScroll, int cxEdge);

struct ComboRect
{
    RECT rect;          // empty when there is no such column
    bool widen;         // the combo column must get widenedWidth first
    int widenedWidth;
};

// The combo box over a cell. rowBounds: the row's LVIR_BOUNDS; widths: the column widths
// in index order (count of them); imageWidth: the width of the cell's image (0 without).
// The box starts 4 pixels into the cell, after the image, and ends 3 pixels before the
// column's width from there; its selection field leaves two edges of the row free below.
// A column too narrow for minWidth is widened to minWidth + 8.
ComboRect ComboBoxRect(const RECT& rowBounds, const int* widths, int count, int column, int imageWidth,
                       int minWidth, int cxEdge);

// The window of a combo box is six selection fields high: one for itself, five for its list.
RECT DropDownWindowRect(const RECT& comboRect);

// The rows whose combo boxes show: from the top row (or the one given) to the one below
// the last fully visible row, at most the last row.
struct RowRange
{
    int first;
    int last;
};

RowRange VisibleRows(int topIndex, int countPerPage, int itemCount);
bool IsInRange(const RowRange& rows, int row);

// Where the combo box of a row goes after a horizontal move: the first visible row's
// box moved down by whole rows.
RECT RowComboRect(const RECT& firstRowRect, int firstRow, int row, int rowHeight);

// The header notifications of tracking a divider or double-clicking it (both character sets).
bool IsDividerNotification(UINT code);
// Such a notification re-lays the combo boxes when its column lies left of the combo
// column or is the combo column itself.
bool MovesComboBoxes(UINT code, int item, int comboColumn);

} // namespace ComboListGeometry
