// Collections: covers
// - CArray insertion/removal at the edges and in the middle, growth with a grow-by,
//   element construction/destruction counts (no leak, no double destruction),
//   arguments that alias an element, out-of-range indexes throwing
// - CList insertion/removal at head, tail and around positions, Find/FindIndex,
//   element lifetimes, empty-list errors
// - CMap with HWND and pointer keys (64-bit values), block size, InitHashTable
//   with entries kept, PLookup, RemoveKey, iteration visiting each entry once
// - CTypedPtrList/CTypedPtrArray/CTypedPtrMap over the untyped collections, and the
//   untyped collections the library uses
#include <gtest/gtest.h>
#include <afxtempl.h>

#include "AfxTestSupport.h"

#include <functional>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace {

using afx_test::Throws;
using afx_test::W;

// Counts live instances, so leaks and double destruction show up as a count.
struct Tracked
{
    static int s_live;
    int value;
    Tracked() : value(0) { ++s_live; }
    Tracked(int v) : value(v) { ++s_live; }
    Tracked(const Tracked& other) : value(other.value) { ++s_live; }
    Tracked& operator=(const Tracked& other) { value = other.value; return *this; }
    ~Tracked() { --s_live; }
    bool operator==(const Tracked& other) const { return value == other.value; }
};
int Tracked::s_live = 0;

template<class ARRAY>
std::string Join(const ARRAY& a)
{
    std::string s;
    for (INT_PTR i = 0; i < a.GetSize(); i++)
        s += (i ? "," : "") + std::to_string(a[i]);
    return s;
}

// The list's elements from the head, or from the tail backwards.
template<class LIST>
std::string JoinList(const LIST& l, bool backwards = false)
{
    std::string s;
    for (POSITION pos = backwards ? l.GetTailPosition() : l.GetHeadPosition(); pos != NULL;)
        s += (s.empty() ? "" : ",") + std::to_string(backwards ? l.GetPrev(pos) : l.GetNext(pos));
    return s;
}

} // namespace

// ---------------------------------------------------------------------------
// CArray

TEST(CArrayTest, InsertAndRemoveAtEdges)
{
    CArray<int, int> a;
    EXPECT_EQ(0, a.Add(2));
    EXPECT_EQ(1, a.Add(3));
    a.InsertAt(0, 1);                 // head
    a.InsertAt(a.GetSize(), 4);       // tail
    a.InsertAt(2, 9, 3);              // middle, repeated
    EXPECT_EQ("1,2,9,9,9,3,4", Join(a));
    a.RemoveAt(0);                    // head
    a.RemoveAt(a.GetUpperBound());    // tail
    a.RemoveAt(1, 3);                 // middle block
    EXPECT_EQ("2,3", Join(a));
    a.InsertAt(5, 7);                 // past the end: the gap is zero-filled
    EXPECT_EQ("2,3,0,0,0,7", Join(a));
    a.RemoveAt(0, a.GetSize());
    EXPECT_EQ(-1, a.GetUpperBound());
    a.Add(1);
    a.Add(2);
    a.InsertAt(1, &a);   // an array into itself
    EXPECT_EQ("1,1,2,2", Join(a));
}

TEST(CArrayTest, SetSizeGrowByAndFreeExtra)
{
    CArray<int, int> a;
    a.SetSize(3, 10);
    EXPECT_EQ("0,0,0", Join(a));
    for (int i = 0; i < 20; i++)
        a.SetAtGrow(i, i);
    EXPECT_EQ(20, a.GetSize());
    EXPECT_EQ(19, a[19]);
    a.SetSize(5);
    EXPECT_EQ("0,1,2,3,4", Join(a));
    a.FreeExtra();
    EXPECT_EQ("0,1,2,3,4", Join(a));
    a.SetSize(0);
    EXPECT_EQ(nullptr, a.GetData());
}

TEST(CArrayTest, ElementLifetimes)
{
    Tracked::s_live = 0;
    {
        CArray<Tracked> a;
        a.SetSize(4);
        EXPECT_EQ(4, Tracked::s_live);
        a.Add(Tracked(5));
        a.InsertAt(0, Tracked(1), 2);
        a.RemoveAt(1, 3);
        EXPECT_EQ(a.GetSize(), Tracked::s_live);
        for (int i = 0; i < 100; i++)
            a.Add(Tracked(i));         // several reallocations
        EXPECT_EQ(a.GetSize(), Tracked::s_live);
        a.SetSize(10);
        EXPECT_EQ(10, Tracked::s_live);
        CArray<Tracked> b;
        b.Copy(a);
        b.Append(a);
        EXPECT_EQ(30, Tracked::s_live);
    }
    EXPECT_EQ(0, Tracked::s_live);
}

