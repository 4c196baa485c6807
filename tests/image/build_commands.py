"""The build's own commands, to compile and link something else with."""

import json
import shlex
import subprocess


def run(command, folder, **options):
    return subprocess.run(command, cwd=folder, capture_output=True, text=True, **options)


def compile_command(build, source, output):
    """How the library's sources are compiled, for another source. Dependencies are not recorded."""
    database = json.loads(run(["ninja", "-t", "compdb"], build, check=True).stdout)
    entry = next(e for e in database if e["file"].endswith("/src/library/version.cpp"))
    arguments = shlex.split(entry["command"])
    for option in ("-MF", "-MT", "-o", "-c"):
        at = arguments.index(option)
        del arguments[at:at + 2]
    arguments.remove("-MD")
    return arguments + ["-o", str(output), "-c", str(source)]


def link_command(build, output):
    """How the library is linked, into another file and without a map."""
    commands = run(["ninja", "-t", "commands", "bin/korcontrols.dll"], build, check=True).stdout
    link = commands.strip().splitlines()[-1].removeprefix(": && ").split(" && ")[0]
    arguments = shlex.split(link)
    arguments[arguments.index("-o") + 1] = str(output)
    return [argument for argument in arguments if not argument.startswith("-Map=")]
