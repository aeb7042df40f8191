#include "KVXDoubleEdit.h"

#include <string>

#include "NumberFormat.h"

static const TCHAR kDefaultFormat[] = _T("%.16g");

/////////////////////////////////////////////////////////////////////////////
// Constructors

KVXDoubleEdit::KVXDoubleEdit()
    : m_bAutoDelta(true),
      m_strFormat(kDefaultFormat),
      m_dDelta(1.0),
      m_dMiddleVal(0.0)
{
    m_varValue = 0.0;
    // The bounds are 1e300, not the largest double: their text stays readable.
    KVXNumericEdit::SetRange(KVXVariant(-1e300), KVXVariant(1e300), TRUE, TRUE);
}

KVXDoubleEdit::~KVXDoubleEdit()
{
}

/////////////////////////////////////////////////////////////////////////////
// Attributes

CString KVXDoubleEdit::GetFormat()
{
    return m_strFormat;
}

int KVXDoubleEdit::SetFormat(CString strFormat)
{
    // The format is handed to printf with one double: refuse any other shape.
    if (strFormat.IsEmpty() || !NumberFormat::IsSingleDoubleFormat((LPCTSTR)strFormat))
        return FALSE;
    m_strFormat = strFormat;
    double dValue = 0.0;
    m_varValue.GetAs(dValue);
    SetValue(dValue, TRUE);
    return TRUE;
}

void KVXDoubleEdit::ResetFormat()
{
    m_strFormat = kDefaultFormat;
}

void KVXDoubleEdit::SetAutomaticDeltaDeterminationEnabled(bool bEnable)
{
    m_bAutoDelta = bEnable;
}

bool KVXDoubleEdit::GetAutomaticDeltaDeterminationEnabled()
{
    return m_bAutoDelta;
}

void KVXDoubleEdit::SetDelta(double dDelta)
{
    m_dDelta = dDelta;
}

double KVXDoubleEdit::GetDelta()
{
    return m_dDelta;
}

/////////////////////////////////////////////////////////////////////////////
// Operations

double KVXDoubleEdit::GetValue(int bCommit)
{
    if (!KVXEdit::SyntaxCheck(FALSE) || IsEmpty())
        m_varValue = m_varCommitted;
    if (bCommit)
    {
        SetUndefined(FALSE);
        m_varCommitted = m_varValue;
    }
    double dValue = 0.0;
    if (m_varValue.GetAs(dValue) != KVT_VARIANT_OK)
        dValue = 0.0;
    return dValue;
}

int KVXDoubleEdit::SetValue(double dValue, int bCommit)
{
    m_varValue = dValue;
    if (bCommit)
    {
        SetUndefined(FALSE);
        m_varCommitted = m_varValue;
    }
    m_strFormatted = FormatValue(dValue);
    if (::IsWindow(m_hWnd))
    {
        // Raises EN_CHANGE: the change check reads the shown (possibly rounded) text back
        // into m_varValue, while a committed value keeps the unrounded number.
        SetWindowText(m_strFormatted);
        SendMessage(EM_SETSEL, 100, 101);
        SendMessage(EM_SCROLLCARET, 0, 0);
    }
    return TRUE;
}

int KVXDoubleEdit::EnableWindow(int bEnable)
{
    return KVXNumericEdit::EnableWindow(bEnable);
}

/////////////////////////////////////////////////////////////////////////////
// Overridables

int KVXDoubleEdit::SetValueAsVariant(KVXVariant varValue, int bCommit)
{
    double dValue = 0.0;
    if (varValue.GetAs(dValue) != KVT_VARIANT_OK)
        return FALSE;
    return SetValue(dValue, bCommit);
}

KVXVariant KVXDoubleEdit::GetValueAsVariant(int)
{
    return KVXNumericEdit::GetValueAsVariant(TRUE);
}

void KVXDoubleEdit::SetRange(KVXVariant varMin, KVXVariant varMax, int bMinInclude, int bMaxInclude)
{
    // Ends given as integers would make an integer range, whose excluded ends move inward
    // by whole units; a floating-point field needs them as doubles.
    double dMin = 0.0;
    double dMax = 0.0;
    if (varMin.GetAs(dMin) == KVT_VARIANT_OK)
        varMin = dMin;
    if (varMax.GetAs(dMax) == KVT_VARIANT_OK)
        varMax = dMax;
    KVXNumericEdit::SetRange(varMin, varMax, bMinInclude, bMaxInclude);
    MoveIntoRange(false);
}

