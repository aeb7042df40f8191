#include "KVXNumericEdit.h"

#include <afxstat_.h>

#include "KVXSpin.h"
#include "NumberFormat.h"
#include "SpinGeometry.h"

BEGIN_MESSAGE_MAP(KVXNumericEdit, KVXEdit)
    ON_WM_KEYUP()
    ON_WM_KEYDOWN()
    ON_WM_KILLFOCUS()
    ON_WM_SETFOCUS()
    ON_WM_DESTROY()
    ON_CONTROL_REFLECT_EX(EN_CHANGE, &KVXNumericEdit::OnChange)
END_MESSAGE_MAP()

/////////////////////////////////////////////////////////////////////////////
// Constructors

KVXNumericEdit::KVXNumericEdit()
    : m_bSpinAcceleration(true),
      m_nSpinOffset(0),
      m_bInSpinStep(FALSE),
      m_bChangedBySpin(FALSE),
      m_bInSliderMove(FALSE),
      m_bChangedBySlider(FALSE),
      m_bKeyDown(false),
      m_nSpinStep(1),
      m_pSpin(NULL),
      m_bSpinButton(TRUE)
{
}

KVXNumericEdit::~KVXNumericEdit()
{
    if (GetSpinHwnd() != NULL)
        m_pSpin->DestroyWindow();
    delete m_pSpin;
    m_pSpin = NULL;
}

/////////////////////////////////////////////////////////////////////////////
// Attributes

int KVXNumericEdit::IsInRange(KVXVariant varValue)
{
    return m_range.IsInRange(varValue) ? TRUE : FALSE;
}

KVXVariant KVXNumericEdit::GetMinimumInRange()
{
    return m_range.GetMinimumInRange();
}

KVXVariant KVXNumericEdit::GetMaximumInRange()
{
    return m_range.GetMaximumInRange();
}

void KVXNumericEdit::SetSpinButtonAccelerationEnabled(bool bEnable)
{
    m_bSpinAcceleration = bEnable;
}

bool KVXNumericEdit::GetSpinButtonAccelerationEnabled()
{
    return m_bSpinAcceleration;
}

/////////////////////////////////////////////////////////////////////////////
// Overridables

void KVXNumericEdit::SetSpinButtonFlag(int bOn)
{
    // Before initialisation there is nowhere to put a spin; the flag is not stored either.
    if (m_pParentWnd == NULL || m_pSpin == NULL)
        return;

    if (!bOn)
    {
        if (GetSpinHwnd() != NULL)
            m_pSpin->DestroyWindow();
    }
    else if (GetSpinHwnd() == NULL && ::IsWindow(m_hWnd))
    {
        // The parent is taken from the live window: the pointer kept at initialisation
        // may have been one of the framework's temporary objects.
        CWnd* pParent = GetParent();
        if (pParent == NULL)
            pParent = m_pParentWnd;
        const CRect rectSpin(SpinGeometry::SpinRectBesideEdit(m_rectCreate));
        if (m_pSpin->Create(pParent, this, rectSpin))
            m_pSpin->ModifyStyle(WS_BORDER, 0, 0);
    }
    m_bSpinButton = bOn;
}

int KVXNumericEdit::GetSpinButtonFlag()
{
    return m_bSpinButton;
}

int KVXNumericEdit::Create(DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID)
{
    const BOOL bCreated = CEdit::Create(dwStyle, rect, pParentWnd, nID);
    Initialize(rect, pParentWnd);
    return bCreated;
}

KVXVariant KVXNumericEdit::GetValueAsVariant(int bCommit)
{
    if (!SyntaxCheck(FALSE) || IsEmpty())
        m_varValue = m_varCommitted;
    return KVXEdit::GetValueAsVariant(bCommit);
}

void KVXNumericEdit::SetRange(KVXVariant varMin, KVXVariant varMax, int bMinInclude, int bMaxInclude)
{
    m_range.Empty(varMin);
    m_range.Adjust(varMax);
    m_range.SetMinimumInclude(bMinInclude != 0);
    m_range.SetMaximumInclude(bMaxInclude != 0);
}

KVXVariant KVXNumericEdit::GetMinimum()
{
    return m_range.GetMinimum();
}

KVXVariant KVXNumericEdit::GetMaximum()
{
    return m_range.GetMaximum();
}

int KVXNumericEdit::GetMinimumInclude()
{
    return m_range.GetMinimumInclude() ? TRUE : FALSE;
}

int KVXNumericEdit::GetMaximumInclude()
{
    return m_range.GetMaximumInclude() ? TRUE : FALSE;
}

