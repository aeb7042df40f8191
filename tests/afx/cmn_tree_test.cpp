// afxcmn.h: CTreeCtrl and CImageList over the common controls.
// - creation (Create, CreateEx), run-time classes;
// - insertion overloads, item text (long texts grow the buffer), data, images, state,
//   check boxes, children, navigation (siblings, parent, visible order, caret);
// - selection, drop target, first visible, expansion, hit testing, item rectangles,
//   sorting, deletion, label editing;
// - image lists: creation, handle maps (permanent and temporary wrappers), the tree's
//   image lists, drag images owned by the caller, handles released.
#include <afxwin.h>
#include <afxcmn.h>

#include <gtest/gtest.h>

#include "Input.h"

#include <string>

namespace {

class TreeCtrlTest : public testing::Test
{
protected:
    void SetUp() override
    {
        LPCTSTR cls = AfxRegisterWndClass(0);
        ASSERT_TRUE(m_parent.CreateEx(0, cls, _T("tree parent"), WS_POPUP | WS_VISIBLE, 40, 40, 300, 300, NULL, NULL));
        ASSERT_TRUE(m_tree.Create(WS_CHILD | WS_VISIBLE | TVS_HASBUTTONS | TVS_LINESATROOT | TVS_EDITLABELS,
            CRect(0, 0, 280, 280), &m_parent, 77));
    }

    void TearDown() override
    {
        m_tree.DestroyWindow();
        m_parent.DestroyWindow();
    }

    std::wstring Text(HTREEITEM h) const { return std::wstring(static_cast<LPCTSTR>(m_tree.GetItemText(h))); }

    CWnd m_parent;
    CTreeCtrl m_tree;
};

TEST_F(TreeCtrlTest, CreatesTreeViewWindowWithId)
{
    TCHAR cls[64] = {};
    ::GetClassName(m_tree.m_hWnd, cls, 64);
    EXPECT_STREQ(WC_TREEVIEW, cls);
    EXPECT_EQ(77, m_tree.GetDlgCtrlID());
    EXPECT_EQ(&m_tree, CWnd::FromHandlePermanent(m_tree.m_hWnd));

    CTreeCtrl other;
    ASSERT_TRUE(other.CreateEx(WS_EX_CLIENTEDGE, WS_CHILD, CRect(0, 0, 50, 50), &m_parent, 78));
    EXPECT_TRUE(other.GetExStyle() & WS_EX_CLIENTEDGE);
    EXPECT_EQ(78, other.GetDlgCtrlID());
}

TEST_F(TreeCtrlTest, RuntimeClasses)
{
    EXPECT_TRUE(m_tree.IsKindOf(RUNTIME_CLASS(CWnd)));
    EXPECT_STREQ("CTreeCtrl", RUNTIME_CLASS(CTreeCtrl)->m_lpszClassName);
    CObject* pObject = RUNTIME_CLASS(CImageList)->CreateObject();
    ASSERT_NE(nullptr, pObject);
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CImageList)));
    delete pObject;
}

