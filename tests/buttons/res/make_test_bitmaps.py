#!/usr/bin/env python3
"""Writes the bitmaps of the buttons tests (16 x 16, 4 bits per pixel, colour table).

Each bitmap has an identifying colour in columns 0-3 (red: normal, green: pressed,
blue: disabled) and four bands in columns 4-15 whose colours the buttons map:
rows 0-3 the key colour, rows 4-7 mid-grey 0x808080, rows 8-11 black, rows 12-15 white.
The key is magenta, except in face_*.bmp where it is RGB(212, 208, 200), the button face
the tests set while they use them, so that a key of -1 (the face colour) has pixels to
act on.
CreateMappedBitmap maps colour-table entries only, hence the palette format.
Run it again after changing a picture; the build uses the committed .bmp files.
"""
import os
import struct

MAGENTA = (255, 0, 255)
GREY = (128, 128, 128)
BLACK = (0, 0, 0)
WHITE = (255, 255, 255)
FACE = (212, 208, 200)


def write_bmp(path, ident, key):
    palette = [ident, key, GREY, BLACK, WHITE]
    palette += [(0, 0, 0)] * (16 - len(palette))
    rows = []
    for y in range(16):
        band = 1 + y // 4          # key, grey, black, white
        row = [0] * 4 + [band] * 12
        rows.append(bytes((row[i] << 4) | row[i + 1] for i in range(0, 16, 2)))
    pixels = b"".join(reversed(rows))   # bottom-up
    table = b"".join(struct.pack("<BBBB", b, g, r, 0) for (r, g, b) in palette)
    info = struct.pack("<IiiHHIIiiII", 40, 16, 16, 1, 4, 0, len(pixels), 2835, 2835, 16, 0)
    offset = 14 + len(info) + len(table)
    header = struct.pack("<2sIHHI", b"BM", offset + len(pixels), 0, 0, offset)
    with open(path, "wb") as f:
        f.write(header + info + table + pixels)


here = os.path.dirname(os.path.abspath(__file__))
for name, ident in (("normal", (255, 0, 0)), ("pressed", (0, 255, 0)), ("disabled", (0, 0, 255))):
    write_bmp(os.path.join(here, name + ".bmp"), ident, MAGENTA)
    write_bmp(os.path.join(here, "face_" + name + ".bmp"), ident, FACE)
