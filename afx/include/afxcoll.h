// afxcoll.h - the untyped collections: arrays, lists and hash maps of bytes,
// words, pointers, CObject pointers and strings.
#pragma once

#ifndef __AFXCOLL_H__
#define __AFXCOLL_H__

#include <afx.h>
#include <afxplex_.h>

/////////////////////////////////////////////////////////////////////////////
// CByteArray

class CByteArray : public CObject
{
    DECLARE_DYNAMIC(CByteArray)
public:
// Construction
    CByteArray();

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1);

// Operations
    void FreeExtra();
    void RemoveAll();

    // Element access (an index out of range throws CInvalidArgException)
    BYTE GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, BYTE newElement) { CheckIndex(nIndex); m_pData[nIndex] = newElement; }
    BYTE& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const BYTE* GetData() const { return (const BYTE*)m_pData; }
    BYTE* GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, BYTE newElement);
    INT_PTR Add(BYTE newElement);
    INT_PTR Append(const CByteArray& src);
    void Copy(const CByteArray& src);

    BYTE operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    BYTE& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, BYTE newElement, INT_PTR nCount = 1);
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nStartIndex, CByteArray* pNewArray);

// Implementation
protected:
    BYTE* m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }

public:
    virtual ~CByteArray();

    typedef BYTE BASE_TYPE;
    typedef BYTE BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CWordArray

class CWordArray : public CObject
{
    DECLARE_DYNAMIC(CWordArray)
public:
// Construction
    CWordArray();

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1);

// Operations
    void FreeExtra();
    void RemoveAll();

    // Element access (an index out of range throws CInvalidArgException)
    WORD GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, WORD newElement) { CheckIndex(nIndex); m_pData[nIndex] = newElement; }
    WORD& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const WORD* GetData() const { return (const WORD*)m_pData; }
    WORD* GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, WORD newElement);
    INT_PTR Add(WORD newElement);
    INT_PTR Append(const CWordArray& src);
    void Copy(const CWordArray& src);

    WORD operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    WORD& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, WORD newElement, INT_PTR nCount = 1);
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nStartIndex, CWordArray* pNewArray);

// Implementation
protected:
    WORD* m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }

public:
    virtual ~CWordArray();

    typedef WORD BASE_TYPE;
    typedef WORD BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CDWordArray

class CDWordArray : public CObject
{
    DECLARE_DYNAMIC(CDWordArray)
public:
// Construction
    CDWordArray();

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1);

// Operations
    void FreeExtra();
    void RemoveAll();

    // Element access (an index out of range throws CInvalidArgException)
    DWORD GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, DWORD newElement) { CheckIndex(nIndex); m_pData[nIndex] = newElement; }
    DWORD& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const DWORD* GetData() const { return (const DWORD*)m_pData; }
    DWORD* GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, DWORD newElement);
    INT_PTR Add(DWORD newElement);
    INT_PTR Append(const CDWordArray& src);
    void Copy(const CDWordArray& src);

    DWORD operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    DWORD& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, DWORD newElement, INT_PTR nCount = 1);
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nStartIndex, CDWordArray* pNewArray);

// Implementation
protected:
    DWORD* m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }

public:
    virtual ~CDWordArray();

    typedef DWORD BASE_TYPE;
    typedef DWORD BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CUIntArray

class CUIntArray : public CObject
{
    DECLARE_DYNAMIC(CUIntArray)
public:
// Construction
    CUIntArray();

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1);

// Operations
    void FreeExtra();
    void RemoveAll();

    // Element access (an index out of range throws CInvalidArgException)
    UINT GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, UINT newElement) { CheckIndex(nIndex); m_pData[nIndex] = newElement; }
    UINT& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const UINT* GetData() const { return (const UINT*)m_pData; }
    UINT* GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, UINT newElement);
    INT_PTR Add(UINT newElement);
    INT_PTR Append(const CUIntArray& src);
    void Copy(const CUIntArray& src);

    UINT operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    UINT& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, UINT newElement, INT_PTR nCount = 1);
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nStartIndex, CUIntArray* pNewArray);

// Implementation
protected:
    UINT* m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }

public:
    virtual ~CUIntArray();

    typedef UINT BASE_TYPE;
    typedef UINT BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CPtrArray

class CPtrArray : public CObject
{
    DECLARE_DYNAMIC(CPtrArray)
public:
// Construction
    CPtrArray();

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1);

