"""The workbook uses the whole library, and its page says where."""

import re
import struct

import pytest

from desktop import ROOT

HEADERS = sorted((ROOT / "include" / "korcontrols").glob("*.h"))
WORKBOOK = ROOT / "apps" / "workbook"
MESSAGE = r"(?:GRIDM|GRIDN|HCM|HCN|GM|GN|TIPM|FBM|FBN)_\w+"


def exports():
    lines = (ROOT / "src" / "library" / "korcontrols.def").read_text().splitlines()
    return {line.split()[0] for line in lines if re.match(r"\s+\w+\s+@\d+", line)}


def messages():
    return {
        name for file in HEADERS for name in re.findall(rf"(?m)^#define ({MESSAGE})", file.read_text())
    }


def wrappers():
    """The typed wrappers of each message."""
    found = {}
    for file in HEADERS:
        for name, body in re.findall(
            r"static __inline[\w *]+?(Kor\w+)\([^)]*\)\s*\{(.*?)\}\n", file.read_text(), re.S
        ):
            for message in re.findall(MESSAGE, body):
                found.setdefault(message, set()).add(name)
    return found


def table():
    """(name, place) of each name in the page's table."""
    rows = []
    for line in (ROOT / "docs" / "workbook.md").read_text().splitlines():
        cells = [cell.strip() for cell in line.strip("|").split("|")]
        if len(cells) == 3:
            rows += [(name, cells[2]) for name in re.findall(r"`(\w+)`", cells[0])]
    return rows


class Image:
    """A Windows program's file, with addresses as it has them when it is loaded."""

    def __init__(self, path):
        self._bytes = path.read_bytes()
        header = self._number("<I", 0x3C)
        sections, optional_size = self._number("<H", header + 6), self._number("<H", header + 20)
        optional = header + 24
        self._is64 = self._number("<H", optional) == 0x20B
        self._sections = [
            struct.unpack_from("<4I", self._bytes, optional + optional_size + 40 * index + 8)
            for index in range(sections)
        ]
        self._imports = self._number("<I", optional + (112 if self._is64 else 96) + 8)

    def _number(self, form, offset):
        return struct.unpack_from(form, self._bytes, offset)[0]

    def _offset(self, address):
        for size, start, _, raw in self._sections:
            if start <= address < start + size:
                return address - start + raw
        raise ValueError(f"no section has {address:#x}")

    def _text(self, address):
        start = self._offset(address)
        return self._bytes[start : self._bytes.index(b"\0", start)].decode()

    def imports_of(self, library):
        """The names that the program imports from a library."""
        names, at = set(), self._offset(self._imports)
        while self._number("<I", at + 12):
            if self._text(self._number("<I", at + 12)).lower() == library:
                names |= set(self._names(self._offset(self._number("<I", at))))
            at += 20
        return names

    def _names(self, at):
        form, step = ("<Q", 8) if self._is64 else ("<I", 4)
        while address := self._number(form, at):
            yield self._text(address + 2)
            at += step


def test_the_workbook_imports_every_export(programs):
    assert len(exports()) == 38
    used = Image(programs / "workbook.exe").imports_of("korcontrols.dll")
    assert exports() - used == set()


def test_the_page_names_every_export_and_message():
    assert len(messages()) >= 60
    named = {name for name, _ in table()}
    assert (exports() | messages()) - named == set()


def source(file):
    return (WORKBOOK / file if (WORKBOOK / file).exists() else ROOT / file).read_text()


@pytest.mark.parametrize("name, place", table())
def test_what_the_page_says_is_so(name, place):
    assert name in exports() | messages()
    words = re.findall(r"`([\w./]+)`", place)
    file = next(word for word in words if word.endswith(".cpp"))
    text = source(file)
    assert any(re.search(rf"\b{known}\b", text) for known in {name} | wrappers().get(name, set()))
    for function in words:
        if not function.endswith(".cpp"):
            assert re.search(rf"\b{function}\(", text), function
