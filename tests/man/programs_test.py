"""The pages say of the programs what the programs say of themselves."""

import json
import re
import subprocess
import tomllib
from pathlib import Path

import pytest
from page import PAGES, SOURCES, Page, page, rows, terms, without_markup
from programs import EXAMPLES, PROGRAMS, RAIDINFO, RAIDSIM, Program, known_words, recording

HELP = "-h, --help"

RAIDINFO_SUBCOMMANDS = PROGRAMS[0].subcommands()
SUBCOMMANDS = [(program, name) for program in PROGRAMS for name in program.subcommands()]

every_program = pytest.mark.parametrize("program", PROGRAMS, ids=str)
every_subcommand = pytest.mark.parametrize(("program", "subcommand"), SUBCOMMANDS, ids=str)


def page_of(program: Program, subcommand: str = "") -> Page:
    """A subcommand of raidinfo has a page of its own, that of raidsim has a section."""
    own = subcommand and program.name == "raidinfo"
    return page(f"{program.name}-{subcommand}(1)" if own else f"{program.name}(1)")


def defined_options(text: str) -> set[str]:
    """The options that a text defines, with VALUE for the name of what they take."""
    shown = (without_markup(term) for term in terms(text) if term.startswith("*-"))
    return {re.sub(r" [A-Z]+$", " VALUE", term) for term in shown}


def names(text: str) -> set[str]:
    return set(re.findall(r"(?<![\w-])--[a-z][a-z-]*", text))


def options_by_place() -> dict[tuple[str, str], set[str]]:
    """The options that programs have, by the pages and sections where they are looked for."""
    places = {(f"{program}(1)", "OPTIONS"): program.options() for program in PROGRAMS}
    for program, subcommand in SUBCOMMANDS:
        section = {"generate": "GENERATING DOCUMENTS"}.get(subcommand, "OPTIONS")
        own = program.options(subcommand) - {HELP}
        places.setdefault((str(page_of(program, subcommand)), section), set()).update(own)
    return {place: options for place, options in places.items() if options}


def test_every_option_is_defined_in_its_place_and_nowhere_else() -> None:
    defined = {
        (str(each), section): defined_options(text)
        for each in PAGES
        for section, text in each.sections.items()
    }
    assert {place: found for place, found in defined.items() if found} == options_by_place()


def test_every_subcommand_of_raidinfo_has_its_page_and_every_page_its_subcommand() -> None:
    of_subcommands = {
        each.name for each in PAGES if each.name.startswith("raidinfo-") and each.section == "1"
    }
    assert of_subcommands == {f"raidinfo-{name}" for name in RAIDINFO_SUBCOMMANDS}


def test_raidinfo_lists_its_subcommands_as_the_help_does_and_by_what_their_pages_say() -> None:
    shown = rows(page("raidinfo(1)").sections["SUBCOMMANDS"])
    assert list(shown) == [f"*raidinfo-{name}*(1)" for name in RAIDINFO_SUBCOMMANDS]
    for name, line in zip(RAIDINFO_SUBCOMMANDS, shown.values()):
        summary = page(f"raidinfo-{name}(1)").summary()
        assert without_markup(line) == f"{summary[0].upper()}{summary[1:]}."


@pytest.mark.parametrize("subcommand", RAIDINFO_SUBCOMMANDS)
def test_the_page_of_a_subcommand_has_what_is_looked_for(subcommand: str) -> None:
    sections = page(f"raidinfo-{subcommand}(1)").sections
    assert {"SYNOPSIS", "OPTIONS", "EXIT STATUS"} <= set(sections)
    for section in ("OPTIONS", "EXIT STATUS"):
        assert "*raidinfo*(1)" in sections[section]


@pytest.mark.parametrize("subcommand", RAIDINFO_SUBCOMMANDS)
def test_the_exit_statuses_of_a_subcommand_are_among_those_of_raidinfo(subcommand: str) -> None:
    shown = terms(page(f"raidinfo-{subcommand}(1)").sections["EXIT STATUS"])
    assert set(re.findall(r"\d+", " ".join(shown))) <= set(PROGRAMS[0].statuses())


