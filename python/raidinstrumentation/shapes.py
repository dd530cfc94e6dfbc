"""The shapes of the library's accessors, which the records' fields are annotated with."""

import ctypes
from abc import ABC, abstractmethod
from collections.abc import Callable
from dataclasses import dataclass
from enum import StrEnum
from typing import Any, ClassVar, NamedTuple

from .text import TextBuffer, decoded

CType = type[ctypes.c_int] | type[ctypes.c_void_p] | type[ctypes.c_char_p]


class OverallStatus(StrEnum):
    """The health of an adapter, a drive, an enclosure or a logical drive."""

    NORMAL = "Normal"
    WARNING = "Warning"
    CRITICAL = "Critical"

    @property
    def severity(self) -> int:
        """The service's own number, which rises as things get worse."""
        return list(OverallStatus).index(self)


class Signature(NamedTuple):
    """A function of the library as C declares it."""

    name: str
    result: CType | None
    parameters: tuple[CType, ...]


ReadValue = Callable[[int], object]


@dataclass(frozen=True)
class Shape(ABC):
    """What an accessor returns or writes; field is the end of the accessor's name."""

    RESULT: ClassVar[CType | None] = ctypes.c_int
    PARAMETERS: ClassVar[tuple[CType, ...]] = (ctypes.c_int,)

    field: str

    def signature(self, prefix: str) -> Signature:
        """The accessor; the prefix is that of the record's kind."""
        return Signature(prefix + self.field, self.RESULT, self.PARAMETERS)

    @abstractmethod
    def reader(self, accessor: Callable[..., Any], buffer: TextBuffer) -> ReadValue:
        """What returns the value of the record at a position."""


class Number(Shape):
    """A number as the service sent it."""

    def reader(self, accessor: Callable[..., Any], buffer: TextBuffer) -> ReadValue:
        return accessor


class Flag(Shape):
    """1 if the service sent exactly "true"."""

    def reader(self, accessor: Callable[..., Any], buffer: TextBuffer) -> ReadValue:
        return lambda position: accessor(position) != 0


class Constant(Shape):
    """A number that is the same for all records."""

    PARAMETERS = ()

    def reader(self, accessor: Callable[..., Any], buffer: TextBuffer) -> ReadValue:
        return lambda position: accessor()


class Written(Shape):
    """What an accessor writes to a buffer of the caller."""

    RESULT: ClassVar[CType | None] = None
    PARAMETERS = (ctypes.c_void_p, ctypes.c_int)

    def reader(self, accessor: Callable[..., Any], buffer: TextBuffer) -> ReadValue:
        def read(position: int) -> object:
            buffer.empty()
            accessor(buffer.address, position)
            return self.value(buffer.text())

        return read

    @abstractmethod
    def value(self, written: bytes) -> object:
        """What the bytes stand for."""


class Text(Written):
    """A text of the service, decoded."""

    def value(self, written: bytes) -> str:
        return decoded(written)


class DisplayName(Text):
    """A name that the library makes of a number; its length is returned, too."""

    RESULT = ctypes.c_int


class Status(Written):
    """The word for an overall status; for a status without one nothing is written."""

    def value(self, written: bytes) -> OverallStatus | None:
        word = decoded(written)
        return next((status for status in OverallStatus if status == word), None)


class Numbers(Written):
    """Decimal numbers, separated by commas."""

    def value(self, written: bytes) -> tuple[int, ...]:
        return tuple(int(number) for number in written.split(b",") if number)
