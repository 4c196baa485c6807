"""The library can be loaded at any address."""

from build_commands import link_command, run
from pe_file import PeFile

HIGHLOW = 3
ELSEWHERE = 0x2C050000


def test_there_are_some_and_all_are_of_whole_words(library):
    relocations = library.relocations()
    assert len(relocations) > 100
    assert {kind for kind, _ in relocations} == {HIGHLOW}


def test_each_place_is_an_aligned_word_that_holds_an_address_of_the_library(library):
    places = [address for _, address in library.relocations()]
    assert len(places) == len(set(places))
    for place in places:
        assert place % 4 == 0
        target = library.word(place) - library.base
        assert library.section_at(target), f"{place:#x} holds {target:#x}"


def test_moving_it_gives_what_linking_it_elsewhere_gives(library, build, tmp_path):
    command = link_command(build, tmp_path / "korcontrols.dll")
    command += ["--image-base", hex(ELSEWHERE)]
    linked = run(command, build)
    assert linked.returncode == 0, linked.stderr
    elsewhere = PeFile(tmp_path / "korcontrols.dll")
    assert elsewhere.base == ELSEWHERE

    moved = bytearray(library.image)
    for _, place in library.relocations():
        value = library.word(place) - library.base + ELSEWHERE
        moved[place:place + 4] = value.to_bytes(4, "little")
    differences = [at for at in range(library.headers_size, library.image_size)
                   if moved[at] != elsewhere.image[at]]
    assert not differences
