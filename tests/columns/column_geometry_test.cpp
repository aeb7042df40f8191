// Header drag and drop without windows, as tables: the press margins (17 pixels is the
// narrowest item that can be taken), hit tests, the insertion index and line with the
// parent's scroll, the marker, the sort arrow, the sort column after a change, and the
// check of dropped payloads (whole records only; truncated, oversized and garbage).
#include <gtest/gtest.h>

#include "Checks.h"
#include "ColumnDragGeometry.h"
#include "ColumnPayload.h"

#include <array>
#include <string>
#include <tuple>
#include <vector>

using namespace ColumnDragGeometry;

namespace {

using orvane_test::CaseName;

const int kWidths[] = { 100, 15, 17, 60 };   // items at 0, 100, 115, 132; end 192

struct PressCase { const char* name; int x; int item; };
const PressCase kPressCases[] = {
    { "SevenRightOfLeftEdgeIsADivider", 7, -1 },
    { "EightRightOfLeftEdgeTakes", 8, 0 },
    { "NineLeftOfRightEdgeTakes", 91, 0 },
    { "EightLeftOfRightEdgeIsADivider", 92, -1 },
    { "FifteenWideCannotBeTaken", 108, -1 },
    { "SeventeenWideAtItsOnlyPixel", 123, 2 },
    { "LastItem", 150, 3 },
    { "RightOfAllItems", 400, -1 },
};
class PressTest : public testing::TestWithParam<PressCase> {};
TEST_P(PressTest, Item)
{
    EXPECT_EQ(GetParam().item, FindPressedItem(GetParam().x, kWidths, 4));
}
INSTANTIATE_TEST_SUITE_P(Cases, PressTest, testing::ValuesIn(kPressCases), CaseName<PressCase>);

TEST(HitTestItemsTest, SpanAndClientHeight)
{
    const RECT client = { 0, 0, 300, 20 };
    const struct { POINT point; int item; } cases[] = { { { 0, 5 }, 0 }, { { 99, 19 }, 0 }, { { 100, 5 }, 1 },
        { { 191, 5 }, 3 }, { { 192, 5 }, -1 }, { { 50, 20 }, -1 }, { { 50, -1 }, -1 } };
    for (const auto& c : cases)
        EXPECT_EQ(c.item, HitTestItems(c.point, client, kWidths, 4)) << c.point.x << "," << c.point.y;
}

struct InsertionCase { const char* name; int x; int scroll; int index; int lineX; };
const InsertionCase kInsertionCases[] = {
    { "LeftOfFirstMiddleIsZero", 49, 0, 0, 0 },
    { "FirstMiddleGoesBehindIt", 50, 0, 1, 100 },
    { "RightHalfOfItemOneIsTwo", 108, 0, 2, 115 },
    { "OddWidthMiddleRoundsDown", 123, 0, 3, 132 },
    { "RightOfLastMiddleIsTheCount", 162, 0, 4, 192 },
    { "FarLeftIsZero", -40, 0, 0, 0 },
    { "ScrollMovesTheLineLeft", 108, 30, 2, 85 },
    { "ScrolledAtTheStart", 10, 30, 0, -30 },
};
class InsertionTest : public testing::TestWithParam<InsertionCase> {};
TEST_P(InsertionTest, IndexAndLine)
{
    const InsertionCase& c = GetParam();
    const InsertionPoint point = FindInsertionPoint(c.x, kWidths, 4, c.scroll);
    EXPECT_EQ(std::make_pair(c.index, c.lineX), std::make_pair(point.index, point.lineX));
}
INSTANTIATE_TEST_SUITE_P(Cases, InsertionTest, testing::ValuesIn(kInsertionCases), CaseName<InsertionCase>);

TEST(InsertionTest, NoItemsIsZero)
{
    EXPECT_EQ(0, FindInsertionPoint(25, kWidths, 0, 0).index);
}

TEST(InsertionMarkerTest, TrianglesPointAtTheHeaderAndAreasCoverThem)
{
    const InsertionMarker m = MakeInsertionMarker(50, 0, 20);
    // the struct's points and rectangles, coordinate by coordinate
    const std::vector<int> all(&m.top[0].x, &m.top[0].x + sizeof m / sizeof(int));
    EXPECT_EQ((std::vector<int>{ 50, -1, 47, -7, 53, -7,  50, 21, 47, 27, 53, 27,  46, -8, 54, 0,  46, 20, 54, 28 }), all);
}

// Placed as the extended header's indicator (its table covers the placement), pointing the
// other way: inside the 3-pixel margin of item (100, 0, 200, 20), top 3 and bottom 17.
struct ArrowCase { const char* name; RECT item; int textWidth; bool rightAligned; bool ascending;
                   bool visible; int x; int apexY; int baseY; };
const ArrowCase kArrowCases[] = {
    { "AscendingPointsUp", { 100, 0, 200, 20 }, 30, false, true, true, 186, 5, 14 },
    { "DescendingPointsDown", { 100, 0, 200, 20 }, 30, false, false, true, 186, 14, 5 },
};
class SortArrowTest : public testing::TestWithParam<ArrowCase> {};
TEST_P(SortArrowTest, Placement)
{
    const ArrowCase& c = GetParam();
    const SortArrow arrow = PlaceSortArrow(c.item, c.textWidth, c.rightAligned, c.ascending);
    EXPECT_EQ(std::make_tuple(c.visible, c.x, c.apexY, c.baseY),
        std::make_tuple(arrow.visible, arrow.x, arrow.apexY, arrow.baseY));
}
INSTANTIATE_TEST_SUITE_P(Cases, SortArrowTest, testing::ValuesIn(kArrowCases), CaseName<ArrowCase>);

TEST(SortColumnTest, FollowsInsertionsAndDeletions)
{
    // sort column, position, sorted flag -> after insertion; sort column, deleted -> after deletion
    for (const auto& c : { std::array<int, 4>{ 2, 2, 0, 3 }, { 2, 0, 0, 3 }, { 2, 3, 0, 2 }, { -1, 0, 0, -1 },
                           { 2, 4, 1, 4 }, { -1, 1, 1, 1 } })
        EXPECT_EQ(c[3], SortColumnAfterInsert(c[0], c[1], c[2] != 0)) << c[0] << " at " << c[1];
    for (const auto& c : { std::array<int, 3>{ 2, 2, -1 }, { 2, 0, 1 }, { 2, 3, 2 }, { -1, 0, -1 } })
        EXPECT_EQ(c[2], SortColumnAfterDelete(c[0], c[1])) << c[0] << " less " << c[1];
}

// ---------------------------------------------------------------------------------
// Payloads. "Name", index 2, sub-item 5, width 120, format 0, sort type 3, flag 1.

std::vector<unsigned char> NamePayload()
{
    return { 'N', 'a', 'm', 'e', 0, 2, 0, 0, 0, 5, 0, 0, 0, 120, 0, 0, 0, 0, 0, 0, 0, 3, 1 };
}

std::vector<unsigned char> With(std::vector<unsigned char> bytes, size_t at, unsigned char value)
{
    bytes[at] = value;
    return bytes;
}

std::vector<unsigned char> Resized(std::vector<unsigned char> bytes, size_t size)
{
    bytes.resize(size, 'x');
    return bytes;
}

// A title of n letters and the 17 bytes of a default record behind it.
std::vector<unsigned char> Titled(size_t n)
{
    std::vector<unsigned char> bytes(n, 'T');
    const unsigned char fields[] = { 0, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0, 0, 0, 0, 0, 0, 0, 0, 0 };
    bytes.insert(bytes.end(), fields, fields + sizeof fields);
    return bytes;
}

using namespace ColumnPayload;

struct PayloadCase { const char* name; std::vector<unsigned char> bytes; Verdict verdict; size_t recordSize;
                     bool hasFlag; bool flag; };
const PayloadCase kPayloadCases[] = {
    { "WholeRecordAndFlag", NamePayload(), Valid, 22, true, true },
    { "FlagZero", With(NamePayload(), 22, 0), Valid, 22, true, false },
    { "AnyNonZeroFlagIsSet", With(NamePayload(), 22, 0x37), Valid, 22, true, true },
    { "NoFlag", Resized(NamePayload(), 22), Valid, 22, false, false },
    { "TrailingBytesIgnored", Resized(NamePayload(), 40), Valid, 22, true, true },
    { "Empty", {}, Truncated, 0, false, false },
    { "TitleWithoutTerminator", { 'N', 'a', 'm', 'e' }, Truncated, 0, false, false },
    { "OneFieldByteShort", Resized(NamePayload(), 21), Truncated, 0, false, false },
    { "EmptyTitle", Titled(0), Valid, 18, false, false },
    { "LongestTitle", Titled(kMaxTitleLength), Valid, kMaxTitleLength + 18, false, false },
    { "TitleOneTooLong", Titled(kMaxTitleLength + 1), TitleTooLong, 0, false, false },
    { "NegativeWidth", With(NamePayload(), 16, 0x80), BadWidth, 22, true, true },
    { "WidthBeyondGdi", With(NamePayload(), 15, 0x80), BadWidth, 22, true, true },
    { "LastSortType", With(NamePayload(), 21, 8), Valid, 22, true, true },
    { "SortTypeNine", With(NamePayload(), 21, 9), BadSortType, 22, true, true },
};
class PayloadTest : public testing::TestWithParam<PayloadCase> {};
TEST_P(PayloadTest, Verdict)
{
    const PayloadCase& c = GetParam();
    const Check check = CheckPayload(c.bytes.data(), c.bytes.size());
    EXPECT_EQ(std::make_tuple(c.verdict, c.recordSize, c.hasFlag, c.flag),
        std::make_tuple(check.verdict, check.verdict == Truncated || check.verdict == TitleTooLong ? 0
            : check.recordSize, check.hasFlag, check.flag));
}
INSTANTIATE_TEST_SUITE_P(Cases, PayloadTest, testing::ValuesIn(kPayloadCases), CaseName<PayloadCase>);

} // namespace
