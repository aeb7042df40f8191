// COleDropSource (the start of a drag and its end) and COleDropTarget (a
// window's IDropTarget, dispatching to virtuals with client coordinates).
#include "oleimpl.h"

/////////////////////////////////////////////////////////////////////////////
// COleDropSource

UINT COleDropSource::nDragMinDist = 0;
UINT COleDropSource::nDragDelay = 0;

BEGIN_INTERFACE_MAP(COleDropSource, CCmdTarget)
    INTERFACE_PART(COleDropSource, IID_IDropSource, DropSource)
END_INTERFACE_MAP()

COleDropSource::COleDropSource()
    : m_bDragStarted(FALSE), m_dwButtonCancel(0), m_dwButtonDrop(0)
{
    static BOOL s_bMetricsRead = FALSE;
    if (!s_bMetricsRead)
    {
        nDragMinDist = ::GetProfileInt(_T("windows"), _T("DragMinDist"), DD_DEFDRAGMINDIST);
        nDragDelay = ::GetProfileInt(_T("windows"), _T("DragDelay"), DD_DEFDRAGDELAY);
        s_bMetricsRead = TRUE;
    }
}

COleDropSource::~COleDropSource()
{
}

// The button held now drops, the other one cancels. Mouse and key messages
// taken from the queue here are the drag's own: they are not dispatched.
BOOL COleDropSource::OnBeginDrag(CWnd* pWnd)
{
    m_dwButtonCancel = 0;
    m_dwButtonDrop = 0;
    if (::GetKeyState(VK_LBUTTON) < 0)
    {
        m_dwButtonDrop |= MK_LBUTTON;
        m_dwButtonCancel |= MK_RBUTTON;
    }
    else if (::GetKeyState(VK_RBUTTON) < 0)
    {
        m_dwButtonDrop |= MK_RBUTTON;
        m_dwButtonCancel |= MK_LBUTTON;
    }
    if (m_bDragStarted)
        return TRUE;    // no start rectangle to wait for

    // Without a main window the capture stays where it is (usually with the
    // window that saw the button go down).
    HWND hWndCapture = pWnd->GetSafeHwnd();
    if (hWndCapture == NULL)
        hWndCapture = ::GetCapture();
    else
        ::SetCapture(hWndCapture);

    DWORD dwLastTick = ::GetTickCount();
    while (!m_bDragStarted)
    {
        // some applications take the capture away at random times
        if (hWndCapture != NULL && ::GetCapture() != hWndCapture)
            break;

        MSG msg;
        if (::PeekMessage(&msg, NULL, WM_MOUSEFIRST, WM_MOUSELAST, PM_REMOVE)
            || ::PeekMessage(&msg, NULL, WM_KEYFIRST, WM_KEYLAST, PM_REMOVE))
        {
            // a button pressed or released ends the wait, as does Escape
            if (msg.message == WM_LBUTTONUP || msg.message == WM_RBUTTONUP
                || msg.message == WM_LBUTTONDOWN || msg.message == WM_RBUTTONDOWN)
                break;
            if (msg.message == WM_KEYDOWN && msg.wParam == VK_ESCAPE)
                break;
            m_bDragStarted = !m_rectStartDrag.PtInRect(msg.pt);
        }

        // holding still long enough starts the drag too
        if (::GetTickCount() - dwLastTick > nDragDelay)
            m_bDragStarted = TRUE;
    }
    if (pWnd->GetSafeHwnd() != NULL && ::GetCapture() == hWndCapture)
        ::ReleaseCapture();
    return m_bDragStarted;
}

SCODE COleDropSource::QueryContinueDrag(BOOL bEscapePressed, DWORD dwKeyState)
{
    if (bEscapePressed || (dwKeyState & m_dwButtonCancel) != 0)
    {
        m_bDragStarted = FALSE;
        return DRAGDROP_S_CANCEL;
    }
    // the button that started the drag went up
    if ((dwKeyState & m_dwButtonDrop) == 0)
        return m_bDragStarted ? DRAGDROP_S_DROP : DRAGDROP_S_CANCEL;
    return S_OK;
}

