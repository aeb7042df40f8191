// Columns page: a parts catalogue in a column-customising list. Twenty columns are
// known, eight of them shown. Drag a header to another place to move its column, drag
// it into the column chooser (Customize) to hide it, and drag a strip from the chooser
// onto the header to show its column there again; the red marker shows where it will
// go. The list asks the page for the texts of every cell it shows (the fill callback),
// so a column shown again is filled at once. Save writes the column records to a file
// with KVXColumnInfo::Write, Load reads them back and rebuilds the list in that layout.
// In screenshot mode the chooser is open beside the list and the marker is drawn as
// during a drag, so that the picture has both.
#include "GalleryPage.h"

#include <afxcmn.h>
#include <afxole.h>

#include "KVXColumnInfo.h"
#include "KVXDragColumnListCtrl.h"
#include "KVXHeaderCtrlClipboardFormats.h"
#include "KVXHeaderCtrlDataSource.h"
#include "KVXHeaderCtrlDropTarget.h"
#include "KVXListCtrlPropFrame.h"

#include <algorithm>
#include <memory>
#include <vector>

namespace {

struct FieldSpec
{
    LPCTSTR title;
    int format;
    int width;
    unsigned char type;     // the column type code: how the column sorts
    bool shown;             // in the first layout
};

const FieldSpec kFields[] = {
    { _T("Part"), LVCFMT_LEFT, 70, 1, true },
    { _T("Name"), LVCFMT_LEFT, 120, 1, true },
    { _T("Category"), LVCFMT_LEFT, 80, 1, true },
    { _T("Supplier"), LVCFMT_LEFT, 90, 1, false },
    { _T("Price"), LVCFMT_RIGHT, 60, 5, true },
    { _T("Stock"), LVCFMT_RIGHT, 50, 2, true },
    { _T("Reorder at"), LVCFMT_RIGHT, 70, 2, false },
    { _T("Weight"), LVCFMT_RIGHT, 60, 5, false },
    { _T("Colour"), LVCFMT_LEFT, 60, 1, false },
    { _T("Material"), LVCFMT_LEFT, 70, 1, true },
    { _T("Length"), LVCFMT_RIGHT, 55, 2, false },
    { _T("Width"), LVCFMT_RIGHT, 55, 2, false },
    { _T("Height"), LVCFMT_RIGHT, 55, 2, false },
    { _T("Warehouse"), LVCFMT_LEFT, 80, 1, true },
    { _T("Shelf"), LVCFMT_LEFT, 50, 0, false },
    { _T("Added"), LVCFMT_LEFT, 80, 3, true },
    { _T("Last sold"), LVCFMT_LEFT, 80, 3, false },
    { _T("Rating"), LVCFMT_RIGHT, 50, 2, false },
    { _T("Barcode"), LVCFMT_LEFT, 100, 0, false },
    { _T("Notes"), LVCFMT_LEFT, 120, 4, false },
};
const int kFieldCount = sizeof kFields / sizeof kFields[0];
const int kRows = 400;

LPCTSTR const kNames[] = { _T("Bracket"), _T("Hinge"), _T("Bolt"), _T("Washer"), _T("Spring"), _T("Gasket"),
    _T("Bearing"), _T("Clamp"), _T("Pulley"), _T("Valve"), _T("Nozzle"), _T("Flange") };
LPCTSTR const kCategories[] = { _T("Fasteners"), _T("Fittings"), _T("Motion"), _T("Seals") };
LPCTSTR const kSuppliers[] = { _T("Arden & Co"), _T("Brightwell"), _T("Corvale"), _T("Dunmore"), _T("Eastbrook") };
LPCTSTR const kColours[] = { _T("Black"), _T("Grey"), _T("Silver"), _T("Blue"), _T("Red") };
LPCTSTR const kMaterials[] = { _T("Steel"), _T("Brass"), _T("Nylon"), _T("Aluminium"), _T("Rubber") };
LPCTSTR const kWarehouses[] = { _T("North"), _T("South"), _T("Harbour"), _T("Airport") };
LPCTSTR const kNotes[] = { _T(""), _T("Fragile"), _T("Heavy item"), _T(""), _T("Discontinued soon") };

template <size_t N>
LPCTSTR Pick(LPCTSTR const (&words)[N], int n)
{
    return words[static_cast<size_t>(n) % N];
}

// The catalogue: the text of one field of one row, made up from the row number.
CString CellText(int nRow, int nField)
{
    const int k = nRow * 7919 + 13;
    CString text;
    switch (nField)
    {
    case 0: text.Format(_T("P-%05d"), 10000 + nRow * 37); break;
    case 1: text.Format(_T("%s %d"), Pick(kNames, nRow), 10 + k % 90); break;
    case 2: text = Pick(kCategories, nRow / 3); break;
    case 3: text = Pick(kSuppliers, k / 7); break;
    case 4: text.Format(_T("%d.%02d"), 1 + k % 240, k % 100); break;
    case 5: text.Format(_T("%d"), k % 1200); break;
    case 6: text.Format(_T("%d"), 50 + (k / 11) % 200); break;
    case 7: text.Format(_T("%d.%d"), k % 20, k % 10); break;
    case 8: text = Pick(kColours, k / 13); break;
    case 9: text = Pick(kMaterials, k / 17); break;
    case 10: text.Format(_T("%d"), 10 + k % 400); break;
    case 11: text.Format(_T("%d"), 5 + k % 120); break;
    case 12: text.Format(_T("%d"), 2 + k % 80); break;
    case 13: text = Pick(kWarehouses, k / 19); break;
    case 14: text.Format(_T("%c%02d"), _T('A') + k % 8, k % 40); break;
    case 15: text.Format(_T("%d/%d/%d"), 1 + k % 12, 1 + k % 28, 2015 + k % 10); break;
    case 16: text.Format(_T("%d/%d/%d"), 1 + (k / 3) % 12, 1 + (k / 5) % 28, 2024 + k % 2); break;
    case 17: text.Format(_T("%d"), 1 + k % 5); break;
    case 18: text.Format(_T("40%010d"), k % 1000000000); break;
    case 19: text = Pick(kNotes, k / 23); break;
    }
    return text;
}

int FieldOf(const CString& title)
{
    for (int f = 0; f < kFieldCount; ++f)
        if (title == kFields[f].title)
            return f;
    return -1;
}

} // namespace