// Operations
    void FreeExtra();
    void RemoveAll();

    // Element access (an index out of range throws CInvalidArgException)
    void* GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, void* newElement) { CheckIndex(nIndex); m_pData[nIndex] = newElement; }
    void*& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const void** GetData() const { return (const void**)m_pData; }
    void** GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, void* newElement);
    INT_PTR Add(void* newElement);
    INT_PTR Append(const CPtrArray& src);
    void Copy(const CPtrArray& src);

    void* operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    void*& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, void* newElement, INT_PTR nCount = 1);
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nStartIndex, CPtrArray* pNewArray);

// Implementation
protected:
    void** m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }

public:
    virtual ~CPtrArray();

    typedef void* BASE_TYPE;
    typedef void* BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CObArray

class CObArray : public CObject
{
    DECLARE_DYNAMIC(CObArray)
public:
// Construction
    CObArray();

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1);

// Operations
    void FreeExtra();
    void RemoveAll();

    // Element access (an index out of range throws CInvalidArgException)
    CObject* GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, CObject* newElement) { CheckIndex(nIndex); m_pData[nIndex] = newElement; }
    CObject*& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const CObject** GetData() const { return (const CObject**)m_pData; }
    CObject** GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, CObject* newElement);
    INT_PTR Add(CObject* newElement);
    INT_PTR Append(const CObArray& src);
    void Copy(const CObArray& src);

    CObject* operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    CObject*& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, CObject* newElement, INT_PTR nCount = 1);
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nStartIndex, CObArray* pNewArray);

// Implementation
protected:
    CObject** m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }

public:
    virtual ~CObArray();

    typedef CObject* BASE_TYPE;
    typedef CObject* BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CStringArray

class CStringArray : public CObject
{
    DECLARE_DYNAMIC(CStringArray)
public:
// Construction
    CStringArray();

// Attributes
    INT_PTR GetSize() const { return m_nSize; }
    INT_PTR GetCount() const { return m_nSize; }
    BOOL IsEmpty() const { return m_nSize == 0; }
    INT_PTR GetUpperBound() const { return m_nSize - 1; }
    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy = -1);

// Operations
    void FreeExtra();
    void RemoveAll();

    // Element access (an index out of range throws CInvalidArgException)
    const CString& GetAt(INT_PTR nIndex) const { CheckIndex(nIndex); return m_pData[nIndex]; }
    void SetAt(INT_PTR nIndex, LPCTSTR newElement);
    void SetAt(INT_PTR nIndex, const CString& newElement);
    CString& ElementAt(INT_PTR nIndex) { CheckIndex(nIndex); return m_pData[nIndex]; }
    const CString* GetData() const { return (const CString*)m_pData; }
    CString* GetData() { return m_pData; }

    // Growing
    void SetAtGrow(INT_PTR nIndex, LPCTSTR newElement);
    void SetAtGrow(INT_PTR nIndex, const CString& newElement);
    INT_PTR Add(LPCTSTR newElement);
    INT_PTR Add(const CString& newElement);
    INT_PTR Append(const CStringArray& src);
    void Copy(const CStringArray& src);

    const CString& operator[](INT_PTR nIndex) const { return GetAt(nIndex); }
    CString& operator[](INT_PTR nIndex) { return ElementAt(nIndex); }

    // Moving elements
    void InsertAt(INT_PTR nIndex, LPCTSTR newElement, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nIndex, const CString& newElement, INT_PTR nCount = 1);
    void RemoveAt(INT_PTR nIndex, INT_PTR nCount = 1);
    void InsertAt(INT_PTR nStartIndex, CStringArray* pNewArray);

// Implementation
protected:
    CString* m_pData;
    INT_PTR m_nSize;
    INT_PTR m_nMaxSize;
    INT_PTR m_nGrowBy;

    void CheckIndex(INT_PTR nIndex) const
        { if (nIndex < 0 || nIndex >= m_nSize) AfxThrowInvalidArgException(); }

public:
    virtual ~CStringArray();

    typedef CString BASE_TYPE;
    typedef LPCTSTR BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CPtrList

class CPtrList : public CObject
{
    DECLARE_DYNAMIC(CPtrList)
protected:
    struct CNode
    {
        CNode* pNext;
        CNode* pPrev;
        void* data;
    };

public:
// Construction
    explicit CPtrList(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }

    // Head and tail of a non-empty list (an empty one throws CInvalidArgException)
    void*& GetHead();
    const void* GetHead() const;
    void*& GetTail();
    const void* GetTail() const;

// Operations
    void* RemoveHead();
    void* RemoveTail();
    POSITION AddHead(void* newElement);
    POSITION AddTail(void* newElement);
    void AddHead(CPtrList* pNewList);
    void AddTail(CPtrList* pNewList);
    void RemoveAll();

