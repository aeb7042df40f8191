// Test harness of the tree family: a parent window that vetoes and answers probes, the
// notifications it receives recorded by a MsgLog (with IsEmulatedNotify at that moment) as
// a compact trace, a tree that exposes the protected operations, and a fixture that builds
// named items and drives presses.
//
// Trace of one notification: [*]code[:-old][+new]
//   *    sent by the control itself (IsEmulatedNotify was TRUE during the call)
//   code ing, ed (selection changing/changed), click, rclick, drag, rdrag, expanding, expanded
//   -X   item X in itemOld, +Y item Y in itemNew (by item text)
#pragma once

#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "CMultiTree.h"
#include "CallLater.h"
#include "Input.h"
#include "MsgSequence.h"
#include "OrvaneLibrary.h"

#include <functional>
#include <map>
#include <sstream>
#include <string>
#include <vector>

namespace tree_test {

// The small tree most cases use: one item a line, indented by depth.
inline const char* const kSmallTree = "A\n A1\n A2\n  A2a\nB\nC\n C1\nD\nE\n";

inline std::string ItemName(const CTreeCtrl& tree, HTREEITEM hItem)
{
    const CString text = hItem != NULL ? tree.GetItemText(hItem) : CString();
    return std::string(static_cast<LPCTSTR>(text), static_cast<LPCTSTR>(text) + text.GetLength());
}

// Names of the selected items in visible order, separated by blanks.
inline std::string SelectedNames(const CMultiTree& tree)
{
    std::string names;
    for (HTREEITEM h = tree.GetRootItem(); h != NULL; h = tree.GetNextVisibleItem(h))
        if (tree.IsSelected(h))
            names += (names.empty() ? "" : " ") + ItemName(tree, h);
    return names;
}

class CTestTree : public CMultiTree
{
public:
    using CMultiTree::OnButtonDown;

    HTREEITEM Anchor() const { return m_hAnchorItem; }
    void SetAnchor(HTREEITEM hItem) { m_hAnchorItem = hItem; }

    // "+A -B": OnItemSelected calls in order.
    std::string m_hookTrace;
    void OnItemSelected(HTREEITEM hItem, bool bSelected) override
    {
        m_hookTrace += (m_hookTrace.empty() ? "" : " ") + std::string(bSelected ? "+" : "-") + ItemName(*this, hItem);
    }
};

// Refuses TVN_SELCHANGINGW naming m_hVeto. A posted kProbeMessage records the selection
// when a press loop dispatches it: the state between the press and the release. A posted
// kCaptureMessage gives the mouse capture to the window in wParam.
class CTestParent : public CWnd
{
public:
    static constexpr UINT kProbeMessage = WM_APP + 7;
    static constexpr UINT kCaptureMessage = WM_APP + 8;
    CTestTree* m_pTree = nullptr;
    HTREEITEM m_hVeto = NULL;
    std::vector<std::string> m_probes;
    void PostProbe() { PostMessage(kProbeMessage); }

protected:
    BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult) override
    {
        const NMTREEVIEW* pNM = reinterpret_cast<const NMTREEVIEW*>(lParam);
        if (pNM->hdr.code == TVN_SELCHANGINGW && m_hVeto != NULL
            && (pNM->itemNew.hItem == m_hVeto || pNM->itemOld.hItem == m_hVeto))
        {
            *pResult = TRUE;
            return TRUE;
        }
        // The framework reflects the notification to the tree first (collapse handling).
        return CWnd::OnNotify(wParam, lParam, pResult);
    }
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override
    {
        if (message == kProbeMessage)
            m_probes.push_back(m_pTree != nullptr ? SelectedNames(*m_pTree) : std::string());
        else if (message == kCaptureMessage)
            ::SetCapture(reinterpret_cast<HWND>(wParam));
        else
            return CWnd::WindowProc(message, wParam, lParam);
        return 0;
    }
};

class TreeFixture : public testing::Test
{
protected:
    static constexpr DWORD kBaseStyle = WS_CHILD | WS_VISIBLE | WS_BORDER | TVS_HASBUTTONS | TVS_HASLINES
        | TVS_LINESATROOT | TVS_SHOWSELALWAYS;

