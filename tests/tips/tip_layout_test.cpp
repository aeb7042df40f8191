// Tip layout without windows:
//  - character wrapping: a line exactly as wide as the limit keeps its last character, one
//    pixel more gives it back; a character wider than the limit shows nothing; the line
//    that would reach the monitor's height is dropped with the rest; zero-width characters;
//  - tool tip: fit test (fits, one pixel wider, always), monitor edges touched and crossed,
//    shift at the right edge, wider than the monitor (wrapped), above the area or not,
//    moved up at the bottom, wholly outside the monitor, hover rectangle;
//  - title tip: fit test with the margin on both sides, cut at the right edge, wrapped
//    downward, moved up at the bottom with the hover rectangle following;
//  - with real fonts, the fit-based wrapping gives exactly the lines of measuring after
//    every character, at one extent query per line.
#include <windows.h>

#include <gtest/gtest.h>

#include <random>
#include <string>

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
    if (!ok)
        return L"none";
    std::wstring out;
    for (const Line& line : lines)
        out += (out.empty() ? L"" : L"/") + text.substr(line.start, line.length);
    return out;
}

struct WrapCase
{
    const char* name;
    const wchar_t* text;
    int maxWidth;
    int maxHeight;
    const wchar_t* lines;
    int queries;
};

const WrapCase kWrapCases[] = {
    { "LineAsWideAsTheLimitKeepsItsLastCharacter", L"aaaaa", 12, 100, L"aa/aa/a", 3 },
    { "OnePixelOverGivesTheCharacterBack", L"aaaaa", 11, 100, L"a/a/a/a/a", 5 },
    { "SplitsInsideWords", L"Wide iWi", 20, 100, L"Wid/e i/Wi", 3 },
    { "CharacterWiderThanTheLimit", L"aaW", 9, 100, L"none", 3 },
    { "LineReachingTheMonitorHeightIsDropped", L"aaaaaaa", 12, 30, L"aa/aa", 3 },
    { "FirstLineAlreadyTooHigh", L"aaa", 12, 10, L"", 1 },
    { "ZeroWidthCharactersNeedALongerQuery", L"i||||||||i", 3, 100, L"i||||||||/i", 4 },
    { "ZeroWidthAfterAFullLineStaysOnIt", L"aa|a", 12, 100, L"aa/|a", 2 },
};

class WrapTable : public testing::TestWithParam<WrapCase> {};

TEST_P(WrapTable, Lines)
{
    const WrapCase& c = GetParam();
    TableMeasurer m;
    const std::wstring text = c.text;
    const Wrap wrap = WrapText(text.c_str(), static_cast<int>(text.size()), c.maxWidth, c.maxHeight, m);
    EXPECT_EQ(std::wstring(c.lines), Joined(text, wrap.ok, wrap.lines));
    if (wrap.ok)
    {
        EXPECT_EQ(10 * static_cast<int>(wrap.lines.size()), wrap.height);
    }
    EXPECT_EQ(c.queries, m.queries);
}

INSTANTIATE_TEST_SUITE_P(Tips, WrapTable, testing::ValuesIn(kWrapCases),
                         [](const testing::TestParamInfo<WrapCase>& info) { return std::string(info.param.name); });

// Monitor 1000 x 800; area 20 high at (100, 100); texts of 'a' are 6 pixels per character.
const RECT kMonitor = { 0, 0, 1000, 800 };

struct ToolTipCase
{
    const char* name;
    RECT area;
    POINT point;
    int chars;
    bool always;
    bool show;
    RECT window;
    int lines;   // 0: single line
};

