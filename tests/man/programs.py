"""The programs that the pages describe, and what they say about themselves."""

import os
import re
import subprocess
from dataclasses import dataclass
from pathlib import Path

from page import SOURCES

RAIDINFO = os.environ["RAIDINFO_PROGRAM"]
RAIDSIM = os.environ["RAIDSIM_PROGRAM"]
EXAMPLES = SOURCES / "examples"


@dataclass(frozen=True)
class Program:
    name: str
    path: str
    document: str

    def __str__(self) -> str:
        return self.name

    def help(self, *subcommand: str) -> str:
        command = [self.path, *subcommand, "--help"]
        return subprocess.run(command, capture_output=True, text=True, check=True).stdout

    def subcommands(self) -> list[str]:
        table = self.help().partition("\nSubcommands:\n")[2].partition("\n\n")[0]
        return re.findall(r"(?m)^  (\w+)", table)

    def options(self, *subcommand: str) -> set[str]:
        """The options as the pages define them, such as "-o, --columns VALUE"."""
        rows = re.findall(r"(?m)^  (?:(-\w),)?(--[\w-]+)( \S)?", self.help(*subcommand))
        return {
            (short + ", " if short else "") + option + (" VALUE" if takes_value else "")
            for short, option, takes_value in rows
        }

    def statuses(self) -> list[str]:
        """The exit statuses of the program's document, in the only table that follows the words."""
        text = (SOURCES / "docs" / self.document).read_text(encoding="utf-8")
        table = re.search(r"(?s)(?:## Exit status\n\n|\| Exit status \|)(.+?)\n\n", text)
        assert table is not None
        return re.findall(r"(?m)^\| (\d+) \|", table[1])


PROGRAMS = [
    Program("raidinfo", RAIDINFO, "raidinfo.md"),
    Program("raidsim", RAIDSIM, "raidsim.md"),
]


def known_words(message: str) -> set[str]:
    """The words that a complaint about an unknown one names."""
    return set(re.split(", ", message.rstrip().rpartition("known: ")[2]))


def recording(folder: Path, document: str = "small-server.xml") -> Path:
    """A recording of one of the examples."""
    answer = (EXAMPLES / document).read_text(encoding="utf-8")
    path = folder / Path(document).with_suffix(".rec")
    size = len(answer.encode())
    heading = f"raid-recording 1 2026-11-21T17:48:00Z\nanswer 0 configuration {size}\n"
    path.write_text(heading + answer + "\n", encoding="utf-8")
    return path
