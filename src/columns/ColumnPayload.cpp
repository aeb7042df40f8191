// Checking a dropped column before it is read.
#include "ColumnPayload.h"

namespace ColumnPayload {

namespace {

// The record's integers are little-endian.
int ReadInt(const unsigned char* p)
{
    return static_cast<int>(static_cast<unsigned>(p[0]) | static_cast<unsigned>(p[1]) << 8
        | static_cast<unsigned>(p[2]) << 16 | static_cast<unsigned>(p[3]) << 24);
}

constexpr size_t kWidthOffset = 8;      // after index and sub-item
constexpr size_t kSortTypeOffset = 16;  // after width and format

} // namespace

Check CheckPayload(const unsigned char* data, size_t size)
{
    Check check = { Truncated, 0, false, false };
    size_t titleEnd = 0;
    while (titleEnd < size && titleEnd <= kMaxTitleLength && data[titleEnd] != 0)
        ++titleEnd;
    if (titleEnd > kMaxTitleLength)
    {
        check.verdict = TitleTooLong;
        return check;
    }
    if (titleEnd == size || size - titleEnd - 1 < kFieldBytes)
        return check;

    const unsigned char* fields = data + titleEnd + 1;
    check.recordSize = titleEnd + 1 + kFieldBytes;
    check.hasFlag = size > check.recordSize;
    check.flag = check.hasFlag && data[check.recordSize] != 0;
    const int width = ReadInt(fields + kWidthOffset);
    if (width < 0 || width > kMaxWidth)
        check.verdict = BadWidth;
    else if (fields[kSortTypeOffset] > kLastSortType)
        check.verdict = BadSortType;
    else
        check.verdict = Valid;
    return check;
}

} // namespace ColumnPayload
