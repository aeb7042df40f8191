// The untyped hash maps. Bucket handling is shared with CMap (afxplex_.h).
#include <afxcoll.h>

namespace {

struct WordKey
{
    static UINT Hash(WORD key) { return key; }
    static bool Equal(WORD a, WORD b) { return a == b; }
};

struct PtrKey
{
    static UINT Hash(void* key) { return AfxCollImpl::HashPointer(key); }
    static bool Equal(void* a, void* b) { return a == b; }
};

struct StringKey
{
    static UINT Hash(LPCTSTR key) { return AfxCollImpl::HashString(key); }
    static bool Equal(const CString& a, LPCTSTR b) { return a.Compare(b) == 0; }
};

} // namespace

/////////////////////////////////////////////////////////////////////////////
// CMapWordToPtr

IMPLEMENT_DYNAMIC(CMapWordToPtr, CObject)

// The const members only read through the reference.
#define MAP_REF AfxCollImpl::MapRef<CAssoc, WORD, WordKey>{ const_cast<CAssoc**&>(m_pHashTable), \
    const_cast<UINT&>(m_nHashTableSize), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CAssoc*&>(m_pFreeList), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

CMapWordToPtr::CMapWordToPtr(INT_PTR nBlockSize)
    : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CMapWordToPtr::~CMapWordToPtr()
{
    MAP_REF.RemoveAll();
}

void CMapWordToPtr::RemoveAll()
{
    MAP_REF.RemoveAll();
}

void CMapWordToPtr::InitHashTable(UINT hashSize, BOOL bAllocNow)
{
    MAP_REF.InitHashTable(hashSize, bAllocNow);
}

UINT CMapWordToPtr::HashKey(WORD key) const
{
    return WordKey::Hash(key);
}

BOOL CMapWordToPtr::Lookup(WORD key, void*& rValue) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rValue = pAssoc->value;
    return TRUE;
}

void*& CMapWordToPtr::operator[](WORD key)
{
    return MAP_REF.LookupOrAdd(key)->value;
}

void CMapWordToPtr::SetAt(WORD key, void* newValue)
{
    (*this)[key] = newValue;
}

BOOL CMapWordToPtr::RemoveKey(WORD key)
{
    return MAP_REF.RemoveKey(key);
}

void CMapWordToPtr::GetNextAssoc(POSITION& rNextPosition, WORD& rKey, void*& rValue) const
{
    CAssoc* pAssoc = MAP_REF.GetNextAssoc(rNextPosition);
    rKey = pAssoc->key;
    rValue = pAssoc->value;
}

#undef MAP_REF

/////////////////////////////////////////////////////////////////////////////
// CMapPtrToWord

IMPLEMENT_DYNAMIC(CMapPtrToWord, CObject)

// The const members only read through the reference.
#define MAP_REF AfxCollImpl::MapRef<CAssoc, void*, PtrKey>{ const_cast<CAssoc**&>(m_pHashTable), \
    const_cast<UINT&>(m_nHashTableSize), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CAssoc*&>(m_pFreeList), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

CMapPtrToWord::CMapPtrToWord(INT_PTR nBlockSize)
    : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CMapPtrToWord::~CMapPtrToWord()
{
    MAP_REF.RemoveAll();
}

void CMapPtrToWord::RemoveAll()
{
    MAP_REF.RemoveAll();
}

void CMapPtrToWord::InitHashTable(UINT hashSize, BOOL bAllocNow)
{
    MAP_REF.InitHashTable(hashSize, bAllocNow);
}

UINT CMapPtrToWord::HashKey(void* key) const
{
    return PtrKey::Hash(key);
}

BOOL CMapPtrToWord::Lookup(void* key, WORD& rValue) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rValue = pAssoc->value;
    return TRUE;
}

WORD& CMapPtrToWord::operator[](void* key)
{
    return MAP_REF.LookupOrAdd(key)->value;
}

void CMapPtrToWord::SetAt(void* key, WORD newValue)
{
    (*this)[key] = newValue;
}

BOOL CMapPtrToWord::RemoveKey(void* key)
{
    return MAP_REF.RemoveKey(key);
}

void CMapPtrToWord::GetNextAssoc(POSITION& rNextPosition, void*& rKey, WORD& rValue) const
{
    CAssoc* pAssoc = MAP_REF.GetNextAssoc(rNextPosition);
    rKey = pAssoc->key;
    rValue = pAssoc->value;
}

#undef MAP_REF

/////////////////////////////////////////////////////////////////////////////
// CMapPtrToPtr

IMPLEMENT_DYNAMIC(CMapPtrToPtr, CObject)

// The const members only read through the reference.
#define MAP_REF AfxCollImpl::MapRef<CAssoc, void*, PtrKey>{ const_cast<CAssoc**&>(m_pHashTable), \
    const_cast<UINT&>(m_nHashTableSize), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CAssoc*&>(m_pFreeList), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

