// afxadv.h - advanced framework classes: CSharedFile, a memory file in a
// global memory block that can be handed to the clipboard or OLE.
#pragma once

#ifndef __AFXADV_H__
#define __AFXADV_H__

#ifndef __AFX_H__
#include <afx.h>
#endif

class CSharedFile : public CMemFile
{
    DECLARE_DYNAMIC(CSharedFile)

public:
// Constructors
    CSharedFile(UINT nAllocFlags = GMEM_DDESHARE | GMEM_MOVEABLE, UINT nGrowBytes = 4096);

// Attributes
    // Hands the memory block over to the caller; the file is empty afterwards.
    HGLOBAL Detach();
    // The file takes ownership of the block: its whole size is the file's length.
    void SetHandle(HGLOBAL hGlobalMemory, BOOL bAllowGrow = TRUE);

// Implementation
protected:
    virtual BYTE* Alloc(SIZE_T nBytes);
    virtual BYTE* Realloc(BYTE* lpMem, SIZE_T nBytes);
    virtual void Free(BYTE* lpMem);

    UINT m_nAllocFlags;
    HGLOBAL m_hGlobalMemory;
    BOOL m_bAllowGrow;

public:
    virtual ~CSharedFile();
};

#endif // __AFXADV_H__
