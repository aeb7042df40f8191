// afxole.h - OLE drag and drop: the data object a drop target reads, the data
// source a drag offers, the drop source and drop target, the stream-backed file,
// and the OLE initialisation of the application.
//
// The COM objects are CCmdTarget objects whose interfaces are nested parts named
// in an interface map. Each starts with one reference, its own: a data source or
// drop source on the stack outlives its drag, since OLE gives back every
// reference it takes before DoDragDrop returns.
#pragma once

#ifndef __AFXOLE_H__
#define __AFXOLE_H__

#ifndef __AFXWIN_H__
#include <afxwin.h>
#endif
#include <afxdisp.h>

#include <ole2.h>

// One of the DROPEFFECT_ values of the system's headers.
typedef DWORD DROPEFFECT;

class COleDataSource;
class COleDropSource;
class COleDropTarget;

/////////////////////////////////////////////////////////////////////////////
// COleDataObject: the receiving side of a data transfer (an IDataObject)

class COleDataObject
{
// Constructors
public:
    COleDataObject();

// Operations
    void Attach(LPDATAOBJECT lpDataObject, BOOL bAutoRelease = TRUE);
    LPDATAOBJECT Detach();
    void Release();

// Attributes
    BOOL IsDataAvailable(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc = NULL);

    // The data in any medium, as the source gives it; the caller releases it.
    BOOL GetData(CLIPFORMAT cfFormat, LPSTGMEDIUM lpStgMedium, LPFORMATETC lpFormatEtc = NULL);
    // A memory handle the caller owns, or NULL.
    HGLOBAL GetGlobalData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc = NULL);
    // The data as a file the caller deletes: a CSharedFile over a memory
    // handle, a COleStreamFile over a stream; NULL when neither is offered.
    CFile* GetFileData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc = NULL);

// Implementation
public:
    LPDATAOBJECT m_lpDataObject;
    BOOL m_bAutoRelease;        // Release() releases m_lpDataObject

    ~COleDataObject();

private:
    COleDataObject(const COleDataObject&);
    void operator=(const COleDataObject&);
};

/////////////////////////////////////////////////////////////////////////////
// COleDataSource: the offering side; formats are cached or rendered on demand

struct AFX_DATACACHE_ENTRY
{
    FORMATETC m_formatEtc;
    STGMEDIUM m_stgMedium;      // TYMED_NULL: rendered when asked for
    DATADIR m_nDataDir;
};

class COleDataSource : public CCmdTarget
{
// Constructors
public:
    COleDataSource();

// Operations
    void Empty();

    // The data source takes ownership of the handle (or medium).
    void CacheGlobalData(CLIPFORMAT cfFormat, HGLOBAL hGlobal, LPFORMATETC lpFormatEtc = NULL);
    void CacheData(CLIPFORMAT cfFormat, LPSTGMEDIUM lpStgMedium, LPFORMATETC lpFormatEtc = NULL);

    // Offers a format rendered when a target asks: OnRenderData (memory handle
    // by default), or OnRenderFileData into a memory or stream-backed file.
    void DelayRenderData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc = NULL);
    void DelayRenderFileData(CLIPFORMAT cfFormat, LPFORMATETC lpFormatEtc = NULL);

    // Waits for the mouse to leave lpRectStartDrag (or the drag delay), then
    // runs the system's drag loop; DROPEFFECT_NONE when the drag never began.
    DROPEFFECT DoDragDrop(DWORD dwEffects = DROPEFFECT_COPY | DROPEFFECT_MOVE | DROPEFFECT_LINK,
        LPCRECT lpRectStartDrag = NULL, COleDropSource* pDropSource = NULL);

// Overridables
    virtual BOOL OnRenderGlobalData(LPFORMATETC lpFormatEtc, HGLOBAL* phGlobal);
    virtual BOOL OnRenderFileData(LPFORMATETC lpFormatEtc, CFile* pFile);
    virtual BOOL OnRenderData(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium);
    virtual BOOL OnSetData(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium, BOOL bRelease);

// Implementation
public:
    virtual ~COleDataSource();

protected:
    AFX_DATACACHE_ENTRY* m_pDataCache;
    UINT m_nMaxSize;            // entries allocated
    UINT m_nSize;               // entries used
    UINT m_nGrowBy;

    AFX_DATACACHE_ENTRY* Lookup(LPFORMATETC lpFormatEtc, DATADIR nDataDir) const;
    AFX_DATACACHE_ENTRY* GetCacheEntry(LPFORMATETC lpFormatEtc, DATADIR nDataDir);

// Interface maps
public:
    BEGIN_INTERFACE_PART(DataObject, IDataObject)
        STDMETHOD(GetData)(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium);
        STDMETHOD(GetDataHere)(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium);
        STDMETHOD(QueryGetData)(LPFORMATETC lpFormatEtc);
        STDMETHOD(GetCanonicalFormatEtc)(LPFORMATETC lpFormatEtcIn, LPFORMATETC lpFormatEtcOut);
        STDMETHOD(SetData)(LPFORMATETC lpFormatEtc, LPSTGMEDIUM lpStgMedium, BOOL bRelease);
        STDMETHOD(EnumFormatEtc)(DWORD dwDirection, LPENUMFORMATETC* ppenumFormatEtc);
        STDMETHOD(DAdvise)(LPFORMATETC lpFormatEtc, DWORD advf, LPADVISESINK pAdvSink,
            LPDWORD pdwConnection);
        STDMETHOD(DUnadvise)(DWORD dwConnection);
        STDMETHOD(EnumDAdvise)(LPENUMSTATDATA* ppenumAdvise);
    END_INTERFACE_PART(DataObject)

    DECLARE_INTERFACE_MAP()

