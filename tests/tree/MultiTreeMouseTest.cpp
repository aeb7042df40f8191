// Mouse handling of the multi-selection tree. Each press runs a nested loop, so the
// messages it should see are posted before the button-down is sent; a posted probe
// records the selection between the press and the release.
// - presses as a table: click on an unselected item, on one item of a multiple selection,
//   drag beyond the drag distance (TVN_BEGINDRAGW, selection kept) or within it, Ctrl
//   toggling at the release, Shift and Ctrl+Shift ranges, rubber bands (plain, Ctrl toggling
//   and restoring, Shift taking over), a press on empty space;
// - the anchor across presses and deletion; TVS_DISABLEDRAGDROP; labels-only banding;
// - expand button and state icon handed to the tree; the right button;
// - a press ended by Escape, by a lost capture or by WM_QUIT;
// - auto-scroll by move and by timer ticks (the band's row test is BandTouches' table);
// - the highlight of every selected label, not only the caret's, follows the focus.
#include "TreeHarness.h"

using namespace tree_test;

namespace {

class MouseTest : public SmallTreeFixture
{
protected:
    // Press at pt with the messages queued before; the probe runs first in the loop. A move
    // at x = -1 stands for an Escape key press.
    void Press(CPoint pt, UINT keys, const std::vector<CPoint>& moves)
    {
        PointCursorAt(pt);
        m_parent.PostProbe();
        for (const CPoint& move : moves)
            if (move.x == -1)
                m_tree.PostMessage(WM_KEYDOWN, VK_ESCAPE, 0x00010001);
            else
                PostMove(move, keys | MK_LBUTTON);
        PostButtonUp(moves.empty() ? pt : moves.back(), keys);
        SendButtonDown(pt, keys | MK_LBUTTON);
        orvane_test::PumpUntilIdle(50);
    }
    std::string Probe() const { return m_parent.m_probes.empty() ? "<no probe>" : m_parent.m_probes.front(); }
    std::string LastCode() const { return m_trace.substr(m_trace.rfind(' ') + 1); }
    CPoint EmptySpaceBelowItems() const
    {
        CRect rcLast, rcClient;
        m_tree.GetItemRect(Item("E"), &rcLast, FALSE);
        m_tree.GetClientRect(&rcClient);
        return CPoint(rcClient.CenterPoint().x, (rcLast.bottom + rcClient.bottom) / 2);
    }
    // "B": B's label; ">B": right of B's label; "_": empty space below the items.
    CPoint At(const std::string& where) const
    {
        return where == "_" ? EmptySpaceBelowItems() : where[0] == '>' ? RightOfLabel(where.substr(1)) : LabelPoint(where);
    }
    // Item names: that item's row at the press's x; "dx,dy": offsets from the press, where
    // 'd' stands for the system's drag distance ("d+1,0" is one pixel beyond it); "esc".
    std::vector<CPoint> Moves(const std::string& path, CPoint press) const
    {
        std::vector<CPoint> moves;
        std::istringstream words(path);
        for (std::string w; words >> w;)
        {
            const size_t comma = w.find(',');
            if (comma == std::string::npos)
            {
                moves.emplace_back(w == "esc" ? -1 : press.x, w == "esc" ? 0 : LabelPoint(w).y);
                continue;
            }
            auto offset = [](std::string part, int drag) {
                const int sign = part[0] == '-' ? -1 : 1;
                if (part[0] == '-' || part[0] == '+')
                    part = part.substr(1);
                if (part[0] != 'd')
                    return sign * std::stoi(part);
                return sign * drag + (part.size() > 1 ? std::stoi(part.substr(1)) : 0);
            };
            moves.emplace_back(press.x + offset(w.substr(0, comma), ::GetSystemMetrics(SM_CXDRAG)),
                               press.y + offset(w.substr(comma + 1), ::GetSystemMetrics(SM_CYDRAG)));
        }
        return moves;
    }
};

struct PressCase
{
    const char* name;
    DWORD style;          // extra tree styles
    const char* before;   // selected items
    const char* caret;
    const char* at;
    UINT keys;
    const char* moves;
    const char* probe;    // the selection between press and release; nullptr: not checked
    const char* selected;
    const char* caretAfter;   // nullptr: not checked
    const char* last;     // the last notification ([*]click, drag:+item); "-": neither click nor drag
};

const PressCase kPressCases[] = {
    { "ClickOnAnUnselectedItemSelectsOnlyItAtOnce", 0, "A B", "A", "D", 0, "", "D", "D", "D", "*click" },
    { "ClickInsideAMultipleSelectionKeepsItUntilRelease", 0, "A B D", "A", "B", 0, "", "A B D", "B", "B", "*click" },
    { "DragBeyondTheDistanceKeepsTheSelection", 0, "A B D", "A", "B", 0, "d,0 d+1,0", nullptr, "A B D", "B", "*drag:+B" },
    { "VerticalDragBeyondTheDistance", 0, "", "A", "C", 0, "0,-d-1", nullptr, "C", "C", "*drag:+C" },
    { "MovesWithinTheDistanceStayAClick", 0, "A B D", "A", "B", 0, "d,-d -d,d", nullptr, "B", "B", "*click" },
    { "CtrlClickAddsAtTheRelease", 0, "A B", "A", "D", MK_CONTROL, "", "A B", "A B D", "D", "*click" },
    { "CtrlClickRemovesAtTheRelease", 0, "A B D", "D", "B", MK_CONTROL, "", "A B D", "A D", "B", "*click" },
    { "ShiftClickSelectsTheRangeFromTheCaretAtThePress", 0, "A1", "A1", "C", MK_SHIFT, "", "A1 A2 A2a B C",
      "A1 A2 A2a B C", "C", "*click" },
    { "CtrlShiftClickAddsTheRange", 0, "B E", "B", "D", MK_SHIFT | MK_CONTROL, "", nullptr, "B C C1 D E", "D", "*click" },
    { "ShiftClickWithoutACaretSelectsTheItemAlone", 0, "", "", "C", MK_SHIFT, "", nullptr, "C", "C", "*click" },
    { "PressOnEmptySpaceClearsTheSelection", 0, "B D", "B", "_", 0, "", nullptr, "", nullptr, "*click" },
    { "ShiftPressOnEmptySpaceKeepsIt", 0, "B D", "B", "_", MK_SHIFT, "", nullptr, "B D", nullptr, "*click" },
    { "PlainBandSelectsTheTouchedRowsOnly", 0, "E", "A", ">B", 0, "C D", nullptr, "B C C1 D", "A", "*click" },
    { "BandWithinTheDragDistanceDoesNotStart", 0, "E", "A", ">B", MK_CONTROL, "2,2", nullptr, "E", nullptr, "*click" },
    { "CtrlBandTogglesSnapshotItems", 0, "B C", "A", ">A", MK_CONTROL, "C", nullptr, "A A1 A2 A2a", nullptr, "*click" },
    { "CtrlBandRestoresSnapshotItemsWhenItLeavesThem", 0, "B C", "A", ">A", MK_CONTROL, "C A1", nullptr, "A A1 B C",
      nullptr, "*click" },
    { "ShiftBandTakesOverTheItemsItTouched", 0, "C E", "A", ">A", MK_SHIFT, "C A1", nullptr, "A A1 E", nullptr, "*click" },
    { "DisabledDragDropSendsNoBeginDrag", TVS_DISABLEDRAGDROP, "A B", "A", "B", 0, "20,0", nullptr, "A B", "B", "-" },
    { "EscapeClearsEverythingAndEndsTheBand", 0, "D E", "A", ">A", MK_CONTROL, "B esc E", nullptr, "", nullptr, "*click" },
};

TEST_F(MouseTest, Presses)
{
    for (const PressCase& c : kPressCases)
    {
        SCOPED_TRACE(c.name);
        if (c.style != 0 || (m_tree.GetStyle() & TVS_DISABLEDRAGDROP) != 0)
        {
            CreateTree(c.style);
            Build(kSmallTree);
        }
        Arrange(c.before, c.caret);
        orvane_test::NotifySpy drags(m_parent, TVN_BEGINDRAGW, sizeof(NMTREEVIEW));
        const CPoint press = At(c.at);
        Press(press, c.keys, Moves(c.moves, press));
        if (c.probe != nullptr)
            EXPECT_EQ(c.probe, Probe());
        EXPECT_EQ(c.selected, Selected());
        if (c.caretAfter != nullptr)
            EXPECT_EQ(c.caretAfter, Caret());
        if (std::string(c.last) == "-")
        {
            EXPECT_FALSE(Traced("click")) << m_trace;
            EXPECT_FALSE(Traced("drag")) << m_trace;
        }
        else
        {
            EXPECT_EQ(c.last, LastCode()) << m_trace;
            EXPECT_EQ(m_tree.m_hWnd, ::GetFocus());
        }
        EXPECT_EQ(nullptr, ::GetCapture());
        if (drags.count() > 0)
        {
            const NMTREEVIEW& drag = *reinterpret_cast<const NMTREEVIEW*>(drags.payloads().back().data());
            EXPECT_EQ(LPARAM(m_tree.GetItemData(drag.itemNew.hItem)), drag.itemNew.lParam);
            EXPECT_EQ(press.x, drag.ptDrag.x);
            EXPECT_EQ(press.y, drag.ptDrag.y);
            EXPECT_FALSE(Traced("click")) << "a drag is no click: " << m_trace;
        }
        else if (!m_selectionAtClick.empty())
            EXPECT_EQ(c.selected, m_selectionAtClick.back()) << "NM_CLICK comes after the selection";
    }
}

TEST_F(MouseTest, TheAnchorLastsAcrossShiftClicksUntilAPlainClickOrItsDeletion)
{
    Arrange("A1", "A1");
    Press(LabelPoint("C"), MK_SHIFT, {});
    EXPECT_EQ(Item("A1"), m_tree.Anchor());
    Press(LabelPoint("A"), MK_SHIFT, {});
    EXPECT_EQ("A A1", Selected());
    EXPECT_EQ(Item("A1"), m_tree.Anchor());
    Press(LabelPoint("B"), MK_CONTROL, {});
    EXPECT_EQ(NULL, m_tree.Anchor());
    Press(LabelPoint("C"), MK_SHIFT, {});
    Press(LabelPoint("E"), 0, {});
    EXPECT_EQ(NULL, m_tree.Anchor());
    Press(LabelPoint("D"), MK_SHIFT, {});
    EXPECT_EQ("D E", Selected());
    EXPECT_EQ(Item("E"), m_tree.Anchor());
    m_tree.DeleteItem(Item("E"));
    EXPECT_EQ(NULL, m_tree.Anchor());
    Press(LabelPoint("B"), MK_SHIFT, {});
    EXPECT_EQ("B C C1 D", Selected());   // from the caret, not from a stale handle
}

TEST_F(MouseTest, BandingHitTestsLabelsInsteadOfRows)
{
    CRect rcClient;
    m_tree.GetClientRect(&rcClient);
    const CPoint start(rcClient.right - 4, LabelPoint("B").y);
    const CPoint end(rcClient.right - 12, LabelPoint("D").y);
    Arrange("", "A");
    Press(start, 0, { end });
    EXPECT_EQ("B C C1 D", Selected());
    Arrange("", "A");
    EXPECT_FALSE(m_tree.SetBandingHit(TRUE));
    Press(start, 0, { end });
    EXPECT_EQ("", Selected());
    Arrange("", "A");
    Press(start, 0, { CPoint(LabelPoint("D").x, end.y) });
    EXPECT_EQ("B C C1 D", Selected());
}

TEST_F(MouseTest, ExpandButtonAndStateIconAreHandledByTheTree)
{
    Arrange("B", "B");
    m_tree.Expand(Item("C"), TVE_COLLAPSE);
    Click(PointWithHit("C", TVHT_ONITEMBUTTON));
    EXPECT_EQ(UINT(TVIS_EXPANDED), m_tree.GetItemState(Item("C"), TVIS_EXPANDED));
    EXPECT_EQ("B", Selected());
    EXPECT_EQ(std::string::npos, m_trace.find('*')) << m_trace;

    CreateTree(TVS_CHECKBOXES);
    Build(kSmallTree);
    m_tree.UpdateWindow();   // the state images appear with the first paint
    Arrange("A", "A");
    Click(PointWithHit("B", TVHT_ONITEMSTATEICON));
    EXPECT_TRUE(m_tree.GetCheck(Item("B")));
    EXPECT_EQ("A", Selected());
    EXPECT_EQ(std::string::npos, m_trace.find('*')) << m_trace;
}

TEST_F(MouseTest, RightButtonSelectsWithoutTouchingTheAnchorAndSendsRClickOrRDrag)
{
    Arrange("A B", "A");
    m_tree.SetAnchor(Item("A"));
    PostButtonUp(LabelPoint("D"), 0, WM_RBUTTONUP);
    RightPress(LabelPoint("D"));
    EXPECT_EQ("D", Selected());
    EXPECT_EQ("D", Caret());
    EXPECT_EQ(Item("A"), m_tree.Anchor());
    EXPECT_EQ("*rclick", LastCode());
    PostButtonUp(LabelPoint("B"), 0, WM_RBUTTONUP);
    RightPress(LabelPoint("B"), MK_RBUTTON | MK_CONTROL);
    EXPECT_EQ(Item("B"), m_tree.Anchor());
    EXPECT_EQ("D", Selected());

    Arrange("A B", "A");
    const CPoint pt = LabelPoint("B");
    PostMove(CPoint(pt.x, pt.y + 30), MK_RBUTTON);
    RightPress(pt);
    orvane_test::PumpUntilIdle(50);
    EXPECT_EQ("*rdrag:+B", LastCode());
    EXPECT_EQ("A B", Selected());
}

TEST_F(MouseTest, CaptureLostEndsAPressWithoutClickAndABandAsAfterARelease)
{
    CWnd other;
    ASSERT_TRUE(other.CreateEx(0, AfxRegisterWndClass(0), _T("other"), WS_POPUP, 0, 0, 10, 10, NULL, NULL));
    Arrange("A", "A");
    PointCursorAt(LabelPoint("C"));
    m_parent.PostMessage(CTestParent::kCaptureMessage, reinterpret_cast<WPARAM>(other.m_hWnd));
    SendButtonDown(LabelPoint("C"));
    EXPECT_EQ(other.m_hWnd, ::GetCapture());   // the control did not release a capture it lost
    ::ReleaseCapture();
    EXPECT_EQ("C", Selected());
    EXPECT_FALSE(Traced("click")) << m_trace;
    EXPECT_FALSE(Traced("drag")) << m_trace;

    Arrange("B D", "B");
    m_parent.PostMessage(CTestParent::kCaptureMessage, reinterpret_cast<WPARAM>(other.m_hWnd));
    SendButtonDown(RightOfLabel("A"), MK_LBUTTON | MK_CONTROL);
    EXPECT_EQ(other.m_hWnd, ::GetCapture());
    ::ReleaseCapture();
    EXPECT_EQ("B D", Selected());
    EXPECT_EQ("*click", LastCode());
    other.DestroyWindow();
}

TEST_F(MouseTest, QuitDuringAPressIsKeptForTheApplication)
{
    Arrange("A", "A");
    for (const char* at : { "C", ">B" })
    {
        SCOPED_TRACE(at);
        m_trace.clear();
        PointCursorAt(At(at));
        ::PostQuitMessage(3);
        SendButtonDown(At(at));
        EXPECT_EQ(nullptr, ::GetCapture());
        if (at[0] != '>')
            EXPECT_FALSE(Traced("click")) << m_trace;
        MSG msg;
        ASSERT_TRUE(::PeekMessage(&msg, NULL, WM_QUIT, WM_QUIT, PM_REMOVE));
        EXPECT_EQ(3u, msg.wParam);
    }
}

// --- geometry and auto-scroll --------------------------------------------------------

class ScrollingBandTest : public TreeFixture
{
protected:
    void SetUp() override
    {
        TreeFixture::SetUp();
        BuildFlat(60);
        m_tree.GetClientRect(&m_rcClient);
        m_nItemHeight = m_tree.GetItemHeight();
        Arrange("", "I0");
    }
    // The item whose row holds client y, from the tree's own rectangles.
    int RowAt(int y) const
    {
        for (HTREEITEM h = m_tree.GetRootItem(); h != NULL; h = m_tree.GetNextVisibleItem(h))
        {
            CRect rc;
            if (m_tree.GetItemRect(h, &rc, FALSE) && y >= rc.top && y < rc.bottom)
                return std::stoi(ItemName(m_tree, h).substr(1));
        }
        return -1;
    }
    std::string Range(int first, int last) const
    {
        std::string names;
        for (int i = first; i <= last; ++i)
            names += (names.empty() ? "I" : " I") + std::to_string(i);
        return names;
    }
    void ScrollTo(int row)
    {
        m_tree.SendMessage(WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, row), 0);
        m_tree.SendMessage(WM_VSCROLL, SB_ENDSCROLL, 0);
    }

