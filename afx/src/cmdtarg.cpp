// CCmdTarget: message map search and command dispatch; CCmdUI.
#include "wndimpl.h"

IMPLEMENT_DYNAMIC(CCmdTarget, CObject)

// CCmdTarget's map ends every chain.
const AFX_MSGMAP* PASCAL CCmdTarget::_GetBaseMessageMap()
{
    return NULL;
}

const AFX_MSGMAP* CCmdTarget::GetMessageMap() const
{
    return &CCmdTarget::messageMap;
}

struct CCmdTarget::_messageEntries
{
    static const AFX_MSGMAP_ENTRY entries[];
};

const AFX_MSGMAP CCmdTarget::messageMap =
    { &CCmdTarget::_GetBaseMessageMap, &CCmdTarget::_messageEntries::entries[0] };

const AFX_MSGMAP_ENTRY CCmdTarget::_messageEntries::entries[] =
{
    { 0, 0, 0, 0, AfxSig_end, (AFX_PMSG)0 }
};

CCmdTarget::CCmdTarget()
{
}

CCmdTarget::~CCmdTarget()
{
}

const AFX_MSGMAP_ENTRY* AFXAPI AfxFindMessageEntry(const AFX_MSGMAP_ENTRY* lpEntry,
    UINT nMsg, UINT nCode, UINT nID)
{
    if (lpEntry == NULL)
        return NULL;
    for (; lpEntry->nSig != AfxSig_end; ++lpEntry)
    {
        if (lpEntry->nMessage == nMsg && lpEntry->nCode == nCode
            && nID >= lpEntry->nID && nID <= lpEntry->nLastID)
            return lpEntry;
    }
    return NULL;
}

static BOOL DispatchCmdMsg(CCmdTarget* pTarget, UINT nID, int nCode, AFX_PMSG pfn,
    void* pExtra, UINT_PTR nSig, AFX_CMDHANDLERINFO* pHandlerInfo)
{
    if (pHandlerInfo != NULL)
    {
        // Only asked who would handle it
        pHandlerInfo->pTarget = pTarget;
        pHandlerInfo->pmf = pfn;
        return TRUE;
    }

    AFX_NOTIFY* pNotify = (AFX_NOTIFY*)pExtra;
    BOOL bResult = TRUE;
    switch (nSig)
    {
    case AfxSigCmd_v:
        (pTarget->*pfn)();
        break;
    case AfxSigCmd_b:
        bResult = (pTarget->*AfxCmdHandler<BOOL (CCmdTarget::*)()>(pfn))();
        break;
    case AfxSigCmd_RANGE:
        (pTarget->*AfxCmdHandler<void (CCmdTarget::*)(UINT)>(pfn))(nID);
        break;
    case AfxSigCmd_EX:
        bResult = (pTarget->*AfxCmdHandler<BOOL (CCmdTarget::*)(UINT)>(pfn))(nID);
        break;
    case AfxSigNotify_v:
        if (pNotify == NULL)
            return FALSE;
        (pTarget->*AfxCmdHandler<void (CCmdTarget::*)(NMHDR*, LRESULT*)>(pfn))(
            pNotify->pNMHDR, pNotify->pResult);
        break;
    case AfxSigNotify_b:
        if (pNotify == NULL)
            return FALSE;
        bResult = (pTarget->*AfxCmdHandler<BOOL (CCmdTarget::*)(NMHDR*, LRESULT*)>(pfn))(
            pNotify->pNMHDR, pNotify->pResult);
        break;
    case AfxSigNotify_RANGE:
        if (pNotify == NULL)
            return FALSE;
        (pTarget->*AfxCmdHandler<void (CCmdTarget::*)(UINT, NMHDR*, LRESULT*)>(pfn))(
            nID, pNotify->pNMHDR, pNotify->pResult);
        break;
    case AfxSigNotify_EX:
        if (pNotify == NULL)
            return FALSE;
        bResult = (pTarget->*AfxCmdHandler<BOOL (CCmdTarget::*)(UINT, NMHDR*, LRESULT*)>(pfn))(
            nID, pNotify->pNMHDR, pNotify->pResult);
        break;
    case AfxSig_cmdui:
    case AfxSig_cmduiw:
        {
            CCmdUI* pCmdUI = (CCmdUI*)pExtra;
            if (pCmdUI == NULL)
                return FALSE;
            pCmdUI->m_bContinueRouting = FALSE;
            if (nSig == AfxSig_cmdui)
                (pTarget->*AfxCmdHandler<void (CCmdTarget::*)(CCmdUI*)>(pfn))(pCmdUI);
            else
                (pTarget->*AfxCmdHandler<void (CCmdTarget::*)(CCmdUI*, UINT)>(pfn))(pCmdUI, nID);
            bResult = !pCmdUI->m_bContinueRouting;
            pCmdUI->m_bContinueRouting = FALSE;
        }
        break;
    default:
        bResult = FALSE;
        break;
    }
    (void)nCode;
    return bResult;
}

