// CString: covers
// - layout (one pointer), copy-on-write independence of copies, locked buffers
// - Mid/Left/Right clamping, Span*, Trim (blank, char, set), Find/ReverseFind/FindOneOf
// - Replace (char, string, growing, shrinking, self-referencing), Remove, Insert, Delete
// - Format: %s wide, %S narrow, growth past any fixed buffer, self as argument
// - GetBuffer/ReleaseBuffer/GetBufferSetLength/FreeExtra, BSTR conversion
// - comparisons, concatenation operators, ANSI conversion, LoadString of a missing id
#include <gtest/gtest.h>
#include <afx.h>
#include <string>

namespace {

std::wstring W(const CString& s)
{
    return std::wstring((LPCTSTR)s, (size_t)s.GetLength());
}

} // namespace

TEST(CStringLayout, IsOnePointerAndEmptyByDefault)
{
    EXPECT_EQ(sizeof(void*), sizeof(CString));
    CString s;
    EXPECT_EQ(0, s.GetLength());
    EXPECT_TRUE(s.IsEmpty());
    EXPECT_EQ(L"", W(s));
    EXPECT_EQ(0, ((LPCTSTR)s)[0]);
}

TEST(CStringConstruct, FromEveryKindOfSource)
{
    EXPECT_EQ(L"abc", W(CString(L"abc")));
    EXPECT_EQ(L"abc", W(CString("abc")));
    EXPECT_EQ(L"xxxx", W(CString(L'x', 4)));
    EXPECT_EQ(L"", W(CString(L'x', 0)));
    EXPECT_EQ(L"", W(CString(L'x', -3)));
    EXPECT_EQ(L"ab", W(CString(L"abcdef", 2)));
    EXPECT_EQ(L"ab", W(CString("abcdef", 2)));
    EXPECT_EQ(L"", W(CString((LPCWSTR)NULL)));
    EXPECT_EQ(L"", W(CString((LPCSTR)NULL)));
    EXPECT_EQ(L"", W(CString((LPCWSTR)NULL, 5)));
    // cp1252: 0xE4 is a-umlaut, 0x80 the euro sign
    EXPECT_EQ(std::wstring(L"\x00E4\x20AC"), W(CString("\xE4\x80")));
}

TEST(CStringCopyOnWrite, CopiesShareUntilOneWrites)
{
    CString a(L"shared text");
    CString b(a);
    CString c;
    c = a;
    EXPECT_EQ((LPCTSTR)a, (LPCTSTR)b) << "a copy shares the buffer";
    EXPECT_EQ((LPCTSTR)a, (LPCTSTR)c);

    b.SetAt(0, L'S');
    c += L"!";
    a.MakeUpper();
    EXPECT_EQ(L"SHARED TEXT", W(a));
    EXPECT_EQ(L"Shared text", W(b));
    EXPECT_EQ(L"shared text!", W(c));

    CString d(a);
    LPTSTR p = d.GetBuffer(0);
    p[0] = L'x';
    d.ReleaseBuffer();
    EXPECT_EQ(L"SHARED TEXT", W(a)) << "GetBuffer detaches a shared buffer";
    EXPECT_EQ(L"xHARED TEXT", W(d));
}

TEST(CStringCopyOnWrite, LockedBufferIsNeverShared)
{
    CString a(L"locked");
    LPTSTR p = a.LockBuffer();
    CString b(a);
    EXPECT_NE((LPCTSTR)a, (LPCTSTR)b);
    p[0] = L'L';
    EXPECT_EQ(L"Locked", W(a));
    EXPECT_EQ(L"locked", W(b));
    a.UnlockBuffer();
    CString c(a);
    EXPECT_EQ((LPCTSTR)a, (LPCTSTR)c);
}

