// afxcmn.h: what CListCtrl adds to the control's messages (the rectangle parts, hit
// tests, owner-drawn rows and the header's order array are exercised by the lists family):
// - item texts of any length, and the buffer form's length;
// - image lists owned by a CImageList survive the list's destruction.
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include <string>

namespace {

class ListCtrlTest : public testing::Test
{
protected:
    void SetUp() override
    {
        ASSERT_TRUE(m_parent.CreateEx(0, AfxRegisterWndClass(0), _T("list parent"), WS_POPUP | WS_VISIBLE, 40, 40,
            320, 240, NULL, NULL));
        ASSERT_TRUE(m_list.Create(WS_CHILD | WS_VISIBLE | LVS_REPORT, CRect(0, 0, 300, 200), &m_parent, 5));
        m_list.InsertColumn(0, _T("Name"), LVCFMT_LEFT, 120);
        m_list.InsertColumn(1, _T("Size"), LVCFMT_RIGHT, 80, 1);
        m_list.InsertItem(0, _T("first"));
        m_list.SetItemText(0, 1, _T("12"));
    }

    void TearDown() override
    {
        m_list.DestroyWindow();
        m_parent.DestroyWindow();
    }

    CWnd m_parent;
    CListCtrl m_list;
};

TEST_F(ListCtrlTest, ItemTextsOfAnyLength)
{
    std::wstring longText(700, L'x');
    longText += L"end";
    ASSERT_TRUE(m_list.SetItemText(0, 1, longText.c_str()));
    EXPECT_EQ(longText, std::wstring(static_cast<LPCTSTR>(m_list.GetItemText(0, 1))));
    TCHAR buffer[8];
    EXPECT_EQ(7, m_list.GetItemText(0, 1, buffer, 8));
    EXPECT_STREQ(_T("xxxxxxx"), buffer);
    EXPECT_STREQ(_T(""), m_list.GetItemText(5, 0));
}

TEST_F(ListCtrlTest, OwnedImageListOutlivesTheList)
{
    CImageList images;
    ASSERT_TRUE(images.Create(16, 16, ILC_COLOR24, 1, 1));
    m_list.SetImageList(&images, LVSIL_SMALL);
    EXPECT_EQ(&images, m_list.GetImageList(LVSIL_SMALL));
    m_list.DestroyWindow();
    int cx = 0, cy = 0;
    EXPECT_TRUE(::ImageList_GetIconSize(images.m_hImageList, &cx, &cy));
    EXPECT_EQ(16, cx);
}

} // namespace
