"""Column widths, row heights and zoom."""

import pytest

from workbook_app import expect

LINE = (0xB0, 0xB0, 0xB0)  # grid lines


@pytest.fixture
def workbook(open_workbook, stations):
    return open_workbook(stations)


def column_sizes(workbook):
    return workbook.view().column_header.sizes


def test_dragging_a_column_border_resizes_the_column(workbook):
    sizes = column_sizes(workbook)
    view = workbook.view()
    edge = view.column_edges(1)[1]
    y = view.column_header.centre[1]
    workbook.desktop.drag((edge - 1, y), (edge + 20, y), (edge + 39, y))
    expect(lambda: abs(column_sizes(workbook)[1] - sizes[1] - 40) <= 1, True)
    assert column_sizes(workbook)[0] == sizes[0]
    assert column_sizes(workbook)[2] == sizes[2]

    # The grid lines have moved along with the header's border, below the last row of data.
    view, picture = workbook.view(), workbook.settle()
    new_edge, row = view.column_edges(1)[1], view.centre("A12")[1]
    assert picture.pixel(new_edge, row) == LINE
    assert picture.pixel(edge, row) != LINE
    assert picture.pixel(new_edge + sizes[2], row) == LINE
    # The tracking line is gone, and the file is as it was.
    assert picture.pixel(edge + 20, row) == (255, 255, 255)
    assert view.title == "stations.csv - Workbook"


def test_a_border_cannot_be_dragged_past_the_columns_beginning(workbook):
    view = workbook.view()
    left, right = view.column_edges(2)
    y = view.column_header.centre[1]
    workbook.desktop.drag((right - 1, y), (left + 30, y), (left - 50, y))
    expect(lambda: 0 < column_sizes(workbook)[2] <= 3, True)


def test_dragging_a_row_border_resizes_the_row(workbook):
    view = workbook.view()
    sizes = view.row_header.sizes
    x, bottom = view.row_header.centre[0], view.row_edges(2)[1]
    workbook.desktop.drag((x, bottom - 1), (x, bottom + 10), (x, bottom + 19))
    expect(lambda: abs(workbook.view().row_header.sizes[2] - sizes[2] - 20) <= 1, True)
    assert workbook.view().row_header.sizes[3] == sizes[3]


def test_zoom_scales_every_size_and_back(workbook):
    before, picture = workbook.view(), workbook.settle()
    workbook.desktop.key("alt+v", "z", "2")
    expect(lambda: workbook.view().zoom, "200 %")
    zoomed = workbook.view()
    count = len(zoomed.column_header.sizes)
    assert zoomed.column_header.sizes == [2 * size for size in before.column_header.sizes][:count]
    assert set(zoomed.row_header.sizes) == {32}
    left, top, right, bottom = zoomed.column_header.client
    assert bottom - top == 32
    # Empty cells show nothing but their lines, twice as far apart.
    empty = workbook.settle().crop(zoomed.cell("C8"))
    assert empty.pixel(0, 5) == LINE and empty.pixel(5, 0) == LINE
    assert empty.crop((1, 1, empty.width, empty.height)).colours().keys() == {(255, 255, 255)}

    workbook.desktop.key("alt+v", "z", "1")
    expect(lambda: workbook.view().zoom, "100 %")
    now, grid = workbook.settle(), before.grid.rect
    assert now.crop(grid).difference(picture.crop(grid)) is None


def test_half_zoom_shows_twice_the_rows(workbook):
    before = len(workbook.view().row_header.sizes)
    workbook.desktop.key("alt+v", "z", "5")
    expect(lambda: workbook.view().zoom, "50 %")
    sizes = workbook.view().row_header.sizes
    assert set(sizes) == {8}
    assert 2 * before - 2 <= len(sizes) <= 2 * before + 2
