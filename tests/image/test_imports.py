"""The library needs nothing but what Windows CE 3.0 has, by name, from three modules."""

import pytest

from definitions import read_list

MODULES = ("coredll", "commctrl", "aygshell")


@pytest.fixture(scope="module")
def lists(source):
    return dict(read_list(source / "src" / "platform" / "ce" / f"{module}.def")
                for module in MODULES)


def test_modules_are_the_platforms(library):
    assert set(library.imports()) == {f"{module}.dll" for module in MODULES}


def test_every_import_is_listed_and_every_listed_name_is_needed(library, lists):
    imports = library.imports()
    for module, names in lists.items():
        assert len(names) == len(set(names)), f"a name twice in the list of {module}"
        assert set(imports[module]) == set(names)


def test_nothing_is_imported_by_number(library):
    for names in library.imports().values():
        assert not [name for name in names if name.startswith("#")]
