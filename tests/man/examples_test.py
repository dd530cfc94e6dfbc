"""The examples of the pages work."""

import os
import shlex
import shutil
import subprocess
import time
from collections.abc import Callable
from pathlib import Path

import pytest
from page import PAGES, SOURCES, page
from programs import EXAMPLES, PROGRAMS, RAIDINFO, recording
from stage import POLL, control, play, play_dialogue, run, simulator, tell

SERVICE = "raidsim --init small-server.init small-server.xml"


@pytest.fixture(autouse=True)
def folder(tmp_path: Path, monkeypatch: pytest.MonkeyPatch) -> Path:
    """The working directory: the examples, and beside them the faults."""
    shutil.copytree(EXAMPLES, tmp_path / "examples")
    (tmp_path / "faults").symlink_to(SOURCES / "faults")
    monkeypatch.chdir(tmp_path / "examples")
    return tmp_path / "examples"


def play_beside_a_service(block: str) -> None:
    with simulator(SERVICE) as service:
        if block.startswith("$ "):
            play_dialogue(block, service)
        else:
            play(block)


def play_commands_or_lines_of_control(block: str) -> None:
    if block.startswith("raidsim"):
        play(block)
    else:
        control("--init small-server.init small-server.xml", block)


def play_a_scenario(block: str) -> None:
    Path("example.scenario").write_text(block, encoding="utf-8")
    said = control("--clock virtual --scenario example.scenario", "advance 3600\n")
    assert said.endswith("time 3600\n")


def arm_a_fault(block: str) -> None:
    Path("example.fault").write_text(block, encoding="utf-8")
    said = control("small-server.xml", "fault example.fault\n")
    assert "fault: armed example\n" in said


def judge_by_a_policy(block: str) -> None:
    Path("example.toml").write_text(block, encoding="utf-8")
    run(f"{RAIDINFO} --from {recording(Path.cwd())} health --policy example.toml")


def show_codes(block: str) -> None:
    Path("example.toml").write_text(block, encoding="utf-8")
    run(f"{RAIDINFO} --from {recording(Path.cwd())} --codes example.toml list")


def compile_a_program(source: str) -> None:
    Path("example.c").write_text(source, encoding="utf-8")
    library = Path(os.environ["RAID_LIBRARY"])
    compiler = os.environ["RAID_C_COMPILER"]
    flags = f"-std=c99 -Wall -Wextra -Werror -I {shlex.quote(str(SOURCES / 'include'))}"
    run(f"{compiler} {flags} example.c -o example {library} -pthread -Wl,-rpath,{library.parent}")


def run_a_program(block: str) -> None:
    compile_a_program(block)
    with simulator(SERVICE) as service, subprocess.Popen(
        "./example", stdout=subprocess.PIPE, text=True
    ) as program:
        # One that waits for an event gets as many as it needs.
        while program.poll() is None:
            tell(service, "event string=Again")
            time.sleep(POLL)
        said = program.communicate()[0].splitlines()
    assert program.returncode == 0
    assert [line for line in said if not line.startswith("sent size")] != []


def look_around(block: str) -> None:
    """The first command stands for the service."""
    first, _, rest = block.partition("&\n")
    with simulator(first):
        play(rest)


EXAMPLES_OF: dict[str, Callable[[str], None]] = {
    "raidinfo(1)": play_beside_a_service,
    **{f"raidinfo-{name}(1)": play_beside_a_service for name in PROGRAMS[0].subcommands()},
    "raidsim(1)": play_commands_or_lines_of_control,
    "libRAIDInstrumentation(3)": run_a_program,
    "raid-fault(5)": arm_a_fault,
    "raid-recording(5)": play_beside_a_service,
    "raid-scenario(5)": play_a_scenario,
    "raidinfo-codes(5)": show_codes,
    "raidinfo-policy(5)": judge_by_a_policy,
    "raidinfo-snapshot(5)": play_beside_a_service,
    "raidinfo-state(5)": play_beside_a_service,
    "raid-instrumentation(7)": look_around,
}


@pytest.mark.parametrize("name", sorted(EXAMPLES_OF))
def test_the_examples_work(name: str) -> None:
    blocks = page(name).blocks("EXAMPLES")
    assert blocks != []
    for block in blocks:
        EXAMPLES_OF[name](block)


def test_every_page_has_examples_that_are_played() -> None:
    assert {str(each) for each in PAGES} == set(EXAMPLES_OF)
