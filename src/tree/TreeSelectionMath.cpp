#include "TreeSelectionMath.h"

#include <algorithm>
#include <cstdlib>

namespace TreeSelectionMath {

StatePlan PlanStateRequest(const StateRequest& r)
{
    StatePlan plan;
    UINT st = r.state & ~kFocused;
    UINT mk = r.mask & ~kFocused;
    const bool maskFocus = (r.mask & kFocused) != 0;
    const bool wantFocus = (r.state & kFocused) != 0;
    const bool maskSel = (r.mask & kSelected) != 0;
    const bool wantSel = (r.state & kSelected) != 0;

    if (maskFocus && wantFocus)
    {
        // Moving the caret would take the highlight from a selected caret.
        plan.releaseSelectedCaret = !r.itemIsCaret && r.caretSelected;
        plan.makeCaret = true;
        if (maskSel && wantSel)
        {
            // The tree selects the new caret itself; only a caret that stays the caret
            // without its highlight must be selected here.
            if (!(r.itemIsCaret && !r.caretSelected))
            {
                st &= ~kSelected;
                mk &= ~kSelected;
            }
        }
        else if (!maskSel && !r.itemSelected)
        {
            // Focus only: take back the selection the tree gives the new caret.
            mk |= kSelected;
            st &= ~kSelected;
        }
    }
    else if (maskFocus && !wantFocus && r.itemIsCaret)
    {
        plan.removeCaret = true;
        if (!maskSel)
        {
            plan.restoreItemSelection = r.itemSelected;
        }
        else if (wantSel && r.itemSelected)
        {
            plan.restoreItemSelection = true;
            st &= ~kSelected;
            mk &= ~kSelected;
        }
        // Deselecting, or selecting an item that was not selected: the notified change
        // below does it (the caret removal has just cleared the bit).
    }

    plan.state = st & mk;
    plan.mask = mk;
    return plan;
}

RangeSelectionWalk::RangeSelectionWalk(bool only, bool singleItem)
    : m_bOnly(only), m_bSingleItem(singleItem)
{
}

RangeStep RangeSelectionWalk::Next(bool isEndpoint)
{
    switch (m_phase)
    {
    case Phase::Before:
        if (isEndpoint)
        {
            m_phase = m_bSingleItem ? Phase::After : Phase::Inside;
            return RangeStep::Select;
        }
        break;
    case Phase::Inside:
        if (isEndpoint)
            m_phase = Phase::After;
        return RangeStep::Select;
    case Phase::After:
        break;
    }
    return m_bOnly ? RangeStep::Deselect : RangeStep::Keep;
}

PressRoute ClassifyPress(bool hitItem, UINT hitFlags, bool left, bool checkBoxes)
{
    if (hitItem)
    {
        if (hitFlags & kHitOnItemButton)
            return PressRoute::Tree;
        if (left && checkBoxes && (hitFlags & kHitOnItemStateIcon))
            return PressRoute::Tree;
        if (!(hitFlags & kHitBesideItem))
            return PressRoute::Item;
    }
    return PressRoute::Band;
}

PreSelection ClassifyPreSelection(bool left, UINT keyFlags)
{
    const bool shift = (keyFlags & MK_SHIFT) != 0;
    const bool ctrl = (keyFlags & MK_CONTROL) != 0;
    if (left)
    {
        if (shift)
            return PreSelection::ShiftRange;
        return ctrl ? PreSelection::ClearAnchor : PreSelection::SelectItem;
    }
    if (shift)
        return PreSelection::Nothing;
    return ctrl ? PreSelection::SetAnchor : PreSelection::SelectKeepAnchor;
}

ClickSelection PlanClick(bool left, UINT keyFlags, bool itemSelected)
{
    ClickSelection click;
    if (!left || (keyFlags & MK_SHIFT))
        return click;
    click.apply = true;
    if (keyFlags & MK_CONTROL)
    {
        click.selectedBit = itemSelected ? 0 : kSelected;
    }
    else
    {
        click.deselectOthers = true;
        click.selectedBit = kSelected;
    }
    return click;
}

bool ExceedsDragDistance(POINT from, POINT to, int cxDrag, int cyDrag)
{
    return std::abs(to.x - from.x) > cxDrag || std::abs(to.y - from.y) > cyDrag;
}

POINT ClientToContent(POINT client, int hScrollPos, int vScrollPos, int itemHeight)
{
    return POINT{ client.x + hScrollPos, client.y + vScrollPos * itemHeight };
}

POINT ContentToClient(POINT content, int hScrollPos, int vScrollPos, int itemHeight)
{
    return POINT{ content.x - hScrollPos, content.y - vScrollPos * itemHeight };
}

RECT BandRect(POINT startContent, int hScrollPos, int vScrollPos, int itemHeight, POINT p)
{
    const POINT s = ContentToClient(startContent, hScrollPos, vScrollPos, itemHeight);
    return RECT{ (std::min)(s.x, p.x), (std::min)(s.y, p.y), (std::max)(s.x, p.x), (std::max)(s.y, p.y) };
}

bool BandTouches(const RECT& band, const RECT& item)
{
    if (item.left >= item.right || item.top >= item.bottom)
        return false;
    return band.left < item.right && band.right >= item.left
        && band.top < item.bottom && band.bottom >= item.top;
}

AutoScroll AutoScrollFor(POINT p, const RECT& client)
{
    AutoScroll scroll;
    if (p.y < client.top)
        scroll.vertical = -1;
    else if (p.y >= client.bottom)
        scroll.vertical = 1;
    if (p.x < client.left)
        scroll.horizontal = -1;
    else if (p.x >= client.right)
        scroll.horizontal = 1;
    return scroll;
}

BandStep DecideBandStep(bool touches, bool selected, bool inSnapshot, UINT keyFlags)
{
    if (touches)
    {
        if (!selected && !inSnapshot)
            return BandStep::Select;
        if ((keyFlags & MK_CONTROL) && inSnapshot)
            return BandStep::Deselect;
        if ((keyFlags & MK_SHIFT) && inSnapshot)
            return BandStep::ForgetSnapshot;
        return BandStep::Nothing;
    }
    if (selected && !inSnapshot)
        return BandStep::Deselect;
    if (inSnapshot)
        return BandStep::Reselect;
    return BandStep::Nothing;
}

} // namespace TreeSelectionMath
