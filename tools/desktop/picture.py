"""Screen pictures: taking one from an X window dump, cutting, enlarging, comparing, writing PNG."""

import struct
import zlib


class Picture:
    """Pixels as one bytes object of red, green and blue, row by row from the top."""

    def __init__(self, width, height, pixels):
        self.width, self.height, self.pixels = width, height, pixels

    @classmethod
    def from_xwd(cls, dump):
        """`dump`: an X window dump with 32 bits per pixel, as Xvfb keeps its screen in a file."""
        header = struct.unpack(">25I", dump[:100])
        size, width, height, bits, stride, colours = (header[i] for i in (0, 4, 5, 11, 12, 19))
        assert bits == 32, f"{bits} bits per pixel"
        start = size + 12 * colours
        rows = bytearray(3 * width * height)
        blue_first = header[7] == 0  # the lowest byte comes first
        for y in range(height):
            row = dump[start + y * stride : start + y * stride + 4 * width]
            at = slice(3 * width * y, 3 * width * (y + 1))
            target = bytearray(3 * width)
            for channel in range(3):
                target[channel::3] = row[2 - channel if blue_first else 1 + channel :: 4]
            rows[at] = target
        return cls(width, height, bytes(rows))

    def pixel(self, x, y):
        at = 3 * (y * self.width + x)
        return tuple(self.pixels[at : at + 3])

    def crop(self, rect):
        """`rect`: left, top, right, bottom; right and bottom are exclusive."""
        left, top, right, bottom = rect
        rows = [
            self.pixels[3 * (y * self.width + left) : 3 * (y * self.width + right)]
            for y in range(top, bottom)
        ]
        return Picture(right - left, bottom - top, b"".join(rows))

    def enlarge(self, times):
        """Each pixel becomes a square of `times` by `times`."""
        rows = []
        for y in range(self.height):
            row = self.pixels[3 * self.width * y : 3 * self.width * (y + 1)]
            wide = b"".join(row[x : x + 3] * times for x in range(0, len(row), 3))
            rows.append(wide * times)
        return Picture(self.width * times, self.height * times, b"".join(rows))

    def inverted(self):
        return Picture(self.width, self.height, bytes(255 - value for value in self.pixels))

    def difference(self, other):
        """The rectangle outside which both show the same, or None when all is the same."""
        different = [
            (at // 3 % self.width, at // 3 // self.width)
            for at in range(0, len(self.pixels), 3)
            if self.pixels[at : at + 3] != other.pixels[at : at + 3]
        ]
        if not different:
            return None
        columns, rows = zip(*different)
        return min(columns), min(rows), max(columns) + 1, max(rows) + 1

    def colours(self):
        """How often each colour occurs."""
        counts = {}
        for at in range(0, len(self.pixels), 3):
            colour = tuple(self.pixels[at : at + 3])
            counts[colour] = counts.get(colour, 0) + 1
        return counts

    def __eq__(self, other):
        return (self.width, self.height, self.pixels) == (other.width, other.height, other.pixels)

    def __repr__(self):
        return f"<{self.width} x {self.height} pixels, checksum {zlib.crc32(self.pixels):08x}>"

    def write_png(self, path):
        def chunk(name, data):
            checksum = zlib.crc32(name + data)
            return struct.pack(">I", len(data)) + name + data + struct.pack(">I", checksum)

        stride = 3 * self.width
        rows = b"".join(
            b"\0" + self.pixels[stride * y : stride * (y + 1)] for y in range(self.height)
        )
        size = struct.pack(">IIBBBBB", self.width, self.height, 8, 2, 0, 0, 0)
        with open(path, "wb") as file:
            file.write(b"\x89PNG\r\n\x1a\n")
            file.write(chunk(b"IHDR", size))
            file.write(chunk(b"IDAT", zlib.compress(rows, 9)))
            file.write(chunk(b"IEND", b""))
