"""The layouts in docs/device.md are those that the compilers give, on the device and on i686."""

import re
import shutil

import pytest

from build_commands import compile_command, run

ROW = re.compile(r"^\| `(\w+)` \| (\d+) \|(?: (.+) \|)?$", re.MULTILINE)
HEADERS = ("#include <windows.h>\n#include <commctrl.h>\n#include <cstddef>\n"
           + "".join(f"#include <korcontrols/{name}.h>\n" for name in (
               "grid", "header", "graph", "tooltip", "funkybar")))


@pytest.fixture(scope="module")
def documented(source):
    """{record: (size, {field: offset})} of both tables."""
    text = (source / "docs" / "device.md").read_text()
    return {name: (int(size), {field: int(offset) for field, offset
                               in re.findall(r"`(\w+)` (\d+)", fields)})
            for name, size, fields in ROW.findall(text)}


def assertions(documented):
    lines = []
    for name, (size, fields) in documented.items():
        lines.append(f'static_assert(sizeof({name}) == {size}, "size of {name}");')
        for field, offset in fields.items():
            lines.append(f'static_assert(offsetof({name}, {field}) == {offset}, '
                         f'"{name}.{field}");')
    return HEADERS + "\n".join(lines) + "\n"


def test_every_public_record_and_field_is_in_the_table(documented, source):
    declared = {}
    for header in (source / "include" / "korcontrols").glob("*.h"):
        text = re.sub(r"/\*.*?\*/", "", header.read_text(), flags=re.DOTALL)
        for body, name in re.findall(r"typedef struct \w+ \{(.*?)\} (?:[A-Z_]+ )?(\w+);", text, re.DOTALL):
            declared[name] = re.findall(r"(\w+);", body)
    assert len(declared) >= 10
    public = {name: list(fields) for name, (_, fields) in documented.items() if fields}
    assert public == declared


def test_the_device_has_these_layouts(documented, build, tmp_path):
    code = tmp_path / "layouts.cpp"
    code.write_text(assertions(documented))
    done = run(compile_command(build, code, tmp_path / "layouts.obj"), build)
    assert done.returncode == 0, done.stderr


def test_32_bit_windows_has_the_same(documented, source, tmp_path):
    compiler = shutil.which("i686-w64-mingw32-g++-posix")
    assert compiler, "scripts/setup device installs it, for its headers"
    code = tmp_path / "layouts.cpp"
    code.write_text(assertions(documented))
    done = run([compiler, "-fsyntax-only", f"-I{source}/include", str(code)], tmp_path)
    assert done.returncode == 0, done.stderr


def test_sizes_are_multiples_of_four(documented):
    assert not [name for name, (size, _) in documented.items() if size % 4]


def test_doubles_stand_at_multiples_of_eight(documented):
    for name, field in (("GraphValue", "value"), ("GraphRange", "min"), ("GraphRange", "max")):
        assert documented[name][1][field] % 8 == 0
