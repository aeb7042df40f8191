// Shared by the windowed column tests.
#include "ColumnsTestSupport.h"

#include "KVXListCtrlPropSheet.h"
#include "OrvaneLibrary.h"

#include <new>

namespace columns_test {

namespace {

struct KnownColumn { LPCWSTR title; int width; unsigned char sortType; bool shown; };
const KnownColumn kKnown[] = {
    { L"Alpha", 90, 1, true }, { L"Beta", 80, 2, true }, { L"Gamma", 70, 3, true }, { L"Delta", 100, 0, true },
    { L"Zeta", 110, 4, false }, { L"Epsilon", 60, 5, false },
};
const int kRows = 3;
const int kFirstItemData = 10;

// Ticks inside DoDragDrop's loop: the cursor to the target, then the button up.
struct DragDriver
{
    DragDriver(POINT target, int releaseTick, std::function<void(int)> onTick)
        : m_target(target), m_nRelease(releaseTick), m_onTick(std::move(onTick))
    {
        s_pDriver = this;
        m_nTimer = ::SetTimer(NULL, 0, 30, &DragDriver::Tick);
    }
    ~DragDriver() { ::KillTimer(NULL, m_nTimer); s_pDriver = nullptr; }
    static void CALLBACK Tick(HWND, UINT, UINT_PTR, DWORD)
    {
        DragDriver* p = s_pDriver;
        if (p == nullptr)
            return;
        if (++p->m_nTicks == 1)
            ::SetCursorPos(p->m_target.x, p->m_target.y);
        BYTE state[256];
        ::GetKeyboardState(state);
        if (p->m_nTicks == p->m_nRelease || p->m_nTicks > 60)
            state[VK_LBUTTON] = 0;
        ::SetKeyboardState(state);
        if (p->m_onTick)
            p->m_onTick(p->m_nTicks);
    }
    static DragDriver* s_pDriver;
    orvane_test::KeyStateGuard m_button{ VK_LBUTTON };
    POINT m_target;
    int m_nRelease;
    std::function<void(int)> m_onTick;
    int m_nTicks = 0;
    UINT_PTR m_nTimer = 0;
};
DragDriver* DragDriver::s_pDriver = nullptr;

// Presses at a client point of the source window and moves: the drag runs until the
// driver drops; a release follows if the source is still there.
void PressAndMove(HWND hSource, POINT client, POINT target, int releaseTick, std::function<void(int)> onTick)
{
    POINT start = client;
    ::ClientToScreen(hSource, &start);
    ::SetCursorPos(start.x, start.y);
    orvane_test::PumpUntilIdle(50);
    {
        DragDriver driver(target, releaseTick, std::move(onTick));
        ::SendMessage(hSource, WM_LBUTTONDOWN, MK_LBUTTON, orvane_test::PointParam(client.x, client.y));
        ::SendMessage(hSource, WM_MOUSEMOVE, MK_LBUTTON, orvane_test::PointParam(client.x + 20, client.y));
    }
    if (::IsWindow(hSource))
        ::SendMessage(hSource, WM_LBUTTONUP, 0, orvane_test::PointParam(client.x + 20, client.y));
}

} // namespace

std::string Narrow(const CString& text)
{
    const LPCWSTR p = text;
    return std::string(p, p + text.GetLength());
}

std::string CTestList::Types() const
{
    std::string types;
    for (unsigned int i = 0; i < m_nColumnTypes; ++i)
        types += (i > 0 ? "," : "") + std::to_string(m_pColumnTypes[i]);
    return types;
}

KVXColumnsPropPage* CTestList::Page() const
{
    return m_pPropFrame != NULL && m_pPropFrame->m_pSheet != NULL ? &m_pPropFrame->m_pSheet->m_page : NULL;
}

void CFiller::Fill(LVITEMW& item, KVXColumnInfo* pColumnInfo)
{
    if (item.iItem == 0)
        m_trace += Narrow(pColumnInfo->GetTitle()) + ",";
    CString text;
    text.Format(L"%s%d", static_cast<LPCWSTR>(pColumnInfo->GetTitle()), static_cast<int>(item.lParam));
    item.mask |= LVIF_TEXT;
    item.pszText = KVXDragColumnListCtrl::AllocItemText(text);
}

void ColumnsFixture::SetUp()
{
    orvane_test::LoadLibraryOnce();
    ASSERT_TRUE(AfxOleInit());
    m_host.reset(new orvane_test::HostWindow(540, 320));
    CreateList();
}

void ColumnsFixture::CreateList(void* pStorage)
{
    m_pList = pStorage != nullptr ? new (pStorage) CTestList : new CTestList;
    ASSERT_TRUE(m_pList->Create(WS_CHILD | WS_VISIBLE | LVS_REPORT, CRect(10, 10, 530, 290),
        CWnd::FromHandle(*m_host), 5));
    m_pList->SetCallbackWindow(&m_filler);
    m_pList->SetFillItem(static_cast<void (CWnd::*)(LVITEMW&, KVXColumnInfo*)>(&CFiller::Fill));
    int nColumn = 0;
    for (const KnownColumn& c : kKnown)
    {
        KVXColumnInfo* pColumnInfo = new KVXColumnInfo(-1, c.title, -1, c.width, LVCFMT_LEFT);
        pColumnInfo->SetSortType(c.sortType);
        m_pList->AddColumn(pColumnInfo);
        const int nShown = c.shown ? nColumn++ : -1;
        if (c.shown)
            ASSERT_EQ(nShown, m_pList->InsertColumn(c.title, nShown));
    }
    m_pList->SetRedraw(FALSE);
    for (int i = 0; i < kRows; ++i)
        m_pList->InsertItem(LVIF_TEXT | LVIF_PARAM, i, L"", 0, 0, 0, kFirstItemData + i);
    m_pList->SetRedraw(TRUE);
    m_pList->UpdateWindow();
    m_filler.m_trace.clear();
}

void ColumnsFixture::TearDown()
{
    if (m_pList != nullptr)
    {
        m_pList->DestroyWindow();
        delete m_pList;
    }
    m_host.reset();
    orvane_test::PumpUntilIdle(50);
}

std::string ColumnsFixture::Layout()
{
    CHeaderCtrl& header = m_pList->m_HeaderCtrl;
    std::string layout;
    for (int i = 0; i < header.GetItemCount(); ++i)
    {
        WCHAR title[64] = {};
        HDITEM item = {};
        item.mask = HDI_TEXT;
        item.pszText = title;
        item.cchTextMax = 64;
        header.GetItem(i, &item);
        int nRecords = 0;
        for (POSITION pos = m_pList->GetColumnInfos().GetHeadPosition(); pos != NULL;)
        {
            const KVXColumnInfo* pColumnInfo = m_pList->GetColumnInfos().GetNext(pos);
            nRecords += pColumnInfo->GetIndex() == i && pColumnInfo->GetTitle() == title ? 1 : 0;
        }
        bool bCells = true;
        for (int row = 0; row < m_pList->GetItemCount(); ++row)
        {
            CString expected;
            expected.Format(L"%s%d", title, static_cast<int>(m_pList->GetItemData(row)));
            bCells = bCells && m_pList->GetItemText(row, i) == expected;
        }
        layout += (i > 0 ? "|" : "") + Narrow(title) + (bCells ? "" : "*") + (nRecords == 1 ? "" : "?");
    }
    return layout;
}

std::string ColumnsFixture::Strips()
{
    KVXColumnsPropPage* pPage = m_pList->Page();
    if (pPage == NULL)
        return "no chooser";
    std::string strips;
    for (int i = 0; i < pPage->m_listColumns.GetItemCount(); ++i)
    {
        const KVXColumnInfo* pColumnInfo = reinterpret_cast<const KVXColumnInfo*>(pPage->m_listColumns.GetItemData(i));
        strips += (i > 0 ? "|" : "") + Narrow(pPage->m_listColumns.GetItemText(i, 0)) + ":"
            + std::to_string(pColumnInfo->GetWidth());
    }
    return strips;
}

POINT ColumnsFixture::ScreenPoint(HWND hwnd, int x, int y)
{
    POINT pt = { x, y };
    ::ClientToScreen(hwnd, &pt);
    return pt;
}

POINT ColumnsFixture::HeaderPoint(int item, int x)
{
    CRect rect;
    m_pList->m_HeaderCtrl.GetItemRect(item, &rect);
    return ScreenPoint(m_pList->m_HeaderCtrl, x < 0 ? rect.CenterPoint().x : rect.left + x, rect.CenterPoint().y);
}

void ColumnsFixture::OpenChooser()
{
    m_pList->Customize();
    ASSERT_NE(nullptr, m_pList->Page());
    m_pList->m_pPropFrame->SetWindowPos(NULL, 560, 0, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
    m_pList->m_pPropFrame->UpdateWindow();
    orvane_test::PumpUntilIdle(50);
}

void ColumnsFixture::DragHeaderItem(int item, POINT target, int releaseTick, std::function<void(int)> onTick)
{
    CRect rect;
    m_pList->m_HeaderCtrl.GetItemRect(item, &rect);
    PressAndMove(m_pList->m_HeaderCtrl, rect.CenterPoint(), target, releaseTick, std::move(onTick));
}

void ColumnsFixture::DragStrip(int row, POINT target, int releaseTick, std::function<void(int)> onTick)
{
    CListCtrl& strips = m_pList->Page()->m_listColumns;
    CRect rect;
    strips.GetItemRect(row, &rect, LVIR_BOUNDS);
    PressAndMove(strips, CPoint(20, rect.CenterPoint().y), target, releaseTick, std::move(onTick));
}

} // namespace columns_test
