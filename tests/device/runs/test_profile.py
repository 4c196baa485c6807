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
    program = device_programs / "device_speed.exe"
    said = run(
        [ROOT / "scripts" / "wine-run", program], KORCONTROLS_DEVICE_PROFILE=f"Z:{profile}"
    )
    redraws = float(re.search(r"([\d.]+) million instructions", said).group(1)) * 1e6
    sums = {"executed": 0, "helpers": 0}
    for line in profile.read_text().splitlines():
        kind, _, count = line.split()
        sums[kind] += int(count)
    assert redraws * 0.999 < sums["executed"] < redraws * 1.2, "redraws and little else"

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

