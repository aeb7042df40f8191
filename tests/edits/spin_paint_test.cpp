// Painted pixels of the spin, compared with the system colours:
//  - face, outer frame and raised buttons; the up and down glyphs in the text colour;
//  - a held half drawn sunken with its glyph one pixel lower;
//  - disabling repaints both glyphs in the shadow colour at once, enabling restores;
//  - repeated painting and window re-creation leave the spin working.
#include "spin_test_fixture.h"

#include "Pixels.h"

namespace spin_test {
namespace {

using SpinGeometry::SpinArea;
using orvane_test::ClientCapture;

// A pixel as it is on the window's surface right now, without repainting first.
COLORREF PixelNow(HWND hwnd, int x, int y)
{
    HDC hdc = ::GetDC(hwnd);
    const COLORREF c = ::GetPixel(hdc, x, y);
    ::ReleaseDC(hwnd, hdc);
    return c;
}

struct Glyph
{
    POINT tip;
    POINT base[3];
};

class SpinPaint : public SpinFixture
{
protected:
    Glyph GlyphAt(bool upper, bool pressed) const
    {
        const RECT half = upper ? SpinGeometry::UpperHalfRect(cx, cy) : SpinGeometry::LowerHalfRect(cx, cy);
        const RECT r = SpinGeometry::GlyphRect(half, pressed);
        POINT pts[3];
        if (upper)
            SpinGeometry::UpGlyphPoints(r, pts);
        else
            SpinGeometry::DownGlyphPoints(r, pts);
        // Three pixels wide and two high: the middle point is the tip, the outer two
        // points and the pixel between them the base row.
        Glyph g;
        g.tip = pts[1];
        g.base[0] = pts[0];
        g.base[1] = POINT{ pts[1].x, pts[0].y };
        g.base[2] = pts[2];
        return g;
    }

