// CObject run-time classes and exceptions: covers
// - IsKindOf and IsDerivedFrom across two levels, the record's name/size/schema
// - CreateObject through IMPLEMENT_DYNCREATE (and NULL without it), look-up by name
//   of registered classes (narrow and wide)
// - TRY/CATCH/AND_CATCH/END_CATCH: the right handler runs, the exception is deleted
//   when the handler ends, THROW_LAST passes it on undeleted
// - auto-deleting vs. the pre-allocated memory exception; error messages
#include <gtest/gtest.h>
#include <afxwin.h>

#include "AfxTestSupport.h"

#include <functional>
#include <string>

namespace {

int g_nLiveObjects = 0;

} // namespace

class CDataBase : public CObject
{
    DECLARE_DYNCREATE(CDataBase)
public:
    CDataBase() { ++g_nLiveObjects; }
    virtual ~CDataBase() { --g_nLiveObjects; }
    int m_nBase = 1;
};

class CDataMiddle : public CDataBase
{
    DECLARE_DYNAMIC(CDataMiddle)
public:
    int m_nMiddle = 2;
};

class CDataLeaf : public CDataMiddle
{
    DECLARE_DYNCREATE(CDataLeaf)
public:
    int m_nLeaf = 3;
};

IMPLEMENT_DYNCREATE(CDataBase, CObject)
IMPLEMENT_DYNAMIC(CDataMiddle, CDataBase)
IMPLEMENT_DYNCREATE(CDataLeaf, CDataMiddle)

TEST(RuntimeClass, KindOfAcrossLevels)
{
    CDataLeaf leaf;
    CObject* pObject = &leaf;
    EXPECT_STREQ("CDataLeaf", pObject->GetRuntimeClass()->m_lpszClassName);
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CDataLeaf)));
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CDataMiddle)));
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CDataBase)));
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CObject)));
    EXPECT_FALSE(pObject->IsKindOf(RUNTIME_CLASS(CException)));

    CDataBase base;
    EXPECT_FALSE(base.IsKindOf(RUNTIME_CLASS(CDataMiddle)));
    EXPECT_TRUE(RUNTIME_CLASS(CDataLeaf)->IsDerivedFrom(RUNTIME_CLASS(CDataBase)));
    EXPECT_FALSE(RUNTIME_CLASS(CDataBase)->IsDerivedFrom(RUNTIME_CLASS(CDataLeaf)));
    EXPECT_FALSE(RUNTIME_CLASS(CDataBase)->IsDerivedFrom(NULL));

    EXPECT_EQ((int)sizeof(CDataLeaf), RUNTIME_CLASS(CDataLeaf)->m_nObjectSize);
    EXPECT_EQ(0xFFFFu, RUNTIME_CLASS(CDataLeaf)->m_wSchema);
    EXPECT_FALSE(leaf.IsSerializable());
    EXPECT_EQ(RUNTIME_CLASS(CDataMiddle), RUNTIME_CLASS(CDataLeaf)->m_pfnGetBaseClass());
    EXPECT_EQ(nullptr, RUNTIME_CLASS(CObject)->m_pfnGetBaseClass());
}

TEST(RuntimeClass, CreateObjectThroughDynCreate)
{
    g_nLiveObjects = 0;
    CObject* pObject = RUNTIME_CLASS(CDataLeaf)->CreateObject();
    ASSERT_NE(nullptr, pObject);
    EXPECT_EQ(RUNTIME_CLASS(CDataLeaf), pObject->GetRuntimeClass());
    EXPECT_EQ(3, static_cast<CDataLeaf*>(pObject)->m_nLeaf);
    EXPECT_EQ(1, g_nLiveObjects);
    delete pObject;
    EXPECT_EQ(0, g_nLiveObjects);

    EXPECT_EQ(nullptr, RUNTIME_CLASS(CDataMiddle)->CreateObject()) << "DYNAMIC only: no factory";
    EXPECT_EQ(nullptr, RUNTIME_CLASS(CObject)->CreateObject());
}

// Classes of the executable (DYNCREATE and DYNAMIC records) and of the framework, by
// narrow and wide name; names are case-sensitive.
const struct { const char* name; CRuntimeClass* pClass; } kClassNames[] = {
    { "CDataLeaf", RUNTIME_CLASS(CDataLeaf) },
    { "CDataMiddle", RUNTIME_CLASS(CDataMiddle) },
    { "CFileException", RUNTIME_CLASS(CFileException) },
    { "CWnd", RUNTIME_CLASS(CWnd) },
    { "cdataleaf", nullptr },
    { "CNoSuchClass", nullptr },
    { "", nullptr },
};

