#include "CMultiTree.h"
#include "TreeSelectionMath.h"

#include <windowsx.h>

using namespace TreeSelectionMath;

namespace {

// The rubber band's auto-scroll timer.
constexpr UINT_PTR kBandTimer = 1;
constexpr UINT kBandTimerMs = 75;

// State and row height factor of an item in one message: a band update reads both for
// every visible item, and each tree-view message costs a search for the item handle.
bool ReadSelectionAndIntegral(HWND hwnd, HTREEITEM hItem, bool& bSelected, int& nIntegral)
{
    TVITEMEXW item = {};
    item.mask = TVIF_HANDLE | TVIF_STATE | TVIF_INTEGRAL;
    item.hItem = hItem;
    item.stateMask = TVIS_SELECTED;
    if (!::SendMessageW(hwnd, TVM_GETITEMW, 0, (LPARAM)&item))
        return false;
    bSelected = (item.state & TVIS_SELECTED) != 0;
    nIntegral = item.iIntegral > 0 ? item.iIntegral : 1;
    return true;
}

// The band's frame: one pixel wide, XOR-drawn with the halftone pattern, so that
// drawing the same rectangle again erases it.
void ToggleBandFrame(CDC& dc, const CRect& rc)
{
    CBrush* pBrush = CDC::GetHalftoneBrush();
    if (pBrush == NULL || rc.IsRectEmpty())
        return;
    CBrush* pOld = dc.SelectObject(pBrush);
    const int w = rc.Width();
    const int h = rc.Height();
    // Each pixel of the frame exactly once: top and bottom rows, then the sides between.
    dc.PatBlt(rc.left, rc.top, w, 1, PATINVERT);
    if (h > 1)
        dc.PatBlt(rc.left, rc.bottom - 1, w, 1, PATINVERT);
    if (h > 2)
    {
        dc.PatBlt(rc.left, rc.top + 1, 1, h - 2, PATINVERT);
        if (w > 1)
            dc.PatBlt(rc.right - 1, rc.top + 1, 1, h - 2, PATINVERT);
    }
    dc.SelectObject(pOld);
}

} // namespace

IMPLEMENT_DYNAMIC(CMultiTree, KVXMultiTreeBase)

BEGIN_MESSAGE_MAP(CMultiTree, KVXMultiTreeBase)
    ON_WM_LBUTTONDOWN()
    ON_WM_SETFOCUS()
    ON_WM_KILLFOCUS()
    ON_NOTIFY_REFLECT_EX(TVN_ITEMEXPANDINGW, &CMultiTree::OnItemExpanding)
    ON_NOTIFY_REFLECT_EX(TVN_DELETEITEMW, &CMultiTree::OnDeleteItem)
    ON_WM_KEYDOWN()
END_MESSAGE_MAP()

/////////////////////////////////////////////////////////////////////////////
// Construction

CMultiTree::CMultiTree()
    : m_bMultiSelect(TRUE)
    , m_hAnchorItem(NULL)
    , m_bEmulatedNotify(FALSE)
    , m_bBandingHit(FALSE)
{
}

CMultiTree::~CMultiTree()
{
}

/////////////////////////////////////////////////////////////////////////////
// Attributes

BOOL CMultiTree::SetMultiSelect(BOOL bMultiSelect)
{
    const BOOL bOld = m_bMultiSelect;
    m_bMultiSelect = bMultiSelect;
    if (bOld && !bMultiSelect && m_hWnd != NULL)
    {
        // Back to the plain tree's single selection: only a selected caret keeps it.
        HTREEITEM hCaret = GetSelectedItem();
        HTREEITEM hKeep = (hCaret != NULL && IsSelected(hCaret)) ? hCaret : NULL;
        for (HTREEITEM h = GetRootItem(); h != NULL; h = GetNextVisibleItem(h))
        {
            if (h != hKeep && IsSelected(h))
                SetItemState(h, 0, TVIS_SELECTED);
        }
        if (hCaret != NULL)
            CTreeCtrl::SelectItem(hCaret);
    }
    return bOld;
}