TEST(CStringAccess, GetAtSetAtAndIndexing)
{
    CString s(L"abc");
    EXPECT_EQ(L'b', s.GetAt(1));
    EXPECT_EQ(L'c', s[2]);
    s.SetAt(1, L'B');
    EXPECT_EQ(L"aBc", W(s));
    s.SetAt(3, L'X');   // out of range: ignored
    s.SetAt(-1, L'X');
    EXPECT_EQ(L"aBc", W(s));
}

// ---------------------------------------------------------------------------
// Extraction with clamping

struct ExtractCase
{
    const char* name;
    const wchar_t* text;
    char op;            // 'M' Mid(first, count), 'm' Mid(first), 'L' Left, 'R' Right
    int first;
    int count;
    const wchar_t* expected;
};

const ExtractCase kExtractCases[] = {
    { "MidInside", L"abcdef", 'M', 1, 3, L"bcd" },
    { "MidCountPastEnd", L"abcdef", 'M', 4, 100, L"ef" },
    { "MidFirstPastEnd", L"abcdef", 'M', 10, 2, L"" },
    { "MidNegativeFirst", L"abcdef", 'M', -2, 3, L"abc" },
    { "MidNegativeCount", L"abcdef", 'M', 1, -1, L"" },
    { "MidHugeCount", L"abcdef", 'M', 2, 0x7FFFFFFF, L"cdef" },
    { "MidToEnd", L"abcdef", 'm', 3, 0, L"def" },
    { "MidToEndPastEnd", L"abcdef", 'm', 6, 0, L"" },
    { "MidOfEmpty", L"", 'M', 0, 5, L"" },
    { "LeftInside", L"abcdef", 'L', 2, 0, L"ab" },
    { "LeftPastEnd", L"abcdef", 'L', 9, 0, L"abcdef" },
    { "LeftNegative", L"abcdef", 'L', -1, 0, L"" },
    { "RightInside", L"abcdef", 'R', 2, 0, L"ef" },
    { "RightPastEnd", L"abcdef", 'R', 9, 0, L"abcdef" },
    { "RightNegative", L"abcdef", 'R', -4, 0, L"" },
};

class CStringExtract : public testing::TestWithParam<ExtractCase> {};

TEST_P(CStringExtract, ClampsToTheString)
{
    const ExtractCase& c = GetParam();
    CString s(c.text);
    CString r;
    switch (c.op)
    {
    case 'M': r = s.Mid(c.first, c.count); break;
    case 'm': r = s.Mid(c.first); break;
    case 'L': r = s.Left(c.first); break;
    case 'R': r = s.Right(c.first); break;
    }
    EXPECT_EQ(std::wstring(c.expected), W(r));
    EXPECT_EQ(std::wstring(c.text), W(s)) << "the source is unchanged";
}

INSTANTIATE_TEST_SUITE_P(Cases, CStringExtract, testing::ValuesIn(kExtractCases),
    [](const testing::TestParamInfo<ExtractCase>& info) { return std::string(info.param.name); });

TEST(CStringExtract, SpanIncludingAndExcluding)
{
    CString s(L"1234abc56");
    EXPECT_EQ(L"1234", W(s.SpanIncluding(L"0123456789")));
    EXPECT_EQ(L"", W(s.SpanIncluding(L"abc")));
    EXPECT_EQ(L"1234", W(s.SpanExcluding(L"cba")));
    EXPECT_EQ(L"1234abc56", W(s.SpanExcluding(L"xyz")));
    EXPECT_EQ(L"", W(s.SpanIncluding(L"")));
}

// ---------------------------------------------------------------------------
// Trimming

struct TrimCase
{
    const char* name;
    const wchar_t* text;
    int kind;               // 0 blanks, 1 one char, 2 char set
    const wchar_t* target;  // char (first) or set
    const wchar_t* left;    // result of TrimLeft
    const wchar_t* right;   // result of TrimRight
};

