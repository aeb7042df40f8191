// Spin arithmetic without a window, as named tables:
//  - the spin's rectangle beside an edit (odd and even heights);
//  - hit areas and painted halves for even and odd heights, row by row at the edges;
//  - glyph rectangles and points, raised and pressed;
//  - timer tick rules (first repeat, two- and five-second calls) over a long hold;
//  - the slider distance curve, both signs, its knee and absurd distances.
#include "edit_harness.h"

#include <climits>

namespace {

using namespace SpinGeometry;
using edit_test::RectText;

char AreaLetter(SpinArea a)
{
    return a == SpinArea::Up ? 'U' : a == SpinArea::Band ? 'B' : a == SpinArea::Down ? 'D' : '-';
}

TEST(SpinBesideEdit, FifteenWideOneAboveRoundedDownToEvenHeight)
{
    EXPECT_EQ("(110,19,125,41)", RectText(SpinRectBesideEdit(RECT{ 10, 20, 110, 41 })));   // 23 -> 22
    EXPECT_EQ("(50,-1,65,21)", RectText(SpinRectBesideEdit(RECT{ 0, 0, 50, 20 })));
    EXPECT_EQ("(5,4,20,6)", RectText(SpinRectBesideEdit(RECT{ 5, 5, 5, 5 })));
    // A reversed rectangle yields a reversed (empty) spin, not garbage.
    EXPECT_EQ("(40,49,55,41)", RectText(SpinRectBesideEdit(RECT{ 100, 50, 40, 40 })));
}

struct HitCase
{
    int width, height, x, y;
    char area;
};

const HitCase kHitCases[] = {
    // H = 20: up rows 0-7, band 8-11, down 12-19; outside the client area nothing.
    { 15, 20, 14, 7, 'U' }, { 15, 20, 0, 8, 'B' },  { 15, 20, 7, 11, 'B' }, { 15, 20, 7, 12, 'D' },
    { 15, 20, 7, 19, 'D' }, { 15, 20, 7, 20, '-' }, { 15, 20, 7, -1, '-' }, { 15, 20, 15, 3, '-' },
    { 15, 20, -1, 15, '-' },
    // The buddy's Down key presses (0, H - 3): always in the down area.
    { 15, 22, 0, 19, 'D' }, { 15, 20, 0, 17, 'D' },
    // Odd H = 21: h = 10, up 0-7, band 8-11, down 12-20.
    { 15, 21, 3, 11, 'B' }, { 15, 21, 3, 20, 'D' },
    // Degenerate: a tiny spin has no up area and a band above the client area.
    { 15, 2, 3, 0, 'B' }, { 15, 0, 3, 0, 'B' }, { 0, 20, 0, 3, '-' }, { 15, 20, INT_MAX, INT_MIN, '-' },
};

TEST(SpinHitTest, Areas)
{
    for (const HitCase& c : kHitCases)
        EXPECT_EQ(c.area, AreaLetter(HitTest(c.width, c.height, POINT{ c.x, c.y })))
            << c.width << "x" << c.height << " at " << c.x << "," << c.y;
}

TEST(SpinHitTest, EveryRowHitsExactlyOneAreaUpFourBandRowsThenDown)
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
            areas += AreaLetter(HitTest(15, height, POINT{ 7, y }));
        }
        const int h = height / 2;
        EXPECT_EQ(std::string(h - 2, 'U') + "BBBB" + std::string(height - h - 2, 'D'), areas) << height;
    }
}

TEST(SpinHalves, HitRectanglesAndPaintedHalves)
{
    EXPECT_EQ("(0,0,15,8)", RectText(UpHitRect(15, 20)));
    EXPECT_EQ("(0,8,15,12)", RectText(SliderBandRect(15, 20)));
    EXPECT_EQ("(0,12,15,20)", RectText(DownHitRect(15, 20)));
    // Painting splits an even height; an odd one leaves the middle row to neither half.
    EXPECT_EQ("(0,0,15,10)", RectText(UpperHalfRect(15, 20)));
    EXPECT_EQ("(0,10,15,20)", RectText(LowerHalfRect(15, 20)));
    EXPECT_EQ("(0,0,15,10)", RectText(UpperHalfRect(15, 21)));
    EXPECT_EQ("(0,11,15,21)", RectText(LowerHalfRect(15, 21)));
}

