// The numeric edit's spin: creation, place, ownership and switching.
//  - created by Create and by subclassing a dialog control: exactly one spin object and
//    one spin window, 15 pixels wide beside the edit, without a border;
//  - switching the spin off before the window exists changes nothing;
//  - off and on again; arrow keys and focus loss with the spin off go nowhere;
//  - destroying the edit destroys and deletes the spin; many create/destroy rounds
//    leave no spin window behind;
//  - disabling the edit disables the spin.
#include "numeric_probes.h"

namespace {

using namespace edit_test;

class NumericSpin : public NumericFixture {};

TEST_F(NumericSpin, CreatedByCreateSitsBesideTheEdit)
{
    LongProbe edit;
    CreateIn(edit, CRect(10, 20, 110, 41));
    ASSERT_NE(nullptr, edit.Spin());
    ASSERT_NE(HWND(NULL), edit.SpinHwnd());
    EXPECT_EQ(1, CountSpins(dlg));
    // h = 23 is odd, so the spin is 22 pixels high, one pixel above the edit.
    EXPECT_EQ("(110,19,125,41)", RectText(RectInParent(edit.SpinHwnd())));
    EXPECT_EQ(0u, static_cast<DWORD>(::GetWindowLongW(edit.SpinHwnd(), GWL_STYLE) & WS_BORDER));
    EXPECT_TRUE(::IsWindowVisible(edit.SpinHwnd()));
    EXPECT_TRUE(edit.GetSpinButtonFlag());
}

TEST_F(NumericSpin, SubclassedDialogControlGetsOneSpinAtItsRightEdge)
{
    LongProbe edit;
    ASSERT_TRUE(edit.SubclassDlgItem(kIdEdit1, &dlg));
    EXPECT_EQ(1, CountSpins(dlg));
    const RECT editRect = RectInParent(edit);
    const RECT spinRect = RectInParent(edit.SpinHwnd());
    int height = editRect.bottom - editRect.top + 2;
    height -= height % 2;
    EXPECT_EQ(RectText({ editRect.right, editRect.top - 1, editRect.right + 15, editRect.top - 1 + height }),
        RectText(spinRect));
}

TEST_F(NumericSpin, SwitchingOffBeforeTheWindowExistsChangesNothing)
{
    DoubleProbe edit;
    edit.SetSpinButtonFlag(FALSE);
    EXPECT_TRUE(edit.GetSpinButtonFlag());
    EXPECT_EQ(nullptr, edit.Spin());
    CreateIn(edit, CRect(10, 20, 110, 41));
    EXPECT_EQ(1, CountSpins(dlg));
}

TEST_F(NumericSpin, OffAndOnAgainKeepsOneSpinObject)
{
    LongProbe edit;
    CreateIn(edit, CRect(10, 20, 110, 41));
    KVXSpin* spin = edit.Spin();
    edit.SetSpinButtonFlag(FALSE);
    EXPECT_FALSE(edit.GetSpinButtonFlag());
    EXPECT_EQ(0, CountSpins(dlg));
    EXPECT_EQ(spin, edit.Spin());

    edit.SetSpinButtonFlag(TRUE);
    EXPECT_EQ(1, CountSpins(dlg));
    EXPECT_EQ(spin, edit.Spin());
    EXPECT_EQ("(110,19,125,41)", RectText(RectInParent(edit.SpinHwnd())));
    edit.SetSpinButtonFlag(TRUE);
    EXPECT_EQ(1, CountSpins(dlg));
}

TEST_F(NumericSpin, KeysAndFocusLossWithTheSpinOffGoNowhere)
{
    LongProbe edit;
    CreateIn(edit, CRect(10, 20, 110, 41));
    edit.SetValue(42, TRUE);
    edit.SetSpinButtonFlag(FALSE);
    edit.SetFocus();
    ::SendMessageW(edit, EM_SETSEL, 2, 2);
    orvane_test::SendKey(edit, VK_UP);
    EXPECT_EQ(42, edit.CurrentLong());
    // The keys reached the control itself: the caret moved.
    EXPECT_NE("2-2", Selection(edit));
    ::SetFocus(dlg.Item(kIdButton));
    PumpDialog(dlg);
    EXPECT_EQ("42", edit.Text());
}

TEST_F(NumericSpin, DestroyingTheEditDestroysAndDeletesTheSpin)
{
    LongProbe edit;
    CreateIn(edit, CRect(10, 20, 110, 41));
    const HWND spin = edit.SpinHwnd();
    ASSERT_TRUE(::IsWindow(spin));
    edit.DestroyWindow();
    EXPECT_FALSE(::IsWindow(spin));
    EXPECT_EQ(nullptr, edit.Spin());
    EXPECT_EQ(0, CountSpins(dlg));
}

TEST_F(NumericSpin, ManyCreateDestroyRoundsLeaveNoSpinBehind)
{
    for (int round = 0; round < 25; ++round)
    {
        SCOPED_TRACE(round);
        DoubleProbe edit;
        CreateIn(edit, CRect(10, 20 + round, 110, 41 + round));
        ASSERT_EQ(1, CountSpins(dlg));
        if (round % 2 == 0)
            edit.DestroyWindow();
        // Odd rounds: the object's destructor takes window and spin along.
    }
    EXPECT_EQ(0, CountSpins(dlg));
}

TEST_F(NumericSpin, DisablingTheEditDisablesTheSpin)
{
    LongProbe edit;
    CreateIn(edit, CRect(10, 20, 110, 41));
    edit.EnableWindow(FALSE);
    EXPECT_FALSE(::IsWindowEnabled(edit));
    EXPECT_FALSE(::IsWindowEnabled(edit.SpinHwnd()));
    edit.EnableWindow(TRUE);
    EXPECT_TRUE(::IsWindowEnabled(edit));
    EXPECT_TRUE(::IsWindowEnabled(edit.SpinHwnd()));
}

TEST_F(NumericSpin, SpinOfADisabledEditIsCreatedDisabled)
{
    LongProbe edit;
    ASSERT_TRUE(edit.SubclassDlgItem(kIdEdit1, &dlg));
    edit.EnableWindow(FALSE);
    edit.SetSpinButtonFlag(FALSE);
    edit.SetSpinButtonFlag(TRUE);
    EXPECT_FALSE(::IsWindowEnabled(edit.SpinHwnd()));
}

} // namespace
