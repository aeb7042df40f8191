// Checking a dropped column before it is read. The "HeaderCtrl Item" payload is one
// column record (title bytes, a zero byte, index, sub-item, width and format of 4 bytes
// each, the sort type byte) and one flag byte. Any process can offer that format, so
// a drop is taken only when its bytes hold one whole record that a list can show.
#pragma once

#include <cstddef>

namespace ColumnPayload {

constexpr size_t kFieldBytes = 17;          // index, sub-item, width, format, sort type
constexpr size_t kMaxTitleLength = 255;
constexpr size_t kMaxPayloadBytes = kMaxTitleLength + 1 + kFieldBytes + 1;
constexpr int kMaxWidth = 32767;            // GDI's 16-bit coordinates
constexpr unsigned char kLastSortType = 8;  // the column type codes run from 0 to 8

enum Verdict
{
    Valid,
    Truncated,          // the data ends before the record does
    TitleTooLong,       // no zero byte within kMaxTitleLength + 1 bytes
    BadWidth,           // negative or wider than kMaxWidth
    BadSortType,        // not a column type code
};

struct Check
{
    Verdict verdict;
    size_t recordSize;  // bytes of the record, title and terminator included
    bool hasFlag;       // a byte follows the record
    bool flag;          // that byte is not zero
};

// Bytes after the record and the flag are ignored.
Check CheckPayload(const unsigned char* data, size_t size);

} // namespace ColumnPayload
