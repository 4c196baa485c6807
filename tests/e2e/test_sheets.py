"""Several sheets in one workbook: new ones, closing them, going from one to another."""

import pytest

from test_files import open_with_dialog, static_text, title, type_into
from workbook_app import expect


@pytest.fixture
def two_sheets(open_workbook, stations, sunspots):
    """stations.csv is shown, sunspots.csv is the sheet before it."""
    return open_workbook(sunspots, stations)


def expect_message(workbook, part):
    """Waits for a message box that says this."""

    def is_said():
        dialog = workbook.dialog()
        return bool(dialog) and part in static_text(dialog)

    expect(is_said, True)


def selected(workbook):
    return lambda: workbook.view().status.split()[0]


def test_all_files_named_at_the_start_are_opened(two_sheets):
    expect(title(two_sheets), "stations.csv - Workbook")
    two_sheets.desktop.key("ctrl+Next")  # round the end
    expect(title(two_sheets), "sunspots.csv - Workbook")
    two_sheets.desktop.key("ctrl+Next")
    expect(title(two_sheets), "stations.csv - Workbook")


def test_each_sheet_keeps_its_place_selection_and_sizes(two_sheets):
    workbook = two_sheets
    view = workbook.view()
    edge, y = view.column_edges(1)[1], view.column_header.centre[1]
    workbook.desktop.drag((edge - 1, y), (edge + 15, y), (edge + 29, y))
    edge, x = view.row_edges(2)[1], view.row_header.centre[0]
    workbook.desktop.drag((x, edge - 1), (x, edge + 10), (x, edge + 19))
    workbook.drag_cells("B2", "C4")
    expect(selected(workbook), "B2:C4")
    before = workbook.view()
    picture = workbook.settle()

    workbook.desktop.key("ctrl+Prior")
    expect(title(workbook), "sunspots.csv - Workbook")
    other = workbook.view()
    assert other.row_header.sizes[2] != before.row_header.sizes[2]
    assert other.column_header.sizes[1] != before.column_header.sizes[1]
    workbook.desktop.key("ctrl+End")
    expect(lambda: workbook.view().first_row > 200, True)
    at_end = selected(workbook)()

    workbook.desktop.key("ctrl+Next")
    expect(selected(workbook), "B2:C4")
    view = workbook.view()
    assert view.column_header.sizes[:6] == before.column_header.sizes[:6]
    assert view.row_header.sizes[:6] == before.row_header.sizes[:6]
    grid = view.grid.client
    assert workbook.settle().crop(grid).difference(picture.crop(grid)) is None

    workbook.desktop.key("ctrl+Prior")
    expect(selected(workbook), at_end)
    assert workbook.view().first_row > 200


def test_a_new_sheet_is_empty_and_the_others_stay(two_sheets):
    workbook = two_sheets
    workbook.desktop.key("ctrl+n")
    expect(title(workbook), "Untitled - Workbook")
    assert workbook.view().equation.text == ""
    type_into(workbook, "A1", "7")
    expect(title(workbook), "*Untitled - Workbook")
    workbook.desktop.key("ctrl+n")
    expect(title(workbook), "Untitled 2 - Workbook")
    workbook.desktop.key("ctrl+Prior", "ctrl+Prior")
    expect(title(workbook), "stations.csv - Workbook")
    workbook.desktop.key("ctrl+Home")
    expect(lambda: workbook.view().equation.text, "Station")


def test_undo_is_about_the_sheet_that_is_shown(two_sheets):
    workbook = two_sheets
    type_into(workbook, "B2", "5")
    workbook.desktop.key("ctrl+Prior")
    expect(title(workbook), "sunspots.csv - Workbook")
    workbook.desktop.key("ctrl+z")
    workbook.desktop.key("ctrl+Next")
    expect(title(workbook), "*stations.csv - Workbook")
    workbook.desktop.key("ctrl+z")
    expect(title(workbook), "stations.csv - Workbook")


