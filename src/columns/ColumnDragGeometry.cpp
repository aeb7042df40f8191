// Geometry of header drag and drop without a window.
#include "ColumnDragGeometry.h"

namespace ColumnDragGeometry {

namespace {

// Space kept around the sort arrow inside the item.
constexpr int kArrowMargin = 3;
// A short title puts the arrow this far inside the item's right edge.
constexpr int kArrowRightInset = 11;
// The arrow needs this much room before the limit: its width and two pixels.
constexpr int kArrowRoom = 8;

} // namespace

int FindPressedItem(int x, const int* widths, int count)
{
    int left = 0;
    for (int i = 0; i < count; ++i)
    {
        if (left + kPressLeftMargin < x && x < left + widths[i] - kPressRightMargin)
            return i;
        left += widths[i];
    }
    return -1;
}

int HitTestItems(POINT point, const RECT& client, const int* widths, int count)
{
    int left = 0;
    for (int i = 0; i < count; ++i)
    {
        const RECT item = { left, client.top, left + widths[i], client.bottom };
        if (::PtInRect(&item, point))
            return i;
        left += widths[i];
    }
    return -1;
}

InsertionPoint FindInsertionPoint(int x, const int* widths, int count, int scroll)
{
    int left = 0;
    int index = 0;
    while (index < count && x >= left + widths[index] / 2)
        left += widths[index++];
    return InsertionPoint{ index, left - scroll };
}

InsertionMarker MakeInsertionMarker(int x, int top, int bottom)
{
    const int h = kMarkerHalfWidth;
    InsertionMarker marker = {
        { { x, top - 1 }, { x - h, top - 1 - kMarkerHeight }, { x + h, top - 1 - kMarkerHeight } },
        { { x, bottom + 1 }, { x - h, bottom + 1 + kMarkerHeight }, { x + h, bottom + 1 + kMarkerHeight } },
        { x - h, top - 1 - kMarkerHeight, x + h, top - 1 },
        { x - h, bottom + 1, x + h, bottom + 1 + kMarkerHeight },
    };
    ::InflateRect(&marker.topArea, 1, 1);
    ::InflateRect(&marker.bottomArea, 1, 1);
    return marker;
}

SortArrow PlaceSortArrow(const RECT& item, int textWidth, bool rightAligned, bool ascending)
{
    const int left = item.left + kArrowMargin;
    const int right = item.right - kArrowMargin;
    const int top = item.top + kArrowMargin;
    const int bottom = item.bottom - kArrowMargin;

    SortArrow arrow = {};
    int limit;
    if (rightAligned)
    {
        // In front of the right-aligned title.
        arrow.x = left;
        limit = right - textWidth;
    }
    else
    {
        // Behind the title, or inset from the right edge when the title is short.
        arrow.x = left + textWidth > right - kArrowRightInset ? left + textWidth : right - kArrowRightInset;
        limit = right;
    }
    arrow.visible = arrow.x + kArrowRoom < limit;
    arrow.apexY = ascending ? top + 2 : bottom - 3;
    arrow.baseY = ascending ? bottom - 3 : top + 2;
    return arrow;
}

int SortColumnAfterInsert(int sortColumn, int inserted, bool sorted)
{
    if (sorted)
        return inserted;
    return sortColumn != -1 && inserted <= sortColumn ? sortColumn + 1 : sortColumn;
}

int SortColumnAfterDelete(int sortColumn, int deleted)
{
    if (sortColumn == deleted)
        return -1;
    return sortColumn > deleted ? sortColumn - 1 : sortColumn;
}

} // namespace ColumnDragGeometry
