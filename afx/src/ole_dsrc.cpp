// COleDataSource: the cache of offered formats, delayed rendering into a memory
// handle or a stream, the IDataObject it implements, and DoDragDrop.
#include "oleimpl.h"

#include <new>

/////////////////////////////////////////////////////////////////////////////
// The formats a data source offers, as an IEnumFORMATETC over a copy

namespace {

class CEnumFormatEtc : public IEnumFORMATETC
{
public:
    CEnumFormatEtc(const FORMATETC* pFormats, ULONG nCount, ULONG nCurrent = 0)
        : m_nRef(1), m_pFormats(new FORMATETC[nCount == 0 ? 1 : nCount]), m_nCount(nCount),
          m_nCurrent(nCurrent)
    {
        for (ULONG i = 0; i < nCount; ++i)
        {
            m_pFormats[i] = pFormats[i];
            m_pFormats[i].ptd = CopyTargetDevice(pFormats[i].ptd);
        }
    }

    STDMETHOD(QueryInterface)(REFIID iid, LPVOID* ppvObj)
    {
        if (ppvObj == NULL)
            return E_POINTER;
        if (IsEqualIID(iid, IID_IUnknown) || IsEqualIID(iid, IID_IEnumFORMATETC))
        {
            *ppvObj = this;
            AddRef();
            return S_OK;
        }
        *ppvObj = NULL;
        return E_NOINTERFACE;
    }
    STDMETHOD_(ULONG, AddRef)()
    {
        return (ULONG)::InterlockedIncrement(&m_nRef);
    }
    STDMETHOD_(ULONG, Release)()
    {
        LONG nRef = ::InterlockedDecrement(&m_nRef);
        if (nRef == 0)
            delete this;
        return (ULONG)nRef;
    }
    STDMETHOD(Next)(ULONG celt, FORMATETC* rgelt, ULONG* pceltFetched)
    {
        if (rgelt == NULL || (celt > 1 && pceltFetched == NULL))
            return E_POINTER;
        ULONG nFetched = 0;
        while (nFetched < celt && m_nCurrent < m_nCount)
        {
            rgelt[nFetched] = m_pFormats[m_nCurrent++];
            rgelt[nFetched].ptd = CopyTargetDevice(rgelt[nFetched].ptd);
            ++nFetched;
        }
        if (pceltFetched != NULL)
            *pceltFetched = nFetched;
        return nFetched == celt ? S_OK : S_FALSE;
    }
    STDMETHOD(Skip)(ULONG celt)
    {
        ULONG nLeft = m_nCount - m_nCurrent;
        m_nCurrent += celt < nLeft ? celt : nLeft;
        return celt <= nLeft ? S_OK : S_FALSE;
    }
    STDMETHOD(Reset)()
    {
        m_nCurrent = 0;
        return S_OK;
    }
    STDMETHOD(Clone)(IEnumFORMATETC** ppenum)
    {
        if (ppenum == NULL)
            return E_POINTER;
        *ppenum = new (std::nothrow) CEnumFormatEtc(m_pFormats, m_nCount, m_nCurrent);
        return *ppenum != NULL ? S_OK : E_OUTOFMEMORY;
    }

    static DVTARGETDEVICE* CopyTargetDevice(const DVTARGETDEVICE* ptd)
    {
        if (ptd == NULL)
            return NULL;
        DVTARGETDEVICE* ptdCopy = (DVTARGETDEVICE*)::CoTaskMemAlloc(ptd->tdSize);
        if (ptdCopy != NULL)
            memcpy(ptdCopy, ptd, ptd->tdSize);
        return ptdCopy;
    }

private:
    virtual ~CEnumFormatEtc()
    {
        for (ULONG i = 0; i < m_nCount; ++i)
            ::CoTaskMemFree(m_pFormats[i].ptd);
        delete[] m_pFormats;
    }