void KVXNumericEdit::PreSubclassWindow()
{
    // During Create the framework still holds this object as the one being created:
    // Create initialises once the window is complete. Otherwise an existing window (a
    // dialog control) is being subclassed and is initialised here.
    const bool bCreating = AfxGetThreadState()->m_pWndInit == this;
    if (!bCreating && ::IsWindow(m_hWnd))
    {
        CWnd* pParent = CWnd::FromHandle(::GetParent(m_hWnd));
        CRect rect;
        GetWindowRect(&rect);
        if (pParent != NULL)
            pParent->ScreenToClient(&rect);
        Initialize(rect, pParent);
    }
    CWnd::PreSubclassWindow();
}

int KVXNumericEdit::SyntaxCheck(int bShow)
{
    return KVXEdit::SyntaxCheck(bShow);
}

/////////////////////////////////////////////////////////////////////////////
// Implementation

void KVXNumericEdit::Initialize(const RECT& rect, CWnd* pParentWnd)
{
    m_pParentWnd = pParentWnd;
    m_rectCreate = rect;
    // A repeated call (Create on an object that has its window) keeps the one spin.
    if (m_pSpin == NULL)
        m_pSpin = new KVXSpin;
    if (m_bSpinButton)
    {
        m_bSpinButton = FALSE;
        SetSpinButtonFlag(TRUE);
    }
    SetValueAsVariant(GetValueAsVariant(TRUE), TRUE);
}

HWND KVXNumericEdit::GetSpinHwnd() const
{
    if (m_pSpin == NULL || !::IsWindow(m_pSpin->m_hWnd))
        return NULL;
    return m_pSpin->m_hWnd;
}

void KVXNumericEdit::PressSpin(UINT nMessage, int y)
{
    HWND hSpin = GetSpinHwnd();
    if (hSpin != NULL)
        ::SendMessage(hSpin, nMessage, MK_LBUTTON, MAKELPARAM(0, y));
}

int KVXNumericEdit::SpinKeyPointY() const
{
    CRect rectSpin(0, 0, 0, 0);
    HWND hSpin = GetSpinHwnd();
    if (hSpin != NULL)
        ::GetWindowRect(hSpin, &rectSpin);
    return rectSpin.Height() - 3;
}

BOOL KVXNumericEdit::HandleUndoChar(WCHAR c)
{
    if (!(::GetKeyState(VK_CONTROL) & 0x8000) || c != NumberFormat::kUndoChar)
        return FALSE;
    if (!m_bUndefined)
        SetValueAsVariant(m_varCommitted, TRUE);
    else if (::IsWindow(m_hWnd))
        SetWindowText(_T(""));
    return TRUE;
}

void KVXNumericEdit::MoveIntoRange(bool bWholeNumbers)
{
    if (IsInRange(m_varValue))
        return;
    KVXVariant varLower = GetMinimumInRange();
    KVXVariant varUpper = GetMaximumInRange();
    bool bLowerIsNearer = false;
    if (bWholeNumbers)
    {
        long lCur = 0;
        long lLower = 0;
        long lUpper = 0;
        m_varValue.GetAs(lCur, 1);
        varLower.GetAs(lLower, 1);
        varUpper.GetAs(lUpper, 1);
        bLowerIsNearer = NumberFormat::LowerEndIsNearer(lLower, lUpper, lCur);
    }
    else
    {
        double dCur = 0.0;
        double dLower = 0.0;
        double dUpper = 0.0;
        m_varValue.GetAs(dCur);
        varLower.GetAs(dLower);
        varUpper.GetAs(dUpper);
        bLowerIsNearer = NumberFormat::LowerEndIsNearer(dLower, dUpper, dCur);
    }
    // Each subclass shows an end the way it reads it, as in the comparison above.
    SetValueAsVariant(bLowerIsNearer ? varLower : varUpper, TRUE);
}

void KVXNumericEdit::StartFromUndefined(const KVXVariant& varZero)
{
    if (!GetUndefined())
        return;
    SetValueAsVariant(IsInRange(varZero) ? varZero : GetMinimumInRange(), FALSE);
}

void KVXNumericEdit::ReleaseSpin()
{
    HWND hSpin = GetSpinHwnd();
    if (m_bSpinButton && hSpin != NULL)
        ::PostMessage(hSpin, WM_LBUTTONUP, 0, 0);
}

void KVXNumericEdit::RestoreCommitted()
{
    m_varValue = m_varCommitted;
    SetValueAsVariant(m_varValue, FALSE);
}

int KVXNumericEdit::EnableWindow(int bEnable)
{
    if (m_bSpinButton && GetSpinHwnd() != NULL)
        m_pSpin->EnableWindow(bEnable);
    if (!bEnable)
    {
        ResetOwnMessage();
        if (!SyntaxCheck(FALSE))
            RestoreCommitted();
    }
    return CWnd::EnableWindow(bEnable);
}

/////////////////////////////////////////////////////////////////////////////
// Called by the spin

