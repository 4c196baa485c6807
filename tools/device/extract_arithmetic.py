#!/usr/bin/env python3
"""extract_arithmetic.py OBJECT OUTPUT - writes the code of the arithmetic helpers, one section of an
object file in COFF, so that the stand-in can find it in the device's image and count what it costs."""

import struct
import sys

SECTION = b"arithmetic"


def sections(data):
    """(name, contents) of each section; long names stand in the string table."""
    count, symbols, symbol_count = struct.unpack_from("<H4xII", data, 2)
    strings = symbols + 18 * symbol_count
    (header_size,) = struct.unpack_from("<H", data, 16)
    for i in range(count):
        at = 20 + header_size + 40 * i
        name = data[at : at + 8].rstrip(b"\0")
        if name.startswith(b"/"):
            start = strings + int(name[1:])
            name = data[start : data.index(b"\0", start)]
        size, offset = struct.unpack_from("<II", data, at + 16)
        yield name, data[offset : offset + size]


def main():
    with open(sys.argv[1], "rb") as file:
        data = file.read()
    found = [contents for name, contents in sections(data) if SECTION in name]
    if len(found) != 1 or not found[0]:
        sys.exit(f"extract_arithmetic: {len(found)} sections of helpers in {sys.argv[1]}")
    with open(sys.argv[2], "wb") as file:
        file.write(found[0])


main()
