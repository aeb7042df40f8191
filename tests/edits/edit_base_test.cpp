// The validated edit base, driven through a small subclass (digits are valid, 'x' is a
// typeable syntax error) inside modeless dialogs:
//  - the character filter, and Ctrl+C/V/X passing it only while Ctrl is down;
//  - the change check registering and unregistering, the parent still getting EN_CHANGE,
//    an emptied field being valid, the later of two invalid edits registered;
//  - Tab, Alt keys and focus moves within the page held while an error is pending (the
//    message shown, the focus taken back, the text from the error position selected);
//    focus moves in another dialog ignored; SetOwnMessage shown once;
//  - a disabled invalid field restored without a box; GetModified, undefined mode;
//  - mended faults: no registration outlives its edit or its window, unbalanced
//    InitErrorHandling calls, another page's edits not taking the hooks along, a second
//    display request while the box is up.
#include "edit_harness.h"

#include "KVXEdit.h"

namespace {

using namespace edit_test;
using orvane_test::KeyStateGuard;
using orvane_test::PostKey;
using orvane_test::SendChars;

class ProbeEdit : public KVXEdit
{
public:
    int charChecks = 0;

    int SetValueAsVariant(KVXVariant varValue, int bCommit) override
    {
        long value = 0;
        if (varValue.GetAs(value, 1) != KVT_VARIANT_OK)
            return FALSE;
        m_varValue = value;
        if (bCommit)
        {
            SetUndefined(FALSE);
            m_varCommitted = m_varValue;
        }
        if (::IsWindow(m_hWnd))
        {
            CString text;
            text.Format(_T("%ld"), value);
            SetWindowText(text);
            SetSel(100, 101);   // caret at the end, where typing continues
        }
        return TRUE;
    }
    int SyntaxCheck(int bShow) override { return KVXEdit::SyntaxCheck(bShow); }

    long Value() const { return AsLong(m_varValue); }
    long Committed() const { return AsLong(m_varCommitted); }
    std::string Message() const { return Narrow(static_cast<LPCTSTR>(m_strErrorMessage)); }
    int ErrorPos() const { return m_nErrorPos; }
    std::string Text() const { return Narrow(WindowText(m_hWnd)); }
    KVXVariant ReadValue(int commit) { return GetValueAsVariant(commit); }
    static int PagesCount() { return m_iErrorPagesCount; }
    static bool HooksInstalled() { return m_hHookGet != NULL && m_hHookRet != NULL; }
    static bool HooksRemoved() { return m_hHookGet == NULL && m_hHookRet == NULL; }

protected:
    int CharCheck(WCHAR c) override
    {
        ++charChecks;
        return c == 8 || c == L'x' || (c >= L'0' && c <= L'9');
    }
    int SyntaxCheck(KVXString strText) override
    {
        CString message(_T("Empty"));
        for (int i = 0; i < strText.GetLength(); ++i)
        {
            if (strText[i] < L'0' || strText[i] > L'9')
            {
                SetErrorPos(i);
                message.Format(_T("Bad character at %d"), i);
                SetErrorMessage(message);
                return FALSE;
            }
        }
        if (strText.IsEmpty())
        {
            SetErrorMessage(message);
            return FALSE;
        }
        m_varValue = static_cast<long>(_wtol(strText));
        return TRUE;
    }

private:
    static long AsLong(const KVXVariant& v)
    {
        long value = -999;
        v.GetAs(value, 1);
        return value;
    }
};

class EditBase : public PageFixture
{
protected:
    void SetUp() override
    {
        PageFixture::SetUp();
        ASSERT_TRUE(edit1.SubclassDlgItem(kIdEdit1, &dlg));
        ASSERT_TRUE(edit2.SubclassDlgItem(kIdEdit2, &dlg));
        edit1.InitErrorHandling(dlg.m_hWnd, TRUE);   // as a host page does when it starts
        edit1.SetFocus();
        PumpDialog(dlg);
        dlg.changes.clear();
    }
    void TearDown() override
    {
        edit1.InitErrorHandling(dlg.m_hWnd, FALSE);
        PageFixture::TearDown();
    }

    // Types into edit1 and leaves it invalid at position 2 ("12x45").
    void MakeEdit1Invalid()
    {
        edit1.SetFocus();
        SendChars(edit1, L"12x45");
        ASSERT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
    }
    // Tab in edit1, as a user presses it; with the page's hooks a pending error holds it.
    void Tab()
    {
        PostKey(edit1, VK_TAB);
        PumpDialog(dlg);
    }

