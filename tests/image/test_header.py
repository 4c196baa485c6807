"""The headers are those of a library for Windows CE 3.0 on ARM."""

import struct

from pe_file import (DELAYED_IMPORTS, EXCEPTIONS, LOAD_CONFIGURATION, TLS)


def test_machine_is_arm(library):
    assert library.machine == 0x01C0
    assert library.magic == 0x010B


def test_subsystem_is_windows_ce_3(library):
    assert library.subsystem == 9
    assert (library.subsystem_major, library.subsystem_minor) == (3, 0)
    assert (library.system_major, library.system_minor) == (3, 0)


def test_is_a_library_that_can_be_moved(library):
    is_library, without_relocations = 0x2000, 0x0001
    assert library.characteristics & is_library
    assert not library.characteristics & without_relocations


def test_has_no_features_of_later_systems(library):
    assert library.dll_characteristics == 0
    for directory in (EXCEPTIONS, TLS, LOAD_CONFIGURATION, DELAYED_IMPORTS):
        assert library.directories[directory] == (0, 0)


def test_has_neither_time_nor_symbols(library):
    assert library.timestamp == 0
    assert library.symbol_count == 0


def test_sections_begin_on_pages_and_follow_each_other(library):
    assert library.section_alignment == 0x1000
    end = 0
    for section in library.sections:
        assert section.address % 0x1000 == 0
        assert section.address >= end
        end = section.address + section.size
    assert end <= library.image_size


def test_code_is_not_writable(library):
    assert [section.name for section in library.sections if section.is_code] == [".text"]
    assert not library.section_at(library.entry).is_writable


def test_entry_is_code(library):
    assert library.section_at(library.entry).is_code
    assert library.entry % 4 == 0


def test_the_file_ends_where_its_sections_end(library):
    count, = struct.unpack_from("<H", library.bytes, library.header + 6)
    table = library.header + 24 + 224
    ends = [sum(struct.unpack_from("<II", library.bytes, table + 40 * i + 16))
            for i in range(count)]
    assert max(ends) == len(library.bytes)