BOOL CMultiTree::IsMultiSelect() const
{
    return m_bMultiSelect;
}

BOOL CMultiTree::IsEmulatedNotify() const
{
    return m_bEmulatedNotify;
}

BOOL CMultiTree::SetBandingHit(BOOL bLabel)
{
    const BOOL bOld = m_bBandingHit;
    m_bBandingHit = bLabel;
    return bOld;
}

UINT CMultiTree::GetItemState(HTREEITEM hItem, UINT nStateMask) const
{
    UINT nState = CTreeCtrl::GetItemState(hItem, nStateMask) & ~TVIS_FOCUSED;
    if ((nStateMask & TVIS_FOCUSED) && hItem != NULL && hItem == GetSelectedItem())
        nState |= TVIS_FOCUSED;
    return nState;
}

BOOL CMultiTree::IsSelected(HTREEITEM hItem) const
{
    return (CTreeCtrl::GetItemState(hItem, TVIS_SELECTED) & TVIS_SELECTED) ? 1 : 0;
}

HTREEITEM CMultiTree::GetFocusedItem() const
{
    return GetSelectedItem();
}

HTREEITEM CMultiTree::GetFirstSelectedItem() const
{
    for (HTREEITEM h = GetRootItem(); h != NULL; h = GetNextVisibleItem(h))
    {
        if (IsSelected(h))
            return h;
    }
    return NULL;
}

HTREEITEM CMultiTree::GetNextSelectedItem(HTREEITEM hItem) const
{
    if (hItem == NULL)
        return NULL;
    for (HTREEITEM h = GetNextVisibleItem(hItem); h != NULL; h = GetNextVisibleItem(h))
    {
        if (IsSelected(h))
            return h;
    }
    return NULL;
}

UINT CMultiTree::GetSelectedCount() const
{
    UINT nCount = 0;
    for (HTREEITEM h = GetRootItem(); h != NULL; h = GetNextVisibleItem(h))
    {
        if (IsSelected(h))
            ++nCount;
    }
    return nCount;
}

void CMultiTree::GetSelectedList(CTypedPtrList<CPtrList, HTREEITEM>& list) const
{
    list.RemoveAll();
    for (HTREEITEM h = GetRootItem(); h != NULL; h = GetNextVisibleItem(h))
    {
        if (IsSelected(h))
            list.AddTail(h);
    }
}

/////////////////////////////////////////////////////////////////////////////
// Selection model

BOOL CMultiTree::SetItemState(HTREEITEM hItem, UINT nState, UINT nStateMask)
{
    if (!m_bMultiSelect)
        return KVXMultiTreeBase::SetItemState(hItem, nState, nStateMask);
    if (hItem == NULL)
        return FALSE;

    HTREEITEM hCaret = GetSelectedItem();
    StateRequest request;
    request.state = nState;
    request.mask = nStateMask;
    request.itemIsCaret = (hCaret == hItem);
    request.caretSelected = hCaret != NULL && IsSelected(hCaret);
    request.itemSelected = IsSelected(hItem) != 0;
    const StatePlan plan = PlanStateRequest(request);

    if (plan.releaseSelectedCaret)
    {
        CTreeCtrl::SelectItem(NULL);
        KVXMultiTreeBase::SetItemState(hCaret, TVIS_SELECTED, TVIS_SELECTED);
        UpdateWindow();
    }
    if (plan.makeCaret && !CTreeCtrl::SelectItem(hItem))
        return FALSE;
    if (plan.removeCaret)
    {
        CTreeCtrl::SelectItem(NULL);
        if (plan.restoreItemSelection)
            KVXMultiTreeBase::SetItemState(hItem, TVIS_SELECTED, TVIS_SELECTED);
    }

    UINT nSt = plan.state;
    UINT nMk = plan.mask;
    if (nMk == 0)
        return TRUE;
    if (nMk & TVIS_SELECTED)
    {
        const bool bSelecting = (nSt & TVIS_SELECTED) != 0;
        if (SendSelectionNotify(TVN_SELCHANGINGW, hItem, bSelecting))
            return FALSE;
        KVXMultiTreeBase::SetItemState(hItem, nSt, nMk);
        SendSelectionNotify(TVN_SELCHANGEDW, hItem, bSelecting);
        nSt &= ~TVIS_SELECTED;
        nMk &= ~TVIS_SELECTED;
    }
    if (nMk == 0)
        return TRUE;
    return KVXMultiTreeBase::SetItemState(hItem, nSt, nMk);
}

