// Small controls page: a string edit with escapes and a length limit, the three bitmap
// buttons (push, check, momentary) drawn from the gallery's own bitmaps, two colour
// wells (one undefined) and a list box whose horizontal scroll bar follows its longest
// entry. A status line reports what the controls tell their parent.
#include "GalleryPage.h"

#include "KVXBitmapButtonEx.h"
#include "KVXCheckButtonEx.h"
#include "KVXColorWell.h"
#include "KVXListBoxEx.h"
#include "KVXStringEdit.h"
#include "KVXUncheckButton.h"
#include "small_controls_ids.h"

class CSmallControlsPage : public CGalleryPage
{
public:
    LPCTSTR GetTitle() const override { return _T("Small controls"); }
    void CreateControls() override;

protected:
    afx_msg void OnPlay();
    afx_msg void OnBold();
    afx_msg void OnRecord();
    afx_msg void OnShowValue();
    afx_msg void OnAddEntry();
    afx_msg void OnDeleteEntry();
    afx_msg void OnToggleEnabled();
    afx_msg LRESULT OnColorChanged(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    enum
    {
        IDC_STRING = 300, IDC_SHOW_VALUE, IDC_VALUE, IDC_PLAY, IDC_BOLD, IDC_RECORD, IDC_TOGGLE,
        IDC_WELL, IDC_WELL_UNDEFINED, IDC_LIST, IDC_ADD, IDC_DELETE, IDC_STATUS
    };

    void AddLabel(CWnd& label, LPCTSTR text, const CRect& rc);
    void AddButton(CWnd& button, LPCTSTR text, const CRect& rc, UINT nID);
    void Status(LPCTSTR text);

    CWnd m_labels[5];
    KVXStringEdit m_string;
    CWnd m_showValue;
    CWnd m_value;
    KVXBitmapButtonEx m_play;
    KVXCheckButtonEx m_bold;
    KVXUncheckButton m_record;
    CWnd m_toggle;
    KVXColorWell m_well;
    KVXColorWell m_wellUndefined;
    KVXListBoxEx m_list;
    CWnd m_add;
    CWnd m_delete;
    CWnd m_status;
    int m_nPlays = 0;
    int m_nEntries = 0;
};

GALLERY_PAGE(30, CSmallControlsPage);

BEGIN_MESSAGE_MAP(CSmallControlsPage, CGalleryPage)
    ON_COMMAND(IDC_PLAY, &CSmallControlsPage::OnPlay)
    ON_COMMAND(IDC_BOLD, &CSmallControlsPage::OnBold)
    ON_COMMAND(IDC_RECORD, &CSmallControlsPage::OnRecord)
    ON_BN_CLICKED(IDC_SHOW_VALUE, &CSmallControlsPage::OnShowValue)
    ON_BN_CLICKED(IDC_ADD, &CSmallControlsPage::OnAddEntry)
    ON_BN_CLICKED(IDC_DELETE, &CSmallControlsPage::OnDeleteEntry)
    ON_BN_CLICKED(IDC_TOGGLE, &CSmallControlsPage::OnToggleEnabled)
    ON_MESSAGE(WM_KVX_COLORWELLCHANGED, &CSmallControlsPage::OnColorChanged)
END_MESSAGE_MAP()

void CSmallControlsPage::AddLabel(CWnd& label, LPCTSTR text, const CRect& rc)
{
    label.Create(_T("STATIC"), text, WS_CHILD | WS_VISIBLE, rc, this, 0xFFFF);
    label.SetFont(GuiFont());
}

void CSmallControlsPage::AddButton(CWnd& button, LPCTSTR text, const CRect& rc, UINT nID)
{
    button.Create(_T("BUTTON"), text, WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_PUSHBUTTON, rc, this, nID);
    button.SetFont(GuiFont());
}

void CSmallControlsPage::Status(LPCTSTR text)
{
    m_status.SetWindowText(text);
}

void CSmallControlsPage::CreateControls()
{
    CRect rc;
    GetClientRect(&rc);

    // String edit: 20 characters at most; \n, \t and \\ are translated when read.
    AddLabel(m_labels[0], _T("String edit (at most 20 characters; try a\\tb or x\\ny):"), CRect(12, 12, 420, 30));
    m_string.SetCharacterCount(20);
    m_string.Create(WS_CHILD | WS_VISIBLE | WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL, CRect(12, 32, 232, 53), this,
                    IDC_STRING);
    m_string.SetFont(GuiFont());
    m_string.SetValue(KVXString(_T("Tab\\there")), TRUE);
    AddButton(m_showValue, _T("Read value"), CRect(242, 31, 342, 55), IDC_SHOW_VALUE);
    m_value.Create(_T("STATIC"), _T(""), WS_CHILD | WS_VISIBLE | SS_NOPREFIX, CRect(352, 35, rc.right - 12, 53), this,
                   IDC_VALUE);
    m_value.SetFont(GuiFont());

    // Bitmap buttons: statics with SS_NOTIFY carrying the gallery's bitmaps.
    AddLabel(m_labels[1], _T("Bitmap buttons: push, check, momentary (hold it):"), CRect(12, 70, 420, 88));
    const DWORD buttonStyle = WS_CHILD | WS_VISIBLE | SS_NOTIFY;
    m_play.SetBitmaps(IDB_SMALL_PLAY_NORMAL, IDB_SMALL_PLAY_PRESSED, IDB_SMALL_PLAY_DISABLED, RGB(255, 0, 255));
    m_play.Create(_T(""), buttonStyle, CRect(12, 92, 40, 120), this, IDC_PLAY);
    m_bold.SetBitmaps(IDB_SMALL_BOLD_NORMAL, IDB_SMALL_BOLD_PRESSED, IDB_SMALL_BOLD_DISABLED, RGB(255, 0, 255));
    m_bold.Create(_T(""), buttonStyle, CRect(46, 92, 74, 120), this, IDC_BOLD);
    m_record.SetBitmaps(IDB_SMALL_RECORD_NORMAL, IDB_SMALL_RECORD_PRESSED, IDB_SMALL_RECORD_DISABLED,
                        RGB(255, 0, 255));
    m_record.Create(_T(""), buttonStyle, CRect(80, 92, 108, 120), this, IDC_RECORD);
    AddButton(m_toggle, _T("Enable / disable"), CRect(120, 94, 240, 118), IDC_TOGGLE);

    // Colour wells: a defined colour and an undefined one (cross-hatched).
    AddLabel(m_labels[2], _T("Colour wells (the second one is undefined):"), CRect(12, 136, 420, 154));
    m_well.Create(_T(""), WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_OWNERDRAW, CRect(12, 158, 92, 182), this, IDC_WELL);
    m_well.SetColor(RGB(0, 0, 255));
    m_wellUndefined.Create(_T(""), WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_OWNERDRAW, CRect(102, 158, 182, 182), this,
                           IDC_WELL_UNDEFINED);
    m_wellUndefined.SetButtonGapHorizontal(2);
    m_wellUndefined.SetButtonGapVertical(2);
    m_wellUndefined.SetBorderWidth(3);
    m_wellUndefined.SetColorUndefined(TRUE);

    // List box: the horizontal scroll bar reaches the end of the longest entry.
    AddLabel(m_labels[3], _T("List box with horizontal extent:"), CRect(12, 198, 420, 216));
    m_list.CreateEx(WS_EX_CLIENTEDGE, _T("LISTBOX"), nullptr,
                    WS_CHILD | WS_VISIBLE | WS_TABSTOP | WS_VSCROLL | WS_HSCROLL | LBS_NOINTEGRALHEIGHT | LBS_NOTIFY,
                    CRect(12, 220, 332, 330), this, IDC_LIST);
    m_list.SetFont(GuiFont());
    m_list.AddString(_T("Short entry"));
    m_list.AddString(_T("A considerably longer entry that does not fit into the list box at all, so scroll"));
    m_list.AddString(_T("Medium length entry, still readable"));
    AddButton(m_add, _T("Add longer"), CRect(342, 220, 442, 244), IDC_ADD);
    AddButton(m_delete, _T("Delete first"), CRect(342, 250, 442, 274), IDC_DELETE);

    m_status.Create(_T("STATIC"), _T("Notifications appear here."), WS_CHILD | WS_VISIBLE | SS_NOPREFIX,
                    CRect(12, 344, rc.right - 12, 362), this, IDC_STATUS);
    m_status.SetFont(GuiFont());
}

void CSmallControlsPage::OnPlay()
{
    CString text;
    text.Format(_T("Push button pressed (%d)"), ++m_nPlays);
    Status(text);
}

void CSmallControlsPage::OnBold()
{
    Status(m_bold.GetCheck() ? _T("Check button: on") : _T("Check button: off"));
}

void CSmallControlsPage::OnRecord()
{
    Status(m_record.IsPressed() ? _T("Momentary button: held") : _T("Momentary button: released"));
}

void CSmallControlsPage::OnShowValue()
{
    // Control characters shown as symbols, so the translation can be seen.
    CString value = m_string.GetValue(FALSE);
    value.Replace(_T("\n"), _T("<LF>"));
    value.Replace(_T("\t"), _T("<TAB>"));
    m_value.SetWindowText(value);
}

void CSmallControlsPage::OnAddEntry()
{
    CString entry;
    entry.Format(_T("Added entry %d, made longer than the one before it by some words"), ++m_nEntries);
    for (int i = 0; i < m_nEntries; ++i)
        entry += _T(" and more");
    m_list.AddString(entry);
}

void CSmallControlsPage::OnDeleteEntry()
{
    if (m_list.GetCount() > 0)
        m_list.DeleteString(0);
}

void CSmallControlsPage::OnToggleEnabled()
{
    const BOOL bEnable = !m_play.IsWindowEnabled();
    m_play.EnableWindow(bEnable);
    m_bold.EnableWindow(bEnable);
    m_record.EnableWindow(bEnable);
    m_well.EnableWindow(bEnable);
}

LRESULT CSmallControlsPage::OnColorChanged(WPARAM wParam, LPARAM lParam)
{
    const KVXColorWellNotify* pNotify = reinterpret_cast<const KVXColorWellNotify*>(lParam);
    if (pNotify == NULL)
        return 0;
    CString text;
    text.Format(_T("Colour well %u: RGB(%u, %u, %u)"), static_cast<UINT>(wParam), GetRValue(pNotify->clrColor),
                GetGValue(pNotify->clrColor), GetBValue(pNotify->clrColor));
    Status(text);
    return 0;
}