    void ExpectGlyph(const ClientCapture& cap, const Glyph& g, COLORREF colour, const char* what)
    {
        SCOPED_TRACE(what);
        EXPECT_EQ(colour, cap.At(g.tip.x, g.tip.y));
        for (const POINT& p : g.base)
            EXPECT_EQ(colour, cap.At(p.x, p.y)) << "base pixel " << p.x << "," << p.y;
        // Beside the tip and beyond the base lies the face.
        const COLORREF face = ::GetSysColor(COLOR_BTNFACE);
        EXPECT_EQ(face, cap.At(g.tip.x - 1, g.tip.y));
        EXPECT_EQ(face, cap.At(g.tip.x + 1, g.tip.y));
        EXPECT_EQ(face, cap.At(g.base[0].x - 1, g.base[0].y));
        EXPECT_EQ(face, cap.At(g.base[2].x + 1, g.base[2].y));
    }
};

TEST_F(SpinPaint, RaisedButtonsAndGlyphsInTheTextColour)
{
    ClientCapture cap(hSpin);
    ASSERT_EQ(cx, cap.width());
    const COLORREF text = ::GetSysColor(COLOR_BTNTEXT);
    ExpectGlyph(cap, GlyphAt(true, false), text, "up glyph");
    ExpectGlyph(cap, GlyphAt(false, false), text, "down glyph");

    const RECT upper = SpinGeometry::UpperHalfRect(cx, cy);
    const RECT lower = SpinGeometry::LowerHalfRect(cx, cy);
    // Outer frame: dark shadow at the right and bottom of each half.
    const COLORREF dark = ::GetSysColor(COLOR_3DDKSHADOW);
    EXPECT_EQ(dark, cap.At(upper.right - 1, upper.top + 2));
    EXPECT_EQ(dark, cap.At(upper.left + 2, upper.bottom - 1));
    EXPECT_EQ(dark, cap.At(lower.right - 1, lower.bottom - 2));
    // Raised buttons: highlight at the inner top-left, shadow at the inner bottom-right.
    EXPECT_EQ(::GetSysColor(COLOR_BTNHIGHLIGHT), cap.At(upper.left + 1, upper.top + 1));
    EXPECT_EQ(::GetSysColor(COLOR_BTNSHADOW), cap.At(upper.right - 2, upper.bottom - 2));
    EXPECT_EQ(::GetSysColor(COLOR_BTNHIGHLIGHT), cap.At(lower.left + 1, lower.top + 1));
    EXPECT_EQ(::GetSysColor(COLOR_BTNSHADOW), cap.At(lower.right - 2, lower.bottom - 2));
}

TEST_F(SpinPaint, HeldHalfIsSunkenWithItsGlyphOnePixelLower)
{
    Press(SpinArea::Up);
    ClientCapture cap(hSpin);
    const RECT upper = SpinGeometry::UpperHalfRect(cx, cy);
    const RECT lower = SpinGeometry::LowerHalfRect(cx, cy);
    EXPECT_EQ(::GetSysColor(COLOR_BTNSHADOW), cap.At(upper.left + 1, upper.top + 1));
    EXPECT_EQ(::GetSysColor(COLOR_BTNHIGHLIGHT), cap.At(upper.right - 2, upper.bottom - 2));
    const COLORREF text = ::GetSysColor(COLOR_BTNTEXT);
    const Glyph raised = GlyphAt(true, false);
    const Glyph sunk = GlyphAt(true, true);
    EXPECT_EQ(raised.tip.x, sunk.tip.x);
    EXPECT_EQ(raised.tip.y + 1, sunk.tip.y);
    ExpectGlyph(cap, sunk, text, "pressed up glyph");
    // The lower half stays raised.
    EXPECT_EQ(::GetSysColor(COLOR_BTNHIGHLIGHT), cap.At(lower.left + 1, lower.top + 1));
    ExpectGlyph(cap, GlyphAt(false, false), text, "down glyph");

    Release(SpinArea::Up);
    ClientCapture after(hSpin);
    EXPECT_EQ(::GetSysColor(COLOR_BTNHIGHLIGHT), after.At(upper.left + 1, upper.top + 1));
    ExpectGlyph(after, raised, text, "released up glyph");
}

TEST_F(SpinPaint, DisablingRepaintsGlyphsInTheShadowColourAtOnce)
{
    orvane_test::PumpUntilIdle();
    const Glyph up = GlyphAt(true, false);
    const Glyph down = GlyphAt(false, false);
    ASSERT_EQ(::GetSysColor(COLOR_BTNTEXT), PixelNow(hSpin, up.tip.x, up.tip.y));

    edit->EnableWindow(FALSE);
    // Read straight from the window surface, with no message pumped in between.
    const COLORREF shadow = ::GetSysColor(COLOR_BTNSHADOW);
    EXPECT_EQ(shadow, PixelNow(hSpin, up.tip.x, up.tip.y));
    EXPECT_EQ(shadow, PixelNow(hSpin, down.tip.x, down.tip.y));
    {
        ClientCapture cap(hSpin);
        ExpectGlyph(cap, up, shadow, "disabled up glyph");
        ExpectGlyph(cap, down, shadow, "disabled down glyph");
    }

    edit->EnableWindow(TRUE);
    EXPECT_EQ(::GetSysColor(COLOR_BTNTEXT), PixelNow(hSpin, up.tip.x, up.tip.y));
    EXPECT_EQ(::GetSysColor(COLOR_BTNTEXT), PixelNow(hSpin, down.tip.x, down.tip.y));
}

TEST_F(SpinPaint, RepeatedPaintingAndRecreationKeepWorking)
{
    for (int i = 0; i < 30; ++i)
    {
        ::RedrawWindow(hSpin, NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
        if (i % 10 == 9)
        {
            edit->SetSpinButtonFlag(FALSE);
            edit->SetSpinButtonFlag(TRUE);
            hSpin = edit->SpinHwnd();
            ASSERT_TRUE(::IsWindow(hSpin));
        }
    }
    ClientCapture cap(hSpin);
    ExpectGlyph(cap, GlyphAt(true, false), ::GetSysColor(COLOR_BTNTEXT), "up glyph after repainting");
}

} // namespace
} // namespace spin_test
