// Spin page: numeric edits with their spin beside them, to try the arrows (click,
// hold for acceleration), the slider band between them (hover, press and drag up or
// down) and the Up and Down keys.
#include "GalleryPage.h"

#include "KVXDoubleEdit.h"
#include "KVXLongEdit.h"

class CSpinPage : public CGalleryPage
{
public:
    LPCTSTR GetTitle() const override { return _T("Spin"); }
    void CreateControls() override;

protected:
    afx_msg void OnToggleEnabled();
    afx_msg void OnToggleSpin();
    DECLARE_MESSAGE_MAP()

private:
    enum { IDC_TOGGLE_ENABLED = 200, IDC_TOGGLE_SPIN = 201 };

    void AddLabel(CWnd& label, LPCTSTR text, int y);

    CWnd m_labels[6];
    KVXLongEdit m_accelerated;
    KVXLongEdit m_plain;
    KVXLongEdit m_hexadecimal;
    KVXDoubleEdit m_double;
    KVXLongEdit m_switchable;
    CWnd m_toggleEnabled;
    CWnd m_toggleSpin;
};

GALLERY_PAGE(12, CSpinPage);

BEGIN_MESSAGE_MAP(CSpinPage, CGalleryPage)
    ON_BN_CLICKED(IDC_TOGGLE_ENABLED, &CSpinPage::OnToggleEnabled)
    ON_BN_CLICKED(IDC_TOGGLE_SPIN, &CSpinPage::OnToggleSpin)
END_MESSAGE_MAP()

void CSpinPage::AddLabel(CWnd& label, LPCTSTR text, int y)
{
    label.Create(_T("STATIC"), text, WS_CHILD | WS_VISIBLE, CRect(12, y + 3, 300, y + 21), this, 0xFFFF);
    label.SetFont(CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT))));
}

void CSpinPage::CreateControls()
{
    CFont* font = CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT)));
    const DWORD style = WS_CHILD | WS_VISIBLE | WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL;
    const int left = 310;
    const int right = 430;

    AddLabel(m_labels[0], _T("Integer 0 to 1000, accelerating"), 12);
    m_accelerated.Create(style, CRect(left, 12, right, 33), this, 101);
    m_accelerated.SetFont(font);
    m_accelerated.SetRange(KVXVariant(0L), KVXVariant(1000L), TRUE, TRUE);
    m_accelerated.SetValue(500, TRUE);

    AddLabel(m_labels[1], _T("Integer, no acceleration"), 48);
    m_plain.Create(style, CRect(left, 48, right, 69), this, 102);
    m_plain.SetFont(font);
    m_plain.SetSpinButtonAccelerationEnabled(false);
    m_plain.SetValue(0, TRUE);

    AddLabel(m_labels[2], _T("Integer shown in hexadecimal"), 84);
    m_hexadecimal.SetDisplayType(KVXLongEdit::HEXADECIMAL);
    m_hexadecimal.Create(style, CRect(left, 84, right, 105), this, 103);
    m_hexadecimal.SetFont(font);
    m_hexadecimal.SetValue(255, TRUE);

    AddLabel(m_labels[3], _T("Floating-point -10 to 10"), 120);
    m_double.Create(style, CRect(left, 120, right, 141), this, 104);
    m_double.SetFont(font);
    m_double.SetRange(KVXVariant(-10.0), KVXVariant(10.0), TRUE, TRUE);
    m_double.SetValue(1.5, TRUE);

    AddLabel(m_labels[4], _T("Switch this one's state and spin:"), 156);
    m_switchable.Create(style, CRect(left, 156, right, 177), this, 105);
    m_switchable.SetFont(font);
    m_switchable.SetValue(42, TRUE);

    m_toggleEnabled.Create(_T("BUTTON"), _T("Enable / disable"), WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_PUSHBUTTON,
                           CRect(left, 186, left + 120, 210), this, IDC_TOGGLE_ENABLED);
    m_toggleEnabled.SetFont(font);
    m_toggleSpin.Create(_T("BUTTON"), _T("Spin on / off"), WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_PUSHBUTTON,
                        CRect(left + 130, 186, left + 250, 210), this, IDC_TOGGLE_SPIN);
    m_toggleSpin.SetFont(font);

    AddLabel(m_labels[5], _T("Hover between the arrows and drag vertically to slide."), 226);
}

void CSpinPage::OnToggleEnabled()
{
    m_switchable.EnableWindow(!m_switchable.IsWindowEnabled());
}

void CSpinPage::OnToggleSpin()
{
    m_switchable.SetSpinButtonFlag(!m_switchable.GetSpinButtonFlag());
}
