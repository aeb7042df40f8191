#include "KVXListBoxEx.h"

#include <vector>

KVXListBoxEx::KVXListBoxEx()
{
}

KVXListBoxEx::~KVXListBoxEx()
{
}

BOOL KVXListBoxEx::HasStrings() const
{
    const DWORD dwStyle = GetStyle();
    if ((dwStyle & (LBS_OWNERDRAWFIXED | LBS_OWNERDRAWVARIABLE)) == 0)
        return TRUE;
    return (dwStyle & LBS_HASSTRINGS) != 0;
}

void KVXListBoxEx::WidenExtent(int nExtent)
{
    if (GetHorizontalExtent() < nExtent)
        SetHorizontalExtent(nExtent);
}

int KVXListBoxEx::AddString(LPCTSTR lpszItem)
{
    // Widened before the string goes in, whatever the outcome.
    WidenExtent(GetExtentForString(lpszItem));
    return CListBox::AddString(lpszItem);
}

int KVXListBoxEx::InsertString(int nIndex, LPCTSTR lpszItem)
{
    const int nResult = CListBox::InsertString(nIndex, lpszItem);
    if (nResult == LB_ERR)
        return nResult;
    WidenExtent(GetExtentForString(lpszItem));
    return nResult;
}

int KVXListBoxEx::DeleteString(UINT nIndex)
{
    int nDeletedExtent = 0;
    if (HasStrings())
    {
        const int nLength = GetTextLen(nIndex);
        if (nLength != LB_ERR)
        {
            std::vector<TCHAR> text(static_cast<size_t>(nLength) + 1, 0);
            if (CListBox::GetText(nIndex, text.data()) != LB_ERR)
                nDeletedExtent = GetExtentForString(text.data());
        }
    }
    const int nCurrentExtent = GetHorizontalExtent();
    const int nResult = CListBox::DeleteString(nIndex);
    if (nResult == LB_ERR)
        return LB_ERR;
    if (nDeletedExtent >= nCurrentExtent)
        SetHorizontalExtent(GetExtentForEntireControl());
    return nResult;
}

void KVXListBoxEx::ResetContent()
{
    SetHorizontalExtent(0);
    CListBox::ResetContent();
}

int KVXListBoxEx::Dir(UINT attr, LPCTSTR lpszWildCard)
{
    const int nResult = CListBox::Dir(attr, lpszWildCard);
    if (nResult == LB_ERR || nResult == LB_ERRSPACE)
        return nResult;
    SetHorizontalExtent(GetExtentForEntireControl());
    return nResult;
}

int KVXListBoxEx::GetExtentForString(LPCTSTR lpszItem)
{
    if (lpszItem == NULL || !HasStrings())
        return 0;
    CFont* pFont = GetFont();
    if (pFont == NULL)
        return 0;
    CClientDC dc(this);
    CFont* pOldFont = dc.SelectObject(pFont);
    TEXTMETRIC tm;
    dc.GetTextMetrics(&tm);
    CSize size = dc.GetTextExtent(lpszItem, lstrlen(lpszItem));
    dc.SelectObject(pOldFont);
    return size.cx + tm.tmAveCharWidth;
}

int KVXListBoxEx::GetExtentForEntireControl()
{
    if (!HasStrings())
        return 0;
    CFont* pFont = GetFont();
    if (pFont == NULL)
        return 0;
    CClientDC dc(this);
    CFont* pOldFont = dc.SelectObject(pFont);
    TEXTMETRIC tm;
    dc.GetTextMetrics(&tm);
    int nMax = 0;
    CString strItem;
    for (int i = 0; i < GetCount(); ++i)
    {
        GetText(i, strItem);
        if (strItem.IsEmpty())
            continue;
        CSize size = dc.GetTextExtent(strItem, strItem.GetLength());
        if (size.cx + tm.tmAveCharWidth > nMax)
            nMax = size.cx + tm.tmAveCharWidth;
    }
    dc.SelectObject(pOldFont);
    return nMax;
}
