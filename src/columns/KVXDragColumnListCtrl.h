// KVXDragColumnListCtrl: the extended list control with columns the user shows, hides
// and reorders. The host describes every column it can show with a KVXColumnInfo
// record (AddColumn) and shows some of them (InsertColumn); the user drags a column
// by its title to another place, into the column chooser (Customize) to hide it, and
// from the chooser back onto the header to show it. The list obtains the texts of
// its cells from the host's fill callback whenever a column is shown or moves and
// whenever a row is inserted. OLE must be initialised (AfxOleInit) for the drags.
//
// The fill callback, (pCallbackWnd->*pfnFillItem)(item, pColumnInfo), gets an
// LVITEMW whose iItem is the row, iSubItem the record's position, mask LVIF_PARAM |
// LVIF_STATE and lParam the row's item data. It sets what it wants to write, normally
// adding LVIF_TEXT and setting pszText to text made with AllocItemText: the list frees
// that text with the library's operator delete once the cell is written.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxtempl.h>

#include "KVXColumnInfo.h"
#include "KVXDragHeaderCtrl.h"
#include "KVXListCtrlEx.h"
#include "KVXListCtrlPropSheetData.h"

class KVXListCtrlPropFrame;

class AFX_EXT_CLASS KVXDragColumnListCtrl : public KVXListCtrlEx
{
// Constructors
public:
    KVXDragColumnListCtrl();
    virtual ~KVXDragColumnListCtrl();

// Columns
    // Takes ownership of the record (a null pointer is ignored). It is known from now
    // on, shown (index 0, 1, ...) or hidden (index -1); no list column is made.
    void AddColumn(KVXColumnInfo* pColumnInfo);
    // Shows the hidden known column(s) of that title at nCol, moving the shown columns
    // from there one to the right. Returns the new column's position, -1 if none.
    int InsertColumn(CString strTitle, int nCol);
    // Every known record, shown and hidden, e.g. to store the layout with
    // KVXColumnInfo::Write.
    CList<KVXColumnInfo*, KVXColumnInfo*>& GetColumnInfos();
    // Fills the column of the record in every row through the fill callback.
    void FillColumn(KVXColumnInfo* pColumnInfo);
    // The header item under a point, -1 if none.
    int HeaderHitTest(CPoint point);

// Column chooser
    // Creates the chooser the first time (with the hidden columns) and shows it.
    void Customize();
    // Help target, help method and caption of the chooser: set before the first Customize.
    KVXListCtrlPropSheetData& GetPropPageData();

// Fill callback
    void SetCallbackWindow(CWnd* pWnd);
    void SetFillItem(void (CWnd::*pfn)(LVITEMW&, KVXColumnInfo*));
    // A copy of the text for the callback's pszText, allocated in this library so that
    // the list can free it whatever runtime the host was built with.
    static LPWSTR AllocItemText(LPCWSTR pszText);

// Overridables
protected:
    virtual void PreSubclassWindow();
    virtual BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult);

// Message map and handlers
protected:
    afx_msg LRESULT OnInsertItem(WPARAM wParam, LPARAM lParam);
    afx_msg int OnCreate(LPCREATESTRUCT lpCreateStruct);
    afx_msg LRESULT OnMessageInsertColumn(WPARAM wParam, LPARAM lParam);
    afx_msg void OnNotifyDeleteColumn(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg void OnParentNotify(UINT message, LPARAM lParam);
    afx_msg void OnDestroy();
    DECLARE_MESSAGE_MAP()

// Implementation
protected:
    KVXListCtrlPropSheetData m_PropPageData;
    KVXListCtrlPropFrame* m_pPropFrame;         // the chooser, null until the first Customize
    void (CWnd::*m_pfnFillItem)(LVITEMW&, KVXColumnInfo*);
    CWnd* m_pCallbackWnd;                       // not owned
    CList<KVXColumnInfo*, KVXColumnInfo*> m_ColumnInfos;   // owned
    KVXDragHeaderCtrl m_HeaderCtrl;

private:
    void FillItem(int nItem, KVXColumnInfo* pColumnInfo);
    void ResetColumn(KVXColumnInfo* pColumnInfo);
    void AttachHeader();
    // Hands the shown records' sort types to SetColumnTypes, position by position.
    void UpdateColumnTypes();
    // Tells the header where the sort arrow goes now.
    void ShowSortColumn();
    bool IsPropFrameAlive() const;
    void DestroyPropFrame();

    HWND m_hWndPropFrame;                       // the chooser's window, to know it is still there
};
