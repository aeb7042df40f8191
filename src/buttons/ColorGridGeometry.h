// Geometry and keyboard rules of the colour well's popup palette: cell rectangles,
// hit tests, popup size and placement, and hover moves by key. No windows involved.
#pragma once

#include <windows.h>

#include <cstdint>
#include <vector>

namespace ColorGridGeometry {

// The palette's layout settings, in pixels.
struct ColorGridLayout
{
    int rows = 5;
    int columns = 4;
    int buttonWidth = 20;
    int buttonHeight = 20;
    int gapHorizontal = 0;
    int gapVertical = 0;
    int border = 0;

    int CellCount() const { return rows * columns; }
    int PitchX() const { return buttonWidth + gapHorizontal; }
    int PitchY() const { return buttonHeight + gapVertical; }
};

// Accepted ranges of the layout settings; other values leave a setting unchanged.
bool IsValidGridCount(long value);       // rows, columns: 1 to 20
bool IsValidButtonExtent(long value);    // button width, height: 10 to 100
bool IsValidGridSpacing(long value);     // gaps, border: 0 to 100

// The 20 colours of a new palette, in cell order.
std::vector<COLORREF> DefaultPaletteColors();

// Cell i including the gaps to its right and below (the area repainted for it).
RECT CellRect(const ColorGridLayout& layout, int index);
// The colour button of cell i: buttonWidth x buttonHeight at the cell's top-left corner.
RECT CellButtonRect(const ColorGridLayout& layout, int index);

// Cell under a moving pointer (client coordinates), gaps included; -1 outside the grid.
int CellFromHoverPoint(const ColorGridLayout& layout, int x, int y);
// Cell whose colour button lies under a released pointer; -1 on a gap, in the margin or
// outside the grid, so that such a release picks nothing.
int CellFromReleasePoint(const ColorGridLayout& layout, int x, int y);

// Window size of the popup. frame: the dialog frame width (SM_CXDLGFRAME);
// otherHeight: height of the Other... button.
SIZE PopupSize(const ColorGridLayout& layout, bool hasOtherButton, int frame, int otherHeight);
// Client-coordinate rectangle of the Other... button inside a popup of the given size.
RECT OtherButtonRect(const ColorGridLayout& layout, SIZE popup, int frame, int otherHeight);
// Top-left corner that keeps a popup of the given size inside area: pushed up and left
// until its bottom and right edges touch the area's, never above or left of the area.
POINT KeepPopupInside(POINT origin, SIZE size, const RECT& area);

// Hover index after a navigation key (VK_HOME, VK_END, VK_LEFT, VK_RIGHT, VK_UP,
// VK_DOWN). -1 stands for the Other... button (or nothing). Returns false for other keys.
bool MoveHoverByKey(const ColorGridLayout& layout, int hover, UINT vk, bool hasOtherButton,
                    int& newHover);

} // namespace ColorGridGeometry
