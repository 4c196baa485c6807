"""Moving through the sheet with the scroll bars, the keys and the wheel."""

import csv

import pytest

from workbook_app import expect


@pytest.fixture
def workbook(open_workbook, sunspots):
    return open_workbook(sunspots)


def first_row(workbook):
    return lambda: workbook.view().first_row


def first_column(workbook):
    return lambda: workbook.view().first_column


def test_the_vertical_bars_arrows_scroll_one_row(workbook):
    x, up, _, _, down = workbook.view().vertical_bar()
    before = workbook.settle()
    workbook.desktop.click(x, down)
    workbook.desktop.click(x, down)
    expect(first_row(workbook), 2)

    # The picture has moved up by the height of two rows: rows 3 to 9 stand where 1 to 7 stood.
    view, now = workbook.view(), workbook.settle()
    left, top, right, _ = view.grid.client
    top = view.row_header.client[1]
    moved = now.crop((left, top, right, top + 7 * 16))
    assert moved == before.crop((left, top + 2 * 16, right, top + 9 * 16))

    workbook.desktop.click(x, up)
    expect(first_row(workbook), 1)


def test_the_vertical_bars_page_area_scrolls_a_screen(workbook):
    view = workbook.view()
    visible = len(view.row_header.sizes)
    x, _, above, below, _ = view.vertical_bar()
    workbook.desktop.click(x, below)
    expect(first_row(workbook), visible - 1)
    workbook.desktop.click(x, below)
    expect(first_row(workbook), 2 * (visible - 1))
    workbook.desktop.click(x, above)
    expect(first_row(workbook), 2 * (visible - 1) - visible)


def test_the_thumb_drags_the_view_to_the_last_rows(workbook, sunspots):
    with open(sunspots, newline="", encoding="utf-8") as file:
        rows = len(list(csv.reader(file)))
    x, _, thumb, bottom, _ = workbook.view().vertical_bar()
    workbook.desktop.drag((x, thumb), (x, (thumb + bottom) // 2), (x, bottom))
    expect(lambda: workbook.view().first_row > 0, True)

    view = workbook.view()
    assert view.first_row < rows <= view.last_whole_row() + 1 + len(view.row_header.sizes)
    workbook.desktop.drag((x, bottom), (x, thumb - 40))
    expect(first_row(workbook), 0)


def test_the_horizontal_bar_scrolls_columns(workbook):
    y, left, _, _, right = workbook.view().horizontal_bar()
    workbook.desktop.click(right, y)
    expect(first_column(workbook), 1)
    assert workbook.view().column_header.first_label == "B"
    workbook.desktop.click(left, y)
    expect(first_column(workbook), 0)


def test_arrow_keys_scroll_when_they_leave_the_view(workbook):
    last = workbook.view().last_whole_row()
    workbook.desktop.key(*["Down"] * last)
    expect(lambda: workbook.view().status.split()[0], f"A{last + 1}")
    assert workbook.view().first_row <= 1
    workbook.desktop.key("Down", "Down", "Down")
    expect(lambda: workbook.view().status.split()[0], f"A{last + 4}")
    assert 2 <= workbook.view().first_row <= 4
    assert workbook.view().last_whole_row() >= last + 3

    workbook.desktop.key("Right")
    expect(lambda: workbook.view().status.split()[0], f"B{last + 4}")
    workbook.desktop.key("ctrl+Home")
    expect(first_row(workbook), 0)
    assert workbook.view().status.split()[0] == "A1"


def test_page_keys_move_by_a_screen(workbook):
    visible = len(workbook.view().row_header.sizes)
    workbook.desktop.key("Next")
    expect(lambda: workbook.view().status.split()[0], f"A{visible + 1}")
    view = workbook.view()
    assert view.first_row > 0
    assert view.first_row <= visible <= view.last_whole_row()
    workbook.desktop.key("Prior")
    expect(first_row(workbook), 0)


def test_the_wheel_scrolls_rows_and_with_shift_columns(workbook):
    x, y = workbook.view().centre("B5")
    workbook.desktop.wheel(x, y, down=2)
    expect(lambda: workbook.view().first_row > 1, True)
    workbook.desktop.wheel(x, y, up=2)
    expect(first_row(workbook), 0)
    with workbook.desktop.holding("shift"):
        workbook.desktop.wheel(x, y, down=1)
    expect(lambda: workbook.view().first_column > 0, True)
