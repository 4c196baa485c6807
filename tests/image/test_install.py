"""What is installed is enough to build a host for the device."""

import pytest

from build_commands import compile_command, link_command, run
from pe_file import PeFile

HOST = """
#include <korcontrols/korcontrols.h>
#include <korcontrols/grid.h>

extern "C" int HostEntry(HINSTANCE instance, HINSTANCE, LPWSTR, int) {
    return RegisterGridControl(instance) ? static_cast<int>(KORCONTROLS_Version()) : 0;
}
"""


@pytest.fixture(scope="module")
def installed(build, tmp_path_factory):
    folder = tmp_path_factory.mktemp("installed")
    done = run(["cmake", "--install", str(build), "--prefix", str(folder)], build)
    assert done.returncode == 0, done.stderr
    return folder


def test_the_library_its_import_library_and_all_headers_are_there(installed, source, build):
    files = {str(path.relative_to(installed)) for path in installed.rglob("*") if path.is_file()}
    headers = {f"include/korcontrols/{path.name}"
               for path in (source / "include" / "korcontrols").iterdir()}
    headers.add("include/korcontrols/version.h")  # which is made
    assert files == headers | {"bin/korcontrols.dll", "lib/libkorcontrols.dll.a",
                               "lib/korcontrols.def"}
    assert (installed / "bin" / "korcontrols.dll").read_bytes() == (
        build / "bin" / "korcontrols.dll").read_bytes()


def test_a_host_links_with_it(installed, build, source, tmp_path):
    code, thing, host = tmp_path / "host.cpp", tmp_path / "host.obj", tmp_path / "host.exe"
    code.write_text(HOST)
    command = compile_command(build, code, thing)
    # With the installed headers, not the tree's.
    command = [word for word in command if word not in (f"-I{source}/include", f"-I{source}/src", f"-I{build}/include")]
    compiled = run(command + [f"-I{installed}/include"], tmp_path)
    assert compiled.returncode == 0, compiled.stderr

    linker = link_command(build, "")[0]
    linked = run([linker, "--subsystem", "wince:3.0", "-e", "HostEntry", str(thing),
                  f"-L{installed}/lib", "-lkorcontrols", "-o", str(host)], tmp_path)
    assert linked.returncode == 0, linked.stderr
    imports = PeFile(host).imports()
    assert {name: set(imports[name]) for name in imports} == {
        "korcontrols.dll": {"RegisterGridControl", "KORCONTROLS_Version"}}
