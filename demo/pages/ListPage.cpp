// List page: five thousand files in an extended list. A click on a column header sorts
// by that column with its own rule (names without case, sizes as numbers, dates, times
// of day counted from 6:00 AM, flags by their image; the comment column does not sort),
// a second click reverses the order, and the header shows the sort with its indicator.
// Dragging a header moves its column; the page keeps the column types and the sort
// with the column. The line below the list shows what GetSortInfo reports.
// The list draws itself: the switch above it picks the highlight (label, all columns,
// whole row); rows marked invalid (state bit 0x0010) show in red; the page shortens long
// folder paths through the abbreviate callback; the check boxes are state images that
// a click on them toggles; a cut-off cell shows its whole text in a title tip. In
// screenshot mode the pointer rests on a shortened folder so that the picture has its
// tip, and one more picture is taken per highlight type.
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

// The columns leave room on the right, where only the whole-row highlight reaches.
const ColumnSpec kColumns[] = {
    { _T("Name"), LVCFMT_LEFT, 160, 1 },
    { _T("Size"), LVCFMT_RIGHT, 70, 2 },
    { _T("Modified"), LVCFMT_LEFT, 80, 3 },
    { _T("Time"), LVCFMT_LEFT, 70, 6 },
    { _T("Type"), LVCFMT_LEFT, 100, 0 },
    { _T("Folder"), LVCFMT_LEFT, 150, 1 },
    { _T("Comment"), LVCFMT_LEFT, 90, 4 },
    { _T("Flag"), LVCFMT_LEFT, 40, 7 },
};
const int kColumnCount = sizeof kColumns / sizeof kColumns[0];
const int kRows = 5000;
const int kFolderColumn = 5;
const int kFlagColumn = 7;
// Every this many rows one is marked invalid.
const int kInvalidEvery = 13;
// In screenshot mode the pointer rests on the first long folder from this row in view on.
const int kScreenshotRow = 4;