struct GlyphCase
{
    int height;
    bool upper;
    bool pressed;
    const char* rect;
    POINT points[3];
};

const GlyphCase kGlyphCases[] = {
    { 22, true, false, "(1,4,14,7)", { { 5, 6 }, { 6, 5 }, { 7, 6 } } },
    { 22, true, true, "(2,5,15,8)", { { 5, 7 }, { 6, 6 }, { 7, 7 } } },
    { 22, false, false, "(1,15,14,18)", { { 5, 15 }, { 6, 16 }, { 7, 15 } } },
    { 22, false, true, "(2,16,15,19)", { { 5, 16 }, { 6, 17 }, { 7, 16 } } },
    { 20, true, false, "(1,4,14,6)", { { 5, 5 }, { 6, 4 }, { 7, 5 } } },
    { 20, false, false, "(1,14,14,16)", { { 5, 13 }, { 6, 14 }, { 7, 13 } } },
};

TEST(SpinGlyph, RectangleAndPoints)
{
    for (const GlyphCase& c : kGlyphCases)
    {
        SCOPED_TRACE(std::to_string(c.height) + (c.upper ? " up" : " down") + (c.pressed ? " pressed" : ""));
        const RECT glyph = GlyphRect(c.upper ? UpperHalfRect(15, c.height) : LowerHalfRect(15, c.height), c.pressed);
        EXPECT_EQ(c.rect, RectText(glyph));
        POINT pts[3];
        c.upper ? UpGlyphPoints(glyph, pts) : DownGlyphPoints(glyph, pts);
        for (int i = 0; i < 3; ++i)
        {
            EXPECT_EQ(c.points[i].x, pts[i].x) << "point " << i;
            EXPECT_EQ(c.points[i].y, pts[i].y) << "point " << i;
        }
    }
}

TEST(SpinTicks, SixtyTicksOfAHeldArrowAndTheEnds)
{
    // One letter per tick: '.' rests, 's' steps, 'S' steps then calls the two-second
    // acceleration, 'F' steps then calls the five-second one.
    std::string trace;
    for (int tick = 1; tick <= 60; ++tick)
    {
        const TickActions a = TickRule(tick);
        EXPECT_FALSE(a.twoSecs && a.fiveSecs) << "tick " << tick;
        trace += a.fiveSecs ? 'F' : a.twoSecs ? 'S' : a.step ? 's' : '.';
    }
    EXPECT_EQ(std::string(5, '.') + std::string(14, 's') + "S" + std::string(29, 's') + "F" + std::string(10, 's'), trace);
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

TEST(SpinSlider, DistanceCurve)
{
    // Linear to 10 pixels, then d*d*0.05 + 5 truncated toward zero; 16-bit coordinates stay
    // far below LONG_MAX, absurd distances saturate.
    const long cases[][2] = { { 0, 0 },     { 1, 1 },       { 10, 10 },          { 11, 11 },           { 20, 25 },
                              { 40, 85 },   { -1, -1 },     { -15, -16 },        { 100, 505 },         { 65535, 214741816 },
                              { LONG_MAX, LONG_MAX },       { LONG_MIN, -LONG_MAX } };
    for (const auto& c : cases)
        EXPECT_EQ(c[1], SliderStepOffset(c[0])) << "distance " << c[0];
    long previous = 0;
    for (long d = 0; d <= 2000; ++d)
    {
        const long offset = SliderStepOffset(d);
        EXPECT_GE(offset, previous) << "distance " << d;
        EXPECT_EQ(-offset, SliderStepOffset(-d)) << "distance " << d;
        previous = offset;
    }
    EXPECT_EQ(15, SliderDistance(POINT{ 3, 10 }, POINT{ 9, -5 }));
    EXPECT_EQ(-5, SliderDistance(POINT{ 3, 10 }, POINT{ 3, 15 }));
    EXPECT_EQ(0, SliderDistance(POINT{ 3, 10 }, POINT{ 30, 10 }));
}

} // namespace