    LONG m_nRef;
    FORMATETC* m_pFormats;
    ULONG m_nCount;
    ULONG m_nCurrent;
};

BOOL SameTargetDevice(const DVTARGETDEVICE* ptd1, const DVTARGETDEVICE* ptd2)
{
    if (ptd1 == NULL || ptd2 == NULL)
        return ptd1 == ptd2;
    return ptd1->tdSize == ptd2->tdSize && memcmp(ptd1, ptd2, ptd1->tdSize) == 0;
}

} // namespace

/////////////////////////////////////////////////////////////////////////////
// COleDataSource

BEGIN_INTERFACE_MAP(COleDataSource, CCmdTarget)
    INTERFACE_PART(COleDataSource, IID_IDataObject, DataObject)
END_INTERFACE_MAP()

COleDataSource::COleDataSource()
    : m_pDataCache(NULL), m_nMaxSize(0), m_nSize(0), m_nGrowBy(10)
{
}

COleDataSource::~COleDataSource()
{
    Empty();
}

void COleDataSource::Empty()
{
    for (UINT i = 0; i < m_nSize; ++i)
    {
        ::CoTaskMemFree(m_pDataCache[i].m_formatEtc.ptd);
        ::ReleaseStgMedium(&m_pDataCache[i].m_stgMedium);
    }
    delete[] m_pDataCache;
    m_pDataCache = NULL;
    m_nMaxSize = 0;
    m_nSize = 0;
}

// The entry that serves lpFormatEtc: same format, aspect, index and direction,
// a medium in common; an entry for the same target device is preferred.
AFX_DATACACHE_ENTRY* COleDataSource::Lookup(LPFORMATETC lpFormatEtc, DATADIR nDataDir) const
{
    if (lpFormatEtc == NULL)
        return NULL;
    AFX_DATACACHE_ENTRY* pLast = NULL;
    for (UINT i = 0; i < m_nSize; ++i)
    {
        AFX_DATACACHE_ENTRY* pCache = &m_pDataCache[i];
        const FORMATETC& cached = pCache->m_formatEtc;
        if (cached.cfFormat == lpFormatEtc->cfFormat && (cached.tymed & lpFormatEtc->tymed) != 0
            && cached.dwAspect == lpFormatEtc->dwAspect && cached.lindex == lpFormatEtc->lindex
            && pCache->m_nDataDir == nDataDir)
        {
            pLast = pCache;
            if (SameTargetDevice(cached.ptd, lpFormatEtc->ptd))
                break;
        }
    }
    return pLast;
}

AFX_DATACACHE_ENTRY* COleDataSource::GetCacheEntry(LPFORMATETC lpFormatEtc, DATADIR nDataDir)
{
    AFX_DATACACHE_ENTRY* pEntry = Lookup(lpFormatEtc, nDataDir);
    if (pEntry != NULL)
    {
        // the format is offered again: the new offer replaces the old one
        ::CoTaskMemFree(pEntry->m_formatEtc.ptd);
        ::ReleaseStgMedium(&pEntry->m_stgMedium);
    }
    else
    {
        if (m_nSize == m_nMaxSize)
        {
            AFX_DATACACHE_ENTRY* pNewCache = new AFX_DATACACHE_ENTRY[m_nMaxSize + m_nGrowBy];
            if (m_nSize != 0)
                memcpy(pNewCache, m_pDataCache, m_nSize * sizeof(AFX_DATACACHE_ENTRY));
            delete[] m_pDataCache;
            m_pDataCache = pNewCache;
            m_nMaxSize += m_nGrowBy;
        }
        pEntry = &m_pDataCache[m_nSize++];
    }
    pEntry->m_nDataDir = nDataDir;
    pEntry->m_formatEtc = *lpFormatEtc;
    pEntry->m_formatEtc.ptd = CEnumFormatEtc::CopyTargetDevice(lpFormatEtc->ptd);
    memset(&pEntry->m_stgMedium, 0, sizeof(pEntry->m_stgMedium));
    return pEntry;
}

