"""Measures whole runs of raidinfo against a host that only asks the library for the configuration.

    python3 bench/client.py BUILD DOCUMENT

BUILD is a build with the benchmarks. Prints a table; the service's port must be free.
"""

import pathlib
import statistics
import subprocess
import sys
import time

RUNS = 60


def run(command: list[str]) -> float:
    """The milliseconds from the start of a process to its end."""
    begun = time.perf_counter()
    subprocess.run(command, stdout=subprocess.DEVNULL, check=True)
    return (time.perf_counter() - begun) * 1000


def main(build: pathlib.Path, document: str) -> None:
    raidinfo = str(build / "raidinfo")
    commands = {
        "a host that calls `RAIDinit`": [str(build / "bench_host")],
        "`raidinfo list`": [raidinfo, "list"],
        "`raidinfo tree`": [raidinfo, "tree"],
        "`raidinfo list --json`": [raidinfo, "list", "--json"],
        "`raidinfo health`": [raidinfo, "health"],
        "`raidinfo --version`, which asks nobody": [raidinfo, "--version"],
    }
    simulator = subprocess.Popen(
        [str(build / "raidsim"), document],
        stdin=subprocess.PIPE,
        stdout=subprocess.PIPE,
        text=True,
    )
    assert simulator.stdin and simulator.stdout
    try:
        if "listening" not in simulator.stdout.readline():
            sys.exit("The simulator does not start.")
        times: dict[str, list[float]] = {name: [] for name in commands}
        for _ in range(RUNS):
            for name, command in commands.items():
                times[name].append(run(command))
    finally:
        simulator.kill()
        simulator.wait()
    medians = {name: statistics.median(measured) for name, measured in times.items()}
    host = next(iter(medians.values()))
    print("| process | ms | to the host |", "|---|---:|---:|", sep="\n")
    for name, median in medians.items():
        print(f"| {name} | {median:.1f} | {median / host:.2f} |")


main(pathlib.Path(sys.argv[1]), sys.argv[2])
