"""The bar above the sheet: which one is open, and its menu with all of them."""

from test_files import title, type_into
from test_sheets import two_sheets  # noqa: F401, a fixture
from workbook_app import expect

BAR = "FunkyBarControl"
UNSAVED_MARK = (230, 81, 0)


def bar(workbook):
    return workbook.view().main.find(BAR)


def open_menu(workbook):
    workbook.desktop.click(*bar(workbook).centre)
    return workbook.wait_for_menu()


def entry(menu, number, count):
    """The middle of a menu's entry; entries are equally high."""
    left, top, right, bottom = menu.rect
    return (left + right) // 2, top + (2 * number + 1) * (bottom - top) // (2 * count)


def bar_picture(workbook):
    return workbook.settle().crop(bar(workbook).rect)


def test_a_sheet_is_chosen_from_the_menu(two_sheets):  # noqa: F811
    workbook = two_sheets
    first = bar_picture(workbook)
    menu = open_menu(workbook)
    workbook.desktop.click(*entry(menu, 0, 2))
    expect(title(workbook), "sunspots.csv - Workbook")
    assert bar_picture(workbook) != first

    menu = open_menu(workbook)
    workbook.desktop.click(*entry(menu, 1, 2))
    expect(title(workbook), "stations.csv - Workbook")
    expect(lambda: bar_picture(workbook) == first, True)
    # The sheet has the keys, not the bar.
    workbook.desktop.key("Down")
    expect(lambda: workbook.view().status.split()[0], "A2")


def test_the_menu_opens_below_the_bar_wherever_the_window_is(two_sheets):  # noqa: F811
    workbook = two_sheets
    left, top, right, _ = workbook.view().main.rect
    caption = (left + right) // 2, top + 12
    workbook.desktop.drag(caption, (caption[0] + 40, caption[1] + 30), (caption[0] + 50, 60))
    expect(lambda: workbook.view().main.rect[0] > left + 30, True)
    menu = open_menu(workbook)
    expect(lambda: workbook.wait_for_menu().rect[0], bar(workbook).rect[0])
    assert abs(menu.rect[1] - bar(workbook).rect[3]) <= 2
    menu = workbook.wait_for_menu()
    workbook.desktop.click(*entry(menu, 0, 2))
    expect(title(workbook), "sunspots.csv - Workbook")


def test_unsaved_changes_are_marked(two_sheets):  # noqa: F811
    workbook = two_sheets
    saved = bar_picture(workbook)
    assert UNSAVED_MARK not in saved.colours()
    type_into(workbook, "B2", "5")
    expect(lambda: UNSAVED_MARK in bar_picture(workbook).colours(), True)
    workbook.desktop.key("ctrl+z")
    expect(lambda: bar_picture(workbook) == saved, True)


def test_a_closed_sheet_is_no_longer_offered(two_sheets):  # noqa: F811
    workbook = two_sheets
    height = open_menu(workbook)
    workbook.desktop.key("Escape")
    workbook.desktop.key("ctrl+w")
    expect(title(workbook), "sunspots.csv - Workbook")
    menu = open_menu(workbook)
    assert menu.rect[3] - menu.rect[1] < height.rect[3] - height.rect[1]
    workbook.desktop.key("Escape")
