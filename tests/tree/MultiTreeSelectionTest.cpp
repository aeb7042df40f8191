// Selection model of the multi-selection tree, driven through its API and keys. The
// decisions behind it are tested as plain functions in TreeSelectionMathTest.cpp.
// - SetItemState as a table of requests: the emulated TVN_SELCHANGINGW/TVN_SELCHANGEDW
//   pair (items, IsEmulatedNotify during the call), the veto, the pair for unchanged items,
//   OnItemSelected only on real changes, focus moves through the tree's own caret;
// - GetItemState/FocusItem, selection walks, SelectAll, SelectRange (only/add, hidden and
//   missing endpoints), SelectChildren;
// - keyboard: Shift+arrows, Ctrl+Down, plain arrows clearing the anchor;
// - collapse deselecting descendants and removing the caret; SetMultiSelect(FALSE);
// - run-time classes.
#include "TreeHarness.h"

using namespace tree_test;
using orvane_test::KeyStateGuard;
using orvane_test::SendKey;

namespace {

const UINT S = TVIS_SELECTED;
const UINT F = TVIS_FOCUSED;
const UINT BOLD = TVIS_BOLD;

// Trace: [*]ing/ed (selection changing/changed) :-old +new, '*' while IsEmulatedNotify.
struct StateCase
{
    const char* name;
    const char* before;   // selected items
    const char* caret;
    const char* item;
    UINT state, mask;
    const char* veto;     // TVN_SELCHANGINGW naming this item is refused
    BOOL result;
    const char* trace;
    const char* selected;
    const char* caretAfter;
    UINT itemState;       // GetItemState(item, F | S | BOLD) afterwards
    const char* hook;     // OnItemSelected calls
};

const StateCase kStateCases[] = {
    { "SelectingSendsTheEmulatedPair", "A", "A", "C", S, S, "", TRUE, "*ing:+C *ed:+C", "A C", "A", S, "+C" },
    { "DeselectingPutsTheItemInItemOld", "A C", "A", "C", 0, S, "", TRUE, "*ing:-C *ed:-C", "A", "A", 0, "-C" },
    { "UnchangedSelectedItemGetsThePairNotTheHook", "A C", "A", "C", S, S, "", TRUE, "*ing:+C *ed:+C", "A C", "A", S, "" },
    { "UnchangedUnselectedItemGetsThePairNotTheHook", "A C", "A", "D", 0, S, "", TRUE, "*ing:-D *ed:-D", "A C", "A", 0, "" },
    { "VetoLeavesSelectionAndOtherBits", "A", "A", "C", S | BOLD, S | BOLD, "C", FALSE, "*ing:+C", "A", "A", 0, "" },
    { "OtherBitsWithoutSelectionSendNothing", "A", "A", "C", BOLD, BOLD, "", TRUE, "", "A", "A", BOLD, "" },
    // The tree's own caret moves (not emulated): the selected caret is given up and
    // re-selected, D becomes the caret; then the control takes back the selection the tree
    // gave D.
    { "FocusMoveKeepsTheSelectedCaretAndLeavesTheTargetUnselected", "A B", "A", "D", F, F, "", TRUE,
      "ing:-A ed:-A ing:+D ed:+D *ing:-D *ed:-D", "A B", "D", F, nullptr },
    { "FocusAndSelectMovesTheCaretWithTreeNotificationsOnly", "A", "A", "C", F | S, F | S, "", TRUE,
      "ing:-A ed:-A ing:+C ed:+C", "A C", "C", F | S, nullptr },
    { "FocusAndSelectOnTheUnselectedCaretSelectsItWithThePair", "", "B", "B", F | S, F | S, "", TRUE,
      "*ing:+B *ed:+B", "B", "B", F | S, nullptr },
    { "CaretVetoedFailsAfterTheOldCaretWasGivenUp", "A", "A", "D", F | S, F | S, "D", FALSE, "ing:-A ed:-A ing:+D", "A", "", 0, nullptr },
    { "TakingTheFocusAwayAndDeselecting", "A B", "B", "B", 0, F | S, "", TRUE, "ing:-B ed:-B *ing:-B *ed:-B", "A", "",
      0, nullptr },
    { "TakingTheFocusAwayAndSelectingTheUnselectedCaretSelectsIt", "A", "B", "B", S, F | S, "", TRUE, nullptr,
      "A B", "", S, nullptr },
};

using SelectionTest = SmallTreeFixture;

TEST_F(SelectionTest, SetItemStateRequests)
{
    for (const StateCase& c : kStateCases)
    {
        SCOPED_TRACE(c.name);
        m_tree.CTreeCtrl::SetItemState(Item(c.item), 0, BOLD);
        Arrange(c.before, c.caret);
        m_parent.m_hVeto = Item(c.veto);
        EXPECT_EQ(c.result, m_tree.SetItemState(Item(c.item), c.state, c.mask));
        if (c.trace != nullptr)
            EXPECT_EQ(c.trace, m_trace);
        EXPECT_EQ(c.selected, Selected());
        EXPECT_EQ(c.caretAfter, Caret());
        EXPECT_EQ(c.itemState, m_tree.GetItemState(Item(c.item), F | S | BOLD));
        if (c.hook != nullptr)
            EXPECT_EQ(c.hook, m_tree.m_hookTrace);
    }
    m_parent.m_hVeto = NULL;
}

TEST_F(SelectionTest, TheEmulatedPairCarriesHandleAndItemData)
{
    Arrange("A", "A");
    orvane_test::NotifySpy changed(m_parent, TVN_SELCHANGEDW, sizeof(NMTREEVIEW));
    m_tree.SetItemState(Item("C"), S, S);
    ASSERT_EQ(1, changed.count());
    const NMTREEVIEW& nm = *reinterpret_cast<const NMTREEVIEW*>(changed.payloads()[0].data());
    EXPECT_EQ(UINT(TVIF_HANDLE | TVIF_PARAM), nm.itemNew.mask);
    EXPECT_EQ(LPARAM(m_tree.GetItemData(Item("C"))), nm.itemNew.lParam);
    EXPECT_FALSE(m_tree.SetItemState(NULL, S, S));
}

TEST_F(SelectionTest, FocusOnlyForTheCaretAndFocusItem)
{
    Arrange("A C", "C");
    EXPECT_EQ(F | S, m_tree.GetItemState(Item("C"), F | S));
    EXPECT_EQ(S, m_tree.GetItemState(Item("A"), F | S));
    EXPECT_EQ(Item("C"), m_tree.GetFocusedItem());
    EXPECT_EQ(1, m_tree.IsSelected(Item("A")));
    EXPECT_EQ(0, m_tree.IsSelected(Item("B")));
    EXPECT_TRUE(m_tree.FocusItem(Item("D")));
    EXPECT_EQ("D", Caret());
    EXPECT_EQ("A C", Selected());
    EXPECT_TRUE(m_tree.FocusItem(NULL));
    EXPECT_EQ("", Caret());
    EXPECT_EQ("A C", Selected());
    EXPECT_FALSE(m_tree.FocusItem(NULL));   // no caret any more
}

TEST_F(SelectionTest, SelectedWalksFollowVisibleOrderSelectAllTouchesOnlyItemsThatDiffer)
{
    Arrange("A2a B E", "B");
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

    Arrange("B D", "B");
    m_tree.SelectAll(FALSE);
    EXPECT_EQ("", Selected());
    EXPECT_EQ("*ing:-B *ed:-B *ing:-D *ed:-D", m_trace);
    m_tree.SelectAll(TRUE);
    EXPECT_EQ("A A1 A2 A2a B C C1 D E", Selected());
}

struct RangeCase
{
    const char* before;
    const char* first;
    const char* last;
    BOOL only;
    const char* expected;
};

const RangeCase kRanges[] = {
    { "A E", "A2", "C", TRUE, "A2 A2a B C" }, { "A E", "C", "A2", TRUE, "A2 A2a B C" },
    { "A E", "A2", "C", FALSE, "A A2 A2a B C E" }, { "A E", "C", "C", TRUE, "C" },
    { "", "A", "E", TRUE, "A A1 A2 A2a B C C1 D E" },
    // A missing endpoint is the other one; both missing select nothing.
    { "A", "", "C", TRUE, "C" }, { "A", "B", "", FALSE, "A B" }, { "A E", "", "", TRUE, "" },
};

TEST_F(SelectionTest, SelectRange)
{
    for (const RangeCase& c : kRanges)
    {
        Arrange(c.before, "A");
        m_tree.SelectRange(Item(c.first), Item(c.last), c.only);
        EXPECT_EQ(c.expected, Selected()) << c.first << ".." << c.last << " only " << c.only;
    }
    // A hidden endpoint stops at its visible ancestor.
    m_tree.Expand(Item("A2"), TVE_COLLAPSE);
    m_tree.Expand(Item("C"), TVE_COLLAPSE);
    Arrange("", "A");
    m_tree.SelectRange(Item("A2a"), Item("C1"), TRUE);
    EXPECT_EQ("A2 B C", Selected());
    EXPECT_EQ(3u, m_tree.GetSelectedCount());
}

TEST_F(SelectionTest, SelectChildrenRecursesIntoExpandedBranchesAndReportsTheCaret)
{
    Arrange("", "A2a");
    EXPECT_TRUE(m_tree.SelectChildren(Item("A"), TRUE, TRUE));
    EXPECT_EQ("A1 A2 A2a", Selected());
    EXPECT_FALSE(m_tree.SelectChildren(Item("C"), TRUE, FALSE));
    EXPECT_EQ("A1 A2 A2a C1", Selected());
    EXPECT_TRUE(m_tree.SelectChildren(Item("A2"), FALSE, FALSE));
    EXPECT_FALSE(m_tree.SelectChildren(Item("B"), TRUE, TRUE));    // no children
    EXPECT_FALSE(m_tree.SelectChildren(Item("A"), FALSE, FALSE));  // caret A2a is a grandchild
    EXPECT_EQ("C1", Selected());

    // Depth first with a stack of its own: each level is one nested branch.
    CreateTree();
    m_tree.ShowWindow(SW_HIDE);
    std::string outline;
    for (int i = 0; i < 300; ++i)
        outline += std::string(static_cast<size_t>(i), ' ') + "L" + std::to_string(i) + "\n";
    Build(outline.c_str());
    EXPECT_FALSE(m_tree.SelectChildren(Item("L0"), TRUE, TRUE));
    EXPECT_EQ(299u, m_tree.GetSelectedCount());
    EXPECT_EQ(1, m_tree.IsSelected(Item("L299")));
}

// --- keyboard ---------------------------------------------------------------------

TEST_F(SelectionTest, ShiftArrowsExtendFromTheAnchorCtrlMovesOnlyTheFocus)
{
    Arrange("B", "B");
    m_tree.SetFocus();
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
        EXPECT_EQ("B C", Selected());
        SendKey(m_tree, VK_DOWN);
        EXPECT_EQ("B C C1", Selected());
        EXPECT_EQ("C1", Caret());
        for (int i = 0; i < 3; ++i)
            SendKey(m_tree, VK_UP);
    }
    EXPECT_EQ("A2a B", Selected());
    EXPECT_EQ("A2a", Caret());
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        SendKey(m_tree, VK_DOWN);
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("C", Caret());
    EXPECT_EQ("A2a B", Selected());
}

