"""The pages as they are built and read."""

import os
import re
import subprocess
from pathlib import Path

import pytest
from page import PAGES, Page, referred

BUILT = Path(os.environ["RAID_MAN_PAGES"])
WIDTH = 80

# Where a reader expects them.
ORDER = [
    "NAME",
    "SYNOPSIS",
    "DESCRIPTION",
    "OPTIONS",
    "RETURN VALUES",
    "ERRORS",
    "ENVIRONMENT",
    "FILES",
    "EXIT STATUS",
    "EXAMPLES",
    "SEE ALSO",
    "CAVEATS",
]

every_page = pytest.mark.parametrize("page", PAGES, ids=str)


def typeset(page: Page) -> str:
    """The page as on a terminal; what troff has to say about it fails the test."""
    # As man(1) does, on one long sheet.
    source = ".pl 1100i\n" + (BUILT / page.path.stem).read_text(encoding="utf-8")
    done = subprocess.run(
        ["groff", "-t", "-Kutf8", "-man", "-ww", "-Tutf8", "-P-c"],
        input=source,
        capture_output=True,
        encoding="utf-8",
        check=True,
    )
    assert done.stderr == ""
    return re.sub(".\b", "", done.stdout)


@every_page
def test_scdoc_understands_it_without_a_word(page: Page) -> None:
    with page.path.open("rb") as source:
        done = subprocess.run(["scdoc"], stdin=source, capture_output=True, check=True)
    assert done.stderr == b""


@every_page
def test_it_fits_a_terminal(page: Page) -> None:
    assert [line for line in typeset(page).splitlines() if len(line) > WIDTH] == []


@every_page
def test_no_word_is_broken_so_that_options_can_be_copied(page: Page) -> None:
    assert "\N{HYPHEN}" not in typeset(page)


@every_page
def test_it_has_its_name_and_its_sections_where_they_are_looked_for(page: Page) -> None:
    assert page.text.startswith(f'{page} "RAIDInstrumentation"')
    assert page.sections["NAME"].startswith(f"\n{page.name} - ")
    usual = [title for title in page.sections if title in ORDER]
    assert usual == sorted(usual, key=ORDER.index)
    assert {"NAME", "DESCRIPTION", "EXAMPLES", "SEE ALSO"} <= set(usual)


@every_page
def test_it_refers_to_pages_that_are_there(page: Page) -> None:
    there = {str(each) for each in PAGES}
    of_this_project = re.compile("raid|libRAID")
    assert set(page.references("SEE ALSO")) <= there
    for section in page.sections:
        assert {name for name in page.references(section) if of_this_project.match(name)} <= there


@every_page
def test_it_refers_to_others_in_the_order_of_their_sections(page: Page) -> None:
    others = page.references("SEE ALSO")
    assert others == sorted(set(others) - {str(page)}, key=lambda name: (name[-2], name))


@every_page
def test_whom_it_recommends_refers_to_it(page: Page) -> None:
    recommended = [each for each in PAGES if str(each) in page.references("SEE ALSO")]
    assert [str(each) for each in recommended if str(page) not in referred(each.text)] == []


def test_the_overview_refers_to_every_page() -> None:
    overview = next(each for each in PAGES if each.section == "7")
    assert set(overview.references("SEE ALSO")) == {str(each) for each in PAGES} - {str(overview)}