const ToolTipCase kToolTipCases[] = {
    { "FitsShowsNothing", { 100, 100, 163, 120 }, { 110, 100 }, 10, false, false, {}, 0 },
    { "OnePixelWiderShows", { 100, 100, 162, 120 }, { 110, 100 }, 10, false, true, { 110, 100, 173, 120 }, 0 },
    { "AlwaysShowsAFittingText", { 100, 100, 163, 120 }, { 110, 100 }, 10, true, true, { 110, 100, 173, 120 }, 0 },
    { "TouchingTheLeftEdgeShowsAFittingText", { 0, 100, 163, 120 }, { 0, 100 }, 10, false, true, { 0, 100, 63, 120 }, 0 },
    { "CrossingTheLeftEdgeMovesRight", { 0, 100, 40, 120 }, { -5, 100 }, 10, false, true, { 0, 100, 63, 120 }, 0 },
    { "TouchingTheRightEdgeShows", { 900, 100, 1000, 120 }, { 937, 100 }, 10, false, true, { 937, 100, 1000, 120 }, 0 },
    { "CrossingTheRightEdgeShiftsLeft", { 900, 100, 1000, 120 }, { 990, 100 }, 10, false, true, { 937, 100, 1000, 120 }, 0 },
    { "WhollyOutsideIsNotMoved", { 900, 100, 1000, 120 }, { 1200, 100 }, 10, false, true, { 1200, 100, 1263, 120 }, 0 },
    // 200 characters: 1200 pixels; lines of 166 characters (996 <= 999 < 1002) and 34.
    { "WiderThanTheMonitorWrapsAndGoesAboveTheArea", { 100, 100, 300, 120 }, { 110, 100 }, 200, false, true,
      { 0, 74, 1000, 95 }, 2 },
    { "NoRoomAboveStaysBelowThePoint", { 100, 20, 300, 40 }, { 110, 20 }, 200, false, true, { 0, 20, 1000, 41 }, 2 },
    { "WrappedBeyondTheBottomMovesUp", { 100, 700, 300, 770 }, { 110, 790 }, 200, false, true,
      { 0, 779, 1000, 800 }, 2 },
};

class ToolTipTable : public testing::TestWithParam<ToolTipCase> {};

TEST_P(ToolTipTable, Placement)
{
    const ToolTipCase& c = GetParam();
    TableMeasurer m;
    const std::wstring text(c.chars, L'a');
    const Placement p = LayoutToolTip(c.area, c.point, text.c_str(), c.chars, c.always, kMonitor, m);
    ASSERT_EQ(c.show, p.show);
    if (!c.show)
        return;
    EXPECT_EQ(c.window.left, p.window.left);
    EXPECT_EQ(c.window.top, p.window.top);
    EXPECT_EQ(c.window.right, p.window.right);
    EXPECT_EQ(c.window.bottom, p.window.bottom);
    EXPECT_EQ(c.lines, static_cast<int>(p.lines.size()));
    EXPECT_EQ(c.lines != 0, p.wrapped);
    // The area, right and bottom edges included, in the tip's client coordinates.
    EXPECT_EQ(c.area.left - p.window.left - 1, p.hover.left);
    EXPECT_EQ(c.area.top - p.window.top - 1, p.hover.top);
    EXPECT_EQ(c.area.right - p.window.left, p.hover.right);
    EXPECT_EQ(c.area.bottom - p.window.top, p.hover.bottom);
}

INSTANTIATE_TEST_SUITE_P(Tips, ToolTipTable, testing::ValuesIn(kToolTipCases),
                         [](const testing::TestParamInfo<ToolTipCase>& info) { return std::string(info.param.name); });

struct TitleTipCase
{
    const char* name;
    RECT cell;
    int offset;
    int chars;
    bool show;
    RECT window;
    int lines;
    RECT hover;
};

const TitleTipCase kTitleTipCases[] = {
    // 10 characters: 60 + 3 + 2 x 5 = 73.
    { "FitsWithTheMarginOnBothSides", { 100, 100, 173, 117 }, 5, 10, false, {}, 0, { -1, -1, 68, 18 } },
    { "OnePixelMoreCoversTheCellFromTheText", { 100, 100, 172, 117 }, 5, 10, true, { 105, 100, 168, 117 }, 0,
      { -1, -1, 67, 18 } },
    { "CutAtTheRightEdgeKeepsTheTextStart", { 934, 100, 990, 117 }, 5, 10, true, { 939, 100, 1000, 117 }, 0,
      { -1, -1, 51, 18 } },
    { "CrossingTheLeftEdgeMovesRight", { -50, 100, 20, 117 }, 5, 10, true, { 0, 100, 63, 117 }, 0,
      { -1, -1, 65, 18 } },
    // 30 characters in 75 pixels: L = 74, 12 characters per line (72), three lines.
    { "LongerThanTheRoomWrapsDownward", { 900, 100, 990, 117 }, 25, 30, true, { 925, 100, 1000, 131 }, 3,
      { -1, -1, 65, 18 } },
    { "WrappedAtTheBottomMovesUpWithTheHover", { 900, 780, 990, 797 }, 25, 30, true, { 925, 769, 1000, 800 }, 3,
      { -1, 10, 65, 29 } },
};

class TitleTipTable : public testing::TestWithParam<TitleTipCase> {};

