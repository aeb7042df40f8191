// The library frame: how the library joins the host's resource chain, and the resources
// the library relies on as a host sees them.
//  - before LoadOrvaneControlsLibrary the chain finds none of its strings, templates or
//    classes; afterwards it does;
//  - every string number yields its exact text (the system's own texts, byte for byte);
//  - the templates load through the chain by number (the colour pop-up only in German) as
//    dialogs with the controls the library uses;
//  - the slider cursor is 32 x 32 monochrome with its hot spot at (15, 15);
//  - the registered "HeaderCtrl Item" clipboard format; the file version.
#include <afxwin.h>

#include <commctrl.h>
#include <gtest/gtest.h>

#include "KVXHeaderCtrlClipboardFormats.h"
#include "Input.h"
#include "OrvaneLibrary.h"
#include "resource.h"

#include <string>
#include <vector>

namespace {

HMODULE LibraryModule() { return ::GetModuleHandleW(L"OrvaneControlsU.dll"); }

// Must run first: the chain is inspected before the host inserts the library.
TEST(LibraryFrame, ResourceChainFindsTheLibraryOnlyAfterLoading)
{
    ASSERT_NE(LibraryModule(), nullptr);
    CString text;
    EXPECT_FALSE(text.LoadString(IDS_COLOR));
    EXPECT_NE(LibraryModule(), AfxFindResourceHandle(MAKEINTRESOURCE(IDD_COLUMNS_PAGE), RT_DIALOG));
    EXPECT_EQ(nullptr, CRuntimeClass::FromName("CMultiTree")) << "the library's classes are its own until loading";
    orvane_test::LoadLibraryOnce();
    EXPECT_TRUE(text.LoadString(IDS_COLOR));
    EXPECT_EQ(LibraryModule(), AfxFindResourceHandle(MAKEINTRESOURCE(IDD_COLUMNS_PAGE), RT_DIALOG));
    EXPECT_EQ(LibraryModule(), AfxFindResourceHandle(MAKEINTRESOURCE(IDC_SLIDER_CURSOR), RT_GROUP_CURSOR));
    CRuntimeClass* pClass = CRuntimeClass::FromName(L"CMultiTree");
    ASSERT_NE(nullptr, pClass);
    EXPECT_TRUE(pClass->IsDerivedFrom(CRuntimeClass::FromName("KVXMultiTreeBase")));
}

const struct { UINT id; const wchar_t* text; } kStrings[] = {
    { 5100, L"DragListCtrl" },
    { 5101, L"Color" },
    { 5107, L"Overflow !" },
    { 5108, L"Underflow !" },
    { 5109, L"Value is not a number !" },
    { 5110, L"Couldn't convert string !" },
    { 5111, L"Long value not in Range !" },
    { 5112, L"Syntax Error !\n( Only the characters '0' - '9', '.' , 'e'  and 'E' are accepted )" },
    { 5113, L"Double value not in range !" },
    { 5114, L"Value must be inserted in decimal !" },
    { 5115, L"Value must be inserted in binary!\n0b prefix missing !" },
    { 5116, L"Value must be inserted in hexadecimal!\n0x prefix missing !" },
    { 5117, L"Syntax Error !\nOnly the characters '0' and '1' are accepted \nin binary numbers (prefix: \"0b\") ! " },
    { 5118, L"Syntax Error !\nOnly the characters '0' - '9', 'a' - 'f' and 'A' - 'F' are accepted\n"
            L"in hexadecimal numbers (prefix: \"0x\") " },
    { 5119, L"Syntax Error !\nOnly characters from '0' to '9' are accepted in decimal\n"
            L"numbers (binary numbers use prefix \"0b\", hexadecimal\nnumbers use prefix \"0x\")" },
    { 5120, L"Overflow !\n( Value must be smaller than or equal to 2147483647)" },
    { 5121, L"Underflow !\n( Value must be greater than or equal to -2147483648 )" },
};

TEST(LibraryFrame, StringTableYieldsTheExactTextsAndNothingElse)
{
    orvane_test::LoadLibraryOnce();
    for (const auto& s : kStrings)
    {
        CString text;
        EXPECT_TRUE(text.LoadString(s.id)) << s.id;
        EXPECT_EQ(std::wstring(s.text), std::wstring(static_cast<LPCTSTR>(text))) << s.id;
    }
    for (UINT id : { 5099u, 5102u, 5103u, 5104u, 5105u, 5106u, 5122u })
        EXPECT_FALSE(CString().LoadString(id)) << id;
}

using orvane_test::WindowText;

TEST(LibraryFrame, TemplatesLoadThroughTheChainWithTheControlsTheLibraryUses)
{
    orvane_test::LoadLibraryOnce();
    std::vector<WORD> languages;
    ::EnumResourceLanguagesW(LibraryModule(), RT_DIALOG, MAKEINTRESOURCEW(IDD_COLOR_POPUP),
        [](HMODULE, LPCWSTR, LPCWSTR, WORD language, LONG_PTR param) -> BOOL {
            reinterpret_cast<std::vector<WORD>*>(param)->push_back(language);
            return TRUE;
        },
        reinterpret_cast<LONG_PTR>(&languages));
    EXPECT_EQ(std::vector<WORD>{ MAKELANGID(LANG_GERMAN, SUBLANG_GERMAN) }, languages);

    CDialog popup;   // a host asking by number alone gets the German template
    ASSERT_TRUE(popup.Create(IDD_COLOR_POPUP));
    EXPECT_EQ(static_cast<DWORD>(WS_POPUP | DS_MODALFRAME), popup.GetStyle() & (WS_POPUP | DS_MODALFRAME | WS_CHILD));
    EXPECT_EQ(L"Dummy", WindowText(::GetDlgItem(popup, IDC_COLOR_DUMMY)));
    EXPECT_EQ(L"&Other...", WindowText(::GetDlgItem(popup, IDC_COLOR_OTHER)));
    popup.DestroyWindow();

    CWnd host;
    ASSERT_TRUE(host.CreateEx(0, AfxRegisterWndClass(0), _T("host"), WS_POPUP, 0, 0, 400, 300, NULL, NULL));
    CDialog columns, page;
    ASSERT_TRUE(columns.Create(IDD_COLUMNS_PAGE, &host));
    ASSERT_TRUE(page.Create(IDD_MY_PAGE, &host));
    EXPECT_EQ(L"Columns", WindowText(columns));
    EXPECT_EQ(L"My Page", WindowText(page));
    EXPECT_EQ(static_cast<DWORD>(WS_CHILD | WS_DISABLED | WS_CAPTION), columns.GetStyle() & (WS_CHILD | WS_DISABLED | WS_CAPTION));
    CWnd* pList = columns.GetDlgItem(IDC_COLUMNS_LIST);
    ASSERT_NE(nullptr, pList);
    wchar_t cls[32] = {};
    ::GetClassNameW(pList->m_hWnd, cls, 32);
    EXPECT_EQ(0, _wcsicmp(L"SysListView32", cls)) << cls;
    const DWORD listStyle = LVS_REPORT | LVS_SORTASCENDING | LVS_OWNERDRAWFIXED | LVS_NOCOLUMNHEADER;
    EXPECT_EQ(listStyle, pList->GetStyle() & (LVS_TYPEMASK | listStyle));
    host.DestroyWindow();
}

TEST(LibraryFrame, SliderCursorIsMonochromeWithCentralHotSpot)
{
    orvane_test::LoadLibraryOnce();
    HINSTANCE module = AfxFindResourceHandle(MAKEINTRESOURCE(IDC_SLIDER_CURSOR), RT_GROUP_CURSOR);
    HCURSOR cursor = ::LoadCursorW(module, MAKEINTRESOURCEW(IDC_SLIDER_CURSOR));
    ICONINFO info = {};
    ASSERT_TRUE(::GetIconInfo(cursor, &info));
    EXPECT_FALSE(info.fIcon);
    EXPECT_EQ(15u, info.xHotspot);
    EXPECT_EQ(15u, info.yHotspot);
    EXPECT_EQ(nullptr, info.hbmColor) << "a monochrome cursor has only a mask";
    BITMAP mask = {};
    ASSERT_NE(0, ::GetObjectW(info.hbmMask, sizeof mask, &mask));
    EXPECT_EQ(32, mask.bmWidth);
    EXPECT_EQ(64, mask.bmHeight);   // AND mask above XOR mask
    // Arrow tips on the centre column above and below the hot spot, transparent corners.
    HDC dc = ::CreateCompatibleDC(nullptr);
    HGDIOBJ old = ::SelectObject(dc, info.hbmMask);
    EXPECT_EQ(RGB(255, 255, 255), ::GetPixel(dc, 0, 0));
    EXPECT_EQ(RGB(0, 0, 0), ::GetPixel(dc, 15, 7));
    EXPECT_EQ(RGB(0, 0, 0), ::GetPixel(dc, 15, 23));
    ::SelectObject(dc, old);
    ::DeleteDC(dc);
    ::DeleteObject(info.hbmMask);
}

TEST(LibraryFrame, ClipboardFormatAndFileVersion)
{
    EXPECT_EQ(::RegisterClipboardFormatW(L"HeaderCtrl Item"), KVXHeaderCtrlClipboardFormats::HeaderCtrlItem);
    wchar_t path[MAX_PATH];
    ASSERT_NE(0u, ::GetModuleFileNameW(LibraryModule(), path, MAX_PATH));
    DWORD handle = 0;
    std::vector<BYTE> data(::GetFileVersionInfoSizeW(path, &handle));
    ASSERT_TRUE(::GetFileVersionInfoW(path, 0, DWORD(data.size()), data.data()));
    VS_FIXEDFILEINFO* fixed = nullptr;
    UINT length = 0;
    ASSERT_TRUE(::VerQueryValueW(data.data(), L"\\", reinterpret_cast<void**>(&fixed), &length));
    EXPECT_EQ(MAKELONG(7, 3), fixed->dwFileVersionMS);
    EXPECT_EQ(MAKELONG(30, 0), fixed->dwFileVersionLS);
}

} // namespace
