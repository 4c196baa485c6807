"""The side panel: the tree of sheets and columns, and the list of statistics."""

import pytest

from desktop import wait_until
from test_files import title, type_into
from test_sheets import selected, two_sheets  # noqa: F401, a fixture
from workbook_app import expect

TREE, LIST = "SysTreeView32", "SysListView32"
ALL_ROWS = 16384


@pytest.fixture
def workbook(two_sheets):  # noqa: F811
    two_sheets.desktop.key("F9")
    wait_until(lambda: two_sheets.view().main.find(TREE), "the panel appears")
    expect(lambda: len(tree(two_sheets)), 2)
    return two_sheets


def tree(workbook):
    return workbook.view().main.find(TREE).items


def rows(workbook):
    return workbook.view().main.find(LIST).rows


def labels(workbook):
    return [row["texts"][0] for row in rows(workbook)]


def middle(rect):
    left, top, right, bottom = rect
    return (left + right) // 2, (top + bottom) // 2


def click_row(workbook, number):
    left, top, _, bottom = rows(workbook)[number]["rect"]
    workbook.desktop.click(left + 8, (top + bottom) // 2)


def test_the_panel_takes_its_place_and_gives_it_back(workbook):
    view = workbook.view()
    assert view.main.find(TREE).rect[2] <= view.grid.rect[0]
    workbook.desktop.key("F9")
    expect(lambda: workbook.view().main.find(TREE), None)
    assert workbook.view().grid.rect[0] == workbook.view().main.client[0]


def test_its_edge_can_be_dragged(workbook):
    left, top, _, bottom = workbook.view().grid.rect
    y = (top + bottom) // 2
    workbook.desktop.drag((left - 2, y), (left + 40, y), (left + 98, y))
    expect(lambda: abs(workbook.view().grid.rect[0] - left - 100) <= 2, True)


def test_the_list_shows_the_columns_statistics(workbook):
    expect(lambda: len(rows(workbook)), 4)
    texts = [row["texts"] for row in rows(workbook)]
    assert texts[0] == ["A  Station", "4", "0"] + [""] * 6
    # Height: 4, 212, 88, 540.
    assert texts[1][:6] == ["B  Height", "4", "4", "4", "540", "211"]
    assert texts[1][6:] == ["150", "235.38621", "844"]
    assert texts[3][0] == "D  Sun" and texts[3][8] == "15.5"


def test_statistics_follow_edits_and_undo(workbook):
    expect(lambda: len(rows(workbook)), 4)
    type_into(workbook, "D3", "100")
    expect(lambda: rows(workbook)[3]["texts"][4], "100")
    type_into(workbook, "E2", "7")  # another column
    expect(lambda: labels(workbook)[-1], "E  ")
    workbook.desktop.key("ctrl+z", "ctrl+z")
    expect(lambda: len(rows(workbook)), 4)
    assert rows(workbook)[3]["texts"][4] == "6"


def test_choosing_a_row_selects_its_column(workbook):
    expect(lambda: len(rows(workbook)), 4)
    click_row(workbook, 2)
    expect(selected(workbook), f"C1:C{ALL_ROWS}")
    # Choosing it again means it again.
    workbook.click_cell("A2")
    expect(selected(workbook), "A2")
    click_row(workbook, 2)
    expect(selected(workbook), f"C1:C{ALL_ROWS}")
    workbook.desktop.key("Down")
    expect(selected(workbook), f"D1:D{ALL_ROWS}")


def test_rows_are_removed_from_the_list_and_shown_again(workbook):
    expect(lambda: len(rows(workbook)), 4)
    click_row(workbook, 1)
    with workbook.desktop.holding("ctrl"):
        click_row(workbook, 3)
    expect(lambda: [row["selected"] for row in rows(workbook)], [False, True, False, True])
    workbook.desktop.key("Delete")
    expect(lambda: labels(workbook), ["A  Station", "C  Rain"])
    workbook.click_cell("B2")  # the sheet itself has lost nothing
    expect(lambda: workbook.view().equation.text, "4")

    x, y = middle(rows(workbook)[1]["rect"])
    workbook.desktop.right_click(x, y + 60)  # below the rows
    workbook.wait_for_menu()
    workbook.desktop.key("a")
    expect(lambda: len(rows(workbook)), 4)


def test_the_menu_removes_the_row_under_the_pointer(workbook):
    expect(lambda: len(rows(workbook)), 4)
    workbook.desktop.right_click(*middle(rows(workbook)[2]["rect"]))
    workbook.wait_for_menu()
    workbook.desktop.key("r")
    expect(lambda: labels(workbook), ["A  Station", "B  Height", "D  Sun"])


def test_the_tree_lists_sheets_and_unfolds_their_columns(workbook):
    assert [item["text"] for item in tree(workbook)] == ["sunspots.csv", "stations.csv"]
    workbook.desktop.click(*middle(tree(workbook)[1]["rect"]))
    workbook.desktop.key("Right")
    expect(
        lambda: [item["text"] for item in tree(workbook)][1:],
        ["stations.csv", "A  Station", "B  Height", "C  Rain", "D  Sun"],
    )
    workbook.desktop.click(*middle(tree(workbook)[4]["rect"]))
    expect(selected(workbook), f"C1:C{ALL_ROWS}")
    # What is unfolded stays so when a sheet's name gets its mark.
    type_into(workbook, "B2", "5")
    expect(lambda: [item["text"] for item in tree(workbook)][1], "*stations.csv")
    assert len(tree(workbook)) == 6


def test_choosing_a_sheet_in_the_tree_shows_it(workbook):
    workbook.desktop.click(*middle(tree(workbook)[0]["rect"]))
    expect(title(workbook), "sunspots.csv - Workbook")
    expect(lambda: labels(workbook)[:2], ["A  Year", "B  Jan"])