    static void SetUpTestSuite() { orvane_test::LoadLibraryOnce(); }
    void SetUp() override
    {
        m_log.onRecord = [this](int, const orvane_test::MsgEntry& e) { Record(e); };
        ASSERT_TRUE(CreateParent());
        m_parent.m_pTree = &m_tree;
        CreateTree();
    }
    // The tree's top-level parent window (again, after a test destroyed it).
    bool CreateParent()
    {
        if (!m_parent.CreateEx(0, AfxRegisterWndClass(0, ::LoadCursor(NULL, IDC_ARROW), HBRUSH(COLOR_WINDOW + 1)),
                               _T("tree test"), WS_POPUP | WS_VISIBLE | WS_CLIPCHILDREN, 60, 60, 320, 420, NULL, NULL))
            return false;
        m_log.SpyParent(m_parent, 0);
        return true;
    }
    // Appends a notification of the tree to the trace while it is being sent.
    void Record(const orvane_test::MsgEntry& e)
    {
        const NMTREEVIEW* pNM = reinterpret_cast<const NMTREEVIEW*>(e.lParam);
        const bool fromTree = e.message == WM_NOTIFY && pNM->hdr.hwndFrom == m_tree.m_hWnd;
        const char* code = fromTree ? CodeName(pNM->hdr.code) : nullptr;
        m_log.Flush();
        if (code == nullptr)
            return;
        std::string entry = (m_tree.IsEmulatedNotify() ? "*" : "") + std::string(code);
        if (pNM->hdr.code == NM_CLICK || pNM->hdr.code == NM_RCLICK)
            m_selectionAtClick.push_back(Selected());
        else
        {
            const std::string oldName = ItemName(m_tree, pNM->itemOld.hItem);
            const std::string newName = ItemName(m_tree, pNM->itemNew.hItem);
            if (!oldName.empty() || !newName.empty())
                entry += ":" + (oldName.empty() ? "" : "-" + oldName) + (newName.empty() ? "" : "+" + newName);
        }
        m_trace += (m_trace.empty() ? "" : " ") + entry;
    }
    static const char* CodeName(UINT code)
    {
        switch (code)
        {
        case TVN_SELCHANGINGW: return "ing";
        case TVN_SELCHANGEDW: return "ed";
        case NM_CLICK: return "click";
        case NM_RCLICK: return "rclick";
        case TVN_BEGINDRAGW: return "drag";
        case TVN_BEGINRDRAGW: return "rdrag";
        case TVN_ITEMEXPANDINGW: return "expanding";
        case TVN_ITEMEXPANDEDW: return "expanded";
        default: return nullptr;
        }
    }
    // Whether the trace holds a notification of this code ("click", "drag"...).
    bool Traced(const std::string& code) const
    {
        std::istringstream words(m_trace);
        for (std::string w; words >> w;)
            if (w.substr(w[0] == '*' ? 1 : 0, w.find(':') - (w[0] == '*' ? 1 : 0)) == code)
                return true;
        return false;
    }
    void TearDown() override
    {
        m_tree.DestroyWindow();
        m_parent.DestroyWindow();
        orvane_test::PumpUntilIdle(50);
    }

