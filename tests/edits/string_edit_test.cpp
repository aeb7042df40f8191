// KVXStringEdit:
//  - escape translation, stray-backslash removal and the paste arithmetic as plain
//    functions (named case tables);
//  - the maximum: 255 characters typed, the 256th refused; typing over a selection at the
//    maximum refused while pasting over it replaces; stray backslashes not counted when
//    they are dropped; control characters always pass;
//  - paste (also by Ctrl+V) cut to the maximum, verbatim, CF_TEXT through the code page,
//    Unicode kept, a read-only field untouched;
//  - GetValue translating, SetValue cutting 300 characters and removing stray backslashes,
//    the selection it leaves, SetValueAsVariant with other types, values without a window.
#include "edit_harness.h"

#include "KVXStringEdit.h"
#include "StringEscapes.h"

#include <memory>
#include <string>

namespace {

using namespace edit_test;
using orvane_test::KeyStateGuard;
using orvane_test::SendChars;
using orvane_test::SetClipboardAnsi;
using orvane_test::SetClipboardText;

// ---------------------------------------------------------------------------
// Plain functions

struct EscapeCase
{
    const char* name;
    const wchar_t* text;
    bool keepStray;
    const wchar_t* expected;
};

const EscapeCase kEscapeCases[] = {
    { "LineFeed", L"a\\nb", true, L"a\nb" },
    { "Tab", L"a\\tb", true, L"a\tb" },
    { "DoubledBackslashFirst", L"a\\\\n", true, L"a\\n" },
    { "StrayKept", L"x\\y", true, L"x\\y" },
    { "StrayDropped", L"x\\y", false, L"xy" },
    { "TrailingKept", L"x\\", true, L"x\\" },
    { "TrailingDropped", L"x\\", false, L"x" },
    { "ThreeThenN", L"\\\\\\n", false, L"\\\n" },
    { "NoRescanOfOutput", L"\\\\t", true, L"\\t" },
    { "StrayBeforeEscape", L"\\q\\n", false, L"q\n" },
    { "Empty", L"", true, L"" },
    { "OnlyBackslash", L"\\", false, L"" },
    { "UpperNIsNoEscape", L"\\N", true, L"\\N" },
};

TEST(StringEscapes, ReplaceSpecialCharacters)
{
    for (const EscapeCase& c : kEscapeCases)
        EXPECT_EQ(std::wstring(c.expected), StringEscapes::ReplaceSpecialCharacters(c.text, c.keepStray)) << c.name;
}

struct StrayCase
{
    const char* name;
    const wchar_t* text;
    const wchar_t* expected;
};

const StrayCase kStrayCases[] = {
    { "Single", L"x\\y", L"xy" },
    { "Three", L"x\\\\\\y", L"x\\\\y" },
    { "EscapeN", L"x\\ny", L"x\\ny" },
    { "ThreeThenN", L"x\\\\\\ny", L"x\\\\\\ny" },
    { "EscapeT", L"\\t", L"\\t" },
    { "Even", L"a\\\\b", L"a\\\\b" },
    { "EvenThenN", L"a\\\\n", L"a\\\\n" },
    { "AtEnd", L"ab\\", L"ab" },
    { "ThreeAtEnd", L"ab\\\\\\", L"ab\\\\" },
    { "SeveralRuns", L"\\a\\\\b\\\\\\c\\n", L"a\\\\b\\\\c\\n" },
    { "Empty", L"", L"" },
};

TEST(StringEscapes, RemoveStrayBackslashes)
{
    for (const StrayCase& c : kStrayCases)
        EXPECT_EQ(std::wstring(c.expected), StringEscapes::RemoveStrayBackslashes(c.text)) << c.name;
}

struct PasteCase
{
    const char* name;
    const wchar_t* text;
    int selStart, selEnd;
    const wchar_t* clip;
    int max;
    bool done;
    const wchar_t* result;
    int caret;
};

const PasteCase kPasteCases[] = {
    { "SixLettersIntoMaxFour", L"", 0, 0, L"abcdef", 4, true, L"abcd", 4 },
    { "Fits", L"xy", 1, 1, L"ab", 10, true, L"xaby", 3 },
    { "ReplacesSelectionAtMax", L"abcd", 1, 2, L"Z", 4, true, L"aZcd", 2 },
    { "FullFieldDoesNothing", L"abcd", 2, 2, L"Z", 4, false, L"", 0 },
    { "CutInMiddle", L"ab", 1, 1, L"12345", 5, true, L"a123b", 4 },
    { "EmptyClip", L"ab", 0, 2, L"", 5, true, L"", 0 },
    { "SelectionBeyondText", L"ab", 7, 9, L"c", 5, true, L"abc", 3 },
    { "ReversedSelection", L"abcd", 3, 1, L"Z", 4, true, L"aZd", 2 },
    { "NegativeMaximum", L"", 0, 0, L"a", -1, false, L"", 0 },
};

TEST(StringEscapes, ComposePaste)
{
    for (const PasteCase& c : kPasteCases)
    {
        StringEscapes::PasteResult r;
        ASSERT_EQ(c.done, StringEscapes::ComposePaste(c.text, c.selStart, c.selEnd, c.clip, c.max, r)) << c.name;
        if (c.done)
        {
            EXPECT_EQ(std::wstring(c.result), r.text) << c.name;
            EXPECT_EQ(c.caret, r.caret) << c.name;
        }
    }
}

TEST(StringEscapes, ProspectiveTypedTextIgnoresTheSelection)
{
    EXPECT_EQ(std::wstring(L"aXbc"), StringEscapes::ProspectiveTypedText(L"abc", 1, L'X'));
    EXPECT_EQ(std::wstring(L"abcX"), StringEscapes::ProspectiveTypedText(L"abc", 99, L'X'));
    EXPECT_EQ(std::wstring(L"Xabc"), StringEscapes::ProspectiveTypedText(L"abc", -4, L'X'));
}

// ---------------------------------------------------------------------------
// The control

// Exposes the committed value for the tests.
class StringEdit : public KVXStringEdit
{
public:
    using KVXStringEdit::KVXStringEdit;
    std::wstring Stored() const { return Read(m_varValue); }
    std::wstring Committed() const { return Read(m_varCommitted); }

private:
    static std::wstring Read(const KVXVariant& v)
    {
        KVXString text;
        v.GetAs(text);
        return std::wstring((LPCTSTR)text, static_cast<size_t>(text.GetLength()));
    }
};

std::wstring Std(const KVXString& s) { return std::wstring((LPCTSTR)s, static_cast<size_t>(s.GetLength())); }

class StringEditTest : public PageFixture
{
protected:
    // The edit made with these flags, subclassing the page's first edit.
    StringEdit& Attach(int bReplaceSpecialChars = TRUE, int bAcceptSingleBackslash = TRUE)
    {
        m_edit = std::make_unique<StringEdit>(bReplaceSpecialChars, bAcceptSingleBackslash);
        EXPECT_TRUE(m_edit->SubclassDlgItem(kIdEdit1, &dlg));
        m_hEdit = m_edit->m_hWnd;
        return *m_edit;
    }
    void SetSel(int start, int end) { ::SendMessage(m_hEdit, EM_SETSEL, start, end); }
    void Paste() { ::SendMessage(m_hEdit, WM_PASTE, 0, 0); }
    std::wstring Text() const { return WindowText(m_hEdit); }

