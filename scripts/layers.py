"""Holds the sources to their layers: a file includes what stands in its own folder or one before.

The programs include nothing of the library's own sources but what is listed here.
"""

import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent

# From the bottom up. What stands in none of the folders is free.
LAYERS = {
    "src": "base orvo diag xml model agent flat",
    "tools/raidinfo": "system text library inventory redact settings codebook source events doctor"
    " diff health listing json presentation watch command_line commands",
    "tools/raidsim": "xml soap http state fault control generate net",
}

# By the folder that includes them. The classes of the model have their getters inline; the others
# tell how the library asks, how it reads its settings, and what it takes for space.
TAKEN_FROM_SOURCES = {
    "tools/raidinfo/inventory": {"model/system_and_adapter.h"},
    "tools/raidinfo/redact": {"xml/space.h"},
    "tools/raidinfo/doctor": {"orvo/property_file.h"},
    "tools/raidinfo/source": {"agent/requests.h", "model/system_and_adapter.h"},
}

INCLUDE = re.compile(r'^#include [<"](?P<name>[^">]+)[">]', re.MULTILINE)


def complaints(tree, order):
    folders = sorted(path.name for path in tree.iterdir() if path.is_dir())
    for name in sorted(set(folders) ^ set(order)):
        yield f"{tree / name}: a folder without a layer, or a layer without a folder"
    for path in sorted(tree.glob("*/**/*.[hc]*")):
        own = path.relative_to(tree).parts[0]
        for include in INCLUDE.finditer(path.read_text(encoding="utf-8")):
            name = include["name"].removeprefix("../").partition("/")[0]
            if own in order and name in order and order.index(name) > order.index(own):
                yield f"{path}: {own} knows nothing of {name}"


def taken_from_sources(path, program):
    """The headers of the library's sources that a file includes, by their names there."""
    sources = ROOT / "src"
    for include in INCLUDE.finditer(path.read_text(encoding="utf-8")):
        places = (path.parent, program, ROOT / "tools", sources)
        header = next(
            (place / include["name"] for place in places if (place / include["name"]).exists()),
            None,
        )
        if header is not None and header.resolve().is_relative_to(sources):
            yield str(header.resolve().relative_to(sources))


def complaints_of_programs():
    taken = {
        (str(path.parent.relative_to(ROOT)), header)
        for program in (ROOT / "tools").iterdir()
        for path in program.glob("**/*.[hc]*")
        for header in taken_from_sources(path, program)
    }
    allowed = {
        (folder, header) for folder, headers in TAKEN_FROM_SOURCES.items() for header in headers
    }
    for folder, header in sorted(taken - allowed):
        yield f"{folder}: {header} is the library's own"
    for folder, header in sorted(allowed - taken):
        yield f"{folder}: does not include {header} any more"


def main():
    found = [
        complaint.removeprefix(f"{ROOT}/")
        for tree, order in LAYERS.items()
        for complaint in complaints(ROOT / tree, order.split())
    ]
    found += complaints_of_programs()
    print(*found, sep="\n", end="\n" if found else "", file=sys.stderr)
    return 1 if found else 0


sys.exit(main())