const COLORREF kFlagColors[] = { RGB(200, 40, 40), RGB(240, 160, 20), RGB(40, 160, 60), RGB(50, 90, 200) };
const int kFlagCount = sizeof kFlagColors / sizeof kFlagColors[0];

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
        EnableHeaderDrag(true);
        m_ctlHeader.SetCallback(this, static_cast<void (CWnd::*)(int, int)>(&CFileList::OnColumnDragged));
    }

    // The title tip hides itself when the pointer leaves the cell; a page that is hidden
    // while the pointer rests takes it away.
    void HideTitleTip()
    {
        if (m_ctlTitleTip.GetSafeHwnd() != NULL && m_ctlTitleTip.IsWindowVisible())
        {
            ::ReleaseCapture();
            m_ctlTitleTip.ShowWindow(SW_HIDE);
        }
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
    int GetScreenshotVariantCount() const override { return kHighlightTypes; }
    CString ShowScreenshotVariant(int nVariant) override;

protected:
    afx_msg LRESULT OnSorted(WPARAM wParam, LPARAM lParam);
    afx_msg void OnHighlightType(UINT nID);
    afx_msg void OnWindowPosChanged(WINDOWPOS* lpwndpos);
    afx_msg LRESULT OnRestOnFolder(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    enum { IDC_LIST = 500, IDC_SORTINFO, IDC_HIGHLIGHT_LABEL, IDC_HIGHLIGHT_FIRST };
    static const int kHighlightTypes = 3;
    static const UINT kRestOnFolderMessage = WM_APP + 21;

    // The list's abbreviate callback: a text longer than nMaxLength that is a path keeps
    // its first nKeepFirst parts and as many of its last parts as fit, "..." between.
    CString AbbreviatePath(CString strText, int nMaxLength, int nKeepFirst);
    void CreateFlagImages();
    void Fill();

    CWnd m_label;
    CWnd m_highlightLabel;
    CButton m_highlight[kHighlightTypes];
    CFileList m_list;
    CWnd m_sortInfo;
    CImageList m_flags;
    CImageList m_checks;
};

GALLERY_PAGE(20, CListPage);

BEGIN_MESSAGE_MAP(CListPage, CGalleryPage)
    ON_MESSAGE(CFileList::kSortedMessage, &CListPage::OnSorted)
    ON_CONTROL_RANGE(BN_CLICKED, IDC_HIGHLIGHT_FIRST, IDC_HIGHLIGHT_FIRST + kHighlightTypes - 1,
                     &CListPage::OnHighlightType)
    ON_WM_WINDOWPOSCHANGED()
    ON_MESSAGE(kRestOnFolderMessage, &CListPage::OnRestOnFolder)
END_MESSAGE_MAP()

void CListPage::CreateControls()
{
    CRect rc;
    GetClientRect(&rc);
    m_label.Create(_T("STATIC"),
        _T("Click a header to sort by its column, again to reverse; drag a header to move its column. ")
        _T("Times count from 6:00 AM; comments do not sort. Rows in red are marked invalid; long ")
        _T("folders are shortened, and resting the pointer on a cut-off cell shows its whole text."),
        WS_CHILD | WS_VISIBLE, CRect(12, 8, rc.right - 12, 38), this, 0xFFFF);
    m_label.SetFont(GuiFont());

    m_highlightLabel.Create(_T("STATIC"), _T("Highlight:"), WS_CHILD | WS_VISIBLE, CRect(12, 44, 70, 60), this,
                            IDC_HIGHLIGHT_LABEL);
    m_highlightLabel.SetFont(GuiFont());
    const LPCTSTR kHighlightNames[kHighlightTypes] = { _T("Label"), _T("All columns"), _T("Whole row") };
    for (int i = 0; i < kHighlightTypes; ++i)
    {
        m_highlight[i].Create(kHighlightNames[i], WS_CHILD | WS_VISIBLE | BS_AUTORADIOBUTTON | (i == 0 ? WS_GROUP : 0),
                              CRect(76 + 100 * i, 42, 170 + 100 * i, 62), this, IDC_HIGHLIGHT_FIRST + i);
        m_highlight[i].SetFont(GuiFont());
    }

    // Owner-drawn from the start, so that the label highlight draws as the others do.
    m_list.CreateEx(WS_EX_CLIENTEDGE,
        WS_CHILD | WS_VISIBLE | WS_TABSTOP | LVS_REPORT | LVS_SHOWSELALWAYS | LVS_OWNERDRAWFIXED,
        CRect(12, 68, rc.right - 12, rc.bottom - 34), this, IDC_LIST);
    m_list.SetFont(GuiFont());
    m_list.SetExtendedStyle(LVS_EX_FULLROWSELECT | LVS_EX_SUBITEMIMAGES);
    CreateFlagImages();
    CreateCheckBoxImages(m_checks, this);
    m_list.SetImageList(&m_flags, LVSIL_SMALL);
    m_list.SetImageList(&m_checks, LVSIL_STATE);
    m_list.SetAbbreviateName(static_cast<CString (CWnd::*)(CString, int, int)>(&CListPage::AbbreviatePath));
    m_list.EnableTitleTip(true);
    m_highlight[1].SetCheck(BST_CHECKED);
    m_list.SetHighlightType(1);

    m_sortInfo.Create(_T("STATIC"), _T(""), WS_CHILD | WS_VISIBLE, CRect(12, rc.bottom - 26, rc.right - 12, rc.bottom - 8),
        this, IDC_SORTINFO);
    m_sortInfo.SetFont(GuiFont());

    std::vector<unsigned char> types;
    for (int c = 0; c < kColumnCount; ++c)
    {
        m_list.InsertColumn(c, kColumns[c].title, kColumns[c].format, kColumns[c].width, c);
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

CString CListPage::AbbreviatePath(CString strText, int nMaxLength, int nKeepFirst)
{
    if (strText.GetLength() <= nMaxLength || strText.Find(_T('\\')) < 0)
        return strText;
    CStringArray parts;
    for (int nStart = 0;;)
    {
        const int nEnd = strText.Find(_T('\\'), nStart);
        parts.Add(strText.Mid(nStart, nEnd < 0 ? strText.GetLength() - nStart : nEnd - nStart));
        if (nEnd < 0)
            break;
        nStart = nEnd + 1;
    }
    CString strHead;
    for (int i = 0; i < nKeepFirst && i < parts.GetSize(); ++i)
        strHead += parts[i] + _T("\\");
    strHead += _T("...");
    // The last part always stays, even when it alone is longer than the limit.
    CString strTail = _T("\\") + parts[parts.GetSize() - 1];
    for (INT_PTR i = parts.GetSize() - 2; i >= nKeepFirst; --i)
    {
        const CString strLonger = _T("\\") + parts[i] + strTail;
        if (strHead.GetLength() + strLonger.GetLength() > nMaxLength)
            break;
        strTail = strLonger;
    }
    return strHead + strTail;
}

void CListPage::Fill()
{
    static const LPCTSTR kWords[] = { _T("Report"), _T("invoice"), _T("Budget"), _T("holiday"), _T("Letter"),
        _T("minutes"), _T("Summary"), _T("scan"), _T("Notes"), _T("contract"), _T("Backup"), _T("photo") };
    struct FileType { LPCTSTR extension; LPCTSTR name; };
    static const FileType kTypes[] = { { _T("pdf"), _T("PDF document") }, { _T("txt"), _T("Text file") },
        { _T("png"), _T("PNG image") }, { _T("csv"), _T("CSV spreadsheet") }, { _T("docx"), _T("Word document") } };
    static const LPCTSTR kComments[] = { _T(""), _T("checked"), _T("to review"), _T(""), _T("sent to Ben"),
        _T("draft"), _T("waiting for the signed copy"), _T("") };
    static const LPCTSTR kFolders[] = { _T("Documents"), _T("Projects"), _T("Archive 2023"), _T("Customers"),
        _T("Shared with the accounting team"), _T("Scans"), _T("Quarterly reports"), _T("Drafts") };

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
        text = _T("C:\\Users\\Public");
        for (unsigned nDepth = 1 + next() % 4; nDepth > 0; --nDepth)
            text += CString(_T("\\")) + kFolders[next() % 8];
        m_list.SetItemText(r, kFolderColumn, text);
        m_list.SetItemText(r, 6, kComments[next() % 8]);
        const int nFlag = static_cast<int>(next() % kFlagCount);
        m_list.SetItem(r, kFlagColumn, LVIF_IMAGE, NULL, nFlag, 0, 0, 0);
        m_list.SetFlag(r, nFlag);
        const UINT nState = INDEXTOSTATEIMAGEMASK(next() % 3 == 0 ? 2 : 1) | (r % kInvalidEvery == 5 ? LVIS_GLOW : 0);
        m_list.SetItemState(r, nState, LVIS_STATEIMAGEMASK | LVIS_GLOW);
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

void CListPage::OnHighlightType(UINT nID)
{
    m_list.SetHighlightType(static_cast<int>(nID - IDC_HIGHLIGHT_FIRST));
}

CString CListPage::ShowScreenshotVariant(int nVariant)
{
    for (int i = 0; i < kHighlightTypes; ++i)
        m_highlight[i].SetCheck(i == nVariant ? BST_CHECKED : BST_UNCHECKED);
    m_list.SetHighlightType(nVariant);
    CString strSuffix;
    strSuffix.Format(_T("type%d"), nVariant);
    return strSuffix;
}

void CListPage::OnWindowPosChanged(WINDOWPOS* lpwndpos)
{
    // The gallery shows its pages with SetWindowPos, which sends no WM_SHOWWINDOW.
    CGalleryPage::OnWindowPosChanged(lpwndpos);
    if (lpwndpos->flags & SWP_HIDEWINDOW)
        m_list.HideTitleTip();
    else if ((lpwndpos->flags & SWP_SHOWWINDOW) && InScreenshotMode())
        PostMessage(kRestOnFolderMessage);
}

LRESULT CListPage::OnRestOnFolder(WPARAM, LPARAM)
{
    // As if the user selected a row and rested the pointer on a shortened folder: the
    // system sends the list the move, and the tip shows the whole path.
    m_list.SetFocus();
    int nItem = m_list.GetTopIndex() + kScreenshotRow;
    while (nItem + 1 < m_list.GetItemCount() && m_list.GetItemText(nItem, kFolderColumn).GetLength() <= 40)
        ++nItem;
    m_list.SetItemState(nItem, LVIS_SELECTED | LVIS_FOCUSED, LVIS_SELECTED | LVIS_FOCUSED);
    CRect rc;
    m_list.GetSubItemRect(nItem, kFolderColumn, LVIR_BOUNDS, rc);
    m_list.ClientToScreen(&rc);
    ::SetCursorPos(rc.left + 30, rc.CenterPoint().y);
    return 0;
}