@pytest.mark.parametrize("subcommand", RAIDINFO_SUBCOMMANDS)
def test_every_member_of_what_a_subcommand_prints_as_json_is_there(subcommand: str) -> None:
    schema = subprocess.run([RAIDINFO, "schema"], capture_output=True, check=True).stdout
    definitions = json.loads(schema)["$defs"]
    printed = definitions.get({"events": "event"}.get(subcommand, subcommand), {})
    text = page(f"raidinfo-{subcommand}(1)").sections["DESCRIPTION"]
    assert [key for key in printed.get("properties", {}) if f"*{key}*" not in text] == []


def form_of(program: Program, subcommand: str) -> str:
    found = [
        form
        for form in page_of(program, subcommand).forms()
        if re.match(rf"{program.name} (\[OPTION\]... )?{subcommand}\b", form)
    ]
    assert len(found) == 1
    return found[0]


@every_subcommand
def test_the_synopsis_is_that_of_the_program(program: Program, subcommand: str) -> None:
    form = form_of(program, subcommand)
    help_text = program.help(subcommand)
    # An option may stand there by its short name.
    shown = set(re.findall(r"\[(--?[\w-]+(?: [A-Z]+)?)\]", form))
    options = {re.sub(r"^-\w, ", "", each) for each in program.options(subcommand) - {HELP}}
    long_names = dict(re.findall(r"(?m)^  (-\w),(--[\w-]+)", help_text))
    in_full = {re.sub(r"^-\w\b", lambda short: str(long_names[short[0]]), each) for each in shown}
    assert {re.sub(r" [A-Z]+$", " VALUE", each) for each in in_full} == options

    usage = re.search(r"(?m)^Usage: \w+ \w+ \[OPTIONS\] ?(.*)$", help_text)
    assert usage is not None
    operands = re.sub(r"\[-[^]]*\](\.\.\.)? ?", "", form).partition(subcommand)[2].strip()
    assert operands == usage[1].upper()


@pytest.mark.parametrize("each", PAGES, ids=str)
def test_no_page_names_an_option_that_no_program_has(each: Page) -> None:
    helps = [program.help() for program in PROGRAMS]
    helps += [program.help(name) for program in PROGRAMS for name in program.subcommands()]
    of_pkg_config = {"--cflags", "--libs"}
    assert names(each.text) <= names("\n".join(helps)) | of_pkg_config


@every_program
def test_every_exit_status_of_the_document_is_there_and_no_other(program: Program) -> None:
    text = page(program.name + "(1)").sections["EXIT STATUS"]
    shown = re.findall(r"(?m)^\|[\[ ] \*(\d+)\*$", text)
    assert shown == program.statuses()
    assert len(shown) > 3


def test_every_command_of_raidsim_is_defined_and_no_other(tmp_path: Path) -> None:
    told = subprocess.run(
        [RAIDSIM, "--port", "0", EXAMPLES / "small-server.xml"],
        input="help\nquit\n",
        capture_output=True,
        text=True,
        check=True,
    )
    commands = {line.split()[0] for line in told.stdout.splitlines()[1:]}
    shown = {
        without_markup(term).split()[0] for term in terms(page("raidsim(1)").sections["COMMANDS"])
    }
    assert shown == commands


@pytest.mark.parametrize(
    ("name", "sections", "pattern"),
    [
        ("raid-scenario(5)", ["STATEMENTS"], "examples/**/*.scenario"),
        (
            "raid-fault(5)",
            ["CASES", "THE ANSWER", "THE CONNECTION", "EXPECTATIONS"],
            "faults/**/*.fault",
        ),
    ],
)
def test_what_the_shipped_files_begin_their_lines_with_is_defined(
    name: str, sections: list[str], pattern: str
) -> None:
    lines = [
        line
        for path in SOURCES.glob(pattern)
        for line in path.read_text(encoding="utf-8", errors="replace").splitlines()
    ]
    used = {line.split()[0] for line in lines if line.strip() and not line.startswith("#")}
    defined = {
        without_markup(term).split()[0]
        for section in sections
        for term in terms(page(name).sections[section])
    }
    if "PART" in defined:
        defined |= {"header", "body"}
    assert len(used) > 3
    assert used <= defined


