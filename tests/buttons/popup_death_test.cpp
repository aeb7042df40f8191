// Fault injection into the colour well's modal loops: while its popup, or the standard
// colour dialog opened from it, is up, a script step destroys the well or its top-level
// window. The loops end by themselves (before the script's time limit would cancel
// them), the capture is free, the parent gets no colour message, and a new well picks
// a colour as before.
#include "ButtonsTestSupport.h"
#include "resource.h"

namespace {

using orvane_test::ModalScript;

struct DeathCase
{
    const char* name;
    bool colorDialog;   // the standard dialog is up, else the popup
    bool topLevel;      // the well's top-level window dies, else the well
};

const DeathCase kDeaths[] = {
    { "PopupWellDestroyed", false, false },
    { "PopupTopLevelDestroyed", false, true },
    { "ColorDialogWellDestroyed", true, false },
    { "ColorDialogTopLevelDestroyed", true, true },
};

class PopupDeathTest : public buttons_test::WellFixture, public testing::WithParamInterface<DeathCase> {};

TEST_P(PopupDeathTest, LoopsEndWithTheWellAndANewWellWorks)
{
    const DeathCase& c = GetParam();
    HWND hPopup = NULL;
    const ModalScript::Step open = [&](HWND hDialog) {
        hPopup = hDialog;
        if (c.colorDialog)
            ::PostMessage(hDialog, WM_COMMAND, IDC_COLOR_OTHER, (LPARAM)::GetDlgItem(hDialog, IDC_COLOR_OTHER));
        return true;
    };
    const ModalScript::Step kill = [&](HWND hDialog) {
        if (c.colorDialog && hDialog == hPopup)
            return false;   // until the standard dialog is up
        c.topLevel ? m_parent->DestroyWindow() : m_well.DestroyWindow();
        return true;
    };
    {
        // A dialog still up after the kill waits for the last step: the time limit cancels it.
        ModalScript script({ open, kill, [](HWND) { return false; } }, 2000);
        m_well.DoColorWellDlg();
        EXPECT_EQ(2u, script.stepsDone());
        EXPECT_FALSE(script.timedOut()) << "a loop ran on after the well was gone";
    }
    EXPECT_FALSE(::IsWindow(hPopup));
    EXPECT_EQ(nullptr, ::GetCapture());
    EXPECT_EQ(0, m_spy->count());

    Close();
    Open();
    // Row 1, column 2 of the default palette: white.
    ModalScript pick({ [](HWND hDialog) { return ::PostMessage(hDialog, WM_LBUTTONUP, 0, MAKELPARAM(50, 30)) != FALSE; } });
    m_well.DoColorWellDlg();
    ASSERT_EQ(1, m_spy->count());
    EXPECT_EQ(buttons_test::Hex(RGB(255, 255, 255)), buttons_test::Hex(Notified(0)));
}

INSTANTIATE_TEST_SUITE_P(Buttons, PopupDeathTest, testing::ValuesIn(kDeaths),
    [](const testing::TestParamInfo<DeathCase>& info) { return std::string(info.param.name); });

} // namespace
