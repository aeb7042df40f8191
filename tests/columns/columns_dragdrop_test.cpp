// Column drags over OLE, end to end with DoDragDrop: reorder within the header (the sort
// column follows), header to chooser (a strip as wide as the column, sorted by title),
// chooser to header and back onto itself, a drop outside (nothing changes; the payload's
// flag marks the sorted column only), the list destroyed by a host timer during a drag.
// Direct IDropTarget calls: the marker under a scrolled parent, refused drops, fuzzing.
#include "ColumnsTestSupport.h"

#include "ColumnPayload.h"
#include "KVXHeaderCtrlClipboardFormats.h"
#include "KVXHeaderCtrlDataSource.h"
#include "Pixels.h"

#include <algorithm>
#include <cstring>
#include <vector>

namespace columns_test {
namespace {

class ColumnDragTest : public ColumnsFixture {};

// COLOR_3DHILIGHT and COLOR_3DDKSHADOW made distinct from the faces, while edges are read.
struct EdgeColorsGuard
{
    const INT elements[2] = { COLOR_3DHILIGHT, COLOR_3DDKSHADOW };
    const COLORREF saved[2] = { ::GetSysColor(COLOR_3DHILIGHT), ::GetSysColor(COLOR_3DDKSHADOW) };
    const COLORREF colors[2] = { RGB(0, 160, 0), RGB(128, 0, 0) };
    EdgeColorsGuard() { ::SetSysColors(2, elements, colors); }
    ~EdgeColorsGuard() { ::SetSysColors(2, elements, saved); }
};

// The drop target the header registered, called as OLE calls it.
struct HeaderAccess : KVXDragHeaderCtrl
{
    static KVXHeaderCtrlDropTarget& Target(KVXDragHeaderCtrl& header) { return header.*(&HeaderAccess::m_DropTarget); }
};

IDropTarget* HeaderTarget(KVXDragHeaderCtrl& header)
{
    return static_cast<IDropTarget*>(HeaderAccess::Target(header).GetInterface(&IID_IDropTarget));
}

TEST_F(ColumnDragTest, ReorderWithinTheHeaderMovesTheSortColumnAlong)
{
    m_pList->SortList(0, true);
    ASSERT_EQ("Alpha|Beta|Gamma|Delta", Layout());
    const long nTargetRefs = HeaderAccess::Target(m_pList->m_HeaderCtrl).m_dwRef;
    // over the right half of Gamma: position 3; taking out position 0 refills every column
    DragHeaderItem(0, HeaderPoint(2, 60));
    EXPECT_EQ("Beta|Gamma|Alpha|Delta", Layout());
    EXPECT_EQ("Alpha,Beta,Gamma,Delta,Alpha,", m_filler.m_trace);
    EXPECT_EQ(nTargetRefs, HeaderAccess::Target(m_pList->m_HeaderCtrl).m_dwRef);
    EXPECT_EQ("2,3,1,0", m_pList->Types());
    EXPECT_EQ(2, m_pList->m_nSortColumn);
    EXPECT_EQ(nullptr, ::GetCapture());
}

TEST_F(ColumnDragTest, HeaderToChooserAndBack)
{
    OpenChooser();
    EXPECT_EQ("Epsilon:60|Zeta:110", Strips());
    CListCtrl& strips = m_pList->Page()->m_listColumns;
    DragHeaderItem(2, ScreenPoint(strips, 30, 60));
    EXPECT_EQ("Alpha|Beta|Delta", Layout());
    EXPECT_EQ("", m_filler.m_trace);
    EXPECT_EQ("Epsilon:60|Gamma:70|Zeta:110", Strips());

    // the strip's frame, from its first pixel off the window colour to its dark right edge
    EdgeColorsGuard colors;
    strips.RedrawWindow();
    CRect row;
    strips.GetItemRect(1, &row, LVIR_BOUNDS);
    orvane_test::ClientCapture pixels(strips);
    int nFirst = -1, nLast = -1;
    for (int x = 0; x < pixels.width(); ++x)
    {
        const COLORREF c = pixels.At(x, row.CenterPoint().y);
        nFirst = nFirst < 0 && c != ::GetSysColor(COLOR_WINDOW) ? x : nFirst;
        nLast = c == ::GetSysColor(COLOR_3DDKSHADOW) ? x : nLast;
    }
    EXPECT_EQ(::GetSysColor(COLOR_3DHILIGHT), pixels.At(nFirst, row.CenterPoint().y));
    EXPECT_EQ(70, nLast - nFirst + 1) << nFirst << ".." << nLast;

    // Epsilon left of the middle of Alpha: position 0, filled like the others
    DragStrip(0, HeaderPoint(0, 10));
    EXPECT_EQ("Epsilon|Alpha|Beta|Delta", Layout());
    EXPECT_EQ("Alpha,Epsilon,", m_filler.m_trace);
    EXPECT_EQ("Gamma:70|Zeta:110", Strips());
    // dropped back on the chooser: nothing changes
    DragStrip(0, ScreenPoint(strips, 30, 100));
    EXPECT_EQ("Gamma:70|Zeta:110", Strips());
    EXPECT_EQ("Epsilon|Alpha|Beta|Delta", Layout());
}

// Takes any dragged column with a copy and keeps the payload's bytes.
class CRecordingTarget : public COleDropTarget
{
public:
    DROPEFFECT OnDragOver(CWnd*, COleDataObject*, DWORD, CPoint) override { return DROPEFFECT_COPY; }
    DROPEFFECT OnDragEnter(CWnd*, COleDataObject*, DWORD, CPoint) override { return DROPEFFECT_COPY; }
    BOOL OnDrop(CWnd*, COleDataObject* pData, DROPEFFECT, CPoint) override
    {
        std::unique_ptr<CFile> pFile(pData->GetFileData(
            static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem)));
        BYTE bytes[64];
        const UINT n = pFile != nullptr ? pFile->Read(bytes, sizeof bytes) : 0;
        m_payloads.push_back(std::vector<BYTE>(bytes, bytes + n));
        return TRUE;
    }
    std::vector<std::vector<BYTE>> m_payloads;
};

TEST_F(ColumnDragTest, DropOutsideChangesNothingAndFlagsOnlyTheSortedColumn)
{
    orvane_test::HostWindow other(200, 200);
    ::SetWindowPos(other, HWND_TOP, 600, 400, 0, 0, SWP_NOSIZE | SWP_NOACTIVATE);
    CRecordingTarget target;
    ASSERT_TRUE(target.Register(CWnd::FromHandle(other)));
    m_pList->SortList(2, false);
    DragHeaderItem(2, ScreenPoint(other, 50, 50));
    DragHeaderItem(1, ScreenPoint(other, 50, 50));
    EXPECT_EQ("Alpha|Beta|Gamma|Delta", Layout());
    EXPECT_EQ(2, m_pList->m_nSortColumn);
    ASSERT_EQ(2u, target.m_payloads.size());
    // "Gamma", index 2, sub-item -1, width 70, format 0, sort type 3, flag 1
    EXPECT_EQ((std::vector<BYTE>{ 'G', 'a', 'm', 'm', 'a', 0, 2, 0, 0, 0, 0xFF, 0xFF, 0xFF, 0xFF, 70, 0, 0, 0,
        0, 0, 0, 0, 3, 1 }), target.m_payloads[0]);
    ASSERT_EQ(23u, target.m_payloads[1].size());
    EXPECT_EQ(0, target.m_payloads[1].back());
}

// The host destroys the list (and with it the chooser) from a timer while the user
// drags a header item or a strip; the list's memory is then overwritten, so that any
// later write to the destroyed objects shows. The cursor stays over the source, whose
// drop target the drag holds.
TEST_F(ColumnDragTest, ListDestroyedDuringTheDragEndsItAndIsNotTouchedAgain)
{
    for (bool bFromChooser : { false, true })
    {
        SCOPED_TRACE(bFromChooser ? "chooser" : "header");
        m_pList->DestroyWindow();
        delete m_pList;
        alignas(CTestList) static unsigned char storage[sizeof(CTestList)];
        CreateList(storage);
        OpenChooser();
        const HWND hList = m_pList->m_hWnd;
        const HWND hFrame = m_pList->m_pPropFrame->m_hWnd;
        const HWND hStrips = m_pList->Page()->m_listColumns.m_hWnd;
        auto destroy = [&](int nTick) {
            if (nTick != 3 || m_pList == nullptr)
                return;
            m_pList->DestroyWindow();
            m_pList->~CTestList();
            memset(storage, 0xDD, sizeof storage);
            m_pList = nullptr;
        };
        const DWORD dwStart = ::GetTickCount();
        if (bFromChooser)
            DragStrip(0, ScreenPoint(hStrips, 30, 40), 0, destroy);
        else
            DragHeaderItem(1, HeaderPoint(1, 20), 0, destroy);
        // ended by the drop source, long before the driver's Escape
        EXPECT_LT(::GetTickCount() - dwStart, 1000u);
        EXPECT_EQ(nullptr, m_pList);
        EXPECT_EQ(sizeof storage, static_cast<size_t>(std::count(storage, storage + sizeof storage, 0xDD)));
        EXPECT_FALSE(::IsWindow(hList));
        EXPECT_FALSE(::IsWindow(hFrame));
        EXPECT_EQ(nullptr, ::GetCapture());
        orvane_test::PumpUntilIdle(50);

        // a fresh list drags as before
        CreateList();
        DragHeaderItem(0, HeaderPoint(3, 90));
        EXPECT_EQ("Beta|Gamma|Delta|Alpha", Layout());
    }
}

// The marker is drawn over the window, not painted by it: read as it stands.
COLORREF PixelNow(HWND hwnd, int x, int y)
{
    HDC dc = ::GetDC(hwnd);
    const COLORREF c = ::GetPixel(dc, x, y);
    ::ReleaseDC(hwnd, dc);
    return c;
}

POINTL Pointl(POINT pt) { return POINTL{ pt.x, pt.y }; }

TEST_F(ColumnDragTest, DirectCallsMarkTheScrolledPositionAndRefuseWhatIsNotAMovedColumn)
{
    m_pList->SetColumnWidth(3, 400);
    m_pList->Scroll(CSize(40, 0));
    ASSERT_EQ(40, m_pList->GetScrollPos(SB_HORZ));
    m_pList->UpdateWindow();
    KVXDragHeaderCtrl& header = m_pList->m_HeaderCtrl;
    IDropTarget* pTarget = HeaderTarget(header);
    const long nTargetRefs = HeaderAccess::Target(header).m_dwRef;
    KVXColumnInfo zeta(-1, L"Zeta", -1, 110, LVCFMT_LEFT);
    KVXHeaderCtrlDataSource source;
    source.DelayRenderFileData(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem));
    source.SetData(zeta, false);
    IDataObject* pData = static_cast<IDataObject*>(source.GetInterface(&IID_IDataObject));

