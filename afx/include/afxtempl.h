// afxtempl.h - the collection templates: CArray, CList, CMap and the typed
// pointer wrappers over the untyped collections of afxcoll.h.
#pragma once

#ifndef __AFXTEMPL_H__
#define __AFXTEMPL_H__

#include <afx.h>
#include <afxplex_.h>
#include <afxcoll.h>

/////////////////////////////////////////////////////////////////////////////
// Element helpers (elements are built in place; storage is raw memory)

template<class TYPE>
AFX_INLINE void AFXAPI ConstructElements(TYPE* pElements, INT_PTR nCount)
{
    AfxCollImpl::ConstructRange(pElements, nCount);
}

template<class TYPE>
AFX_INLINE void AFXAPI DestructElements(TYPE* pElements, INT_PTR nCount)
{
    AfxCollImpl::DestroyRange(pElements, nCount);
}

template<class TYPE>
AFX_INLINE void AFXAPI CopyElements(TYPE* pDest, const TYPE* pSrc, INT_PTR nCount)
{
    for (INT_PTR i = 0; i < nCount; i++)
        pDest[i] = pSrc[i];
}

template<class TYPE, class ARG_TYPE>
AFX_INLINE BOOL AFXAPI CompareElements(const TYPE* pElement1, const ARG_TYPE* pElement2)
{
    return *pElement1 == *pElement2;
}

// The default hash works for integers and for pointer-sized keys (handles,
// pointers) alike; strings have their own.
template<class ARG_KEY>
AFX_INLINE UINT AFXAPI HashKey(ARG_KEY key)
{
    return AfxCollImpl::HashPointer((const void*)(UINT_PTR)key);
}

template<>
AFX_INLINE UINT AFXAPI HashKey<LPCWSTR>(LPCWSTR key)
{
    return AfxCollImpl::HashString(key);
}

template<>
AFX_INLINE UINT AFXAPI HashKey<LPWSTR>(LPWSTR key)
{
    return AfxCollImpl::HashString(key);
}

template<>
AFX_INLINE UINT AFXAPI HashKey<LPCSTR>(LPCSTR key)
{
    return AfxCollImpl::HashString(key);
}

template<>
AFX_INLINE UINT AFXAPI HashKey<LPSTR>(LPSTR key)
{
    return AfxCollImpl::HashString(key);
}

template<>
AFX_INLINE UINT AFXAPI HashKey<const CString&>(const CString& key)
{
    return AfxCollImpl::HashString((LPCTSTR)key);
}

template<>
AFX_INLINE UINT AFXAPI HashKey<CString>(CString key)
{
    return AfxCollImpl::HashString((LPCTSTR)key);
}

/////////////////////////////////////////////////////////////////////////////
// CArray<TYPE, ARG_TYPE>

template<class TYPE, class ARG_TYPE = const TYPE&>
class CArray : public CObject
{
public:
// Construction
    CArray() : m_pData(NULL), m_nSize(0), m_nMaxSize(0), m_nGrowBy(0) {}

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1) { Ref().SetSize(nNewSize, nGrowBy); }

