"""Charts printed through the real print dialog and printer driver, down to the ink on the paper.

The printer writes PostScript; Ghostscript makes it a picture at the printer's own resolution, so
that a pixel of the printable area is a pixel of the chart.
"""

import contextlib
import fcntl
import math
import re
import subprocess
from types import SimpleNamespace

import pytest

from desktop import ROOT, WINE_RUN
from picture import Picture
from workbook_app import windows_path

DOTS = 300
EDGE = 150  # half an inch that cannot be printed, as printer.ppd has it
WIDTH, HEIGHT = 2250, 3000
MARGIN = 15  # of a chart without titles and labels

LINE, AREA, BAR, COLUMN, PIE = range(5)
WHITE, BLACK = (255, 255, 255), (0, 0, 0)
GREEN, BLUE, RED, YELLOW = (0, 255, 0), (0, 0, 255), (255, 0, 0), (255, 255, 0)
GRID = (0, 150, 150)
WHEAT, RYE = (1, 2, 3, 4), (4, 4, 2, 2)  # as printing_host.cpp has them


@contextlib.contextmanager
def one_at_a_time():
    """A Wine prefix has one default printer, and several machines' tests may run in it at once."""
    with open(ROOT / "build" / "printing.lock", "w", encoding="utf-8") as lock:
        fcntl.flock(lock, fcntl.LOCK_EX)
        yield


def run_host(program, folder):
    """What printing_host said, and the folder with its files."""
    with one_at_a_time():
        ran = subprocess.run(
            [WINE_RUN, program]
            + [windows_path(ROOT / "tests" / "e2e" / "printer.ppd"), windows_path(folder)],
            capture_output=True,
            text=True,
            timeout=120,
            check=False,
        )
    assert ran.returncode == 0, ran.stdout + ran.stderr
    # Whatever Wine has to say comes the same way.
    own = re.compile(r"available |(full|plain)[0-4] dialog |cancelled dialog ")
    return SimpleNamespace(folder=folder, lines=list(filter(own.match, ran.stdout.splitlines())))


@pytest.fixture(scope="session")
def prints(programs, tmp_path_factory):
    return run_host(programs / "printing_host.exe", tmp_path_factory.mktemp("prints"))


@pytest.fixture(scope="session")
def paper(prints):
    """paper("plain", LINE) is the printable area of that page."""
    return lambda kind, chart_type: printable_area(prints.folder / f"{kind}{chart_type}.ps")


def printable_area(file):
    drawn = subprocess.run(
        ["gs", "-q", "-dNOPAUSE", "-dBATCH", "-dSAFER", "-sDEVICE=ppmraw", f"-r{DOTS}"]
        + ["-sOutputFile=-", str(file)],
        capture_output=True,
        timeout=120,
        check=True,
    ).stdout
    lines = [line for line in drawn[:200].split(b"\n") if not line.startswith(b"#")]
    assert lines[0] == b"P6"
    width, height = map(int, lines[1].split())
    sheet = Picture(width, height, drawn[-3 * width * height :])
    assert (width, height) == (WIDTH + 2 * EDGE, HEIGHT + 2 * EDGE)
    return sheet.crop((EDGE, EDGE, EDGE + WIDTH, EDGE + HEIGHT))


def colours(picture, points):
    return [picture.pixel(round(x), round(y)) for x, y in points]