    // Iteration
    POSITION GetHeadPosition() const { return (POSITION)m_pNodeHead; }
    POSITION GetTailPosition() const { return (POSITION)m_pNodeTail; }
    void*& GetNext(POSITION& rPosition);
    const void* GetNext(POSITION& rPosition) const;
    void*& GetPrev(POSITION& rPosition);
    const void* GetPrev(POSITION& rPosition) const;

    // Access at a position
    void*& GetAt(POSITION position);
    const void* GetAt(POSITION position) const;
    void SetAt(POSITION pos, void* newElement);
    void RemoveAt(POSITION position);

    // Insertion before or after a position (NULL: at the head or tail)
    POSITION InsertBefore(POSITION position, void* newElement);
    POSITION InsertAfter(POSITION position, void* newElement);

    // Searching
    POSITION Find(void* searchValue, POSITION startAfter = NULL) const;
    POSITION FindIndex(INT_PTR nIndex) const;

// Implementation
protected:
    CNode* m_pNodeHead;
    CNode* m_pNodeTail;
    INT_PTR m_nCount;
    CNode* m_pNodeFree;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CPtrList();

    typedef void* BASE_TYPE;
    typedef void* BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CObList

class CObList : public CObject
{
    DECLARE_DYNAMIC(CObList)
protected:
    struct CNode
    {
        CNode* pNext;
        CNode* pPrev;
        CObject* data;
    };

public:
// Construction
    explicit CObList(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }

    // Head and tail of a non-empty list (an empty one throws CInvalidArgException)
    CObject*& GetHead();
    const CObject* GetHead() const;
    CObject*& GetTail();
    const CObject* GetTail() const;

// Operations
    CObject* RemoveHead();
    CObject* RemoveTail();
    POSITION AddHead(CObject* newElement);
    POSITION AddTail(CObject* newElement);
    void AddHead(CObList* pNewList);
    void AddTail(CObList* pNewList);
    void RemoveAll();

    // Iteration
    POSITION GetHeadPosition() const { return (POSITION)m_pNodeHead; }
    POSITION GetTailPosition() const { return (POSITION)m_pNodeTail; }
    CObject*& GetNext(POSITION& rPosition);
    const CObject* GetNext(POSITION& rPosition) const;
    CObject*& GetPrev(POSITION& rPosition);
    const CObject* GetPrev(POSITION& rPosition) const;

    // Access at a position
    CObject*& GetAt(POSITION position);
    const CObject* GetAt(POSITION position) const;
    void SetAt(POSITION pos, CObject* newElement);
    void RemoveAt(POSITION position);

    // Insertion before or after a position (NULL: at the head or tail)
    POSITION InsertBefore(POSITION position, CObject* newElement);
    POSITION InsertAfter(POSITION position, CObject* newElement);

    // Searching
    POSITION Find(CObject* searchValue, POSITION startAfter = NULL) const;
    POSITION FindIndex(INT_PTR nIndex) const;

// Implementation
protected:
    CNode* m_pNodeHead;
    CNode* m_pNodeTail;
    INT_PTR m_nCount;
    CNode* m_pNodeFree;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CObList();

    typedef CObject* BASE_TYPE;
    typedef CObject* BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CStringList

class CStringList : public CObject
{
    DECLARE_DYNAMIC(CStringList)
protected:
    struct CNode
    {
        CNode* pNext;
        CNode* pPrev;
        CString data;
    };

public:
// Construction
    explicit CStringList(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }

    // Head and tail of a non-empty list (an empty one throws CInvalidArgException)
    CString& GetHead();
    const CString& GetHead() const;
    CString& GetTail();
    const CString& GetTail() const;

// Operations
    CString RemoveHead();
    CString RemoveTail();
    POSITION AddHead(LPCTSTR newElement);
    POSITION AddTail(LPCTSTR newElement);
    POSITION AddHead(const CString& newElement);
    POSITION AddTail(const CString& newElement);
    void AddHead(CStringList* pNewList);
    void AddTail(CStringList* pNewList);
    void RemoveAll();

    // Iteration
    POSITION GetHeadPosition() const { return (POSITION)m_pNodeHead; }
    POSITION GetTailPosition() const { return (POSITION)m_pNodeTail; }
    CString& GetNext(POSITION& rPosition);
    const CString& GetNext(POSITION& rPosition) const;
    CString& GetPrev(POSITION& rPosition);
    const CString& GetPrev(POSITION& rPosition) const;

    // Access at a position
    CString& GetAt(POSITION position);
    const CString& GetAt(POSITION position) const;
    void SetAt(POSITION pos, LPCTSTR newElement);
    void SetAt(POSITION pos, const CString& newElement);
    void RemoveAt(POSITION position);