CMapPtrToPtr::CMapPtrToPtr(INT_PTR nBlockSize)
    : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CMapPtrToPtr::~CMapPtrToPtr()
{
    MAP_REF.RemoveAll();
}

void CMapPtrToPtr::RemoveAll()
{
    MAP_REF.RemoveAll();
}

void CMapPtrToPtr::InitHashTable(UINT hashSize, BOOL bAllocNow)
{
    MAP_REF.InitHashTable(hashSize, bAllocNow);
}

UINT CMapPtrToPtr::HashKey(void* key) const
{
    return PtrKey::Hash(key);
}

BOOL CMapPtrToPtr::Lookup(void* key, void*& rValue) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rValue = pAssoc->value;
    return TRUE;
}

void*& CMapPtrToPtr::operator[](void* key)
{
    return MAP_REF.LookupOrAdd(key)->value;
}

void CMapPtrToPtr::SetAt(void* key, void* newValue)
{
    (*this)[key] = newValue;
}

BOOL CMapPtrToPtr::RemoveKey(void* key)
{
    return MAP_REF.RemoveKey(key);
}

void CMapPtrToPtr::GetNextAssoc(POSITION& rNextPosition, void*& rKey, void*& rValue) const
{
    CAssoc* pAssoc = MAP_REF.GetNextAssoc(rNextPosition);
    rKey = pAssoc->key;
    rValue = pAssoc->value;
}

#undef MAP_REF

/////////////////////////////////////////////////////////////////////////////
// CMapWordToOb

IMPLEMENT_DYNAMIC(CMapWordToOb, CObject)

// The const members only read through the reference.
#define MAP_REF AfxCollImpl::MapRef<CAssoc, WORD, WordKey>{ const_cast<CAssoc**&>(m_pHashTable), \
    const_cast<UINT&>(m_nHashTableSize), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CAssoc*&>(m_pFreeList), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

CMapWordToOb::CMapWordToOb(INT_PTR nBlockSize)
    : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CMapWordToOb::~CMapWordToOb()
{
    MAP_REF.RemoveAll();
}

void CMapWordToOb::RemoveAll()
{
    MAP_REF.RemoveAll();
}

void CMapWordToOb::InitHashTable(UINT hashSize, BOOL bAllocNow)
{
    MAP_REF.InitHashTable(hashSize, bAllocNow);
}

UINT CMapWordToOb::HashKey(WORD key) const
{
    return WordKey::Hash(key);
}

BOOL CMapWordToOb::Lookup(WORD key, CObject*& rValue) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rValue = pAssoc->value;
    return TRUE;
}

CObject*& CMapWordToOb::operator[](WORD key)
{
    return MAP_REF.LookupOrAdd(key)->value;
}

void CMapWordToOb::SetAt(WORD key, CObject* newValue)
{
    (*this)[key] = newValue;
}

BOOL CMapWordToOb::RemoveKey(WORD key)
{
    return MAP_REF.RemoveKey(key);
}

void CMapWordToOb::GetNextAssoc(POSITION& rNextPosition, WORD& rKey, CObject*& rValue) const
{
    CAssoc* pAssoc = MAP_REF.GetNextAssoc(rNextPosition);
    rKey = pAssoc->key;
    rValue = pAssoc->value;
}

#undef MAP_REF

/////////////////////////////////////////////////////////////////////////////
// CMapStringToPtr

IMPLEMENT_DYNAMIC(CMapStringToPtr, CObject)

// The const members only read through the reference.
#define MAP_REF AfxCollImpl::MapRef<CAssoc, LPCTSTR, StringKey>{ const_cast<CAssoc**&>(m_pHashTable), \
    const_cast<UINT&>(m_nHashTableSize), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CAssoc*&>(m_pFreeList), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

CMapStringToPtr::CMapStringToPtr(INT_PTR nBlockSize)
    : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CMapStringToPtr::~CMapStringToPtr()
{
    MAP_REF.RemoveAll();
}

void CMapStringToPtr::RemoveAll()
{
    MAP_REF.RemoveAll();
}

void CMapStringToPtr::InitHashTable(UINT hashSize, BOOL bAllocNow)
{
    MAP_REF.InitHashTable(hashSize, bAllocNow);
}

UINT CMapStringToPtr::HashKey(LPCTSTR key) const
{
    return StringKey::Hash(key);
}

BOOL CMapStringToPtr::Lookup(LPCTSTR key, void*& rValue) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rValue = pAssoc->value;
    return TRUE;
}

BOOL CMapStringToPtr::LookupKey(LPCTSTR key, LPCTSTR& rKey) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rKey = pAssoc->key;
    return TRUE;
}

void*& CMapStringToPtr::operator[](LPCTSTR key)
{
    return MAP_REF.LookupOrAdd(key)->value;
}

void CMapStringToPtr::SetAt(LPCTSTR key, void* newValue)
{
    (*this)[key] = newValue;
}

BOOL CMapStringToPtr::RemoveKey(LPCTSTR key)
{
    return MAP_REF.RemoveKey(key);
}

