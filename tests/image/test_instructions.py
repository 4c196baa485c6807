"""The code is ARMv4's alone, which the oldest processors of the device run.

The walk begins at every place that the platform or a table can reach, and follows the code from there;
so numbers that lie between the functions are never taken for instructions.
"""

import pytest

from armv4 import NotArmv4, branch_target, check, ends_flow, is_call_through_register


@pytest.fixture(scope="module")
def walked(library):
    """{address: word} of every instruction that can be reached."""
    code = next(section for section in library.sections if section.is_code)
    pointed_at = {library.word(place) - library.base for _, place in library.relocations()}
    open_ends = {library.entry} | {export.address for export in library.exports()}
    open_ends |= {address for address in pointed_at if library.section_at(address) == code}
    seen = {}
    while open_ends:
        address = open_ends.pop()
        before = 0
        while address not in seen and code.address <= address < code.address + code.size:
            word = library.word(address)
            seen[address] = word
            target = branch_target(word, address)
            if target is not None:
                open_ends.add(target)
            if ends_flow(word) and not is_call_through_register(word, before):
                break
            before = word
            address += 4
    return seen


def test_every_instruction_is_of_armv4(walked):
    found = []
    for address, word in walked.items():
        try:
            check(word)
        except NotArmv4 as error:
            found.append(f"{address:#x}: {word:08x}: {error}")
    assert not found


def test_the_walk_sees_the_code_and_not_a_corner_of_it(library, walked):
    code = next(section for section in library.sections if section.is_code)
    # What is left are the addresses and numbers between the functions.
    assert 4 * len(walked) > 0.85 * code.size


@pytest.mark.parametrize("word", [
    0xE12FFF1E,  # bx lr
    0xE12FFF33,  # blx r3
    0xE16F0F11,  # clz r0, r1
    0xE1C000D0,  # ldrd r0, [r0]
    0xE1C000F0,  # strd r0, [r0]
    0xF5D1F000,  # pld [r1]
    0xE1600080,  # smulbb r0, r0, r0
    0xE1010050,  # qadd r0, r0, r1
    0xE6BF0070,  # sxth r0, r0
    0xE3000001,  # movw r0, #1
    0xE7F000F0,  # udf
    0xE1900F9F,  # ldrex r0, [r0]
    0xEE300B40,  # faddd
    0xFA000000,  # blx to Thumb
])
def test_what_later_versions_brought_is_recognised(word):
    with pytest.raises(NotArmv4):
        check(word)


def test_what_version_4_has_is_let_through():
    words = [
        0xE1A0F00E,  # mov pc, lr
        0xE92D4010,  # stmdb sp!, {r4, lr}
        0xE8BD8010,  # ldmia sp!, {r4, pc}
        0xE59FC000,  # ldr ip, [pc]
        0xE1D010B2,  # ldrh r1, [r0, #2]
        0xE1D010F2,  # ldrsh r1, [r0, #2]
        0xE1D010D2,  # ldrsb r1, [r0, #2]
        0xE1C010B2,  # strh r1, [r0, #2]
        0xE0810392,  # umull r0, r1, r2, r3
        0xE0C10392,  # smull r0, r1, r2, r3
        0xE0000291,  # mul r0, r1, r2
        0xE10F0000,  # mrs r0, cpsr
        0xE3500000,  # cmp r0, #0
        0xEBFFFFFE,  # bl
        0xEF000000,  # swi 0
    ]
    for word in words:
        check(word)
