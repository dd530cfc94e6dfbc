"""The event stream."""

import threading
from collections import deque
from collections.abc import Iterator

from .calls import Call, CallCancelled
from .errors import EventLogRestarted, MalformedAnswer, ServiceUnavailable
from .library import Library
from .records import Event
from .text import TextBuffer

LARGEST_NUMBER = 2**31 - 1
# So many numbers the library asks for at once.
_BATCH = 101
_PAUSE_AFTER_NOTHING = 0.2
# A service that answers, but whose events could not be read so often in a row, sends malformed ones.
_MALFORMED_READS = 2


class EventStream(Iterator[Event]):
    """The events as they happen, each once, in the order in which the service sends them.

    Waits for the next one without limit; Ctrl-C and cancel end the wait at once. ServiceUnavailable
    and MalformedAnswer do not end the stream: the next call of next() goes on where it stood, so
    that nothing is lost or comes twice when the service restarts.

    One thread at a time can wait for events, whatever the number of streams; another one gets a
    RuntimeError.
    """

    def __init__(self, library: Library, first: int) -> None:
        """Made by RAIDInstrumentation.events; first is the number of the first event."""
        self._library = library
        self._next = first
        self._fetched: deque[Event] = deque()
        self._is_cancelled = False
        self._call: Call[None] | None = None

    def __next__(self) -> Event:
        while not self._is_cancelled:
            try:
                return self._fetched.popleft()
            except IndexError:
                pass
            self._call = Call(self._fetch, self._library.cancel)
            if not self._is_cancelled:
                try:
                    self._call.result()
                except CallCancelled:
                    break
        raise StopIteration

    def cancel(self) -> None:
        """Ends the stream, also while another thread waits for it; its iteration just ends.

        Any thread may call it, and any signal handler.
        """
        self._is_cancelled = True
        if self._call is not None:
            self._call.cancel()

    # What follows runs on the call's thread, where no signal handler can break it off.

    def _fetch(self, stopping: threading.Event) -> None:
        with self._library.event_turn():
            failed_reads = 0
            while not stopping.is_set():
                newest = self._library.newest_event(stopping)
                if newest is None:
                    raise ServiceUnavailable
                # A service that counts anew would be waited for in vain.
                check_newest(newest, self._next - 1)
                if failed_reads == _MALFORMED_READS:
                    raise MalformedAnswer
                cancels = self._library.cancels
                came = self._library.ask_for_events(min(self._next, LARGEST_NUMBER))
                batch = self._read_batch()
                if self._keep_unseen(batch):
                    return
                # That nothing came tells nothing after a cancel, be it that of another call.
                if self._library.cancels != cancels:
                    continue
                if came and not batch and newest >= self._next + _BATCH:
                    # The service no longer keeps the events with these numbers.
                    self._next += _BATCH
                    continue
                failed_reads = 0 if came else failed_reads + 1
                stopping.wait(_PAUSE_AFTER_NOTHING)

    def _read_batch(self) -> tuple[Event, ...]:
        with TextBuffer() as buffer:
            return tuple(Event(**fields) for fields in self._library.read(Event, buffer))

    def _keep_unseen(self, batch: tuple[Event, ...]) -> bool:
        """Keeps the events of a batch that are new; tells whether there were any."""
        unseen: dict[int, Event] = {}
        for event in batch:
            if event.sequence_number >= self._next:
                unseen.setdefault(event.sequence_number, event)
        if unseen:
            self._next = max(unseen) + 1
            self._fetched.extend(unseen.values())
        return bool(unseen)


def check_newest(newest: int, seen: int) -> None:
    """Raises if the service counts its events anew."""
    if newest < seen:
        raise EventLogRestarted(newest, seen)
