// Geometry of header drag and drop without a window. Header items are located by
// adding up their widths in index order from the header's left edge (x = 0); the
// header's own item rectangles and order array are not used.
#pragma once

#include <windows.h>

namespace ColumnDragGeometry {

// A press takes a column only well inside its item: more than this many pixels right
// of its left edge and left of its right edge, so the dividers stay with the header's
// own resizing. An item 15 pixels wide or narrower cannot be taken.
constexpr int kPressLeftMargin = 7;
constexpr int kPressRightMargin = 8;

// The first item i whose span [left, left + width) has left + 7 < x < left + width - 8;
// -1 when none.
int FindPressedItem(int x, const int* widths, int count);

// The first item whose span, over the client rectangle's height, holds the point; -1
// when none.
int HitTestItems(POINT point, const RECT& client, const int* widths, int count);

// Where a column dropped at header x goes: index counts the items whose middle (half
// the width, rounded toward zero) x has reached, from 0 to count; lineX is the left
// edge of that position in the coordinates of the header's parent, which is scrolled
// horizontally by scroll pixels.
struct InsertionPoint
{
    int index;
    int lineX;
};

InsertionPoint FindInsertionPoint(int x, const int* widths, int count, int scroll);

// The red insertion marker: a triangle above the header pointing down at it and one
// below pointing up, at line x; top and bottom are the header's edges. The areas cover
// each triangle with a pixel to spare, to be invalidated when the marker moves.
constexpr COLORREF kMarkerColor = RGB(255, 0, 0);
constexpr int kMarkerHalfWidth = 3;
constexpr int kMarkerHeight = 6;

struct InsertionMarker
{
    POINT top[3];
    POINT bottom[3];
    RECT topArea;
    RECT bottomArea;
};

InsertionMarker MakeInsertionMarker(int x, int top, int bottom);

// The sort arrow of the drag header: 6 pixels wide, its apex at x + 3, pointing up when
// ascending. item: the sorted item's span over the client's height; textWidth: its
// title's width; rightAligned: the title is aligned right (HDF_RIGHT).
constexpr int kArrowWidth = 6;

struct SortArrow
{
    bool visible;   // false: the item is too narrow for title and arrow
    int x;
    int apexY;
    int baseY;
};

SortArrow PlaceSortArrow(const RECT& item, int textWidth, bool rightAligned, bool ascending);

// The list's sort column (-1: none) after a column went in at position inserted
// (sorted: it is the column the list is sorted by), or after the column at deleted
// was taken out.
int SortColumnAfterInsert(int sortColumn, int inserted, bool sorted);
int SortColumnAfterDelete(int sortColumn, int deleted);

} // namespace ColumnDragGeometry
