// Painting: the highlight of every selected item, not only the caret's, follows the
// keyboard focus. Pixels are read from the screen after UpdateWindow, so only what the
// control invalidated is repainted.
#include "TreeHarness.h"

#include "Input.h"

using namespace tree_test;

namespace {

class PaintTest : public TreeFixture
{
protected:
    void SetUp() override
    {
        TreeFixture::SetUp();
        Build("A\nB\nC\nD\n");
    }

    // Pixels of the highlight colour inside the item's label, as on screen now.
    int HighlightPixels(const std::string& name)
    {
        m_tree.UpdateWindow();
        CRect rc;
        EXPECT_TRUE(m_tree.GetItemRect(Item(name), &rc, TRUE));
        const COLORREF highlight = ::GetSysColor(COLOR_HIGHLIGHT);
        HDC dc = ::GetDC(m_tree.m_hWnd);
        int count = 0;
        for (int y = rc.top; y < rc.bottom; ++y)
            for (int x = rc.left; x < rc.right; ++x)
                count += ::GetPixel(dc, x, y) == highlight ? 1 : 0;
        ::ReleaseDC(m_tree.m_hWnd, dc);
        return count;
    }
};

TEST_F(PaintTest, SelectedLabelsFollowTheFocus)
{
    Arrange({ "A", "C" }, "C");
    m_tree.SetFocus();
    m_tree.RedrawWindow();
    EXPECT_GT(HighlightPixels("A"), 0);
    EXPECT_GT(HighlightPixels("C"), 0);
    EXPECT_EQ(0, HighlightPixels("B"));

    m_parent.SetFocus();
    orvane_test::PumpUntilIdle(50);
    EXPECT_EQ(0, HighlightPixels("A"));
    EXPECT_EQ(0, HighlightPixels("C"));

    m_tree.SetFocus();
    orvane_test::PumpUntilIdle(50);
    EXPECT_GT(HighlightPixels("A"), 0);
    EXPECT_GT(HighlightPixels("C"), 0);
}

} // namespace
