// The untyped arrays. Growth, insertion and removal are shared with CArray
// (afxplex_.h); these classes only bind the algorithms to their element type.
#include <afxcoll.h>

#define ARRAY_REF(TYPE) AfxCollImpl::ArrayRef<TYPE>{ m_pData, m_nSize, m_nMaxSize, m_nGrowBy }

/////////////////////////////////////////////////////////////////////////////
// CByteArray

IMPLEMENT_DYNAMIC(CByteArray, CObject)

CByteArray::CByteArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0)
{
}

CByteArray::~CByteArray()
{
    ARRAY_REF(BYTE).RemoveAll();
}

void CByteArray::SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
{
    ARRAY_REF(BYTE).SetSize(nNewSize, nGrowBy);
}

void CByteArray::FreeExtra()
{
    ARRAY_REF(BYTE).FreeExtra();
}

void CByteArray::RemoveAll()
{
    ARRAY_REF(BYTE).RemoveAll();
}

void CByteArray::SetAtGrow(INT_PTR nIndex, BYTE newElement)
{
    ARRAY_REF(BYTE).SetAtGrow(nIndex, newElement);
}

INT_PTR CByteArray::Add(BYTE newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(BYTE).SetAtGrow(nIndex, newElement);
    return nIndex;
}

void CByteArray::InsertAt(INT_PTR nIndex, BYTE newElement, INT_PTR nCount)
{
    ARRAY_REF(BYTE).InsertAt(nIndex, newElement, nCount);
}

INT_PTR CByteArray::Append(const CByteArray& src)
{
    return ARRAY_REF(BYTE).Append(src.m_pData, src.m_nSize, src.m_pData);
}

void CByteArray::Copy(const CByteArray& src)
{
    if (this != &src)
        ARRAY_REF(BYTE).Copy(src.m_pData, src.m_nSize);
}

void CByteArray::RemoveAt(INT_PTR nIndex, INT_PTR nCount)
{
    ARRAY_REF(BYTE).RemoveAt(nIndex, nCount);
}

void CByteArray::InsertAt(INT_PTR nStartIndex, CByteArray* pNewArray)
{
    if (pNewArray == NULL)
        AfxThrowInvalidArgException();
    if (pNewArray->GetSize() == 0)
        return;
    if (pNewArray == this)
    {
        CByteArray copy;
        copy.Copy(*this);
        InsertAt(nStartIndex, &copy);
        return;
    }
    ARRAY_REF(BYTE).InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
    for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
        m_pData[nStartIndex + i] = pNewArray->m_pData[i];
}

/////////////////////////////////////////////////////////////////////////////
// CWordArray

IMPLEMENT_DYNAMIC(CWordArray, CObject)

CWordArray::CWordArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0)
{
}

CWordArray::~CWordArray()
{
    ARRAY_REF(WORD).RemoveAll();
}

void CWordArray::SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
{
    ARRAY_REF(WORD).SetSize(nNewSize, nGrowBy);
}

void CWordArray::FreeExtra()
{
    ARRAY_REF(WORD).FreeExtra();
}

void CWordArray::RemoveAll()
{
    ARRAY_REF(WORD).RemoveAll();
}

void CWordArray::SetAtGrow(INT_PTR nIndex, WORD newElement)
{
    ARRAY_REF(WORD).SetAtGrow(nIndex, newElement);
}

INT_PTR CWordArray::Add(WORD newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(WORD).SetAtGrow(nIndex, newElement);
    return nIndex;
}

void CWordArray::InsertAt(INT_PTR nIndex, WORD newElement, INT_PTR nCount)
{
    ARRAY_REF(WORD).InsertAt(nIndex, newElement, nCount);
}

INT_PTR CWordArray::Append(const CWordArray& src)
{
    return ARRAY_REF(WORD).Append(src.m_pData, src.m_nSize, src.m_pData);
}

void CWordArray::Copy(const CWordArray& src)
{
    if (this != &src)
        ARRAY_REF(WORD).Copy(src.m_pData, src.m_nSize);
}

void CWordArray::RemoveAt(INT_PTR nIndex, INT_PTR nCount)
{
    ARRAY_REF(WORD).RemoveAt(nIndex, nCount);
}