def test_what_is_being_typed_is_stored_in_its_own_sheet(two_sheets):
    workbook = two_sheets
    workbook.click_cell("B2")
    workbook.desktop.type("123")
    expect(lambda: workbook.view().mode, "Edit")
    workbook.desktop.key("ctrl+Prior")
    expect(title(workbook), "sunspots.csv - Workbook")
    workbook.desktop.key("ctrl+Next")
    expect(title(workbook), "*stations.csv - Workbook")
    expect(lambda: workbook.view().equation.text, "123")


def test_opening_an_open_file_shows_its_sheet(two_sheets, sunspots):
    workbook = two_sheets
    open_with_dialog(workbook, sunspots)
    expect(title(workbook), "sunspots.csv - Workbook")
    workbook.desktop.key("ctrl+w")
    expect(title(workbook), "stations.csv - Workbook")
    workbook.desktop.key("ctrl+w")  # there were two sheets only
    expect(title(workbook), "Untitled - Workbook")


def test_closing_a_changed_sheet_asks(two_sheets, stations):
    workbook = two_sheets
    before = stations.read_bytes()
    type_into(workbook, "B2", "5")
    workbook.desktop.key("ctrl+w")
    expect_message(workbook, "stations.csv")
    workbook.answer("Cancel")
    assert workbook.view().title == "*stations.csv - Workbook"
    workbook.desktop.key("ctrl+w")
    workbook.wait_for_dialog()
    workbook.answer("No")
    expect(title(workbook), "sunspots.csv - Workbook")
    assert stations.read_bytes() == before


def test_ending_asks_about_each_changed_sheet_and_shows_it(two_sheets, stations, sunspots):
    workbook = two_sheets
    unsaved = sunspots.read_bytes()
    type_into(workbook, "B2", "5")
    workbook.desktop.key("ctrl+Prior")
    expect(title(workbook), "sunspots.csv - Workbook")
    type_into(workbook, "B2", "77")
    workbook.desktop.key("ctrl+n")
    expect(title(workbook), "Untitled - Workbook")

    workbook.desktop.key("alt+F4")
    expect_message(workbook, "sunspots.csv")
    workbook.press("No")
    expect_message(workbook, "stations.csv")
    assert workbook.view().title == "*stations.csv - Workbook"
    workbook.press("Yes")
    assert workbook.wait_for_end() == 0
    assert stations.read_bytes().splitlines()[1] == b"Harbour,5,12.5,6"
    assert sunspots.read_bytes() == unsaved


def test_cancelling_the_second_question_keeps_the_program(two_sheets):
    workbook = two_sheets
    type_into(workbook, "B2", "5")
    workbook.desktop.key("ctrl+Prior")
    expect(title(workbook), "sunspots.csv - Workbook")
    type_into(workbook, "B2", "77")
    workbook.desktop.key("alt+F4")
    expect_message(workbook, "sunspots.csv")
    workbook.press("No")
    expect_message(workbook, "stations.csv")
    workbook.answer("Cancel")
    expect(title(workbook), "*stations.csv - Workbook")
    # Nothing is lost by the "No".
    workbook.desktop.key("ctrl+Prior")
    expect(title(workbook), "*sunspots.csv - Workbook")


def test_saving_over_another_open_file_is_refused(two_sheets, sunspots):
    workbook = two_sheets
    before = sunspots.read_bytes()
    workbook.desktop.key("ctrl+shift+s")
    workbook.wait_for_dialog()
    workbook.desktop.key("ctrl+a")
    workbook.desktop.type("sunspots.csv")
    workbook.desktop.key("Return")
    expect_message(workbook, "already exists")
    workbook.press("Yes")
    expect_message(workbook, "another sheet")
    workbook.answer("OK")
    assert workbook.view().title == "stations.csv - Workbook"
    assert sunspots.read_bytes() == before
