// GDI wrappers: covers
// - SelectObject returns the previously selected object (the owning C++ object, or
//   a typed temporary wrapper) and restoring returns the one selected before
// - every object type deletes its handle in the destructor; Attach over a held
//   handle leaves the old one to the caller, as MFC does, but no longer names the
//   object for it; temporary wrappers never delete their handle
// - FromHandle: owner first, otherwise one typed temporary per handle until DeleteTempMap
// - the halftone brush's pixels (FillSolidRect and Draw3dRect are read back by the spin's
//   and the colour well's pixel tests)
// - CFont::CreatePointFont height from the DC's resolution; GetTextExtent
// - CPaintDC ends the paint, validating the window; CClientDC reads back what it drew
#include <gtest/gtest.h>
#include <afxwin.h>

#include "AfxTestSupport.h"


namespace {

// A memory DC with a colour bitmap selected, as a screen-compatible canvas.
struct Canvas
{
    CDC dc;
    CBitmap bitmap;
    CBitmap* pOldBitmap;

    Canvas(int cx, int cy) : pOldBitmap(NULL)
    {
        CClientDC screen(NULL);
        EXPECT_TRUE(dc.CreateCompatibleDC(&screen));
        EXPECT_TRUE(bitmap.CreateCompatibleBitmap(&screen, cx, cy));
        pOldBitmap = dc.SelectObject(&bitmap);
    }
    ~Canvas()
    {
        dc.SelectObject(pOldBitmap);
    }
};

} // namespace

class GdiTest : public testing::Test
{
protected:
    void TearDown() override
    {
        CGdiObject::DeleteTempMap();
        CDC::DeleteTempMap();
    }
};

TEST_F(GdiTest, SelectReturnsOldObjectAndRestores)
{
    Canvas canvas(8, 8);
    CDC& dc = canvas.dc;
    ASSERT_NE(nullptr, canvas.pOldBitmap);
    EXPECT_TRUE(canvas.pOldBitmap->IsKindOf(RUNTIME_CLASS(CBitmap)));

    CPen red(PS_SOLID, 1, RGB(255, 0, 0));
    CPen blue(PS_SOLID, 1, RGB(0, 0, 255));
    CPen* pStockPen = dc.SelectObject(&red);
    ASSERT_NE(nullptr, pStockPen);
    EXPECT_EQ((HGDIOBJ)::GetStockObject(BLACK_PEN), pStockPen->GetSafeHandle());
    EXPECT_TRUE(pStockPen->IsKindOf(RUNTIME_CLASS(CPen)));
    EXPECT_EQ(&red, dc.GetCurrentPen());
    EXPECT_EQ(&red, dc.SelectObject(&blue)) << "the owning object comes back, not a wrapper";
    EXPECT_EQ(&blue, dc.SelectObject(pStockPen));
    EXPECT_EQ(pStockPen, dc.GetCurrentPen());

    CBrush brush(RGB(1, 2, 3));
    CBrush* pOldBrush = dc.SelectObject(&brush);
    EXPECT_EQ((HGDIOBJ)::GetStockObject(WHITE_BRUSH), pOldBrush->GetSafeHandle());
    EXPECT_EQ(&brush, dc.SelectObject(pOldBrush));

    CFont font;
    ASSERT_TRUE(font.CreatePointFont(100, L"Arial"));
    CFont* pOldFont = dc.SelectObject(&font);
    ASSERT_NE(nullptr, pOldFont);
    EXPECT_EQ(&font, dc.GetCurrentFont());
    EXPECT_EQ(&font, dc.SelectObject(pOldFont));

    CGdiObject* pOld = dc.SelectStockObject(NULL_BRUSH);
    EXPECT_EQ(pOldBrush, pOld) << "one temporary wrapper per handle";
    dc.SelectObject(pOld);

    CRgn rgn;
    ASSERT_TRUE(rgn.CreateRectRgn(0, 0, 4, 4));
    EXPECT_EQ(SIMPLEREGION, dc.SelectObject(&rgn));
    CRect rcClip;
    EXPECT_EQ(SIMPLEREGION, dc.GetClipBox(&rcClip));
    EXPECT_EQ(CRect(0, 0, 4, 4), rcClip);

    // Null objects change nothing.
    EXPECT_EQ(nullptr, dc.SelectObject((CPen*)NULL));
    EXPECT_EQ(GDI_ERROR, dc.SelectObject((CRgn*)NULL));
    EXPECT_EQ(pStockPen, dc.GetCurrentPen());
}

