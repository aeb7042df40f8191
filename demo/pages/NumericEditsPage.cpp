// Numeric edits page: integer fields in the three display bases, floating-point fields
// with a format and a range, fields with and without spin buttons. Invalid input keeps
// the user in the field: clicking another control of the page shows the message.
#include "GalleryPage.h"

#include "KVXDoubleEdit.h"
#include "KVXLongEdit.h"

class CNumericEditsPage : public CGalleryPage
{
public:
    CNumericEditsPage();

    LPCTSTR GetTitle() const override { return _T("Numeric edits"); }
    void CreateControls() override;

protected:
    afx_msg void OnDestroy();
    afx_msg void OnShowValues();
    DECLARE_MESSAGE_MAP()

private:
    enum { IDC_SHOW_VALUES = 300 };

    void AddLabel(CWnd& label, LPCTSTR text, int x, int y, int width);
    void Place(CEdit& edit, UINT id, int y);

    CFont* m_pFont;
    CWnd m_labels[10];
    KVXLongEdit m_decimal;
    KVXLongEdit m_binary;
    KVXLongEdit m_hexadecimal;
    KVXLongEdit m_fixedHex;
    KVXLongEdit m_noSpin;
    KVXDoubleEdit m_double;
    KVXDoubleEdit m_twoDecimals;
    KVXDoubleEdit m_scientific;
    KVXDoubleEdit m_unitInterval;
    CWnd m_showValues;
    CWnd m_values;
};

GALLERY_PAGE(10, CNumericEditsPage);

BEGIN_MESSAGE_MAP(CNumericEditsPage, CGalleryPage)
    ON_WM_DESTROY()
    ON_BN_CLICKED(IDC_SHOW_VALUES, &CNumericEditsPage::OnShowValues)
END_MESSAGE_MAP()

CNumericEditsPage::CNumericEditsPage()
    : m_pFont(NULL),
      m_binary(KVXLongEdit::BINARY),
      m_hexadecimal(KVXLongEdit::HEXADECIMAL),
      m_fixedHex(KVXLongEdit::HEXADECIMAL)
{
}

void CNumericEditsPage::AddLabel(CWnd& label, LPCTSTR text, int x, int y, int width)
{
    label.Create(_T("STATIC"), text, WS_CHILD | WS_VISIBLE, CRect(x, y + 3, x + width, y + 21), this, 0xFFFF);
    label.SetFont(m_pFont);
}

void CNumericEditsPage::Place(CEdit& edit, UINT id, int y)
{
    const DWORD style = WS_CHILD | WS_VISIBLE | WS_BORDER | WS_TABSTOP | ES_AUTOHSCROLL;
    // KVXNumericEdit::Create is virtual: the spin is placed beside the field.
    edit.Create(style, CRect(330, y, 560, y + 21), this, id);
    edit.SetFont(m_pFont);
}

void CNumericEditsPage::CreateControls()
{
    m_pFont = CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT)));

    // Ranges and values are set before the windows exist; creation shows them.
    m_decimal.SetRange(KVXVariant(-1000L), KVXVariant(1000L), TRUE, TRUE);
    m_decimal.SetValue(250, TRUE);
    m_binary.SetRange(KVXVariant(0L), KVXVariant(255L), TRUE, TRUE);
    m_binary.SetValue(10, TRUE);
    m_hexadecimal.SetValue(-1, TRUE);
    m_fixedHex.SetFixedInput(true);
    m_fixedHex.SetValue(0xC0FFEE, TRUE);
    m_noSpin.SetRange(KVXVariant(1L), KVXVariant(10L), FALSE, TRUE);
    m_noSpin.SetValue(5, TRUE);
    m_double.SetValue(12.5, TRUE);
    m_twoDecimals.SetValue(3.14159, TRUE);
    m_scientific.SetValue(1.5e10, TRUE);
    m_unitInterval.SetRange(KVXVariant(0.0), KVXVariant(1.0), TRUE, FALSE);
    m_unitInterval.SetAutomaticDeltaDeterminationEnabled(false);
    m_unitInterval.SetDelta(0.05);
    m_unitInterval.SetValue(0.5, TRUE);

    AddLabel(m_labels[0], _T("Integer, decimal, -1000 to 1000"), 12, 12, 310);
    Place(m_decimal, 101, 12);
    AddLabel(m_labels[1], _T("Integer, binary, 0 to 255"), 12, 44, 310);
    Place(m_binary, 102, 44);
    AddLabel(m_labels[2], _T("Integer, hexadecimal, full range"), 12, 76, 310);
    Place(m_hexadecimal, 103, 76);
    AddLabel(m_labels[3], _T("Integer, hexadecimal, fixed input (0x only)"), 12, 108, 310);
    Place(m_fixedHex, 104, 108);
    AddLabel(m_labels[4], _T("Integer ( 1 , 10 ], without spin buttons"), 12, 140, 310);
    Place(m_noSpin, 105, 140);
    m_noSpin.SetSpinButtonFlag(FALSE);

    AddLabel(m_labels[5], _T("Floating-point, default format %.16g"), 12, 188, 310);
    Place(m_double, 106, 188);
    AddLabel(m_labels[6], _T("Floating-point, format %.2f"), 12, 220, 310);
    Place(m_twoDecimals, 107, 220);
    m_twoDecimals.SetFormat(_T("%.2f"));
    AddLabel(m_labels[7], _T("Floating-point, format %.3e"), 12, 252, 310);
    Place(m_scientific, 108, 252);
    m_scientific.SetFormat(_T("%.3e"));
    AddLabel(m_labels[8], _T("Floating-point [ 0 , 1 ), step 0.05"), 12, 284, 310);
    Place(m_unitInterval, 109, 284);

    m_showValues.Create(_T("BUTTON"), _T("Read values"), WS_CHILD | WS_VISIBLE | WS_TABSTOP | BS_PUSHBUTTON,
                        CRect(330, 324, 450, 348), this, IDC_SHOW_VALUES);
    m_showValues.SetFont(m_pFont);
    m_values.Create(_T("STATIC"), _T(""), WS_CHILD | WS_VISIBLE, CRect(12, 360, 760, 400), this, 0xFFFF);
    m_values.SetFont(m_pFont);
    AddLabel(m_labels[9], _T("Type a bad value and click elsewhere: the field keeps you until it is fixed."),
             12, 410, 600);

    m_decimal.InitErrorHandling(m_hWnd, TRUE);
}

void CNumericEditsPage::OnShowValues()
{
    CString text;
    text.Format(_T("%ld   0x%lX   %ld   |   %.16g   %.16g   %.16g   %.16g"),
                m_decimal.GetValue(FALSE), static_cast<unsigned long>(m_hexadecimal.GetValue(FALSE)),
                m_noSpin.GetValue(FALSE), m_double.GetValue(FALSE), m_twoDecimals.GetValue(FALSE),
                m_scientific.GetValue(FALSE), m_unitInterval.GetValue(FALSE));
    m_values.SetWindowText(text);
}

void CNumericEditsPage::OnDestroy()
{
    m_decimal.InitErrorHandling(m_hWnd, FALSE);
    CGalleryPage::OnDestroy();
}