    // over the right half of Beta (header x 130 of 90..170): position 2, the line at
    // 170 in the header, 40 pixels further left in the list
    CRect rectHeader;
    header.GetWindowRect(&rectHeader);
    const POINTL overBeta = Pointl(ScreenPoint(header, 150, rectHeader.Height() / 2));
    DWORD dwEffect = DROPEFFECT_COPY | DROPEFFECT_MOVE;
    ASSERT_EQ(S_OK, pTarget->DragEnter(pData, MK_LBUTTON, overBeta, &dwEffect));
    EXPECT_EQ(static_cast<DWORD>(DROPEFFECT_MOVE), dwEffect);
    const int yMarker = rectHeader.Height() + 4;
    EXPECT_EQ(RGB(255, 0, 0), PixelNow(*m_pList, 130, yMarker));
    EXPECT_NE(RGB(255, 0, 0), PixelNow(*m_pList, 170, yMarker));

    // refused: a copy, a point off the header, data of another format
    dwEffect = DROPEFFECT_COPY;
    ASSERT_EQ(S_OK, pTarget->Drop(pData, 0, overBeta, &dwEffect));
    EXPECT_EQ(static_cast<DWORD>(DROPEFFECT_NONE), dwEffect);
    dwEffect = DROPEFFECT_MOVE;
    pTarget->DragEnter(pData, MK_LBUTTON, Pointl(ScreenPoint(header, 150, rectHeader.Height() + 30)), &dwEffect);
    EXPECT_EQ(static_cast<DWORD>(DROPEFFECT_NONE), dwEffect);
    pTarget->DragLeave();
    COleDataSource text;
    text.CacheGlobalData(CF_TEXT, ::GlobalAlloc(GMEM_MOVEABLE, 4));
    dwEffect = DROPEFFECT_MOVE;
    pTarget->DragEnter(static_cast<IDataObject*>(text.GetInterface(&IID_IDataObject)), MK_LBUTTON, overBeta, &dwEffect);
    EXPECT_EQ(static_cast<DWORD>(DROPEFFECT_NONE), dwEffect);
    pTarget->DragLeave();
    EXPECT_EQ("Alpha|Beta|Gamma|Delta", Layout());

