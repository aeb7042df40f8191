// Decisions of the multi-selection tree without a window:
// - how a state request splits into caret moves and a notified selection change;
// - which items a range selects and deselects, with and without `only`;
// - press routing, pre-selection and click plans by button and modifier keys;
// - drag distance, band geometry, auto-scroll and the band's per-item decision.
#include <gtest/gtest.h>

#include "TreeSelectionMath.h"

#include <string>

using namespace TreeSelectionMath;

namespace {

// ---------------------------------------------------------------------------------
// PlanStateRequest

struct PlanCase
{
    const char* name;
    UINT state;
    UINT mask;
    bool itemIsCaret;
    bool caretSelected;
    bool itemSelected;
    // expected: "R" release selected caret, "M" make caret, "X" remove caret,
    // "S" restore the item's selection, then "st/mk" of the remaining request
    const char* steps;
    UINT restState;
    UINT restMask;
};

std::string Steps(const StatePlan& p)
{
    std::string s;
    if (p.releaseSelectedCaret) s += 'R';
    if (p.makeCaret) s += 'M';
    if (p.removeCaret) s += 'X';
    if (p.restoreItemSelection) s += 'S';
    return s;
}

const UINT F = kFocused;
const UINT S = kSelected;
const UINT BOLD = 0x0010;   // TVIS_BOLD: passes through untouched

const PlanCase kPlanCases[] = {
    // Focus without selection
    { "FocusOtherItem_SelectedCaret_ItemUnselected", F, F, false, true, false, "RM", 0, S },
    { "FocusOtherItem_SelectedCaret_ItemSelected", F, F, false, true, true, "RM", 0, 0 },
    { "FocusOtherItem_UnselectedCaret_ItemUnselected", F, F, false, false, false, "M", 0, S },
    { "FocusCaretItself_Unselected", F, F, true, false, false, "M", 0, S },
    { "FocusCaretItself_Selected", F, F, true, true, true, "M", 0, 0 },
    // Focus with selection
    { "FocusSelectOtherItem", F | S, F | S, false, true, false, "RM", 0, 0 },
    { "FocusSelectOtherItem_NoSelectedCaret", F | S, F | S, false, false, false, "M", 0, 0 },
    { "FocusSelectUnselectedCaret", F | S, F | S, true, false, false, "M", S, S },
    { "FocusSelectSelectedCaret", F | S, F | S, true, true, true, "M", 0, 0 },
    { "FocusDeselectOtherItem", F, F | S, false, true, true, "RM", 0, S },
    // Taking the focus away
    { "UnfocusSelectedCaret", 0, F, true, true, true, "XS", 0, 0 },
    { "UnfocusUnselectedCaret", 0, F, true, false, false, "X", 0, 0 },
    { "UnfocusAndDeselectCaret", 0, F | S, true, true, true, "X", 0, S },
    { "UnfocusKeepSelectedCaret", S, F | S, true, true, true, "XS", 0, 0 },
    // Open case: selecting an unselected caret while taking its focus selects it
    // through the notified change.
    { "UnfocusAndSelectUnselectedCaret", S, F | S, true, false, false, "X", S, S },
    { "UnfocusItemThatIsNotCaret", 0, F, false, true, false, "", 0, 0 },
    // No focus in the mask
    { "SelectOnly", S, S, false, true, false, "", S, S },
    { "DeselectOnly", 0, S, true, true, true, "", 0, S },
    { "FocusBitInStateOnly_Ignored", F | S, S, false, false, false, "", S, S },
    { "OtherBitsPassThrough", F | BOLD, F | BOLD, false, true, true, "RM", BOLD, BOLD },
    { "EmptyMask", S, 0, false, false, false, "", 0, 0 },
};

TEST(PlanStateRequest, Steps)
{
    for (const PlanCase& c : kPlanCases)
    {
        const StatePlan plan = PlanStateRequest(StateRequest{ c.state, c.mask, c.itemIsCaret, c.caretSelected, c.itemSelected });
        EXPECT_EQ(c.steps, Steps(plan)) << c.name;
        EXPECT_EQ(c.restState, plan.state) << c.name;
        EXPECT_EQ(c.restMask, plan.mask) << c.name;
    }
}

// ---------------------------------------------------------------------------------
// RangeSelectionWalk: items as letters, endpoints in upper case; the result marks
// each item: s select, d deselect, . keep.

struct RangeCase
{
    const char* name;
    const char* items;
    bool only;
    bool singleItem;
    const char* expected;
};

const RangeCase kRangeCases[] = {
    { "MiddleOnly", "abCdEfg", true, false, "ddsssdd" },
    { "MiddleAdd", "abCdEfg", false, false, "..sss.." },
    { "AdjacentEndpoints", "aBCd", true, false, "dssd" },
    { "SingleItemOnly", "abCde", true, true, "ddsdd" },
    { "SingleItemAdd", "abCde", false, true, "..s.." },
    { "FirstAndLastItem", "AbcD", true, false, "ssss" },
    { "NoEndpointOnly", "abcd", true, false, "dddd" },
    { "NoEndpointAdd", "abcd", false, false, "...." },
    // The raw walk runs on to the end when the second endpoint never comes; the tree
    // therefore resolves endpoints before walking.
    { "SecondEndpointNeverComes", "aBcd", true, false, "dsss" },
    { "EmptyTree", "", true, false, "" },
};

TEST(RangeSelectionWalk, Marks)
{
    for (const RangeCase& c : kRangeCases)
    {
        RangeSelectionWalk walk(c.only, c.singleItem);
        std::string marks;
        for (char ch : std::string(c.items))
        {
            const RangeStep step = walk.Next(ch >= 'A' && ch <= 'Z');
            marks += step == RangeStep::Select ? 's' : step == RangeStep::Deselect ? 'd' : '.';
        }
        EXPECT_EQ(c.expected, marks) << c.name;
    }
}

// ---------------------------------------------------------------------------------
// Presses

struct PressCase
{
    const char* name;
    bool hitItem;
    UINT flags;
    bool left;
    bool checkBoxes;
    PressRoute expected;
};

const PressCase kPressCases[] = {
    { "Label", true, 0x0004, true, false, PressRoute::Item },
    { "Icon", true, 0x0002, true, false, PressRoute::Item },
    { "ExpandButton", true, kHitOnItemButton, true, false, PressRoute::Tree },
    { "ExpandButtonRight", true, kHitOnItemButton, false, false, PressRoute::Tree },
    { "StateIconWithCheckBoxes", true, kHitOnItemStateIcon, true, true, PressRoute::Tree },
    { "StateIconWithoutCheckBoxes", true, kHitOnItemStateIcon, true, false, PressRoute::Item },
    { "StateIconRightButton", true, kHitOnItemStateIcon, false, true, PressRoute::Item },
    { "Indent", true, kHitOnItemIndent, true, false, PressRoute::Band },
    { "RightOfLabel", true, kHitOnItemRight, true, false, PressRoute::Band },
    { "Nowhere", false, kHitNowhere, true, false, PressRoute::Band },
    { "NoItemButFlags", false, 0x0004, true, false, PressRoute::Band },
};

TEST(ClassifyPress, Route)
{
    for (const PressCase& c : kPressCases)
        EXPECT_EQ(int(c.expected), int(ClassifyPress(c.hitItem, c.flags, c.left, c.checkBoxes))) << c.name;
}

TEST(PreSelection, ByButtonAndKeys)
{
    const struct { bool left; UINT keys; PreSelection expected; } cases[] = {
        { true, MK_SHIFT, PreSelection::ShiftRange },          { true, MK_SHIFT | MK_CONTROL, PreSelection::ShiftRange },
        { true, MK_CONTROL, PreSelection::ClearAnchor },       { true, MK_LBUTTON, PreSelection::SelectItem },
        { false, MK_RBUTTON, PreSelection::SelectKeepAnchor }, { false, MK_SHIFT, PreSelection::Nothing },
        { false, MK_SHIFT | MK_CONTROL, PreSelection::Nothing }, { false, MK_CONTROL, PreSelection::SetAnchor },
    };
    for (const auto& c : cases)
        EXPECT_EQ(int(c.expected), int(ClassifyPreSelection(c.left, c.keys))) << c.left << " keys " << c.keys;
}

TEST(PlanClick, ByButtonKeysAndState)
{
    // The plan as letters: A applied, D others deselected, S selected bit; "-" not applied.
    const struct { bool left; UINT keys; bool itemSelected; const char* plan; } cases[] = {
        { true, 0, true, "ADS" },       { true, MK_CONTROL, true, "A" },  { true, MK_CONTROL, false, "AS" },
        { true, MK_SHIFT, false, "-" }, { true, MK_SHIFT | MK_CONTROL, false, "-" },
        { false, 0, false, "-" },       { false, MK_CONTROL, false, "-" },
    };
    for (const auto& c : cases)
    {
        const ClickSelection p = PlanClick(c.left, c.keys, c.itemSelected);
        std::string plan = p.apply ? "A" : "-";
        if (p.apply)
            plan += std::string(p.deselectOthers ? "D" : "") + (p.selectedBit == kSelected ? "S" : "");
        EXPECT_EQ(c.plan, plan) << c.left << " keys " << c.keys << " selected " << c.itemSelected;
    }
}

TEST(DragDistance, StrictlyBeyondOnEitherAxis)
{
    const struct { POINT to; bool beyond; } cases[] = {
        { { 104, 54 }, false }, { { 96, 46 }, false }, { { 105, 50 }, true }, { { 100, 45 }, true },
        { { -30000, 50 }, true },
    };
    for (const auto& c : cases)
        EXPECT_EQ(c.beyond, ExceedsDragDistance(POINT{ 100, 50 }, c.to, 4, 4)) << c.to.x << "," << c.to.y;
}

// ---------------------------------------------------------------------------------
// Band geometry

TEST(BandGeometry, StartPointStaysInContent)
{
    // Pressed at (30, 40) with the tree scrolled 5 px right and 2 rows of 16 down.
    const POINT start = ClientToContent(POINT{ 30, 40 }, 5, 2, 16);
    EXPECT_EQ(35, start.x);
    EXPECT_EQ(72, start.y);
    // After scrolling 3 more rows down the start point is 48 px higher on screen.
    const POINT now = ContentToClient(start, 5, 5, 16);
    EXPECT_EQ(30, now.x);
    EXPECT_EQ(-8, now.y);

    const RECT band = BandRect(start, 5, 5, 16, POINT{ 10, 100 });
    EXPECT_EQ(10, band.left);
    EXPECT_EQ(-8, band.top);
    EXPECT_EQ(30, band.right);
    EXPECT_EQ(100, band.bottom);
}

TEST(BandGeometry, EmptyTreeHasNoRowHeight)
{
    const POINT start = ClientToContent(POINT{ 3, 4 }, 0, 7, 0);
    EXPECT_EQ(3, start.x);
    EXPECT_EQ(4, start.y);
}

struct TouchCase
{
    const char* name;
    RECT band;
    RECT item;
    bool expected;
};

const TouchCase kTouchCases[] = {
    { "Inside", { 10, 10, 50, 50 }, { 0, 16, 200, 32 }, true },
    { "ZeroWidthBandCrossesRows", { 40, 5, 40, 40 }, { 0, 16, 200, 32 }, true },
    { "BandEndsOnFirstPixelOfRow", { 40, 0, 60, 16 }, { 0, 16, 200, 32 }, true },
    { "BandEndsAbove", { 40, 0, 60, 15 }, { 0, 16, 200, 32 }, false },
    { "BandStartsOnRowBottomEdge", { 40, 32, 60, 50 }, { 0, 16, 200, 32 }, false },
    { "BandLeftOfLabel", { 0, 0, 19, 50 }, { 20, 16, 80, 32 }, false },
    { "BandTouchesLabelLeftPixel", { 0, 0, 20, 50 }, { 20, 16, 80, 32 }, true },
    { "BandRightOfLabel", { 80, 0, 120, 50 }, { 20, 16, 80, 32 }, false },
    { "EmptyItem", { 0, 0, 100, 100 }, { 20, 20, 20, 40 }, false },
};

TEST(BandTouches, Touches)
{
    for (const TouchCase& c : kTouchCases)
        EXPECT_EQ(c.expected, BandTouches(c.band, c.item)) << c.name;
}

TEST(AutoScroll, OneLinePerAxisOutsideTheClientArea)
{
    // The client area is (0, 0, 200, 100); its bottom and right edges are outside.
    const struct { POINT pt; int vertical, horizontal; } cases[] = {
        { { 0, 0 }, 0, 0 }, { { 50, 100 }, 1, 0 }, { { -1, -1 }, -1, -1 }, { { 200, 99 }, 0, 1 },
    };
    for (const auto& c : cases)
    {
        const AutoScroll scroll = AutoScrollFor(c.pt, RECT{ 0, 0, 200, 100 });
        EXPECT_EQ(c.vertical, scroll.vertical) << c.pt.x << "," << c.pt.y;
        EXPECT_EQ(c.horizontal, scroll.horizontal) << c.pt.x << "," << c.pt.y;
    }
}

// ---------------------------------------------------------------------------------
// DecideBandStep

struct BandCase
{
    const char* name;
    bool touches;
    bool selected;
    bool inSnapshot;
    UINT keys;
    BandStep expected;
};

const BandCase kBandCases[] = {
    { "InsideUnselected", true, false, false, 0, BandStep::Select },
    { "InsideSelected", true, true, false, 0, BandStep::Nothing },
    { "InsideCtrlSnapshotSelected", true, true, true, MK_CONTROL, BandStep::Deselect },
    { "InsideCtrlSnapshotDeselected", true, false, true, MK_CONTROL, BandStep::Deselect },
    { "InsideShiftSnapshot", true, true, true, MK_SHIFT, BandStep::ForgetSnapshot },
    { "InsideCtrlShiftSnapshot", true, true, true, MK_SHIFT | MK_CONTROL, BandStep::Deselect },
    { "InsideSnapshotNoKeys", true, true, true, 0, BandStep::Nothing },
    { "OutsideSelectedByBand", false, true, false, 0, BandStep::Deselect },
    { "OutsideSnapshotDeselected", false, false, true, MK_CONTROL, BandStep::Reselect },
    { "OutsideSnapshotSelected", false, true, true, MK_CONTROL, BandStep::Reselect },
    { "OutsideNeither", false, false, false, MK_CONTROL, BandStep::Nothing },
};

TEST(DecideBandStep, Step)
{
    for (const BandCase& c : kBandCases)
        EXPECT_EQ(int(c.expected), int(DecideBandStep(c.touches, c.selected, c.inSnapshot, c.keys))) << c.name;
}

TEST(SelectionSnapshot, AddContainsRemove)
{
    SelectionSnapshot snapshot;
    int a = 0, b = 0;
    EXPECT_TRUE(snapshot.IsEmpty());
    snapshot.Add(&a);
    snapshot.Add(&b);
    snapshot.Add(&a);
    EXPECT_EQ(2u, snapshot.Size());
    EXPECT_TRUE(snapshot.Contains(&a));
    snapshot.Remove(&a);
    EXPECT_FALSE(snapshot.Contains(&a));
    EXPECT_TRUE(snapshot.Contains(&b));
    snapshot.Remove(&a);   // removing twice is harmless
    EXPECT_EQ(1u, snapshot.Size());
}

} // namespace