const TrimCase kTrimCases[] = {
    { "Blanks", L" \t\r\n ab c \n", 0, L"", L"ab c \n", L" \t\r\n ab c" },
    { "AllBlanks", L"  \t ", 0, L"", L"", L"" },
    { "NoBlanks", L"abc", 0, L"", L"abc", L"abc" },
    { "Empty", L"", 0, L"", L"", L"" },
    { "OneChar", L"xxaxbxx", 1, L"x", L"axbxx", L"xxaxb" },
    { "OneCharNotThere", L"abc", 1, L"x", L"abc", L"abc" },
    { "Set", L"-+-a+b-+", 2, L"+-", L"a+b-+", L"-+-a+b" },
    { "EmptySet", L" a ", 2, L"", L" a ", L" a " },
    { "SetRemovesAll", L"+-+", 2, L"-+", L"", L"" },
};

class CStringTrim : public testing::TestWithParam<TrimCase> {};

TEST_P(CStringTrim, LeftAndRight)
{
    const TrimCase& c = GetParam();
    CString l(c.text), r(c.text);
    switch (c.kind)
    {
    case 0: l.TrimLeft(); r.TrimRight(); break;
    case 1: l.TrimLeft(c.target[0]); r.TrimRight(c.target[0]); break;
    case 2: l.TrimLeft(c.target); r.TrimRight(c.target); break;
    }
    EXPECT_EQ(std::wstring(c.left), W(l));
    EXPECT_EQ(std::wstring(c.right), W(r));
}

INSTANTIATE_TEST_SUITE_P(Cases, CStringTrim, testing::ValuesIn(kTrimCases),
    [](const testing::TestParamInfo<TrimCase>& info) { return std::string(info.param.name); });

// ---------------------------------------------------------------------------
// Searching

struct FindCase
{
    const char* name;
    const wchar_t* text;
    const wchar_t* sub;     // one character when isChar
    bool isChar;
    int start;              // -100: the overload without start
    int expected;
};

const FindCase kFindCases[] = {
    { "CharFirst", L"abcabc", L"b", true, -100, 1 },
    { "CharFromStart", L"abcabc", L"b", true, 2, 4 },
    { "CharStartPastEnd", L"abcabc", L"b", true, 10, -1 },
    { "CharNegativeStart", L"abcabc", L"a", true, -5, 0 },
    { "CharMissing", L"abcabc", L"z", true, -100, -1 },
    { "StringFirst", L"abcabc", L"ca", false, -100, 2 },
    { "StringFromStart", L"abcabc", L"bc", false, 2, 4 },
    { "StringAtStartIndex", L"abcabc", L"abc", false, 3, 3 },
    { "StringStartAtLength", L"abcabc", L"c", false, 6, -1 },
    { "StringStartPastEnd", L"abcabc", L"c", false, 7, -1 },
    { "StringLongerThanText", L"ab", L"abc", false, -100, -1 },
    { "StringInEmpty", L"", L"a", false, -100, -1 },
};

class CStringFind : public testing::TestWithParam<FindCase> {};

TEST_P(CStringFind, FindsFirstOccurrenceFromStart)
{
    const FindCase& c = GetParam();
    CString s(c.text);
    int n;
    if (c.isChar)
        n = (c.start == -100) ? s.Find(c.sub[0]) : s.Find(c.sub[0], c.start);
    else
        n = (c.start == -100) ? s.Find(c.sub) : s.Find(c.sub, c.start);
    EXPECT_EQ(c.expected, n);
}

INSTANTIATE_TEST_SUITE_P(Cases, CStringFind, testing::ValuesIn(kFindCases),
    [](const testing::TestParamInfo<FindCase>& info) { return std::string(info.param.name); });

