// Spin arithmetic without a window:
//  - the spin's rectangle beside an edit (odd and even heights);
//  - hit areas and painted halves for even and odd heights, row by row at the edges;
//  - glyph rectangles and points, raised and pressed;
//  - timer tick rules (first repeat, two- and five-second calls) over a long hold;
//  - the slider distance curve, both signs, its knee and absurd distances.
#include "SpinGeometry.h"

#include <gtest/gtest.h>

#include <climits>
#include <ostream>
#include <string>
#include <vector>

namespace {

using namespace SpinGeometry;

struct R
{
    int left, top, right, bottom;
};

bool operator==(const RECT& a, const R& b)
{
    return a.left == b.left && a.top == b.top && a.right == b.right && a.bottom == b.bottom;
}

::testing::AssertionResult RectIs(const RECT& actual, const R& expected)
{
    if (actual == expected)
        return ::testing::AssertionSuccess();
    return ::testing::AssertionFailure()
        << "actual (" << actual.left << ", " << actual.top << ", " << actual.right << ", " << actual.bottom
        << "), expected (" << expected.left << ", " << expected.top << ", " << expected.right << ", "
        << expected.bottom << ")";
}

const char* AreaName(SpinArea a)
{
    switch (a)
    {
    case SpinArea::Up: return "Up";
    case SpinArea::Band: return "Band";
    case SpinArea::Down: return "Down";
    default: return "None";
    }
}

// ---------------------------------------------------------------------------
// Rectangle beside the edit

struct BesideCase
{
    const char* name;
    R edit;
    R spin;
};

void PrintTo(const BesideCase& c, std::ostream* os) { *os << c.name; }

const BesideCase kBesideCases[] = {
    // Height 21: 21 + 2 = 23 is odd, rounded down to 22.
    { "OddHeight", { 10, 20, 110, 41 }, { 110, 19, 125, 41 } },
    // Height 20: 22 stays.
    { "EvenHeight", { 0, 0, 50, 20 }, { 50, -1, 65, 21 } },
    { "Empty", { 5, 5, 5, 5 }, { 5, 4, 20, 6 } },
    // A reversed rectangle yields a reversed (empty) spin, not garbage.
    { "Reversed", { 100, 50, 40, 40 }, { 40, 49, 55, 41 } },
};

class SpinBesideEdit : public ::testing::TestWithParam<BesideCase> {};

TEST_P(SpinBesideEdit, Rectangle)
{
    const BesideCase& c = GetParam();
    RECT edit = { c.edit.left, c.edit.top, c.edit.right, c.edit.bottom };
    EXPECT_TRUE(RectIs(SpinRectBesideEdit(edit), c.spin));
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinBesideEdit, ::testing::ValuesIn(kBesideCases),
                         [](const ::testing::TestParamInfo<BesideCase>& i) { return std::string(i.param.name); });

// ---------------------------------------------------------------------------
// Hit areas

struct HitCase
{
    const char* name;
    int width, height;
    int x, y;
    SpinArea area;
};

void PrintTo(const HitCase& c, std::ostream* os) { *os << c.name; }

const HitCase kHitCases[] = {
    // H = 20: up rows 0-7, band 8-11, down 12-19.
    { "H20_TopLeft", 15, 20, 0, 0, SpinArea::Up },
    { "H20_LastUpRow", 15, 20, 14, 7, SpinArea::Up },
    { "H20_FirstBandRow", 15, 20, 0, 8, SpinArea::Band },
    { "H20_LastBandRow", 15, 20, 7, 11, SpinArea::Band },
    { "H20_FirstDownRow", 15, 20, 7, 12, SpinArea::Down },
    { "H20_LastDownRow", 15, 20, 7, 19, SpinArea::Down },
    { "H20_BelowClient", 15, 20, 7, 20, SpinArea::None },
    { "H20_AboveClient", 15, 20, 7, -1, SpinArea::None },
    { "H20_RightOfClient", 15, 20, 15, 3, SpinArea::None },
    { "H20_LeftOfClient", 15, 20, -1, 15, SpinArea::None },
    // H = 22 (the spin of a 21-pixel edit): h = 11, up 0-8, band 9-12, down 13-21.
    { "H22_LastUpRow", 15, 22, 3, 8, SpinArea::Up },
    { "H22_BandTop", 15, 22, 3, 9, SpinArea::Band },
    { "H22_BandBottom", 15, 22, 3, 12, SpinArea::Band },
    { "H22_FirstDownRow", 15, 22, 3, 13, SpinArea::Down },
    // The buddy's Down key presses (0, H - 3): always in the down area.
    { "H22_DownKeyPoint", 15, 22, 0, 19, SpinArea::Down },
    { "H20_DownKeyPoint", 15, 20, 0, 17, SpinArea::Down },
    // Odd H = 21: h = 10, up 0-7, band 8-11, down 12-20.
    { "H21_Band", 15, 21, 3, 11, SpinArea::Band },
    { "H21_Down", 15, 21, 3, 20, SpinArea::Down },
    // Degenerate: a tiny spin has no up area and a band above the client area.
    { "H2_Row0", 15, 2, 3, 0, SpinArea::Band },
    { "H0_Row0", 15, 0, 3, 0, SpinArea::Band },
    { "W0_NothingHit", 0, 20, 0, 3, SpinArea::None },
    { "HugePoint", 15, 20, INT_MAX, INT_MIN, SpinArea::None },
};

class SpinHitTest : public ::testing::TestWithParam<HitCase> {};

TEST_P(SpinHitTest, Area)
{
    const HitCase& c = GetParam();
    POINT pt = { c.x, c.y };
    EXPECT_STREQ(AreaName(c.area), AreaName(HitTest(c.width, c.height, pt)));
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinHitTest, ::testing::ValuesIn(kHitCases),
                         [](const ::testing::TestParamInfo<HitCase>& i) { return std::string(i.param.name); });

TEST(SpinAreas, RectanglesForHeight20)
{
    EXPECT_TRUE(RectIs(UpHitRect(15, 20), { 0, 0, 15, 8 }));
    EXPECT_TRUE(RectIs(SliderBandRect(15, 20), { 0, 8, 15, 12 }));
    EXPECT_TRUE(RectIs(DownHitRect(15, 20), { 0, 12, 15, 20 }));
    // Painting: rows 0-9 and 10-19.
    EXPECT_TRUE(RectIs(UpperHalfRect(15, 20), { 0, 0, 15, 10 }));
    EXPECT_TRUE(RectIs(LowerHalfRect(15, 20), { 0, 10, 15, 20 }));
}

TEST(SpinAreas, OddHeightLeavesMiddleRowToNeitherHalf)
{
    EXPECT_TRUE(RectIs(UpperHalfRect(15, 21), { 0, 0, 15, 10 }));
    EXPECT_TRUE(RectIs(LowerHalfRect(15, 21), { 0, 11, 15, 21 }));
}

TEST(SpinAreas, EveryRowOfTheClientAreaHitsExactlyOneArea)
{
    for (int height : { 4, 5, 20, 21, 22, 40 })
    {
        std::string areas;
        for (int y = 0; y < height; ++y)
        {
            int hits = 0;
            for (const RECT& r : { UpHitRect(15, height), SliderBandRect(15, height), DownHitRect(15, height) })
                hits += (y >= r.top && y < r.bottom) ? 1 : 0;
            EXPECT_EQ(1, hits) << "height " << height << " row " << y;
            areas += AreaName(HitTest(15, height, POINT{ 7, y }))[0];
        }
        // Up rows, then four band rows, then down rows.
        const int h = height / 2;
        const std::string expected = std::string(h - 2, 'U') + "BBBB" + std::string(height - h - 2, 'D');
        EXPECT_EQ(expected, areas) << "height " << height;
    }
}

// ---------------------------------------------------------------------------
// Glyphs

struct GlyphCase
{
    const char* name;
    int height;
    bool upper;
    bool pressed;
    R glyphRect;
    POINT points[3];
};

void PrintTo(const GlyphCase& c, std::ostream* os) { *os << c.name; }

const GlyphCase kGlyphCases[] = {
    // Spin of a 21-pixel edit: 15 x 22.
    { "H22_UpRaised", 22, true, false, { 1, 4, 14, 7 }, { { 5, 6 }, { 6, 5 }, { 7, 6 } } },
    { "H22_UpPressed", 22, true, true, { 2, 5, 15, 8 }, { { 5, 7 }, { 6, 6 }, { 7, 7 } } },
    { "H22_DownRaised", 22, false, false, { 1, 15, 14, 18 }, { { 5, 15 }, { 6, 16 }, { 7, 15 } } },
    { "H22_DownPressed", 22, false, true, { 2, 16, 15, 19 }, { { 5, 16 }, { 6, 17 }, { 7, 16 } } },
    { "H20_UpRaised", 20, true, false, { 1, 4, 14, 6 }, { { 5, 5 }, { 6, 4 }, { 7, 5 } } },
    { "H20_DownRaised", 20, false, false, { 1, 14, 14, 16 }, { { 5, 13 }, { 6, 14 }, { 7, 13 } } },
};

class SpinGlyph : public ::testing::TestWithParam<GlyphCase> {};

TEST_P(SpinGlyph, RectangleAndPoints)
{
    const GlyphCase& c = GetParam();
    const RECT half = c.upper ? UpperHalfRect(15, c.height) : LowerHalfRect(15, c.height);
    const RECT glyph = GlyphRect(half, c.pressed);
    EXPECT_TRUE(RectIs(glyph, c.glyphRect));
    POINT pts[3];
    if (c.upper)
        UpGlyphPoints(glyph, pts);
    else
        DownGlyphPoints(glyph, pts);
    for (int i = 0; i < 3; ++i)
    {
        EXPECT_EQ(c.points[i].x, pts[i].x) << "point " << i;
        EXPECT_EQ(c.points[i].y, pts[i].y) << "point " << i;
    }
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinGlyph, ::testing::ValuesIn(kGlyphCases),
                         [](const ::testing::TestParamInfo<GlyphCase>& i) { return std::string(i.param.name); });

// ---------------------------------------------------------------------------
// Timer ticks

TEST(SpinTicks, SixtyTicksOfAHeldArrow)
{
    // One letter per tick: '.' rests, 's' steps, 'S' steps then two-second call,
    // 'F' steps then five-second call.
    std::string trace;
    for (int tick = 1; tick <= 60; ++tick)
    {
        const TickActions a = TickRule(tick);
        EXPECT_FALSE(a.twoSecs && a.fiveSecs) << "tick " << tick;
        trace += a.fiveSecs ? 'F' : a.twoSecs ? 'S' : a.step ? 's' : '.';
    }
    const std::string expected = std::string(5, '.') + std::string(14, 's') + "S" + std::string(29, 's') + "F" +
                                 std::string(10, 's');
    EXPECT_EQ(expected, trace);
}

TEST(SpinTicks, NoActionBeforeTheFirstTickAndCountSaturates)
{
    for (int tick : { INT_MIN, -1, 0 })
    {
        const TickActions a = TickRule(tick);
        EXPECT_FALSE(a.step || a.twoSecs || a.fiveSecs) << "tick " << tick;
    }
    EXPECT_EQ(1, NextTick(0));
    EXPECT_EQ(INT_MAX, NextTick(INT_MAX - 1));
    EXPECT_EQ(INT_MAX, NextTick(INT_MAX));
    EXPECT_TRUE(TickRule(INT_MAX).step);
    EXPECT_FALSE(TickRule(INT_MAX).twoSecs);
}

// ---------------------------------------------------------------------------
// Slider

struct SliderCase
{
    const char* name;
    long distance;
    long offset;
};

void PrintTo(const SliderCase& c, std::ostream* os) { *os << c.name; }

const SliderCase kSliderCases[] = {
    { "Zero", 0, 0 },
    { "One", 1, 1 },
    { "Ten_Linear", 10, 10 },
    { "Eleven_Curve", 11, 11 },   // 11.05 truncated
    { "Twenty", 20, 25 },
    { "Forty", 40, 85 },
    { "MinusOne", -1, -1 },
    { "MinusTen", -10, -10 },
    { "MinusFifteen", -15, -16 },   // 16.25 truncated toward zero
    { "Hundred", 100, 505 },
    // Coordinates are 16-bit; the largest real distance stays far below LONG_MAX.
    { "FullCoordinateRange", 65535, 214741816 },
    { "LongMax_Saturates", LONG_MAX, LONG_MAX },
    { "LongMin_Saturates", LONG_MIN, -LONG_MAX },
};

class SpinSliderCurve : public ::testing::TestWithParam<SliderCase> {};

TEST_P(SpinSliderCurve, Offset)
{
    EXPECT_EQ(GetParam().offset, SliderStepOffset(GetParam().distance));
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinSliderCurve, ::testing::ValuesIn(kSliderCases),
                         [](const ::testing::TestParamInfo<SliderCase>& i) { return std::string(i.param.name); });

TEST(SpinSliderCurveShape, CurveNeverDecreasesAndIsSymmetric)
{
    long previous = 0;
    for (long d = 0; d <= 2000; ++d)
    {
        const long offset = SliderStepOffset(d);
        EXPECT_GE(offset, previous) << "distance " << d;
        EXPECT_EQ(-offset, SliderStepOffset(-d)) << "distance " << d;
        previous = offset;
    }
}

TEST(SpinSliderCurveShape, DistanceIsMeasuredUpwardsFromThePressPoint)
{
    EXPECT_EQ(15, SliderDistance(POINT{ 3, 10 }, POINT{ 9, -5 }));
    EXPECT_EQ(-5, SliderDistance(POINT{ 3, 10 }, POINT{ 3, 15 }));
    EXPECT_EQ(0, SliderDistance(POINT{ 3, 10 }, POINT{ 30, 10 }));
}

} // namespace
