"""What the library prints."""

import contextlib
import ctypes
import functools
import threading
from collections.abc import Iterator


@contextlib.contextmanager
def discarded_c_output() -> Iterator[None]:
    """Discards what C code of this process prints, such as the library's line for each exchange.

    It exchanges the C library's stream "stdout" for one that leads nowhere. Descriptor 1 stays what
    it is, so print() and sys.stdout work as ever, also in other threads and while events are waited
    for; but what other C code prints through that stream meanwhile is lost, too. That is for the
    program to decide, so nothing here does it unasked. It may be nested.
    """
    _replacement.enter()
    try:
        yield
    finally:
        _replacement.leave()


class _Replacement:
    """The stream that stands in for "stdout" as long as anybody wants it."""

    def __init__(self) -> None:
        self._lock = threading.Lock()
        self._wanted = 0
        self._replaced: int | None = None

    def enter(self) -> None:
        stream = _nowhere()
        with self._lock:
            if self._wanted == 0:
                self._replaced = _stdout().value
                _stdout().value = stream
            self._wanted += 1

    def leave(self) -> None:
        with self._lock:
            self._wanted -= 1
            if self._wanted == 0:
                _stdout().value = self._replaced


_replacement = _Replacement()


def _stdout() -> ctypes.c_void_p:
    return ctypes.c_void_p.in_dll(ctypes.CDLL(None), "stdout")


@functools.cache
def _nowhere() -> int:
    """Is never closed: some thread may still be about to print to it."""
    open_stream = ctypes.CDLL(None, use_errno=True).fopen
    open_stream.argtypes = (ctypes.c_char_p, ctypes.c_char_p)
    open_stream.restype = ctypes.c_void_p
    stream: int | None = open_stream(b"/dev/null", b"we")
    if stream is None:
        raise OSError(ctypes.get_errno(), "cannot open /dev/null")
    return stream
