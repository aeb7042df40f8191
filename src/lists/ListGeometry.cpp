// Geometry of the extended list control without a window.
#include "ListGeometry.h"

#include <commctrl.h>

#include <algorithm>   // (std::min) and (std::max): safe from the min and max macros of windows.h

namespace ListGeometry {

namespace {

// A sub-item's text starts this far into its cell.
constexpr int kSubItemTextOffset = 6;
// The first column's text starts this far into its label rectangle.
constexpr int kLabelTextOffset = 3;

constexpr int kClearCheckBox = 1;
constexpr int kCheckedCheckBox = 2;

} // namespace

RECT HighlightRect(int type, const RECT& bounds, const RECT& label, int textWidth, int offset, int clientRight)
{
    RECT rc = label;
    switch (type)
    {
    case kLabelOnly:
        rc.right = (std::min)(label.right, static_cast<LONG>(label.left + textWidth + offset));
        break;
    case kAllColumns:
    case kWholeRow:
        rc = bounds;
        rc.left = label.left;
        if (type == kWholeRow)
            rc.right = (std::max)(bounds.right, static_cast<LONG>(clientRight));
        break;
    default:
        break;
    }
    return rc;
}

bool IsRowHighlighted(UINT state, bool hasFocus, bool showSelectionAlways)
{
    if (state & LVIS_DROPHILITED)
        return true;
    return (state & LVIS_SELECTED) != 0 && (hasFocus || showSelectionAlways);
}

UINT TextAlignment(int format)
{
    switch (format & LVCFMT_JUSTIFYMASK)
    {
    case LVCFMT_RIGHT: return DT_RIGHT;
    case LVCFMT_CENTER: return DT_CENTER;
    default: return DT_LEFT;
    }
}

UINT SmallImageStyle(UINT state, bool highlighted)
{
    // The state's overlay bits are the image list's overlay bits.
    return ILD_TRANSPARENT | (state & LVIS_OVERLAYMASK) | (highlighted ? ILD_BLEND50 : 0);
}

RECT CellTextRect(const RECT& cell, bool hasImage, int imageShift, int offset)
{
    RECT rc = cell;
    if (hasImage)
        rc.left += imageShift;
    rc.left += offset;
    rc.right -= offset;
    return rc;
}

RowRange ScannedRows(int topIndex, int countPerPage, int itemCount)
{
    RowRange rows = { topIndex, (std::min)(topIndex + countPerPage, itemCount - 1) };
    return rows;
}

ColumnHit FindColumn(int x, int rowLeft, const int* widths, int count, int clientRight)
{
    ColumnHit hit = { -1, 0, 0 };
    int left = rowLeft;
    for (int c = 0; c < count; ++c)
    {
        const int right = left + widths[c];
        if (left <= x && x <= right)
        {
            if (clientRight != kNoClientEdge && x > clientRight)
                return hit;
            hit.column = c;
            hit.left = left;
            hit.right = clientRight != kNoClientEdge ? (std::min)(right, clientRight) : right;
            return hit;
        }
        left = right;
    }
    return hit;
}

TitleTipPlacement PlaceTitleTip(int column, const RECT& cell, int labelLeft, int x)
{
    const int offset = column == 0 ? labelLeft - cell.left + kLabelTextOffset : kSubItemTextOffset;
    TitleTipPlacement tip = { x >= cell.left + offset, cell, offset - 1 };
    tip.rect.top -= 1;
    return tip;
}

int NextCheckBoxImage(int stateImage)
{
    return stateImage == kClearCheckBox ? kCheckedCheckBox : kClearCheckBox;
}

FitResult FitColumn(const ColumnFacts* columns, int count, int clientWidth)
{
    FitResult fit = { 0, 0 };
    int othersWidth = 0;
    for (int c = 0; c < count; ++c)
    {
        if (columns[c].fetched && columns[c].subItem != 0)
            othersWidth += columns[c].width;
        else
            fit.column = c;
    }
    // Less than nothing left is nothing: a negative width would be refused, or taken
    // for one of the list view's automatic sizes (-1, -2).
    fit.width = (std::max)(0, clientWidth - othersWidth);
    return fit;
}

bool WholeRowRepaintRect(const RECT& rowBounds, const RECT& client, const RECT& clipBox, RECT* pRepaint)
{
    if (rowBounds.right >= client.right)
        return false;
    *pRepaint = clipBox;
    pRepaint->left = (std::min)(clipBox.left, rowBounds.right - 1);
    pRepaint->right = client.right;
    return true;
}

} // namespace ListGeometry