TEST_F(SelectionTest, PlainArrowClearsSelectionAndAnchor)
{
    Arrange("B", "B");
    m_tree.SetFocus();
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ(Item("B"), m_tree.Anchor());
    SendKey(m_tree, VK_DOWN);
    EXPECT_EQ("C1", Selected());
    EXPECT_EQ(NULL, m_tree.Anchor());
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("C1 D", Selected());   // the range starts at the new caret, not at B
}

// --- collapse -------------------------------------------------------------------------

TEST_F(SelectionTest, CollapseDeselectsDescendantsAndRemovesTheCaretInside)
{
    const struct { const char* before; const char* caret; bool focus; const char* selected; const char* caretAfter; const char* trace; } cases[] = {
        { "A1 A2a D", "A2a", true, "D", "", "*ing:-A2a *ed:-A2a" },
        { "A A1 A2a", "A2a", false, "A", "A", "expanding:+A" },   // a selected parent: the tree moves the caret to it
        { "A1 B", "B", false, "B", "B", "expanding:+A" },         // the caret outside stays
    };
    for (const auto& c : cases)
    {
        SCOPED_TRACE(c.before);
        CreateTree();
        Build(kSmallTree);
        Arrange(c.before, c.caret);
        if (c.focus)
            m_tree.SetFocus();
        Click(PointWithHit("A", TVHT_ONITEMBUTTON));
        EXPECT_EQ(0u, m_tree.GetItemState(Item("A"), TVIS_EXPANDED));
        EXPECT_EQ(c.selected, Selected());
        EXPECT_EQ(c.caretAfter, Caret());
        EXPECT_NE(std::string::npos, m_trace.find("expanding:+A")) << m_trace;
        EXPECT_NE(std::string::npos, m_trace.find(c.trace)) << m_trace;
    }
}