    dwEffect = DROPEFFECT_MOVE;
    pTarget->DragEnter(pData, MK_LBUTTON, overBeta, &dwEffect);
    ASSERT_EQ(S_OK, pTarget->Drop(pData, 0, overBeta, &dwEffect));
    EXPECT_EQ(static_cast<DWORD>(DROPEFFECT_MOVE), dwEffect);
    EXPECT_EQ("Alpha|Beta|Zeta|Gamma|Delta", Layout());
    EXPECT_NE(RGB(255, 0, 0), PixelNow(*m_pList, 130, yMarker));
    EXPECT_EQ(1, source.m_dwRef);
    EXPECT_EQ(1, text.m_dwRef);
    EXPECT_EQ(nTargetRefs, HeaderAccess::Target(header).m_dwRef);
}

// Payloads from nowhere in particular: random bytes, and records with random titles,
// widths and sort types, cut off at random places.
std::vector<BYTE> FuzzPayload(unsigned& state)
{
    auto next = [&state](unsigned n) { state = state * 1664525u + 1013904223u; return (state >> 8) % n; };
    std::vector<BYTE> bytes;
    if (next(2) == 0)
    {
        bytes.resize(next(300));
        for (BYTE& b : bytes)
            b = static_cast<BYTE>(next(256));
        return bytes;
    }
    const unsigned nTitle = next(60);
    for (unsigned i = 0; i < nTitle; ++i)
        bytes.push_back(static_cast<BYTE>('a' + next(26)));    // letters: Layout's marks stay apart
    bytes.push_back(0);
    const int fields[] = { -1, -1, static_cast<int>(next(40000)) - 5, 0 };
    for (int v : fields)
        for (int k = 0; k < 4; ++k)
            bytes.push_back(static_cast<BYTE>(static_cast<unsigned>(v) >> (8 * k)));
    bytes.push_back(static_cast<BYTE>(next(13)));
    bytes.push_back(static_cast<BYTE>(next(3)));
    if (next(3) == 0)
        bytes.resize(next(static_cast<unsigned>(bytes.size()) + 1));
    return bytes;
}

