// KVXDragColumnListCtrl: known columns, the two column messages, the fill callback
// and the column chooser.
#include "KVXDragColumnListCtrl.h"

#include "ColumnDragGeometry.h"
#include "KVXColumnNotify.h"
#include "KVXListCtrlPropFrame.h"
#include "KVXListCtrlPropSheet.h"

#include <cwchar>
#include <new>
#include <vector>

BEGIN_MESSAGE_MAP(KVXDragColumnListCtrl, KVXListCtrlEx)
    ON_MESSAGE(LVM_INSERTITEMW, &KVXDragColumnListCtrl::OnInsertItem)
    ON_WM_CREATE()
    ON_MESSAGE(WM_KVX_INSERTCOLUMN, &KVXDragColumnListCtrl::OnMessageInsertColumn)
    ON_WM_PARENTNOTIFY()
    ON_WM_DESTROY()
END_MESSAGE_MAP()

namespace {

// The chooser: a small tool window with caption and system menu, owned by the list.
const DWORD kPropFrameStyle = WS_POPUP | WS_CAPTION | WS_SYSMENU;

} // namespace

KVXDragColumnListCtrl::KVXDragColumnListCtrl()
    : m_pPropFrame(NULL), m_pfnFillItem(NULL), m_pCallbackWnd(NULL), m_ColumnInfos(10), m_hWndPropFrame(NULL)
{
}

KVXDragColumnListCtrl::~KVXDragColumnListCtrl()
{
    DestroyPropFrame();
    while (!m_ColumnInfos.IsEmpty())
        delete m_ColumnInfos.RemoveHead();
}

/////////////////////////////////////////////////////////////////////////////
// The drag header in place of the list view's own

void KVXDragColumnListCtrl::PreSubclassWindow()
{
    // KVXListCtrlEx's header is not attached: this list's header is the drag header.
    CListCtrl::PreSubclassWindow();
    AttachHeader();
}

int KVXDragColumnListCtrl::OnCreate(LPCREATESTRUCT lpCreateStruct)
{
    if (CListCtrl::OnCreate(lpCreateStruct) == -1)
        return -1;
    AttachHeader();
    return 0;
}

void KVXDragColumnListCtrl::OnParentNotify(UINT message, LPARAM lParam)
{
    // A hidden list view makes its header with the first column, after WM_CREATE; the
    // base class would take it for its own header.
    CListCtrl::OnParentNotify(message, lParam);
    if (LOWORD(message) == WM_CREATE)
        AttachHeader();
}

void KVXDragColumnListCtrl::AttachHeader()
{
    if (m_HeaderCtrl.m_hWnd != NULL)
        return;
    HWND hHeader = ::GetDlgItem(m_hWnd, 0);
    if (hHeader != NULL && m_HeaderCtrl.SubclassWindow(hHeader))
    {
        m_HeaderCtrl.InitDragDrop();
        m_HeaderCtrl.SetMessageWnd(this);
    }
}

int KVXDragColumnListCtrl::HeaderHitTest(CPoint point)
{
    if (m_HeaderCtrl.m_hWnd == NULL)
        return -1;
    return m_HeaderCtrl.HitTest(point);
}

/////////////////////////////////////////////////////////////////////////////
// Known columns

void KVXDragColumnListCtrl::AddColumn(KVXColumnInfo* pColumnInfo)
{
    if (pColumnInfo == NULL)
        return;
    m_ColumnInfos.AddTail(pColumnInfo);
    m_HeaderCtrl.AddColumn(pColumnInfo);
}

CList<KVXColumnInfo*, KVXColumnInfo*>& KVXDragColumnListCtrl::GetColumnInfos()
{
    return m_ColumnInfos;
}

