"""Runs what the documents show.

    transcripts.py [--update] PROGRAMS DOCUMENT...

Each "console" block of a document is a dialogue: "$ " begins a command for the shell, "raidsim> " a
line for the simulator that an earlier "$ raidsim ..." has started, and what stands below must be what
comes out. A line "..." stands for any number of lines. All blocks of a document share one shell, one
simulator and an empty folder that holds the examples. With --update a block that is otherwise is
written anew.
"""

import difflib
import os
import pathlib
import re
import shutil
import signal
import subprocess
import sys
import tempfile

ROOT = pathlib.Path(__file__).resolve().parents[2]
MARK = "end-of-command"
BLOCK = re.compile(r"(?ms)^```console\n(.*?)^```$")
# Seconds after which something hangs.
PATIENCE = 100
PROMPTS = ("$ ", "raidsim> ")


class Simulator:
    """The simulator, which is told its lines one by one."""

    def __init__(self, command, folder, environment):
        self.process = subprocess.Popen(
            ["/bin/bash", "-c", "exec " + command],
            cwd=folder,
            env=environment,
            stdin=subprocess.PIPE,
            stdout=subprocess.PIPE,
            stderr=subprocess.STDOUT,
            text=True,
        )
        self.greeting = self.process.stdout.readline()

    def tell(self, line):
        """Says the line, and then one whose answer shows that it was carried out."""
        self.process.stdin.write(line + "\nstatus\n")
        self.process.stdin.flush()
        said = []
        while (answer := self.process.stdout.readline()) and not answer.startswith("document "):
            said.append(answer)
        return "".join(said)

    def end(self):
        self.process.kill()
        self.process.communicate()


class Shell:
    """One shell that runs commands as somebody would type them."""

    def __init__(self, folder, environment):
        self.process = subprocess.Popen(
            ["/bin/bash", "--noprofile", "--norc"],
            cwd=folder,
            env=environment,
            stdin=subprocess.PIPE,
            stdout=subprocess.PIPE,
            stderr=subprocess.STDOUT,
            text=True,
            errors="replace",
        )

    def run(self, command):
        self.process.stdin.write(f"{{ {command}\n}} </dev/null\nstatus=$? ; printf '%s\\n' {MARK} ; (exit $status)\n")
        self.process.stdin.flush()
        lines = []
        while (line := self.process.stdout.readline()) and not line.endswith(MARK + "\n"):
            lines.append(line)
        rest = line.removesuffix(MARK + "\n")
        return "".join(lines) + (rest + "\n" if rest else "")

    def end(self):
        self.process.communicate()


class Stage:
    """What the blocks of a document share."""

    def __init__(self, programs):
        self.folder = tempfile.mkdtemp(prefix="transcripts-")
        for name in ("examples", "faults"):
            os.symlink(ROOT / name, os.path.join(self.folder, name))
        self.environment = {
            "PATH": f"{programs}:/usr/local/bin:/usr/bin:/bin",
            "HOME": self.folder,
            "LC_ALL": "C.UTF-8",
            "SOURCE_DATE_EPOCH": "1163000000",
        }
        self.shell = Shell(self.folder, self.environment)
        self.simulator = None

    def play(self, line):
        prompt = next(prompt for prompt in PROMPTS if line.startswith(prompt))
        text = line.removeprefix(prompt)
        if prompt == "raidsim> ":
            return self.simulator.tell(text)
        if re.match(r"raidsim (?!.*--help)(?!generate)", text):
            self.end_simulator()
            self.simulator = Simulator(text, self.folder, self.environment)
            return self.simulator.greeting
        return self.shell.run(text)

    def end_simulator(self):
        if self.simulator is not None:
            self.simulator.end()

    def end(self):
        self.end_simulator()
        self.shell.end()
        shutil.rmtree(self.folder)


def steps(block):
    """The prompts of a block, each with the output below it."""
    found = []
    for line in block.splitlines(keepends=True):
        if line.startswith(PROMPTS):
            found.append([line.rstrip("\n"), ""])
        else:
            found[-1][1] += line
    return found


def matches(expected, actual):
    parts = expected.split("...\n")
    pattern = ".*".join(re.escape(part) for part in parts)
    return re.fullmatch(pattern, actual, re.DOTALL) is not None


def difference(document, prompt, expected, actual):
    return "".join(
        difflib.unified_diff(
            expected.splitlines(keepends=True),
            actual.splitlines(keepends=True),
            f"{document}: {prompt}",
            "what comes out",
        )
    )


def played(document, text, programs):
    """The text with what really comes out, and the differences."""
    stage = Stage(programs)
    differences = []

    def play_block(match):
        block = ""
        for prompt, expected in steps(match.group(1)):
            actual = stage.play(prompt)
            if matches(expected, actual):
                actual = expected
            else:
                differences.append(difference(document, prompt, expected, actual))
            block += prompt + "\n" + actual
        return f"```console\n{block}```"

    try:
        return BLOCK.sub(play_block, text), differences
    finally:
        stage.end()


def main():
    signal.alarm(PATIENCE)
    arguments = sys.argv[1:]
    update = "--update" in arguments
    programs, *documents = [argument for argument in arguments if argument != "--update"]
    failed = False
    for document in documents:
        path = ROOT / document
        text = path.read_text(encoding="utf-8")
        new, differences = played(document, text, os.path.abspath(programs))
        if update:
            path.write_text(new, encoding="utf-8")
        elif differences:
            failed = True
            print("\n".join(differences))
    sys.exit(1 if failed else 0)


if __name__ == "__main__":
    main()
