#!/usr/bin/env python3
"""plot_curve.py - draws the time of a redraw by the number of points.

Reads what `graph_benchmark --curve` prints (a heading, then rows of a number of points and the
microseconds of each way) from standard input and writes an SVG picture to standard output. Both
axes are logarithmic: what grows with the points runs parallel to the dashed line.
"""

import csv
import math
import sys

WIDTH, HEIGHT = 720, 440
LEFT, TOP, RIGHT, BOTTOM = 80, 50, 130, 60  # margins
COLOURS = {
    "pass": "#666666",
    "line": "#1f5fbf",
    "area": "#c2571a",
    "bar": "#7a3e9d",
    "column": "#1d7f4b",
}
LABEL_GAP = 15  # pixels between the names at the right


def read_rows(stream):
    """The numbers of points, and each way's times in microseconds."""
    rows = list(csv.DictReader(stream))
    points = [int(row.pop("points")) for row in rows]
    return points, {way: [float(row[way]) for row in rows] for way in rows[0]}


def time_text(microseconds):
    for unit, size in (("s", 1e6), ("ms", 1e3), ("µs", 1)):
        if microseconds >= size:
            return f"{microseconds / size:g} {unit}"
    return f"{microseconds * 1000:g} ns"


class Scale:
    """One logarithmic axis: a value's place between two pixels."""

    def __init__(self, low, high, low_pixel, high_pixel):
        self.low = math.floor(math.log10(low))
        self.high = math.ceil(math.log10(high))
        self.low_pixel = low_pixel
        self.high_pixel = high_pixel

    def __call__(self, value):
        share = (math.log10(value) - self.low) / (self.high - self.low)
        return self.low_pixel + share * (self.high_pixel - self.low_pixel)

    def decades(self):
        return [10.0**exponent for exponent in range(self.low, self.high + 1)]


def text(x, y, content, **attributes):
    written = "".join(f' {name.replace("_", "-")}="{value}"' for name, value in attributes.items())
    return f'<text x="{x:.1f}" y="{y:.1f}"{written}>{content}</text>'


def draw_axes(x, y):
    left, right, bottom, top = LEFT, WIDTH - RIGHT, HEIGHT - BOTTOM, TOP
    for value in x.decades():
        yield f'<path d="M{x(value):.1f} {top}V{bottom}" class="grid"/>'
        yield text(x(value), bottom + 18, f"{value:,.0f}", text_anchor="middle")
    for value in y.decades():
        yield f'<path d="M{left} {y(value):.1f}H{right}" class="grid"/>'
        yield text(left - 8, y(value) + 4, time_text(value), text_anchor="end")
    yield f'<path d="M{left} {top}V{bottom}H{right}" class="axis"/>'
    yield text((left + right) / 2, HEIGHT - 16, "points of one series", text_anchor="middle")


def label_places(ends):
    """Where the names stand beside the lines' ends: below one another, as near as there is room."""
    places = {}
    lowest = -math.inf
    for way, end in sorted(ends.items(), key=lambda item: item[1]):
        lowest = max(end + 4, lowest + LABEL_GAP)
        places[way] = lowest
    return places


def draw_lines(points, times, x, y):
    for way, values in times.items():
        path = "L".join(f"{x(count):.1f} {y(time):.1f}" for count, time in zip(points, values))
        dashes = ' stroke-dasharray="6 4"' if way == "pass" else ""
        yield f'<path d="M{path}" stroke="{COLOURS[way]}" class="line"{dashes}/>'
    places = label_places({way: y(values[-1]) for way, values in times.items()})
    for way, place in places.items():
        yield text(WIDTH - RIGHT + 8, place, "one pass" if way == "pass" else way, fill=COLOURS[way])


def draw(points, times):
    every = [time for values in times.values() for time in values]
    x = Scale(min(points), max(points), LEFT, WIDTH - RIGHT)
    y = Scale(min(every), max(every), HEIGHT - BOTTOM, TOP)
    yield (
        f'<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 {WIDTH} {HEIGHT}" '
        f'width="{WIDTH}" height="{HEIGHT}" font-family="sans-serif" font-size="12" fill="#222">'
    )
    yield (
        "<style>.grid{stroke:#ddd}.axis{stroke:#222;fill:none}"
        ".line{fill:none;stroke-width:2}</style>"
    )
    yield f'<rect width="{WIDTH}" height="{HEIGHT}" fill="#fff"/>'
    title = "Time of a whole redraw at 320 x 240, beside one pass over the values"
    yield text(LEFT, 26, title, font_size=15)
    yield from draw_axes(x, y)
    yield from draw_lines(points, times, x, y)
    yield "</svg>"


def main():
    points, times = read_rows(sys.stdin)
    sys.stdout.reconfigure(encoding="utf-8")
    print("\n".join(draw(points, times)))


if __name__ == "__main__":
    main()