// Operations
    void FreeExtra() { Ref().FreeExtra(); }
    void RemoveAll() { Ref().RemoveAll(); }

    // Element access (an index out of range throws CInvalidArgException)
    const TYPE& GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    TYPE& GetAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, ARG_TYPE newElement) { CheckIndex(nIndex); m_pData[nIndex] = newElement; }
    const TYPE& ElementAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    TYPE& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const TYPE* GetData() const { return m_pData; }
    TYPE* GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, ARG_TYPE newElement) { Ref().SetAtGrow(nIndex, TYPE(newElement)); }
    INT_PTR Add(ARG_TYPE newElement)
    {
        INT_PTR nIndex = m_nSize;
        Ref().SetAtGrow(nIndex, TYPE(newElement));
        return nIndex;
    }
    INT_PTR Append(const CArray& src) { return Ref().Append(src.m_pData, src.m_nSize, src.m_pData); }
    void Copy(const CArray& src)
    {
        if (this != &src)
            Ref().Copy(src.m_pData, src.m_nSize);
    }

    const TYPE& operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    TYPE& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, ARG_TYPE newElement, INT_PTR nCount = 1)
        { Ref().InsertAt(nIndex, TYPE(newElement), nCount); }
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1) { Ref().RemoveAt(nIndex, nCount); }
    void InsertAt(INT_PTR nStartIndex, CArray* pNewArray)
    {
        if (pNewArray == NULL)
            AfxThrowInvalidArgException();
        if (pNewArray->GetSize() == 0)
            return;
        if (pNewArray == this)
        {
            CArray copy;
            copy.Copy(*this);
            InsertAt(nStartIndex, &copy);
            return;
        }
        Ref().InsertAt(nStartIndex, pNewArray->m_pData[0], pNewArray->m_nSize);
        for (INT_PTR i = 1; i < pNewArray->m_nSize; i++)
            m_pData[nStartIndex + i] = pNewArray->m_pData[i];
    }

// Implementation
protected:
    TYPE* m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }
    AfxCollImpl::ArrayRef<TYPE> Ref() { return { m_pData, m_nSize, m_nMaxSize, m_nGrowBy }; }

public:
    virtual ~CArray() { Ref().RemoveAll(); }
};

/////////////////////////////////////////////////////////////////////////////
// CList<TYPE, ARG_TYPE>

template<class TYPE, class ARG_TYPE = const TYPE&>
class CList : public CObject
{
protected:
    struct CNode
    {
        CNode* pNext;
        CNode* pPrev;
        TYPE data;
    };

public:
// Construction
    explicit CList(INT_PTR nBlockSize = 10)
        : m_pNodeHead(NULL), m_pNodeTail(NULL), m_nCount(0), m_pNodeFree(NULL),
          m_pBlocks(NULL), m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10) {}

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }

    // Head and tail of a non-empty list (an empty one throws CInvalidArgException)
    TYPE& GetHead() { return Ref::Node((POSITION)m_pNodeHead)->data; }
    const TYPE& GetHead() const { return Ref::Node((POSITION)m_pNodeHead)->data; }
    TYPE& GetTail() { return Ref::Node((POSITION)m_pNodeTail)->data; }
    const TYPE& GetTail() const { return Ref::Node((POSITION)m_pNodeTail)->data; }

