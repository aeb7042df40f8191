// Bitmap buttons on SS_NOTIFY statics:
//  - notification sequences at the owner for press, release, drag out, double click,
//    focus loss and disabling while held, for each of the three classes, with the state
//    the owner reads during each notification (IsPressed, GetCheck);
//  - capture as the pressed state;
//  - the bitmap and colour map painted per state (read back as pixels): normal, pressed,
//    checked, disabled, greyed normal bitmap, key colour magenta and -1, no bitmap.
#include <afxwin.h>

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ButtonsTestSupport.h"
#include "Input.h"
#include "KVXBitmapButtonEx.h"
#include "KVXCheckButtonEx.h"
#include "KVXUncheckButton.h"
#include "MsgSequence.h"
#include "Pixels.h"
#include "buttons_test_ids.h"

namespace {

using namespace orvane_test;
using buttons_test::TestParent;

constexpr UINT kId = 1001;
constexpr COLORREF kMagenta = RGB(255, 0, 255);
constexpr COLORREF kRed = RGB(255, 0, 0);      // identifies the normal bitmap
constexpr COLORREF kGreen = RGB(0, 255, 0);    // the pressed bitmap
constexpr COLORREF kBlue = RGB(0, 0, 255);     // the disabled bitmap

// Window-free state the owner can read while it is being notified.
class OwnerTrace
{
public:
    OwnerTrace(HWND hParent, std::function<char()> state) : m_hParent(hParent), m_state(std::move(state))
    {
        ::SetWindowSubclass(m_hParent, Proc, 1, reinterpret_cast<DWORD_PTR>(this));
    }
    ~OwnerTrace() { ::RemoveWindowSubclass(m_hParent, Proc, 1); }
    const std::string& trace() const { return m_trace; }

private:
    static LRESULT CALLBACK Proc(HWND hwnd, UINT msg, WPARAM wParam, LPARAM lParam, UINT_PTR, DWORD_PTR ref)
    {
        auto* self = reinterpret_cast<OwnerTrace*>(ref);
        if (msg == WM_COMMAND && lParam == 0 && LOWORD(wParam) == kId)
            self->m_trace += self->m_state();
        return ::DefSubclassProc(hwnd, msg, wParam, lParam);
    }
    HWND m_hParent;
    std::function<char()> m_state;
    std::string m_trace;
};

class BitmapButtonTest : public ::testing::Test
{
protected:
    static void SetUpTestSuite() { buttons_test::EnsureLibraryLoaded(); }

    void SetUp() override
    {
        m_parent = std::make_unique<TestParent>();
        m_log.SpyParent(m_parent->m_hWnd, 1);
    }

    void TearDown() override
    {
        m_log.Unspy(m_parent->m_hWnd);
        ::ReleaseCapture();
    }

    void Create(CStatic& button)
    {
        ASSERT_TRUE(button.Create(_T(""), WS_CHILD | WS_VISIBLE | SS_NOTIFY, CRect(10, 10, 42, 42), m_parent.get(),
                                  kId));
        m_log.Flush();
    }

    static void Down(HWND h) { ::SendMessage(h, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(5, 5)); }
    static void Up(HWND h) { ::SendMessage(h, WM_LBUTTONUP, 0, PointParam(5, 5)); }
    static void DblClk(HWND h) { ::SendMessage(h, WM_LBUTTONDBLCLK, MK_LBUTTON, PointParam(5, 5)); }
    static void Move(HWND h, int x, int y) { ::SendMessage(h, WM_MOUSEMOVE, MK_LBUTTON, PointParam(x, y)); }

    // Expected parent traffic, built around the button's handle.
    static MsgEntry Static(HWND h, WORD code)
    {
        return { WM_COMMAND, Sent | Parent | WParam | LParam, MAKEWPARAM(kId, code), reinterpret_cast<LPARAM>(h), 0 };
    }
    static MsgEntry Owner() { return { WM_COMMAND, Sent | Parent | WParam | LParam, MAKEWPARAM(kId, 0), 0, 0 }; }
    static MsgEntry Maybe(MsgEntry e)
    {
        e.flags |= Optional;
        return e;
    }
    static MsgEntry End() { return { 0 }; }

