// wndimpl.h - private declarations shared by the window sources of the framework.
#pragma once

#include <afxwin.h>
#include <afxpriv.h>
#include <windowsx.h>
#include <unordered_map>

// windowsx.h defines message crackers named like CWnd members.
#undef SubclassWindow

/////////////////////////////////////////////////////////////////////////////
// CHandleMap: HWND -> CWnd* for one thread. Permanent entries are objects the
// program attached; temporary entries are objects made by FromHandle, owned by
// the map and freed at idle time. Each temporary carries the generation in
// which it was made, so a modal loop frees only what was made inside it.

class CHandleMap
{
public:
    CHandleMap() : m_nGeneration(0) {}
    ~CHandleMap();

    CWnd* FromHandle(HWND hWnd);
    CWnd* LookupPermanent(HWND hWnd) const;
    CWnd* LookupTemporary(HWND hWnd) const;
    void SetPermanent(HWND hWnd, CWnd* pWnd);
    void RemoveHandle(HWND hWnd);

    // Frees temporaries made after generation nAfter (0: all of them).
    void DeleteTemp(unsigned nAfter = 0);
    unsigned CurrentGeneration() const { return m_nGeneration; }
    size_t TemporaryCount() const { return m_temporaryMap.size(); }

private:
    struct TempEntry
    {
        CWnd* pWnd;
        unsigned nGeneration;
    };
    std::unordered_map<HWND, CWnd*> m_permanentMap;
    std::unordered_map<HWND, TempEntry> m_temporaryMap;
    unsigned m_nGeneration;
};

CHandleMap* AFXAPI afxMapHWND(BOOL bCreate = FALSE);

// Frees the temporary objects of every kind the framework keeps (windows, image
// lists, GDI objects); nAfter as in CHandleMap::DeleteTemp.
void AFXAPI AfxDeleteTempObjects(unsigned nAfter);

LRESULT CALLBACK _AfxCbtFilterHook(int code, WPARAM wParam, LPARAM lParam);

// Thread state clean-up at thread exit and process detach.
void AFXAPI AfxTermThreadState();
void AFXAPI AfxTermModuleState();

// GDI wrappers come from afxgdi_.h once it exists.
CDC* AFXAPI AfxDCFromHandle(HDC hDC);

// Message handlers are stored as one generic member pointer; these undo the
// conversion made by the map macros.
template<class F>
inline F AfxWndHandler(AFX_PMSG pfn)
{
    return reinterpret_cast<F>(static_cast<AFX_PMSGW>(pfn));
}

template<class F>
inline F AfxCmdHandler(AFX_PMSG pfn)
{
    return reinterpret_cast<F>(pfn);
}

// The first window up the parent chain without WS_CHILD (the window itself if
// it is top-level).
HWND AFXAPI AfxGetTopLevelWindow(HWND hWnd);

// Dialog template helpers (DLGTEMPLATE and DLGTEMPLATEEX)
BOOL AFXAPI AfxGetDialogTemplateStyle(LPCDLGTEMPLATE lpTemplate, DWORD* pdwStyle, short* px, short* py);
