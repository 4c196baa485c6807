"""What becomes of files when saving is not as simple as that: others at the file, links, rights, no
room, no folder, a killed program."""

import os
import pathlib
import random
import resource
import signal
import subprocess
import time

import pytest

from desktop import WINE_RUN
from test_files import static_text, title, type_into
from workbook_app import expect, windows_path

OURS = b"Harbour,5,12.5,6"  # the second line of stations.csv after change_a_cell


def change_a_cell(workbook):
    type_into(workbook, "B2", "5")
    expect(title(workbook), "*stations.csv - Workbook")


def save(workbook):
    """Ctrl+S, without waiting for what comes of it."""
    workbook.desktop.key("ctrl+s")


def expect_saved(workbook, path):
    expect(title(workbook), "stations.csv - Workbook")
    assert path.read_bytes().splitlines()[1] == OURS


def expect_refused(workbook, reason):
    """A message with this word, after which the sheet still has its unsaved changes."""
    message = static_text(workbook.wait_for_dialog())
    assert "stations.csv" in message and reason in message, message
    workbook.answer("OK")
    assert workbook.view().title == "*stations.csv - Workbook"


def names(folder):
    return sorted(path.name for path in folder.iterdir())


# ---- Others at the file --------------------------------------------------------------------------


def test_what_others_wrote_goes_only_when_told_to(open_workbook, stations):
    workbook = open_workbook(stations)
    change_a_cell(workbook)
    stations.write_bytes(theirs := b"theirs\r\n")
    for answer in "No", None, "Yes":
        save(workbook)
        question = static_text(workbook.wait_for_dialog())
        assert "changed by another program" in question, question
        assert stations.read_bytes() == theirs
        if answer:
            workbook.answer(answer)
        else:
            workbook.desktop.key("Return")  # the preset answer loses nothing
            expect(workbook.dialog, None)
        if answer != "Yes":
            assert workbook.view().title == "*stations.csv - Workbook"
            assert stations.read_bytes() == theirs
    expect_saved(workbook, stations)
    type_into(workbook, "C2", "1")
    save(workbook)  # nobody else was there since
    expect(title(workbook), "stations.csv - Workbook")


def test_closing_keeps_the_sheet_when_others_changes_are_to_stay(open_workbook, stations):
    workbook = open_workbook(stations)
    change_a_cell(workbook)
    stations.write_bytes(b"theirs\r\n")
    workbook.desktop.key("alt+F4")
    workbook.wait_for_dialog()
    workbook.press("Yes")  # save
    expect(lambda: "another program" in static_text(workbook.dialog()), True)
    workbook.answer("No")
    assert workbook.view().title == "*stations.csv - Workbook"
    assert stations.read_bytes() == b"theirs\r\n"


def test_a_removed_file_is_written_again_when_told_to(open_workbook, stations):
    workbook = open_workbook(stations)
    change_a_cell(workbook)
    stations.unlink()
    save(workbook)
    assert "no longer there" in static_text(workbook.wait_for_dialog())
    workbook.answer("No")
    assert workbook.view().title == "*stations.csv - Workbook"
    assert not stations.exists()
    save(workbook)
    workbook.wait_for_dialog()
    workbook.answer("Yes")
    expect_saved(workbook, stations)


# ---- Links and rights ----------------------------------------------------------------------------


def test_a_link_stays_a_link_and_rights_stay(open_workbook, stations, tmp_path):
    elsewhere = tmp_path / "elsewhere"
    elsewhere.mkdir()
    target = stations.rename(elsewhere / "target.csv")
    target.chmod(0o600)
    stations.symlink_to("elsewhere/target.csv")
    workbook = open_workbook(stations)
    change_a_cell(workbook)
    save(workbook)
    expect_saved(workbook, stations)
    assert os.readlink(stations) == "elsewhere/target.csv"
    assert target.read_bytes().splitlines()[1] == OURS
    assert oct(target.stat().st_mode) == "0o100600"
    assert (names(tmp_path), names(elsewhere)) == (["elsewhere", "stations.csv"], ["target.csv"])


@pytest.mark.parametrize("mode", ["644", "666"])
def test_files_for_others_stay_so(programs, tmp_path, mode):
    path = tmp_path / "a.csv"
    path.write_bytes(b"1\r\n")
    path.chmod(int(mode, 8))
    save_once(programs, path)
    assert path.read_bytes() != b"1\r\n"
    assert path.stat().st_mode & 0o666 == int(mode, 8)