    // Re-creates the tree with extra styles (the default is lines, buttons, lines at root).
    void CreateTree(DWORD extraStyle = 0)
    {
        if (m_tree.m_hWnd != NULL)
            m_tree.DestroyWindow();
        m_items.clear();
        CRect rc;
        m_parent.GetClientRect(&rc);
        rc.DeflateRect(10, 10);
        ASSERT_TRUE(m_tree.Create(kBaseStyle | extraStyle, rc, &m_parent, 1234));
    }
    // One item per line, one leading blank per level, item data from 100; every parent expanded.
    void Build(const char* outline)
    {
        std::vector<HTREEITEM> parents;   // parents[level]: the last item at that level
        std::istringstream lines(outline);
        LPARAM data = 100;
        m_tree.SetRedraw(FALSE);
        for (std::string line; std::getline(lines, line);)
        {
            const size_t level = line.find_first_not_of(' ');
            const std::string name = line.substr(level);
            HTREEITEM h = m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM, CString(name.c_str()), 0, 0, 0, 0, data++,
                                            level == 0 ? TVI_ROOT : parents.at(level - 1), TVI_LAST);
            m_items[name] = h;
            parents.resize(level + 1);
            parents[level] = h;
        }
        for (auto& entry : m_items)
            if (m_tree.ItemHasChildren(entry.second))
                m_tree.Expand(entry.second, TVE_EXPAND);
        m_tree.SetRedraw(TRUE);
        m_tree.UpdateWindow();
        m_trace.clear();
    }
    // count flat items "I0".."I<count-1>".
    void BuildFlat(int count)
    {
        std::string outline;
        for (int i = 0; i < count; ++i)
            outline += "I" + std::to_string(i) + "\n";
        Build(outline.c_str());
    }

    HTREEITEM Item(const std::string& name) const
    {
        auto it = m_items.find(name);
        return it == m_items.end() ? NULL : it->second;
    }
    std::string Selected() const { return SelectedNames(m_tree); }
    std::string Caret() const { return ItemName(m_tree, m_tree.GetSelectedItem()); }

    // Puts the items' state directly (no notification) to arrange a starting state: the
    // caret ("" for none), the selected items (blank-separated), no anchor, empty traces.
    void Arrange(const std::string& selected, const std::string& caret)
    {
        m_tree.CTreeCtrl::SelectItem(Item(caret));
        for (auto& entry : m_items)
        {
            const bool want = (" " + selected + " ").find(" " + entry.first + " ") != std::string::npos;
            m_tree.CTreeCtrl::SetItemState(entry.second, want ? TVIS_SELECTED : 0, TVIS_SELECTED);
        }
        m_tree.SetAnchor(NULL);
        m_tree.UpdateWindow();
        m_trace.clear();
        m_selectionAtClick.clear();
        m_parent.m_probes.clear();
        m_tree.m_hookTrace.clear();
    }

    // Mouse, in client coordinates of the tree.
    CPoint LabelPoint(const std::string& name) const
    {
        CRect rc;
        EXPECT_TRUE(m_tree.GetItemRect(Item(name), &rc, TRUE)) << name;
        return rc.CenterPoint();
    }
    CPoint RightOfLabel(const std::string& name) const { return LabelPoint(name) + CSize(LabelWidth(name) / 2 + 20, 0); }
    int LabelWidth(const std::string& name) const
    {
        CRect rc;
        m_tree.GetItemRect(Item(name), &rc, TRUE);
        return rc.Width();
    }
    // A point where the tree's hit test reports hitFlag (TVHT_ONITEMBUTTON, ...) for the item.
    CPoint PointWithHit(const std::string& name, UINT hitFlag) const
    {
        const CPoint label = LabelPoint(name);
        for (int x = 0; x < label.x; ++x)
        {
            UINT flags = 0;
            if (m_tree.HitTest(CPoint(x, label.y), &flags) == Item(name) && (flags & hitFlag))
                return CPoint(x + 2, label.y);   // a little inside the area
        }
        ADD_FAILURE() << "no hit area " << hitFlag << " on " << name;
        return CPoint(0, label.y);
    }
    void PointCursorAt(CPoint client)
    {
        m_tree.ClientToScreen(&client);
        ::SetCursorPos(client.x, client.y);
        orvane_test::PumpUntilIdle(50);
    }
    void PostMove(CPoint pt, UINT keys = MK_LBUTTON) { m_tree.PostMessage(WM_MOUSEMOVE, keys, MAKELPARAM(pt.x, pt.y)); }
    void PostButtonUp(CPoint pt, UINT keys = 0, UINT message = WM_LBUTTONUP)
    {
        m_tree.PostMessage(message, keys, MAKELPARAM(pt.x, pt.y));
    }
    // Runs a press. The press loops end when the control loses the capture, so a loop still
    // running after five seconds has the capture taken away, and the test fails.
    void Bounded(const std::function<void()>& press)
    {
        orvane_test::CallLater watchdog(5000, [] { ::ReleaseCapture(); });
        press();
        EXPECT_FALSE(watchdog.fired()) << "a press loop did not end by itself";
    }
    void SendButtonDown(CPoint pt, UINT keys = MK_LBUTTON)
    {
        Bounded([&] { m_tree.SendMessage(WM_LBUTTONDOWN, keys, MAKELPARAM(pt.x, pt.y)); });
    }
    void RightPress(CPoint pt, UINT keys = MK_RBUTTON) { Bounded([&] { m_tree.OnButtonDown(FALSE, keys, pt); }); }
    // A click: the button-up queued, then the button-down sent.
    void Click(CPoint pt, UINT keys = 0)
    {
        PointCursorAt(pt);
        PostButtonUp(pt, keys & ~(MK_LBUTTON | MK_RBUTTON));
        SendButtonDown(pt, keys | MK_LBUTTON);
        orvane_test::PumpUntilIdle(50);
    }

    CTestParent m_parent;
    CTestTree m_tree;
    std::map<std::string, HTREEITEM> m_items;
    orvane_test::MsgLog m_log{ 1 };
    std::string m_trace;
    std::vector<std::string> m_selectionAtClick;   // the selection at each NM_CLICK
};

// The fixture with kSmallTree built.
class SmallTreeFixture : public TreeFixture
{
protected:
    void SetUp() override
    {
        TreeFixture::SetUp();
        Build(kSmallTree);
    }
};

} // namespace tree_test
