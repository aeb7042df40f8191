// Handle maps of the GDI wrappers: which object owns a handle (process-wide),
// and the temporary wrappers FromHandle made for handles nobody owns (per
// thread, freed by DeleteTempMap when the thread goes idle).
#include <afxwin.h>

#include <map>
#include <vector>

namespace {

// Temporary wrappers of one thread. A wrapper that stops being current (its
// handle got an owner, or was reused for another kind of object) is retired,
// not deleted: the caller that received it may still use it until idle.
struct ThreadTemps
{
    std::map<HGDIOBJ, CGdiObject*> gdi;
    std::map<HDC, CDC*> dc;
    std::vector<CGdiObject*> retiredGdi;
    std::vector<CDC*> retiredDC;

    void DeleteGdi()
    {
        std::map<HGDIOBJ, CGdiObject*> temp;
        temp.swap(gdi);
        std::vector<CGdiObject*> retired;
        retired.swap(retiredGdi);
        for (auto& entry : temp)
            retired.push_back(entry.second);
        for (CGdiObject* pObject : retired)
        {
            pObject->m_hObject = NULL;   // a wrapper never deletes the handle
            delete pObject;
        }
    }

    void DeleteDC()
    {
        std::map<HDC, CDC*> temp;
        temp.swap(dc);
        std::vector<CDC*> retired;
        retired.swap(retiredDC);
        for (auto& entry : temp)
            retired.push_back(entry.second);
        for (CDC* pDC : retired)
        {
            pDC->m_hDC = NULL;
            pDC->m_hAttribDC = NULL;
            delete pDC;
        }
    }

    bool IsEmpty() const
    {
        return gdi.empty() && dc.empty() && retiredGdi.empty() && retiredDC.empty();
    }
};

class GdiHandleMaps
{
public:
    GdiHandleMaps() : m_tlsIndex(::TlsAlloc())
    {
        ::InitializeCriticalSection(&m_cs);
    }

    ThreadTemps* Temps(bool bCreate)
    {
        if (m_tlsIndex == TLS_OUT_OF_INDEXES)
            return NULL;
        ThreadTemps* pTemps = (ThreadTemps*)::TlsGetValue(m_tlsIndex);
        if (pTemps == NULL && bCreate)
        {
            pTemps = new ThreadTemps;
            ::TlsSetValue(m_tlsIndex, pTemps);
        }
        return pTemps;
    }

    // Frees the thread's container once it holds nothing, so that a thread
    // that ends after going idle leaves nothing behind.
    void ReleaseTempsIfEmpty()
    {
        ThreadTemps* pTemps = Temps(false);
        if (pTemps != NULL && pTemps->IsEmpty())
        {
            delete pTemps;
            ::TlsSetValue(m_tlsIndex, NULL);
        }
    }

    struct Lock
    {
        explicit Lock(GdiHandleMaps& maps) : m_maps(maps) { ::EnterCriticalSection(&m_maps.m_cs); }
        ~Lock() { ::LeaveCriticalSection(&m_maps.m_cs); }
        GdiHandleMaps& m_maps;
    };

    std::map<HGDIOBJ, CGdiObject*> m_permanentGdi;
    std::map<HDC, CDC*> m_permanentDC;

private:
    DWORD m_tlsIndex;
    CRITICAL_SECTION m_cs;
};

// Never destroyed: objects with static storage in any module may still
// attach or detach handles while the process shuts down.
GdiHandleMaps& Maps()
{
    static GdiHandleMaps* s_pMaps = new GdiHandleMaps;
    return *s_pMaps;
}

// The wrapper class that matches the kind of GDI object.
CGdiObject* NewWrapper(DWORD dwType)
{
    switch (dwType)
    {
    case OBJ_PEN:
    case OBJ_EXTPEN:
        return new CPen;
    case OBJ_BRUSH:
        return new CBrush;
    case OBJ_FONT:
        return new CFont;
    case OBJ_BITMAP:
        return new CBitmap;
    case OBJ_PAL:
        return new CPalette;
    case OBJ_REGION:
        return new CRgn;
    default:
        return new CGdiObject;
    }
}

CRuntimeClass* WrapperClass(DWORD dwType)
{
    switch (dwType)
    {
    case OBJ_PEN:
    case OBJ_EXTPEN:
        return RUNTIME_CLASS(CPen);
    case OBJ_BRUSH:
        return RUNTIME_CLASS(CBrush);
    case OBJ_FONT:
        return RUNTIME_CLASS(CFont);
    case OBJ_BITMAP:
        return RUNTIME_CLASS(CBitmap);
    case OBJ_PAL:
        return RUNTIME_CLASS(CPalette);
    case OBJ_REGION:
        return RUNTIME_CLASS(CRgn);
    default:
        return RUNTIME_CLASS(CGdiObject);
    }
}

} // namespace

/////////////////////////////////////////////////////////////////////////////
// CGdiObject handle map

