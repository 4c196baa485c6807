"""The footprint's figures: the program that counts and the script that makes tables of them agree,
the tables of the page are those of today's interactions, and the bars hold."""

import pathlib
import re
import subprocess

import pytest

import footprint

ROOT = pathlib.Path(__file__).resolve().parents[3]
CHART_POINTS = [10, 100, 1000]


@pytest.fixture(scope="module")
def image(device_programs):
    return (device_programs / "device" / "korcontrols.dll").read_bytes()


@pytest.fixture(scope="module")
def counted(device_programs, image):
    ended = subprocess.run(
        [ROOT / "scripts" / "wine-run", device_programs / "device_footprint.exe", "--quick"],
        capture_output=True,
        text=True,
        check=True,
        timeout=280,
    )
    return footprint.Footprint(image, ended.stdout)


def rows(lines):
    """Those of all tables, without their headings."""
    found = []
    for line in lines:
        if line.startswith("|---"):
            found.pop()
        elif line.startswith("|"):
            found.append(line.strip("| ").split(" | "))
    return found


def instructions(counted, name, points=0):
    return next(each.instructions for each in counted.interactions
                if (each.name, each.points) == (name, points))


def test_every_bar_holds(counted):
    assert not counted.missed_bars()


def test_all_runs_are_alike(counted):
    assert [each.name for each in counted.interactions if not each.alike] == []


def test_what_is_destroyed_leaves_nothing_but_the_strips_font(counted):
    left = {each.name: (each.heap_left, each.objects_left) for each in counted.creations}
    assert left.pop("grid, with its strips and its equation bar") == (0, 1)
    assert set(left.values()) == {(0, 0)}


def test_what_lives_takes_memory(counted):
    heap = {each.name: each.heap for each in counted.creations}
    empty, full = heap["chart without data, with its tooltip"], heap["chart of 1,000 points"]
    assert 8000 < full - empty < 8200
    assert all(each.heap > 0 for each in counted.creations)


def test_the_work_done_is_seen_in_the_counts(counted):
    redraw = instructions(counted, "redraw of all cells")
    assert instructions(counted, "arrow key within the view") < redraw / 10
    assert instructions(counted, "arrow key that scrolls by a row") > redraw / 2
    assert instructions(counted, "column border let go") > redraw / 2
    for points in CHART_POINTS:
        drawn = instructions(counted, "redraw, line", points)
        assert instructions(counted, "pan by one tick, line", points) > drawn / 10
        assert instructions(counted, "live update of all values", points) > points
    assert (instructions(counted, "tap on a value, line", 1000) >
            2 * instructions(counted, "removing it", 1000))


def test_the_page_has_the_same_tables(counted):
    page = (ROOT / "docs" / "device.md").read_text(encoding="utf-8")
    shown = page.partition(footprint.BEGIN)[2].partition(footprint.END)[0].splitlines()
    made = footprint.tables(counted)
    assert [row[0] for row in rows(shown)] == [row[0] for row in rows(made)]
    figure = re.compile(r"[\d,.]+( %| with headers)?")
    assert [row for row in rows(shown) if not all(map(figure.fullmatch, row[1:]))] == []


def test_a_page_without_markers_is_refused():
    with pytest.raises(ValueError, match="markers"):
        footprint.replace_tables("no markers", ["| a |"])


def test_new_tables_replace_the_old_ones():
    page = f"before\n{footprint.BEGIN}\nold\n{footprint.END}\nafter\n"
    replaced = footprint.replace_tables(page, ["new"])
    assert replaced == f"before\n{footprint.BEGIN}\n\nnew\n\n{footprint.END}\nafter\n"


def test_a_bar_that_is_missed_is_named(image):
    counts = ("interaction\tredraw, pie\t1000\t10000001\t5\t7\talike\n"
              "interaction\tredraw, pie\t10000\t99000000\t5\t7\talike\nspeed\t1\n")
    missed = footprint.Footprint(image, counts).missed_bars()
    assert len(missed) == 1 and "redraw, pie, 1,000 points: 10,000,001" in missed[0]
    large = footprint.Footprint(image + bytes(footprint.IMAGE_BAR - len(image)), "speed\t1")
    assert "not below 131,072" in large.missed_bars()[0]


def test_what_wine_says_is_left_out(image):
    counts = "wine: something has happened\nstack\t100\nspeed\t1\n"
    assert footprint.Footprint(image, counts).stack == 100
    with pytest.raises(ValueError, match="not a line of"):
        footprint.Footprint(image, "another\tline\n")


def test_counts_that_end_early_are_refused(image):
    with pytest.raises(ValueError, match="end"):
        footprint.Footprint(image, "stack\t100")