int KVXDragColumnListCtrl::InsertColumn(CString strTitle, int nCol)
{
    if (m_ColumnInfos.IsEmpty() || strTitle.IsEmpty() || nCol < 0)
        return -1;

    int nResult = -1;
    for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
    {
        KVXColumnInfo* pColumnInfo = m_ColumnInfos.GetNext(pos);
        // A column already shown is not shown twice: its record would leave its first
        // list column without a record.
        if (pColumnInfo->GetIndex() != -1 || pColumnInfo->GetTitle() != strTitle)
            continue;
        const int nPosition = CListCtrl::InsertColumn(nCol, pColumnInfo->GetTitle(), pColumnInfo->GetFormat(),
            pColumnInfo->GetWidth(), pColumnInfo->GetSubItem());
        if (nPosition == -1)
            continue;
        // The shown columns from there on moved one to the right, their records with them.
        for (POSITION other = m_ColumnInfos.GetHeadPosition(); other != NULL;)
        {
            KVXColumnInfo* pOther = m_ColumnInfos.GetNext(other);
            if (pOther->GetIndex() >= nPosition)
                pOther->SetIndex(pOther->GetIndex() + 1);
        }
        pColumnInfo->SetIndex(nPosition);
        m_nSortColumn = ColumnDragGeometry::SortColumnAfterInsert(m_nSortColumn, nPosition, false);
        nResult = nPosition;
    }
    UpdateColumnTypes();
    if (nResult != -1)
        ShowSortColumn();
    return nResult;
}

void KVXDragColumnListCtrl::UpdateColumnTypes()
{
    std::vector<unsigned char> types(static_cast<size_t>(m_ColumnInfos.GetCount()) + 1, 0);
    unsigned int nShown = 0;
    for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
    {
        const KVXColumnInfo* pColumnInfo = m_ColumnInfos.GetNext(pos);
        const int nIndex = pColumnInfo->GetIndex();
        if (nIndex < 0)
            continue;
        if (static_cast<size_t>(nIndex) < types.size())
            types[nIndex] = pColumnInfo->GetSortType();
        ++nShown;
    }
    SetColumnTypes(types.data(), nShown);
}

void KVXDragColumnListCtrl::ShowSortColumn()
{
    HWND hHeader = ::GetDlgItem(m_hWnd, 0);
    if (hHeader != NULL)
        ::SendMessage(hHeader, WM_USER + 1, static_cast<WPARAM>(m_nSortColumn), static_cast<LPARAM>(m_bSortAscending));
}

/////////////////////////////////////////////////////////////////////////////
// Cells through the fill callback

void KVXDragColumnListCtrl::SetCallbackWindow(CWnd* pWnd)
{
    m_pCallbackWnd = pWnd;
}

void KVXDragColumnListCtrl::SetFillItem(void (CWnd::*pfn)(LVITEMW&, KVXColumnInfo*))
{
    m_pfnFillItem = pfn;
}

LPWSTR KVXDragColumnListCtrl::AllocItemText(LPCWSTR pszText)
{
    const size_t nLength = pszText != NULL ? std::wcslen(pszText) : 0;
    LPWSTR pszCopy = static_cast<LPWSTR>(::operator new((nLength + 1) * sizeof(WCHAR)));
    if (nLength > 0)
        std::wmemcpy(pszCopy, pszText, nLength);
    pszCopy[nLength] = 0;
    return pszCopy;
}

void KVXDragColumnListCtrl::FillColumn(KVXColumnInfo* pColumnInfo)
{
    CWinApp* pApp = AfxGetApp();
    if (pApp != NULL)
        pApp->BeginWaitCursor();
    if (m_pCallbackWnd != NULL && m_pfnFillItem != NULL)
    {
        for (int nItem = GetNextItem(-1, LVNI_ALL); nItem != -1; nItem = GetNextItem(nItem, LVNI_ALL))
            FillItem(nItem, pColumnInfo);
    }
    if (pApp != NULL)
        pApp->EndWaitCursor();
}

