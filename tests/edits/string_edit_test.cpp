// KVXStringEdit:
//  - escape translation, stray-backslash removal and the paste arithmetic as plain
//    functions (named case tables);
//  - the maximum: 255 characters typed, the 256th refused; typing over a selection at the
//    maximum refused while pasting over it replaces; stray backslashes not counted when
//    they are dropped; control characters always pass;
//  - paste: six letters into maximum 4, a full field, Ctrl+V, control characters and
//    backslashes verbatim, CF_TEXT through the code page, Unicode kept, read-only field;
//  - GetValue with and without replacement, SetValue cutting 300 characters and removing
//    stray backslashes, the selection it leaves, SetValueAsVariant with other types,
//    values without a window.
#include "edit_harness.h"

#include "KVXStringEdit.h"
#include "StringEscapes.h"

#include <string>

namespace {

using namespace edit_test;
using orvane_test::KeyStateGuard;
using orvane_test::SendChars;

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

class StringEscapeTranslation : public ::testing::TestWithParam<EscapeCase> {};

TEST_P(StringEscapeTranslation, Translates)
{
    const EscapeCase& c = GetParam();
    EXPECT_EQ(std::wstring(c.expected), StringEscapes::ReplaceSpecialCharacters(c.text, c.keepStray));
}

INSTANTIATE_TEST_SUITE_P(Cases, StringEscapeTranslation, ::testing::ValuesIn(kEscapeCases),
                         [](const ::testing::TestParamInfo<EscapeCase>& info) { return std::string(info.param.name); });

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

class StrayBackslashRemoval : public ::testing::TestWithParam<StrayCase> {};

TEST_P(StrayBackslashRemoval, Removes)
{
    const StrayCase& c = GetParam();
    EXPECT_EQ(std::wstring(c.expected), StringEscapes::RemoveStrayBackslashes(c.text));
}

INSTANTIATE_TEST_SUITE_P(Cases, StrayBackslashRemoval, ::testing::ValuesIn(kStrayCases),
                         [](const ::testing::TestParamInfo<StrayCase>& info) { return std::string(info.param.name); });

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

class StringPaste : public ::testing::TestWithParam<PasteCase> {};

TEST_P(StringPaste, Composes)
{
    const PasteCase& c = GetParam();
    StringEscapes::PasteResult r;
    ASSERT_EQ(c.done, StringEscapes::ComposePaste(c.text, c.selStart, c.selEnd, c.clip, c.max, r));
    if (c.done)
    {
        EXPECT_EQ(std::wstring(c.result), r.text);
        EXPECT_EQ(c.caret, r.caret);
    }
}

INSTANTIATE_TEST_SUITE_P(Cases, StringPaste, ::testing::ValuesIn(kPasteCases),
                         [](const ::testing::TestParamInfo<PasteCase>& info) { return std::string(info.param.name); });

TEST(StringTyping, ProspectiveTextIgnoresSelection)
{
    EXPECT_EQ(std::wstring(L"aXbc"), StringEscapes::ProspectiveTypedText(L"abc", 1, L'X'));
    EXPECT_EQ(std::wstring(L"abcX"), StringEscapes::ProspectiveTypedText(L"abc", 99, L'X'));
    EXPECT_EQ(std::wstring(L"Xabc"), StringEscapes::ProspectiveTypedText(L"abc", -4, L'X'));
}

// ---------------------------------------------------------------------------
// The control

// Puts text on the clipboard in one format only (CF_TEXT bytes or CF_UNICODETEXT).
bool SetClipboard(HWND owner, const std::string* ansi, const std::wstring* wide)
{
    if (!::OpenClipboard(owner))
        return false;
    ::EmptyClipboard();
    HGLOBAL hData = NULL;
    UINT format = 0;
    if (ansi != nullptr)
    {
        hData = ::GlobalAlloc(GMEM_MOVEABLE, ansi->size() + 1);
        if (hData != NULL)
        {
            memcpy(::GlobalLock(hData), ansi->c_str(), ansi->size() + 1);
            ::GlobalUnlock(hData);
        }
        format = CF_TEXT;
    }
    else
    {
        hData = ::GlobalAlloc(GMEM_MOVEABLE, (wide->size() + 1) * sizeof(wchar_t));
        if (hData != NULL)
        {
            memcpy(::GlobalLock(hData), wide->c_str(), (wide->size() + 1) * sizeof(wchar_t));
            ::GlobalUnlock(hData);
        }
        format = CF_UNICODETEXT;
    }
    const bool ok = hData != NULL && ::SetClipboardData(format, hData) != NULL;
    ::CloseClipboard();
    return ok;
}

bool SetClipboardAnsi(HWND owner, const std::string& text) { return SetClipboard(owner, &text, nullptr); }
bool SetClipboardWide(HWND owner, const std::wstring& text) { return SetClipboard(owner, nullptr, &text); }

// Exposes the committed value for the tests.
class StringEdit : public KVXStringEdit
{
public:
    using KVXStringEdit::KVXStringEdit;
    std::wstring Stored() const
    {
        KVXString text;
        m_varValue.GetAs(text);
        return std::wstring((LPCTSTR)text, static_cast<size_t>(text.GetLength()));
    }
    std::wstring Committed() const
    {
        KVXString text;
        m_varCommitted.GetAs(text);
        return std::wstring((LPCTSTR)text, static_cast<size_t>(text.GetLength()));
    }
};

std::wstring Std(const KVXString& s) { return std::wstring((LPCTSTR)s, static_cast<size_t>(s.GetLength())); }

class StringEditTest : public ::testing::Test
{
protected:
    static void SetUpTestSuite() { EnsureLibraryLoaded(); }

