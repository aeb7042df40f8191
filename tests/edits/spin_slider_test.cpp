// The spin's slider band, with a real integer edit as buddy:
//  - a press in the band takes the middle value; drag distances 10, 11, 20, 40 and -15
//    become the offsets of the curve; a drag sequence measures from the press point
//    and repeats the distance for a move without vertical change;
//  - the release ends the drag without resetting the step factor;
//  - hovering over the band captures the mouse and shows the slider cursor (32 x 32,
//    monochrome, hot spot 15,15); leaving the band releases the capture.
#include "spin_test_fixture.h"

namespace spin_test {
namespace {

using SpinGeometry::SpinArea;

using SpinSlider = SpinFixture;

struct DistanceCase
{
    const char* name;
    int distance;   // pixels upwards from the press point
    const char* call;
};

void PrintTo(const DistanceCase& c, std::ostream* os) { *os << c.name; }

const DistanceCase kDistanceCases[] = {
    { "Up10", 10, "inc(10)=110" },
    { "Up11", 11, "inc(11)=111" },
    { "Up20", 20, "inc(25)=125" },
    { "Up40", 40, "inc(85)=185" },
    { "Down15", -15, "dec(-16)=84" },
};

class SpinSliderDistance : public SpinFixture, public ::testing::WithParamInterface<DistanceCase> {};

TEST_P(SpinSliderDistance, OneMove)
{
    const DistanceCase& c = GetParam();
    const POINT press = In(SpinArea::Band);
    Send(hSpin, WM_LBUTTONDOWN, MK_LBUTTON, press.x, press.y);
    EXPECT_TRUE(Captured());
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, press.x, press.y - c.distance);
    Send(hSpin, WM_LBUTTONUP, 0, press.x, press.y - c.distance);
    EXPECT_FALSE(Captured());
    EXPECT_EQ(std::vector<std::string>({ "mid(1)", c.call }), edit->calls);
}

INSTANTIATE_TEST_SUITE_P(Cases, SpinSliderDistance, ::testing::ValuesIn(kDistanceCases),
                         [](const ::testing::TestParamInfo<DistanceCase>& i) { return std::string(i.param.name); });

TEST_F(SpinSlider, DragMeasuresFromThePressPointAndKeepsTheStepFactor)
{
    edit->SetSpinStep(7);
    const POINT press = In(SpinArea::Band);
    Send(hSpin, WM_LBUTTONDOWN, MK_LBUTTON, press.x, press.y);
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, press.x, press.y - 15);
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, press.x, press.y + 5);
    // Sideways, far outside the window: the same distance again, capture kept.
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, press.x + 300, press.y + 5);
    EXPECT_TRUE(Captured());
    // No timer runs during a drag.
    Ticks(10);
    Send(hSpin, WM_LBUTTONUP, 0, press.x + 300, press.y + 5);
    EXPECT_FALSE(Captured());
    EXPECT_EQ(std::vector<std::string>({ "mid(1)", "inc(16)=116", "dec(-5)=95", "dec(-5)=95" }), edit->calls);
    // A slider release is not the end of an arrow press.
    EXPECT_EQ(7, edit->SpinStep());
    // Nothing pressed any more: moves and a second release do nothing.
    Send(hSpin, WM_MOUSEMOVE, 0, press.x, In(SpinArea::Up).y);
    Send(hSpin, WM_LBUTTONUP, 0, 0, 0);
    EXPECT_EQ(4u, edit->calls.size());
}

TEST_F(SpinSlider, DragAfterArrowStepsContinuesFromTheSteppedValue)
{
    Press(SpinArea::Up);
    Release(SpinArea::Up);
    const POINT press = In(SpinArea::Band);
    Send(hSpin, WM_LBUTTONDOWN, MK_LBUTTON, press.x, press.y);
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, press.x, press.y - 2);
    Send(hSpin, WM_LBUTTONUP, 0, press.x, press.y - 2);
    // The arrow's sequence took the middle with step detection, the band without.
    EXPECT_EQ(std::vector<std::string>({ "mid(1)", "inc(1)=101", "mid(0)", "inc(2)=103" }), edit->calls);
}

TEST_F(SpinSlider, HoveringTheBandCapturesAndShowsTheSliderCursor)
{
    const POINT band = In(SpinArea::Band);
    Send(hSpin, WM_MOUSEMOVE, 0, band.x, band.y);
    EXPECT_TRUE(Captured());

    HCURSOR hCursor = ::GetCursor();
    ASSERT_NE(static_cast<HCURSOR>(NULL), hCursor);
    ICONINFO info = {};
    ASSERT_TRUE(::GetIconInfo(hCursor, &info));
    EXPECT_FALSE(info.fIcon);
    EXPECT_EQ(15u, info.xHotspot);
    EXPECT_EQ(15u, info.yHotspot);
    // Monochrome: no colour bitmap, the mask holds AND and XOR halves.
    EXPECT_EQ(static_cast<HBITMAP>(NULL), info.hbmColor);
    BITMAP bm = {};
    ASSERT_NE(0, ::GetObjectW(info.hbmMask, sizeof bm, &bm));
    EXPECT_EQ(32, bm.bmWidth);
    EXPECT_EQ(64, bm.bmHeight);
    ::DeleteObject(info.hbmMask);
    if (info.hbmColor != NULL)
        ::DeleteObject(info.hbmColor);

    // Moving within the band keeps the capture; leaving it releases.
    Send(hSpin, WM_MOUSEMOVE, 0, 0, band.y + 1);
    EXPECT_TRUE(Captured());
    const POINT down = In(SpinArea::Down);
    Send(hSpin, WM_MOUSEMOVE, 0, down.x, down.y);
    EXPECT_FALSE(Captured());
    // Hovering changes no value.
    EXPECT_EQ(std::vector<std::string>(), edit->calls);

    // Coming back captures again.
    Send(hSpin, WM_MOUSEMOVE, 0, band.x, band.y);
    EXPECT_TRUE(Captured());
    Send(hSpin, WM_MOUSEMOVE, 0, band.x, -10);
    EXPECT_FALSE(Captured());
}

TEST_F(SpinSlider, PressWhileHoveringStartsTheDrag)
{
    const POINT band = In(SpinArea::Band);
    Send(hSpin, WM_MOUSEMOVE, 0, band.x, band.y);
    Send(hSpin, WM_LBUTTONDOWN, MK_LBUTTON, band.x, band.y);
    // Leaving the band while sliding keeps the capture.
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, band.x, band.y + 40);
    EXPECT_TRUE(Captured());
    Send(hSpin, WM_LBUTTONUP, 0, band.x, band.y + 40);
    EXPECT_FALSE(Captured());
    EXPECT_EQ(std::vector<std::string>({ "mid(1)", "dec(-85)=15" }), edit->calls);
}

TEST_F(SpinSlider, CaptureTakenDuringADragEndsIt)
{
    const POINT band = In(SpinArea::Band);
    Send(hSpin, WM_LBUTTONDOWN, MK_LBUTTON, band.x, band.y);
    ::SetCapture(host->hwnd());
    ::ReleaseCapture();
    Send(hSpin, WM_MOUSEMOVE, MK_LBUTTON, band.x, band.y - 10);
    Send(hSpin, WM_LBUTTONUP, 0, band.x, band.y - 10);
    // The move after losing the capture is a hover over the up area: no slider move.
    EXPECT_EQ(std::vector<std::string>({ "mid(1)" }), edit->calls);
}

} // namespace
} // namespace spin_test
