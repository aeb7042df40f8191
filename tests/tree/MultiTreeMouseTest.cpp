// Mouse handling of the multi-selection tree. Each press runs a nested loop, so the
// messages it should see are posted before the button-down is sent; a posted probe
// records the selection between the press and the release.
// - click on an unselected item, on one item of a multiple selection, drag beyond the
//   drag distance (TVN_BEGINDRAGW, selection kept), TVS_DISABLEDRAGDROP;
// - Ctrl toggling at the release, Shift and Ctrl+Shift ranges, Shift without a caret;
// - expand button and state icon handed to the tree; the right button;
// - rubber band: plain, labels only, Ctrl toggling and restoring, Shift taking over,
//   Escape, a press on empty space, auto-scroll by move and by timer ticks.
#include "TreeHarness.h"

#include "Input.h"

using namespace tree_test;

namespace {

class MouseTest : public TreeFixture
{
protected:
    void SetUp() override
    {
        TreeFixture::SetUp();
        Build(kSmallTree);
    }

    // Press at pt with the messages queued before; the probe runs first in the loop.
    void Press(CPoint pt, UINT keys, const std::vector<CPoint>& moves, bool release = true)
    {
        PointCursorAt(pt);
        m_parent.PostProbe();
        for (const CPoint& move : moves)
            PostMove(move, keys | MK_LBUTTON);
        if (release)
            PostButtonUp(moves.empty() ? pt : moves.back(), keys);
        SendButtonDown(pt, keys | MK_LBUTTON);
        orvane_test::PumpUntilIdle(50);
    }

    std::string Probe() const
    {
        return m_parent.m_probes.empty() ? std::string("<no probe>") : m_parent.m_probes.front();
    }

    std::string LastCode() const
    {
        const std::string trace = m_parent.Trace();
        const size_t blank = trace.rfind(' ');
        return blank == std::string::npos ? trace : trace.substr(blank + 1);
    }

