// Fault injection into what the edits hold while the user acts: the error box and the
// spin's held arrow. A timer destroys the edit or its dialog, or posts a quit, meanwhile.
// The box's showing state ends on every way out (the object shows its next error in
// its next window; the quit reaches the application's loop); a held arrow ends with
// its edit (capture free, no step into the dead edit, the next window's spin steps).
#include "edit_harness.h"

#include "CallLater.h"

namespace {

using namespace edit_test;
using orvane_test::CallLater;

enum Death { kEditDies, kDialogDies, kQuitPosted };

std::string DeathName(const testing::TestParamInfo<Death>& info)
{
    const char* const names[] = { "EditDestroyed", "DialogDestroyed", "QuitPosted" };
    return names[info.param];
}

class LoopDeath : public PageFixture, public testing::WithParamInterface<Death>
{
protected:
    // The dialog and the edit in control nId, each made again if its window died.
    void Open(UINT nId)
    {
        ASSERT_TRUE(::IsWindow(dlg) || dlg.Open());
        ASSERT_TRUE(edit.m_hWnd != NULL || edit.SubclassDlgItem(nId, &dlg));
        edit.SetFocus();
    }
    void Kill()
    {
        if (GetParam() == kEditDies)
            edit.DestroyWindow();
        else if (GetParam() == kDialogDies)
            dlg.DestroyWindow();
        else
            ::PostQuitMessage(9);
        edit.calls.clear();
    }

    LongProbe edit;
};

using ErrorBoxDeath = LoopDeath;

TEST_P(ErrorBoxDeath, ShowingEndsOnEveryWayOutOfTheBox)
{
    BoxRecorder boxes;
    boxes.answer = false;
    Open(kIdEdit1);
    edit.SetWindowText(_T("12x"));
    {
        CallLater kill(30, [&] { Kill(); });
        // The edit's own death leaves the box to its owner: closed here.
        CallLater close(1000, [&] { ::PostMessageW(boxes.hwnds.back(), WM_COMMAND, IDOK, 0); });
        edit.SendMessage(WM_KVX_SHOWERRORMESSAGE);
        EXPECT_TRUE(kill.fired());
        EXPECT_EQ(GetParam() == kEditDies, close.fired());
    }
    ASSERT_EQ(1, boxes.count());
    MSG msg = {};
    const bool bQuit = ::PeekMessageW(&msg, NULL, WM_QUIT, WM_QUIT, PM_REMOVE) != FALSE;
    EXPECT_EQ(GetParam() == kQuitPosted, bQuit);
    EXPECT_EQ(bQuit ? 9u : 0u, msg.wParam);

    Open(kIdEdit2);
    edit.SetWindowText(_T("34x"));
    boxes.answer = true;
    edit.SendMessage(WM_KVX_SHOWERRORMESSAGE);
    EXPECT_EQ(2, boxes.count()) << "the next error shows no box";
}

INSTANTIATE_TEST_SUITE_P(Edits, ErrorBoxDeath, testing::Values(kEditDies, kDialogDies, kQuitPosted), DeathName);

using SpinDeath = LoopDeath;

TEST_P(SpinDeath, HeldArrowEndsWithItsEdit)
{
    Open(kIdEdit1);
    const HWND hSpin = edit.SpinHwnd();
    ::SendMessageW(hSpin, WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(1, 1));
    ASSERT_EQ(hSpin, ::GetCapture());
    CallLater kill(30, [&] { Kill(); });
    EXPECT_TRUE(orvane_test::WaitFor([&] { return kill.fired(); }, 2000));
    orvane_test::PumpUntilIdle(50);
    EXPECT_EQ(nullptr, ::GetCapture());
    EXPECT_FALSE(::IsWindow(hSpin)) << "the spin and its timer outlived the edit";
    EXPECT_TRUE(edit.calls.empty()) << edit.calls.front();

    Open(kIdEdit2);
    const long lBefore = edit.GetValue(FALSE);
    ::SendMessageW(edit.SpinHwnd(), WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(1, 1));
    ::SendMessageW(edit.SpinHwnd(), WM_LBUTTONUP, 0, MAKELPARAM(1, 1));
    EXPECT_EQ(lBefore + 1, edit.GetValue(FALSE));
    EXPECT_EQ(nullptr, ::GetCapture());
}

INSTANTIATE_TEST_SUITE_P(Edits, SpinDeath, testing::Values(kEditDies, kDialogDies), DeathName);

} // namespace
