// afxcmn.h: what CListCtrl and CHeaderCtrl add to the controls' messages.
// - item texts of any length, and the buffer form's length;
// - the rectangle part asked for (bounds, label, icon, sub-item) reaches the control;
// - hit test flags;
// - image lists owned by a CImageList survive the list's destruction;
// - owner-drawn rows and header items reach DrawItem through reflection;
// - the header's order array with its own item count.
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include <string>

namespace {

class CCountingList : public CListCtrl
{
public:
    void DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct) override { m_nDrawn += lpDrawItemStruct->CtlType == ODT_LISTVIEW; }
    int m_nDrawn = 0;
};

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
    CCountingList m_list;
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

TEST_F(ListCtrlTest, RectanglePartsAndHitTest)
{
    CRect bounds, label, sub;
    ASSERT_TRUE(m_list.GetItemRect(0, &bounds, LVIR_BOUNDS));
    ASSERT_TRUE(m_list.GetItemRect(0, &label, LVIR_LABEL));
    ASSERT_TRUE(m_list.GetSubItemRect(0, 1, LVIR_BOUNDS, sub));
    EXPECT_EQ(200, bounds.Width());
    EXPECT_EQ(120, label.right);
    EXPECT_EQ(120, sub.left);

    UINT flags = 0;
    EXPECT_EQ(0, m_list.HitTest(label.CenterPoint(), &flags));
    EXPECT_EQ(static_cast<UINT>(LVHT_ONITEMLABEL), flags);
    EXPECT_EQ(-1, m_list.HitTest(CPoint(250, 150), &flags));
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

TEST_F(ListCtrlTest, OwnerDrawnRowsReachDrawItem)
{
    m_list.ModifyStyle(0, LVS_OWNERDRAWFIXED);
    m_list.Invalidate();
    m_list.UpdateWindow();
    EXPECT_EQ(1, m_list.m_nDrawn);
}

TEST_F(ListCtrlTest, HeaderOrderArrayWithItsOwnCount)
{
    CHeaderCtrl* pHeader = m_list.GetHeaderCtrl();
    ASSERT_NE(nullptr, pHeader);
    int order[2] = { 1, 0 };
    ASSERT_TRUE(pHeader->SetOrderArray(2, order));
    int back[2] = {};
    ASSERT_TRUE(pHeader->GetOrderArray(back));
    EXPECT_EQ(1, back[0]);
    EXPECT_EQ(0, back[1]);
}

} // namespace
