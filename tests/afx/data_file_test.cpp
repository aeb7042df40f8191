// CFile and CMemFile: covers
// - round trip write/read, Seek from each origin, SeekToBegin/End, GetPosition, GetLength
// - reading past the end returns fewer bytes (no exception); SetLength truncates/extends
// - Open failure fills CFileException (cause, OS error, name) and returns FALSE;
//   the throwing constructor raises the same; operations on a closed file throw
// - mode flags: modeCreate truncates unless modeNoTruncate, read-only refuses writes,
//   shareExclusive refuses a second open with sharingViolation
// - GetFileName/GetFileTitle/GetFilePath; Close/Abort release the handle
// - CMemFile growth by the grow-by step, seek past end then write (zero gap),
//   fixed attached blocks (length = block, cannot grow), Detach handing back the block,
//   growable attached blocks used through the CFile interface
#include <gtest/gtest.h>
#include <afx.h>
#include <string>
#include <vector>

namespace {

std::wstring W(const CString& s)
{
    return std::wstring((LPCTSTR)s, (size_t)s.GetLength());
}

// A unique file name in the user's temporary folder, removed afterwards.
class TempFileName
{
public:
    TempFileName()
    {
        WCHAR szDir[MAX_PATH], szFile[MAX_PATH];
        ::GetTempPathW(MAX_PATH, szDir);
        ::GetTempFileNameW(szDir, L"afx", 0, szFile);
        m_name = szFile;
    }
    ~TempFileName() { ::DeleteFileW(m_name.c_str()); }
    LPCWSTR c_str() const { return m_name.c_str(); }
    std::wstring m_name;
};

// Runs f and returns the cause of the CFileException it threw (-1: none thrown).
template<class F>
int FileExceptionCause(F f, CString* pFileName = NULL)
{
    try
    {
        f();
    }
    catch (CFileException* e)
    {
        int cause = e->m_cause;
        if (pFileName != NULL)
            *pFileName = e->m_strFileName;
        e->Delete();
        return cause;
    }
    return -1;
}

} // namespace

TEST(CFileTest, RoundTripSeekAndReadPastEnd)
{
    TempFileName name;
    {
        CFile file;
        ASSERT_TRUE(file.Open(name.c_str(), CFile::modeCreate | CFile::modeReadWrite));
        const char data[] = "0123456789";
        file.Write(data, 10);
        EXPECT_EQ(10u, file.GetLength());
        EXPECT_EQ(10u, file.GetPosition());

        EXPECT_EQ(3u, file.Seek(3, CFile::begin));
        char buf[16] = {};
        EXPECT_EQ(4u, file.Read(buf, 4));
        EXPECT_EQ(std::string("3456"), std::string(buf, 4));
        EXPECT_EQ(5u, file.Seek(-2, CFile::current));
        EXPECT_EQ(8u, file.Seek(-2, CFile::end));
        EXPECT_EQ(2u, file.Read(buf, 16)) << "reading past the end is not an error";
        EXPECT_EQ(0u, file.Read(buf, 16));
        EXPECT_EQ(0u, file.Read(buf, 0));

        file.SeekToBegin();
        EXPECT_EQ(0u, file.GetPosition());
        EXPECT_EQ(10u, file.SeekToEnd());

        file.SetLength(4);
        EXPECT_EQ(4u, file.GetLength());
        file.SetLength(6);
        file.SeekToBegin();
        EXPECT_EQ(6u, file.Read(buf, 16));
        EXPECT_EQ(std::string("0123\0\0", 6), std::string(buf, 6));

        EXPECT_EQ(CFileException::badSeek, FileExceptionCause([&] { file.Seek(-100, CFile::begin); }));
        file.Flush();
        file.Close();
        EXPECT_EQ(CFile::hFileNull, file.m_hFile);
    }
    {
        CFile file(name.c_str(), CFile::modeRead | CFile::shareDenyWrite);
        EXPECT_EQ(6u, file.GetLength());
        std::wstring expectedName = name.m_name.substr(name.m_name.find_last_of(L"\\/") + 1);
        EXPECT_EQ(expectedName, W(file.GetFileName()));
        EXPECT_EQ(expectedName.substr(0, expectedName.rfind(L'.')), W(file.GetFileTitle()));
        EXPECT_EQ(0, file.GetFilePath().CompareNoCase(name.c_str()));
    }
}

