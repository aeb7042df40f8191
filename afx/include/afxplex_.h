// afxplex_.h - private: the block allocator of lists and maps, and the
// algorithms shared by the untyped collections (afxcoll.h) and the templates
// (afxtempl.h). Each collection keeps MFC's own fields; the helpers below work
// on references to them.
#pragma once

#ifndef __AFXPLEX_H__
#define __AFXPLEX_H__

#include <afx.h>
#include <stdint.h>
#include <stdlib.h>
#include <string.h>
#include <new>
#include <type_traits>
#include <utility>

struct __POSITION {};
typedef __POSITION* POSITION;
#define BEFORE_START_POSITION ((POSITION)-1L)

// Blocks of list nodes and map entries; freed only as a whole chain.
struct CPlex
{
    CPlex* pNext;
    void* pReserved;    // keeps the elements 16-byte aligned

    void* data() { return this + 1; }
    static CPlex* PASCAL Create(CPlex*& head, UINT_PTR nMax, UINT_PTR cbElement);
    void FreeDataChain();
};

namespace AfxCollImpl
{

/////////////////////////////////////////////////////////////////////////////
// Raw element storage

template<class TYPE>
TYPE* AllocElements(INT_PTR nCount)
{
    if (nCount <= 0 || (UINT_PTR)nCount > ((size_t)-1) / sizeof(TYPE))
        AfxThrowMemoryException();
    TYPE* p = (TYPE*)malloc((size_t)nCount * sizeof(TYPE));
    if (p == NULL)
        AfxThrowMemoryException();
    return p;
}

template<class TYPE>
void ConstructRange(TYPE* p, INT_PTR nCount)
{
    for (INT_PTR i = 0; i < nCount; i++)
        ::new ((void*)(p + i)) TYPE();
}

template<class TYPE>
void DestroyRange(TYPE* p, INT_PTR nCount)
{
    for (INT_PTR i = 0; i < nCount; i++)
        (p + i)->~TYPE();
}

// Moves elements into uninitialised storage and ends their old lifetime.
template<class TYPE>
void RelocateRange(TYPE* pDest, TYPE* pSrc, INT_PTR nCount)
{
    if (nCount <= 0)
        return;
    if (std::is_trivially_copyable<TYPE>::value)
    {
        memcpy((void*)pDest, (const void*)pSrc, (size_t)nCount * sizeof(TYPE));
        return;
    }
    for (INT_PTR i = 0; i < nCount; i++)
    {
        ::new ((void*)(pDest + i)) TYPE(std::move(pSrc[i]));
        (pSrc + i)->~TYPE();
    }
}

/////////////////////////////////////////////////////////////////////////////
// Arrays: m_pData, m_nSize, m_nMaxSize, m_nGrowBy

template<class TYPE>
struct ArrayRef
{
    TYPE*& m_pData;
    INT_PTR& m_nSize;
    INT_PTR& m_nMaxSize;
    INT_PTR& m_nGrowBy;

    void RemoveAll()
    {
        if (m_pData != NULL)
        {
            DestroyRange(m_pData, m_nSize);
            free(m_pData);
        }
        m_pData = NULL;
        m_nSize = m_nMaxSize = 0;
    }