void KVXNumericEdit::OnSpinUpButton()
{
    if (!SyntaxCheck(TRUE))
        return;
    if (FindErrorOnPage(::GetParent(m_hWnd)) != NULL)
        return;
    if (!m_bChangedBySpin)
    {
        SetMiddleVal(m_bChangedBySlider ? FALSE : TRUE);
        m_nSpinOffset = 0;
    }
    m_nSpinOffset += m_nSpinStep;
    m_bInSpinStep = TRUE;
    if (!IncreaseValue(m_nSpinOffset))
    {
        SetMiddleVal(FALSE);
        m_nSpinOffset = 0;
    }
    m_bInSpinStep = FALSE;
}

void KVXNumericEdit::OnSpinDownButton()
{
    if (!SyntaxCheck(TRUE))
        return;
    if (FindErrorOnPage(::GetParent(m_hWnd)) != NULL)
        return;
    if (!m_bChangedBySpin)
    {
        SetMiddleVal(m_bChangedBySlider ? FALSE : TRUE);
        m_nSpinOffset = 0;
    }
    m_nSpinOffset -= m_nSpinStep;
    m_bInSpinStep = TRUE;
    if (!DecreaseValue(m_nSpinOffset))
    {
        SetMiddleVal(FALSE);
        m_nSpinOffset = 0;
    }
    m_bInSpinStep = FALSE;
}

void KVXNumericEdit::OnSpinTimerTwoSecs()
{
    if (m_bSpinAcceleration)
        m_nSpinStep = 5;
}

void KVXNumericEdit::OnSpinTimerFiveSecs()
{
    if (m_bSpinAcceleration)
        m_nSpinStep = 20;
}

void KVXNumericEdit::OnSpinTimerKill()
{
    m_nSpinStep = 1;
}

void KVXNumericEdit::OnSliderSet(int bPressed)
{
    if (!SyntaxCheck(FALSE) || !bPressed)
        return;
    SetMiddleVal((m_bChangedBySlider || m_bChangedBySpin) ? FALSE : TRUE);
}

void KVXNumericEdit::OnSliderMove(long lDistance)
{
    if (!SyntaxCheck(TRUE))
        return;
    const long lSteps = SpinGeometry::SliderStepOffset(lDistance);
    m_bInSliderMove = TRUE;
    if (lDistance >= 0)
        IncreaseValue(lSteps);
    else
        DecreaseValue(lSteps);
    m_bInSliderMove = FALSE;
}

/////////////////////////////////////////////////////////////////////////////
// Message handlers

void KVXNumericEdit::OnKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags)
{
    HWND hSpin = GetSpinHwnd();
    if (m_bSpinButton && hSpin != NULL && (nChar == VK_UP || nChar == VK_DOWN))
    {
        // Keys press the spin's halves, so that keys and mouse share one auto-repeat.
        PressSpin(WM_LBUTTONDOWN, nChar == VK_DOWN ? SpinKeyPointY() : 0);
        if (m_pSpin != NULL)
            m_pSpin->SetKeyDown(true);
        m_bKeyDown = true;
        return;
    }
    KVXEdit::OnKeyDown(nChar, nRepCnt, nFlags);
}

void KVXNumericEdit::OnKeyUp(UINT nChar, UINT nRepCnt, UINT nFlags)
{
    HWND hSpin = GetSpinHwnd();
    if (m_bSpinButton && hSpin != NULL && (nChar == VK_UP || nChar == VK_DOWN))
    {
        PressSpin(WM_LBUTTONUP, nChar == VK_DOWN ? SpinKeyPointY() : 0);
        m_bKeyDown = false;
        if (m_pSpin != NULL)
            m_pSpin->SetKeyDown(false);
        return;
    }
    KVXEdit::OnKeyUp(nChar, nRepCnt, nFlags);
}

void KVXNumericEdit::OnKillFocus(CWnd* pNewWnd)
{
    PressSpin(WM_LBUTTONUP, 0);
    if (!GetUndefined() && SyntaxCheck(FALSE) && IsEmpty())
        RestoreCommitted();
    KVXEdit::OnKillFocus(pNewWnd);
}

void KVXNumericEdit::OnSetFocus(CWnd* pOldWnd)
{
    KVXEdit::OnSetFocus(pOldWnd);
    m_bChangedBySpin = FALSE;
}

void KVXNumericEdit::OnDestroy()
{
    if (GetSpinHwnd() != NULL)
        m_pSpin->DestroyWindow();
    delete m_pSpin;
    m_pSpin = NULL;
    KVXEdit::OnDestroy();
}

BOOL KVXNumericEdit::OnChange()
{
    m_bChangedBySpin = m_bInSpinStep;
    m_bChangedBySlider = m_bInSliderMove;
    KVXEdit::OnChange();
    return FALSE;
}
