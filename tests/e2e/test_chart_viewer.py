"""The command bar and the property pages with a real mouse and keyboard."""

import pytest

from desktop import wait_until
from viewer_app import CHART, GREEN, GRID, TITLE, TYPE, X_MAX, X_MIN, ZOOM, Viewer


@pytest.fixture
def viewer(desktop, probe, programs):
    with Viewer(desktop, probe, programs / "chart_viewer.exe") as running:
        yield running


def count(picture, colour):
    return picture.colours().get(colour, 0)


def wait_for_tooltip(viewer, text):
    wait_until(lambda: viewer.tooltip() == text, f"a tooltip: {text}")


def test_the_first_button_trades_chart_and_grid_and_its_tooltip_follows(viewer):
    viewer.point_at_button(0)
    wait_for_tooltip(viewer, "Show Grid")
    viewer.click_button(0)
    wait_until(lambda: viewer.main().find(GRID), "the grid is shown")
    assert not viewer.main().find(CHART)
    viewer.point_at_button(1)  # a click ends the tooltip until the pointer was elsewhere
    wait_for_tooltip(viewer, "Graph Properties")
    viewer.point_at_button(0)
    wait_for_tooltip(viewer, "Show Graph")


def test_the_combo_boxes_have_tooltips(viewer):
    for combo, text in (ZOOM, "Graph Zoom Level"), (TYPE, "Graph Type"):
        viewer.desktop.move(*viewer.combo(combo).centre)
        wait_for_tooltip(viewer, text)


def test_the_type_combo_changes_the_chart(viewer):
    before = count(viewer.picture_of_chart(), GREEN)
    viewer.choose(TYPE, "Down")  # the item after Line
    wait_until(lambda: viewer.combo(TYPE).text == "Area", "the combo box shows the choice")
    wait_until(
        lambda: count(viewer.picture_of_chart(), GREEN) > 10 * before, "the areas are filled"
    )


def test_the_zoom_combo_changes_the_chart(viewer):
    before = viewer.picture_of_lower_half()
    viewer.choose(ZOOM, "Down")
    wait_until(lambda: viewer.combo(ZOOM).text == "200%", "the combo box shows the choice")
    wait_until(lambda: viewer.picture_of_lower_half() != before, "the chart is drawn anew")


def test_pages_change_title_and_range(viewer):
    before = viewer.picture_of_lower_half()
    viewer.open_sheet()
    viewer.type_into(TITLE, "More of it")
    viewer.show_data_page()
    viewer.type_into(X_MAX, "4")
    viewer.press_ok()
    wait_until(lambda: viewer.picture_of_lower_half() != before, "the chart is drawn anew")
    sheet = viewer.open_sheet()
    assert sheet.find("Edit", id=TITLE).text == "More of it"
    viewer.show_data_page()
    assert viewer.sheet().find("Edit", id=X_MAX).text == "4"


def test_a_reversed_range_is_refused(viewer):
    viewer.open_sheet()
    viewer.show_data_page()
    viewer.type_into(X_MAX, "0")
    viewer.type_into(X_MIN, "1")
    viewer.desktop.click(*viewer.sheet().find("Button", text="OK").centre)
    box = wait_until(
        lambda: next((w for w in viewer.probe.windows() if w.text == "Range Error"), None),
        "the box appears",
    )
    assert box.find("Static", text="Incorrect Range Entered.")
    viewer.desktop.key("Return")
    wait_until(lambda: not viewer.sheet(), "the sheet closes all the same")
