// Geometry of the extended header without a window.
#include "HeaderGeometry.h"

namespace HeaderGeometry {

namespace {

// The triangle keeps this far inside the column's right edge when the title is short.
constexpr int kRightInset = 11;
// Space kept around the triangle inside the header item.
constexpr int kItemMargin = 3;

} // namespace

SortArrow PlaceSortArrow(const RECT& column, int textWidth, bool rightAligned, bool ascending)
{
    const int left = column.left + kItemMargin;
    const int right = column.right - kItemMargin;
    const int top = column.top + kItemMargin;
    const int bottom = column.bottom - kItemMargin;

    SortArrow arrow = {};
    int limit;
    if (rightAligned)
    {
        // Before the right-aligned title, at the column's left edge.
        arrow.x0 = left;
        limit = right - textWidth;
    }
    else
    {
        // Behind the title, or inset from the right edge when the title is short.
        arrow.x0 = left + textWidth > right - kRightInset ? left + textWidth : right - kRightInset;
        limit = right;
    }
    arrow.visible = arrow.x0 + kArrowWidth < limit;
    arrow.apexX = (2 * arrow.x0 + kArrowWidth) / 2;
    arrow.apexY = ascending ? bottom - 3 : top + 2;
    arrow.baseY = ascending ? top + 2 : bottom - 3;
    return arrow;
}

DropPosition FindDropPosition(int x, const int* widths, int count)
{
    if (x <= 0)
        return DropPosition{ 0, 0 };
    int left = 0;
    for (int i = 0; i < count; ++i)
    {
        if (left <= x && x < left + widths[i])
            return DropPosition{ i, left };
        left += widths[i];
    }
    return DropPosition{ count, left };
}

DropMarker MakeDropMarker(int edge, int headerHeight)
{
    const int h = headerHeight;
    DropMarker marker;
    marker.points[0] = POINT{ edge, h };
    marker.points[1] = POINT{ edge - h / 4, h / 2 };
    marker.points[2] = POINT{ edge + h / 4, h / 2 };
    marker.bounds = RECT{ edge - h / 4 - 1, h - h / 2 - 1, edge + h / 4 + 1, h + 1 };
    return marker;
}

} // namespace HeaderGeometry
