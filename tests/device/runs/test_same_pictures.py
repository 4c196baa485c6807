"""The workbook looks the same with the device's library as with the desktop's, to the pixel."""

import itertools
import pathlib

from tour import opened, steps

ROOT = pathlib.Path(__file__).resolve().parents[3]
SUNSPOTS = ROOT / "examples" / "workbook" / "data" / "sunspots.csv"
PICTURES = 9


def pictures(programs):
    """What the workbook shows on its tour, by step."""
    seen = {}
    with opened(programs, SUNSPOTS) as workbook:
        for step in steps(workbook, SUNSPOTS):
            seen[step] = workbook.settle().crop(workbook.view().main.rect)
    return seen


def test_the_tour_shows_the_same(desktop_programs, device_programs, tmp_path):
    desktop, device = pictures(desktop_programs), pictures(device_programs)
    assert list(desktop) == list(device)
    assert len(device) >= PICTURES
    for one, other in itertools.combinations(device.values(), 2):
        assert one.difference(other), "two steps of the tour look the same"
    for step, wanted in desktop.items():
        device[step].write_png(tmp_path / f"{step}.png")
        assert wanted.difference(device[step]) is None, f"{step}: see {tmp_path}"