void CMapStringToPtr::GetNextAssoc(POSITION& rNextPosition, CString& rKey, void*& rValue) const
{
    CAssoc* pAssoc = MAP_REF.GetNextAssoc(rNextPosition);
    rKey = pAssoc->key;
    rValue = pAssoc->value;
}

#undef MAP_REF

/////////////////////////////////////////////////////////////////////////////
// CMapStringToOb

IMPLEMENT_DYNAMIC(CMapStringToOb, CObject)

// The const members only read through the reference.
#define MAP_REF AfxCollImpl::MapRef<CAssoc, LPCTSTR, StringKey>{ const_cast<CAssoc**&>(m_pHashTable), \
    const_cast<UINT&>(m_nHashTableSize), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CAssoc*&>(m_pFreeList), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

CMapStringToOb::CMapStringToOb(INT_PTR nBlockSize)
    : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CMapStringToOb::~CMapStringToOb()
{
    MAP_REF.RemoveAll();
}

void CMapStringToOb::RemoveAll()
{
    MAP_REF.RemoveAll();
}

void CMapStringToOb::InitHashTable(UINT hashSize, BOOL bAllocNow)
{
    MAP_REF.InitHashTable(hashSize, bAllocNow);
}

UINT CMapStringToOb::HashKey(LPCTSTR key) const
{
    return StringKey::Hash(key);
}

BOOL CMapStringToOb::Lookup(LPCTSTR key, CObject*& rValue) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rValue = pAssoc->value;
    return TRUE;
}

BOOL CMapStringToOb::LookupKey(LPCTSTR key, LPCTSTR& rKey) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rKey = pAssoc->key;
    return TRUE;
}

CObject*& CMapStringToOb::operator[](LPCTSTR key)
{
    return MAP_REF.LookupOrAdd(key)->value;
}

void CMapStringToOb::SetAt(LPCTSTR key, CObject* newValue)
{
    (*this)[key] = newValue;
}

BOOL CMapStringToOb::RemoveKey(LPCTSTR key)
{
    return MAP_REF.RemoveKey(key);
}

void CMapStringToOb::GetNextAssoc(POSITION& rNextPosition, CString& rKey, CObject*& rValue) const
{
    CAssoc* pAssoc = MAP_REF.GetNextAssoc(rNextPosition);
    rKey = pAssoc->key;
    rValue = pAssoc->value;
}

#undef MAP_REF

/////////////////////////////////////////////////////////////////////////////
// CMapStringToString

IMPLEMENT_DYNAMIC(CMapStringToString, CObject)

// The const members only read through the reference.
#define MAP_REF AfxCollImpl::MapRef<CAssoc, LPCTSTR, StringKey>{ const_cast<CAssoc**&>(m_pHashTable), \
    const_cast<UINT&>(m_nHashTableSize), const_cast<INT_PTR&>(m_nCount), \
    const_cast<CAssoc*&>(m_pFreeList), const_cast<CPlex*&>(m_pBlocks), m_nBlockSize }

CMapStringToString::CMapStringToString(INT_PTR nBlockSize)
    : m_pHashTable(NULL), m_nHashTableSize(17), m_nCount(0), m_pFreeList(NULL), m_pBlocks(NULL),
      m_nBlockSize(nBlockSize > 0 ? nBlockSize : 10)
{
}

CMapStringToString::~CMapStringToString()
{
    MAP_REF.RemoveAll();
}

void CMapStringToString::RemoveAll()
{
    MAP_REF.RemoveAll();
}

void CMapStringToString::InitHashTable(UINT hashSize, BOOL bAllocNow)
{
    MAP_REF.InitHashTable(hashSize, bAllocNow);
}

UINT CMapStringToString::HashKey(LPCTSTR key) const
{
    return StringKey::Hash(key);
}

BOOL CMapStringToString::Lookup(LPCTSTR key, CString& rValue) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rValue = pAssoc->value;
    return TRUE;
}

BOOL CMapStringToString::LookupKey(LPCTSTR key, LPCTSTR& rKey) const
{
    UINT nHashBucket, nHashValue;
    CAssoc* pAssoc = MAP_REF.GetAssocAt(key, nHashBucket, nHashValue);
    if (pAssoc == NULL)
        return FALSE;
    rKey = pAssoc->key;
    return TRUE;
}

CString& CMapStringToString::operator[](LPCTSTR key)
{
    return MAP_REF.LookupOrAdd(key)->value;
}

void CMapStringToString::SetAt(LPCTSTR key, LPCTSTR newValue)
{
    (*this)[key] = newValue;
}

BOOL CMapStringToString::RemoveKey(LPCTSTR key)
{
    return MAP_REF.RemoveKey(key);
}

void CMapStringToString::GetNextAssoc(POSITION& rNextPosition, CString& rKey, CString& rValue) const
{
    CAssoc* pAssoc = MAP_REF.GetNextAssoc(rNextPosition);
    rKey = pAssoc->key;
    rValue = pAssoc->value;
}

#undef MAP_REF