// --- multi-selection off ------------------------------------------------------------

TEST_F(SelectionTest, SwitchingOffKeepsOnlyASelectedCaret)
{
    Arrange("A B D", "B");
    EXPECT_TRUE(m_tree.SetMultiSelect(FALSE));
    EXPECT_FALSE(m_tree.IsMultiSelect());
    EXPECT_EQ("B", Selected());
    EXPECT_EQ(std::string::npos, m_trace.find('*')) << m_trace;
    EXPECT_EQ("-A -D", m_tree.m_hookTrace);
    EXPECT_FALSE(m_tree.SetMultiSelect(TRUE));
    Arrange("A C D", "B");
    m_tree.SetMultiSelect(FALSE);
    EXPECT_EQ("", Selected());
    EXPECT_EQ("B", Caret());
}

TEST_F(SelectionTest, SingleModeBehavesAsAPlainTree)
{
    Arrange("A2a", "A2a");
    m_tree.SetMultiSelect(FALSE);
    m_trace.clear();
    m_tree.m_hookTrace.clear();
    EXPECT_TRUE(m_tree.SetItemState(Item("C"), S, S));
    EXPECT_EQ("", m_trace);
    EXPECT_EQ("+C", m_tree.m_hookTrace);
    m_tree.CTreeCtrl::SetItemState(Item("C"), 0, S);
    {
        KeyStateGuard shift({ VK_SHIFT });
        SendKey(m_tree, VK_DOWN);
    }
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("ing:-A2a+B ed:-A2a+B", m_trace);
    m_tree.CTreeCtrl::SelectItem(Item("A1"));
    Click(PointWithHit("A", TVHT_ONITEMBUTTON));
    EXPECT_EQ("A", Caret());   // the plain tree moves a hidden caret to the collapsed parent
    EXPECT_EQ("A", Selected());
}

TEST(MultiTreeClasses, RuntimeClassRecords)
{
    CRuntimeClass* pBase = RUNTIME_CLASS(KVXMultiTreeBase);
    CRuntimeClass* pTree = RUNTIME_CLASS(CMultiTree);
    EXPECT_STREQ("CMultiTree", pTree->m_lpszClassName);
    EXPECT_EQ(0xFFFFu, pBase->m_wSchema);
    EXPECT_EQ(static_cast<int>(sizeof(CMultiTree)), pTree->m_nObjectSize);
    EXPECT_TRUE(pTree->IsDerivedFrom(pBase));
    EXPECT_EQ(nullptr, pTree->m_pfnCreateObject);
    CObject* pObject = pBase->CreateObject();
    ASSERT_NE(nullptr, pObject);
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CTreeCtrl)));
    EXPECT_FALSE(pObject->IsKindOf(RUNTIME_CLASS(CMultiTree)));
    delete pObject;
    CMultiTree tree;
    EXPECT_TRUE(tree.IsMultiSelect());
    EXPECT_FALSE(tree.IsEmulatedNotify());
    EXPECT_FALSE(tree.SetBandingHit(TRUE));
    EXPECT_TRUE(tree.SetBandingHit(FALSE));
}

} // namespace
