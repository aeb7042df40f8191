// Colour well, its popup and the colour dialog:
//  - the well's pixels: frame, separator, arrow, swatch, hatch when undefined, no swatch
//    and embossed arrow when disabled, focus dots, pressed look;
//  - popup size and place below the well, kept on screen at the bottom right;
//  - current and hover cells at opening (defined and undefined colour);
//  - picking by mouse (row 1, column 2 gives white and one WM_USER+42 with its record),
//    a release on a gap or an empty cell, Escape and clicks outside (no message);
//  - the keyboard moves, the Other... button among them, Return with and without it;
//  - Other... with the standard dialog answered OK and cancelled (capture kept);
//  - setter ranges, palette changes, KVXColorDialog's caption and run-time class.
#include <afxwin.h>

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ButtonsTestSupport.h"
#include "Input.h"
#include "KVXColorDialog.h"
#include "KVXColorWell.h"
#include "Pixels.h"
#include "resource.h"

namespace {

using namespace orvane_test;
using buttons_test::ActiveDialog;
using buttons_test::ColorNotifyRecorder;
using buttons_test::ModalScript;
using buttons_test::TestParent;

constexpr UINT kWellId = 2001;
constexpr int kWellWidth = 80;
constexpr int kWellHeight = 24;

COLORREF Face() { return ::GetSysColor(COLOR_BTNFACE); }
COLORREF Hi() { return ::GetSysColor(COLOR_BTNHIGHLIGHT); }
COLORREF Sh() { return ::GetSysColor(COLOR_BTNSHADOW); }

std::string Hex(COLORREF c)
{
    char buf[16];
    snprintf(buf, sizeof buf, "%06lX", static_cast<unsigned long>(c));
    return buf;
}

// The well's palette layout as the tests set it, for computing cell places.
struct Grid
{
    int rows = 5, columns = 4, width = 20, height = 20, gapH = 0, gapV = 0, border = 0;
    RECT Button(int i) const
    {
        const int r = i / columns, c = i % columns;
        RECT rc = { border + c * (width + gapH), border + r * (height + gapV), 0, 0 };
        rc.right = rc.left + width;
        rc.bottom = rc.top + height;
        return rc;
    }
    POINT Centre(int i) const
    {
        RECT rc = Button(i);
        return { (rc.left + rc.right) / 2, (rc.top + rc.bottom) / 2 };
    }
};

// Cell drawn raised (the hover cell that is not current), read from the popup's pixels;
// -1 when there is none.
int RaisedCell(HWND hPopup, const Grid& grid)
{
    ClientCapture cap(hPopup);
    int found = -1;
    for (int i = 0; i < grid.rows * grid.columns; ++i)
    {
        RECT rc = grid.Button(i);
        if (cap.At(rc.left, rc.top + 1) == Hi() && cap.At(rc.right - 1, rc.bottom - 2) == Sh())
        {
            if (found != -1)
                return -2;   // two raised cells: a stale frame
            found = i;
        }
    }
    return found;
}

// Cell drawn sunken (the current cell), or -1.
int SunkenCell(HWND hPopup, const Grid& grid)
{
    ClientCapture cap(hPopup);
    for (int i = 0; i < grid.rows * grid.columns; ++i)
    {
        RECT rc = grid.Button(i);
        if (cap.At(rc.left, rc.top + 1) == Sh() && cap.At(rc.right - 1, rc.bottom - 2) == Hi())
            return i;
    }
    return -1;
}

bool FocusOnOther(HWND hPopup)
{
    return ::GetFocus() == ::GetDlgItem(hPopup, IDC_COLOR_OTHER);
}

void PostKey(UINT vk)
{
    HWND hFocus = ::GetFocus();
    ::PostMessage(hFocus, WM_KEYDOWN, vk, 1);
    ::PostMessage(hFocus, WM_KEYUP, vk, 0xC0000001);
}

class ColorWellTest : public ::testing::Test
{
protected:
    static void SetUpTestSuite() { buttons_test::EnsureLibraryLoaded(); }

