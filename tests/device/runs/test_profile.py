"""The profile of a program that ran on the device's library, and what the script makes of it."""

import os
import pathlib
import re
import subprocess

ROOT = pathlib.Path(__file__).resolve().parents[3]


def run(arguments, **environment):
    finished = subprocess.run(
        arguments, capture_output=True, text=True, timeout=240, env={**os.environ, **environment}
    )
    assert finished.returncode == 0, finished.stdout + finished.stderr
    return finished.stdout


def test_a_profile_has_every_instruction_by_function(device_programs, tmp_path):
    profile = tmp_path / "profile.txt"
    program = device_programs / "device_footprint.exe"
    said = run(
        [ROOT / "scripts" / "wine-run", program, "--quick"],
        KORCONTROLS_DEVICE_PROFILE=f"Z:{profile}",
    )
    counted = int(re.search(r"^speed\t\d+\t(\d+)$", said, re.M).group(1))
    sums = {"executed": 0, "helpers": 0}
    for line in profile.read_text().splitlines():
        kind, _, count = line.split()
        sums[kind] += int(count)
    assert counted <= sums["executed"] < counted * 1.001, "all but the process's end"

    listed = run(
        [ROOT / "scripts" / "device-profile", profile, device_programs / "device" / "korcontrols.map"]
    )
    heading = re.match(r"(\d+) instructions, ([\d.]+) % in helpers\n", listed)
    assert int(heading.group(1)) == sums["executed"]
    assert abs(float(heading.group(2)) - 100 * sums["helpers"] / sums["executed"]) < 0.1
    shares = {name: float(share) for share, name in re.findall(r"^ *([\d.]+) %.*  (\S.*)$", listed, re.M)}
    functions = [name.split("(")[0] for name in shares]
    assert "kor::Summarise" in functions
    assert "__adddf3" in functions
    own = [name for name in shares if not name.startswith("__")]
    assert 95 < sum(shares[name] for name in own) < 101, "nothing is missing"

