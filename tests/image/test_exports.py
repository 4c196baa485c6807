"""The library exports what src/library/korcontrols.def says."""

import pytest

from definitions import read_exports


@pytest.fixture(scope="module")
def promised(source):
    return read_exports(source / "src" / "library" / "korcontrols.def")


def test_names_and_ordinals_are_the_promised_ones(library, promised):
    assert {export.name: export.ordinal for export in library.exports()} == promised


def test_there_are_38(promised):
    assert len(promised) == 38
    assert sorted(promised.values()) == list(range(1, 39))


def test_each_leads_into_the_code(library):
    for export in library.exports():
        assert library.section_at(export.address).is_code, export.name
        assert export.address % 4 == 0


def test_the_library_knows_its_name(library):
    assert library.export_module_name() == "korcontrols.dll"