TEST_P(TitleTipTable, Placement)
{
    const TitleTipCase& c = GetParam();
    TableMeasurer m;
    const std::wstring text(c.chars, L'a');
    const Placement p = LayoutTitleTip(c.cell, c.offset, text.c_str(), c.chars, kMonitor, m);
    EXPECT_EQ(c.show, p.show);
    EXPECT_EQ(c.hover.left, p.hover.left);
    EXPECT_EQ(c.hover.top, p.hover.top);
    EXPECT_EQ(c.hover.right, p.hover.right);
    EXPECT_EQ(c.hover.bottom, p.hover.bottom);
    if (!c.show)
        return;
    EXPECT_EQ(c.window.left, p.window.left);
    EXPECT_EQ(c.window.top, p.window.top);
    EXPECT_EQ(c.window.right, p.window.right);
    EXPECT_EQ(c.window.bottom, p.window.bottom);
    EXPECT_EQ(c.lines, static_cast<int>(p.lines.size()));
}

INSTANTIATE_TEST_SUITE_P(Tips, TitleTipTable, testing::ValuesIn(kTitleTipCases),
                         [](const testing::TestParamInfo<TitleTipCase>& info) { return std::string(info.param.name); });

// The rule as stated: grow the line one character at a time, measuring after each.
struct Reference
{
    Wrap wrap;
    int linesMeasured = 0;
};

Reference WrapByCharacters(HDC hdc, const std::wstring& text, int maxWidth, int maxHeight)
{
    Reference r;
    const int length = static_cast<int>(text.size());
    for (int start = 0; start < length;)
    {
        int count = 0;
        SIZE size = {};
        do
            GetTextExtentPoint32W(hdc, text.c_str() + start, ++count, &size);
        while (size.cx < maxWidth && start + count < length);
        if (size.cx > maxWidth)
            --count;
        ++r.linesMeasured;
        if (count == 0)
            return r;
        GetTextExtentPoint32W(hdc, text.c_str() + start, count, &size);
        if (r.wrap.height + size.cy >= maxHeight)
            break;
        r.wrap.lines.push_back(Line{ start, count, size.cy });
        r.wrap.height += size.cy;
        start += count;
    }
    r.wrap.ok = true;
    return r;
}

class CountingMeasurer : public DcTextMeasurer
{
public:
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
    // Kerning pairs, narrow and wide letters, accents, a CJK character; the second
    // alphabet adds zero-width characters (zero-width space, combining acute accent).
    const std::wstring plain = L"AVAWaToTyLTfifijl.,;:!mWM \x00e4\x00df\x20ac\x6f22\t0123456789";
    const std::wstring zeroWidth = plain + L"\x200b\x0301";
    std::mt19937 random(20240611);
    HDC hdc = CreateCompatibleDC(nullptr);
    int texts = 0, lines = 0, queries = 0;
    for (const Face& face : faces)
    {
        LOGFONTW lf = {};
        lf.lfHeight = face.height;
        lf.lfWeight = face.weight;
        lf.lfItalic = face.italic;
        lstrcpynW(lf.lfFaceName, face.name, LF_FACESIZE);
        HFONT font = CreateFontIndirectW(&lf);
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
            const Reference expected = WrapByCharacters(hdc, text, maxWidth, maxHeight);
            CountingMeasurer measurer(hdc);
            const Wrap actual = WrapText(text.c_str(), static_cast<int>(text.size()), maxWidth, maxHeight, measurer);
            SCOPED_TRACE(testing::Message() << face.name << " text " << i << " width " << maxWidth << " height " << maxHeight);
            ASSERT_EQ(Joined(text, expected.wrap.ok, expected.wrap.lines), Joined(text, actual.ok, actual.lines));
            for (size_t k = 0; k < actual.lines.size(); ++k)
                ASSERT_EQ(expected.wrap.lines[k].height, actual.lines[k].height) << "line " << k;
            if (alphabet.size() == plain.size())
            {
                EXPECT_EQ(expected.linesMeasured, measurer.queries);
                ++texts;
                lines += expected.linesMeasured;
                queries += measurer.queries;
            }
        }
        SelectObject(hdc, old);
        DeleteObject(font);
    }
    DeleteDC(hdc);
    RecordProperty("ExtentQueriesPerLine", testing::PrintToString(static_cast<double>(queries) / lines));
    std::printf("wrapping: %d texts, %d lines measured, %d extent queries\n", texts, lines, queries);
}

} // namespace
