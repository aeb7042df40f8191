#include "KVXColorPopup.h"
#include "ColorGridGeometry.h"

#include "KVXColorDialog.h"
#include "KVXColorWell.h"
#include "resource.h"

BEGIN_MESSAGE_MAP(KVXColorPopup, CDialog)
    ON_WM_PAINT()
    ON_WM_MOUSEMOVE()
    ON_WM_LBUTTONDOWN()
    ON_WM_LBUTTONUP()
    ON_BN_CLICKED(IDC_COLOR_OTHER, &KVXColorPopup::OnOther)
    ON_WM_CANCELMODE()
END_MESSAGE_MAP()

KVXColorPopup::KVXColorPopup()
    : CDialog(IDD_COLOR_POPUP),
      m_clrColor(RGB(0, 0, 0)),
      m_pColorWell(NULL),
      m_nCurrent(-1),
      m_nHover(-1),
      m_nRows(5),
      m_nColumns(4),
      m_nButtonWidth(20),
      m_nButtonHeight(20),
      m_nGapHorizontal(0),
      m_nGapVertical(0),
      m_nBorderWidth(0),
      m_bHasOtherButton(TRUE),
      m_bColorUndefined(FALSE)
{
    for (COLORREF clr : ColorGridGeometry::DefaultPaletteColors())
        m_arrColors.Add(clr);
}

KVXColorPopup::~KVXColorPopup()
{
}

ColorGridGeometry::ColorGridLayout KVXColorPopup::GetLayout() const
{
    ColorGridGeometry::ColorGridLayout layout;
    layout.rows = m_nRows;
    layout.columns = m_nColumns;
    layout.buttonWidth = m_nButtonWidth;
    layout.buttonHeight = m_nButtonHeight;
    layout.gapHorizontal = m_nGapHorizontal;
    layout.gapVertical = m_nGapVertical;
    layout.border = m_nBorderWidth;
    return layout;
}

COLORREF KVXColorPopup::GetCellColor(int nIndex) const
{
    if (nIndex >= 0 && nIndex < m_arrColors.GetSize())
        return m_arrColors[nIndex];
    return RGB(0, 0, 0);
}

BOOL KVXColorPopup::OnInitDialog()
{
    CDialog::OnInitDialog();

    CWnd* pDummy = GetDlgItem(IDC_COLOR_DUMMY);
    CWnd* pOther = GetDlgItem(IDC_COLOR_OTHER);
    if (m_pColorWell != NULL && pDummy != NULL && pOther != NULL)
    {
        const int nFrame = ::GetSystemMetrics(SM_CXDLGFRAME);
        const ColorGridGeometry::ColorGridLayout layout = GetLayout();

        // The Dummy button stays a focus target for the grid, but invisible.
        pDummy->MoveWindow(0, 0, 0, 0);
        CRect rcOther;
        pOther->GetClientRect(&rcOther);
        const int nOtherHeight = rcOther.Height();

        const SIZE size = ColorGridGeometry::PopupSize(layout, m_bHasOtherButton != FALSE, nFrame, nOtherHeight);
        CRect rcWell;
        m_pColorWell->GetWindowRect(&rcWell);

        if (m_bHasOtherButton)
        {
            pOther->ShowWindow(SW_SHOW);
            const RECT rcPlace = ColorGridGeometry::OtherButtonRect(layout, size, nFrame, nOtherHeight);
            pOther->MoveWindow(&rcPlace);
        }
        else
        {
            pOther->MoveWindow(0, 0, 0, 0);
            pOther->ShowWindow(SW_HIDE);
        }

        // Right below the well, kept on the well's monitor.
        MONITORINFO mi = { sizeof(mi) };
        HMONITOR hMonitor = ::MonitorFromRect(&rcWell, MONITOR_DEFAULTTONEAREST);
        if (hMonitor == NULL || !::GetMonitorInfo(hMonitor, &mi))
            ::SetRect(&mi.rcMonitor, 0, 0, ::GetSystemMetrics(SM_CXSCREEN), ::GetSystemMetrics(SM_CYSCREEN));
        const POINT origin = ColorGridGeometry::KeepPopupInside(POINT{ rcWell.left, rcWell.bottom }, size,
                                                                mi.rcMonitor);
        MoveWindow(origin.x, origin.y, size.cx, size.cy);

        SetCapture();
    }

    m_nCurrent = m_nHover = -1;
    if (!m_bColorUndefined)
    {
        for (int i = 0; i < m_arrColors.GetSize(); ++i)
        {
            if (m_arrColors[i] == m_clrColor)
            {
                m_nCurrent = m_nHover = i;
                break;
            }
        }
    }
    return TRUE;
}

