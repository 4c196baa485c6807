"""Opening, saving and closing."""

import pytest

from workbook_app import expect, windows_path


def type_into(workbook, address, text):
    workbook.click_cell(address)
    expect(lambda: workbook.view().status.split()[0], address)
    workbook.desktop.type(text)
    workbook.desktop.key("Return")
    expect(lambda: workbook.view().mode, "Ready")


def title(workbook):
    return lambda: workbook.view().title


def static_text(dialog):
    return " ".join(child.text for child in dialog.all() if child.window_class == "Static")


def open_with_dialog(workbook, path):
    workbook.desktop.key("ctrl+o")
    dialog = workbook.wait_for_dialog()
    assert dialog.find("Edit").focus
    workbook.desktop.type(windows_path(path))
    workbook.desktop.key("Return")


def test_a_file_is_saved_with_exactly_the_changes(open_workbook, sunspots):
    workbook = open_workbook(sunspots)
    assert workbook.view().title == "sunspots.csv - Workbook"
    before = sunspots.read_bytes()
    lines = before.split(b"\n")
    fields = lines[2].rstrip(b"\r").split(b",")
    assert len(fields) >= 2

    type_into(workbook, "B3", "123.5")
    expect(title(workbook), "*sunspots.csv - Workbook")
    assert sunspots.read_bytes() == before
    workbook.desktop.key("ctrl+s")
    expect(title(workbook), "sunspots.csv - Workbook")
    fields[1] = b"123.5"
    lines[2] = b",".join(fields) + (b"\r" if lines[2].endswith(b"\r") else b"")
    assert sunspots.read_bytes() == b"\n".join(lines)


def test_texts_formulas_and_new_rows_are_saved_as_typed(open_workbook, stations):
    workbook = open_workbook(stations)
    type_into(workbook, "A6", "Both, of them")
    type_into(workbook, "B6", "=SUM(B2:B5)")
    type_into(workbook, "D3", "0.5")
    workbook.click_cell("C4")
    workbook.desktop.key("Delete", "ctrl+s")
    expect(title(workbook), "stations.csv - Workbook")
    assert stations.read_bytes() == (
        b"Station,Height,Rain,Sun\r\n"
        b"Harbour,4,12.5,6\r\n"
        b"Moor,212,30.25,0.5\r\n"
        b'"Mill, old",88,,4.5\r\n'
        b"Ridge,540,41,2\r\n"
        b'"Both, of them",=SUM(B2:B5),,\r\n'
    )


def test_undo_to_what_was_saved_takes_the_mark_away(open_workbook, stations):
    workbook = open_workbook(stations)
    type_into(workbook, "B2", "5")
    expect(title(workbook), "*stations.csv - Workbook")
    workbook.desktop.key("ctrl+z")
    expect(title(workbook), "stations.csv - Workbook")


@pytest.fixture
def malformed(tmp_path):
    path = tmp_path / "malformed.csv"
    path.write_text('a,b\n1,2\n3,"4"5\n6,7\n', encoding="utf-8")
    return path


def test_a_malformed_file_is_refused_with_its_line(open_workbook, stations, malformed):
    workbook = open_workbook(stations)
    before = workbook.settle().crop(workbook.view().grid.rect)
    open_with_dialog(workbook, malformed)
    expect(lambda: workbook.dialog() and workbook.dialog().text, "Workbook")
    message = static_text(workbook.dialog())
    assert "line 3" in message.lower(), message
    workbook.answer("OK")

    # What was open stays open.
    assert workbook.view().title == "stations.csv - Workbook"
    assert workbook.view().equation.text == "Station"
    assert workbook.settle().crop(workbook.view().grid.rect).difference(before) is None


def test_another_file_is_opened_as_another_sheet(open_workbook, stations, sunspots):
    workbook = open_workbook(sunspots)
    workbook.click_cell("A30")
    open_with_dialog(workbook, stations)
    expect(title(workbook), "stations.csv - Workbook")
    view = workbook.view()
    assert (view.first_column, view.first_row) == (0, 0)
    assert view.equation.text == "Station"

    workbook.desktop.key("ctrl+Prior")
    expect(title(workbook), "sunspots.csv - Workbook")
    expect(lambda: workbook.view().status.split()[0], "A30")


def test_a_file_that_is_not_there_is_told_at_start(open_workbook, tmp_path):
    workbook = open_workbook(tmp_path / "missing.csv")
    message = static_text(workbook.wait_for_dialog())
    assert "missing.csv" in message, message
    workbook.answer("OK")
    assert workbook.view().title == "Untitled - Workbook"


def test_closing_without_changes_just_ends(open_workbook, stations):
    workbook = open_workbook(stations)
    workbook.desktop.key("alt+F4")
    assert workbook.wait_for_end() == 0


def test_closing_with_changes_asks_first(open_workbook, stations):
    workbook = open_workbook(stations)
    before = stations.read_bytes()
    type_into(workbook, "B2", "5")
    workbook.desktop.key("alt+F4")
    assert "stations.csv" in static_text(workbook.wait_for_dialog())
    workbook.answer("Cancel")
    assert workbook.view().title == "*stations.csv - Workbook"

    workbook.desktop.key("alt+F4")
    workbook.wait_for_dialog()
    workbook.press("No")
    assert workbook.wait_for_end() == 0
    assert stations.read_bytes() == before


def test_closing_saves_when_told_to(open_workbook, stations):
    workbook = open_workbook(stations)
    type_into(workbook, "B2", "5")
    workbook.desktop.key("alt+F4")
    workbook.wait_for_dialog()
    workbook.press("Yes")
    assert workbook.wait_for_end() == 0
    assert stations.read_bytes().splitlines()[1] == b"Harbour,5,12.5,6"
