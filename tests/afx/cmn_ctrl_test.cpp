// afxcmn.h: what CTreeCtrl, CListCtrl and CImageList add to the common controls (their
// one-line forwards to the platform are not retested here; the list's rectangle parts, hit
// tests, owner-drawn rows and the header's order array are exercised by the lists family):
// - item texts of any length (the buffer grows), a missing item's empty text, the list's
//   buffer form and its length;
// - the tree's insertion overload that fills mask, state and data; check boxes from state images;
// - image lists: permanent and temporary wrappers, Attach/Detach, DeleteImageList;
// - the controls' image lists returned as wrappers and let go of when the control goes (an
//   owned list survives it); drag images owned by the caller.
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include <string>

namespace {

// A control in a visible pop-up parent; the test creates the control.
template<class CTRL>
class ControlTest : public testing::Test
{
protected:
    void SetUp() override
    {
        ASSERT_TRUE(m_parent.CreateEx(0, AfxRegisterWndClass(0), _T("parent"), WS_POPUP | WS_VISIBLE, 40, 40,
                                      320, 300, NULL, NULL));
    }
    void TearDown() override
    {
        m_ctrl.DestroyWindow();
        m_parent.DestroyWindow();
    }

    CWnd m_parent;
    CTRL m_ctrl;
};

class TreeCtrlTest : public ControlTest<CTreeCtrl>
{
protected:
    void SetUp() override
    {
        ControlTest::SetUp();
        ASSERT_TRUE(m_tree.Create(WS_CHILD | WS_VISIBLE | TVS_HASBUTTONS | TVS_LINESATROOT | TVS_EDITLABELS,
                                  CRect(0, 0, 280, 280), &m_parent, 77));
    }
    std::wstring Text(HTREEITEM h) const { return std::wstring(static_cast<LPCTSTR>(m_tree.GetItemText(h))); }

    CTreeCtrl& m_tree = m_ctrl;
};

TEST_F(TreeCtrlTest, ItemTextsOfAnyLengthAndTheInsertOverloadThatFillsEverything)
{
    const std::wstring longText = std::wstring(700, L'x') + L"end";
    HTREEITEM h = m_tree.InsertItem(longText.c_str());
    EXPECT_EQ(longText, Text(h));
    EXPECT_TRUE(m_tree.SetItemText(h, _T("")));
    EXPECT_EQ(L"", Text(h));
    m_tree.DeleteItem(h);
    EXPECT_EQ(L"", Text(h)) << "an item that does not exist yields an empty text";

    HTREEITEM b = m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM | TVIF_STATE | TVIF_IMAGE | TVIF_SELECTEDIMAGE, _T("B"), 2,
                                    3, TVIS_BOLD, TVIS_BOLD, 42, TVI_ROOT, TVI_LAST);
    HTREEITEM b1 = m_tree.InsertItem(_T("B1"), b);
    EXPECT_EQ(L"B", Text(b));
    EXPECT_EQ(42u, m_tree.GetItemData(b));
    EXPECT_EQ(UINT(TVIS_BOLD), m_tree.GetItemState(b, TVIS_BOLD));
    int image = -1, selected = -1;
    EXPECT_TRUE(m_tree.GetItemImage(b, image, selected));
    EXPECT_EQ(2, image);
    EXPECT_EQ(3, selected);
    EXPECT_TRUE(m_tree.ItemHasChildren(b));
    EXPECT_FALSE(m_tree.ItemHasChildren(b1));

    m_tree.ModifyStyle(0, TVS_CHECKBOXES);
    EXPECT_TRUE(m_tree.SetCheck(b1, TRUE));
    EXPECT_TRUE(m_tree.GetCheck(b1));
    EXPECT_EQ(UINT(INDEXTOSTATEIMAGEMASK(2)), m_tree.GetItemState(b1, TVIS_STATEIMAGEMASK));
    EXPECT_TRUE(m_tree.SetCheck(b1, FALSE));
    EXPECT_FALSE(m_tree.GetCheck(b1));
    EXPECT_FALSE(m_tree.GetCheck(NULL));
}

