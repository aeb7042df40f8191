// Geometry of the extended header without a window: where the sort indicator goes
// beside a column title, which insertion position a pointer marks while a column
// is dragged, and the marker triangle drawn there.
#pragma once

#include <windows.h>

namespace HeaderGeometry {

// The etched triangle: 8 pixels wide, its base from x0 to x0 + 8 at baseY, its apex
// at (x0 + 4, apexY). Ascending points down, descending up.
constexpr int kArrowWidth = 8;

struct SortArrow
{
    bool visible;   // false: the column is too narrow for title and triangle
    int x0;
    int apexX;
    int apexY;
    int baseY;
};

// column: the sorted column's left and right edges and the header's top and bottom;
// textWidth: its title's width; rightAligned: the title is aligned right (HDF_RIGHT).
SortArrow PlaceSortArrow(const RECT& column, int textWidth, bool rightAligned, bool ascending);

// The insertion position for pointer x over items of the given widths in index
// order: the item whose span [left, left + width) holds x, with its left edge; 0
// at or left of 0; the item count, with the total width, right of the last item.
struct DropPosition
{
    int position;
    int edge;
};

DropPosition FindDropPosition(int x, const int* widths, int count);

// The filled triangle pointing down at the header's lower border at the edge, and
// the rectangle that covers it (invalidated to erase it again).
struct DropMarker
{
    POINT points[3];
    RECT bounds;
};

DropMarker MakeDropMarker(int edge, int headerHeight);

} // namespace HeaderGeometry