    void SetUp() override
    {
        m_parent = std::make_unique<TestParent>(100, 100, 400, 300);
        m_parent->MoveClientTo(100, 100);
        ASSERT_TRUE(m_well.Create(_T(""), WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_OWNERDRAW,
                                  CRect(20, 20, 20 + kWellWidth, 20 + kWellHeight), m_parent.get(), kWellId));
        m_recorder = std::make_unique<ColorNotifyRecorder>(m_parent->m_hWnd);
    }

    void TearDown() override
    {
        m_recorder.reset();
        ::ReleaseCapture();
    }

    // Runs the popup with the given steps; every script must close the popup itself.
    void RunPopup(std::vector<ModalScript::Step> steps)
    {
        ModalScript script(std::move(steps));
        m_well.DoColorWellDlg();
        EXPECT_TRUE(script.finished()) << "steps done: " << script.stepsDone();
        EXPECT_FALSE(script.timedOut());
        EXPECT_EQ(nullptr, ::GetCapture());
    }

    CRect WellScreenRect()
    {
        CRect rc;
        m_well.GetWindowRect(&rc);
        return rc;
    }

    std::unique_ptr<TestParent> m_parent;
    KVXColorWell m_well;
    std::unique_ptr<ColorNotifyRecorder> m_recorder;
};

// ---------------------------------------------------------------------------
// The well's own drawing (client 80 x 24: L 0, T 0, R 80, B 24, arrow middle m 12)

TEST_F(ColorWellTest, DefinedColourShowsFramedSwatchAndArrow)
{
    m_well.SetColor(RGB(200, 10, 10));
    ClientCapture cap(m_well.m_hWnd);
    EXPECT_EQ(Hex(RGB(200, 10, 10)), Hex(cap.At(30, 12))) << "swatch inside";
    EXPECT_EQ(Hex(0), Hex(cap.At(5, 4))) << "swatch outline";
    EXPECT_EQ(Hex(0), Hex(cap.At(64, 19))) << "swatch outline, bottom right";
    EXPECT_EQ(Hex(Face()), Hex(cap.At(65, 12))) << "right of the swatch";
    EXPECT_EQ(Hex(0), Hex(cap.At(79, 23))) << "outer frame";
    EXPECT_EQ(Hex(Sh()), Hex(cap.At(78, 22))) << "inner shadow";
    EXPECT_EQ(Hex(Hi()), Hex(cap.At(1, 1))) << "highlight";
    EXPECT_EQ(Hex(Hi()), Hex(cap.At(70, 10))) << "separator, light";
    EXPECT_EQ(Hex(Sh()), Hex(cap.At(69, 10))) << "separator, dark";
    EXPECT_EQ(Hex(0), Hex(cap.At(76, 11))) << "arrow, first row";
    EXPECT_EQ(Hex(0), Hex(cap.At(72, 11))) << "arrow, first row end";
    EXPECT_EQ(Hex(0), Hex(cap.At(73, 12))) << "arrow, second row";
    EXPECT_EQ(Hex(0), Hex(cap.At(74, 13))) << "arrow tip";
    EXPECT_EQ(Hex(Face()), Hex(cap.At(71, 11))) << "left of the arrow";
}

TEST_F(ColorWellTest, NewWellIsBlack)
{
    EXPECT_EQ(Hex(0), Hex(m_well.GetColor()));
    EXPECT_FALSE(m_well.GetColorUndefined());
    ClientCapture cap(m_well.m_hWnd);
    RECT inside = { 6, 5, 64, 19 };
    EXPECT_EQ(58 * 14, cap.Count(inside, 0));
}

TEST_F(ColorWellTest, UndefinedColourIsHatched)
{
    m_well.SetColor(RGB(200, 10, 10));
    m_well.SetColorUndefined(TRUE);
    EXPECT_TRUE(m_well.GetColorUndefined());
    ClientCapture cap(m_well.m_hWnd);
    RECT inside = { 6, 5, 64, 19 };
    const int total = 58 * 14;
    const int black = cap.Count(inside, 0);
    EXPECT_GT(black, total / 8);
    EXPECT_LT(black, total / 2);
    EXPECT_EQ(0, cap.Count(inside, RGB(200, 10, 10)));
    // SetColor makes the colour defined again.
    m_well.SetColor(RGB(10, 200, 10));
    EXPECT_FALSE(m_well.GetColorUndefined());
    EXPECT_EQ(Hex(RGB(10, 200, 10)), Hex(ClientCapture(m_well.m_hWnd).At(30, 12)));
}

TEST_F(ColorWellTest, DisabledWellHasNoSwatchAndAnEmbossedArrow)
{
    m_well.SetColor(RGB(200, 10, 10));
    m_well.EnableWindow(FALSE);
    ClientCapture cap(m_well.m_hWnd);
    RECT inside = { 5, 4, 65, 20 };
    EXPECT_EQ(60 * 16, cap.Count(inside, Face()));
    EXPECT_EQ(Hex(0xFFFFFF), Hex(cap.At(76, 11)));
    EXPECT_EQ(Hex(0xFFFFFF), Hex(cap.At(75, 12)));
    EXPECT_EQ(Hex(0xFFFFFF), Hex(cap.At(74, 13)));
    EXPECT_EQ(Hex(Sh()), Hex(cap.At(73, 11)));
    EXPECT_EQ(Hex(Sh()), Hex(cap.At(73, 12)));
}

TEST_F(ColorWellTest, FocusDotsAndPressedLook)
{
    m_well.SetColor(RGB(200, 10, 10));
    m_well.SetFocus();
    {
        ClientCapture cap(m_well.m_hWnd);
        EXPECT_EQ(Hex(0), Hex(cap.At(3, 3)));
        EXPECT_EQ(Hex(Face()), Hex(cap.At(4, 3)));
        EXPECT_EQ(Hex(0), Hex(cap.At(5, 3)));
        EXPECT_EQ(Hex(0), Hex(cap.At(3, 5)));
        EXPECT_EQ(Hex(0), Hex(cap.At(77, 19)));
    }
    m_well.SetState(TRUE);   // ODS_SELECTED
    {
        ClientCapture cap(m_well.m_hWnd);
        EXPECT_EQ(Hex(Sh()), Hex(cap.At(0, 10))) << "pressed frame, left";
        EXPECT_EQ(Hex(0), Hex(cap.At(1, 10))) << "pressed frame, inner left";
        EXPECT_EQ(Hex(Hi()), Hex(cap.At(79, 10))) << "pressed frame, right";
        EXPECT_EQ(Hex(0), Hex(cap.At(6, 5))) << "swatch outline moved by one";
        EXPECT_EQ(Hex(RGB(200, 10, 10)), Hex(cap.At(7, 6)));
    }
    m_well.SetState(FALSE);
}

// ---------------------------------------------------------------------------
// Settings

struct SetterCase
{
    const char* name;
    void (KVXColorWell::*set)(long);
    long (KVXColorWell::*get)();
    long initial;
    std::vector<long> rejected;
    std::vector<long> accepted;
};

const SetterCase kSetterCases[] = {
    { "Rows", &KVXColorWell::SetRowCount, &KVXColorWell::GetRowCount, 5, { 0, 21, -1 }, { 1, 20 } },
    { "Columns", &KVXColorWell::SetColumnCount, &KVXColorWell::GetColumnCount, 4, { 0, 21 }, { 1, 20 } },
    { "ButtonWidth", &KVXColorWell::SetButtonWidth, &KVXColorWell::GetButtonWidth, 20, { 9, 101 }, { 10, 100 } },
    { "ButtonHeight", &KVXColorWell::SetButtonHeight, &KVXColorWell::GetButtonHeight, 20, { 9, 101 }, { 10, 100 } },
    { "GapH", &KVXColorWell::SetButtonGapHorizontal, &KVXColorWell::GetButtonGapHorizontal, 0, { -1, 101 }, { 100, 0 } },
    { "GapV", &KVXColorWell::SetButtonGapVertical, &KVXColorWell::GetButtonGapVertical, 0, { -1, 101 }, { 100, 0 } },
    { "Border", &KVXColorWell::SetBorderWidth, &KVXColorWell::GetBorderWidth, 0, { -1, 101 }, { 100, 0 } },
};

class ColorWellSetter : public ::testing::TestWithParam<SetterCase> {};

TEST_P(ColorWellSetter, KeepsRange)
{
    const SetterCase& c = GetParam();
    KVXColorWell well;
    EXPECT_EQ(c.initial, (well.*c.get)());
    for (long v : c.rejected)
    {
        (well.*c.set)(v);
        EXPECT_EQ(c.initial, (well.*c.get)()) << "after setting " << v;
    }
    for (long v : c.accepted)
    {
        (well.*c.set)(v);
        EXPECT_EQ(v, (well.*c.get)());
    }
}

INSTANTIATE_TEST_SUITE_P(Cases, ColorWellSetter, ::testing::ValuesIn(kSetterCases),
                         [](const ::testing::TestParamInfo<SetterCase>& info) { return std::string(info.param.name); });

TEST(ColorWellDefaults, NameAndPaletteAndOtherButton)
{
    buttons_test::EnsureLibraryLoaded();
    KVXColorWell well;
    EXPECT_EQ(CString(_T("Color")), well.GetColorName());
    EXPECT_TRUE(well.GetHasOtherButton());
    ASSERT_EQ(20, well.GetColorArray()->GetSize());
    EXPECT_EQ(Hex(0xFFFFFF), Hex(well.GetColorArray()->GetAt(6)));
    EXPECT_EQ(Hex(0xC08080), Hex(well.GetColorArray()->GetAt(19)));
    well.SetHasOtherButton(FALSE);
    EXPECT_FALSE(well.GetHasOtherButton());
    well.SetColorName(_T("Farbe"));
    EXPECT_EQ(CString(_T("Farbe")), well.GetColorName());
}

// ---------------------------------------------------------------------------
// Popup geometry

TEST_F(ColorWellTest, PopupOpensBelowTheWellWithItsSize)
{
    const CRect rcWell = WellScreenRect();
    const int f = ::GetSystemMetrics(SM_CXDLGFRAME);
    CRect rcPopup, rcOther, rcDummy;
    HWND hCapture = NULL;
    int sunken = -2, raised = -2;
    RunPopup({ [&](HWND hPopup) {
        ::GetWindowRect(hPopup, &rcPopup);
        ::GetWindowRect(::GetDlgItem(hPopup, IDC_COLOR_OTHER), &rcOther);
        ::MapWindowPoints(NULL, hPopup, reinterpret_cast<POINT*>(&rcOther), 2);
        ::GetWindowRect(::GetDlgItem(hPopup, IDC_COLOR_DUMMY), &rcDummy);
        hCapture = ::GetCapture() == hPopup ? hPopup : NULL;
        // The black well: cell 0 is current and hovered, so drawn sunken without dither.
        sunken = SunkenCell(hPopup, Grid());
        raised = RaisedCell(hPopup, Grid());
        ::SendMessage(hPopup, WM_LBUTTONDOWN, 0, PointParam(-20, -20));
        return true;
    } });
    ASSERT_NE(nullptr, hCapture) << "the popup holds the capture";
    const int h = rcOther.Height();
    EXPECT_GT(h, 0);
    EXPECT_EQ(rcWell.left, rcPopup.left);
    EXPECT_EQ(rcWell.bottom, rcPopup.top);
    EXPECT_EQ(4 * 20 + 2 * f, rcPopup.Width());
    EXPECT_EQ(5 * 20 + f + 2 + h + 3, rcPopup.Height());
    EXPECT_EQ(f, rcOther.left);
    EXPECT_EQ(rcPopup.Width() - 2 * f - 3, rcOther.right);
    EXPECT_EQ(rcPopup.Height() - f - 3, rcOther.bottom);
    EXPECT_EQ(0, rcDummy.Width());
    EXPECT_EQ(0, rcDummy.Height());
    EXPECT_EQ(0, sunken);
    EXPECT_EQ(-1, raised);
    EXPECT_EQ(0, m_recorder->count());
}

TEST_F(ColorWellTest, PopupNearTheScreenCornerStaysOnScreen)
{
    const int cx = ::GetSystemMetrics(SM_CXSCREEN);
    const int cy = ::GetSystemMetrics(SM_CYSCREEN);
    m_parent->MoveClientTo(cx - 60, cy - 30);   // the well at (cx-40, cy-10): popup would leave
    CRect rcPopup;
    RunPopup({ [&](HWND hPopup) {
        ::GetWindowRect(hPopup, &rcPopup);
        ::PostMessage(::GetFocus(), WM_KEYDOWN, VK_ESCAPE, 1);
        return true;
    } });
    EXPECT_EQ(cy, rcPopup.bottom);
    EXPECT_EQ(cx, rcPopup.right);
    EXPECT_EQ(0, m_recorder->count());
}

TEST_F(ColorWellTest, PopupWithoutOtherButtonIsShorterAndGapsWiden)
{
    m_well.SetHasOtherButton(FALSE);
    m_well.SetButtonGapHorizontal(4);
    m_well.SetButtonGapVertical(2);
    m_well.SetBorderWidth(3);
    const int f = ::GetSystemMetrics(SM_CXDLGFRAME);
    CRect rcPopup;
    BOOL bOtherVisible = TRUE;
    RunPopup({ [&](HWND hPopup) {
        ::GetWindowRect(hPopup, &rcPopup);
        bOtherVisible = ::IsWindowVisible(::GetDlgItem(hPopup, IDC_COLOR_OTHER));
        ::PostMessage(::GetFocus(), WM_KEYDOWN, VK_ESCAPE, 1);
        return true;
    } });
    EXPECT_FALSE(bOtherVisible);
    EXPECT_EQ(4 * 20 + 3 * 4 + 2 * (3 + f), rcPopup.Width());
    EXPECT_EQ(5 * 20 + 4 * 2 + 2 * 3 + f + 2, rcPopup.Height());
}

// ---------------------------------------------------------------------------
// Mouse

TEST_F(ColorWellTest, HoverAndPickRow1Column2GivesWhite)
{
    const Grid grid;
    int raised = -2, sunken = -2;
    RunPopup({ [&](HWND hPopup) {
        const POINT pt = grid.Centre(6);
        ::SendMessage(hPopup, WM_MOUSEMOVE, 0, PointParam(pt.x, pt.y));
        raised = RaisedCell(hPopup, grid);
        sunken = SunkenCell(hPopup, grid);
        ::SendMessage(hPopup, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(pt.x, pt.y));
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(pt.x, pt.y));
        return true;
    } });
    EXPECT_EQ(6, raised);
    EXPECT_EQ(0, sunken);
    EXPECT_EQ(Hex(0xFFFFFF), Hex(m_well.GetColor()));
    EXPECT_FALSE(m_well.GetColorUndefined());
    ASSERT_EQ(1, m_recorder->count());
    const ColorNotifyRecorder::Record& r = m_recorder->records()[0];
    EXPECT_EQ(kWellId, r.wParam);
    EXPECT_EQ(m_well.m_hWnd, r.hwndFrom);
    EXPECT_EQ(kWellId, r.idFrom);
    EXPECT_EQ(0x42Au, r.code);
    EXPECT_EQ(Hex(0xFFFFFF), Hex(r.clrColor));
    EXPECT_EQ(Hex(0xFFFFFF), Hex(ClientCapture(m_well.m_hWnd).At(30, 12)));
}

