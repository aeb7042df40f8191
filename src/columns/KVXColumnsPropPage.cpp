// KVXColumnsPropPage: the hidden columns as strips, drags from and onto them, help.
#include "KVXColumnsPropPage.h"

#include "ColumnDragSupport.h"
#include "KVXHeaderCtrlClipboardFormats.h"
#include "KVXHeaderCtrlDataSource.h"
#include "resource.h"

static_assert(KVXColumnsPropPage::IDD == IDD_COLUMNS_PAGE, "the page's template");

IMPLEMENT_DYNCREATE(KVXColumnsPropPage, CPropertyPage)

BEGIN_MESSAGE_MAP(KVXColumnsPropPage, CPropertyPage)
    ON_NOTIFY(LVN_BEGINDRAG, IDC_COLUMNS_LIST, &KVXColumnsPropPage::OnBegindragListColumns)
    ON_WM_CREATE()
    ON_WM_DRAWITEM()
    ON_WM_HELPINFO()
END_MESSAGE_MAP()

KVXColumnsPropPage::KVXColumnsPropPage()
    : CPropertyPage(IDD), m_pHelpTarget(NULL), m_pfnDisplayHelp(NULL), m_bDroppedOnSelf(false),
      m_bDragging(false), m_ColumnInfos(10)
{
}

KVXColumnsPropPage::~KVXColumnsPropPage()
{
    while (!m_ColumnInfos.IsEmpty())
        delete m_ColumnInfos.RemoveHead();
}

void KVXColumnsPropPage::SetDisplayHelp(CCmdTarget* pTarget, void (CCmdTarget::*pfn)(CString, UINT, HWND))
{
    m_pHelpTarget = pTarget;
    m_pfnDisplayHelp = pfn;
}

void KVXColumnsPropPage::DoDataExchange(CDataExchange* pDX)
{
    CPropertyPage::DoDataExchange(pDX);
    DDX_Control(pDX, IDC_COLUMNS_LIST, m_listColumns);
}

int KVXColumnsPropPage::OnCreate(LPCREATESTRUCT lpCreateStruct)
{
    if (CPropertyPage::OnCreate(lpCreateStruct) == -1)
        return -1;
    m_DropTarget.Register(this);
    return 0;
}

BOOL KVXColumnsPropPage::OnInitDialog()
{
    CPropertyPage::OnInitDialog();
    CRect rectList;
    m_listColumns.GetClientRect(&rectList);
    m_listColumns.InsertColumn(0, _T("Columnname"), LVCFMT_LEFT, rectList.Width(), -1);
    for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
    {
        KVXColumnInfo* pColumnInfo = m_ColumnInfos.GetNext(pos);
        if (pColumnInfo->GetIndex() == -1)
            InsertStrip(pColumnInfo);
    }
    return TRUE;
}

bool KVXColumnsPropPage::InsertStrip(KVXColumnInfo* pColumnInfo)
{
    // The list view sorts its items by title (LVS_SORTASCENDING, comparing as lstrcmp
    // does), but not every one does so while it is owner-drawn: the strip goes where
    // the sort puts it.
    const CString strTitle = pColumnInfo->GetTitle();
    int nItem = 0;
    while (nItem < m_listColumns.GetItemCount() && lstrcmp(m_listColumns.GetItemText(nItem, 0), strTitle) <= 0)
        ++nItem;
    return m_listColumns.InsertItem(LVIF_TEXT | LVIF_PARAM, nItem, strTitle, 0, 0, 0,
        reinterpret_cast<LPARAM>(pColumnInfo)) != -1;
}

void KVXColumnsPropPage::AddColumn(KVXColumnInfo& columnInfo)
{
    // Dropped back on the page it came from: the strip is still here.
    if (m_bDragging)
    {
        m_bDroppedOnSelf = true;
        return;
    }
    KVXColumnInfo* pColumnInfo = new KVXColumnInfo;
    *pColumnInfo = columnInfo;
    m_ColumnInfos.AddTail(pColumnInfo);
    // Before the page has a window OnInitDialog shows the record; a strip the list
    // view refuses is not kept as an invisible record.
    if (::IsWindow(m_listColumns.m_hWnd) && !InsertStrip(pColumnInfo))
    {
        m_ColumnInfos.RemoveTail();
        delete pColumnInfo;
    }
}

