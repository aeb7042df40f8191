// KVXListCtrlEx: the extended report-view list control. This part of the class sorts
// its rows by one column with the column's comparison rule (when the user clicks a
// header item or the host asks), shows the sort in its header and moves a column
// when the header reports a finished column drag.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxdisp.h>

#include "KVXHeaderCtrlEx.h"

#include <vector>

class AFX_EXT_CLASS KVXListCtrlEx : public CListCtrl
{
// Constructors
public:
    KVXListCtrlEx();
    virtual ~KVXListCtrlEx();

// Sorting
    // Header clicks sort the list; returns the previous setting.
    bool EnableSort(bool bEnable);
    // One column type code (0 to 8, see ListSortKeys.h) per column position. A code
    // above 8 leaves the list without types and returns false. A column without an
    // entry sorts as case-sensitive text.
    bool SetColumnTypes(unsigned char* pTypes, unsigned int nCount);
    // The reference time of type 6 columns, parsed like a cell; false keeps the old one.
    bool SetBaseTime(CString strTime);
    // Sorts by the column position (-1: no sort) in the direction. With the current
    // column and direction nothing is sorted and the header is not told again.
    void SortList(int nColumn, bool bAscending);
    // Sorts again by the current column and direction, e.g. after rows were added.
    void ResortList();
    // false when the list is not sorted (the arguments are left alone).
    bool GetSortInfo(int& nColumn, bool& bAscending);

// Overridables
protected:
    virtual void PreSubclassWindow();
public:
    // Called at the start and at the end of every SortList, also when nothing is sorted.
    virtual void PreSort();
    virtual void PostSort();

// Implementation
protected:
    // The LVM_SORTITEMS callback: during a sort every row's item data is its rank in
    // the order the column's rule gives. lParamSort is the column type code times 256
    // plus the direction (1 ascending).
    static int CALLBACK Compare(LPARAM lParam1, LPARAM lParam2, LPARAM lParamSort);
    // The header's drag callback: moves column nSource before position nTarget (or
    // to the end when nTarget is the column count), cell texts included.
    void DragColumn(int nSource, int nTarget);

    afx_msg void OnParentNotify(UINT message, LPARAM lParam);
    afx_msg void OnHeaderClicked(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg LRESULT OnSetRedraw(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

    int m_nHighlightType;
    bool m_bSortEnabled;
    unsigned char* m_pColumnTypes;
    unsigned int m_nColumnTypes;
    COleDateTime m_dtBaseTime;
    int m_nSortColumn;
    BOOL m_bSortAscending;
    KVXHeaderCtrlEx m_ctlHeader;
    CString (CWnd::*m_pfnAbbreviate)(CString, int, int);
    COLORREF m_crInvalid;
    BOOL m_bRedraw;             // as the last WM_SETREDRAW left it

private:
    void SubclassHeader();
    unsigned char GetColumnType(int nColumn) const;
    // Appends the row's key text for a column of the type, and a terminating zero.
    void AppendKeyText(int nItem, int nColumn, unsigned char nType, std::vector<TCHAR>& keys) const;
    void SortRows(int nColumn, bool bAscending);
};
