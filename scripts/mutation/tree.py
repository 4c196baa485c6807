"""The build trees: which programs there are, and how the library is compiled and linked."""

import hashlib
import os
import re
import shlex
import shutil
import subprocess
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
PLAIN = ROOT / "build/i686"
COVERAGE = ROOT / "build/coverage"
LIBRARY = "bin/korcontrols.dll"
# What test programs load or start; they look for it beside themselves.
COMPANIONS = (
    "commdlg.dll",
    "wingdi.dll",
    "faulty_library.dll",
    "clipboard_partner.exe",
    "module_host.exe",
    "reload_host.exe",
)
# Its tests are those of an example's engine, which does not use the library.
OTHERS = ("workbook_model_tests",)


def build():
    """Both trees; of the instrumented one what the other lacks."""
    programs = [name for name in test_targets() if name not in OTHERS]
    run_build("i686", ["korcontrols", *programs, *(Path(name).stem for name in COMPANIONS)])
    run_build("coverage", ["korcontrols", *(name for name in programs if links_objects(name))])
    return programs


def run_build(preset, targets):
    subprocess.run([ROOT / "scripts/build", preset, *targets], check=True)


def test_targets():
    """The programs that the CMakeLists.txt below tests/ name."""
    run_build("i686", ["korcontrols"])
    rules = (PLAIN / "build.ninja").read_text(encoding="utf-8")
    return sorted(re.findall(r"^build bin/(\w+_tests)\.exe:", rules, re.MULTILINE))


def commands(tree, target):
    printed = subprocess.run(["ninja", "-C", tree, "-t", "commands", target], check=True, capture_output=True, text=True)
    return [line for line in printed.stdout.splitlines() if not line.startswith("ninja:")]


def links_objects(program):
    """Whether a test program is linked with the library's objects instead of the DLL."""
    return "korcontrols_objects.dir" in commands(PLAIN, f"bin/{program}.exe")[-1]


def source_files():
    """The library's own, without those of the device alone and the companions, which are no part of it."""
    found = sorted([*(ROOT / "src").rglob("*.cpp"), *(ROOT / "src").rglob("*.h")])
    names = [str(path.relative_to(ROOT)) for path in found]
    return [name for name in names if "/platform/ce/" not in name and "/companions/" not in name]


def test_sources(program):
    """A program's sources, and the headers beside them."""
    compiled = re.findall(r" -c (\S+)$", "\n".join(commands(PLAIN, f"bin/{program}.exe")), re.MULTILINE)
    sources = {Path(name) for name in compiled if not Path(name).is_relative_to(ROOT / "src")}
    headers = {header for source in sources for header in source.parent.glob("*.h")}
    return sorted(path for path in sources | headers if path.is_relative_to(ROOT / "tests"))


def fingerprint(paths):
    """Of files, and of all files in folders."""
    digest = hashlib.sha256()
    for path in paths:
        for file in sorted(path.rglob("*")) if path.is_dir() else [path]:
            if file.is_file():
                digest.update(str(file).encode() + b"\0" + file.read_bytes())
    return digest.hexdigest()[:16]


def link_or_copy(source, target):
    target.parent.mkdir(parents=True, exist_ok=True)
    target.unlink(missing_ok=True)
    try:
        os.link(source, target)
    except OSError:
        shutil.copy2(source, target)


def furnish(folder, programs):
    """Test programs of the plain tree, with what they start, in a folder where another library can lie."""
    for name in [f"{program}.exe" for program in programs] + list(COMPANIONS):
        link_or_copy(PLAIN / "bin" / name, folder / name)


class Compiler:
    """The plain tree's own commands, for other sources, objects and outputs."""

    def __init__(self, programs):
        self.compilations = {}
        for command in commands(PLAIN, LIBRARY):
            found = re.search(r" -o (\S+\.cpp\.obj) -c (\S+)$", command)
            if found:
                self.compilations[str(Path(found[2]).relative_to(ROOT))] = (command, found[1])
        self.links = {"korcontrols.dll": commands(PLAIN, LIBRARY)[-1]}
        for program in filter(links_objects, programs):
            self.links[f"{program}.exe"] = commands(PLAIN, f"bin/{program}.exe")[-1]

    def object_of(self, unit):
        return self.compilations[unit][1]

    def dependents(self, header):
        """The sources that include it, directly or not."""
        objects = {name: unit for unit, (_, name) in self.compilations.items()}
        printed = subprocess.run(["ninja", "-C", PLAIN, "-t", "deps"], check=True, capture_output=True, text=True)
        found = []
        for block in printed.stdout.split("\n\n"):
            unit = objects.get(block.split(":", 1)[0])
            if unit and str(ROOT / header) in block.split():
                found.append(unit)
        return sorted(found)

    def compile(self, unit, source, output, headers=None):
        """Whether it compiles. Warnings do not matter in what is broken on purpose."""
        words = shlex.split(self.compilations[unit][0])
        words[words.index("-o") + 1] = output
        words[words.index("-c") + 1] = source
        for flag in ("-MD", "-MT", "-MF"):
            at = words.index(flag)
            del words[at : at + (1 if flag == "-MD" else 2)]
        words[1:1] = ["-w", "-iquote", source.parent, *(["-iquote", headers] if headers else [])]
        output.parent.mkdir(parents=True, exist_ok=True)
        return subprocess.run(words, cwd=PLAIN, capture_output=True, check=False).returncode == 0

    def link(self, name, objects, folder):
        """`objects`: the broken ones in place of the tree's."""
        command = self.links[name]
        for old, new in objects.items():
            command = command.replace(f" {old} ", f" {new} ")
        command = re.sub(r" -o \S+ -Wl,--out-implib,\S+", f" -o {folder / name} -Wl,--out-implib,{folder / name}.a", command)
        (folder / name).unlink(missing_ok=True)
        subprocess.run(command, shell=True, cwd=PLAIN, check=True, capture_output=True)
