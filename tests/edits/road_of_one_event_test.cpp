// One user event end to end: 0b102 typed into an integer edit in binary display, inside
// a dialog that started error handling in OnInitDialog, then Tab.
//  - each character passes the filter and is inserted; the parent gets every EN_CHANGE;
//  - the text check stores message 5117 with the position of the "2" and registers the
//    edit, whose value stays the last valid one (2);
//  - Tab is swallowed by the hook, the box shows 5117, the focus stays, the text from the
//    "2" to the end is selected;
//  - deleting the "2" makes the text valid and removes the registration; Tab moves on.
#include "numeric_probes.h"

#include "resource.h"

namespace {

using namespace edit_test;

class RoadDialog : public TestDialog
{
public:
    RoadDialog() : edit(KVXLongEdit::BINARY) {}

    virtual BOOL OnInitDialog()
    {
        CDialog::OnInitDialog();
        edit.SubclassDlgItem(kIdEdit1, this);
        edit.InitErrorHandling(m_hWnd, TRUE);
        return TRUE;
    }

    void End()
    {
        edit.InitErrorHandling(m_hWnd, FALSE);
        DestroyWindow();
    }

    LongProbe edit;
};

TEST(RoadOfOneEvent, BinaryTypoTabMessageCorrectionTab)
{
    EnsureLibraryLoaded();
    RoadDialog dlg;
    ASSERT_TRUE(dlg.Open(L"Road"));
    LongProbe& edit = dlg.edit;
    ASSERT_EQ("0b0", edit.Text());
    edit.SetFocus();
    edit.SetSel(0, -1);
    dlg.changes.clear();
    BoxRecorder boxes;

    std::vector<std::string> texts;
    for (wchar_t c : std::wstring(L"0b102"))
    {
        ::SendMessageW(edit, WM_CHAR, c, 1);
        texts.push_back(edit.Text());
    }
    EXPECT_EQ((std::vector<std::string>{ "0", "0b", "0b1", "0b10", "0b102" }), texts);
    EXPECT_EQ(std::vector<UINT>(5, kIdEdit1), dlg.changes);

    EXPECT_EQ(&edit, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_EQ(Narrow(LoadText(IDS_BINARY_SYNTAX)), edit.Message());
    EXPECT_EQ(4, edit.ErrorPos());
    EXPECT_EQ(2, edit.CurrentLong());

    PostKey(edit, VK_TAB);
    PumpDialog(dlg, 300);
    ASSERT_EQ(1, boxes.count());
    EXPECT_EQ(LoadText(IDS_BINARY_SYNTAX), boxes.texts()[0]);
    EXPECT_EQ("Syntax Error !\nOnly the characters '0' and '1' are accepted \nin binary numbers (prefix: \"0b\") ! ",
        boxes.last());
    EXPECT_EQ(edit.m_hWnd, ::GetFocus());
    EXPECT_EQ("4-5", Selection(edit));

    ::SendMessageW(edit, WM_CHAR, 8, 1);
    EXPECT_EQ("0b10", edit.Text());
    EXPECT_EQ(2, edit.CurrentLong());
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));

    PostKey(edit, VK_TAB);
    PumpDialog(dlg);
    EXPECT_EQ(dlg.Item(kIdEdit2), ::GetFocus());
    EXPECT_EQ(1, boxes.count());
    EXPECT_EQ(2, edit.GetValue(TRUE));
    dlg.End();
}

} // namespace