    std::unique_ptr<TestParent> m_parent;
    MsgLog m_log;
};

// ---------------------------------------------------------------------------
// KVXUncheckButton

TEST_F(BitmapButtonTest, UncheckPressAndReleaseNotifyTwice)
{
    KVXUncheckButton button;
    Create(button);
    HWND h = button.m_hWnd;
    OwnerTrace owner(m_parent->m_hWnd, [&] { return button.IsPressed() ? 'P' : 'R'; });

    Down(h);
    EXPECT_TRUE(button.IsPressed());
    EXPECT_EQ(h, ::GetCapture());
    const MsgEntry press[] = { Static(h, STN_CLICKED), Owner(), End() };
    EXPECT_MSGS(m_log, 1, press);

    Move(h, 20, 20);   // moving inside while held changes nothing
    Up(h);
    EXPECT_FALSE(button.IsPressed());
    const MsgEntry release[] = { Owner(), End() };
    EXPECT_MSGS(m_log, 1, release);
    EXPECT_EQ("PR", owner.trace());
}

TEST_F(BitmapButtonTest, UncheckDragOutNotifiesOnLeavingAndAgainOnRelease)
{
    KVXUncheckButton button;
    Create(button);
    HWND h = button.m_hWnd;
    OwnerTrace owner(m_parent->m_hWnd, [&] { return button.IsPressed() ? 'P' : 'R'; });

    Down(h);
    Move(h, 40, 5);    // client is 32 x 32
    EXPECT_FALSE(button.IsPressed());
    EXPECT_EQ(nullptr, ::GetCapture());
    EXPECT_EQ("PR", owner.trace());
    Move(h, 50, 5);    // no capture any more: nothing new
    EXPECT_EQ("PR", owner.trace());
    Up(h);
    EXPECT_EQ("PRR", owner.trace());
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), Owner(), Owner(), End() };
    EXPECT_MSGS(m_log, 1, seq);
}

TEST_F(BitmapButtonTest, UncheckIgnoresSecondClickOfDoubleClick)
{
    KVXUncheckButton button;
    button.SetBitmaps(IDB_TEST_NORMAL, IDB_TEST_PRESSED, IDB_TEST_DISABLED, kMagenta);
    Create(button);
    HWND h = button.m_hWnd;
    OwnerTrace owner(m_parent->m_hWnd, [&] { return button.IsPressed() ? 'P' : 'R'; });

    Down(h);
    Up(h);
    DblClk(h);
    EXPECT_FALSE(button.IsPressed());
    EXPECT_EQ(kRed, ClientCapture(h).At(9, 9));
    Up(h);
    EXPECT_EQ("PRR", owner.trace());
    // No STN_DBLCLK: the double click never reaches the static control.
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), Owner(), Owner(), End() };
    EXPECT_MSGS(m_log, 1, seq);
}

TEST_F(BitmapButtonTest, UncheckFocusLossAlwaysNotifies)
{
    KVXUncheckButton button;
    Create(button);
    HWND h = button.m_hWnd;
    OwnerTrace owner(m_parent->m_hWnd, [&] { return button.IsPressed() ? 'P' : 'R'; });

    ::SetFocus(h);
    Down(h);
    ::SetFocus(m_parent->m_hWnd);
    EXPECT_FALSE(button.IsPressed());
    EXPECT_EQ("PR", owner.trace());
    // Not held: losing the focus still notifies.
    ::SetFocus(h);
    ::SetFocus(m_parent->m_hWnd);
    EXPECT_EQ("PRR", owner.trace());
}

