// Layout of the tool tip and the title tip without windows: measuring, the fit test,
// clamping to the monitor, character wrapping and the hover rectangle. Everything is in
// screen coordinates; the tips convert their arguments before and show the result after.
#pragma once

#include <windows.h>

#include <vector>

namespace TipLayout {

// Measures text in the tip's font.
class TextMeasurer
{
public:
    // Extent of text[0, count), as GetTextExtentPoint32 gives it.
    virtual SIZE Extent(const wchar_t* text, int count) = 0;
    // One query for the widths of all prefixes of text[0, count): widths[i] receives the
    // extent of text[0, i]. Returns the height of the text, as Extent would.
    virtual int PrefixExtents(const wchar_t* text, int count, int* widths) = 0;

protected:
    ~TextMeasurer() = default;
};

// A measurer over a device context with the tip's font selected.
class DcTextMeasurer : public TextMeasurer
{
public:
    explicit DcTextMeasurer(HDC hdc) : m_hdc(hdc) {}
    SIZE Extent(const wchar_t* text, int count) override;
    int PrefixExtents(const wchar_t* text, int count, int* widths) override;

private:
    HDC m_hdc;
};

struct Line
{
    int start;    // index of the first character in the text
    int length;
    int height;   // measured height; the next line is drawn this much lower
};

struct Wrap
{
    bool ok = false;          // false: a single character is wider than the limit
    std::vector<Line> lines;  // the kept lines
    int height = 0;           // sum of the kept lines' heights
};

// Character wrapping: a line grows one character at a time until its measured width
// reaches maxWidth or the text ends; a line wider than maxWidth gives its last character
// back (a line exactly maxWidth wide keeps it). The line that would make the total
// height reach maxHeight is dropped with the rest of the text. One measuring query per
// line for texts whose characters are at least one pixel wide.
Wrap WrapText(const wchar_t* text, int length, int maxWidth, int maxHeight, TextMeasurer& measurer);

struct Placement
{
    bool show = false;
    RECT window = {};         // screen rectangle of the tip window
    bool wrapped = false;     // false: one line, the whole text at (0, 0)
    std::vector<Line> lines;  // wrapped mode: the lines, top-down from y = 0
    RECT hover = {};          // the hover rectangle, in the tip's client coordinates
};

// Tool tip: the text at point, as high as area, shown when it does not fit into area
// (or always), clamped to the monitor on both sides, wrapped when wider than the
// monitor, and moved above area when the wrapped tip would cover it.
Placement LayoutToolTip(const RECT& area, POINT point, const wchar_t* text, int length, bool showAlways,
                        const RECT& monitor, TextMeasurer& measurer);

// Title tip: the text over the cell, starting textOffset pixels right of its left edge,
// shown when it does not fit into the cell with the same margin on both sides, cut at
// the monitor's right edge, wrapped downward and moved up at the monitor's bottom. The
// hover rectangle is filled even when the tip is not shown.
Placement LayoutTitleTip(const RECT& cell, int textOffset, const wchar_t* text, int length, const RECT& monitor,
                         TextMeasurer& measurer);

} // namespace TipLayout
