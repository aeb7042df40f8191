// Shared by the windowed column tests: a column-customising list on screen with six
// known columns (four shown), a fill callback writing "<title><row data>" into each
// cell, readings of the layout and of the chooser, and a driver for real drags.
#pragma once

#include <afxwin.h>
#include <afxole.h>

#include <gtest/gtest.h>

#include "Input.h"
#include "KVXColumnsPropPage.h"
#include "KVXDragColumnListCtrl.h"
#include "KVXListCtrlPropFrame.h"

#include <functional>
#include <memory>
#include <string>

namespace columns_test {

// The list's protected state, for reading.
class CTestList : public KVXDragColumnListCtrl
{
public:
    using KVXDragColumnListCtrl::m_HeaderCtrl;
    using KVXDragColumnListCtrl::m_pPropFrame;
    using KVXListCtrlEx::m_nSortColumn;
    // The column type codes the list holds, "1,2,3,0".
    std::string Types() const;
    KVXColumnsPropPage* Page() const;
};

// Writes "<title><item data>" and notes each call for row 0 as "<title>," in the trace.
class CFiller : public CWnd
{
public:
    void Fill(LVITEMW& item, KVXColumnInfo* pColumnInfo);
    std::string m_trace;
};

std::string Narrow(const CString& text);

// COLOR_3DHILIGHT and COLOR_3DDKSHADOW made distinct from the white and grey faces
// they would match, while a test reads edges.
class EdgeColorsGuard
{
public:
    EdgeColorsGuard();
    ~EdgeColorsGuard();

private:
    COLORREF m_saved[2];
};

// Drives a real DoDragDrop as a hand would: the thread's key state has the left
// button down; a timer that ticks inside the drag's loop moves the cursor to the
// target at the first tick and lets the button go at releaseTick (0: never). After
// 60 ticks it lets go in any case, so every drag ends. onTick runs at every tick.
class DragDriver
{
public:
    DragDriver(POINT screenTarget, int releaseTick = 2, std::function<void(int)> onTick = nullptr);
    ~DragDriver();
    int ticks() const { return m_nTicks; }

private:
    static void CALLBACK Tick(HWND, UINT, UINT_PTR, DWORD);
    orvane_test::KeyStateGuard m_button{ VK_LBUTTON };
    POINT m_target;
    int m_nRelease;
    std::function<void(int)> m_onTick;
    int m_nTicks = 0;
    UINT_PTR m_nTimer = 0;
};

class ColumnsFixture : public testing::Test
{
protected:
    void SetUp() override;
    void TearDown() override;
    // On the heap, or built in pStorage (then not deleted by TearDown).
    void CreateList(void* pStorage = nullptr);

    // The header's titles in order, "Alpha|Beta|Gamma|Delta". A title is followed by
    // '*' when its cells do not read "<title><item data>" and by '?' when no record,
    // or more than one, has its position as index.
    std::string Layout();
    // The chooser's strips in their order with their records' widths, "Epsilon:60|Zeta:110".
    std::string Strips();
    // Screen point of a client point of a window.
    static POINT ScreenPoint(HWND hwnd, int x, int y);
    // Screen point over the middle of header item i, or x pixels into it.
    POINT HeaderPoint(int item, int x = -1);
    // Opens the chooser, beside the host so that it covers nothing of the list.
    void OpenChooser();
    // Presses header item i and moves: the header's drag runs until the driver drops.
    void DragHeaderItem(int item, POINT target, int releaseTick = 2, std::function<void(int)> onTick = nullptr);
    // Presses the chooser strip at row and moves, likewise.
    void DragStrip(int row, POINT target, int releaseTick = 2, std::function<void(int)> onTick = nullptr);

    std::unique_ptr<orvane_test::HostWindow> m_host;
    CFiller m_filler;
    CTestList* m_pList = nullptr;
};

} // namespace columns_test
