// KVXColumnsPropPage: the page of the column chooser (template 5105). It lists the
// columns hidden from a column-customising list as button-like strips as wide as
// the columns, sorted by title; a strip dragged onto the list's header shows its
// column again there, and a column dragged from the header onto the page is hidden.
// F1 calls the help method set with SetDisplayHelp.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxdlgs.h>
#include <afxtempl.h>

#include "KVXColumnInfo.h"
#include "KVXListCtrlPropDropTarget.h"

class AFX_EXT_CLASS KVXColumnsPropPage : public CPropertyPage
{
    DECLARE_DYNCREATE(KVXColumnsPropPage)

// Constructors
public:
    enum { IDD = 5105 };
    KVXColumnsPropPage();
    virtual ~KVXColumnsPropPage();

// Operations
    // Adds a copy of the record as a hidden column (nothing when the record was dragged
    // from this page and dropped back on it).
    void AddColumn(KVXColumnInfo& columnInfo);
    // (pTarget->*pfn)(_T(""), 5105, page window) on F1; both must be set.
    void SetDisplayHelp(CCmdTarget* pTarget, void (CCmdTarget::*pfn)(CString, UINT, HWND));

// Dialog data
    CListCtrl m_listColumns;    // control 5101

// Overridables
protected:
    virtual void DoDataExchange(CDataExchange* pDX);
    virtual BOOL OnInitDialog();

// Message map and handlers
protected:
    afx_msg void OnBegindragListColumns(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg int OnCreate(LPCREATESTRUCT lpCreateStruct);
    afx_msg void OnDrawItem(int nIDCtl, LPDRAWITEMSTRUCT lpDrawItemStruct);
    afx_msg BOOL OnHelpInfo(HELPINFO* pHelpInfo);
    DECLARE_MESSAGE_MAP()

// Implementation
protected:
    CCmdTarget* m_pHelpTarget;                              // not owned
    void (CCmdTarget::*m_pfnDisplayHelp)(CString, UINT, HWND);
    bool m_bDroppedOnSelf;      // a drag from this page was dropped back on it
    bool m_bDragging;           // a drag from this page is running
    KVXListCtrlPropDropTarget m_DropTarget;
    CList<KVXColumnInfo*, KVXColumnInfo*> m_ColumnInfos;   // owned

private:
    // Inserts the strip of a record; false when the list view refused it.
    bool InsertStrip(KVXColumnInfo* pColumnInfo);
};