void KVXColumnsPropPage::OnDrawItem(int nIDCtl, LPDRAWITEMSTRUCT lpDrawItemStruct)
{
    const KVXColumnInfo* pColumnInfo = reinterpret_cast<const KVXColumnInfo*>(lpDrawItemStruct->itemData);
    if (lpDrawItemStruct->CtlType != ODT_LISTVIEW || lpDrawItemStruct->CtlID != IDC_COLUMNS_LIST
        || lpDrawItemStruct->itemID == static_cast<UINT>(-1) || pColumnInfo == NULL
        || m_ColumnInfos.Find(const_cast<KVXColumnInfo*>(pColumnInfo)) == NULL)
    {
        CPropertyPage::OnDrawItem(nIDCtl, lpDrawItemStruct);
        return;
    }
    // The strip is as wide as the column would be, whatever the list view's width;
    // selection and focus are not shown.
    CRect rectStrip = lpDrawItemStruct->rcItem;
    rectStrip.right = rectStrip.left + pColumnInfo->GetWidth();
    ::DrawFrameControl(lpDrawItemStruct->hDC, &rectStrip, DFC_BUTTON, DFCS_BUTTONPUSH);
    const CString strTitle = pColumnInfo->GetTitle();
    ::DrawText(lpDrawItemStruct->hDC, strTitle, strTitle.GetLength(), &rectStrip, DT_CENTER);
}

BOOL KVXColumnsPropPage::OnHelpInfo(HELPINFO* pHelpInfo)
{
    if (m_pHelpTarget != NULL && m_pfnDisplayHelp != NULL)
        (m_pHelpTarget->*m_pfnDisplayHelp)(CString(), IDD, m_hWnd);
    return CPropertyPage::OnHelpInfo(pHelpInfo);
}

void KVXColumnsPropPage::OnBegindragListColumns(NMHDR* pNMHDR, LRESULT* pResult)
{
    *pResult = 0;
    const NMLISTVIEW* pNMListView = reinterpret_cast<const NMLISTVIEW*>(pNMHDR);
    KVXColumnInfo* pColumnInfo = pNMListView->iItem >= 0
        ? reinterpret_cast<KVXColumnInfo*>(m_listColumns.GetItemData(pNMListView->iItem)) : NULL;
    // Only a press on the drawn strip takes it.
    if (pColumnInfo == NULL || m_ColumnInfos.Find(pColumnInfo) == NULL
        || pNMListView->ptAction.x >= pColumnInfo->GetWidth())
        return;

    KVXHeaderCtrlDataSource source;
    source.DelayRenderFileData(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem));
    // A column coming from the chooser is never the sorted column.
    source.SetData(*pColumnInfo, false);

    // The chooser goes with its list, which the host may destroy during the drag:
    // the drop source then ends the drag, and this object is not touched again.
    const HWND hWnd = m_hWnd;
    ColumnDropSource dropSource(hWnd);
    m_bDragging = true;
    const DROPEFFECT dropEffect = source.DoDragDrop(DROPEFFECT_COPY | DROPEFFECT_MOVE | DROPEFFECT_LINK, NULL,
        &dropSource);
    if (!IsStillAttached(hWnd, this))
        return;

    // Moved onto a header, which shows the column now.
    if (dropEffect == DROPEFFECT_MOVE && !m_bDroppedOnSelf)
    {
        LVFINDINFO find = {};
        find.flags = LVFI_PARAM;
        find.lParam = reinterpret_cast<LPARAM>(pColumnInfo);
        const int nItem = m_listColumns.FindItem(&find);
        if (nItem != -1)
            m_listColumns.DeleteItem(nItem);
        POSITION pos;
        while ((pos = m_ColumnInfos.Find(pColumnInfo)) != NULL)
            m_ColumnInfos.RemoveAt(pos);
        delete pColumnInfo;
    }
    m_bDroppedOnSelf = false;
    m_bDragging = false;
}