TEST_F(BitmapButtonTest, UncheckDisabledWhileHeldNotifiesOnce)
{
    KVXUncheckButton button;
    Create(button);
    HWND h = button.m_hWnd;
    OwnerTrace owner(m_parent->m_hWnd, [&] { return button.IsPressed() ? 'P' : 'R'; });

    Down(h);
    button.EnableWindow(FALSE);
    EXPECT_FALSE(button.IsPressed());
    EXPECT_EQ("PR", owner.trace());
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), Owner(), Maybe(Static(h, STN_DISABLE)), End() };
    EXPECT_MSGS(m_log, 1, seq);

    // Enabling and disabling while not held tells the owner nothing.
    button.EnableWindow(TRUE);
    button.EnableWindow(FALSE);
    EXPECT_EQ("PR", owner.trace());
}

TEST_F(BitmapButtonTest, UncheckCancelModeWhileHeldNotifies)
{
    KVXUncheckButton button;
    Create(button);
    HWND h = button.m_hWnd;
    OwnerTrace owner(m_parent->m_hWnd, [&] { return button.IsPressed() ? 'P' : 'R'; });

    Down(h);
    ::SendMessage(h, WM_CANCELMODE, 0, 0);   // as when a message box comes up
    EXPECT_FALSE(button.IsPressed());
    ::SendMessage(h, WM_CANCELMODE, 0, 0);
    EXPECT_EQ("PR", owner.trace());
}

TEST_F(BitmapButtonTest, IsPressedWithoutWindowIsFalse)
{
    KVXUncheckButton button;
    EXPECT_FALSE(button.IsPressed());
}

// ---------------------------------------------------------------------------
// KVXBitmapButtonEx

TEST_F(BitmapButtonTest, PushNotifiesOnPressOnly)
{
    KVXBitmapButtonEx button;
    Create(button);
    HWND h = button.m_hWnd;

    Down(h);
    EXPECT_EQ(h, ::GetCapture());
    Up(h);
    EXPECT_EQ(nullptr, ::GetCapture());
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), End() };
    EXPECT_MSGS(m_log, 1, seq);
}

TEST_F(BitmapButtonTest, PushDoubleClickNotifiesTwice)
{
    KVXBitmapButtonEx button;
    Create(button);
    HWND h = button.m_hWnd;

    Down(h);
    Up(h);
    DblClk(h);
    EXPECT_EQ(h, ::GetCapture());   // the second press holds the button too
    Up(h);
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), Owner(), End() };
    EXPECT_MSGS(m_log, 1, seq);
}

TEST_F(BitmapButtonTest, PushDragOutAndDisableReleaseSilently)
{
    KVXBitmapButtonEx button;
    Create(button);
    HWND h = button.m_hWnd;

    Down(h);
    Move(h, -3, 5);
    EXPECT_EQ(nullptr, ::GetCapture());
    Down(h);
    button.EnableWindow(FALSE);
    EXPECT_EQ(nullptr, ::GetCapture());
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), Static(h, STN_CLICKED), Owner(),
                             Maybe(Static(h, STN_DISABLE)), End() };
    EXPECT_MSGS(m_log, 1, seq);
}

TEST_F(BitmapButtonTest, ReleaseLeavesAnotherWindowsCaptureAlone)
{
    KVXBitmapButtonEx button;
    Create(button);
    ::SetCapture(m_parent->m_hWnd);
    Up(button.m_hWnd);
    EXPECT_EQ(m_parent->m_hWnd, ::GetCapture());
}

// ---------------------------------------------------------------------------
// KVXCheckButtonEx

TEST_F(BitmapButtonTest, CheckTogglesOncePerPress)
{
    KVXCheckButtonEx button;
    Create(button);
    HWND h = button.m_hWnd;
    OwnerTrace owner(m_parent->m_hWnd, [&] { return button.GetCheck() ? '1' : '0'; });

    Down(h);
    EXPECT_EQ(1, button.GetCheck());
    EXPECT_EQ(h, ::GetCapture());
    Up(h);
    EXPECT_EQ(nullptr, ::GetCapture());
    Down(h);
    Up(h);
    EXPECT_EQ(0, button.GetCheck());
    EXPECT_EQ("10", owner.trace());
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), Static(h, STN_CLICKED), Owner(), End() };
    EXPECT_MSGS(m_log, 1, seq);
}

