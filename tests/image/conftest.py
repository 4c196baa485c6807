"""Options of the tests that look at the device's library as a file."""

import pathlib

import pytest

from pe_file import PeFile


def pytest_addoption(parser):
    parser.addoption("--build", required=True, help="the build tree of the preset wince-arm")


@pytest.fixture(scope="session")
def source():
    return pathlib.Path(__file__).resolve().parents[2]


@pytest.fixture(scope="session")
def build(pytestconfig):
    return pathlib.Path(pytestconfig.getoption("--build")).resolve()


@pytest.fixture(scope="session")
def library_path(build):
    return build / "bin" / "korcontrols.dll"


@pytest.fixture(scope="session")
def library(library_path):
    return PeFile(library_path)