TEST_F(ColorWellTest, ClickOnTheWellOpensThePopup)
{
    const Grid grid;
    RunPopup({ [&](HWND hPopup) {
        const POINT pt = grid.Centre(1);
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(pt.x, pt.y));
        return true;
    } });
    ASSERT_EQ(1, m_recorder->count());
    // Again, opened by a click on the well this time.
    ModalScript script({ [&](HWND hPopup) {
        const POINT pt = grid.Centre(2);
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(pt.x, pt.y));
        return true;
    } });
    ::SendMessage(m_well.m_hWnd, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(10, 10));
    ::SendMessage(m_well.m_hWnd, WM_LBUTTONUP, 0, PointParam(10, 10));
    EXPECT_TRUE(script.finished());
    EXPECT_EQ(Hex(0x00FF00), Hex(m_well.GetColor()));
    EXPECT_EQ(2, m_recorder->count());
}

TEST_F(ColorWellTest, ReleaseOnAGapKeepsTheColourAndStillNotifies)
{
    m_well.SetButtonGapHorizontal(6);
    m_well.SetButtonGapVertical(6);
    m_well.SetColor(0x808000);   // teal, cell 13
    Grid grid;
    grid.gapH = grid.gapV = 6;
    RunPopup({ [&](HWND hPopup) {
        const RECT rc = grid.Button(5);
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(rc.right + 2, rc.top + 5));
        return true;
    } });
    EXPECT_EQ(Hex(0x808000), Hex(m_well.GetColor()));
    ASSERT_EQ(1, m_recorder->count());
    EXPECT_EQ(Hex(0x808000), Hex(m_recorder->records()[0].clrColor));
}

