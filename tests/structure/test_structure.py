"""The rooms of src/: includes run downwards, and what only reckons stays without the platform."""

import pathlib
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.path.insert(0, str(ROOT / "tools"))

import structure  # noqa: E402


def problems_of(**files):
    """Of files that are given as room__name="headers"."""
    names = {name.replace("__", "/") + ".h": value.split() for name, value in files.items()}
    return structure.problems(names)


def test_the_tree_is_as_it_is_drawn():
    ran = subprocess.run(
        [sys.executable, "-B", ROOT / "tools/structure.py", "--check"],
        capture_output=True,
        text=True,
        check=False,
    )
    assert ran.returncode == 0, ran.stdout


def test_an_include_that_runs_up_is_found():
    assert problems_of(base__a="grid/b.h", grid__b="") == ["base/a.h: grid/b.h is not below base"]
    assert problems_of(grid__b="base/a.h", base__a="") == []


def test_neighbours_do_not_include_each_other():
    assert problems_of(header__a="funkybar/b.h", funkybar__b="") == [
        "header/a.h: funkybar/b.h is not below header"
    ]


def test_what_only_reckons_needs_no_platform():
    assert problems_of(grid__moves="platform/platform.h", platform__platform="<windows.h>") == [
        "grid/moves.h: only reckons, and includes platform/platform.h"
    ]
    assert problems_of(grid__moves="<korcontrols/grid.h>") == [
        "grid/moves.h: only reckons, and includes <korcontrols/grid.h>"
    ]
    assert problems_of(grid__moves="<cmath> grid/block.h", grid__block="<cstdint>") == []


def test_a_room_that_nobody_knows_is_found():
    assert problems_of(attic__a="") == ["attic/a.h: attic is no room that structure.py knows"]


def test_a_missing_file_is_found():
    assert problems_of(grid__a="grid/b.h") == ["grid/a.h: there is no grid/b.h"]
