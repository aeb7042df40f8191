// KVXListCtrlPropSheet: the column chooser's property sheet, a modeless child of its
// frame with the one page; it deletes itself when its window is destroyed.
#pragma once

#include <afxwin.h>
#include <afxdlgs.h>

#include "KVXColumnsPropPage.h"

class AFX_EXT_CLASS KVXListCtrlPropSheet : public CPropertySheet
{
    DECLARE_DYNAMIC(KVXListCtrlPropSheet)

// Constructors
public:
    // Caption string 5100, the page selected.
    explicit KVXListCtrlPropSheet(CWnd* pParentWnd);
    virtual ~KVXListCtrlPropSheet();

// Attributes
    KVXColumnsPropPage m_page;

// Implementation
protected:
    virtual void PostNcDestroy();
    DECLARE_MESSAGE_MAP()
};