void CWordArray::InsertAt(INT_PTR nStartIndex, CWordArray* pNewArray)
{
    if (pNewArray == NULL)
        AfxThrowInvalidArgException();
    if (pNewArray->GetSize() == 0)
        return;
    if (pNewArray == this)
    {
        CWordArray copy;
        copy.Copy(*this);
        InsertAt(nStartIndex, &copy);
        return;
    }
    ARRAY_REF(WORD).InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
    for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
        m_pData[nStartIndex + i] = pNewArray->m_pData[i];
}

/////////////////////////////////////////////////////////////////////////////
// CDWordArray

IMPLEMENT_DYNAMIC(CDWordArray, CObject)

CDWordArray::CDWordArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0)
{
}

CDWordArray::~CDWordArray()
{
    ARRAY_REF(DWORD).RemoveAll();
}

void CDWordArray::SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
{
    ARRAY_REF(DWORD).SetSize(nNewSize, nGrowBy);
}

void CDWordArray::FreeExtra()
{
    ARRAY_REF(DWORD).FreeExtra();
}

void CDWordArray::RemoveAll()
{
    ARRAY_REF(DWORD).RemoveAll();
}

void CDWordArray::SetAtGrow(INT_PTR nIndex, DWORD newElement)
{
    ARRAY_REF(DWORD).SetAtGrow(nIndex, newElement);
}

INT_PTR CDWordArray::Add(DWORD newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(DWORD).SetAtGrow(nIndex, newElement);
    return nIndex;
}

void CDWordArray::InsertAt(INT_PTR nIndex, DWORD newElement, INT_PTR nCount)
{
    ARRAY_REF(DWORD).InsertAt(nIndex, newElement, nCount);
}

INT_PTR CDWordArray::Append(const CDWordArray& src)
{
    return ARRAY_REF(DWORD).Append(src.m_pData, src.m_nSize, src.m_pData);
}

void CDWordArray::Copy(const CDWordArray& src)
{
    if (this != &src)
        ARRAY_REF(DWORD).Copy(src.m_pData, src.m_nSize);
}

void CDWordArray::RemoveAt(INT_PTR nIndex, INT_PTR nCount)
{
    ARRAY_REF(DWORD).RemoveAt(nIndex, nCount);
}

void CDWordArray::InsertAt(INT_PTR nStartIndex, CDWordArray* pNewArray)
{
    if (pNewArray == NULL)
        AfxThrowInvalidArgException();
    if (pNewArray->GetSize() == 0)
        return;
    if (pNewArray == this)
    {
        CDWordArray copy;
        copy.Copy(*this);
        InsertAt(nStartIndex, &copy);
        return;
    }
    ARRAY_REF(DWORD).InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
    for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
        m_pData[nStartIndex + i] = pNewArray->m_pData[i];
}

/////////////////////////////////////////////////////////////////////////////
// CUIntArray

IMPLEMENT_DYNAMIC(CUIntArray, CObject)

CUIntArray::CUIntArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0)
{
}

CUIntArray::~CUIntArray()
{
    ARRAY_REF(UINT).RemoveAll();
}

void CUIntArray::SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
{
    ARRAY_REF(UINT).SetSize(nNewSize, nGrowBy);
}

void CUIntArray::FreeExtra()
{
    ARRAY_REF(UINT).FreeExtra();
}

void CUIntArray::RemoveAll()
{
    ARRAY_REF(UINT).RemoveAll();
}

void CUIntArray::SetAtGrow(INT_PTR nIndex, UINT newElement)
{
    ARRAY_REF(UINT).SetAtGrow(nIndex, newElement);
}

INT_PTR CUIntArray::Add(UINT newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(UINT).SetAtGrow(nIndex, newElement);
    return nIndex;
}

void CUIntArray::InsertAt(INT_PTR nIndex, UINT newElement, INT_PTR nCount)
{
    ARRAY_REF(UINT).InsertAt(nIndex, newElement, nCount);
}

INT_PTR CUIntArray::Append(const CUIntArray& src)
{
    return ARRAY_REF(UINT).Append(src.m_pData, src.m_nSize, src.m_pData);
}