TEST_F(TreeCtrlTest, InsertOverloadsAndNavigation)
{
    HTREEITEM a = m_tree.InsertItem(_T("A"));
    HTREEITEM a1 = m_tree.InsertItem(_T("A1"), a);
    HTREEITEM a2 = m_tree.InsertItem(_T("A2"), 2, 3, a, TVI_LAST);
    HTREEITEM a0 = m_tree.InsertItem(_T("A0"), a, TVI_FIRST);
    HTREEITEM b = m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM | TVIF_STATE, _T("B"), 0, 0, TVIS_BOLD, TVIS_BOLD, 42, TVI_ROOT, TVI_LAST);
    TVINSERTSTRUCT tvis = {};
    tvis.hParent = TVI_ROOT;
    tvis.hInsertAfter = TVI_LAST;
    tvis.item.mask = TVIF_TEXT;
    tvis.item.pszText = const_cast<LPTSTR>(_T("C"));
    HTREEITEM c = m_tree.InsertItem(&tvis);
    ASSERT_TRUE(a && a1 && a2 && a0 && b && c);

    EXPECT_EQ(6u, m_tree.GetCount());
    EXPECT_EQ(a, m_tree.GetRootItem());
    EXPECT_EQ(a0, m_tree.GetChildItem(a));
    EXPECT_EQ(a1, m_tree.GetNextSiblingItem(a0));
    EXPECT_EQ(a0, m_tree.GetPrevSiblingItem(a1));
    EXPECT_EQ(a, m_tree.GetParentItem(a2));
    EXPECT_EQ(NULL, m_tree.GetParentItem(a));
    EXPECT_TRUE(m_tree.ItemHasChildren(a));
    EXPECT_FALSE(m_tree.ItemHasChildren(b));
    EXPECT_EQ(42u, m_tree.GetItemData(b));
    EXPECT_EQ(static_cast<UINT>(TVIS_BOLD), m_tree.GetItemState(b, TVIS_BOLD));
    int image = -1, selected = -1;
    EXPECT_TRUE(m_tree.GetItemImage(a2, image, selected));
    EXPECT_EQ(2, image);
    EXPECT_EQ(3, selected);

    // Visible order: a collapsed parent hides its children.
    EXPECT_EQ(b, m_tree.GetNextVisibleItem(a));
    EXPECT_TRUE(m_tree.Expand(a, TVE_EXPAND));
    EXPECT_EQ(a0, m_tree.GetNextVisibleItem(a));
    EXPECT_EQ(a2, m_tree.GetPrevVisibleItem(b));
    EXPECT_EQ(c, m_tree.GetLastVisibleItem());
    EXPECT_EQ(a, m_tree.GetFirstVisibleItem());
    EXPECT_EQ(6u, m_tree.GetCount());
    EXPECT_GE(m_tree.GetVisibleCount(), 6u);
}

TEST_F(TreeCtrlTest, ItemTextOfAnyLength)
{
    std::wstring longText(700, L'x');
    longText += L"end";
    HTREEITEM h = m_tree.InsertItem(longText.c_str());
    EXPECT_EQ(longText, Text(h));
    EXPECT_TRUE(m_tree.SetItemText(h, _T("short")));
    EXPECT_EQ(L"short", Text(h));
    EXPECT_TRUE(m_tree.SetItemText(h, _T("")));
    EXPECT_EQ(L"", Text(h));
    // An item that does not exist yields an empty text, not garbage.
    m_tree.DeleteItem(h);
    EXPECT_EQ(L"", Text(h));
}

TEST_F(TreeCtrlTest, SetItemFamily)
{
    HTREEITEM h = m_tree.InsertItem(_T("item"));
    EXPECT_TRUE(m_tree.SetItemData(h, 0x1234));
    EXPECT_EQ(0x1234u, m_tree.GetItemData(h));
    EXPECT_TRUE(m_tree.SetItemImage(h, 5, 6));
    int image = 0, selected = 0;
    m_tree.GetItemImage(h, image, selected);
    EXPECT_EQ(5, image);
    EXPECT_EQ(6, selected);
    EXPECT_TRUE(m_tree.SetItemState(h, TVIS_BOLD | TVIS_CUT, TVIS_BOLD));
    EXPECT_EQ(static_cast<UINT>(TVIS_BOLD), m_tree.GetItemState(h, TVIS_BOLD | TVIS_CUT));

    TVITEM item = {};
    item.mask = TVIF_HANDLE | TVIF_PARAM;
    item.hItem = h;
    item.lParam = 99;
    EXPECT_TRUE(m_tree.SetItem(&item));
    item.lParam = 0;
    EXPECT_TRUE(m_tree.GetItem(&item));
    EXPECT_EQ(99, item.lParam);
}

TEST_F(TreeCtrlTest, CheckBoxes)
{
    m_tree.ModifyStyle(0, TVS_CHECKBOXES);
    HTREEITEM h = m_tree.InsertItem(_T("check"));
    EXPECT_TRUE(m_tree.SetCheck(h, TRUE));
    EXPECT_TRUE(m_tree.GetCheck(h));
    EXPECT_EQ(static_cast<UINT>(INDEXTOSTATEIMAGEMASK(2)), m_tree.GetItemState(h, TVIS_STATEIMAGEMASK));
    EXPECT_TRUE(m_tree.SetCheck(h, FALSE));
    EXPECT_FALSE(m_tree.GetCheck(h));
    EXPECT_FALSE(m_tree.GetCheck(NULL));
}

