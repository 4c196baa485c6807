"""Selecting cells with the mouse, and what the status line says of them."""

import csv

import pytest

from workbook_app import expect


@pytest.fixture
def workbook(open_workbook, sunspots):
    return open_workbook(sunspots)


def read_numbers(path, column, first, last):
    """The numbers of one column in rows `first` to `last`, counted from 1 as in the window."""
    with open(path, newline="", encoding="utf-8") as file:
        rows = list(csv.reader(file))
    return [float(row[column]) for row in rows[first - 1 : last]]


def status(workbook):
    return lambda: workbook.view().status.split()


def test_dragging_selects_a_block_and_inverts_it(workbook):
    before = workbook.settle()
    workbook.drag_cells("B4", "C9")
    expect(lambda: status(workbook)()[0], "B4:C9")
    block = workbook.view().block("B4", "C9")
    after = workbook.settle()
    assert after.crop(block) == before.crop(block).inverted()

    # What lies left and below is as it was; and a click takes the inversion away again.
    view = workbook.view()
    beside = view.block("A4", "A9")
    assert after.crop(beside) == before.crop(beside)
    workbook.click_cell("A20")
    expect(lambda: status(workbook)()[0], "A20")
    assert workbook.settle().crop(block) == before.crop(block)


def test_the_status_line_sums_the_selected_numbers(workbook, sunspots):
    numbers = read_numbers(sunspots, 1, 3, 12)
    workbook.drag_cells("B3", "B12")
    expect(
        status(workbook),
        ["B3:B12", "Sum:", f"{sum(numbers):.9g}", "Average:", f"{sum(numbers) / 10:.9g}"]
        + ["Count:", "10"],
    )


def test_shift_click_extends_the_selection(workbook):
    workbook.click_cell("B5")
    with workbook.desktop.holding("shift"):
        workbook.click_cell("C8")
    expect(lambda: status(workbook)()[0], "B5:C8")


def test_dragging_past_the_edge_scrolls_on(workbook, sunspots):
    view = workbook.view()
    x, y = view.centre("B5")
    below = view.grid.client[3] - 3
    workbook.desktop.drag((x, y), (x, below), release=False)
    expect(lambda: workbook.view().first_row >= 3, True)
    workbook.desktop.move(x + 1, below)
    workbook.desktop.release_button()

    # The last row that the pointer was on is selected, far below what was visible at first.
    workbook.settle()
    scrolled = workbook.view()
    last = scrolled.first_row + (below - scrolled.row_header.client[1]) // 16 + 1
    assert last > view.last_whole_row() + 1
    numbers = read_numbers(sunspots, 1, 5, last)
    expect(
        lambda: status(workbook)()[:3], [f"B5:B{last}", "Sum:", f"{round(sum(numbers), 9):.9g}"]
    )


def test_a_press_on_a_header_selects_the_whole_column_or_row(workbook):
    view = workbook.view()
    left, right = view.column_edges(1)
    workbook.desktop.click((left + right) // 2, view.column_header.centre[1])
    expect(lambda: status(workbook)()[0], "B1:B16384")
    top, bottom = view.row_edges(6)
    workbook.desktop.click(view.row_header.centre[0], (top + bottom) // 2)
    expect(lambda: status(workbook)()[0], "A7:IV7")


def test_the_corner_button_selects_everything(workbook):
    corner = workbook.view().grid.find("Button", id=1)
    workbook.desktop.click(*corner.centre)
    expect(lambda: status(workbook)()[0], "A1:IV16384")