TEST_F(BitmapButtonTest, CheckIgnoresSecondClickOfDoubleClick)
{
    KVXCheckButtonEx button;
    Create(button);
    HWND h = button.m_hWnd;

    Down(h);
    Up(h);
    DblClk(h);
    EXPECT_EQ(nullptr, ::GetCapture());
    Up(h);
    EXPECT_EQ(1, button.GetCheck());
    // The static reports the double click; the class ignores it.
    const MsgEntry seq[] = { Static(h, STN_CLICKED), Owner(), Static(h, STN_DBLCLK), End() };
    EXPECT_MSGS(m_log, 1, seq);
}

TEST_F(BitmapButtonTest, SetCheckDoesNotNotify)
{
    KVXCheckButtonEx button;
    button.SetCheck(TRUE);   // before the window exists
    Create(button);
    EXPECT_EQ(1, button.GetCheck());
    button.SetCheck(FALSE);
    EXPECT_EQ(0, button.GetCheck());
    const MsgEntry none[] = { End() };
    EXPECT_MSGS(m_log, 1, none);
}

// ---------------------------------------------------------------------------
// Painting. The 16 x 16 test bitmaps sit centred at (8, 8) in the 32 x 32 client:
// columns 0-3 carry the colour that names the bitmap, columns 4-15 four bands of
// key colour, mid-grey, black and white.

struct Probe
{
    COLORREF ident;
    COLORREF key;
    COLORREF grey;
    COLORREF black;
    COLORREF white;
};

Probe ReadProbe(HWND h)
{
    ClientCapture cap(h);
    return { cap.At(9, 9), cap.At(16, 9), cap.At(16, 13), cap.At(16, 17), cap.At(16, 21) };
}

std::string Hex(COLORREF c)
{
    char buf[16];
    snprintf(buf, sizeof buf, "%06lX", static_cast<unsigned long>(c));
    return buf;
}

void ExpectProbe(const Probe& actual, const Probe& expected)
{
    EXPECT_EQ(Hex(expected.ident), Hex(actual.ident)) << "identifying colour";
    EXPECT_EQ(Hex(expected.key), Hex(actual.key)) << "key band";
    EXPECT_EQ(Hex(expected.grey), Hex(actual.grey)) << "grey band";
    EXPECT_EQ(Hex(expected.black), Hex(actual.black)) << "black band";
    EXPECT_EQ(Hex(expected.white), Hex(actual.white)) << "white band";
}

COLORREF Face() { return ::GetSysColor(COLOR_BTNFACE); }
COLORREF Hi() { return ::GetSysColor(COLOR_BTNHIGHLIGHT); }
COLORREF Sh() { return ::GetSysColor(COLOR_BTNSHADOW); }

TEST_F(BitmapButtonTest, PushLooksPerState)
{
    KVXBitmapButtonEx button;
    button.SetBitmaps(IDB_TEST_NORMAL, IDB_TEST_PRESSED, IDB_TEST_DISABLED, kMagenta);
    Create(button);
    HWND h = button.m_hWnd;

    {
        SCOPED_TRACE("normal");
        ExpectProbe(ReadProbe(h), { kRed, Face(), 0x808080, 0, 0xFFFFFF });
    }
    Down(h);
    {
        SCOPED_TRACE("pressed");
        ExpectProbe(ReadProbe(h), { kGreen, Face(), Sh(), 0, Hi() });
    }
    Up(h);
    button.EnableWindow(FALSE);
    {
        SCOPED_TRACE("disabled");
        ExpectProbe(ReadProbe(h), { kBlue, Face(), 0x808080, 0, 0xFFFFFF });
    }
}