TEST_F(ColumnDragTest, FuzzedPayloadsAreTakenOnlyWhenWhole)
{
    OpenChooser();
    IDropTarget* pTargets[2] = { HeaderTarget(m_pList->m_HeaderCtrl), NULL };
    CListCtrl& strips = m_pList->Page()->m_listColumns;
    // the page's target, reached as OLE reaches it: through the page's window
    struct PageAccess : KVXColumnsPropPage
    {
        static COleDropTarget& Target(KVXColumnsPropPage& page) { return page.*(&PageAccess::m_DropTarget); }
    };
    pTargets[1] = static_cast<IDropTarget*>(PageAccess::Target(*m_pList->Page()).GetInterface(&IID_IDropTarget));
    CRect rectHeader;
    m_pList->m_HeaderCtrl.GetClientRect(&rectHeader);
    const POINTL points[2] = { Pointl(ScreenPoint(m_pList->m_HeaderCtrl, rectHeader.right - 5, 5)),
        Pointl(ScreenPoint(strips, 30, 60)) };

    unsigned state = 20240611u;
    int nExpected[2] = { 4, 2 };     // shown columns, strips
    for (int i = 0; i < 300; ++i)
    {
        const int t = i % 2;
        const std::vector<BYTE> bytes = FuzzPayload(state);
        const ColumnPayload::Check check = ColumnPayload::CheckPayload(bytes.data(), bytes.size());
        nExpected[t] += check.verdict == ColumnPayload::Valid && (t == 1 || check.hasFlag) ? 1 : 0;
        HGLOBAL hGlobal = ::GlobalAlloc(GMEM_MOVEABLE, bytes.size());
        if (!bytes.empty())
            memcpy(::GlobalLock(hGlobal), bytes.data(), bytes.size());
        ::GlobalUnlock(hGlobal);
        COleDataSource source;
        source.CacheGlobalData(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem), hGlobal);
        IDataObject* pData = static_cast<IDataObject*>(source.GetInterface(&IID_IDataObject));
        DWORD dwEffect = DROPEFFECT_MOVE;
        pTargets[t]->DragEnter(pData, MK_LBUTTON, points[t], &dwEffect);
        pTargets[t]->Drop(pData, 0, points[t], &dwEffect);
        ASSERT_EQ(1, source.m_dwRef) << i;
    }
    EXPECT_EQ(nExpected[0], m_pList->m_HeaderCtrl.GetItemCount());
    EXPECT_EQ(nExpected[1], strips.GetItemCount());
    const std::string layout = Layout();
    EXPECT_EQ(std::string::npos, layout.find_first_of("*?")) << layout;
}

} // namespace
} // namespace columns_test
