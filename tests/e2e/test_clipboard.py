"""Copying, cutting and pasting, with another program at the other end; undo and redo of it."""

import pytest

from test_chart import Chart
from test_files import title
from test_sheets import selected
from workbook_app import expect


@pytest.fixture
def workbook(open_workbook, stations):
    return open_workbook(stations)


def cell(workbook, address):
    """What was typed into a cell."""
    workbook.click_cell(address)
    expect(selected(workbook), address)
    return workbook.view().equation.text


def test_cells_are_copied_as_text_with_tabs(workbook, clipboard):
    workbook.drag_cells("A2", "C4")
    expect(selected(workbook), "A2:C4")
    workbook.desktop.key("ctrl+c")
    expect(clipboard.text, "Harbour\t4\t12.5\r\nMoor\t212\t30.25\r\nMill, old\t88\t17\r\n")
    assert workbook.view().title == "stations.csv - Workbook"


def test_texts_of_another_program_are_pasted(workbook, clipboard):
    clipboard.put('1.5\t"two\nlines"\t"say ""so"""\r\nlast\n')
    workbook.click_cell("B7")
    expect(selected(workbook), "B7")
    workbook.desktop.key("ctrl+v")
    expect(selected(workbook), "B7:D8")
    workbook.desktop.key("ctrl+c")
    expect(clipboard.text, '1.5\t"two\nlines"\t"say ""so"""\r\nlast\t\t\r\n')
    assert cell(workbook, "D7") == 'say "so"'


def test_cutting_empties_the_cells_and_undo_brings_them_back(workbook, clipboard):
    workbook.drag_cells("B2", "C3")
    expect(selected(workbook), "B2:C3")
    workbook.desktop.key("ctrl+x")
    expect(title(workbook), "*stations.csv - Workbook")
    assert clipboard.text() == "4\t12.5\r\n212\t30.25\r\n"
    assert cell(workbook, "C3") == ""

    workbook.desktop.key("ctrl+z")
    expect(title(workbook), "stations.csv - Workbook")
    assert cell(workbook, "C3") == "30.25"
    workbook.desktop.key("ctrl+y")
    expect(title(workbook), "*stations.csv - Workbook")
    assert cell(workbook, "C3") == ""
    workbook.click_cell("B6")
    expect(selected(workbook), "B6")
    workbook.desktop.key("ctrl+v")
    expect(selected(workbook), "B6:C7")
    assert cell(workbook, "C7") == "30.25"


def test_the_charts_picture_is_copied(open_workbook, stations, clipboard):
    chart = Chart(open_workbook(stations), "A1", "D5")
    chart.workbook.desktop.key("ctrl+shift+c")
    left, top, right, bottom = chart.window().rect
    # Its sides are multiples of four.
    expect(clipboard.picture, ((right - left + 3) // 4 * 4, (bottom - top + 3) // 4 * 4))
    assert clipboard.text() is None