    void SetSize(INT_PTR nNewSize, INT_PTR nGrowBy)
    {
        if (nNewSize < 0)
            AfxThrowInvalidArgException();
        if (nGrowBy >= 0)
            m_nGrowBy = nGrowBy;

        if (nNewSize == 0)
        {
            RemoveAll();
        }
        else if (m_pData == NULL)
        {
            INT_PTR nAlloc = (nNewSize > m_nGrowBy) ? nNewSize : m_nGrowBy;
            m_pData = AllocElements<TYPE>(nAlloc);
            ConstructRange(m_pData, nNewSize);
            m_nSize = nNewSize;
            m_nMaxSize = nAlloc;
        }
        else if (nNewSize <= m_nMaxSize)
        {
            if (nNewSize > m_nSize)
                ConstructRange(m_pData + m_nSize, nNewSize - m_nSize);
            else
                DestroyRange(m_pData + nNewSize, m_nSize - nNewSize);
            m_nSize = nNewSize;
        }
        else
        {
            // Grow by the given step, or heuristically: the larger the array,
            // the larger the step (at least 4, at most 1024 elements).
            INT_PTR nStep = m_nGrowBy;
            if (nStep == 0)
            {
                nStep = m_nSize / 8;
                nStep = (nStep < 4) ? 4 : ((nStep > 1024) ? 1024 : nStep);
            }
            INT_PTR nNewMax = nNewSize;
            if (m_nMaxSize <= INTPTR_MAX - nStep && m_nMaxSize + nStep > nNewSize)
                nNewMax = m_nMaxSize + nStep;
            TYPE* pNewData = AllocElements<TYPE>(nNewMax);
            RelocateRange(pNewData, m_pData, m_nSize);
            ConstructRange(pNewData + m_nSize, nNewSize - m_nSize);
            free(m_pData);
            m_pData = pNewData;
            m_nSize = nNewSize;
            m_nMaxSize = nNewMax;
        }
    }

    void FreeExtra()
    {
        if (m_nSize == m_nMaxSize)
            return;
        TYPE* pNewData = NULL;
        if (m_nSize != 0)
        {
            pNewData = AllocElements<TYPE>(m_nSize);
            RelocateRange(pNewData, m_pData, m_nSize);
        }
        free(m_pData);
        m_pData = pNewData;
        m_nMaxSize = m_nSize;
    }

    void SetAtGrow(INT_PTR nIndex, const TYPE& newElement)
    {
        if (nIndex < 0)
            AfxThrowInvalidArgException();
        if (nIndex >= m_nSize)
        {
            TYPE copy(newElement);     // newElement may live in this array
            SetSize(nIndex + 1, -1);
            m_pData[nIndex] = std::move(copy);
            return;
        }
        m_pData[nIndex] = newElement;
    }

    void InsertAt(INT_PTR nIndex, const TYPE& newElement, INT_PTR nCount)
    {
        if (nIndex < 0 || nCount < 0)
            AfxThrowInvalidArgException();
        if (nCount == 0)
            return;
        TYPE copy(newElement);         // newElement may live in this array
        if (nIndex >= m_nSize)
        {
            if (nIndex > INTPTR_MAX - nCount)
                AfxThrowInvalidArgException();
            SetSize(nIndex + nCount, -1);
        }
        else
        {
            INT_PTR nOldSize = m_nSize;
            if (nOldSize > INTPTR_MAX - nCount)
                AfxThrowInvalidArgException();
            SetSize(nOldSize + nCount, -1);
            for (INT_PTR i = nOldSize - 1; i >= nIndex; i--)
                m_pData[i + nCount] = std::move(m_pData[i]);
        }
        for (INT_PTR i = nIndex; i < nIndex + nCount; i++)
            m_pData[i] = copy;
    }

    void RemoveAt(INT_PTR nIndex, INT_PTR nCount)
    {
        if (nIndex < 0 || nCount < 0 || nIndex > m_nSize - nCount)
            AfxThrowInvalidArgException();
        if (nCount == 0)
            return;
        for (INT_PTR i = nIndex; i < m_nSize - nCount; i++)
            m_pData[i] = std::move(m_pData[i + nCount]);
        DestroyRange(m_pData + m_nSize - nCount, nCount);
        m_nSize -= nCount;
    }

    INT_PTR Append(const TYPE* pSrcData, INT_PTR nSrcSize, TYPE* const& pSrcAfter)
    {
        // pSrcAfter is the source's m_pData, read again after growing: the
        // source may be this array.
        INT_PTR nOldSize = m_nSize;
        if (nSrcSize > 0)
        {
            SetSize(nOldSize + nSrcSize, -1);
            const TYPE* pSrc = (pSrcAfter != NULL) ? pSrcAfter : pSrcData;
            for (INT_PTR i = 0; i < nSrcSize; i++)
                m_pData[nOldSize + i] = pSrc[i];
        }
        return nOldSize;
    }

