"""The .def files of the sources: what is exported, and what may be imported."""

import re


def read_exports(path):
    """{name: ordinal}; lines that begin with a semicolon are of functions to come."""
    found = {}
    for line in path.read_text().splitlines():
        line = line.split(";")[0].split()
        if len(line) == 2 and line[1].startswith("@"):
            assert line[0] not in found
            found[line[0]] = int(line[1][1:])
    return found


def read_list(path):
    """The module's name, and the names that it exports according to the list."""
    module, names = None, []
    for line in path.read_text().splitlines():
        line = line.split(";")[0].strip()
        if line.startswith("LIBRARY"):
            module = line.split()[1]
        elif line and line != "EXPORTS":
            # NAME, or "NAME HERE" == "NAME IN THE MODULE"
            names.append(re.sub(r'.*== *', "", line).strip('"'))
    return module, names
