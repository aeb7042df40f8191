// The gallery: a host application that shows each family of controls on a page
// of its own. With "/screenshots <folder>" it paints every page once, writes a
// bitmap of it into the folder (page01-library.bmp, ...; a page with variants adds
// one picture per variant, e.g. page04-list-type0.bmp) and quits (used where there
// is no display).
#include <afxwin.h>
#include <afxole.h>
#include <commctrl.h>

#include "GalleryPage.h"
#include "OrvaneControls.h"

#include <cwctype>

namespace {

GalleryPageEntry* g_firstPage = nullptr;

const int kWindowWidth = 900;
const int kWindowHeight = 640;

bool SaveClientBitmap(HWND hwnd, const CString& path)
{
    RECT rc;
    ::GetClientRect(hwnd, &rc);
    HDC screen = ::GetDC(hwnd);
    HDC mem = ::CreateCompatibleDC(screen);
    BITMAPINFO info = {};
    info.bmiHeader.biSize = sizeof(BITMAPINFOHEADER);
    info.bmiHeader.biWidth = rc.right;
    info.bmiHeader.biHeight = rc.bottom;
    info.bmiHeader.biPlanes = 1;
    info.bmiHeader.biBitCount = 24;
    info.bmiHeader.biCompression = BI_RGB;
    void* bits = nullptr;
    HBITMAP dib = ::CreateDIBSection(screen, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
    HGDIOBJ old = ::SelectObject(mem, dib);
    ::BitBlt(mem, 0, 0, rc.right, rc.bottom, screen, 0, 0, SRCCOPY);
    // Popups of the page over the window (a tip) are separate windows: add them as shown.
    struct Popups { HWND main; HDC mem; POINT origin; } popups = { hwnd, mem, { 0, 0 } };
    ::ClientToScreen(hwnd, &popups.origin);
    ::EnumThreadWindows(::GetCurrentThreadId(), [](HWND popup, LPARAM lParam) -> BOOL {
        const Popups* p = reinterpret_cast<const Popups*>(lParam);
        RECT rcPopup;
        if (popup == p->main || !::IsWindowVisible(popup) || !::GetWindowRect(popup, &rcPopup))
            return TRUE;
        HDC dc = ::GetWindowDC(popup);
        ::BitBlt(p->mem, rcPopup.left - p->origin.x, rcPopup.top - p->origin.y, rcPopup.right - rcPopup.left,
                 rcPopup.bottom - rcPopup.top, dc, 0, 0, SRCCOPY);
        ::ReleaseDC(popup, dc);
        return TRUE;
    }, reinterpret_cast<LPARAM>(&popups));
    ::GdiFlush();
    ::SelectObject(mem, old);

    DWORD stride = ((rc.right * 3 + 3) / 4) * 4;
    DWORD imageSize = stride * rc.bottom;
    BITMAPFILEHEADER file = {};
    file.bfType = 0x4D42;
    file.bfOffBits = sizeof(BITMAPFILEHEADER) + sizeof(BITMAPINFOHEADER);
    file.bfSize = file.bfOffBits + imageSize;
    bool ok = false;
    HANDLE h = ::CreateFileW(path, GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr);
    if (h != INVALID_HANDLE_VALUE)
    {
        DWORD written = 0;
        ok = ::WriteFile(h, &file, sizeof file, &written, nullptr) &&
             ::WriteFile(h, &info.bmiHeader, sizeof info.bmiHeader, &written, nullptr) &&
             ::WriteFile(h, bits, imageSize, &written, nullptr);
        ::CloseHandle(h);
    }
    ::DeleteObject(dib);
    ::DeleteDC(mem);
    ::ReleaseDC(hwnd, screen);
    return ok;
}

// "Numeric edits" -> "numeric-edits": a file name that stays when pages are added.
CString FileNameOf(LPCTSTR title)
{
    CString name;
    bool bGap = false;
    for (LPCTSTR p = title; *p != 0; ++p)
    {
        if (!iswalnum(*p))
        {
            bGap = true;
            continue;
        }
        if (bGap && !name.IsEmpty())
            name += _T('-');
        name += static_cast<TCHAR>(towlower(*p));
        bGap = false;
    }
    return name;
}

} // namespace

CFont* CGalleryPage::GuiFont()
{
    return CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT)));
}

bool CGalleryPage::InScreenshotMode()
{
    return wcsstr(::GetCommandLineW(), L"/screenshots") != nullptr;
}

