// A small extension DLL for the framework's tests: one run-time class record,
// one string, a dialog template and a property page template.
#pragma once

#define IDS_EXT_TEST_STRING 31001
#define IDD_EXT_TEST_DIALOG 31002
#define IDC_EXT_TEST_EDIT   31003
#define IDD_EXT_TEST_PAGE   31004

#ifndef RC_INVOKED

#include <afxwin.h>

class AFX_EXT_CLASS CExtTestObject : public CObject
{
    DECLARE_DYNCREATE(CExtTestObject)
public:
    CExtTestObject();
    int m_nMagic;
};

// Inserts the DLL into the resource and class chain (one CDynLinkLibrary).
extern "C" AFX_EXT_API void ExtTestLoad();
// The DLL's module record: the extension test reads it.
extern "C" AFX_EXT_API AFX_EXTENSION_MODULE* ExtTestModule();

#endif // RC_INVOKED
