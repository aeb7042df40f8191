// KVXNumericEdit: abstract base of the integer and floating-point edits.
//
// Adds to the validated edit a range of accepted values, a spin control beside the field
// that it creates and owns, and stepping: spin arrows, the spin's slider band and the Up
// and Down keys change the value in steps counted from a middle value, with acceleration
// while an arrow is held. What a step is worth, parsing and formatting belong to the
// subclasses.
#pragma once

#include "KVXEdit.h"
#include "KVXRange.h"

class KVXSpin;

class AFX_EXT_CLASS KVXNumericEdit : public KVXEdit
{
    friend class KVXSpin;

// Constructors
public:
    KVXNumericEdit();
    virtual ~KVXNumericEdit();

// Attributes
public:
    int IsInRange(KVXVariant varValue);
    KVXVariant GetMinimumInRange();
    KVXVariant GetMaximumInRange();
    void SetSpinButtonAccelerationEnabled(bool bEnable);
    bool GetSpinButtonAccelerationEnabled();

// Overridables
protected:
    // Takes the current value as the middle value of a new step sequence; with
    // bDetermineStep TRUE the subclass may derive its step size from the text.
    virtual void SetMiddleVal(int bDetermineStep) = 0;
    // Shows, uncommitted, the middle value plus lOffset steps; outside the range shows the
    // range's upper (lower) in-range value instead and returns FALSE.
    virtual int IncreaseValue(long lOffset) = 0;
    virtual int DecreaseValue(long lOffset) = 0;

public:
    virtual void SetSpinButtonFlag(int bOn);
    virtual int GetSpinButtonFlag();
    virtual int Create(DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID);
    // An invalid or empty field reads as its committed value.
    virtual KVXVariant GetValueAsVariant(int bCommit) = 0;
    virtual void SetRange(KVXVariant varMin, KVXVariant varMax, int bMinInclude, int bMaxInclude) = 0;
    virtual KVXVariant GetMinimum() = 0;
    virtual KVXVariant GetMaximum() = 0;
    virtual int GetMinimumInclude() = 0;
    virtual int GetMaximumInclude() = 0;

protected:
    virtual void PreSubclassWindow();
    virtual int SyntaxCheck(int bShow);
    using KVXEdit::SyntaxCheck;

// Implementation
protected:
    int EnableWindow(int bEnable);

    // Called by the spin (see KVXSpin).
    void OnSpinUpButton();
    void OnSpinDownButton();
    void OnSpinTimerTwoSecs();
    void OnSpinTimerFiveSecs();
    void OnSpinTimerKill();
    void OnSliderSet(int bPressed);
    void OnSliderMove(long lDistance);

protected:
    bool m_bSpinAcceleration;
    int m_nSpinOffset;
    BOOL m_bInSpinStep;
    BOOL m_bChangedBySpin;
    BOOL m_bInSliderMove;
    BOOL m_bChangedBySlider;
    bool m_bKeyDown;
    KVXRange m_range;
    int m_nSpinStep;
    KVXSpin* m_pSpin;
    BOOL m_bSpinButton;

    // The spin's window, or NULL when it has none: messages to a missing spin go nowhere.
    HWND GetSpinHwnd() const;

    // Shared by the integer and floating-point edits.
    // Ctrl+Z: shows the committed value again (committed), or empties an undefined field.
    // TRUE when c was that key while Ctrl is down: the character is then swallowed.
    BOOL HandleUndoChar(WCHAR c);
    // A current value outside the range moves, committed, to the nearer in-range end
    // (equal distances: the upper one), compared as whole numbers or as doubles.
    void MoveIntoRange(bool bWholeNumbers);
    // An undefined field starts a step sequence at zero, or at the lowest value allowed.
    void StartFromUndefined(const KVXVariant& varZero);
    // Posts a release to the spin, ending an auto-repeat that ran into a bad value.
    void ReleaseSpin();

private:
    void Initialize(const RECT& rect, CWnd* pParentWnd);
    void PressSpin(UINT nMessage, int y);
    // Where the Down key presses the spin: three pixels above its bottom edge.
    int SpinKeyPointY() const;
    // Puts the committed value back into the field, uncommitted.
    void RestoreCommitted();

// Message map
protected:
    afx_msg void OnKeyUp(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnKeyDown(UINT nChar, UINT nRepCnt, UINT nFlags);
    afx_msg void OnKillFocus(CWnd* pNewWnd);
    afx_msg void OnSetFocus(CWnd* pOldWnd);
    afx_msg void OnDestroy();
    afx_msg BOOL OnChange();
    DECLARE_MESSAGE_MAP()
};
