"""The small changes that scripts/mutate makes to the reader and the snapshot, one at a time."""

import dataclasses
import pathlib
import re

ROOT = pathlib.Path(__file__).resolve().parent.parent

MUTATED = [
    "src/agent/envelope.cpp",
    "src/agent/first_chunk.cpp",
    "src/base/decimal.cpp",
    "src/base/decimal.h",
    "src/flat/snapshot.cpp",
    "src/model/arrays_vocabulary.h",
    "src/model/channels_and_drives_vocabulary.h",
    "src/model/enclosures_vocabulary.h",
    "src/model/logical_drives_vocabulary.h",
    "src/model/numbering.cpp",
    "src/model/raid_events_vocabulary.h",
    "src/model/system_and_adapter_vocabulary.h",
    "src/xml/bytes.h",
    "src/xml/element_reader.h",
    "src/xml/parse_def_unit.cpp",
    "src/xml/raid_xml_error.cpp",
    "src/xml/reading_errors.cpp",
    "src/xml/scan.h",
    "src/xml/space.h",
    "src/xml/tag_index.h",
    "src/xml/tag_memory.cpp",
    "src/xml/tag_memory.h",
    "src/xml/unit.h",
    "src/xml/unit_reader.cpp",
    "src/xml/unit_reader.h",
    "src/xml/usual_tags.h",
    "src/xml/vocabulary.h",
]

# A comparison has spaces around it, which tells it from the brackets of a template.
REPLACEMENTS = [
    (r" == ", [" != "]),
    (r" != ", [" == "]),
    (r" < ", [" <= "]),
    (r" > ", [" >= "]),
    (r" <= ", [" < "]),
    (r" >= ", [" > "]),
    (r" && ", [" || "]),
    (r" \|\| ", [" && "]),
    (r" \+ ", [" - "]),
    (r" - ", [" + "]),
    (r" \+= ", [" -= "]),
    (r" -= ", [" += "]),
    (r"\+\+(?=[a-z])", ["--"]),
    (r"--(?=[a-z])", ["++"]),
    (r"(?<=[a-z])\+\+", ["--"]),
    (r"(?<=[( !])!(?=[a-z*(])", [""]),
    # What has no comparison or "!" that can be changed instead.
    (r"\b(if|while) \((?!.* [=!<>]=? )(?!!)(?!.* = )(?=.*\) \{$)", [r"\1 (!"]),
    (r"\btrue\b", ["false"]),
    (r"\bfalse\b", ["true"]),
    (r"(?<![\w\"'.:])\d+(?![\w'.])", ["NEXT"]),
    (r"\breturn (?!0;|false;|nullptr;|std::nullopt;|\{)(.+);", ["return {};"]),
]
STRING = re.compile(r'"(?:[^"\\]|\\.)*"')
# A call or an assignment that stands alone.
STATEMENT = re.compile(r"^\s+(?!return|const |auto |constexpr |using |static |friend |throw |\}|break)"
                       r"[\w.*>:\-\[\]]+[^{}]*;(?:  //.*)?$")


@dataclasses.dataclass(frozen=True)
class Mutant:
    path: str
    line: int  # from 0
    changed: str
    original: str

    @property
    def key(self):
        return f"{self.path}: {self.original.strip()} => {self.changed.strip() or '(nothing)'}"


def code_of(line):
    """The line without its comment."""
    return re.sub(r"\s*//.*$", "", line)


def mutants_of_line(path, number, line):
    code = code_of(line)
    if not code.strip() or code.lstrip().startswith(("#", "static_assert", "[[noreturn]]")):
        return
    if code.endswith(("= delete;", "= default;")):
        return
    seen = {line}

    def mutant(changed):
        if changed not in seen:
            seen.add(changed)
            yield Mutant(path, number, changed, line)

    strings = [match.span() for match in STRING.finditer(code)]
    for start, end in strings:
        yield from mutant(line[: end - 1] + "~" + line[end - 1 :])
    for pattern, replacements in REPLACEMENTS:
        for match in re.finditer(pattern, code):
            if any(start <= match.start() < end for start, end in strings):
                continue
            for replacement in replacements:
                new = (str(int(match.group()) + 1) if replacement == "NEXT"
                       else match.expand(replacement))
                closing = ")" if new.endswith(" (!") else ""
                rest = line[match.end() :]
                if closing:
                    new += "("
                    rest = re.sub(r"\) \{$", ")) {", rest)
                yield from mutant(line[: match.start()] + new + rest)
    if STATEMENT.match(code) and code.count("(") == code.count(")"):
        yield from mutant("")


def all_mutants():
    for path in MUTATED:
        for number, line in enumerate((ROOT / path).read_text().splitlines()):
            yield from mutants_of_line(path, number, line)