KVXVariant KVXDoubleEdit::GetMinimum()
{
    return KVXNumericEdit::GetMinimum();
}

KVXVariant KVXDoubleEdit::GetMaximum()
{
    return KVXNumericEdit::GetMaximum();
}

int KVXDoubleEdit::GetMinimumInclude()
{
    return KVXNumericEdit::GetMinimumInclude();
}

int KVXDoubleEdit::GetMaximumInclude()
{
    return KVXNumericEdit::GetMaximumInclude();
}

int KVXDoubleEdit::SyntaxCheck(int bShow)
{
    return KVXNumericEdit::SyntaxCheck(bShow);
}

int KVXDoubleEdit::CharCheck(WCHAR c)
{
    if (HandleUndoChar(c))
        return FALSE;
    if (NumberFormat::IsDoubleEditChar(c))
        return TRUE;
    ::MessageBeep(0xFFFFFFFF);
    return FALSE;
}

int KVXDoubleEdit::SyntaxCheck(KVXString strText)
{
    SetErrorPos(0);
    double dValue = 0.0;
    int nErrorPos = 0;
    const KVTEnumConvertType eCode = strText.GetAs(dValue, nErrorPos);
    if (eCode == KVT_CONVERT_OK && IsInRange(KVXVariant(dValue)))
    {
        m_varValue = dValue;
        return TRUE;
    }

    ReleaseSpin();
    CString strMessage;
    strMessage.LoadString(NumberFormat::DoubleErrorMessageId(eCode));
    if (eCode == KVT_CONVERT_OK)
    {
        double dMin = 0.0;
        double dMax = 0.0;
        GetMinimum().GetAs(dMin);
        GetMaximum().GetAs(dMax);
        const KVXString strMin = FormatValue(dMin);
        const KVXString strMax = FormatValue(dMax);
        strMessage += NumberFormat::RangeText((LPCTSTR)strMin, (LPCTSTR)strMax,
            GetMinimumInclude() != 0, GetMaximumInclude() != 0).c_str();
    }
    else if (eCode == KVT_CONVERT_SYNTAX_ERROR)
    {
        SetErrorPos(nErrorPos);
    }
    SetErrorMessage(strMessage);
    return FALSE;
}

void KVXDoubleEdit::SetMiddleVal(int bDetermineStep)
{
    StartFromUndefined(KVXVariant(0.0));
    if (!KVXEdit::SyntaxCheck(FALSE))
        return;
    double dMiddle = 0.0;
    if (m_varValue.GetAs(dMiddle) != KVT_VARIANT_OK)
        return;
    m_dMiddleVal = dMiddle;
    if (!bDetermineStep)
        return;

    // The step follows the digits the user sees: one unit of the last digit shown.
    const KVXString strShown = FormatValue(m_dMiddleVal);
    const double dDelta = NumberFormat::AutoDelta((LPCTSTR)strShown, m_dMiddleVal);
    if (m_bAutoDelta)
        SetDelta(dDelta);
}

int KVXDoubleEdit::IncreaseValue(long lOffset)
{
    return StepTo(lOffset, true);
}

int KVXDoubleEdit::DecreaseValue(long lOffset)
{
    return StepTo(lOffset, false);
}

/////////////////////////////////////////////////////////////////////////////
// Implementation

KVXString KVXDoubleEdit::FormatValue(double dValue)
{
    KVXString strText;
    strText.Format((LPCTSTR)m_strFormat, dValue);
    return strText;
}

int KVXDoubleEdit::StepTo(long lOffset, bool bUpward)
{
    // Each value comes from the middle value and the whole offset, so rounding errors
    // do not add up over a long spin.
    const double dTarget = static_cast<double>(lOffset) * m_dDelta + m_dMiddleVal;
    if (IsInRange(KVXVariant(dTarget)))
    {
        SetValueAsVariant(KVXVariant(dTarget), FALSE);
        return TRUE;
    }
    double dEnd = 0.0;
    (bUpward ? GetMaximumInRange() : GetMinimumInRange()).GetAs(dEnd);
    SetValueAsVariant(KVXVariant(dEnd), FALSE);
    return FALSE;
}

