// COleDataObject, the files it hands out (CSharedFile over a memory handle,
// COleStreamFile over a stream) and the medium helpers.
//
// The data of a drop may come from another process: every length is the one
// the medium reports (GlobalSize, the stream's end), so reads stop there.
#include "oleimpl.h"

/////////////////////////////////////////////////////////////////////////////
// Helpers

LPFORMATETC AFXAPI _AfxFillFormatEtc(LPFORMATETC lpFormatEtc, CLIPFORMAT cfFormat,
    LPFORMATETC lpFormatEtcFill)
{
    if (lpFormatEtc == NULL && cfFormat != 0)
    {
        lpFormatEtc = lpFormatEtcFill;
        lpFormatEtc->cfFormat = cfFormat;
        lpFormatEtc->ptd = NULL;
        lpFormatEtc->dwAspect = DVASPECT_CONTENT;
        lpFormatEtc->lindex = -1;
        lpFormatEtc->tymed = (DWORD)-1;
    }
    return lpFormatEtc;
}

BOOL AFXAPI _AfxCopyStgMedium(CLIPFORMAT, LPSTGMEDIUM lpDest, LPSTGMEDIUM lpSource)
{
    if (lpDest->tymed == TYMED_NULL)
    {
        lpDest->hGlobal = NULL;
        lpDest->pUnkForRelease = NULL;
    }
    else if (lpDest->tymed != lpSource->tymed)
        return FALSE;

    switch (lpSource->tymed)
    {
    case TYMED_HGLOBAL:
        {
            SIZE_T nSize = ::GlobalSize(lpSource->hGlobal);
            HGLOBAL hDest = lpDest->hGlobal;
            if (hDest == NULL)
                hDest = ::GlobalAlloc(GMEM_MOVEABLE | GMEM_DDESHARE, nSize);
            else if (::GlobalSize(hDest) < nSize)
            {
                HGLOBAL hNew = ::GlobalReAlloc(hDest, nSize, GMEM_MOVEABLE);
                if (hNew == NULL)
                    return FALSE;
                hDest = hNew;
            }
            if (hDest == NULL)
                return FALSE;
            const void* pSource = ::GlobalLock(lpSource->hGlobal);
            void* pDest = ::GlobalLock(hDest);
            if (pSource != NULL && pDest != NULL)
                memcpy(pDest, pSource, nSize);
            ::GlobalUnlock(hDest);
            ::GlobalUnlock(lpSource->hGlobal);
            if (pSource == NULL || pDest == NULL)
            {
                if (lpDest->hGlobal == NULL)
                    ::GlobalFree(hDest);
                return FALSE;
            }
            lpDest->tymed = TYMED_HGLOBAL;
            lpDest->hGlobal = hDest;
        }
        return TRUE;

    case TYMED_ISTREAM:
        {
            LPSTREAM lpStream = lpDest->pstm;
            if (lpStream == NULL && FAILED(::CreateStreamOnHGlobal(NULL, TRUE, &lpStream)))
                return FALSE;
            STATSTG stat;
            LARGE_INTEGER zero = {};
            BOOL bCopied = SUCCEEDED(lpSource->pstm->Stat(&stat, STATFLAG_NONAME))
                && SUCCEEDED(lpSource->pstm->Seek(zero, STREAM_SEEK_SET, NULL))
                && SUCCEEDED(lpSource->pstm->CopyTo(lpStream, stat.cbSize, NULL, NULL));
            lpSource->pstm->Seek(zero, STREAM_SEEK_SET, NULL);
            if (!bCopied)
            {
                if (lpDest->pstm == NULL)
                    lpStream->Release();
                return FALSE;
            }
            if (lpDest->pstm == NULL)
                lpStream->Seek(zero, STREAM_SEEK_SET, NULL);
            lpDest->tymed = TYMED_ISTREAM;
            lpDest->pstm = lpStream;
        }
        return TRUE;

    default:
        return FALSE;
    }
}

