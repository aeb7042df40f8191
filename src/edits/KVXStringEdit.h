// KVXStringEdit: the text member of the validated-edit family.
//
// Every text is valid; the field holds at most a maximum number of characters (255 by
// default), refused with a beep when typed and cut silently when pasted or set.
// GetValue can translate the escapes \\, \n and \t; a switch decides whether stray
// backslashes stay or are dropped (typed ones then do not count toward the maximum).
#pragma once

#include "KVXEdit.h"

class AFX_EXT_CLASS KVXStringEdit : public KVXEdit
{
// Constructors
public:
    KVXStringEdit(int bReplaceSpecialChars = TRUE, int bAcceptSingleBackslash = TRUE);
    virtual ~KVXStringEdit();

// Attributes
public:
    // Not bounded; the edit control's own text limit is left as it is.
    void SetCharacterCount(int nCharacterCount);
    int GetCharacterCount();
    void SetReplaceSpecialChars(int bReplaceSpecialChars);
    void SetAcceptSingleBackslash(int bAcceptSingleBackslash);

// Operations
public:
    // The current text, with the escapes translated when replacement is on.
    KVXString GetValue(int bCommit);
    // Shows a text, cut to the maximum (and without stray backslashes when they are not
    // accepted), and selects its last character. Always TRUE.
    int SetValue(KVXString strValue, int bCommit);

// Overridables
public:
    // Only texts (VT_BSTR) are accepted; anything else returns FALSE and changes nothing.
    virtual int SetValueAsVariant(KVXVariant varValue, int bCommit);
    virtual int SyntaxCheck(int bShow);
protected:
    virtual int CharCheck(WCHAR c);
    virtual int SyntaxCheck(KVXString strText);

// Implementation
protected:
    int m_nCharacterCount;
    BOOL m_bReplaceSpecialChars;
    BOOL m_bAcceptSingleBackslash;

private:
    void ReplaceSpecialCharacters(KVXString& str);
    void GetStrWithoutBackslash(KVXString& str);

// Message map
protected:
    afx_msg LRESULT OnPaste(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()
};