    std::unique_ptr<StringEdit> m_edit;
    HWND m_hEdit = NULL;
};

TEST_F(StringEditTest, AcceptsTwoHundredFiftyFiveCharactersAndRefusesTheNext)
{
    StringEdit& edit = Attach();
    EXPECT_EQ(255, edit.GetCharacterCount());
    SendChars(m_hEdit, std::wstring(255, L'a'));
    SendChars(m_hEdit, L"b");
    EXPECT_EQ(std::wstring(255, L'a'), Text());
    SendChars(m_hEdit, L"\b");   // control characters always pass
    EXPECT_EQ(std::wstring(254, L'a'), edit.Stored());
}

TEST_F(StringEditTest, AtTheMaximumTypingOverASelectionIsRefusedPastingReplaces)
{
    StringEdit& edit = Attach();
    edit.SetCharacterCount(5);
    SendChars(m_hEdit, L"abcde");
    SetSel(2, 3);
    SendChars(m_hEdit, L"Z");
    EXPECT_EQ(L"abcde", Text());
    ASSERT_TRUE(SetClipboardAnsi(dlg, "Z"));
    SetSel(2, 3);
    Paste();
    EXPECT_EQ(L"abZde", Text());
    EXPECT_EQ("3-3", Selection(m_hEdit));
    EXPECT_EQ(L"abZde", edit.Stored());
    // Full now: a further paste, also by Ctrl+V, changes nothing, the selection included.
    SetSel(1, 1);
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessage(m_hEdit, WM_CHAR, 0x16, 1);
    }
    EXPECT_EQ(L"abZde", Text());
    EXPECT_EQ("1-1", Selection(m_hEdit));
}

TEST_F(StringEditTest, PasteIsCutToTheMaximumAndInsertsEverythingVerbatim)
{
    StringEdit& edit = Attach(TRUE, FALSE);
    edit.SetCharacterCount(6);
    ASSERT_TRUE(SetClipboardAnsi(dlg, "a\\b\tc\\de"));
    Paste();
    EXPECT_EQ(L"a\\b\tc\\", Text());
    EXPECT_EQ("6-6", Selection(m_hEdit));
}

