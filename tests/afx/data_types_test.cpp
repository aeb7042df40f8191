// CSize, CPoint, CRect: covers
// - construction from every source (packed LPARAM coordinates are signed)
// - arithmetic between the three types, inflate/deflate in all forms, normalising,
//   intersection/union/subtraction, MulDiv, moving, the corner references
#include <gtest/gtest.h>
#include <afx.h>
#include <atltypes.h>
#include <string>

// gtest would print CRect through its LPRECT conversion, as an address.
static void PrintTo(const CRect& rect, std::ostream* os)
{
    *os << "(" << rect.left << "," << rect.top << ")-(" << rect.right << "," << rect.bottom << ")";
}

static void PrintTo(const CPoint& point, std::ostream* os)
{
    *os << "(" << point.x << "," << point.y << ")";
}

static void PrintTo(const CSize& size, std::ostream* os)
{
    *os << "[" << size.cx << "x" << size.cy << "]";
}

TEST(AtlTypes, Construction)
{
    EXPECT_EQ(CPoint(0, 0), CPoint());
    EXPECT_EQ(CPoint(-3, 7), CPoint(MAKELPARAM(-3, 7))) << "packed coordinates are signed";
    EXPECT_EQ(CPoint(4, 5), CPoint(CSize(4, 5)));
    EXPECT_EQ(CSize(-2, 9), CSize((DWORD)MAKELONG(-2, 9)));
    EXPECT_EQ(CSize(1, 2), CSize(CPoint(1, 2)));
    EXPECT_EQ(CRect(1, 2, 4, 6), CRect(CPoint(1, 2), CSize(3, 4)));
    EXPECT_EQ(CRect(1, 2, 4, 6), CRect(CPoint(1, 2), CPoint(4, 6)));
    RECT rc = { 5, 6, 7, 8 };
    EXPECT_EQ(CRect(5, 6, 7, 8), CRect(rc));
    EXPECT_EQ(CRect(5, 6, 7, 8), CRect(&rc));
}

TEST(AtlTypes, PointAndSizeArithmetic)
{
    CPoint pt(10, 20);
    EXPECT_EQ(CPoint(13, 24), pt + CSize(3, 4));
    EXPECT_EQ(CPoint(7, 16), pt - CSize(3, 4));
    EXPECT_EQ(CPoint(11, 22), pt + CPoint(1, 2));
    EXPECT_EQ(CSize(9, 18), pt - CPoint(1, 2));
    EXPECT_EQ(CPoint(-10, -20), -pt);
    EXPECT_EQ(CRect(11, 22, 13, 24), pt + CRect(1, 2, 3, 4));
    EXPECT_EQ(CRect(-9, -18, -7, -16), pt - CRect(1, 2, 3, 4));
    pt += CSize(1, 1);
    pt -= CPoint(2, 2);
    pt.Offset(5, 5);
    EXPECT_EQ(CPoint(14, 24), pt);

    CSize size(3, 4);
    EXPECT_EQ(CSize(4, 6), size + CSize(1, 2));
    EXPECT_EQ(CSize(2, 2), size - CSize(1, 2));
    EXPECT_EQ(CSize(-3, -4), -size);
    EXPECT_EQ(CPoint(4, 6), size + CPoint(1, 2));
    EXPECT_EQ(CRect(4, 6, 6, 8), size + CRect(1, 2, 3, 4));
    EXPECT_EQ(1, size != CSize(3, 5));
}

struct RectCase
{
    const char* name;
    CRect (*op)(CRect);
    CRect expected;
};

