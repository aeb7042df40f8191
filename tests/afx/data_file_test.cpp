// CFile and CMemFile, the layer's own parts (reading and seeking are the platform's):
// - reading past the end returns fewer bytes (no exception); SetLength; GetFileName/Title;
// - Open failure fills CFileException (cause, OS error, name) and returns FALSE; the
//   throwing constructor raises the same; a closed file throws; sharing violations;
// - modeCreate truncates unless modeNoTruncate, read-only refuses writes, reopening and
//   Abort release the handle;
// - CMemFile growth by the grow-by step, seek past the end then write (a zero gap),
//   fixed attached blocks (cannot grow), Detach handing back the block.
#include <gtest/gtest.h>
#include <afx.h>

#include "AfxTestSupport.h"

#include <string>
#include <vector>

namespace {

using afx_test::Throws;
using afx_test::W;

// The cause of the CFileException f threw (-1: none thrown), and its file name.
template<class F>
int FileExceptionCause(F f, CString* pFileName = NULL)
{
    int cause = -1;
    Throws<CFileException>(f, [&](CFileException* e) {
        cause = e->m_cause;
        if (pFileName != NULL)
            *pFileName = e->m_strFileName;
    });
    return cause;
}

// A new empty file in the temporary folder.
std::wstring TempFile()
{
    WCHAR dir[MAX_PATH], name[MAX_PATH];
    ::GetTempPathW(MAX_PATH, dir);
    ::GetTempFileNameW(dir, L"afx", 0, name);
    return name;
}

TEST(CFileTest, ReadPastTheEndSetLengthNamesFailuresAndSharing)
{
    const std::wstring path = TempFile();
    LPCWSTR name = path.c_str();
    {
        CFile file;
        ASSERT_TRUE(file.Open(name, CFile::modeCreate | CFile::modeReadWrite));
        file.Write("0123456789", 10);
        EXPECT_EQ(8u, file.Seek(-2, CFile::end));
        char buf[16] = {};
        EXPECT_EQ(2u, file.Read(buf, 16)) << "reading past the end is not an error";
        EXPECT_EQ(0u, file.Read(buf, 16));
        file.SetLength(4);
        file.SetLength(6);
        file.SeekToBegin();
        EXPECT_EQ(6u, file.Read(buf, 16));
        EXPECT_EQ(std::string("0123\0\0", 6), std::string(buf, 6));
        EXPECT_EQ(CFileException::badSeek, FileExceptionCause([&] { file.Seek(-100, CFile::begin); }));
        const std::wstring title = W(file.GetFileName());
        EXPECT_EQ(W(file.GetFileTitle()), title.substr(0, title.rfind(L'.')));
        CFile second;
        CFileException e;
        EXPECT_FALSE(second.Open(name, CFile::modeRead | CFile::shareDenyNone, &e));
        EXPECT_EQ(CFileException::sharingViolation, e.m_cause);
        file.Close();
        EXPECT_EQ(CFile::hFileNull, file.m_hFile);
        char c;
        EXPECT_EQ(CFileException::invalidFile, FileExceptionCause([&] { file.Read(&c, 1); }));
    }
    ::DeleteFileW(name);
    const std::wstring missing = std::wstring(name) + L".missing";
    CFile file;
    CFileException e;
    EXPECT_FALSE(file.Open(missing.c_str(), CFile::modeRead, &e));
    EXPECT_EQ(CFileException::fileNotFound, e.m_cause);
    EXPECT_EQ(LONG(ERROR_FILE_NOT_FOUND), e.m_lOsError);
    EXPECT_EQ(missing, W(e.m_strFileName));
    TCHAR szMessage[512];
    EXPECT_TRUE(e.GetErrorMessage(szMessage, 512));
    EXPECT_NE(std::wstring::npos, std::wstring(szMessage).find(missing)) << "the message names the file";
    CString thrownName;
    EXPECT_EQ(CFileException::fileNotFound,
              FileExceptionCause([&] { CFile thrower(missing.c_str(), CFile::modeRead); }, &thrownName));
    EXPECT_EQ(missing, W(thrownName));
}

TEST(CFileTest, ModeFlagsAndHandles)
{
    const std::wstring path = TempFile();
    LPCWSTR name = path.c_str();
    CFile(name, CFile::modeCreate | CFile::modeWrite).Write("abcdef", 6);
    EXPECT_EQ(6u, CFile(name, CFile::modeCreate | CFile::modeNoTruncate | CFile::modeRead).GetLength());
    {
        CFile file(name, CFile::modeRead | CFile::shareDenyWrite);
        EXPECT_EQ(CFileException::accessDenied, FileExceptionCause([&] { file.Write("x", 1); }));
        EXPECT_EQ(0, file.GetFilePath().CompareNoCase(name));
        ASSERT_TRUE(file.Open(name, CFile::modeReadWrite | CFile::shareDenyNone))
            << "reopening releases the first handle (else its sharing would block this)";
        HANDLE h = file.m_hFile;
        DWORD flags = 0;
        file.Abort();
        EXPECT_EQ(CFile::hFileNull, file.m_hFile);
        EXPECT_FALSE(::GetHandleInformation(h, &flags)) << "Abort closed the handle";
    }
    EXPECT_EQ(0u, CFile(name, CFile::modeCreate | CFile::modeWrite).GetLength()) << "modeCreate truncates";
    CFileException e;
    EXPECT_FALSE(CFile().Open((std::wstring(name) + L".nodir\\f.txt").c_str(), CFile::modeRead, &e));
    EXPECT_EQ(CFileException::badPath, e.m_cause);
    ::DeleteFileW(name);
}

TEST(CMemFileTest, GrowsFillsGapsAndHandsBackBlocks)
{
    CMemFile file(16);
    std::vector<BYTE> data(100);
    for (int i = 0; i < 100; i++)
        data[i] = (BYTE)i;
    file.Write(data.data(), 40);
    file.Write(data.data() + 40, 60);
    BYTE buf[200];
    file.SeekToBegin();
    EXPECT_EQ(100u, file.Read(buf, 200)) << "a short read at the end";
    EXPECT_EQ(0, memcmp(buf, data.data(), 100));
    EXPECT_EQ(110u, file.Seek(10, CFile::end));
    file.Write("\xAA", 1);
    file.Seek(100, CFile::begin);
    EXPECT_EQ(11u, file.Read(buf, 20));
    EXPECT_EQ(std::vector<BYTE>(10, 0), std::vector<BYTE>(buf, buf + 10)) << "the gap is zero-filled";
    EXPECT_EQ(CFileException::badSeek, FileExceptionCause([&] { file.Seek(-1, CFile::begin); }));
    file.SetLength(20);
    EXPECT_EQ(20u, file.GetPosition()) << "truncating moves the position back";

    BYTE block[8] = { 1, 2, 3, 4, 5, 6, 7, 8 };
    CMemFile fixed(block, 8);   // fixed: the file is the whole block
    EXPECT_EQ(8u, fixed.GetLength());
    fixed.Write("\x09", 1);
    EXPECT_EQ(9, block[0]) << "writes go into the caller's block";
    fixed.SeekToEnd();
    EXPECT_TRUE(Throws<CMemoryException>([&] { fixed.Write("x", 1); })) << "a fixed block cannot grow";
    EXPECT_EQ(block, fixed.Detach());

    CMemFile grown(4);
    grown.Write("hello world", 11);
    BYTE* p = grown.Detach();
    EXPECT_EQ(std::string("hello world"), std::string((const char*)p, 11));
    free(p);   // the caller owns a detached block
}

} // namespace
