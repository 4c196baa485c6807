"""The same sources give the same bytes, wherever they lie."""

import os
import re
import shutil

import pytest

from build_commands import run

SOURCES = ("CMakeLists.txt", "CMakePresets.json", "cmake", "include", "scripts", "src")
OUTPUTS = ("bin/korcontrols.dll", "lib/libkorcontrols.dll.a")


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


@pytest.mark.parametrize("name", OUTPUTS)
def test_another_folder_gives_the_same_bytes(build, other_build, name):
    assert (build / name).read_bytes() == (other_build / name).read_bytes()


@pytest.mark.parametrize("name", OUTPUTS)
def test_no_folder_of_this_machine_is_in_it(build, source, name):
    content = (build / name).read_bytes()
    for folder in (str(source), str(build), os.path.expanduser("~") + "/", "/usr/", "/tmp/"):
        # The last form is how a folder would stand in the name of a symbol.
        as_symbol = re.sub(r"\W", "_", folder)
        for written in (folder.encode(), folder.encode("utf-16-le"), as_symbol.encode()):
            assert written not in content