void KVXColorPopup::DrawCell(CDC* pDC, const CRect& rcButton, COLORREF clr, BOOL bCurrent, BOOL bHover)
{
    const COLORREF clrFace = ::GetSysColor(COLOR_BTNFACE);
    const COLORREF clrHighlight = ::GetSysColor(COLOR_BTNHIGHLIGHT);
    const COLORREF clrShadow = ::GetSysColor(COLOR_BTNSHADOW);

    // The halftone brush takes its two colours from these.
    pDC->SetBkColor(clrFace);
    pDC->SetTextColor(clrHighlight);
    CBrush brushFace(clrFace);
    pDC->FillRect(&rcButton, &brushFace);

    if (bCurrent || bHover)
    {
        // Sunken frame for the current cell, raised for the hovered one.
        CPen penTopLeft(PS_SOLID, 1, bCurrent ? clrShadow : clrHighlight);
        CPen penBottomRight(PS_SOLID, 1, bCurrent ? clrHighlight : clrShadow);
        CPen* pOldPen = pDC->SelectObject(&penTopLeft);
        pDC->MoveTo(rcButton.left, rcButton.bottom - 1);
        pDC->LineTo(rcButton.left, rcButton.top);
        pDC->LineTo(rcButton.right - 1, rcButton.top);
        pDC->SelectObject(&penBottomRight);
        pDC->LineTo(rcButton.right - 1, rcButton.bottom - 1);
        pDC->LineTo(rcButton.left - 1, rcButton.bottom - 1);
        pDC->SelectObject(pOldPen);
        if (bCurrent && !bHover)
        {
            // Latched look: dithered inside the frame.
            CRect rcLatched(rcButton.left + 1, rcButton.top + 1, rcButton.right - 1, rcButton.bottom - 1);
            if (CBrush* pHalftone = CDC::GetHalftoneBrush())
                pDC->FillRect(&rcLatched, pHalftone);
        }
    }

    CPen penSwatch(PS_SOLID, 1, clrShadow);
    CBrush brushSwatch(clr);
    CPen* pOldPen = pDC->SelectObject(&penSwatch);
    CBrush* pOldBrush = pDC->SelectObject(&brushSwatch);
    CRect rcSwatch(rcButton);
    rcSwatch.DeflateRect(3, 3);
    pDC->Rectangle(&rcSwatch);
    pDC->SelectObject(pOldBrush);
    pDC->SelectObject(pOldPen);
}

void KVXColorPopup::OnPaint()
{
    CPaintDC dc(this);
    const ColorGridGeometry::ColorGridLayout layout = GetLayout();
    for (int i = 0; i < layout.CellCount(); ++i)
    {
        CRect rcButton(ColorGridGeometry::CellButtonRect(layout, i));
        DrawCell(&dc, rcButton, GetCellColor(i), i == m_nCurrent, i == m_nHover);
    }
}