private:
    COleDataSource(const COleDataSource&);
    void operator=(const COleDataSource&);
};

/////////////////////////////////////////////////////////////////////////////
// COleDropSource: the drag's feedback and end; the default one drops when the
// button that started the drag goes up and cancels on Escape or the other button

class COleDropSource : public CCmdTarget
{
// Constructors
public:
    COleDropSource();

// Overridables
    virtual SCODE QueryContinueDrag(BOOL bEscapePressed, DWORD dwKeyState);
    virtual SCODE GiveFeedback(DROPEFFECT dropEffect);
    // Waits until the mouse leaves m_rectStartDrag or nDragDelay elapses (TRUE),
    // or a button or Escape ends the wait (FALSE); pWnd holds the capture.
    virtual BOOL OnBeginDrag(CWnd* pWnd);

// Implementation
public:
    virtual ~COleDropSource();

    BOOL m_bDragStarted;        // the mouse left the start rectangle
    DWORD m_dwButtonCancel;     // the button that cancels the drag (MK_*)
    DWORD m_dwButtonDrop;       // the button whose release drops (MK_*)
    CRect m_rectStartDrag;      // screen coordinates

    // win.ini [windows] DragMinDist and DragDelay, read once
    static UINT nDragMinDist;
    static UINT nDragDelay;

    BEGIN_INTERFACE_PART(DropSource, IDropSource)
        STDMETHOD(QueryContinueDrag)(BOOL bEscapePressed, DWORD dwKeyState);
        STDMETHOD(GiveFeedback)(DWORD dwEffect);
    END_INTERFACE_PART(DropSource)

    DECLARE_INTERFACE_MAP()

    friend class COleDataSource;
};

/////////////////////////////////////////////////////////////////////////////
// COleDropTarget: a window's drop target; points arrive in the client
// coordinates of the registered window

class COleDropTarget : public CCmdTarget
{
// Constructors
public:
    COleDropTarget();

// Operations
    BOOL Register(CWnd* pWnd);
    virtual void Revoke();      // also called when the window is destroyed

// Overridables
    virtual DROPEFFECT OnDragEnter(CWnd* pWnd, COleDataObject* pDataObject,
        DWORD dwKeyState, CPoint point);
    virtual DROPEFFECT OnDragOver(CWnd* pWnd, COleDataObject* pDataObject,
        DWORD dwKeyState, CPoint point);
    virtual BOOL OnDrop(CWnd* pWnd, COleDataObject* pDataObject,
        DROPEFFECT dropEffect, CPoint point);
    // (DROPEFFECT)-1 (the default) passes the drop on to OnDrop
    virtual DROPEFFECT OnDropEx(CWnd* pWnd, COleDataObject* pDataObject,
        DROPEFFECT dropDefault, DROPEFFECT dropList, CPoint point);
    virtual void OnDragLeave(CWnd* pWnd);
    virtual DROPEFFECT OnDragScroll(CWnd* pWnd, DWORD dwKeyState, CPoint point);

// Implementation
public:
    virtual ~COleDropTarget();

protected:
    HWND m_hWnd;                    // the registered window
    LPDATAOBJECT m_lpDataObject;    // held from DragEnter until DragLeave, Drop or Revoke
    // What OLE holds while the window is registered; Revoke cuts it off.
    struct AFX_DROPTARGET_FORWARDER* m_pForwarder;

    BEGIN_INTERFACE_PART(DropTarget, IDropTarget)
        STDMETHOD(DragEnter)(LPDATAOBJECT lpDataObject, DWORD dwKeyState, POINTL pt,
            LPDWORD pdwEffect);
        STDMETHOD(DragOver)(DWORD dwKeyState, POINTL pt, LPDWORD pdwEffect);
        STDMETHOD(DragLeave)();
        STDMETHOD(Drop)(LPDATAOBJECT lpDataObject, DWORD dwKeyState, POINTL pt,
            LPDWORD pdwEffect);
    END_INTERFACE_PART(DropTarget)

    DECLARE_INTERFACE_MAP()

private:
    COleDropTarget(const COleDropTarget&);
    void operator=(const COleDropTarget&);
};

/////////////////////////////////////////////////////////////////////////////
// COleStreamFile: a CFile over an IStream

class COleStreamFile : public CFile
{
    DECLARE_DYNAMIC(COleStreamFile)

// Constructors and Destructors
public:
    // Takes over one reference to lpStream (released by Close).
    COleStreamFile(LPSTREAM lpStream = NULL);

// Operations
    void Attach(LPSTREAM lpStream);
    LPSTREAM Detach();
    IStream* GetStream() const;

    // A new stream in growable memory.
    BOOL CreateMemoryStream(CFileException* pError = NULL);

// Overridables
public:
    virtual ~COleStreamFile();

    virtual ULONGLONG GetPosition() const;
    virtual ULONGLONG Seek(LONGLONG lOff, UINT nFrom);
    virtual void SetLength(ULONGLONG dwNewLen);
    virtual ULONGLONG GetLength() const;
    virtual UINT Read(void* lpBuf, UINT nCount);
    virtual void Write(const void* lpBuf, UINT nCount);
    virtual void LockRange(ULONGLONG dwPos, ULONGLONG dwCount);
    virtual void UnlockRange(ULONGLONG dwPos, ULONGLONG dwCount);
    virtual void Abort();
    virtual void Flush();
    virtual void Close();
    virtual CFile* Duplicate() const;

// Implementation
protected:
    LPSTREAM m_lpStream;
};

#endif // __AFXOLE_H__
