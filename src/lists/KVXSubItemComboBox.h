// KVXSubItemComboBox: the drop-down list combo box that KVXComboBoxListCtrlEx lays over
// one cell of its combo column. It takes the list's font, reports the entry the user
// picks to the list's parent as LVN_ENDLABELEDITW (with a null text once the user has
// pressed Esc in it), keeps Enter and Esc from the dialog around the list, handing the
// focus back to the list instead, and deletes itself when its window is destroyed.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXSubItemComboBox : public CComboBox
{
// Constructors
public:
    // Made with new by the list; the window's destruction deletes the object.
    KVXSubItemComboBox(int nRow, int nColumn);

// Attributes
    int GetRow() const { return m_nRow; }
    int GetColumn() const { return m_nColumn; }

// Overridables
    // Enter and Esc go to the combo box at once, before a dialog can take them.
    virtual BOOL PreTranslateMessage(MSG* pMsg);

// Implementation
protected:
    virtual ~KVXSubItemComboBox();
    // WM_NCDESTROY's last step, also reached when the creation fails: deletes the object.
    virtual void PostNcDestroy();

    afx_msg int OnCreate(LPCREATESTRUCT lpCreateStruct);
    afx_msg void OnChar(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnSelChange();
    DECLARE_MESSAGE_MAP()

    int m_nRow;
    int m_nColumn;
    BOOL m_bEscape;     // set by the first Esc, never cleared
};
