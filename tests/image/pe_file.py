"""A reader of portable executables: what the device's loader looks at, and no more.

It knows the file format from its description and shares nothing with the tools that wrote the file.
"""

import struct
from typing import NamedTuple

EXPORTS, IMPORTS, RESOURCES, EXCEPTIONS, RELOCATIONS = 0, 1, 2, 3, 5
TLS, LOAD_CONFIGURATION, DELAYED_IMPORTS = 9, 10, 13


class Section(NamedTuple):
    name: str
    address: int  # relative to the image, as all addresses here
    size: int
    characteristics: int

    @property
    def is_code(self):
        return bool(self.characteristics & 0x20)

    @property
    def is_writable(self):
        return bool(self.characteristics & 0x80000000)


class Export(NamedTuple):
    ordinal: int
    name: str
    address: int


class Resource(NamedTuple):
    kind: int
    name: int
    language: int
    data: bytes


class PeFile:
    def __init__(self, path):
        with open(path, "rb") as file:
            self.bytes = file.read()
        assert self.bytes[:2] == b"MZ"
        self.header = struct.unpack_from("<I", self.bytes, 0x3C)[0]
        assert self.bytes[self.header:self.header + 4] == b"PE\0\0"
        (self.machine, section_count, self.timestamp, _, self.symbol_count, optional_size,
         self.characteristics) = struct.unpack_from("<HHIIIHH", self.bytes, self.header + 4)
        self._read_optional_header(self.header + 24)
        self._load(self.header + 24 + optional_size, section_count)

    def _read_optional_header(self, at):
        self.magic = struct.unpack_from("<H", self.bytes, at)[0]
        self.entry, = struct.unpack_from("<I", self.bytes, at + 16)
        self.base, self.section_alignment, self.file_alignment = struct.unpack_from(
            "<III", self.bytes, at + 28)
        (self.system_major, self.system_minor, _, _, self.subsystem_major,
         self.subsystem_minor) = struct.unpack_from("<6H", self.bytes, at + 40)
        self.image_size, self.headers_size, self.checksum = struct.unpack_from(
            "<III", self.bytes, at + 56)
        self.subsystem, self.dll_characteristics = struct.unpack_from("<HH", self.bytes, at + 68)
        count, = struct.unpack_from("<I", self.bytes, at + 92)
        self.directories = [struct.unpack_from("<II", self.bytes, at + 96 + 8 * i)
                            for i in range(count)]

    def _load(self, at, count):
        """Lays the sections out as in memory."""
        self.sections = []
        self.image = bytearray(self.image_size)
        self.image[:self.headers_size] = self.bytes[:self.headers_size]
        for i in range(count):
            name, size, address, file_size, file_at = struct.unpack_from("<8sIIII", self.bytes,
                                                                         at + 40 * i)
            flags, = struct.unpack_from("<I", self.bytes, at + 40 * i + 36)
            self.sections.append(Section(name.rstrip(b"\0").decode(), address, size, flags))
            used = min(size, file_size)
            self.image[address:address + used] = self.bytes[file_at:file_at + used]

    def word(self, address):
        return struct.unpack_from("<I", self.image, address)[0]

    def text(self, address):
        return bytes(self.image[address:self.image.index(0, address)]).decode("ascii")

    def section_at(self, address):
        for section in self.sections:
            if section.address <= address < section.address + section.size:
                return section
        return None

    def exports(self):
        start, _ = self.directories[EXPORTS]
        (base, functions, names, function_table, name_table,
         place_table) = struct.unpack_from("<IIIIII", self.image, start + 16)
        found = []
        named = {}
        for i in range(names):
            place, = struct.unpack_from("<H", self.image, place_table + 2 * i)
            named[place] = self.text(self.word(name_table + 4 * i))
        for place in range(functions):
            address = self.word(function_table + 4 * place)
            if address:
                found.append(Export(base + place, named.get(place, ""), address))
        return found

    def export_module_name(self):
        return self.text(self.word(self.directories[EXPORTS][0] + 12))

    def imports(self):
        """{module: [name, ...]}; an import by number appears as "#7"."""
        found = {}
        at, size = self.directories[IMPORTS]
        while size and self.word(at + 12):
            lookup, address_table = self.word(at), self.word(at + 16)
            names = []
            entry = lookup or address_table
            while self.word(entry):
                value = self.word(entry)
                names.append(f"#{value & 0xFFFF}" if value >> 31 else self.text(value + 2))
                entry += 4
            found.setdefault(self.text(self.word(at + 12)), []).extend(names)
            at += 20
        return found

    def relocations(self):
        """[(kind, address), ...] without the entries that only fill up a block."""
        found = []
        at, size = self.directories[RELOCATIONS]
        end = at + size
        while at < end:
            page, block = struct.unpack_from("<II", self.image, at)
            assert block >= 8 and block % 4 == 0
            for entry in struct.unpack_from(f"<{(block - 8) // 2}H", self.image, at + 8):
                if entry >> 12:
                    found.append((entry >> 12, page + (entry & 0xFFF)))
            at += block
        return found

    def resources(self):
        start, _ = self.directories[RESOURCES]
        found = []

        def walk(table, path):
            named, numbered = struct.unpack_from("<HH", self.image, table + 12)
            assert not named, "all resources have numbers"
            for i in range(numbered):
                number, offset = struct.unpack_from("<II", self.image, table + 16 + 8 * i)
                if offset >> 31:
                    walk(start + (offset & 0x7FFFFFFF), path + [number])
                else:
                    address, size = struct.unpack_from("<II", self.image, start + offset)
                    found.append(Resource(*path, number, bytes(self.image[address:address + size])))

        walk(start, [])
        return found
