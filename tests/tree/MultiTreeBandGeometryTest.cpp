// UpdateSelectionForRect against the tree's own item rectangles: a one-pixel band on the
// first and on the last pixel line of each row selects exactly that row's item, in a
// scrolled tree with rows of different integral heights (rows scrolled out above the
// client area included); with label hit testing a band beside the label misses.
#include "TreeHarness.h"
#include "TreeSelectionMath.h"

using namespace tree_test;

namespace {

class BandGeometryTest : public TreeFixture
{
protected:
    void SetUp() override
    {
        TreeFixture::SetUp();
        m_tree.ShowWindow(SW_HIDE);   // geometry only: no repainting per change
        BuildFlat(40);
        SetIntegral("I3", 2);
        SetIntegral("I10", 3);
        SetIntegral("I11", 2);
        Arrange({}, "");
        m_tree.SendMessage(WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, 6), 0);
        m_tree.SendMessage(WM_VSCROLL, SB_ENDSCROLL, 0);
    }

    void SetIntegral(const std::string& name, int integral)
    {
        TVITEMEXW item = {};
        item.mask = TVIF_HANDLE | TVIF_INTEGRAL;
        item.hItem = Item(name);
        item.iIntegral = integral;
        ASSERT_TRUE(m_tree.SendMessage(TVM_SETITEMW, 0, reinterpret_cast<LPARAM>(&item)));
    }

    std::string SelectWithBand(const CRect& band)
    {
        Arrange({}, "");
        TreeSelectionMath::SelectionSnapshot none;
        m_tree.UpdateSelectionForRect(&band, 0, none);
        return Selected();
    }
};

TEST_F(BandGeometryTest, BandOnEachRowEdgeSelectsThatRowOnly)
{
    ASSERT_GT(m_tree.GetScrollPos(SB_VERT), 4);   // rows above the client area too
    int rows = 0;
    for (HTREEITEM h = m_tree.GetRootItem(); h != NULL; h = m_tree.GetNextVisibleItem(h))
    {
        CRect rc;
        ASSERT_TRUE(m_tree.GetItemRect(h, &rc, FALSE));
        const std::string name = ItemName(m_tree, h);
        EXPECT_EQ(name, SelectWithBand(CRect(5, rc.top, 9, rc.top))) << "top line of " << name;
        EXPECT_EQ(name, SelectWithBand(CRect(5, rc.bottom - 1, 9, rc.bottom - 1))) << "bottom line of " << name;
        ++rows;
    }
    EXPECT_EQ(40, rows);
}

TEST_F(BandGeometryTest, LabelHitMissesBandBesideTheLabel)
{
    CRect rcRow, rcLabel;
    ASSERT_TRUE(m_tree.GetItemRect(Item("I10"), &rcRow, FALSE));
    ASSERT_TRUE(m_tree.GetItemRect(Item("I10"), &rcLabel, TRUE));
    const CRect besideLabel(rcLabel.right + 2, rcRow.top, rcLabel.right + 6, rcRow.bottom - 1);
    EXPECT_EQ("I10", SelectWithBand(besideLabel));
    m_tree.SetBandingHit(TRUE);
    EXPECT_EQ("", SelectWithBand(besideLabel));
    EXPECT_EQ("I10", SelectWithBand(CRect(rcLabel.right - 1, rcRow.top, rcLabel.right + 6, rcRow.top + 1)));
}

TEST_F(BandGeometryTest, BandLeftOfClientAreaTouchesNothing)
{
    CRect rc;
    ASSERT_TRUE(m_tree.GetItemRect(Item("I8"), &rc, FALSE));
    EXPECT_EQ("", SelectWithBand(CRect(-40, rc.top, -1, rc.bottom)));
    EXPECT_EQ("I8", SelectWithBand(CRect(-40, rc.top, 0, rc.top)));
}

} // namespace
