#include "SpinGeometry.h"

#include <climits>
#include <cmath>

namespace SpinGeometry {

namespace {

RECT MakeRect(int left, int top, int right, int bottom)
{
    RECT r = { left, top, right, bottom };
    return r;
}

bool Contains(const RECT& r, POINT pt)
{
    // PtInRect's rule: left/top inclusive, right/bottom exclusive.
    return pt.x >= r.left && pt.x < r.right && pt.y >= r.top && pt.y < r.bottom;
}

} // namespace

RECT SpinRectBesideEdit(const RECT& editRect)
{
    int height = editRect.bottom - editRect.top + 2;
    if (height % 2 != 0)
        height -= 1;
    const int top = editRect.top - 1;
    return MakeRect(editRect.right, top, editRect.right + kSpinWidth, top + height);
}

RECT UpHitRect(int width, int height)
{
    const int h = height / 2;
    return MakeRect(0, 0, width, h - 2);
}

RECT SliderBandRect(int width, int height)
{
    const int h = height / 2;
    return MakeRect(0, h - 2, width, h + 2);
}

RECT DownHitRect(int width, int height)
{
    const int h = height / 2;
    return MakeRect(0, h + 2, width, height);
}

SpinArea HitTest(int width, int height, POINT pt)
{
    if (Contains(UpHitRect(width, height), pt))
        return SpinArea::Up;
    if (Contains(SliderBandRect(width, height), pt))
        return SpinArea::Band;
    if (Contains(DownHitRect(width, height), pt))
        return SpinArea::Down;
    return SpinArea::None;
}

RECT UpperHalfRect(int width, int height)
{
    return MakeRect(0, 0, width, height / 2);
}

RECT LowerHalfRect(int width, int height)
{
    return MakeRect(0, height - height / 2, width, height);
}

RECT GlyphRect(const RECT& half, bool pressed)
{
    RECT r = MakeRect(half.left + 1, half.top + 1, half.right - 1, half.bottom - 1);
    if (pressed)
    {
        r.left += 1;
        r.right += 1;
        r.top += 1;
        r.bottom += 1;
    }
    r.top += 3;
    r.bottom -= 3;
    return r;
}

void UpGlyphPoints(const RECT& glyphRect, POINT points[3])
{
    const int mx = (glyphRect.right - glyphRect.left) / 2;
    points[0] = { mx - 1, glyphRect.bottom - 1 };
    points[1] = { mx, glyphRect.bottom - 2 };
    points[2] = { mx + 1, glyphRect.bottom - 1 };
}

void DownGlyphPoints(const RECT& glyphRect, POINT points[3])
{
    const int mx = (glyphRect.right - glyphRect.left) / 2;
    points[0] = { mx - 1, glyphRect.bottom - 3 };
    points[1] = { mx, glyphRect.bottom - 2 };
    points[2] = { mx + 1, glyphRect.bottom - 3 };
}

TickActions TickRule(int tick)
{
    TickActions actions;
    actions.step = tick >= kFirstRepeatTick;
    actions.twoSecs = tick == kTwoSecondsTick;
    actions.fiveSecs = tick == kFiveSecondsTick;
    return actions;
}

int NextTick(int tick)
{
    return tick < INT_MAX ? tick + 1 : INT_MAX;
}

long SliderDistance(POINT press, POINT pt)
{
    return static_cast<long>(press.y) - static_cast<long>(pt.y);
}

long SliderStepOffset(long distance)
{
    double d = std::fabs(static_cast<double>(distance));
    if (d > 10.0)
        d = d * d * 0.05 + 5.0;
    const double steps = std::trunc(d);
    const long magnitude = steps >= static_cast<double>(LONG_MAX) ? LONG_MAX : static_cast<long>(steps);
    return distance >= 0 ? magnitude : -magnitude;
}

} // namespace SpinGeometry
