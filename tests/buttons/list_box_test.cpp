// KVXListBoxEx: the horizontal extent follows the widest string.
//  - add and insert widen it (a narrower string leaves it), an insert that fails leaves it;
//  - deleting the widest string recomputes it, a narrower one leaves it, an invalid index
//    returns -1 and leaves it;
//  - reset sets 0; empty strings never count in a recomputation;
//  - filling from a directory recomputes; without a font every extent is 0;
//  - an owner-drawn list box without strings keeps its item data out of the arithmetic.
#include <afxwin.h>

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ButtonsTestSupport.h"
#include "KVXListBoxEx.h"

namespace {

using buttons_test::TestParent;

class ListBoxExTest : public ::testing::Test
{
protected:
    void SetUp() override
    {
        m_parent = std::make_unique<TestParent>();
        m_font.CreatePointFont(90, _T("Tahoma"));
    }

    void Create(DWORD extraStyle = 0, bool withFont = true)
    {
        ASSERT_TRUE(m_list.Create(WS_CHILD | WS_VISIBLE | WS_VSCROLL | WS_HSCROLL | LBS_NOTIFY | extraStyle,
                                  CRect(10, 10, 150, 150), m_parent.get(), 3001));
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

    std::unique_ptr<TestParent> m_parent;
    CFont m_font;
    KVXListBoxEx m_list;
};

const CString kShort = _T("ab");
const CString kMiddle = _T("a middle sized entry");
const CString kLong = _T("a very much longer entry than any other in this list box");

TEST_F(ListBoxExTest, AddWidensOnlyForWiderStrings)
{
    Create();
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
    EXPECT_EQ(0, m_list.AddString(kMiddle));
    EXPECT_EQ(Extent(kMiddle), m_list.GetHorizontalExtent());
    EXPECT_EQ(1, m_list.AddString(kShort));
    EXPECT_EQ(Extent(kMiddle), m_list.GetHorizontalExtent());
    EXPECT_EQ(2, m_list.AddString(kLong));
    EXPECT_EQ(Extent(kLong), m_list.GetHorizontalExtent());
}

TEST_F(ListBoxExTest, InsertWidensAndAFailedInsertLeavesTheExtent)
{
    Create();
    m_list.AddString(kShort);
    EXPECT_EQ(0, m_list.InsertString(0, kMiddle));
    EXPECT_EQ(Extent(kMiddle), m_list.GetHorizontalExtent());
    EXPECT_EQ(LB_ERR, m_list.InsertString(7, kLong));
    EXPECT_EQ(Extent(kMiddle), m_list.GetHorizontalExtent());
    EXPECT_EQ(2, m_list.GetCount());
    EXPECT_EQ(2, m_list.InsertString(-1, kLong));   // -1 appends
    EXPECT_EQ(Extent(kLong), m_list.GetHorizontalExtent());
}

struct DeleteCase
{
    const char* name;
    int index;            // index deleted from { kMiddle, kLong, kShort }
    int result;
    int expectedOf;       // the remaining string whose extent is expected; -1: kLong unchanged
};

const DeleteCase kDeleteCases[] = {
    { "Widest", 1, 2, 0 },
    { "Narrower", 2, 2, -1 },
    { "Invalid", 3, LB_ERR, -1 },
    { "Negative", -1, LB_ERR, -1 },
};

class ListBoxExDelete : public ListBoxExTest, public ::testing::WithParamInterface<DeleteCase> {};

TEST_P(ListBoxExDelete, RecomputesOnlyForTheWidest)
{
    const DeleteCase& c = GetParam();
    Create();
    m_list.AddString(kMiddle);
    m_list.AddString(kLong);
    m_list.AddString(kShort);
    EXPECT_EQ(c.result, m_list.DeleteString(static_cast<UINT>(c.index)));
    const int expected = c.expectedOf == 0 ? Extent(kMiddle) : Extent(kLong);
    EXPECT_EQ(expected, m_list.GetHorizontalExtent());
}

INSTANTIATE_TEST_SUITE_P(Cases, ListBoxExDelete, ::testing::ValuesIn(kDeleteCases),
                         [](const ::testing::TestParamInfo<DeleteCase>& info) { return std::string(info.param.name); });

TEST_F(ListBoxExTest, DeletingDownToEmptyStringsGivesZero)
{
    Create();
    m_list.AddString(_T(""));
    m_list.AddString(kLong);
    m_list.AddString(_T(""));
    EXPECT_EQ(Extent(kLong), m_list.GetHorizontalExtent());
    EXPECT_EQ(2, m_list.DeleteString(1));
    // Empty strings never count in a recomputation.
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
}

TEST_F(ListBoxExTest, ResetSetsZero)
{
    Create();
    m_list.AddString(kLong);
    m_list.ResetContent();
    EXPECT_EQ(0, m_list.GetCount());
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
    m_list.AddString(kShort);
    EXPECT_EQ(Extent(kShort), m_list.GetHorizontalExtent());
}

TEST_F(ListBoxExTest, DirRecomputesFromTheEntries)
{
    Create();
    m_list.AddString(kLong);
    wchar_t dir[MAX_PATH];
    ::GetModuleFileNameW(NULL, dir, MAX_PATH);
    std::wstring pattern(dir);
    pattern = pattern.substr(0, pattern.find_last_of(L'\\') + 1) + L"*.dll";
    const int result = m_list.Dir(0, pattern.c_str());
    ASSERT_GE(result, 1);
    // The long string is still there, so it stays the widest; remove it and refill.
    m_list.ResetContent();
    ASSERT_GE(m_list.Dir(0, pattern.c_str()), 0);
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

TEST_F(ListBoxExTest, WithoutAFontEveryExtentIsZero)
{
    Create(0, false);
    m_list.AddString(kLong);
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
    // A recomputation gives 0 as well.
    m_list.SetHorizontalExtent(500);
    wchar_t dir[MAX_PATH];
    ::GetModuleFileNameW(NULL, dir, MAX_PATH);
    std::wstring pattern(dir);
    pattern = pattern.substr(0, pattern.find_last_of(L'\\') + 1) + L"*.exe";
    ASSERT_GE(m_list.Dir(0, pattern.c_str()), 1);
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
}

TEST_F(ListBoxExTest, OwnerDrawWithoutStringsKeepsItemDataOutOfTheExtent)
{
    Create(LBS_OWNERDRAWFIXED);
    // Item data, not a string pointer: must never be read as text.
    EXPECT_EQ(0, m_list.AddString(reinterpret_cast<LPCTSTR>(static_cast<UINT_PTR>(0x42))));
    EXPECT_EQ(1, m_list.InsertString(-1, reinterpret_cast<LPCTSTR>(static_cast<UINT_PTR>(0x43))));
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
    EXPECT_EQ(1, m_list.DeleteString(0));
    EXPECT_EQ(0, m_list.GetHorizontalExtent());
}

} // namespace
