// Geometry of the combo list without a window.
#include "ComboListGeometry.h"

#include <commctrl.h>

#include <algorithm>   // (std::min): safe from the min macro of windows.h

namespace ComboListGeometry {

namespace {

// The box starts this far into its cell and ends this much short of the cell's width from there.
constexpr int kLeftInset = 4;
constexpr int kWidthShortfall = 3;
// A widened column gets this much more than the minimum; the box then this much.
constexpr int kWidenedColumnExtra = 8;
constexpr int kWidenedBoxExtra = 5;
// Drop-down room below the selection field, in selection fields.
constexpr int kListFields = 5;

} // namespace

int MinimumWidth(int cxVScroll, int cxEdge)
{
    return cxVScroll + 2 * cxEdge;
}

ComboRect ComboBoxRect(const RECT& rowBounds, const int* widths, int count, int column, int imageWidth,
                       int minWidth, int cxEdge)
{
    ComboRect result = { { 0, 0, 0, 0 }, false, 0 };
    if (column < 0 || column >= count || widths == nullptr)
        return result;
    int left = rowBounds.left;
    for (int c = 0; c < column; ++c)
        left += widths[c];
    left += imageWidth + kLeftInset;
    int right = left + widths[column] - kWidthShortfall;
    if (minWidth > right - left)
    {
        result.widen = true;
        result.widenedWidth = minWidth + kWidenedColumnExtra;
        right = left + minWidth + kWidenedBoxExtra;
    }
    result.rect = { left, rowBounds.top, right, rowBounds.bottom - 2 * cxEdge };
    return result;
}

RECT DropDownWindowRect(const RECT& comboRect)
{
    RECT rc = comboRect;
    rc.bottom += kListFields * (comboRect.bottom - comboRect.top);
    return rc;
}

RowRange VisibleRows(int topIndex, int countPerPage, int itemCount)
{
    return { topIndex, (std::min)(topIndex + countPerPage, itemCount - 1) };
}

bool IsInRange(const RowRange& rows, int row)
{
    return row >= rows.first && row <= rows.last;
}

RECT RowComboRect(const RECT& firstRowRect, int firstRow, int row, int rowHeight)
{
    RECT rc = firstRowRect;
    ::OffsetRect(&rc, 0, (row - firstRow) * rowHeight);
    return rc;
}

bool IsDividerNotification(UINT code)
{
    switch (code)
    {
    case HDN_BEGINTRACKA: case HDN_BEGINTRACKW:
    case HDN_ENDTRACKA: case HDN_ENDTRACKW:
    case HDN_DIVIDERDBLCLICKA: case HDN_DIVIDERDBLCLICKW:
        return true;
    default:
        return false;
    }
}

bool MovesComboBoxes(UINT code, int item, int comboColumn)
{
    return item <= comboColumn && IsDividerNotification(code);
}

} // namespace ComboListGeometry