void KVXDragColumnListCtrl::FillItem(int nItem, KVXColumnInfo* pColumnInfo)
{
    if (nItem == -1 || pColumnInfo == NULL || pColumnInfo->GetIndex() == -1 || m_pCallbackWnd == NULL
        || m_pfnFillItem == NULL)
        return;

    LVITEMW item = {};
    item.iItem = nItem;
    item.iSubItem = pColumnInfo->GetIndex();
    item.mask = LVIF_PARAM | LVIF_STATE;
    SendMessage(LVM_GETITEMW, 0, reinterpret_cast<LPARAM>(&item));

    (m_pCallbackWnd->*m_pfnFillItem)(item, pColumnInfo);

    // Only the first column may set item data and state.
    item.iItem = nItem;
    item.iSubItem = pColumnInfo->GetIndex();
    if (item.iSubItem != 0)
        item.mask &= ~(LVIF_PARAM | LVIF_STATE);
    SendMessage(LVM_SETITEMW, 0, reinterpret_cast<LPARAM>(&item));
    if (item.pszText != NULL && item.pszText != LPSTR_TEXTCALLBACKW)
        ::operator delete(item.pszText);
}

void KVXDragColumnListCtrl::ResetColumn(KVXColumnInfo* pColumnInfo)
{
    if (pColumnInfo->GetIndex() == -1)
        return;
    const int nCount = GetItemCount();
    for (int nItem = 0; nItem < nCount; ++nItem)
        SetItem(nItem, pColumnInfo->GetIndex(), LVIF_TEXT, _T(""), 0, 0, 0, 0);
}

LRESULT KVXDragColumnListCtrl::OnInsertItem(WPARAM, LPARAM lParam)
{
    // The row the list view made, which is the one asked for whenever that lies
    // within the rows there are.
    const LRESULT nItem = Default();
    if (lParam != 0 && nItem != -1)
    {
        for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
            FillItem(static_cast<int>(nItem), m_ColumnInfos.GetNext(pos));
    }
    return nItem;
}

/////////////////////////////////////////////////////////////////////////////
// The two column messages of the drag header and its drop target

LRESULT KVXDragColumnListCtrl::OnMessageInsertColumn(WPARAM, LPARAM lParam)
{
    const KVXColumnNotify* pNotify = reinterpret_cast<const KVXColumnNotify*>(lParam);
    if (pNotify == NULL || pNotify->pColumnInfo == NULL)
        return 0;
    const bool bSortedColumn = pNotify->bSortedColumn;

    // The list column goes in first, so that a failed insertion leaves every record
    // as it was (the shown columns numbered 0, 1, 2 ... without gaps).
    KVXColumnInfo* pNew = new KVXColumnInfo;
    *pNew = *pNotify->pColumnInfo;
    const int nRequested = pNew->GetIndex();
    const int nPosition = nRequested < 0 ? -1
        : CListCtrl::InsertColumn(nRequested, pNew->GetTitle(), pNew->GetFormat(), pNew->GetWidth(), -1);
    if (nPosition == -1)
    {
        delete pNew;
        return 0;
    }

    KVXColumnInfo* pLeftFirst = NULL;
    for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
    {
        KVXColumnInfo* pColumnInfo = m_ColumnInfos.GetNext(pos);
        if (pColumnInfo->GetIndex() >= nPosition)
        {
            if (pColumnInfo->GetIndex() == 0)
                pLeftFirst = pColumnInfo;
            pColumnInfo->SetIndex(pColumnInfo->GetIndex() + 1);
        }
    }
    // The first column's cells are the items' own texts, which stay at position 0.
    if (pLeftFirst != NULL)
        FillColumn(pLeftFirst);

    // Beyond the last column the list view appends: the record says where it went.
    pNew->SetIndex(nPosition);
    m_ColumnInfos.AddTail(pNew);
    m_HeaderCtrl.AddColumn(pNew);
    UpdateColumnTypes();
    FillColumn(pNew);

    m_nSortColumn = ColumnDragGeometry::SortColumnAfterInsert(m_nSortColumn, nPosition, bSortedColumn);
    ShowSortColumn();
    RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
    return 0;
}

BOOL KVXDragColumnListCtrl::OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    NMHDR* pNMHDR = reinterpret_cast<NMHDR*>(lParam);
    if (pNMHDR != NULL && pNMHDR->code == KVXN_DELETECOLUMN && wParam == 0)
        OnNotifyDeleteColumn(pNMHDR, pResult);
    return CWnd::OnNotify(wParam, lParam, pResult);
}

