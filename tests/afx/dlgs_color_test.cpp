// CColorDialog (afxdlgs.h):
//  - construction: the CHOOSECOLOR record MFC fills (size, hook, flags, RGB init only for
//    a non-black colour, the shared custom colours);
//  - SetCurrentColor while running, OnColorOK keeping the dialog open (the window attached
//    to the object while it runs, OnInitDialog and OK: KVXColorDialog's tests, buttons).
#include <afxwin.h>
#include <afxdlgs.h>

#include <gtest/gtest.h>

#include <commctrl.h>

#include "Input.h"

#include <functional>
#include <vector>

namespace {

using DialogSteps = orvane_test::ModalScript;

TEST(CColorDialogTest, ConstructionFillsTheRecord)
{
    CColorDialog black;
    EXPECT_EQ(sizeof(CHOOSECOLOR), black.m_cc.lStructSize);
    EXPECT_EQ(static_cast<DWORD>(CC_ENABLEHOOK), black.m_cc.Flags);
    EXPECT_NE(nullptr, black.m_cc.lpfnHook);
    EXPECT_EQ(0u, black.m_cc.rgbResult);
    EXPECT_EQ(CColorDialog::GetSavedCustomColors(), black.m_cc.lpCustColors);

    CColorDialog red(RGB(255, 0, 0), CC_FULLOPEN);
    EXPECT_EQ(static_cast<DWORD>(CC_ENABLEHOOK | CC_FULLOPEN | CC_RGBINIT), red.m_cc.Flags);
    EXPECT_EQ(RGB(255, 0, 0), red.m_cc.rgbResult);
    EXPECT_EQ(RGB(255, 0, 0), red.GetColor());
    EXPECT_TRUE(red.IsKindOf(RUNTIME_CLASS(CColorDialog)));
    EXPECT_TRUE(red.IsKindOf(RUNTIME_CLASS(CDialog)));

    COLORREF* pCustom = CColorDialog::GetSavedCustomColors();
    ASSERT_NE(nullptr, pCustom);
    EXPECT_EQ(pCustom, CColorDialog::GetSavedCustomColors());
}

// A derived dialog that records the colours its OnColorOK sees.
class CRecordingColorDialog : public CColorDialog
{
public:
    CRecordingColorDialog() : CColorDialog(0, CC_FULLOPEN) {}

    virtual BOOL OnColorOK()
    {
        m_colorsAtColorOk.push_back(GetColor());
        return m_nRejects-- > 0;
    }

    int m_nRejects = 0;
    std::vector<COLORREF> m_colorsAtColorOk;
};

// Wine 8's colour dialog neither handles SETRGBSTRING nor sends COLOROKSTRING to the
// hook: the tests check the framework's side of both (the message sent to the running
// dialog; the hook's answer to the OK notification) and mark the platform's part.
LRESULT CALLBACK RecordSetRgb(HWND hwnd, UINT msg, WPARAM wParam, LPARAM lParam, UINT_PTR, DWORD_PTR ref)
{
    if (msg == ::RegisterWindowMessage(SETRGBSTRING))
        reinterpret_cast<std::vector<LPARAM>*>(ref)->push_back(lParam);
    return ::DefSubclassProc(hwnd, msg, wParam, lParam);
}

TEST(CColorDialogTest, SetCurrentColorSendsSetRgbToTheRunningDialog)
{
    CRecordingColorDialog dlg;
    std::vector<LPARAM> sent;
    DialogSteps steps({ [&](HWND h) {
        ::SetWindowSubclass(h, RecordSetRgb, 1, reinterpret_cast<DWORD_PTR>(&sent));
        dlg.SetCurrentColor(RGB(12, 34, 56));
        ::RemoveWindowSubclass(h, RecordSetRgb, 1);
        ::PostMessage(h, WM_COMMAND, IDOK, 0);
        return true;
    } });
    EXPECT_EQ(IDOK, dlg.DoModal());
    EXPECT_EQ((std::vector<LPARAM>{ static_cast<LPARAM>(RGB(12, 34, 56)) }), sent);
    // Known platform deviation: Wine ignores the message, the colour stays black.
    EXPECT_EQ(RGB(0, 0, 0), dlg.GetColor());
}

TEST(CColorDialogTest, HookAsksOnColorOkWhetherToStayOpen)
{
    CRecordingColorDialog dlg;
    dlg.m_nRejects = 1;
    const UINT nColorOk = ::RegisterWindowMessage(COLOROKSTRING);
    std::vector<UINT_PTR> answers;
    DialogSteps steps({ [&](HWND h) {
        CHOOSECOLOR cc = dlg.m_cc;
        cc.rgbResult = RGB(1, 1, 1);
        answers.push_back(_AfxCommDlgProc(h, nColorOk, 0, reinterpret_cast<LPARAM>(&cc)));
        cc.rgbResult = RGB(2, 2, 2);
        answers.push_back(_AfxCommDlgProc(h, nColorOk, 0, reinterpret_cast<LPARAM>(&cc)));
        ::PostMessage(h, WM_COMMAND, IDOK, 0);
        return true;
    } });
    EXPECT_EQ(IDOK, dlg.DoModal());
    EXPECT_EQ((std::vector<UINT_PTR>{ TRUE, FALSE }), answers);
    EXPECT_EQ((std::vector<COLORREF>{ RGB(1, 1, 1), RGB(2, 2, 2) }), dlg.m_colorsAtColorOk);
    // Known platform deviation: Wine's own OK sends no COLOROKSTRING.
    EXPECT_EQ(2u, dlg.m_colorsAtColorOk.size());
}

} // namespace
