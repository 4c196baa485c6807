#!/usr/bin/env python3
"""tour.py PROGRAMS FILE.csv FOLDER - drives the workbook over a virtual display, taking pictures.

PROGRAMS is the folder with workbook.exe and window_probe.exe. Nothing is saved to FILE.csv.
"""

import contextlib
import csv
import pathlib
import sys

sys.dont_write_bytecode = True
ROOT = pathlib.Path(__file__).resolve().parents[1]
sys.path.insert(0, str(ROOT / "tests" / "e2e"))

from desktop import Desktop, wait_until  # noqa: E402
from probe import Probe  # noqa: E402
from workbook_app import Workbook, column_name, expect, windows_path  # noqa: E402


@contextlib.contextmanager
def opened(programs, file):
    """A running workbook with the file, ended without saving."""
    with Desktop(programs / "workbook.exe") as desktop:
        probe = Probe(desktop, programs / "window_probe.exe")
        workbook = Workbook(desktop, probe, programs / "workbook.exe", windows_path(file))
        try:
            yield workbook
            workbook.end_without_saving()
        finally:
            workbook.kill()
            probe.close()


def free_column(workbook, file):
    """The letters of the column after the file's last, or of the last one in view."""
    with open(file, newline="", encoding="utf-8", errors="replace") as lines:
        columns = max((len(row) for _, row in zip(range(100), csv.reader(lines))), default=0)
    return column_name(min(columns, workbook.view().last_whole_column()))


def zoom(workbook, key, percent):
    """Through the View menu; `key` is the underlined letter of the entry."""
    workbook.desktop.key("alt+v", "z", key)
    expect(lambda: workbook.view().zoom, f"{percent} %")


def chart_of(workbook):
    return workbook.view().main.find("KORVANE Corporation GraphControl")


def show_chart(workbook, first, last):
    """Selects a block and charts it."""
    workbook.drag_cells(first, last)
    expect(lambda: workbook.view().status.split()[0], f"{first}:{last}")
    workbook.desktop.key("ctrl+h")
    wait_until(lambda: chart_of(workbook), "the chart appears")


def steps(workbook, file):
    """Does one thing after the other, and yields what is to be seen then."""
    yield "opened"

    x, _, _, below, down = workbook.view().vertical_bar()
    workbook.desktop.click(x, below)
    workbook.desktop.click(x, down)
    expect(lambda: workbook.view().first_row > 1, True)
    yield "scrolled"

    workbook.desktop.key("ctrl+Home")
    expect(lambda: workbook.view().first_row, 0)
    workbook.drag_cells("B2", "B13")
    expect(lambda: workbook.view().status.split()[0], "B2:B13")
    yield "block-selected"

    cell = free_column(workbook, file) + "2"
    workbook.click_cell(cell)
    workbook.desktop.type("=AVERAGE(B2:B13)")
    expect(lambda: workbook.view().equation.text, "=AVERAGE(B2:B13)")
    yield "formula-being-typed"

    workbook.desktop.key("Return")
    expect(lambda: workbook.view().mode, "Ready")
    workbook.click_cell(cell)
    expect(lambda: workbook.view().status.split()[0], cell)
    yield "formula-entered"

    zoom(workbook, "0", 150)
    yield "zoomed-to-150-percent"
    zoom(workbook, "5", 50)
    yield "zoomed-to-50-percent"

    zoom(workbook, "1", 100)
    workbook.desktop.key("ctrl+Home")
    show_chart(workbook, "A1", "C13")
    yield "line-chart"
    workbook.desktop.key("alt+c", "o")
    workbook.desktop.key("alt+c", "g")
    yield "column-chart-with-legend"


def main():
    programs, file, folder = (pathlib.Path(word).absolute() for word in sys.argv[1:4])
    folder.mkdir(parents=True, exist_ok=True)
    for old in folder.glob("*.png"):
        old.unlink()
    with opened(programs, file) as workbook:
        for number, what in enumerate(steps(workbook, file), 1):
            path = folder / f"{number}-{what}.png"
            workbook.settle().crop(workbook.view().main.rect).write_png(path)
            print(path)


if __name__ == "__main__":
    main()