BOOL CMultiTree::SelectItem(HTREEITEM hItem)
{
    return CTreeCtrl::SelectItem(hItem);
}

BOOL CMultiTree::FocusItem(HTREEITEM hItem)
{
    if (hItem != NULL)
        return SetItemState(hItem, TVIS_FOCUSED, TVIS_FOCUSED);
    HTREEITEM hCaret = GetSelectedItem();
    if (hCaret == NULL)
        return FALSE;
    return SetItemState(hCaret, 0, TVIS_FOCUSED);
}

void CMultiTree::SelectAll(BOOL bSelect)
{
    SelectAllIgnore(bSelect, NULL);
}

void CMultiTree::SelectAllIgnore(BOOL bSelect, HTREEITEM hIgnore)
{
    const UINT nWanted = bSelect ? TVIS_SELECTED : 0;
    for (HTREEITEM h = GetRootItem(); h != NULL; h = GetNextVisibleItem(h))
    {
        if (h != hIgnore && (IsSelected(h) ? TVIS_SELECTED : 0u) != nWanted)
            SetItemState(h, nWanted, TVIS_SELECTED);
    }
}

HTREEITEM CMultiTree::VisibleEndpoint(HTREEITEM hItem) const
{
    // An item inside a collapsed branch is shown by the outermost collapsed ancestor.
    HTREEITEM hVisible = hItem;
    for (HTREEITEM hParent = GetParentItem(hItem); hParent != NULL; hParent = GetParentItem(hParent))
    {
        if (!(CTreeCtrl::GetItemState(hParent, TVIS_EXPANDED) & TVIS_EXPANDED))
            hVisible = hParent;
    }
    return hVisible;
}

void CMultiTree::SelectRange(HTREEITEM hFirst, HTREEITEM hLast, BOOL bOnly)
{
    // A missing endpoint makes a range of the other one alone, and a hidden endpoint is
    // replaced by the item that shows it: a range never runs on to the end of the tree
    // for want of an endpoint in the walk.
    if (hFirst == NULL)
        hFirst = hLast;
    if (hLast == NULL)
        hLast = hFirst;
    if (hFirst != NULL)
    {
        hFirst = VisibleEndpoint(hFirst);
        hLast = VisibleEndpoint(hLast);
    }

    RangeSelectionWalk walk(bOnly != FALSE, hFirst == hLast);
    for (HTREEITEM h = GetRootItem(); h != NULL; h = GetNextVisibleItem(h))
    {
        const bool bEndpoint = h == hFirst || h == hLast;
        switch (walk.Next(bEndpoint))
        {
        case RangeStep::Select:
            if (!IsSelected(h))
                SetItemState(h, TVIS_SELECTED, TVIS_SELECTED);
            break;
        case RangeStep::Deselect:
            if (IsSelected(h))
                SetItemState(h, 0, TVIS_SELECTED);
            break;
        case RangeStep::Keep:
            break;
        }
    }
}

