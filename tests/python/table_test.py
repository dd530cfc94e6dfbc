"""The records against the C header, and against the table of raidinfo."""

import ctypes
import dataclasses
import re
from collections.abc import Iterator

import pytest
from raidinstrumentation import library, shapes
from raidinstrumentation.inventory import KINDS
from raidinstrumentation.records import Event, Record
from raidinstrumentation.table import columns_of, count_of
from support import build

ALL_KINDS: dict[str, type[Record]] = {**KINDS, "events": Event}

C_TYPES = {ctypes.c_int: "int", ctypes.c_void_p: "char*", None: "void"}

# What raidinfo calls the shapes.
SHAPES: dict[type[shapes.Shape], str] = {
    shapes.Number: "number",
    shapes.Flag: "flag",
    shapes.Constant: "constant",
    shapes.Text: "text",
    shapes.Status: "statusText",
    shapes.DisplayName: "displayName",
    shapes.Numbers: "numbers",
}


def declared() -> dict[str, str]:
    """The functions of the C header as they are declared, without the names of parameters."""
    header = (build.SOURCES / "include" / "RAIDInstrumentation.h").read_text()
    functions = re.findall(r"^(int|void) (\w+)\((.*)\);$", header, re.MULTILINE)
    return {
        name: f"{result} ({re.sub(r' (destination|position|sequenceNumber)', '', parameters)})"
        for result, name, parameters in functions
    }


def as_declared(signature: shapes.Signature) -> str:
    parameters = ", ".join(C_TYPES[parameter] for parameter in signature.parameters)
    return f"{C_TYPES[signature.result]} ({parameters or 'void'})"


def accessors() -> Iterator[shapes.Signature]:
    for kind in ALL_KINDS.values():
        yield count_of(kind)
        for column in columns_of(kind):
            yield column.accessor


def test_every_accessor_of_the_header_is_read_with_its_signature() -> None:
    getters = {name: text for name, text in declared().items() if name.startswith("get")}
    del getters["getPellionIndex"]
    del getters["getEvent"]
    assert {accessor.name: as_declared(accessor) for accessor in accessors()} == getters


def test_the_other_flat_functions_have_the_signatures_of_the_header() -> None:
    flat = [call for call in library.CALLS if not call.name.startswith("_Z")]
    assert {call.name: as_declared(call) for call in flat}.items() <= declared().items()


@pytest.mark.parametrize("width", ["amd64", "i386"])
def test_what_is_used_besides_is_exported_in_both_widths(width: str) -> None:
    symbols = (build.SOURCES / "abi" / f"symbols-{width}.txt").read_text().splitlines()
    functions = {f"{call.name} T" for call in library.CALLS}
    assert functions <= set(symbols)


def raidinfos_table() -> dict[str, tuple[str, dict[str, tuple[str, str]]]]:
    """By the key of each list: the count function; function and shape of each field by its key."""
    code = (build.SOURCES / "tools" / "raidinfo" / "inventory" / "kinds.cpp").read_text()
    text = r'\s*"([^"]*)"'
    fields = {
        name: {
            key: (function, shape)
            for function, key, _, shape in re.findall(
                rf"\{{{text},{text},{text},\s*(\w+)(?:,\s*(?:summary|chief))?\}}", rows
            )
        }
        for name, rows in re.findall(r"constexpr auto (\w+Fields) = .*?\(\{(.*?)\}\);", code, re.S)
    }
    kinds = re.findall(
        rf"\{{KindId::\w+,{text},{text},{text},{text},{text},\s*(\w+Fields)(?:,\s*\w+)?\}}",
        code,
        re.S,
    )
    return {key: (count, fields[name]) for count, key, _, _, _, name in kinds}


def test_kinds_and_fields_are_called_and_read_as_in_raidinfo() -> None:
    assert raidinfos_table() == {
        key: (
            count_of(kind).name,
            {
                column.key: (column.accessor.name, SHAPES[type(column.shape)])
                for column in columns_of(kind)
            },
        )
        for key, kind in ALL_KINDS.items()
    }


def test_only_the_position_is_no_column() -> None:
    for kind in KINDS.values():
        keys = {column.key for column in columns_of(kind)}
        assert {field.name for field in dataclasses.fields(kind)} - keys == {"position"}
    assert len(columns_of(Event)) == len(dataclasses.fields(Event))