    ProbeEdit edit1;
    ProbeEdit edit2;
};

TEST_F(EditBase, TypedCharactersPassTheFilterClipboardKeysOnlyWithCtrl)
{
    SendChars(edit1, L"1a2 3x");
    EXPECT_EQ("123x", edit1.Text());
    EXPECT_EQ(6, edit1.charChecks);

    ASSERT_TRUE(orvane_test::SetClipboardText(dlg, L"45"));
    edit1.SetWindowText(_T(""));
    ::SendMessageW(edit1, WM_CHAR, 22, 1);   // Ctrl+V's code without Ctrl: the filter refuses it
    EXPECT_EQ("", edit1.Text());
    EXPECT_EQ(7, edit1.charChecks);
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessageW(edit1, WM_CHAR, 22, 1);
        EXPECT_EQ("45", edit1.Text());
        orvane_test::SetClipboardText(dlg, L"zz");
        ::SendMessageW(edit1, EM_SETSEL, 0, -1);
        ::SendMessageW(edit1, WM_CHAR, 3, 1);
        EXPECT_EQ(L"45", orvane_test::ClipboardText(dlg));
        orvane_test::SetClipboardText(dlg, L"zz");
        ::SendMessageW(edit1, WM_CHAR, 24, 1);
        EXPECT_EQ(L"45", orvane_test::ClipboardText(dlg));
        EXPECT_EQ("", edit1.Text());
    }
    EXPECT_EQ(7, edit1.charChecks);
}

TEST_F(EditBase, FailedCheckRegistersTheParentStillGetsEnChangeAnEmptyFieldIsValid)
{
    SendChars(edit1, L"12");
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_EQ(12, edit1.Value());
    SendChars(edit1, L"x");
    EXPECT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_EQ(12, edit1.Value());
    EXPECT_EQ("Bad character at 2", edit1.Message());
    EXPECT_EQ(2, edit1.ErrorPos());
    SendChars(edit1, L"\b");
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_EQ(std::vector<UINT>(4, kIdEdit1), dlg.changes);

    SendChars(edit1, L"4x");
    edit1.SetWindowText(_T(""));
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_TRUE(edit1.SyntaxCheck(FALSE));
    EXPECT_EQ(124, edit1.Value());
}

TEST_F(EditBase, OnlyTheLaterOfTwoInvalidEditsIsRegistered)
{
    SendChars(edit1, L"1x");
    SendChars(edit2, L"2x");
    EXPECT_EQ(&edit2, KVXEdit::FindErrorOnPage(dlg));
    SendChars(edit1, L"\b");
    EXPECT_EQ(&edit2, KVXEdit::FindErrorOnPage(dlg));
    SendChars(edit1, L"x");
    SendChars(edit2, L"\b");
    EXPECT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
    SendChars(edit1, L"\b");
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
}

// What a user does to leave an invalid field, and each is held the same way.
struct LeaveCase
{
    const char* name;
    void (*leave)(TestDialog& dlg, HWND edit);
};

const LeaveCase kLeaveCases[] = {
    { "Tab", [](TestDialog& dlg, HWND edit) { PostKey(edit, VK_TAB); PumpDialog(dlg); } },
    { "AltKey", [](TestDialog& dlg, HWND edit) { PostKey(edit, 'F', true); PumpDialog(dlg); } },
    { "FocusToAnotherControl", [](TestDialog& dlg, HWND) { ::SetFocus(dlg.Item(kIdButton)); PumpDialog(dlg); } },
};

class EditBaseLeave : public EditBase, public testing::WithParamInterface<LeaveCase> {};

TEST_P(EditBaseLeave, ShowsTheMessageAndTakesTheFocusBackEveryTime)
{
    BoxRecorder boxes;
    MakeEdit1Invalid();
    for (int attempt = 1; attempt <= 2; ++attempt)
    {
        GetParam().leave(dlg, edit1);
        EXPECT_EQ(attempt, boxes.count());
        EXPECT_EQ("Bad character at 2", boxes.last());
        EXPECT_EQ(edit1.m_hWnd, ::GetFocus());
        EXPECT_EQ("2-5", Selection(edit1));
    }
    EXPECT_EQ("12x45", edit1.Text());   // the display changes no text
    EXPECT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
}