// The page's list: reaches its chooser, and in screenshot mode draws the insertion
// marker after every paint, as the drop target draws it during a drag.
class CCatalogueList : public KVXDragColumnListCtrl
{
public:
    void HideChooser()
    {
        if (m_pPropFrame != NULL && ::IsWindow(m_pPropFrame->GetSafeHwnd()))
            m_pPropFrame->ShowWindow(SW_HIDE);
    }

    CWnd* GetChooser() const
    {
        return m_pPropFrame != NULL && ::IsWindow(m_pPropFrame->GetSafeHwnd()) ? m_pPropFrame : NULL;
    }

    // Marks the insertion position at header point x as a drag of pColumn would.
    void ShowMarkerAt(int x, KVXColumnInfo* pColumn)
    {
        m_source.reset(new KVXHeaderCtrlDataSource);
        m_source->DelayRenderFileData(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem));
        m_source->SetData(*pColumn, false);
        m_nMarkerX = x;
        RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW | RDW_ALLCHILDREN);
    }

protected:
    afx_msg void OnPaint()
    {
        KVXListCtrlEx::OnPaint();
        if (m_source == nullptr || m_HeaderCtrl.GetSafeHwnd() == NULL)
            return;
        COleDataObject data;
        data.Attach(static_cast<LPDATAOBJECT>(m_source->GetInterface(&IID_IDataObject)), FALSE);
        CRect rectHeader;
        m_HeaderCtrl.GetClientRect(&rectHeader);
        m_marker.OnDragOver(&m_HeaderCtrl, &data, MK_LBUTTON, CPoint(m_nMarkerX, rectHeader.CenterPoint().y));
    }
    DECLARE_MESSAGE_MAP()

private:
    std::unique_ptr<KVXHeaderCtrlDataSource> m_source;
    KVXHeaderCtrlDropTarget m_marker;
    int m_nMarkerX = 0;
};

BEGIN_MESSAGE_MAP(CCatalogueList, KVXDragColumnListCtrl)
    ON_WM_PAINT()
END_MESSAGE_MAP()

