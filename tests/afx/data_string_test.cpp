// CString, as tables of expressions and their results:
// - layout (one pointer), copy-on-write independence of copies, locked buffers;
// - construction from every source, Mid/Left/Right clamping, Span*, Trim (blank, char, set),
//   Find/ReverseFind/FindOneOf, Replace (growing, shrinking, self-referencing), Remove,
//   Insert, Delete, case, Format (%s wide, %S narrow, growth past any fixed buffer, itself
//   as argument), concatenation and comparison operators;
// - GetBuffer/ReleaseBuffer/GetBufferSetLength/FreeExtra, BSTR conversion, LoadString of a
//   missing id.
#include <gtest/gtest.h>
#include <afx.h>

#include "AfxTestSupport.h"

#include <string>

namespace {

using afx_test::W;

TEST(CStringLayout, OnePointerCopiesShareUntilOneWritesLockedBuffersAreNeverShared)
{
    EXPECT_EQ(sizeof(void*), sizeof(CString));
    EXPECT_EQ(0, ((LPCTSTR)CString())[0]);
    CString a(L"shared text");
    CString b(a), c;
    c = a;
    EXPECT_EQ((LPCTSTR)a, (LPCTSTR)b) << "a copy shares the buffer";
    b.SetAt(0, L'S');
    c += L"!";
    a.MakeUpper();
    EXPECT_EQ(L"SHARED TEXT", W(a));
    EXPECT_EQ(L"Shared text", W(b));
    EXPECT_EQ(L"shared text!", W(c));
    CString d(a);
    d.GetBuffer(0)[0] = L'x';
    d.ReleaseBuffer();
    EXPECT_EQ(L"SHARED TEXT", W(a)) << "GetBuffer detaches a shared buffer";
    EXPECT_EQ(L"xHARED TEXT", W(d));

    CString locked(L"locked");
    LPTSTR p = locked.LockBuffer();
    CString copy(locked);
    EXPECT_NE((LPCTSTR)locked, (LPCTSTR)copy);
    p[0] = L'L';
    EXPECT_EQ(L"locked", W(copy));
    locked.UnlockBuffer();
    EXPECT_EQ((LPCTSTR)locked, (LPCTSTR)CString(locked));
    locked.SetAt(6, L'X');   // out of range: ignored
    locked.SetAt(-1, L'X');
    EXPECT_EQ(L"Locked", W(locked));
}

struct TextCase
{
    const char* name;
    CString (*make)();
    const wchar_t* expected;
};

// Each expression is evaluated on fresh strings; the name says what it shows.
const TextCase kTextCases[] = {
    { "NarrowSource", [] { return CString("abc"); }, L"abc" },
    { "Repeated", [] { return CString(L'x', 4); }, L"xxxx" },
    { "NegativeRepeat", [] { return CString(L'x', -3); }, L"" },
    { "WideCounted", [] { return CString(L"abcdef", 2); }, L"ab" },
    { "NarrowCounted", [] { return CString("abcdef", 2); }, L"ab" },
    { "NullWide", [] { return CString((LPCWSTR)NULL); }, L"" },
    { "NullNarrowCounted", [] { return CString((LPCWSTR)NULL, 5); }, L"" },
    { "Codepage1252", [] { return CString("\xE4\x80"); }, L"\x00E4\x20AC" },
    { "MidInside", [] { return CString(L"abcdef").Mid(1, 3); }, L"bcd" },
    { "MidCountPastEnd", [] { return CString(L"abcdef").Mid(4, 100); }, L"ef" },
    { "MidFirstPastEnd", [] { return CString(L"abcdef").Mid(10, 2); }, L"" },
    { "MidNegativeFirst", [] { return CString(L"abcdef").Mid(-2, 3); }, L"abc" },
    { "MidNegativeCount", [] { return CString(L"abcdef").Mid(1, -1); }, L"" },
    { "MidHugeCount", [] { return CString(L"abcdef").Mid(2, 0x7FFFFFFF); }, L"cdef" },
    { "MidToEndPastEnd", [] { return CString(L"abcdef").Mid(6); }, L"" },
    { "LeftPastEnd", [] { return CString(L"abcdef").Left(9); }, L"abcdef" },
    { "LeftNegative", [] { return CString(L"abcdef").Left(-1); }, L"" },
    { "RightInside", [] { return CString(L"abcdef").Right(2); }, L"ef" },
    { "RightNegative", [] { return CString(L"abcdef").Right(-4); }, L"" },
    { "SpanIncluding", [] { return CString(L"1234abc56").SpanIncluding(L"0123456789"); }, L"1234" },
    { "SpanIncludingNone", [] { return CString(L"1234abc56").SpanIncluding(L"abc"); }, L"" },
    { "SpanExcluding", [] { return CString(L"1234abc56").SpanExcluding(L"cba"); }, L"1234" },
    { "SpanExcludingAll", [] { return CString(L"1234").SpanExcluding(L"xyz"); }, L"1234" },
    { "TrimLeftBlanks", [] { CString s(L" \t\r\n ab c \n"); s.TrimLeft(); return s; }, L"ab c \n" },
    { "TrimRightBlanks", [] { CString s(L" \t\r\n ab c \n"); s.TrimRight(); return s; }, L" \t\r\n ab c" },
    { "TrimAllBlanks", [] { CString s(L"  \t "); s.TrimLeft(); return s; }, L"" },
    { "TrimLeftChar", [] { CString s(L"xxaxbxx"); s.TrimLeft(L'x'); return s; }, L"axbxx" },
    { "TrimRightChar", [] { CString s(L"xxaxbxx"); s.TrimRight(L'x'); return s; }, L"xxaxb" },
    { "TrimLeftSet", [] { CString s(L"-+-a+b-+"); s.TrimLeft(L"+-"); return s; }, L"a+b-+" },
    { "TrimRightSet", [] { CString s(L"-+-a+b-+"); s.TrimRight(L"+-"); return s; }, L"-+-a+b" },
    { "TrimEmptySet", [] { CString s(L" a "); s.TrimLeft(L""); return s; }, L" a " },
    { "TrimSetRemovesAll", [] { CString s(L"+-+"); s.TrimRight(L"-+"); return s; }, L"" },
    { "ReplaceShrinks", [] { CString s(L"a--b--c"); s.Replace(L"--", L"-"); return s; }, L"a-b-c" },
    { "ReplaceGrows", [] { CString s(L"a-b-c"); s.Replace(L"-", L"<->"); return s; }, L"a<->b<->c" },
    { "ReplaceToEmpty", [] { CString s(L"xaxbx"); s.Replace(L"x", L""); return s; }, L"ab" },
    { "ReplaceNonOverlapping", [] { CString s(L"aaaa"); s.Replace(L"aa", L"b"); return s; }, L"bb" },
    { "ReplaceNewContainsOld", [] { CString s(L"ab"); s.Replace(L"a", L"aa"); return s; }, L"aab" },
    { "ReplaceNullNew", [] { CString s(L"a.b"); s.Replace(L".", NULL); return s; }, L"ab" },
    { "ReplaceFromOwnBuffer", [] { CString t(L"xyxy"); LPCTSTR p = t; t.Replace(p + 2, p + 1); return t; }, L"yxyyxy" },
    { "ReplaceChar", [] { CString s(L"a,b,c"); s.Replace(L',', L';'); return s; }, L"a;b;c" },
    { "ReplaceLeavesCopies", [] { CString s(L"a.b"), t(s); s.Replace(L".", L"!"); return t; }, L"a.b" },
    { "Remove", [] { CString s(L"a-b--c-"); s.Remove(L'-'); return s; }, L"abc" },
    { "InsertPastEndAndNegative", [] { CString s(L"abc"); s.Insert(100, L"<<"); s.Insert(-5, L'['); return s; },
      L"[abc<<" },
    { "DeleteClamped", [] { CString s(L"]>abc<<"); s.Delete(4, 100); s.Delete(10, 1); s.Delete(-3, 2); return s; },
      L"ab" },
    { "CaseAndReverse", [] { CString s(L"He\x00E4"); s.MakeUpper(); s += L"|"; s.MakeReverse(); return s; },
      L"|\x00C4" L"EH" },
    { "FormatWideAndNarrow", [] { CString s; s.Format(L"%s|%S|%5.2f|%c|%x", L"w", "n", 3.14159, L'Z', 255); return s; },
      L"w|n| 3.14|Z|ff" },
    { "FormatLengthPrefixes", [] { CString s; s.Format(L"%ls|%hs|%I64d", L"w", "n", -1234567890123LL); return s; },
      L"w|n|-1234567890123" },
    { "FormatItselfAsArgument", [] { CString s(L"abc"); s.Format(L"%s%s", (LPCTSTR)s, (LPCTSTR)s); return s; },
      L"abcabc" },
    { "FormatNull", [] { CString s(L"x"); s.Format((LPCTSTR)NULL); return s; }, L"" },
    { "FormatMessage", [] { CString s; s.FormatMessage(L"%1 and %2!d!", L"one", 2); return s; }, L"one and 2" },
    { "Concatenations", [] { CString a(L"ab"); return L'x' + a + L'y' + L"!" + 'z' + CString(L"cd"); }, L"xaby!zcd" },
    { "AppendItself", [] { CString s(L"ab"); s += 'c'; s += s; return s; }, L"abcabc" },
    { "AssignFromOwnBuffer", [] { CString s(L"0123456"); s = (LPCTSTR)s + 4; return s; }, L"456" },
    { "SelfAssignment", [] { CString s(L"same"); s = s; return s; }, L"same" },
    { "LoadStringOfMissingIdEmpties", [] { CString s(L"previous"); s.LoadString(0xFFF0); return s; }, L"" },
    { "ResourceConstructorOfMissingId", [] { return CString(MAKEINTRESOURCE(0xFFF1)); }, L"" },
};

TEST(CStringTexts, Expressions)
{
    for (const TextCase& c : kTextCases)
        EXPECT_EQ(std::wstring(c.expected), W(c.make())) << c.name;
}

struct NumberCase
{
    const char* name;
    int (*eval)();
    int expected;
};

const NumberCase kNumberCases[] = {
    { "FindChar", [] { return CString(L"abcabc").Find(L'b'); }, 1 },
    { "FindCharFromStart", [] { return CString(L"abcabc").Find(L'b', 2); }, 4 },
    { "FindCharStartPastEnd", [] { return CString(L"abcabc").Find(L'b', 10); }, -1 },
    { "FindCharNegativeStart", [] { return CString(L"abcabc").Find(L'a', -5); }, 0 },
    { "FindString", [] { return CString(L"abcabc").Find(L"ca"); }, 2 },
    { "FindStringAtStartIndex", [] { return CString(L"abcabc").Find(L"abc", 3); }, 3 },
    { "FindStringStartAtLength", [] { return CString(L"abcabc").Find(L"c", 6); }, -1 },
    { "FindLongerThanText", [] { return CString(L"ab").Find(L"abc"); }, -1 },
    { "FindNull", [] { return CString(L"ab").Find((LPCTSTR)NULL); }, -1 },
    { "ReverseFind", [] { return CString(L"a.b.c").ReverseFind(L'.'); }, 3 },
    { "ReverseFindInEmpty", [] { return CString().ReverseFind(L'a'); }, -1 },
    { "FindOneOf", [] { return CString(L"a.b.c").FindOneOf(L"x.c"); }, 1 },
    { "FindOneOfEmptySet", [] { return CString(L"a.b.c").FindOneOf(L""); }, -1 },
    { "ReplaceCount", [] { CString s(L"a--b--c"); return s.Replace(L"--", L"-"); }, 2 },
    { "ReplaceEmptyOldIgnored", [] { CString s(L"abc"); return s.Replace(L"", L"x"); }, 0 },
    { "ReplaceSameChar", [] { CString s(L"a;b"); return s.Replace(L';', L';'); }, 0 },
    { "RemoveCount", [] { CString s(L"a-b--c-"); return s.Remove(L'-'); }, 4 },
    { "InsertReturnsLength", [] { CString s(L"abc"); return s.Insert(3, L""); }, 3 },
    { "DeleteNegativeCount", [] { CString s(L"abcd"); return s.Delete(1, -1); }, 4 },
    { "CompareOrdinal", [] { return int(CString(L"apple").Compare(L"Apple") > 0); }, 1 },
    { "CompareNoCase", [] { return CString(L"apple").CompareNoCase(L"APPLE"); }, 0 },
    { "CompareNoCaseOrder", [] { return int(CString(L"apple").CompareNoCase(L"banana") < 0); }, 1 },
    { "CollateNoCase", [] { return CString(L"apple").CollateNoCase(L"APPLE"); }, 0 },
    { "CompareWithNull", [] { return int(CString(L"apple").Compare(NULL) > 0); }, 1 },
};

TEST(CStringNumbers, Expressions)
{
    for (const NumberCase& c : kNumberCases)
        EXPECT_EQ(c.expected, c.eval()) << c.name;
}

// The six relations as one string, "==" first, each 1 or 0.
template<class A, class B>
std::string Relations(const A& a, const B& b)
{
    return std::string() + char('0' + (a == b)) + char('0' + (a != b)) + char('0' + (a < b)) + char('0' + (a > b))
        + char('0' + (a <= b)) + char('0' + (a >= b));
}

TEST(CStringOperators, ComparisonsAreOrdinal)
{
    CString apple(L"apple"), banana(L"Banana");
    //                == != <  >  <= >=
    EXPECT_EQ("100011", Relations(apple, L"apple"));
    EXPECT_EQ("100011", Relations(L"apple", apple));
    EXPECT_EQ("010101", Relations(apple, banana)) << "'B' sorts before 'a'";
    EXPECT_EQ("011010", Relations((LPCTSTR)banana, apple));
}

TEST(CStringFormat, GrowsPastAnyFixedBuffer)
{
    const std::wstring big(100000, L'q');
    CString s;
    s.Format(L"<%s>", big.c_str());
    ASSERT_EQ(100002, s.GetLength());
    EXPECT_EQ(L'q', s[50000]);
    EXPECT_EQ(L'>', s[100001]);
    s.Format(L"%-70000d|", 7);
    EXPECT_EQ(70001, s.GetLength());
    EXPECT_EQ(L"|", W(s.Right(1)));
}

TEST(CStringBuffer, GetBufferReleaseBufferFreeExtraAndSysStrings)
{
    CString s;
    LPTSTR p = s.GetBuffer(10);
    EXPECT_GE(s.GetAllocLength(), 10);
    wcscpy(p, L"hello");
    s.ReleaseBuffer();
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
    t.FreeExtra();
    EXPECT_EQ(3, t.GetAllocLength());
    EXPECT_EQ(L"012", W(t));

    BSTR b = CString(L"bstr text").AllocSysString();
    EXPECT_EQ(9u, SysStringLen(b));
    EXPECT_EQ(b, CString(L"other").SetSysString(&b));
    EXPECT_EQ(L"other", std::wstring(b));
    SysFreeString(b);
    CString u(L"previous");
    u.Format(0xFFF2, 1, 2);
    EXPECT_EQ(L"", W(u)) << "a missing format resource";
    EXPECT_FALSE(CString().LoadString(0xFFF0));
}

} // namespace
