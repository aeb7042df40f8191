// KVXMultiTreeBase: a tree control that reports every real change of an item's
// selected bit made through SetItemState to one overridable hook.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>

class AFX_EXT_CLASS KVXMultiTreeBase : public CTreeCtrl
{
    DECLARE_DYNCREATE(KVXMultiTreeBase)

// Constructors
public:
    KVXMultiTreeBase();
    virtual ~KVXMultiTreeBase();

// Operations
    // Sets the state bits; when TVIS_SELECTED is in the mask and the bit really
    // changed, OnItemSelected is told. Hides CTreeCtrl::SetItemState.
    BOOL SetItemState(HTREEITEM hItem, UINT nState, UINT nStateMask);

// Overridables
    virtual void OnItemSelected(HTREEITEM hItem, bool bSelected);

// Message map
protected:
    DECLARE_MESSAGE_MAP()
};
