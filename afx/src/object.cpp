// CObject, CRuntimeClass and the diagnostic helpers.
#include <afx.h>

/////////////////////////////////////////////////////////////////////////////
// CRuntimeClass

CObject* CRuntimeClass::CreateObject()
{
    if (m_pfnCreateObject == NULL)
        return NULL;
    CObject* pObject = NULL;
    TRY
    {
        pObject = (*m_pfnCreateObject)();
    }
    END_TRY
    return pObject;
}

BOOL CRuntimeClass::IsDerivedFrom(const CRuntimeClass* pBaseClass) const
{
    if (pBaseClass == NULL)
        return FALSE;
    const CRuntimeClass* pClassThis = this;
    while (pClassThis != NULL)
    {
        if (pClassThis == pBaseClass)
            return TRUE;
        if (pClassThis->m_pfnGetBaseClass == NULL)
            break;
        pClassThis = (*pClassThis->m_pfnGetBaseClass)();
    }
    return FALSE;
}

/////////////////////////////////////////////////////////////////////////////
// CObject

CRuntimeClass* PASCAL CObject::_GetBaseClass()
{
    return NULL;
}

CRuntimeClass CObject::classCObject =
{
    "CObject", sizeof(CObject), 0xFFFF, NULL, &CObject::_GetBaseClass, NULL
};
static const AFX_CLASSINIT _init_CObject(RUNTIME_CLASS(CObject));

CObject::CObject()
{
}

CObject::~CObject()
{
}

CRuntimeClass* CObject::GetRuntimeClass() const
{
    return RUNTIME_CLASS(CObject);
}

void* PASCAL CObject::operator new(size_t nSize)
{
    return ::operator new(nSize);
}

void* PASCAL CObject::operator new(size_t, void* p)
{
    return p;
}

void PASCAL CObject::operator delete(void* p)
{
    ::operator delete(p);
}

void PASCAL CObject::operator delete(void*, void*)
{
}

BOOL CObject::IsSerializable() const
{
    return GetRuntimeClass()->m_wSchema != 0xFFFF;
}

BOOL CObject::IsKindOf(const CRuntimeClass* pClass) const
{
    return GetRuntimeClass()->IsDerivedFrom(pClass);
}

void CObject::Serialize(CArchive&)
{
}

void CObject::AssertValid() const
{
}

/////////////////////////////////////////////////////////////////////////////
// Diagnostics

BOOL AFXAPI AfxAssertFailedLine(LPCSTR lpszFileName, int nLine)
{
    char sz[MAX_PATH + 64];
    wsprintfA(sz, "Assertion failed: %.260s(%d)\n", lpszFileName ? lpszFileName : "?", nLine);
    ::OutputDebugStringA(sz);
    return FALSE;
}

void AFXAPI AfxAssertValidObject(const CObject* pOb, LPCSTR lpszFileName, int nLine)
{
    if (pOb == NULL)
    {
        AfxAssertFailedLine(lpszFileName, nLine);
        return;
    }
    pOb->AssertValid();
}

// A pointer is "valid" when non-null and the whole range is committed memory with
// the access asked for; VirtualQuery is used instead of the obsolete IsBad*Ptr.
static BOOL RangeAccessible(const void* lp, UINT_PTR nBytes, BOOL bReadWrite)
{
    if (lp == NULL)
        return FALSE;
    const BYTE* p = (const BYTE*)lp;
    const BYTE* pEnd = p + nBytes;
    if (pEnd < p)
        return FALSE;
    const DWORD readable = PAGE_READONLY | PAGE_READWRITE | PAGE_WRITECOPY | PAGE_EXECUTE_READ
        | PAGE_EXECUTE_READWRITE | PAGE_EXECUTE_WRITECOPY;
    const DWORD writable = PAGE_READWRITE | PAGE_WRITECOPY | PAGE_EXECUTE_READWRITE
        | PAGE_EXECUTE_WRITECOPY;
    do
    {
        MEMORY_BASIC_INFORMATION mbi;
        if (::VirtualQuery(p, &mbi, sizeof(mbi)) == 0 || mbi.State != MEM_COMMIT
            || (mbi.Protect & PAGE_GUARD) != 0
            || (mbi.Protect & (bReadWrite ? writable : readable)) == 0)
            return FALSE;
        p = (const BYTE*)mbi.BaseAddress + mbi.RegionSize;
    } while (p < pEnd);
    return TRUE;
}

BOOL AFXAPI AfxIsValidAddress(const void* lp, UINT_PTR nBytes, BOOL bReadWrite)
{
    return RangeAccessible(lp, nBytes, bReadWrite);
}

BOOL AFXAPI AfxIsValidString(LPCWSTR lpsz, int nLength)
{
    if (lpsz == NULL)
        return FALSE;
    if (nLength >= 0)
        return RangeAccessible(lpsz, (UINT_PTR)nLength * sizeof(WCHAR), FALSE);
    return RangeAccessible(lpsz, sizeof(WCHAR), FALSE);
}

BOOL AFXAPI AfxIsValidString(LPCSTR lpsz, int nLength)
{
    if (lpsz == NULL)
        return FALSE;
    if (nLength >= 0)
        return RangeAccessible(lpsz, (UINT_PTR)nLength, FALSE);
    return RangeAccessible(lpsz, 1, FALSE);
}