TEST_F(TreeCtrlTest, SelectionDropTargetAndFirstVisible)
{
    HTREEITEM items[40];
    for (int i = 0; i < 40; ++i)
        items[i] = m_tree.InsertItem((_T("I") + std::to_wstring(i)).c_str());
    EXPECT_EQ(NULL, m_tree.GetSelectedItem());
    EXPECT_TRUE(m_tree.SelectItem(items[3]));
    EXPECT_EQ(items[3], m_tree.GetSelectedItem());
    EXPECT_EQ(static_cast<UINT>(TVIS_SELECTED), m_tree.GetItemState(items[3], TVIS_SELECTED));
    EXPECT_TRUE(m_tree.Select(items[4], TVGN_CARET));
    EXPECT_EQ(items[4], m_tree.GetSelectedItem());
    EXPECT_TRUE(m_tree.SelectDropTarget(items[5]));
    EXPECT_EQ(items[5], m_tree.GetDropHilightItem());
    EXPECT_TRUE(m_tree.SelectSetFirstVisible(items[20]));
    EXPECT_EQ(items[20], m_tree.GetFirstVisibleItem());
    EXPECT_TRUE(m_tree.EnsureVisible(items[0]));
    EXPECT_EQ(items[0], m_tree.GetFirstVisibleItem());
}

TEST_F(TreeCtrlTest, ItemRectsAndHitTest)
{
    HTREEITEM a = m_tree.InsertItem(_T("Alpha"));
    HTREEITEM b = m_tree.InsertItem(_T("Beta"));
    CRect rcRow, rcLabel;
    ASSERT_TRUE(m_tree.GetItemRect(b, &rcRow, FALSE));
    ASSERT_TRUE(m_tree.GetItemRect(b, &rcLabel, TRUE));
    CRect rcClient;
    m_tree.GetClientRect(&rcClient);
    EXPECT_EQ(0, rcRow.left);
    EXPECT_EQ(rcClient.right, rcRow.right);
    // Wine reports the row one pixel line shorter than its pitch.
    EXPECT_LE(rcRow.Height(), m_tree.GetItemHeight());
    EXPECT_GE(rcRow.Height(), m_tree.GetItemHeight() - 1);
    EXPECT_GT(rcLabel.left, rcRow.left);
    EXPECT_EQ(rcRow.top, rcLabel.top);

    UINT flags = 0;
    EXPECT_EQ(b, m_tree.HitTest(rcLabel.CenterPoint(), &flags));
    EXPECT_TRUE(flags & TVHT_ONITEMLABEL);
    TVHITTESTINFO hti = {};
    hti.pt = CPoint(rcLabel.right + 10, rcLabel.CenterPoint().y);
    EXPECT_EQ(b, m_tree.HitTest(&hti));
    EXPECT_TRUE(hti.flags & TVHT_ONITEMRIGHT);
    EXPECT_EQ(NULL, m_tree.HitTest(CPoint(5, rcClient.bottom - 2), &flags));
    EXPECT_TRUE(flags & TVHT_NOWHERE);
    EXPECT_EQ(a, m_tree.HitTest(CPoint(rcLabel.CenterPoint().x, rcRow.top - 2)));
}

int CALLBACK CompareByData(LPARAM l1, LPARAM l2, LPARAM)
{
    return static_cast<int>(l2 - l1);   // descending
}

TEST_F(TreeCtrlTest, SortingAndDeleting)
{
    HTREEITEM c = m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM, _T("c"), 0, 0, 0, 0, 1, TVI_ROOT, TVI_LAST);
    HTREEITEM a = m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM, _T("a"), 0, 0, 0, 0, 3, TVI_ROOT, TVI_LAST);
    HTREEITEM b = m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM, _T("b"), 0, 0, 0, 0, 2, TVI_ROOT, TVI_LAST);
    EXPECT_TRUE(m_tree.SortChildren(TVI_ROOT));
    EXPECT_EQ(a, m_tree.GetRootItem());
    EXPECT_EQ(b, m_tree.GetNextSiblingItem(a));
    EXPECT_EQ(c, m_tree.GetNextSiblingItem(b));

    TVSORTCB sort = {};
    sort.hParent = TVI_ROOT;
    sort.lpfnCompare = CompareByData;
    EXPECT_TRUE(m_tree.SortChildrenCB(&sort));
    EXPECT_EQ(a, m_tree.GetRootItem());   // data 3 first
    EXPECT_EQ(c, m_tree.GetNextSiblingItem(b));

    EXPECT_TRUE(m_tree.DeleteItem(b));
    EXPECT_EQ(2u, m_tree.GetCount());
    EXPECT_TRUE(m_tree.DeleteAllItems());
    EXPECT_EQ(0u, m_tree.GetCount());
    EXPECT_EQ(NULL, m_tree.GetRootItem());
}

