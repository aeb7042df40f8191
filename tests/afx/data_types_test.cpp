// CSize, CPoint, CRect: the arithmetic the layer computes itself (the forwards to
// InflateRect, OffsetRect, IntersectRect and their kind are the platform's):
// - packed LPARAM coordinates are signed;
// - the mixed operators between the three types, inflating and deflating by a rectangle,
//   MulDiv, normalising, swapping, moving, the centre and the corner references.
#include <gtest/gtest.h>
#include <afx.h>
#include <atltypes.h>

#include "AfxTestSupport.h"

#include <string>

TEST(AtlTypes, PackedCoordinatesAreSignedAndTheMixedOperators)
{
    EXPECT_EQ(CPoint(-3, 7), CPoint(MAKELPARAM(-3, 7)));
    EXPECT_EQ(CSize(-2, 9), CSize((DWORD)MAKELONG(-2, 9)));
    EXPECT_EQ(CRect(1, 2, 4, 6), CRect(CPoint(1, 2), CSize(3, 4)));
    const CPoint pt(10, 20);
    EXPECT_EQ(CSize(9, 18), pt - CPoint(1, 2));
    EXPECT_EQ(CRect(11, 22, 13, 24), pt + CRect(1, 2, 3, 4));
    EXPECT_EQ(CRect(-9, -18, -7, -16), pt - CRect(1, 2, 3, 4));
    EXPECT_EQ(CPoint(4, 6), CSize(3, 4) + CPoint(1, 2));
    EXPECT_EQ(CRect(4, 6, 6, 8), CSize(3, 4) + CRect(1, 2, 3, 4));
    EXPECT_EQ(CPoint(20, 30), CRect(10, 20, 30, 40).CenterPoint());
}

struct RectCase
{
    const char* name;
    CRect (*op)(CRect);
    CRect expected;
};

const RectCase kRectCases[] = {
    { "InflateEachSide", [](CRect r) { r.InflateRect(1, 2, 3, 4); return r; }, CRect(9, 18, 33, 44) },
    { "InflateByRect", [](CRect r) { r.InflateRect(CRect(1, 2, 3, 4)); return r; }, CRect(9, 18, 33, 44) },
    { "DeflateEachSide", [](CRect r) { r.DeflateRect(1, 2, 3, 4); return r; }, CRect(11, 22, 27, 36) },
    { "DeflateByRect", [](CRect r) { r.DeflateRect(CRect(1, 2, 3, 4)); return r; }, CRect(11, 22, 27, 36) },
    { "PlusRectInflates", [](CRect r) { CRect d(1, 1, 1, 1); return r + &d; }, CRect(9, 19, 31, 41) },
    { "MinusRectDeflates", [](CRect r) { CRect d(1, 1, 1, 1); return r - &d; }, CRect(11, 21, 29, 39) },
    { "MulDiv", [](CRect r) { return r.MulDiv(3, 2); }, CRect(15, 30, 45, 60) },
    { "MoveToXY", [](CRect r) { r.MoveToXY(0, 0); return r; }, CRect(0, 0, 20, 20) },
    { "MoveToX", [](CRect r) { r.MoveToX(-5); return r; }, CRect(-5, 20, 15, 40) },
    { "Normalize", [](CRect r) { CRect s(r.right, r.bottom, r.left, r.top); s.NormalizeRect(); return s; },
      CRect(10, 20, 30, 40) },
    { "SwapLeftRight", [](CRect r) { r.SwapLeftRight(); return r; }, CRect(30, 20, 10, 40) },
    { "CornerReferences", [](CRect r) { r.TopLeft() = CPoint(0, 0); r.BottomRight().x = 5; return r; },
      CRect(0, 0, 5, 40) },
};

TEST(AtlTypes, RectArithmeticFromTenTwentyThirtyForty)
{
    for (const RectCase& c : kRectCases)
        EXPECT_EQ(c.expected, c.op(CRect(10, 20, 30, 40))) << c.name;
}
