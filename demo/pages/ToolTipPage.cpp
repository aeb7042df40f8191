// Tool tip page: labels too narrow for their texts. Resting the pointer on a cut-off label
// shows its whole text beside the pointer; the tip hides itself as soon as the pointer
// leaves the label or a button is pressed. The label at the right edge has a text that
// reaches the screen's edge (the tip moves left to stay on the monitor), and the one at the
// bottom is longer than the screen is wide (the tip wraps it and goes above the label).
// In screenshot mode the pointer is put on the second label so that the picture has its tip.
#include "GalleryPage.h"

#include "KVXToolTipCtrl.h"

class CToolTipPage : public CGalleryPage
{
public:
    LPCTSTR GetTitle() const override { return _T("Tool tips"); }
    void CreateControls() override;

protected:
    afx_msg void OnMouseMove(UINT nFlags, CPoint point);
    afx_msg void OnWindowPosChanged(WINDOWPOS* lpwndpos);
    afx_msg void OnDestroy();
    afx_msg LRESULT OnGetFont(WPARAM wParam, LPARAM lParam);
    afx_msg LRESULT OnPointAtLabel(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    static const UINT kPointAtLabelMessage = WM_APP + 50;
    enum { kLabelCount = 7, kLongLabel = kLabelCount - 1, kScreenshotLabel = 1 };

    void AddLabel(CWnd& label, LPCTSTR text, const CRect& rc, DWORD style = SS_ENDELLIPSIS);

    CWnd m_intro;
    CWnd m_labels[kLabelCount];
    KVXToolTipCtrl m_tip;
};

GALLERY_PAGE(50, CToolTipPage);

BEGIN_MESSAGE_MAP(CToolTipPage, CGalleryPage)
    ON_WM_MOUSEMOVE()
    ON_WM_WINDOWPOSCHANGED()
    ON_WM_DESTROY()
    ON_MESSAGE(WM_GETFONT, &CToolTipPage::OnGetFont)
    ON_MESSAGE(kPointAtLabelMessage, &CToolTipPage::OnPointAtLabel)
END_MESSAGE_MAP()

void CToolTipPage::AddLabel(CWnd& label, LPCTSTR text, const CRect& rc, DWORD style)
{
    // A plain static lets the mouse through to the page (it hit-tests as transparent).
    label.Create(_T("STATIC"), text, WS_CHILD | WS_VISIBLE | SS_NOPREFIX | style, rc, this, 0xFFFF);
    label.SetFont(GuiFont());
}

void CToolTipPage::CreateControls()
{
    CRect rc;
    GetClientRect(&rc);
    AddLabel(m_intro,
             _T("Rest the pointer on a label: where its text is cut off, the whole text appears beside the ")
             _T("pointer. Leave the label or press a button and the tip is gone."),
             CRect(12, 12, rc.right - 12, 44), 0);

    const CRect column(12, 60, 232, 78);
    const LPCTSTR texts[] = {
        _T("Short enough"),
        _T("A label whose text is a good deal longer than its box"),
        _T("C:\\Users\\Public\\Documents\\Orvane\\Gallery\\Samples\\tool tips.txt"),
        _T("Fits too"),
    };
    for (int i = 0; i < 4; ++i)
        AddLabel(m_labels[i], texts[i], column + CPoint(0, 30 * i));

    // Its tip reaches past the screen's right edge and is moved left onto the monitor.
    AddLabel(m_labels[4],
             _T("Near the screen edge: this text is long enough to reach beyond the right edge of the screen, ")
             _T("so the tip moves left until it ends exactly at the monitor's edge"),
             CRect(rc.right - 192, 60, rc.right - 12, 78));
    AddLabel(m_labels[5], _T("Another cut-off label on the right-hand side of the page"),
             CRect(rc.right - 192, 90, rc.right - 12, 108));

    // Longer than the screen is wide: wrapped by characters and placed above the label.
    CString strLong, strSentence;
    for (int i = 1; i <= 12; ++i)
    {
        strSentence.Format(_T("Sentence %d of a text far wider than the monitor, wrapped by characters. "), i);
        strLong += strSentence;
    }
    AddLabel(m_labels[kLongLabel], strLong, CRect(12, 300, 332, 318));

    m_tip.Create(this);
}

void CToolTipPage::OnMouseMove(UINT nFlags, CPoint point)
{
    CGalleryPage::OnMouseMove(nFlags, point);
    if (nFlags != 0)
        return;
    for (CWnd& label : m_labels)
    {
        CRect rc;
        label.GetWindowRect(&rc);
        ScreenToClient(&rc);
        if (!rc.PtInRect(point))
            continue;
        CString strText;
        label.GetWindowText(strText);
        // Beside the pointer, below its arrow; shown only when the text does not fit.
        m_tip.Show(rc, point + CPoint(12, 18), strText, false);
        return;
    }
}

void CToolTipPage::OnWindowPosChanged(WINDOWPOS* lpwndpos)
{
    // The gallery shows its pages with SetWindowPos, which sends no WM_SHOWWINDOW.
    CGalleryPage::OnWindowPosChanged(lpwndpos);
    if (lpwndpos->flags & SWP_HIDEWINDOW)
        m_tip.Hide();
    else if ((lpwndpos->flags & SWP_SHOWWINDOW) && InScreenshotMode())
        PostMessage(kPointAtLabelMessage);
}

void CToolTipPage::OnDestroy()
{
    m_tip.DestroyWindow();
    CGalleryPage::OnDestroy();
}

LRESULT CToolTipPage::OnGetFont(WPARAM, LPARAM)
{
    // The tip measures and draws in the labels' font.
    return reinterpret_cast<LRESULT>(GuiFont()->GetSafeHandle());
}

LRESULT CToolTipPage::OnPointAtLabel(WPARAM, LPARAM)
{
    // As if the user rested the pointer on the label: the system sends the page the move.
    CRect rc;
    m_labels[kScreenshotLabel].GetWindowRect(&rc);
    ::SetCursorPos(rc.left + 40, rc.CenterPoint().y);
    return 0;
}
