// Printable rectangles and texts, names of table cases, and the leak measure (live GDI objects, the thread's windows with their children, heap blocks).
#pragma once

#include <windows.h>

#include <gtest/gtest.h>

#include <cwchar>
#include <functional>
#include <string>
#include <vector>

namespace orvane_test {

inline std::string Str(const RECT& r) { return testing::PrintToString(std::vector<LONG>{ r.left, r.top, r.right, r.bottom }); }

inline std::string Narrow(const wchar_t* s) { return s == nullptr ? "(null)" : std::string(s, s + wcslen(s)); }

template <typename Case>
std::string CaseName(const testing::TestParamInfo<Case>& info) { return info.param.name; }

inline std::vector<long> LiveResources()
{
    std::vector<long> n(3, 0);
    for (UINT_PTR i = 1; i <= 0xFFFF; ++i)   // Wine resolves every 16-bit handle index
        n[0] += ::GetObjectType(reinterpret_cast<HGDIOBJ>(i)) != 0;
    ::EnumThreadWindows(::GetCurrentThreadId(), [](HWND hwnd, LPARAM p) -> BOOL {
        ::EnumChildWindows(hwnd, [](HWND, LPARAM q) -> BOOL { return ++*reinterpret_cast<long*>(q) > 0; }, p);
        return ++*reinterpret_cast<long*>(p) > 0;
    }, reinterpret_cast<LPARAM>(&n[1]));
    HANDLE heaps[64];
    const DWORD count = ::GetProcessHeaps(64, heaps);
    for (DWORD h = 0; h < count && h < 64; ++h)
        for (PROCESS_HEAP_ENTRY entry = {}; ::HeapWalk(heaps[h], &entry);)
            n[2] += (entry.wFlags & PROCESS_HEAP_ENTRY_BUSY) != 0;
    return n;
}

// Warms up, then runs two equal halves: a leak is growth in both halves (for heap blocks,
// by at least heapSlack each: the harness's own come and go; 0 leaves them unchecked);
// windows must all be gone.
inline void ExpectNoLeaks(const std::function<void(int)>& cycles, int warmUp, int half, long heapSlack)
{
    cycles(warmUp);
    const std::vector<long> before = LiveResources();
    cycles(half);
    const std::vector<long> middle = LiveResources();
    cycles(half);
    const std::vector<long> after = LiveResources();
    EXPECT_FALSE(middle[0] > before[0] && after[0] > middle[0])
        << "GDI objects " << before[0] << " " << middle[0] << " " << after[0];
    EXPECT_EQ(before[1], after[1]) << "windows";
    EXPECT_FALSE(heapSlack > 0 && middle[2] >= before[2] + heapSlack && after[2] >= middle[2] + heapSlack)
        << "heap blocks " << before[2] << " " << middle[2] << " " << after[2];
}

} // namespace orvane_test
