// Shared by the windowed column tests: a list on screen with six known columns (four
// shown), a fill callback, readings of the layout and of the chooser, real drags.
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

class CTestList : public KVXDragColumnListCtrl
{
public:
    using KVXDragColumnListCtrl::m_HeaderCtrl;
    using KVXDragColumnListCtrl::m_pPropFrame;
    using KVXListCtrlEx::m_nSortColumn;
    std::string Types() const;      // the column type codes, "1,2,3,0"
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
    // A real drag of header item i or of the chooser's strip at row to a screen point:
    // the left button goes down in the key state; a timer ticking in the drag's loop moves
    // the cursor to the target and lets go at releaseTick (0: never; after 60 ticks in
    // any case). onTick runs at every tick.
    void DragHeaderItem(int item, POINT target, int releaseTick = 2, std::function<void(int)> onTick = nullptr);
    void DragStrip(int row, POINT target, int releaseTick = 2, std::function<void(int)> onTick = nullptr);

    std::unique_ptr<orvane_test::HostWindow> m_host;
    CFiller m_filler;
    CTestList* m_pList = nullptr;
};

} // namespace columns_test