void COleDataSource::CacheGlobalData(CLIPFORMAT cfFormat, HGLOBAL hGlobal, LPFORMATETC lpFormatEtc)
{
    FORMATETC formatEtc;
    lpFormatEtc = _AfxFillFormatEtc(lpFormatEtc, cfFormat, &formatEtc);
    if (lpFormatEtc == NULL)
        return;
    FORMATETC offer = *lpFormatEtc;
    offer.tymed = TYMED_HGLOBAL;
    AFX_DATACACHE_ENTRY* pEntry = GetCacheEntry(&offer, DATADIR_GET);
    pEntry->m_stgMedium.tymed = TYMED_HGLOBAL;
    pEntry->m_stgMedium.hGlobal = hGlobal;
    pEntry->m_stgMedium.pUnkForRelease = NULL;
}

void COleDataSource::CacheData(CLIPFORMAT cfFormat, LPSTGMEDIUM lpStgMedium, LPFORMATETC lpFormatEtc)
{
    if (lpStgMedium == NULL)
        return;
    FORMATETC formatEtc;
    lpFormatEtc = _AfxFillFormatEtc(lpFormatEtc, cfFormat, &formatEtc);
    if (lpFormatEtc == NULL)
        return;
    FORMATETC offer = *lpFormatEtc;
    offer.tymed = lpStgMedium->tymed;
    AFX_DATACACHE_ENTRY* pEntry = GetCacheEntry(&offer, DATADIR_GET);
    pEntry->m_stgMedium = *lpStgMedium;
}

void COleDataSource::DelayRenderData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc)
{
    FORMATETC formatEtc;
    FORMATETC offer;
    if (lpFormatEtc == NULL)
    {
        lpFormatEtc = _AfxFillFormatEtc(NULL, cfFormat, &formatEtc);
        if (lpFormatEtc == NULL)
            return;
        lpFormatEtc->tymed = TYMED_HGLOBAL;
    }
    offer = *lpFormatEtc;
    if (cfFormat != 0)
        offer.cfFormat = cfFormat;
    GetCacheEntry(&offer, DATADIR_GET);     // a TYMED_NULL medium: rendered when asked
}

void COleDataSource::DelayRenderFileData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc)
{
    FORMATETC formatEtc;
    lpFormatEtc = _AfxFillFormatEtc(lpFormatEtc, cfFormat, &formatEtc);
    if (lpFormatEtc == NULL)
        return;
    FORMATETC offer = *lpFormatEtc;
    offer.tymed &= TYMED_ISTREAM | TYMED_HGLOBAL;    // the media a CFile can render into
    GetCacheEntry(&offer, DATADIR_GET);
}

/////////////////////////////////////////////////////////////////////////////
// Rendering

BOOL COleDataSource::OnRenderGlobalData(LPFORMATETC, HGLOBAL*)
{
    return FALSE;
}

BOOL COleDataSource::OnRenderFileData(LPFORMATETC, CFile*)
{
    return FALSE;
}

