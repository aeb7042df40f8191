// Combo list page: a task list whose "Status" column carries a drop-down combo box in
// every row (KVXComboBoxListCtrlEx). Picking a status reaches the page as
// LVN_ENDLABELEDITW; the pane on the right shows each report (a null text after Esc was
// pressed in that box) and the page writes the status into the cell under the box. The
// boxes follow the rows when the list scrolls and the columns when a divider is dragged.
// The title tip of a cut-off task shows the whole description, which the list asks the
// page for with LVN_GETDISPINFOW. The buttons select rows by their state
// (KVXSimpleListControlExItemCommand): the checked ones, or none. In screenshot mode the
// page picks a status in one row and selects the checked rows.
#include "GalleryPage.h"

#include <afxcmn.h>

#include "KVXComboBoxListCtrlEx.h"
#include "KVXSimpleListControlExItemCommand.h"

namespace {

const int kRows = 200;
const int kStatusColumn = 1;
const LPCTSTR kStatuses[] = { _T("Open"), _T("In progress"), _T("Waiting"), _T("Done") };
const int kStatusCount = sizeof kStatuses / sizeof kStatuses[0];
const LPCTSTR kTasks[] = { _T("Invoice"), _T("Quarterly report"), _T("Customer call"), _T("Contract review"),
    _T("Team meeting minutes"), _T("Server backup check"), _T("Budget draft"), _T("Holiday plan") };
const LPCTSTR kDetails[] = { _T("compare the amounts with the order and send it to the customer"),
    _T("collect the figures of all departments and write the summary"),
    _T("ask about the delivery dates and note the answers"),
    _T("read the new clauses and mark what legal should look at"),
    _T("write up the decisions and send them round"),
    _T("restore one file from last night's backup to prove it works"),
    _T("put next year's numbers next to this year's"),
    _T("find a week that suits everybody") };
const LPCTSTR kOwners[] = { _T("Ann"), _T("Ben"), _T("Chris"), _T("Dana"), _T("Eli") };
// A row's combo box has the identifier row + 5106.
const int kComboBoxIdBase = 5106;
// The state a checked row's check box has (state image 2).
const UINT kCheckedState = INDEXTOSTATEIMAGEMASK(2);

} // namespace