TEST(ImageListTest, PermanentAndTemporaryWrappersAttachDetachAndRelease)
{
    CImageList images;
    ASSERT_TRUE(images.Create(16, 16, ILC_COLOR24 | ILC_MASK, 2, 2));
    HIMAGELIST h = images.GetSafeHandle();
    EXPECT_EQ(&images, CImageList::FromHandlePermanent(h));
    EXPECT_EQ(&images, CImageList::FromHandle(h));
    EXPECT_EQ(0, images.Add(::LoadIcon(NULL, IDI_APPLICATION)));
    EXPECT_EQ(-1, images.Add(static_cast<CBitmap*>(NULL), static_cast<CBitmap*>(NULL)));
    EXPECT_FALSE(images.Replace(0, NULL, NULL));
    EXPECT_TRUE(images.DeleteImageList());
    EXPECT_EQ(nullptr, images.GetSafeHandle());
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(h));
    EXPECT_FALSE(images.DeleteImageList());

    HIMAGELIST raw = ImageList_Create(16, 16, ILC_COLOR24, 1, 1);
    CImageList* pTemp = CImageList::FromHandle(raw);
    ASSERT_NE(nullptr, pTemp);
    EXPECT_EQ(pTemp, CImageList::FromHandle(raw)) << "one wrapper per handle";
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(raw));
    CImageList::DeleteTempMap();
    EXPECT_EQ(0, ImageList_GetImageCount(raw)) << "a temporary wrapper never destroys the handle";
    EXPECT_EQ(nullptr, CImageList::FromHandle(NULL));
    {
        CImageList owner;
        EXPECT_TRUE(owner.Attach(raw));
        EXPECT_EQ(&owner, CImageList::FromHandle(raw));
        EXPECT_EQ(raw, owner.Detach());
        EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(raw));
        EXPECT_TRUE(owner.Attach(raw));   // the owner destroys it
    }
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(raw));
}

TEST_F(TreeCtrlTest, ImageListsAndDragImages)
{
    CImageList images;
    ASSERT_TRUE(images.Create(16, 16, ILC_COLOR24, 1, 1));
    images.Add(::LoadIcon(NULL, IDI_APPLICATION));
    EXPECT_EQ(nullptr, m_tree.SetImageList(&images, TVSIL_NORMAL));
    EXPECT_EQ(&images, m_tree.GetImageList(TVSIL_NORMAL));
    EXPECT_EQ(nullptr, m_tree.GetImageList(TVSIL_STATE));

    HTREEITEM h = m_tree.InsertItem(_T("drag me"), 0, 0);
    m_tree.UpdateWindow();
    CImageList* pDrag = m_tree.CreateDragImage(h);
    ASSERT_NE(nullptr, pDrag);
    HIMAGELIST hDrag = pDrag->GetSafeHandle();
    EXPECT_EQ(pDrag, CImageList::FromHandlePermanent(hDrag)) << "the caller owns the new object";
    delete pDrag;
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(hDrag));
    EXPECT_EQ(nullptr, m_tree.CreateDragImage(NULL));

    // The tree lets go of the image lists when it goes; the object keeps its own.
    m_tree.DestroyWindow();
    EXPECT_EQ(1, images.GetImageCount());
}

class ListCtrlTest : public ControlTest<CListCtrl>
{
protected:
    void SetUp() override
    {
        ControlTest::SetUp();
        ASSERT_TRUE(m_list.Create(WS_CHILD | WS_VISIBLE | LVS_REPORT, CRect(0, 0, 300, 200), &m_parent, 5));
        m_list.InsertColumn(0, _T("Name"), LVCFMT_LEFT, 120);
        m_list.InsertColumn(1, _T("Size"), LVCFMT_RIGHT, 80, 1);
        m_list.InsertItem(0, _T("first"));
        m_list.SetItemText(0, 1, _T("12"));
    }

    CListCtrl& m_list = m_ctrl;
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