TEST(CFileTest, OpenFailureFillsException)
{
    TempFileName name;
    ::DeleteFileW(name.c_str());
    std::wstring missing = name.m_name + L".missing";

    CFile file;
    CFileException e;
    EXPECT_FALSE(file.Open(missing.c_str(), CFile::modeRead, &e));
    EXPECT_EQ(CFileException::fileNotFound, e.m_cause);
    EXPECT_EQ((LONG)ERROR_FILE_NOT_FOUND, e.m_lOsError);
    EXPECT_EQ(missing, W(e.m_strFileName));
    EXPECT_EQ(CFile::hFileNull, file.m_hFile);
    TCHAR szMessage[512];
    EXPECT_TRUE(e.GetErrorMessage(szMessage, 512));
    EXPECT_NE(std::wstring::npos, std::wstring(szMessage).find(missing)) << "the message names the file";

    std::wstring badDir = name.m_name + L".nodir\\file.txt";
    EXPECT_FALSE(file.Open(badDir.c_str(), CFile::modeRead, &e));
    EXPECT_EQ(CFileException::badPath, e.m_cause);
    EXPECT_FALSE(file.Open(L"", CFile::modeRead, &e));
    EXPECT_FALSE(file.Open(missing.c_str(), CFile::modeRead)) << "no exception object: only FALSE";

    CString thrownName;
    EXPECT_EQ(CFileException::fileNotFound,
        FileExceptionCause([&] { CFile thrower(missing.c_str(), CFile::modeRead); }, &thrownName));
    EXPECT_EQ(missing, W(thrownName));
}

TEST(CFileTest, ModeFlags)
{
    TempFileName name;
    {
        CFile file(name.c_str(), CFile::modeCreate | CFile::modeWrite);
        file.Write("abcdef", 6);
    }
    {
        CFile file(name.c_str(), CFile::modeCreate | CFile::modeNoTruncate | CFile::modeReadWrite);
        EXPECT_EQ(6u, file.GetLength()) << "modeNoTruncate keeps the contents";
    }
    {
        CFile file(name.c_str(), CFile::modeRead | CFile::shareExclusive);
        EXPECT_EQ(CFileException::accessDenied, FileExceptionCause([&] { file.Write("x", 1); }));
        CFile second;
        CFileException e;
        EXPECT_FALSE(second.Open(name.c_str(), CFile::modeRead | CFile::shareDenyNone, &e));
        EXPECT_EQ(CFileException::sharingViolation, e.m_cause);
    }
    {
        CFile file(name.c_str(), CFile::modeCreate | CFile::modeWrite);
        EXPECT_EQ(0u, file.GetLength()) << "modeCreate truncates";
    }
}

TEST(CFileTest, ClosedFileOperationsThrowAndHandlesAreReleased)
{
    TempFileName name;
    CFile file;
    char buf[4];
    EXPECT_EQ(CFileException::invalidFile, FileExceptionCause([&] { file.Read(buf, 4); }));
    EXPECT_EQ(CFileException::invalidFile, FileExceptionCause([&] { file.Write(buf, 4); }));
    file.Close();   // closing a closed file does nothing
    file.Abort();

    ASSERT_TRUE(file.Open(name.c_str(), CFile::modeCreate | CFile::modeReadWrite));
    ASSERT_TRUE(file.Open(name.c_str(), CFile::modeReadWrite | CFile::shareDenyNone))
        << "reopening releases the first handle (else its exclusive sharing would block this)";
    HANDLE h = file.m_hFile;
    DWORD flags = 0;
    EXPECT_TRUE(::GetHandleInformation(h, &flags));
    file.Abort();
    EXPECT_EQ(CFile::hFileNull, file.m_hFile);
    EXPECT_FALSE(::GetHandleInformation(h, &flags)) << "Abort closed the handle";
}