void AFXAPI _AfxThrowOleFileException(SCODE sc)
{
    int cause = CFileException::genericException;
    if (sc == STG_E_MEDIUMFULL)
        cause = CFileException::diskFull;
    else if (sc == STG_E_ACCESSDENIED)
        cause = CFileException::accessDenied;
    else if (sc == STG_E_INVALIDFUNCTION || sc == STG_E_SEEKERROR)
        cause = CFileException::badSeek;
    AfxThrowFileException(cause, (LONG)sc);
}

/////////////////////////////////////////////////////////////////////////////
// COleDataObject

COleDataObject::COleDataObject()
    : m_lpDataObject(NULL), m_bAutoRelease(TRUE)
{
}

COleDataObject::~COleDataObject()
{
    Release();
}

void COleDataObject::Attach(LPDATAOBJECT lpDataObject, BOOL bAutoRelease)
{
    Release();
    m_lpDataObject = lpDataObject;
    m_bAutoRelease = bAutoRelease;
}

LPDATAOBJECT COleDataObject::Detach()
{
    LPDATAOBJECT lpDataObject = m_lpDataObject;
    m_lpDataObject = NULL;
    return lpDataObject;
}

void COleDataObject::Release()
{
    if (m_lpDataObject != NULL)
    {
        if (m_bAutoRelease)
            m_lpDataObject->Release();
        m_lpDataObject = NULL;
    }
}

BOOL COleDataObject::IsDataAvailable(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc)
{
    if (m_lpDataObject == NULL)
        return FALSE;
    FORMATETC formatEtc;
    lpFormatEtc = _AfxFillFormatEtc(lpFormatEtc, cfFormat, &formatEtc);
    return lpFormatEtc != NULL && m_lpDataObject->QueryGetData(lpFormatEtc) == S_OK;
}

BOOL COleDataObject::GetData(CLIPFORMAT cfFormat, LPSTGMEDIUM lpStgMedium, LPFORMATETC lpFormatEtc)
{
    if (m_lpDataObject == NULL || lpStgMedium == NULL)
        return FALSE;
    FORMATETC formatEtc;
    lpFormatEtc = _AfxFillFormatEtc(lpFormatEtc, cfFormat, &formatEtc);
    return lpFormatEtc != NULL && m_lpDataObject->GetData(lpFormatEtc, lpStgMedium) == S_OK;
}

HGLOBAL COleDataObject::GetGlobalData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc)
{
    if (m_lpDataObject == NULL)
        return NULL;
    FORMATETC formatEtc;
    lpFormatEtc = _AfxFillFormatEtc(lpFormatEtc, cfFormat, &formatEtc);
    if (lpFormatEtc == NULL)
        return NULL;
    FORMATETC request = *lpFormatEtc;
    request.tymed = TYMED_HGLOBAL | TYMED_MFPICT;

    STGMEDIUM stgMedium = {};
    if (FAILED(m_lpDataObject->GetData(&request, &stgMedium)))
        return NULL;
    if (stgMedium.tymed != TYMED_HGLOBAL && stgMedium.tymed != TYMED_MFPICT)
    {
        ::ReleaseStgMedium(&stgMedium);
        return NULL;
    }
    if (stgMedium.pUnkForRelease == NULL)
        return stgMedium.hGlobal;

    // The source keeps the block: the caller gets a copy of its own.
    STGMEDIUM stgMediumDest = {};
    stgMediumDest.tymed = TYMED_NULL;
    STGMEDIUM stgMediumSource = stgMedium;
    stgMediumSource.tymed = TYMED_HGLOBAL;
    BOOL bCopied = _AfxCopyStgMedium(request.cfFormat, &stgMediumDest, &stgMediumSource);
    ::ReleaseStgMedium(&stgMedium);
    return bCopied ? stgMediumDest.hGlobal : NULL;
}