TEST_F(ColorWellTest, ReleaseOnAnEmptyCellPicksNothing)
{
    CArray<COLORREF, COLORREF>* pColors = m_well.GetColorArray();
    pColors->SetSize(10);
    pColors->SetAt(9, RGB(1, 2, 3));
    const Grid grid;
    int pickedLater = 0;
    RunPopup({ [&](HWND hPopup) {
        const POINT pt = grid.Centre(15);
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(pt.x, pt.y));
        return true;
    } });
    EXPECT_EQ(Hex(0), Hex(m_well.GetColor()));
    EXPECT_EQ(1, m_recorder->count());
    // The shortened palette persists between openings.
    RunPopup({ [&](HWND hPopup) {
        const POINT pt = grid.Centre(9);
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(pt.x, pt.y));
        pickedLater = 1;
        return true;
    } });
    EXPECT_EQ(1, pickedLater);
    EXPECT_EQ(Hex(RGB(1, 2, 3)), Hex(m_well.GetColor()));
}

TEST_F(ColorWellTest, EscapeAndClicksOutsideCancelSilently)
{
    m_well.SetColorUndefined(TRUE);
    RunPopup({ [&](HWND) {
        PostKey(VK_ESCAPE);
        return true;
    } });
    RunPopup({ [&](HWND hPopup) {
        CRect rc;
        ::GetClientRect(hPopup, &rc);
        ::SendMessage(hPopup, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(rc.right + 30, 5));
        return true;
    } });
    RunPopup({ [&](HWND hPopup) {
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(-5, -5));
        return true;
    } });
    EXPECT_EQ(0, m_recorder->count());
    EXPECT_TRUE(m_well.GetColorUndefined());
    EXPECT_EQ(Hex(0), Hex(m_well.GetColor()));
}