BOOL CMultiTree::SelectChildren(HTREEITEM hParent, BOOL bSelect, BOOL bRecurse)
{
    // Depth first in the order of the items, with a stack of its own: a deep tree must
    // not exhaust the thread's stack.
    BOOL bCaretSeen = FALSE;
    const UINT nWanted = bSelect ? TVIS_SELECTED : 0;
    CTypedPtrList<CPtrList, HTREEITEM> pending;   // next siblings still to visit
    HTREEITEM hChild = GetChildItem(hParent);
    for (;;)
    {
        if (hChild == NULL)
        {
            if (pending.IsEmpty())
                break;
            hChild = pending.RemoveTail();
            continue;
        }
        const UINT nState = GetItemState(hChild, TVIS_SELECTED | TVIS_FOCUSED | TVIS_EXPANDED);
        if ((nState & TVIS_SELECTED) != nWanted)
            SetItemState(hChild, nWanted, TVIS_SELECTED);
        if (nState & TVIS_FOCUSED)
            bCaretSeen = TRUE;
        HTREEITEM hNext = GetNextSiblingItem(hChild);
        if (bRecurse && (nState & TVIS_EXPANDED))
        {
            pending.AddTail(hNext);
            hChild = GetChildItem(hChild);
        }
        else
        {
            hChild = hNext;
        }
    }
    return bCaretSeen;
}

BOOL CMultiTree::_SendNotify(LPNMHDR pNMHDR)
{
    pNMHDR->hwndFrom = m_hWnd;
    pNMHDR->idFrom = GetDlgCtrlID();
    HWND hParent = ::GetParent(m_hWnd);
    if (hParent == NULL)
        return FALSE;
    const BOOL bOld = m_bEmulatedNotify;
    m_bEmulatedNotify = TRUE;
    const LRESULT lResult = ::SendMessage(hParent, WM_NOTIFY, (WPARAM)pNMHDR->idFrom, (LPARAM)pNMHDR);
    m_bEmulatedNotify = bOld;
    return (BOOL)lResult;
}

BOOL CMultiTree::SendSelectionNotify(UINT nCode, HTREEITEM hItem, bool bSelecting)
{
    NMTREEVIEW nm = {};
    nm.hdr.code = nCode;
    TVITEM& item = bSelecting ? nm.itemNew : nm.itemOld;
    item.mask = TVIF_HANDLE | TVIF_PARAM;
    item.hItem = hItem;
    item.lParam = (LPARAM)GetItemData(hItem);
    return _SendNotify(&nm.hdr);
}

BOOL CMultiTree::SendItemNotify(UINT nCode, HTREEITEM hItem, CPoint point)
{
    NMTREEVIEW nm = {};
    nm.hdr.code = nCode;
    nm.itemNew.mask = TVIF_HANDLE | TVIF_PARAM;
    nm.itemNew.hItem = hItem;
    nm.itemNew.lParam = (LPARAM)GetItemData(hItem);
    nm.ptDrag = point;
    return _SendNotify(&nm.hdr);
}

/////////////////////////////////////////////////////////////////////////////
// Mouse: press, click or drag

void CMultiTree::OnLButtonDown(UINT nFlags, CPoint point)
{
    OnButtonDown(TRUE, nFlags, point);
}

void CMultiTree::OnButtonDown(BOOL bLeft, UINT nFlags, CPoint point)
{
    if (!m_bMultiSelect)
    {
        Default();
        return;
    }
    UINT nHitFlags = 0;
    HTREEITEM hItem = HitTest(point, &nHitFlags);
    const bool bCheckBoxes = (GetStyle() & TVS_CHECKBOXES) != 0;
    switch (ClassifyPress(hItem != NULL, nHitFlags, bLeft != FALSE, bCheckBoxes))
    {
    case PressRoute::Tree:
        Default();
        break;
    case PressRoute::Item:
        DoPreSelection(hItem, bLeft, nFlags);
        DoAction(hItem, bLeft, nFlags, point);
        break;
    case PressRoute::Band:
        DoBanding(bLeft, nFlags, point);
        break;
    }
}