CFile* COleDataObject::GetFileData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc)
{
    if (m_lpDataObject == NULL)
        return NULL;
    FORMATETC formatEtc;
    lpFormatEtc = _AfxFillFormatEtc(lpFormatEtc, cfFormat, &formatEtc);
    if (lpFormatEtc == NULL)
        return NULL;
    FORMATETC request = *lpFormatEtc;
    request.tymed &= TYMED_HGLOBAL | TYMED_ISTREAM;
    if (request.tymed == 0)
        return NULL;

    STGMEDIUM stgMedium = {};
    if (FAILED(m_lpDataObject->GetData(&request, &stgMedium)))
        return NULL;

    if (stgMedium.pUnkForRelease != NULL)
    {
        // The source keeps the medium: a memory block is copied, a stream is
        // held by a reference of our own.
        STGMEDIUM stgMediumOwn = {};
        stgMediumOwn.tymed = TYMED_NULL;
        BOOL bOwn = FALSE;
        if (stgMedium.tymed == TYMED_HGLOBAL)
            bOwn = _AfxCopyStgMedium(request.cfFormat, &stgMediumOwn, &stgMedium);
        else if (stgMedium.tymed == TYMED_ISTREAM && stgMedium.pstm != NULL)
        {
            stgMediumOwn.tymed = TYMED_ISTREAM;
            stgMediumOwn.pstm = stgMedium.pstm;
            stgMediumOwn.pstm->AddRef();
            bOwn = TRUE;
        }
        ::ReleaseStgMedium(&stgMedium);
        if (!bOwn)
            return NULL;
        stgMedium = stgMediumOwn;
    }

    CFile* pFile = NULL;
    TRY
    {
        switch (stgMedium.tymed)
        {
        case TYMED_HGLOBAL:
            if (stgMedium.hGlobal == NULL)
                break;
            pFile = new CSharedFile;
            ((CSharedFile*)pFile)->SetHandle(stgMedium.hGlobal);
            stgMedium.tymed = TYMED_NULL;     // the file owns the block now
            break;
        case TYMED_ISTREAM:
            if (stgMedium.pstm == NULL)
                break;
            pFile = new COleStreamFile(stgMedium.pstm);
            stgMedium.tymed = TYMED_NULL;     // the file holds the reference now
            break;
        default:
            break;
        }
    }
    CATCH_ALL(e)
    {
        delete pFile;
        pFile = NULL;
    }
    END_CATCH_ALL

    if (stgMedium.tymed != TYMED_NULL)
        ::ReleaseStgMedium(&stgMedium);
    return pFile;
}

/////////////////////////////////////////////////////////////////////////////
// CSharedFile

IMPLEMENT_DYNAMIC(CSharedFile, CMemFile)

CSharedFile::CSharedFile(UINT nAllocFlags, UINT nGrowBytes)
    : CMemFile(nGrowBytes), m_nAllocFlags(nAllocFlags), m_hGlobalMemory(NULL), m_bAllowGrow(TRUE)
{
}

CSharedFile::~CSharedFile()
{
    if (m_lpBuffer != NULL)
        Close();
}

void CSharedFile::SetHandle(HGLOBAL hGlobalMemory, BOOL bAllowGrow)
{
    if (m_lpBuffer != NULL)
        Close();
    m_hGlobalMemory = hGlobalMemory;
    m_lpBuffer = (BYTE*)::GlobalLock(m_hGlobalMemory);
    // A block that cannot be locked is an empty file (and still freed by Close).
    m_nBufferSize = m_lpBuffer != NULL ? ::GlobalSize(m_hGlobalMemory) : 0;
    m_nFileSize = m_nBufferSize;
    m_nPosition = 0;
    m_bAllowGrow = bAllowGrow;
    m_bAutoDelete = TRUE;
    if (m_lpBuffer == NULL && m_hGlobalMemory != NULL)
    {
        ::GlobalFree(m_hGlobalMemory);
        m_hGlobalMemory = NULL;
    }
}

