#include "ButtonLook.h"

namespace ButtonLook {

namespace {

void Add(Look& look, COLORREF from, COLORREF to)
{
    look.map[look.mapCount].from = from;
    look.map[look.mapCount].to = to;
    ++look.mapCount;
}

} // namespace

Look Choose(Kind kind, bool pressed, bool enabled, UINT normal, UINT pressedBitmap,
            UINT disabled, COLORREF key, const SysColors& colors)
{
    const COLORREF b = key == kKeyIsButtonFace ? colors.face : key;
    Look look;
    if (pressed)
    {
        look.bitmap = pressedBitmap;
        if (kind == Kind::Check && !enabled)
        {
            Add(look, b, colors.face);
            Add(look, 0x808080, colors.highlight);
            Add(look, 0x000000, colors.shadow);
            Add(look, 0xFFFFFF, colors.highlight);
        }
        else
        {
            // The checked look lights the key colour; a held push button keeps the face.
            Add(look, b, kind == Kind::Check ? colors.highlight : colors.face);
            Add(look, 0x808080, colors.shadow);
            Add(look, 0xFFFFFF, colors.highlight);
        }
    }
    else if (enabled)
    {
        look.bitmap = normal;
        Add(look, b, colors.face);
    }
    else if (disabled != 0)
    {
        look.bitmap = disabled;
        Add(look, b, colors.face);
    }
    else
    {
        // Greyed look made from the normal bitmap.
        look.bitmap = normal;
        Add(look, b, colors.face);
        Add(look, 0x808080, colors.highlight);
        Add(look, 0x000000, colors.shadow);
    }
    if (look.bitmap == 0)
        look.mapCount = 0;
    return look;
}

POINT CenteredOrigin(const RECT& client, int bitmapWidth, int bitmapHeight)
{
    POINT pt;
    pt.x = client.left + (client.right - client.left - bitmapWidth) / 2;
    pt.y = client.top + (client.bottom - client.top - bitmapHeight) / 2;
    return pt;
}

} // namespace ButtonLook
