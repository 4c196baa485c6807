"""Test suites as they are run here: whole in one process, or one test in each where that fails."""

import os
import re
import subprocess
import time
from dataclasses import dataclass, field

from mutation.tree import ROOT

PATIENCE = 900  # seconds, for a suite of which nothing is known


@dataclass
class Unit:
    """What one process runs."""

    program: str
    suite: str
    tests: list  # all of the suite's, or a single one
    whole: bool = True
    seconds: float = 0.0
    lines: dict = field(default_factory=dict)  # file: the lines that it ran

    @property
    def filter(self):
        return f"{self.suite}.{'*' if self.whole else self.tests[0]}"

    @property
    def name(self):
        return f"{self.program}: {self.filter}"

    def split(self):
        return [Unit(self.program, self.suite, [test], False) for test in self.tests]

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
    arguments = [f"--gtest_filter={unit.filter}", "--gtest_fail_fast"]
    process = start(folder, unit.program, arguments, log, environment)
    try:
        status = process.wait(limit)
    except subprocess.TimeoutExpired:
        process.kill()
        process.wait()
        status = None
    seconds = time.monotonic() - begin
    return outcome_of(status, log.read_text(encoding="utf-8", errors="replace")), seconds


def outcome_of(status, output):
    failed = re.findall(r"^\[  FAILED  \] (\S+\.\S+?),? ", output, re.MULTILINE)
    test = (failed[:1] or re.findall(r"^\[ RUN      \] (\S+)", output, re.MULTILINE)[-1:] or [""])[0]
    if status == 0 and "[  PASSED  ]" in output and "] Running 0 tests" not in output:
        return Outcome("passed")
    if re.search(r": Failure$|^\[  FAILED  \]", output, re.MULTILINE):
        return Outcome("assertion", test)
    return Outcome("hang" if status is None else "crash", test)
