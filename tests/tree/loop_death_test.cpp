// Fault injection into the tree's press loops: the tree, or its top-level window, is
// destroyed from a timer while the click-or-drag loop or the rubber band runs. The
// loop ends at once (before a later release would have ended it), leaves the capture
// free, sends nothing more about the dead tree, and a new tree works as before.
#include "TreeHarness.h"

using namespace tree_test;
using orvane_test::CallLater;

namespace {

struct DeathCase
{
    const char* name;
    bool band;          // the rubber band, else the click-or-drag loop
    bool topLevel;      // the tree's top-level window dies, else the tree itself
};

const DeathCase kDeaths[] = {
    { "ClickOrDragTreeDestroyed", false, false },
    { "ClickOrDragTopLevelDestroyed", false, true },
    { "BandTreeDestroyed", true, false },
    { "BandTopLevelDestroyed", true, true },
};

class LoopDeathTest : public SmallTreeFixture, public testing::WithParamInterface<DeathCase> {};

TEST_P(LoopDeathTest, LoopEndsAtOnceAndANewTreeWorks)
{
    const DeathCase& c = GetParam();
    const CPoint press = c.band ? RightOfLabel("B") : LabelPoint("B");
    PointCursorAt(press);
    CallLater kill(30, [&] {
        c.topLevel ? m_parent.DestroyWindow() : m_tree.DestroyWindow();
        m_trace.clear();
        m_tree.m_hookTrace.clear();
    });
    CallLater release(1500, [] { ::PostMessageW(NULL, WM_LBUTTONUP, 0, 0); });
    SendButtonDown(press);
    EXPECT_TRUE(kill.fired());
    EXPECT_FALSE(release.fired()) << "the loop ran on after its window was gone";
    EXPECT_EQ(nullptr, ::GetCapture());
    orvane_test::PumpUntilIdle(50);
    EXPECT_EQ("", m_trace);
    EXPECT_EQ("", m_tree.m_hookTrace);

    ASSERT_TRUE(!c.topLevel || CreateParent());
    CreateTree();
    Build(kSmallTree);
    if (c.band)
    {
        const CPoint start = RightOfLabel("B");
        const CPoint end(start.x - 5, LabelPoint("D").y);
        PointCursorAt(start);
        PostMove(end);
        PostButtonUp(end);
        SendButtonDown(start);
        EXPECT_EQ("B C C1 D", Selected());
    }
    else
    {
        Click(LabelPoint("D"));
        EXPECT_EQ("D", Selected());
    }
    EXPECT_NE(std::string::npos, m_trace.find("*click")) << m_trace;
}

INSTANTIATE_TEST_SUITE_P(Tree, LoopDeathTest, testing::ValuesIn(kDeaths),
    [](const testing::TestParamInfo<DeathCase>& info) { return std::string(info.param.name); });

} // namespace
