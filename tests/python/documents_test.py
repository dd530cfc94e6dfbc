"""The page for authors of providers, and the example that it names, as they are."""

import itertools
import re
import signal
import subprocess
import sys
from collections.abc import Iterator
from contextlib import contextmanager

import pytest
from support import build
from support.simulator import Simulator

PAGE = (build.SOURCES / "docs" / "python.md").read_text()
WATCHER = build.PACKAGE / "examples" / "watch_events.py"

# Each program with what it prints.
PROGRAMS = re.findall(r"```python\n(.*?)```\n\n```text\n(.*?)```", PAGE, re.DOTALL)


def test_every_program_of_the_page_is_followed_by_what_it_prints() -> None:
    assert len(PROGRAMS) == PAGE.count("```python\n") > 0


@pytest.mark.parametrize(
    ("program", "output"), PROGRAMS, ids=[str(number) for number in range(len(PROGRAMS))]
)
def test_the_programs_of_the_page_print_what_it_says(program: str, output: str) -> None:
    with Simulator("small-server.xml", "--init", build.EXAMPLES / "small-server.init"):
        result = subprocess.run([sys.executable, "-c", program], capture_output=True, text=True)
    assert result.stderr == ""
    # The page speaks of these lines, but does not show them each time.
    lines = [line for line in result.stdout.splitlines() if not line.startswith("sent size ")]
    assert lines == output.splitlines()


@contextmanager
def watching() -> Iterator[subprocess.Popen[str]]:
    with subprocess.Popen(
        [sys.executable, WATCHER], stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True
    ) as process:
        try:
            yield process
        finally:
            process.kill()


def lines_until(process: subprocess.Popen[str], end: str) -> list[str]:
    assert process.stdout is not None
    lines = []
    for line in process.stdout:
        lines.append(line.rstrip("\n"))
        if end in line:
            return lines
    raise AssertionError(f"no line with {end!r} among {lines}")


def failing_drive() -> list[tuple[str, str]]:
    """The commands of the scenario, each with its time."""
    scenario = (build.EXAMPLES / "failing-drive.scenario").read_text()
    return re.findall(r"^at (\S+) (.*)$", scenario, re.MULTILINE)


def interrupt(process: subprocess.Popen[str]) -> None:
    process.send_signal(signal.SIGINT)
    output, errors = process.communicate(timeout=60)
    assert (output, errors, process.returncode) == ("", "", 0)


def test_the_example_shows_a_drive_that_fails_and_is_replaced() -> None:
    with Simulator("small-server.xml") as simulator, watching() as process:
        for _, step in itertools.groupby(failing_drive(), key=lambda timed: timed[0]):
            # Then it has shown what was before.
            simulator.wait_for_waiting_client()
            for _, command in step:
                simulator.command(command)
        lines = lines_until(process, "Hot spare assigned")
        interrupt(process)
    assert lines[:2] == [
        "Pellion Adapter 1: Pellion 4220, Normal",
        "6 disk drives, 2 logical drives, 1 enclosures",
    ]
    assert any(line.endswith("  Critical  Drive failed") for line in lines)
    for change in (
        "  Drive QS0101003K: Normal -> Critical",
        "  Logical drive 0 of adapter 1: Normal -> Warning",
        "  Drive QS0102001K: Normal -> Warning",
        "  Drive QS0102001K: Warning -> Normal",
        "  Logical drive 1 of adapter 1: Warning -> Normal",
        "  Drive QS0101003K: Critical -> absent",
        "  Drive QS0101077K: absent -> Normal",
    ):
        assert change in lines


def test_the_example_says_that_the_service_is_not_there() -> None:
    with watching() as process:
        output, errors = process.communicate(timeout=60)
    assert (output, process.returncode) == ("", 1)
    assert re.fullmatch(
        r"watch_events: the RAID management service [^\n]* does not answer\n", errors
    )


def test_the_example_goes_on_after_an_outage() -> None:
    with watching_from_start_to_outage() as process:
        with Simulator("small-server.xml") as simulator:
            simulator.event("back again", sequenceNumber=2)
            lines_until(process, "back again")
            interrupt_after_outage(process)


def test_the_example_goes_on_when_the_service_counts_anew() -> None:
    with watching_from_start_to_outage() as process:
        with Simulator("small-server.xml") as simulator:
            simulator.event("of another log", sequenceNumber=1)
            lines_until(process, "of another log")
            assert process.stderr is not None
            assert "counts its events anew" in process.stderr.readline()
            interrupt_after_outage(process)


@contextmanager
def watching_from_start_to_outage() -> Iterator[subprocess.Popen[str]]:
    with Simulator("small-server.xml") as simulator:
        simulator.event("before", sequenceNumber=1)
        with watching() as process:
            lines_until(process, "before")
            simulator.wait_for_waiting_client()
            simulator.kill()
            assert process.stderr is not None
            assert process.stderr.readline().endswith("does not answer; trying again\n")
            yield process


def interrupt_after_outage(process: subprocess.Popen[str]) -> None:
    process.send_signal(signal.SIGINT)
    output, _ = process.communicate(timeout=60)
    assert (output, process.returncode) == ("", 0)