TEST(CArrayTest, ArgumentAliasingAnElementSurvivesGrowth)
{
    CArray<CString, const CString&> a;
    a.Add(CString(L"first"));
    for (int i = 0; i < 50; i++)
        a.Add(a[0]);                  // a[0] lives in the buffer that Add may move
    a.InsertAt(0, a[a.GetUpperBound()], 3);
    EXPECT_EQ(54, a.GetSize());
    EXPECT_EQ(L"first", W(a[0]));
    EXPECT_EQ(L"first", W(a[53]));
    a.Append(a);
    EXPECT_EQ(108, a.GetSize());
    EXPECT_EQ(L"first", W(a[107]));
}

TEST(CArrayTest, OutOfRangeThrowsInvalidArg)
{
    CArray<int, int> a;
    a.Add(1);
    const std::function<void()> misuses[] = {
        [&] { a.GetAt(1); }, [&] { a.GetAt(-1); }, [&] { a.SetAt(5, 1); }, [&] { a.RemoveAt(0, 2); },
        [&] { a.RemoveAt(-1); }, [&] { a.SetSize(-1); }, [&] { a.InsertAt(-1, 0); },
    };
    for (size_t i = 0; i < sizeof misuses / sizeof misuses[0]; ++i)
        EXPECT_TRUE(Throws<CInvalidArgException>(misuses[i])) << "misuse " << i;
    EXPECT_EQ("1", Join(a));
}

// ---------------------------------------------------------------------------
// CList

TEST(CListTest, InsertAndRemoveAtEdgesAndPositions)
{
    CList<int, int> l;
    POSITION p2 = l.AddTail(2);
    l.AddHead(1);
    l.AddTail(4);
    l.InsertAfter(p2, 3);
    l.InsertBefore(l.GetHeadPosition(), 0);
    l.InsertAfter(l.GetTailPosition(), 5);
    EXPECT_EQ("0,1,2,3,4,5", JoinList(l));
    EXPECT_EQ("5,4,3,2,1,0", JoinList(l, true));
    EXPECT_EQ(0, l.RemoveHead());
    EXPECT_EQ(5, l.RemoveTail());
    l.RemoveAt(p2);
    EXPECT_EQ("1,3,4", JoinList(l));
    EXPECT_EQ(1, l.GetHead());
    EXPECT_EQ(4, l.GetTail());
    l.RemoveAt(l.GetHeadPosition());
    l.RemoveAt(l.GetTailPosition());
    EXPECT_EQ("3", JoinList(l));
    EXPECT_EQ("3", JoinList(l, true));
    l.RemoveAt(l.GetHeadPosition());
    EXPECT_EQ(0, l.GetCount());
    EXPECT_EQ(nullptr, l.GetHeadPosition());
    EXPECT_EQ(nullptr, l.GetTailPosition());
    l.InsertBefore(NULL, 7);          // NULL position: at the head
    l.InsertAfter(NULL, 8);           // NULL position: at the tail
    EXPECT_EQ("7,8", JoinList(l));
    l.AddTail(&l);                    // a list to itself: doubled once
    l.AddHead(&l);
    EXPECT_EQ("7,8,7,8,7,8,7,8", JoinList(l));
}

TEST(CListTest, FindAndFindIndex)
{
    CList<int, int> l(3);             // small blocks: several blocks in use
    for (int i = 0; i < 10; i++)
        l.AddTail(i % 5);
    POSITION first = l.Find(3);
    ASSERT_NE(nullptr, first);
    POSITION second = l.Find(3, first);
    ASSERT_NE(nullptr, second);
    EXPECT_EQ(nullptr, l.Find(3, second));
    EXPECT_EQ(nullptr, l.Find(42));
    EXPECT_EQ(first, l.FindIndex(3));
    EXPECT_EQ(second, l.FindIndex(8));
    EXPECT_EQ(nullptr, l.FindIndex(10));
    EXPECT_EQ(nullptr, l.FindIndex(-1));
    l.SetAt(first, 30);
    EXPECT_EQ("0,1,2,30,4,0,1,2,3,4", JoinList(l));
}