    CPoint EmptySpaceBelowItems() const
    {
        CRect rcLast, rcClient;
        m_tree.GetItemRect(Item("E"), &rcLast, FALSE);
        m_tree.GetClientRect(&rcClient);
        return CPoint(rcClient.CenterPoint().x, (rcLast.bottom + rcClient.bottom) / 2);
    }
};

// ---------------------------------------------------------------------------------
// Click or drag

TEST_F(MouseTest, PressOnUnselectedItemSelectsOnlyItAtOnce)
{
    Arrange({ "A", "B" }, "A");
    Press(LabelPoint("D"), 0, {});
    EXPECT_EQ("D", Probe());
    EXPECT_EQ("D", Selected());
    EXPECT_EQ("D", Caret());
    EXPECT_EQ("*click", LastCode());
    EXPECT_EQ(m_tree.m_hWnd, ::GetFocus());
}

TEST_F(MouseTest, PressInsideMultipleSelectionKeepsItUntilRelease)
{
    Arrange({ "A", "B", "D" }, "A");
    Press(LabelPoint("B"), 0, {});
    EXPECT_EQ("A B D", Probe());
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("B", Caret());
    ASSERT_EQ(1u, m_parent.m_selectionAtClick.size());
    EXPECT_EQ("B", m_parent.m_selectionAtClick[0]);
}

TEST_F(MouseTest, DragBeyondDistanceSendsBeginDragAndKeepsSelection)
{
    Arrange({ "A", "B", "D" }, "A");
    const CPoint press = LabelPoint("B");
    const int cx = ::GetSystemMetrics(SM_CXDRAG);
    Press(press, 0, { CPoint(press.x + cx, press.y), CPoint(press.x + cx + 1, press.y) });
    EXPECT_EQ("A B D", Selected());
    EXPECT_EQ("B", Caret());
    const CRecordingParent::Record* drag = m_parent.Last(TVN_BEGINDRAGW);
    ASSERT_NE(nullptr, drag) << m_parent.Trace();
    EXPECT_TRUE(drag->emulated);
    EXPECT_EQ("B", drag->newName);
    EXPECT_EQ(static_cast<LPARAM>(m_tree.GetItemData(Item("B"))), drag->newParam);
    EXPECT_EQ(press.x, drag->ptDrag.x);
    EXPECT_EQ(press.y, drag->ptDrag.y);
    EXPECT_EQ(nullptr, m_parent.Last(NM_CLICK)) << m_parent.Trace();
}

TEST_F(MouseTest, VerticalMoveBeyondDistanceIsDragToo)
{
    Arrange({}, "A");
    const CPoint press = LabelPoint("C");
    const int cy = ::GetSystemMetrics(SM_CYDRAG);
    Press(press, 0, { CPoint(press.x, press.y - cy - 1) });
    EXPECT_EQ("*drag:+C", LastCode());
    EXPECT_EQ("C", Selected());
}

TEST_F(MouseTest, MoveWithinDistanceStaysAClick)
{
    Arrange({ "A", "B", "D" }, "A");
    const CPoint press = LabelPoint("B");
    const int cx = ::GetSystemMetrics(SM_CXDRAG);
    const int cy = ::GetSystemMetrics(SM_CYDRAG);
    Press(press, 0, { CPoint(press.x + cx, press.y - cy), CPoint(press.x - cx, press.y + cy) });
    EXPECT_EQ(nullptr, m_parent.Last(TVN_BEGINDRAGW)) << m_parent.Trace();
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("*click", LastCode());
}

TEST_F(MouseTest, DisabledDragDropSendsNoBeginDrag)
{
    CreateTree(TVS_DISABLEDRAGDROP);
    Build(kSmallTree);
    Arrange({ "A", "B" }, "A");
    const CPoint press = LabelPoint("B");
    Press(press, 0, { CPoint(press.x + 20, press.y) });
    EXPECT_EQ(nullptr, m_parent.Last(TVN_BEGINDRAGW)) << m_parent.Trace();
    EXPECT_EQ(nullptr, m_parent.Last(NM_CLICK)) << m_parent.Trace();
    EXPECT_EQ("A B", Selected());
    EXPECT_EQ("B", Caret());
}

// ---------------------------------------------------------------------------------
// Modifier keys

TEST_F(MouseTest, CtrlClickTogglesAtReleaseOnly)
{
    Arrange({ "A", "B" }, "A");
    Press(LabelPoint("D"), MK_CONTROL, {});
    EXPECT_EQ("A B", Probe());
    EXPECT_EQ("A B D", Selected());
    EXPECT_EQ("D", Caret());

    m_parent.m_probes.clear();
    Press(LabelPoint("B"), MK_CONTROL, {});
    EXPECT_EQ("A B D", Probe());
    EXPECT_EQ("A D", Selected());
    EXPECT_EQ("B", Caret());
    EXPECT_EQ(static_cast<UINT>(TVIS_FOCUSED), m_tree.GetItemState(Item("B"), TVIS_FOCUSED | TVIS_SELECTED));
    EXPECT_EQ(NULL, m_tree.Anchor());
}

TEST_F(MouseTest, ShiftClickSelectsRangeFromCaretAndKeepsAnchor)
{
    Arrange({ "A1" }, "A1");
    Press(LabelPoint("C"), MK_SHIFT, {});
    EXPECT_EQ("A1 A2 A2a B C", Probe());   // the range is made at the press
    EXPECT_EQ("A1 A2 A2a B C", Selected());
    EXPECT_EQ("C", Caret());
    EXPECT_EQ(Item("A1"), m_tree.Anchor());

    Press(LabelPoint("A"), MK_SHIFT, {});
    EXPECT_EQ("A A1", Selected());
    EXPECT_EQ("A", Caret());
    EXPECT_EQ(Item("A1"), m_tree.Anchor());
}

TEST_F(MouseTest, CtrlShiftClickAddsRange)
{
    Arrange({ "E" }, "B");
    m_tree.CTreeCtrl::SetItemState(Item("B"), TVIS_SELECTED, TVIS_SELECTED);
    Press(LabelPoint("D"), MK_SHIFT | MK_CONTROL, {});
    EXPECT_EQ("B C C1 D E", Selected());
    EXPECT_EQ("D", Caret());
}

TEST_F(MouseTest, ShiftClickWithoutCaretSelectsTheItemAlone)
{
    Arrange({}, "");
    Press(LabelPoint("C"), MK_SHIFT, {});
    EXPECT_EQ("C", Selected());
    EXPECT_EQ("C", Caret());
}

TEST_F(MouseTest, PlainClickClearsAnchor)
{
    Arrange({ "B" }, "B");
    Press(LabelPoint("C"), MK_SHIFT, {});
    EXPECT_EQ(Item("B"), m_tree.Anchor());
    Press(LabelPoint("E"), 0, {});
    EXPECT_EQ(NULL, m_tree.Anchor());
    Press(LabelPoint("D"), MK_SHIFT, {});
    EXPECT_EQ("D E", Selected());
}

// ---------------------------------------------------------------------------------
// Presses the tree handles itself; the right button

TEST_F(MouseTest, ExpandButtonIsHandledByTheTree)
{
    Arrange({ "B" }, "B");
    m_tree.Expand(Item("C"), TVE_COLLAPSE);
    Click(PointWithHit("C", TVHT_ONITEMBUTTON));
    EXPECT_EQ(static_cast<UINT>(TVIS_EXPANDED), m_tree.GetItemState(Item("C"), TVIS_EXPANDED));
    EXPECT_EQ("B", Selected());
    EXPECT_EQ("B", Caret());
    EXPECT_EQ(std::string::npos, m_parent.Trace().find('*')) << m_parent.Trace();
}

TEST_F(MouseTest, StateIconTogglesCheckBoxInTree)
{
    CreateTree(TVS_CHECKBOXES);
    Build(kSmallTree);
    m_tree.UpdateWindow();   // the state images appear with the first paint
    Arrange({ "A" }, "A");
    EXPECT_FALSE(m_tree.GetCheck(Item("B")));
    Click(PointWithHit("B", TVHT_ONITEMSTATEICON));
    EXPECT_TRUE(m_tree.GetCheck(Item("B")));
    EXPECT_EQ("A", Selected());
    EXPECT_EQ(std::string::npos, m_parent.Trace().find('*')) << m_parent.Trace();
}

TEST_F(MouseTest, RightButtonSelectsWithoutTouchingAnchorAndSendsRClick)
{
    Arrange({ "A", "B" }, "A");
    m_tree.SetAnchor(Item("A"));
    const CPoint pt = LabelPoint("D");
    PostButtonUp(pt, 0, WM_RBUTTONUP);
    {
        PressWatchdog watchdog;
        m_tree.OnButtonDown(FALSE, MK_RBUTTON, pt);
    }
    EXPECT_EQ("D", Selected());
    EXPECT_EQ("D", Caret());
    EXPECT_EQ(Item("A"), m_tree.Anchor());
    EXPECT_EQ("*rclick", LastCode());

    PostButtonUp(LabelPoint("B"), 0, WM_RBUTTONUP);
    {
        PressWatchdog watchdog;
        m_tree.OnButtonDown(FALSE, MK_RBUTTON | MK_CONTROL, LabelPoint("B"));
    }
    EXPECT_EQ(Item("B"), m_tree.Anchor());
    EXPECT_EQ("D", Selected());
}

TEST_F(MouseTest, RightDragSendsBeginRDrag)
{
    Arrange({ "A", "B" }, "A");
    const CPoint pt = LabelPoint("B");
    PostMove(CPoint(pt.x, pt.y + 30), MK_RBUTTON);
    {
        PressWatchdog watchdog;
        m_tree.OnButtonDown(FALSE, MK_RBUTTON, pt);
    }
    orvane_test::PumpUntilIdle(50);
    EXPECT_EQ("*rdrag:+B", LastCode());
    EXPECT_EQ("A B", Selected());
}

TEST_F(MouseTest, CaptureLostEndsPressWithoutClick)
{
    Arrange({ "A" }, "A");
    // Another window takes the capture in the middle of the press.
    CWnd other;
    ASSERT_TRUE(other.CreateEx(0, AfxRegisterWndClass(0), _T("other"), WS_POPUP, 0, 0, 10, 10, NULL, NULL));
    PointCursorAt(LabelPoint("C"));
    m_parent.PostMessage(CRecordingParent::kCaptureMessage, reinterpret_cast<WPARAM>(other.m_hWnd));
    SendButtonDown(LabelPoint("C"));
    EXPECT_EQ(other.m_hWnd, ::GetCapture());   // the control did not release a capture it lost
    ::ReleaseCapture();
    EXPECT_EQ("C", Selected());
    EXPECT_EQ(nullptr, m_parent.Last(NM_CLICK)) << m_parent.Trace();
    EXPECT_EQ(nullptr, m_parent.Last(TVN_BEGINDRAGW)) << m_parent.Trace();

    // A band ends as after a release: NM_CLICK, and the selection stays as it was.
    Arrange({ "B", "D" }, "B");
    m_parent.PostMessage(CRecordingParent::kCaptureMessage, reinterpret_cast<WPARAM>(other.m_hWnd));
    SendButtonDown(RightOfLabel("A"), MK_LBUTTON | MK_CONTROL);
    EXPECT_EQ(other.m_hWnd, ::GetCapture());
    ::ReleaseCapture();
    EXPECT_EQ("B D", Selected());
    EXPECT_EQ("*click", LastCode());
    other.DestroyWindow();
}

TEST_F(MouseTest, QuitDuringPressIsKeptForTheApplication)
{
    Arrange({ "A" }, "A");
    PointCursorAt(LabelPoint("C"));
    ::PostQuitMessage(3);
    SendButtonDown(LabelPoint("C"));
    EXPECT_EQ(nullptr, ::GetCapture());
    EXPECT_EQ(nullptr, m_parent.Last(NM_CLICK)) << m_parent.Trace();
    MSG msg;
    ASSERT_TRUE(::PeekMessage(&msg, NULL, WM_QUIT, WM_QUIT, PM_REMOVE));
    EXPECT_EQ(3u, msg.wParam);

    // The same for a band.
    ::PostQuitMessage(4);
    SendButtonDown(RightOfLabel("B"));
    EXPECT_EQ(nullptr, ::GetCapture());
    ASSERT_TRUE(::PeekMessage(&msg, NULL, WM_QUIT, WM_QUIT, PM_REMOVE));
    EXPECT_EQ(4u, msg.wParam);
}

TEST_F(MouseTest, DeletingTheAnchorForgetsIt)
{
    Arrange({ "B" }, "B");
    Press(LabelPoint("D"), MK_SHIFT, {});
    EXPECT_EQ(Item("B"), m_tree.Anchor());
    m_tree.DeleteItem(Item("B"));
    EXPECT_EQ(NULL, m_tree.Anchor());
    Press(LabelPoint("E"), MK_SHIFT, {});
    EXPECT_EQ("D E", Selected());   // from the caret, not from a stale handle
}

// ---------------------------------------------------------------------------------
// Rubber band

TEST_F(MouseTest, PressOnEmptySpaceClearsSelectionAndSendsClick)
{
    Arrange({ "B", "D" }, "B");
    Press(EmptySpaceBelowItems(), 0, {});
    EXPECT_EQ("", Selected());
    EXPECT_EQ("*click", LastCode());
    EXPECT_EQ(m_tree.m_hWnd, ::GetFocus());

    Arrange({ "B", "D" }, "B");
    Press(EmptySpaceBelowItems(), MK_SHIFT, {});
    EXPECT_EQ("B D", Selected());
    EXPECT_EQ("*click", LastCode());
}

TEST_F(MouseTest, PlainBandSelectsTouchedRowsOnly)
{
    Arrange({ "E" }, "A");
    const CPoint start = RightOfLabel("B");
    Press(start, 0, { CPoint(start.x - 5, LabelPoint("C").y), CPoint(start.x - 5, LabelPoint("D").y) });
    EXPECT_EQ("B C C1 D", Selected());
    EXPECT_EQ("*click", LastCode());
    EXPECT_EQ("A", Caret());
}

TEST_F(MouseTest, BandWithinDragDistanceDoesNotStart)
{
    Arrange({ "E" }, "A");
    const CPoint start = RightOfLabel("B");
    Press(start, MK_CONTROL, { CPoint(start.x + 2, start.y + 2) });
    EXPECT_EQ("E", Selected());
    EXPECT_EQ("*click", LastCode());
}

TEST_F(MouseTest, BandingHitTestsLabelsInsteadOfRows)
{
    CRect rcClient;
    m_tree.GetClientRect(&rcClient);
    const CPoint start(rcClient.right - 4, LabelPoint("B").y);
    const CPoint end(rcClient.right - 12, LabelPoint("D").y);

    Arrange({}, "A");
    Press(start, 0, { end });
    EXPECT_EQ("B C C1 D", Selected());

    Arrange({}, "A");
    EXPECT_FALSE(m_tree.SetBandingHit(TRUE));
    Press(start, 0, { end });
    EXPECT_EQ("", Selected());

    Arrange({}, "A");
    Press(start, 0, { CPoint(LabelPoint("D").x, end.y) });
    EXPECT_EQ("B C C1 D", Selected());
}

TEST_F(MouseTest, CtrlBandTogglesSnapshotItems)
{
    Arrange({ "B", "C" }, "A");
    const CPoint start = RightOfLabel("A");
    Press(start, MK_CONTROL, { CPoint(start.x, LabelPoint("C").y) });
    EXPECT_EQ("A A1 A2 A2a", Selected());
}

TEST_F(MouseTest, CtrlBandRestoresSnapshotItemsWhenItLeavesThem)
{
    Arrange({ "B", "C" }, "A");
    const CPoint start = RightOfLabel("A");
    Press(start, MK_CONTROL, { CPoint(start.x, LabelPoint("C").y), CPoint(start.x, LabelPoint("A1").y) });
    EXPECT_EQ("A A1 B C", Selected());
}

TEST_F(MouseTest, ShiftBandTakesOverTouchedItems)
{
    Arrange({ "C", "E" }, "A");
    const CPoint start = RightOfLabel("A");
    Press(start, MK_SHIFT, { CPoint(start.x, LabelPoint("C").y), CPoint(start.x, LabelPoint("A1").y) });
    EXPECT_EQ("A A1 E", Selected());   // C was touched, so it left with the band
}

TEST_F(MouseTest, EscapeClearsEverythingAndEndsBand)
{
    Arrange({ "D", "E" }, "A");
    const CPoint start = RightOfLabel("A");
    PointCursorAt(start);
    PostMove(CPoint(start.x, LabelPoint("B").y));
    m_tree.PostMessage(WM_KEYDOWN, VK_ESCAPE, 0x00010001);
    PostMove(CPoint(start.x, LabelPoint("E").y));   // after the band: not a band move
    PostButtonUp(CPoint(start.x, LabelPoint("E").y));
    SendButtonDown(start, MK_LBUTTON | MK_CONTROL);
    EXPECT_EQ("", Selected());
    EXPECT_EQ("*click", LastCode());
    EXPECT_EQ(nullptr, ::GetCapture());
    orvane_test::PumpUntilIdle(50);
    EXPECT_EQ("", Selected());
}

class ScrollingBandTest : public TreeFixture
{
protected:
    void SetUp() override
    {
        TreeFixture::SetUp();
        BuildFlat(60);
        m_tree.GetClientRect(&m_rcClient);
        m_nItemHeight = m_tree.GetItemHeight();
    }

