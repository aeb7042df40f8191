// KVXEdit: abstract base of the validated entry fields.
//
// Every typed character passes CharCheck before the control sees it; after every change
// the whole text passes SyntaxCheck, which stores either the parsed value or an error
// message. An edit whose text fails is registered for its parent (dialog or page): while
// it stays registered, Tab, Alt combinations and focus moves to other controls of that
// parent bring up its message box, and the edit takes the focus back with the faulty
// part of its text selected. The parent still receives EN_CHANGE as usual.
#pragma once

#include <afxwin.h>
#include <afxtempl.h>

#include "KVXString.h"
#include "KVXVariant.h"

// Posted to an edit to show its pending error message (wParam 0, lParam 0).
#define WM_KVX_SHOWERRORMESSAGE (WM_USER + 100)

class AFX_EXT_CLASS KVXEdit : public CEdit
{
// Constructors
public:
    KVXEdit();
    virtual ~KVXEdit();

// Operations
public:
    // Installs (init TRUE) or releases (init FALSE) the thread hooks that keep the user in
    // an invalid field; calls are counted per page. Clears the page's registration.
    void InitErrorHandling(HWND hParent, int bInit);
    // The edit whose error is pending on that page, or NULL.
    static KVXEdit* PASCAL FindErrorOnPage(HWND hParent);
    // Posts the error display to the edit registered for this edit's parent.
    int ShowErrorMessage();
    // Makes strMessage the pending message of this edit, shown by the next error display.
    void SetOwnMessage(CString& strMessage);
    // TRUE when the current value differs from the committed one (never while undefined).
    int GetModified();
    // Undefined mode: an empty field is a legal state of its own.
    void SetUndefined(int bUndefined);
    int GetUndefined();
    int IsFocusSet();

// Overridables
public:
    // Shows a value, and commits it when bCommit is TRUE.
    virtual int SetValueAsVariant(KVXVariant varValue, int bCommit) = 0;

protected:
    // TRUE lets a typed character through to the control.
    virtual int CharCheck(WCHAR c) = 0;
    // Result of the last text check; with bShow TRUE an invalid non-empty text also
    // posts the error display to this edit.
    virtual int SyntaxCheck(int bShow);
    // Checks a whole text: stores the value in m_varValue and returns TRUE, or stores the
    // message (and error position) and returns FALSE.
    virtual int SyntaxCheck(KVXString strText) = 0;
    virtual void PostNcDestroy();

// Implementation for the subclasses
protected:
    void SetErrorMessage(CString& strMessage);
    void SetErrorPos(int nPos);
    // Drops a pending host message together with its parent's registration.
    void ResetOwnMessage();
    KVXVariant GetValueAsVariant(int bCommit);
    int IsEmpty();

    static LRESULT CALLBACK GetMsgProc(int nCode, WPARAM wParam, LPARAM lParam);
    static LRESULT CALLBACK CallWndRetProc(int nCode, WPARAM wParam, LPARAM lParam);

protected:
    BOOL m_bSyntaxOk;
    BOOL m_bShowingError;
    BOOL m_bFocusSet;
    BOOL m_bOwnMessage;
    int m_nErrorPos;
    CString m_strErrorMessage;
    BOOL m_bUndefined;
    KVXVariant m_varValue;
    KVXVariant m_varCommitted;
    CRect m_rectCreate;
    CWnd* m_pParentWnd;
    KVXString m_strFormatted;
    KVXString m_strText;

    // For each parent window, the edit whose error is pending there.
    static CMap<HWND, HWND, KVXEdit*, KVXEdit*> m_cmapError;
    static HHOOK m_hHookGet;
    static HHOOK m_hHookRet;
    static int m_iErrorPagesCount;

private:
    void Register();
    // Removes the parent's registration when it names this edit.
    void UnregisterSelf(HWND hParent);
    static void PASCAL RemoveHooks();
    static void PASCAL PostShowError(KVXEdit* pEdit);

// Message map
protected:
    afx_msg void OnChar(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnKillFocus(CWnd* pNewWnd);
    afx_msg void OnSetFocus(CWnd* pOldWnd);
    afx_msg BOOL OnChange();
    afx_msg LRESULT OnShowErrorMessage(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()
};
