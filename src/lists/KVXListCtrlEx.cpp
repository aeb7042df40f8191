// KVXListCtrlEx: sorting, the embedded header and column moves.
#include "KVXListCtrlEx.h"

#include "ListSortKeys.h"

#include <new>
#include <vector>

BEGIN_MESSAGE_MAP(KVXListCtrlEx, CListCtrl)
    ON_WM_PARENTNOTIFY()
    ON_NOTIFY(HDN_ITEMCLICKA, 0, &KVXListCtrlEx::OnHeaderClicked)
    ON_NOTIFY(HDN_ITEMCLICKW, 0, &KVXListCtrlEx::OnHeaderClicked)
    ON_MESSAGE(WM_SETREDRAW, &KVXListCtrlEx::OnSetRedraw)
END_MESSAGE_MAP()

namespace {

// What one sort keeps of every row. The rows' key texts (the cell text, or the cell's
// image index as "%d") lie side by side in one buffer.
struct SortRecord
{
    DWORD_PTR dwItemData;   // the row's own item data, restored after the sort
    size_t nKeyStart;       // where the row's key text starts in the buffer
};

// Key texts up to this length are fetched without a heap buffer.
const int kKeyBufferLength = 260;
// LVM_GETCOLUMN's text buffer when a column is moved.
const int kColumnTitleLength = 159;

} // namespace

KVXListCtrlEx::KVXListCtrlEx()
    : m_nHighlightType(0), m_bSortEnabled(false), m_pColumnTypes(NULL), m_nColumnTypes(0),
      m_nSortColumn(-1), m_bSortAscending(TRUE),
      m_ctlHeader(this, static_cast<void (CWnd::*)(int, int)>(&KVXListCtrlEx::DragColumn)),
      m_pfnAbbreviate(NULL), m_crInvalid(RGB(255, 0, 0)), m_bRedraw(TRUE)
{
    m_dtBaseTime.SetStatus(COleDateTime::invalid);
}

KVXListCtrlEx::~KVXListCtrlEx()
{
    delete[] m_pColumnTypes;
}

/////////////////////////////////////////////////////////////////////////////
// The embedded header

void KVXListCtrlEx::PreSubclassWindow()
{
    CListCtrl::PreSubclassWindow();
    SubclassHeader();
}

void KVXListCtrlEx::OnParentNotify(UINT message, LPARAM lParam)
{
    CListCtrl::OnParentNotify(message, lParam);
    // A list made with Create meets PreSubclassWindow before it has a header: the list
    // view makes it during its own WM_CREATE, or with the first column when hidden.
    if (LOWORD(message) == WM_CREATE)
        SubclassHeader();
}

void KVXListCtrlEx::SubclassHeader()
{
    if (m_ctlHeader.m_hWnd != NULL)
        return;
    HWND hHeader = ::GetDlgItem(m_hWnd, 0);
    if (hHeader != NULL)
        m_ctlHeader.SubclassWindow(hHeader);
}

LRESULT KVXListCtrlEx::OnSetRedraw(WPARAM wParam, LPARAM)
{
    m_bRedraw = wParam != 0;
    return Default();
}

/////////////////////////////////////////////////////////////////////////////
// Sort state

bool KVXListCtrlEx::EnableSort(bool bEnable)
{
    const bool bPrevious = m_bSortEnabled;
    m_bSortEnabled = bEnable;
    return bPrevious;
}

bool KVXListCtrlEx::SetColumnTypes(unsigned char* pTypes, unsigned int nCount)
{
    delete[] m_pColumnTypes;
    m_pColumnTypes = NULL;
    m_nColumnTypes = 0;
    if (nCount == 0)
        return true;
    if (pTypes == NULL)
        return false;
    for (unsigned int i = 0; i < nCount; ++i)
    {
        if (pTypes[i] > ListSortKeys::kLastColumnType)
            return false;
    }
    m_pColumnTypes = new (std::nothrow) unsigned char[nCount];
    if (m_pColumnTypes == NULL)
        return false;
    for (unsigned int i = 0; i < nCount; ++i)
        m_pColumnTypes[i] = pTypes[i];
    m_nColumnTypes = nCount;
    return true;
}

bool KVXListCtrlEx::SetBaseTime(CString strTime)
{
    COleDateTime baseTime;
    if (!baseTime.ParseDateTime(strTime, 0, LANG_USER_DEFAULT))
        return false;
    m_dtBaseTime = baseTime;
    return true;
}