    void Copy(const TYPE* pSrcData, INT_PTR nSrcSize)
    {
        if (pSrcData == m_pData && nSrcSize == m_nSize)
            return;
        SetSize(nSrcSize, -1);
        for (INT_PTR i = 0; i < nSrcSize; i++)
            m_pData[i] = pSrcData[i];
    }

    void CheckIndex(INT_PTR nIndex) const
    {
        if (nIndex < 0 || nIndex >= m_nSize)
            AfxThrowInvalidArgException();
    }
};

/////////////////////////////////////////////////////////////////////////////
// Doubly linked lists: nodes { pNext, pPrev, data } from CPlex blocks

template<class CNode, class TYPE>
struct ListRef
{
    CNode*& m_pNodeHead;
    CNode*& m_pNodeTail;
    INT_PTR& m_nCount;
    CNode*& m_pNodeFree;
    CPlex*& m_pBlocks;
    INT_PTR m_nBlockSize;

    CNode* NewNode(CNode* pPrev, CNode* pNext, const TYPE& value)
    {
        if (m_pNodeFree == NULL)
        {
            CPlex* pNewBlock = CPlex::Create(m_pBlocks, (UINT_PTR)m_nBlockSize, sizeof(CNode));
            CNode* pNode = (CNode*)pNewBlock->data();
            pNode += m_nBlockSize - 1;
            for (INT_PTR i = m_nBlockSize - 1; i >= 0; i--, pNode--)
            {
                pNode->pNext = m_pNodeFree;
                m_pNodeFree = pNode;
            }
        }
        CNode* pNode = m_pNodeFree;
        ::new ((void*)&pNode->data) TYPE(value);
        m_pNodeFree = m_pNodeFree->pNext;
        pNode->pPrev = pPrev;
        pNode->pNext = pNext;
        m_nCount++;
        return pNode;
    }

    void FreeNode(CNode* pNode)
    {
        (&pNode->data)->~TYPE();
        pNode->pNext = m_pNodeFree;
        m_pNodeFree = pNode;
        m_nCount--;
        // The last element gone: give every block back.
        if (m_nCount == 0)
            RemoveAll();
    }

    void RemoveAll()
    {
        for (CNode* pNode = m_pNodeHead; pNode != NULL; pNode = pNode->pNext)
            (&pNode->data)->~TYPE();
        m_nCount = 0;
        m_pNodeHead = m_pNodeTail = m_pNodeFree = NULL;
        if (m_pBlocks != NULL)
            m_pBlocks->FreeDataChain();
        m_pBlocks = NULL;
    }

    POSITION AddHead(const TYPE& newElement)
    {
        CNode* pNewNode = NewNode(NULL, m_pNodeHead, newElement);
        if (m_pNodeHead != NULL)
            m_pNodeHead->pPrev = pNewNode;
        else
            m_pNodeTail = pNewNode;
        m_pNodeHead = pNewNode;
        return (POSITION)pNewNode;
    }

    POSITION AddTail(const TYPE& newElement)
    {
        CNode* pNewNode = NewNode(m_pNodeTail, NULL, newElement);
        if (m_pNodeTail != NULL)
            m_pNodeTail->pNext = pNewNode;
        else
            m_pNodeHead = pNewNode;
        m_pNodeTail = pNewNode;
        return (POSITION)pNewNode;
    }

    TYPE RemoveHead()
    {
        if (m_pNodeHead == NULL)
            AfxThrowInvalidArgException();
        CNode* pOldNode = m_pNodeHead;
        TYPE returnValue(std::move(pOldNode->data));
        m_pNodeHead = pOldNode->pNext;
        if (m_pNodeHead != NULL)
            m_pNodeHead->pPrev = NULL;
        else
            m_pNodeTail = NULL;
        FreeNode(pOldNode);
        return returnValue;
    }