def complaint(folder: Path, option: str, text: str) -> str:
    file = folder / "wrong.toml"
    file.write_text(text, encoding="utf-8")
    command: list[str | Path] = [RAIDINFO, "--from", recording(folder), "health", option, file]
    return subprocess.run(command, capture_output=True, text=True).stderr


def rule(**keys: str) -> str:
    usual = {
        "name": '"a"',
        "kind": '"fans"',
        "when": '{ field = "status", is = 0 }',
        "severity": '"warning"',
        "message": '"m"',
    }
    return "[[rule]]\n" + "".join(f"{key} = {value}\n" for key, value in (usual | keys).items())


@pytest.mark.parametrize(
    ("name", "section", "option", "wrong"),
    [
        ("raidinfo-policy(5)", "RULES", "--policy", rule(other="1")),
        ("raidinfo-policy(5)", "RULES", "--policy", rule(severity='"other"')),
        ("raidinfo-policy(5)", "CONDITIONS", "--policy", rule(when='{field="status", other=1}')),
        ("raidinfo-policy(5)", "KINDS AND FIELDS", "--policy", rule(kind='"other"')),
        ("raidinfo-codes(5)", "FORMAT", "--codes", "[other.other]\n"),
    ],
)
def test_every_word_that_a_policy_or_a_code_book_knows_is_there(
    name: str, section: str, option: str, wrong: str, tmp_path: Path
) -> None:
    known = known_words(complaint(tmp_path, option, wrong))
    text = page(name).sections[section]
    assert len(known) > 2
    assert {word for word in known if not re.search(rf"[*\"]{word}[*\"]", text)} == set()


def chief_columns(kind: str, recorded: Path) -> list[str]:
    """What the program adds to, of which JSON tells the keys, without the position."""
    command = [RAIDINFO, "--from", str(recorded), "--json", "list", kind, "-o", "+position"]
    listed = json.loads(subprocess.run(command, capture_output=True, check=True).stdout)
    return [key for key in listed["data"][kind][0] if key != "position"]


def test_every_kind_of_record_is_there_with_its_chief_columns(tmp_path: Path) -> None:
    refused = subprocess.run([RAIDINFO, "list", "other"], capture_output=True, text=True)
    kinds = re.findall(r"\w+", refused.stderr.rpartition("there are ")[2])
    recorded = recording(tmp_path, "mixed.xml")
    shown = {
        kind: re.findall(r"\w+", columns)
        for names_of_kinds, columns in re.findall(
            r"(?m)^(\*\w+\*(?:, \*\w+\*)*)\n((?:\t.+\n)+)",
            page("raidinfo-list(1)").sections["DESCRIPTION"],
        )
        for kind in re.findall(r"\w+", names_of_kinds)
    }
    assert list(shown) == kinds
    assert shown == {kind: chief_columns(kind, recorded) for kind in kinds}
    assert len(kinds) == 12


def test_the_default_policy_is_that_of_the_program() -> None:
    shipped = SOURCES / "tools/raidinfo/health/health.toml"
    policy = tomllib.loads(shipped.read_text(encoding="utf-8"))
    text = page("raidinfo-policy(5)").sections["DEFAULT POLICY"]
    for severity in ("critical", "warning", "unknown"):
        shown = re.search(rf"(?m)^\*{severity}\*\n((?:\t.*\n)+)", text)
        assert shown is not None
        rules = [each["name"] for each in policy["rule"] if each["severity"] == severity]
        assert re.findall(r"[\w-]+", shown[1]) == rules
    counts = {each["name"] for each in policy["count"]}
    assert set(re.findall(r"\*(\w+)\*", text.partition("Its counts are")[2])) == counts
