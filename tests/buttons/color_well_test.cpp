// Colour well, its popup and the colour dialog. Cell places, hit tests, popup size and
// placement and the keyboard moves are tested as plain functions in geometry_test.cpp;
// here each is wired once:
//  - the well's pixels per state: frame, separator, arrow, swatch, hatch when undefined, no
//    swatch and an embossed arrow when disabled, focus dots, pressed look;
//  - the popup's size and place below the well, kept on screen at the bottom right;
//  - current and hover cells at opening; picking by mouse (row 1, column 2 gives white and
//    one WM_USER+42 with its record), a release on a gap or an empty cell, Escape and clicks
//    outside (no message); the keyboard, the Other... button among the moves, Return;
//  - Other... with the standard dialog answered OK and cancelled (capture kept);
//  - setter ranges, defaults, KVXColorDialog's caption and run-time class.
#include "ButtonsTestSupport.h"
#include "KVXColorDialog.h"
#include "resource.h"

namespace {

using namespace buttons_test;
using orvane_test::ClientCapture;
using orvane_test::ModalScript;
using orvane_test::PointParam;

// The default palette layout (5 rows, 4 columns of 20 x 20), with gaps as a test sets them.
struct Grid
{
    int columns = 4, size = 20, gap = 0;
    RECT Button(int i) const
    {
        const int x = (i % columns) * (size + gap), y = (i / columns) * (size + gap);
        return RECT{ x, y, x + size, y + size };
    }
    POINT Centre(int i) const { return POINT{ Button(i).left + size / 2, Button(i).top + size / 2 }; }
};

// The cell drawn raised (the hover cell that is not current), or sunken (the current one),
// read from the popup's pixels: -1 none, -2 more than one.
int Cell(HWND hPopup, bool raised)
{
    ClientCapture cap(hPopup);
    const COLORREF topLeft = raised ? Hi() : Sh(), bottomRight = raised ? Sh() : Hi();
    int found = -1;
    for (int i = 0; i < 20; ++i)
    {
        const RECT rc = Grid().Button(i);
        if (cap.At(rc.left, rc.top + 1) == topLeft && cap.At(rc.right - 1, rc.bottom - 2) == bottomRight)
            found = found == -1 ? i : -2;
    }
    return found;
}

// The hover as the keyboard test sees it: the raised cell, or -1 when the Other button has
// the focus and no cell is raised; any mix of the two reads as -3.
int Hover(HWND hPopup)
{
    const bool other = ::GetFocus() == ::GetDlgItem(hPopup, IDC_COLOR_OTHER);
    const int raised = Cell(hPopup, true);
    return other == (raised == -1) ? raised : -3;
}

void PostKeyToFocus(UINT vk)
{
    ::PostMessage(::GetFocus(), WM_KEYDOWN, vk, 1);
    ::PostMessage(::GetFocus(), WM_KEYUP, vk, 0xC0000001);
}

// A popup step that sends one mouse message at a client point of the popup.
ModalScript::Step Mouse(UINT message, WPARAM keys, POINT pt)
{
    return [=](HWND hPopup) {
        ::SendMessage(hPopup, message, keys, PointParam(pt.x, pt.y));
        return true;
    };
}

std::wstring Caption(HWND hwnd) { return orvane_test::WindowText(hwnd); }
bool IsColorDialog(HWND hwnd) { return ::GetDlgItem(hwnd, 706) != NULL; }

class ColorWellTest : public WellFixture
{
protected:
    // Runs the popup with the given steps; every script must close the popup itself.
    void RunPopup(std::vector<ModalScript::Step> steps)
    {
        ModalScript script(std::move(steps));
        m_well.DoColorWellDlg();
        EXPECT_TRUE(script.finished()) << "steps done: " << script.stepsDone();
        EXPECT_EQ(nullptr, ::GetCapture());
    }
};

// Pixels of the 80 x 24 well (arrow middle at y 12) per state: s swatch colour, else the
// letters of Colour().
struct PixelCase
{
    const char* state;
    int x, y;
    char colour;
};

const PixelCase kPixels[] = {
    { "defined", 30, 12, 's' }, { "defined", 5, 4, 'k' },   { "defined", 64, 19, 'k' }, { "defined", 65, 12, 'F' },
    { "defined", 79, 23, 'k' }, { "defined", 78, 22, 'S' }, { "defined", 1, 1, 'H' },   { "defined", 70, 10, 'H' },
    { "defined", 69, 10, 'S' }, { "defined", 76, 11, 'k' }, { "defined", 72, 11, 'k' }, { "defined", 73, 12, 'k' },
    { "defined", 74, 13, 'k' }, { "defined", 71, 11, 'F' },
    { "disabled", 76, 11, 'w' }, { "disabled", 75, 12, 'w' }, { "disabled", 74, 13, 'w' }, { "disabled", 73, 11, 'S' },
    { "disabled", 73, 12, 'S' },
    { "focused", 3, 3, 'k' },   { "focused", 4, 3, 'F' },   { "focused", 5, 3, 'k' },   { "focused", 3, 5, 'k' },
    { "focused", 77, 19, 'k' },
    { "pressed", 0, 10, 'S' },  { "pressed", 1, 10, 'k' },  { "pressed", 79, 10, 'H' }, { "pressed", 6, 5, 'k' },
    { "pressed", 7, 6, 's' },
};

TEST_F(ColorWellTest, DrawingPerState)
{
    const COLORREF swatch = RGB(200, 10, 10);
    EXPECT_EQ(Hex(0), Hex(m_well.GetColor())) << "a new well is black";
    EXPECT_EQ(58 * 14, ClientCapture(m_well.m_hWnd).Count(RECT{ 6, 5, 64, 19 }, 0));
    m_well.SetColor(swatch);
    for (const std::string state : { "defined", "focused", "pressed", "disabled" })
    {
        if (state == "focused")
            m_well.SetFocus();
        else if (state == "pressed")
            m_well.SetState(TRUE);   // ODS_SELECTED
        else if (state == "disabled")
        {
            m_well.SetState(FALSE);
            m_parent->SetFocus();
            m_well.EnableWindow(FALSE);
        }
        ClientCapture cap(m_well.m_hWnd);
        for (const PixelCase& p : kPixels)
        {
            if (p.state != state)
                continue;
            const COLORREF expected = p.colour == 's' ? swatch : Colour(p.colour);
            EXPECT_EQ(Hex(expected), Hex(cap.At(p.x, p.y))) << state << " at " << p.x << "," << p.y;
        }
        if (state == "disabled")
        {
            EXPECT_EQ(60 * 16, cap.Count(RECT{ 5, 4, 65, 20 }, Face())) << "no swatch when disabled";
        }
    }
}

TEST_F(ColorWellTest, UndefinedColourIsHatchedUntilSetColor)
{
    m_well.SetColor(RGB(200, 10, 10));
    m_well.SetColorUndefined(TRUE);
    EXPECT_TRUE(m_well.GetColorUndefined());
    ClientCapture cap(m_well.m_hWnd);
    const RECT inside = { 6, 5, 64, 19 };
    const int black = cap.Count(inside, 0);
    EXPECT_GT(black, 58 * 14 / 8);
    EXPECT_LT(black, 58 * 14 / 2);
    EXPECT_EQ(0, cap.Count(inside, RGB(200, 10, 10)));
    m_well.SetColor(RGB(10, 200, 10));
    EXPECT_FALSE(m_well.GetColorUndefined());
    EXPECT_EQ(Hex(RGB(10, 200, 10)), Hex(ClientCapture(m_well.m_hWnd).At(30, 12)));
}

TEST(ColorWellSettings, RangesAndDefaults)
{
    orvane_test::LoadLibraryOnce();
    KVXColorWell well;
    const struct { void (KVXColorWell::*set)(long); long (KVXColorWell::*get)(); long initial, bad1, bad2, good; } cases[] = {
        { &KVXColorWell::SetRowCount, &KVXColorWell::GetRowCount, 5, 0, 21, 20 },
        { &KVXColorWell::SetColumnCount, &KVXColorWell::GetColumnCount, 4, 0, 21, 1 },
        { &KVXColorWell::SetButtonWidth, &KVXColorWell::GetButtonWidth, 20, 9, 101, 100 },
        { &KVXColorWell::SetButtonHeight, &KVXColorWell::GetButtonHeight, 20, 9, 101, 10 },
        { &KVXColorWell::SetButtonGapHorizontal, &KVXColorWell::GetButtonGapHorizontal, 0, -1, 101, 100 },
        { &KVXColorWell::SetButtonGapVertical, &KVXColorWell::GetButtonGapVertical, 0, -1, 101, 100 },
        { &KVXColorWell::SetBorderWidth, &KVXColorWell::GetBorderWidth, 0, -1, 101, 100 },
    };
    for (const auto& c : cases)
    {
        EXPECT_EQ(c.initial, (well.*c.get)());
        (well.*c.set)(c.bad1);
        (well.*c.set)(c.bad2);
        EXPECT_EQ(c.initial, (well.*c.get)()) << "after " << c.bad1 << " and " << c.bad2;
        (well.*c.set)(c.good);
        EXPECT_EQ(c.good, (well.*c.get)());
    }
    EXPECT_EQ(CString(_T("Color")), well.GetColorName());
    EXPECT_TRUE(well.GetHasOtherButton());
    ASSERT_EQ(20, well.GetColorArray()->GetSize());
    EXPECT_EQ(Hex(0xC08080), Hex(well.GetColorArray()->GetAt(19)));
}

TEST_F(ColorWellTest, PopupOpensBelowTheWellWithItsSizeOrStaysOnScreen)
{
    CRect rcWell, rcPopup, rcOther, rcDummy;
    m_well.GetWindowRect(&rcWell);
    const int f = ::GetSystemMetrics(SM_CXDLGFRAME);
    bool captured = false;
    int sunken = -2, raised = -2;
    RunPopup({ [&](HWND hPopup) {
        ::GetWindowRect(hPopup, &rcPopup);
        ::GetWindowRect(::GetDlgItem(hPopup, IDC_COLOR_OTHER), &rcOther);
        ::MapWindowPoints(NULL, hPopup, reinterpret_cast<POINT*>(&rcOther), 2);
        ::GetWindowRect(::GetDlgItem(hPopup, IDC_COLOR_DUMMY), &rcDummy);
        captured = ::GetCapture() == hPopup;
        sunken = Cell(hPopup, false);   // the black well: cell 0 current and hovered, drawn sunken
        raised = Cell(hPopup, true);
        ::SendMessage(hPopup, WM_LBUTTONDOWN, 0, PointParam(-20, -20));
        return true;
    } });
    EXPECT_TRUE(captured) << "the popup holds the capture";
    EXPECT_EQ(rcWell.left, rcPopup.left);
    EXPECT_EQ(rcWell.bottom, rcPopup.top);
    EXPECT_EQ(4 * 20 + 2 * f, rcPopup.Width());
    EXPECT_EQ(5 * 20 + f + 2 + rcOther.Height() + 3, rcPopup.Height());
    EXPECT_EQ(f, rcOther.left);
    EXPECT_EQ(rcPopup.Width() - 2 * f - 3, rcOther.right);
    EXPECT_EQ(rcPopup.Height() - f - 3, rcOther.bottom);
    EXPECT_EQ(0, rcDummy.Width());
    EXPECT_EQ(0, sunken);
    EXPECT_EQ(-1, raised);

    const int cx = ::GetSystemMetrics(SM_CXSCREEN), cy = ::GetSystemMetrics(SM_CYSCREEN);
    m_parent->MoveClientTo(cx - 60, cy - 30);   // the well at (cx-40, cy-10): the popup would leave
    RunPopup({ [&](HWND hPopup) {
        ::GetWindowRect(hPopup, &rcPopup);
        PostKeyToFocus(VK_ESCAPE);
        return true;
    } });
    EXPECT_EQ(cy, rcPopup.bottom);
    EXPECT_EQ(cx, rcPopup.right);
    EXPECT_EQ(0, m_spy->count());
}

TEST_F(ColorWellTest, HoverAndPickRow1Column2GivesWhiteOnceAlsoWhenOpenedByAClick)
{
    int raised = -2, sunken = -2;
    RunPopup({ [&](HWND hPopup) {
        const POINT pt = Grid().Centre(6);
        ::SendMessage(hPopup, WM_MOUSEMOVE, 0, PointParam(pt.x, pt.y));
        raised = Cell(hPopup, true);
        sunken = Cell(hPopup, false);
        ::SendMessage(hPopup, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(pt.x, pt.y));
        ::SendMessage(hPopup, WM_LBUTTONUP, 0, PointParam(pt.x, pt.y));
        return true;
    } });
    EXPECT_EQ(6, raised);
    EXPECT_EQ(0, sunken);
    EXPECT_EQ(Hex(0xFFFFFF), Hex(m_well.GetColor()));
    ASSERT_EQ(1, m_spy->count());
    EXPECT_EQ(Hex(0xFFFFFF), Hex(Notified(0)));
    EXPECT_EQ(0x42Au, reinterpret_cast<const NMHDR*>(m_spy->payloads()[0].data())->code);
    EXPECT_EQ(Hex(0xFFFFFF), Hex(ClientCapture(m_well.m_hWnd).At(30, 12)));

    ModalScript script({ Mouse(WM_LBUTTONUP, 0, Grid().Centre(2)) });
    ::SendMessage(m_well.m_hWnd, WM_LBUTTONDOWN, MK_LBUTTON, PointParam(10, 10));
    ::SendMessage(m_well.m_hWnd, WM_LBUTTONUP, 0, PointParam(10, 10));
    EXPECT_TRUE(script.finished());
    EXPECT_EQ(Hex(0x00FF00), Hex(m_well.GetColor()));
    EXPECT_EQ(2, m_spy->count());
}

TEST_F(ColorWellTest, ReleaseOnAGapKeepsTheColourAndStillNotifiesOnAnEmptyCellPicksNothing)
{
    m_well.SetButtonGapHorizontal(6);
    m_well.SetButtonGapVertical(6);
    m_well.SetColor(0x808000);   // teal, cell 13
    Grid grid;
    grid.gap = 6;
    const RECT rc = grid.Button(5);
    RunPopup({ Mouse(WM_LBUTTONUP, 0, POINT{ rc.right + 2, rc.top + 5 }) });
    EXPECT_EQ(Hex(0x808000), Hex(m_well.GetColor()));
    ASSERT_EQ(1, m_spy->count());
    EXPECT_EQ(Hex(0x808000), Hex(Notified(0)));

    m_well.SetButtonGapHorizontal(0);
    m_well.SetButtonGapVertical(0);
    m_well.GetColorArray()->SetSize(10);
    m_well.GetColorArray()->SetAt(9, RGB(1, 2, 3));
    for (int cell : { 15, 9 })   // the shortened palette persists between openings
        RunPopup({ Mouse(WM_LBUTTONUP, 0, Grid().Centre(cell)) });
    EXPECT_EQ(Hex(RGB(1, 2, 3)), Hex(m_well.GetColor()));
    EXPECT_EQ(Hex(0x808000), Hex(Notified(1))) << "the empty cell picked nothing";
}

TEST_F(ColorWellTest, EscapeAndClicksOutsideCancelSilentlyAnUndefinedColourHasNoCurrentCell)
{
    m_well.SetColorUndefined(TRUE);
    int raised = -2, sunken = -2;
    RunPopup({ [&](HWND hPopup) {
        raised = Cell(hPopup, true);
        sunken = Cell(hPopup, false);
        PostKeyToFocus(VK_ESCAPE);
        return true;
    } });
    EXPECT_EQ(-1, raised);
    EXPECT_EQ(-1, sunken);
    RunPopup({ Mouse(WM_LBUTTONDOWN, MK_LBUTTON, POINT{ 200, 5 }) });
    RunPopup({ Mouse(WM_LBUTTONUP, 0, POINT{ -5, -5 }) });
    EXPECT_EQ(0, m_spy->count());
    EXPECT_TRUE(m_well.GetColorUndefined());
}

TEST_F(ColorWellTest, KeyboardMovesIncludeTheOtherButtonAndReturnPicks)
{
    m_well.SetColorUndefined(TRUE);   // no current cell: every hover shows raised
    // Key, then the hover expected after it (-1: the Other button, which has the focus).
    const std::vector<std::pair<UINT, int>> keys = {
        { VK_RIGHT, 0 }, { VK_LEFT, -1 }, { VK_LEFT, 19 }, { VK_DOWN, -1 }, { VK_DOWN, 0 }, { VK_RIGHT, 1 },
        { VK_DOWN, 5 }, { VK_RIGHT, 6 },
    };
    std::vector<std::string> wrong;
    std::vector<ModalScript::Step> steps;
    for (size_t i = 0; i <= keys.size(); ++i)
        steps.push_back([&, i](HWND hPopup) {
            if (i > 0)
            {
                const int hover = Hover(hPopup);
                if (hover != keys[i - 1].second)
                    wrong.push_back("key " + std::to_string(i - 1) + ": " + std::to_string(hover));
            }
            PostKeyToFocus(i < keys.size() ? keys[i].first : VK_RETURN);
            return true;
        });
    RunPopup(steps);
    EXPECT_EQ(std::vector<std::string>(), wrong);
    EXPECT_EQ(Hex(0xFFFFFF), Hex(m_well.GetColor())) << "Return on cell 6 picks white";
    EXPECT_EQ(1, m_spy->count());
}

TEST_F(ColorWellTest, WithoutOtherButtonItIsHiddenTheLeftKeyWrapsAndReturnOnNothingCloses)
{
    m_well.SetHasOtherButton(FALSE);
    m_well.SetColor(0x0000FF);   // red, cell 1
    int afterLeftLeft = -2, afterRight = -2;
    BOOL otherVisible = TRUE;
    CRect rcPopup;
    RunPopup({ [&](HWND hPopup) {
                  otherVisible = ::IsWindowVisible(::GetDlgItem(hPopup, IDC_COLOR_OTHER));
                  ::GetWindowRect(hPopup, &rcPopup);
                  PostKeyToFocus(VK_LEFT);   // 1 -> 0
                  PostKeyToFocus(VK_LEFT);   // 0 -> 19 without the Other button
                  return true;
              },
              [&](HWND hPopup) {
                  afterLeftLeft = Cell(hPopup, true);
                  PostKeyToFocus(VK_RIGHT);   // 19 -> nothing
                  return true;
              },
              [&](HWND hPopup) {
                  afterRight = Cell(hPopup, true);
                  PostKeyToFocus(VK_RETURN);   // nothing hovered: closes with OK
                  return true;
              } });
    EXPECT_FALSE(otherVisible);
    EXPECT_EQ(5 * 20 + ::GetSystemMetrics(SM_CXDLGFRAME) + 2, rcPopup.Height()) << "no room for Other...";
    EXPECT_EQ(19, afterLeftLeft);
    EXPECT_EQ(-1, afterRight);
    EXPECT_EQ(Hex(0x0000FF), Hex(m_well.GetColor()));
    EXPECT_EQ(1, m_spy->count());
}

// The standard dialog is answered by the script as well: it is the active dialog while it
// runs (its caption is set by OnInitDialog, which Wine calls after activating it).
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
    ASSERT_EQ(1, m_spy->count());
    EXPECT_EQ(Hex(RGB(10, 20, 30)), Hex(Notified(0)));
}