class CComboListPage : public CGalleryPage
{
public:
    LPCTSTR GetTitle() const override { return _T("Combo list"); }
    void CreateControls() override;

protected:
    afx_msg void OnEndLabelEdit(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg void OnGetDispInfo(NMHDR* pNMHDR, LRESULT* pResult);
    afx_msg void OnSelectChecked();
    afx_msg void OnSelectNone();
    afx_msg void OnWindowPosChanged(WINDOWPOS* lpwndpos);
    afx_msg LRESULT OnDemonstrate(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    enum { IDC_LIST = 700, IDC_REPORTS, IDC_SELECT_CHECKED, IDC_SELECT_NONE };
    static const UINT kDemonstrateMessage = WM_APP + 30;

    void Fill();
    void Report(const CString& strLine);

    CWnd m_label;
    KVXComboBoxListCtrlEx m_list;
    CWnd m_reportsLabel;
    CListBox m_reports;
    CButton m_selectChecked;
    CButton m_selectNone;
    CImageList m_checks;
    CString m_strDetail;    // the text handed to the title tip
};

GALLERY_PAGE(25, CComboListPage);

BEGIN_MESSAGE_MAP(CComboListPage, CGalleryPage)
    ON_NOTIFY(LVN_ENDLABELEDITW, IDC_LIST, &CComboListPage::OnEndLabelEdit)
    ON_NOTIFY(LVN_GETDISPINFOW, IDC_LIST, &CComboListPage::OnGetDispInfo)
    ON_BN_CLICKED(IDC_SELECT_CHECKED, &CComboListPage::OnSelectChecked)
    ON_BN_CLICKED(IDC_SELECT_NONE, &CComboListPage::OnSelectNone)
    ON_WM_WINDOWPOSCHANGED()
    ON_MESSAGE(kDemonstrateMessage, &CComboListPage::OnDemonstrate)
END_MESSAGE_MAP()

void CComboListPage::CreateControls()
{
    CRect rc;
    GetClientRect(&rc);
    const int nPaneLeft = rc.right - 250;
    m_label.Create(_T("STATIC"),
        _T("Pick a status in a row's box; the pane shows what the list reports (after Esc in a box its ")
        _T("reports carry no text). Rest the pointer on a cut-off task for its whole description."),
        WS_CHILD | WS_VISIBLE, CRect(12, 8, rc.right - 12, 38), this, 0xFFFF);
    m_label.SetFont(GuiFont());

    m_list.CreateEx(WS_EX_CLIENTEDGE, WS_CHILD | WS_VISIBLE | WS_TABSTOP | LVS_REPORT | LVS_SHOWSELALWAYS,
                    CRect(12, 44, nPaneLeft - 12, rc.bottom - 12), this, IDC_LIST);
    m_list.SetFont(GuiFont());
    m_list.SetExtendedStyle(LVS_EX_FULLROWSELECT);
    CreateCheckBoxImages(m_checks, this);
    m_list.SetImageList(&m_checks, LVSIL_STATE);
    m_list.InsertColumn(0, _T("Task"), LVCFMT_LEFT, 170, 0);
    m_list.InsertColumn(1, _T("Status"), LVCFMT_LEFT, 110, 1);
    m_list.InsertColumn(2, _T("Owner"), LVCFMT_LEFT, 70, 2);
    m_list.InsertColumn(3, _T("Due"), LVCFMT_LEFT, 80, 3);
    m_list.SetComboBoxColID(kStatusColumn);
    m_list.EnableTitleTip(true);
    Fill();

    m_reportsLabel.Create(_T("STATIC"), _T("LVN_ENDLABELEDITW reports:"), WS_CHILD | WS_VISIBLE,
                          CRect(nPaneLeft, 44, rc.right - 12, 62), this, 0xFFFF);
    m_reportsLabel.SetFont(GuiFont());
    m_reports.Create(WS_CHILD | WS_VISIBLE | WS_BORDER | WS_VSCROLL | LBS_NOINTEGRALHEIGHT | LBS_NOSEL,
                     CRect(nPaneLeft, 64, rc.right - 12, rc.bottom - 76), this, IDC_REPORTS);
    m_reports.SetFont(GuiFont());
    m_selectChecked.Create(_T("Select the checked rows"), WS_CHILD | WS_VISIBLE | BS_PUSHBUTTON,
                           CRect(nPaneLeft, rc.bottom - 68, rc.right - 12, rc.bottom - 44), this, IDC_SELECT_CHECKED);
    m_selectChecked.SetFont(GuiFont());
    m_selectNone.Create(_T("Select none"), WS_CHILD | WS_VISIBLE | BS_PUSHBUTTON,
                        CRect(nPaneLeft, rc.bottom - 38, rc.right - 12, rc.bottom - 14), this, IDC_SELECT_NONE);
    m_selectNone.SetFont(GuiFont());
}

void CComboListPage::Fill()
{
    CStringArray statuses;
    for (int i = 0; i < kStatusCount; ++i)
        statuses.Add(kStatuses[i]);
    // Filled with redraw off: a visible list repaints after every insertion.
    m_list.SetRedraw(FALSE);
    for (int r = 0; r < kRows; ++r)
    {
        CString strTask;
        strTask.Format(_T("%s %d"), kTasks[r % 8], 1001 + r);
        m_list.InsertItem(LVIF_TEXT | LVIF_PARAM, r, strTask, 0, 0, 0, r);
        const int nStatus = (r * 7 + r / 3) % kStatusCount;
        m_list.SetItemText(r, kStatusColumn, kStatuses[nStatus]);
        m_list.SetItemText(r, 2, kOwners[(r * 3) % 5]);
        CString strDue;
        strDue.Format(_T("2027-%02d-%02d"), 1 + r % 12, 1 + (r * 5) % 28);
        m_list.SetItemText(r, 3, strDue);
        m_list.SetItemState(r, INDEXTOSTATEIMAGEMASK(r % 3 == 0 ? 2 : 1), LVIS_STATEIMAGEMASK);
    }
    for (int r = 0; r < kRows; ++r)
        m_list.SetSubItems(r, kStatusCount, &statuses, (r * 7 + r / 3) % kStatusCount);
    m_list.SetRedraw(TRUE);
    m_list.Invalidate();
}

void CComboListPage::Report(const CString& strLine)
{
    const int nIndex = m_reports.AddString(strLine);
    m_reports.SetTopIndex(nIndex);
}

void CComboListPage::OnEndLabelEdit(NMHDR* pNMHDR, LRESULT* pResult)
{
    // Sent by the row's combo box: idFrom is the box's identifier, the item says the cell.
    const NMLVDISPINFOW* pInfo = reinterpret_cast<const NMLVDISPINFOW*>(pNMHDR);
    CString strLine;
    if (pInfo->item.pszText == NULL)
    {
        strLine.Format(_T("Row %d: no text (Esc was pressed)"), pInfo->item.iItem);
    }
    else
    {
        strLine.Format(_T("Row %d: %s"), pInfo->item.iItem, pInfo->item.pszText);
        m_list.SetItemText(pInfo->item.iItem, pInfo->item.iSubItem, pInfo->item.pszText);
    }
    Report(strLine);
    *pResult = 0;
}

void CComboListPage::OnGetDispInfo(NMHDR* pNMHDR, LRESULT* pResult)
{
    *pResult = 0;
    NMLVDISPINFOW* pInfo = reinterpret_cast<NMLVDISPINFOW*>(pNMHDR);
    // The title tip asks without a buffer; the list view's own questions come with one.
    if (pInfo->item.pszText != NULL || pInfo->item.cchTextMax != 0)
        return;
    m_strDetail = m_list.GetItemText(pInfo->item.iItem, pInfo->item.iSubItem);
    if (pInfo->item.iSubItem == 0)
        m_strDetail += CString(_T(": ")) + kDetails[pInfo->item.iItem % 8];
    pInfo->item.pszText = const_cast<LPWSTR>(static_cast<LPCWSTR>(m_strDetail));
}

void CComboListPage::OnSelectChecked()
{
    KVXSimpleListControlExItemCommand command(m_list);
    command.SelectItemsByState(kCheckedState, true);
}

void CComboListPage::OnSelectNone()
{
    KVXSimpleListControlExItemCommand command(m_list);
    command.SelectItemsByState(0, false);
}

void CComboListPage::OnWindowPosChanged(WINDOWPOS* lpwndpos)
{
    CGalleryPage::OnWindowPosChanged(lpwndpos);
    if ((lpwndpos->flags & SWP_SHOWWINDOW) && InScreenshotMode())
        PostMessage(kDemonstrateMessage);
}

LRESULT CComboListPage::OnDemonstrate(WPARAM, LPARAM)
{
    // As if the user stepped a status on in row 2's box and pressed the first button.
    if (CWnd* pBox = m_list.GetDlgItem(2 + kComboBoxIdBase))
        pBox->SendMessage(WM_KEYDOWN, VK_DOWN, 1);
    OnSelectChecked();
    m_list.SetFocus();
    return 0;
}