    TYPE RemoveTail()
    {
        if (m_pNodeTail == NULL)
            AfxThrowInvalidArgException();
        CNode* pOldNode = m_pNodeTail;
        TYPE returnValue(std::move(pOldNode->data));
        m_pNodeTail = pOldNode->pPrev;
        if (m_pNodeTail != NULL)
            m_pNodeTail->pNext = NULL;
        else
            m_pNodeHead = NULL;
        FreeNode(pOldNode);
        return returnValue;
    }

    POSITION InsertBefore(POSITION position, const TYPE& newElement)
    {
        if (position == NULL)
            return AddHead(newElement);
        CNode* pOldNode = (CNode*)position;
        CNode* pNewNode = NewNode(pOldNode->pPrev, pOldNode, newElement);
        if (pOldNode->pPrev != NULL)
            pOldNode->pPrev->pNext = pNewNode;
        else
            m_pNodeHead = pNewNode;
        pOldNode->pPrev = pNewNode;
        return (POSITION)pNewNode;
    }

    POSITION InsertAfter(POSITION position, const TYPE& newElement)
    {
        if (position == NULL)
            return AddTail(newElement);
        CNode* pOldNode = (CNode*)position;
        CNode* pNewNode = NewNode(pOldNode, pOldNode->pNext, newElement);
        if (pOldNode->pNext != NULL)
            pOldNode->pNext->pPrev = pNewNode;
        else
            m_pNodeTail = pNewNode;
        pOldNode->pNext = pNewNode;
        return (POSITION)pNewNode;
    }

    void RemoveAt(POSITION position)
    {
        if (position == NULL)
            AfxThrowInvalidArgException();
        CNode* pOldNode = (CNode*)position;
        if (pOldNode == m_pNodeHead)
            m_pNodeHead = pOldNode->pNext;
        else
            pOldNode->pPrev->pNext = pOldNode->pNext;
        if (pOldNode == m_pNodeTail)
            m_pNodeTail = pOldNode->pPrev;
        else
            pOldNode->pNext->pPrev = pOldNode->pPrev;
        FreeNode(pOldNode);
    }

    POSITION FindIndex(INT_PTR nIndex) const
    {
        if (nIndex < 0 || nIndex >= m_nCount)
            return NULL;
        CNode* pNode = m_pNodeHead;
        while (nIndex--)
            pNode = pNode->pNext;
        return (POSITION)pNode;
    }

    template<class EQUAL>
    POSITION Find(POSITION startAfter, EQUAL equal) const
    {
        CNode* pNode = (startAfter == NULL) ? m_pNodeHead : ((CNode*)startAfter)->pNext;
        for (; pNode != NULL; pNode = pNode->pNext)
        {
            if (equal(pNode->data))
                return (POSITION)pNode;
        }
        return NULL;
    }

    static CNode* Node(POSITION position)
    {
        if (position == NULL || position == BEFORE_START_POSITION)
            AfxThrowInvalidArgException();
        return (CNode*)position;
    }

    static TYPE& Next(POSITION& rPosition)
    {
        CNode* pNode = Node(rPosition);
        rPosition = (POSITION)pNode->pNext;
        return pNode->data;
    }

    static TYPE& Prev(POSITION& rPosition)
    {
        CNode* pNode = Node(rPosition);
        rPosition = (POSITION)pNode->pPrev;
        return pNode->data;
    }
};

/////////////////////////////////////////////////////////////////////////////
// Hash maps: entries { pNext, nHashValue, key, value } from CPlex blocks.
// TRAITS supplies Hash(ARG_KEY) and Equal(const KEY&, ARG_KEY).

template<class CAssoc, class ARG_KEY, class TRAITS>
struct MapRef
{
    CAssoc**& m_pHashTable;
    UINT& m_nHashTableSize;
    INT_PTR& m_nCount;
    CAssoc*& m_pFreeList;
    CPlex*& m_pBlocks;
    INT_PTR m_nBlockSize;