class CColumnsPage : public CGalleryPage
{
public:
    LPCTSTR GetTitle() const override { return _T("Columns"); }
    void CreateControls() override;

protected:
    afx_msg void OnCustomize();
    afx_msg void OnSaveLayout();
    afx_msg void OnLoadLayout();
    afx_msg void OnWindowPosChanged(WINDOWPOS* lpwndpos);
    afx_msg LRESULT OnShowScreenshotState(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    enum { IDC_LIST = 600, IDC_CUSTOMIZE, IDC_SAVE, IDC_LOAD, IDC_STATUS };

    // The list's fill callback: the text of the record's field in the row of the item data.
    void FillCell(LVITEMW& item, KVXColumnInfo* pColumn);
    // A new list in the layout of the records: shown ones at their index, the others hidden.
    void BuildList(const std::vector<KVXColumnInfo*>& records);
    CString LayoutPath() const;
    void SetStatus(const CString& text);
    static const UINT kScreenshotStateMessage = WM_APP + 25;

    CWnd m_label;
    CButton m_customize;
    CButton m_save;
    CButton m_load;
    CWnd m_status;
    std::unique_ptr<CCatalogueList> m_pList;
};

GALLERY_PAGE(25, CColumnsPage);

BEGIN_MESSAGE_MAP(CColumnsPage, CGalleryPage)
    ON_BN_CLICKED(IDC_CUSTOMIZE, &CColumnsPage::OnCustomize)
    ON_BN_CLICKED(IDC_SAVE, &CColumnsPage::OnSaveLayout)
    ON_BN_CLICKED(IDC_LOAD, &CColumnsPage::OnLoadLayout)
    ON_WM_WINDOWPOSCHANGED()
    ON_MESSAGE(kScreenshotStateMessage, &CColumnsPage::OnShowScreenshotState)
END_MESSAGE_MAP()

void CColumnsPage::CreateControls()
{
    CRect rc;
    GetClientRect(&rc);
    m_label.Create(_T("STATIC"),
        _T("Drag a header to move its column, into the column chooser to hide it, and a strip from the ")
        _T("chooser onto the header to show it again; the red marker shows where it goes. Twenty columns ")
        _T("are known, eight shown. Save and Load keep the layout in a file."),
        WS_CHILD | WS_VISIBLE, CRect(12, 8, rc.right - 12, 38), this, 0xFFFF);
    m_label.SetFont(GuiFont());
    const struct { CButton* pButton; LPCTSTR text; UINT id; } buttons[] = {
        { &m_customize, _T("Customize..."), IDC_CUSTOMIZE },
        { &m_save, _T("Save layout"), IDC_SAVE },
        { &m_load, _T("Load layout"), IDC_LOAD },
    };
    for (int i = 0; i < 3; ++i)
    {
        buttons[i].pButton->Create(buttons[i].text, WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_PUSHBUTTON,
            CRect(12 + 100 * i, 42, 104 + 100 * i, 64), this, buttons[i].id);
        buttons[i].pButton->SetFont(GuiFont());
    }
    m_status.Create(_T("STATIC"), _T(""), WS_CHILD | WS_VISIBLE, CRect(320, 46, rc.right - 12, 62), this, IDC_STATUS);
    m_status.SetFont(GuiFont());

    std::vector<KVXColumnInfo*> records;
    int nShown = 0;
    for (const FieldSpec& field : kFields)
    {
        records.push_back(new KVXColumnInfo(field.shown ? nShown : -1, field.title, -1, field.width, field.format));
        records.back()->SetSortType(field.type);
        nShown += field.shown ? 1 : 0;
    }
    BuildList(records);
}

void CColumnsPage::BuildList(const std::vector<KVXColumnInfo*>& records)
{
    CRect rc;
    GetClientRect(&rc);
    m_pList.reset(new CCatalogueList);
    m_pList->CreateEx(WS_EX_CLIENTEDGE, WS_CHILD | WS_VISIBLE | WS_TABSTOP | LVS_REPORT | LVS_SHOWSELALWAYS,
        CRect(12, 70, rc.right - 12, rc.bottom - 12), this, IDC_LIST);
    m_pList->SetFont(GuiFont());
    m_pList->SetExtendedStyle(LVS_EX_FULLROWSELECT);
    m_pList->SetCallbackWindow(this);
    m_pList->SetFillItem(static_cast<void (CWnd::*)(LVITEMW&, KVXColumnInfo*)>(&CColumnsPage::FillCell));
    m_pList->GetPropPageData().m_strCaption = _T("Hidden columns");

    // Every record is known hidden first; the shown ones then go in by title, left to right.
    std::vector<KVXColumnInfo*> shown;
    for (KVXColumnInfo* pRecord : records)
    {
        if (pRecord->GetIndex() >= 0)
            shown.push_back(pRecord);
    }
    std::stable_sort(shown.begin(), shown.end(),
        [](const KVXColumnInfo* a, const KVXColumnInfo* b) { return a->GetIndex() < b->GetIndex(); });
    for (KVXColumnInfo* pRecord : records)
    {
        pRecord->SetIndex(-1);
        m_pList->AddColumn(pRecord);
    }
    for (size_t i = 0; i < shown.size(); ++i)
        m_pList->InsertColumn(shown[i]->GetTitle(), static_cast<int>(i));

    // Rows go in with the columns in place, so that the list fills them as they come.
    m_pList->SetRedraw(FALSE);
    for (int nRow = 0; nRow < kRows; ++nRow)
        m_pList->InsertItem(LVIF_TEXT | LVIF_PARAM, nRow, _T(""), 0, 0, 0, nRow);
    m_pList->SetRedraw(TRUE);
    // A click on a header sorts by its column; the header's arrow shows the sort.
    m_pList->EnableSort(true);
    m_pList->SortList(1, true);
}

void CColumnsPage::FillCell(LVITEMW& item, KVXColumnInfo* pColumn)
{
    const int nField = FieldOf(pColumn->GetTitle());
    if (nField < 0)
        return;
    item.mask |= LVIF_TEXT;
    item.pszText = KVXDragColumnListCtrl::AllocItemText(CellText(static_cast<int>(item.lParam), nField));
}

void CColumnsPage::OnCustomize()
{
    m_pList->Customize();
}

CString CColumnsPage::LayoutPath() const
{
    TCHAR szFolder[MAX_PATH] = {};
    ::GetTempPath(MAX_PATH, szFolder);
    return CString(szFolder) + _T("OrvaneGalleryColumns.layout");
}

void CColumnsPage::SetStatus(const CString& text)
{
    m_status.SetWindowText(text);
}

void CColumnsPage::OnSaveLayout()
{
    // One record after the other: the format has no count, the file ends after the last.
    CFile file;
    if (!file.Open(LayoutPath(), CFile::modeCreate | CFile::modeWrite))
    {
        SetStatus(_T("The layout file cannot be written."));
        return;
    }
    CList<KVXColumnInfo*, KVXColumnInfo*>& records = m_pList->GetColumnInfos();
    for (POSITION pos = records.GetHeadPosition(); pos != NULL;)
        records.GetNext(pos)->Write(&file);
    file.Close();
    SetStatus(_T("Saved to ") + LayoutPath());
}

void CColumnsPage::OnLoadLayout()
{
    CFile file;
    if (!file.Open(LayoutPath(), CFile::modeRead))
    {
        SetStatus(_T("No layout saved yet."));
        return;
    }
    // Only known titles count, each once: a column shown again keeps its hidden record
    // too, and the shown one is the one that counts.
    std::vector<KVXColumnInfo*> records;
    while (file.GetPosition() < file.GetLength())
    {
        std::unique_ptr<KVXColumnInfo> pRecord(new KVXColumnInfo);
        pRecord->Read(&file);
        if (FieldOf(pRecord->GetTitle()) < 0)
            continue;
        auto same = std::find_if(records.begin(), records.end(),
            [&](const KVXColumnInfo* p) { return p->GetTitle() == pRecord->GetTitle(); });
        if (same == records.end())
            records.push_back(pRecord.release());
        else if ((*same)->GetIndex() < 0)
            **same = *pRecord;
    }
    file.Close();
    // Columns the file does not know come back hidden.
    for (const FieldSpec& field : kFields)
    {
        if (std::none_of(records.begin(), records.end(), [&](const KVXColumnInfo* p) { return p->GetTitle() == field.title; }))
        {
            records.push_back(new KVXColumnInfo(-1, field.title, -1, field.width, field.format));
            records.back()->SetSortType(field.type);
        }
    }
    m_pList->DestroyWindow();
    BuildList(records);
    SetStatus(_T("Loaded from ") + LayoutPath());
}

void CColumnsPage::OnWindowPosChanged(WINDOWPOS* lpwndpos)
{
    // The gallery shows its pages with SetWindowPos, which sends no WM_SHOWWINDOW. The
    // chooser is a window of its own: it goes with the page.
    CGalleryPage::OnWindowPosChanged(lpwndpos);
    if ((lpwndpos->flags & SWP_HIDEWINDOW) && m_pList != nullptr)
        m_pList->HideChooser();
    else if ((lpwndpos->flags & SWP_SHOWWINDOW) && InScreenshotMode())
        PostMessage(kScreenshotStateMessage);
}

LRESULT CColumnsPage::OnShowScreenshotState(WPARAM, LPARAM)
{
    m_pList->Customize();
    CWnd* pChooser = m_pList->GetChooser();
    if (pChooser == NULL)
        return 0;
    // Beside the header, low over the list, where it hides none of the marker.
    CRect rectList, rectChooser;
    m_pList->GetWindowRect(&rectList);
    pChooser->GetWindowRect(&rectChooser);
    pChooser->SetWindowPos(NULL, rectList.right - rectChooser.Width() - 16, rectList.bottom - rectChooser.Height() - 16,
        0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
    // The marker between the second and the third column, for a drag of "Supplier".
    CList<KVXColumnInfo*, KVXColumnInfo*>& records = m_pList->GetColumnInfos();
    KVXColumnInfo* pDragged = NULL;
    int nX = 0;
    for (POSITION pos = records.GetHeadPosition(); pos != NULL;)
    {
        KVXColumnInfo* pRecord = records.GetNext(pos);
        if (pRecord->GetIndex() == 0 || pRecord->GetIndex() == 1)
            nX += pRecord->GetWidth();
        if (pRecord->GetTitle() == _T("Supplier"))
            pDragged = pRecord;
    }
    if (pDragged != NULL)
        m_pList->ShowMarkerAt(nX + 10, pDragged);
    return 0;
}
