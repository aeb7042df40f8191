// Test harness of the tree family: a parent window that records the notifications it
// receives (with IsEmulatedNotify at that moment) as a compact trace, a tree that
// exposes the protected operations, and a fixture that builds named items.
//
// Trace of one notification: [*]code[:-old][+new]
//   *    sent by the control itself (IsEmulatedNotify was TRUE during the call)
//   code ing, ed (selection changing/changed), click, rclick, drag, rdrag,
//        expanding, expanded
//   -X   item X in itemOld, +Y item Y in itemNew (by item text)
#pragma once

#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "CMultiTree.h"

#include <map>
#include <string>
#include <vector>

namespace tree_test {

// The small tree most cases use: one item a line, indented by depth.
inline const char* const kSmallTree =
    "A\n"
    " A1\n"
    " A2\n"
    "  A2a\n"
    "B\n"
    "C\n"
    " C1\n"
    "D\n"
    "E\n";

class CTestTree : public CMultiTree
{
public:
    using CMultiTree::OnButtonDown;
    using CMultiTree::UpdateSelectionForRect;

    HTREEITEM Anchor() const { return m_hAnchorItem; }
    void SetAnchor(HTREEITEM hItem) { m_hAnchorItem = hItem; }

    // "+A -B": OnItemSelected calls in order.
    std::string m_hookTrace;
    void OnItemSelected(HTREEITEM hItem, bool bSelected) override;
};

class CRecordingParent : public CWnd
{
public:
    struct Record
    {
        UINT code;
        bool emulated;
        std::string oldName;
        std::string newName;
        UINT newMask;
        LPARAM newParam;
        POINT ptDrag;
    };

    BOOL CreateParent(int x, int y, int cx, int cy);

    std::string Trace() const;
    void ClearTrace() { m_records.clear(); }
    const std::vector<Record>& Records() const { return m_records; }
    const Record* Last(UINT code) const;

    CTestTree* m_pTree = nullptr;
    HTREEITEM m_hVeto = NULL;         // TVN_SELCHANGINGW naming this item is refused
    std::vector<std::string> m_selectionAtClick;   // Selected() seen at each NM_CLICK
    // A posted kProbeMessage records the selection when a press loop dispatches it:
    // the state between the press and the release.
    static constexpr UINT kProbeMessage = WM_APP + 7;
    std::vector<std::string> m_probes;
    void PostProbe() { PostMessage(kProbeMessage); }
    // A posted kCaptureMessage gives the mouse capture to the window in wParam when a
    // press loop dispatches it.
    static constexpr UINT kCaptureMessage = WM_APP + 8;

protected:
    BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult) override;
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

private:
    std::vector<Record> m_records;
};

// Bounds a press: the press loops end when the control loses the capture, so a loop
// still running after five seconds has the capture taken away, and the test fails.
class PressWatchdog
{
public:
    PressWatchdog();
    ~PressWatchdog();
    PressWatchdog(const PressWatchdog&) = delete;
    PressWatchdog& operator=(const PressWatchdog&) = delete;

private:
    UINT_PTR m_timer;
};

// Names of the selected items in visible order, separated by blanks.
std::string SelectedNames(const CMultiTree& tree);
std::string ItemName(const CTreeCtrl& tree, HTREEITEM hItem);

class TreeFixture : public testing::Test
{
protected:
    static void SetUpTestSuite();

    void SetUp() override;
    void TearDown() override;

    // Re-creates the tree with extra styles (the default is lines, buttons, lines at root).
    void CreateTree(DWORD extraStyle = 0);
    // One item per line, one leading blank per level; every parent is expanded.
    void Build(const char* spec);
    // count flat items "I0".."I<count-1>".
    void BuildFlat(int count);
    // Names of the items in a blank-separated list.
    std::vector<std::string> Names(const std::string& list) const;

    HTREEITEM Item(const std::string& name) const;
    std::string Selected() const { return SelectedNames(m_tree); }
    std::string Caret() const { return ItemName(m_tree, m_tree.GetSelectedItem()); }

    // Puts the items' state directly (no notification) to arrange a starting state:
    // the caret ("" for none) and the selected items, and no anchor.
    void Arrange(const std::vector<std::string>& selected, const std::string& caret);
    void Arrange(const char* selected, const char* caret) { Arrange(Names(selected), caret); }

    // Mouse, in client coordinates of the tree.
    CPoint LabelPoint(const std::string& name) const;
    CPoint RightOfLabel(const std::string& name) const;
    // A point where the tree's hit test reports hitFlag (TVHT_ONITEMBUTTON, ...) for the item.
    CPoint PointWithHit(const std::string& name, UINT hitFlag) const;
    void PointCursorAt(CPoint client);
    void PostMove(CPoint pt, UINT keys = MK_LBUTTON);
    void PostButtonUp(CPoint pt, UINT keys = 0, UINT message = WM_LBUTTONUP);
    void SendButtonDown(CPoint pt, UINT keys = MK_LBUTTON);
    // A click: button-up queued, then the button-down sent.
    void Click(CPoint pt, UINT keys = 0);

    CRecordingParent m_parent;
    CTestTree m_tree;
    std::map<std::string, HTREEITEM> m_items;

    static constexpr UINT kTreeId = 1234;
    static constexpr DWORD kBaseStyle = WS_CHILD | WS_VISIBLE | WS_BORDER | TVS_HASBUTTONS | TVS_HASLINES
        | TVS_LINESATROOT | TVS_SHOWSELALWAYS;
};

} // namespace tree_test