    // Insertion before or after a position (NULL: at the head or tail)
    POSITION InsertBefore(POSITION position, LPCTSTR newElement);
    POSITION InsertAfter(POSITION position, LPCTSTR newElement);
    POSITION InsertBefore(POSITION position, const CString& newElement);
    POSITION InsertAfter(POSITION position, const CString& newElement);

    // Searching
    POSITION Find(LPCTSTR searchValue, POSITION startAfter = NULL) const;
    POSITION FindIndex(INT_PTR nIndex) const;

// Implementation
protected:
    CNode* m_pNodeHead;
    CNode* m_pNodeTail;
    INT_PTR m_nCount;
    CNode* m_pNodeFree;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CStringList();

    typedef CString BASE_TYPE;
    typedef LPCTSTR BASE_ARG_TYPE;
};

/////////////////////////////////////////////////////////////////////////////
// CMapWordToPtr

class CMapWordToPtr : public CObject
{
    DECLARE_DYNAMIC(CMapWordToPtr)
protected:
    struct CAssoc
    {
        CAssoc* pNext;
        UINT nHashValue;
        WORD key;
        void* value;
        explicit CAssoc(WORD k) : key(k), value() {}
    };

public:
// Construction
    explicit CMapWordToPtr(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }
    BOOL Lookup(WORD key, void*& rValue) const;

// Operations
    void*& operator[](WORD key);
    void SetAt(WORD key, void* newValue);
    BOOL RemoveKey(WORD key);
    void RemoveAll();

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, WORD& rKey, void*& rValue) const;

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE);
    UINT HashKey(WORD key) const;

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CMapWordToPtr();

    typedef WORD BASE_KEY;
    typedef WORD BASE_ARG_KEY;
    typedef void* BASE_VALUE;
    typedef void* BASE_ARG_VALUE;
};

/////////////////////////////////////////////////////////////////////////////
// CMapPtrToWord

class CMapPtrToWord : public CObject
{
    DECLARE_DYNAMIC(CMapPtrToWord)
protected:
    struct CAssoc
    {
        CAssoc* pNext;
        UINT nHashValue;
        void* key;
        WORD value;
        explicit CAssoc(void* k) : key(k), value() {}
    };

public:
// Construction
    explicit CMapPtrToWord(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }
    BOOL Lookup(void* key, WORD& rValue) const;

// Operations
    WORD& operator[](void* key);
    void SetAt(void* key, WORD newValue);
    BOOL RemoveKey(void* key);
    void RemoveAll();

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, void*& rKey, WORD& rValue) const;

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE);
    UINT HashKey(void* key) const;

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CMapPtrToWord();

    typedef void* BASE_KEY;
    typedef void* BASE_ARG_KEY;
    typedef WORD BASE_VALUE;
    typedef WORD BASE_ARG_VALUE;
};

/////////////////////////////////////////////////////////////////////////////
// CMapPtrToPtr

class CMapPtrToPtr : public CObject
{
    DECLARE_DYNAMIC(CMapPtrToPtr)
protected:
    struct CAssoc
    {
        CAssoc* pNext;
        UINT nHashValue;
        void* key;
        void* value;
        explicit CAssoc(void* k) : key(k), value() {}
    };

public:
// Construction
    explicit CMapPtrToPtr(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }
    BOOL Lookup(void* key, void*& rValue) const;

// Operations
    void*& operator[](void* key);
    void SetAt(void* key, void* newValue);
    BOOL RemoveKey(void* key);
    void RemoveAll();

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, void*& rKey, void*& rValue) const;

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE);
    UINT HashKey(void* key) const;

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CMapPtrToPtr();

    typedef void* BASE_KEY;
    typedef void* BASE_ARG_KEY;
    typedef void* BASE_VALUE;
    typedef void* BASE_ARG_VALUE;
};

/////////////////////////////////////////////////////////////////////////////
// CMapWordToOb

class CMapWordToOb : public CObject
{
    DECLARE_DYNAMIC(CMapWordToOb)
protected:
    struct CAssoc
    {
        CAssoc* pNext;
        UINT nHashValue;
        WORD key;
        CObject* value;
        explicit CAssoc(WORD k) : key(k), value() {}
    };

public:
// Construction
    explicit CMapWordToOb(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }
    BOOL Lookup(WORD key, CObject*& rValue) const;

// Operations
    CObject*& operator[](WORD key);
    void SetAt(WORD key, CObject* newValue);
    BOOL RemoveKey(WORD key);
    void RemoveAll();

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, WORD& rKey, CObject*& rValue) const;

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE);
    UINT HashKey(WORD key) const;

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CMapWordToOb();

    typedef WORD BASE_KEY;
    typedef WORD BASE_ARG_KEY;
    typedef CObject* BASE_VALUE;
    typedef CObject* BASE_ARG_VALUE;
};

