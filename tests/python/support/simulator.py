"""The simulated service."""

import subprocess
from pathlib import Path
from types import TracebackType

from . import build
from .waiting import wait_until


class Simulator:
    """raidsim with one of the shipped examples, as long as the with block lasts."""

    def __init__(self, example: str, *options: str | Path) -> None:
        command = [build.RAIDSIM, *options, build.EXAMPLES / example]
        self._process = subprocess.Popen(
            command, stdin=subprocess.PIPE, stdout=subprocess.PIPE, text=True
        )
        self._read_line_with("listening")

    def __enter__(self) -> "Simulator":
        return self

    def __exit__(
        self,
        kind: type[BaseException] | None,
        error: BaseException | None,
        traceback: TracebackType | None,
    ) -> None:
        self.kill()

    def kill(self) -> None:
        """Ends the simulator in the middle of what it does."""
        self._process.kill()
        self._process.communicate()

    def command(self, line: str) -> None:
        """Has the simulator carry out a command; it has when this returns."""
        self._write(line)
        self._status()

    def event(self, message: str, **fields: object) -> None:
        """Adds an event."""
        words = [f"{name}={value}" for name, value in fields.items()]
        self.command(" ".join(["event", f'string="{message}"', *words]))

    def arm(self, fault: str, case: int) -> None:
        """Has the next client that it is meant for meet a case of a fault file."""
        self._write(f"fault {build.FAULTS / fault} {case}")
        self._read_line_with("fault: armed")

    def wait_for_waiting_client(self) -> None:
        """Returns once a client waits for an event."""
        wait_until(lambda: "waiting clients 0" not in self._status())

    def _status(self) -> str:
        self._write("status")
        return self._read_line_with("waiting clients")

    def _write(self, line: str) -> None:
        assert self._process.stdin is not None
        self._process.stdin.write(line + "\n")
        self._process.stdin.flush()

    def _read_line_with(self, text: str) -> str:
        assert self._process.stdout is not None
        for line in self._process.stdout:
            if text in line:
                return line
        raise AssertionError("raidsim has ended")
