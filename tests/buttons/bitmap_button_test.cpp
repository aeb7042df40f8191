// Bitmap buttons on SS_NOTIFY statics. The bitmap and colour map chosen per kind and state
// are tested as a plain function in geometry_test.cpp; here:
//  - mouse, focus and enable scripts per class as a table, with the notifications the owner
//    gets and the state it reads during each one (IsPressed, GetCheck), capture as the
//    pressed state;
//  - the looks painted per class and state, read back as pixels: normal, pressed, checked,
//    disabled, greyed normal bitmap, key colour magenta and -1, no bitmap.
#include "ButtonsTestSupport.h"
#include "KVXBitmapButtonEx.h"
#include "KVXCheckButtonEx.h"
#include "KVXUncheckButton.h"
#include "buttons_test_ids.h"

namespace {

using namespace buttons_test;
using orvane_test::ClientCapture;
using orvane_test::PointParam;

constexpr UINT kId = 1001;
constexpr COLORREF kMagenta = RGB(255, 0, 255);

enum Kind { Push, Uncheck, Check };

// Script tokens: D down, U up, C double click, M move inside, O move outside (no capture
// afterwards), f focus to the button, F focus to the parent, X disable, E enable, K cancel
// mode, p the parent takes the capture; ?C ?c the button holds the capture or not, ?p the
// parent does. Trace: c and d for the static's STN_CLICKED and STN_DBLCLK, and for each
// notification of the owner the state it reads: P/R pressed or released (KVXUncheckButton),
// 1/0 checked (KVXCheckButtonEx), o (KVXBitmapButtonEx).
struct ScriptCase
{
    const char* name;
    Kind kind;
    const char* script;
    const char* trace;
};

const ScriptCase kScriptCases[] = {
    { "UncheckPressAndReleaseNotifyTwice", Uncheck, "D ?C M U ?c", "cPR" },
    { "UncheckDragOutNotifiesOnLeavingAndAgainOnRelease", Uncheck, "D O ?c O U", "cPRR" },
    { "UncheckIgnoresTheSecondClickOfADoubleClick", Uncheck, "D U C U", "cPRR" },
    { "UncheckFocusLossAlwaysNotifies", Uncheck, "f D F f F", "cPRR" },
    { "UncheckDisabledWhileHeldNotifiesOnce", Uncheck, "D X E X", "cPR" },
    { "UncheckCancelModeWhileHeldNotifiesOnce", Uncheck, "D K K", "cPR" },
    { "PushNotifiesOnPressOnly", Push, "D ?C U ?c", "co" },
    { "PushDoubleClickIsASecondPress", Push, "D U C ?C U", "coo" },
    { "PushDragOutAndDisableReleaseSilently", Push, "D O ?c D X ?c", "coco" },
    { "PushReleaseLeavesAnotherWindowsCaptureAlone", Push, "p U ?p", "" },
    { "CheckTogglesOncePerPress", Check, "D ?C U ?c D U", "c1c0" },
    { "CheckIgnoresTheSecondClickOfADoubleClick", Check, "D U C ?c U", "c1d" },
};

class BitmapButtonTest : public ::testing::Test
{
protected:
    void SetUp() override { m_parent = std::make_unique<TestParent>(); }
    void TearDown() override { ::ReleaseCapture(); }