TEST_F(ColorWellTest, UndefinedColourOpensWithoutCurrentOrHover)
{
    m_well.SetColorUndefined(TRUE);
    int raised = -2, sunken = -2;
    RunPopup({ [&](HWND hPopup) {
        raised = RaisedCell(hPopup, Grid());
        sunken = SunkenCell(hPopup, Grid());
        PostKey(VK_ESCAPE);
        return true;
    } });
    EXPECT_EQ(-1, raised);
    EXPECT_EQ(-1, sunken);
}

// ---------------------------------------------------------------------------
// Keyboard

struct KeyStep
{
    UINT vk;
    int hover;        // expected hover after the key; -1: the Other button
    bool focusOther;  // expected focus
};

TEST_F(ColorWellTest, KeyboardMovesIncludingTheOtherButton)
{
    m_well.SetColorUndefined(TRUE);   // no current cell: every hover shows raised
    const Grid grid;
    const std::vector<KeyStep> keys = {
        { VK_RIGHT, 0, false }, { VK_LEFT, -1, true }, { VK_LEFT, 19, false }, { VK_RIGHT, -1, true },
        { VK_RIGHT, 0, false }, { VK_END, 19, false }, { VK_UP, 15, false }, { VK_DOWN, 19, false },
        { VK_DOWN, -1, true }, { VK_DOWN, 0, false }, { VK_UP, -1, true }, { VK_UP, 16, false },
        { VK_HOME, 0, false }, { VK_DOWN, 4, false }, { VK_RIGHT, 5, false }, { VK_RIGHT, 6, false },
    };
    // Each step checks the previous key's effect and posts the next key; the posted key
    // is handled by the popup's loop before the next timer tick.
    std::vector<std::string> results;
    std::vector<ModalScript::Step> steps;
    for (size_t i = 0; i <= keys.size(); ++i)
    {
        steps.push_back([&, i](HWND hPopup) {
            if (i > 0)
            {
                const KeyStep& k = keys[i - 1];
                const int raised = RaisedCell(hPopup, grid);
                const bool other = FocusOnOther(hPopup);
                if (raised != k.hover || other != k.focusOther)
                    results.push_back("key " + std::to_string(i - 1) + ": hover " + std::to_string(raised)
                                      + (other ? " focus Other" : " focus Dummy") + ", expected "
                                      + std::to_string(k.hover) + (k.focusOther ? " focus Other" : " focus Dummy"));
            }
            PostKey(i < keys.size() ? keys[i].vk : VK_RETURN);
            return true;
        });
    }
    RunPopup(steps);
    EXPECT_EQ(std::vector<std::string>(), results);
    // Return on cell 6 picks white.
    EXPECT_EQ(Hex(0xFFFFFF), Hex(m_well.GetColor()));
    EXPECT_FALSE(m_well.GetColorUndefined());
    EXPECT_EQ(1, m_recorder->count());
}

