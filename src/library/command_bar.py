#!/usr/bin/env python3
"""command_bar.py - writes command_bar.bmp, the three button images of a chart's command bar.

The toolbar puts the colours of buttons in place of black, dark grey, light grey and white; the last
row stays empty for bars whose images are 15 pixels high."""

import pathlib
import struct

LETTERS = "KrgybmcSGRNYBMCW"  # in the order of PALETTE; "." is light grey, the button's face
PALETTE = [
    (0, 0, 0), (128, 0, 0), (0, 128, 0), (128, 128, 0),
    (0, 0, 128), (128, 0, 128), (0, 128, 128), (192, 192, 192),
    (128, 128, 128), (255, 0, 0), (0, 255, 0), (255, 255, 0),
    (0, 0, 255), (255, 0, 255), (0, 255, 255), (255, 255, 255),
]

SHOW_CHART = """
................
..K.............
..K.........BBb.
..K.........BBb.
..K.........BBb.
..K.....YYy.BBb.
..K.....YYy.BBb.
..K.....YYy.BBb.
..K.RRr.YYy.BBb.
..K.RRr.YYy.BBb.
..K.RRr.YYy.BBb.
..K.RRr.YYy.BBb.
..K.RRr.YYy.BBb.
.KKKKKKKKKKKKKK.
..K.............
................
"""

PROPERTIES = """
................
.KKKKKKK........
.KWWWWWK........
.KWWWWWKKKKKKKK.
.KWWWWWWWWWWWWK.
.KWWWWWBWWWWWWK.
.KWBWWBBWGGGGWK.
.KWBBBBWWWWWWWK.
.KWWBBWWWWWWWWK.
.KWWWWWBWWWWWWK.
.KWBWWBBWGGGGWK.
.KWBBBBWWWWWWWK.
.KWWBBWWWWWWWWK.
.KWWWWWWWWWWWWK.
.KKKKKKKKKKKKKK.
................
"""

LEGEND = """
................
................
.KKKKKKKKKKKKK..
.KWWWWWWWWWWWKG.
.KWRRRWWWWWWWKG.
.KWRRRWGGGGGWKG.
.KWWWWWWWWWWWKG.
.KWYYYWWWWWWWKG.
.KWYYYWGGGGGWKG.
.KWWWWWWWWWWWKG.
.KWBBBWWWWWWWKG.
.KWBBBWGGGGGWKG.
.KWWWWWWWWWWWKG.
.KKKKKKKKKKKKKG.
..GGGGGGGGGGGGG.
................
"""


def rows_of(*images):
    """The images side by side, as lists of palette indexes from the top."""
    for parts in zip(*(image.split() for image in images), strict=True):
        yield [LETTERS.index("S" if letter == "." else letter) for letter in "".join(parts)]


def bitmap(rows):
    """A BMP file of 4 bits per pixel: its rows run from the bottom, a byte holds two pixels."""
    width, height = len(rows[0]), len(rows)
    bits = b"".join(
        bytes(left << 4 | right for left, right in zip(row[::2], row[1::2]))
        for row in reversed(rows))
    table = b"".join(struct.pack("<4B", blue, green, red, 0) for red, green, blue in PALETTE)
    start = 14 + 40 + len(table)
    return (struct.pack("<2sIHHI", b"BM", start + len(bits), 0, 0, start)
            + struct.pack("<IiiHHIIiiII", 40, width, height, 1, 4, 0, len(bits), 0, 0, 0, 0)
            + table + bits)


if __name__ == "__main__":
    target = pathlib.Path(__file__).with_name("command_bar.bmp")
    target.write_bytes(bitmap(list(rows_of(SHOW_CHART, PROPERTIES, LEGEND))))