    CRect m_rcClient;
    int m_nItemHeight = 0;
};

TEST_F(ScrollingBandTest, MovesAndTicksOutsideTheClientAreaScrollKeepingTheStartInContent)
{
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
    EXPECT_EQ(4 + below.y / m_nItemHeight, RowAt(below.y));
    EXPECT_EQ(Range(2, RowAt(below.y)), Selected());

    Arrange("", "I0");
    ScrollTo(10);
    const CPoint from = RightOfLabel("I14");   // fifth visible row
    const CPoint above(from.x, -5);
    PointCursorAt(above);
    PostMove(above);
    m_tree.PostMessage(WM_TIMER, 1, 0);
    PostButtonUp(above);
    SendButtonDown(from);
    EXPECT_EQ(8, m_tree.GetScrollPos(SB_VERT));
    EXPECT_EQ(Range(7, 14), Selected());   // up to the row at y = -5
}

TEST_F(ScrollingBandTest, TimersOfOtherWindowsOrIdsDoNotScroll)
{
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

HWND g_hReleaseTarget = NULL;

void CALLBACK PostRelease(HWND, UINT, UINT_PTR id, DWORD)
{
    ::KillTimer(NULL, id);
    ::PostMessage(g_hReleaseTarget, WM_LBUTTONUP, 0, 0);
}

TEST_F(ScrollingBandTest, HeldBelowTheClientAreaScrollsOneLinePerTick)
{
    // Start on the last whole row: the first band update selects two rows, each tick
    // one more, so that the ticks are not held up by repainting.
    const int lastRow = m_rcClient.bottom / m_nItemHeight - 1;
    const CPoint start = RightOfLabel("I" + std::to_string(lastRow));
    const CPoint below(start.x, m_rcClient.bottom + 5);
    PointCursorAt(below);
    // A thread timer ends the band after 400 ms: about five ticks of 75 ms.
    g_hReleaseTarget = m_tree.m_hWnd;
    ASSERT_NE(0u, ::SetTimer(NULL, 0, 400, &PostRelease));
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
    EXPECT_EQ(Range(lastRow, RowAt(below.y)), Selected());
}

TEST_F(MouseTest, SelectedLabelsFollowTheFocus)
{
    Arrange("A C", "C");
    m_tree.SetFocus();
    m_tree.RedrawWindow();
    // Pixels of the highlight colour inside an item's label, as on screen now.
    auto highlighted = [this](const char* name) {
        m_tree.UpdateWindow();
        CRect rc;
        m_tree.GetItemRect(Item(name), &rc, TRUE);
        HDC dc = ::GetDC(m_tree.m_hWnd);
        int count = 0;
        for (int y = rc.top; y < rc.bottom; ++y)
            for (int x = rc.left; x < rc.right; ++x)
                count += ::GetPixel(dc, x, y) == ::GetSysColor(COLOR_HIGHLIGHT) ? 1 : 0;
        ::ReleaseDC(m_tree.m_hWnd, dc);
        return count;
    };
    EXPECT_GT(highlighted("A"), 0);
    EXPECT_GT(highlighted("C"), 0);
    EXPECT_EQ(0, highlighted("B"));
    m_parent.SetFocus();
    orvane_test::PumpUntilIdle(50);
    EXPECT_EQ(0, highlighted("A"));
    EXPECT_EQ(0, highlighted("C"));
    m_tree.SetFocus();
    orvane_test::PumpUntilIdle(50);
    EXPECT_GT(highlighted("A"), 0);
}

} // namespace
