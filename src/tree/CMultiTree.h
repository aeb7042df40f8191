// CMultiTree: a tree control in which any number of items can be selected, the way
// file lists behave (click, Ctrl+click, Shift+click, Shift/Ctrl+arrows, rubber band).
// The selection lives in the items' TVIS_SELECTED bits; the tree's caret is the
// focused item. The control sends the parent the selection, click and begin-drag
// notifications a plain tree would send, and IsEmulatedNotify tells them apart from
// the tree's own.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxtempl.h>

#include "KVXMultiTreeBase.h"

namespace TreeSelectionMath { class SelectionSnapshot; }

class AFX_EXT_CLASS CMultiTree : public KVXMultiTreeBase
{
    DECLARE_DYNAMIC(CMultiTree)

// Constructors
public:
    CMultiTree();
    virtual ~CMultiTree();

// Attributes
    // Off: every handler behaves as the plain tree and SetItemState sends nothing.
    BOOL SetMultiSelect(BOOL bMultiSelect);
    BOOL IsMultiSelect() const;
    // TRUE while the control sends one of its own notifications to the parent.
    BOOL IsEmulatedNotify() const;
    // TRUE: the rubber band tests item labels; FALSE: whole rows.
    BOOL SetBandingHit(BOOL bLabel);

    // TVIS_FOCUSED is the caret, never a stored bit.
    UINT GetItemState(HTREEITEM hItem, UINT nStateMask) const;
    BOOL SetItemState(HTREEITEM hItem, UINT nState, UINT nStateMask);
    BOOL IsSelected(HTREEITEM hItem) const;
    HTREEITEM GetFocusedItem() const;
    HTREEITEM GetFirstSelectedItem() const;
    HTREEITEM GetNextSelectedItem(HTREEITEM hItem) const;
    UINT GetSelectedCount() const;
    void GetSelectedList(CTypedPtrList<CPtrList, HTREEITEM>& list) const;

// Operations
    // The tree's own single selection (the caret); NULL removes the caret.
    BOOL SelectItem(HTREEITEM hItem);
    BOOL FocusItem(HTREEITEM hItem);
    void SelectAll(BOOL bSelect);
    void SelectRange(HTREEITEM hFirst, HTREEITEM hLast, BOOL bOnly);
    // Returns TRUE when one of the visited children was the caret.
    BOOL SelectChildren(HTREEITEM hParent, BOOL bSelect, BOOL bRecurse);

// Implementation
protected:
    void SelectAllIgnore(BOOL bSelect, HTREEITEM hIgnore);
    void OnButtonDown(BOOL bLeft, UINT nFlags, CPoint point);
    void DoPreSelection(HTREEITEM hItem, BOOL bLeft, UINT nFlags);
    void DoAction(HTREEITEM hItem, BOOL bLeft, UINT nFlags, CPoint point);
    void DoBanding(BOOL bLeft, UINT nFlags, CPoint point);
    void UpdateSelectionForRect(LPCRECT pRect, UINT nFlags, TreeSelectionMath::SelectionSnapshot& snapshot);
    BOOL _SendNotify(LPNMHDR pNMHDR);

    BOOL m_bMultiSelect;
    HTREEITEM m_hAnchorItem;     // Shift ranges start here; NULL: the caret when needed
    BOOL m_bEmulatedNotify;
    BOOL m_bBandingHit;

private:
    // The steps of DoBanding.
    struct BandLoop;
    BandLoop StartBand(CPoint point, UINT nFlags);
    // The point a band message moves to: a mouse move, or a timer tick with the pointer outside.
    BOOL BandPointFromMessage(const MSG& msg, const BandLoop& band, CPoint& pt);
    void MoveBand(CDC& dc, BandLoop& band, CPoint pt, UINT nFlags, TreeSelectionMath::SelectionSnapshot& snapshot);
    // Timer, capture, frame or cleared selection, NM_CLICK or NM_RCLICK.
    void EndBand(CDC& dc, const BandLoop& band, BOOL bLeft);

    BOOL SendSelectionNotify(UINT nCode, HTREEITEM hItem, bool bSelecting);
    BOOL SendItemNotify(UINT nCode, HTREEITEM hItem, CPoint point);
    HTREEITEM VisibleEndpoint(HTREEITEM hItem) const;
    void InvalidateSelectedLabels();

// Message map
protected:
    afx_msg void OnLButtonDown(UINT nFlags, CPoint point);
    afx_msg void OnSetFocus(CWnd* pOldWnd);
    afx_msg void OnKillFocus(CWnd* pNewWnd);
    afx_msg BOOL OnItemExpanding(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg BOOL OnDeleteItem(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg void OnKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags);
    DECLARE_MESSAGE_MAP()
};
