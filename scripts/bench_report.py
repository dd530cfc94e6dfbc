"""bench_report.py FOLDER: prints what scripts/bench measured, and writes FOLDER/results.json.

Every figure is the median over the repetitions; a ratio is one of medians of the same run.
"""

import collections
import json
import pathlib
import re
import statistics
import sys

WIDTHS = ["amd64", "i386"]


def medians(folder, width):
    """Nanoseconds and items of each benchmark."""
    times = collections.defaultdict(list)
    items = {}
    for path in sorted(folder.glob(f"*-{width}.json")):
        for run in json.loads(path.read_text())["benchmarks"]:
            if run["run_type"] == "iteration":
                name = run["name"].removesuffix("/manual_time")
                times[name].append(run["real_time"])
                items[name] = run["items"]
    return {name: (statistics.median(runs), items[name]) for name, runs in times.items()}


def table(title, head, rows):
    rows = [[str(cell) for cell in row] for row in rows]
    print(f"\n### {title}\n")
    print("| " + " | ".join(head) + " |")
    print("|" + "---|" * len(head))
    for row in rows:
        print("| " + " | ".join(row) + " |")


def size_of(document):
    """For the order of rows: small, then by megabytes."""
    number = re.match(r"\d+", document)
    return (int(number.group()) if number else 0, document)


def speeds(title, figures, kind):
    documents = sorted({name.split("/")[1] for name in figures
                        if name.startswith(kind + "/") and "events" not in name}, key=size_of)
    readers = [reader for reader in ("library", "rapidxml", "pugixml", "libxml2", "expat")
               if any(name.endswith("/" + reader) for name in figures)]
    rows = []
    for document in documents:
        speed = {}
        for reader in readers:
            time, size = figures[f"{kind}/{document}/{reader}"]
            speed[reader] = size / time * 1000
        fastest = max(value for reader, value in speed.items() if reader != "library")
        rows.append([document, *(f"{speed[reader]:.0f}" for reader in readers),
                     f"{speed['library'] / fastest:.2f}"])
    table(title, ["document", *(f"{reader}, MB/s" for reader in readers), "to the fastest peer"],
          rows)


def ratios(title, figures, kind, subject, floor, unit=1000):
    rows = []
    for name in sorted(figures, key=lambda name: size_of(name.split("/")[1])):
        if name.startswith(kind + "/") and name.endswith("/" + subject):
            base = name.removesuffix(subject) + floor
            if base in figures:
                time, least = figures[name][0], figures[base][0]
                rows.append([name.split("/")[1], f"{time / unit:.1f}", f"{least / unit:.1f}",
                             f"{time / least:.2f}"])
    table(title, ["", f"{subject}, µs", f"{floor}, µs", "ratio"], rows)


def accessors(figures):
    nothing = figures["accessor/nothing"][0] / figures["accessor/nothing"][1]
    rows = []
    for name, (time, calls) in sorted(figures.items()):
        if name.startswith("accessor/") and name != "accessor/nothing":
            rows.append([name.removeprefix("accessor/"), f"{time / calls - nothing:.2f}"])
    table("Accessors, beyond an empty loop", ["call", "ns"], rows)


def others(figures):
    rows = [[name, f"{time / 1000:.1f}"] for name, (time, _) in sorted(figures.items())
            if name.startswith("log/") or "events" in name]
    table("Events and the log", ["", "µs"], rows)


def main(folder):
    results = {}
    for width in WIDTHS:
        figures = medians(folder, width)
        results[width] = {name: {"nanoseconds": time, "items": items}
                          for name, (time, items) in sorted(figures.items())}
        print(f"\n## {width}")
        speeds("Answer to model", figures, "read")
        speeds("Answer to published lists", figures, "publish")
        ratios("Publishing against one copy of what is published", figures, "lists", "publish",
               "copy")
        ratios("A whole refresh against the exchange alone", figures, "refresh", "library",
               "exchange")
        accessors(figures)
        others(figures)
    (folder / "results.json").write_text(json.dumps(results, indent=1) + "\n")


if __name__ == "__main__":
    main(pathlib.Path(sys.argv[1]))