TEST_F(BitmapButtonTest, DisabledWithoutDisabledBitmapIsGreyedNormal)
{
    KVXUncheckButton button;
    button.SetBitmaps(IDB_TEST_NORMAL, IDB_TEST_PRESSED, 0, kMagenta);
    Create(button);
    button.EnableWindow(FALSE);
    ExpectProbe(ReadProbe(button.m_hWnd), { kRed, Face(), Hi(), Sh(), 0xFFFFFF });
}

TEST_F(BitmapButtonTest, CheckedLookLastsAfterRelease)
{
    KVXCheckButtonEx button;
    button.SetBitmaps(IDB_TEST_NORMAL, IDB_TEST_PRESSED, IDB_TEST_DISABLED, kMagenta);
    Create(button);
    HWND h = button.m_hWnd;

    Down(h);
    Up(h);
    {
        SCOPED_TRACE("checked, released");
        ExpectProbe(ReadProbe(h), { kGreen, Hi(), Sh(), 0, Hi() });
    }
    button.EnableWindow(FALSE);
    {
        SCOPED_TRACE("checked, disabled");
        ExpectProbe(ReadProbe(h), { kGreen, Face(), Hi(), Sh(), Hi() });
    }
    button.EnableWindow(TRUE);
    Down(h);   // unchecks, but held: still the pressed bitmap
    EXPECT_EQ(0, button.GetCheck());
    EXPECT_EQ(Hex(kGreen), Hex(ReadProbe(h).ident));
    Up(h);
    EXPECT_EQ(Hex(kRed), Hex(ReadProbe(h).ident));
}

// Sets the button face for the session while it lives (face_*.bmp carry this colour).
class ButtonFaceGuard
{
public:
    explicit ButtonFaceGuard(COLORREF face) : m_saved(::GetSysColor(COLOR_BTNFACE))
    {
        Set(face);
    }
    ~ButtonFaceGuard() { Set(m_saved); }

private:
    static void Set(COLORREF c)
    {
        const INT element = COLOR_BTNFACE;
        ::SetSysColors(1, &element, &c);
    }
    COLORREF m_saved;
};

TEST_F(BitmapButtonTest, KeyMinusOneKeepsFacePixelsExceptWhenChecked)
{
    ButtonFaceGuard face(RGB(212, 208, 200));
    ASSERT_EQ(Hex(RGB(212, 208, 200)), Hex(Face()));
    KVXCheckButtonEx button;
    button.SetBitmaps(IDB_TEST_FACE_NORMAL, IDB_TEST_FACE_PRESSED, IDB_TEST_FACE_DISABLED, 0xFFFFFFFF);
    Create(button);
    HWND h = button.m_hWnd;

    EXPECT_EQ(Hex(Face()), Hex(ReadProbe(h).key));
    button.EnableWindow(FALSE);
    EXPECT_EQ(Hex(Face()), Hex(ReadProbe(h).key));
    button.EnableWindow(TRUE);
    button.SetCheck(TRUE);
    EXPECT_EQ(Hex(Hi()), Hex(ReadProbe(h).key));
}

TEST_F(BitmapButtonTest, WithoutBitmapsTheFaceIsFilled)
{
    KVXBitmapButtonEx button;
    Create(button);
    ClientCapture cap(button.m_hWnd);
    RECT all = { 0, 0, 32, 32 };
    EXPECT_EQ(32 * 32, cap.Count(all, Face()));
}

TEST_F(BitmapButtonTest, MissingBitmapResourceDrawsNothing)
{
    KVXBitmapButtonEx button;
    button.SetBitmaps(0, 4242, 0, kMagenta);   // 4242 names no bitmap
    Create(button);
    Down(button.m_hWnd);
    ClientCapture cap(button.m_hWnd);
    RECT all = { 0, 0, 32, 32 };
    EXPECT_EQ(32 * 32, cap.Count(all, Face()));
}

} // namespace