# ---- Saving that cannot be -----------------------------------------------------------------------


def test_a_write_protected_file_stays_as_it_is(open_workbook, stations, tmp_path):
    before = stations.read_bytes()
    stations.chmod(0o444)
    workbook = open_workbook(stations)
    change_a_cell(workbook)
    save(workbook)
    expect_refused(workbook, "denied")
    assert stations.read_bytes() == before
    stations.chmod(0o644)
    save(workbook)
    expect_saved(workbook, stations)
    assert names(tmp_path) == ["stations.csv"]


def test_a_folder_that_has_gone_is_told_and_may_come_back(open_workbook, stations, tmp_path):
    """As when the network's path does not answer."""
    folder = tmp_path / "share"
    folder.mkdir()
    path = stations.rename(folder / "stations.csv")
    workbook = open_workbook(path)
    change_a_cell(workbook)
    folder.rename(tmp_path / "away")
    save(workbook)
    expect_refused(workbook, "Path not found")
    (tmp_path / "away").rename(folder)
    save(workbook)
    expect_saved(workbook, path)
    assert names(folder) == ["stations.csv"]


def name_of(process):
    return pathlib.Path(f"/proc/{process.pid}/comm").read_text(encoding="utf-8").strip()


def limit_files(workbook, size):
    """From now on no file of the program may grow beyond this: what a full disk looks like."""
    assert name_of(workbook.process) == "workbook.exe"  # not a process that only started it
    hard = resource.prlimit(workbook.process.pid, resource.RLIMIT_FSIZE)[1]
    resource.prlimit(workbook.process.pid, resource.RLIMIT_FSIZE, (size, hard))


def test_a_full_disk_loses_nothing(open_workbook, sunspots, tmp_path):
    before = sunspots.read_bytes()
    # Python ignores the signal that would end the program, and hands that down.
    workbook = open_workbook(sunspots, restore_signals=False)
    type_into(workbook, "B3", "123.5")
    limit_files(workbook, len(before) // 2)
    save(workbook)
    message = static_text(workbook.wait_for_dialog())
    assert "Cannot write" in message and "sunspots.csv" in message, message
    workbook.answer("OK")
    assert workbook.view().title == "*sunspots.csv - Workbook"
    assert sunspots.read_bytes() == before
    assert names(tmp_path) == ["sunspots.csv"]
    limit_files(workbook, resource.RLIM_INFINITY)
    save(workbook)
    expect(title(workbook), "sunspots.csv - Workbook")
    assert len(sunspots.read_bytes()) == len(before) + len("123.5") - len(
        before.splitlines()[2].split(b",")[1]
    )


# ---- Killed while saving -------------------------------------------------------------------------


def save_once(programs, path):
    ran = subprocess.run(
        [WINE_RUN, programs / "saving_loop.exe", windows_path(path), "1"],
        capture_output=True,
        timeout=60,
        check=False,
    )
    assert ran.returncode == 0, ran.stdout


def versions(programs, path):
    """What saving_loop writes in turn."""
    both = set()
    for _ in range(2):
        save_once(programs, path)
        both.add(path.read_bytes())
    assert len(both) == 2
    return both


def test_a_killed_program_leaves_the_old_file_or_the_new_one(programs, tmp_path, machine, pytestconfig):
    rounds = pytestconfig.getoption("--kills")
    path = tmp_path / "a.csv"
    path.write_bytes(b"1\r\n")
    whole = versions(programs, path)
    seen = []
    chance = random.Random(machine)
    for _ in range(rounds):
        program = subprocess.Popen(
            [WINE_RUN, "--direct", programs / "saving_loop.exe", windows_path(path)],
            stdin=subprocess.DEVNULL,
            stdout=subprocess.PIPE,
            stderr=subprocess.DEVNULL,
        )
        assert program.stdout.readline().strip() == b"saving"
        assert name_of(program) == "saving_loop.exe"  # not a process that only started it
        time.sleep(chance.uniform(0, 0.2))
        program.send_signal(signal.SIGKILL)
        program.wait()
        program.stdout.close()
        seen.append(path.read_bytes())
        assert seen[-1] in whole, f"round {len(seen)}: {len(seen[-1])} bytes that nobody wrote"
    unfinished = list(tmp_path.glob("a.csv.*.tmp"))  # which a killed program cannot remove
    for left in unfinished:
        left.unlink()
    assert names(tmp_path) == ["a.csv"]
    print(f"{rounds} killed, {len(unfinished)} in the middle of a file")