    CAssoc* GetAssocAt(ARG_KEY key, UINT& nHashBucket, UINT& nHashValue) const
    {
        nHashValue = TRAITS::Hash(key);
        nHashBucket = (m_nHashTableSize != 0) ? nHashValue % m_nHashTableSize : 0;
        if (m_pHashTable == NULL)
            return NULL;
        for (CAssoc* pAssoc = m_pHashTable[nHashBucket]; pAssoc != NULL; pAssoc = pAssoc->pNext)
        {
            if (pAssoc->nHashValue == nHashValue && TRAITS::Equal(pAssoc->key, key))
                return pAssoc;
        }
        return NULL;
    }

    static CAssoc** AllocTable(UINT nHashSize)
    {
        CAssoc** pTable = (CAssoc**)calloc(nHashSize, sizeof(CAssoc*));
        if (pTable == NULL)
            AfxThrowMemoryException();
        return pTable;
    }

    void InitHashTable(UINT nHashSize, BOOL bAllocNow)
    {
        if (nHashSize == 0)
            nHashSize = 1;
        if (m_nCount == 0)
        {
            free(m_pHashTable);
            m_pHashTable = bAllocNow ? AllocTable(nHashSize) : NULL;
            m_nHashTableSize = nHashSize;
            return;
        }
        // Resizing a filled map keeps its entries: they move to their new buckets.
        CAssoc** pNewTable = AllocTable(nHashSize);
        for (UINT nBucket = 0; nBucket < m_nHashTableSize; nBucket++)
        {
            CAssoc* pAssoc = m_pHashTable[nBucket];
            while (pAssoc != NULL)
            {
                CAssoc* pNext = pAssoc->pNext;
                UINT nNewBucket = pAssoc->nHashValue % nHashSize;
                pAssoc->pNext = pNewTable[nNewBucket];
                pNewTable[nNewBucket] = pAssoc;
                pAssoc = pNext;
            }
        }
        free(m_pHashTable);
        m_pHashTable = pNewTable;
        m_nHashTableSize = nHashSize;
    }

    CAssoc* NewAssoc(ARG_KEY key)
    {
        if (m_pFreeList == NULL)
        {
            CPlex* pNewBlock = CPlex::Create(m_pBlocks, (UINT_PTR)m_nBlockSize, sizeof(CAssoc));
            CAssoc* pAssoc = (CAssoc*)pNewBlock->data();
            pAssoc += m_nBlockSize - 1;
            for (INT_PTR i = m_nBlockSize - 1; i >= 0; i--, pAssoc--)
            {
                pAssoc->pNext = m_pFreeList;
                m_pFreeList = pAssoc;
            }
        }
        CAssoc* pAssoc = m_pFreeList;
        CAssoc* pNextFree = pAssoc->pNext;
        ::new ((void*)pAssoc) CAssoc(key);
        m_pFreeList = pNextFree;
        m_nCount++;
        return pAssoc;
    }

    void FreeAssoc(CAssoc* pAssoc)
    {
        pAssoc->~CAssoc();
        pAssoc->pNext = m_pFreeList;
        m_pFreeList = pAssoc;
        m_nCount--;
        // The last entry gone: give every block back.
        if (m_nCount == 0)
            RemoveAll();
    }

    void RemoveAll()
    {
        if (m_pHashTable != NULL)
        {
            for (UINT nHash = 0; nHash < m_nHashTableSize; nHash++)
            {
                for (CAssoc* pAssoc = m_pHashTable[nHash]; pAssoc != NULL;)
                {
                    CAssoc* pNext = pAssoc->pNext;
                    pAssoc->~CAssoc();
                    pAssoc = pNext;
                }
            }
            free(m_pHashTable);
            m_pHashTable = NULL;
        }
        m_nCount = 0;
        m_pFreeList = NULL;
        if (m_pBlocks != NULL)
            m_pBlocks->FreeDataChain();
        m_pBlocks = NULL;
    }