def ink(picture, rect, colour=BLACK):
    """The bounds of a colour's pixels in a rectangle, in the picture's coordinates, or None."""
    left, top, _, _ = rect
    part = picture.crop(rect)
    xs, ys = [], []
    for at in range(0, len(part.pixels), 3):
        if tuple(part.pixels[at : at + 3]) == colour:
            xs.append(left + at // 3 % part.width)
            ys.append(top + at // 3 // part.width)
    return (min(xs), min(ys), max(xs) + 1, max(ys) + 1) if xs else None


def across(value, high):
    """The column of a value on the x axis of a plain chart that shows 0 to `high`."""
    return MARGIN + value / high * (WIDTH - 2 * MARGIN)


def upwards(value, high):
    """The row of a value on its y axis."""
    return MARGIN + (high - value) / high * (HEIGHT - 2 * MARGIN)


def data_points(values):
    return [(across(number, 5), upwards(value, 4)) for number, value in enumerate(values, 1)]


# ---- The dialog and the job ----------------------------------------------------------------------


def test_the_dialog_was_answered_and_the_window_is_left_disabled(prints):
    kinds = [f"{kind}{chart_type}" for kind in ("full", "plain") for chart_type in range(5)]
    assert prints.lines == (
        ["available 1"]
        + [f'{kind} dialog "Print" window-enabled 0' for kind in kinds]
        + ['cancelled dialog "Print" window-enabled 1']
    )


def test_a_cancelled_dialog_prints_nothing(prints):
    assert not (prints.folder / "cancelled.ps").exists()


def test_without_the_companion_modules_there_is_no_printing(alone_with_library, tmp_path):
    prints = run_host(alone_with_library("printing_host.exe"), tmp_path)
    assert prints.lines[0] == "available 0"
    assert len(prints.lines) == 12
    assert all(line.endswith(' dialog "" window-enabled 1') for line in prints.lines[1:])
    assert not list(tmp_path.glob("*.ps"))


@pytest.mark.parametrize("chart_type", range(5))
def test_each_chart_is_a_document_of_one_page_named_graph(prints, chart_type):
    lines = (prints.folder / f"full{chart_type}.ps").read_text("latin-1").splitlines()
    assert lines[0].startswith("%!PS-Adobe-")
    assert "%%Title: Graph" in lines
    assert [line for line in lines if line.startswith("%%Page: ")] == ["%%Page: 1 1"]
    assert "%%Pages: 1" in lines
    assert lines[-1] == "%%EOF"


# ---- Shapes, on charts whose margins are known --------------------------------------------------


def test_line(paper):
    page = paper("plain", LINE)
    assert colours(page, data_points(WHEAT)[:3]) == [GREEN] * 3
    assert colours(page, data_points(RYE)[2:]) == [BLUE] * 2
    # The marker of the second point has its four pixels radius, small as it is on paper.
    x, y = map(round, data_points(WHEAT)[1])
    _, top, _, bottom = ink(page, (x - 3, y - 20, x + 4, y + 20), GREEN)
    assert 7 <= bottom - top <= 22, "a circle of 8 pixels and the line through it"
    assert ink(page, (x - 40, y - 5, x - 12, y + 5), GREEN) is None
    # Between two points there is the line.
    x, y = (across(1.5, 5), upwards(1.5, 4))
    assert ink(page, (round(x) - 4, round(y) - 4, round(x) + 4, round(y) + 4), GREEN)
    # The axes, two pixels wide, at the left and the bottom of the plot.
    assert page.pixel(MARGIN, 1500) == BLACK
    assert page.pixel(1000, HEIGHT - MARGIN) == BLACK
    assert page.pixel(MARGIN + 4, 1500) == WHITE


def test_area(paper):
    page = paper("plain", AREA)
    inside_wheat = [(across(x, 5), upwards(y, 4)) for x, y in ((1.5, 0.7), (2, 1), (3.5, 3))]
    above_wheat = [(across(x, 5), upwards(y, 4)) for x, y in ((1.5, 3), (2, 3.5))]
    outside = [(across(x, 5), upwards(y, 4)) for x, y in ((3.5, 3.8), (0.5, 1), (4.5, 1))]
    assert colours(page, inside_wheat) == [GREEN] * 3
    assert colours(page, above_wheat) == [BLUE] * 2
    assert colours(page, outside) == [WHITE] * 3


def test_columns(paper):
    page = paper("plain", COLUMN)
    width = (WIDTH - 2 * MARGIN) / 5 / 2
    for values, colour, middle in ((WHEAT, GREEN, -width / 2), (RYE, BLUE, width / 2)):
        for x, y in data_points(values):
            column = [(x + middle, y + 20), (x + middle + width / 2 - 6, HEIGHT - MARGIN - 6)]
            assert colours(page, column) == [colour] * 2
            if y > MARGIN:
                assert page.pixel(round(x + middle), round(y) - 6) == WHITE


def test_bars(paper):
    page = paper("plain", BAR)
    thickness = (HEIGHT - 2 * MARGIN) / 5 / 2
    for values, colour, middle in ((WHEAT, GREEN, thickness / 2), (RYE, BLUE, -thickness / 2)):
        for number, value in enumerate(values, 1):
            x, y = across(value, 4), upwards(number, 5) + middle
            assert colours(page, [(x - 6, y), (MARGIN + 6, y)]) == [colour] * 2
            if value < 4:
                assert page.pixel(round(x) + 6, round(y)) == WHITE


def test_pie(paper):
    page = paper("plain", PIE)
    radius = WIDTH / 2 - 4
    start = 0
    for value, colour in zip(WHEAT, (RED, GREEN, BLUE, YELLOW)):
        middle = math.radians(start + 18 * value)  # of the 36 degrees that one ton has
        start += 36 * value
        for distance, expected in ((0.1, colour), (0.6, colour), (0.99, colour), (1.004, WHITE)):
            x = WIDTH / 2 - distance * radius * math.sin(middle)
            y = HEIGHT / 2 - distance * radius * math.cos(middle)
            assert page.pixel(round(x), round(y)) == expected, (value, distance)
    assert page.pixel(WIDTH // 2, 200) == WHITE, "centred in the page's height"


# ---- Texts --------------------------------------------------------------------------------------


@pytest.mark.parametrize("chart_type", range(5))
def test_titles_have_ten_points_at_the_printers_resolution(paper, chart_type):
    left, top, right, bottom = ink(paper("full", chart_type), (300, 0, 1950, 44))
    assert 25 <= bottom - top <= 41, "10 points are 41 pixels, most of which a capital has"
    assert bottom <= 42, "whole above the frame"
    assert abs((left + right) / 2 - WIDTH / 2) < 15, "centred on the page"
    assert right - left > 300


def test_labels_and_the_axis_title_stand_below_the_plot(paper):
    page = paper("full", COLUMN)
    _, label_top, _, label_bottom = ink(page, (300, 2920, 2240, 2952))
    _, title_top, _, title_bottom = ink(page, (900, 2958, 1400, HEIGHT))
    assert label_bottom - label_top > 15
    assert title_bottom - title_top > 15
    numbers = ink(page, (0, 400, 80, 2800))
    assert numbers is not None, "numbers left of the y axis"


def test_the_frame_reaches_the_margins_and_no_further(paper):
    page = paper("full", LINE)
    left, _, right, _ = ink(page, (0, 1300, WIDTH, 1600), GRID)
    assert WIDTH - MARGIN - 2 <= right <= WIDTH - MARGIN + 2
    assert 60 < left < 140, "room for a number of the printer's size"


def test_percentages_stand_around_the_pie(paper):
    page = paper("full", PIE)
    plain = paper("plain", PIE)
    assert ink(plain, (0, 0, WIDTH, 300)) is None
    # "40%" right of the largest slice, where the circle has already turned away.
    label = ink(page, (2125, 1100, WIDTH, 1200))
    assert label is not None and 20 <= label[3] - label[1] <= 41