SCODE COleDropSource::GiveFeedback(DROPEFFECT)
{
    return DRAGDROP_S_USEDEFAULTCURSORS;
}

STDMETHODIMP_(ULONG) COleDropSource::XDropSource::AddRef()
{
    METHOD_PROLOGUE_EX_(COleDropSource, DropSource)
    return pThis->ExternalAddRef();
}

STDMETHODIMP_(ULONG) COleDropSource::XDropSource::Release()
{
    METHOD_PROLOGUE_EX_(COleDropSource, DropSource)
    return pThis->ExternalRelease();
}

STDMETHODIMP COleDropSource::XDropSource::QueryInterface(REFIID iid, LPVOID* ppvObj)
{
    METHOD_PROLOGUE_EX_(COleDropSource, DropSource)
    return (HRESULT)pThis->ExternalQueryInterface(&iid, ppvObj);
}

STDMETHODIMP COleDropSource::XDropSource::QueryContinueDrag(BOOL bEscapePressed, DWORD dwKeyState)
{
    METHOD_PROLOGUE_EX_(COleDropSource, DropSource)
    return pThis->QueryContinueDrag(bEscapePressed, dwKeyState);
}

STDMETHODIMP COleDropSource::XDropSource::GiveFeedback(DWORD dwEffect)
{
    METHOD_PROLOGUE_EX(COleDropSource, DropSource)
    return pThis->GiveFeedback(dwEffect);
}

/////////////////////////////////////////////////////////////////////////////
// COleDropTarget

// What OLE holds of a registered target. A drag over the window keeps its
// reference after RevokeDragDrop, and the target (usually a member of the
// window's object) may be deleted with the window while the drag runs: once
// Revoke has cut the forwarder off, the drag's remaining calls reach nothing.
struct AFX_DROPTARGET_FORWARDER : public IDropTarget
{
    explicit AFX_DROPTARGET_FORWARDER(COleDropTarget* pTarget) : m_nRef(1), m_pTarget(pTarget)
    {
        pTarget->ExternalAddRef();
    }

    void Disconnect()
    {
        COleDropTarget* pTarget = m_pTarget;
        m_pTarget = NULL;
        if (pTarget != NULL)
            pTarget->ExternalRelease();
    }

    IDropTarget* Target() const
    {
        return m_pTarget != NULL ? (IDropTarget*)m_pTarget->GetInterface(&IID_IDropTarget) : NULL;
    }

