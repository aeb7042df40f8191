// Window-free arithmetic of the spin control: where it sits beside its edit, which
// area a point hits, where the halves and glyphs are painted, what a timer tick
// does and how far a slider drag moves the value.
#pragma once

#include <windows.h>

namespace SpinGeometry {

// Width of the spin window in pixels.
constexpr int kSpinWidth = 15;
// Auto-repeat timer of a held arrow.
constexpr UINT_PTR kTimerId = 1;
constexpr UINT kTimerPeriodMs = 100;
// Ticks after which a held arrow starts repeating, and the ticks at which the
// buddy accelerates (two and five seconds after the press).
constexpr int kFirstRepeatTick = 6;
constexpr int kTwoSecondsTick = 20;
constexpr int kFiveSecondsTick = 50;

enum class SpinArea
{
    None,   // outside every area (only possible outside the client rectangle)
    Up,     // press steps up
    Band,   // slider band between the halves
    Down,   // press steps down
};

// Spin rectangle (parent coordinates) for an edit at editRect: 15 pixels wide at the
// edit's right edge, one pixel above it and two pixels taller, rounded down to an
// even height.
RECT SpinRectBesideEdit(const RECT& editRect);

// Hit areas of a spin whose client area is width x height (origin 0,0). They do not
// overlap: up (0, 0, W, h-2), band (0, h-2, W, h+2), down (0, h+2, W, H), h = H/2.
RECT UpHitRect(int width, int height);
RECT SliderBandRect(int width, int height);
RECT DownHitRect(int width, int height);
SpinArea HitTest(int width, int height, POINT pt);
inline bool InArea(int width, int height, POINT pt, SpinArea area) { return HitTest(width, height, pt) == area; }

// Painted halves: upper (0, 0, W, h), lower (0, H-h, W, H); for odd H the middle
// row belongs to neither.
RECT UpperHalfRect(int width, int height);
RECT LowerHalfRect(int width, int height);
// Rectangle a glyph is placed in: the half shrunk by the outer frame (1) and, after
// the pressed offset (+1, +1), by 3 at top and bottom.
RECT GlyphRect(const RECT& half, bool pressed);
// The three points of a glyph in glyphRect. The centre is half the rectangle's width
// measured from x = 0, so the pressed offset moves a glyph down but not sideways.
void UpGlyphPoints(const RECT& glyphRect, POINT points[3]);
void DownGlyphPoints(const RECT& glyphRect, POINT points[3]);

// What the spin does on a timer tick, given the tick count after incrementing it.
// The step comes before the acceleration call of the same tick.
struct TickActions
{
    bool step;       // call the buddy's step in the held direction
    bool twoSecs;    // call the buddy's two-second acceleration
    bool fiveSecs;   // call the buddy's five-second acceleration
};
TickActions TickRule(int tick);
// The next tick count; saturates instead of overflowing on an endless hold.
int NextTick(int tick);

// Vertical drag distance (positive upwards) from the press point to pt.
long SliderDistance(POINT press, POINT pt);
// Steps from the middle value for a drag distance: linear up to 10 pixels, then
// d*d*0.05 + 5 (the curves meet at 10), truncated toward zero, sign kept. Saturates
// at LONG_MAX steps for absurd distances.
long SliderStepOffset(long distance);

} // namespace SpinGeometry
