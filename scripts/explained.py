"""Lists of things that are as they are for a reason."""

import sys


def explained(path):
    """The entries of a list. Each stands indented below the reason for it."""
    entries = []
    reason = None
    for number, line in enumerate(path.read_text().splitlines(), 1):
        if not line.strip():
            reason = None
        elif line.startswith("    "):
            if reason is None:
                sys.exit(f"{path}: line {number} has no reason")
            entries.append(line.strip())
        elif not line.startswith("#"):
            reason = line.strip()
    return entries