BYTE* CSharedFile::Alloc(SIZE_T nBytes)
{
    m_hGlobalMemory = ::GlobalAlloc(m_nAllocFlags, nBytes);
    if (m_hGlobalMemory == NULL)
        return NULL;
    return (BYTE*)::GlobalLock(m_hGlobalMemory);
}

BYTE* CSharedFile::Realloc(BYTE*, SIZE_T nBytes)
{
    if (!m_bAllowGrow || m_hGlobalMemory == NULL)
        return NULL;
    ::GlobalUnlock(m_hGlobalMemory);
    HGLOBAL hNew = ::GlobalReAlloc(m_hGlobalMemory, nBytes, m_nAllocFlags);
    if (hNew == NULL)
    {
        // the old block stays the file's, locked as before
        ::GlobalLock(m_hGlobalMemory);
        return NULL;
    }
    m_hGlobalMemory = hNew;
    return (BYTE*)::GlobalLock(m_hGlobalMemory);
}

void CSharedFile::Free(BYTE*)
{
    if (m_hGlobalMemory == NULL)
        return;
    ::GlobalUnlock(m_hGlobalMemory);
    ::GlobalFree(m_hGlobalMemory);
    m_hGlobalMemory = NULL;
}

HGLOBAL CSharedFile::Detach()
{
    HGLOBAL hMem = m_hGlobalMemory;
    if (hMem != NULL)
        ::GlobalUnlock(hMem);
    m_hGlobalMemory = NULL;
    m_lpBuffer = NULL;
    m_nBufferSize = 0;
    m_nFileSize = 0;
    m_nPosition = 0;
    return hMem;
}

/////////////////////////////////////////////////////////////////////////////
// COleStreamFile

IMPLEMENT_DYNAMIC(COleStreamFile, CFile)

COleStreamFile::COleStreamFile(LPSTREAM lpStream)
    : m_lpStream(lpStream)
{
}

COleStreamFile::~COleStreamFile()
{
    if (m_lpStream != NULL)
        Abort();
}

void COleStreamFile::Attach(LPSTREAM lpStream)
{
    if (m_lpStream != NULL)
        Abort();
    m_lpStream = lpStream;
}

LPSTREAM COleStreamFile::Detach()
{
    LPSTREAM lpStream = m_lpStream;
    m_lpStream = NULL;
    return lpStream;
}

IStream* COleStreamFile::GetStream() const
{
    return m_lpStream;
}

BOOL COleStreamFile::CreateMemoryStream(CFileException* pError)
{
    if (m_lpStream != NULL)
        Abort();
    HRESULT hr = ::CreateStreamOnHGlobal(NULL, TRUE, &m_lpStream);
    if (FAILED(hr))
    {
        m_lpStream = NULL;
        if (pError != NULL)
        {
            pError->m_cause = CFileException::genericException;
            pError->m_lOsError = (LONG)hr;
        }
        return FALSE;
    }
    return TRUE;
}

ULONGLONG COleStreamFile::GetPosition() const
{
    if (m_lpStream == NULL)
        return 0;
    LARGE_INTEGER zero = {};
    ULARGE_INTEGER pos = {};
    HRESULT hr = m_lpStream->Seek(zero, STREAM_SEEK_CUR, &pos);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
    return pos.QuadPart;
}

ULONGLONG COleStreamFile::Seek(LONGLONG lOff, UINT nFrom)
{
    if (m_lpStream == NULL)
        _AfxThrowOleFileException(E_UNEXPECTED);
    LARGE_INTEGER off;
    off.QuadPart = lOff;
    ULARGE_INTEGER pos = {};
    DWORD dwOrigin = nFrom == begin ? STREAM_SEEK_SET : nFrom == end ? STREAM_SEEK_END : STREAM_SEEK_CUR;
    HRESULT hr = m_lpStream->Seek(off, dwOrigin, &pos);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
    return pos.QuadPart;
}