TEST(CMemFileTest, GrowsSeeksAndReads)
{
    CMemFile file(16);
    std::vector<BYTE> data(100);
    for (int i = 0; i < 100; i++)
        data[i] = (BYTE)i;
    file.Write(data.data(), 40);
    file.Write(data.data() + 40, 60);
    EXPECT_EQ(100u, file.GetLength());
    EXPECT_EQ(100u, file.GetPosition());

    BYTE buf[200];
    file.SeekToBegin();
    EXPECT_EQ(100u, file.Read(buf, 200)) << "a short read at the end";
    EXPECT_EQ(0, memcmp(buf, data.data(), 100));
    EXPECT_EQ(0u, file.Read(buf, 1));

    EXPECT_EQ(110u, file.Seek(10, CFile::end));
    EXPECT_EQ(0u, file.Read(buf, 1)) << "past the end reads nothing";
    file.Write("\xAA", 1);
    EXPECT_EQ(111u, file.GetLength());
    file.Seek(100, CFile::begin);
    EXPECT_EQ(11u, file.Read(buf, 20));
    EXPECT_EQ(std::vector<BYTE>(10, 0), std::vector<BYTE>(buf, buf + 10)) << "the gap is zero-filled";
    EXPECT_EQ(0xAA, buf[10]);

    EXPECT_EQ(CFileException::badSeek, FileExceptionCause([&] { file.Seek(-1, CFile::begin); }));
    EXPECT_EQ(50u, file.Seek(-61, CFile::end));
    file.SetLength(20);
    EXPECT_EQ(20u, file.GetLength());
    EXPECT_EQ(20u, file.GetPosition()) << "truncating moves the position back";
}

TEST(CMemFileTest, AttachedBlocksAndDetach)
{
    BYTE block[8] = { 1, 2, 3, 4, 5, 6, 7, 8 };
    {
        CMemFile file(block, 8);   // fixed: the file is the whole block
        EXPECT_EQ(8u, file.GetLength());
        BYTE buf[8];
        EXPECT_EQ(8u, file.Read(buf, 8));
        EXPECT_EQ(0, memcmp(buf, block, 8));
        file.SeekToBegin();
        file.Write("\x09", 1);
        EXPECT_EQ(9, block[0]) << "writes go into the caller's block";
        file.SeekToEnd();
        bool threw = false;
        try
        {
            file.Write("x", 1);
        }
        catch (CMemoryException* e)
        {
            threw = true;
            e->Delete();
        }
        EXPECT_TRUE(threw) << "a fixed block cannot grow";
        EXPECT_EQ(block, file.Detach());
        EXPECT_EQ(0u, file.GetLength());
    }
    {
        CMemFile file(4);
        file.Write("hello world", 11);
        ULONGLONG nLength = file.GetLength();
        BYTE* p = file.Detach();
        ASSERT_NE(nullptr, p);
        EXPECT_EQ(11u, nLength);
        EXPECT_EQ(std::string("hello world"), std::string((const char*)p, 11));
        free(p);   // the caller owns a detached block
    }
    {
        CMemFile file;
        file.Attach((BYTE*)malloc(4), 4, 4);    // growable: starts empty, reallocates the block
        EXPECT_EQ(0u, file.GetLength());
        CFile* pFile = &file;                   // through the base class's interface
        pFile->Write("0123456789", 10);
        EXPECT_EQ(10u, pFile->GetLength());
        file.Close();
        EXPECT_EQ(0u, file.GetLength());
    }
}
