// List page: five thousand files in an extended list. A click on a column header sorts
// by that column with its own rule (names without case, sizes as numbers, dates, times
// of day counted from 6:00 AM, flags by their image; the comment column does not sort),
// a second click reverses the order, and the header shows the sort with its indicator.
// Dragging a header moves its column; the page keeps the column types and the sort
// with the column. The line below the list shows what GetSortInfo reports.
#include "GalleryPage.h"

#include <afxcmn.h>
#include <afxdisp.h>

#include "KVXListCtrlEx.h"

#include <algorithm>
#include <vector>

namespace {

struct ColumnSpec
{
    LPCTSTR title;
    int format;
    int width;
    unsigned char type;
};

const ColumnSpec kColumns[] = {
    { _T("Name"), LVCFMT_LEFT, 170, 1 },
    { _T("Size"), LVCFMT_RIGHT, 80, 2 },
    { _T("Modified"), LVCFMT_LEFT, 90, 3 },
    { _T("Time"), LVCFMT_LEFT, 80, 6 },
    { _T("Type"), LVCFMT_LEFT, 120, 0 },
    { _T("Comment"), LVCFMT_LEFT, 130, 4 },
    { _T("Flag"), LVCFMT_LEFT, 50, 7 },
};
const int kColumnCount = sizeof kColumns / sizeof kColumns[0];
const int kRows = 5000;
const int kFlagColumn = 6;
const COLORREF kFlagColors[] = { RGB(200, 40, 40), RGB(240, 160, 20), RGB(40, 160, 60), RGB(50, 90, 200) };
const int kFlagCount = sizeof kFlagColors / sizeof kFlagColors[0];

CFont* GuiFont()
{
    return CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT)));
}

} // namespace

// The page's list tells the page after every sort, and moves columns through the
// page so that the column types and the sort go with them.
class CFileList : public KVXListCtrlEx
{
public:
    CFileList() : m_pOwnerPage(NULL) {}

    void Setup(CWnd* pOwnerPage, const std::vector<unsigned char>& types)
    {
        m_pOwnerPage = pOwnerPage;
        m_types = types;
        SetColumnTypes(m_types.data(), static_cast<unsigned int>(m_types.size()));
        m_ctlHeader.EnableDrag(true);
        m_ctlHeader.SetCallback(this, static_cast<void (CWnd::*)(int, int)>(&CFileList::OnColumnDragged));
    }

    void PostSort() override
    {
        if (m_pOwnerPage != NULL && m_pOwnerPage->m_hWnd != NULL)
            m_pOwnerPage->SendMessage(kSortedMessage);
    }

    void SetFlag(int nItem, int nFlag)
    {
        if (nItem >= static_cast<int>(m_flags.size()))
            m_flags.resize(static_cast<size_t>(nItem) + 1);
        m_flags[nItem] = nFlag;
    }

    static const UINT kSortedMessage = WM_APP + 20;

private:
    void OnColumnDragged(int nSource, int nTarget)
    {
        // Where every old column goes: the moved one before nTarget, the rest close up.
        const int nNewPlace = nTarget > nSource ? nTarget - 1 : nTarget;
        std::vector<int> order(m_types.size());
        for (size_t i = 0; i < order.size(); ++i)
            order[i] = static_cast<int>(i);
        order.erase(order.begin() + nSource);
        order.insert(order.begin() + nNewPlace, nSource);

        DragColumn(nSource, nTarget);

        std::vector<unsigned char> types(m_types.size());
        for (size_t i = 0; i < order.size(); ++i)
            types[i] = m_types[order[i]];
        m_types = types;
        SetColumnTypes(m_types.data(), static_cast<unsigned int>(m_types.size()));
        // A column move carries the texts only: the flags go back from the row's data.
        const int nFlagColumn = static_cast<int>(std::find(m_types.begin(), m_types.end(), kImageType) - m_types.begin());
        if (nFlagColumn < static_cast<int>(m_types.size()))
            ShowFlags(nFlagColumn);

        // The sort state stays with the position; follow the sorted column instead.
        int nColumn;
        bool bAscending;
        if (GetSortInfo(nColumn, bAscending))
        {
            const int nMoved = static_cast<int>(std::find(order.begin(), order.end(), nColumn) - order.begin());
            if (nMoved != nColumn)
                SortList(nMoved, bAscending);
        }
    }