// A memory handle is tried first (OnRenderGlobalData, then OnRenderFileData into
// a memory file), then a stream (OnRenderFileData into a stream-backed file).
// A medium the caller provides (GetDataHere) is rendered into.
BOOL COleDataSource::OnRenderData(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium)
{
    if (lpFormatEtc->tymed & TYMED_HGLOBAL)
    {
        HGLOBAL hGlobal = lpStgMedium->tymed == TYMED_HGLOBAL ? lpStgMedium->hGlobal : NULL;
        if (OnRenderGlobalData(lpFormatEtc, &hGlobal) && hGlobal != NULL)
        {
            lpStgMedium->tymed = TYMED_HGLOBAL;
            lpStgMedium->hGlobal = hGlobal;
            return TRUE;
        }

        CSharedFile file;
        BOOL bCallerBlock = lpStgMedium->tymed == TYMED_HGLOBAL && lpStgMedium->hGlobal != NULL;
        if (bCallerBlock)
            file.SetHandle(lpStgMedium->hGlobal, FALSE);
        BOOL bRendered = FALSE;
        TRY
        {
            bRendered = OnRenderFileData(lpFormatEtc, &file);
        }
        CATCH_ALL(e)
        {
            if (bCallerBlock)
                file.Detach();  // the caller's block is not the file's to free
            THROW_LAST();
        }
        END_CATCH_ALL
        if (bRendered)
        {
            SIZE_T nLength = (SIZE_T)file.GetLength();
            HGLOBAL hRendered = file.Detach();
            if (hRendered == NULL)      // nothing written: an empty block
                hRendered = ::GlobalAlloc(GMEM_MOVEABLE | GMEM_DDESHARE, 0);
            else if (!bCallerBlock && nLength > 0 && ::GlobalSize(hRendered) > nLength)
            {
                // the file grew in steps: the block ends with the data, so that
                // its size is the data's and no stale bytes go along
                if (HGLOBAL hShrunk = ::GlobalReAlloc(hRendered, nLength, GMEM_MOVEABLE))
                    hRendered = hShrunk;
            }
            if (hRendered != NULL)
            {
                lpStgMedium->tymed = TYMED_HGLOBAL;
                lpStgMedium->hGlobal = hRendered;
                return TRUE;
            }
        }
        if (bCallerBlock)
            file.Detach();
    }

    if (lpFormatEtc->tymed & TYMED_ISTREAM)
    {
        COleStreamFile file;
        BOOL bOwnStream = lpStgMedium->tymed != TYMED_ISTREAM || lpStgMedium->pstm == NULL;
        if (!bOwnStream)
        {
            lpStgMedium->pstm->AddRef();
            file.Attach(lpStgMedium->pstm);
        }
        else if (!file.CreateMemoryStream())
            AfxThrowMemoryException();
        if (OnRenderFileData(lpFormatEtc, &file))
        {
            // a new stream is read from its beginning
            if (bOwnStream)
                file.SeekToBegin();
            lpStgMedium->tymed = TYMED_ISTREAM;
            lpStgMedium->pstm = file.Detach();
            if (!bOwnStream)
                lpStgMedium->pstm->Release();   // the caller's own reference remains
            return TRUE;
        }
    }
    return FALSE;
}

BOOL COleDataSource::OnSetData(LPFORMATETC, LPSTGMEDIUM, BOOL)
{
    return FALSE;
}

/////////////////////////////////////////////////////////////////////////////
// COleDataSource::XDataObject

STDMETHODIMP_(ULONG) COleDataSource::XDataObject::AddRef()
{
    METHOD_PROLOGUE_EX_(COleDataSource, DataObject)
    return pThis->ExternalAddRef();
}

STDMETHODIMP_(ULONG) COleDataSource::XDataObject::Release()
{
    METHOD_PROLOGUE_EX_(COleDataSource, DataObject)
    return pThis->ExternalRelease();
}

STDMETHODIMP COleDataSource::XDataObject::QueryInterface(REFIID iid, LPVOID* ppvObj)
{
    METHOD_PROLOGUE_EX_(COleDataSource, DataObject)
    return (HRESULT)pThis->ExternalQueryInterface(&iid, ppvObj);
}