void CMultiTree::DoPreSelection(HTREEITEM hItem, BOOL bLeft, UINT nFlags)
{
    switch (ClassifyPreSelection(bLeft != FALSE, nFlags))
    {
    case PreSelection::ShiftRange:
        if (m_hAnchorItem == NULL)
            m_hAnchorItem = GetSelectedItem();
        SelectRange(m_hAnchorItem, hItem, !(nFlags & MK_CONTROL));
        SetItemState(hItem, TVIS_FOCUSED, TVIS_FOCUSED);
        break;
    case PreSelection::ClearAnchor:
        m_hAnchorItem = NULL;
        break;
    case PreSelection::SelectItem:
    case PreSelection::SelectKeepAnchor:
        // A press inside a multiple selection keeps it until the release, so that a
        // drag carries all of it.
        if (!IsSelected(hItem))
            SelectAllIgnore(FALSE, hItem);
        SetItemState(hItem, TVIS_FOCUSED | TVIS_SELECTED, TVIS_FOCUSED | TVIS_SELECTED);
        if (bLeft)
            m_hAnchorItem = NULL;
        break;
    case PreSelection::SetAnchor:
        m_hAnchorItem = hItem;
        break;
    case PreSelection::Nothing:
        break;
    }
}

void CMultiTree::DoAction(HTREEITEM hItem, BOOL bLeft, UINT nFlags, CPoint point)
{
    enum class Outcome { None, Click, Drag };
    Outcome outcome = Outcome::None;

    // The loop holds the handle, not the object: a window destroyed by a dispatched
    // message loses the capture, which ends the loop before anything touches this.
    const HWND hWnd = m_hWnd;
    SetCapture();
    const int cxDrag = ::GetSystemMetrics(SM_CXDRAG);
    const int cyDrag = ::GetSystemMetrics(SM_CYDRAG);
    MSG msg;
    while (outcome == Outcome::None && ::GetCapture() == hWnd)
    {
        const BOOL bGot = ::GetMessage(&msg, NULL, 0, 0);
        if (bGot == 0)
        {
            // The application's own loop must still see the request to quit.
            ::PostQuitMessage((int)msg.wParam);
            break;
        }
        if (bGot == -1)
            break;
        if (::GetCapture() != hWnd)
        {
            ::DispatchMessage(&msg);
            break;
        }
        switch (msg.message)
        {
        case WM_MOUSEMOVE:
        {
            const POINT pt = { GET_X_LPARAM(msg.lParam), GET_Y_LPARAM(msg.lParam) };
            if (ExceedsDragDistance(point, pt, cxDrag, cyDrag))
                outcome = Outcome::Drag;
            break;
        }
        case WM_LBUTTONUP:
        case WM_RBUTTONUP:
            outcome = Outcome::Click;
            break;
        default:
            ::DispatchMessage(&msg);
            break;
        }
    }
    if (!::IsWindow(hWnd))
        return;     // the object may have gone with its window
    // Release only our own capture: another window may have taken it.
    if (::GetCapture() == hWnd)
        ::ReleaseCapture();

    if (outcome == Outcome::Click)
    {
        const ClickSelection click = PlanClick(bLeft != FALSE, nFlags, IsSelected(hItem) != 0);
        if (click.apply)
        {
            if (click.deselectOthers)
                SelectAllIgnore(FALSE, hItem);
            SetItemState(hItem, click.selectedBit | TVIS_FOCUSED, TVIS_FOCUSED | TVIS_SELECTED);
        }
        if (::GetFocus() != m_hWnd)
            SetFocus();
        SendItemNotify(bLeft ? NM_CLICK : NM_RCLICK, hItem, point);
    }
    else if (outcome == Outcome::Drag)
    {
        SetItemState(hItem, TVIS_FOCUSED | TVIS_SELECTED, TVIS_FOCUSED | TVIS_SELECTED);
        if (!(GetStyle() & TVS_DISABLEDRAGDROP))
            SendItemNotify(bLeft ? TVN_BEGINDRAGW : TVN_BEGINRDRAGW, hItem, point);
    }
}

/////////////////////////////////////////////////////////////////////////////
// Mouse: rubber band

// One rubber-band press: where it started and what is on screen.
struct CMultiTree::BandLoop
{
    POINT ptStart;          // the press point in content coordinates
    CRect rcClient;
    int cxDrag;
    int cyDrag;
    int nItemHeight;        // the tree scrolls vertically by rows of this height
    bool bKeep;             // Shift or Ctrl: the selection before the press stays
    bool bStarted;          // the pointer has left the drag distance
    bool bDrawn;            // a frame is on screen at rcDrawn
    CRect rcDrawn;
};

