"""Texts: the memory the library writes them to, and how they are decoded."""

import ctypes
import mmap
import os
import re
from types import TracebackType

# No text is longer than the answer it came in, and the length of an answer has at most nine digits.
CAPACITY = 1_000_000_000

_PREDEFINED = {"amp": "&", "lt": "<", "gt": ">", "quot": '"', "apos": "'"}
# A reference that is decoded has at most 16 characters.
_REFERENCE = re.compile(
    r"&(?:(?P<name>amp|lt|gt|quot|apos)|#(?P<decimal>[0-9]{1,13})|#x(?P<hex>[0-9A-Fa-f]{1,12}));"
)


def decoded(sent: bytes) -> str:
    """A text of the service as people get it.

    The five predefined entity references and numeric character references are decoded once, other
    references stay as they are; every byte sequence that is not UTF-8 becomes U+FFFD.
    """
    return _REFERENCE.sub(_referenced, sent.decode("utf-8", errors="replace"))


def _referenced(reference: re.Match[str]) -> str:
    if name := reference["name"]:
        return _PREDEFINED[name]
    number = int(reference["decimal"]) if reference["decimal"] else int(reference["hex"], 16)
    is_surrogate = 0xD800 <= number <= 0xDFFF
    if number == 0 or number > 0x10FFFF or is_surrogate:
        return reference[0]
    return chr(number)


class TextBuffer:
    """Where the library's text functions, which know no buffer size, have room for any text.

    A shared mapping of a sparse file in memory: only the pages written to cost memory, and unlike
    private memory it is not charged in advance, whatever the machine's overcommit policy. Making
    one takes microseconds, so it lives no longer than what is read through it.
    """

    def __init__(self) -> None:
        file = os.memfd_create("raidinstrumentation-text")
        try:
            os.ftruncate(file, CAPACITY)
            self._map = mmap.mmap(file, CAPACITY)
        finally:
            os.close(file)
        self._first = ctypes.c_char.from_buffer(self._map)
        self.address = ctypes.addressof(self._first)

    def __enter__(self) -> "TextBuffer":
        return self

    def __exit__(
        self,
        kind: type[BaseException] | None,
        error: BaseException | None,
        traceback: TracebackType | None,
    ) -> None:
        # The mapping stays as long as something points into it.
        del self._first
        self._map.close()

    def empty(self) -> None:
        """Forgets the text: some functions write nothing."""
        self._first.value = b"\0"

    def text(self) -> bytes:
        """What the library wrote, up to its terminating zero byte."""
        return ctypes.string_at(self.address)
