"""The event stream."""

import contextlib
import logging
import threading
from collections import deque
from collections.abc import Callable, Iterator

from .calls import Call, CallCancelled
from .continuity import Continuity
from .follower import Follower
from .library import Library
from .records import Event

_LOG = logging.getLogger("raidinstrumentation")


class EventStream(Iterator[Event]):
    """The events as they happen, each once, as the service sends them and each batch by its numbers.

    Waits for the next one without limit; Ctrl-C and cancel end the wait at once. ServiceUnavailable
    and MalformedAnswer do not end the stream: the next call of next() goes on where it stood, so
    that nothing is lost or comes twice when the service restarts. Nor does EventLogRestarted; what
    comes after it is everything that the service has, but for what came before just so.

    Numbers that the service passes over are in missing, and the logger "raidinstrumentation" warns
    of them before the event behind them comes. Events that come late are not held back.

    One thread at a time can wait for events, whatever the number of streams; another one gets a
    RuntimeError.
    """

    def __init__(self, library: Library, first: int, known: int | None = None) -> None:
        """Made by RAIDInstrumentation.events.

        It begins at the first number, or at whatever comes first where that is 0. Of an event with
        the known number it is known that it was there.
        """
        self._library = library
        self._continuity = Continuity(first, known)
        self._follower = Follower(library, self._continuity)
        self._fetched: deque[Event | range] = deque()
        self._is_cancelled = False
        # More than one only as long as a second thread is refused.
        self._calls: set[Call[None]] = set()

    def __next__(self) -> Event:
        while not self._is_cancelled:
            try:
                fetched = self._fetched.popleft()
            except IndexError:
                self._fetch()
                continue
            if isinstance(fetched, Event):
                return fetched
            _LOG.warning(_told(fetched))
        raise StopIteration

    @property
    def missing(self) -> tuple[range, ...]:
        """The numbers that the service has passed over and not sent since, by what was read so far.

        Of very many gaps the oldest are forgotten.
        """
        return self._continuity.missing

    def cancel(self) -> None:
        """Ends the stream, also while another thread waits for it; its iteration just ends.

        Any thread may call it, and any signal handler.
        """
        self._is_cancelled = True
        for call in tuple(self._calls):
            call.cancel()

    def confirmation(self) -> Call[None]:
        """A call that raises EventLogRestarted if the service counts anew."""
        return self._call_for(self._follower.confirm)

    def _fetch(self) -> None:
        call = self._call_for(self._follower.news)
        self._calls.add(call)
        try:
            if not self._is_cancelled:
                with contextlib.suppress(CallCancelled):
                    call.result()
        finally:
            self._calls.discard(call)

    def _call_for(self, look: Callable[[threading.Event], list[Event | range]]) -> Call[None]:
        # On the call's thread no signal handler can break it off between reading and keeping.
        def fetch(stopping: threading.Event) -> None:
            with self._library.event_turn():
                self._fetched.extend(look(stopping))

        return Call(fetch, self._library.cancel)


def _told(missing: range) -> str:
    first, last = missing[0], missing[-1]
    return f"event {first} is missing" if first == last else f"events {first} to {last} are missing"