void CMultiTree::DoBanding(BOOL bLeft, UINT nFlags, CPoint point)
{
    // As in DoAction, the loop ends with the window's capture and then leaves this alone.
    const HWND hWnd = m_hWnd;
    if (::GetFocus() != hWnd)
        SetFocus();
    SetCapture();

    BandLoop band = StartBand(point, nFlags);
    SelectionSnapshot snapshot;
    if (band.bKeep)
    {
        CTypedPtrList<CPtrList, HTREEITEM> listSelected(10);
        GetSelectedList(listSelected);
        for (POSITION pos = listSelected.GetHeadPosition(); pos != NULL;)
            snapshot.Add(listSelected.GetNext(pos));
    }
    CClientDC dc(this);
    SetTimer(kBandTimer, kBandTimerMs, NULL);

    bool bEndMessage = false;   // msg ended the loop and is dispatched afterwards
    bool bQuit = false;
    MSG msg;
    while (::GetCapture() == hWnd)
    {
        const BOOL bGot = ::GetMessage(&msg, NULL, 0, 0);
        if (bGot == 0)
        {
            bQuit = true;
            break;
        }
        if (bGot == -1)
            break;
        if (::GetCapture() != hWnd || msg.message == WM_LBUTTONUP || msg.message == WM_RBUTTONUP)
        {
            bEndMessage = true;
            break;
        }
        if (msg.message == WM_KEYDOWN && msg.wParam == VK_ESCAPE)
        {
            SelectAll(FALSE);
            bEndMessage = true;
            break;
        }
        CPoint pt;
        if (BandPointFromMessage(msg, band, pt))
            MoveBand(dc, band, pt, nFlags, snapshot);
        else
            ::DispatchMessage(&msg);
    }

    // Destroyed inside the loop: timer, capture and the window's DC went with it.
    if (::IsWindow(hWnd))
        EndBand(dc, band, bLeft);
    if (bQuit)
        ::PostQuitMessage((int)msg.wParam);
    else if (bEndMessage)
        ::DispatchMessage(&msg);
}

CMultiTree::BandLoop CMultiTree::StartBand(CPoint point, UINT nFlags)
{
    BandLoop band = {};
    GetClientRect(&band.rcClient);
    band.cxDrag = ::GetSystemMetrics(SM_CXDRAG);
    band.cyDrag = ::GetSystemMetrics(SM_CYDRAG);
    band.nItemHeight = GetRootItem() != NULL ? GetItemHeight() : 0;
    band.ptStart = ClientToContent(point, GetScrollPos(SB_HORZ), GetScrollPos(SB_VERT), band.nItemHeight);
    band.bKeep = (nFlags & (MK_SHIFT | MK_CONTROL)) != 0;
    return band;
}

BOOL CMultiTree::BandPointFromMessage(const MSG& msg, const BandLoop& band, CPoint& pt)
{
    if (msg.message == WM_MOUSEMOVE)
    {
        pt = CPoint(GET_X_LPARAM(msg.lParam), GET_Y_LPARAM(msg.lParam));
        return TRUE;
    }
    if (msg.message == WM_TIMER && msg.hwnd == m_hWnd && msg.wParam == kBandTimer)
    {
        // Holding the pointer outside keeps scrolling, one line per tick.
        pt = msg.pt;
        ScreenToClient(&pt);
        return !band.rcClient.PtInRect(pt);
    }
    return FALSE;
}