// nCode carries the message in its high word (0 means WM_COMMAND) and the
// notification code in its low word; CN_UPDATE_COMMAND_UI is passed whole.
BOOL CCmdTarget::OnCmdMsg(UINT nID, int nCode, void* pExtra, AFX_CMDHANDLERINFO* pHandlerInfo)
{
    UINT nMsg = 0;
    UINT nEntryCode = (UINT)nCode;
    if ((UINT)nCode != CN_UPDATE_COMMAND_UI)
    {
        nMsg = HIWORD(nCode);
        nEntryCode = LOWORD(nCode);
    }
    if (nMsg == 0)
        nMsg = WM_COMMAND;

    for (const AFX_MSGMAP* pMessageMap = GetMessageMap(); pMessageMap != NULL;
         pMessageMap = (*pMessageMap->pfnGetBaseMap)())
    {
        const AFX_MSGMAP_ENTRY* lpEntry = AfxFindMessageEntry(pMessageMap->lpEntries, nMsg, nEntryCode, nID);
        if (lpEntry != NULL)
            return DispatchCmdMsg(this, nID, nCode, lpEntry->pfn, pExtra, lpEntry->nSig, pHandlerInfo);
    }
    return FALSE;
}

/////////////////////////////////////////////////////////////////////////////
// Wait cursor

void CCmdTarget::BeginWaitCursor()
{
    if (CWinApp* pApp = AfxGetApp())
        pApp->DoWaitCursor(1);
}

void CCmdTarget::EndWaitCursor()
{
    if (CWinApp* pApp = AfxGetApp())
        pApp->DoWaitCursor(-1);
}

void CCmdTarget::RestoreWaitCursor()
{
    if (CWinApp* pApp = AfxGetApp())
        pApp->DoWaitCursor(0);
}

/////////////////////////////////////////////////////////////////////////////
// CCmdUI: only window items are updated here (there are no menus).

CCmdUI::CCmdUI()
    : m_nID(0), m_nIndex(0), m_pMenu(NULL), m_pSubMenu(NULL), m_pOther(NULL),
      m_bEnableChanged(FALSE), m_bContinueRouting(FALSE), m_nIndexMax(0), m_pParentMenu(NULL)
{
}

void CCmdUI::Enable(BOOL bOn)
{
    if (m_pOther != NULL && m_pOther->m_hWnd != NULL)
    {
        // Move the focus away from a control about to be disabled
        if (!bOn && ::GetFocus() == m_pOther->m_hWnd)
        {
            if (CWnd* pParent = m_pOther->GetParent())
                pParent->SendMessage(WM_NEXTDLGCTL, 0, FALSE);
        }
        m_pOther->EnableWindow(bOn);
    }
    m_bEnableChanged = TRUE;
}

void CCmdUI::SetCheck(int nCheck)
{
    if (m_pOther != NULL && m_pOther->m_hWnd != NULL
        && (m_pOther->SendMessage(WM_GETDLGCODE) & DLGC_BUTTON))
        m_pOther->SendMessage(BM_SETCHECK, nCheck);
}

void CCmdUI::SetRadio(BOOL bOn)
{
    SetCheck(bOn ? 1 : 0);
}

void CCmdUI::SetText(LPCTSTR lpszText)
{
    if (m_pOther != NULL && m_pOther->m_hWnd != NULL && lpszText != NULL)
    {
        // Avoid flicker: set only a changed text
        CString strOld;
        m_pOther->GetWindowText(strOld);
        if (strOld != lpszText)
            m_pOther->SetWindowText(lpszText);
    }
}

void CCmdUI::ContinueRouting()
{
    m_bContinueRouting = TRUE;
}

BOOL CCmdUI::DoUpdate(CCmdTarget* pTarget, BOOL bDisableIfNoHndler)
{
    if (m_nID == 0 || LOWORD(m_nID) == 0xFFFF)
        return TRUE;    // ignore invalid IDs
    m_bEnableChanged = FALSE;
    BOOL bResult = pTarget->OnCmdMsg(m_nID, (int)CN_UPDATE_COMMAND_UI, this, NULL);
    if (!bResult && bDisableIfNoHndler && !m_bEnableChanged)
    {
        AFX_CMDHANDLERINFO info;
        info.pTarget = NULL;
        BOOL bHandler = pTarget->OnCmdMsg(m_nID, CN_COMMAND, this, &info);
        Enable(bHandler);
    }
    return bResult;
}
