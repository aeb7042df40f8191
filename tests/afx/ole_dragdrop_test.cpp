// OLE drag and drop.
// Covers:
// - AfxOleInit initialises OLE once per thread; one AfxOleTerm ends it
// - delayed file rendering: a request for a memory handle or for a stream reaches
//   OnRenderFileData with a memory file or a stream-backed file (memory first); a
//   failed render or a format not offered gives nothing
// - COleDataObject over both media: GetFileData's file is as long as the medium
//   and reads past its end come back short; GetGlobalData hands out a copy
// - reference counts: QueryInterface adds one, the last Release deletes
// - COleDropTarget: points in the registered window's client coordinates, the
//   effect the source allows, OnDrop after OnDragOver, a refused drop ends as a
//   leave, the data object held from enter to leave; Revoke when the window or
//   the target goes first
// - DoDragDrop's start: a button or Escape before the mouse leaves the start
//   rectangle ends it with DROPEFFECT_NONE, leaving it or the drag delay starts it
// - a real DoDragDrop to a window; every reference OLE took is given back
#include <afxole.h>
#include <afxadv.h>

#include <gtest/gtest.h>

#include "Input.h"

#include <string>

namespace {

const CLIPFORMAT g_cfMemory = (CLIPFORMAT)::RegisterClipboardFormatW(L"Orvane afx test memory");
const CLIPFORMAT g_cfRendered = (CLIPFORMAT)::RegisterClipboardFormatW(L"Orvane afx test rendered");
const CLIPFORMAT g_cfBoth = (CLIPFORMAT)::RegisterClipboardFormatW(L"Orvane afx test both");
const char kPayload[] = "payload!";     // rendered without its terminator
const UINT kPayloadSize = sizeof(kPayload) - 1;

bool OleInitialized()
{
    HRESULT hr = ::CoInitializeEx(NULL, COINIT_APARTMENTTHREADED);
    if (SUCCEEDED(hr))
        ::CoUninitialize();
    return hr == S_FALSE;
}

std::string ReadAll(CFile* pFile)
{
    char buf[64];
    return std::string(buf, pFile->Read(buf, sizeof buf));
}

FORMATETC FormatEtc(CLIPFORMAT cf, DWORD tymed)
{
    return FORMATETC{ cf, NULL, DVASPECT_CONTENT, -1, tymed };
}

// Renders kPayload and notes the file it was given: H memory, S stream.
class CRecordingSource : public COleDataSource
{
public:
    std::string m_trace;
    BOOL m_bRender = TRUE;

    BOOL OnRenderFileData(LPFORMATETC, CFile* pFile) override
    {
        m_trace += pFile->IsKindOf(RUNTIME_CLASS(CSharedFile)) ? "H"
            : pFile->IsKindOf(RUNTIME_CLASS(COleStreamFile)) ? "S" : "?";
        if (m_bRender)
            pFile->Write(kPayload, kPayloadSize);
        return m_bRender;
    }
};

// Records each call: letter, client point, '+' when the payload is offered.
class CTracingTarget : public COleDropTarget
{
public:
    std::string m_trace;
    CWnd* m_pExpectedWnd = NULL;
    DROPEFFECT m_effect = DROPEFFECT_MOVE;
    std::string m_dropped;
    long m_nSourceRefsAtDrop = 0;
    COleDataSource* m_pSource = NULL;

