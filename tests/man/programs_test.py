"""The pages say of the programs what the programs say of themselves."""

import re
import subprocess
import tomllib
from pathlib import Path

import pytest
from page import PAGES, SOURCES, Page, page, terms, without_markup
from programs import EXAMPLES, PROGRAMS, RAIDINFO, RAIDSIM, Program, known_words, recording

HELP = "-h, --help"

every_program = pytest.mark.parametrize("program", PROGRAMS, ids=str)


def defined_options(text: str) -> set[str]:
    """The options that a text defines, with VALUE for the name of what they take."""
    shown = (without_markup(term) for term in terms(text) if term.startswith("*-"))
    return {re.sub(r" [A-Z]+$", " VALUE", term) for term in shown}


def names(text: str) -> set[str]:
    return set(re.findall(r"(?<![\w-])--[a-z][a-z-]*", text))


@every_program
def test_every_option_is_defined_and_no_other(program: Program) -> None:
    assert defined_options(page(program.name + "(1)").sections["OPTIONS"]) == program.options()


def test_every_subcommand_of_raidinfo_is_defined_and_no_other() -> None:
    shown = re.findall(r"(?m)^## (\w+)$", page("raidinfo(1)").sections["SUBCOMMANDS"])
    assert shown == PROGRAMS[0].subcommands()


@pytest.mark.parametrize("subcommand", PROGRAMS[0].subcommands())
def test_every_option_of_a_subcommand_is_defined_and_no_other(subcommand: str) -> None:
    text = page("raidinfo(1)").subsection("SUBCOMMANDS", subcommand)
    assert defined_options(text) == PROGRAMS[0].options(subcommand) - {HELP}


def test_every_option_of_generate_is_defined_and_no_other() -> None:
    assert PROGRAMS[1].subcommands() == ["generate"]
    text = page("raidsim(1)").sections["GENERATING DOCUMENTS"]
    assert defined_options(text) == PROGRAMS[1].options("generate") - {HELP}


def form_of(program: Program, subcommand: str) -> str:
    found = [
        form
        for form in page(program.name + "(1)").forms()
        if re.match(rf"{program.name} (\[OPTION\]... )?{subcommand}\b", form)
    ]
    assert len(found) == 1
    return found[0]


@pytest.mark.parametrize(
    ("program", "subcommand"),
    [(program, name) for program in PROGRAMS for name in program.subcommands()],
    ids=str,
)
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


def test_every_kind_of_record_is_there() -> None:
    refused = subprocess.run([RAIDINFO, "list", "other"], capture_output=True, text=True)
    kinds = re.findall(r"\w+_\w+|\w+", refused.stderr.rpartition("there are ")[2])
    text = page("raidinfo(1)").subsection("SUBCOMMANDS", "list")
    assert len(kinds) == 12
    assert [kind for kind in kinds if f"*{kind}*" not in text] == []


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