void KVXDragColumnListCtrl::OnNotifyDeleteColumn(NMHDR* pNMHDR, LRESULT*)
{
    const KVXColumnNotify* pNotify = reinterpret_cast<const KVXColumnNotify*>(pNMHDR);
    if (pNotify == NULL || pNotify->pColumnInfo == NULL)
        return;
    // Only a shown column of this very list is taken out (and its record deleted).
    KVXColumnInfo* pDeleted = pNotify->pColumnInfo;
    POSITION posDeleted = m_ColumnInfos.Find(pDeleted);
    const int nDeleted = pDeleted->GetIndex();
    if (posDeleted == NULL || nDeleted < 0)
        return;

    ResetColumn(pDeleted);
    DeleteColumn(nDeleted);
    m_HeaderCtrl.RemoveColumn(pDeleted);
    m_ColumnInfos.RemoveAt(posDeleted);
    for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
    {
        KVXColumnInfo* pColumnInfo = m_ColumnInfos.GetNext(pos);
        if (pColumnInfo->GetIndex() > nDeleted)
            pColumnInfo->SetIndex(pColumnInfo->GetIndex() - 1);
        // Taking out the first column moves every other column's cells.
        if (nDeleted == 0 && pColumnInfo->GetIndex() != -1)
            FillColumn(pColumnInfo);
    }
    UpdateColumnTypes();
    delete pDeleted;

    m_nSortColumn = ColumnDragGeometry::SortColumnAfterDelete(m_nSortColumn, nDeleted);
    ShowSortColumn();
    RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
}

/////////////////////////////////////////////////////////////////////////////
// Column chooser

KVXListCtrlPropSheetData& KVXDragColumnListCtrl::GetPropPageData()
{
    return m_PropPageData;
}

bool KVXDragColumnListCtrl::IsPropFrameAlive() const
{
    return m_pPropFrame != NULL && ::IsWindow(m_hWndPropFrame)
        && CWnd::FromHandlePermanent(m_hWndPropFrame) == m_pPropFrame;
}

void KVXDragColumnListCtrl::Customize()
{
    // The frame deletes itself with its window, which may have gone with its owner.
    if (!IsPropFrameAlive())
        m_pPropFrame = NULL;

    if (m_pPropFrame == NULL)
    {
        KVXListCtrlPropFrame* pFrame = new KVXListCtrlPropFrame;
        // A failed creation has deleted the frame already (PostNcDestroy).
        if (!pFrame->Create(NULL, m_PropPageData.m_strCaption, kPropFrameStyle, CRect(0, 0, 0, 0), this, 0))
        {
            m_hWndPropFrame = NULL;
            return;
        }
        m_pPropFrame = pFrame;
        m_hWndPropFrame = pFrame->m_hWnd;
        pFrame->CenterWindow();
        if (KVXListCtrlPropSheet* pSheet = pFrame->m_pSheet)
        {
            pSheet->m_page.SetDisplayHelp(m_PropPageData.m_pHelpTarget, m_PropPageData.m_pfnDisplayHelp);
            for (POSITION pos = m_ColumnInfos.GetHeadPosition(); pos != NULL;)
            {
                KVXColumnInfo* pColumnInfo = m_ColumnInfos.GetNext(pos);
                if (pColumnInfo->GetIndex() == -1)
                    pSheet->m_page.AddColumn(*pColumnInfo);
            }
        }
    }
    if (!m_pPropFrame->IsWindowVisible())
        m_pPropFrame->ShowWindow(SW_SHOW);
}

void KVXDragColumnListCtrl::OnDestroy()
{
    // The system makes the list's top-level window the chooser's owner: the chooser
    // would outlive the list without this.
    DestroyPropFrame();
    CListCtrl::OnDestroy();
}

void KVXDragColumnListCtrl::DestroyPropFrame()
{
    if (IsPropFrameAlive())
        m_pPropFrame->DestroyWindow();
    m_pPropFrame = NULL;
    m_hWndPropFrame = NULL;
}