TEST_F(TreeCtrlTest, AttributesRoundTrip)
{
    m_tree.SetIndent(31);
    EXPECT_EQ(31u, m_tree.GetIndent());
    m_tree.SetItemHeight(24);
    EXPECT_EQ(24, m_tree.GetItemHeight());
    m_tree.SetBkColor(RGB(1, 2, 3));
    EXPECT_EQ(RGB(1, 2, 3), m_tree.GetBkColor());
    m_tree.SetTextColor(RGB(4, 5, 6));
    EXPECT_EQ(RGB(4, 5, 6), m_tree.GetTextColor());
    m_tree.SetInsertMarkColor(RGB(7, 8, 9));
    EXPECT_EQ(RGB(7, 8, 9), m_tree.GetInsertMarkColor());
    m_tree.SetLineColor(RGB(10, 11, 12));
    EXPECT_EQ(RGB(10, 11, 12), m_tree.GetLineColor());
    HTREEITEM h = m_tree.InsertItem(_T("mark"));
    EXPECT_TRUE(m_tree.SetInsertMark(h, TRUE));
}

TEST_F(TreeCtrlTest, EditLabelReturnsTheEditControl)
{
    HTREEITEM h = m_tree.InsertItem(_T("label"));
    m_tree.SetFocus();
    CEdit* pEdit = m_tree.EditLabel(h);
    ASSERT_NE(nullptr, pEdit);
    EXPECT_TRUE(::IsWindow(pEdit->m_hWnd));
    EXPECT_EQ(pEdit->m_hWnd, m_tree.GetEditControl()->m_hWnd);
    CString text;
    pEdit->GetWindowText(text);
    EXPECT_STREQ(_T("label"), text);
    m_tree.SendMessage(TVM_ENDEDITLABELNOW, TRUE, 0);
    EXPECT_EQ(nullptr, m_tree.GetEditControl());
}

// ---------------------------------------------------------------------------------
// CImageList

TEST(ImageListTest, CreateAddDrawAndRelease)
{
    CImageList images;
    ASSERT_TRUE(images.Create(16, 16, ILC_COLOR24 | ILC_MASK, 2, 2));
    HIMAGELIST h = images.GetSafeHandle();
    EXPECT_EQ(h, static_cast<HIMAGELIST>(images));
    EXPECT_EQ(&images, CImageList::FromHandlePermanent(h));
    EXPECT_EQ(&images, CImageList::FromHandle(h));

    HICON icon = ::LoadIcon(NULL, IDI_APPLICATION);
    EXPECT_EQ(0, images.Add(icon));
    EXPECT_EQ(1, images.Add(icon));
    EXPECT_EQ(2, images.GetImageCount());
    int cx = 0, cy = 0;
    EXPECT_TRUE(images.GetIconSize(&cx, &cy));
    EXPECT_EQ(16, cx);
    IMAGEINFO info = {};
    EXPECT_TRUE(images.GetImageInfo(1, &info));
    EXPECT_TRUE(images.Remove(0));
    EXPECT_EQ(1, images.GetImageCount());
    images.SetBkColor(RGB(255, 0, 0));
    EXPECT_EQ(RGB(255, 0, 0), images.GetBkColor());

    CClientDC dc(CWnd::GetDesktopWindow());
    EXPECT_TRUE(images.Draw(&dc, 0, CPoint(0, 0), ILD_NORMAL));
    EXPECT_FALSE(images.Draw(NULL, 0, CPoint(0, 0), ILD_NORMAL));

    HICON extracted = images.ExtractIcon(0);
    ASSERT_NE(nullptr, extracted);
    ::DestroyIcon(extracted);

    EXPECT_TRUE(images.DeleteImageList());
    EXPECT_EQ(nullptr, images.GetSafeHandle());
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(h));
    EXPECT_FALSE(images.DeleteImageList());
}

