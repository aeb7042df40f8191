#include "TipLayout.h"

#include <algorithm>

namespace TipLayout {

SIZE DcTextMeasurer::Extent(const wchar_t* text, int count)
{
    SIZE size = { 0, 0 };
    if (!::GetTextExtentPoint32W(m_hdc, text, count, &size))
        size.cx = size.cy = 0;
    return size;
}

int DcTextMeasurer::PrefixExtents(const wchar_t* text, int count, int* widths)
{
    // Without a fit count the maximum extent is ignored and every partial extent is
    // filled. GDI's extent height is the font's height, whatever the characters.
    SIZE size = { 0, 0 };
    if (!::GetTextExtentExPointW(m_hdc, text, count, 0, NULL, widths, &size))
    {
        std::fill(widths, widths + count, 0);
        return 0;
    }
    return size.cy;
}

Wrap WrapText(const wchar_t* text, int length, int maxWidth, int maxHeight, TextMeasurer& measurer)
{
    Wrap result;
    if (maxWidth <= 0)
        return result;
    std::vector<int> widths;
    int start = 0;
    while (start < length)
    {
        const int remaining = length - start;
        // Characters at least one pixel wide reach maxWidth within maxWidth characters, so
        // one more is enough to see the character that crosses the limit; only zero-width
        // characters can make a longer query necessary.
        int count = remaining - 1 < maxWidth ? remaining : maxWidth + 1;
        int lineLength = 0;
        int height = 0;
        for (;;)
        {
            widths.resize(static_cast<size_t>(count));
            height = measurer.PrefixExtents(text + start, count, widths.data());
            int reached = 0;   // index of the first prefix as wide as the limit
            while (reached < count && widths[reached] < maxWidth)
                ++reached;
            if (reached < count)
            {
                lineLength = widths[reached] > maxWidth ? reached : reached + 1;
                break;
            }
            if (count == remaining)
            {
                lineLength = count;
                break;
            }
            count = count > remaining / 2 ? remaining : count * 2;
        }
        if (lineLength == 0)
            return Wrap();   // a single character is wider than the limit
        if (result.height + height >= maxHeight)
            break;           // this line would make the tip as high as the monitor
        result.lines.push_back(Line{ start, lineLength, height });
        result.height += height;
        start += lineLength;
    }
    result.ok = true;
    return result;
}

namespace {

bool StrictlyInsideHorizontally(const RECT& tip, const RECT& monitor)
{
    return tip.left > monitor.left && tip.right < monitor.right;
}

// A tip crossing the monitor's left edge moves right onto it, keeping its width.
void MoveOntoLeftEdge(RECT& tip, const RECT& monitor)
{
    if (tip.left < monitor.left && tip.right > monitor.left)
    {
        tip.right += monitor.left - tip.left;
        tip.left = monitor.left;
    }
}

bool WrapInto(Placement& placement, RECT& tip, const wchar_t* text, int length, const RECT& monitor,
              TextMeasurer& measurer)
{
    Wrap wrap = WrapText(text, length, tip.right - tip.left - 1, monitor.bottom - monitor.top, measurer);
    if (!wrap.ok)
        return false;
    tip.bottom = tip.top + wrap.height + 1;
    placement.wrapped = true;
    placement.lines = std::move(wrap.lines);
    return true;
}

} // namespace

Placement LayoutToolTip(const RECT& area, POINT point, const wchar_t* text, int length, bool showAlways,
                        const RECT& monitor, TextMeasurer& measurer)
{
    Placement placement;
    const int textWidth = measurer.Extent(text, length).cx;
    RECT tip = { point.x, point.y, point.x + textWidth + 3, point.y + (area.bottom - area.top) };

    if (!showAlways && StrictlyInsideHorizontally(tip, monitor) && textWidth + 3 <= area.right - area.left)
        return placement;

    MoveOntoLeftEdge(tip, monitor);
    if (tip.right > monitor.right && tip.left < monitor.right)
    {
        tip.left = (std::max)(monitor.left, tip.left - (tip.right - monitor.right));
        tip.right = monitor.right;
    }

    if (textWidth > tip.right - tip.left)
    {
        if (!WrapInto(placement, tip, text, length, monitor, measurer))
            return placement;
        if (tip.bottom > monitor.bottom)
        {
            tip.top = (std::max)(monitor.top, tip.top - (tip.bottom - monitor.bottom));
            tip.bottom = monitor.bottom;
        }
        // Keep the area readable: above it with a gap of 5 pixels, where there is room.
        if (tip.top < area.bottom && tip.left < area.right)
        {
            const int newTop = area.top - 5 - (tip.bottom - tip.top);
            if (newTop > monitor.top)
            {
                tip.top = newTop;
                tip.bottom = area.top - 5;
            }
        }
    }

    placement.show = true;
    placement.window = tip;
    // One pixel of border: the area's right and bottom edges still count as inside.
    placement.hover = { area.left - tip.left - 1, area.top - tip.top - 1, area.right - tip.left,
                        area.bottom - tip.top };
    return placement;
}

Placement LayoutTitleTip(const RECT& cell, int textOffset, const wchar_t* text, int length, const RECT& monitor,
                         TextMeasurer& measurer)
{
    Placement placement;
    // From the text start to the cell's right edge, from its top to one pixel below it.
    placement.hover = { -1, -1, cell.right - cell.left - textOffset, cell.bottom - cell.top + 1 };

    const int textWidth = measurer.Extent(text, length).cx;
    RECT tip = { cell.left + textOffset, cell.top, cell.left + textOffset + textWidth + 3, cell.bottom };

    if (StrictlyInsideHorizontally(tip, monitor) && tip.right <= cell.right - textOffset)
        return placement;

    MoveOntoLeftEdge(tip, monitor);
    // Cut, not shifted: the tip stays aligned with the cell's text.
    if (tip.right > monitor.right && tip.left < monitor.right)
        tip.right = monitor.right;

    if (textWidth > tip.right - tip.left)
    {
        if (!WrapInto(placement, tip, text, length, monitor, measurer))
            return placement;
        if (tip.bottom > monitor.bottom)
        {
            // Moved up: the cell lies lower in the tip's coordinates.
            const int up = tip.bottom - monitor.bottom;
            tip.top -= up;
            placement.hover.top += up;
            placement.hover.bottom += up;
            if (tip.top < monitor.top)
            {
                const int excess = monitor.top - tip.top;
                tip.top = monitor.top;
                placement.hover.top -= excess;
                placement.hover.bottom -= excess;
            }
            tip.bottom = monitor.bottom;
        }
    }

    placement.show = true;
    placement.window = tip;
    return placement;
}

} // namespace TipLayout