TEST(CStringFind, ReverseFindAndFindOneOf)
{
    CString s(L"a.b.c");
    EXPECT_EQ(3, s.ReverseFind(L'.'));
    EXPECT_EQ(-1, s.ReverseFind(L'x'));
    EXPECT_EQ(1, s.FindOneOf(L"x.c"));
    EXPECT_EQ(-1, s.FindOneOf(L"xyz"));
    EXPECT_EQ(-1, s.FindOneOf(L""));
    EXPECT_EQ(-1, CString().ReverseFind(L'a'));
    EXPECT_EQ(-1, s.Find((LPCTSTR)NULL));
}

// ---------------------------------------------------------------------------
// Modification

struct ReplaceCase
{
    const char* name;
    const wchar_t* text;
    const wchar_t* oldText;
    const wchar_t* newText;
    int count;
    const wchar_t* expected;
};

const ReplaceCase kReplaceCases[] = {
    { "Shrinks", L"a--b--c", L"--", L"-", 2, L"a-b-c" },
    { "Grows", L"a-b-c", L"-", L"<->", 2, L"a<->b<->c" },
    { "ToEmpty", L"xaxbx", L"x", L"", 3, L"ab" },
    { "WholeString", L"abc", L"abc", L"", 1, L"" },
    { "NotFound", L"abc", L"z", L"y", 0, L"abc" },
    { "NonOverlapping", L"aaaa", L"aa", L"b", 2, L"bb" },
    { "EmptyOldIgnored", L"abc", L"", L"x", 0, L"abc" },
    { "NewContainsOld", L"ab", L"a", L"aa", 1, L"aab" },
    { "NullNew", L"a.b", L".", NULL, 1, L"ab" },
};

class CStringReplace : public testing::TestWithParam<ReplaceCase> {};

TEST_P(CStringReplace, ReplacesEveryOccurrence)
{
    const ReplaceCase& c = GetParam();
    CString s(c.text);
    CString copy(s);
    EXPECT_EQ(c.count, s.Replace(c.oldText, c.newText));
    EXPECT_EQ(std::wstring(c.expected), W(s));
    EXPECT_EQ(std::wstring(c.text), W(copy)) << "a shared copy is not modified";
}

INSTANTIATE_TEST_SUITE_P(Cases, CStringReplace, testing::ValuesIn(kReplaceCases),
    [](const testing::TestParamInfo<ReplaceCase>& info) { return std::string(info.param.name); });

TEST(CStringReplace, CharAndArgumentsInsideTheString)
{
    CString s(L"a,b,c");
    EXPECT_EQ(2, s.Replace(L',', L';'));
    EXPECT_EQ(L"a;b;c", W(s));
    EXPECT_EQ(0, s.Replace(L';', L';'));

    // Old and new text taken from the string's own buffer.
    CString t(L"xyxy");
    LPCTSTR p = t;
    EXPECT_EQ(2, t.Replace(p + 2, p + 1));   // "xy" -> "yxy"
    EXPECT_EQ(L"yxyyxy", W(t));
}

TEST(CStringModify, RemoveInsertDelete)
{
    CString s(L"a-b--c-");
    EXPECT_EQ(4, s.Remove(L'-'));
    EXPECT_EQ(L"abc", W(s));
    EXPECT_EQ(0, s.Remove(L'-'));

    EXPECT_EQ(4, s.Insert(0, L'>'));
    EXPECT_EQ(L">abc", W(s));
    EXPECT_EQ(6, s.Insert(100, L"<<"));
    EXPECT_EQ(L">abc<<", W(s));
    EXPECT_EQ(8, s.Insert(-5, L"[]"));
    EXPECT_EQ(L"[]>abc<<", W(s));
    EXPECT_EQ(8, s.Insert(3, L""));

    EXPECT_EQ(7, s.Delete(0));
    EXPECT_EQ(L"]>abc<<", W(s));
    EXPECT_EQ(4, s.Delete(4, 100));
    EXPECT_EQ(L"]>ab", W(s));
    EXPECT_EQ(4, s.Delete(10, 1));
    EXPECT_EQ(4, s.Delete(1, -1));
    EXPECT_EQ(2, s.Delete(-3, 2));
    EXPECT_EQ(L"ab", W(s));
}

