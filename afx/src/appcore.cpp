// CWinApp and the application start-up: AfxWinInit, AfxWinMain, AfxWinTerm.
#include "wndimpl.h"

IMPLEMENT_DYNAMIC(CWinApp, CWinThread)

BEGIN_MESSAGE_MAP(CWinApp, CCmdTarget)
    ON_COMMAND(ID_APP_EXIT, &CWinApp::OnAppExit)
END_MESSAGE_MAP()

CWinApp::CWinApp(LPCTSTR lpszAppName)
    : m_hInstance(NULL), m_hPrevInstance(NULL), m_lpCmdLine(NULL), m_nCmdShow(SW_SHOWNORMAL),
      m_pszAppName(lpszAppName), m_pszRegistryKey(NULL), m_pszExeName(NULL),
      m_pszHelpFilePath(NULL), m_pszProfileName(NULL),
      m_nWaitCursorCount(0), m_hcurWaitCursorRestore(NULL),
      m_bAppNameAllocated(FALSE), m_bExeNameAllocated(FALSE)
{
    // The application object is the thread object of the thread that builds it.
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    pModuleState->m_pCurrentWinApp = this;
    AfxGetModuleThreadState()->m_pCurrentWinThread = this;
    m_hThread = ::GetCurrentThread();
    m_nThreadID = ::GetCurrentThreadId();
    m_bAutoDelete = FALSE;
    if (lpszAppName != NULL)
        pModuleState->m_lpszCurrentAppName = lpszAppName;
}

CWinApp::~CWinApp()
{
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    if (pModuleState->m_lpszCurrentAppName == m_pszAppName)
        pModuleState->m_lpszCurrentAppName = NULL;
    if (pModuleState->m_pCurrentWinApp == this)
        pModuleState->m_pCurrentWinApp = NULL;
    if (m_bAppNameAllocated)
        free((void*)m_pszAppName);
    if (m_bExeNameAllocated)
        free((void*)m_pszExeName);
}

// Names the application: the constructor's argument, else the string
// AFX_IDS_APP_TITLE, else the executable's base name.
void CWinApp::SetCurrentHandles()
{
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    pModuleState->m_hCurrentInstanceHandle = m_hInstance;
    pModuleState->m_hCurrentResourceHandle = m_hInstance;

    TCHAR szPath[MAX_PATH];
    DWORD nLen = ::GetModuleFileName(m_hInstance, szPath, MAX_PATH);
    szPath[nLen < MAX_PATH ? nLen : MAX_PATH - 1] = 0;
    LPTSTR pszFileName = szPath;
    for (LPTSTR p = szPath; *p != 0; ++p)
    {
        if (*p == '\\' || *p == '/' || *p == ':')
            pszFileName = p + 1;
    }
    LPTSTR pszExt = NULL;
    for (LPTSTR p = pszFileName; *p != 0; ++p)
    {
        if (*p == '.')
            pszExt = p;
    }
    if (pszExt != NULL)
        *pszExt = 0;

    if (m_pszExeName == NULL)
    {
        m_pszExeName = _wcsdup(pszFileName);
        m_bExeNameAllocated = m_pszExeName != NULL;
    }
    if (m_pszAppName == NULL)
    {
        CString strTitle;
        if (strTitle.LoadString(AFX_IDS_APP_TITLE) && !strTitle.IsEmpty())
            m_pszAppName = _wcsdup(strTitle);
        else
            m_pszAppName = _wcsdup(m_pszExeName != NULL ? m_pszExeName : pszFileName);
        m_bAppNameAllocated = m_pszAppName != NULL;
    }
    pModuleState->m_lpszCurrentAppName = m_pszAppName;
}

BOOL CWinApp::InitApplication()
{
    return TRUE;
}

BOOL CWinApp::InitInstance()
{
    return TRUE;
}

int CWinApp::Run()
{
    if (m_pMainWnd == NULL)
        AfxPostQuitMessage(0);  // nothing to run without a main window
    return CWinThread::Run();
}

BOOL CWinApp::OnIdle(LONG lCount)
{
    if (lCount <= 0)
        CWinThread::OnIdle(lCount);
    else if (lCount == 1)
        CWinThread::OnIdle(lCount);
    return lCount < 1;
}

int CWinApp::ExitInstance()
{
    return (int)AfxGetThreadState()->m_msgCur.wParam;
}

LRESULT CWinApp::ProcessWndProcException(CException* e, const MSG* pMsg)
{
    return CWinThread::ProcessWndProcException(e, pMsg);
}

