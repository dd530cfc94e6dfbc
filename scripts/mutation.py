"""Changes the reader and the snapshot in small ways, and counts the changes that no test notices.

  scripts/mutate                  every change, in the 64-bit build
  scripts/mutate --width i386     in the 32-bit build
  scripts/mutate --sample N       N of the changes, spread evenly: what scripts/test runs
  scripts/mutate FILE...          the changes of these files only
  scripts/mutate --list           shows the changes and makes none

The changes are made in copies of the tree below build/mutation.
"""

import argparse
import collections
import concurrent.futures
import os
import pathlib
import queue
import shutil
import signal
import subprocess
import sys

from explained import explained
from mutants import MUTATED, ROOT, all_mutants

WORK = ROOT / "build" / "mutation"
SURVIVORS = ROOT / "tests" / "mutation" / "survivors.txt"

# Those that notice most come first. The shared ones are those of the preset, and find any library.
SHARED_TESTS = ["xml_test", "model_test", "agent_link_test", "flat_test", "events_test", "exchange_test"]
# These have the library's objects or its path compiled in, and so each copy of the tree builds them;
# most changes need not wait for that.
OWN_TESTS = ["reading_test", "numbering_test", "base_test", "host_test", "loading_test"]

def files_of_the_tree():
    for folder, folders, names in os.walk(ROOT):
        if pathlib.Path(folder) == ROOT:
            folders[:] = [name for name in folders if name not in ("build", ".git")]
        yield from (pathlib.Path(folder, name) for name in names)


class Copy:
    """A copy of the tree with a build of the library."""

    def __init__(self, number, width, jobs):
        self.root = WORK / f"{width}-{number}"
        self.build = self.root / "build"
        for source in files_of_the_tree():
            target = self.root / source.relative_to(ROOT)
            if target.exists() and target.read_bytes() == source.read_bytes():
                continue  # so that it is not compiled again
            target.parent.mkdir(parents=True, exist_ok=True)
            shutil.copy(source, target)
        flags = "-O0 -m32" if width == "i386" else "-O0"
        self.run("cmake", "-S", self.root, "-B", self.build, "-G", "Ninja",
                 "-DCMAKE_BUILD_TYPE=None", f"-DCMAKE_CXX_FLAGS={flags}",
                 f"-DCMAKE_C_FLAGS={flags}", "-DRAID_BUILD_TESTS=ON", "-DRAID_LIBRARY_ONLY=ON",
                 "-DCMAKE_UNITY_BUILD=ON", "-DCMAKE_UNITY_BUILD_BATCH_SIZE=12")
        self.tests = ROOT / "build" / width / "tests" / "bin"
        self.jobs = str(jobs)
        self.run(*self.build_of("RAIDInstrumentation", *OWN_TESTS))

    @staticmethod
    def run(*command):
        finished = subprocess.run([str(word) for word in command], stdin=subprocess.DEVNULL,
                                  stdout=subprocess.PIPE, stderr=subprocess.STDOUT, check=False)
        if finished.returncode != 0:
            sys.exit(finished.stdout.decode(errors="replace") + "\nThe copy does not build.")

    def build_of(self, *targets):
        return ["cmake", "--build", str(self.build), "--parallel", self.jobs, "--target", *targets]

    def builds(self, *targets):
        return subprocess.run(self.build_of(*targets), stdin=subprocess.DEVNULL,
                              stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
                              check=False).returncode == 0

    def passes(self, test):
        folder = self.build / "tests" / "bin" if test in OWN_TESTS else self.tests
        try:
            return subprocess.run(
                [str(folder / test), "--gtest_brief=1", "--gtest_fail_fast"],
                env=os.environ | {"LD_LIBRARY_PATH": str(self.build)},
                stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
                timeout=60, check=False).returncode == 0
        except subprocess.TimeoutExpired:
            return False

    def first_failing(self, tests):
        return next((test for test in tests if not self.passes(test)), None)

    def try_out(self, mutant):
        """How the change ends: "invalid", the test that noticed it, or None."""
        path = self.root / mutant.path
        original = path.read_text()
        lines = original.splitlines()
        lines[mutant.line] = mutant.changed
        try:
            path.write_text("\n".join(lines) + "\n")
            if not self.builds("RAIDInstrumentation"):
                return "invalid"
            noticed = self.first_failing(SHARED_TESTS)
            if noticed:
                return noticed
            if not self.builds(*OWN_TESTS):
                return "invalid"
            return self.first_failing(OWN_TESTS)
        finally:
            path.write_text(original)


