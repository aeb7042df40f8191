// Which bitmap the bitmap buttons paint in which state, and how its colours are mapped
// (the colour table given to CreateMappedBitmap). No windows involved.
#pragma once

#include <windows.h>
#include <commctrl.h>

namespace ButtonLook {

// Key colour meaning "use the button face".
constexpr COLORREF kKeyIsButtonFace = 0xFFFFFFFF;

enum class Kind
{
    Push,        // KVXBitmapButtonEx
    Check,       // KVXCheckButtonEx
    Momentary,   // KVXUncheckButton
};

struct SysColors
{
    COLORREF face;
    COLORREF highlight;
    COLORREF shadow;
};

struct Look
{
    UINT bitmap = 0;      // resource identifier; 0: draw no bitmap
    int mapCount = 0;     // used entries of map
    COLORMAP map[4] = {};
};

// Bitmap and colour map for one state. pressed: the control holds the capture; for the
// check button a checked state counts as pressed.
Look Choose(Kind kind, bool pressed, bool enabled, UINT normal, UINT pressedBitmap,
            UINT disabled, COLORREF key, const SysColors& colors);

// Top-left corner that centres a bitmap in a client rectangle (integer division).
POINT CenteredOrigin(const RECT& client, int bitmapWidth, int bitmapHeight);

} // namespace ButtonLook