void KVXColorPopup::RedrawCell(int nIndex)
{
    if (nIndex < 0 || !::IsWindow(GetSafeHwnd()))
        return;
    CRect rcCell(ColorGridGeometry::CellRect(GetLayout(), nIndex));
    RedrawWindow(&rcCell, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
}

void KVXColorPopup::SetHover(int nIndex)
{
    if (nIndex == m_nHover)
        return;
    const int nOld = m_nHover;
    m_nHover = nIndex;
    RedrawCell(nOld);
    RedrawCell(nIndex);
}

void KVXColorPopup::FocusForHover()
{
    MoveFocusTo(GetDlgItem(m_nHover == -1 && m_bHasOtherButton ? IDC_COLOR_OTHER : IDC_COLOR_DUMMY));
}

// Through the dialog manager, so that the focused button also becomes the default one
// and Return presses it.
void KVXColorPopup::MoveFocusTo(CWnd* pTarget)
{
    if (pTarget != NULL && GetFocus() != pTarget)
        GotoDlgCtrl(pTarget);
}

void KVXColorPopup::PickColor(int nIndex)
{
    m_clrColor = m_arrColors[nIndex];
    if (m_pColorWell != NULL)
        m_pColorWell->SetColorUndefined(FALSE);
}

void KVXColorPopup::EndPopup(int nResult)
{
    if (m_hWnd != NULL && ::GetCapture() == m_hWnd)
        ::ReleaseCapture();
    EndDialog(nResult);
}

void KVXColorPopup::OnOK()
{
    EndPopup(IDOK);
}

void KVXColorPopup::OnCancel()
{
    EndPopup(IDCANCEL);
}

BOOL KVXColorPopup::IsOutsideWindow(CPoint ptClient)
{
    CRect rcWindow;
    GetWindowRect(&rcWindow);
    CPoint ptScreen(ptClient);
    ClientToScreen(&ptScreen);
    return !rcWindow.PtInRect(ptScreen);
}

void KVXColorPopup::OnMouseMove(UINT nFlags, CPoint point)
{
    // A press on Other... that was released elsewhere leaves nobody with the capture;
    // take it back so that clicks outside still close the popup.
    if (::GetCapture() == NULL)
        SetCapture();

    const ColorGridGeometry::ColorGridLayout layout = GetLayout();
    const int nCell = ColorGridGeometry::CellFromHoverPoint(layout, point.x, point.y);
    if (nCell < layout.CellCount())
        SetHover(nCell);

    if (m_bHasOtherButton)
    {
        CWnd* pOther = GetDlgItem(IDC_COLOR_OTHER);
        CWnd* pDummy = GetDlgItem(IDC_COLOR_DUMMY);
        if (pOther != NULL && pDummy != NULL)
        {
            CRect rcOther;
            pOther->GetWindowRect(&rcOther);
            ScreenToClient(&rcOther);
            MoveFocusTo(rcOther.PtInRect(point) ? pOther : pDummy);
        }
    }
}

// The popup sees clicks outside only through its capture. A cancel mode that takes it
// while the popup is still the active window is answered by taking it back: this
// platform sends one late, when the focus comes back from the colour dialog, and the
// popup would then stay open, deaf to clicks outside. (Opening the colour dialog
// releases the capture first, so its cancel mode finds none to take back.)
void KVXColorPopup::OnCancelMode()
{
    const bool bHeld = ::GetCapture() == m_hWnd;
    CDialog::OnCancelMode();
    if (bHeld && ::GetCapture() == NULL && ::GetActiveWindow() == m_hWnd && IsWindowEnabled())
        SetCapture();
}

void KVXColorPopup::OnLButtonDown(UINT nFlags, CPoint point)
{
    if (IsOutsideWindow(point))
    {
        EndPopup(IDCANCEL);
        return;
    }
    // The Other... button takes the capture from here, so that the click completes on it.
    HWND hChild = ::ChildWindowFromPointEx(m_hWnd, point, CWP_SKIPINVISIBLE | CWP_SKIPDISABLED);
    if (hChild != NULL && hChild != m_hWnd)
        ::SendMessage(hChild, WM_LBUTTONDOWN, 0, 0);
}

void KVXColorPopup::OnLButtonUp(UINT nFlags, CPoint point)
{
    if (IsOutsideWindow(point))
    {
        EndPopup(IDCANCEL);
        return;
    }
    // A release on a gap, in the margin or on an empty cell picks nothing but still
    // closes the popup with OK.
    const int nCell = ColorGridGeometry::CellFromReleasePoint(GetLayout(), point.x, point.y);
    if (nCell >= 0 && nCell < m_arrColors.GetSize())
        PickColor(nCell);
    EndPopup(IDOK);
}

BOOL KVXColorPopup::PreTranslateMessage(MSG* pMsg)
{
    if (pMsg->message == WM_KEYDOWN && ::IsWindow(GetSafeHwnd()))
    {
        const UINT nKey = static_cast<UINT>(pMsg->wParam);
        if (nKey == VK_RETURN || nKey == VK_SPACE)
        {
            if (m_nHover >= 0 && m_nHover < m_arrColors.GetSize())
            {
                PickColor(m_nHover);
                EndPopup(IDOK);
                return TRUE;
            }
            if (!m_bHasOtherButton)
            {
                EndPopup(IDOK);
                return TRUE;
            }
            // The dialog presses the focused button (Other...).
            return CDialog::PreTranslateMessage(pMsg);
        }

        int nNewHover = m_nHover;
        if (ColorGridGeometry::MoveHoverByKey(GetLayout(), m_nHover, nKey, m_bHasOtherButton != FALSE, nNewHover))
        {
            SetHover(nNewHover);
            FocusForHover();
            return TRUE;
        }
    }
    return CDialog::PreTranslateMessage(pMsg);
}

void KVXColorPopup::OnOther()
{
    ::ReleaseCapture();

    // Owned by the popup, which it disables while it runs: clicks on the palette cannot
    // end the popup under the running dialog, also in a host without a main window.
    KVXColorDialog dlg(0, 0, this);
    if (m_pColorWell != NULL)
        dlg.SetWindowName(m_pColorWell->GetColorName());
    dlg.m_cc.rgbResult = m_clrColor;
    dlg.m_cc.Flags |= CC_RGBINIT | CC_FULLOPEN;
    const HWND hWnd = m_hWnd;
    const INT_PTR nResult = dlg.DoModal();
    if (!::IsWindow(hWnd))
        return;     // the popup went, with its well, while the dialog was up
    if (nResult == IDOK)
    {
        m_clrColor = dlg.GetColor();
        if (m_pColorWell != NULL)
            m_pColorWell->SetColorUndefined(FALSE);
        EndPopup(IDOK);
    }
    else
    {
        SetCapture();
    }
}