void COleStreamFile::SetLength(ULONGLONG dwNewLen)
{
    if (m_lpStream == NULL)
        _AfxThrowOleFileException(E_UNEXPECTED);
    ULARGE_INTEGER size;
    size.QuadPart = dwNewLen;
    HRESULT hr = m_lpStream->SetSize(size);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
}

ULONGLONG COleStreamFile::GetLength() const
{
    if (m_lpStream == NULL)
        return 0;
    STATSTG stat;
    HRESULT hr = m_lpStream->Stat(&stat, STATFLAG_NONAME);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
    return stat.cbSize.QuadPart;
}

UINT COleStreamFile::Read(void* lpBuf, UINT nCount)
{
    if (nCount == 0)
        return 0;
    if (m_lpStream == NULL || lpBuf == NULL)
        _AfxThrowOleFileException(E_INVALIDARG);
    // Never more than the stream holds: some streams read on past their end
    // once the position is beyond it.
    STATSTG stat;
    LARGE_INTEGER zero = {};
    ULARGE_INTEGER pos;
    if (SUCCEEDED(m_lpStream->Stat(&stat, STATFLAG_NONAME))
        && SUCCEEDED(m_lpStream->Seek(zero, STREAM_SEEK_CUR, &pos)))
    {
        if (pos.QuadPart >= stat.cbSize.QuadPart)
            return 0;
        if (stat.cbSize.QuadPart - pos.QuadPart < nCount)
            nCount = (UINT)(stat.cbSize.QuadPart - pos.QuadPart);
    }
    ULONG nRead = 0;
    HRESULT hr = m_lpStream->Read(lpBuf, nCount, &nRead);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
    // a stream that claims more than was asked for is not believed
    return nRead <= nCount ? (UINT)nRead : nCount;
}

void COleStreamFile::Write(const void* lpBuf, UINT nCount)
{
    if (nCount == 0)
        return;
    if (m_lpStream == NULL || lpBuf == NULL)
        _AfxThrowOleFileException(E_INVALIDARG);
    ULONG nWritten = 0;
    HRESULT hr = m_lpStream->Write(lpBuf, nCount, &nWritten);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
    if (nWritten < nCount)
        AfxThrowFileException(CFileException::diskFull);
}

void COleStreamFile::LockRange(ULONGLONG dwPos, ULONGLONG dwCount)
{
    ULARGE_INTEGER pos, count;
    pos.QuadPart = dwPos;
    count.QuadPart = dwCount;
    HRESULT hr = m_lpStream != NULL ? m_lpStream->LockRegion(pos, count, LOCK_EXCLUSIVE) : E_UNEXPECTED;
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
}

void COleStreamFile::UnlockRange(ULONGLONG dwPos, ULONGLONG dwCount)
{
    ULARGE_INTEGER pos, count;
    pos.QuadPart = dwPos;
    count.QuadPart = dwCount;
    HRESULT hr = m_lpStream != NULL ? m_lpStream->UnlockRegion(pos, count, LOCK_EXCLUSIVE) : E_UNEXPECTED;
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
}

void COleStreamFile::Abort()
{
    if (m_lpStream != NULL)
    {
        m_lpStream->Release();
        m_lpStream = NULL;
    }
}

void COleStreamFile::Flush()
{
    if (m_lpStream == NULL)
        return;
    HRESULT hr = m_lpStream->Commit(STGC_DEFAULT);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
}

void COleStreamFile::Close()
{
    Abort();
}

CFile* COleStreamFile::Duplicate() const
{
    if (m_lpStream == NULL)
        _AfxThrowOleFileException(E_UNEXPECTED);
    LPSTREAM lpStream = NULL;
    HRESULT hr = m_lpStream->Clone(&lpStream);
    if (FAILED(hr))
        _AfxThrowOleFileException(hr);
    return new COleStreamFile(lpStream);
}
