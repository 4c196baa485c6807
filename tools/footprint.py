#!/usr/bin/env python3
"""footprint.py IMAGE COUNTS [--check] [--write PAGE] - tables of what the device's library takes.

IMAGE is the library for Windows CE, COUNTS what device_footprint has printed. The tables go to the
standard output; with --write they replace those between the two markers in PAGE, a Markdown file.
With --check the status is 0 only when every bar holds.
"""

import argparse
import pathlib
import struct
import sys
from typing import NamedTuple

IMAGE_BAR = 128 * 1024  # bytes; must be smaller
INTERACTION_BAR = 10_000_000  # instructions
INTERACTION_POINTS = 1000  # with more points the bar does not count
INSTRUCTIONS_A_MILLISECOND = 200_000

BEGIN = "<!-- footprint: begin; made by ./bench --device --write -->"
END = "<!-- footprint: end -->"


class Section(NamedTuple):
    name: str
    size: int  # in memory
    file_size: int


class Creation(NamedTuple):
    name: str
    heap: int
    objects: int
    heap_left: int
    objects_left: int


class Interaction(NamedTuple):
    name: str
    points: int  # 0: none
    instructions: int
    soft_float: int
    calls: int
    alike: bool

    @property
    def milliseconds(self):
        return self.instructions / INSTRUCTIONS_A_MILLISECOND

    @property
    def share(self):
        """Of soft floating point, in percent."""
        return 100 * self.soft_float / self.instructions


class Footprint:
    """What was counted, and the image's sizes."""

    def __init__(self, image, counts):
        self.image_size = len(image)
        self.sections = sections_of(image)
        self.creations, self.interactions = [], []
        self.stack = self.speed = None
        for line in counts.splitlines():
            kind, *fields = line.split("\t")
            if not fields:
                continue  # one of Wine's own processes has said something
            if kind == "creation":
                self.creations.append(Creation(fields[0], *map(int, fields[1:])))
            elif kind == "interaction":
                name, *numbers, runs = fields
                self.interactions.append(Interaction(name, *map(int, numbers), runs == "alike"))
            elif kind == "stack":
                self.stack = int(fields[0])
            elif kind == "speed":
                self.speed = int(fields[0])
            else:
                raise ValueError(f"not a line of device_footprint: {line!r}")
        if self.speed is None:
            raise ValueError("device_footprint did not come to its end")

    def missed_bars(self):
        """Sentences."""
        missed = []
        if self.image_size >= IMAGE_BAR:
            missed.append(f"the library has {self.image_size:,} bytes, not below {IMAGE_BAR:,}")
        for one in self.interactions:
            if one.points <= INTERACTION_POINTS and one.instructions > INTERACTION_BAR:
                missed.append(f"{one.name}, {one.points:,} points: {one.instructions:,} "
                              f"instructions, above {INTERACTION_BAR:,}")
        return missed


def sections_of(image):
    header = struct.unpack_from("<I", image, 0x3C)[0]
    count, = struct.unpack_from("<H", image, header + 6)
    table = header + 24 + struct.unpack_from("<H", image, header + 20)[0]
    found = []
    for at in range(table, table + 40 * count, 40):
        name, size, _, file_size = struct.unpack_from("<8sIII", image, at)
        found.append(Section(name.rstrip(b"\0").decode(), size, file_size))
    return found


# ---- Tables --------------------------------------------------------------------------------------


def table(heading, rows):
    """Markdown; all columns but the first are numbers."""
    yield f"| {' | '.join(heading)} |"
    yield "|---" + "|---:" * (len(heading) - 1) + "|"
    for row in rows:
        yield f"| {' | '.join(row)} |"
    yield ""


def size_table(footprint):
    rows = [(f"`{each.name}`", f"{each.size:,}", f"{each.file_size:,}")
            for each in footprint.sections]
    memory = sum(each.size for each in footprint.sections)
    rows.append(("all", f"{memory:,}", f"{footprint.image_size:,} with headers"))
    return table(("section", "bytes in memory", "bytes in the file"), rows)


def creation_table(footprint):
    return table(("created", "heap bytes", "GDI objects", "heap bytes left", "GDI objects left"),
                 [(each.name, *(f"{number:,}" for number in each[1:]))
                  for each in footprint.creations])


def plain_table(footprint):
    return table(("grid, strips, function bar, lists", "instructions", "soft float",
                  "platform calls", "ms"),
                 [(each.name, f"{each.instructions:,}", f"{each.share:.0f} %", f"{each.calls:,}",
                   f"{each.milliseconds:.2f}")
                  for each in footprint.interactions if not each.points])


def chart_table(footprint, title, figure):
    """A row for each interaction, a column for each number of points."""
    of_charts = [each for each in footprint.interactions if each.points]
    points = sorted({each.points for each in of_charts})
    cells = {(each.name, each.points): figure(each) for each in of_charts}
    names = dict.fromkeys(each.name for each in of_charts)
    return table((title, *(f"{number:,}" for number in points)),
                 [(name, *(cells[name, number] for number in points)) for name in names])


def tables(footprint):
    yield from size_table(footprint)
    yield from creation_table(footprint)
    yield from plain_table(footprint)
    yield from chart_table(footprint, "chart: instructions, by points",
                           lambda each: f"{each.instructions:,}")
    yield from chart_table(footprint, "chart: milliseconds, by points",
                           lambda each: f"{each.milliseconds:.2f}")
    yield from chart_table(footprint, "chart: soft float, by points",
                           lambda each: f"{each.share:.0f} %")
    yield from chart_table(footprint, "chart: platform calls, by points",
                           lambda each: f"{each.calls:,}")
    varying = [each for each in footprint.interactions if not each.alike]
    if varying:
        names = ", ".join(f"{each.name} ({each.points:,} points)" for each in varying)
        yield f"Not the same in all runs, the smallest is given: {names}."
    else:
        yield "All runs of an interaction gave the same counts."
    yield f"The deepest stack in all of this was {footprint.stack:,} bytes."


def replace_tables(page, lines):
    """The page's text with these lines between its markers."""
    before, begin, rest = page.partition(BEGIN)
    _, end, after = rest.partition(END)
    if not begin or not end:
        raise ValueError(f"the markers are missing: {BEGIN} and {END}")
    return f"{before}{BEGIN}\n\n" + "\n".join(lines) + f"\n\n{END}{after}"


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("image", type=pathlib.Path)
    parser.add_argument("counts", type=pathlib.Path)
    parser.add_argument("--check", action="store_true")
    parser.add_argument("--write", type=pathlib.Path, metavar="PAGE")
    arguments = parser.parse_args()
    footprint = Footprint(arguments.image.read_bytes(), arguments.counts.read_text())
    lines = list(tables(footprint))
    print("\n".join(lines))
    print(f"\n{footprint.speed} million instructions were interpreted in a second.")
    if arguments.write:
        page = arguments.write.read_text(encoding="utf-8")
        arguments.write.write_text(replace_tables(page, lines), encoding="utf-8")
        print(f"wrote {arguments.write}")
    missed = footprint.missed_bars()
    print("\n".join(f"MISSED: {each}" for each in missed) or "every bar holds")
    return 1 if arguments.check and missed else 0


if __name__ == "__main__":
    sys.exit(main())
