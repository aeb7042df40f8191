// Geometry of header drag and drop without a window.
#include "ColumnDragGeometry.h"

#include "HeaderGeometry.h"

namespace ColumnDragGeometry {

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
    // Placed where the extended header puts its indicator (the room it needs is this
    // arrow's width and two pixels), but pointing the other way.
    const HeaderGeometry::SortArrow placed =
        HeaderGeometry::PlaceSortArrow(item, textWidth, rightAligned, !ascending);
    return SortArrow{ placed.visible, placed.x0, placed.apexY, placed.baseY };
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