    CStatic* Make(Kind kind, UINT normal = 0, UINT pressed = 0, UINT disabled = 0, DWORD key = kMagenta)
    {
        auto make = [&](auto& button) -> CStatic* {
            button.SetBitmaps(normal, pressed, disabled, key);
            const DWORD style = WS_CHILD | WS_VISIBLE | SS_NOTIFY;
            EXPECT_TRUE(button.Create(_T(""), style, CRect(10, 10, 42, 42), m_parent.get(), kId));
            return &button;
        };
        return kind == Push ? make(m_push) : kind == Uncheck ? make(m_uncheck) : make(m_check);
    }
    void Run(HWND h, const std::string& script)
    {
        for (size_t i = 0; i < script.size(); ++i)
        {
            SCOPED_TRACE("at " + std::to_string(i));
            switch (script[i])
            {
            case 'D': ::SendMessage(h, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(5, 5)); break;
            case 'U': ::SendMessage(h, WM_LBUTTONUP, 0, PointParam(5, 5)); break;
            case 'C': ::SendMessage(h, WM_LBUTTONDBLCLK, MK_LBUTTON, PointParam(5, 5)); break;
            case 'M': ::SendMessage(h, WM_MOUSEMOVE, MK_LBUTTON, PointParam(20, 20)); break;
            case 'O': ::SendMessage(h, WM_MOUSEMOVE, MK_LBUTTON, PointParam(40, 5)); break;   // the client is 32 x 32
            case 'f': ::SetFocus(h); break;
            case 'F': ::SetFocus(m_parent->m_hWnd); break;
            case 'X': ::EnableWindow(h, FALSE); break;
            case 'E': ::EnableWindow(h, TRUE); break;
            case 'K': ::SendMessage(h, WM_CANCELMODE, 0, 0); break;   // as when a message box comes up
            case 'p': ::SetCapture(m_parent->m_hWnd); break;
            case '?':
                ++i;
                EXPECT_EQ(script[i] == 'C' ? h : script[i] == 'p' ? m_parent->m_hWnd : NULL, ::GetCapture());
                break;
            default: break;
            }
        }
    }

