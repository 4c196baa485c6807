"""Values and formulas through the equation bar, with its keys and its buttons."""

import pytest

from workbook_app import expect


@pytest.fixture
def workbook(open_workbook, stations):
    return open_workbook(stations)


def text_of(workbook, address):
    """What the equation bar shows for a cell: what was typed into it."""
    workbook.click_cell(address)
    expect(lambda: workbook.view().status.split()[0], address)
    return workbook.view().equation.text


def current(workbook):
    return lambda: workbook.view().status.split()[0]


def test_the_bar_shows_the_current_cell(workbook):
    assert workbook.view().equation.text == "Station"
    assert text_of(workbook, "A4") == "Mill, old"
    assert text_of(workbook, "C3") == "30.25"
    assert text_of(workbook, "F9") == ""


def test_enter_stores_and_moves_down(workbook):
    workbook.click_cell("B2")
    workbook.desktop.type("17")
    expect(lambda: workbook.view().equation.text, "17")
    assert workbook.view().mode == "Edit"
    workbook.desktop.key("Return")
    expect(current(workbook), "B3")
    assert workbook.view().mode == "Ready"
    assert text_of(workbook, "B2") == "17"


def test_an_arrow_key_stores_what_was_typed_ahead(workbook):
    workbook.click_cell("C2")
    workbook.desktop.type("7.5")
    workbook.desktop.key("Right")
    expect(current(workbook), "D2")
    assert text_of(workbook, "C2") == "7.5"


def test_tab_stores_and_moves_right_and_with_shift_left(workbook):
    workbook.click_cell("C3")
    workbook.desktop.type("8")
    workbook.desktop.key("Tab")
    expect(current(workbook), "D3")
    workbook.desktop.type("9")
    workbook.desktop.key("shift+Tab")
    expect(current(workbook), "C3")
    assert text_of(workbook, "C3") == "8"
    assert text_of(workbook, "D3") == "9"


def test_a_formula_is_evaluated_and_follows_its_cells(workbook):
    workbook.click_cell("B6")
    workbook.desktop.type("=SUM(B2:B5)")
    workbook.desktop.key("Return")
    expect(current(workbook), "B7")
    workbook.click_cell("B6")
    expect(lambda: workbook.view().status.split()[:3], ["B6", "Sum:", "844"])
    assert workbook.view().equation.text == "=SUM(B2:B5)"

    workbook.click_cell("B2")
    workbook.desktop.type("1000")
    workbook.desktop.key("Return")
    expect(current(workbook), "B3")
    workbook.click_cell("B6")
    expect(lambda: workbook.view().status.split()[:3], ["B6", "Sum:", "1840"])


def test_escape_gives_up_typing(workbook):
    workbook.click_cell("C4")
    before = workbook.settle()
    workbook.desktop.type("999")
    expect(lambda: workbook.view().equation.text, "999")
    workbook.desktop.key("Escape")
    expect(lambda: workbook.view().equation.text, "17")
    expect(lambda: workbook.view().mode, "Ready")
    assert current(workbook)() == "C4"
    assert workbook.view().title == "stations.csv - Workbook"
    row = workbook.view().block("A4", "D4")
    assert workbook.settle().crop(row) == before.crop(row)


def test_backspace_in_the_bar_counts_as_typing(workbook):
    workbook.click_cell("B3")
    workbook.desktop.key("F2", "BackSpace")
    expect(lambda: workbook.view().equation.text, "21")
    workbook.desktop.key("Return")
    expect(current(workbook), "B4")
    assert text_of(workbook, "B3") == "21"


def test_a_click_into_the_bar_lets_the_arrows_move_the_caret(workbook):
    workbook.click_cell("B3")
    left, top, right, bottom = workbook.view().equation.rect
    workbook.desktop.click(right - 20, (top + bottom) // 2)
    expect(lambda: workbook.view().equation.focus, True)
    workbook.desktop.key("Left", "5")
    expect(lambda: workbook.view().equation.text, "2152")
    workbook.desktop.key("Return")
    expect(current(workbook), "B4")
    assert text_of(workbook, "B3") == "2152"


def test_ok_stores_and_moves_down(workbook):
    workbook.click_cell("D2")
    workbook.desktop.type("11")
    expect(lambda: workbook.view().equation.text, "11")
    workbook.click_button("OK")
    expect(current(workbook), "D3")
    assert text_of(workbook, "D2") == "11"


def test_x_gives_up_typing(workbook):
    workbook.click_cell("D3")
    workbook.desktop.type("77")
    expect(lambda: workbook.view().equation.text, "77")
    workbook.click_button("X")
    expect(lambda: workbook.view().equation.text, "3")
    expect(lambda: workbook.view().mode, "Ready")
    assert current(workbook)() == "D3"
    assert workbook.view().title == "stations.csv - Workbook"


def test_fx_offers_functions_and_types_the_chosen_one(workbook):
    workbook.click_cell("D6")
    workbook.click_button("fx")
    menu = workbook.wait_for_menu()
    assert menu.rect[3] - menu.rect[1] > 60
    workbook.desktop.key("Down", "Return")
    expect(lambda: workbook.view().equation.text[:1], "=")
    expect(lambda: workbook.view().equation.text[-1:], "(")
    workbook.desktop.type("D2:D5)")
    workbook.desktop.key("Return")
    expect(current(workbook), "D7")
    text = text_of(workbook, "D6")
    assert text.startswith("=") and text.endswith("(D2:D5)")


def test_delete_clears_the_block_and_undo_brings_it_back(workbook):
    workbook.drag_cells("B2", "C4")
    expect(current(workbook), "B2:C4")
    workbook.desktop.key("Delete")
    expect(lambda: workbook.view().status.split(), ["B2:C4"])
    assert text_of(workbook, "C3") == ""
    workbook.desktop.key("ctrl+z")
    expect(lambda: workbook.view().status.split()[0], "B2:C4")
    assert text_of(workbook, "C3") == "30.25"
    assert text_of(workbook, "B4") == "88"
