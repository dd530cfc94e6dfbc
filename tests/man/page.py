"""The sources of the manual pages, read as far as the tests look at them."""

import os
import re
from pathlib import Path

SOURCES = Path(os.environ["RAID_SOURCES"])


def without_markup(text: str) -> str:
    """The text as it is shown, on one line."""
    markup = r"\\(.)|\*|(?<!\w)_|_(?!\w)"
    return re.sub(markup, lambda found: found[1] or "", " ".join(text.split()))


class Page:
    """A page in the language of scdoc: sections under "# ", subsections under "## "."""

    def __init__(self, path: Path) -> None:
        self.name, self.section, _ = path.name.rsplit(".", 2)
        self.path = path
        self.text = path.read_text(encoding="utf-8")
        headings = re.split(r"(?m)^# (.+)\n", self.text)
        self.sections = dict(zip(headings[1::2], headings[2::2]))

    def __str__(self) -> str:
        return f"{self.name}({self.section})"

    def summary(self) -> str:
        """What NAME says of it in a few words."""
        line: str = self.sections["NAME"].strip()
        return line.removeprefix(f"{self.name} - ")

    def references(self, section: str) -> list[str]:
        """The pages that a section refers to, such as "raidinfo(1)"."""
        return referred(self.sections[section])

    def blocks(self, section: str) -> list[str]:
        """The literal blocks of a section."""
        found = re.findall(r"(?ms)^```\n(.*?)^```$", self.sections[section])
        return [re.sub(r"\\(.)", r"\1", block) for block in found]

    def forms(self) -> list[str]:
        """What the SYNOPSIS shows, each form on a line of its own."""
        text = re.sub(r"\n\t", " ", self.sections["SYNOPSIS"])
        return [without_markup(line.removesuffix("++")) for line in text.splitlines() if line]


def referred(text: str) -> list[str]:
    return [f"{name}({number})" for name, number in re.findall(r"\*([\w-]+)\*\((\d)\)", text)]


def terms(text: str) -> list[str]:
    """What a text defines: lines with an indented explanation below."""
    return re.findall(r"(?m)^(\S.*)\n\t", text)


def rows(text: str) -> dict[str, str]:
    """What the first column of a table holds, as it is written, and what stands beside it."""
    return dict(re.findall(r"(?m)^\|[\[ ] (.+)\n:[< ] +(.+(?:\n +.+)*)$", text))


PAGES = [Page(path) for path in sorted((SOURCES / "man").glob("*.scd"))]


def page(name: str) -> Page:
    return next(each for each in PAGES if str(each) == name)