    // The item whose row holds client y after the band, from the tree's own rectangles.
    std::string ItemAtClientY(int y) const
    {
        for (HTREEITEM h = m_tree.GetRootItem(); h != NULL; h = m_tree.GetNextVisibleItem(h))
        {
            CRect rc;
            if (m_tree.GetItemRect(h, &rc, FALSE) && y >= rc.top && y < rc.bottom)
                return ItemName(m_tree, h);
        }
        return std::string();
    }

    std::string Range(int first, int last) const
    {
        std::string names;
        for (int i = first; i <= last; ++i)
            names += (names.empty() ? "I" : " I") + std::to_string(i);
        return names;
    }

    CRect m_rcClient;
    int m_nItemHeight = 0;
};

TEST_F(ScrollingBandTest, MoveAndTicksBelowClientScrollAndKeepStartInContent)
{
    Arrange({}, "I0");
    const CPoint start = RightOfLabel("I2");
    const CPoint below(start.x, m_rcClient.bottom + 5);
    // Timer messages carry the pointer's screen position: park it below the tree.
    PointCursorAt(below);
    PostMove(below);
    for (int i = 0; i < 3; ++i)
        m_tree.PostMessage(WM_TIMER, 1, 0);
    PostButtonUp(below);
    SendButtonDown(start);

    EXPECT_EQ(4, m_tree.GetScrollPos(SB_VERT));
    const std::string last = ItemAtClientY(below.y);
    ASSERT_FALSE(last.empty());
    EXPECT_EQ(Range(2, std::stoi(last.substr(1))), Selected());
    EXPECT_EQ(4 + below.y / m_nItemHeight, std::stoi(last.substr(1)));
}

TEST_F(ScrollingBandTest, TicksInsideClientDoNotScroll)
{
    Arrange({}, "I0");
    const CPoint start = RightOfLabel("I2");
    const CPoint inside(start.x, LabelPoint("I6").y);
    PointCursorAt(inside);
    PostMove(inside);
    for (int i = 0; i < 3; ++i)
        m_tree.PostMessage(WM_TIMER, 1, 0);
    PostButtonUp(inside);
    SendButtonDown(start);
    EXPECT_EQ(0, m_tree.GetScrollPos(SB_VERT));
    EXPECT_EQ(Range(2, 6), Selected());
}

TEST_F(ScrollingBandTest, TimersOfOtherWindowsDoNotScroll)
{
    Arrange({}, "I0");
    const CPoint start = RightOfLabel("I2");
    const CPoint inside(start.x, LabelPoint("I6").y);
    PointCursorAt(CPoint(start.x, m_rcClient.bottom + 5));
    PostMove(inside);
    for (int i = 0; i < 3; ++i)
        m_parent.PostMessage(WM_TIMER, 1, 0);
    m_tree.PostMessage(WM_TIMER, 7, 0);
    PostButtonUp(inside);
    SendButtonDown(start);
    EXPECT_EQ(0, m_tree.GetScrollPos(SB_VERT));
    EXPECT_EQ(Range(2, 6), Selected());
}

TEST_F(ScrollingBandTest, AboveClientScrollsBackUp)
{
    Arrange({}, "I0");
    m_tree.SendMessage(WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, 10), 0);
    m_tree.SendMessage(WM_VSCROLL, SB_ENDSCROLL, 0);
    ASSERT_EQ(10, m_tree.GetScrollPos(SB_VERT));
    const CPoint start = RightOfLabel("I14");   // fifth visible row
    const CPoint above(start.x, -5);
    PointCursorAt(above);
    PostMove(above);
    m_tree.PostMessage(WM_TIMER, 1, 0);
    PostButtonUp(above);
    SendButtonDown(start);
    EXPECT_EQ(8, m_tree.GetScrollPos(SB_VERT));
    // The band reaches from I14 up to the row at y = -5: I7.
    EXPECT_EQ(Range(7, 14), Selected());
}

