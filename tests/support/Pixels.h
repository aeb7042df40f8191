// Reading what a window painted: a memory bitmap of its client area, filled with
// WM_PRINTCLIENT or copied from the screen after a synchronous paint.
#pragma once

#include <windows.h>

namespace orvane_test {

class ClientCapture
{
public:
    enum Mode { FromScreen, PrintClient };
    explicit ClientCapture(HWND hwnd, Mode mode = FromScreen);
    ~ClientCapture();
    ClientCapture(const ClientCapture&) = delete;
    ClientCapture& operator=(const ClientCapture&) = delete;

    COLORREF At(int x, int y) const;
    int width() const { return m_width; }
    int height() const { return m_height; }
    // Number of pixels of colour c inside the rectangle (client coordinates).
    int Count(const RECT& area, COLORREF c) const;

private:
    HDC m_dc = nullptr;
    HBITMAP m_bitmap = nullptr;
    HGDIOBJ m_old = nullptr;
    int m_width = 0;
    int m_height = 0;
};

} // namespace orvane_test