TEST_F(ColorWellTest, WithoutOtherButtonLeftWrapsAndReturnOnNothingCloses)
{
    m_well.SetHasOtherButton(FALSE);
    m_well.SetColor(0x0000FF);   // red, cell 1
    const Grid grid;
    int afterLeftLeft = -2, afterRight = -2;
    RunPopup({ [&](HWND) {
                  PostKey(VK_LEFT);   // 1 -> 0
                  PostKey(VK_LEFT);   // 0 -> 19 without the Other button
                  return true;
              },
              [&](HWND hPopup) {
                  afterLeftLeft = RaisedCell(hPopup, grid);
                  PostKey(VK_RIGHT);   // 19 -> -1 even without the Other button
                  return true;
              },
              [&](HWND hPopup) {
                  afterRight = RaisedCell(hPopup, grid);
                  PostKey(VK_RETURN);   // nothing hovered: closes with OK
                  return true;
              } });
    EXPECT_EQ(19, afterLeftLeft);
    EXPECT_EQ(-1, afterRight);
    EXPECT_EQ(Hex(0x0000FF), Hex(m_well.GetColor()));
    EXPECT_EQ(1, m_recorder->count());
}

// ---------------------------------------------------------------------------
// Other...

// The standard dialog is answered by the script as well: it is the active dialog while
// it runs (its caption is set by OnInitDialog, which Wine calls after activating it).
std::wstring Caption(HWND hwnd)
{
    wchar_t text[128] = {};
    ::GetWindowTextW(hwnd, text, 128);
    return text;
}