TEST(CListTest, ElementLifetimesAndEmptyListErrors)
{
    Tracked::s_live = 0;
    {
        CList<Tracked> l(2);
        for (int i = 0; i < 7; i++)
            l.AddTail(Tracked(i));
        EXPECT_EQ(7, Tracked::s_live);
        l.RemoveHead();
        l.RemoveTail();
        l.RemoveAt(l.FindIndex(2));
        EXPECT_EQ(4, Tracked::s_live);
        CList<Tracked> m;
        m.AddTail(&l);
        m.AddHead(&l);
        EXPECT_EQ(12, Tracked::s_live);
        EXPECT_EQ(1, m.GetHead().value);
        l.RemoveAll();
        EXPECT_EQ(8, Tracked::s_live);
    }
    EXPECT_EQ(0, Tracked::s_live);

    CList<int, int> empty;
    EXPECT_TRUE(Throws<CInvalidArgException>([&] { empty.RemoveHead(); }));
    EXPECT_TRUE(Throws<CInvalidArgException>([&] { empty.RemoveTail(); }));
    EXPECT_TRUE(Throws<CInvalidArgException>([&] { empty.GetHead(); }));
    EXPECT_TRUE(Throws<CInvalidArgException>([&] { empty.RemoveAt(NULL); }));
    POSITION pos = NULL;
    EXPECT_TRUE(Throws<CInvalidArgException>([&] { empty.GetNext(pos); }));
}

// ---------------------------------------------------------------------------
// CMap

TEST(CMapTest, HwndKeysWithBlockSize)
{
    // Handle values with high bits set, as 64-bit handles and pointers can be.
    CMap<HWND, HWND, int, int> m(10);
    std::vector<HWND> keys;
    for (int i = 0; i < 100; i++)
        keys.push_back((HWND)(((UINT_PTR)0x7FF0ULL << 32) + (UINT_PTR)i * 16));
    for (int i = 0; i < 100; i++)
        m[keys[i]] = i;
    m.SetAt((HWND)NULL, -1);
    EXPECT_EQ(101, m.GetCount());

    int value = 0;
    EXPECT_TRUE(m.Lookup(keys[57], value));
    EXPECT_EQ(57, value);
    EXPECT_TRUE(m.Lookup((HWND)NULL, value));
    EXPECT_EQ(-1, value);
    EXPECT_FALSE(m.Lookup((HWND)(UINT_PTR)12345, value));
    // Keys differing only in the upper half of the pointer are different keys.
    EXPECT_FALSE(m.Lookup((HWND)(UINT_PTR)(57 * 16), value));

    EXPECT_TRUE(m.RemoveKey(keys[57]));
    EXPECT_FALSE(m.RemoveKey(keys[57]));
    EXPECT_FALSE(m.Lookup(keys[57], value));
    EXPECT_EQ(100, m.GetCount());

    // Spreads over the buckets: no bucket gets more than a few of 100 keys.
    std::map<UINT, int> buckets;
    for (HWND h : keys)
        buckets[HashKey<HWND>(h) % m.GetHashTableSize()]++;
    int maxPerBucket = 0;
    for (auto& b : buckets)
        maxPerBucket = std::max(maxPerBucket, b.second);
    EXPECT_LE(maxPerBucket, 100 / (int)m.GetHashTableSize() + 2);
}

TEST(CMapTest, IterationVisitsEachEntryOnce)
{
    CMap<int, int, CString, LPCTSTR> m;
    m.InitHashTable(7);
    for (int i = 0; i < 30; i++)
    {
        CString s;
        s.Format(L"v%d", i);
        m.SetAt(i, s);
    }
    std::set<int> seen;
    POSITION pos = m.GetStartPosition();
    while (pos != NULL)
    {
        int key;
        CString value;
        m.GetNextAssoc(pos, key, value);
        CString expected;
        expected.Format(L"v%d", key);
        EXPECT_EQ(W(expected), W(value));
        EXPECT_TRUE(seen.insert(key).second) << "key " << key << " visited twice";
    }
    EXPECT_EQ(30u, seen.size());
    POSITION none = NULL;
    int key;
    CString value;
    EXPECT_TRUE(Throws<CInvalidArgException>([&] { m.GetNextAssoc(none, key, value); }));
}

TEST(CMapTest, InitHashTableKeepsEntriesAndPLookup)
{
    CMap<CString, LPCTSTR, int, int> m;
    m[L"one"] = 1;
    m[L"two"] = 2;
    m[L"three"] = 3;
    m.InitHashTable(101);
    EXPECT_EQ(101u, m.GetHashTableSize());
    EXPECT_EQ(3, m.GetCount());
    CMap<CString, LPCTSTR, int, int>::CPair* pPair = m.PLookup(L"two");
    ASSERT_NE(nullptr, pPair);
    EXPECT_EQ(L"two", W(pPair->key));
    EXPECT_EQ(2, pPair->value);
    pPair->value = 22;
    int value = 0;
    EXPECT_TRUE(m.Lookup(L"two", value));
    EXPECT_EQ(22, value);
    EXPECT_EQ(nullptr, m.PLookup(L"four"));
    const CMap<CString, LPCTSTR, int, int>& cm = m;
    ASSERT_NE(nullptr, cm.PLookup(L"one"));
    EXPECT_EQ(1, cm.PLookup(L"one")->value);
}

