"""What the stand-in catches: an export of the image is overwritten with a few instructions, and a
program that calls it must be stopped with the right words."""

import pathlib
import shutil
import struct
import subprocess

import pytest

from pe_file import PeFile

WINE_RUN = pathlib.Path(__file__).resolve().parents[3] / "scripts" / "wine-run"
STOPPED = 70
RETURN = 0xE1A0F00E  # mov pc, lr

CASES = {
    "a newer instruction": ([0xE16F0F10], "ARMv4 does not have"),  # clz r0, r0
    "an unpredictable one": ([0xE1B0F00E], "unpredictable"),  # movs pc, lr
    "a misaligned read": ([0xE59F0001], "a misaligned read"),  # ldr r0, [pc, #1]
    "a misaligned write": ([0xE28D1002, 0xE5810000], "a misaligned write"),  # add r1, sp, #2; str
    "a write below the stack": ([0xE50D0004], "below the stack pointer"),  # str r0, [sp, #-4]
    "a write to code": ([0xE58F0000], "not the guest's"),  # str r0, [pc]
    # mov r1, #0x400000, where the program lies; str r0, [r1]
    "a write to the program's headers": ([0xE3A01501, 0xE5810000], "not the guest's"),
    "a read from nowhere": ([0xE3A01000, 0xE5910000], "a read from 00000000"),  # ldr r0, [0]
    "a jump into the program": ([0xE3A01501, 0xE1A0F001], "a jump out of the image"),
    "a jump to the middle": ([0xE28F1002, 0xE1A0F001], "a jump to a misaligned address"),
    "a register not put back": ([0xE3A04000, RETURN], "r4 was not put back"),  # mov r4, #0
    "a stack pointer not put back": ([0xE24DD004, RETURN], "the stack pointer came back"),
    "an operating system's call": ([0xEF000000], "ARMv4 does not have"),  # swi 0
}


class StandIn:
    """A folder with the stand-in, a program, and an image of one's own."""

    def __init__(self, folder, programs):
        self.folder, self.programs = folder, programs
        for name in ("korcontrols.dll", "library_tests.exe"):
            shutil.copy(programs / name, folder)
        (folder / "device").mkdir()

    def run(self, words, change=lambda image: None):
        """Puts the words at the beginning of an export and calls it; the finished process."""
        path = self.programs / "device" / "korcontrols.dll"
        data = bytearray(path.read_bytes())
        at = file_offset(PeFile(path), export_address(PeFile(path)))
        data[at : at + 4 * len(words)] = struct.pack(f"<{len(words)}I", *words)
        change(data)
        (self.folder / "device" / "korcontrols.dll").write_bytes(data)
        return subprocess.run(
            [WINE_RUN, self.folder / "library_tests.exe", "--gtest_filter=Version.*"],
            capture_output=True,
            text=True,
            check=False,
            timeout=120,
        )


def export_address(image):
    return next(entry.address for entry in image.exports() if entry.name == "KORCONTROLS_Version")


def file_offset(image, address):
    """Where in the file the byte lies that is loaded at this address."""
    count = struct.unpack_from("<H", image.bytes, image.header + 6)[0]
    table = image.header + 24 + struct.unpack_from("<H", image.bytes, image.header + 20)[0]
    for at in range(table, table + 40 * count, 40):
        size, start, _, offset = struct.unpack_from("<IIII", image.bytes, at + 8)
        if start <= address < start + size:
            return offset + address - start
    raise AssertionError(f"nothing is loaded at {address:x}")


@pytest.fixture
def stand_in(tmp_path, device_programs):
    return StandIn(tmp_path, device_programs)


@pytest.mark.parametrize("case", CASES)
def test_stops_at(case, stand_in):
    words, message = CASES[case]
    ended = stand_in.run(words)
    assert message in ended.stdout
    assert ended.returncode == STOPPED


def test_runs_the_image_as_it_is(stand_in):
    assert stand_in.run([]).returncode == 0


def test_runs_the_images_own_code(stand_in):
    ended = stand_in.run([0xE3A00007, RETURN])  # mov r0, #7
    assert "Which is: 7" in ended.stdout
    assert ended.returncode == 1


def test_takes_no_image_for_another_machine(stand_in):
    def for_i386(data):
        header = struct.unpack_from("<I", data, 0x3C)[0]
        struct.pack_into("<H", data, header + 4, 0x14C)

    ended = stand_in.run([], for_i386)
    assert "machine 014c is not ARM" in ended.stdout
    assert ended.returncode == STOPPED


def test_takes_no_image_with_other_exports(stand_in):
    def renamed(data):
        at = data.index(b"KORCONTROLS_Version\0")
        data[at : at + 3] = b"kor"

    ended = stand_in.run([], renamed)
    assert "the library does not" in ended.stdout
    assert ended.returncode == STOPPED
