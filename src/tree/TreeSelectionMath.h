// Decisions of the multi-selection tree that need no window: how a state request is
// split into caret moves and selection changes, which items a range or a rubber band
// selects, how a press is classified, and the band's geometry. The tree applies the
// results with its own messages.
#pragma once

#include <windows.h>

#include <unordered_set>

namespace TreeSelectionMath {

// Tree-view state bits and hit-test flags as the tree control defines them; kept here
// so that the decisions compile without the common-controls header.
constexpr UINT kFocused = 0x0001;     // TVIS_FOCUSED: never stored, it is the caret
constexpr UINT kSelected = 0x0002;    // TVIS_SELECTED
constexpr UINT kHitNowhere = 0x0001;
constexpr UINT kHitOnItemIndent = 0x0008;
constexpr UINT kHitOnItemButton = 0x0010;
constexpr UINT kHitOnItemRight = 0x0020;
constexpr UINT kHitOnItemStateIcon = 0x0040;
// Hits beside an item that start a rubber band instead of pressing the item.
constexpr UINT kHitBesideItem = kHitNowhere | kHitOnItemIndent | kHitOnItemRight;

// ---------------------------------------------------------------------------------
// SetItemState in multi-selection mode

// What the tree knows about the item and the caret before a state request.
struct StateRequest
{
    UINT state;
    UINT mask;
    bool itemIsCaret;
    bool caretSelected;   // a caret exists and carries TVIS_SELECTED
    bool itemSelected;
};

// The steps that carry out a request, in this order:
// 1. releaseSelectedCaret: remove the caret, put TVIS_SELECTED back on the old caret
//    (the tree drops the highlight of an item that loses the caret), repaint;
// 2. makeCaret: make the item the caret (a refusal ends the request with FALSE);
// 3. removeCaret: remove the caret from the item; restoreItemSelection: put
//    TVIS_SELECTED back on it;
// 4. the remaining state/mask (without TVIS_FOCUSED): a mask with TVIS_SELECTED goes
//    through the notified selection change, the rest straight to the tree.
struct StatePlan
{
    bool releaseSelectedCaret = false;
    bool makeCaret = false;
    bool removeCaret = false;
    bool restoreItemSelection = false;
    UINT state = 0;
    UINT mask = 0;
};

StatePlan PlanStateRequest(const StateRequest& request);

// ---------------------------------------------------------------------------------
// Range selection

enum class RangeStep
{
    Keep,       // leave the item as it is
    Select,     // select it if it is not yet selected
    Deselect,   // deselect it if it is selected
};

// Walks the items in visible order and tells for each what a range selection from one
// endpoint to the other does: with `only`, everything outside the range is deselected.
class RangeSelectionWalk
{
public:
    // singleItem: both endpoints are the same item.
    RangeSelectionWalk(bool only, bool singleItem);
    // isEndpoint: the item is one of the two endpoints.
    RangeStep Next(bool isEndpoint);

private:
    enum class Phase { Before, Inside, After };
    bool m_bOnly;
    bool m_bSingleItem;
    Phase m_phase = Phase::Before;
};

// ---------------------------------------------------------------------------------
// Mouse presses

enum class PressRoute
{
    Tree,   // default processing: the plain tree handles it
    Item,   // pre-selection, then the click-or-drag loop
    Band,   // rubber band
};

PressRoute ClassifyPress(bool hitItem, UINT hitFlags, bool left, bool checkBoxes);

// What a press on an item does at once (MK_SHIFT / MK_CONTROL in keyFlags).
enum class PreSelection
{
    ShiftRange,      // anchor = caret if none; range anchor..item (only when Ctrl is up); focus item
    ClearAnchor,     // Ctrl only: the toggle comes at the release
    SelectItem,      // select and focus the item (others deselected unless it was selected); anchor cleared
    SelectKeepAnchor,// as SelectItem, the anchor stays (right button)
    SetAnchor,       // right Ctrl: anchor = item
    Nothing,
};

PreSelection ClassifyPreSelection(bool left, UINT keyFlags);

// The selection change a click (press and release without a drag) makes.
struct ClickSelection
{
    bool apply = false;           // FALSE: the click changes no selection
    bool deselectOthers = false;
    UINT selectedBit = 0;         // TVIS_SELECTED or 0, applied with the focus
};

ClickSelection PlanClick(bool left, UINT keyFlags, bool itemSelected);

// |dx| > cx or |dy| > cy: the pointer left the rectangle the system allows for a click.
bool ExceedsDragDistance(POINT from, POINT to, int cxDrag, int cyDrag);

// ---------------------------------------------------------------------------------
// Rubber band

// The tree scrolls horizontally by pixels and vertically by rows of itemHeight.
POINT ClientToContent(POINT client, int hScrollPos, int vScrollPos, int itemHeight);
POINT ContentToClient(POINT content, int hScrollPos, int vScrollPos, int itemHeight);

// The band from the start point (content coordinates) to p (client), normalised.
RECT BandRect(POINT startContent, int hScrollPos, int vScrollPos, int itemHeight, POINT p);

// Whether the band touches an item rectangle. The band includes the pixels of both its
// corners (the press point and the pointer), so a band dragged straight down, zero
// pixels wide, still touches the rows it crosses; the item rectangle is half-open.
bool BandTouches(const RECT& band, const RECT& item);

// One line per axis when the pointer is outside the client area: -1 up/left, +1 down/right.
struct AutoScroll
{
    int vertical = 0;
    int horizontal = 0;
};

AutoScroll AutoScrollFor(POINT p, const RECT& client);

// What a band update does with one item.
enum class BandStep
{
    Nothing,
    Select,
    Deselect,
    ForgetSnapshot,   // Shift band: the item now counts as selected by the band
    Reselect,         // outside the band and in the snapshot: selected again
};

BandStep DecideBandStep(bool touches, bool selected, bool inSnapshot, UINT keyFlags);

// The selection held when a Shift or Ctrl band started: looked up once per item on
// every band update, so kept in a hash set.
class SelectionSnapshot
{
public:
    void Add(const void* item) { m_items.insert(item); }
    bool Contains(const void* item) const { return m_items.count(item) != 0; }
    void Remove(const void* item) { m_items.erase(item); }
    void Clear() { m_items.clear(); }
    size_t Size() const { return m_items.size(); }
    bool IsEmpty() const { return m_items.empty(); }

private:
    std::unordered_set<const void*> m_items;
};

} // namespace TreeSelectionMath