void CMultiTree::MoveBand(CDC& dc, BandLoop& band, CPoint pt, UINT nFlags, SelectionSnapshot& snapshot)
{
    if (!band.bStarted)
    {
        const POINT ptPress = ContentToClient(band.ptStart, GetScrollPos(SB_HORZ), GetScrollPos(SB_VERT),
                                              band.nItemHeight);
        if (!ExceedsDragDistance(ptPress, pt, band.cxDrag, band.cyDrag))
            return;
        band.bStarted = true;
        if (!band.bKeep)
            SelectAll(FALSE);
        UpdateWindow();
    }
    if (band.bDrawn)
    {
        ToggleBandFrame(dc, band.rcDrawn);
        band.bDrawn = false;
    }
    const AutoScroll scroll = AutoScrollFor(pt, band.rcClient);
    if (scroll.vertical != 0)
        SendMessage(WM_VSCROLL, MAKEWPARAM(scroll.vertical < 0 ? SB_LINEUP : SB_LINEDOWN, 0), 0);
    if (scroll.horizontal != 0)
        SendMessage(WM_HSCROLL, MAKEWPARAM(scroll.horizontal < 0 ? SB_LINELEFT : SB_LINERIGHT, 0), 0);

    const CRect rcBand = BandRect(band.ptStart, GetScrollPos(SB_HORZ), GetScrollPos(SB_VERT), band.nItemHeight, pt);
    UpdateSelectionForRect(&rcBand, nFlags, snapshot);
    ToggleBandFrame(dc, rcBand);
    band.rcDrawn = rcBand;
    band.bDrawn = true;
}

void CMultiTree::EndBand(CDC& dc, const BandLoop& band, BOOL bLeft)
{
    KillTimer(kBandTimer);
    if (::GetCapture() == m_hWnd)
        ::ReleaseCapture();
    if (band.bDrawn)
        ToggleBandFrame(dc, band.rcDrawn);
    else if (!band.bKeep)
        SelectAll(FALSE);   // a plain click on empty space clears the selection

    NMHDR hdr = {};
    hdr.code = bLeft ? NM_CLICK : NM_RCLICK;
    _SendNotify(&hdr);
}

void CMultiTree::UpdateSelectionForRect(LPCRECT pRect, UINT nFlags, SelectionSnapshot& snapshot)
{
    // Rows follow each other from the root's row down, each the base item height times
    // its integral apart: the row rectangles come from that sum, and one message per
    // item reads both the state and the integral. The root's rectangle gives the start
    // and how much shorter than its pitch the tree reports a row (Wine leaves out the
    // last pixel line). Labels are asked for only where the row meets the band.
    CRect rcClient;
    GetClientRect(&rcClient);
    const int nItemHeight = GetItemHeight();
    HTREEITEM h = GetRootItem();
    int nTop = 0;
    int nShortfall = 0;
    if (h != NULL)
    {
        CRect rcRoot;
        bool bRootSelected = false;
        int nRootIntegral = 1;
        if (GetItemRect(h, &rcRoot, FALSE) && ReadSelectionAndIntegral(m_hWnd, h, bRootSelected, nRootIntegral))
        {
            nTop = rcRoot.top;
            nShortfall = nItemHeight * nRootIntegral - rcRoot.Height();
        }
    }
    while (h != NULL)
    {
        bool bSelected = false;
        int nIntegral = 1;
        ReadSelectionAndIntegral(m_hWnd, h, bSelected, nIntegral);
        const int nPitch = nItemHeight * nIntegral;
        const RECT rcRow = { 0, nTop, rcClient.right, nTop + nPitch - nShortfall };
        nTop += nPitch;

        bool bTouches = BandTouches(*pRect, rcRow);
        if (bTouches && m_bBandingHit)
        {
            CRect rcLabel;
            bTouches = GetItemRect(h, &rcLabel, TRUE) && BandTouches(*pRect, rcLabel);
        }
        const bool bInSnapshot = !snapshot.IsEmpty() && snapshot.Contains(h);
        switch (DecideBandStep(bTouches, bSelected, bInSnapshot, nFlags))
        {
        case BandStep::Select:
        case BandStep::Reselect:
            SetItemState(h, TVIS_SELECTED, TVIS_SELECTED);
            break;
        case BandStep::Deselect:
            SetItemState(h, 0, TVIS_SELECTED);
            break;
        case BandStep::ForgetSnapshot:
            snapshot.Remove(h);
            break;
        case BandStep::Nothing:
            break;
        }
        h = GetNextVisibleItem(h);
    }
    UpdateWindow();
}

