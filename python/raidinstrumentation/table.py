"""The records' annotations as a table: the fields of each kind, and how each is read."""

import ctypes
import dataclasses
from typing import Annotated, NamedTuple, get_args, get_origin, get_type_hints

from .records import Record
from .shapes import Shape, Signature


class Column(NamedTuple):
    """A field of a kind that the library knows: its key, and how it is read with what."""

    key: str
    shape: Shape
    accessor: Signature


def columns_of(kind: type[Record]) -> tuple[Column, ...]:
    """The fields of a kind, in the order of the class."""
    hints = get_type_hints(kind, include_extras=True)
    columns = []
    for field in dataclasses.fields(kind):
        if get_origin(hints[field.name]) is Annotated:
            _, shape = get_args(hints[field.name])
            columns.append(Column(field.name, shape, shape.signature(kind.PREFIX)))
    return tuple(columns)


def count_of(kind: type[Record]) -> Signature:
    """The function that counts the records of a kind."""
    return Signature(f"{kind.PREFIX}Count", ctypes.c_int, ())
