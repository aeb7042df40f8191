// Extension modules and the resource and class chain.
// Covers:
// - the raw entry of an extension DLL collects the classes its constructors
//   register for that DLL alone: before a CDynLinkLibrary exists, FromName does
//   not find them; the host's own classes stay found
// - a CDynLinkLibrary makes FromName find the DLL's classes (ANSI and wide
//   names) and AfxFindResourceHandle find its strings and templates; CString
//   and AfxMessageBox by id load through the chain (a dialog by id: the colour
//   pop-up of the buttons family)
// - AfxTermExtensionModule takes the DLL out of the chain again
#include <afxwin.h>

#include <gtest/gtest.h>

#include "Input.h"
#include "ext_testdll.h"

namespace {

// One test walks the whole life of the chain entry, since the DLL is inserted once.
TEST(ExtChain, DynLinkLibraryInsertsAndRemovesTheDll)
{
    AFX_EXTENSION_MODULE* pModule = ExtTestModule();
    ASSERT_TRUE(pModule->bInitialized);
    HMODULE hDll = ::GetModuleHandleW(L"afx_ext_testdll.dll");
    ASSERT_NE(nullptr, hDll);
    EXPECT_EQ(hDll, pModule->hModule);
    EXPECT_EQ(hDll, pModule->hResource);
    ASSERT_NE(nullptr, pModule->pFirstSharedClass);
    EXPECT_STREQ("CExtTestObject", pModule->pFirstSharedClass->m_lpszClassName);

    // Not in the chain yet: neither its classes nor its resources are found.
    EXPECT_EQ(nullptr, CRuntimeClass::FromName("CExtTestObject"));
    EXPECT_EQ(RUNTIME_CLASS(CWnd), CRuntimeClass::FromName("CWnd"));
    EXPECT_EQ(AfxGetResourceHandle(),
        AfxFindResourceHandle(MAKEINTRESOURCE(IDD_EXT_TEST_DIALOG), RT_DIALOG));
    CString str;
    EXPECT_FALSE(str.LoadString(IDS_EXT_TEST_STRING));

    ExtTestLoad();

    CRuntimeClass* pClass = CRuntimeClass::FromName("CExtTestObject");
    ASSERT_NE(nullptr, pClass);
    EXPECT_EQ(pClass, CRuntimeClass::FromName(L"CExtTestObject"));
    EXPECT_TRUE(pClass->IsDerivedFrom(RUNTIME_CLASS(CObject)));
    CObject* pObject = pClass->CreateObject();
    ASSERT_NE(nullptr, pObject);
    EXPECT_TRUE(pObject->IsKindOf(RUNTIME_CLASS(CExtTestObject)));
    EXPECT_EQ(4711, ((CExtTestObject*)pObject)->m_nMagic);
    delete pObject;

    EXPECT_EQ((HINSTANCE)hDll, AfxFindResourceHandle(MAKEINTRESOURCE(IDD_EXT_TEST_DIALOG), RT_DIALOG));
    EXPECT_EQ((HINSTANCE)hDll,
        AfxFindResourceHandle(MAKEINTRESOURCE((IDS_EXT_TEST_STRING >> 4) + 1), RT_STRING));
    ASSERT_TRUE(str.LoadString(IDS_EXT_TEST_STRING));
    EXPECT_STREQ(L"From the extension DLL !", (LPCTSTR)str);

    // A message box by string id, answered from the hook
    {
        orvane_test::DialogAnswerer answerer(IDOK);
        EXPECT_EQ(IDOK, AfxMessageBox(IDS_EXT_TEST_STRING));
        ASSERT_EQ(1, answerer.count());
        EXPECT_EQ(L"From the extension DLL !", answerer.lastText());
    }

    // Taking the DLL out of the chain again
    AfxTermExtensionModule(*pModule);
    EXPECT_EQ(nullptr, CRuntimeClass::FromName("CExtTestObject"));
    EXPECT_EQ(AfxGetResourceHandle(),
        AfxFindResourceHandle(MAKEINTRESOURCE(IDD_EXT_TEST_DIALOG), RT_DIALOG));
    EXPECT_FALSE(str.LoadString(IDS_EXT_TEST_STRING));

    // and in once more, for the layer to free at exit
    ExtTestLoad();
    EXPECT_NE(nullptr, CRuntimeClass::FromName("CExtTestObject"));
}

} // namespace
