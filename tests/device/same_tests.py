"""same_tests.py CTEST TREE - holds the device's tests against the desktop's, in a build tree of CTest.

Each test of the desktop must have a twin "device.<test>" that runs the same test of the same program,
or is skipped with a reason. not_applicable.txt may name no test that does not exist.
"""

import json
import pathlib
import subprocess
import sys

PREFIX = "device."
NOT_APPLICABLE = pathlib.Path(__file__).with_name("not_applicable.txt")
SKIPPED = "does not apply to the device: "


def tests_of(ctest, tree):
    """The command of each test, by its name: the desktop's, and the device's without the prefix."""
    listed = subprocess.run(
        [ctest, "--test-dir", tree, "--show-only=json-v1"], capture_output=True, check=True
    )
    desktop, device = {}, {}
    for test in json.loads(listed.stdout)["tests"]:
        labels = [p["value"] for p in test["properties"] if p["name"] == "LABELS"]
        if not labels:
            desktop[test["name"]] = test.get("command", [])
        elif test["name"].startswith(PREFIX):
            device[test["name"].removeprefix(PREFIX)] = test.get("command", [])
    return desktop, device


def is_skipped(command):
    return any(word.startswith(SKIPPED) and word != SKIPPED for word in command)


def what_runs(command):
    """The program's name and the filter: the machine's own folder and other options left out."""
    names = [pathlib.PurePath(word).name for word in command if word.endswith(".exe")]
    return names + [word for word in command if word.startswith("--gtest_filter=")]


def complaints(desktop, device):
    for name in sorted(desktop.keys() - device.keys()):
        yield f"{name} is missing on the device"
    for name in sorted(device.keys() - desktop.keys()):
        yield f"{name} exists on the device alone"
    for name in sorted(desktop.keys() & device.keys()):
        if not is_skipped(device[name]) and what_runs(device[name]) != what_runs(desktop[name]):
            yield f"{name} is another test on the device: {device[name]}"
    for line in NOT_APPLICABLE.read_text().splitlines():
        name, _, reason = line.partition(" ")
        if not line.startswith("#") and name not in desktop:
            yield f"{NOT_APPLICABLE.name} names {name}, which does not exist"
        elif not reason:
            yield f"{NOT_APPLICABLE.name} has no reason for {name}"


def main():
    desktop, device = tests_of(*sys.argv[1:])
    assert desktop, "no tests"
    found = list(complaints(desktop, device))
    print(*found, f"{len(desktop)} tests on the desktop, {len(device)} on the device", sep="\n")
    sys.exit(1 if found else 0)


main()