    // Finds the entry of key, adding one with a default value when missing.
    CAssoc* LookupOrAdd(ARG_KEY key)
    {
        UINT nHashBucket, nHashValue;
        CAssoc* pAssoc = GetAssocAt(key, nHashBucket, nHashValue);
        if (pAssoc != NULL)
            return pAssoc;
        if (m_pHashTable == NULL)
        {
            InitHashTable(m_nHashTableSize, TRUE);
            nHashBucket = nHashValue % m_nHashTableSize;
        }
        pAssoc = NewAssoc(key);
        pAssoc->nHashValue = nHashValue;
        pAssoc->pNext = m_pHashTable[nHashBucket];
        m_pHashTable[nHashBucket] = pAssoc;
        return pAssoc;
    }

    BOOL RemoveKey(ARG_KEY key)
    {
        if (m_pHashTable == NULL)
            return FALSE;
        UINT nHashValue = TRAITS::Hash(key);
        CAssoc** ppAssocPrev = &m_pHashTable[nHashValue % m_nHashTableSize];
        for (CAssoc* pAssoc = *ppAssocPrev; pAssoc != NULL; pAssoc = pAssoc->pNext)
        {
            if (pAssoc->nHashValue == nHashValue && TRAITS::Equal(pAssoc->key, key))
            {
                *ppAssocPrev = pAssoc->pNext;
                FreeAssoc(pAssoc);
                return TRUE;
            }
            ppAssocPrev = &pAssoc->pNext;
        }
        return FALSE;
    }

    POSITION GetStartPosition() const
    {
        return (m_nCount == 0) ? NULL : BEFORE_START_POSITION;
    }

    CAssoc* FirstAssoc() const
    {
        if (m_pHashTable == NULL)
            return NULL;
        for (UINT nBucket = 0; nBucket < m_nHashTableSize; nBucket++)
        {
            if (m_pHashTable[nBucket] != NULL)
                return m_pHashTable[nBucket];
        }
        return NULL;
    }

    CAssoc* NextAssoc(const CAssoc* pAssoc) const
    {
        if (pAssoc->pNext != NULL)
            return pAssoc->pNext;
        for (UINT nBucket = pAssoc->nHashValue % m_nHashTableSize + 1; nBucket < m_nHashTableSize; nBucket++)
        {
            if (m_pHashTable[nBucket] != NULL)
                return m_pHashTable[nBucket];
        }
        return NULL;
    }

    // Returns the entry at rNextPosition and advances it (NULL after the last).
    CAssoc* GetNextAssoc(POSITION& rNextPosition) const
    {
        CAssoc* pAssocRet = (CAssoc*)rNextPosition;
        if (pAssocRet == (CAssoc*)BEFORE_START_POSITION)
            pAssocRet = FirstAssoc();
        if (pAssocRet == NULL)
            AfxThrowInvalidArgException();
        rNextPosition = (POSITION)NextAssoc(pAssocRet);
        return pAssocRet;
    }
};

/////////////////////////////////////////////////////////////////////////////
// Hash values of the untyped maps' keys

inline UINT HashPointer(const void* key)
{
    // Heap and handle values are multiples of 16 or 4: drop the low bits and
    // fold the high half in, so 64-bit values spread over the buckets.
    UINT_PTR n = (UINT_PTR)key;
    return (UINT)((n >> 4) ^ (n >> 32));
}

inline UINT HashString(LPCWSTR key)
{
    UINT nHash = 0;
    if (key != NULL)
    {
        while (*key)
            nHash = (nHash << 5) + nHash + *key++;
    }
    return nHash;
}

inline UINT HashString(LPCSTR key)
{
    UINT nHash = 0;
    if (key != NULL)
    {
        while (*key)
            nHash = (nHash << 5) + nHash + (BYTE)*key++;
    }
    return nHash;
}

} // namespace AfxCollImpl

#endif // __AFXPLEX_H__