bool IsColorDialog(HWND hwnd)
{
    return ::GetDlgItem(hwnd, 706) != NULL;
}

TEST_F(ColorWellTest, OtherWithTheStandardDialogAnsweredOk)
{
    m_well.SetColorName(_T("Farbe"));
    std::wstring caption;
    RunPopup({ [&](HWND hPopup) {
                  ::PostMessage(hPopup, WM_COMMAND, MAKEWPARAM(IDC_COLOR_OTHER, BN_CLICKED),
                                reinterpret_cast<LPARAM>(::GetDlgItem(hPopup, IDC_COLOR_OTHER)));
                  return true;
              },
              [&](HWND hDialog) {
                  if (!IsColorDialog(hDialog))
                      return false;
                  caption = Caption(hDialog);
                  ::SetDlgItemInt(hDialog, 706, 10, FALSE);
                  ::SetDlgItemInt(hDialog, 707, 20, FALSE);
                  ::SetDlgItemInt(hDialog, 708, 30, FALSE);
                  ::PostMessage(hDialog, WM_COMMAND, IDOK, 0);
                  return true;
              } });
    EXPECT_EQ(L"Farbe", caption);
    EXPECT_EQ(Hex(RGB(10, 20, 30)), Hex(m_well.GetColor()));
    ASSERT_EQ(1, m_recorder->count());
    EXPECT_EQ(Hex(RGB(10, 20, 30)), Hex(m_recorder->records()[0].clrColor));
}