INSTANTIATE_TEST_SUITE_P(Cases, EditBaseLeave, testing::ValuesIn(kLeaveCases),
    [](const testing::TestParamInfo<LeaveCase>& info) { return std::string(info.param.name); });

TEST_F(EditBase, TabMovesOnWithoutAnErrorOrWithoutTheHooks)
{
    BoxRecorder boxes;
    SendChars(edit1, L"12");
    Tab();
    EXPECT_EQ(edit2.m_hWnd, ::GetFocus());
    edit1.InitErrorHandling(dlg.m_hWnd, FALSE);   // the page ends its error handling
    MakeEdit1Invalid();
    Tab();
    EXPECT_EQ(edit2.m_hWnd, ::GetFocus());
    EXPECT_EQ(0, boxes.count());
    edit1.InitErrorHandling(dlg.m_hWnd, TRUE);
}

TEST_F(EditBase, FocusMovesInAnotherDialogAreIgnored)
{
    BoxRecorder boxes;
    MakeEdit1Invalid();
    TestDialog other;
    ASSERT_TRUE(other.Open(L"Other"));
    ::SetFocus(other.Item(kIdEdit1));
    PumpDialog(other);
    ::SetFocus(other.Item(kIdButton));
    PumpDialog(other);
    EXPECT_EQ(0, boxes.count());
    EXPECT_EQ(other.Item(kIdButton), ::GetFocus());
    EXPECT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
}

TEST_F(EditBase, HostMessageIsShownOnceAlsoWhenTheFieldGetsTheFocus)
{
    BoxRecorder boxes;
    SendChars(edit1, L"7");
    CString message(_T("Host says no"));
    edit1.SetOwnMessage(message);
    EXPECT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_TRUE(edit2.ShowErrorMessage());   // any edit of the page reaches the registered one
    PumpDialog(dlg);
    EXPECT_EQ(1, boxes.count());
    EXPECT_EQ("Host says no", boxes.last());
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
    EXPECT_FALSE(edit1.ShowErrorMessage());
    PumpDialog(dlg);
    EXPECT_EQ(1, boxes.count());

    edit2.SetFocus();
    CString check(_T("Check this"));
    edit1.SetOwnMessage(check);
    edit1.SetFocus();
    PumpDialog(dlg);
    EXPECT_EQ(2, boxes.count());
    EXPECT_EQ("Check this", boxes.last());
}

TEST_F(EditBase, DisabledInvalidFieldGetsItsCommittedValueWithoutABox)
{
    BoxRecorder boxes;
    edit1.SetValueAsVariant(KVXVariant(5L), TRUE);
    SendChars(edit1, L"x");
    ASSERT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
    edit1.EnableWindow(FALSE);
    EXPECT_TRUE(edit1.ShowErrorMessage());
    PumpDialog(dlg);
    EXPECT_EQ(0, boxes.count());
    EXPECT_EQ("5", edit1.Text());
    EXPECT_EQ(5, edit1.Value());
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
}

TEST_F(EditBase, ModifiedWhileTheValueDiffersUndefinedWhileEmpty)
{
    edit1.SetValueAsVariant(KVXVariant(5L), TRUE);
    EXPECT_FALSE(edit1.GetModified());
    SendChars(edit1, L"\b6");
    EXPECT_TRUE(edit1.GetModified());
    SendChars(edit1, L"\b5");
    EXPECT_FALSE(edit1.GetModified());
    SendChars(edit1, L"\b7");
    long value = 0;
    edit1.ReadValue(TRUE).GetAs(value, 1);
    EXPECT_EQ(7, value);
    EXPECT_FALSE(edit1.GetModified());
    EXPECT_EQ(7, edit1.Committed());

    SendChars(edit1, L"\b6");
    edit1.SetUndefined(TRUE);
    EXPECT_EQ("", edit1.Text());
    EXPECT_TRUE(edit1.GetUndefined());
    EXPECT_FALSE(edit1.GetModified());
    SendChars(edit1, L"3");
    EXPECT_FALSE(edit1.GetUndefined());
    EXPECT_TRUE(edit1.GetModified());
}

TEST_F(EditBase, FocusTrackingFollowsTheEdit)
{
    edit2.SetFocus();   // the dialog gave edit1 the focus before it was subclassed
    edit1.SetFocus();
    EXPECT_TRUE(edit1.IsFocusSet());
    edit2.SetFocus();
    EXPECT_FALSE(edit1.IsFocusSet());
    EXPECT_TRUE(edit2.IsFocusSet());
}

// --- mended faults ----------------------------------------------------------