/////////////////////////////////////////////////////////////////////////////
// Focus, keyboard, expansion

void CMultiTree::InvalidateSelectedLabels()
{
    // The highlight colour of selected items follows the focus.
    for (HTREEITEM h = GetRootItem(); h != NULL; h = GetNextVisibleItem(h))
    {
        CRect rcLabel;
        if (IsSelected(h) && GetItemRect(h, &rcLabel, TRUE))
            InvalidateRect(&rcLabel, TRUE);
    }
}

void CMultiTree::OnSetFocus(CWnd* /*pOldWnd*/)
{
    Default();
    if (m_bMultiSelect)
        InvalidateSelectedLabels();
}

void CMultiTree::OnKillFocus(CWnd* /*pNewWnd*/)
{
    Default();
    if (m_bMultiSelect)
        InvalidateSelectedLabels();
}

void CMultiTree::OnKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags)
{
    // The tree's own key handling is called through DefWindowProc with the message
    // rebuilt: notifications sent before it must not change what it gets.
    const LPARAM lKeyData = MAKELPARAM(nRepCnt, nFlags);
    if (!m_bMultiSelect)
    {
        DefWindowProc(WM_KEYDOWN, nChar, lKeyData);
        return;
    }
    const bool bCtrl = ::GetKeyState(VK_CONTROL) < 0;
    const bool bShift = ::GetKeyState(VK_SHIFT) < 0;
    const bool bVertical = nChar == VK_UP || nChar == VK_DOWN;

    HTREEITEM hCaret = NULL;
    if (bVertical)
    {
        hCaret = GetSelectedItem();
        if (m_hAnchorItem == NULL)
            m_hAnchorItem = hCaret;
        if (!bCtrl && !bShift)
        {
            m_hAnchorItem = NULL;
            SelectAll(FALSE);
        }
    }

    // Ctrl alone moves only the focus (below). The tree of this platform would move its
    // caret and the selection with it, so it does not see these keys.
    if (!(bVertical && bCtrl && !bShift))
        DefWindowProc(WM_KEYDOWN, nChar, lKeyData);

    if (bVertical && hCaret != NULL && (bCtrl || bShift))
    {
        HTREEITEM hTarget = nChar == VK_UP ? GetPrevVisibleItem(hCaret) : GetNextVisibleItem(hCaret);
        if (hTarget == NULL)
            hTarget = hCaret;
        if (bShift)
            SelectRange(m_hAnchorItem, hTarget, TRUE);
        else
            SetItemState(hTarget, TVIS_FOCUSED, TVIS_FOCUSED);
    }
}

BOOL CMultiTree::OnItemExpanding(NMHDR* pNMHDR, LRESULT* pResult)
{
    if (!m_bMultiSelect)
        return FALSE;
    *pResult = 0;
    const NMTREEVIEW* pNMTreeView = reinterpret_cast<const NMTREEVIEW*>(pNMHDR);
    if (pNMTreeView->action == TVE_COLLAPSE || pNMTreeView->action == TVE_COLLAPSERESET)
    {
        HTREEITEM hItem = pNMTreeView->itemNew.hItem;
        const BOOL bItemSelected = IsSelected(hItem);
        // Items about to be hidden leave the selection; a hidden caret would make the
        // tree select the collapsing item on its own.
        if (SelectChildren(hItem, FALSE, TRUE) && !bItemSelected)
            CTreeCtrl::SelectItem(NULL);
    }
    return FALSE;   // the parent receives the notification as well
}

BOOL CMultiTree::OnDeleteItem(NMHDR* pNMHDR, LRESULT* /*pResult*/)
{
    // A deleted anchor must not stand for a later item that reuses its handle.
    const NMTREEVIEW* pNMTreeView = reinterpret_cast<const NMTREEVIEW*>(pNMHDR);
    if (pNMTreeView->itemOld.hItem == m_hAnchorItem)
        m_hAnchorItem = NULL;
    return FALSE;
}
