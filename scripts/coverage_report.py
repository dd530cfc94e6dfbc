"""coverage_report.py NAME FILE BRANCHES: judges what gcovr found (FILE is its JSON) of the library.

Every line must be executed, except those that tests/coverage/left-out.txt names with a reason, and
19 of 20 branches of the conditions that the source shows. To the compiler every call that an
exception could leave is a branch, too; those do not count. The branches that nothing takes are
listed in BRANCHES.
"""

import collections
import json
import pathlib
import re
import sys

from explained import explained

ROOT = pathlib.Path(__file__).resolve().parent.parent
LEAST_BRANCHES = 95
CONDITION = re.compile(r"\b(if|while|for|switch)\b|\?|&&|\|\|")


def lines_of(report):
    """Each line that is code: its text, its number, and gcov's counts."""
    for source in report["files"]:
        text = (ROOT / source["file"]).read_text().splitlines()
        for line in source["lines"]:
            if not line.get("gcovr/noncode") and not line.get("gcovr/excluded"):
                code = text[line["line_number"] - 1].strip()
                yield f"{source['file']}: {code}", code, line


def main(name, path, branches_path):
    left_out = collections.Counter(explained(ROOT / "tests" / "coverage" / "left-out.txt"))
    number_left_out = left_out.total()
    lines = branches = taken = 0
    unexecuted = []
    untaken = []
    for key, code, line in lines_of(json.loads(pathlib.Path(path).read_text())):
        where = f"{key} (line {line['line_number']})"
        if line["count"] == 0:
            if left_out[key] > 0:
                left_out[key] -= 1
                continue
            unexecuted.append(where)
        lines += 1
        counts = [branch["count"] for branch in line["branches"]] if CONDITION.search(code) else []
        branches += len(counts)
        taken += sum(count > 0 for count in counts)
        untaken += [where] * counts.count(0)
    pathlib.Path(branches_path).write_text("".join(f"{where}\n" for where in untaken))

    percent = 100 * taken / branches
    executed = lines - len(unexecuted)
    print(f"{name}: {executed} of {lines} lines ({100 * executed / lines:.1f} %), "
          f"{taken} of {branches} branches ({percent:.1f} %), {number_left_out} lines left out")
    stale = sorted(left_out.elements())
    for where in unexecuted:
        print(f"not executed: {where}")
    for key in stale:
        print(f"left out, but executed or gone: {key}")
    if percent < LEAST_BRANCHES:
        print(f"not taken: see {branches_path}")
    if unexecuted or stale or percent < LEAST_BRANCHES:
        sys.exit(f"{name}: the tests do not execute what they should")


if __name__ == "__main__":
    main(*sys.argv[1:])
