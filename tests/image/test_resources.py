"""Everything in src/library/korcontrols.rc is in the library."""

import re
import struct

import pytest

BITMAP, DIALOG, STRINGS, VERSION = 2, 5, 6, 16
BITMAP_FILE_HEADER = 14  # bytes before the picture in a .bmp file, absent in a resource


@pytest.fixture(scope="module")
def script(source):
    """The script with the numbers of its identifiers."""
    names = (source / "src" / "base" / "resources.h").read_text()
    numbers = dict(re.findall(r"^#define (KOR_\w+) (\d+)$", names, re.MULTILINE))
    text = re.sub(r"//[^\n]*", "", (source / "src" / "library" / "korcontrols.rc").read_text())
    return re.sub(r"\bKOR_\w+", lambda name: numbers[name.group()], text)


@pytest.fixture(scope="module")
def resources(library):
    found = {(r.kind, r.name): r.data for r in library.resources()}
    assert len(found) == len(library.resources()), "a resource in two languages"
    return found


def numbers_of(script, word):
    return {int(number) for number in re.findall(rf"^(\d+)\s+{word}\b", script, re.MULTILINE)}


def test_kinds_and_numbers_are_those_of_the_script(script, resources):
    bitmaps, dialogs = numbers_of(script, "BITMAP"), numbers_of(script, "DIALOG")
    assert {name for kind, name in resources if kind == BITMAP} == bitmaps == {105, 107}
    assert {name for kind, name in resources if kind == DIALOG} == dialogs == {3000, 3001, 4050}
    assert {kind for kind, _ in resources} == {BITMAP, DIALOG, STRINGS, VERSION}


def test_bitmaps_are_the_files(script, resources, source):
    for number, name in re.findall(r'^(\d+)\s+BITMAP\s+"([^"]+)"', script, re.MULTILINE):
        file = (source / "src" / "library" / name).read_bytes()
        data = resources[BITMAP, int(number)]
        assert data[:len(file) - BITMAP_FILE_HEADER] == file[BITMAP_FILE_HEADER:], name


def strings_of(resources):
    """{id: text}. A block holds sixteen texts, each after its length."""
    found = {}
    for (kind, block), data in resources.items():
        if kind != STRINGS:
            continue
        at = 0
        for i in range(16):
            length, = struct.unpack_from("<H", data, at)
            if length:
                text = data[at + 2:at + 2 + 2 * length].decode("utf-16-le")
                found[(block - 1) * 16 + i] = text
            at += 2 + 2 * length
    return found


def test_strings_are_those_of_the_script(script, resources):
    table = script[script.index("STRINGTABLE"):]
    table = table[:table.index("END")]
    written = {int(number): text for number, text in re.findall(r'(\d+)\s+"([^"]*)"', table)}
    assert strings_of(resources) == written
    assert sorted(written) == list(range(1, 11))


def read_dialog(data):
    """(style, control count, (x, y, width, height), caption) of a plain dialog template."""
    style, _, count, *place = struct.unpack_from("<IIH4h", data)
    assert struct.unpack_from("<HH", data, 18) == (0, 0), "no menu, the usual class"
    caption = data[22:].decode("utf-16-le").split("\0")[0]
    return style, count, tuple(place), caption


@pytest.mark.parametrize("number, count, place, caption", [
    (3000, 6, (0, 0, 130, 75), "Titles"),
    (3001, 12, (0, 0, 130, 75), "Data"),
    (4050, 2, (0, 0, 102, 59), "Graph Print")])
def test_dialogs_are_plain_ones_with_their_controls(resources, number, count, place, caption):
    style, controls, rectangle, text = read_dialog(resources[DIALOG, number])
    assert style & 0xFFFF != 1 or style >> 16 != 0xFFFF, "not of the extended kind"
    assert (controls, rectangle, text) == (count, place, caption)


def test_version_record_is_that_of_the_library(resources):
    data = resources[VERSION, 1]
    assert data[6:38].decode("utf-16-le") == "VS_VERSION_INFO\0"
    signature, _, high, low = struct.unpack_from("<IIII", data, 40)
    assert signature == 0xFEEF04BD
    assert (high, low) == (49, 0)
