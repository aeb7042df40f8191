// KVXSubItemComboBox: one row's combo box in a KVXComboBoxListCtrlEx.
#include "KVXSubItemComboBox.h"

#include <afxcmn.h>

BEGIN_MESSAGE_MAP(KVXSubItemComboBox, CComboBox)
    ON_WM_CREATE()
    ON_WM_CHAR()
    ON_CONTROL_REFLECT(CBN_SELCHANGE, &KVXSubItemComboBox::OnSelChange)
END_MESSAGE_MAP()

KVXSubItemComboBox::KVXSubItemComboBox(int nRow, int nColumn)
    : m_nRow(nRow), m_nColumn(nColumn), m_bEscape(FALSE)
{
}

KVXSubItemComboBox::~KVXSubItemComboBox()
{
}

void KVXSubItemComboBox::PostNcDestroy()
{
    delete this;
}

int KVXSubItemComboBox::OnCreate(LPCREATESTRUCT lpCreateStruct)
{
    if (CComboBox::OnCreate(lpCreateStruct) == -1)
        return -1;
    // The list's font; a list without one leaves NULL, the system font.
    CWnd* pParent = GetParent();
    const HFONT hFont = pParent != NULL ? reinterpret_cast<HFONT>(pParent->SendMessage(WM_GETFONT)) : NULL;
    SendMessage(WM_SETFONT, reinterpret_cast<WPARAM>(hFont), TRUE);
    return 0;
}

BOOL KVXSubItemComboBox::PreTranslateMessage(MSG* pMsg)
{
    // A dialog would press its default button for Enter and cancel for Esc: the combo
    // box closes its list and hands the focus back instead (OnChar).
    if (pMsg->message == WM_KEYDOWN && (pMsg->wParam == VK_RETURN || pMsg->wParam == VK_ESCAPE))
    {
        ::TranslateMessage(pMsg);
        ::DispatchMessage(pMsg);
        return TRUE;
    }
    return CComboBox::PreTranslateMessage(pMsg);
}

void KVXSubItemComboBox::OnChar(UINT nChar, UINT nRepCnt, UINT nFlags)
{
    if (nChar == VK_ESCAPE || nChar == VK_RETURN)
    {
        if (nChar == VK_ESCAPE)
            m_bEscape = TRUE;
        if (CWnd* pList = GetParent())
            pList->SetFocus();
        return;
    }
    CComboBox::OnChar(nChar, nRepCnt, nFlags);
}

void KVXSubItemComboBox::OnSelChange()
{
    const int nSelected = GetCurSel();
    CWnd* pList = GetParent();
    CWnd* pReceiver = pList != NULL ? pList->GetParent() : NULL;
    if (nSelected == CB_ERR || pReceiver == NULL)
        return;
    CString strText;
    GetLBText(nSelected, strText);

    // As if the list had ended a label edit of the cell; the block's sender is this box.
    NMLVDISPINFOW info = {};
    info.hdr.hwndFrom = pList->m_hWnd;
    info.hdr.idFrom = static_cast<UINT_PTR>(GetDlgCtrlID());
    info.hdr.code = LVN_ENDLABELEDITW;
    info.item.mask = LVIF_TEXT;
    info.item.iItem = m_nRow;
    info.item.iSubItem = m_nColumn;
    info.item.pszText = m_bEscape ? NULL : const_cast<LPWSTR>(static_cast<LPCWSTR>(strText));
    info.item.cchTextMax = strText.GetLength();
    pReceiver->SendMessage(WM_NOTIFY, static_cast<WPARAM>(pList->GetDlgCtrlID()), reinterpret_cast<LPARAM>(&info));
}
