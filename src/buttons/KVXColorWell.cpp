#include "KVXColorWell.h"

#include "resource.h"

BEGIN_MESSAGE_MAP(KVXColorWell, CButton)
    ON_CONTROL_REFLECT(BN_CLICKED, &KVXColorWell::OnClicked)
END_MESSAGE_MAP()

KVXColorWell::KVXColorWell()
{
    m_popup.m_pColorWell = this;
    m_strColorName.LoadString(IDS_COLOR);
}

KVXColorWell::~KVXColorWell()
{
}

void KVXColorWell::Redraw()
{
    if (::IsWindow(GetSafeHwnd()))
        RedrawWindow(NULL, NULL, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
}

void KVXColorWell::SetColor(COLORREF clr)
{
    m_popup.m_clrColor = clr;
    m_popup.m_bColorUndefined = FALSE;
    Redraw();
}

COLORREF KVXColorWell::GetColor()
{
    return m_popup.m_clrColor;
}

void KVXColorWell::SetColorUndefined(BOOL bUndefined)
{
    m_popup.m_bColorUndefined = bUndefined;
    Redraw();
}

BOOL KVXColorWell::GetColorUndefined()
{
    return m_popup.m_bColorUndefined;
}

void KVXColorWell::SetHasOtherButton(BOOL bHasOtherButton)
{
    m_popup.m_bHasOtherButton = bHasOtherButton;
}

BOOL KVXColorWell::GetHasOtherButton()
{
    return m_popup.m_bHasOtherButton;
}

void KVXColorWell::SetRowCount(long nRows)
{
    if (ColorGridGeometry::IsValidGridCount(nRows))
        m_popup.m_nRows = nRows;
}

long KVXColorWell::GetRowCount()
{
    return m_popup.m_nRows;
}

void KVXColorWell::SetColumnCount(long nColumns)
{
    if (ColorGridGeometry::IsValidGridCount(nColumns))
        m_popup.m_nColumns = nColumns;
}

long KVXColorWell::GetColumnCount()
{
    return m_popup.m_nColumns;
}

void KVXColorWell::SetButtonWidth(long nWidth)
{
    if (ColorGridGeometry::IsValidButtonExtent(nWidth))
        m_popup.m_nButtonWidth = nWidth;
}

long KVXColorWell::GetButtonWidth()
{
    return m_popup.m_nButtonWidth;
}

void KVXColorWell::SetButtonHeight(long nHeight)
{
    if (ColorGridGeometry::IsValidButtonExtent(nHeight))
        m_popup.m_nButtonHeight = nHeight;
}

long KVXColorWell::GetButtonHeight()
{
    return m_popup.m_nButtonHeight;
}

void KVXColorWell::SetButtonGapHorizontal(long nGap)
{
    if (ColorGridGeometry::IsValidGridSpacing(nGap))
        m_popup.m_nGapHorizontal = nGap;
}

long KVXColorWell::GetButtonGapHorizontal()
{
    return m_popup.m_nGapHorizontal;
}

void KVXColorWell::SetButtonGapVertical(long nGap)
{
    if (ColorGridGeometry::IsValidGridSpacing(nGap))
        m_popup.m_nGapVertical = nGap;
}

long KVXColorWell::GetButtonGapVertical()
{
    return m_popup.m_nGapVertical;
}

void KVXColorWell::SetBorderWidth(long nBorder)
{
    if (ColorGridGeometry::IsValidGridSpacing(nBorder))
        m_popup.m_nBorderWidth = nBorder;
}

long KVXColorWell::GetBorderWidth()
{
    return m_popup.m_nBorderWidth;
}

CArray<COLORREF, COLORREF>* KVXColorWell::GetColorArray()
{
    return &m_popup.m_arrColors;
}

void KVXColorWell::SetColorName(CString strColorName)
{
    m_strColorName = strColorName;
}

CString KVXColorWell::GetColorName()
{
    return m_strColorName;
}

void KVXColorWell::OnClicked()
{
    DoColorWellDlg();
}

void KVXColorWell::DoColorWellDlg()
{
    if (m_popup.DoModal() != IDOK)
        return;
    if (!::IsWindow(GetSafeHwnd()))
        return;
    Invalidate(TRUE);
    HWND hParent = ::GetParent(m_hWnd);
    const int nID = GetDlgCtrlID();
    if (hParent == NULL)
        return;
    m_popup.m_bColorUndefined = FALSE;
    KVXColorWellNotify notify;
    notify.hdr.hwndFrom = m_hWnd;
    notify.hdr.idFrom = nID;
    notify.hdr.code = WM_KVX_COLORWELLCHANGED;
    notify.clrColor = m_popup.m_clrColor;
    // Sent, not posted or notified: the record lives on this stack only for the call,
    // also when the parent belongs to another thread.
    ::SendMessage(hParent, WM_KVX_COLORWELLCHANGED, nID, reinterpret_cast<LPARAM>(&notify));
}

void KVXColorWell::DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct)
{
    CDC* pDC = CDC::FromHandle(lpDrawItemStruct->hDC);
    const UINT nState = lpDrawItemStruct->itemState;
    int L = lpDrawItemStruct->rcItem.left;
    int T = lpDrawItemStruct->rcItem.top;
    int R = lpDrawItemStruct->rcItem.right;
    int B = lpDrawItemStruct->rcItem.bottom;
    const BOOL bEnabled = (nState & ODS_DISABLED) == 0;
    const COLORREF clrFace = ::GetSysColor(COLOR_BTNFACE);
    const COLORREF clrShadow = ::GetSysColor(COLOR_BTNSHADOW);
    const COLORREF clrHighlight = ::GetSysColor(COLOR_BTNHIGHLIGHT);
    const COLORREF clrBlack = RGB(0, 0, 0);

    CRect rcFill(L, T, R, B);
    rcFill.InflateRect(1, 1);
    pDC->FillSolidRect(&rcFill, clrFace);

    CPen penBlack(PS_SOLID, 1, clrBlack);
    CPen penShadow(PS_SOLID, 1, clrShadow);
    CPen penHighlight(PS_SOLID, 1, clrHighlight);
    CPen* pOldPen = pDC->SelectObject(&penBlack);

    if ((nState & ODS_SELECTED) == 0)
    {
        pDC->MoveTo(L, B - 1);
        pDC->LineTo(R - 1, B - 1);
        pDC->LineTo(R - 1, T);
        pDC->SelectObject(&penShadow);
        pDC->MoveTo(L + 1, B - 2);
        pDC->LineTo(R - 2, B - 2);
        pDC->LineTo(R - 2, T + 1);
        pDC->SelectObject(&penHighlight);
        pDC->LineTo(L + 1, T + 1);
        pDC->LineTo(L + 1, B - 2);
    }
    else
    {
        pDC->SelectObject(&penShadow);
        pDC->MoveTo(L, B - 1);
        pDC->LineTo(L, T);
        pDC->LineTo(R - 1, T);
        pDC->SelectObject(&penHighlight);
        pDC->MoveTo(R - 1, T - 1);
        pDC->LineTo(R - 1, B - 1);
        pDC->LineTo(L + 1, B - 1);
        pDC->SelectObject(&penBlack);
        pDC->MoveTo(L + 1, B - 2);
        pDC->LineTo(L + 1, T + 1);
        pDC->LineTo(R - 2, T + 1);
        // The pressed look draws everything else one pixel right and down.
        ++L;
        ++T;
        ++R;
        ++B;
    }

    // Separator between swatch and arrow.
    pDC->SelectObject(&penHighlight);
    pDC->MoveTo(R - 10, T + 4);
    pDC->LineTo(R - 10, B - 4);
    pDC->SelectObject(&penShadow);
    pDC->MoveTo(R - 11, T + 4);
    pDC->LineTo(R - 11, B - 4);

    // Drop-down arrow; the disabled one is embossed with white pixels.
    const int m = B / 2;
    pDC->SelectObject(bEnabled ? &penBlack : &penShadow);
    pDC->MoveTo(R - 4, m - 1);
    pDC->LineTo(R - 9, m - 1);
    pDC->MoveTo(R - 5, m);
    pDC->LineTo(R - 8, m);
    if (bEnabled)
    {
        pDC->SetPixel(R - 6, m + 1, clrBlack);
    }
    else
    {
        pDC->SetPixel(R - 4, m - 1, RGB(255, 255, 255));
        pDC->SetPixel(R - 5, m, RGB(255, 255, 255));
        pDC->SetPixel(R - 6, m + 1, RGB(255, 255, 255));
    }

    // Swatch: the colour, or a cross hatch while undefined; none when disabled.
    if (bEnabled)
    {
        CBrush brush;
        if (m_popup.m_bColorUndefined)
            brush.CreateHatchBrush(HS_DIAGCROSS, clrBlack);
        else
            brush.CreateSolidBrush(m_popup.m_clrColor);
        pDC->SelectObject(&penBlack);
        CBrush* pOldBrush = pDC->SelectObject(&brush);
        pDC->Rectangle(L + 5, T + 4, R - 15, B - 4);
        pDC->SelectObject(pOldBrush);
    }

    if (nState & ODS_FOCUS)
    {
        for (int x = L + 3; x < R - 3; x += 2)
        {
            pDC->SetPixel(x, T + 3, clrBlack);
            pDC->SetPixel(x, B - 4, clrBlack);
        }
        for (int y = T + 3; y < B - 4; y += 2)
        {
            pDC->SetPixel(L + 3, y, clrBlack);
            pDC->SetPixel(R - 3, y, clrBlack);
        }
    }

    pDC->SelectObject(pOldPen);
}