TEST_F(GdiTest, DestructorsDeleteEveryObject)
{
    HGDIOBJ handles[8] = {};
    HDC hdc = NULL;
    {
        CPen pen(PS_DASH, 1, RGB(1, 1, 1));
        LOGBRUSH lb = { BS_SOLID, RGB(2, 2, 2), 0 };
        CPen extPen(PS_GEOMETRIC | PS_SOLID, 3, &lb);
        CBrush brush(RGB(3, 3, 3));
        CBrush hatch(HS_CROSS, RGB(4, 4, 4));
        CFont font;
        ASSERT_TRUE(font.CreateFont(-12, 0, 0, 0, FW_BOLD, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"Arial"));
        CBitmap bitmap;
        ASSERT_TRUE(bitmap.CreateBitmap(8, 8, 1, 1, NULL));
        CBrush pattern(&bitmap);
        CRgn rgn;
        POINT pts[] = { { 0, 0 }, { 10, 0 }, { 5, 8 } };
        ASSERT_TRUE(rgn.CreatePolygonRgn(pts, 3, ALTERNATE));
        CDC dc;
        ASSERT_TRUE(dc.CreateCompatibleDC(NULL));

        handles[0] = pen.m_hObject;
        handles[1] = extPen.m_hObject;
        handles[2] = brush.m_hObject;
        handles[3] = hatch.m_hObject;
        handles[4] = font.m_hObject;
        handles[5] = bitmap.m_hObject;
        handles[6] = pattern.m_hObject;
        handles[7] = rgn.m_hObject;
        hdc = dc.m_hDC;
        const DWORD expected[8] = { OBJ_PEN, OBJ_EXTPEN, OBJ_BRUSH, OBJ_BRUSH, OBJ_FONT, OBJ_BITMAP,
            OBJ_BRUSH, OBJ_REGION };
        for (int i = 0; i < 8; i++)
            EXPECT_EQ(expected[i], ::GetObjectType(handles[i])) << "object " << i;
        EXPECT_EQ((DWORD)OBJ_MEMDC, ::GetObjectType(hdc));
    }
    for (int i = 0; i < 8; i++)
        EXPECT_EQ(0u, ::GetObjectType(handles[i])) << "object " << i << " still exists";
    EXPECT_EQ(0u, ::GetObjectType(hdc));
}

TEST_F(GdiTest, AttachOverHeldHandleLetsGoOfIt)
{
    CBrush brush;
    ASSERT_TRUE(brush.CreateSolidBrush(RGB(10, 10, 10)));
    HGDIOBJ hFirst = brush.m_hObject;
    ASSERT_TRUE(brush.CreateSolidBrush(RGB(20, 20, 20)));
    HGDIOBJ hSecond = brush.m_hObject;
    EXPECT_EQ((DWORD)OBJ_BRUSH, ::GetObjectType(hFirst));
    EXPECT_NE(&brush, CGdiObject::FromHandle(hFirst));
    ::DeleteObject(hFirst);
    EXPECT_EQ((DWORD)OBJ_BRUSH, ::GetObjectType(hSecond));
    EXPECT_EQ(&brush, CGdiObject::FromHandle(hSecond));

    HGDIOBJ hDetached = brush.Detach();
    EXPECT_EQ(hSecond, hDetached);
    EXPECT_EQ(nullptr, brush.m_hObject);
    EXPECT_FALSE(brush.DeleteObject());
    EXPECT_NE(&brush, CGdiObject::FromHandle(hDetached)) << "a detached handle has no owner";
    CGdiObject::DeleteTempMap();
    EXPECT_EQ((DWORD)OBJ_BRUSH, ::GetObjectType(hDetached));
    ::DeleteObject(hDetached);
}

TEST_F(GdiTest, TemporaryWrappersAreTypedSharedAndNeverDelete)
{
    HBRUSH hBrush = ::CreateSolidBrush(RGB(5, 6, 7));
    HPEN hPen = ::CreatePen(PS_SOLID, 1, RGB(5, 6, 7));
    HRGN hRgn = ::CreateRectRgn(0, 0, 1, 1);
    CGdiObject* pBrush = CGdiObject::FromHandle(hBrush);
    ASSERT_NE(nullptr, pBrush);
    EXPECT_STREQ("CBrush", pBrush->GetRuntimeClass()->m_lpszClassName);
    EXPECT_STREQ("CPen", CGdiObject::FromHandle(hPen)->GetRuntimeClass()->m_lpszClassName);
    EXPECT_STREQ("CRgn", CGdiObject::FromHandle(hRgn)->GetRuntimeClass()->m_lpszClassName);
    EXPECT_EQ(pBrush, CBrush::FromHandle(hBrush));
    EXPECT_EQ(nullptr, CGdiObject::FromHandle(NULL));

    CGdiObject::DeleteTempMap();
    EXPECT_EQ((DWORD)OBJ_BRUSH, ::GetObjectType(hBrush));
    EXPECT_EQ((DWORD)OBJ_PEN, ::GetObjectType(hPen));
    EXPECT_EQ((DWORD)OBJ_REGION, ::GetObjectType(hRgn));

    // A handle that gets an owner is answered by the owner.
    CBrush owner;
    CBrush* pTemp = CBrush::FromHandle(hBrush);
    ASSERT_TRUE(owner.Attach(hBrush));
    EXPECT_EQ(&owner, CBrush::FromHandle(hBrush));
    EXPECT_EQ(hBrush, pTemp->m_hObject) << "the old wrapper stays usable until idle";
    CGdiObject::DeleteTempMap();
    EXPECT_EQ((DWORD)OBJ_BRUSH, ::GetObjectType(hBrush));

    ::DeleteObject(hPen);
    ::DeleteObject(hRgn);

    HDC hdc = ::CreateCompatibleDC(NULL);
    CDC* pDC = CDC::FromHandle(hdc);
    ASSERT_NE(nullptr, pDC);
    EXPECT_EQ(hdc, pDC->m_hDC);
    EXPECT_EQ(hdc, pDC->m_hAttribDC);
    EXPECT_EQ(pDC, CDC::FromHandle(hdc));
    CDC::DeleteTempMap();
    EXPECT_EQ((DWORD)OBJ_MEMDC, ::GetObjectType(hdc));
    ::DeleteDC(hdc);
}

