"""One broken place: compiled, linked, and run against the suites that reach it."""

import re
import shutil
import threading
from collections import Counter
from dataclasses import dataclass

from mutation import tree, units

SLOTS = tree.ROOT / "build/mutants"
# A suite that takes so much longer than usual does not end.
HANG_FACTOR, HANG_SECONDS = 20, 20


@dataclass
class Result:
    mutant: object
    kind: str  # does not compile, identical, uncovered, survived, assertion, crash, hang
    suite: str = ""
    test: str = ""
    ran: int = 0  # processes
    covering: int = 0  # of so many that run the line

    @property
    def counts(self):
        return self.kind not in ("does not compile", "identical")

    @property
    def noticed(self):
        return self.kind in ("assertion", "crash", "hang")


class Bench:
    """Slots in which mutants are tried at the same time, and what they share."""

    def __init__(self, programs, coverage, sources, jobs, most):
        self.coverage = coverage
        self.sources = sources
        self.most = most  # processes for a mutant
        self.compiler = tree.Compiler(programs)
        self.free = [Slot(self, number, programs) for number in range(jobs)]
        self.lock = threading.Lock()
        self.locks = {}
        self.steady = {}  # by the unit's name

    def try_out(self, mutant):
        with self.lock:
            slot = self.free.pop()
        try:
            return slot.try_out(mutant)
        finally:
            with self.lock:
                self.free.append(slot)

    def is_steady(self, unit, log):
        """Whether the unit passes with the unbroken library; looked at once, when it has failed first."""
        with self.lock:
            lock = self.locks.setdefault(unit.name, threading.Lock())
        with lock:
            if unit.name not in self.steady:
                outcome, _ = units.run(unit, tree.PLAIN / "bin", log)
                self.steady[unit.name] = outcome.passed
                if not outcome.passed:
                    print(f"not used any more: {unit.name}; {outcome.test} fails although nothing is broken", flush=True)
        return self.steady[unit.name]

    def reach(self, mutant):
        """The lines by which a mutant can be noticed: {file: lines}."""
        source = self.sources[mutant.file]
        first, last = mutant.lines
        lines = self.coverage.executable[mutant.file] & set(range(min(first, mutant.line), last + 1))
        if lines:
            return {mutant.file: lines}
        name = source.constant_at(mutant.begin) or source.field_at(mutant.begin)
        if name:
            return self.uses(mutant.file, name)
        return {mutant.file: self.lines_before(mutant.file, mutant.line)}

    def uses(self, file, name, depth=2):
        """Lines with a constant of namespace scope; those of a source file are its own."""
        found = {}
        for other, source in self.sources.items():
            if file.endswith(".cpp") and other != file:
                continue
            for use in re.finditer(rf"\b{name}\b", source.text):
                line = source.line_of(use.start())
                if line in self.coverage.executable[other]:
                    found.setdefault(other, set()).add(line)
                    continue
                further = source.constant_at(use.start())
                if further and further != name and depth:
                    for where, lines in self.uses(other, further, depth - 1).items():
                        found.setdefault(where, set()).update(lines)
                elif not further:
                    found.setdefault(other, set()).update(self.lines_before(other, line))
        return found

    def lines_before(self, file, line):
        """The line with code to which a later line of the same statement belongs."""
        return {max((each for each in self.coverage.executable[file] if each <= line), default=0)} - {0}

    def objects_of(self, mutant, reach):
        """Sources to compile. What a header's functions become is in the objects that use them; its
        constants can be anywhere."""
        if mutant.file.endswith(".cpp"):
            return [mutant.file]
        if reach.keys() == {mutant.file}:
            return self.coverage.objects_at(mutant.file, reach[mutant.file])
        return self.compiler.dependents(mutant.file)

    def units_of(self, reach):
        """Of each suite the quickest and most specific first, then of each the second, and so on."""
        found = {}
        for file, lines in reach.items():
            found.update((unit.name, unit) for unit in self.coverage.units_at(file, lines))
        ranked, seen = [], Counter()
        for unit in sorted(found.values(), key=lambda unit: unit.seconds * unit.size()):
            ranked.append((seen[unit.program, unit.suite], len(ranked), unit))
            seen[unit.program, unit.suite] += 1
        return [unit for _, _, unit in sorted(ranked, key=lambda each: each[:2])]


class Slot:
    def __init__(self, bench, number, programs):
        self.bench = bench
        self.folder = SLOTS / f"slot-{number}"
        shutil.rmtree(self.folder, ignore_errors=True)
        tree.furnish(self.folder / "bin", programs)

    def try_out(self, mutant):
        reach = self.bench.reach(mutant)
        objects = self.broken_objects(mutant, self.bench.objects_of(mutant, reach))
        if objects is None:
            return Result(mutant, "does not compile")
        if not objects:
            return Result(mutant, "identical")
        covering = self.bench.units_of(reach)
        if not covering:
            return Result(mutant, "uncovered")
        return self.run(mutant, objects, covering)

    def broken_objects(self, mutant, compiled):
        """{the tree's object: the broken one} of those that differ; None if one does not compile."""
        text = self.bench.sources[mutant.file].text
        broken = self.folder / mutant.file
        broken.parent.mkdir(parents=True, exist_ok=True)
        broken.write_text(text[: mutant.begin] + mutant.replacement + text[mutant.end :], encoding="utf-8")
        try:
            return self.compile_all(mutant, compiled)
        finally:
            broken.unlink()

    def compile_all(self, mutant, compiled):
        objects = {}
        for unit in compiled:
            source = (self.folder if unit == mutant.file else tree.ROOT) / unit
            output = self.folder / "objects" / f"{unit}.obj"
            if not self.bench.compiler.compile(unit, source, output, self.folder / "src"):
                return None
            whole = self.bench.compiler.object_of(unit)
            if output.read_bytes() != (tree.PLAIN / whole).read_bytes():
                objects[whole] = output
        return objects

    def run(self, mutant, objects, covering):
        linked = set()
        folder = self.folder / "bin"
        for count, unit in enumerate(covering[: self.bench.most], 1):
            program = f"{unit.program}.exe"
            linking = program if program in self.bench.compiler.links else "korcontrols.dll"
            if linking not in linked:
                self.bench.compiler.link(linking, objects, folder)
                linked.add(linking)
            limit = HANG_FACTOR * unit.seconds + HANG_SECONDS
            outcome, _ = units.run(unit, folder, self.folder / "log", limit)
            if not outcome.passed and self.bench.is_steady(unit, self.folder / "log.whole"):
                return Result(mutant, outcome.kind, unit.name, outcome.test, count, len(covering))
        return Result(mutant, "survived", ran=min(len(covering), self.bench.most), covering=len(covering))