TEST_F(EditBase, DestroyedEditTakesItsRegistrationAlongAndLeavesAnothersAlone)
{
    BoxRecorder boxes;
    auto* edit3 = new ProbeEdit;
    ASSERT_TRUE(edit3->SubclassDlgItem(kIdEdit3, &dlg));
    SendChars(*edit3, L"x");
    ASSERT_EQ(edit3, KVXEdit::FindErrorOnPage(dlg));
    // The window stays on the page while the object goes: only the destructor can tell.
    const HWND hEdit3 = edit3->UnsubclassWindow();
    delete edit3;
    ASSERT_TRUE(::IsWindow(hEdit3));
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(dlg));
    edit2.SetFocus();
    PostKey(edit2, VK_TAB);
    PumpDialog(dlg);
    EXPECT_EQ(0, boxes.count());
    EXPECT_NE(edit2.m_hWnd, ::GetFocus());

    edit3 = new ProbeEdit;
    ASSERT_TRUE(edit3->SubclassWindow(hEdit3));
    SendChars(*edit3, L"x");
    SendChars(edit1, L"x");
    ASSERT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
    delete edit3;
    EXPECT_EQ(&edit1, KVXEdit::FindErrorOnPage(dlg));
}

TEST_F(EditBase, RegistrationDoesNotOutliveTheEditsWindow)
{
    BoxRecorder boxes;
    TestDialog page;
    ASSERT_TRUE(page.Open(L"Page"));
    ProbeEdit survivor;
    ASSERT_TRUE(survivor.SubclassDlgItem(kIdEdit1, &page));
    SendChars(survivor, L"x");
    const HWND hPage = page.m_hWnd;
    ASSERT_EQ(&survivor, KVXEdit::FindErrorOnPage(hPage));
    page.DestroyWindow();   // the object lives on, its window and page are gone
    EXPECT_EQ(nullptr, KVXEdit::FindErrorOnPage(hPage));
    PumpDialog(dlg);
    EXPECT_EQ(0, boxes.count());
}

TEST_F(EditBase, UnbalancedReleasesNeitherGoNegativeNorUnhookTwice)
{
    ASSERT_EQ(1, ProbeEdit::PagesCount());
    ASSERT_TRUE(ProbeEdit::HooksInstalled());
    for (int i = 0; i < 3; ++i)
        edit1.InitErrorHandling(dlg.m_hWnd, FALSE);
    EXPECT_EQ(0, ProbeEdit::PagesCount());
    EXPECT_TRUE(ProbeEdit::HooksRemoved());
    // One start brings the hooks back: Tab is held again.
    BoxRecorder boxes;
    edit1.InitErrorHandling(dlg.m_hWnd, TRUE);
    EXPECT_EQ(1, ProbeEdit::PagesCount());
    MakeEdit1Invalid();
    Tab();
    EXPECT_EQ(1, boxes.count());
    EXPECT_EQ(edit1.m_hWnd, ::GetFocus());
}

TEST_F(EditBase, AnotherPagesEditsDoNotTakeTheHooksAlong)
{
    {
        // A second page opens and closes while this one runs, and its edits die.
        TestDialog page;
        ASSERT_TRUE(page.Open(L"Nested"));
        ProbeEdit pageEdit;
        ASSERT_TRUE(pageEdit.SubclassDlgItem(kIdEdit1, &page));
        pageEdit.InitErrorHandling(page.m_hWnd, TRUE);
        EXPECT_EQ(2, ProbeEdit::PagesCount());
        pageEdit.InitErrorHandling(page.m_hWnd, FALSE);
        page.DestroyWindow();
    }
    EXPECT_EQ(1, ProbeEdit::PagesCount());
    EXPECT_TRUE(ProbeEdit::HooksInstalled());
    BoxRecorder boxes;
    dlg.SetActiveWindow();
    MakeEdit1Invalid();
    Tab();
    EXPECT_EQ(1, boxes.count());
}

TEST_F(EditBase, ASecondDisplayRequestWhileTheBoxIsUpOpensNoSecondBox)
{
    BoxRecorder boxes;
    MakeEdit1Invalid();
    ::PostMessageW(edit1, WM_KVX_SHOWERRORMESSAGE, 0, 0);
    ::PostMessageW(edit1, WM_KVX_SHOWERRORMESSAGE, 0, 0);
    PumpDialog(dlg, 300);
    EXPECT_EQ(1, boxes.count());
}

} // namespace