TEST_F(ColorWellTest, OtherCancelledReturnsToThePopupWithCapture)
{
    m_well.SetColor(0x00FF00);
    HWND hPopupSeen = NULL;
    HWND hCaptureAfter = NULL;
    HWND ownerOfDialog = NULL;
    BOOL popupEnabledMeanwhile = TRUE;
    std::wstring caption;
    RunPopup({ [&](HWND hPopup) {
                  hPopupSeen = hPopup;
                  PostKey(VK_HOME);
                  PostKey(VK_LEFT);   // cell 0 -> the Other button, which takes the focus
                  return true;
              },
              [&](HWND) {
                  // Return with the focus on Other... presses it.
                  PostKey(VK_RETURN);
                  return true;
              },
              [&](HWND hDialog) {
                  if (!IsColorDialog(hDialog))
                      return false;
                  caption = Caption(hDialog);
                  popupEnabledMeanwhile = ::IsWindowEnabled(hPopupSeen);
                  ownerOfDialog = ::GetWindow(hDialog, GW_OWNER);
                  ::PostMessage(hDialog, WM_COMMAND, IDCANCEL, 0);
                  return true;
              },
              [&](HWND hDialog) {
                  // Back in the popup after the standard dialog was cancelled.
                  if (hDialog != hPopupSeen)
                      return false;
                  hCaptureAfter = ::GetCapture();
                  PostKey(VK_ESCAPE);
                  return true;
              } });
    EXPECT_EQ(L"Color", caption);
    // The standard dialog is modal to the popup.
    EXPECT_EQ(hPopupSeen, ownerOfDialog);
    EXPECT_FALSE(popupEnabledMeanwhile);
    EXPECT_EQ(hPopupSeen, hCaptureAfter);
    EXPECT_EQ(0, m_recorder->count());
    EXPECT_EQ(Hex(0x00FF00), Hex(m_well.GetColor()));
}

// ---------------------------------------------------------------------------
// KVXColorDialog

TEST(KVXColorDialogTest, CaptionSetOnceThenColorAgain)
{
    buttons_test::EnsureLibraryLoaded();
    std::vector<std::wstring> captions;
    const ModalScript::Step answer = [&](HWND hDialog) {
        captions.push_back(Caption(hDialog));
        ::PostMessage(hDialog, WM_COMMAND, IDCANCEL, 0);
        return true;
    };
    KVXColorDialog dlg(RGB(1, 2, 3));
    dlg.SetWindowName(_T("Pick one"));
    {
        ModalScript script({ answer });
        EXPECT_EQ(IDCANCEL, dlg.DoModal());
    }
    {
        ModalScript script({ answer });
        EXPECT_EQ(IDCANCEL, dlg.DoModal());
    }
    EXPECT_EQ((std::vector<std::wstring>{ L"Pick one", L"Color" }), captions);
}

TEST(KVXColorDialogTest, RunTimeClass)
{
    KVXColorDialog dlg;
    EXPECT_TRUE(dlg.IsKindOf(RUNTIME_CLASS(KVXColorDialog)));
    EXPECT_TRUE(dlg.IsKindOf(RUNTIME_CLASS(CColorDialog)));
    EXPECT_STREQ("KVXColorDialog", dlg.GetRuntimeClass()->m_lpszClassName);
    EXPECT_EQ(0xFFFFu, RUNTIME_CLASS(KVXColorDialog)->m_wSchema);
    EXPECT_EQ(nullptr, RUNTIME_CLASS(KVXColorDialog)->m_pfnCreateObject);
    buttons_test::EnsureLibraryLoaded();
    EXPECT_EQ(RUNTIME_CLASS(KVXColorDialog), CRuntimeClass::FromName("KVXColorDialog"));
}

} // namespace