TEST(CMapTest, ValueLifetimes)
{
    Tracked::s_live = 0;
    {
        CMap<int, int, Tracked, const Tracked&> m(4);
        for (int i = 0; i < 20; i++)
            m.SetAt(i, Tracked(i));
        EXPECT_EQ(20, Tracked::s_live);
        for (int i = 0; i < 20; i += 2)
            m.RemoveKey(i);
        EXPECT_EQ(10, Tracked::s_live);
        m[100].value = 5;
        EXPECT_EQ(11, Tracked::s_live);
    }
    EXPECT_EQ(0, Tracked::s_live);
}

// ---------------------------------------------------------------------------
// Typed pointer collections and the untyped ones under them

namespace {

class CItem : public CObject
{
public:
    explicit CItem(int n) : m_n(n) {}
    int m_n;
};

} // namespace

TEST(TypedPtrCollections, OverTheUntypedCollections)
{
    CItem a(1), b(2), c(3);
    CTypedPtrList<CObList, CItem*> items;
    items.AddTail(&b);
    items.AddHead(&a);
    items.AddTail(&c);
    std::string order;
    for (POSITION pos = items.GetHeadPosition(); pos != NULL;)
        order += std::to_string(items.GetNext(pos)->m_n);
    EXPECT_EQ("123", order);
    EXPECT_EQ(&a, items.RemoveHead());
    EXPECT_EQ(&c, items.RemoveTail());
    EXPECT_EQ(&b, items.GetAt(items.Find(&b)));
    CTypedPtrList<CPtrList, int*> ptrs;
    int x = 5, y = 6;
    ptrs.AddTail(&x);
    ptrs.InsertBefore(ptrs.GetHeadPosition(), &y);
    EXPECT_EQ(6, *ptrs.GetHead());
    ptrs.GetHead() = &x;
    EXPECT_EQ(5, *ptrs.GetHead());

    CTypedPtrArray<CPtrArray, CItem*> array;
    array.Add(&a);
    array.InsertAt(0, &b);
    EXPECT_EQ(2, array[0]->m_n);
    EXPECT_EQ(&a, array.GetData()[1]);

    CTypedPtrMap<CMapPtrToPtr, HWND, CItem*> map;
    HWND h = (HWND)(UINT_PTR)0x123450;
    map.SetAt(h, &a);
    POSITION pos = map.GetStartPosition();
    HWND key = NULL;
    CItem* value = NULL;
    map.GetNextAssoc(pos, key, value);
    EXPECT_EQ(h, key);
    EXPECT_EQ(&a, value);
    EXPECT_EQ(nullptr, pos);
    EXPECT_TRUE(map.RemoveKey(h));
    EXPECT_FALSE(map.Lookup(h, value));

    CMapStringToPtr names;
    names[L"key"] = &x;
    void* p = NULL;
    EXPECT_TRUE(names.Lookup(L"key", p));
    EXPECT_EQ(&x, p);
    EXPECT_FALSE(names.Lookup(L"KEY", p)) << "keys compare case-sensitively";
    LPCTSTR pszKey = NULL;
    EXPECT_TRUE(names.LookupKey(L"key", pszKey));
    EXPECT_EQ(L"key", std::wstring(pszKey));
    CMapWordToPtr words(2);
    for (WORD w = 0; w < 50; w++)
        words[w] = (void*)(UINT_PTR)(w + 1);
    EXPECT_TRUE(words.Lookup(49, p));
    EXPECT_EQ((void*)(UINT_PTR)50, p);
    words.RemoveAll();
    EXPECT_FALSE(words.Lookup(49, p));
    CMapPtrToWord ptrWords;
    ptrWords[&x] = 7;
    WORD word = 0;
    EXPECT_TRUE(ptrWords.Lookup(&x, word));
    EXPECT_EQ(7, word);
    CStringList list;
    list.AddTail(L"x");
    list.AddHead(L"w");
    EXPECT_EQ(L"x", W(list.GetAt(list.Find(L"x"))));
    EXPECT_EQ(nullptr, list.Find(L"z"));
    CStringArray strings;
    strings.Add(L"b");
    strings.InsertAt(0, L"a");
    strings.SetAtGrow(3, L"d");
    CStringArray copy;
    copy.Copy(strings);
    strings[0] = L"changed";
    EXPECT_EQ(L"a", W(copy[0]));
    EXPECT_EQ(L"", W(copy[2]));
}
