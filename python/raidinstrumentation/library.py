"""The loaded library: where it is found, what is used of it, and whose turn it is to call it."""

import contextlib
import ctypes
import itertools
import os
import threading
from collections.abc import Callable, Iterator
from typing import Any

from .calls import CallCancelled, prepare_wake_up
from .errors import LibraryNotFound, LibraryUnusable
from .inventory import KINDS
from .ranges import numbers_in, request_for
from .records import Event, Record
from .shapes import Signature
from .table import columns_of, count_of
from .text import TextBuffer

VARIABLE = "RAIDINSTRUMENTATION_LIBRARY"
INSTALLED_NAME = "libRAIDInstrumentation.so.1"

INIT = Signature("RAIDinit", ctypes.c_int, ())
SET_REFRESH_FLAG = Signature("setRefreshFlag", None, ())
SET_EVENT_NUMBER = Signature("setRAIDEventSequenceNumber", None, (ctypes.c_int,))
GET_EVENT = Signature("getEvent", ctypes.c_int, ())
CANCEL = Signature("cancelGetEvent", None, ())

# The flat functions alone cannot tell an answer that never came from one that changed nothing, nor
# ask for the newest event without moving the number that another thread's getEvent counts on, nor
# for more than a hundred numbers at once. These can; they are C++ functions with plain types,
# declared in the installed headers agent/envelope.h, agent/agent_link.h and agent/exchange.h.
PROCESS_CONFIGURATION = Signature(
    "_Z10processXMLPci", ctypes.c_int, (ctypes.c_void_p, ctypes.c_int)
)
PROCESS_EVENTS = Signature("_Z15processEventXMLPci", ctypes.c_int, (ctypes.c_void_p, ctypes.c_int))
NEWEST_EVENT = Signature("_Z21getNewestEventRAIDXMLv", ctypes.c_int, ())
EXCHANGE = Signature("_Z11getSOAPDataPKc", ctypes.c_void_p, (ctypes.c_char_p,))

CALLS = (
    INIT,
    SET_REFRESH_FLAG,
    SET_EVENT_NUMBER,
    GET_EVENT,
    CANCEL,
    PROCESS_CONFIGURATION,
    PROCESS_EVENTS,
    NEWEST_EVENT,
    EXCHANGE,
)

_NO_ANSWER = -1
_LOOK_UP_INTERVAL = 0.02