STDMETHODIMP COleDataSource::XDataObject::GetData(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium)
{
    METHOD_PROLOGUE_EX(COleDataSource, DataObject)
    if (lpFormatEtc == NULL || lpStgMedium == NULL)
        return E_INVALIDARG;
    AFX_DATACACHE_ENTRY* pCache = pThis->Lookup(lpFormatEtc, DATADIR_GET);
    if (pCache == NULL)
        return DATA_E_FORMATETC;

    memset(lpStgMedium, 0, sizeof(STGMEDIUM));
    if (pCache->m_stgMedium.tymed != TYMED_NULL)
    {
        // cached data: the caller gets a copy of its own
        return _AfxCopyStgMedium(lpFormatEtc->cfFormat, lpStgMedium, &pCache->m_stgMedium)
            ? S_OK : DATA_E_FORMATETC;
    }

    // delayed rendering, in the media both the offer and the request allow
    FORMATETC formatEtc = *lpFormatEtc;
    formatEtc.tymed &= pCache->m_formatEtc.tymed;
    HRESULT hr = DATA_E_FORMATETC;
    TRY
    {
        if (pThis->OnRenderData(&formatEtc, lpStgMedium))
            hr = S_OK;
    }
    CATCH_ALL(e)
    {
        hr = E_UNEXPECTED;
    }
    END_CATCH_ALL
    if (hr != S_OK)
        memset(lpStgMedium, 0, sizeof(STGMEDIUM));
    return hr;
}

STDMETHODIMP COleDataSource::XDataObject::GetDataHere(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium)
{
    METHOD_PROLOGUE_EX(COleDataSource, DataObject)
    if (lpFormatEtc == NULL || lpStgMedium == NULL)
        return E_INVALIDARG;
    // rendered into the caller's medium, so the request names that medium only
    FORMATETC formatEtc = *lpFormatEtc;
    formatEtc.tymed = lpStgMedium->tymed;
    AFX_DATACACHE_ENTRY* pCache = pThis->Lookup(&formatEtc, DATADIR_GET);
    if (pCache == NULL)
        return DATA_E_FORMATETC;

    if (pCache->m_stgMedium.tymed != TYMED_NULL)
    {
        return _AfxCopyStgMedium(formatEtc.cfFormat, lpStgMedium, &pCache->m_stgMedium)
            ? S_OK : DATA_E_FORMATETC;
    }

    STGMEDIUM stgMedium = *lpStgMedium;
    HRESULT hr = DATA_E_FORMATETC;
    TRY
    {
        if (pThis->OnRenderData(&formatEtc, &stgMedium))
            hr = S_OK;
    }
    CATCH_ALL(e)
    {
        hr = E_UNEXPECTED;
    }
    END_CATCH_ALL
    if (hr == S_OK && stgMedium.tymed == lpStgMedium->tymed && stgMedium.hGlobal != lpStgMedium->hGlobal)
    {
        // rendered into a new block after all: not what the caller handed in
        ::ReleaseStgMedium(&stgMedium);
        hr = DATA_E_FORMATETC;
    }
    return hr;
}

STDMETHODIMP COleDataSource::XDataObject::QueryGetData(LPFORMATETC lpFormatEtc)
{
    METHOD_PROLOGUE_EX_(COleDataSource, DataObject)
    return pThis->Lookup(lpFormatEtc, DATADIR_GET) != NULL ? S_OK : DATA_E_FORMATETC;
}

STDMETHODIMP COleDataSource::XDataObject::GetCanonicalFormatEtc(LPFORMATETC, LPFORMATETC lpFormatEtcOut)
{
    if (lpFormatEtcOut != NULL)
        lpFormatEtcOut->ptd = NULL;
    return DATA_S_SAMEFORMATETC;
}

STDMETHODIMP COleDataSource::XDataObject::SetData(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium,
    BOOL bRelease)
{
    METHOD_PROLOGUE_EX(COleDataSource, DataObject)
    if (lpFormatEtc == NULL || lpStgMedium == NULL)
        return E_INVALIDARG;
    if (pThis->Lookup(lpFormatEtc, DATADIR_SET) == NULL)
        return DATA_E_FORMATETC;
    HRESULT hr = E_UNEXPECTED;
    TRY
    {
        hr = pThis->OnSetData(lpFormatEtc, lpStgMedium, bRelease) ? S_OK : DATA_E_FORMATETC;
    }
    CATCH_ALL(e)
    {
        hr = E_UNEXPECTED;
    }
    END_CATCH_ALL
    return hr;
}