def main():
    signal.signal(signal.SIGPIPE, signal.SIG_DFL)  # "--list | head" ends quietly
    parser = argparse.ArgumentParser(prog="scripts/mutate", description=__doc__,
                                     formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--width", choices=["amd64", "i386"], default="amd64")
    parser.add_argument("--sample", type=int, metavar="N")
    parser.add_argument("--list", action="store_true")
    parser.add_argument("files", nargs="*", metavar="FILE")
    options = parser.parse_args()

    unknown = sorted(set(options.files) - set(MUTATED))
    if unknown:
        parser.error(f"{unknown[0]} is not among the files that are changed: {' '.join(MUTATED)}")
    mutants = [mutant for mutant in all_mutants()
               if not options.files or mutant.path in options.files]
    if options.list:
        print("\n".join(mutant.key for mutant in mutants))
        return
    if options.sample:
        step = max(len(mutants) // options.sample, 1)
        mutants = mutants[step // 2 :: step]

    known = collections.Counter(explained(SURVIVORS))
    copies = queue.SimpleQueue()
    cores = len(os.sched_getaffinity(0))
    # A copy costs a minute to build.
    workers = 1 if options.sample and options.sample < 20 else cores
    WORK.mkdir(parents=True, exist_ok=True)
    with concurrent.futures.ThreadPoolExecutor(workers) as pool:
        Copy.run("cmake", "--preset", options.width, "-DRAID_BUILD_TESTS=ON")
        Copy.run("cmake", "--build", "--preset", options.width, "--target", *SHARED_TESTS)
        for copy in pool.map(lambda number: Copy(number, options.width, cores // workers), range(workers)):
            for test in SHARED_TESTS + OWN_TESTS:
                if not copy.passes(test):
                    sys.exit(f"{test} fails without a change.")
            copies.put(copy)

        def outcome(mutant):
            copy = copies.get()
            try:
                return mutant, copy.try_out(mutant)
            finally:
                copies.put(copy)

        counts = {"invalid": 0, "noticed": 0, "explained": 0, "survived": 0}
        log = WORK / f"{options.width}.log"
        with log.open("w") as lines:
            for mutant, end in pool.map(outcome, mutants):
                if end == "invalid":
                    kind = "invalid"
                elif end is not None:
                    kind = "noticed"
                else:
                    kind = "explained" if known[mutant.key] > 0 else "survived"
                    known[mutant.key] -= 1
                counts[kind] += 1
                print(f"{kind} {end or '-'} {mutant.line + 1} {mutant.key}", file=lines, flush=True)
                if kind == "survived":
                    print(f"survived: {mutant.key} (line {mutant.line + 1})", flush=True)

    valid = len(mutants) - counts["invalid"]
    if valid < len(mutants) / 2:
        sys.exit(f"Of {len(mutants)} changes only {valid} compiled: that is not for the changes.")
    surviving = counts["explained"] + counts["survived"]
    print(f"{options.width}: {valid} changes, {counts['noticed']} noticed, {surviving} survived "
          f"({100 * surviving / valid:.1f} %), {counts['survived']} of them unexplained; "
          f"{counts['invalid']} more did not compile")
    stale = [] if options.sample or options.files else [key for key, count in known.items() if count > 0]
    for key in stale:
        print(f"explained, but noticed or gone: {key}")
    if stale:
        sys.exit("tests/mutation/survivors.txt explains what does not survive.")
    if counts["survived"]:
        sys.exit("A change survived that tests/mutation/survivors.txt does not explain.")


if __name__ == "__main__":
    main()