bool KVXListCtrlEx::GetSortInfo(int& nColumn, bool& bAscending)
{
    if (m_nSortColumn == -1)
        return false;
    nColumn = m_nSortColumn;
    bAscending = m_bSortAscending != FALSE;
    return true;
}

unsigned char KVXListCtrlEx::GetColumnType(int nColumn) const
{
    if (m_pColumnTypes == NULL || nColumn < 0 || static_cast<unsigned int>(nColumn) >= m_nColumnTypes)
        return ListSortKeys::kDefaultColumnType;
    return m_pColumnTypes[nColumn];
}

void KVXListCtrlEx::PreSort()
{
}

void KVXListCtrlEx::PostSort()
{
}

/////////////////////////////////////////////////////////////////////////////
// Sorting

void KVXListCtrlEx::OnHeaderClicked(NMHDR* pNMHDR, LRESULT* pResult)
{
    *pResult = 0;
    const NMHEADER* pHeader = reinterpret_cast<const NMHEADER*>(pNMHDR);
    if (pHeader->iButton != 0 || !m_bSortEnabled)
        return;
    // A new column sorts ascending; the sorted one turns round.
    const bool bAscending = pHeader->iItem != m_nSortColumn || !m_bSortAscending;
    SortList(pHeader->iItem, bAscending);
}

void KVXListCtrlEx::ResortList()
{
    const int nColumn = m_nSortColumn;
    m_nSortColumn = -1;
    if (nColumn == -1)
    {
        PreSort();
        PostSort();
        return;
    }
    SortList(nColumn, m_bSortAscending != FALSE);
}

void KVXListCtrlEx::SortList(int nColumn, bool bAscending)
{
    PreSort();
    if (nColumn < 0)
        nColumn = -1;
    // The list is taken to be sorted already: nothing to do, not even for the header.
    if (nColumn == m_nSortColumn && bAscending == (m_bSortAscending != FALSE))
    {
        PostSort();
        return;
    }
    m_nSortColumn = nColumn;
    if (nColumn != -1)
    {
        m_bSortAscending = bAscending;
        SortRows(nColumn, bAscending);
    }
    // Should the header have come without telling its parent, it is taken now.
    SubclassHeader();
    HWND hHeader = ::GetDlgItem(m_hWnd, 0);
    if (hHeader != NULL)
        ::SendMessage(hHeader, WM_KVX_SETSORTEDCOLUMN, (WPARAM)m_nSortColumn, (LPARAM)m_bSortAscending);
    PostSort();
}

void KVXListCtrlEx::AppendKeyText(int nItem, int nColumn, unsigned char nType, std::vector<TCHAR>& keys) const
{
    TCHAR szText[kKeyBufferLength];
    szText[0] = 0;
    int nLength;
    if (nType == ListSortKeys::kImage || nType == ListSortKeys::kImageAlt)
    {
        LVITEM item = {};
        item.mask = LVIF_IMAGE;
        item.iItem = nItem;
        item.iSubItem = nColumn;
        GetItem(&item);
        nLength = ::wsprintf(szText, _T("%d"), item.iImage);
    }
    else
    {
        nLength = GetItemText(nItem, nColumn, szText, kKeyBufferLength);
    }
    if (nLength >= 0 && nLength < kKeyBufferLength - 1)
    {
        keys.insert(keys.end(), szText, szText + nLength);
    }
    else
    {
        // The text filled the buffer: it may be longer.
        const CString strText = GetItemText(nItem, nColumn);
        keys.insert(keys.end(), static_cast<LPCTSTR>(strText), static_cast<LPCTSTR>(strText) + strText.GetLength());
    }
    keys.push_back(0);
}

