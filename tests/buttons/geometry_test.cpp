// Window-free rules of the buttons family:
//  - colour palette grid: cell rectangles, hover and release hit tests (gaps, margins,
//    outside), popup size and Other... button place, keeping the popup on screen;
//  - keyboard moves of the popup's hover, with and without the Other... button;
//  - bitmap buttons: bitmap and colour map chosen per kind and state, centring.
#include "ButtonLook.h"
#include "ColorGridGeometry.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <vector>

namespace {

using ColorGridGeometry::ColorGridLayout;

std::string RectText(const RECT& r)
{
    return "(" + std::to_string(r.left) + ", " + std::to_string(r.top) + ", " + std::to_string(r.right)
           + ", " + std::to_string(r.bottom) + ")";
}

::testing::AssertionResult RectIs(const RECT& actual, int l, int t, int r, int b)
{
    if (actual.left == l && actual.top == t && actual.right == r && actual.bottom == b)
        return ::testing::AssertionSuccess();
    RECT expected = { l, t, r, b };
    return ::testing::AssertionFailure() << "actual " << RectText(actual) << ", expected " << RectText(expected);
}

ColorGridLayout Spaced()
{
    ColorGridLayout l;
    l.rows = 3;
    l.columns = 4;
    l.buttonWidth = 12;
    l.buttonHeight = 10;
    l.gapHorizontal = 3;
    l.gapVertical = 2;
    l.border = 5;
    return l;
}

// ---------------------------------------------------------------------------
// Cells

TEST(ColorGridCells, RectanglesIncludeGapsButtonsDoNot)
{
    const ColorGridLayout l = Spaced();
    // Cell 6: row 1, column 2.
    EXPECT_TRUE(RectIs(ColorGridGeometry::CellRect(l, 6), 5 + 2 * 15, 5 + 12, 5 + 3 * 15, 5 + 2 * 12));
    EXPECT_TRUE(RectIs(ColorGridGeometry::CellButtonRect(l, 6), 35, 17, 47, 27));
    EXPECT_TRUE(RectIs(ColorGridGeometry::CellRect(ColorGridLayout(), 0), 0, 0, 20, 20));
    EXPECT_TRUE(RectIs(ColorGridGeometry::CellRect(ColorGridLayout(), 19), 60, 80, 80, 100));
}

struct HitCase
{
    const char* name;
    int x, y;
    int hover;     // CellFromHoverPoint
    int release;   // CellFromReleasePoint
};

// Layout Spaced(): columns start at 5, 20, 35, 50 (buttons 12 wide, gaps 3); rows at
// 5, 17, 29 (buttons 10 high, gaps 2); the grid ends at x 65 and y 41.
const HitCase kHitCases[] = {
    { "FirstButton", 6, 6, 0, 0 },
    { "Row1Col2", 40, 20, 6, 6 },
    { "LastButton", 61, 38, 11, 11 },
    { "ButtonLeftEdge", 5, 10, -1, 0 },     // hover needs x > border; the button starts there
    { "ButtonTopEdge", 10, 5, -1, 0 },
    { "HorizontalGap", 18, 10, 0, -1 },     // gap right of cell 0: hovered, not picked
    { "VerticalGap", 10, 16, 0, -1 },
    { "GapCorner", 33, 28, 5, -1 },
    { "LeftMargin", 2, 10, -1, -1 },
    { "TopMargin", 10, 2, -1, -1 },
    { "RightOfGrid", 65, 10, -1, -1 },
    { "BelowGrid", 10, 41, -1, -1 },
    { "FarNegative", -40, -40, -1, -1 },
    { "FarOutside", 5000, 5000, -1, -1 },
};

TEST(ColorGridHit, HoverAndRelease)
{
    for (const HitCase& c : kHitCases)
    {
        EXPECT_EQ(c.hover, ColorGridGeometry::CellFromHoverPoint(Spaced(), c.x, c.y)) << c.name;
        EXPECT_EQ(c.release, ColorGridGeometry::CellFromReleasePoint(Spaced(), c.x, c.y)) << c.name;
    }
}

TEST(ColorGridCells, DefaultGridRow1Column2IsWhite)
{
    const ColorGridLayout l;
    const int index = ColorGridGeometry::CellFromReleasePoint(l, 2 * 20 + 10, 1 * 20 + 10);
    ASSERT_EQ(6, index);
    EXPECT_EQ(0xFFFFFFu, ColorGridGeometry::DefaultPaletteColors().at(index));
    EXPECT_EQ(20u, ColorGridGeometry::DefaultPaletteColors().size());
}

// ---------------------------------------------------------------------------
// Popup size and placement

TEST(ColorPopupGeometry, DefaultSizeWithAndWithoutOtherButton)
{
    const ColorGridLayout l;
    SIZE with = ColorGridGeometry::PopupSize(l, true, 3, 23);
    EXPECT_EQ(4 * 20 + 2 * 3, with.cx);
    EXPECT_EQ(5 * 20 + 3 + 2 + 23 + 3, with.cy);
    SIZE without = ColorGridGeometry::PopupSize(l, false, 3, 23);
    EXPECT_EQ(with.cx, without.cx);
    EXPECT_EQ(5 * 20 + 3 + 2, without.cy);
}

TEST(ColorPopupGeometry, SpacedSizeAndOtherButton)
{
    const ColorGridLayout l = Spaced();
    SIZE size = ColorGridGeometry::PopupSize(l, true, 3, 20);
    EXPECT_EQ(4 * 12 + 3 * 3 + 2 * (5 + 3), size.cx);
    EXPECT_EQ(3 * 10 + 2 * 2 + 2 * 5 + 3 + 2 + 20 + 3, size.cy);
    RECT other = ColorGridGeometry::OtherButtonRect(l, size, 3, 20);
    EXPECT_TRUE(RectIs(other, 8, size.cy - 5 - 3 - 3 - 20, size.cx - 6 - 5 - 3, size.cy - 5 - 3 - 3));
}

struct PlaceCase
{
    const char* name;
    POINT origin;
    POINT expected;
};

const RECT kScreen = { 0, 0, 1280, 1024 };
const SIZE kPopup = { 86, 131 };

const PlaceCase kPlaceCases[] = {
    { "Inside", { 100, 200 }, { 100, 200 } },
    { "TouchesBottom", { 100, 1024 - 131 }, { 100, 1024 - 131 } },
    { "BelowBottom", { 100, 1000 }, { 100, 1024 - 131 } },
    { "BeyondRight", { 1250, 200 }, { 1280 - 86, 200 } },
    { "BottomRightCorner", { 1279, 1023 }, { 1280 - 86, 1024 - 131 } },
    { "NegativeBecomesZero", { -20, -7 }, { 0, 0 } },
};

TEST(ColorPopupPlacement, KeepsInside)
{
    for (const PlaceCase& c : kPlaceCases)
    {
        const POINT pt = ColorGridGeometry::KeepPopupInside(c.origin, kPopup, kScreen);
        EXPECT_EQ(c.expected.x, pt.x) << c.name;
        EXPECT_EQ(c.expected.y, pt.y) << c.name;
    }
}

TEST(ColorPopupGeometry, PopupTallerThanScreenSticksToTop)
{
    SIZE huge = { 100, 2000 };
    POINT pt = ColorGridGeometry::KeepPopupInside(POINT{ 10, 500 }, huge, kScreen);
    EXPECT_EQ(10, pt.x);
    EXPECT_EQ(0, pt.y);
}

// ---------------------------------------------------------------------------
// Keyboard

struct KeyCase
{
    const char* name;
    UINT vk;
    int hover;
    bool other;
    int expected;
};

// Default grid: 5 rows x 4 columns, n = 20.
const KeyCase kKeyCases[] = {
    { "HomeFromAnywhere", VK_HOME, 13, true, 0 },
    { "HomeFromOther", VK_HOME, -1, true, 0 },
    { "End", VK_END, 3, true, 19 },
    { "LeftInside", VK_LEFT, 5, true, 4 },
    { "LeftFromFirstToOther", VK_LEFT, 0, true, -1 },
    { "LeftFromFirstWithoutOther", VK_LEFT, 0, false, 19 },
    { "LeftFromOtherToLast", VK_LEFT, -1, true, 19 },
    { "LeftFromNothingToLast", VK_LEFT, -1, false, 19 },
    { "RightInside", VK_RIGHT, 5, true, 6 },
    { "RightFromLastToOther", VK_RIGHT, 19, true, -1 },
    { "RightFromLastWithoutOther", VK_RIGHT, 19, false, -1 },
    { "RightFromOtherToFirst", VK_RIGHT, -1, true, 0 },
    { "UpInside", VK_UP, 9, true, 5 },
    { "UpFromFirstRowToOther", VK_UP, 2, true, -1 },
    { "UpFromOtherToLastRow", VK_UP, -1, true, 16 },
    { "DownInside", VK_DOWN, 5, true, 9 },
    { "DownFromLastRowToOther", VK_DOWN, 17, true, -1 },
    { "DownFromOtherToFirst", VK_DOWN, -1, false, 0 },
};

TEST(ColorPopupKeys, MovesHover)
{
    for (const KeyCase& c : kKeyCases)
    {
        int hover = 12345;
        ASSERT_TRUE(ColorGridGeometry::MoveHoverByKey(ColorGridLayout(), c.hover, c.vk, c.other, hover)) << c.name;
        EXPECT_EQ(c.expected, hover) << c.name;
    }
}

TEST(ColorPopupKeysOther, OtherKeysAreNotMoves)
{
    int hover = 7;
    EXPECT_FALSE(ColorGridGeometry::MoveHoverByKey(ColorGridLayout(), 3, VK_ESCAPE, true, hover));
    EXPECT_FALSE(ColorGridGeometry::MoveHoverByKey(ColorGridLayout(), 3, VK_RETURN, true, hover));
    EXPECT_EQ(7, hover);
}

// ---------------------------------------------------------------------------
// Bitmap button looks

using ButtonLook::Kind;

const ButtonLook::SysColors kColors = { 0xC0C0C0, 0xFFFFFF, 0x808080 };
const COLORREF kFace = kColors.face;
const COLORREF kHi = kColors.highlight;
const COLORREF kSh = kColors.shadow;
const COLORREF kMagenta = 0xFF00FF;

using ColourMap = std::vector<std::pair<COLORREF, COLORREF>>;
const ColourMap kPressedMap = { { kMagenta, kFace }, { 0x808080, kSh }, { 0xFFFFFF, kHi } };
const ColourMap kGreyedMap = { { kMagenta, kFace }, { 0x808080, kHi }, { 0x000000, kSh } };

struct LookCase
{
    const char* name;
    Kind kind;
    bool pressed;
    bool enabled;
    UINT normal, pressedBitmap, disabled;
    COLORREF key;
    UINT bitmap;
    ColourMap map;
};

const LookCase kLookCases[] = {
    { "PushNormal", Kind::Push, false, true, 101, 102, 103, kMagenta, 101, { { kMagenta, kFace } } },
    { "PushPressed", Kind::Push, true, true, 101, 102, 103, kMagenta, 102, kPressedMap },
    { "PushPressedDisabledIgnoresEnable", Kind::Push, true, false, 101, 102, 103, kMagenta, 102, kPressedMap },
    { "PushDisabled", Kind::Push, false, false, 101, 102, 103, kMagenta, 103, { { kMagenta, kFace } } },
    { "PushGreyedWithoutDisabledBitmap", Kind::Push, false, false, 101, 102, 0, kMagenta, 101, kGreyedMap },
    { "PushNothingWithoutBitmaps", Kind::Push, false, false, 0, 102, 0, kMagenta, 0, {} },
    { "PushPressedWithoutPressedBitmap", Kind::Push, true, true, 101, 0, 103, kMagenta, 0, {} },
    { "MomentaryPressed", Kind::Momentary, true, true, 101, 102, 103, kMagenta, 102, kPressedMap },
    { "CheckNormalKeyIsFace", Kind::Check, false, true, 101, 102, 103, 0xFFFFFFFF, 101, { { kFace, kFace } } },
    { "CheckCheckedLightsKey", Kind::Check, true, true, 101, 102, 103, 0xFFFFFFFF, 102,
      { { kFace, kHi }, { 0x808080, kSh }, { 0xFFFFFF, kHi } } },
    { "CheckCheckedDisabled", Kind::Check, true, false, 101, 102, 103, kMagenta, 102,
      { { kMagenta, kFace }, { 0x808080, kHi }, { 0x000000, kSh }, { 0xFFFFFF, kHi } } },
    { "CheckGreyed", Kind::Check, false, false, 101, 102, 0, kMagenta, 101, kGreyedMap },
};

TEST(BitmapButtonLook, BitmapAndMap)
{
    for (const LookCase& c : kLookCases)
    {
        const ButtonLook::Look look = ButtonLook::Choose(c.kind, c.pressed, c.enabled, c.normal, c.pressedBitmap,
                                                         c.disabled, c.key, kColors);
        EXPECT_EQ(c.bitmap, look.bitmap) << c.name;
        ColourMap map;
        for (int i = 0; i < look.mapCount; ++i)
            map.emplace_back(look.map[i].from, look.map[i].to);
        EXPECT_EQ(c.map, map) << c.name;
    }
}

TEST(BitmapButtonLookCentre, IntegerDivision)
{
    RECT client = { 0, 0, 33, 20 };
    POINT pt = ButtonLook::CenteredOrigin(client, 16, 15);
    EXPECT_EQ(8, pt.x);
    EXPECT_EQ(2, pt.y);
    RECT small = { 0, 0, 10, 10 };
    pt = ButtonLook::CenteredOrigin(small, 16, 16);
    EXPECT_EQ(-3, pt.x);
    EXPECT_EQ(-3, pt.y);
}

} // namespace
