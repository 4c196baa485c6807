"""The chart view: showing and hiding it, its types, values, panning, legend and edits."""

import pytest

from desktop import OUT_OF_THE_WAY, wait_until
from workbook_app import expect

GRAPH = "KORVANE Corporation GraphControl"
LEGEND = "KORVANE Corporation LegendControl"
TOOLTIP = "KORVANE Corporation ToolTipControl"
GREEN, BLUE, YELLOW, RED = (0, 255, 0), (0, 0, 255), (255, 255, 0), (255, 0, 0)
WHITE, BLACK, LIGHT_YELLOW = (255, 255, 255), (0, 0, 0), (255, 255, 224)


class Chart:
    """The workbook's chart of a block that was selected by dragging."""

    def __init__(self, workbook, first, last):
        self.workbook = workbook
        workbook.drag_cells(first, last)
        expect(lambda: workbook.view().status.split()[0], f"{first}:{last}")
        workbook.desktop.key("ctrl+h")
        wait_until(self.window, "the chart appears")

    def window(self):
        return self.workbook.view().main.find(GRAPH)

    def menu(self, *keys):
        self.workbook.desktop.move(*OUT_OF_THE_WAY)  # a pointer over the menu chooses there
        self.workbook.desktop.key("alt+c", *keys)

    def picture(self):
        return self.workbook.settle().crop(self.window().rect)

    def wait_for_change(self, picture):
        """Waits until the chart looks different, and returns what it looks like then."""
        wait_until(lambda: self.picture() != picture, "the chart's picture changes")
        return self.picture()

    def on_screen(self, place):
        left, top, _, _ = self.window().rect
        return left + place[0], top + place[1]


@pytest.fixture
def chart(open_workbook, sunspots):
    return Chart(open_workbook(sunspots), "A1", "D13")


