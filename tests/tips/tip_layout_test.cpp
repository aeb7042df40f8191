// Tip layout without windows: character wrapping (limits met exactly and by one pixel, a
// character wider than the limit, lines dropped at the monitor's height, zero-width characters);
// placement (fit tests, monitor edges touched and crossed, wrapping, above the area, moved up,
// hover); with real fonts, fit-based wrapping against the per-character rule, queries per line.
#include <windows.h>

#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

#include "Checks.h"
#include "TipLayout.h"

namespace {

using namespace TipLayout;

// Synthetic font: 'i' 2 pixels, 'W' 10, '|' zero width, everything else 6; lines 10 high.
class TableMeasurer : public TextMeasurer
{
public:
    static int Width(wchar_t c) { return c == L'i' ? 2 : c == L'W' ? 10 : c == L'|' ? 0 : 6; }
    SIZE Extent(const wchar_t* text, int count) override
    {
        SIZE size = { 0, 10 };
        for (int i = 0; i < count; ++i)
            size.cx += Width(text[i]);
        return size;
    }
    int PrefixExtents(const wchar_t* text, int count, int* widths) override
    {
        ++queries;
        for (int i = 0, x = 0; i < count; ++i)
            widths[i] = x += Width(text[i]);
        return 10;
    }
    int queries = 0;
};

// The kept lines joined with '/', or "none" when nothing is shown.
std::wstring Joined(const std::wstring& text, bool ok, const std::vector<Line>& lines)
{
    std::wstring out = ok ? L"" : L"none";
    for (const Line& line : lines)
        out += (out.empty() ? L"" : L"/") + text.substr(line.start, line.length);
    return out;
}

using orvane_test::CaseName;
using orvane_test::Str;

struct WrapCase { const char* name; const wchar_t* text; int maxWidth, maxHeight; const wchar_t* lines; int queries; };

const WrapCase kWrapCases[] = {
    { "LineAsWideAsTheLimitKeepsItsLastCharacter", L"aaaaa", 12, 100, L"aa/aa/a", 3 },
    { "OnePixelOverGivesTheCharacterBack", L"aaaaa", 11, 100, L"a/a/a/a/a", 5 },
    { "SplitsInsideWords", L"Wide iWi", 20, 100, L"Wid/e i/Wi", 3 },
    { "CharacterWiderThanTheLimit", L"aaW", 9, 100, L"none", 3 },
    { "LineReachingTheMonitorHeightIsDropped", L"aaaaaaa", 12, 30, L"aa/aa", 3 },
    { "FirstLineAlreadyTooHigh", L"aaa", 12, 10, L"", 1 },
    { "ZeroWidthCharactersNeedALongerQuery", L"i||||||||i", 3, 100, L"i||||||||/i", 4 },
    { "ZeroWidthAfterAFullLineStartsTheNext", L"aa|a", 12, 100, L"aa/|a", 2 },
};

class WrapTable : public testing::TestWithParam<WrapCase> {};

TEST_P(WrapTable, Lines)
{
    const WrapCase& c = GetParam();
    TableMeasurer m;
    const std::wstring text = c.text;
    const Wrap wrap = WrapText(text.c_str(), static_cast<int>(text.size()), c.maxWidth, c.maxHeight, m);
    EXPECT_EQ(std::wstring(c.lines), Joined(text, wrap.ok, wrap.lines));
    EXPECT_EQ(10 * static_cast<int>(wrap.lines.size()), wrap.height);
    EXPECT_EQ(c.queries, m.queries);
}

INSTANTIATE_TEST_SUITE_P(Tips, WrapTable, testing::ValuesIn(kWrapCases), CaseName<WrapCase>);

// Monitor 1000 x 800; texts of 'a', 6 pixels per character.
const RECT kMonitor = { 0, 0, 1000, 800 };

// area: the tool tip's area or the title tip's cell; point.x is the title tip's text offset;
// an empty window: not shown; lines 0: one line; an all-zero hover: not checked.
enum Kind { Tool, ToolAlways, Title };
struct PlacementCase { const char* name; Kind kind; RECT area; POINT point; int chars; RECT window; int lines;
                       RECT hover; };

const PlacementCase kPlacementCases[] = {
    // Tool tips of 10 characters are 63 pixels wide.
    { "FitsShowsNothing", Tool, { 100, 100, 163, 120 }, { 110, 100 }, 10, {}, 0, {} },
    { "OnePixelWider", Tool, { 100, 100, 162, 120 }, { 110, 100 }, 10, { 110, 100, 173, 120 }, 0, { -11, -1, 52, 20 } },
    { "AlwaysShowsAFittingText", ToolAlways, { 100, 100, 163, 120 }, { 110, 100 }, 10, { 110, 100, 173, 120 }, 0, {} },
    { "TouchingTheLeftEdgeShows", Tool, { 0, 100, 163, 120 }, { 0, 100 }, 10, { 0, 100, 63, 120 }, 0, {} },
    { "CrossingLeftEdge", Tool, { 0, 100, 40, 120 }, { -5, 100 }, 10, { 0, 100, 63, 120 }, 0, { -1, -1, 40, 20 } },
    { "CrossingRightEdge", Tool, { 900, 100, 1000, 120 }, { 990, 100 }, 10, { 937, 100, 1000, 120 }, 0, {} },
    { "WhollyOutsideIsNotMoved", Tool, { 900, 100, 1000, 120 }, { 1200, 100 }, 10, { 1200, 100, 1263, 120 }, 0, {} },
    // 200 characters, 1200 pixels: lines of 166 characters (996 <= 999 < 1002) and 34.
    { "WiderThanTheMonitorWrapsAboveTheArea", Tool, { 100, 100, 300, 120 }, { 110, 100 }, 200, { 0, 74, 1000, 95 }, 2,
      { 99, 25, 300, 46 } },
    { "NoRoomAboveStaysAtThePoint", Tool, { 100, 20, 300, 40 }, { 110, 20 }, 200, { 0, 20, 1000, 41 }, 2, {} },
    { "WrappedBeyondTheBottomMovesUp", Tool, { 100, 700, 300, 770 }, { 110, 790 }, 200, { 0, 779, 1000, 800 }, 2, {} },
    // Title tips: 10 characters and an offset of 5 need 60 + 3 + 2 x 5 = 73 pixels.
    { "TitleFitsWithTheMargins", Title, { 100, 100, 173, 117 }, { 5 }, 10, {}, 0, { -1, -1, 68, 18 } },
    { "TitleOnePixelMoreCoversTheCell", Title, { 100, 100, 172, 117 }, { 5 }, 10, { 105, 100, 168, 117 }, 0, {} },
    { "TitleCutAtRight", Title, { 934, 100, 990, 117 }, { 5 }, 10, { 939, 100, 1000, 117 }, 0, { -1, -1, 51, 18 } },
    // 30 characters in 75 pixels: L = 74, 12 characters per line, three lines.
    { "TitleWrapsDownward", Title, { 900, 100, 990, 117 }, { 25 }, 30, { 925, 100, 1000, 131 }, 3, { -1, -1, 65, 18 } },
    { "TitleMovedUp", Title, { 900, 780, 990, 797 }, { 25 }, 30, { 925, 769, 1000, 800 }, 3, { -1, 10, 65, 29 } },
};

class PlacementTable : public testing::TestWithParam<PlacementCase> {};

TEST_P(PlacementTable, WindowLinesAndHover)
{
    const PlacementCase& c = GetParam();
    TableMeasurer m;
    const std::wstring text(c.chars, L'a');
    const wchar_t* t = text.c_str();
    const Placement p = c.kind == Title ? LayoutTitleTip(c.area, c.point.x, t, c.chars, kMonitor, m)
                                        : LayoutToolTip(c.area, c.point, t, c.chars, c.kind == ToolAlways, kMonitor, m);
    EXPECT_EQ(!IsRectEmpty(&c.window), p.show);
    EXPECT_EQ(Str(c.window), Str(p.show ? p.window : RECT{}));
    EXPECT_EQ(c.lines, static_cast<int>(p.lines.size()));
    EXPECT_EQ(c.lines != 0, p.wrapped);
    const RECT unchecked = {};
    EXPECT_EQ(Str(c.hover), Str(EqualRect(&c.hover, &unchecked) ? unchecked : p.hover));
}

INSTANTIATE_TEST_SUITE_P(Tips, PlacementTable, testing::ValuesIn(kPlacementCases), CaseName<PlacementCase>);

// The rule as stated: grow the line one character at a time, measuring after each.
Wrap WrapByCharacters(HDC hdc, const std::wstring& text, int maxWidth, int maxHeight, int& linesMeasured)
{
    Wrap r;
    for (int start = 0, length = static_cast<int>(text.size()); start < length;)
    {
        int count = 0;
        SIZE size = {};
        do
            GetTextExtentPoint32W(hdc, text.c_str() + start, ++count, &size);
        while (size.cx < maxWidth && start + count < length);
        count -= size.cx > maxWidth;
        ++linesMeasured;
        if (count == 0)
            return Wrap();
        GetTextExtentPoint32W(hdc, text.c_str() + start, count, &size);
        if (r.height + size.cy >= maxHeight)
            break;
        r.lines.push_back(Line{ start, count, size.cy });
        r.height += size.cy;
        start += count;
    }
    r.ok = true;
    return r;
}

struct CountingMeasurer : DcTextMeasurer
{
    using DcTextMeasurer::DcTextMeasurer;
    int PrefixExtents(const wchar_t* text, int count, int* widths) override
    {
        ++queries;
        return DcTextMeasurer::PrefixExtents(text, count, widths);
    }
    int queries = 0;
};

TEST(TipWrapping, FitBasedLinesEqualTheCharacterRuleOnRealFonts)
{
    struct Face { const wchar_t* name; int height; int weight; BYTE italic; };
    const Face faces[] = { { L"MS Shell Dlg", -11, FW_NORMAL, 0 }, { L"Tahoma", -13, FW_BOLD, 0 },
                           { L"Times New Roman", -17, FW_NORMAL, 1 }, { L"Liberation Serif", -15, FW_NORMAL, 0 } };
    // Kerning pairs, narrow and wide letters, accents, a CJK character, a tab; every third
    // text also has zero-width characters (zero-width space, combining acute accent).
    const std::wstring plain = L"AVAWaToTyLTfifijl.,;:!mWM \x00e4\x00df\x20ac\x6f22\t0123456789";
    const std::wstring zeroWidth = plain + L"\x200b\x0301";
    std::mt19937 random(20240611);
    HDC hdc = CreateCompatibleDC(nullptr);
    int lines = 0, queries = 0;
    for (const Face& face : faces)
    {
        HFONT font = CreateFontW(face.height, 0, 0, 0, face.weight, face.italic, 0, 0, 0, 0, 0, 0, 0, face.name);
        HGDIOBJ old = SelectObject(hdc, font);
        TEXTMETRICW tm;
        GetTextMetricsW(hdc, &tm);
        for (int i = 0; i < 150; ++i)
        {
            const std::wstring& alphabet = i % 3 == 2 ? zeroWidth : plain;
            std::wstring text(1 + random() % 300, L' ');
            for (wchar_t& c : text)
                c = alphabet[random() % alphabet.size()];
            const int maxWidth = 1 + static_cast<int>(random() % 250);
            const int maxHeight = tm.tmHeight * static_cast<int>(1 + random() % 12);
            int measured = 0;
            const Wrap expected = WrapByCharacters(hdc, text, maxWidth, maxHeight, measured);
            CountingMeasurer measurer(hdc);
            const Wrap actual = WrapText(text.c_str(), static_cast<int>(text.size()), maxWidth, maxHeight, measurer);
            SCOPED_TRACE(testing::Message() << face.name << " text " << i << " width " << maxWidth);
            ASSERT_EQ(Joined(text, expected.ok, expected.lines), Joined(text, actual.ok, actual.lines));
            for (size_t k = 0; k < actual.lines.size(); ++k)
                ASSERT_EQ(expected.lines[k].height, actual.lines[k].height) << "line " << k;
            if (&alphabet == &plain)
            {
                EXPECT_EQ(measured, measurer.queries);
                lines += measured;
                queries += measurer.queries;
            }
        }
        SelectObject(hdc, old);
        DeleteObject(font);
    }
    DeleteDC(hdc);
    std::printf("wrapping: %d lines measured with %d extent queries\n", lines, queries);
}

} // namespace
