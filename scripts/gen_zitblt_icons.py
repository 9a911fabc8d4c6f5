#!/usr/bin/env python3
"""Writes the ZitBlt button icons and the product-input display-status icons as 16 x 16
24-bit BMP files into resources/icons (run from anywhere; re-run after changing a design)."""
import os
import struct

SIZE = 16

# 5 x 7 glyphs, drawn twice as large (10 x 14) in the middle of the icon.
GLYPHS = {
    "I": ["11111", "00100", "00100", "00100", "00100", "00100", "11111"],
    "O": ["01110", "10001", "10001", "10001", "10001", "10001", "01110"],
    "R": ["11110", "10001", "10001", "11110", "10100", "10010", "10001"],
    "S": ["01111", "10000", "10000", "01110", "00001", "00001", "11110"],
}


def blank(color):
    return [[color for _ in range(SIZE)] for _ in range(SIZE)]


def border(pixels, color):
    for i in range(SIZE):
        pixels[0][i] = pixels[SIZE - 1][i] = pixels[i][0] = pixels[i][SIZE - 1] = color


def letter_icon(letter, background, ink=(255, 255, 255), edge=(40, 40, 40)):
    pixels = blank(background)
    border(pixels, edge)
    rows = GLYPHS[letter]
    top, left = 1, 3
    for r, row in enumerate(rows):
        for c, bit in enumerate(row):
            if bit == "1":
                for dy in range(2):
                    for dx in range(2):
                        pixels[top + 2 * r + dy][left + 2 * c + dx] = ink
    return pixels


def part_icon(fill):
    """A part (a box) fully drawn, outlined only, or half filled."""
    pixels = blank((255, 255, 255))
    solid, outline = (30, 140, 60), (120, 120, 120)
    for y in range(3, 13):
        for x in range(3, 13):
            on_edge = y in (3, 12) or x in (3, 12)
            if fill == "shown" or (fill == "partial" and x < 8):
                pixels[y][x] = solid
            elif on_edge:
                pixels[y][x] = outline
    if fill == "hidden":  # a diagonal stroke: not shown
        for i in range(2, 14):
            pixels[i][i] = (200, 40, 40)
    return pixels


def write_bmp(path, pixels):
    row_size = (SIZE * 3 + 3) & ~3
    data = bytearray()
    for row in reversed(pixels):  # BMP rows are stored bottom-up
        line = bytearray()
        for r, g, b in row:
            line += bytes((b, g, r))
        line += b"\0" * (row_size - len(line))
        data += line
    header = struct.pack("<2sIHHI", b"BM", 54 + len(data), 0, 0, 54)
    info = struct.pack("<IiiHHIIiiII", 40, SIZE, SIZE, 1, 24, 0, len(data), 2835, 2835, 0, 0)
    with open(path, "wb") as f:
        f.write(header + info + data)


def main():
    out = os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "resources", "icons")
    os.makedirs(out, exist_ok=True)
    icons = {
        "I_ZitBltProductInput": letter_icon("I", (40, 150, 70)),
        "I_ZitBltProductOutput": letter_icon("O", (40, 90, 190)),
        "I_ZitBltResource": letter_icon("R", (220, 120, 20)),
        "I_ZitBltStatusBar": letter_icon("S", (110, 110, 110)),
        "I_PODShownInputPart": part_icon("shown"),
        "I_PODHiddenInputPart": part_icon("hidden"),
        "I_PODPartiallyHiddenInputPart": part_icon("partial"),
    }
    for name, pixels in icons.items():
        write_bmp(os.path.join(out, name + ".bmp"), pixels)


if __name__ == "__main__":
    main()