void CUIntArray::Copy(const CUIntArray& src)
{
    if (this != &src)
        ARRAY_REF(UINT).Copy(src.m_pData, src.m_nSize);
}

void CUIntArray::RemoveAt(INT_PTR nIndex, INT_PTR nCount)
{
    ARRAY_REF(UINT).RemoveAt(nIndex, nCount);
}

void CUIntArray::InsertAt(INT_PTR nStartIndex, CUIntArray* pNewArray)
{
    if (pNewArray == NULL)
        AfxThrowInvalidArgException();
    if (pNewArray->GetSize() == 0)
        return;
    if (pNewArray == this)
    {
        CUIntArray copy;
        copy.Copy(*this);
        InsertAt(nStartIndex, &copy);
        return;
    }
    ARRAY_REF(UINT).InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
    for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
        m_pData[nStartIndex + i] = pNewArray->m_pData[i];
}

/////////////////////////////////////////////////////////////////////////////
// CPtrArray

IMPLEMENT_DYNAMIC(CPtrArray, CObject)

CPtrArray::CPtrArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0)
{
}

CPtrArray::~CPtrArray()
{
    ARRAY_REF(void*).RemoveAll();
}

void CPtrArray::SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
{
    ARRAY_REF(void*).SetSize(nNewSize, nGrowBy);
}

void CPtrArray::FreeExtra()
{
    ARRAY_REF(void*).FreeExtra();
}

void CPtrArray::RemoveAll()
{
    ARRAY_REF(void*).RemoveAll();
}

void CPtrArray::SetAtGrow(INT_PTR nIndex, void* newElement)
{
    ARRAY_REF(void*).SetAtGrow(nIndex, newElement);
}

INT_PTR CPtrArray::Add(void* newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(void*).SetAtGrow(nIndex, newElement);
    return nIndex;
}

void CPtrArray::InsertAt(INT_PTR nIndex, void* newElement, INT_PTR nCount)
{
    ARRAY_REF(void*).InsertAt(nIndex, newElement, nCount);
}

INT_PTR CPtrArray::Append(const CPtrArray& src)
{
    return ARRAY_REF(void*).Append(src.m_pData, src.m_nSize, src.m_pData);
}

void CPtrArray::Copy(const CPtrArray& src)
{
    if (this != &src)
        ARRAY_REF(void*).Copy(src.m_pData, src.m_nSize);
}

void CPtrArray::RemoveAt(INT_PTR nIndex, INT_PTR nCount)
{
    ARRAY_REF(void*).RemoveAt(nIndex, nCount);
}

void CPtrArray::InsertAt(INT_PTR nStartIndex, CPtrArray* pNewArray)
{
    if (pNewArray == NULL)
        AfxThrowInvalidArgException();
    if (pNewArray->GetSize() == 0)
        return;
    if (pNewArray == this)
    {
        CPtrArray copy;
        copy.Copy(*this);
        InsertAt(nStartIndex, &copy);
        return;
    }
    ARRAY_REF(void*).InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
    for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
        m_pData[nStartIndex + i] = pNewArray->m_pData[i];
}

/////////////////////////////////////////////////////////////////////////////
// CObArray

IMPLEMENT_DYNAMIC(CObArray, CObject)

CObArray::CObArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0)
{
}

CObArray::~CObArray()
{
    ARRAY_REF(CObject*).RemoveAll();
}

void CObArray::SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
{
    ARRAY_REF(CObject*).SetSize(nNewSize, nGrowBy);
}

void CObArray::FreeExtra()
{
    ARRAY_REF(CObject*).FreeExtra();
}

void CObArray::RemoveAll()
{
    ARRAY_REF(CObject*).RemoveAll();
}

void CObArray::SetAtGrow(INT_PTR nIndex, CObject* newElement)
{
    ARRAY_REF(CObject*).SetAtGrow(nIndex, newElement);
}

INT_PTR CObArray::Add(CObject* newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(CObject*).SetAtGrow(nIndex, newElement);
    return nIndex;
}

void CObArray::InsertAt(INT_PTR nIndex, CObject* newElement, INT_PTR nCount)
{
    ARRAY_REF(CObject*).InsertAt(nIndex, newElement, nCount);
}

