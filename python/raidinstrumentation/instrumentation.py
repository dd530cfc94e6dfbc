"""The entrance to the package."""

import operator
import os
import threading
import weakref
from types import TracebackType
from typing import Self, TypeVar

from .calls import Call
from .configuration import read_inventory
from .errors import ServiceUnavailable
from .events import EventStream
from .follower import LARGEST_NUMBER
from .inventory import Inventory
from .library import load

Result = TypeVar("Result")

# As long as raidinfo waits.
PATIENCE = 60.0


class RAIDInstrumentation:
    """The RAID configuration and events of this machine.

        with RAIDInstrumentation() as raid:
            for drive in raid.inventory().disk_drives:
                print(drive.serial_number, drive.overall_status)

    Threads: all methods may be called from any thread. Inventory calls wait for each other; one
    stream of events can be waited for beside them. What is returned never changes and may be
    shared. This holds for all objects of this class together, since the library's state is the
    process's; it does not hold for other code of the process that calls the library by itself.

    Signals: the library is called on threads of its own, so that Ctrl-C works while the service is
    waited for. They get none of the host's signals but SIGURG, which wakes them and is given a
    handler that does nothing, unless it has a handler already. A child process makes its own
    objects, and is not forked while the inventory is asked for.

    Output: the library prints one line for each exchange with the service on standard output; see
    discarded_c_output. Memory that runs out inside the library ends the process.
    """

    def __init__(self, library: str | os.PathLike[str] | None = None) -> None:
        """Loads the library: this file, else the one that the environment variable
        RAIDINSTRUMENTATION_LIBRARY names, else libRAIDInstrumentation.so.1 as the loader finds it.

        Asks the service nothing. Raises LibraryNotFound, or LibraryUnusable.
        """
        self._library = load(library)
        self._inventory: Inventory | None = None
        self._streams: weakref.WeakSet[EventStream] = weakref.WeakSet()
        self._is_closed = False
        # Of these two. A signal handler may close what its thread is just about to add to.
        self._lock = threading.RLock()

    def __enter__(self) -> Self:
        return self

    def __exit__(
        self,
        kind: type[BaseException] | None,
        error: BaseException | None,
        traceback: TracebackType | None,
    ) -> None:
        self.close()

    def close(self) -> None:
        """Cancels the event streams. Afterwards nothing can be asked any more."""
        with self._lock:
            self._is_closed = True
            streams = tuple(self._streams)
        for stream in streams:
            stream.cancel()

    def inventory(self, *, timeout: float | None = PATIENCE) -> Inventory:
        """The inventory that was read last; reads it if there is none yet, as refresh does."""
        _check(timeout)
        self._check_open()
        return self._inventory or self.refresh(timeout=timeout)

    def refresh(self, *, timeout: float | None = PATIENCE) -> Inventory:
        """Asks the service for the inventory, which inventory() then returns, too.

        Raises ServiceUnavailable, also after so many seconds without an answer (None waits without
        limit), or MalformedAnswer; inventory() then returns what it did before. A timeout that is
        no time, such as 0, is a ValueError.
        """
        _check(timeout)
        library = self._library
        call = Call(lambda stopping: read_inventory(library, stopping), library.cancel)
        self._inventory = self._result(call, timeout)
        return self._inventory

    def events(self, after: int | None = None, *, timeout: float | None = PATIENCE) -> EventStream:
        """The events that come after the one with this number, or from the newest one on.

        0 is before the first event that the service keeps. To resume later, store the
        sequence_number of the last event that was dealt with.

        Asks the service for its newest event, so that none is missed between this call and the
        first next(). Raises ServiceUnavailable as refresh does. If that has a lower number, looks
        whether the service still has the event with this number, and raises EventLogRestarted if
        not. The timeout is that of this call, not of the stream.
        """
        _check(timeout)
        if after is not None and not 0 <= operator.index(after) <= LARGEST_NUMBER:
            raise ValueError(f"event numbers range from 0 to {LARGEST_NUMBER}, unlike {after}")
        library = self._library
        newest = self._result(Call(library.newest_event, library.cancel), timeout)
        if newest is None:
            raise ServiceUnavailable
        if after is None:
            stream = EventStream(library, newest, newest or None)
        elif after == 0:
            stream = EventStream(library, 0)
        else:
            stream = EventStream(library, after + 1, after)
            if newest < after:
                self._result(stream.confirmation(), timeout)
        with self._lock:
            self._streams.add(stream)
            is_closed = self._is_closed
        if is_closed:
            stream.cancel()
        return stream

    def _check_open(self) -> None:
        if self._is_closed:
            raise RuntimeError("the RAIDInstrumentation is closed")

    def _result(self, call: Call[Result], timeout: float | None) -> Result:
        self._check_open()
        try:
            return call.result(timeout)
        except TimeoutError:
            raise ServiceUnavailable(f"gave no answer within {timeout:g} seconds") from None


def _check(timeout: float | None) -> None:
    # NaN is not above 0, either.
    if timeout is not None and not timeout > 0:
        raise ValueError(f"a timeout is a number of seconds above 0, or None, unlike {timeout}")