    DROPEFFECT OnDragEnter(CWnd* pWnd, COleDataObject* pData, DWORD, CPoint point) override
        { Note("E", pWnd, pData, point); return m_effect; }
    DROPEFFECT OnDragOver(CWnd* pWnd, COleDataObject* pData, DWORD, CPoint point) override
        { Note("O", pWnd, pData, point); return m_effect; }
    void OnDragLeave(CWnd* pWnd) override { m_trace += pWnd == m_pExpectedWnd ? "L;" : "L!;"; }
    BOOL OnDrop(CWnd* pWnd, COleDataObject* pData, DROPEFFECT dropEffect, CPoint point) override
    {
        Note("D" + std::to_string(dropEffect), pWnd, pData, point);
        if (CFile* pFile = pData->GetFileData(g_cfRendered))
        {
            m_dropped = ReadAll(pFile);
            delete pFile;
        }
        m_nSourceRefsAtDrop = m_pSource != NULL ? m_pSource->m_dwRef : 0;
        return TRUE;
    }
    HWND RegisteredWindow() const { return m_hWnd; }

private:
    void Note(const std::string& letter, CWnd* pWnd, COleDataObject* pData, CPoint point)
    {
        m_trace += letter + "(" + std::to_string(point.x) + "," + std::to_string(point.y) + ")"
            + (pData->IsDataAvailable(g_cfRendered) ? "+" : "") + (pWnd == m_pExpectedWnd ? ";" : "!;");
    }
};

class OleTest : public testing::Test
{
protected:
    static void SetUpTestSuite() { ASSERT_TRUE(AfxOleInit()); }

    // A child of a visible host, at (30, 40) in the host's client area.
    void CreateTarget(CWnd& wnd)
    {
        ASSERT_TRUE(wnd.CreateEx(0, NULL, L"target", WS_CHILD | WS_VISIBLE, CRect(30, 40, 230, 140),
            CWnd::FromHandle(m_host), 1));
    }
    POINTL ScreenPoint(CWnd& wnd, int x, int y)
    {
        POINT pt = { x, y };
        wnd.ClientToScreen(&pt);
        return POINTL{ pt.x, pt.y };
    }