TEST_F(StringEditTest, ClipboardTextIsReadWithTheCodePageOrAsUnicode)
{
    StringEdit& edit = Attach();
    ASSERT_TRUE(SetClipboardAnsi(dlg, "caf\xE9 "));
    Paste();
    ASSERT_TRUE(SetClipboardText(dlg, L"\x03A9mega \x0416"));
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessage(m_hEdit, WM_CHAR, 0x16, 1);
    }
    EXPECT_EQ(L"caf\x00E9 \x03A9mega \x0416", Text());
}

TEST_F(StringEditTest, ReadOnlyFieldIgnoresPaste)
{
    StringEdit& edit = Attach();
    ::SendMessage(m_hEdit, EM_SETREADONLY, TRUE, 0);
    ::SetWindowTextW(m_hEdit, L"fixed");
    ASSERT_TRUE(SetClipboardAnsi(dlg, "new"));
    SetSel(0, -1);
    Paste();
    EXPECT_EQ(L"fixed", Text());
}

TEST_F(StringEditTest, DroppedBackslashesDoNotCountWhenTyping)
{
    StringEdit& edit = Attach(TRUE, FALSE);
    edit.SetCharacterCount(3);
    SendChars(m_hEdit, L"ab\\c");   // the stray backslash will be dropped: "abc"
    SendChars(m_hEdit, L"d");
    EXPECT_EQ(L"ab\\c", Text());
    StringEdit counting;   // accepted backslashes count
    ASSERT_TRUE(counting.SubclassDlgItem(kIdEdit2, &dlg));
    counting.SetCharacterCount(3);
    SendChars(counting.m_hWnd, L"ab\\c");
    EXPECT_EQ(L"ab\\", WindowText(counting.m_hWnd));
}

TEST_F(StringEditTest, GetValueTranslatesTheShownText)
{
    StringEdit& plain = Attach(FALSE, TRUE);
    ::SetWindowTextW(m_hEdit, L"a\\nb");
    EXPECT_EQ(L"a\\nb", Std(plain.GetValue(FALSE)));
    plain.UnsubclassWindow();
    StringEdit& edit = Attach(TRUE, FALSE);
    ::SetWindowTextW(m_hEdit, L"a\\n\\q\\");
    EXPECT_EQ(L"a\nq", Std(edit.GetValue(FALSE)));
    EXPECT_EQ(L"a\\n\\q\\", edit.Stored()) << "the stored text stays untranslated";
}

TEST_F(StringEditTest, SetValueRemovesStrayBackslashesAndCutsToTheMaximum)
{
    StringEdit& edit = Attach(FALSE, FALSE);
    EXPECT_TRUE(edit.SetValue(KVXString(L"x\\\\\\ny\\"), FALSE));
    EXPECT_EQ(L"x\\\\\\ny", Text());
    EXPECT_EQ(L"x\\\\\\ny", edit.Stored());
    std::wstring text;
    for (int i = 0; i < 300; ++i)
        text += static_cast<wchar_t>(L'a' + i % 26);
    EXPECT_TRUE(edit.SetValue(KVXString(text.c_str()), TRUE));
    EXPECT_EQ(text.substr(0, 255), Text());
    EXPECT_EQ(text.substr(0, 255), edit.Committed());
    EXPECT_EQ("255-255", Selection(m_hEdit));
    // A text that fits: its last character is selected.
    edit.SetValue(KVXString(L"abc"), FALSE);
    EXPECT_EQ("2-3", Selection(m_hEdit));
    EXPECT_EQ(text.substr(0, 255), edit.Committed());
    EXPECT_TRUE(edit.GetModified());
    EXPECT_EQ(L"abc", Std(edit.GetValue(TRUE)));
    EXPECT_FALSE(edit.GetModified());
}

TEST_F(StringEditTest, SetValueAsVariantTakesOnlyText)
{
    StringEdit& edit = Attach();
    edit.SetValue(KVXString(L"keep"), TRUE);
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(42L), TRUE));
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(1.5), TRUE));
    EXPECT_EQ(L"keep", Text());
    EXPECT_EQ(L"keep", edit.Stored());
    EXPECT_TRUE(edit.SetValueAsVariant(KVXVariant(KVXString(L"new")), FALSE));
    EXPECT_EQ(L"new", Text());
    EXPECT_EQ(L"keep", edit.Committed());
}

TEST(StringEditWithoutWindow, ValuesWork)
{
    StringEdit edit;
    EXPECT_TRUE(edit.SetValue(KVXString(std::wstring(300, L'q').c_str()), TRUE));
    EXPECT_EQ(std::wstring(255, L'q'), edit.Stored());
    edit.SetCharacterCount(-3);   // not bounded: nothing fits any more
    EXPECT_TRUE(edit.SetValue(KVXString(L"abc"), FALSE));
    EXPECT_EQ(L"", edit.Stored());
    EXPECT_EQ(-3, edit.GetCharacterCount());
}

} // namespace