// Operations
    TYPE RemoveHead() { return MakeRef().RemoveHead(); }
    TYPE RemoveTail() { return MakeRef().RemoveTail(); }
    POSITION AddHead(ARG_TYPE newElement) { return MakeRef().AddHead(newElement); }
    POSITION AddTail(ARG_TYPE newElement) { return MakeRef().AddTail(newElement); }
    void AddHead(CList* pNewList)
    {
        if (pNewList == NULL)
            AfxThrowInvalidArgException();
        INT_PTR nCount = pNewList->GetCount();
        POSITION pos = pNewList->GetTailPosition();
        while (pos != NULL && nCount-- > 0)
            AddHead(pNewList->GetPrev(pos));
    }
    void AddTail(CList* pNewList)
    {
        if (pNewList == NULL)
            AfxThrowInvalidArgException();
        INT_PTR nCount = pNewList->GetCount();
        POSITION pos = pNewList->GetHeadPosition();
        while (pos != NULL && nCount-- > 0)
            AddTail(pNewList->GetNext(pos));
    }
    void RemoveAll() { MakeRef().RemoveAll(); }

    // Iteration
    POSITION GetHeadPosition() const { return (POSITION)m_pNodeHead; }
    POSITION GetTailPosition() const { return (POSITION)m_pNodeTail; }
    TYPE& GetNext(POSITION& rPosition) { return Ref::Next(rPosition); }
    const TYPE& GetNext(POSITION& rPosition) const { return Ref::Next(rPosition); }
    TYPE& GetPrev(POSITION& rPosition) { return Ref::Prev(rPosition); }
    const TYPE& GetPrev(POSITION& rPosition) const { return Ref::Prev(rPosition); }

    // Access at a position
    TYPE& GetAt(POSITION position) { return Ref::Node(position)->data; }
    const TYPE& GetAt(POSITION position) const { return Ref::Node(position)->data; }
    void SetAt(POSITION pos, ARG_TYPE newElement) { Ref::Node(pos)->data = newElement; }
    void RemoveAt(POSITION position) { Ref::Node(position); MakeRef().RemoveAt(position); }

    // Insertion before or after a position (NULL: at the head or tail)
    POSITION InsertBefore(POSITION position, ARG_TYPE newElement)
        { return MakeRef().InsertBefore(position, newElement); }
    POSITION InsertAfter(POSITION position, ARG_TYPE newElement)
        { return MakeRef().InsertAfter(position, newElement); }

    // Searching (elements compared with CompareElements)
    POSITION Find(ARG_TYPE searchValue, POSITION startAfter = NULL) const
    {
        return const_cast<CList*>(this)->MakeRef().Find(startAfter,
            [&searchValue](const TYPE& element) { return CompareElements(&element, &searchValue) != FALSE; });
    }
    POSITION FindIndex(INT_PTR nIndex) const { return const_cast<CList*>(this)->MakeRef().FindIndex(nIndex); }

// Implementation
protected:
    CNode* m_pNodeHead;
    CNode* m_pNodeTail;
    INT_PTR m_nCount;
    CNode* m_pNodeFree;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

    typedef AfxCollImpl::ListRef<CNode, TYPE> Ref;
    Ref MakeRef() { return { m_pNodeHead, m_pNodeTail, m_nCount, m_pNodeFree, m_pBlocks, m_nBlockSize }; }

public:
    virtual ~CList() { MakeRef().RemoveAll(); }
};

/////////////////////////////////////////////////////////////////////////////
// CMap<KEY, ARG_KEY, VALUE, ARG_VALUE>

template<class KEY, class ARG_KEY, class VALUE, class ARG_VALUE>
class CMap : public CObject
{
public:
    // A key and its value, as PLookup returns them.
    class CPair
    {
    public:
        const KEY key;
        VALUE value;
    protected:
        explicit CPair(ARG_KEY keyval) : key(keyval), value() {}
    };

protected:
    class CAssoc : public CPair
    {
        friend class CMap<KEY, ARG_KEY, VALUE, ARG_VALUE>;
        friend struct AfxCollImpl::MapRef<CAssoc, ARG_KEY, CMap<KEY, ARG_KEY, VALUE, ARG_VALUE> >;
        CAssoc* pNext;
        UINT nHashValue;
    public:
        explicit CAssoc(ARG_KEY key) : CPair(key) {}
    };

public:
// Construction
    explicit CMap(INT_PTR nBlockSize = 10)
        : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL),
          m_pBlocks(NULL), m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10) {}

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }

    BOOL Lookup(ARG_KEY key, VALUE& rValue) const
    {
        const CPair* pPair = PLookup(key);
        if (pPair == NULL)
            return FALSE;
        rValue = pPair->value;
        return TRUE;
    }
    const CPair* PLookup(ARG_KEY key) const
    {
        UINT nHashBucket, nHashValue;
        return const_cast<CMap*>(this)->MakeRef().GetAssocAt(key, nHashBucket, nHashValue);
    }
    CPair* PLookup(ARG_KEY key)
    {
        UINT nHashBucket, nHashValue;
        return MakeRef().GetAssocAt(key, nHashBucket, nHashValue);
    }