class Library:
    """A library that is loaded, and everything that is used of it.

    Its lists and numbers are those of the whole process, so there is one object for each library
    that is loaded, and whoever asks the service takes a turn: one of the inventory, one of the
    events. Both may be under way at once, as the library permits.
    """

    def __init__(self, loaded: ctypes.CDLL) -> None:
        self._loaded = loaded
        self._functions = {call.name: self._bound(call) for call in CALLS}
        kinds: tuple[type[Record], ...] = (*KINDS.values(), Event)
        self._columns = {kind: columns_of(kind) for kind in kinds}
        for kind, columns in self._columns.items():
            for function in (count_of(kind), *(column.accessor for column in columns)):
                self._functions[function.name] = self._bound(function)
        self._configuration = self._pointer("raidSystem")
        self._events = self._pointer("raidEvents")
        self._c_library = ctypes.CDLL(None)
        self._c_library.calloc.argtypes = (ctypes.c_size_t, ctypes.c_size_t)
        self._c_library.calloc.restype = ctypes.c_void_p
        self._c_library.free.argtypes = (ctypes.c_void_p,)
        self._c_library.free.restype = None
        self._inventory_lock = threading.Lock()
        self._event_lock = threading.Lock()
        self._initialised = False
        self._cancel_numbers = itertools.count(1)
        self.cancels = 0
        """Changes with every cancel, which may have ended any exchange that was under way."""

    def _bound(self, signature: Signature) -> Any:
        try:
            function = getattr(self._loaded, signature.name)
        except AttributeError as error:
            raise LibraryUnusable(f"the library is unfit: {error}") from None
        function.argtypes = signature.parameters
        function.restype = signature.result
        return function

    def _pointer(self, name: str) -> ctypes.c_void_p:
        try:
            return ctypes.c_void_p.in_dll(self._loaded, name)
        except ValueError as error:
            raise LibraryUnusable(f"the library is unfit: {error}") from None

    def _call(self, signature: Signature, *arguments: object) -> Any:
        return self._functions[signature.name](*arguments)

    @contextlib.contextmanager
    def inventory_turn(self, stopping: threading.Event) -> Iterator[None]:
        """The right to ask for the configuration and to read it; others wait for it."""
        while not self._inventory_lock.acquire(timeout=_LOOK_UP_INTERVAL):
            if stopping.is_set():
                raise CallCancelled
        try:
            yield
        finally:
            self._inventory_lock.release()

    @contextlib.contextmanager
    def event_turn(self) -> Iterator[None]:
        """The right to wait for events and to read them, which may take long: nobody else waits."""
        if not self._event_lock.acquire(blocking=False):
            raise RuntimeError("another thread is waiting for events")
        try:
            yield
        finally:
            self._event_lock.release()

    def ask_for_configuration(self) -> bool:
        """Asks the service; tells whether there was an answer that could be read.

        If not, the lists stay as they are.
        """
        self._forget(PROCESS_CONFIGURATION)
        if self._initialised:
            self._call(SET_REFRESH_FLAG)
            self._call(count_of(KINDS["disk_drives"]))
        else:
            self._initialised = True
            self._call(INIT)
        return self._configuration.value is not None

    def ask_for_events(self, first: int) -> bool:
        """Waits for events from this number on; tells whether they came and could be read."""
        self._forget(PROCESS_EVENTS)
        self._call(SET_EVENT_NUMBER, first)
        self._call(GET_EVENT)
        return self._events.value is not None

    def numbers_between(self, first: int, last: int) -> list[int] | None:
        """The numbers of the events in a range, without waiting for any; None if that is unknown."""
        answer = self._call(EXCHANGE, request_for(first, last))
        if answer is None:
            return None
        try:
            sent = numbers_in(ctypes.string_at(answer))
        finally:
            self._c_library.free(answer)
        return None if sent is None else [number for number in sent if first <= number <= last]

    def newest_event(self, stopping: threading.Event) -> int | None:
        """The number of the service's newest event, 0 before the first; None without an answer.

        This is how to learn whether the service answers at all.
        """
        while True:
            cancels = self.cancels
            number: int = self._call(NEWEST_EVENT)
            if number != _NO_ANSWER:
                return number
            # The cancel of another call may have ended this exchange.
            if stopping.is_set() or self.cancels == cancels:
                return None

    def cancel(self) -> None:
        """Ends the exchanges under way, unless they clear it first: repeat it until they ended."""
        self.cancels = next(self._cancel_numbers)
        self._call(CANCEL)

    def read(self, kind: type[Record], buffer: TextBuffer) -> Iterator[dict[str, Any]]:
        """The fields of each record of a kind as the lists have them, by position."""
        readers = {
            column.key: column.shape.reader(self._functions[column.accessor.name], buffer)
            for column in self._columns[kind]
        }
        for position in range(self._call(count_of(kind))):
            yield {key: value_at(position) for key, value_at in readers.items()}

    def _forget(self, process: Signature) -> None:
        """Has the library read an empty answer, which leaves none, and its lists as they are."""
        empty = self._c_library.calloc(1, 1)
        if not empty:
            raise MemoryError
        self._call(process, empty, 0)


_libraries: dict[int, Library] = {}
# In a child process nobody gives back the turns that threads of its parent had.
os.register_at_fork(after_in_child=_libraries.clear)


def load(path: str | os.PathLike[str] | None) -> Library:
    """The library at a path, the one that the environment names, or the installed one.

    It stays loaded until the process ends.
    """
    chosen = path if path is not None else os.environ.get(VARIABLE) or None
    # A name without a slash would be searched for in the system's folders.
    file = INSTALLED_NAME if chosen is None else os.path.abspath(chosen)
    try:
        loaded = ctypes.CDLL(file)
    except OSError as error:
        problem = f"cannot load the library: {error}"
        if str(error).startswith(f"{file}: cannot open shared object file: No such file"):
            raise LibraryNotFound(problem) from None
        raise LibraryUnusable(problem) from None
    prepare_wake_up()
    return _libraries.setdefault(loaded._handle, Library(loaded))
