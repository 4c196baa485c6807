"""Test suites as they are run here: whole in one process, or test by test where that fails."""

import os
import re
import subprocess
import time
from dataclasses import dataclass, field

from mutation.tree import ROOT

PATIENCE = 900  # seconds, for a suite of which nothing is known


@dataclass
class Unit:
    program: str
    suite: str
    tests: list  # all of its tests
    whole: bool = True
    seconds: float = 0.0
    lines: dict = field(default_factory=dict)  # file: the lines that it ran

    @property
    def name(self):
        return f"{self.program}: {self.suite}"

    def filters(self):
        return [f"{self.suite}.*"] if self.whole else [f"{self.suite}.{test}" for test in self.tests]

    def size(self):
        return sum(map(len, self.lines.values()))


@dataclass
class Outcome:
    kind: str  # passed, assertion, crash or hang
    test: str = ""

    @property
    def passed(self):
        return self.kind == "passed"


def units_of(folder, program, log):
    """As the program itself lists them."""
    start(folder, program, ["--gtest_list_tests"], log).wait(PATIENCE)
    found = []
    for line in log.read_text(encoding="utf-8", errors="replace").splitlines():
        suite = re.match(r"(\S+)\.(?:  #.*)?$", line)
        test = re.match(r"  (\S+)", line)
        if suite:
            found.append(Unit(program, suite[1], []))
        elif test and found:
            found[-1].tests.append(test[1])
    return found


def start(folder, program, arguments, log, environment=None):
    with log.open("wb") as output:
        return subprocess.Popen(
            [ROOT / "scripts/wine-run", "--direct", folder / f"{program}.exe", *arguments],
            stdin=subprocess.DEVNULL,
            stdout=output,
            stderr=subprocess.STDOUT,
            env={**os.environ, **(environment or {})},
        )


def run(unit, folder, log, limit=PATIENCE, environment=None):
    """Runs the unit's tests up to the first failure; its outcome and its seconds."""
    begin = time.monotonic()
    for test_filter in unit.filters():
        outcome = run_filter(unit.program, test_filter, folder, log, limit, environment)
        if not outcome.passed:
            break
    return outcome, time.monotonic() - begin


def run_filter(program, test_filter, folder, log, limit, environment):
    process = start(folder, program, [f"--gtest_filter={test_filter}", "--gtest_fail_fast"], log, environment)
    try:
        status = process.wait(limit)
    except subprocess.TimeoutExpired:
        process.kill()
        process.wait()
        status = None
    return outcome_of(status, log.read_text(encoding="utf-8", errors="replace"))


def outcome_of(status, output):
    running = re.findall(r"^\[ RUN      \] (\S+)", output, re.MULTILINE)
    test = running[-1] if running else ""
    if status == 0 and "[  PASSED  ]" in output and "] Running 0 tests" not in output:
        return Outcome("passed")
    if re.search(r": Failure$|^\[  FAILED  \]", output, re.MULTILINE):
        return Outcome("assertion", test)
    return Outcome("hang" if status is None else "crash", test)