TEST_F(GdiTest, HalftoneBrushDithersInTextAndBackgroundColours)
{
    CBrush* pBrush = CDC::GetHalftoneBrush();
    ASSERT_NE(nullptr, pBrush);
    EXPECT_EQ(pBrush, CDC::GetHalftoneBrush()) << "one brush for the process";

    Canvas canvas(8, 8);
    CDC& dc = canvas.dc;
    const COLORREF text = RGB(200, 0, 0), back = RGB(0, 0, 200);
    dc.SetTextColor(text);
    dc.SetBkColor(back);
    dc.FillRect(CRect(0, 0, 8, 8), pBrush);
    int nText = 0, nBack = 0;
    for (int y = 0; y < 8; ++y)
        for (int x = 0; x < 8; ++x)
        {
            const COLORREF c = dc.GetPixel(x, y);
            nText += c == text;
            nBack += c == back;
            EXPECT_NE(c, dc.GetPixel((x + 1) % 8, y)) << "neighbours differ at " << x << "," << y;
        }
    EXPECT_EQ(32, nText);
    EXPECT_EQ(32, nBack);
}

TEST_F(GdiTest, PointFontFollowsTheDeviceResolutionTextExtentsMeasureTheString)
{
    CClientDC screen(NULL);
    CFont font;
    ASSERT_TRUE(font.CreatePointFont(120, L"Arial", &screen));
    LOGFONT lf;
    ASSERT_EQ((int)sizeof(LOGFONT), font.GetLogFont(&lf));
    EXPECT_EQ(-::MulDiv(screen.GetDeviceCaps(LOGPIXELSY), 120, 720), lf.lfHeight);
    EXPECT_STREQ(L"Arial", lf.lfFaceName);

    CFont font2;   // without a DC: the screen's resolution
    ASSERT_TRUE(font2.CreatePointFont(90, L"Arial"));
    ASSERT_EQ((int)sizeof(LOGFONT), font2.GetLogFont(&lf));
    EXPECT_EQ(-::MulDiv(screen.GetDeviceCaps(LOGPIXELSY), 90, 720), lf.lfHeight);

    CFont* pOld = screen.SelectObject(&font);
    SIZE expected = { 0, 0 };
    ::GetTextExtentPoint32W(screen.m_hDC, L"Hello", 5, &expected);
    EXPECT_EQ(expected.cx, screen.GetTextExtent(CString(L"Hello")).cx);
    EXPECT_EQ(expected.cx, screen.GetTextExtent(L"Hello", -1).cx) << "a length of -1 measures to the terminator";
    screen.SelectObject(pOld);
}

namespace {

LRESULT CALLBACK PaintWndProc(HWND hWnd, UINT msg, WPARAM wParam, LPARAM lParam)
{
    if (msg != WM_PAINT)
        return ::DefWindowProcW(hWnd, msg, wParam, lParam);
    CPaintDC dc(CWnd::FromHandle(hWnd));
    dc.FillSolidRect(&dc.m_ps.rcPaint, RGB(0, 0, 255));
    return 0;
}

} // namespace

TEST_F(GdiTest, PaintDCValidatesTheWindowClientDCReadsItBack)
{
    WNDCLASSW wc = {};
    wc.lpfnWndProc = PaintWndProc;
    wc.hInstance = ::GetModuleHandleW(NULL);
    wc.lpszClassName = L"AfxGdiTestPaint";
    ::RegisterClassW(&wc);
    HWND hWnd = ::CreateWindowW(wc.lpszClassName, L"", WS_POPUP | WS_VISIBLE, 0, 0, 60, 40, NULL, NULL, wc.hInstance, NULL);
    ASSERT_NE(nullptr, hWnd);
    ::InvalidateRect(hWnd, NULL, TRUE);
    ::UpdateWindow(hWnd);
    RECT rcUpdate;
    EXPECT_FALSE(::GetUpdateRect(hWnd, &rcUpdate, FALSE)) << "EndPaint validated the window";
    {
        CClientDC dc(CWnd::FromHandle(hWnd));
        EXPECT_EQ(hWnd, dc.GetWindow()->GetSafeHwnd());
        EXPECT_EQ(RGB(0, 0, 255), dc.GetPixel(5, 5));
    }
    ::DestroyWindow(hWnd);
    ::UnregisterClassW(wc.lpszClassName, wc.hInstance);
}
