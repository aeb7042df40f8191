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
// the map and freed at the thread's idle time.

class CHandleMap
{
public:
    CHandleMap() {}
    ~CHandleMap();

    CWnd* FromHandle(HWND hWnd);
    CWnd* LookupPermanent(HWND hWnd) const;
    CWnd* LookupTemporary(HWND hWnd) const;
    void SetPermanent(HWND hWnd, CWnd* pWnd);
    void RemoveHandle(HWND hWnd);
    void DeleteTemp();

private:
    std::unordered_map<HWND, CWnd*> m_permanentMap;
    std::unordered_map<HWND, CWnd*> m_temporaryMap;
};

CHandleMap* AFXAPI afxMapHWND(BOOL bCreate = FALSE);

// Frees the temporary objects of every kind the framework keeps (windows, image
// lists, GDI objects).
void AFXAPI AfxDeleteTempObjects();

LRESULT CALLBACK _AfxCbtFilterHook(int code, WPARAM wParam, LPARAM lParam);

// Thread state clean-up at thread exit and process detach.
void AFXAPI AfxTermThreadState();
void AFXAPI AfxTermModuleState();

// The CDC wrapper for a DC handed in with a message (temporary unless owned).
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