TEST(ImageListTest, BitmapsWithMask)
{
    CImageList images;
    ASSERT_TRUE(images.Create(8, 8, ILC_COLOR24 | ILC_MASK, 1, 1));
    CClientDC dc(CWnd::GetDesktopWindow());
    CBitmap bitmap;
    ASSERT_TRUE(bitmap.CreateCompatibleBitmap(&dc, 16, 8));
    EXPECT_EQ(0, images.Add(&bitmap, RGB(255, 0, 255)));   // two images of 8 x 8
    EXPECT_EQ(2, images.GetImageCount());
    EXPECT_TRUE(images.Replace(1, &bitmap, NULL));
    EXPECT_EQ(-1, images.Add(static_cast<CBitmap*>(NULL), static_cast<CBitmap*>(NULL)));
    EXPECT_FALSE(images.Replace(0, NULL, NULL));
}

TEST(ImageListTest, TemporaryWrapperNeverDestroysTheHandle)
{
    HIMAGELIST h = ImageList_Create(16, 16, ILC_COLOR24, 1, 1);
    ASSERT_NE(nullptr, h);
    CImageList* pTemp = CImageList::FromHandle(h);
    ASSERT_NE(nullptr, pTemp);
    EXPECT_EQ(pTemp, CImageList::FromHandle(h));   // one wrapper per handle
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(h));
    CImageList::DeleteTempMap();
    EXPECT_EQ(0, ImageList_GetImageCount(h));       // still alive
    EXPECT_EQ(nullptr, CImageList::FromHandle(NULL));

    // Attaching gives the handle an owner; the owner destroys it.
    {
        CImageList owner;
        CImageList::FromHandle(h);
        EXPECT_TRUE(owner.Attach(h));
        EXPECT_EQ(&owner, CImageList::FromHandle(h));
        EXPECT_EQ(h, owner.Detach());
        EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(h));
        EXPECT_TRUE(owner.Attach(h));
    }
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(h));
}

TEST_F(TreeCtrlTest, ImageListsOfTheTree)
{
    CImageList images;
    ASSERT_TRUE(images.Create(16, 16, ILC_COLOR24, 1, 1));
    EXPECT_EQ(nullptr, m_tree.SetImageList(&images, TVSIL_NORMAL));
    EXPECT_EQ(&images, m_tree.GetImageList(TVSIL_NORMAL));
    EXPECT_EQ(nullptr, m_tree.GetImageList(TVSIL_STATE));
    EXPECT_EQ(&images, m_tree.SetImageList(NULL, TVSIL_NORMAL));
    EXPECT_EQ(nullptr, m_tree.GetImageList(TVSIL_NORMAL));

    // Destroying the tree detaches an image list owned by an object.
    m_tree.SetImageList(&images, TVSIL_NORMAL);
    HWND hTree = m_tree.m_hWnd;
    m_tree.DestroyWindow();
    EXPECT_FALSE(::IsWindow(hTree));
    EXPECT_EQ(0, images.GetImageCount());
}

TEST_F(TreeCtrlTest, DragImageBelongsToTheCaller)
{
    // The tree makes drag images only with a normal image list.
    CImageList images;
    ASSERT_TRUE(images.Create(16, 16, ILC_COLOR24, 1, 1));
    images.Add(::LoadIcon(NULL, IDI_APPLICATION));
    m_tree.SetImageList(&images, TVSIL_NORMAL);
    HTREEITEM h = m_tree.InsertItem(_T("drag me"), 0, 0);
    m_tree.UpdateWindow();
    CImageList* pDrag = m_tree.CreateDragImage(h);
    ASSERT_NE(nullptr, pDrag);
    HIMAGELIST hDrag = pDrag->GetSafeHandle();
    EXPECT_EQ(pDrag, CImageList::FromHandlePermanent(hDrag));
    int cx = 0, cy = 0;
    EXPECT_TRUE(pDrag->GetIconSize(&cx, &cy));
    EXPECT_GT(cx, 16);   // icon and label
    delete pDrag;
    EXPECT_EQ(nullptr, CImageList::FromHandlePermanent(hDrag));
    EXPECT_EQ(nullptr, m_tree.CreateDragImage(NULL));
}

} // namespace
