#!/usr/bin/env python3
"""structure.py [--check] - draws the rooms of src/ and what includes what: docs/images/structure.svg.

Rooms are folders. An include runs from a higher room to a lower one, never back, and what only
reckons (RULES) reaches neither the platform's headers nor a control's record. --check says what is
not so, and whether the drawing is an old one; its status is 0 when all is well.
"""
import html
import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parents[1]
PICTURE = "docs/images/structure.svg"
INCLUDE = re.compile(r'^\s*#\s*include\s*([<"])([^>"]+)[>"]', re.M)

# From the lowest to the highest. A room includes itself and what stands on lines above its own.
FLOORS = [
    ["numbers"],
    ["platform"],
    ["base"],
    ["zoom", "platform/ce", "platform/desktop", "graph/scale"],
    ["text", "graph/shapes"],
    ["header", "funkybar", "listhelpers", "graph/data"],
    ["grid", "graph/drawing"],
    ["graph/children", "graph/output", "graph/tools"],
    ["graph"],
    ["library"],
]

# What only reckons: whole rooms, and single files by their names without the ending.
RULES = [
    "numbers/", "graph/scale/", "graph/shapes/", "grid/block", "grid/geometry", "grid/moves",
    "header/hit_test", "funkybar/layout", "zoom/zoom", "platform/number_text.h",
    "base/assert",
]  # fmt: skip


def is_rule(file):
    return any(file.startswith(rule) if rule.endswith(("/", ".h")) else file.rsplit(".", 1)[0] == rule
               for rule in RULES)  # fmt: skip


def room_of(file):
    folder = file.rpartition("/")[0]
    return folder.removesuffix("/companions")


def read_includes(src):
    """{file: [file or <header>]}, by paths below src/."""
    files = sorted(p for p in src.rglob("*") if p.suffix in (".h", ".cpp"))
    return {
        path.relative_to(src).as_posix(): [
            name if mark == '"' else f"<{name}>"
            for mark, name in INCLUDE.findall(path.read_text(encoding="utf-8"))
        ]
        for path in files
    }


def problems(includes):
    """A line for each include that should not be."""
    floor = {room: number for number, rooms in enumerate(FLOORS) for room in rooms}
    found = []
    for file, names in includes.items():
        room = room_of(file)
        if room not in floor:
            found.append(f"{file}: {room or 'src'} is no room that {pathlib.Path(__file__).name} knows")
            continue
        for name in names:
            own = not name.startswith("<")
            if own and name not in includes:
                found.append(f"{file}: there is no {name}")
            elif own and room_of(name) != room and not floor.get(room_of(name), 99) < floor[room]:
                found.append(f"{file}: {name} is not below {room}")
            if is_rule(file) and (not is_rule(name) if own else not is_standard(name)):
                found.append(f"{file}: only reckons, and includes {name}")
    return found


def is_standard(name):
    """<cmath> and <string.h>, but not <windows.h> or <korcontrols/grid.h>."""
    return "/" not in name and name not in ("<windows.h>", "<commctrl.h>")


def arrows(includes):
    """{(room, room): number of includes}"""
    found = {}
    for file, names in includes.items():
        for name in names:
            pair = room_of(file), room_of(name)
            if not name.startswith("<") and pair[0] != pair[1]:
                found[pair] = found.get(pair, 0) + 1
    return found


# ---- The drawing -----------------------------------------------------------------------------------

WIDTH, BOX_WIDTH, BOX_HEIGHT, FLOOR_HEIGHT, MARGIN = 860, 150, 40, 84, 24


def places():
    """{room: (x, y) of its box's middle}; the highest floor is at the top."""
    found = {}
    for number, rooms in enumerate(reversed(FLOORS)):
        step = (WIDTH - 2 * MARGIN) / len(rooms)
        for index, room in enumerate(rooms):
            x = MARGIN + step * (index + 0.5)
            found[room] = round(x), MARGIN + BOX_HEIGHT // 2 + number * FLOOR_HEIGHT
    return found


def draw(includes):
    """The picture as a text."""
    at = places()
    height = 2 * MARGIN + BOX_HEIGHT + (len(FLOORS) - 1) * FLOOR_HEIGHT
    lines = [
        f'<svg xmlns="http://www.w3.org/2000/svg" width="{WIDTH}" height="{height}" '
        f'viewBox="0 0 {WIDTH} {height}" font-family="sans-serif" font-size="13">',
        '<title>The rooms of src/: each includes those that its lines lead down to</title>',
        f'<rect width="{WIDTH}" height="{height}" fill="white"/>',
    ]
    for (upper, lower), count in sorted(arrows(includes).items()):
        (x1, y1), (x2, y2) = at[upper], at[lower]
        y1, y2 = y1 + BOX_HEIGHT // 2, y2 - BOX_HEIGHT // 2
        bend = (y2 - y1) // 2
        width = min(1 + count / 8, 4)
        opacity = 0.25 if lower in ("base", "platform", "numbers") else 0.8  # everybody's
        lines.append(
            f'<path d="M{x1} {y1} C{x1} {y1 + bend} {x2} {y2 - bend} {x2} {y2}" fill="none" '
            f'stroke="#8a94a6" stroke-width="{width:g}" opacity="{opacity:g}">'
            f"<title>{upper} includes {lower}: {count}</title></path>"
        )
    for room, (x, y) in at.items():
        files = [file for file in includes if room_of(file) == room]
        pure = sum(map(is_rule, files))
        fill = "#dceedd" if files and pure == len(files) else "#eef2f8"
        label = html.escape(room)
        lines += [
            f'<rect x="{x - BOX_WIDTH // 2}" y="{y - BOX_HEIGHT // 2}" width="{BOX_WIDTH}" '
            f'height="{BOX_HEIGHT}" rx="5" fill="{fill}" stroke="#4a5568"/>',
            f'<text x="{x}" y="{y - 2}" text-anchor="middle">{label}</text>',
            f'<text x="{x}" y="{y + 13}" text-anchor="middle" font-size="10" fill="#4a5568">'
            f"{len(files)} files{f', {pure} of rules' if 0 < pure < len(files) else ''}</text>",
        ]
    return "\n".join(lines + ["</svg>", ""])


def main():
    includes = read_includes(ROOT / "src")
    picture = ROOT / PICTURE
    if "--check" not in sys.argv[1:]:
        picture.write_text(draw(includes), encoding="utf-8")
        print(f"wrote {PICTURE}")
    found = problems(includes)
    if not picture.is_file() or picture.read_text(encoding="utf-8") != draw(includes):
        found.append(f"{PICTURE} is not that of these files: tools/structure.py draws it")
    print("\n".join(found) if found else "every include runs downwards")
    sys.exit(bool(found))


if __name__ == "__main__":
    main()
