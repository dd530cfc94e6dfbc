"""bench_report.py FOLDER LARGE: prints what scripts/bench measured, and writes FOLDER/results.json.

LARGE is the document whose memory was measured.

Every figure is the median over the repetitions; a ratio is one of medians of the same run.
"""

import collections
import json
import math
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


def ratios(title, figures, kind, subject, floor, peers=()):
    rows = []
    for name in sorted(figures, key=lambda name: size_of(name.split("/")[1])):
        if not name.startswith(kind + "/") or not name.endswith("/" + subject):
            continue
        base = name.removesuffix(subject)
        least = figures[base + floor][0]
        row = [name.split("/")[1], f"{least / 1000:.1f}"]
        for reader in (subject, *peers):
            time = figures[base + reader][0] if base + reader in figures else None
            row += [f"{time / 1000:.1f}", f"{time / least:.2f}"] if time else ["-", "-"]
        rows.append(row)
    head = ["", f"{floor}, µs"]
    for reader in (subject, *peers):
        head += [f"{reader}, µs", "ratio"]
    table(title, head, rows)


def exponent(smaller, larger):
    """Of the power of the items that the time grows with."""
    (time, items), (longer, more) = smaller, larger
    return math.log(longer / time) / math.log(more / items)


def growth(figures):
    sizes = sorted({name.split("/")[1] for name in figures if name.startswith("read/")
                    and name.endswith("-compact/library")}, key=size_of)
    rows = []
    for kind, title in (("read", "answer to model"), ("publish", "answer to published lists")):
        for smaller, larger in zip(sizes, sizes[1:]):
            if size_of(smaller)[0] > 0:
                ends = [figures[f"{kind}/{size}/library"] for size in (smaller, larger)]
                rows.append([title, f"{smaller} to {larger}", f"{exponent(*ends):.3f}"])
        if size_of(sizes[-1])[0] > 1:
            ends = [figures[f"{kind}/{size}/library"] for size in ("1MB-compact", sizes[-1])]
            rows.append([title, f"1MB-compact to {sizes[-1]}", f"{exponent(*ends):.3f}"])
    table("Growth", ["", "from, to", "exponent"], rows)

    searches = {tuple(map(int, name.split("/")[1:])): figure for name, figure in figures.items()
                if name.startswith("search/")}
    arrays = sorted({key[1] for key in searches})
    drives = sorted({key[0] for key in searches})
    rows = []
    for count in drives:
        rows.append([count, *(f"{searches[count, each][0] / count:.1f}" if (count, each) in searches
                              else "-" for each in arrays)])
    ends = [[searches[count, each] for count in drives if (count, each) in searches]
            for each in arrays]
    rows.append(["exponent", *(f"{exponent(found[0], found[-1]):.3f}" if len(found) > 1 else "-"
                               for found in ends)])
    table("The search for each drive's array, ns a drive",
          ["drives", *(f"{each} arrays" if each > 1 else "1 array" for each in arrays)], rows)


def counts(path):
    rows = []
    for line in path.read_text().splitlines():
        document, *numbers = line.split()
        size, allocations, refresh, reading, without_trace = map(int, numbers)
        rows.append([document, allocations, f"{refresh / size:.2f}", f"{reading / size:.2f}",
                     f"{100 * (reading / without_trace - 1):+.2f} %"])
    table("Counted", ["document", "allocations of a refresh", "instructions a byte",
                      "of them reading", "trace, while it is off, of reading"], rows)


def memory(path, document):
    table(f"Memory, in multiples of {document}",
          ["reader", "at most while reading", "the lists add", "copied into the model",
           "copied into the lists"],
          [line.split() for line in path.read_text().splitlines()])


def accessors(figures):
    rows = [[name.removeprefix("accessor/"), f"{time / calls:.2f}"]
            for name, (time, calls) in sorted(figures.items()) if name.startswith("accessor/")]
    table("Accessors", ["call", "ns"], rows)


def others(figures):
    rows = [[name, f"{time / 1000:.1f}"] for name, (time, _) in sorted(figures.items())
            if name.startswith(("log/", "read/events"))]
    table("Events and the log", ["", "µs"], rows)


def main(folder, large):
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
               "exchange", ("rapidxml", "pugixml"))
        ratios("A batch of 100 events against its two exchanges alone", figures, "batch",
               "library", "exchange")
        accessors(figures)
        memory(folder / f"memory-{width}.txt", large)
        counts(folder / f"counts-{width}.txt")
        growth(figures)
        others(figures)
    (folder / "results.json").write_text(json.dumps(results, indent=1) + "\n")


if __name__ == "__main__":
    main(pathlib.Path(sys.argv[1]), sys.argv[2])