INT_PTR CObArray::Append(const CObArray& src)
{
    return ARRAY_REF(CObject*).Append(src.m_pData, src.m_nSize, src.m_pData);
}

void CObArray::Copy(const CObArray& src)
{
    if (this != &src)
        ARRAY_REF(CObject*).Copy(src.m_pData, src.m_nSize);
}

void CObArray::RemoveAt(INT_PTR nIndex, INT_PTR nCount)
{
    ARRAY_REF(CObject*).RemoveAt(nIndex, nCount);
}

void CObArray::InsertAt(INT_PTR nStartIndex, CObArray* pNewArray)
{
    if (pNewArray == NULL)
        AfxThrowInvalidArgException();
    if (pNewArray->GetSize() == 0)
        return;
    if (pNewArray == this)
    {
        CObArray copy;
        copy.Copy(*this);
        InsertAt(nStartIndex, &copy);
        return;
    }
    ARRAY_REF(CObject*).InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
    for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
        m_pData[nStartIndex + i] = pNewArray->m_pData[i];
}

/////////////////////////////////////////////////////////////////////////////
// CStringArray

IMPLEMENT_DYNAMIC(CStringArray, CObject)

CStringArray::CStringArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0)
{
}

CStringArray::~CStringArray()
{
    ARRAY_REF(CString).RemoveAll();
}

void CStringArray::SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
{
    ARRAY_REF(CString).SetSize(nNewSize, nGrowBy);
}

void CStringArray::FreeExtra()
{
    ARRAY_REF(CString).FreeExtra();
}

void CStringArray::RemoveAll()
{
    ARRAY_REF(CString).RemoveAll();
}

void CStringArray::SetAt(INT_PTR nIndex, LPCTSTR newElement)
{
    CheckIndex(nIndex);
    m_pData[nIndex] = newElement;
}

void CStringArray::SetAtGrow(INT_PTR nIndex, LPCTSTR newElement)
{
    ARRAY_REF(CString).SetAtGrow(nIndex, CString(newElement));
}

INT_PTR CStringArray::Add(LPCTSTR newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(CString).SetAtGrow(nIndex, CString(newElement));
    return nIndex;
}

void CStringArray::InsertAt(INT_PTR nIndex, LPCTSTR newElement, INT_PTR nCount)
{
    ARRAY_REF(CString).InsertAt(nIndex, CString(newElement), nCount);
}

void CStringArray::SetAt(INT_PTR nIndex, const CString& newElement)
{
    CheckIndex(nIndex);
    m_pData[nIndex] = newElement;
}

void CStringArray::SetAtGrow(INT_PTR nIndex, const CString& newElement)
{
    ARRAY_REF(CString).SetAtGrow(nIndex, newElement);
}

INT_PTR CStringArray::Add(const CString& newElement)
{
    INT_PTR nIndex = m_nSize;
    ARRAY_REF(CString).SetAtGrow(nIndex, newElement);
    return nIndex;
}

void CStringArray::InsertAt(INT_PTR nIndex, const CString& newElement, INT_PTR nCount)
{
    ARRAY_REF(CString).InsertAt(nIndex, newElement, nCount);
}

INT_PTR CStringArray::Append(const CStringArray& src)
{
    return ARRAY_REF(CString).Append(src.m_pData, src.m_nSize, src.m_pData);
}

void CStringArray::Copy(const CStringArray& src)
{
    if (this != &src)
        ARRAY_REF(CString).Copy(src.m_pData, src.m_nSize);
}

void CStringArray::RemoveAt(INT_PTR nIndex, INT_PTR nCount)
{
    ARRAY_REF(CString).RemoveAt(nIndex, nCount);
}

void CStringArray::InsertAt(INT_PTR nStartIndex, CStringArray* pNewArray)
{
    if (pNewArray == NULL)
        AfxThrowInvalidArgException();
    if (pNewArray->GetSize() == 0)
        return;
    if (pNewArray == this)
    {
        CStringArray copy;
        copy.Copy(*this);
        InsertAt(nStartIndex, &copy);
        return;
    }
    ARRAY_REF(CString).InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
    for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
        m_pData[nStartIndex + i] = pNewArray->m_pData[i];
}
