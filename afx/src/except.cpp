// The exception classes and the AfxThrow* helpers.
#include <afxwin.h>

/////////////////////////////////////////////////////////////////////////////
// CException

IMPLEMENT_DYNAMIC(CException, CObject)

CException::CException() : m_bAutoDelete(TRUE)
{
}

CException::CException(BOOL bAutoDelete) : m_bAutoDelete(bAutoDelete)
{
}

CException::~CException()
{
}

void CException::Delete()
{
    // Static (pre-allocated) exceptions are never deleted.
    if (m_bAutoDelete > 0)
        delete this;
}

BOOL CException::GetErrorMessage(LPTSTR lpszError, UINT nMaxError, PUINT pnHelpContext)
{
    if (pnHelpContext != NULL)
        *pnHelpContext = 0;
    if (lpszError != NULL && nMaxError != 0)
        *lpszError = 0;
    return FALSE;
}

int CException::ReportError(UINT nType, UINT nMessageID)
{
    TCHAR szErrorMessage[512];
    CString strMessage;
    UINT nHelpContext = 0;
    if (GetErrorMessage(szErrorMessage, _countof(szErrorMessage), &nHelpContext))
        strMessage = szErrorMessage;
    else if (nMessageID != 0)
        strMessage.LoadString(nMessageID);
    if (strMessage.IsEmpty())
        strMessage = _T("An unsupported operation was attempted.");
    return AfxMessageBox(strMessage, nType, nHelpContext);
}

AFX_EXCEPTION_LINK::~AFX_EXCEPTION_LINK()
{
    if (m_pException != NULL)
        m_pException->Delete();
}

/////////////////////////////////////////////////////////////////////////////
// CSimpleException and the fixed-message exceptions

IMPLEMENT_DYNAMIC(CSimpleException, CException)

CSimpleException::CSimpleException()
{
}

CSimpleException::CSimpleException(BOOL bAutoDelete) : CException(bAutoDelete)
{
}

CSimpleException::~CSimpleException()
{
}

LPCTSTR CSimpleException::GetDefaultMessage() const
{
    return _T("An unknown error occurred.");
}

BOOL CSimpleException::GetErrorMessage(LPTSTR lpszError, UINT nMaxError, PUINT pnHelpContext)
{
    if (pnHelpContext != NULL)
        *pnHelpContext = 0;
    if (lpszError == NULL || nMaxError == 0)
        return FALSE;
    lstrcpyn(lpszError, GetDefaultMessage(), (int)nMaxError);
    return TRUE;
}

#define IMPLEMENT_SIMPLE_EXCEPTION(class_name, text) \
    IMPLEMENT_DYNAMIC(class_name, CSimpleException) \
    class_name::class_name() {} \
    class_name::class_name(BOOL bAutoDelete) : CSimpleException(bAutoDelete) {} \
    class_name::~class_name() {} \
    LPCTSTR class_name::GetDefaultMessage() const { return _T(text); }

IMPLEMENT_SIMPLE_EXCEPTION(CMemoryException, "Out of memory.")
IMPLEMENT_SIMPLE_EXCEPTION(CNotSupportedException, "An unsupported operation was attempted.")
IMPLEMENT_SIMPLE_EXCEPTION(CResourceException, "A required resource was unavailable.")
IMPLEMENT_SIMPLE_EXCEPTION(CInvalidArgException, "The parameter is incorrect.")
IMPLEMENT_SIMPLE_EXCEPTION(CUserException, "")

/////////////////////////////////////////////////////////////////////////////
// Throwing

// Allocating an exception when memory is exhausted could fail, so one
// pre-built, never-deleted instance is thrown.
static CMemoryException s_memoryException(FALSE);

void AFXAPI AfxThrowMemoryException()
{
    throw &s_memoryException;
}

void AFXAPI AfxThrowNotSupportedException()
{
    throw new CNotSupportedException;
}

void AFXAPI AfxThrowResourceException()
{
    throw new CResourceException;
}

void AFXAPI AfxThrowInvalidArgException()
{
    throw new CInvalidArgException;
}

void AFXAPI AfxThrowUserException()
{
    throw new CUserException;
}

void AFXAPI AfxAbort()
{
    ::FatalAppExit(0, _T("The application is terminating abnormally."));
    ::TerminateProcess(::GetCurrentProcess(), 3);
}