def places_of(picture, colour):
    """Where the picture has this colour, row by row from the top."""
    return [
        (at // 3 % picture.width, at // 3 // picture.width)
        for at in range(0, len(picture.pixels), 3)
        if tuple(picture.pixels[at : at + 3]) == colour
    ]


def middle_of(picture, colour):
    """A place well inside an area of this colour."""
    for x, y in places_of(picture, colour):
        if 4 <= x < picture.width - 4 and 4 <= y < picture.height - 4:
            if all(picture.pixel(x + i, y + j) == colour for i in (-3, 3) for j in (-3, 3)):
                return x, y
    raise AssertionError(f"no area of {colour}")


def share(picture, colour):
    return picture.colours().get(colour, 0) / (picture.width * picture.height)


def test_the_chart_takes_the_right_part_and_gives_it_back(chart):
    workbook = chart.workbook
    view = workbook.view()
    left, _, right, _ = view.main.client
    assert abs((right - chart.window().rect[0]) / (right - left) - 0.45) < 0.02
    assert view.grid.rect[2] <= chart.window().rect[0]

    workbook.desktop.key("F11")
    wait_until(lambda: chart.window() is None, "the chart goes")
    expect(lambda: workbook.view().grid.rect[2], right)


def test_a_single_cell_charts_the_whole_sheet(open_workbook, stations):
    workbook = open_workbook(stations)
    workbook.click_cell("C3")
    workbook.desktop.key("ctrl+h")
    wait_until(lambda: workbook.view().main.find(GRAPH), "the chart appears")
    workbook.desktop.key("alt+c", "o")
    picture = workbook.settle().crop(workbook.view().main.find(GRAPH).rect)
    # Height, Rain, Sun; the names of the stations are categories.
    for colour in GREEN, BLUE, YELLOW:
        assert share(picture, colour) > 0.0003, colour
    assert RED not in picture.colours()


@pytest.mark.parametrize(
    "key, least", [("l", 0.001), ("a", 0.1), ("b", 0.03), ("o", 0.03), ("p", 0.01)]
)
def test_each_type_shows_the_series(chart, key, least):
    if key != "l":
        chart.menu("p" if key != "p" else "a")
        before = chart.picture()
        chart.menu(key)
        chart.wait_for_change(before)
    picture = chart.picture()
    assert share(picture, GREEN) > least
    assert share(picture, WHITE) > 0.3
    assert share(picture, BLUE) > 0.0005 and share(picture, YELLOW) > 0.0005
    # Slices have colours of their own.
    assert (RED in picture.colours()) == (key == "p")


def test_a_press_on_a_column_shows_its_value(chart):
    before = chart.picture()
    chart.menu("o")
    picture = chart.wait_for_change(before)
    assert chart.workbook.view().main.find(TOOLTIP) is None

    x, y = chart.on_screen(middle_of(picture, GREEN))
    desktop = chart.workbook.desktop
    desktop.drag((x, y), release=False)
    tip = wait_until(lambda: chart.workbook.view().main.find(TOOLTIP), "the tooltip appears")
    left, top, right, bottom = tip.rect
    assert (left, bottom) == (x, y)
    assert 40 < right - left < 120 and 12 < bottom - top < 30
    shown = desktop.picture().crop(tip.rect)
    assert shown.pixel(0, 0) == shown.pixel(shown.width - 1, shown.height - 1) == BLACK
    assert {WHITE, BLACK} <= shown.colours().keys() and GREEN not in shown.colours()

    desktop.release_button()
    wait_until(lambda: chart.workbook.view().main.find(TOOLTIP) is None, "the tooltip goes")
    assert chart.picture() == picture


def test_a_tooltip_at_the_right_edge_is_whole(chart):
    before = chart.picture()
    chart.menu("o")
    picture = chart.wait_for_change(before)
    last = max(x for x, _ in places_of(picture, YELLOW))
    x, y = chart.on_screen((last, max(y for at, y in places_of(picture, YELLOW) if at == last)))
    chart.workbook.desktop.drag((x, y), release=False)
    right = chart.window().rect[2]
    wait_until(
        lambda: (tip := chart.workbook.view().main.find(TOOLTIP)) and tip.rect[2] <= right,
        "the tooltip is whole",
    )
    chart.workbook.desktop.release_button()


def test_an_arrow_pans_after_zooming_in(chart):
    before = chart.picture()
    chart.menu("z", "2")
    zoomed = chart.wait_for_change(before)
    x, y = chart.on_screen(right_arrow(zoomed))
    chart.workbook.desktop.click(x, y)
    panned = chart.wait_for_change(zoomed)
    assert share(panned, GREEN) > 0

    chart.menu("z", "1")
    expect(lambda: chart.picture() == before, True)


def right_arrow(picture):
    """The middle of the arrow at the end of the x axis: the only black in the right margin."""
    margin = 13
    left = picture.width - margin
    places = places_of(picture.crop((left, 0, picture.width, picture.height)), BLACK)
    assert places, "no arrow"
    xs, ys = zip(*places)
    return left + sum(xs) // len(xs), sum(ys) // len(ys)


def test_the_legend_lists_the_series_and_scrolls(chart):
    chart.menu("p")
    chart.menu("g")
    legend = wait_until(lambda: chart.workbook.view().main.find(LEGEND), "the legend appears")
    assert legend.text == "Legend"
    first = chart.workbook.settle().crop(legend.client)
    assert first.pixel(8, 10) == RED  # the first slice

    # The lowest arrow of the legend's scroll bar.
    _, _, client_right, bottom = legend.client
    x = (client_right + legend.rect[2]) // 2
    chart.workbook.desktop.click(x, bottom - 8)
    expect(lambda: chart.workbook.settle().crop(legend.client).pixel(8, 10), GREEN)

    chart.menu("g")
    wait_until(lambda: chart.workbook.view().main.find(LEGEND) is None, "the legend goes")


def test_an_edit_changes_the_chart_and_undo_takes_it_back(chart):
    workbook = chart.workbook
    before = chart.picture()
    workbook.click_cell("B5")
    expect(lambda: workbook.view().status.split()[0], "B5")
    workbook.desktop.type("10")
    workbook.desktop.key("Return")
    chart.wait_for_change(before)
    workbook.desktop.key("ctrl+z")
    expect(lambda: chart.picture() == before, True)


def test_a_new_largest_value_is_in_view(chart):
    before = chart.picture()
    chart.menu("o")
    picture = chart.wait_for_change(before)
    chart.workbook.click_cell("B5")
    expect(lambda: chart.workbook.view().status.split()[0], "B5")
    chart.workbook.desktop.type("1000")
    chart.workbook.desktop.key("Return")
    # All other columns are low now.
    after = chart.wait_for_change(picture)
    assert share(after, BLUE) < share(picture, BLUE) / 4
    assert share(after, GREEN) > 0.01


def test_the_background_has_the_chosen_colour(chart):
    before = chart.picture()
    chart.menu("k", "y")
    after = chart.wait_for_change(before)
    assert after.colours()[LIGHT_YELLOW] == before.colours()[WHITE]
    assert WHITE not in after.colours()


def test_live_data_moves_until_it_is_stopped(chart):
    workbook = chart.workbook
    for mode in "s", "r":
        chart.menu("d", mode)
        live = wait_until(lambda: workbook.view().main.find(GRAPH, id=105), "a live chart")
        first = workbook.desktop.picture().crop(live.rect)
        wait_until(lambda: workbook.desktop.picture().crop(live.rect) != first, "it moves")
    chart.menu("d", "o")
    wait_until(lambda: not workbook.view().main.find(GRAPH, id=105), "the live chart goes")


def test_sixteen_thousand_rows_are_charted(open_workbook, tmp_path):
    path = tmp_path / "long.csv"
    path.write_text("".join(f"{row % 97},{row % 31}\n" for row in range(16384)))
    workbook = open_workbook(path)
    workbook.desktop.key("ctrl+h")
    wait_until(lambda: workbook.view().main.find(GRAPH), "the chart appears", 5)
    picture = workbook.settle().crop(workbook.view().main.find(GRAPH).rect)
    assert share(picture, GREEN) > 0.2


def test_many_categories_leave_each_other_room(open_workbook, sunspots):
    workbook = open_workbook(sunspots)
    workbook.desktop.key("ctrl+h")
    wait_until(lambda: workbook.view().main.find(GRAPH), "the chart appears")
    picture = workbook.settle().crop(workbook.view().main.find(GRAPH).rect)
    labels = picture.crop((0, picture.height - 32, picture.width, picture.height - 20))
    # 265 years on top of each other would be a black bar.
    assert 0.02 < share(labels, BLACK) < 0.25
