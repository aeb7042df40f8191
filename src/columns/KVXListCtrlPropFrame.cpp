// KVXListCtrlPropFrame: the chooser's window around its sheet.
#include "KVXListCtrlPropFrame.h"

IMPLEMENT_DYNCREATE(KVXListCtrlPropFrame, CMiniFrameWnd)

BEGIN_MESSAGE_MAP(KVXListCtrlPropFrame, CMiniFrameWnd)
    ON_WM_CREATE()
    ON_WM_CLOSE()
    ON_WM_SETFOCUS()
    ON_WM_ACTIVATE()
END_MESSAGE_MAP()

KVXListCtrlPropFrame::KVXListCtrlPropFrame()
    : m_pSheet(NULL)
{
}

KVXListCtrlPropFrame::~KVXListCtrlPropFrame()
{
}

int KVXListCtrlPropFrame::OnCreate(LPCREATESTRUCT lpCreateStruct)
{
    if (CFrameWnd::OnCreate(lpCreateStruct) == -1)
        return -1;

    m_pSheet = new KVXListCtrlPropSheet(this);
    if (!m_pSheet->Create(this, WS_CHILD | WS_VISIBLE, 0))
    {
        // A failed Create has run the sheet's PostNcDestroy, which deleted it.
        m_pSheet = NULL;
        return -1;
    }

    // The frame's client area is the sheet.
    CRect rectSheet;
    m_pSheet->GetWindowRect(&rectSheet);
    CRect rectFrame = rectSheet;
    CalcWindowRect(&rectFrame, CWnd::adjustBorder);
    SetWindowPos(NULL, rectFrame.left, rectFrame.top, rectFrame.Width(), rectFrame.Height(),
        SWP_NOZORDER | SWP_NOACTIVATE);
    m_pSheet->SetWindowPos(NULL, 0, 0, rectSheet.Width(), rectSheet.Height(), SWP_NOZORDER | SWP_NOACTIVATE);
    return 0;
}

void KVXListCtrlPropFrame::OnClose()
{
    ShowWindow(SW_HIDE);
}

void KVXListCtrlPropFrame::OnSetFocus(CWnd* pOldWnd)
{
    CFrameWnd::OnSetFocus(pOldWnd);
}

void KVXListCtrlPropFrame::OnActivate(UINT nState, CWnd* pWndOther, BOOL bMinimized)
{
    CFrameWnd::OnActivate(nState, pWndOther, bMinimized);
    // The sheet, a dialog, keeps its focus control across activations.
    if (m_pSheet != NULL && ::IsWindow(m_pSheet->GetSafeHwnd()))
    {
        const MSG* pMsg = GetCurrentMessage();
        m_pSheet->SendMessage(WM_ACTIVATE, pMsg->wParam, pMsg->lParam);
    }
}
