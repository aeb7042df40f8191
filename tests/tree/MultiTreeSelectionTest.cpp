// Selection model of the multi-selection tree, driven through its API and keys:
// - SetItemState: the emulated TVN_SELCHANGINGW/TVN_SELCHANGEDW pair (items, mask,
//   item data, IsEmulatedNotify during the call), the veto, the pair for unchanged
//   items, OnItemSelected only on real changes, focus moves through the caret;
// - GetItemState/FocusItem, selection walks, SelectRange (only/add, hidden and missing
//   endpoints), SelectChildren;
// - keyboard: Shift+Down, Ctrl+Down, plain arrows clearing the anchor;
// - collapse deselecting descendants and removing the caret; SetMultiSelect(FALSE);
// - run-time classes.
#include "TreeHarness.h"

#include "Input.h"

using namespace tree_test;
using orvane_test::KeyStateGuard;
using orvane_test::SendKey;

namespace {

class SelectionTest : public TreeFixture
{
protected:
    void SetUp() override
    {
        TreeFixture::SetUp();
        Build(kSmallTree);
    }
};

// ---------------------------------------------------------------------------------
// SetItemState and notifications

TEST_F(SelectionTest, SelectingSendsEmulatedPairWithItemInItemNew)
{
    Arrange({ "A" }, "A");
    EXPECT_TRUE(m_tree.SetItemState(Item("C"), TVIS_SELECTED, TVIS_SELECTED));
    EXPECT_EQ("*ing:+C *ed:+C", m_parent.Trace());
    EXPECT_EQ("A C", Selected());
    EXPECT_EQ("A", Caret());
    EXPECT_EQ("+C", m_tree.m_hookTrace);

    const CRecordingParent::Record* changed = m_parent.Last(TVN_SELCHANGEDW);
    ASSERT_NE(nullptr, changed);
    EXPECT_EQ(static_cast<UINT>(TVIF_HANDLE | TVIF_PARAM), changed->newMask);
    EXPECT_EQ(static_cast<LPARAM>(m_tree.GetItemData(Item("C"))), changed->newParam);
}

TEST_F(SelectionTest, DeselectingPutsItemInItemOld)
{
    Arrange({ "A", "C" }, "A");
    EXPECT_TRUE(m_tree.SetItemState(Item("C"), 0, TVIS_SELECTED));
    EXPECT_EQ("*ing:-C *ed:-C", m_parent.Trace());
    EXPECT_EQ("A", Selected());
    EXPECT_EQ("-C", m_tree.m_hookTrace);
}

TEST_F(SelectionTest, PairIsSentForUnchangedItemButHookIsNot)
{
    Arrange({ "A", "C" }, "A");
    EXPECT_TRUE(m_tree.SetItemState(Item("C"), TVIS_SELECTED, TVIS_SELECTED));
    EXPECT_TRUE(m_tree.SetItemState(Item("D"), 0, TVIS_SELECTED));
    EXPECT_EQ("*ing:+C *ed:+C *ing:-D *ed:-D", m_parent.Trace());
    EXPECT_EQ("", m_tree.m_hookTrace);
    EXPECT_EQ("A C", Selected());
}

TEST_F(SelectionTest, VetoLeavesSelectionAndOtherBitsUnchanged)
{
    Arrange({ "A" }, "A");
    m_parent.m_hVeto = Item("C");
    EXPECT_FALSE(m_tree.SetItemState(Item("C"), TVIS_SELECTED | TVIS_BOLD, TVIS_SELECTED | TVIS_BOLD));
    EXPECT_EQ("*ing:+C", m_parent.Trace());
    EXPECT_EQ("A", Selected());
    EXPECT_EQ(0u, m_tree.GetItemState(Item("C"), TVIS_BOLD));
    EXPECT_EQ("", m_tree.m_hookTrace);
}

TEST_F(SelectionTest, OtherBitsWithoutSelectionSendNothing)
{
    Arrange({ "A" }, "A");
    EXPECT_TRUE(m_tree.SetItemState(Item("C"), TVIS_BOLD, TVIS_BOLD));
    EXPECT_EQ("", m_parent.Trace());
    EXPECT_EQ(static_cast<UINT>(TVIS_BOLD), m_tree.GetItemState(Item("C"), TVIS_BOLD));
}

TEST_F(SelectionTest, FocusMoveKeepsSelectedCaretAndLeavesTargetUnselected)
{
    Arrange({ "A", "B" }, "A");
    EXPECT_TRUE(m_tree.FocusItem(Item("D")));
    EXPECT_EQ("D", Caret());
    EXPECT_EQ("A B", Selected());
    // The tree's own caret moves (not emulated): the selected caret is given up and
    // re-selected, D becomes the caret; then the control takes back the selection the
    // tree gave D.
    EXPECT_EQ("ing:-A ed:-A ing:+D ed:+D *ing:-D *ed:-D", m_parent.Trace());
    EXPECT_EQ(static_cast<UINT>(TVIS_FOCUSED), m_tree.GetItemState(Item("D"), TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ(static_cast<UINT>(TVIS_SELECTED), m_tree.GetItemState(Item("A"), TVIS_FOCUSED | TVIS_SELECTED));
}

TEST_F(SelectionTest, FocusAndSelectMovesCaretWithTreeNotificationsOnly)
{
    Arrange({ "A" }, "A");
    EXPECT_TRUE(m_tree.SetItemState(Item("C"), TVIS_FOCUSED | TVIS_SELECTED, TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ("C", Caret());
    EXPECT_EQ("A C", Selected());
    EXPECT_EQ("ing:-A ed:-A ing:+C ed:+C", m_parent.Trace());
}

TEST_F(SelectionTest, FocusAndSelectOnUnselectedCaretSelectsItWithPair)
{
    Arrange({}, "B");
    EXPECT_TRUE(m_tree.SetItemState(Item("B"), TVIS_FOCUSED | TVIS_SELECTED, TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ("*ing:+B *ed:+B", m_parent.Trace());
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("B", Caret());
}

TEST_F(SelectionTest, CaretVetoedByParentFailsBeforeSelection)
{
    Arrange({ "A" }, "A");
    m_parent.m_hVeto = Item("D");
    EXPECT_FALSE(m_tree.SetItemState(Item("D"), TVIS_FOCUSED | TVIS_SELECTED, TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ("A", Selected());
    EXPECT_EQ("", Caret());   // the old caret was given up before the refused move
}

TEST_F(SelectionTest, TakingFocusAwayKeepsSelection)
{
    Arrange({ "A", "B" }, "B");
    EXPECT_TRUE(m_tree.FocusItem(NULL));
    EXPECT_EQ("", Caret());
    EXPECT_EQ("A B", Selected());
    EXPECT_FALSE(m_tree.FocusItem(NULL));   // no caret any more
}

TEST_F(SelectionTest, TakingFocusAwayAndDeselecting)
{
    Arrange({ "A", "B" }, "B");
    EXPECT_TRUE(m_tree.SetItemState(Item("B"), 0, TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ("", Caret());
    EXPECT_EQ("A", Selected());
    EXPECT_NE(std::string::npos, m_parent.Trace().find("*ing:-B *ed:-B")) << m_parent.Trace();
}

TEST_F(SelectionTest, TakingFocusAwayAndSelectingUnselectedCaretSelectsIt)
{
    Arrange({ "A" }, "B");
    EXPECT_TRUE(m_tree.SetItemState(Item("B"), TVIS_SELECTED, TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ("", Caret());
    EXPECT_EQ("A B", Selected());
}

TEST_F(SelectionTest, GetItemStateReportsFocusOnlyForCaret)
{
    Arrange({ "A", "C" }, "C");
    EXPECT_EQ(static_cast<UINT>(TVIS_FOCUSED | TVIS_SELECTED), m_tree.GetItemState(Item("C"), TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ(static_cast<UINT>(TVIS_SELECTED), m_tree.GetItemState(Item("A"), TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ(0u, m_tree.GetItemState(Item("C"), TVIS_BOLD));
    EXPECT_EQ(Item("C"), m_tree.GetFocusedItem());
    EXPECT_EQ(1, m_tree.IsSelected(Item("A")));
    EXPECT_EQ(0, m_tree.IsSelected(Item("B")));
}

TEST_F(SelectionTest, NullItemIsRefused)
{
    EXPECT_FALSE(m_tree.SetItemState(NULL, TVIS_SELECTED, TVIS_SELECTED));
    EXPECT_EQ("", m_parent.Trace());
}

// ---------------------------------------------------------------------------------
// Walks

TEST_F(SelectionTest, SelectedWalksFollowVisibleOrder)
{
    Arrange({ "A2a", "B", "E" }, "B");
    EXPECT_EQ(Item("A2a"), m_tree.GetFirstSelectedItem());
    EXPECT_EQ(Item("B"), m_tree.GetNextSelectedItem(Item("A2a")));
    EXPECT_EQ(Item("E"), m_tree.GetNextSelectedItem(Item("B")));
    EXPECT_EQ(NULL, m_tree.GetNextSelectedItem(Item("E")));
    EXPECT_EQ(3u, m_tree.GetSelectedCount());

    CTypedPtrList<CPtrList, HTREEITEM> list;
    list.AddTail(Item("D"));   // emptied first
    m_tree.GetSelectedList(list);
    ASSERT_EQ(3, list.GetCount());
    EXPECT_EQ(Item("A2a"), list.GetHead());
    EXPECT_EQ(Item("E"), list.GetTail());
}

TEST_F(SelectionTest, SelectAllTouchesOnlyItemsThatDiffer)
{
    Arrange({ "B", "D" }, "B");
    m_tree.SelectAll(FALSE);
    EXPECT_EQ("", Selected());
    EXPECT_EQ("*ing:-B *ed:-B *ing:-D *ed:-D", m_parent.Trace());
    m_parent.ClearTrace();
    m_tree.SelectAll(TRUE);
    EXPECT_EQ("A A1 A2 A2a B C C1 D E", Selected());
    EXPECT_EQ(9u, m_tree.GetSelectedCount());
}

struct RangeCase
{
    const char* name;
    std::vector<std::string> before;
    const char* first;
    const char* last;
    BOOL only;
    const char* expected;
};

const RangeCase kRanges[] = {
    { "DownwardsOnly", { "A", "E" }, "A2", "C", TRUE, "A2 A2a B C" },
    { "UpwardsOnly", { "A", "E" }, "C", "A2", TRUE, "A2 A2a B C" },
    { "Adds", { "A", "E" }, "A2", "C", FALSE, "A A2 A2a B C E" },
    { "SingleItem", { "A", "E" }, "C", "C", TRUE, "C" },
    { "WholeTree", {}, "A", "E", TRUE, "A A1 A2 A2a B C C1 D E" },
    { "MissingFirstIsTheOtherEndpoint", { "A" }, "", "C", TRUE, "C" },
    { "MissingLastAdds", { "A" }, "B", "", FALSE, "A B" },
    { "BothMissingOnlyClears", { "A", "E" }, "", "", TRUE, "" },
};

class SelectRangeTest : public SelectionTest, public testing::WithParamInterface<RangeCase> {};

TEST_P(SelectRangeTest, Selects)
{
    const RangeCase& c = GetParam();
    Arrange(c.before, "A");
    m_tree.SelectRange(Item(c.first), Item(c.last), c.only);
    EXPECT_EQ(c.expected, Selected());
}

INSTANTIATE_TEST_SUITE_P(Table, SelectRangeTest, testing::ValuesIn(kRanges),
    [](const testing::TestParamInfo<RangeCase>& info) { return std::string(info.param.name); });

TEST_F(SelectionTest, RangeToHiddenEndpointStopsAtItsVisibleAncestor)
{
    m_tree.Expand(Item("A2"), TVE_COLLAPSE);   // A2a hidden
    m_tree.Expand(Item("C"), TVE_COLLAPSE);    // C1 hidden
    Arrange({}, "A");
    m_tree.SelectRange(Item("A2a"), Item("C1"), TRUE);
    EXPECT_EQ("A2 B C", Selected());
    EXPECT_EQ(3u, m_tree.GetSelectedCount());
}

TEST_F(SelectionTest, SelectChildrenRecursesIntoExpandedBranchesAndReportsCaret)
{
    Arrange({}, "A2a");
    EXPECT_TRUE(m_tree.SelectChildren(Item("A"), TRUE, TRUE));
    EXPECT_EQ("A1 A2 A2a", Selected());
    EXPECT_FALSE(m_tree.SelectChildren(Item("C"), TRUE, FALSE));
    EXPECT_EQ("A1 A2 A2a C1", Selected());
    EXPECT_TRUE(m_tree.SelectChildren(Item("A2"), FALSE, FALSE));
    EXPECT_EQ("A1 A2 C1", Selected());
    EXPECT_FALSE(m_tree.SelectChildren(Item("B"), TRUE, TRUE));   // no children
    EXPECT_FALSE(m_tree.SelectChildren(Item("A"), FALSE, FALSE));  // caret A2a is a grandchild
    EXPECT_EQ("C1", Selected());
}

TEST_F(SelectionTest, SelectChildrenSurvivesDeepTrees)
{
    // Depth first with a stack of its own: each level is one nested branch.
    CreateTree();
    m_tree.ShowWindow(SW_HIDE);
    std::string spec;
    for (int i = 0; i < 300; ++i)
        spec += std::string(static_cast<size_t>(i), ' ') + "L" + std::to_string(i) + "\n";
    Build(spec.c_str());
    EXPECT_FALSE(m_tree.SelectChildren(Item("L0"), TRUE, TRUE));
    EXPECT_EQ(299u, m_tree.GetSelectedCount());
    EXPECT_EQ(0, m_tree.IsSelected(Item("L0")));
    EXPECT_EQ(1, m_tree.IsSelected(Item("L299")));
}

// ---------------------------------------------------------------------------------
// Keyboard

TEST_F(SelectionTest, ShiftDownFromSelectedCaretSelectsCaretAndNext)
{
    Arrange({ "B" }, "B");
    m_tree.SetFocus();
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("B C", Selected());
    EXPECT_EQ("C", Caret());
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("B C C1", Selected());
    EXPECT_EQ("C1", Caret());
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_UP);
        SendKey(m_tree, VK_UP);
        SendKey(m_tree, VK_UP);
    }
    EXPECT_EQ("A2a B", Selected());
    EXPECT_EQ("A2a", Caret());
}

TEST_F(SelectionTest, CtrlDownMovesOnlyTheFocus)
{
    Arrange({ "B" }, "B");
    m_tree.SetFocus();
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("C", Caret());
    EXPECT_EQ("B", Selected());
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("C1", Caret());
    EXPECT_EQ("B", Selected());
}

TEST_F(SelectionTest, PlainArrowClearsSelectionAndAnchor)
{
    Arrange({ "B" }, "B");
    m_tree.SetFocus();
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("B C", Selected());
    EXPECT_EQ(Item("B"), m_tree.Anchor());

    SendKey(m_tree, VK_DOWN);
    EXPECT_EQ("C1", Selected());
    EXPECT_EQ("C1", Caret());
    EXPECT_EQ(NULL, m_tree.Anchor());

    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("C1 D", Selected());   // the range starts at the new caret, not at B
}

// ---------------------------------------------------------------------------------
// Collapse

TEST_F(SelectionTest, CollapseDeselectsDescendantsAndRemovesCaretInside)
{
    Arrange({ "A1", "A2a", "D" }, "A2a");
    m_tree.SetFocus();
    Click(PointWithHit("A", TVHT_ONITEMBUTTON));
    EXPECT_EQ(0u, m_tree.GetItemState(Item("A"), TVIS_EXPANDED));
    EXPECT_EQ("D", Selected());
    EXPECT_EQ("", Caret());
    // The parent still gets the expansion notifications.
    EXPECT_NE(std::string::npos, m_parent.Trace().find("expanding:+A")) << m_parent.Trace();
    EXPECT_NE(std::string::npos, m_parent.Trace().find("*ing:-A2a *ed:-A2a")) << m_parent.Trace();
}

TEST_F(SelectionTest, CollapseOfSelectedParentLetsTreeMoveCaretToIt)
{
    Arrange({ "A", "A1", "A2a" }, "A2a");
    Click(PointWithHit("A", TVHT_ONITEMBUTTON));
    EXPECT_EQ("A", Selected());
    EXPECT_EQ("A", Caret());
}

TEST_F(SelectionTest, CollapseWithCaretOutsideKeepsCaret)
{
    Arrange({ "A1", "B" }, "B");
    Click(PointWithHit("A", TVHT_ONITEMBUTTON));
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("B", Caret());
}

// ---------------------------------------------------------------------------------
// Multi-selection off

TEST_F(SelectionTest, SwitchingOffKeepsOnlySelectedCaret)
{
    Arrange({ "A", "B", "D" }, "B");
    EXPECT_TRUE(m_tree.SetMultiSelect(FALSE));
    EXPECT_FALSE(m_tree.IsMultiSelect());
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("B", Caret());
    EXPECT_EQ(std::string::npos, m_parent.Trace().find('*')) << m_parent.Trace();
    EXPECT_EQ("-A -D", m_tree.m_hookTrace);
    EXPECT_FALSE(m_tree.SetMultiSelect(TRUE));
}

TEST_F(SelectionTest, SwitchingOffWithUnselectedCaretLeavesNone)
{
    Arrange({ "A", "C", "D" }, "B");
    m_tree.SetMultiSelect(FALSE);
    EXPECT_EQ("", Selected());
    EXPECT_EQ("B", Caret());
}

TEST_F(SelectionTest, SingleModeSetItemStateSendsNothing)
{
    Arrange({ "A" }, "A");
    m_tree.SetMultiSelect(FALSE);
    m_parent.ClearTrace();
    EXPECT_TRUE(m_tree.SetItemState(Item("C"), TVIS_SELECTED, TVIS_SELECTED));
    EXPECT_EQ("", m_parent.Trace());
    EXPECT_EQ("+C", m_tree.m_hookTrace);
}

TEST_F(SelectionTest, SingleModeKeysAndCollapseBehaveAsPlainTree)
{
    Arrange({ "A2a" }, "A2a");
    m_tree.SetMultiSelect(FALSE);
    m_parent.ClearTrace();
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("ing:-A2a+B ed:-A2a+B", m_parent.Trace());
    m_tree.CTreeCtrl::SelectItem(Item("A1"));
    Click(PointWithHit("A", TVHT_ONITEMBUTTON));
    EXPECT_EQ("A", Caret());   // the plain tree moves a hidden caret to the collapsed parent
    EXPECT_EQ("A", Selected());
}

// ---------------------------------------------------------------------------------
// Run-time classes

TEST(MultiTreeClasses, RuntimeClassRecords)
{
    CRuntimeClass* pBase = RUNTIME_CLASS(KVXMultiTreeBase);
    CRuntimeClass* pTree = RUNTIME_CLASS(CMultiTree);
    EXPECT_STREQ("KVXMultiTreeBase", pBase->m_lpszClassName);
    EXPECT_STREQ("CMultiTree", pTree->m_lpszClassName);
    EXPECT_EQ(0xFFFFu, pBase->m_wSchema);
    EXPECT_EQ(static_cast<int>(sizeof(CMultiTree)), pTree->m_nObjectSize);
    EXPECT_TRUE(pTree->IsDerivedFrom(pBase));
    EXPECT_TRUE(pBase->IsDerivedFrom(RUNTIME_CLASS(CTreeCtrl)));
    EXPECT_EQ(nullptr, pTree->m_pfnCreateObject);

    CObject* pObject = pBase->CreateObject();
    ASSERT_NE(nullptr, pObject);
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CTreeCtrl)));
    EXPECT_FALSE(pObject->IsKindOf(RUNTIME_CLASS(CMultiTree)));
    delete pObject;

    CMultiTree tree;
    EXPECT_TRUE(tree.IsKindOf(RUNTIME_CLASS(KVXMultiTreeBase)));
    EXPECT_TRUE(tree.IsMultiSelect());
    EXPECT_FALSE(tree.IsEmulatedNotify());
    EXPECT_FALSE(tree.SetBandingHit(TRUE));
    EXPECT_TRUE(tree.SetBandingHit(FALSE));
}

} // namespace
