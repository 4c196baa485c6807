"""The workbook looks the same with the device's library as with the desktop's, to the pixel."""

import itertools
import pathlib

from desktop import wait_until
from tour import opened, steps

ROOT = pathlib.Path(__file__).resolve().parents[3]
SUNSPOTS = ROOT / "apps" / "workbook" / "data" / "sunspots.csv"
PICTURES = 12


def pictures(programs):
    """What the workbook shows on its tour, by step."""
    seen = {}
    with opened(programs, SUNSPOTS) as workbook:
        for step in steps(workbook, SUNSPOTS):
            seen[step] = picture(workbook)
    return seen


def picture(workbook):
    """What its window shows, with the text caret where there is one (it blinks)."""
    window = workbook.view().main.rect
    shown = workbook.settle().crop(window)
    if workbook.view().mode == "Ready" and not workbook.dialog():
        return shown
    blinked = wait_until(
        lambda: [other for other in [workbook.desktop.picture().crop(window)] if other != shown],
        "the caret blinks",
    )[0]
    return min(shown, blinked, key=lambda phase: sum(phase.pixels))


def test_the_tour_shows_the_same(desktop_programs, device_programs, tmp_path):
    desktop, device = pictures(desktop_programs), pictures(device_programs)
    assert list(desktop) == list(device)
    assert len(device) >= PICTURES
    for one, other in itertools.combinations(device.values(), 2):
        assert one.difference(other), "two steps of the tour look the same"
    for step, wanted in desktop.items():
        device[step].write_png(tmp_path / f"{step}.png")
        assert wanted.difference(device[step]) is None, f"{step}: see {tmp_path}"
