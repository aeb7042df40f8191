#include "ColorGridGeometry.h"

namespace ColorGridGeometry {

bool IsValidGridCount(long value) { return value >= 1 && value <= 20; }
bool IsValidButtonExtent(long value) { return value >= 10 && value <= 100; }
bool IsValidGridSpacing(long value) { return value >= 0 && value <= 100; }

std::vector<COLORREF> DefaultPaletteColors()
{
    return {
        0x000000, 0x0000FF, 0x00FF00, 0xFFFF00, 0xFF00FF,
        0x00FFFF, 0xFFFFFF, 0x008000, 0x8080FF, 0x404080,
        0x007DFF, 0x008080, 0x004000, 0x808000, 0x808080,
        0xFF8000, 0xFF8080, 0xA00000, 0xC0C0C0, 0xC08080,
    };
}

RECT CellRect(const ColorGridLayout& layout, int index)
{
    const int columns = layout.columns > 0 ? layout.columns : 1;
    const int row = index / columns;
    const int col = index % columns;
    RECT rc;
    rc.left = layout.border + col * layout.PitchX();
    rc.top = layout.border + row * layout.PitchY();
    rc.right = rc.left + layout.PitchX();
    rc.bottom = rc.top + layout.PitchY();
    return rc;
}

RECT CellButtonRect(const ColorGridLayout& layout, int index)
{
    RECT rc = CellRect(layout, index);
    rc.right = rc.left + layout.buttonWidth;
    rc.bottom = rc.top + layout.buttonHeight;
    return rc;
}

int CellFromHoverPoint(const ColorGridLayout& layout, int x, int y)
{
    if (layout.PitchX() <= 0 || layout.PitchY() <= 0)
        return -1;
    if (x <= layout.border || x >= layout.columns * layout.PitchX() + layout.border)
        return -1;
    if (y <= layout.border || y >= layout.rows * layout.PitchY() + layout.border)
        return -1;
    const int row = (y - layout.border) / layout.PitchY();
    const int col = (x - layout.border) / layout.PitchX();
    return row * layout.columns + col;
}

int CellFromReleasePoint(const ColorGridLayout& layout, int x, int y)
{
    if (layout.PitchX() <= 0 || layout.PitchY() <= 0)
        return -1;
    // Floor division by hand: a point in the top or left margin must not fall into
    // row or column 0 through truncation towards zero.
    const int dx = x - layout.border;
    const int dy = y - layout.border;
    if (dx < 0 || dy < 0)
        return -1;
    const int col = dx / layout.PitchX();
    const int row = dy / layout.PitchY();
    if (col >= layout.columns || row >= layout.rows)
        return -1;
    // The gap to the right of and below a button belongs to no colour.
    if (dx % layout.PitchX() >= layout.buttonWidth || dy % layout.PitchY() >= layout.buttonHeight)
        return -1;
    return row * layout.columns + col;
}

SIZE PopupSize(const ColorGridLayout& layout, bool hasOtherButton, int frame, int otherHeight)
{
    SIZE size;
    size.cx = layout.columns * layout.buttonWidth + (layout.columns - 1) * layout.gapHorizontal
              + 2 * (layout.border + frame);
    size.cy = layout.rows * layout.buttonHeight + (layout.rows - 1) * layout.gapVertical
              + 2 * layout.border + frame + 2;
    if (hasOtherButton)
        size.cy += otherHeight + 3;
    return size;
}

RECT OtherButtonRect(const ColorGridLayout& layout, SIZE popup, int frame, int otherHeight)
{
    RECT rc;
    rc.left = layout.border + frame;
    rc.right = popup.cx - 2 * frame - layout.border - 3;
    rc.bottom = popup.cy - layout.border - frame - 3;
    rc.top = rc.bottom - otherHeight;
    return rc;
}

POINT KeepPopupInside(POINT origin, SIZE size, const RECT& area)
{
    POINT pt = origin;
    if (pt.y + size.cy > area.bottom)
        pt.y = area.bottom - size.cy;
    if (pt.x + size.cx > area.right)
        pt.x = area.right - size.cx;
    if (pt.y < area.top)
        pt.y = area.top;
    if (pt.x < area.left)
        pt.x = area.left;
    return pt;
}

bool MoveHoverByKey(const ColorGridLayout& layout, int hover, UINT vk, bool hasOtherButton,
                    int& newHover)
{
    const int n = layout.CellCount();
    const int columns = layout.columns;
    switch (vk)
    {
    case VK_HOME:
        newHover = 0;
        return true;
    case VK_END:
        newHover = n - 1;
        return true;
    case VK_LEFT:
        if (hover > 0)
            newHover = hover - 1;
        else if (hasOtherButton && hover != -1)
            newHover = -1;
        else
            newHover = n - 1;
        return true;
    case VK_RIGHT:
        if (hover < n - 1)
            newHover = hover + 1;
        else if (hover == n - 1)
            newHover = -1;
        else
            newHover = 0;
        return true;
    case VK_UP:
        if (hover >= columns)
            newHover = hover - columns;
        else if (hover < 0)
            newHover = (layout.rows - 1) * columns;
        else
            newHover = -1;
        return true;
    case VK_DOWN:
        if (hover >= 0 && hover < (layout.rows - 1) * columns)
            newHover = hover + columns;
        else if (hover < 0)
            newHover = 0;
        else
            newHover = -1;
        return true;
    default:
        return false;
    }
}

} // namespace ColorGridGeometry