void CGalleryPage::CreateCheckBoxImages(CImageList& images, CWnd* pWnd)
{
    images.Create(16, 16, ILC_COLOR24 | ILC_MASK, 2, 0);
    CClientDC screen(pWnd);
    for (int i = 0; i < 2; ++i)
    {
        CDC dc;
        dc.CreateCompatibleDC(&screen);
        CBitmap bitmap;
        bitmap.CreateCompatibleBitmap(&screen, 16, 16);
        CBitmap* pOldBitmap = dc.SelectObject(&bitmap);
        dc.FillSolidRect(0, 0, 16, 16, ::GetSysColor(COLOR_WINDOW));
        CRect box(2, 2, 15, 15);
        dc.DrawFrameControl(&box, DFC_BUTTON, DFCS_BUTTONCHECK | DFCS_FLAT | (i == 1 ? DFCS_CHECKED : 0));
        dc.SelectObject(pOldBitmap);
        images.Add(&bitmap, RGB(255, 0, 255));
    }
}

GalleryPageEntry::GalleryPageEntry(int order_, GalleryPageFactory factory_)
    : order(order_), factory(factory_), next(nullptr)
{
    GalleryPageEntry** link = &g_firstPage;
    while (*link && (*link)->order <= order)
        link = &(*link)->next;
    next = *link;
    *link = this;
}

GalleryPageEntry* GetGalleryPages()
{
    return g_firstPage;
}

class CGalleryWnd : public CWnd
{
public:
    BOOL CreateGallery();
    void ShowPage(int index);
    int GetPageCount() const { return static_cast<int>(m_pages.GetSize()); }
    CGalleryPage* GetPage(int index) const { return static_cast<CGalleryPage*>(m_pages.GetAt(index)); }
    LPCTSTR GetPageTitle(int index) const { return static_cast<CGalleryPage*>(m_pages.GetAt(index))->GetTitle(); }

protected:
    afx_msg int OnCreate(LPCREATESTRUCT lpCreateStruct);
    afx_msg void OnDestroy();
    afx_msg void OnSize(UINT nType, int cx, int cy);
    afx_msg void OnTabChange(NMHDR* pNMHDR, LRESULT* pResult);
    virtual void PostNcDestroy();
    DECLARE_MESSAGE_MAP()

private:
    CRect PageRect() const;

    CWnd m_tabs;
    CPtrArray m_pages;
    int m_current = -1;
};

BEGIN_MESSAGE_MAP(CGalleryWnd, CWnd)
    ON_WM_CREATE()
    ON_WM_DESTROY()
    ON_WM_SIZE()
    ON_NOTIFY(TCN_SELCHANGE, 1, &CGalleryWnd::OnTabChange)
END_MESSAGE_MAP()

BOOL CGalleryWnd::CreateGallery()
{
    CString cls = AfxRegisterWndClass(CS_HREDRAW | CS_VREDRAW, ::LoadCursor(nullptr, IDC_ARROW),
                                      reinterpret_cast<HBRUSH>(COLOR_BTNFACE + 1));
    return CreateEx(0, cls, _T("OrvaneControls Gallery"), WS_OVERLAPPEDWINDOW | WS_CLIPCHILDREN,
                    CW_USEDEFAULT, CW_USEDEFAULT, kWindowWidth, kWindowHeight, nullptr, nullptr);
}

int CGalleryWnd::OnCreate(LPCREATESTRUCT lpCreateStruct)
{
    if (CWnd::OnCreate(lpCreateStruct) == -1)
        return -1;
    CRect client;
    GetClientRect(&client);
    if (!m_tabs.Create(WC_TABCONTROL, nullptr, WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS, client, this, 1))
        return -1;
    m_tabs.SetFont(CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT))));

    int index = 0;
    for (GalleryPageEntry* entry = GetGalleryPages(); entry; entry = entry->next)
    {
        CGalleryPage* page = entry->factory();
        TCITEMW item = {};
        item.mask = TCIF_TEXT;
        item.pszText = const_cast<LPWSTR>(page->GetTitle());
        m_tabs.SendMessage(TCM_INSERTITEMW, index, reinterpret_cast<LPARAM>(&item));
        CRect rc = PageRect();
        CString cls = AfxRegisterWndClass(0, ::LoadCursor(nullptr, IDC_ARROW),
                                          reinterpret_cast<HBRUSH>(COLOR_BTNFACE + 1));
        page->Create(cls, page->GetTitle(), WS_CHILD | WS_CLIPCHILDREN, rc, this, 100 + index);
        page->CreateControls();
        m_pages.Add(page);
        ++index;
    }
    ShowPage(0);
    return 0;
}

void CGalleryWnd::OnDestroy()
{
    for (INT_PTR i = 0; i < m_pages.GetSize(); ++i)
    {
        CGalleryPage* page = static_cast<CGalleryPage*>(m_pages[i]);
        page->DestroyWindow();
        delete page;
    }
    m_pages.RemoveAll();
    CWnd::OnDestroy();
}

