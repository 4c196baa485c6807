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
sys.path.insert(0, str(ROOT / "tools" / "desktop"))

from desktop import OUT_OF_THE_WAY, Desktop, wait_until  # noqa: E402
from probe import Probe  # noqa: E402
from workbook_app import Workbook, column_name, expect, windows_path  # noqa: E402


@contextlib.contextmanager
def opened(programs, *files):
    """A running workbook with the files, ended without saving."""
    with Desktop(programs / "workbook.exe") as desktop:
        probe = Probe(desktop, programs / "window_probe.exe")
        workbook = Workbook(desktop, probe, programs / "workbook.exe", *map(windows_path, files))
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


def chart_menu(workbook, *keys):
    """Chooses in the Chart menu, with the pointer out of its way."""
    workbook.desktop.move(*OUT_OF_THE_WAY)
    workbook.desktop.key("alt+c", *keys)


def show_side_panel(workbook):
    """Shows it, with the first sheet unfolded in its tree."""
    workbook.desktop.key("F9")
    wait_until(lambda: workbook.view().main.find("SysTreeView32"), "the side panel appears")
    workbook.desktop.key("F6", "Right")
    wait_until(lambda: len(workbook.view().main.find("SysTreeView32").items) > 1, "its columns")


def choose_column(workbook, number):
    """Clicks a row of the list of statistics."""
    left, top, _, bottom = workbook.view().main.find("SysListView32").rows[number]["rect"]
    workbook.desktop.click(left + 8, (top + bottom) // 2)
    expect(lambda: workbook.view().status.split()[0].startswith(column_name(number) + "1:"), True)


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
    chart_menu(workbook, "o")
    chart_menu(workbook, "g")
    yield "column-chart-with-legend"

    workbook.desktop.key("alt+Return")
    workbook.wait_for_dialog()
    yield "chart-properties"
    workbook.answer("Cancel")

    show_side_panel(workbook)
    choose_column(workbook, 1)
    yield "side-panel"

    workbook.desktop.key("ctrl+n")
    expect(lambda: workbook.view().title, "Untitled - Workbook")
    workbook.desktop.click(*workbook.view().main.find("FunkyBarControl").centre)
    workbook.wait_for_menu()
    yield "menu-of-sheets"
    workbook.desktop.key("Escape")


def take_picture(workbook):
    """The workbook, and what of it reaches beyond its window, such as a dialog."""
    picture, windows = workbook.settle(), workbook.probe.windows()
    lefts, tops, rights, bottoms = zip(*(window.rect for window in windows))
    return picture.crop((min(lefts), min(tops), max(rights), max(bottoms)))


def main():
    programs, file, folder = (pathlib.Path(word).absolute() for word in sys.argv[1:4])
    folder.mkdir(parents=True, exist_ok=True)
    for old in folder.glob("*.png"):
        old.unlink()
    with opened(programs, file) as workbook:
        for number, what in enumerate(steps(workbook, file), 1):
            path = folder / f"{number}-{what}.png"
            take_picture(workbook).write_png(path)
            print(path)


if __name__ == "__main__":
    main()
