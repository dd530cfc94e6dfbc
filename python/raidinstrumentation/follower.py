"""What the service is asked so that no event is lost, and how its answers are judged."""

import threading
from collections.abc import Sequence
from typing import NoReturn

from .continuity import NUMBERS_ASKED, Continuity, History
from .errors import EventLogRestarted, MalformedAnswer, ServiceUnavailable
from .library import Library
from .records import Event
from .text import TextBuffer

LARGEST_NUMBER = 2**31 - 1
# Pauses grow from the shortest one while nothing new comes, doubling so often.
_SHORTEST_PAUSE = 0.1
_DOUBLINGS = 6
# A service that answers, but whose events could not be read so often in a row, sends malformed ones.
_MALFORMED_READS = 2


class Follower:
    """Follows the events of the service. Whoever calls it has the library's turn of the events."""

    def __init__(self, library: Library, continuity: Continuity) -> None:
        self._library = library
        self._continuity = continuity
        # For events that are missing or, after an outage, for one that was seen.
        self._looks_back = False
        self._failed_reads = 0
        self._pauses = 0

    def news(self, stopping: threading.Event) -> list[Event | range]:
        """Waits for new events; the numbers that an event passes over come in front of it."""
        while not stopping.is_set():
            news = self._look(stopping)
            if news:
                return news
        return []

    def confirm(self, stopping: threading.Event) -> list[Event | range]:
        """What is new at one look. Raises EventLogRestarted if the service counts anew."""
        while not stopping.is_set():
            news = self._look(stopping)
            if news is not None:
                return news
        return []

    def _look(self, stopping: threading.Event) -> list[Event | range] | None:
        """One question to the service and what it brings; None without an answer."""
        newest = self._newest(stopping)
        if newest == 0 and self._continuity.last is not None:
            self._doubt_emptiness(stopping)
            return None
        first = self._first_asked(newest)
        batch = self._read(first, stopping)
        if batch is None:
            return None
        self._judge(batch, newest)
        news = self._continuity.accept(batch)
        looked_back = self._looks_back
        self._looks_back = bool(news) and self._continuity.waits_for_late_events()
        if news:
            self._pauses = 0
        elif newest >= first + NUMBERS_ASKED:
            # The service no longer keeps the events with these numbers.
            self._continuity.pass_over_to(first + NUMBERS_ASKED)
        elif not looked_back:
            self._pause(stopping)
        return news

    def _doubt_emptiness(self, stopping: threading.Event) -> None:
        """The service has no event any more, if it says so twice: an answer without a number reads
        like that, too."""
        self._pause(stopping)
        if not stopping.is_set() and self._newest(stopping) == 0:
            self._begin_anew(0)

    def _newest(self, stopping: threading.Event) -> int:
        """The newest number. It is asked for before each wait, for a service that counts anew would
        be waited for in vain."""
        newest = self._library.newest_event(stopping)
        if newest is None:
            self._looks_back = True
            self._failed_reads = 0
            raise ServiceUnavailable
        if self._failed_reads == _MALFORMED_READS:
            self._failed_reads = 0
            raise MalformedAnswer
        return newest

    def _first_asked(self, newest: int) -> int:
        continuity = self._continuity
        seen = continuity.last
        if seen is not None:
            if newest < seen:
                # A wait for what is above the last one would miss what the service counts from here.
                return continuity.around(newest)
            if newest > seen or self._looks_back:
                return continuity.overlapping()
        return continuity.next

    def _read(self, first: int, stopping: threading.Event) -> tuple[Event, ...] | None:
        cancels = self._library.cancels
        if self._library.ask_for_events(min(first, LARGEST_NUMBER)):
            self._failed_reads = 0
            with TextBuffer() as buffer:
                return tuple(Event(**fields) for fields in self._library.read(Event, buffer))
        self._looks_back = True
        # That nothing came tells nothing after a cancel, be it that of another call.
        if self._library.cancels == cancels:
            self._failed_reads += 1
            self._pause(stopping)
        return None

    def _judge(self, batch: Sequence[Event], newest: int) -> None:
        """Looks whether the service still tells of the events that were seen."""
        seen = self._continuity.last
        if seen is None:
            return
        went_back = newest < seen
        history = self._continuity.compared(batch)
        if history is History.DIFFERENT or (went_back and batch and history is History.UNKNOWN):
            self._begin_anew(newest)
        elif went_back and batch:
            greatest = max(event.sequence_number for event in batch)
            # Otherwise the events are only in disorder.
            if greatest < seen:
                self._continuity.shrink_to(greatest)

    def _begin_anew(self, newest: int) -> NoReturn:
        """The service counts anew: everything that it has is asked for next."""
        seen = self._continuity.last
        assert seen is not None
        self._continuity.begin_anew()
        raise EventLogRestarted(newest, seen)

    def _pause(self, stopping: threading.Event) -> None:
        stopping.wait(_SHORTEST_PAUSE * 2**self._pauses)
        self._pauses = min(self._pauses + 1, _DOUBLINGS)