void CGalleryWnd::PostNcDestroy()
{
    ::PostQuitMessage(0);
    delete this;
}

CRect CGalleryWnd::PageRect() const
{
    CRect rc;
    GetClientRect(&rc);
    if (m_tabs.GetSafeHwnd())
        ::SendMessage(m_tabs.GetSafeHwnd(), TCM_ADJUSTRECT, FALSE, reinterpret_cast<LPARAM>(static_cast<LPRECT>(rc)));
    return rc;
}

void CGalleryWnd::OnSize(UINT nType, int cx, int cy)
{
    CWnd::OnSize(nType, cx, cy);
    if (!m_tabs.GetSafeHwnd())
        return;
    m_tabs.MoveWindow(0, 0, cx, cy);
    CRect rc = PageRect();
    for (INT_PTR i = 0; i < m_pages.GetSize(); ++i)
        static_cast<CWnd*>(m_pages[i])->MoveWindow(rc);
}

void CGalleryWnd::ShowPage(int index)
{
    if (index < 0 || index >= GetPageCount())
        return;
    if (m_current >= 0)
        static_cast<CWnd*>(m_pages[m_current])->ShowWindow(SW_HIDE);
    m_current = index;
    m_tabs.SendMessage(TCM_SETCURSEL, index, 0);
    CWnd* page = static_cast<CWnd*>(m_pages[index]);
    page->SetWindowPos(&CWnd::wndTop, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_SHOWWINDOW);
}

void CGalleryWnd::OnTabChange(NMHDR*, LRESULT* pResult)
{
    ShowPage(static_cast<int>(m_tabs.SendMessage(TCM_GETCURSEL)));
    *pResult = 0;
}

class CGalleryApp : public CWinApp
{
public:
    CGalleryApp() : CWinApp(_T("OrvaneControls Gallery")) {}
    virtual BOOL InitInstance();

private:
    void WriteScreenshots(CGalleryWnd* wnd, const CString& folder);
};

CGalleryApp theApp;

BOOL CGalleryApp::InitInstance()
{
    INITCOMMONCONTROLSEX icc = { sizeof icc, ICC_WIN95_CLASSES | ICC_TAB_CLASSES };
    ::InitCommonControlsEx(&icc);
    LoadOrvaneControlsLibrary();
    // The column page drags its columns over OLE.
    if (!AfxOleInit())
        return FALSE;

    CGalleryWnd* wnd = new CGalleryWnd;
    if (!wnd->CreateGallery())
    {
        delete wnd;
        return FALSE;
    }
    m_pMainWnd = wnd;
    wnd->ShowWindow(SW_SHOW);
    wnd->UpdateWindow();

    int argc = 0;
    LPWSTR* argv = ::CommandLineToArgvW(::GetCommandLineW(), &argc);
    CString folder;
    for (int i = 1; i + 1 < argc; ++i)
        if (lstrcmpiW(argv[i], L"/screenshots") == 0)
            folder = argv[i + 1];
    ::LocalFree(argv);
    if (!folder.IsEmpty())
    {
        WriteScreenshots(wnd, folder);
        m_pMainWnd = nullptr;
        wnd->DestroyWindow();
        return FALSE;
    }
    return TRUE;
}

void CGalleryApp::WriteScreenshots(CGalleryWnd* wnd, const CString& folder)
{
    wnd->SetForegroundWindow();
    for (int i = 0; i < wnd->GetPageCount(); ++i)
    {
        wnd->ShowPage(i);
        CString name = FileNameOf(wnd->GetPageTitle(i));
        for (int variant = -1; variant < wnd->GetPage(i)->GetScreenshotVariantCount(); ++variant)
        {
            if (variant >= 0)
                name = FileNameOf(wnd->GetPageTitle(i)) + _T("-") + wnd->GetPage(i)->ShowScreenshotVariant(variant);
            wnd->RedrawWindow(nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW | RDW_ALLCHILDREN);
            // Let posted work (layouts, timers of the pages) settle before the picture.
            DWORD until = ::GetTickCount() + 300;
            MSG msg;
            while (::GetTickCount() < until)
            {
                while (::PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE))
                {
                    ::TranslateMessage(&msg);
                    ::DispatchMessageW(&msg);
                }
                ::Sleep(10);
            }
            wnd->RedrawWindow(nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW | RDW_ALLCHILDREN);
            CString path;
            path.Format(_T("%s\\page%02d-%s.bmp"), static_cast<LPCTSTR>(folder), i + 1, static_cast<LPCTSTR>(name));
            SaveClientBitmap(wnd->GetSafeHwnd(), path);
        }
    }
}