TEST(CStringModify, CaseAndReverse)
{
    CString s(L"Hello \x00E4 World");
    CString t(s);
    s.MakeUpper();
    EXPECT_EQ(L"HELLO \x00C4 WORLD", W(s));
    s.MakeLower();
    EXPECT_EQ(L"hello \x00E4 world", W(s));
    s.MakeReverse();
    EXPECT_EQ(L"dlrow \x00E4 olleh", W(s));
    EXPECT_EQ(L"Hello \x00E4 World", W(t));
}

// ---------------------------------------------------------------------------
// Formatting

TEST(CStringFormat, WideAndNarrowStringConversions)
{
    CString s;
    s.Format(L"%s|%S|%d|%5.2f|%c|%x", L"wide", "narrow", -42, 3.14159, L'Z', 255);
    EXPECT_EQ(L"wide|narrow|-42| 3.14|Z|ff", W(s));
    s.Format(L"%ls|%hs|%I64d|%lld", L"w", "n", (__int64)-1234567890123LL, 9876543210LL);
    EXPECT_EQ(L"w|n|-1234567890123|9876543210", W(s));
}

TEST(CStringFormat, GrowsPastAnyFixedBuffer)
{
    std::wstring big(100000, L'q');
    CString s;
    s.Format(L"<%s>", big.c_str());
    ASSERT_EQ(100002, s.GetLength());
    EXPECT_EQ(L'<', s[0]);
    EXPECT_EQ(L'q', s[50000]);
    EXPECT_EQ(L'>', s[100001]);

    s.Format(L"%-70000d|", 7);
    EXPECT_EQ(70001, s.GetLength());
    EXPECT_EQ(L"7", W(s.Left(1)));
    EXPECT_EQ(L"|", W(s.Right(1)));
}

TEST(CStringFormat, ItselfAsArgumentAndEmptyResult)
{
    CString s(L"abc");
    s.Format(L"%s%s", (LPCTSTR)s, (LPCTSTR)s);
    EXPECT_EQ(L"abcabc", W(s));
    s.Format(L"%s", L"");
    EXPECT_EQ(L"", W(s));
    s.Format((LPCTSTR)NULL);
    EXPECT_EQ(L"", W(s));
}

TEST(CStringFormat, FormatMessageInsertsArguments)
{
    CString s;
    s.FormatMessage(L"%1 and %2!d!", L"one", 2);
    EXPECT_EQ(L"one and 2", W(s));
}

// ---------------------------------------------------------------------------
// Buffers

TEST(CStringBuffer, GetBufferReleaseBuffer)
{
    CString s;
    LPTSTR p = s.GetBuffer(10);
    ASSERT_NE(nullptr, p);
    EXPECT_GE(s.GetAllocLength(), 10);
    wcscpy(p, L"hello");
    s.ReleaseBuffer();
    EXPECT_EQ(5, s.GetLength());
    EXPECT_EQ(L"hello", W(s));

    p = s.GetBuffer(3);   // smaller than the contents: contents are kept
    EXPECT_EQ(L"hello", std::wstring(p));
    s.ReleaseBuffer(2);
    EXPECT_EQ(L"he", W(s));

    p = s.GetBufferSetLength(4);
    p[2] = L'y';
    p[3] = L'!';
    s.ReleaseBuffer(4);
    EXPECT_EQ(L"hey!", W(s));

    s.ReleaseBuffer(1000);   // clamped to the buffer
    EXPECT_LE(s.GetLength(), s.GetAllocLength());

    CString t(L"0123456789");
    t.GetBuffer(100);
    t.ReleaseBuffer(3);
    EXPECT_GE(t.GetAllocLength(), 100);
    t.FreeExtra();
    EXPECT_EQ(3, t.GetAllocLength());
    EXPECT_EQ(L"012", W(t));
}