TEST(RuntimeClass, FromNameFindsRegisteredClasses)
{
    for (const auto& c : kClassNames)
    {
        EXPECT_EQ(c.pClass, CRuntimeClass::FromName(c.name)) << c.name;
        EXPECT_EQ(c.pClass, CRuntimeClass::FromName(CString(c.name))) << c.name;
    }
    EXPECT_EQ(nullptr, CRuntimeClass::FromName((LPCSTR)NULL));
}

// ---------------------------------------------------------------------------
// Exceptions

namespace {

class CCountedException : public CException
{
public:
    static int s_live;
    CCountedException() { ++s_live; }
    virtual ~CCountedException() { --s_live; }
};
int CCountedException::s_live = 0;

} // namespace

TEST(Exceptions, CatchRunsTheMatchingHandlerAndDeletes)
{
    CCountedException::s_live = 0;
    std::string trace;
    TRY
    {
        trace += "try;";
        THROW(new CCountedException);
    }
    CATCH(CFileException, e)
    {
        trace += "file;";
    }
    AND_CATCH(CException, e)
    {
        trace += "base;";
        EXPECT_EQ(1, CCountedException::s_live);
    }
    END_CATCH
    EXPECT_EQ("try;base;", trace);
    EXPECT_EQ(0, CCountedException::s_live) << "deleted when the handler ended";

    trace.clear();
    TRY
    {
        AfxThrowFileException(CFileException::diskFull, 112, L"x.dat");
    }
    CATCH(CFileException, e)
    {
        trace += "file:" + std::to_string(e->m_cause) + ":" + std::to_string(e->m_lOsError) + ";";
    }
    END_CATCH
    EXPECT_EQ("file:13:112;", trace);
}

TEST(Exceptions, ThrowLastPassesTheSameObjectOn)
{
    CCountedException::s_live = 0;
    CException* pCaughtInner = NULL;
    CException* pCaughtOuter = NULL;
    TRY
    {
        TRY
        {
            THROW(new CCountedException);
        }
        CATCH_ALL(e)
        {
            pCaughtInner = e;
            THROW_LAST();
        }
        END_CATCH_ALL
    }
    CATCH_ALL(e)
    {
        pCaughtOuter = e;
        EXPECT_EQ(1, CCountedException::s_live) << "not deleted by the inner handler";
    }
    END_CATCH_ALL
    EXPECT_EQ(pCaughtInner, pCaughtOuter);
    EXPECT_EQ(0, CCountedException::s_live);
}

TEST(Exceptions, MemoryExceptionIsPreallocatedOthersAutoDelete)
{
    CException* pCaught[3] = {};
    const std::function<void()> throws[] = { [] { AfxThrowMemoryException(); }, [] { AfxThrowMemoryException(); },
                                             [] { AfxThrowNotSupportedException(); } };
    for (int i = 0; i < 3; ++i)
    {
        try
        {
            throws[i]();
        }
        catch (CException* e)
        {
            pCaught[i] = e;
            EXPECT_EQ(i == 2, e->m_bAutoDelete != FALSE) << i;
            e->Delete();   // does nothing to the static memory exception
        }
    }
    ASSERT_NE(nullptr, pCaught[0]);
    EXPECT_EQ(pCaught[0], pCaught[1]);
    EXPECT_TRUE(pCaught[0]->IsKindOf(RUNTIME_CLASS(CMemoryException)));
    TCHAR szMessage[128];
    EXPECT_TRUE(pCaught[0]->GetErrorMessage(szMessage, 128));
    EXPECT_NE(0, szMessage[0]);
    EXPECT_TRUE(pCaught[0]->GetErrorMessage(szMessage, 4)) << "truncates into a short buffer";
    EXPECT_EQ(3u, wcslen(szMessage));
}

TEST(Exceptions, FileExceptionCausesFromOsErrors)
{
    const struct { LONG error; int cause; } cases[] = {
        { NO_ERROR, CFileException::none },
        { ERROR_FILE_NOT_FOUND, CFileException::fileNotFound },
        { ERROR_PATH_NOT_FOUND, CFileException::badPath },
        { ERROR_ACCESS_DENIED, CFileException::accessDenied },
        { ERROR_SHARING_VIOLATION, CFileException::sharingViolation },
        { ERROR_DISK_FULL, CFileException::diskFull },
        { ERROR_HANDLE_EOF, CFileException::endOfFile },
        { 123456, CFileException::genericException },
    };
    for (const auto& c : cases)
        EXPECT_EQ(c.cause, CFileException::OsErrorToException(c.error)) << "error " << c.error;
    EXPECT_TRUE(afx_test::Throws<CFileException>([] { CFileException::ThrowOsError(ERROR_TOO_MANY_OPEN_FILES, L"f.txt"); },
        [](CFileException* e) {
            EXPECT_EQ(CFileException::tooManyOpenFiles, e->m_cause);
            EXPECT_EQ(L"f.txt", afx_test::W(e->m_strFileName));
        }));
}
