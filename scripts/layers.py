"""Holds the sources to their layers: a file includes what stands in its own folder or one before."""

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

INCLUDE = re.compile(r'^#include "(?P<name>[^"]+)"', re.MULTILINE)


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


def main():
    found = [
        complaint.removeprefix(f"{ROOT}/")
        for tree, order in LAYERS.items()
        for complaint in complaints(ROOT / tree, order.split())
    ]
    print(*found, sep="\n", end="\n" if found else "", file=sys.stderr)
    return 1 if found else 0


sys.exit(main())
