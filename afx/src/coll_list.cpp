// The untyped lists. Node handling is shared with CList (afxplex_.h).
#include <afxcoll.h>

// The const members only read through the reference.
#define LIST_REF(TYPE) AfxCollImpl::ListRef<CNode, TYPE>{ const_cast<CNode*&>(m_pNodeHead), \
    const_cast<CNode*&>(m_pNodeTail), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CNode*&>(m_pNodeFree), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

/////////////////////////////////////////////////////////////////////////////
// CPtrList

IMPLEMENT_DYNAMIC(CPtrList, CObject)

CPtrList::CPtrList(INT_PTR nBlockSize)
    : m_pNodeHead(NULL), m_pNodeTail(NULL), m_nCount(0), m_pNodeFree(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CPtrList::~CPtrList()
{
    LIST_REF(void*).RemoveAll();
}

void CPtrList::RemoveAll()
{
    LIST_REF(void*).RemoveAll();
}

void*& CPtrList::GetHead()
{
    if (m_pNodeHead == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeHead->data;
}

const void* CPtrList::GetHead() const
{
    if (m_pNodeHead == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeHead->data;
}

void* CPtrList::RemoveHead()
{
    return LIST_REF(void*).RemoveHead();
}

void*& CPtrList::GetTail()
{
    if (m_pNodeTail == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeTail->data;
}

const void* CPtrList::GetTail() const
{
    if (m_pNodeTail == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeTail->data;
}

void* CPtrList::RemoveTail()
{
    return LIST_REF(void*).RemoveTail();
}

POSITION CPtrList::AddHead(void* newElement)
{
    return LIST_REF(void*).AddHead(newElement);
}

POSITION CPtrList::AddTail(void* newElement)
{
    return LIST_REF(void*).AddTail(newElement);
}

POSITION CPtrList::InsertBefore(POSITION position, void* newElement)
{
    return LIST_REF(void*).InsertBefore(position, newElement);
}

POSITION CPtrList::InsertAfter(POSITION position, void* newElement)
{
    return LIST_REF(void*).InsertAfter(position, newElement);
}

void CPtrList::SetAt(POSITION pos, void* newElement)
{
    AfxCollImpl::ListRef<CNode, void*>::Node(pos)->data = newElement;
}

void CPtrList::AddHead(CPtrList* pNewList)
{
    if (pNewList == NULL)
        AfxThrowInvalidArgException();
    // Walks backwards so that the order is kept; the tail position is taken
    // first, so adding a list to itself stops after its original elements.
    INT_PTR nCount = pNewList->GetCount();
    POSITION pos = pNewList->GetTailPosition();
    while (pos != NULL && nCount-- > 0)
        AddHead(pNewList->GetPrev(pos));
}

void CPtrList::AddTail(CPtrList* pNewList)
{
    if (pNewList == NULL)
        AfxThrowInvalidArgException();
    INT_PTR nCount = pNewList->GetCount();
    POSITION pos = pNewList->GetHeadPosition();
    while (pos != NULL && nCount-- > 0)
        AddTail(pNewList->GetNext(pos));
}

void*& CPtrList::GetNext(POSITION& rPosition)
{
    return AfxCollImpl::ListRef<CNode, void*>::Next(rPosition);
}

const void* CPtrList::GetNext(POSITION& rPosition) const
{
    return AfxCollImpl::ListRef<CNode, void*>::Next(rPosition);
}

void*& CPtrList::GetPrev(POSITION& rPosition)
{
    return AfxCollImpl::ListRef<CNode, void*>::Prev(rPosition);
}

const void* CPtrList::GetPrev(POSITION& rPosition) const
{
    return AfxCollImpl::ListRef<CNode, void*>::Prev(rPosition);
}

void*& CPtrList::GetAt(POSITION position)
{
    return AfxCollImpl::ListRef<CNode, void*>::Node(position)->data;
}

const void* CPtrList::GetAt(POSITION position) const
{
    return AfxCollImpl::ListRef<CNode, void*>::Node(position)->data;
}

void CPtrList::RemoveAt(POSITION position)
{
    AfxCollImpl::ListRef<CNode, void*>::Node(position);
    LIST_REF(void*).RemoveAt(position);
}

POSITION CPtrList::Find(void* searchValue, POSITION startAfter) const
{
    return LIST_REF(void*).Find(startAfter, [searchValue](void* p) { return p == searchValue; });
}

POSITION CPtrList::FindIndex(INT_PTR nIndex) const
{
    return LIST_REF(void*).FindIndex(nIndex);
}

/////////////////////////////////////////////////////////////////////////////
// CObList

IMPLEMENT_DYNAMIC(CObList, CObject)

CObList::CObList(INT_PTR nBlockSize)
    : m_pNodeHead(NULL), m_pNodeTail(NULL), m_nCount(0), m_pNodeFree(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CObList::~CObList()
{
    LIST_REF(CObject*).RemoveAll();
}

void CObList::RemoveAll()
{
    LIST_REF(CObject*).RemoveAll();
}

CObject*& CObList::GetHead()
{
    if (m_pNodeHead == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeHead->data;
}

const CObject* CObList::GetHead() const
{
    if (m_pNodeHead == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeHead->data;
}

CObject* CObList::RemoveHead()
{
    return LIST_REF(CObject*).RemoveHead();
}

CObject*& CObList::GetTail()
{
    if (m_pNodeTail == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeTail->data;
}

const CObject* CObList::GetTail() const
{
    if (m_pNodeTail == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeTail->data;
}

CObject* CObList::RemoveTail()
{
    return LIST_REF(CObject*).RemoveTail();
}

POSITION CObList::AddHead(CObject* newElement)
{
    return LIST_REF(CObject*).AddHead(newElement);
}

POSITION CObList::AddTail(CObject* newElement)
{
    return LIST_REF(CObject*).AddTail(newElement);
}

POSITION CObList::InsertBefore(POSITION position, CObject* newElement)
{
    return LIST_REF(CObject*).InsertBefore(position, newElement);
}

POSITION CObList::InsertAfter(POSITION position, CObject* newElement)
{
    return LIST_REF(CObject*).InsertAfter(position, newElement);
}

void CObList::SetAt(POSITION pos, CObject* newElement)
{
    AfxCollImpl::ListRef<CNode, CObject*>::Node(pos)->data = newElement;
}

void CObList::AddHead(CObList* pNewList)
{
    if (pNewList == NULL)
        AfxThrowInvalidArgException();
    // Walks backwards so that the order is kept; the tail position is taken
    // first, so adding a list to itself stops after its original elements.
    INT_PTR nCount = pNewList->GetCount();
    POSITION pos = pNewList->GetTailPosition();
    while (pos != NULL && nCount-- > 0)
        AddHead(pNewList->GetPrev(pos));
}

void CObList::AddTail(CObList* pNewList)
{
    if (pNewList == NULL)
        AfxThrowInvalidArgException();
    INT_PTR nCount = pNewList->GetCount();
    POSITION pos = pNewList->GetHeadPosition();
    while (pos != NULL && nCount-- > 0)
        AddTail(pNewList->GetNext(pos));
}

CObject*& CObList::GetNext(POSITION& rPosition)
{
    return AfxCollImpl::ListRef<CNode, CObject*>::Next(rPosition);
}

const CObject* CObList::GetNext(POSITION& rPosition) const
{
    return AfxCollImpl::ListRef<CNode, CObject*>::Next(rPosition);
}

CObject*& CObList::GetPrev(POSITION& rPosition)
{
    return AfxCollImpl::ListRef<CNode, CObject*>::Prev(rPosition);
}

const CObject* CObList::GetPrev(POSITION& rPosition) const
{
    return AfxCollImpl::ListRef<CNode, CObject*>::Prev(rPosition);
}

CObject*& CObList::GetAt(POSITION position)
{
    return AfxCollImpl::ListRef<CNode, CObject*>::Node(position)->data;
}

const CObject* CObList::GetAt(POSITION position) const
{
    return AfxCollImpl::ListRef<CNode, CObject*>::Node(position)->data;
}

void CObList::RemoveAt(POSITION position)
{
    AfxCollImpl::ListRef<CNode, CObject*>::Node(position);
    LIST_REF(CObject*).RemoveAt(position);
}

POSITION CObList::Find(CObject* searchValue, POSITION startAfter) const
{
    return LIST_REF(CObject*).Find(startAfter, [searchValue](CObject* p) { return p == searchValue; });
}

POSITION CObList::FindIndex(INT_PTR nIndex) const
{
    return LIST_REF(CObject*).FindIndex(nIndex);
}

/////////////////////////////////////////////////////////////////////////////
// CStringList

IMPLEMENT_DYNAMIC(CStringList, CObject)

CStringList::CStringList(INT_PTR nBlockSize)
    : m_pNodeHead(NULL), m_pNodeTail(NULL), m_nCount(0), m_pNodeFree(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CStringList::~CStringList()
{
    LIST_REF(CString).RemoveAll();
}

void CStringList::RemoveAll()
{
    LIST_REF(CString).RemoveAll();
}

CString& CStringList::GetHead()
{
    if (m_pNodeHead == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeHead->data;
}

const CString& CStringList::GetHead() const
{
    if (m_pNodeHead == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeHead->data;
}

CString CStringList::RemoveHead()
{
    return LIST_REF(CString).RemoveHead();
}

CString& CStringList::GetTail()
{
    if (m_pNodeTail == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeTail->data;
}

const CString& CStringList::GetTail() const
{
    if (m_pNodeTail == NULL)
        AfxThrowInvalidArgException();
    return m_pNodeTail->data;
}

CString CStringList::RemoveTail()
{
    return LIST_REF(CString).RemoveTail();
}

POSITION CStringList::AddHead(LPCTSTR newElement)
{
    return LIST_REF(CString).AddHead(CString(newElement));
}

POSITION CStringList::AddTail(LPCTSTR newElement)
{
    return LIST_REF(CString).AddTail(CString(newElement));
}

POSITION CStringList::InsertBefore(POSITION position, LPCTSTR newElement)
{
    return LIST_REF(CString).InsertBefore(position, CString(newElement));
}

POSITION CStringList::InsertAfter(POSITION position, LPCTSTR newElement)
{
    return LIST_REF(CString).InsertAfter(position, CString(newElement));
}

void CStringList::SetAt(POSITION pos, LPCTSTR newElement)
{
    AfxCollImpl::ListRef<CNode, CString>::Node(pos)->data = newElement;
}

POSITION CStringList::AddHead(const CString& newElement)
{
    return LIST_REF(CString).AddHead(newElement);
}

POSITION CStringList::AddTail(const CString& newElement)
{
    return LIST_REF(CString).AddTail(newElement);
}

POSITION CStringList::InsertBefore(POSITION position, const CString& newElement)
{
    return LIST_REF(CString).InsertBefore(position, newElement);
}

POSITION CStringList::InsertAfter(POSITION position, const CString& newElement)
{
    return LIST_REF(CString).InsertAfter(position, newElement);
}

void CStringList::SetAt(POSITION pos, const CString& newElement)
{
    AfxCollImpl::ListRef<CNode, CString>::Node(pos)->data = newElement;
}

void CStringList::AddHead(CStringList* pNewList)
{
    if (pNewList == NULL)
        AfxThrowInvalidArgException();
    // Walks backwards so that the order is kept; the tail position is taken
    // first, so adding a list to itself stops after its original elements.
    INT_PTR nCount = pNewList->GetCount();
    POSITION pos = pNewList->GetTailPosition();
    while (pos != NULL && nCount-- > 0)
        AddHead(pNewList->GetPrev(pos));
}

void CStringList::AddTail(CStringList* pNewList)
{
    if (pNewList == NULL)
        AfxThrowInvalidArgException();
    INT_PTR nCount = pNewList->GetCount();
    POSITION pos = pNewList->GetHeadPosition();
    while (pos != NULL && nCount-- > 0)
        AddTail(pNewList->GetNext(pos));
}

CString& CStringList::GetNext(POSITION& rPosition)
{
    return AfxCollImpl::ListRef<CNode, CString>::Next(rPosition);
}

const CString& CStringList::GetNext(POSITION& rPosition) const
{
    return AfxCollImpl::ListRef<CNode, CString>::Next(rPosition);
}

CString& CStringList::GetPrev(POSITION& rPosition)
{
    return AfxCollImpl::ListRef<CNode, CString>::Prev(rPosition);
}

const CString& CStringList::GetPrev(POSITION& rPosition) const
{
    return AfxCollImpl::ListRef<CNode, CString>::Prev(rPosition);
}

CString& CStringList::GetAt(POSITION position)
{
    return AfxCollImpl::ListRef<CNode, CString>::Node(position)->data;
}

const CString& CStringList::GetAt(POSITION position) const
{
    return AfxCollImpl::ListRef<CNode, CString>::Node(position)->data;
}

void CStringList::RemoveAt(POSITION position)
{
    AfxCollImpl::ListRef<CNode, CString>::Node(position);
    LIST_REF(CString).RemoveAt(position);
}

POSITION CStringList::Find(LPCTSTR searchValue, POSITION startAfter) const
{
    return LIST_REF(CString).Find(startAfter, [searchValue](const CString& s) { return s == searchValue; });
}

POSITION CStringList::FindIndex(INT_PTR nIndex) const
{
    return LIST_REF(CString).FindIndex(nIndex);
}