CGdiObject* PASCAL CGdiObject::FromHandle(HGDIOBJ hObject)
{
    if (hObject == NULL)
        return NULL;
    GdiHandleMaps& maps = Maps();
    {
        GdiHandleMaps::Lock lock(maps);
        auto it = maps.m_permanentGdi.find(hObject);
        if (it != maps.m_permanentGdi.end())
            return it->second;
    }
    ThreadTemps* pTemps = maps.Temps(true);
    if (pTemps == NULL)
        AfxThrowMemoryException();
    DWORD dwType = ::GetObjectType(hObject);
    auto it = pTemps->gdi.find(hObject);
    if (it != pTemps->gdi.end())
    {
        // A deleted handle's value may come back as another kind of object.
        if (it->second->GetRuntimeClass() == WrapperClass(dwType))
            return it->second;
        pTemps->retiredGdi.push_back(it->second);
        pTemps->gdi.erase(it);
    }
    CGdiObject* pTemp = NewWrapper(dwType);
    pTemp->m_hObject = hObject;
    pTemps->gdi[hObject] = pTemp;
    return pTemp;
}

void PASCAL CGdiObject::DeleteTempMap()
{
    GdiHandleMaps& maps = Maps();
    if (ThreadTemps* pTemps = maps.Temps(false))
    {
        pTemps->DeleteGdi();
        maps.ReleaseTempsIfEmpty();
    }
}

BOOL CGdiObject::Attach(HGDIOBJ hObject)
{
    if (hObject == NULL)
        return FALSE;
    ASSERT(m_hObject == NULL);      // only attach once, detach on destroy
    if (hObject == m_hObject)
        return TRUE;
    // As in MFC the held handle is not deleted: the caller leaks it. It is taken out
    // of the map, though, which would otherwise keep naming this object for it and
    // hand out a dangling pointer once this object is gone.
    if (m_hObject != NULL)
        Detach();

    GdiHandleMaps& maps = Maps();
    if (ThreadTemps* pTemps = maps.Temps(false))
    {
        auto it = pTemps->gdi.find(hObject);
        if (it != pTemps->gdi.end())
        {
            pTemps->retiredGdi.push_back(it->second);
            pTemps->gdi.erase(it);
        }
    }
    m_hObject = hObject;
    GdiHandleMaps::Lock lock(maps);
    maps.m_permanentGdi[hObject] = this;
    return TRUE;
}

HGDIOBJ CGdiObject::Detach()
{
    HGDIOBJ hObject = m_hObject;
    if (hObject != NULL)
    {
        GdiHandleMaps& maps = Maps();
        GdiHandleMaps::Lock lock(maps);
        auto it = maps.m_permanentGdi.find(hObject);
        if (it != maps.m_permanentGdi.end() && it->second == this)
            maps.m_permanentGdi.erase(it);
    }
    m_hObject = NULL;
    return hObject;
}

/////////////////////////////////////////////////////////////////////////////
// CDC handle map

CDC* PASCAL CDC::FromHandle(HDC hDC)
{
    if (hDC == NULL)
        return NULL;
    GdiHandleMaps& maps = Maps();
    {
        GdiHandleMaps::Lock lock(maps);
        auto it = maps.m_permanentDC.find(hDC);
        if (it != maps.m_permanentDC.end())
            return it->second;
    }
    ThreadTemps* pTemps = maps.Temps(true);
    if (pTemps == NULL)
        AfxThrowMemoryException();
    auto it = pTemps->dc.find(hDC);
    if (it != pTemps->dc.end())
        return it->second;
    CDC* pTemp = new CDC;
    pTemp->m_hDC = hDC;
    pTemp->m_hAttribDC = hDC;
    pTemps->dc[hDC] = pTemp;
    return pTemp;
}

void PASCAL CDC::DeleteTempMap()
{
    GdiHandleMaps& maps = Maps();
    if (ThreadTemps* pTemps = maps.Temps(false))
    {
        pTemps->DeleteDC();
        maps.ReleaseTempsIfEmpty();
    }
}

BOOL CDC::Attach(HDC hDC)
{
    ASSERT(m_hDC == NULL);
    if (hDC == NULL || m_hDC != NULL)
        return FALSE;
    GdiHandleMaps& maps = Maps();
    if (ThreadTemps* pTemps = maps.Temps(false))
    {
        auto it = pTemps->dc.find(hDC);
        if (it != pTemps->dc.end())
        {
            pTemps->retiredDC.push_back(it->second);
            pTemps->dc.erase(it);
        }
    }
    m_hDC = hDC;
    {
        GdiHandleMaps::Lock lock(maps);
        maps.m_permanentDC[hDC] = this;
    }
    SetAttribDC(m_hDC);
    return TRUE;
}

HDC CDC::Detach()
{
    HDC hDC = m_hDC;
    if (hDC != NULL)
    {
        GdiHandleMaps& maps = Maps();
        GdiHandleMaps::Lock lock(maps);
        auto it = maps.m_permanentDC.find(hDC);
        if (it != maps.m_permanentDC.end() && it->second == this)
            maps.m_permanentDC.erase(it);
    }
    ReleaseAttribDC();
    m_hDC = NULL;
    return hDC;
}
