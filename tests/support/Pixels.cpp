#include "Pixels.h"

namespace orvane_test {

ClientCapture::ClientCapture(HWND hwnd, Mode mode)
{
    RECT rc;
    GetClientRect(hwnd, &rc);
    m_width = rc.right;
    m_height = rc.bottom;
    HDC screen = GetDC(hwnd);
    m_dc = CreateCompatibleDC(screen);
    m_bitmap = CreateCompatibleBitmap(screen, m_width > 0 ? m_width : 1, m_height > 0 ? m_height : 1);
    m_old = SelectObject(m_dc, m_bitmap);
    if (mode == PrintClient)
    {
        SendMessageW(hwnd, WM_PRINTCLIENT, reinterpret_cast<WPARAM>(m_dc), PRF_CLIENT | PRF_ERASEBKGND);
    }
    else
    {
        RedrawWindow(hwnd, nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW | RDW_ALLCHILDREN);
        BitBlt(m_dc, 0, 0, m_width, m_height, screen, 0, 0, SRCCOPY);
    }
    ReleaseDC(hwnd, screen);
}

ClientCapture::~ClientCapture()
{
    SelectObject(m_dc, m_old);
    DeleteObject(m_bitmap);
    DeleteDC(m_dc);
}

COLORREF ClientCapture::At(int x, int y) const
{
    return GetPixel(m_dc, x, y);
}

int ClientCapture::Count(const RECT& area, COLORREF c) const
{
    int n = 0;
    for (int y = area.top; y < area.bottom; ++y)
        for (int x = area.left; x < area.right; ++x)
            if (GetPixel(m_dc, x, y) == c)
                ++n;
    return n;
}

} // namespace orvane_test