    void ShowFlags(int nColumn)
    {
        SetRedraw(FALSE);
        for (int i = 0; i < GetItemCount(); ++i)
        {
            const DWORD_PTR nRow = GetItemData(i);
            if (nRow < m_flags.size())
                SetItem(i, nColumn, LVIF_IMAGE, NULL, m_flags[nRow], 0, 0, 0);
        }
        SetRedraw(TRUE);
        Invalidate();
    }

    static const unsigned char kImageType = 7;
    CWnd* m_pOwnerPage;
    std::vector<unsigned char> m_types;
    std::vector<int> m_flags;     // by row number (the item data)
};

class CListPage : public CGalleryPage
{
public:
    LPCTSTR GetTitle() const override { return _T("List"); }
    void CreateControls() override;

protected:
    afx_msg LRESULT OnSorted(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    enum { IDC_LIST = 500, IDC_SORTINFO };

    void CreateFlagImages();
    void Fill();

    CWnd m_label;
    CFileList m_list;
    CWnd m_sortInfo;
    CImageList m_flags;
};

GALLERY_PAGE(20, CListPage);

BEGIN_MESSAGE_MAP(CListPage, CGalleryPage)
    ON_MESSAGE(CFileList::kSortedMessage, &CListPage::OnSorted)
END_MESSAGE_MAP()

void CListPage::CreateControls()
{
    CRect rc;
    GetClientRect(&rc);
    m_label.Create(_T("STATIC"),
        _T("Click a header to sort by its column, again to reverse; drag a header to move its column. ")
        _T("Times count from 6:00 AM; comments do not sort."),
        WS_CHILD | WS_VISIBLE, CRect(12, 10, rc.right - 12, 28), this, 0xFFFF);
    m_label.SetFont(GuiFont());

    m_list.CreateEx(WS_EX_CLIENTEDGE, WS_CHILD | WS_VISIBLE | WS_TABSTOP | LVS_REPORT | LVS_SHOWSELALWAYS,
        CRect(12, 32, rc.right - 12, rc.bottom - 34), this, IDC_LIST);
    m_list.SetFont(GuiFont());
    m_list.SetExtendedStyle(LVS_EX_FULLROWSELECT | LVS_EX_SUBITEMIMAGES);
    CreateFlagImages();
    m_list.SetImageList(&m_flags, LVSIL_SMALL);

    m_sortInfo.Create(_T("STATIC"), _T(""), WS_CHILD | WS_VISIBLE, CRect(12, rc.bottom - 26, rc.right - 12, rc.bottom - 8),
        this, IDC_SORTINFO);
    m_sortInfo.SetFont(GuiFont());

    std::vector<unsigned char> types;
    for (int c = 0; c < kColumnCount; ++c)
    {
        m_list.InsertColumn(c, kColumns[c].title, kColumns[c].format, kColumns[c].width);
        types.push_back(kColumns[c].type);
    }
    m_list.Setup(this, types);
    m_list.SetBaseTime(_T("6:00 AM"));
    Fill();
    m_list.EnableSort(true);
    m_list.SortList(2, false);
}

void CListPage::CreateFlagImages()
{
    // One round flag per priority, drawn here: 16 x 16 on a magenta mask.
    const COLORREF kMask = RGB(255, 0, 255);
    m_flags.Create(16, 16, ILC_COLOR24 | ILC_MASK, kFlagCount, 0);
    CClientDC screen(this);
    for (int i = 0; i < kFlagCount; ++i)
    {
        CDC dc;
        dc.CreateCompatibleDC(&screen);
        CBitmap bitmap;
        bitmap.CreateCompatibleBitmap(&screen, 16, 16);
        CBitmap* pOldBitmap = dc.SelectObject(&bitmap);
        dc.FillSolidRect(0, 0, 16, 16, kMask);
        CBrush brush(kFlagColors[i]);
        CPen pen(PS_SOLID, 1, RGB(60, 60, 60));
        CBrush* pOldBrush = dc.SelectObject(&brush);
        CPen* pOldPen = dc.SelectObject(&pen);
        dc.Ellipse(2, 2, 14, 14);
        dc.SelectObject(pOldPen);
        dc.SelectObject(pOldBrush);
        dc.SelectObject(pOldBitmap);
        m_flags.Add(&bitmap, kMask);
    }
}

void CListPage::Fill()
{
    static const LPCTSTR kWords[] = { _T("Report"), _T("invoice"), _T("Budget"), _T("holiday"), _T("Letter"),
        _T("minutes"), _T("Summary"), _T("scan"), _T("Notes"), _T("contract"), _T("Backup"), _T("photo") };
    struct FileType { LPCTSTR extension; LPCTSTR name; };
    static const FileType kTypes[] = { { _T("pdf"), _T("PDF document") }, { _T("txt"), _T("Text file") },
        { _T("png"), _T("PNG image") }, { _T("csv"), _T("CSV spreadsheet") }, { _T("docx"), _T("Word document") } };
    static const LPCTSTR kComments[] = { _T(""), _T("checked"), _T("to review"), _T(""), _T("sent to Ben"),
        _T("draft"), _T("") };

    // Filled with redraw off: a visible list repaints after every insertion.
    m_list.SetRedraw(FALSE);
    unsigned state = 4711u;
    auto next = [&state]() { state = state * 1664525u + 1013904223u; return state >> 8; };
    for (int r = 0; r < kRows; ++r)
    {
        const FileType& type = kTypes[next() % 5];
        CString text;
        text.Format(_T("%s %04u.%s"), kWords[next() % 12], next() % 10000, type.extension);
        m_list.InsertItem(LVIF_TEXT | LVIF_IMAGE | LVIF_PARAM, r, text, 0, 0, I_IMAGENONE, r);
        text.Format(_T("%u"), next() % 50000000u);
        m_list.SetItemText(r, 1, text);
        // A day within the last three years, a time of day to the minute.
        m_list.SetItemText(r, 2, COleDateTime(44197.0 + next() % 1095).Format(VAR_DATEVALUEONLY));
        m_list.SetItemText(r, 3, COleDateTime((next() % 1440) / 1440.0).Format(VAR_TIMEVALUEONLY));
        m_list.SetItemText(r, 4, type.name);
        m_list.SetItemText(r, 5, kComments[next() % 7]);
        const int nFlag = static_cast<int>(next() % kFlagCount);
        m_list.SetItem(r, kFlagColumn, LVIF_IMAGE, NULL, nFlag, 0, 0, 0);
        m_list.SetFlag(r, nFlag);
    }
    m_list.SetRedraw(TRUE);
    m_list.Invalidate();
}

LRESULT CListPage::OnSorted(WPARAM, LPARAM)
{
    if (m_sortInfo.m_hWnd == NULL)
        return 0;
    int nColumn = -1;
    bool bAscending = true;
    CString text;
    if (m_list.GetSortInfo(nColumn, bAscending))
    {
        TCHAR title[64] = {};
        LVCOLUMN column = {};
        column.mask = LVCF_TEXT;
        column.pszText = title;
        column.cchTextMax = 64;
        m_list.GetColumn(nColumn, &column);
        text.Format(_T("GetSortInfo: column %d (%s), %s.   %d rows."), nColumn, title,
            bAscending ? _T("ascending") : _T("descending"), m_list.GetItemCount());
    }
    else
    {
        text.Format(_T("GetSortInfo: not sorted.   %d rows."), m_list.GetItemCount());
    }
    m_sortInfo.SetWindowText(text);
    return 0;
}
