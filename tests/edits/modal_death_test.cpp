// Fault injection into what the edits hold while the user acts: the error message box
// and the spin's pressed arrow (capture and auto-repeat timer). From a timer, the edit
// or its dialog is destroyed, or the application is asked to quit, while the box is up
// or the arrow held:
//  - the box's showing state ends on every way out: the same object, given a window
//    again, shows its next error; a posted quit still reaches the application's loop;
//  - a held arrow ends with its edit: capture free, no further step into the dead edit,
//    and a new edit's spin steps as before.
#include "edit_harness.h"

#include "CallLater.h"
#include "spin_test_fixture.h"

namespace {

using namespace edit_test;
using orvane_test::CallLater;

enum class Death { Edit, Dialog, Quit };

struct DeathCase
{
    const char* name;
    Death death;
};

std::string CaseName(const testing::TestParamInfo<DeathCase>& info)
{
    return info.param.name;
}

class LoopDeath : public testing::TestWithParam<DeathCase>
{
protected:
    static void SetUpTestSuite() { EnsureLibraryLoaded(); }
    void TearDown() override { dlg.DestroyWindow(); }

    // The dialog (again, if it died) with the edit subclassed into kId (again, if its
    // window died).
    void Open(UINT nId)
    {
        if (!::IsWindow(dlg))
        {
            ASSERT_TRUE(dlg.Open());
        }
        if (edit.m_hWnd == NULL)
        {
            ASSERT_TRUE(edit.SubclassDlgItem(nId, &dlg));
        }
        edit.SetFocus();
    }
    void Kill(Death death)
    {
        if (death == Death::Edit)
            edit.DestroyWindow();
        else if (death == Death::Dialog)
            dlg.DestroyWindow();
        else
            ::PostQuitMessage(9);
        edit.calls.clear();
    }

    TestDialog dlg;
    spin_test::RecordingLongEdit edit;
};

using ErrorBoxDeath = LoopDeath;

TEST_P(ErrorBoxDeath, ShowingEndsOnEveryWayOutOfTheBox)
{
    const Death death = GetParam().death;
    std::vector<HWND> boxes;
    bool bAnswer = false;
    orvane_test::DialogAnswerer answerer([&](const orvane_test::DialogAnswerer::Seen& seen) {
        if (::GetDlgItem(seen.hwnd, 0xFFFF) == NULL)
            return 0;   // the test dialog itself
        boxes.push_back(seen.hwnd);
        return bAnswer ? IDOK : 0;
    });
    Open(kIdEdit1);
    edit.SetWindowText(_T("12x"));
    {
        CallLater kill(30, [&] { Kill(death); });
        // Closes a box still up: the edit's own death leaves the box to its owner.
        CallLater close(1000, [&] { ::PostMessageW(boxes.back(), WM_COMMAND, IDOK, 0); });
        edit.SendMessage(WM_KVX_SHOWERRORMESSAGE);
        EXPECT_TRUE(kill.fired());
        EXPECT_EQ(death == Death::Edit, close.fired());
    }
    ASSERT_EQ(1u, boxes.size());
    if (death == Death::Quit)
    {
        MSG msg;
        ASSERT_TRUE(::PeekMessageW(&msg, NULL, WM_QUIT, WM_QUIT, PM_REMOVE)) << "the quit was swallowed";
        EXPECT_EQ(9u, msg.wParam);
    }

    Open(kIdEdit2);
    edit.SetWindowText(_T("34x"));
    bAnswer = true;
    edit.SendMessage(WM_KVX_SHOWERRORMESSAGE);
    EXPECT_EQ(2u, boxes.size()) << "the next error shows no box";
}

INSTANTIATE_TEST_SUITE_P(Edits, ErrorBoxDeath, testing::Values(DeathCase{ "EditDestroyed", Death::Edit },
    DeathCase{ "DialogDestroyed", Death::Dialog }, DeathCase{ "QuitPosted", Death::Quit }), CaseName);

using SpinDeath = LoopDeath;

TEST_P(SpinDeath, HeldArrowEndsWithItsEdit)
{
    Open(kIdEdit1);
    const HWND hSpin = edit.SpinHwnd();
    ::SendMessageW(hSpin, WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(1, 1));
    ASSERT_EQ(hSpin, ::GetCapture());
    CallLater kill(30, [&] { Kill(GetParam().death); });
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

INSTANTIATE_TEST_SUITE_P(Edits, SpinDeath, testing::Values(DeathCase{ "EditDestroyed", Death::Edit },
    DeathCase{ "DialogDestroyed", Death::Dialog }), CaseName);

} // namespace