/////////////////////////////////////////////////////////////////////////////
// CMapStringToPtr

class CMapStringToPtr : public CObject
{
    DECLARE_DYNAMIC(CMapStringToPtr)
protected:
    struct CAssoc
    {
        CAssoc* pNext;
        UINT nHashValue;
        CString key;
        void* value;
        explicit CAssoc(LPCTSTR k) : key(k), value() {}
    };

public:
// Construction
    explicit CMapStringToPtr(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }
    BOOL Lookup(LPCTSTR key, void*& rValue) const;
    BOOL LookupKey(LPCTSTR key, LPCTSTR& rKey) const;

// Operations
    void*& operator[](LPCTSTR key);
    void SetAt(LPCTSTR key, void* newValue);
    BOOL RemoveKey(LPCTSTR key);
    void RemoveAll();

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, CString& rKey, void*& rValue) const;

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE);
    UINT HashKey(LPCTSTR key) const;

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CMapStringToPtr();

    typedef CString BASE_KEY;
    typedef LPCTSTR BASE_ARG_KEY;
    typedef void* BASE_VALUE;
    typedef void* BASE_ARG_VALUE;
};

/////////////////////////////////////////////////////////////////////////////
// CMapStringToOb

class CMapStringToOb : public CObject
{
    DECLARE_DYNAMIC(CMapStringToOb)
protected:
    struct CAssoc
    {
        CAssoc* pNext;
        UINT nHashValue;
        CString key;
        CObject* value;
        explicit CAssoc(LPCTSTR k) : key(k), value() {}
    };

public:
// Construction
    explicit CMapStringToOb(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }
    BOOL Lookup(LPCTSTR key, CObject*& rValue) const;
    BOOL LookupKey(LPCTSTR key, LPCTSTR& rKey) const;

// Operations
    CObject*& operator[](LPCTSTR key);
    void SetAt(LPCTSTR key, CObject* newValue);
    BOOL RemoveKey(LPCTSTR key);
    void RemoveAll();

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, CString& rKey, CObject*& rValue) const;

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE);
    UINT HashKey(LPCTSTR key) const;

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CMapStringToOb();

    typedef CString BASE_KEY;
    typedef LPCTSTR BASE_ARG_KEY;
    typedef CObject* BASE_VALUE;
    typedef CObject* BASE_ARG_VALUE;
};

/////////////////////////////////////////////////////////////////////////////
// CMapStringToString

class CMapStringToString : public CObject
{
    DECLARE_DYNAMIC(CMapStringToString)
protected:
    struct CAssoc
    {
        CAssoc* pNext;
        UINT nHashValue;
        CString key;
        CString value;
        explicit CAssoc(LPCTSTR k) : key(k), value() {}
    };

public:
// Construction
    explicit CMapStringToString(INT_PTR nBlockSize = 10);

// Attributes
    INT_PTR GetCount() const { return m_nCount; }
    INT_PTR GetSize() const { return m_nCount; }
    BOOL IsEmpty() const { return m_nCount == 0; }
    BOOL Lookup(LPCTSTR key, CString& rValue) const;
    BOOL LookupKey(LPCTSTR key, LPCTSTR& rKey) const;

// Operations
    CString& operator[](LPCTSTR key);
    void SetAt(LPCTSTR key, LPCTSTR newValue);
    BOOL RemoveKey(LPCTSTR key);
    void RemoveAll();

    POSITION GetStartPosition() const { return (m_nCount == 0) ? NULL : BEFORE_START_POSITION; }
    void GetNextAssoc(POSITION& rNextPosition, CString& rKey, CString& rValue) const;

    UINT GetHashTableSize() const { return m_nHashTableSize; }
    void InitHashTable(UINT hashSize, BOOL bAllocNow = TRUE);
    UINT HashKey(LPCTSTR key) const;

// Implementation
protected:
    CAssoc** m_pHashTable;
    UINT m_nHashTableSize;
    INT_PTR m_nCount;
    CAssoc* m_pFreeList;
    struct CPlex* m_pBlocks;
    INT_PTR m_nBlockSize;

public:
    virtual ~CMapStringToString();

    typedef CString BASE_KEY;
    typedef LPCTSTR BASE_ARG_KEY;
    typedef CString BASE_VALUE;
    typedef LPCTSTR BASE_ARG_VALUE;
};

#endif // __AFXCOLL_H__
