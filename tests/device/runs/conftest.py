"""Options of the tests that run programs on the device's image."""

import pathlib
import sys

import pytest

TESTS = pathlib.Path(__file__).resolve().parents[2]
TOOLS = TESTS.parent / "tools"
sys.dont_write_bytecode = True
sys.path[:0] = [str(TESTS / "image"), str(TOOLS / "desktop"), str(TOOLS)]


def pytest_addoption(parser):
    parser.addoption("--desktop", required=True, help="the folder with the desktop's library")
    parser.addoption("--stand-in", required=True, help="the folder with the stand-in")


@pytest.fixture(scope="session")
def desktop_programs(pytestconfig):
    return pathlib.Path(pytestconfig.getoption("--desktop")).resolve()


@pytest.fixture(scope="session")
def device_programs(pytestconfig):
    return pathlib.Path(pytestconfig.getoption("--stand-in")).resolve()