TEST_F(ColorWellTest, OtherCancelledReturnsToThePopupWithCapture)
{
    m_well.SetColor(0x00FF00);
    HWND hPopupSeen = NULL, hCaptureAfter = NULL, ownerOfDialog = NULL;
    BOOL popupEnabledMeanwhile = TRUE;
    RunPopup({ [&](HWND hPopup) {
                  hPopupSeen = hPopup;
                  PostKeyToFocus(VK_HOME);
                  PostKeyToFocus(VK_LEFT);   // cell 0 -> the Other button, which takes the focus
                  return true;
              },
              [&](HWND) {
                  PostKeyToFocus(VK_RETURN);   // Return with the focus on Other... presses it
                  return true;
              },
              [&](HWND hDialog) {
                  if (!IsColorDialog(hDialog))
                      return false;
                  popupEnabledMeanwhile = ::IsWindowEnabled(hPopupSeen);
                  ownerOfDialog = ::GetWindow(hDialog, GW_OWNER);
                  ::PostMessage(hDialog, WM_COMMAND, IDCANCEL, 0);
                  return true;
              },
              [&](HWND hDialog) {
                  if (hDialog != hPopupSeen)
                      return false;   // back in the popup after the standard dialog was cancelled
                  hCaptureAfter = ::GetCapture();
                  PostKeyToFocus(VK_ESCAPE);
                  return true;
              } });
    EXPECT_EQ(hPopupSeen, ownerOfDialog) << "the standard dialog is modal to the popup";
    EXPECT_FALSE(popupEnabledMeanwhile);
    EXPECT_EQ(hPopupSeen, hCaptureAfter);
    EXPECT_EQ(0, m_spy->count());
    EXPECT_EQ(Hex(0x00FF00), Hex(m_well.GetColor()));
}