HWND g_hReleaseTarget = NULL;

void CALLBACK PostRelease(HWND, UINT, UINT_PTR id, DWORD)
{
    ::KillTimer(NULL, id);
    ::PostMessage(g_hReleaseTarget, WM_LBUTTONUP, 0, 0);
}

TEST_F(ScrollingBandTest, HeldBelowClientScrollsOneLinePerTick)
{
    Arrange({}, "I0");
    // Start on the last whole row: the first band update selects two rows, each tick
    // one more, so that the ticks are not held up by repainting.
    const int lastRow = m_rcClient.bottom / m_nItemHeight - 1;
    const CPoint start = RightOfLabel("I" + std::to_string(lastRow));
    const CPoint below(start.x, m_rcClient.bottom + 5);
    PointCursorAt(below);
    // A thread timer ends the band after 400 ms: about five ticks of 75 ms.
    g_hReleaseTarget = m_tree.m_hWnd;
    const UINT_PTR timer = ::SetTimer(NULL, 0, 400, &PostRelease);
    ASSERT_NE(0u, timer);
    PostMove(below);
    const DWORD t0 = ::GetTickCount();
    SendButtonDown(start);
    const DWORD elapsed = ::GetTickCount() - t0;
    const int lines = m_tree.GetScrollPos(SB_VERT);
    EXPECT_GE(elapsed, 380u);
    EXPECT_LT(elapsed, 3000u);
    // One line for the move, then one per tick; a busy machine may lose a tick or two.
    EXPECT_GE(lines, 3) << "elapsed " << elapsed;
    EXPECT_LE(lines, 1 + static_cast<int>(elapsed / 75)) << "elapsed " << elapsed;
    const std::string last = ItemAtClientY(below.y);
    ASSERT_FALSE(last.empty());
    EXPECT_EQ(Range(lastRow, std::stoi(last.substr(1))), Selected());
}

} // namespace