void KVXListCtrlEx::SortRows(int nColumn, bool bAscending)
{
    const int nCount = GetItemCount();
    const unsigned char nType = GetColumnType(nColumn);

    // Every key is fetched and parsed once; the rows are ordered here and the list
    // view only applies that order, comparing ranks.
    std::vector<SortRecord> records(static_cast<size_t>(nCount));
    std::vector<TCHAR> keys;
    keys.reserve(static_cast<size_t>(nCount) * 16);
    for (int i = 0; i < nCount; ++i)
    {
        records[i].dwItemData = GetItemData(i);
        records[i].nKeyStart = keys.size();
        AppendKeyText(i, nColumn, nType, keys);
    }
    std::vector<LPCWSTR> texts(static_cast<size_t>(nCount));
    for (int i = 0; i < nCount; ++i)
        texts[i] = keys.data() + records[i].nKeyStart;
    const std::vector<int> order = ListSortKeys::SortKeys(nType, texts, m_dtBaseTime).Order(bAscending);
    std::vector<int> ranks(static_cast<size_t>(nCount));
    for (int k = 0; k < nCount; ++k)
        ranks[order[k]] = k;

    // Each item data write repaints a visible row while drawing is on; the order
    // shows once drawing resumes.
    const bool bSuspendRedraw = m_bRedraw && IsWindowVisible();
    if (bSuspendRedraw)
        SetRedraw(FALSE);

    // During the sort every row's item data is its rank. The parent may refuse a
    // change (LVN_ITEMCHANGING): then nothing is sorted and the rows written get
    // their own data back.
    int nWritten = 0;
    while (nWritten < nCount && SetItemData(nWritten, static_cast<DWORD_PTR>(ranks[nWritten])))
        ++nWritten;
    bool bSorted = false;
    if (nWritten == nCount && GetItemCount() == nCount)
        bSorted = SortItems(&KVXListCtrlEx::Compare, (static_cast<DWORD_PTR>(nType) << 8) | (bAscending ? 1 : 0)) != FALSE;
    if (!bSorted)
    {
        for (int i = 0; i < nWritten && i < GetItemCount(); ++i)
            SetItemData(i, records[i].dwItemData);
    }
    else
    {
        // The ranks are distinct, so one order is possible: row k holds rank k. Should
        // a few rows say otherwise, every row is read.
        bool bAsExpected = true;
        for (int k : { 0, nCount / 2, nCount - 1 })
            bAsExpected = bAsExpected && (k < 0 || GetItemData(k) == static_cast<DWORD_PTR>(k));
        for (int k = 0; k < nCount; ++k)
        {
            const DWORD_PTR nRank = bAsExpected ? static_cast<DWORD_PTR>(k) : GetItemData(k);
            if (nRank < static_cast<DWORD_PTR>(nCount))
                SetItemData(k, records[order[nRank]].dwItemData);
        }
    }

    if (bSuspendRedraw)
    {
        SetRedraw(TRUE);
        Invalidate();
    }
}

int CALLBACK KVXListCtrlEx::Compare(LPARAM lParam1, LPARAM lParam2, LPARAM)
{
    // The ranks hold the column's rule and direction already, and keep equal keys in
    // their previous order.
    return lParam1 < lParam2 ? -1 : (lParam1 > lParam2 ? 1 : 0);
}

/////////////////////////////////////////////////////////////////////////////
// Column move

void KVXListCtrlEx::DragColumn(int nSource, int nTarget)
{
    TCHAR szTitle[kColumnTitleLength];
    LVCOLUMN column = {};
    column.mask = LVCF_FMT | LVCF_WIDTH | LVCF_TEXT | LVCF_SUBITEM;
    column.pszText = szTitle;
    column.cchTextMax = kColumnTitleLength;
    if (!GetColumn(nSource, &column))
        return;
    // The copy goes in first; the list view shifts the sub-items at and behind it.
    column.iSubItem = nTarget;
    if (InsertColumn(nTarget, &column) < 0)
        return;

    const int nFrom = nSource > nTarget ? nSource + 1 : nSource;
    const int nRows = GetItemCount();
    if (nTarget == 0)
    {
        // Sub-item 0 is the item itself, which no insertion moves.
        for (int i = nRows - 1; i >= 0; --i)
            SetItemText(i, 1, GetItemText(i, 0));
    }
    for (int i = nRows - 1; i >= 0; --i)
        SetItemText(i, nTarget, GetItemText(i, nFrom));

    if (nFrom == 0)
    {
        // The item's own text stays in column 0: column 0 takes over the title and
        // the texts of column 1, which goes instead.
        LVCOLUMN next = {};
        next.mask = LVCF_FMT | LVCF_WIDTH | LVCF_TEXT | LVCF_SUBITEM;
        next.pszText = szTitle;
        next.cchTextMax = kColumnTitleLength;
        if (GetColumn(1, &next))
        {
            next.iSubItem = 0;
            SetColumn(0, &next);
            for (int i = nRows - 1; i >= 0; --i)
                SetItemText(i, 0, GetItemText(i, 1));
            DeleteColumn(1);
        }
    }
    else
    {
        DeleteColumn(nFrom);
    }
    Invalidate(TRUE);
}