// Operations
    VALUE& operator[](ARG_KEY key) { return MakeRef().LookupOrAdd(key)->value; }
    void SetAt(ARG_KEY key, ARG_VALUE newValue) { (*this)[key] = newValue; }
    BOOL RemoveKey(ARG_KEY key) { return MakeRef().RemoveKey(key); }
    void RemoveAll() { MakeRef().RemoveAll(); }

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, KEY& rKey, VALUE& rValue) const
    {
        CAssoc* pAssoc = const_cast<CMap*>(this)->MakeRef().GetNextAssoc(rNextPosition);
        rKey = pAssoc->key;
        rValue = pAssoc->value;
    }

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE) { MakeRef().InitHashTable(hashSize, bAllocNow); }

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

    friend struct AfxCollImpl::MapRef<CAssoc, ARG_KEY, CMap>;
    typedef AfxCollImpl::MapRef<CAssoc, ARG_KEY, CMap> Ref;
    Ref MakeRef()
        { return { m_pHashTable, m_nHashTableSize, m_nCount, m_pFreeList, m_pBlocks, m_nBlockSize }; }

    // Hashing and comparison for the shared map algorithms.
    static UINT Hash(ARG_KEY key) { return HashKey<ARG_KEY>(key); }
    static bool Equal(const KEY& key1, ARG_KEY key2) { return CompareElements(&key1, &key2) != FALSE; }

public:
    virtual ~CMap() { MakeRef().RemoveAll(); }
};

/////////////////////////////////////////////////////////////////////////////
// CTypedPtrArray<BASE_CLASS, TYPE>: CPtrArray or CObArray holding TYPE pointers

template<class BASE_CLASS, class TYPE>
class CTypedPtrArray : public BASE_CLASS
{
public:
// Accessing elements
    TYPE GetAt(INT_PTR nIndex) const { return (TYPE)BASE_CLASS::GetAt(nIndex); }
    TYPE& ElementAt(INT_PTR nIndex) { return (TYPE&)BASE_CLASS::ElementAt(nIndex); }
    void SetAt(INT_PTR nIndex, TYPE ptr) { BASE_CLASS::SetAt(nIndex, ptr); }

// Potentially growing the array
    void SetAtGrow(INT_PTR nIndex, TYPE newElement) { BASE_CLASS::SetAtGrow(nIndex, newElement); }
    INT_PTR Add(TYPE newElement) { return BASE_CLASS::Add(newElement); }
    INT_PTR Append(const CTypedPtrArray<BASE_CLASS, TYPE>& src) { return BASE_CLASS::Append(src); }
    void Copy(const CTypedPtrArray<BASE_CLASS, TYPE>& src) { BASE_CLASS::Copy(src); }

// Operations that move elements around
    void InsertAt(INT_PTR nIndex, TYPE newElement, INT_PTR nCount = 1)
        { BASE_CLASS::InsertAt(nIndex, newElement, nCount); }
    void InsertAt(INT_PTR nStartIndex, CTypedPtrArray<BASE_CLASS, TYPE>* pNewArray)
        { BASE_CLASS::InsertAt(nStartIndex, pNewArray); }

// Overloaded operator helpers
    TYPE operator[](INT_PTR nIndex) const { return (TYPE)BASE_CLASS::operator[](nIndex); }
    TYPE& operator[](INT_PTR nIndex) { return (TYPE&)BASE_CLASS::operator[](nIndex); }

    const TYPE* GetData() const { return (const TYPE*)BASE_CLASS::GetData(); }
    TYPE* GetData() { return (TYPE*)BASE_CLASS::GetData(); }
};

/////////////////////////////////////////////////////////////////////////////
// CTypedPtrList<BASE_CLASS, TYPE>: CPtrList or CObList holding TYPE pointers