const RectCase kRectCases[] = {
    { "InflateXY", [](CRect r) { r.InflateRect(1, 2); return r; }, CRect(9, 18, 31, 42) },
    { "InflateSize", [](CRect r) { r.InflateRect(CSize(1, 2)); return r; }, CRect(9, 18, 31, 42) },
    { "InflateEachSide", [](CRect r) { r.InflateRect(1, 2, 3, 4); return r; }, CRect(9, 18, 33, 44) },
    { "InflateByRect", [](CRect r) { r.InflateRect(CRect(1, 2, 3, 4)); return r; }, CRect(9, 18, 33, 44) },
    { "DeflateXY", [](CRect r) { r.DeflateRect(1, 2); return r; }, CRect(11, 22, 29, 38) },
    { "DeflateEachSide", [](CRect r) { r.DeflateRect(1, 2, 3, 4); return r; }, CRect(11, 22, 27, 36) },
    { "DeflateByRect", [](CRect r) { r.DeflateRect(CRect(1, 2, 3, 4)); return r; }, CRect(11, 22, 27, 36) },
    { "DeflatePastEmpty", [](CRect r) { r.DeflateRect(15, 0); return r; }, CRect(25, 20, 15, 40) },
    { "OffsetXY", [](CRect r) { r.OffsetRect(-10, 5); return r; }, CRect(0, 25, 20, 45) },
    { "OffsetPoint", [](CRect r) { r.OffsetRect(CPoint(1, 1)); return r; }, CRect(11, 21, 31, 41) },
    { "PlusPoint", [](CRect r) { return r + CPoint(1, 2); }, CRect(11, 22, 31, 42) },
    { "MinusSize", [](CRect r) { return r - CSize(1, 2); }, CRect(9, 18, 29, 38) },
    { "PlusRectInflates", [](CRect r) { CRect d(1, 1, 1, 1); return r + &d; }, CRect(9, 19, 31, 41) },
    { "MinusRectDeflates", [](CRect r) { CRect d(1, 1, 1, 1); return r - &d; }, CRect(11, 21, 29, 39) },
    { "Intersect", [](CRect r) { return r & CRect(25, 0, 50, 30); }, CRect(25, 20, 30, 30) },
    { "IntersectDisjoint", [](CRect r) { return r & CRect(100, 100, 110, 110); }, CRect(0, 0, 0, 0) },
    { "Union", [](CRect r) { return r | CRect(0, 0, 5, 5); }, CRect(0, 0, 30, 40) },
    { "UnionWithEmpty", [](CRect r) { return r | CRect(0, 0, 0, 0); }, CRect(10, 20, 30, 40) },
    { "Subtract", [](CRect r) { CRect out; out.SubtractRect(r, CRect(0, 0, 50, 30)); return out; },
        CRect(10, 30, 30, 40) },
    { "MulDiv", [](CRect r) { return r.MulDiv(3, 2); }, CRect(15, 30, 45, 60) },
    { "MoveToXY", [](CRect r) { r.MoveToXY(0, 0); return r; }, CRect(0, 0, 20, 20) },
    { "MoveToX", [](CRect r) { r.MoveToX(-5); return r; }, CRect(-5, 20, 15, 40) },
    { "Normalize", [](CRect r) { CRect s(r.right, r.bottom, r.left, r.top); s.NormalizeRect(); return s; },
        CRect(10, 20, 30, 40) },
    { "SwapLeftRight", [](CRect r) { r.SwapLeftRight(); return r; }, CRect(30, 20, 10, 40) },
    { "AndAssign", [](CRect r) { r &= CRect(0, 0, 15, 25); return r; }, CRect(10, 20, 15, 25) },
    { "OrAssign", [](CRect r) { r |= CRect(40, 40, 50, 50); return r; }, CRect(10, 20, 50, 50) },
    { "CornerReferences", [](CRect r) { r.TopLeft() = CPoint(0, 0); r.BottomRight().x = 5; return r; },
        CRect(0, 0, 5, 40) },
};

class CRectArithmetic : public testing::TestWithParam<RectCase> {};

TEST_P(CRectArithmetic, FromTenTwentyThirtyForty)
{
    const RectCase& c = GetParam();
    EXPECT_EQ(c.expected, c.op(CRect(10, 20, 30, 40)));
}

INSTANTIATE_TEST_SUITE_P(Cases, CRectArithmetic, testing::ValuesIn(kRectCases),
    [](const testing::TestParamInfo<RectCase>& info) { return std::string(info.param.name); });

TEST(AtlTypes, RectAttributes)
{
    CRect r(10, 20, 30, 40);
    EXPECT_EQ(20, r.Width());
    EXPECT_EQ(20, r.Height());
    EXPECT_EQ(CSize(20, 20), r.Size());
    EXPECT_EQ(CPoint(20, 30), r.CenterPoint());
    EXPECT_EQ(CPoint(10, 20), r.TopLeft());
    EXPECT_EQ(CPoint(30, 40), r.BottomRight());
    EXPECT_EQ(1, r.PtInRect(CPoint(10, 20)));
    EXPECT_EQ(0, r.PtInRect(CPoint(30, 40))) << "right and bottom are outside";
    EXPECT_EQ(0, r.IsRectEmpty());
    EXPECT_EQ(1, CRect(5, 5, 5, 10).IsRectEmpty());
    EXPECT_EQ(1, CRect(5, 10, 1, 1).IsRectEmpty());
    EXPECT_EQ(0, CRect(5, 5, 5, 10).IsRectNull());
    EXPECT_EQ(1, CRect().IsRectNull());
    EXPECT_EQ(1, r.EqualRect(CRect(10, 20, 30, 40)));
    EXPECT_EQ(1, r != CRect(10, 20, 30, 41));

    CRect i;
    EXPECT_EQ(0, i.IntersectRect(r, CRect(100, 100, 200, 200)));
    EXPECT_EQ(CRect(0, 0, 0, 0), i);
    EXPECT_EQ(1, i.UnionRect(r, CRect(0, 0, 1, 1)));
    EXPECT_EQ(CRect(0, 0, 30, 40), i);
    i.SetRectEmpty();
    EXPECT_EQ(1, i.IsRectNull());
    LPRECT pr = r;
    EXPECT_EQ(10, pr->left);
}
