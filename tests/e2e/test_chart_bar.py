"""The chart's tool bar and property sheet, printing, and the help."""

import pytest

from desktop import wait_until
from test_chart import LEGEND, Chart
from test_files import static_text
from workbook_app import expect

TOOLBAR, TOOLTIP = "ToolbarWindow32", "tooltips_class32"
ZOOM, TYPE = 108, 109
SHOW, PROPERTIES, LEGEND_BUTTON = 12, 34, 198  # from the bar's left, in pixels


@pytest.fixture
def chart(open_workbook, stations):
    return Chart(open_workbook(stations), "A1", "C5")


def bar(workbook):
    return workbook.view().main.find(TOOLBAR)


def combo(workbook, number):
    return bar(workbook).find("ComboBox", id=number)


def button(workbook, offset):
    left, top, _, bottom = bar(workbook).rect
    return left + offset, (top + bottom) // 2


def tooltip(workbook):
    for window in workbook.probe.windows():
        if window.window_class == TOOLTIP:
            return window.text
    return None


def open_data_page(workbook):
    workbook.desktop.key("alt+Return")
    left, top, _, _ = workbook.wait_for_dialog().find("SysTabControl32").rect
    workbook.desktop.click(left + 80, top + 10)
    wait_until(lambda: edit(workbook.dialog(), 1005), "the second page")


def edit(dialog, number):
    return dialog.find("Edit", id=number)


def test_the_combo_boxes_follow_the_menu(chart):
    workbook = chart.workbook
    expect(lambda: (combo(workbook, TYPE).text, combo(workbook, ZOOM).text), ("Line", "100%"))
    chart.menu("o")
    expect(lambda: combo(workbook, TYPE).text, "Column")
    chart.menu("z", "0")
    expect(lambda: combo(workbook, ZOOM).text, "50%")


def test_a_type_is_chosen_from_the_combo_box(chart):
    workbook = chart.workbook
    before = chart.picture()
    chart.menu("p")
    pie = chart.wait_for_change(before)
    chart.menu("l")
    chart.wait_for_change(pie)

    workbook.desktop.click(*combo(workbook, TYPE).centre)
    workbook.desktop.key("End", "Return")
    expect(lambda: chart.picture() == pie, True)
    assert combo(workbook, TYPE).text == "Pie"
    workbook.desktop.key("Down")  # the sheet has the keys again
    expect(lambda: combo(workbook, TYPE).text, "Pie")


def test_a_zoom_is_chosen_from_the_combo_box(chart):
    workbook = chart.workbook
    before = chart.picture()
    workbook.desktop.click(*combo(workbook, ZOOM).centre)
    workbook.desktop.key("Home", "Return")
    chart.wait_for_change(before)
    assert combo(workbook, ZOOM).text == "25%"


def test_the_first_button_shows_and_hides_the_chart(chart):
    workbook = chart.workbook
    workbook.desktop.move(*button(workbook, SHOW))
    expect(lambda: tooltip(workbook), "Show Grid")
    workbook.desktop.click(*button(workbook, SHOW))
    wait_until(lambda: chart.window() is None, "the chart goes")
    expect(lambda: combo(workbook, TYPE).enabled, False)
    # A tooltip comes again only after the pointer was on another button.
    workbook.desktop.move(*button(workbook, LEGEND_BUTTON))
    expect(lambda: tooltip(workbook), "Legend")
    workbook.desktop.move(*button(workbook, SHOW))
    expect(lambda: tooltip(workbook), "Show Graph")
    workbook.desktop.click(*button(workbook, SHOW))
    wait_until(chart.window, "the chart comes back")
    expect(lambda: combo(workbook, TYPE).enabled, True)


def test_the_last_button_shows_the_legend(chart):
    workbook = chart.workbook
    workbook.desktop.move(*button(workbook, LEGEND_BUTTON))
    expect(lambda: tooltip(workbook), "Legend")
    workbook.desktop.click(*button(workbook, LEGEND_BUTTON))
    wait_until(lambda: workbook.view().main.find(LEGEND), "the legend appears")
    workbook.desktop.click(*button(workbook, LEGEND_BUTTON))
    wait_until(lambda: workbook.view().main.find(LEGEND) is None, "the legend goes")


def test_properties_are_changed_and_kept(chart):
    workbook = chart.workbook
    before = chart.picture()
    workbook.desktop.click(*button(workbook, PROPERTIES))
    sheet = workbook.wait_for_dialog()
    assert sheet.text == "Graph Properties"
    assert edit(sheet, 1002).text == "stations"
    workbook.desktop.click(*edit(sheet, 1002).centre)
    workbook.desktop.key("ctrl+a")
    workbook.desktop.key("End", "shift+Home")
    workbook.desktop.type("Weather")
    workbook.answer("OK")
    changed = chart.wait_for_change(before)

    # An edit that hands everything over anew keeps the title.
    workbook.click_cell("B2")
    expect(lambda: workbook.view().status.split()[0], "B2")
    workbook.desktop.type("1000")
    workbook.desktop.key("Return")
    chart.wait_for_change(changed)
    workbook.desktop.key("alt+Return")
    assert edit(workbook.wait_for_dialog(), 1002).text == "Weather"
    workbook.answer("Cancel")


def test_a_range_of_the_property_sheet_stays_through_edits(chart):
    workbook = chart.workbook
    open_data_page(workbook)
    for number, value in ((1005, "-100"), (1006, "2000")):
        workbook.desktop.click(*edit(workbook.dialog(), number).centre)
        workbook.desktop.key("Home", "shift+End")
        workbook.desktop.type(value)
        expect(lambda: edit(workbook.dialog(), number).text, value)
    workbook.answer("OK")

    workbook.click_cell("B2")
    expect(lambda: workbook.view().status.split()[0], "B2")
    workbook.desktop.type("1000")
    workbook.desktop.key("Return")
    workbook.settle()
    open_data_page(workbook)
    assert edit(workbook.dialog(), 1005).text == "-100"
    assert edit(workbook.dialog(), 1006).text == "2000"
    workbook.answer("Cancel")


def test_printing_asks_for_a_printer_and_can_be_given_up(chart):
    workbook = chart.workbook
    before = chart.picture()
    workbook.desktop.key("ctrl+p")
    assert workbook.wait_for_dialog().text == "Print"  # or that there is no printer
    workbook.desktop.key("Escape")
    wait_until(lambda: not workbook.dialog(), "the dialog closes")
    assert chart.window().enabled
    chart.menu("o")
    chart.wait_for_change(before)


def test_there_is_nothing_to_print_without_a_chart(open_workbook, stations):
    workbook = open_workbook(stations)
    workbook.desktop.key("ctrl+p", "F1")
    assert workbook.wait_for_dialog().text == "Keys of Workbook"
    workbook.answer("OK")


def test_the_keys_are_explained(open_workbook, stations):
    workbook = open_workbook(stations)
    workbook.desktop.key("F1")
    assert "selects everything" in static_text(workbook.wait_for_dialog())
    workbook.answer("OK")
