// afxstat_.h - module state (one per process: host and extension DLLs share it,
// as with a shared framework DLL) and per-thread state.
#pragma once

#ifndef __AFXSTATE_H__
#define __AFXSTATE_H__

class CWinApp;
class CWinThread;
class CWnd;
class CDynLinkLibrary;
class COleObjectFactory;
class CHandleMap;

/////////////////////////////////////////////////////////////////////////////
// CSimpleList: intrusive singly linked list; the link lives inside each element
// at a fixed offset.

class CSimpleList
{
public:
    CSimpleList(int nNextOffset = 0) : m_pHead(NULL), m_nNextOffset((size_t)nNextOffset) {}
    void Construct(int nNextOffset) { m_nNextOffset = (size_t)nNextOffset; }

// Operations
    BOOL IsEmpty() const { return m_pHead == NULL; }
    void AddHead(void* p) { *GetNextPtr(p) = m_pHead; m_pHead = p; }
    void RemoveAll() { m_pHead = NULL; }
    void* GetHead() const { return m_pHead; }
    void* GetNext(void* p) const { return *GetNextPtr(p); }
    BOOL Remove(void* p)
    {
        if (p == NULL)
            return FALSE;
        for (void** pp = &m_pHead; *pp != NULL; pp = GetNextPtr(*pp))
        {
            if (*pp == p)
            {
                *pp = *GetNextPtr(p);
                return TRUE;
            }
        }
        return FALSE;
    }

// Implementation
    void* m_pHead;
    size_t m_nNextOffset;

    void** GetNextPtr(void* p) const { return (void**)((BYTE*)p + m_nNextOffset); }
};

template<class TYPE>
class CTypedSimpleList : public CSimpleList
{
public:
    CTypedSimpleList(int nNextOffset = 0) : CSimpleList(nNextOffset) {}
    void AddHead(TYPE p) { CSimpleList::AddHead((void*)p); }
    TYPE GetHead() const { return (TYPE)CSimpleList::GetHead(); }
    TYPE GetNext(TYPE p) const { return (TYPE)CSimpleList::GetNext((void*)p); }
    BOOL Remove(TYPE p) { return CSimpleList::Remove((void*)p); }
    operator TYPE() const { return (TYPE)CSimpleList::GetHead(); }
};

/////////////////////////////////////////////////////////////////////////////
// AFX_MODULE_STATE: the application's view of the framework. There is one: the
// host and every extension DLL see the same instance.

class AFX_MODULE_STATE
{
public:
    AFX_MODULE_STATE();

    CWinApp* m_pCurrentWinApp;
    HINSTANCE m_hCurrentInstanceHandle;
    HINSTANCE m_hCurrentResourceHandle;
    LPCTSTR m_lpszCurrentAppName;
    BYTE m_bDLL;        // the module is a DLL
    BYTE m_bSystem;     // the module is the framework itself

    // Run-time classes registered by static constructors, and the heads saved
    // by an extension DLL's raw entry while its own constructors run.
    CRuntimeClass* m_pClassInit;
    CTypedSimpleList<CRuntimeClass*> m_classList;
    COleObjectFactory* m_pFactoryInit;
    CTypedSimpleList<COleObjectFactory*> m_factoryList;

    long m_nObjectCount;
    BOOL m_bUserCtrl;

    // Extension DLLs inserted into the resource and class chain.
    CTypedSimpleList<CDynLinkLibrary*> m_libraryList;

    DWORD m_fRegisteredClasses;     // AFX_WND*_REG bits already registered
};

AFX_MODULE_STATE* AFXAPI AfxGetModuleState();
AFX_MODULE_STATE* AFXAPI AfxGetAppModuleState();
AFX_MODULE_STATE* AFXAPI AfxGetStaticModuleState();

// Switching module states is meaningless with a single shared state; the macro
// exists so that code written for other configurations compiles unchanged.
struct AFX_MAINTAIN_STATE
{
    explicit AFX_MAINTAIN_STATE(AFX_MODULE_STATE*) {}
};
#define AFX_MANAGE_STATE(p) AFX_MAINTAIN_STATE _ctlState(p);

/////////////////////////////////////////////////////////////////////////////
// Per-thread state

class AFX_MODULE_THREAD_STATE
{
public:
    AFX_MODULE_THREAD_STATE();

    CWinThread* m_pCurrentWinThread;    // the thread object of this thread, if any
    CHandleMap* m_pmapHWND;             // HWND -> CWnd*, permanent and temporary
    int m_nTempMapLock;                 // temporary objects are kept while > 0
};

class _AFX_THREAD_STATE
{
public:
    _AFX_THREAD_STATE();

    AFX_MODULE_THREAD_STATE m_moduleThreadState;

    // Window creation hook
    CWnd* m_pWndInit;                   // object waiting for its HWND
    HHOOK m_hHookOldCbtFilter;

    // The message being processed by AfxCallWndProc (Default, GetCurrentMessage)
    MSG m_lastSentMsg;
    // The message retrieved by the message pump
    MSG m_msgCur;

    // IsIdleMessage: repeated mouse moves and the caret blink are not activity
    POINT m_ptCursorLast;
    UINT m_nMsgLast;

    // UpdateData blocks control notifications to this window
    HWND m_hLockoutNotifyWindow;

    // AfxRegisterWndClass returns a name kept here
    TCHAR m_szTempClassName[128];
};

_AFX_THREAD_STATE* AFXAPI AfxGetThreadState();
AFX_MODULE_THREAD_STATE* AFXAPI AfxGetModuleThreadState();

#endif // __AFXSTATE_H__
