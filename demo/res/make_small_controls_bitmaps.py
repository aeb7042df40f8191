#!/usr/bin/env python3
"""Writes the bitmaps of the gallery's small-controls page (24 x 24, 4 bits per pixel).

Three buttons, each with a normal, a pressed and a disabled picture: a play button, a
bold "B" check button and a record (momentary) button. Magenta is the key colour the
buttons paint as button face; 0x808080 and white are mapped to the shadow and highlight
colours in the pressed look, so the frames follow the system colours.
Run it again after changing a picture; the build uses the committed .bmp files.
"""
import os
import struct

PALETTE = {
    ".": (255, 0, 255),   # key: button face
    "#": (0, 0, 0),
    "g": (128, 128, 128),
    "w": (255, 255, 255),
    "r": (192, 0, 0),
    "b": (0, 0, 160),
}
ORDER = list(PALETTE)

PLAY = [
    "##......",
    "####....",
    "######..",
    "########",
    "######..",
    "####....",
    "##......",
]
BOLD = [
    "######..",
    "##...##.",
    "##...##.",
    "######..",
    "##....##",
    "##....##",
    "#######.",
]
RECORD = [
    "..####..",
    ".######.",
    "########",
    "########",
    "########",
    ".######.",
    "..####..",
]


def picture(glyph, ink, look):
    size = 24
    px = [["."] * size for _ in range(size)]
    # Frame: raised (normal, disabled) or sunken (pressed).
    light, dark = ("g", "w") if look == "pressed" else ("w", "g")
    for i in range(size - 1):
        px[0][i] = light
        px[i][0] = light
        px[size - 2][i + 1] = dark
        px[i + 1][size - 2] = dark
        px[size - 1][i] = "#"
        px[i][size - 1] = "#"
    px[size - 1][size - 1] = "#"
    shift = 1 if look == "pressed" else 0
    colour = "g" if look == "disabled" else ink
    top = (size - len(glyph)) // 2 + shift
    left = (size - len(glyph[0])) // 2 + shift
    for y, row in enumerate(glyph):
        for x, ch in enumerate(row):
            if ch == "#":
                px[top + y][left + x] = colour
    if look == "disabled":
        # Embossed: a white copy one pixel right and down, under the grey glyph.
        for y, row in enumerate(glyph):
            for x, ch in enumerate(row):
                if ch == "#" and px[top + y + 1][left + x + 1] == ".":
                    px[top + y + 1][left + x + 1] = "w"
    return px


def write_bmp(path, px):
    size = len(px)
    table = [PALETTE[k] for k in ORDER] + [(0, 0, 0)] * (16 - len(ORDER))
    rows = []
    for row in px:
        idx = [ORDER.index(c) for c in row]
        rows.append(bytes((idx[i] << 4) | idx[i + 1] for i in range(0, size, 2)))
    pixels = b"".join(reversed(rows))
    colours = b"".join(struct.pack("<BBBB", b, g, r, 0) for (r, g, b) in table)
    # biClrUsed 16: resource loaders find the bits right after a full table.
    info = struct.pack("<IiiHHIIiiII", 40, size, size, 1, 4, 0, len(pixels), 2835, 2835, 16, 0)
    offset = 14 + len(info) + len(colours)
    header = struct.pack("<2sIHHI", b"BM", offset + len(pixels), 0, 0, offset)
    with open(path, "wb") as f:
        f.write(header + info + colours + pixels)


here = os.path.dirname(os.path.abspath(__file__))
for name, glyph, ink in (("play", PLAY, "#"), ("bold", BOLD, "b"), ("record", RECORD, "r")):
    for look in ("normal", "pressed", "disabled"):
        write_bmp(os.path.join(here, "%s_%s.bmp" % (name, look)), picture(glyph, ink, look))
