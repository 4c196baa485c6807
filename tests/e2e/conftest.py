"""Fixtures: one desktop for each machine, and workbooks that are closed whatever happens.

    python3 -m pytest tests/e2e [--machine i686] [--machine x86_64] [--machine device] [--build build]
"""

import pathlib
import shutil
import sys

import pytest

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[2] / "tools" / "desktop"))

from clipboard import Clipboard  # noqa: E402
from desktop import ROOT, Desktop  # noqa: E402
from probe import Probe  # noqa: E402
from workbook_app import Workbook, windows_path  # noqa: E402

DATA = ROOT / "apps" / "workbook" / "data"
FAILURES = ROOT / "build" / "e2e-failures"


def pytest_addoption(parser):
    parser.addoption("--machine", action="append", help="i686, x86_64 (default: both) or device")
    parser.addoption("--kills", type=int, default=6, help="how often a program is killed as it saves")
    parser.addoption("--build", default=ROOT / "build", help="the folder of the presets' builds")


def pytest_generate_tests(metafunc):
    if "machine" in metafunc.fixturenames:
        machines = metafunc.config.getoption("machine") or ["i686", "x86_64"]
        metafunc.parametrize("machine", machines, scope="session")


@pytest.hookimpl(hookwrapper=True)
def pytest_runtest_makereport(item, call):
    outcome = yield
    if call.when == "call":
        item.has_failed = outcome.get_result().failed


@pytest.fixture(scope="session")
def programs(machine, pytestconfig):
    """The folder with workbook.exe and window_probe.exe."""
    folder = "i686/device" if machine == "device" else f"{machine}/bin"
    return pathlib.Path(pytestconfig.getoption("build")).absolute() / folder


@pytest.fixture
def alone_with_library(machine, programs, tmp_path):
    """alone_with_library("host.exe") is a copy of the program, in a folder that it shares with the
    library and nothing else."""
    library = ["korcontrols.dll"]  # on the device this is the stand-in, which reads the image
    if machine == "device":
        library.append("device/korcontrols.dll")

    def copy(program):
        for name in program, *library:
            (tmp_path / name).parent.mkdir(exist_ok=True)
            shutil.copy(programs / name, tmp_path / name)
        return tmp_path / program

    return copy


@pytest.fixture(scope="session")
def desktop(programs):
    with Desktop(programs / "workbook.exe") as started:
        yield started


@pytest.fixture(scope="session")
def probe(desktop, programs):
    started = Probe(desktop, programs / "window_probe.exe")
    yield started
    started.close()


@pytest.fixture
def clipboard(desktop, programs):
    return Clipboard(desktop, programs / "window_probe.exe")


@pytest.fixture
def open_workbook(desktop, probe, programs, machine, request):
    """open_workbook(path, ...) starts workbook.exe with these files as arguments; `options` go to
    Popen."""
    started = []

    def open_one(*files, **options):
        workbook = Workbook(
            desktop,
            probe,
            programs / "workbook.exe",
            *[windows_path(file) for file in files],
            **options,
        )
        started.append(workbook)
        return workbook

    yield open_one
    if getattr(request.node, "has_failed", False):
        FAILURES.mkdir(parents=True, exist_ok=True)
        desktop.picture().write_png(FAILURES / f"{request.node.originalname}-{machine}.png")
    desktop.release_button()  # a test that fails in the middle of a drag leaves it pressed
    for workbook in started:
        workbook.kill()


@pytest.fixture
def sunspots(tmp_path):
    """A copy of the example's data."""
    return pathlib.Path(shutil.copy(DATA / "sunspots.csv", tmp_path))


@pytest.fixture
def stations(tmp_path):
    """A small file whose every cell is known."""
    path = tmp_path / "stations.csv"
    path.write_bytes(
        b"Station,Height,Rain,Sun\r\n"
        b"Harbour,4,12.5,6\r\n"
        b"Moor,212,30.25,3\r\n"
        b'"Mill, old",88,17,4.5\r\n'
        b"Ridge,540,41,2\r\n"
    )
    return path
