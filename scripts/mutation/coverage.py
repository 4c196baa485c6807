"""Which suites run which lines of src/, and which branches nothing takes, as gcov tells."""

import json
import os
import re
import shutil
import subprocess
from collections import Counter, defaultdict
from concurrent.futures import ThreadPoolExecutor
from dataclasses import asdict
from pathlib import Path

from mutation import tree, units
from mutation.units import Unit

GCOV = ["i686-w64-mingw32-gcov-posix", "--json-format", "--stdout", "--branch-probabilities"]
NOTES = tree.COVERAGE / "src/CMakeFiles"
MAPS = tree.ROOT / "build/mutants/map"
SCRATCH = tree.ROOT / "build/mutants/coverage"


class Coverage:
    def __init__(self, found, branches):
        self.units = found
        self.branches = branches  # Counter of (file, line, place of the function, number of the branch)
        self.executable, self.objects = executable_lines()
        self.by_line = defaultdict(list)
        for unit in found:
            for file, lines in unit.lines.items():
                for line in lines:
                    self.by_line[file, line].append(unit)

    def units_at(self, file, lines):
        return {unit.name: unit for line in lines for unit in self.by_line[file, line]}.values()

    def objects_at(self, file, lines):
        return sorted({name for line in lines for name in self.objects[file, line]})


def measure(programs, jobs, say):
    """The map of all programs; what is known of one that has not changed is read back."""
    found, branches = [], Counter()
    furnish_scratch(programs)
    for program in programs:
        known = map_of(program, jobs, say)
        found += [Unit(**unit) for unit in known["units"]]
        for *key, count in known["branches"]:
            branches[tuple(key)] += count
    return Coverage(found, branches)


def furnish_scratch(programs):
    """Tests of the DLL are those of the plain tree, beside the instrumented library."""
    shutil.rmtree(SCRATCH, ignore_errors=True)
    tree.furnish(SCRATCH / "bin", programs)
    tree.link_or_copy(tree.COVERAGE / tree.LIBRARY, SCRATCH / tree.LIBRARY)
    for program in filter(tree.links_objects, programs):
        tree.link_or_copy(tree.COVERAGE / f"bin/{program}.exe", SCRATCH / f"bin/{program}.exe")


def map_of(program, jobs, say):
    library = tree.fingerprint([tree.ROOT / "src", tree.ROOT / "include"])
    cached = MAPS / f"{program}-{library}-{tree.fingerprint(tree.test_sources(program))}.json"
    if not cached.exists():
        known = measure_program(program, jobs, say)
        MAPS.mkdir(parents=True, exist_ok=True)
        cached.write_text(json.dumps(known), encoding="utf-8")
    return json.loads(cached.read_text(encoding="utf-8"))


def measure_program(program, jobs, say):
    suites = units.units_of(tree.PLAIN / "bin", program, SCRATCH / f"{program}.log")
    found, branches = [], Counter()
    with ThreadPoolExecutor(jobs) as pool:
        for measured, taken in pool.map(measure_suite, suites):
            found += measured
            branches.update(taken)
    say(
        f"{program}: {len(suites)} suites in {len(found)} processes, {sum(unit.seconds for unit in found):.0f} s, "
        f"{sum(not unit.whole for unit in found)} of them for single tests"
    )
    return {
        "units": [asdict(unit) for unit in found],
        "branches": [[*key, count] for key, count in branches.items()],
    }


def measure_suite(suite):
    """Whole, or each of its tests; and the branches."""
    taken = measure_unit(suite)
    if taken is not None:
        return [suite], taken
    found, branches = suite.split(), Counter()
    for unit in found:
        taken = measure_unit(unit)
        if taken is None:
            raise SystemExit(f"mutants: {unit.name} fails although nothing is broken; see {SCRATCH / 'data'}")
        branches.update(taken)
    return found, branches


def measure_unit(unit):
    """Fills in the unit's lines and seconds; gives its branches, or None where it fails."""
    folder = SCRATCH / "data" / re.sub(r"[^\w.]+", "-", unit.name)
    outcome = run_instrumented(unit, folder, Path(f"{folder}.log"))
    if not outcome.passed:
        return None
    unit.lines, branches = read_data(folder)
    shutil.rmtree(folder)
    return branches


def run_instrumented(unit, folder, log):
    shutil.rmtree(folder, ignore_errors=True)
    folder.mkdir(parents=True)
    outcome, unit.seconds = units.run(unit, SCRATCH / "bin", log, environment={"GCOV_PREFIX": str(folder)})
    return outcome


def read_data(folder):
    """The lines that ran, and how often each branch was taken."""
    lines, branches = defaultdict(set), Counter()
    for _, file in gcov(folder):
        # By the function's place: what a template becomes is one function.
        places = {each["name"]: f"{each['start_line']}:{each['start_column']}" for each in file["functions"]}
        for line in file["lines"]:
            if line["count"]:
                lines[file["file"]].add(line["line_number"])
            place = places.get(line.get("function_name"), "")
            for number, branch in enumerate(line["branches"]):
                branches[file["file"], line["line_number"], place, number] += branch["count"]
    return {name: sorted(numbers) for name, numbers in lines.items()}, branches


def executable_lines():
    """Lines with code, and the objects that have it: of a header's functions those that use them."""
    lines, objects = defaultdict(set), defaultdict(set)
    for unit, file in gcov(None):
        for line in file["lines"]:
            lines[file["file"]].add(line["line_number"])
            objects[file["file"], line["line_number"]].add(unit)
    return lines, objects


def gcov(folder):
    """(source of the object, its record of one file of src/) for all data below a folder, or for all notes."""
    notes = sorted(NOTES.rglob("*.gcno"))
    if folder:
        notes = [note for note in notes if beside_data(note, folder)]
        notes = [Path(f"{folder}{note}") for note in notes]
    if not notes:
        return
    with open(os.devnull, "wb") as nowhere:
        printed = subprocess.run([*GCOV, *notes], check=True, stdout=subprocess.PIPE, stderr=nowhere, cwd=SCRATCH)
    for text in printed.stdout.splitlines():
        record = json.loads(text)
        unit = source_of(record["data_file"])
        for file in record["files"]:
            path = Path(file["file"])
            if path.is_relative_to(tree.ROOT / "src"):
                yield unit, {**file, "file": str(path.relative_to(tree.ROOT))}


def beside_data(note, folder):
    """Puts the compiler's notes beside the data of a run, where there are some."""
    data = Path(f"{folder}{note}").with_suffix(".gcda")
    if data.exists():
        data.with_suffix(".gcno").symlink_to(note)
    return data.exists()


def source_of(data_file):
    """src/CMakeFiles/X.dir/grid/mouse.cpp.gcda is of src/grid/mouse.cpp."""
    return "src/" + data_file.split(".dir/")[1].rsplit(".", 1)[0]