template<class BASE_CLASS, class TYPE>
class CTypedPtrList : public BASE_CLASS
{
public:
// Construction
    explicit CTypedPtrList(INT_PTR nBlockSize = 10) : BASE_CLASS(nBlockSize) {}

// Peek at head or tail
    TYPE& GetHead() { return (TYPE&)BASE_CLASS::GetHead(); }
    TYPE GetHead() const { return (TYPE)BASE_CLASS::GetHead(); }
    TYPE& GetTail() { return (TYPE&)BASE_CLASS::GetTail(); }
    TYPE GetTail() const { return (TYPE)BASE_CLASS::GetTail(); }

// Get head or tail (and remove it)
    TYPE RemoveHead() { return (TYPE)BASE_CLASS::RemoveHead(); }
    TYPE RemoveTail() { return (TYPE)BASE_CLASS::RemoveTail(); }

// Add before head or after tail
    POSITION AddHead(TYPE newElement) { return BASE_CLASS::AddHead(newElement); }
    POSITION AddTail(TYPE newElement) { return BASE_CLASS::AddTail(newElement); }

// Add another list of elements before head or after tail
    void AddHead(CTypedPtrList<BASE_CLASS, TYPE>* pNewList) { BASE_CLASS::AddHead(pNewList); }
    void AddTail(CTypedPtrList<BASE_CLASS, TYPE>* pNewList) { BASE_CLASS::AddTail(pNewList); }

// Iteration
    TYPE& GetNext(POSITION& rPosition) { return (TYPE&)BASE_CLASS::GetNext(rPosition); }
    TYPE GetNext(POSITION& rPosition) const { return (TYPE)BASE_CLASS::GetNext(rPosition); }
    TYPE& GetPrev(POSITION& rPosition) { return (TYPE&)BASE_CLASS::GetPrev(rPosition); }
    TYPE GetPrev(POSITION& rPosition) const { return (TYPE)BASE_CLASS::GetPrev(rPosition); }

// Getting/modifying an element at a given position
    TYPE& GetAt(POSITION position) { return (TYPE&)BASE_CLASS::GetAt(position); }
    TYPE GetAt(POSITION position) const { return (TYPE)BASE_CLASS::GetAt(position); }
    void SetAt(POSITION pos, TYPE newElement) { BASE_CLASS::SetAt(pos, newElement); }
};

/////////////////////////////////////////////////////////////////////////////
// CTypedPtrMap<BASE_CLASS, KEY, VALUE>: a CMap*To* map with typed keys and values

template<class BASE_CLASS, class KEY, class VALUE>
class CTypedPtrMap : public BASE_CLASS
{
public:
// Construction
    explicit CTypedPtrMap(INT_PTR nBlockSize = 10) : BASE_CLASS(nBlockSize) {}

// Lookup
    BOOL Lookup(typename BASE_CLASS::BASE_ARG_KEY key, VALUE& rValue) const
    {
        typename BASE_CLASS::BASE_VALUE value = typename BASE_CLASS::BASE_VALUE();
        if (!BASE_CLASS::Lookup(key, value))
            return FALSE;
        rValue = (VALUE)value;
        return TRUE;
    }

// Lookup and add if not there
    VALUE& operator[](typename BASE_CLASS::BASE_ARG_KEY key)
        { return (VALUE&)BASE_CLASS::operator[](key); }

// Add a new key (key, value) pair
    void SetAt(KEY key, VALUE newValue) { BASE_CLASS::SetAt(key, newValue); }

// Removing existing (key, ?) pair
    BOOL RemoveKey(KEY key) { return BASE_CLASS::RemoveKey(key); }

// Iteration
    void GetNextAssoc(POSITION& rPosition, KEY& rKey, VALUE& rValue) const
    {
        typename BASE_CLASS::BASE_KEY key;
        typename BASE_CLASS::BASE_VALUE value;
        BASE_CLASS::GetNextAssoc(rPosition, key, value);
        rKey = (KEY)key;
        rValue = (VALUE)value;
    }
};

#endif // __AFXTEMPL_H__