    std::unique_ptr<TestParent> m_parent;
    KVXBitmapButtonEx m_push;
    KVXUncheckButton m_uncheck;
    KVXCheckButtonEx m_check;
};

class BitmapButtonScript : public BitmapButtonTest, public ::testing::WithParamInterface<ScriptCase> {};

TEST_P(BitmapButtonScript, NotifiesTheOwner)
{
    const ScriptCase& c = GetParam();
    CStatic* button = Make(c.kind);
    std::string trace;
    orvane_test::MsgLog log(2);
    log.onRecord = [&](int, const orvane_test::MsgEntry& e) {
        if (e.message != WM_COMMAND || LOWORD(e.wParam) != kId)
            return;
        if (e.lParam != 0)
            trace += HIWORD(e.wParam) == STN_CLICKED ? "c" : HIWORD(e.wParam) == STN_DBLCLK ? "d" : "";
        else
            trace += c.kind == Push ? 'o' : c.kind == Uncheck ? (m_uncheck.IsPressed() ? 'P' : 'R')
                                                                 : (m_check.GetCheck() ? '1' : '0');
    };
    log.SpyParent(m_parent->m_hWnd, 1);
    Run(button->m_hWnd, c.script);
    EXPECT_EQ(c.trace, trace);
    log.Unspy(m_parent->m_hWnd);
}

INSTANTIATE_TEST_SUITE_P(Cases, BitmapButtonScript, ::testing::ValuesIn(kScriptCases),
                         [](const ::testing::TestParamInfo<ScriptCase>& info) { return std::string(info.param.name); });

TEST_F(BitmapButtonTest, SetCheckDoesNotNotifyAndIsPressedWithoutWindowIsFalse)
{
    EXPECT_FALSE(m_uncheck.IsPressed());
    m_check.SetCheck(TRUE);   // before the window exists
    orvane_test::NotifySpy owner(m_parent->m_hWnd, 0, 0, true);
    Make(Check);
    EXPECT_EQ(1, m_check.GetCheck());
    m_check.SetCheck(FALSE);
    EXPECT_EQ(0, m_check.GetCheck());
    EXPECT_EQ(0, owner.count());
}

// The 16 x 16 test bitmaps sit centred at (8, 8) in the 32 x 32 client: columns 0-3 carry
// the colour that names the bitmap (r normal, g pressed, b disabled), columns 4-15 bands of
// key colour, mid-grey, black and white. A look is five letters of Colour() for those
// probes (r g b ident), '.' unchecked.
struct LookCase
{
    const char* name;
    Kind kind;
    UINT disabledBitmap;
    const char* script;
    const char* look;
};

const LookCase kLookCases[] = {
    { "PushNormal", Push, IDB_TEST_DISABLED, "", "rFykw" },
    { "PushPressed", Push, IDB_TEST_DISABLED, "D", "gFSkH" },
    { "PushDisabled", Push, IDB_TEST_DISABLED, "U X", "bFykw" },
    { "UncheckGreyedWithoutDisabledBitmap", Uncheck, 0, "X", "rFHSw" },
    { "UncheckDoubleClickLooksReleased", Uncheck, 0, "D U C", "r...." },
    { "CheckCheckedLastsAfterRelease", Check, IDB_TEST_DISABLED, "D U", "gHSkH" },
    { "CheckCheckedDisabled", Check, IDB_TEST_DISABLED, "D U X", "gFHSH" },
    { "CheckUncheckedButHeldShowsThePressedBitmap", Check, IDB_TEST_DISABLED, "D U D", "g...." },
    { "CheckUncheckedReleased", Check, IDB_TEST_DISABLED, "D U D U", "r...." },
};

class BitmapButtonLook : public BitmapButtonTest, public ::testing::WithParamInterface<LookCase> {};

TEST_P(BitmapButtonLook, Pixels)
{
    const LookCase& c = GetParam();
    CStatic* button = Make(c.kind, IDB_TEST_NORMAL, IDB_TEST_PRESSED, c.disabledBitmap);
    Run(button->m_hWnd, c.script);
    ClientCapture cap(button->m_hWnd);
    const POINT probes[5] = { { 9, 9 }, { 16, 9 }, { 16, 13 }, { 16, 17 }, { 16, 21 } };
    for (int i = 0; i < 5; ++i)
        if (c.look[i] != '.')
            EXPECT_EQ(Hex(Colour(c.look[i])), Hex(cap.At(probes[i].x, probes[i].y))) << "probe " << i;
}

INSTANTIATE_TEST_SUITE_P(Cases, BitmapButtonLook, ::testing::ValuesIn(kLookCases),
                         [](const ::testing::TestParamInfo<LookCase>& info) { return std::string(info.param.name); });

TEST_F(BitmapButtonTest, KeyMinusOneKeepsFacePixelsExceptWhenChecked)
{
    // face_*.bmp carry this colour as their key; the session's button face is set to it.
    const COLORREF saved = Face(), face = RGB(212, 208, 200);
    const INT element = COLOR_BTNFACE;
    ::SetSysColors(1, &element, &face);
    CStatic* button = Make(Check, IDB_TEST_FACE_NORMAL, IDB_TEST_FACE_PRESSED, IDB_TEST_FACE_DISABLED, 0xFFFFFFFF);
    EXPECT_EQ(Hex(face), Hex(ClientCapture(button->m_hWnd).At(16, 9)));
    button->EnableWindow(FALSE);
    EXPECT_EQ(Hex(face), Hex(ClientCapture(button->m_hWnd).At(16, 9)));
    button->EnableWindow(TRUE);
    m_check.SetCheck(TRUE);
    EXPECT_EQ(Hex(Hi()), Hex(ClientCapture(button->m_hWnd).At(16, 9)));
    ::SetSysColors(1, &element, &saved);
}

TEST_F(BitmapButtonTest, WithoutBitmapsOrWithAMissingOneTheFaceIsFilled)
{
    Make(Push);
    EXPECT_EQ(32 * 32, ClientCapture(m_push.m_hWnd).Count(RECT{ 0, 0, 32, 32 }, Face()));
    m_push.DestroyWindow();
    Make(Uncheck, 0, 4242, 0);   // 4242 names no bitmap
    ::SendMessage(m_uncheck.m_hWnd, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(5, 5));
    EXPECT_EQ(32 * 32, ClientCapture(m_uncheck.m_hWnd).Count(RECT{ 0, 0, 32, 32 }, Face()));
}

} // namespace