TEST(CStringBuffer, SysStrings)
{
    CString s(L"bstr text");
    BSTR b = s.AllocSysString();
    ASSERT_NE(nullptr, b);
    EXPECT_EQ(9u, SysStringLen(b));
    EXPECT_EQ(L"bstr text", std::wstring(b));
    CString t(L"other");
    BSTR b2 = t.SetSysString(&b);
    EXPECT_EQ(b, b2);
    EXPECT_EQ(L"other", std::wstring(b));
    SysFreeString(b);
}

// ---------------------------------------------------------------------------
// Operators

TEST(CStringOperators, ConcatenationAndAssignment)
{
    CString a(L"ab");
    EXPECT_EQ(L"abcd", W(a + CString(L"cd")));
    EXPECT_EQ(L"abx", W(a + L'x'));
    EXPECT_EQ(L"xab", W(L'x' + a));
    EXPECT_EQ(L"ab!", W(a + L"!"));
    EXPECT_EQ(L"!ab", W(L"!" + a));
    EXPECT_EQ(L"aby", W(a + 'y'));

    CString s;
    s = 'c';
    EXPECT_EQ(L"c", W(s));
    s = "narrow";
    EXPECT_EQ(L"narrow", W(s));
    s += L'-';
    s += 'n';
    s += L"x";
    s += CString(L"yz");
    EXPECT_EQ(L"narrow-nxyz", W(s));
    s += s;
    EXPECT_EQ(L"narrow-nxyznarrow-nxyz", W(s));
    s = (LPCTSTR)s + 7;   // assign from a pointer into its own buffer
    EXPECT_EQ(L"nxyznarrow-nxyz", W(s));
    s = s;
    EXPECT_EQ(L"nxyznarrow-nxyz", W(s));
    s.Empty();
    EXPECT_EQ(0, s.GetLength());
}

// The six relations as one string, "==" first, each 1 or 0.
template<class A, class B>
std::string Relations(const A& a, const B& b)
{
    std::string r;
    r += (a == b) ? '1' : '0';
    r += (a != b) ? '1' : '0';
    r += (a < b) ? '1' : '0';
    r += (a > b) ? '1' : '0';
    r += (a <= b) ? '1' : '0';
    r += (a >= b) ? '1' : '0';
    return r;
}

TEST(CStringOperators, Comparisons)
{
    CString apple(L"apple"), banana(L"Banana");
    //                == != <  >  <= >=
    EXPECT_EQ("100011", Relations(apple, CString(L"apple")));
    EXPECT_EQ("100011", Relations(apple, L"apple"));
    EXPECT_EQ("100011", Relations(L"apple", apple));
    EXPECT_EQ("010101", Relations(apple, banana)) << "ordinal: 'B' sorts before 'a'";
    EXPECT_EQ("010101", Relations(apple, (LPCTSTR)banana));
    EXPECT_EQ("011010", Relations((LPCTSTR)banana, apple));

    EXPECT_LT(0, apple.Compare(L"Apple"));
    EXPECT_EQ(0, apple.CompareNoCase(L"APPLE"));
    EXPECT_GT(0, apple.CompareNoCase(L"banana"));
    EXPECT_EQ(0, apple.Collate(L"apple"));
    EXPECT_EQ(0, apple.CollateNoCase(L"APPLE"));
    EXPECT_LT(0, apple.Compare(NULL));
}

TEST(CStringResource, LoadStringOfMissingIdFailsAndEmpties)
{
    CString s(L"previous");
    EXPECT_FALSE(s.LoadString(0xFFF0));
    EXPECT_EQ(L"", W(s));
    CString t(MAKEINTRESOURCE(0xFFF1));
    EXPECT_EQ(L"", W(t));
    CString u(L"previous");
    u.Format(0xFFF2, 1, 2);
    EXPECT_EQ(L"", W(u));
}
