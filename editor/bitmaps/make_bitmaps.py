#!/usr/bin/env python3
"""Draws the object's two 32 x 32, 16-colour bitmaps (object.bmp, object_small.bmp).

Run it from this folder after changing a picture; the .bmp files it writes are kept in
the repository so that building needs no Python on Windows.
"""
import struct
from pathlib import Path

# The standard 16-colour palette, as red, green, blue.
PALETTE = [
    (0, 0, 0), (128, 0, 0), (0, 128, 0), (128, 128, 0),
    (0, 0, 128), (128, 0, 128), (0, 128, 128), (192, 192, 192),
    (128, 128, 128), (255, 0, 0), (0, 255, 0), (255, 255, 0),
    (0, 0, 255), (255, 0, 255), (0, 255, 255), (255, 255, 255),
]
BLACK, NAVY, SILVER, GREY, BLUE, WHITE = 0, 4, 7, 8, 12, 15
SIZE = 32

# A letter M, 12 wide and 14 high.
LETTER_M = [
    "XX........XX",
    "XXX......XXX",
    "XXXX....XXXX",
    "XX.XX..XX.XX",
    "XX..XXXX..XX",
    "XX...XX...XX",
    "XX........XX",
    "XX........XX",
    "XX........XX",
    "XX........XX",
    "XX........XX",
    "XX........XX",
    "XX........XX",
    "XX........XX",
]


def draw(frame, fill, letter):
    """Rows from the top: a framed square with the letter M in its middle."""
    rows = [[fill] * SIZE for _ in range(SIZE)]
    for i in range(SIZE):
        for edge in (0, 1, SIZE - 2, SIZE - 1):
            rows[i][edge] = frame
            rows[edge][i] = frame
    top, left = (SIZE - len(LETTER_M)) // 2, (SIZE - len(LETTER_M[0])) // 2
    for y, line in enumerate(LETTER_M):
        for x, mark in enumerate(line):
            if mark == "X":
                rows[top + y][left + x] = letter
    return rows


def bitmap(rows):
    """A bottom-up 4-bit BMP file of the rows."""
    pixels = bytearray()
    for row in reversed(rows):
        for x in range(0, SIZE, 2):
            pixels.append(row[x] << 4 | row[x + 1])
    palette = b"".join(struct.pack("<BBBB", b, g, r, 0) for (r, g, b) in PALETTE)
    offset = 14 + 40 + len(palette)
    header = struct.pack("<2sIHHI", b"BM", offset + len(pixels), 0, 0, offset)
    info = struct.pack("<IiiHHIIiiII", 40, SIZE, SIZE, 1, 4, 0, len(pixels), 2835, 2835, 16, 0)
    return header + info + palette + bytes(pixels)


def main():
    here = Path(__file__).resolve().parent
    (here / "object.bmp").write_bytes(bitmap(draw(NAVY, WHITE, BLUE)))
    (here / "object_small.bmp").write_bytes(bitmap(draw(GREY, SILVER, BLACK)))


if __name__ == "__main__":
    main()
