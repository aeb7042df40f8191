// KVXListCtrlPropSheet: the chooser's sheet.
#include "KVXListCtrlPropSheet.h"

#include "resource.h"

IMPLEMENT_DYNAMIC(KVXListCtrlPropSheet, CPropertySheet)

BEGIN_MESSAGE_MAP(KVXListCtrlPropSheet, CPropertySheet)
END_MESSAGE_MAP()

KVXListCtrlPropSheet::KVXListCtrlPropSheet(CWnd* pParentWnd)
    : CPropertySheet(IDS_DRAGLISTCTRL_CAPTION, pParentWnd, 0)
{
    AddPage(&m_page);
}

KVXListCtrlPropSheet::~KVXListCtrlPropSheet()
{
}

void KVXListCtrlPropSheet::PostNcDestroy()
{
    CWnd::PostNcDestroy();
    delete this;
}
