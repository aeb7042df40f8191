#include "KVXColorDialog.h"

#include "resource.h"

IMPLEMENT_DYNAMIC(KVXColorDialog, CColorDialog)

KVXColorDialog::KVXColorDialog(COLORREF clrInit, DWORD dwFlags, CWnd* pParentWnd)
    : CColorDialog(clrInit, dwFlags, pParentWnd)
{
    m_strWindowName.LoadString(IDS_COLOR);
}

KVXColorDialog::~KVXColorDialog()
{
}

void KVXColorDialog::SetWindowName(CString strWindowName)
{
    m_strWindowName = strWindowName;
}

INT_PTR KVXColorDialog::DoModal()
{
    INT_PTR nResult = CColorDialog::DoModal();
    m_strWindowName.LoadString(IDS_COLOR);
    return nResult;
}

BOOL KVXColorDialog::OnInitDialog()
{
    CColorDialog::OnInitDialog();
    SetWindowText(m_strWindowName);
    return TRUE;
}