    STDMETHOD(QueryInterface)(REFIID iid, LPVOID* ppvObj)
    {
        if (ppvObj == NULL)
            return E_POINTER;
        if (IsEqualIID(iid, IID_IUnknown) || IsEqualIID(iid, IID_IDropTarget))
        {
            *ppvObj = (IDropTarget*)this;
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
        {
            Disconnect();
            delete this;
        }
        return (ULONG)nRef;
    }
    STDMETHOD(DragEnter)(LPDATAOBJECT lpDataObject, DWORD dwKeyState, POINTL pt, LPDWORD pdwEffect)
    {
        if (IDropTarget* pTarget = Target())
            return pTarget->DragEnter(lpDataObject, dwKeyState, pt, pdwEffect);
        return Refuse(pdwEffect);
    }
    STDMETHOD(DragOver)(DWORD dwKeyState, POINTL pt, LPDWORD pdwEffect)
    {
        if (IDropTarget* pTarget = Target())
            return pTarget->DragOver(dwKeyState, pt, pdwEffect);
        return Refuse(pdwEffect);
    }
    STDMETHOD(DragLeave)()
    {
        if (IDropTarget* pTarget = Target())
            return pTarget->DragLeave();
        return S_OK;
    }
    STDMETHOD(Drop)(LPDATAOBJECT lpDataObject, DWORD dwKeyState, POINTL pt, LPDWORD pdwEffect)
    {
        if (IDropTarget* pTarget = Target())
            return pTarget->Drop(lpDataObject, dwKeyState, pt, pdwEffect);
        return Refuse(pdwEffect);
    }

private:
    virtual ~AFX_DROPTARGET_FORWARDER() {}

    static HRESULT Refuse(LPDWORD pdwEffect)
    {
        if (pdwEffect != NULL)
            *pdwEffect = DROPEFFECT_NONE;
        return S_OK;
    }

    LONG m_nRef;
    COleDropTarget* m_pTarget;
};

BEGIN_INTERFACE_MAP(COleDropTarget, CCmdTarget)
    INTERFACE_PART(COleDropTarget, IID_IDropTarget, DropTarget)
END_INTERFACE_MAP()

COleDropTarget::COleDropTarget()
    : m_hWnd(NULL), m_lpDataObject(NULL), m_pForwarder(NULL)
{
}

COleDropTarget::~COleDropTarget()
{
    if (m_lpDataObject != NULL)
    {
        m_lpDataObject->Release();
        m_lpDataObject = NULL;
    }
    Revoke();
}

BOOL COleDropTarget::Register(CWnd* pWnd)
{
    if (m_hWnd != NULL || pWnd == NULL || !::IsWindow(pWnd->m_hWnd))
        return FALSE;

    // the object is held externally while it is registered
    LPUNKNOWN lpUnknown = GetInterface(&IID_IUnknown);
    if (::CoLockObjectExternal(lpUnknown, TRUE, FALSE) != S_OK)
        return FALSE;
    AFX_DROPTARGET_FORWARDER* pForwarder = new AFX_DROPTARGET_FORWARDER(this);
    if (::RegisterDragDrop(pWnd->m_hWnd, pForwarder) != S_OK)
    {
        pForwarder->Release();
        ::CoLockObjectExternal(lpUnknown, FALSE, FALSE);
        return FALSE;
    }
    m_pForwarder = pForwarder;
    m_hWnd = pWnd->m_hWnd;
    pWnd->m_pDropTarget = this;
    return TRUE;
}

void COleDropTarget::Revoke()
{
    if (m_hWnd == NULL)
        return;
    ::RevokeDragDrop(m_hWnd);
    m_pForwarder->Disconnect();
    m_pForwarder->Release();
    m_pForwarder = NULL;
    // a drag still over the window is over for this target
    if (m_lpDataObject != NULL)
    {
        m_lpDataObject->Release();
        m_lpDataObject = NULL;
    }
    ::CoLockObjectExternal(GetInterface(&IID_IUnknown), FALSE, TRUE);
    if (CWnd* pWnd = CWnd::FromHandlePermanent(m_hWnd))
    {
        if (pWnd->m_pDropTarget == this)
            pWnd->m_pDropTarget = NULL;
    }
    m_hWnd = NULL;
}

// Without views to scroll or to delegate to, a plain target accepts nothing.
DROPEFFECT COleDropTarget::OnDragEnter(CWnd*, COleDataObject*, DWORD, CPoint)
{
    return DROPEFFECT_NONE;
}

DROPEFFECT COleDropTarget::OnDragOver(CWnd*, COleDataObject*, DWORD, CPoint)
{
    return DROPEFFECT_NONE;
}

BOOL COleDropTarget::OnDrop(CWnd*, COleDataObject*, DROPEFFECT, CPoint)
{
    return FALSE;
}

DROPEFFECT COleDropTarget::OnDropEx(CWnd*, COleDataObject*, DROPEFFECT, DROPEFFECT, CPoint)
{
    return (DROPEFFECT)-1;
}

void COleDropTarget::OnDragLeave(CWnd*)
{
}

DROPEFFECT COleDropTarget::OnDragScroll(CWnd*, DWORD, CPoint)
{
    return DROPEFFECT_NONE;
}

namespace {

// The effect the target chose, if the source allows it; else copy and move stand
// in for each other (then link), and a link the source does not allow is refused.
DROPEFFECT FilterDropEffect(DROPEFFECT dropEffect, DROPEFFECT dwEffects)
{
    if ((dropEffect & dwEffects) != 0)
        return dropEffect;
    switch (dropEffect)
    {
    case DROPEFFECT_COPY:
        if (dwEffects & DROPEFFECT_MOVE)
            return DROPEFFECT_MOVE;
        if (dwEffects & DROPEFFECT_LINK)
            return DROPEFFECT_LINK;
        break;
    case DROPEFFECT_MOVE:
        if (dwEffects & DROPEFFECT_COPY)
            return DROPEFFECT_COPY;
        if (dwEffects & DROPEFFECT_LINK)
            return DROPEFFECT_LINK;
        break;
    default:
        break;
    }
    return DROPEFFECT_NONE;
}

// The registered window and the point in its client coordinates.
CWnd* TargetWindow(HWND hWnd, POINTL pt, CPoint& point)
{
    if (hWnd == NULL || !::IsWindow(hWnd))
        return NULL;
    point.SetPoint((int)pt.x, (int)pt.y);
    ::ScreenToClient(hWnd, &point);
    return CWnd::FromHandle(hWnd);
}

} // namespace

STDMETHODIMP_(ULONG) COleDropTarget::XDropTarget::AddRef()
{
    METHOD_PROLOGUE_EX_(COleDropTarget, DropTarget)
    return pThis->ExternalAddRef();
}

STDMETHODIMP_(ULONG) COleDropTarget::XDropTarget::Release()
{
    METHOD_PROLOGUE_EX_(COleDropTarget, DropTarget)
    return pThis->ExternalRelease();
}

STDMETHODIMP COleDropTarget::XDropTarget::QueryInterface(REFIID iid, LPVOID* ppvObj)
{
    METHOD_PROLOGUE_EX_(COleDropTarget, DropTarget)
    return (HRESULT)pThis->ExternalQueryInterface(&iid, ppvObj);
}

STDMETHODIMP COleDropTarget::XDropTarget::DragEnter(LPDATAOBJECT lpDataObject, DWORD dwKeyState,
    POINTL pt, LPDWORD pdwEffect)
{
    METHOD_PROLOGUE_EX(COleDropTarget, DropTarget)
    if (lpDataObject == NULL || pdwEffect == NULL)
        return E_INVALIDARG;
    CPoint point;
    CWnd* pWnd = TargetWindow(pThis->m_hWnd, pt, point);
    if (pWnd == NULL)
        return E_UNEXPECTED;

    HRESULT hr = E_UNEXPECTED;
    TRY
    {
        // the data object is kept for DragOver and DragLeave
        lpDataObject->AddRef();
        if (pThis->m_lpDataObject != NULL)
            pThis->m_lpDataObject->Release();
        pThis->m_lpDataObject = lpDataObject;

        DROPEFFECT dropEffect = pThis->OnDragScroll(pWnd, dwKeyState, point);
        if ((dropEffect & DROPEFFECT_SCROLL) == 0)
        {
            COleDataObject dataObject;
            dataObject.Attach(lpDataObject, FALSE);
            dropEffect = pThis->OnDragEnter(pWnd, &dataObject, dwKeyState, point);
        }
        *pdwEffect = FilterDropEffect(dropEffect, *pdwEffect);
        hr = S_OK;
    }
    CATCH_ALL(e)
    {
        *pdwEffect = DROPEFFECT_NONE;
    }
    END_CATCH_ALL
    return hr;
}

STDMETHODIMP COleDropTarget::XDropTarget::DragOver(DWORD dwKeyState, POINTL pt, LPDWORD pdwEffect)
{
    METHOD_PROLOGUE_EX(COleDropTarget, DropTarget)
    if (pdwEffect == NULL)
        return E_INVALIDARG;
    CPoint point;
    CWnd* pWnd = TargetWindow(pThis->m_hWnd, pt, point);
    if (pWnd == NULL || pThis->m_lpDataObject == NULL)
    {
        *pdwEffect = DROPEFFECT_NONE;
        return E_UNEXPECTED;    // no DragEnter before
    }

    HRESULT hr = E_UNEXPECTED;
    TRY
    {
        DROPEFFECT dropEffect = pThis->OnDragScroll(pWnd, dwKeyState, point);
        if ((dropEffect & DROPEFFECT_SCROLL) == 0)
        {
            COleDataObject dataObject;
            dataObject.Attach(pThis->m_lpDataObject, FALSE);
            dropEffect = pThis->OnDragOver(pWnd, &dataObject, dwKeyState, point);
        }
        *pdwEffect = FilterDropEffect(dropEffect, *pdwEffect);
        hr = S_OK;
    }
    CATCH_ALL(e)
    {
        *pdwEffect = DROPEFFECT_NONE;
    }
    END_CATCH_ALL
    return hr;
}

STDMETHODIMP COleDropTarget::XDropTarget::DragLeave()
{
    METHOD_PROLOGUE_EX(COleDropTarget, DropTarget)
    CPoint point;
    POINTL pt = { 0, 0 };
    CWnd* pWnd = TargetWindow(pThis->m_hWnd, pt, point);
    if (pWnd != NULL)
    {
        TRY
        {
            pThis->OnDragLeave(pWnd);
        }
        CATCH_ALL(e)
        {
        }
        END_CATCH_ALL
    }
    if (pThis->m_lpDataObject != NULL)
    {
        pThis->m_lpDataObject->Release();
        pThis->m_lpDataObject = NULL;
    }
    return S_OK;
}

// OnDragOver decides the effect once more at the drop point; OnDropEx gets the
// first say, then OnDrop; a refused drop ends like a leave.
STDMETHODIMP COleDropTarget::XDropTarget::Drop(LPDATAOBJECT lpDataObject, DWORD dwKeyState,
    POINTL pt, LPDWORD pdwEffect)
{
    METHOD_PROLOGUE_EX(COleDropTarget, DropTarget)
    if (lpDataObject == NULL || pdwEffect == NULL)
        return E_INVALIDARG;
    CPoint point;
    CWnd* pWnd = TargetWindow(pThis->m_hWnd, pt, point);
    HRESULT hr = E_UNEXPECTED;
    DROPEFFECT dropEffect = DROPEFFECT_NONE;
    if (pWnd != NULL)
    {
        TRY
        {
            COleDataObject dataObject;
            dataObject.Attach(lpDataObject, FALSE);
            dropEffect = FilterDropEffect(
                pThis->OnDragOver(pWnd, &dataObject, dwKeyState, point), *pdwEffect);

            DROPEFFECT dropResult = pThis->OnDropEx(pWnd, &dataObject, dropEffect, *pdwEffect, point);
            if (dropResult != (DROPEFFECT)-1)
                dropEffect = dropResult;
            else if (dropEffect != DROPEFFECT_NONE)
            {
                if (!pThis->OnDrop(pWnd, &dataObject, dropEffect, point))
                    dropEffect = DROPEFFECT_NONE;
            }
            else
                pThis->OnDragLeave(pWnd);
            hr = S_OK;
        }
        CATCH_ALL(e)
        {
            dropEffect = DROPEFFECT_NONE;
        }
        END_CATCH_ALL
    }
    if (pThis->m_lpDataObject != NULL)
    {
        pThis->m_lpDataObject->Release();
        pThis->m_lpDataObject = NULL;
    }
    *pdwEffect = dropEffect;
    return hr;
}
