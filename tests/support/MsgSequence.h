// Message sequences: spies record what windows receive, tests compare the record
// against declarative tables, in the manner of the platform's conformance tests.
//
//   static const MsgEntry kClickSeq[] = {
//       { WM_COMMAND, Sent | Parent | Id, 0, 0, BN_CLICKED },
//       { 0 }
//   };
//   EXPECT_MSGS(log, kParentStream, kClickSeq);
#pragma once

#include <windows.h>

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

namespace orvane_test {

// Where a message was recorded and which of its fields to compare.
enum MsgFlags : unsigned
{
    Sent      = 0x0001,   // documents that the message is sent (not compared: a spy cannot tell)
    Parent    = 0x0004,   // recorded by a parent spy
    WParam    = 0x0010,   // compare wParam
    LParam    = 0x0020,   // compare lParam
    Id        = 0x0040,   // compare id: NMHDR::code of WM_NOTIFY, HIWORD(wParam) of WM_COMMAND
    Optional  = 0x0080,   // may be missing from the record
};

struct MsgEntry
{
    UINT message;
    unsigned flags;
    WPARAM wParam;
    LPARAM lParam;
    UINT id;     // notification code, see MsgFlags::Id
    HWND hwnd;   // filled when recorded; not compared
};

// Message names for failure output.
std::string MessageName(UINT message);
std::string DescribeEntry(const MsgEntry& e);

// A set of streams: each spy appends to one stream; index 0 is the combined stream
// that keeps the order across all of them.
class MsgLog
{
public:
    static constexpr int kCombined = 0;

    explicit MsgLog(int streams = 4);
    ~MsgLog();

    void Add(int stream, const MsgEntry& entry);
    void Flush();                              // forget everything recorded
    const std::vector<MsgEntry>& Stream(int stream) const;

    // Record messages sent to hwnd (the control's stream). Notifications that the
    // control sends to its parent are recorded by SpyParent.
    void SpyWindow(HWND hwnd, int stream);
    // Record WM_COMMAND, WM_NOTIFY, WM_DRAWITEM and private messages reaching a parent;
    // paint, erase, hit-test, cursor and get-text traffic is ignored as noise.
    void SpyParent(HWND hwnd, int stream);
    void Unspy(HWND hwnd);

    // Compares a stream with a table ending in {0}, then flushes that stream.
    testing::AssertionResult Match(int stream, const MsgEntry* expected, const char* file, int line);

    // Called for every entry as it is recorded, while the message is still being sent:
    // lParam still points at the sender's data and the control's state is that of the moment.
    std::function<void(int stream, const MsgEntry&)> onRecord;

private:
    struct Spy { HWND hwnd; int stream; bool parent; MsgLog* log; };
    static LRESULT CALLBACK SpyProc(HWND, UINT, WPARAM, LPARAM, UINT_PTR, DWORD_PTR);

    std::vector<std::vector<MsgEntry>> m_streams;
    std::vector<Spy*> m_spies;
};

#define EXPECT_MSGS(log, stream, table) \
    EXPECT_TRUE((log).Match((stream), (table), __FILE__, __LINE__))

// Counts one notification code (WM_NOTIFY) or one WM_COMMAND code reaching a parent,
// keeping a copy of each payload's header fields. With `message` given, counts that
// private message instead, whose lParam points at a block that starts with an NMHDR.
class NotifySpy
{
public:
    // payloadSize: bytes of each WM_NOTIFY block to keep (the notification's own struct size).
    NotifySpy(HWND parent, UINT code, size_t payloadSize = sizeof(NMHDR), bool command = false, UINT message = 0);
    int count() const { return static_cast<int>(m_ids.size()); }
    // Control ids: NMHDR::idFrom, LOWORD(wParam) of a WM_COMMAND, wParam of a private message.
    const std::vector<UINT_PTR>& senders() const { return m_ids; }
    // Raw copy of each WM_NOTIFY payload.
    const std::vector<std::vector<BYTE>>& payloads() const { return m_payloads; }
    void clear() { m_ids.clear(); m_payloads.clear(); }

private:
    void OnRecord(const MsgEntry& e);
    UINT m_code;
    size_t m_payloadSize;
    UINT m_message;
    std::vector<UINT_PTR> m_ids;
    std::vector<std::vector<BYTE>> m_payloads;
    MsgLog m_log;
};

} // namespace orvane_test