STDMETHODIMP COleDataSource::XDataObject::EnumFormatEtc(DWORD dwDirection, LPENUMFORMATETC* ppenumFormatEtc)
{
    METHOD_PROLOGUE_EX(COleDataSource, DataObject)
    if (ppenumFormatEtc == NULL)
        return E_POINTER;
    *ppenumFormatEtc = NULL;
    FORMATETC* pFormats = new (std::nothrow) FORMATETC[pThis->m_nSize == 0 ? 1 : pThis->m_nSize];
    if (pFormats == NULL)
        return E_OUTOFMEMORY;
    ULONG nCount = 0;
    for (UINT i = 0; i < pThis->m_nSize; ++i)
    {
        if ((DWORD)pThis->m_pDataCache[i].m_nDataDir == dwDirection)
            pFormats[nCount++] = pThis->m_pDataCache[i].m_formatEtc;
    }
    *ppenumFormatEtc = new (std::nothrow) CEnumFormatEtc(pFormats, nCount);
    delete[] pFormats;
    return *ppenumFormatEtc != NULL ? S_OK : E_OUTOFMEMORY;
}

STDMETHODIMP COleDataSource::XDataObject::DAdvise(LPFORMATETC, DWORD, LPADVISESINK, LPDWORD pdwConnection)
{
    if (pdwConnection != NULL)
        *pdwConnection = 0;
    return OLE_E_ADVISENOTSUPPORTED;
}

STDMETHODIMP COleDataSource::XDataObject::DUnadvise(DWORD)
{
    return OLE_E_ADVISENOTSUPPORTED;
}

STDMETHODIMP COleDataSource::XDataObject::EnumDAdvise(LPENUMSTATDATA* ppenumAdvise)
{
    if (ppenumAdvise != NULL)
        *ppenumAdvise = NULL;
    return OLE_E_ADVISENOTSUPPORTED;
}

/////////////////////////////////////////////////////////////////////////////
// Drag and drop

DROPEFFECT COleDataSource::DoDragDrop(DWORD dwEffects, LPCRECT lpRectStartDrag,
    COleDropSource* pDropSource)
{
    COleDropSource dropSource;
    if (pDropSource == NULL)
        pDropSource = &dropSource;

    // the rectangle the mouse must leave before the drag begins
    pDropSource->m_bDragStarted = FALSE;
    if (lpRectStartDrag != NULL)
        pDropSource->m_rectStartDrag.CopyRect(lpRectStartDrag);
    else
    {
        CPoint ptCursor;
        ::GetCursorPos(&ptCursor);
        pDropSource->m_rectStartDrag.SetRect(ptCursor.x, ptCursor.y, ptCursor.x, ptCursor.y);
    }
    if (pDropSource->m_rectStartDrag.IsRectNull())
        pDropSource->m_bDragStarted = TRUE;     // a null rectangle: no waiting
    else if (pDropSource->m_rectStartDrag.IsRectEmpty())
        pDropSource->m_rectStartDrag.InflateRect(COleDropSource::nDragMinDist, COleDropSource::nDragMinDist);

    if (!pDropSource->OnBeginDrag(AfxGetMainWnd()))
        return DROPEFFECT_NONE;

    LPDATAOBJECT lpDataObject = (LPDATAOBJECT)GetInterface(&IID_IDataObject);
    LPDROPSOURCE lpDropSource = (LPDROPSOURCE)pDropSource->GetInterface(&IID_IDropSource);
    DWORD dwResultEffect = DROPEFFECT_NONE;
    if (::DoDragDrop(lpDataObject, lpDropSource, dwEffects, &dwResultEffect) != DRAGDROP_S_DROP)
        dwResultEffect = DROPEFFECT_NONE;
    return dwResultEffect;
}
