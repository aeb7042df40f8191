// KVXListBoxEx: the horizontal extent follows the widest string.
//  - add and insert widen it (a narrower string leaves it), a failed insert leaves it;
//  - deleting the widest string recomputes it, a narrower one or an invalid index (-1) leave
//    it; reset sets 0; empty strings never count in a recomputation;
//  - filling from a directory recomputes; without a font every extent is 0;
//  - an owner-drawn list box without strings keeps its item data out of the arithmetic.
#include "ButtonsTestSupport.h"

#include <algorithm>

#include "KVXListBoxEx.h"

namespace {

using buttons_test::TestParent;

const CString kShort = _T("ab");
const CString kMiddle = _T("a middle sized entry");
const CString kLong = _T("a very much longer entry than any other in this list box");

class ListBoxExTest : public ::testing::Test
{
protected:
    void SetUp() override { m_font.CreatePointFont(90, _T("Tahoma")); }
    void Create(DWORD extraStyle = 0, bool withFont = true)
    {
        ASSERT_TRUE(m_list.Create(WS_CHILD | WS_VISIBLE | WS_VSCROLL | WS_HSCROLL | LBS_NOTIFY | extraStyle,
                                  CRect(10, 10, 150, 150), &m_parent, 3001));
        if (withFont)
            m_list.SetFont(&m_font);
    }
    // Text width in the list box's font plus the font's average character width.
    int Extent(const CString& text)
    {
        CClientDC dc(&m_list);
        CFont* pOld = dc.SelectObject(&m_font);
        TEXTMETRIC tm;
        dc.GetTextMetrics(&tm);
        const int cx = dc.GetTextExtent(text, text.GetLength()).cx;
        dc.SelectObject(pOld);
        return cx + tm.tmAveCharWidth;
    }
    // The executable's folder with a file pattern.
    static std::wstring Pattern(const wchar_t* files)
    {
        wchar_t path[MAX_PATH];
        ::GetModuleFileNameW(NULL, path, MAX_PATH);
        std::wstring dir(path);
        return dir.substr(0, dir.find_last_of(L'\\') + 1) + files;
    }

    TestParent m_parent;
    CFont m_font;
    KVXListBoxEx m_list;
};

TEST_F(ListBoxExTest, AddAndInsertWidenOnlyForWiderStrings)
{
    Create();
    EXPECT_EQ(0, m_list.AddString(kMiddle));
    EXPECT_EQ(Extent(kMiddle), m_list.GetHorizontalExtent());
    EXPECT_EQ(0, m_list.InsertString(0, kShort));
    EXPECT_EQ(Extent(kMiddle), m_list.GetHorizontalExtent());
    EXPECT_EQ(LB_ERR, m_list.InsertString(7, kLong));
    EXPECT_EQ(Extent(kMiddle), m_list.GetHorizontalExtent());
    EXPECT_EQ(2, m_list.InsertString(-1, kLong));   // -1 appends
    EXPECT_EQ(Extent(kLong), m_list.GetHorizontalExtent());
}

TEST_F(ListBoxExTest, DeletingRecomputesOnlyForTheWidestResetSetsZero)
{
    const struct { int index; int result; bool recomputed; } cases[] = {
        { 1, 2, true }, { 2, 2, false }, { 3, LB_ERR, false }, { -1, LB_ERR, false },
    };
    Create();
    for (const auto& c : cases)
    {
        m_list.ResetContent();
        EXPECT_EQ(0, m_list.GetHorizontalExtent());
        m_list.AddString(kMiddle);
        m_list.AddString(kLong);
        m_list.AddString(kShort);
        EXPECT_EQ(c.result, m_list.DeleteString(static_cast<UINT>(c.index))) << c.index;
        EXPECT_EQ(c.recomputed ? Extent(kMiddle) : Extent(kLong), m_list.GetHorizontalExtent()) << c.index;
    }
    m_list.ResetContent();
    m_list.AddString(_T(""));
    m_list.AddString(kLong);
    m_list.AddString(_T(""));
    EXPECT_EQ(2, m_list.DeleteString(1));
    EXPECT_EQ(0, m_list.GetHorizontalExtent()) << "empty strings never count";
}

TEST_F(ListBoxExTest, DirRecomputesFromTheEntries)
{
    Create();
    m_list.AddString(kLong);
    ASSERT_GE(m_list.Dir(0, Pattern(L"*.dll").c_str()), 1);
    m_list.ResetContent();
    ASSERT_GE(m_list.Dir(0, Pattern(L"*.dll").c_str()), 0);
    int widest = 0;
    for (int i = 0; i < m_list.GetCount(); ++i)
    {
        CString s;
        m_list.GetText(i, s);
        widest = std::max(widest, Extent(s));
    }
    EXPECT_GT(widest, 0);
    EXPECT_EQ(widest, m_list.GetHorizontalExtent());
}

TEST_F(ListBoxExTest, WithoutAFontEveryExtentIsZeroOwnerDrawDataStaysOut)
{
    Create(0, false);
    m_list.AddString(kLong);
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
    m_list.SetHorizontalExtent(500);
    ASSERT_GE(m_list.Dir(0, Pattern(L"*.exe").c_str()), 1);
    EXPECT_EQ(0, m_list.GetHorizontalExtent()) << "a recomputation gives 0 as well";

    m_list.DestroyWindow();
    Create(LBS_OWNERDRAWFIXED);
    // Item data, not a string pointer: must never be read as text.
    EXPECT_EQ(0, m_list.AddString(reinterpret_cast<LPCTSTR>(static_cast<UINT_PTR>(0x42))));
    EXPECT_EQ(1, m_list.InsertString(-1, reinterpret_cast<LPCTSTR>(static_cast<UINT_PTR>(0x43))));
    EXPECT_EQ(1, m_list.DeleteString(0));
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
}

} // namespace