    orvane_test::HostWindow m_host{ 400, 300 };
};

TEST(AfxOle, InitCountsOnceAndTermEndsIt)
{
    ASSERT_TRUE(AfxOleInit());
    ASSERT_TRUE(AfxOleInit());
    EXPECT_TRUE(OleInitialized());
    EXPECT_NE(nullptr, AfxGetThread()->m_lpfnOleTermOrFreeLib);     // AfxWinTerm's way to end it
    AfxOleTerm();
    EXPECT_FALSE(OleInitialized());
    ASSERT_TRUE(AfxOleInit());
}

TEST_F(OleTest, GetFileDataReadsEitherMediumUpToItsEnd)
{
    CRecordingSource source;
    HGLOBAL hCached = ::GlobalAlloc(GMEM_MOVEABLE, 5);
    memcpy(::GlobalLock(hCached), "12345", 5);
    ::GlobalUnlock(hCached);
    source.CacheGlobalData(g_cfMemory, hCached);
    FORMATETC streamOnly = FormatEtc(g_cfRendered, TYMED_ISTREAM);
    source.DelayRenderFileData(g_cfRendered, &streamOnly);
    source.DelayRenderFileData(g_cfBoth);

    COleDataObject dataObject;
    dataObject.Attach((IDataObject*)source.GetInterface(&IID_IDataObject), FALSE);
    FORMATETC memoryOnly = FormatEtc(g_cfRendered, TYMED_HGLOBAL);
    EXPECT_TRUE(dataObject.IsDataAvailable(g_cfMemory));
    EXPECT_TRUE(dataObject.IsDataAvailable(g_cfRendered));
    EXPECT_FALSE(dataObject.IsDataAvailable(g_cfRendered, &memoryOnly));
    EXPECT_FALSE(dataObject.IsDataAvailable(CF_TEXT));

    CFile* pFile = dataObject.GetFileData(g_cfMemory);
    ASSERT_NE(nullptr, pFile);
    EXPECT_TRUE(pFile->IsKindOf(RUNTIME_CLASS(CSharedFile)));
    EXPECT_EQ(5u, pFile->GetLength());
    EXPECT_EQ("12345", ReadAll(pFile));     // one short read, then nothing
    EXPECT_EQ("", ReadAll(pFile));
    delete pFile;

    pFile = dataObject.GetFileData(g_cfRendered);
    ASSERT_NE(nullptr, pFile);
    EXPECT_TRUE(pFile->IsKindOf(RUNTIME_CLASS(COleStreamFile)));
    EXPECT_EQ((ULONGLONG)kPayloadSize, pFile->GetLength());
    EXPECT_EQ(kPayload, ReadAll(pFile));
    EXPECT_EQ("", ReadAll(pFile));
    pFile->Seek(100, CFile::begin);     // Wine's memory stream reads on past its end from here
    EXPECT_EQ("", ReadAll(pFile));
    delete pFile;
    EXPECT_EQ(nullptr, dataObject.GetFileData(CF_TEXT));
    // a render that fails gives no file, once both media were tried
    source.m_bRender = FALSE;
    EXPECT_EQ(nullptr, dataObject.GetFileData(g_cfBoth));
    EXPECT_EQ("S" "HS", source.m_trace);

    // the caller's own copy; the cached block stays with the source
    HGLOBAL hCopy = dataObject.GetGlobalData(g_cfMemory);
    ASSERT_NE(nullptr, hCopy);
    EXPECT_NE(hCached, hCopy);
    EXPECT_EQ((SIZE_T)5, ::GlobalSize(hCopy));
    ::GlobalFree(hCopy);
    EXPECT_EQ((SIZE_T)5, ::GlobalSize(hCached));
    EXPECT_EQ(nullptr, dataObject.GetGlobalData(g_cfRendered));    // offered as a stream only
    EXPECT_EQ(1, source.m_dwRef);
}

TEST_F(OleTest, QueryInterfaceAddsReferencesAndTheLastReleaseDeletes)
{
    static bool bDeleted = false;
    struct CHeapSource : COleDataSource { ~CHeapSource() override { bDeleted = true; } };
    CHeapSource* pSource = new CHeapSource;
    IDataObject* pData = (IDataObject*)pSource->GetInterface(&IID_IDataObject);
    IUnknown* pUnknown = NULL;
    ASSERT_EQ(S_OK, pData->QueryInterface(IID_IUnknown, (void**)&pUnknown));
    EXPECT_EQ((IUnknown*)pData, pUnknown);
    EXPECT_EQ(E_NOINTERFACE, pData->QueryInterface(IID_IDropTarget, (void**)&pUnknown));
    EXPECT_EQ(nullptr, pUnknown);
    EXPECT_EQ(2, pSource->m_dwRef);
    EXPECT_EQ(1u, pData->Release());
    EXPECT_FALSE(bDeleted);
    EXPECT_EQ(0u, pSource->ExternalRelease());     // the object's own reference was the last
    EXPECT_TRUE(bDeleted);
}

TEST_F(OleTest, DropTargetCallsCarryClientPointsAndTheAllowedEffect)
{
    CWnd wnd;
    CreateTarget(wnd);
    CTracingTarget target;
    target.m_pExpectedWnd = &wnd;
    ASSERT_TRUE(target.Register(&wnd));
    EXPECT_EQ(&target, wnd.m_pDropTarget);
    IDropTarget* pTarget = (IDropTarget*)target.GetInterface(&IID_IDropTarget);
    CRecordingSource source;
    source.DelayRenderFileData(g_cfRendered);
    IDataObject* pData = (IDataObject*)source.GetInterface(&IID_IDataObject);

    DWORD effect = DROPEFFECT_COPY | DROPEFFECT_MOVE;
    ASSERT_EQ(S_OK, pTarget->DragEnter(pData, 0, ScreenPoint(wnd, 10, 5), &effect));
    EXPECT_EQ((DWORD)DROPEFFECT_MOVE, effect);
    EXPECT_EQ(2, source.m_dwRef);   // held until the leave
    ASSERT_EQ(S_OK, pTarget->DragLeave());
    EXPECT_EQ(1, source.m_dwRef);
    EXPECT_EQ("E(10,5)+;L;", target.m_trace);

    // a drop asks OnDragOver once more, then OnDrop
    target.m_trace.clear();
    target.m_effect = DROPEFFECT_MOVE;
    effect = DROPEFFECT_COPY | DROPEFFECT_MOVE;
    pTarget->DragEnter(pData, 0, ScreenPoint(wnd, 15, 5), &effect);
    ASSERT_EQ(S_OK, pTarget->Drop(pData, 0, ScreenPoint(wnd, -3, 7), &effect));
    EXPECT_EQ((DWORD)DROPEFFECT_MOVE, effect);
    EXPECT_EQ(kPayload, target.m_dropped);
    // a drop OnDragOver refuses ends as a leave
    target.m_effect = DROPEFFECT_NONE;
    effect = DROPEFFECT_MOVE;
    pTarget->DragEnter(pData, 0, ScreenPoint(wnd, 2, 2), &effect);
    pTarget->Drop(pData, 0, ScreenPoint(wnd, 2, 2), &effect);
    EXPECT_EQ((DWORD)DROPEFFECT_NONE, effect);
    EXPECT_EQ("E(15,5)+;O(-3,7)+;D2(-3,7)+;E(2,2)+;O(2,2)+;L;",
        target.m_trace);
    EXPECT_EQ(1, source.m_dwRef);
    wnd.DestroyWindow();
}

TEST_F(OleTest, RevokedWhenTheWindowOrTheTargetGoesFirst)
{
    CWnd wnd, wnd2;
    CreateTarget(wnd);
    CreateTarget(wnd2);
    CTracingTarget target;
    ASSERT_TRUE(target.Register(&wnd));
    EXPECT_FALSE(target.Register(&wnd2));   // one window per target
    EXPECT_GT(target.m_dwRef, 1);           // OLE holds the registered target
    wnd.DestroyWindow();
    EXPECT_EQ(nullptr, target.RegisteredWindow());
    EXPECT_EQ(1, target.m_dwRef);
    {
        CTracingTarget shortLived;
        ASSERT_TRUE(shortLived.Register(&wnd2));
    }
    EXPECT_EQ(nullptr, wnd2.m_pDropTarget);
    EXPECT_EQ(DRAGDROP_E_NOTREGISTERED, ::RevokeDragDrop(wnd2.m_hWnd));
    wnd2.DestroyWindow();
}

// Counts the calls OLE makes once the drag has really begun, and cancels.
class CStartProbe : public COleDropSource
{
public:
    int m_nQueries = 0;
    SCODE QueryContinueDrag(BOOL, DWORD) override { ++m_nQueries; return DRAGDROP_S_CANCEL; }
};

TEST_F(OleTest, DragBeginsOnceTheMouseLeavesTheStartRectangleOrTheDelayPasses)
{
    CWnd mainWnd;
    ASSERT_TRUE(mainWnd.CreateEx(0, NULL, L"main", WS_POPUP | WS_VISIBLE, CRect(0, 0, 50, 50), NULL, 0));
    // Posted messages carry the cursor position as their point (Wine: always
    // (0, 0)); with the cursor at (0, 0) both agree.
    ::SetCursorPos(0, 0);
    orvane_test::PumpUntilIdle(50);
    const CRect around(-40, -40, 40, 40);
    const CRect away(100, 100, 200, 200);

    static const struct { const char* name; bool bMainWnd; UINT message; WPARAM wParam; bool bAway; bool bStarts; }
    kCases[] = {
        { "button up", true, WM_LBUTTONUP, 0, false, false },
        { "button up, no main window", false, WM_LBUTTONUP, 0, false, false },
        { "other button down", true, WM_RBUTTONDOWN, 0, false, false },
        { "escape", true, WM_KEYDOWN, VK_ESCAPE, false, false },
        { "mouse outside", true, WM_MOUSEMOVE, 0, true, true },
        { "mouse inside, delay", true, WM_MOUSEMOVE, 0, false, true },
    };
    CWnd* pMainWnd = AfxGetApp()->m_pMainWnd;     // OnBeginDrag's capture goes there
    for (const auto& c : kCases)
    {
        SCOPED_TRACE(c.name);
        AfxGetApp()->m_pMainWnd = c.bMainWnd ? &mainWnd : NULL;
        CRecordingSource source;
        source.DelayRenderFileData(g_cfRendered);
        CStartProbe dropSource;
        mainWnd.PostMessage(c.message, c.wParam, 0);
        DWORD dwStart = ::GetTickCount();
        EXPECT_EQ((DWORD)DROPEFFECT_NONE, source.DoDragDrop(DROPEFFECT_MOVE, c.bAway ? &away : &around, &dropSource));
        DWORD dwElapsed = ::GetTickCount() - dwStart;
        EXPECT_EQ(c.bStarts, dropSource.m_nQueries > 0);
        if (c.bStarts && !c.bAway)
            EXPECT_GE(dwElapsed, COleDropSource::nDragDelay);
        else
            EXPECT_LT(dwElapsed, COleDropSource::nDragDelay);
        EXPECT_EQ("", source.m_trace);
        EXPECT_EQ(1, source.m_dwRef);
        EXPECT_EQ(1, dropSource.m_dwRef);
        orvane_test::PumpUntilIdle(50);
    }
    AfxGetApp()->m_pMainWnd = pMainWnd;
    mainWnd.DestroyWindow();
}

// Moves the cursor onto the target, then drops once the target has seen it.
class CMovingDropSource : public COleDropSource
{
public:
    CPoint m_ptTarget;
    const std::string* m_pTargetTrace = NULL;
    int m_nQueries = 0;
    SCODE QueryContinueDrag(BOOL, DWORD) override
    {
        if (m_nQueries++ == 0)
        {
            ::SetCursorPos(m_ptTarget.x, m_ptTarget.y);
            return S_OK;
        }
        if (m_nQueries > 50)
            return DRAGDROP_S_CANCEL;   // the target never came: bounded
        return m_pTargetTrace->find("O(") != std::string::npos ? DRAGDROP_S_DROP : S_OK;
    }
};

TEST_F(OleTest, RealDragDropReachesTheTargetAndGivesEveryReferenceBack)
{
    CWnd wnd;
    CreateTarget(wnd);
    CTracingTarget target;
    target.m_pExpectedWnd = &wnd;
    ASSERT_TRUE(target.Register(&wnd));
    long nTargetRefs = target.m_dwRef;
    CRecordingSource source;
    source.DelayRenderFileData(g_cfRendered);
    target.m_pSource = &source;
    CMovingDropSource dropSource;
    POINTL pt = ScreenPoint(wnd, 20, 30);
    dropSource.m_ptTarget.SetPoint(pt.x, pt.y);
    dropSource.m_pTargetTrace = &target.m_trace;

    CRect rectNoWait(0, 0, 0, 0);     // a null start rectangle: the drag begins at once
    EXPECT_EQ((DWORD)DROPEFFECT_MOVE, source.DoDragDrop(DROPEFFECT_COPY | DROPEFFECT_MOVE, &rectNoWait, &dropSource));
    EXPECT_EQ(0u, target.m_trace.find("E(20,30)+;O(20,30)+;")) << target.m_trace;
    EXPECT_NE(std::string::npos, target.m_trace.find("D2(20,30)+;")) << target.m_trace;
    EXPECT_EQ(kPayload, target.m_dropped);
    EXPECT_EQ("H", source.m_trace);
    EXPECT_GT(target.m_nSourceRefsAtDrop, 1);
    EXPECT_EQ(1, source.m_dwRef);
    EXPECT_EQ(1, dropSource.m_dwRef);
    EXPECT_EQ(nTargetRefs, target.m_dwRef);
    wnd.DestroyWindow();
    EXPECT_EQ(1, target.m_dwRef);
}

} // namespace
