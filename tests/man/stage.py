"""Where the examples are played: a folder like the installed ones, and the programs."""

import os
import re
import signal
import subprocess
import time
from collections.abc import Iterator
from contextlib import contextmanager
from itertools import takewhile
from pathlib import Path
from typing import IO

from programs import RAIDINFO, RAIDSIM

# Far more than anything here takes, and less than CTest waits.
PATIENCE = 60
POLL = 0.02


def environment() -> dict[str, str]:
    folders = {str(Path(program).parent) for program in (RAIDINFO, RAIDSIM)}
    return os.environ | {"PATH": ":".join([*sorted(folders), os.environ["PATH"]])}


def first_line(stream: IO[str] | None) -> str:
    assert stream is not None
    return stream.readline()


@contextmanager
def simulator(command: str) -> Iterator[subprocess.Popen[str]]:
    """The simulator of a command line, from when it listens until the block ends."""
    process = subprocess.Popen(
        ["/bin/sh", "-c", "exec " + command],
        stdin=subprocess.PIPE,
        stdout=subprocess.PIPE,
        text=True,
        env=environment(),
    )
    try:
        assert "listening" in first_line(process.stdout)
        yield process
    finally:
        process.terminate()
        process.communicate(timeout=PATIENCE)
    assert process.returncode == 0


def tell(service: subprocess.Popen[str], line: str) -> None:
    assert service.stdin is not None
    service.stdin.write(line + "\n")
    service.stdin.flush()


def answer(service: subprocess.Popen[str], line: str) -> str:
    """What a simulator says to a line, once it has carried it out."""
    tell(service, line + "\nstatus")
    lines = iter(lambda: first_line(service.stdout), "")
    return "".join(takewhile(lambda said: not said.startswith("document "), lines))


def control(options: str, lines: str) -> str:
    """What the simulator says to lines that an operator types; all must be to its liking."""
    command = f"exec {RAIDSIM} --port 0 {options}"
    done = subprocess.run(
        ["/bin/sh", "-c", command],
        input=lines + "quit\n",
        capture_output=True,
        text=True,
        timeout=PATIENCE,
    )
    assert (done.returncode, done.stderr) == (0, "")
    return done.stdout


def follows(command: str) -> bool:
    """Whether the command goes on until somebody interrupts it."""
    follow = ("raidinfo events", "raidinfo watch", "raidinfo record")
    return command.startswith(follow) and not re.search("--count|--for 0", command)


def has_begun(process: subprocess.Popen[str], command: str) -> None:
    """Returns when the command has shown or written something."""
    if not command.startswith("raidinfo record"):
        assert first_line(process.stdout) != ""
        return
    recording = Path(command.split()[-1])
    while not (recording.exists() and b" events " in recording.read_bytes()):
        assert process.poll() is None
        time.sleep(POLL)


def interrupt(command: str) -> None:
    process = subprocess.Popen(
        ["/bin/sh", "-c", "exec " + command], stdout=subprocess.PIPE, text=True, env=environment()
    )
    has_begun(process, command)
    process.send_signal(signal.SIGINT)
    process.communicate(timeout=PATIENCE)
    assert process.returncode == 128 + signal.SIGINT


def shell(command: str, errors: int) -> subprocess.CompletedProcess[str]:
    return subprocess.run(
        ["/bin/sh", "-c", command],
        stdout=subprocess.PIPE,
        stderr=errors,
        text=True,
        env=environment(),
        timeout=PATIENCE,
    )


def run(command: str) -> str:
    done = shell(command, subprocess.PIPE)
    assert (done.returncode, done.stderr) == (0, "")
    return done.stdout


def commands(block: str) -> list[str]:
    """The command lines of a block; lines between braces are one."""
    return [found[0].rstrip("\n") for found in re.finditer(r"(?ms)^\{$.*?^\}.*?$|^.+?$", block)]


def play(block: str) -> None:
    """Carries out what a block shows, line by line. A simulator beside another takes a free port."""
    for command in commands(block):
        if re.match(r"raidsim (?!generate)", command):
            with simulator(command.removesuffix("&") + " --port 0"):
                pass
        elif follows(command):
            interrupt(command)
        else:
            run(command)


def play_dialogue(block: str, service: subprocess.Popen[str]) -> None:
    """Carries out what stands behind the prompts of a block, "$ " for the shell and "raidsim> " for
    the simulator, and compares what comes out. There "..." stands for the rest of a line or for a
    part of it, and where it is alone for any lines."""
    prompts = r"(?m)^(\$|raidsim>) (.+)\n((?:(?!\$ |raidsim> ).*\n)*)"
    for prompt, line, expected in re.findall(prompts, block):
        said = answer(service, line) if prompt != "$" else shell(line, subprocess.STDOUT).stdout
        pattern = re.escape(expected).replace(r"\.\.\.", ".*")
        pattern = re.sub(r"(?m)^\.\*\\\n", r"(?:.*\n)*", pattern)
        assert re.fullmatch(pattern, said), f"{line}\n{said}"
