"""The same sources give the same bytes, wherever they lie."""

import os
import shutil

import pytest

from build_commands import run

SOURCES = ("CMakeLists.txt", "CMakePresets.json", "cmake", "include", "res", "scripts", "src")


@pytest.fixture(scope="module")
def other_build(source, tmp_path_factory):
    """A build of the same sources in a folder of another name and length."""
    folder = tmp_path_factory.mktemp("another place, with spaces in its name")
    for name in SOURCES:
        copy = shutil.copytree if (source / name).is_dir() else shutil.copy
        copy(source / name, folder / name)
    environment = dict(os.environ, SOURCE_DATE_EPOCH="1", TZ="Asia/Tokyo", LC_ALL="C")
    for command in (["cmake", "--preset", "wince-arm", "-DKORCONTROLS_BUILD_TESTS=OFF"],
                    ["cmake", "--build", "--preset", "wince-arm"]):
        done = run(command, folder, env=environment)
        assert done.returncode == 0, done.stdout + done.stderr
    return folder / "build" / "wince-arm"


@pytest.mark.parametrize("name", ["bin/korcontrols.dll", "lib/libkorcontrols.dll.a"])
def test_another_folder_gives_the_same_bytes(build, other_build, name):
    assert (build / name).read_bytes() == (other_build / name).read_bytes()


def test_no_folder_of_this_machine_is_in_the_library(build, source, library):
    for folder in (str(source), str(build), os.path.expanduser("~") + "/", "/usr/", "/tmp/"):
        assert folder.encode() not in library.bytes
        assert folder.encode("utf-16-le") not in library.bytes
