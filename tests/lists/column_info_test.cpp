// The column record and its byte format:
// - byte images of a default record and of a titled one, the drag payload's flag after it;
// - read-back into fresh records; 7-bit ASCII titles byte for byte; characters the
//   code page lacks; records copied by assignment;
// - truncated streams stop at the end of the data, fields not read in full keep their values.
#include <afxwin.h>

#include <gtest/gtest.h>

#include "KVXColumnInfo.h"

#include <sstream>
#include <string>
#include <vector>

namespace {

std::vector<BYTE> BytesOf(KVXColumnInfo& record)
{
    CMemFile file;
    record.Write(&file);
    std::vector<BYTE> bytes(static_cast<size_t>(file.GetLength()));
    file.SeekToBegin();
    file.Read(bytes.data(), static_cast<UINT>(bytes.size()));
    return bytes;
}

void ReadFrom(std::vector<BYTE> bytes, KVXColumnInfo& record)
{
    CMemFile file(bytes.data(), static_cast<UINT>(bytes.size()));
    record.Read(&file);
}

// "title|index|sub-item|width|format|sort type"
std::string Fields(const KVXColumnInfo& record)
{
    const CString title = record.GetTitle();
    std::ostringstream s;
    for (int i = 0; i < title.GetLength(); ++i)
        s << (title[i] < 0x80 ? static_cast<char>(title[i]) : '#');
    s << "|" << record.GetIndex() << "|" << record.GetSubItem() << "|" << record.GetWidth() << "|"
      << record.GetFormat() << "|" << static_cast<int>(record.GetSortType());
    return s.str();
}

// A record made by assignment from a fresh one, so that every case also checks the copy.
void Assign(KVXColumnInfo& record, int index, LPCTSTR title, int subItem, int width, int format, int sortType)
{
    KVXColumnInfo made(index, title, subItem, width, format);
    made.SetSortType(static_cast<unsigned char>(sortType));
    record = made;
}

TEST(ColumnInfoTest, ByteImagesAndReadBack)
{
    KVXColumnInfo empty;
    EXPECT_EQ((std::vector<BYTE>{ 0, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0, 0, 0, 0, 0, 0, 0, 0, 0 }),
        BytesOf(empty));
    KVXColumnInfo emptyBack;
    ReadFrom(BytesOf(empty), emptyBack);
    EXPECT_EQ("|-1|-1|0|0|0", Fields(emptyBack));

    // The titled example; as the drag payload, the flag byte follows and is read after it.
    KVXColumnInfo name;
    Assign(name, 2, _T("Name"), 5, 120, 0, 3);
    EXPECT_EQ((std::vector<BYTE>{ 'N', 'a', 'm', 'e', 0, 2, 0, 0, 0, 5, 0, 0, 0, 0x78, 0, 0, 0, 0, 0, 0, 0, 3 }),
        BytesOf(name));
    CMemFile payload;
    name.Write(&payload);
    const BYTE flag = 1;
    payload.Write(&flag, 1);
    payload.SeekToBegin();
    KVXColumnInfo back;
    back.Read(&payload);
    BYTE flagBack = 0;
    EXPECT_EQ(1u, payload.Read(&flagBack, 1));
    EXPECT_EQ(1, flagBack);
    EXPECT_EQ("Name|2|5|120|0|3", Fields(back));
}

TEST(ColumnInfoTest, TitlesKeepOneBytePerCharacter)
{
    std::wstring ascii;
    for (wchar_t c = 0x20; c < 0x7F; ++c)
        ascii += c;
    KVXColumnInfo record(0, ascii.c_str(), 0, 10, LVCFMT_LEFT);
    const std::vector<BYTE> bytes = BytesOf(record);
    ASSERT_EQ(ascii.size() + 18, bytes.size());
    EXPECT_EQ(std::string(ascii.begin(), ascii.end()), std::string(bytes.begin(), bytes.begin() + ascii.size()));
    KVXColumnInfo back;
    ReadFrom(bytes, back);
    EXPECT_EQ(ascii, std::wstring(static_cast<LPCTSTR>(back.GetTitle())));

    // A character the single-byte code page lacks is stored as '?'; the length holds.
    KVXColumnInfo greek(0, L"\x03A9 \x00E9t\x00E9", 0, 10, LVCFMT_LEFT);
    const std::vector<BYTE> greekBytes = BytesOf(greek);
    ASSERT_EQ(5u + 18u, greekBytes.size());
    KVXColumnInfo greekBack;
    ReadFrom(greekBytes, greekBack);
    EXPECT_EQ(L"? \x00E9t\x00E9", std::wstring(static_cast<LPCTSTR>(greekBack.GetTitle())));
}

TEST(ColumnInfoTest, TruncatedStreamsStopAtTheEnd)
{
    KVXColumnInfo source;
    Assign(source, 2, _T("Name"), 5, 120, LVCFMT_RIGHT, 3);
    const std::vector<BYTE> full = BytesOf(source);
    // Fields end after bytes 9, 13, 17 and 21; one cut short keeps the fresh value.
    for (size_t length = 0; length < full.size(); ++length)
    {
        SCOPED_TRACE(testing::Message() << "bytes " << length);
        KVXColumnInfo back;
        ReadFrom(std::vector<BYTE>(full.begin(), full.begin() + length), back);
        std::ostringstream expected;
        expected << std::string("Name").substr(0, length) << "|" << (length >= 9 ? 2 : -1) << "|"
                 << (length >= 13 ? 5 : -1) << "|" << (length >= 17 ? 120 : 0) << "|" << (length >= 21 ? 1 : 0) << "|0";
        EXPECT_EQ(expected.str(), Fields(back));
    }
}

} // namespace
