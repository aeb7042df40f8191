// KVXListBoxEx: a list box whose horizontal scroll extent follows its widest string
// (text width in the list box's font plus the font's average character width), so that
// a horizontal scroll bar (WS_HSCROLL) reaches the end of every entry. The extent lives
// in the window; adding and inserting widen it, deleting the widest string and filling
// from a directory recompute it, emptying resets it.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXListBoxEx : public CListBox
{
// Constructors
public:
    KVXListBoxEx();
    virtual ~KVXListBoxEx();

// Operations (the list box's own, keeping the extent up to date)
public:
    virtual int Dir(UINT attr, LPCTSTR lpszWildCard);
    virtual void ResetContent();
    virtual int InsertString(int nIndex, LPCTSTR lpszItem);
    virtual int DeleteString(UINT nIndex);
    virtual int AddString(LPCTSTR lpszItem);

// Implementation
private:
    // FALSE for an owner-drawn list box without LBS_HASSTRINGS: its "strings" are item
    // data and take no extent.
    BOOL HasStrings() const;
    void WidenExtent(int nExtent);
    int GetExtentForString(LPCTSTR lpszItem);
    int GetExtentForEntireControl();
};
