// The example's dialog: an integer field with its spin, a colour well and a
// multi-selection tree, each subclassed from a control of the dialog template.
#pragma once

#include <afxwin.h>

#include "CMultiTree.h"
#include "KVXColorWell.h"
#include "KVXLongEdit.h"

class CHostDialog : public CDialog
{
public:
    // bSelfCheck: once the dialog is shown, check its controls, print them and close
    // (IDOK when every control is there, IDABORT otherwise).
    explicit CHostDialog(bool bSelfCheck);

    // What the user chose, read when the dialog closes with OK.
    long m_lCount;
    COLORREF m_clrColour;
    UINT m_nSelected;

protected:
    BOOL OnInitDialog() override;
    void OnOK() override;
    afx_msg void OnDestroy();
    afx_msg LRESULT OnColourChanged(WPARAM wParam, LPARAM lParam);
    afx_msg LRESULT OnKickIdle(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    bool CheckControls();

    bool m_bSelfCheck;
    KVXLongEdit m_count;
    KVXColorWell m_colour;
    CMultiTree m_tree;
};