TEST(KVXColorDialogTest, CaptionSetOnceThenColorAgainAndTheRunTimeClass)
{
    orvane_test::LoadLibraryOnce();
    std::vector<std::wstring> captions;
    const ModalScript::Step answer = [&](HWND hDialog) {
        captions.push_back(Caption(hDialog));
        ::PostMessage(hDialog, WM_COMMAND, IDCANCEL, 0);
        return true;
    };
    KVXColorDialog dlg(RGB(1, 2, 3));
    dlg.SetWindowName(_T("Pick one"));
    for (int i = 0; i < 2; ++i)
    {
        ModalScript script({ answer });
        EXPECT_EQ(IDCANCEL, dlg.DoModal());
    }
    EXPECT_EQ((std::vector<std::wstring>{ L"Pick one", L"Color" }), captions);
    EXPECT_TRUE(dlg.IsKindOf(RUNTIME_CLASS(CColorDialog)));
    EXPECT_EQ(0xFFFFu, RUNTIME_CLASS(KVXColorDialog)->m_wSchema);
    EXPECT_EQ(nullptr, RUNTIME_CLASS(KVXColorDialog)->m_pfnCreateObject);
    EXPECT_EQ(RUNTIME_CLASS(KVXColorDialog), CRuntimeClass::FromName("KVXColorDialog"));
}

} // namespace