BOOL CWinApp::SaveAllModified()
{
    return TRUE;
}

BOOL CWinApp::OnDDECommand(LPTSTR)
{
    return FALSE;
}

void CWinApp::WinHelp(DWORD_PTR, UINT)
{
}

void CWinApp::EnableModeless(BOOL)
{
}

void CWinApp::OnAppExit()
{
    if (m_pMainWnd != NULL)
        m_pMainWnd->SendMessage(WM_CLOSE);
}

void CWinApp::DoWaitCursor(int nCode)
{
    m_nWaitCursorCount += nCode;
    if (m_nWaitCursorCount > 0)
    {
        HCURSOR hcurPrev = ::SetCursor(::LoadCursor(NULL, IDC_WAIT));
        if (nCode > 0 && m_nWaitCursorCount == 1)
            m_hcurWaitCursorRestore = hcurPrev;
    }
    else
    {
        m_nWaitCursorCount = 0;
        ::SetCursor(m_hcurWaitCursorRestore);
    }
}

/////////////////////////////////////////////////////////////////////////////
// Global access

CWinApp* AFXAPI AfxGetApp()
{
    return AfxGetModuleState()->m_pCurrentWinApp;
}

// The thread object of this thread; threads without one share the application's.
CWinThread* AFXAPI AfxGetThread()
{
    CWinThread* pThread = AfxGetModuleThreadState()->m_pCurrentWinThread;
    if (pThread == NULL)
        pThread = AfxGetApp();
    return pThread;
}

CWnd* AFXAPI AfxGetMainWnd()
{
    CWinThread* pThread = AfxGetThread();
    return pThread != NULL ? pThread->GetMainWnd() : NULL;
}

void AFXAPI AfxPostQuitMessage(int nExitCode)
{
    ::PostQuitMessage(nExitCode);
}

/////////////////////////////////////////////////////////////////////////////
// Start-up and shut-down

BOOL AFXAPI AfxWinInit(HINSTANCE hInstance, HINSTANCE hPrevInstance, LPTSTR lpCmdLine, int nCmdShow)
{
    AFX_MODULE_STATE* pModuleState = AfxGetModuleState();
    pModuleState->m_hCurrentInstanceHandle = hInstance;
    pModuleState->m_hCurrentResourceHandle = hInstance;

    if (CWinApp* pApp = AfxGetApp())
    {
        pApp->m_hInstance = hInstance;
        pApp->m_hPrevInstance = hPrevInstance;
        pApp->m_lpCmdLine = lpCmdLine;
        pApp->m_nCmdShow = nCmdShow;
        pApp->SetCurrentHandles();
    }

    // The controls of dialog templates need their classes.
    INITCOMMONCONTROLSEX init = { sizeof(init), ICC_WIN95_CLASSES };
    ::InitCommonControlsEx(&init);
    return TRUE;
}

void AFXAPI AfxWinTerm()
{
    AfxDeleteTempObjects();
    // ends OLE when AfxOleInit started it
    CWinThread* pThread = AfxGetApp();
    if (pThread != NULL && pThread->m_lpfnOleTermOrFreeLib != NULL)
        (*pThread->m_lpfnOleTermOrFreeLib)(TRUE, FALSE);
    _AFX_THREAD_STATE* pThreadState = AfxGetThreadState();
    if (pThreadState->m_hHookOldCbtFilter != NULL)
    {
        ::UnhookWindowsHookEx(pThreadState->m_hHookOldCbtFilter);
        pThreadState->m_hHookOldCbtFilter = NULL;
    }
}

int AFXAPI AfxWinMain(HINSTANCE hInstance, HINSTANCE hPrevInstance, LPTSTR lpCmdLine, int nCmdShow)
{
    int nReturnCode = -1;
    CWinThread* pThread = AfxGetThread();
    CWinApp* pApp = AfxGetApp();

    if (!AfxWinInit(hInstance, hPrevInstance, lpCmdLine, nCmdShow))
        goto InitFailure;
    if (pApp != NULL && !pApp->InitApplication())
        goto InitFailure;
    if (pThread == NULL)
        goto InitFailure;
    if (!pThread->InitInstance())
    {
        if (pThread->m_pMainWnd != NULL)
            pThread->m_pMainWnd->DestroyWindow();
        nReturnCode = pThread->ExitInstance();
        goto InitFailure;
    }
    nReturnCode = pThread->Run();

InitFailure:
    AfxWinTerm();
    return nReturnCode;
}
