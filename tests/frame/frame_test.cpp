// The library frame: how the library joins the host's resource chain, and its
// resource catalogue as a host sees it.
//  - before LoadOrvaneControlsLibrary the host's chain finds none of its strings;
//    afterwards every string number yields its exact text
//  - the dialog templates carry their styles, captions, sizes, languages and controls
//  - the slider cursor is 32 x 32 monochrome with its hot spot at (15, 15)
//  - the process-wide clipboard format is the registered "HeaderCtrl Item"
//  - the file version record
//  - the library's run-time classes are found by name once it is loaded
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "DialogTemplateReader.h"
#include "KVXHeaderCtrlClipboardFormats.h"
#include "OrvaneControls.h"
#include "resource.h"

#include <string>

namespace {

HMODULE LibraryModule()
{
    return ::GetModuleHandleW(L"OrvaneControlsU.dll");
}

void EnsureLibraryLoaded()
{
    static bool loaded = false;
    if (!loaded)
    {
        LoadOrvaneControlsLibrary();
        loaded = true;
    }
}

std::wstring Load(UINT id)
{
    CString text;
    if (!text.LoadString(id))
        return L"<missing>";
    return std::wstring(static_cast<LPCTSTR>(text));
}

// Must run first: the chain is inspected before the host inserts the library.
TEST(LibraryFrame, ResourceChainFindsTheLibraryOnlyAfterLoading)
{
    ASSERT_NE(LibraryModule(), nullptr);
    CString text;
    EXPECT_FALSE(text.LoadString(IDS_COLOR));
    EXPECT_NE(AfxFindResourceHandle(MAKEINTRESOURCE(IDD_COLUMNS_PAGE), RT_DIALOG), LibraryModule());
    EXPECT_EQ(nullptr, CRuntimeClass::FromName("CMultiTree")) << "the library's classes are its own until loading";

    EnsureLibraryLoaded();

    EXPECT_TRUE(text.LoadString(IDS_COLOR));
    EXPECT_STREQ(L"Color", static_cast<LPCTSTR>(text));
    EXPECT_EQ(AfxFindResourceHandle(MAKEINTRESOURCE(IDD_COLUMNS_PAGE), RT_DIALOG), LibraryModule());
    EXPECT_EQ(AfxFindResourceHandle(MAKEINTRESOURCE(IDC_SLIDER_CURSOR), RT_GROUP_CURSOR), LibraryModule());
}

TEST(LibraryFrame, RunTimeClassRecordsAreFoundByName)
{
    EnsureLibraryLoaded();
    CRuntimeClass* tree = CRuntimeClass::FromName("KVXMultiTreeBase");
    CRuntimeClass* multi = CRuntimeClass::FromName(L"CMultiTree");
    ASSERT_NE(nullptr, tree);
    ASSERT_NE(nullptr, multi);
    EXPECT_STREQ("KVXMultiTreeBase", tree->m_lpszClassName);
    EXPECT_EQ(0xFFFF, tree->m_wSchema);
    EXPECT_TRUE(multi->IsDerivedFrom(tree));
    EXPECT_TRUE(tree->IsDerivedFrom(RUNTIME_CLASS(CTreeCtrl)));
    EXPECT_EQ(nullptr, multi->m_pfnCreateObject) << "only the base is dynamically creatable";

    CObject* created = tree->CreateObject();
    ASSERT_NE(nullptr, created);
    EXPECT_TRUE(created->IsKindOf(RUNTIME_CLASS(CTreeCtrl)));
    EXPECT_EQ(tree, created->GetRuntimeClass());
    delete created;
}

struct StringCase
{
    const char* name;
    UINT id;
    const wchar_t* text;
};

const StringCase kStrings[] = {
    { "DragListCtrl", 5100, L"DragListCtrl" },
    { "Color", 5101, L"Color" },
    { "DoubleOverflow", 5107, L"Overflow !" },
    { "DoubleUnderflow", 5108, L"Underflow !" },
    { "NotANumber", 5109, L"Value is not a number !" },
    { "CannotConvert", 5110, L"Couldn't convert string !" },
    { "LongNotInRange", 5111, L"Long value not in Range !" },
    { "DoubleSyntax", 5112, L"Syntax Error !\n( Only the characters '0' - '9', '.' , 'e'  and 'E' are accepted )" },
    { "DoubleNotInRange", 5113, L"Double value not in range !" },
    { "MustBeDecimal", 5114, L"Value must be inserted in decimal !" },
    { "MustBeBinary", 5115, L"Value must be inserted in binary!\n0b prefix missing !" },
    { "MustBeHexadecimal", 5116, L"Value must be inserted in hexadecimal!\n0x prefix missing !" },
    { "BinarySyntax", 5117,
      L"Syntax Error !\nOnly the characters '0' and '1' are accepted \nin binary numbers (prefix: \"0b\") ! " },
    { "HexadecimalSyntax", 5118,
      L"Syntax Error !\nOnly the characters '0' - '9', 'a' - 'f' and 'A' - 'F' are accepted\n"
      L"in hexadecimal numbers (prefix: \"0x\") " },
    { "DecimalSyntax", 5119,
      L"Syntax Error !\nOnly characters from '0' to '9' are accepted in decimal\n"
      L"numbers (binary numbers use prefix \"0b\", hexadecimal\nnumbers use prefix \"0x\")" },
    { "LongOverflow", 5120, L"Overflow !\n( Value must be smaller than or equal to 2147483647)" },
    { "LongUnderflow", 5121, L"Underflow !\n( Value must be greater than or equal to -2147483648 )" },
};

class StringTable : public testing::TestWithParam<StringCase>
{
protected:
    void SetUp() override { EnsureLibraryLoaded(); }
};

TEST_P(StringTable, YieldsTheExactText)
{
    EXPECT_EQ(std::wstring(GetParam().text), Load(GetParam().id));
}

INSTANTIATE_TEST_SUITE_P(LibraryFrame, StringTable, testing::ValuesIn(kStrings),
                         [](const testing::TestParamInfo<StringCase>& info) { return std::string(info.param.name); });

TEST(LibraryFrame, NumbersOutsideTheTableHaveNoText)
{
    EnsureLibraryLoaded();
    for (UINT id : { 5102u, 5103u, 5104u, 5105u, 5106u, 5099u, 5122u })
    {
        CString text;
        EXPECT_FALSE(text.LoadString(id)) << id;
        EXPECT_TRUE(text.IsEmpty()) << id;
    }
}

DialogTemplateInfo ReadTemplate(UINT id, WORD language)
{
    HRSRC res = ::FindResourceExW(LibraryModule(), RT_DIALOG, MAKEINTRESOURCEW(id), language);
    if (!res)
        return DialogTemplateInfo();
    HGLOBAL mem = ::LoadResource(LibraryModule(), res);
    return ReadDialogTemplate(::LockResource(mem), ::SizeofResource(LibraryModule(), res));
}

std::vector<WORD> DialogLanguages(UINT id)
{
    std::vector<WORD> languages;
    ::EnumResourceLanguagesW(LibraryModule(), RT_DIALOG, MAKEINTRESOURCEW(id),
        [](HMODULE, LPCWSTR, LPCWSTR, WORD language, LONG_PTR param) -> BOOL {
            reinterpret_cast<std::vector<WORD>*>(param)->push_back(language);
            return TRUE;
        },
        reinterpret_cast<LONG_PTR>(&languages));
    return languages;
}

const WORD kEnglishUS = MAKELANGID(LANG_ENGLISH, SUBLANG_ENGLISH_US);
const WORD kGerman = MAKELANGID(LANG_GERMAN, SUBLANG_GERMAN);

TEST(LibraryFrame, PageTemplatesAreDisabledChildrenWithCaption)
{
    const DWORD kPageStyle = WS_CHILD | WS_DISABLED | WS_CAPTION | DS_SETFONT;

    EXPECT_EQ(std::vector<WORD>{ kEnglishUS }, DialogLanguages(IDD_MY_PAGE));
    DialogTemplateInfo page = ReadTemplate(IDD_MY_PAGE, kEnglishUS);
    ASSERT_TRUE(page.valid);
    EXPECT_EQ(kPageStyle, page.style);
    EXPECT_EQ(L"My Page", page.caption);
    EXPECT_EQ(183, page.cx);
    EXPECT_EQ(94, page.cy);
    EXPECT_EQ(8, page.pointSize);
    EXPECT_EQ(L"MS Sans Serif", page.fontName);
    EXPECT_TRUE(page.controls.empty());

    EXPECT_EQ(std::vector<WORD>{ kEnglishUS }, DialogLanguages(IDD_COLUMNS_PAGE));
    DialogTemplateInfo columns = ReadTemplate(IDD_COLUMNS_PAGE, kEnglishUS);
    ASSERT_TRUE(columns.valid);
    EXPECT_EQ(kPageStyle, columns.style);
    EXPECT_EQ(L"Columns", columns.caption);
    EXPECT_EQ(210, columns.cx);
    EXPECT_EQ(154, columns.cy);
    EXPECT_EQ(L"MS Sans Serif", columns.fontName);
    ASSERT_EQ(1u, columns.controls.size());
    const DialogControlInfo& list = columns.controls[0];
    EXPECT_EQ(IDC_COLUMNS_LIST, list.id);
    // Class names are matched without regard to case; the resource compiler stores them upper-cased.
    EXPECT_EQ(0, _wcsicmp(L"SysListView32", list.className.c_str())) << list.className;
    EXPECT_EQ(L"List1", list.text);
    EXPECT_EQ(7, list.x);
    EXPECT_EQ(7, list.y);
    EXPECT_EQ(196, list.cx);
    EXPECT_EQ(140, list.cy);
    EXPECT_EQ(static_cast<DWORD>(WS_CHILD | WS_VISIBLE | WS_BORDER | WS_TABSTOP | LVS_REPORT |
                                 LVS_SORTASCENDING | LVS_OWNERDRAWFIXED | LVS_NOCOLUMNHEADER),
              list.style);
}

TEST(LibraryFrame, ColourPopupTemplateIsGerman)
{
    EXPECT_EQ(std::vector<WORD>{ kGerman }, DialogLanguages(IDD_COLOR_POPUP));
    DialogTemplateInfo popup = ReadTemplate(IDD_COLOR_POPUP, kGerman);
    ASSERT_TRUE(popup.valid);
    EXPECT_EQ(static_cast<DWORD>(WS_POPUP | DS_MODALFRAME | DS_SETFONT), popup.style);
    EXPECT_EQ(L"", popup.caption);
    EXPECT_EQ(54, popup.cx);
    EXPECT_EQ(62, popup.cy);
    ASSERT_EQ(2u, popup.controls.size());

    struct Expected { WORD id; const wchar_t* text; short y; };
    const Expected expected[] = { { IDC_COLOR_DUMMY, L"Dummy", 18 }, { IDC_COLOR_OTHER, L"&Other...", 41 } };
    for (size_t i = 0; i < 2; ++i)
    {
        const DialogControlInfo& button = popup.controls[i];
        EXPECT_EQ(expected[i].id, button.id);
        EXPECT_EQ(expected[i].text, button.text);
        EXPECT_EQ(L"Button", button.className);
        EXPECT_EQ(4, button.x);
        EXPECT_EQ(expected[i].y, button.y);
        EXPECT_EQ(50, button.cx);
        EXPECT_EQ(14, button.cy);
        EXPECT_EQ(static_cast<DWORD>(WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_PUSHBUTTON), button.style);
    }

    // A host asking by number alone gets the German template through the chain.
    EnsureLibraryLoaded();
    HINSTANCE module = AfxFindResourceHandle(MAKEINTRESOURCE(IDD_COLOR_POPUP), RT_DIALOG);
    EXPECT_EQ(LibraryModule(), module);
    EXPECT_NE(nullptr, ::FindResourceW(module, MAKEINTRESOURCEW(IDD_COLOR_POPUP), RT_DIALOG));
}

TEST(LibraryFrame, SliderCursorIsMonochromeWithCentralHotSpot)
{
    EnsureLibraryLoaded();
    HINSTANCE module = AfxFindResourceHandle(MAKEINTRESOURCE(IDC_SLIDER_CURSOR), RT_GROUP_CURSOR);
    HCURSOR cursor = ::LoadCursorW(module, MAKEINTRESOURCEW(IDC_SLIDER_CURSOR));
    ASSERT_NE(nullptr, cursor);

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
    EXPECT_EQ(1, mask.bmBitsPixel);

    // The picture: arrow tips on the centre column above and below the hot spot,
    // transparent corners.
    HDC dc = ::CreateCompatibleDC(nullptr);
    HGDIOBJ old = ::SelectObject(dc, info.hbmMask);
    EXPECT_EQ(RGB(255, 255, 255), ::GetPixel(dc, 0, 0)) << "corner transparent in the AND mask";
    EXPECT_EQ(RGB(0, 0, 0), ::GetPixel(dc, 15, 7)) << "upper arrow opaque";
    EXPECT_EQ(RGB(0, 0, 0), ::GetPixel(dc, 15, 23)) << "lower arrow opaque";
    EXPECT_EQ(RGB(0, 0, 0), ::GetPixel(dc, 12, 14)) << "bar opaque";
    ::SelectObject(dc, old);
    ::DeleteDC(dc);
    ::DeleteObject(info.hbmMask);
}

TEST(LibraryFrame, ClipboardFormatIsTheRegisteredName)
{
    UINT expected = ::RegisterClipboardFormatW(L"HeaderCtrl Item");
    EXPECT_NE(0u, expected);
    EXPECT_EQ(expected, KVXHeaderCtrlClipboardFormats::HeaderCtrlItem);
    wchar_t name[64] = {};
    ::GetClipboardFormatNameW(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem, name, 64);
    EXPECT_STREQ(L"HeaderCtrl Item", name);
}

TEST(LibraryFrame, FileVersionIs3_7_0_30)
{
    wchar_t path[MAX_PATH];
    ASSERT_NE(0u, ::GetModuleFileNameW(LibraryModule(), path, MAX_PATH));
    DWORD handle = 0;
    DWORD size = ::GetFileVersionInfoSizeW(path, &handle);
    ASSERT_GT(size, 0u);
    std::vector<BYTE> data(size);
    ASSERT_TRUE(::GetFileVersionInfoW(path, 0, size, data.data()));
    VS_FIXEDFILEINFO* fixed = nullptr;
    UINT length = 0;
    ASSERT_TRUE(::VerQueryValueW(data.data(), L"\\", reinterpret_cast<void**>(&fixed), &length));
    EXPECT_EQ(MAKELONG(7, 3), fixed->dwFileVersionMS);
    EXPECT_EQ(MAKELONG(30, 0), fixed->dwFileVersionLS);
}

} // namespace
