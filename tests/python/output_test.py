"""What the library prints, and who does not want it."""

import subprocess
import sys

import pytest
from support.documents import configuration
from support.scripted_service import ScriptedService

ASKING = """
import subprocess, threading
from raidinstrumentation import RAIDInstrumentation, discarded_c_output

def ask():
    raid.refresh()

with RAIDInstrumentation() as raid:
    {how}
"""


def printed(how: str) -> list[str]:
    program = ASKING.format(how=how.replace("\n", "\n    "))
    with ScriptedService(config=(configuration(""),)):
        return subprocess.run(
            [sys.executable, "-c", program], stdout=subprocess.PIPE, check=True, text=True
        ).stdout.splitlines()


def test_every_exchange_prints_a_line() -> None:
    assert printed("ask(); ask()") == ["sent size 64, FD isset 1"] * 2


def test_the_lines_can_be_discarded() -> None:
    assert printed("with discarded_c_output(): ask()") == []


def test_they_are_printed_again_afterwards() -> None:
    assert len(printed("with discarded_c_output(): ask()\nask()")) == 1


@pytest.mark.parametrize(
    "how",
    [
        'with discarded_c_output():\n    ask()\n    print("mine", flush=True)',
        'with discarded_c_output():\n    ask()\n    subprocess.run(["echo", "mine"])',
        "try:\n    with discarded_c_output():\n        ask(); 1/0\nexcept ArithmeticError:\n"
        '    print("mine")',
    ],
    ids=["print", "child process", "exception"],
)
def test_what_the_program_prints_itself_stays(how: str) -> None:
    assert printed(how) == ["mine"]


def test_discarding_may_be_nested_and_overlap_between_threads() -> None:
    nested = "with discarded_c_output():\n    with discarded_c_output(): ask()\n    ask()"
    assert printed(nested) == []
    threads = """
entered, left = threading.Event(), threading.Event()
def other():
    with discarded_c_output():
        entered.set()
        left.wait()
        ask()
thread = threading.Thread(target=other)
with discarded_c_output():
    thread.start()
    entered.wait()
left.set()
thread.join()
"""
    assert printed(threads) == []
