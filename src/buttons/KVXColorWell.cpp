#include "KVXColorWell.h"
#include "ColorGridGeometry.h"

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

// The well's window is gone (with its dialog, say) while its popup may be up: the popup
// and the colour dialog it owns go too, so that DoColorWellDlg returns at once and
// sends nothing. Ending the modal loop first also ends it where the popup's window
// went before the well's (owned by the same top-level window).
void KVXColorWell::PostNcDestroy()
{
    m_popup.EndPopup(IDCANCEL);
    if (::IsWindow(m_popup.GetSafeHwnd()))
        m_popup.DestroyWindow();
    CButton::PostNcDestroy();
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

// The well's parts, measured from the item rectangle: a frame two pixels wide; at the
// right a strip with a separator (two lines 10 and 11 pixels from the right edge) and a
// small arrow; the swatch fills the rest inside the frame, 15 pixels short of the right
// edge. Separator and swatch keep 4 pixels from the top and bottom edges.
namespace {

constexpr int kSeparatorFromRight = 10;     // the highlight line; its shadow line is left of it
constexpr int kInsetVertical = 4;
constexpr int kSwatchFromLeft = 5;
constexpr int kSwatchFromRight = 15;
constexpr int kArrowCentreFromRight = 6;    // rows of 5, 3 and 1 pixels centred there
constexpr int kFocusInset = 3;

struct WellPens
{
    CPen black{ PS_SOLID, 1, RGB(0, 0, 0) };
    CPen shadow{ PS_SOLID, 1, ::GetSysColor(COLOR_BTNSHADOW) };
    CPen highlight{ PS_SOLID, 1, ::GetSysColor(COLOR_BTNHIGHLIGHT) };
};

// Lines end before their end point, as LineTo does.
void Line(CDC* pDC, CPen& pen, int x0, int y0, int x1, int y1)
{
    pDC->SelectObject(&pen);
    pDC->MoveTo(x0, y0);
    pDC->LineTo(x1, y1);
}

// Raised: black outside at the bottom and right, shadow inside it, highlight at the top
// and left.
void DrawRaisedFrame(CDC* pDC, const CRect& rc, WellPens& pens)
{
    Line(pDC, pens.black, rc.left, rc.bottom - 1, rc.right - 1, rc.bottom - 1);
    pDC->LineTo(rc.right - 1, rc.top);
    Line(pDC, pens.shadow, rc.left + 1, rc.bottom - 2, rc.right - 2, rc.bottom - 2);
    pDC->LineTo(rc.right - 2, rc.top + 1);
    pDC->SelectObject(&pens.highlight);
    pDC->LineTo(rc.left + 1, rc.top + 1);
    pDC->LineTo(rc.left + 1, rc.bottom - 2);
}

// Sunken: shadow outside at the left and top, highlight at the right and bottom, black
// inside at the left and top.
void DrawSunkenFrame(CDC* pDC, const CRect& rc, WellPens& pens)
{
    Line(pDC, pens.shadow, rc.left, rc.bottom - 1, rc.left, rc.top);
    pDC->LineTo(rc.right - 1, rc.top);
    Line(pDC, pens.highlight, rc.right - 1, rc.top - 1, rc.right - 1, rc.bottom - 1);
    pDC->LineTo(rc.left + 1, rc.bottom - 1);
    Line(pDC, pens.black, rc.left + 1, rc.bottom - 2, rc.left + 1, rc.top + 1);
    pDC->LineTo(rc.right - 2, rc.top + 1);
}

void DrawSeparator(CDC* pDC, const CRect& rc, WellPens& pens)
{
    const int x = rc.right - kSeparatorFromRight;
    Line(pDC, pens.highlight, x, rc.top + kInsetVertical, x, rc.bottom - kInsetVertical);
    Line(pDC, pens.shadow, x - 1, rc.top + kInsetVertical, x - 1, rc.bottom - kInsetVertical);
}

// The drop-down arrow points down from the middle row m = bottom / 2. Disabled, it is
// drawn in the shadow colour with the right end of each row white (embossed).
void DrawArrow(CDC* pDC, const CRect& rc, WellPens& pens, bool bEnabled)
{
    const int cx = rc.right - kArrowCentreFromRight;
    const int m = rc.bottom / 2;
    for (int row = 0; row < 3; ++row)
    {
        const int half = 2 - row;
        const int y = m - 1 + row;
        Line(pDC, bEnabled ? pens.black : pens.shadow, cx + half, y, cx - half - 1, y);
        if (!bEnabled)
            pDC->SetPixel(cx + half, y, RGB(255, 255, 255));
    }
}

// The colour, or a black cross hatch while it is undefined, framed in black.
void DrawSwatch(CDC* pDC, const CRect& rc, WellPens& pens, COLORREF clr, BOOL bUndefined)
{
    CBrush brush;
    if (bUndefined)
        brush.CreateHatchBrush(HS_DIAGCROSS, RGB(0, 0, 0));
    else
        brush.CreateSolidBrush(clr);
    pDC->SelectObject(&pens.black);
    CBrush* pOldBrush = pDC->SelectObject(&brush);
    pDC->Rectangle(rc.left + kSwatchFromLeft, rc.top + kInsetVertical, rc.right - kSwatchFromRight,
                   rc.bottom - kInsetVertical);
    pDC->SelectObject(pOldBrush);
}

// Black dots on every second pixel of a rectangle inset by 3 (one pixel less at the
// bottom).
void DrawFocusDots(CDC* pDC, const CRect& rc)
{
    const COLORREF clrBlack = RGB(0, 0, 0);
    const int left = rc.left + kFocusInset;
    const int top = rc.top + kFocusInset;
    const int right = rc.right - kFocusInset;
    const int bottom = rc.bottom - kFocusInset - 1;
    for (int x = left; x < right; x += 2)
    {
        pDC->SetPixel(x, top, clrBlack);
        pDC->SetPixel(x, bottom, clrBlack);
    }
    for (int y = top; y < bottom; y += 2)
    {
        pDC->SetPixel(left, y, clrBlack);
        pDC->SetPixel(right, y, clrBlack);
    }
}

} // namespace

void KVXColorWell::DrawItem(LPDRAWITEMSTRUCT lpDrawItemStruct)
{
    CDC* pDC = CDC::FromHandle(lpDrawItemStruct->hDC);
    const UINT nState = lpDrawItemStruct->itemState;
    const bool bEnabled = (nState & ODS_DISABLED) == 0;
    CRect rc(lpDrawItemStruct->rcItem);

    CRect rcFill(rc);
    rcFill.InflateRect(1, 1);
    pDC->FillSolidRect(&rcFill, ::GetSysColor(COLOR_BTNFACE));

    WellPens pens;
    CPen* pOldPen = pDC->SelectObject(&pens.black);
    if (nState & ODS_SELECTED)
    {
        DrawSunkenFrame(pDC, rc, pens);
        rc.OffsetRect(1, 1);    // the pressed look draws everything else one pixel right and down
    }
    else
    {
        DrawRaisedFrame(pDC, rc, pens);
    }
    DrawSeparator(pDC, rc, pens);
    DrawArrow(pDC, rc, pens, bEnabled);
    if (bEnabled)
        DrawSwatch(pDC, rc, pens, m_popup.m_clrColor, m_popup.m_bColorUndefined);
    if (nState & ODS_FOCUS)
        DrawFocusDots(pDC, rc);
    pDC->SelectObject(pOldPen);
}