    void SetUp() override { ASSERT_TRUE(m_dlg.Open(L"String edit")); }

    void Attach(StringEdit& edit, DWORD extraStyle = 0)
    {
        ASSERT_TRUE(edit.SubclassDlgItem(kIdEdit1, &m_dlg));
        if (extraStyle != 0)
            edit.ModifyStyle(0, extraStyle);
        m_hEdit = edit.m_hWnd;
    }

    void SetSel(int start, int end) { ::SendMessage(m_hEdit, EM_SETSEL, start, end); }
    void Paste() { ::SendMessage(m_hEdit, WM_PASTE, 0, 0); }
    std::wstring Text() const { return WindowText(m_hEdit); }

    TestDialog m_dlg;
    HWND m_hEdit = NULL;
};

TEST_F(StringEditTest, AcceptsTwoHundredFiftyFiveCharactersAndRefusesTheNext)
{
    StringEdit edit;
    Attach(edit);
    EXPECT_EQ(255, edit.GetCharacterCount());
    SendChars(m_hEdit, std::wstring(255, L'a'));
    EXPECT_EQ(255u, Text().size());
    SendChars(m_hEdit, L"b");
    EXPECT_EQ(std::wstring(255, L'a'), Text());
    // Control characters (backspace) always pass.
    SendChars(m_hEdit, L"\b");
    EXPECT_EQ(254u, Text().size());
    EXPECT_EQ(std::wstring(254, L'a'), edit.Stored());
}

TEST_F(StringEditTest, AtTheMaximumTypingOverASelectionIsRefusedPastingReplaces)
{
    StringEdit edit;
    Attach(edit);
    edit.SetCharacterCount(5);
    SendChars(m_hEdit, L"abcde");
    SetSel(2, 3);
    SendChars(m_hEdit, L"Z");
    EXPECT_EQ(L"abcde", Text());
    ASSERT_TRUE(SetClipboardAnsi(m_dlg.m_hWnd, "Z"));
    SetSel(2, 3);
    Paste();
    EXPECT_EQ(L"abZde", Text());
    EXPECT_EQ("3-3", Selection(m_hEdit));
    EXPECT_EQ(L"abZde", edit.Stored());
}

TEST_F(StringEditTest, PastingSixLettersIntoMaximumFour)
{
    StringEdit edit;
    Attach(edit);
    edit.SetCharacterCount(4);
    ASSERT_TRUE(SetClipboardAnsi(m_dlg.m_hWnd, "abcdef"));
    Paste();
    EXPECT_EQ(L"abcd", Text());
    EXPECT_EQ("4-4", Selection(m_hEdit));
    EXPECT_EQ(L"abcd", edit.Stored());
    // Full now: a further paste changes nothing, the selection included.
    SetSel(1, 1);
    Paste();
    EXPECT_EQ(L"abcd", Text());
    EXPECT_EQ("1-1", Selection(m_hEdit));
}

TEST_F(StringEditTest, CtrlVGoesThroughThePasteLimit)
{
    StringEdit edit;
    Attach(edit);
    edit.SetCharacterCount(3);
    ASSERT_TRUE(SetClipboardAnsi(m_dlg.m_hWnd, "123456"));
    {
        KeyStateGuard ctrl({ VK_CONTROL });
        ::SendMessage(m_hEdit, WM_CHAR, 0x16, 1);
    }
    EXPECT_EQ(L"123", Text());
}

TEST_F(StringEditTest, PasteInsertsEverythingVerbatimAndBackslashesCount)
{
    StringEdit edit(TRUE, FALSE);
    Attach(edit);
    edit.SetCharacterCount(6);
    ASSERT_TRUE(SetClipboardAnsi(m_dlg.m_hWnd, "a\\b\tc\\de"));
    Paste();
    EXPECT_EQ(L"a\\b\tc\\", Text());
}

TEST_F(StringEditTest, AnsiClipboardTextIsReadWithTheCodePage)
{
    StringEdit edit;
    Attach(edit);
    ASSERT_TRUE(SetClipboardAnsi(m_dlg.m_hWnd, "caf\xE9"));
    Paste();
    EXPECT_EQ(L"caf\x00E9", Text());
}

TEST_F(StringEditTest, UnicodeClipboardTextSurvives)
{
    StringEdit edit;
    Attach(edit);
    ASSERT_TRUE(SetClipboardWide(m_dlg.m_hWnd, L"\x03A9mega \x0416"));
    Paste();
    EXPECT_EQ(L"\x03A9mega \x0416", Text());
}

TEST_F(StringEditTest, ReadOnlyFieldIgnoresPaste)
{
    StringEdit edit;
    Attach(edit, 0);
    ::SendMessage(m_hEdit, EM_SETREADONLY, TRUE, 0);
    ::SetWindowTextW(m_hEdit, L"fixed");
    ASSERT_TRUE(SetClipboardAnsi(m_dlg.m_hWnd, "new"));
    SetSel(0, -1);
    Paste();
    EXPECT_EQ(L"fixed", Text());
}

TEST_F(StringEditTest, DroppedBackslashesDoNotCountWhenTyping)
{
    StringEdit edit(TRUE, FALSE);
    Attach(edit);
    edit.SetCharacterCount(3);
    SendChars(m_hEdit, L"ab\\c");   // the stray backslash will be dropped: "abc"
    EXPECT_EQ(L"ab\\c", Text());
    SendChars(m_hEdit, L"d");
    EXPECT_EQ(L"ab\\c", Text());
    // Accepted backslashes count.
    StringEdit counting;
    ASSERT_TRUE(counting.SubclassDlgItem(kIdEdit2, &m_dlg));
    counting.SetCharacterCount(3);
    SendChars(counting.m_hWnd, L"ab\\c");
    EXPECT_EQ(L"ab\\", WindowText(counting.m_hWnd));
}

struct ValueCase
{
    const char* name;
    BOOL replace;
    BOOL acceptSingle;
    const wchar_t* typed;
    const wchar_t* value;
};

const ValueCase kValueCases[] = {
    { "LineFeed", TRUE, TRUE, L"a\\nb", L"a\nb" },
    { "ReplacementOff", FALSE, TRUE, L"a\\nb", L"a\\nb" },
    { "DoubledBackslashFirst", TRUE, TRUE, L"a\\\\n", L"a\\n" },
    { "StrayKept", TRUE, TRUE, L"x\\y", L"x\\y" },
    { "StrayDropped", TRUE, FALSE, L"x\\y", L"xy" },
    { "TrailingKept", TRUE, TRUE, L"x\\", L"x\\" },
    { "TrailingDropped", TRUE, FALSE, L"x\\", L"x" },
    { "Tab", TRUE, TRUE, L"1\\t2", L"1\t2" },
};

class StringEditValue : public StringEditTest, public ::testing::WithParamInterface<ValueCase> {};

TEST_P(StringEditValue, GetValueTranslates)
{
    const ValueCase& c = GetParam();
    StringEdit edit(c.replace, c.acceptSingle);
    Attach(edit);
    ::SetWindowTextW(m_hEdit, c.typed);
    EXPECT_EQ(std::wstring(c.value), Std(edit.GetValue(FALSE)));
    // The stored text stays untranslated.
    EXPECT_EQ(std::wstring(c.typed), edit.Stored());
}

INSTANTIATE_TEST_SUITE_P(Cases, StringEditValue, ::testing::ValuesIn(kValueCases),
                         [](const ::testing::TestParamInfo<ValueCase>& info) { return std::string(info.param.name); });

struct SetValueCase
{
    const char* name;
    const wchar_t* given;
    const wchar_t* shown;
};

const SetValueCase kSetValueCases[] = {
    { "Single", L"x\\y", L"xy" },
    { "Three", L"x\\\\\\y", L"x\\\\y" },
    { "EscapeN", L"x\\ny", L"x\\ny" },
    { "ThreeThenN", L"x\\\\\\ny", L"x\\\\\\ny" },
};

class StringEditSetValue : public StringEditTest, public ::testing::WithParamInterface<SetValueCase> {};

TEST_P(StringEditSetValue, RemovesStrayBackslashes)
{
    const SetValueCase& c = GetParam();
    StringEdit edit(FALSE, FALSE);
    Attach(edit);
    EXPECT_TRUE(edit.SetValue(KVXString(c.given), FALSE));
    EXPECT_EQ(std::wstring(c.shown), Text());
    EXPECT_EQ(std::wstring(c.shown), edit.Stored());
    EXPECT_EQ(std::wstring(c.shown), Std(edit.GetValue(FALSE)));
}

INSTANTIATE_TEST_SUITE_P(Cases, StringEditSetValue, ::testing::ValuesIn(kSetValueCases),
                         [](const ::testing::TestParamInfo<SetValueCase>& info) { return std::string(info.param.name); });

TEST_F(StringEditTest, SetValueCutsThreeHundredCharacters)
{
    StringEdit edit;
    Attach(edit);
    std::wstring text;
    for (int i = 0; i < 300; ++i)
        text += static_cast<wchar_t>(L'a' + i % 26);
    EXPECT_TRUE(edit.SetValue(KVXString(text.c_str()), TRUE));
    EXPECT_EQ(text.substr(0, 255), Text());
    EXPECT_EQ(text.substr(0, 255), edit.Stored());
    EXPECT_EQ(text.substr(0, 255), edit.Committed());
    EXPECT_EQ("255-255", Selection(m_hEdit));
    // A text that fits: its last character is selected.
    edit.SetValue(KVXString(L"abc"), FALSE);
    EXPECT_EQ("2-3", Selection(m_hEdit));
    EXPECT_EQ(text.substr(0, 255), edit.Committed());
}

TEST_F(StringEditTest, SetValueAsVariantTakesOnlyText)
{
    StringEdit edit;
    Attach(edit);
    edit.SetValue(KVXString(L"keep"), TRUE);
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(42L), TRUE));
    EXPECT_FALSE(edit.SetValueAsVariant(KVXVariant(1.5), TRUE));
    EXPECT_EQ(L"keep", Text());
    EXPECT_EQ(L"keep", edit.Stored());
    EXPECT_TRUE(edit.SetValueAsVariant(KVXVariant(KVXString(L"new")), FALSE));
    EXPECT_EQ(L"new", Text());
    EXPECT_EQ(L"keep", edit.Committed());
}

TEST_F(StringEditTest, CommitAndModified)
{
    StringEdit edit;
    Attach(edit);
    edit.SetValue(KVXString(L"one"), TRUE);
    EXPECT_FALSE(edit.GetModified());
    ::SetWindowTextW(m_hEdit, L"two");
    EXPECT_TRUE(edit.GetModified());
    EXPECT_EQ(L"two", Std(edit.GetValue(TRUE)));
    EXPECT_FALSE(edit.GetModified());
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
