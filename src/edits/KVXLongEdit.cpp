#include "KVXLongEdit.h"

#include <climits>

#include "NumberFormat.h"

/////////////////////////////////////////////////////////////////////////////
// Constructors

KVXLongEdit::KVXLongEdit(DISPLAYTYPE eDisplay)
    : m_lMiddleVal(0),
      m_eDisplayType((eDisplay == BINARY || eDisplay == HEXADECIMAL) ? eDisplay : DECIMAL),
      m_bFixedInput(false)
{
    m_varValue = 0L;
    KVXNumericEdit::SetRange(KVXVariant(static_cast<long>(LONG_MIN)), KVXVariant(static_cast<long>(LONG_MAX)), TRUE, TRUE);
}

KVXLongEdit::~KVXLongEdit()
{
}

/////////////////////////////////////////////////////////////////////////////
// Attributes

void KVXLongEdit::SetDisplayType(long lDisplay)
{
    if (lDisplay < DECIMAL || lDisplay > HEXADECIMAL)
        return;
    m_eDisplayType = static_cast<DISPLAYTYPE>(lDisplay);
    m_strFormatted.Empty();
    SetValueAsVariant(m_varValue, FALSE);
}

KVXLongEdit::DISPLAYTYPE KVXLongEdit::GetDisplayType()
{
    return m_eDisplayType;
}

void KVXLongEdit::SetFixedInput(bool bFixed)
{
    m_bFixedInput = bFixed;
}

bool KVXLongEdit::GetFixedInput()
{
    return m_bFixedInput;
}

/////////////////////////////////////////////////////////////////////////////
// Operations

long KVXLongEdit::GetValue(int bCommit)
{
    if (!KVXEdit::SyntaxCheck(FALSE) || IsEmpty())
        m_varValue = m_varCommitted;
    if (bCommit)
    {
        SetUndefined(FALSE);
        m_varCommitted = m_varValue;
    }
    long lValue = 0;
    if (m_varValue.GetAs(lValue, 1) != KVT_VARIANT_OK)
        lValue = 0;
    return lValue;
}

int KVXLongEdit::SetValue(long lValue, int bCommit)
{
    m_varValue = lValue;
    if (bCommit)
    {
        SetUndefined(FALSE);
        m_varCommitted = m_varValue;
    }
    if (m_eDisplayType == BINARY)
    {
        BinaryToKVXString(lValue, m_strFormatted);
        m_strFormatted.Insert(0, _T("0b"));
    }
    else
    {
        m_strFormatted = NumberFormat::LongDisplayText(lValue, m_eDisplayType).c_str();
    }
    if (::IsWindow(m_hWnd))
    {
        // Raises EN_CHANGE: the change check reads the text back into m_varValue.
        SetWindowText(m_strFormatted);
        SendMessage(EM_SETSEL, 100, 101);
        SendMessage(EM_SCROLLCARET, 0, 0);
    }
    return TRUE;
}

int KVXLongEdit::EnableWindow(int bEnable)
{
    return KVXNumericEdit::EnableWindow(bEnable);
}

/////////////////////////////////////////////////////////////////////////////
// Overridables

int KVXLongEdit::SetValueAsVariant(KVXVariant varValue, int bCommit)
{
    long lValue = 0;
    if (varValue.GetAs(lValue, 1) != KVT_VARIANT_OK)
        return FALSE;
    return SetValue(lValue, bCommit);
}

KVXVariant KVXLongEdit::GetValueAsVariant(int bCommit)
{
    return KVXNumericEdit::GetValueAsVariant(bCommit);
}

void KVXLongEdit::SetRange(KVXVariant varMin, KVXVariant varMax, int bMinInclude, int bMaxInclude)
{
    KVXNumericEdit::SetRange(varMin, varMax, bMinInclude, bMaxInclude);
    MoveIntoRange(true);
}

KVXVariant KVXLongEdit::GetMinimum()
{
    return KVXNumericEdit::GetMinimum();
}

KVXVariant KVXLongEdit::GetMaximum()
{
    return KVXNumericEdit::GetMaximum();
}

int KVXLongEdit::GetMinimumInclude()
{
    return KVXNumericEdit::GetMinimumInclude();
}

int KVXLongEdit::GetMaximumInclude()
{
    return KVXNumericEdit::GetMaximumInclude();
}

int KVXLongEdit::SyntaxCheck(int bShow)
{
    return KVXNumericEdit::SyntaxCheck(bShow);
}

int KVXLongEdit::CharCheck(WCHAR c)
{
    if (HandleUndoChar(c))
        return FALSE;
    if (NumberFormat::IsLongEditChar(c))
        return TRUE;
    ::MessageBeep(0xFFFFFFFF);
    return FALSE;
}

int KVXLongEdit::SyntaxCheck(KVXString strText)
{
    SetErrorPos(0);
    const int nBase = strText.GetBase();
    if (m_bFixedInput)
    {
        const UINT nFixedId = NumberFormat::FixedInputMessageId(m_eDisplayType, nBase);
        if (nFixedId != 0)
        {
            CString strMessage;
            strMessage.LoadString(nFixedId);
            SetErrorMessage(strMessage);
            return FALSE;
        }
    }

    long lValue = 0;
    int nErrorPos = 0;
    const KVTEnumConvertType eCode = strText.GetAs(lValue, nErrorPos);
    if (eCode == KVT_CONVERT_OK && IsInRange(KVXVariant(lValue)))
    {
        m_varValue = lValue;
        return TRUE;
    }

    ReleaseSpin();
    CString strMessage;
    strMessage.LoadString(NumberFormat::LongErrorMessageId(eCode, nBase));
    if (eCode == KVT_CONVERT_OK)
    {
        long lMin = 0;
        long lMax = 0;
        GetMinimum().GetAs(lMin, 1);
        GetMaximum().GetAs(lMax, 1);
        KVXString strMin;
        KVXString strMax;
        strMin.Format(_T("%ld"), lMin);
        strMax.Format(_T("%ld"), lMax);
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

void KVXLongEdit::SetMiddleVal(int)
{
    StartFromUndefined(KVXVariant(0L));
    if (KVXEdit::SyntaxCheck(FALSE))
    {
        long lValue = 0;
        if (m_varValue.GetAs(lValue, 1) == KVT_VARIANT_OK)
            m_lMiddleVal = lValue;
    }
}

int KVXLongEdit::IncreaseValue(long lOffset)
{
    return StepTo(lOffset, true);
}

int KVXLongEdit::DecreaseValue(long lOffset)
{
    return StepTo(lOffset, false);
}

/////////////////////////////////////////////////////////////////////////////
// Implementation

void KVXLongEdit::BinaryToKVXString(long lValue, KVXString& strOut)
{
    strOut.Empty();
    strOut = NumberFormat::BinaryDigits(lValue).c_str();
}

int KVXLongEdit::StepTo(long lOffset, bool bUpward)
{
    long lTarget = 0;
    if (NumberFormat::AddSteps(m_lMiddleVal, lOffset, lTarget) && IsInRange(KVXVariant(lTarget)))
    {
        SetValueAsVariant(KVXVariant(lTarget), FALSE);
        return TRUE;
    }
    long lEnd = 0;
    (bUpward ? GetMaximumInRange() : GetMinimumInRange()).GetAs(lEnd, 1);
    SetValueAsVariant(KVXVariant(lEnd), FALSE);
    return FALSE;
}

