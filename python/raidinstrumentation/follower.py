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
# The library asks for a hundred more, and from further above its numbers would overflow.
_HIGHEST_ASKED = LARGEST_NUMBER - NUMBERS_ASKED + 1
# The search behind a gap begins with so many numbers, and goes on with so many times more: raidinfo
# searches in the same way, and goes on from the same number.
_NUMBERS_SEARCHED = 8 * NUMBERS_ASKED
_WIDENING = 8
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
        # From where to look once more: for events that are missing, or for one that was seen, in
        # place of which there may be another one after an outage, or another one beside it.
        self._looks_back_to: int | None = None
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
        seen, expected = self._continuity.last, self._continuity.next
        news = self._continuity.accept(batch)
        looked_back = self._looks_back_to is not None
        self._looks_back_to = None
        if news:
            self._pauses = 0
            self._look_back_after_news(first, seen)
        elif looked_back or self._continuity.next > expected:
            pass  # There may be more.
        elif newest >= first + NUMBERS_ASKED:
            self._pass_over(first, newest, stopping)
        else:
            self._pause(stopping)
        return news

    def _look_back_after_news(self, first: int, seen: int | None) -> None:
        if self._continuity.waits_for_late_events():
            self._looks_back_to = self._continuity.overlapping()
        if seen is not None and seen < first:
            # While the next one was waited for, the last one may have been sent once more.
            self._looks_back_to = min(self._looks_back_to or seen, seen)

    def _pass_over(self, first: int, newest: int, stopping: threading.Event) -> None:
        """The service no longer keeps the events with the numbers asked for, but some behind them."""
        expected = self._continuity.next
        low, count = expected, _NUMBERS_SEARCHED
        while low <= newest and not stopping.is_set():
            high = min(low + count - 1, newest)
            there = self._library.numbers_between(low, high)
            if there is None:
                self._continuity.pass_over_to(first + NUMBERS_ASKED)
                return
            if there:
                self._continuity.pass_over_to(min(there))
                return
            low, count = high + 1, count * _WIDENING
        if not stopping.is_set():
            # What comes late is a little below the newest number; yet what was searched in vain is
            # not asked for again from its beginning, without end.
            self._continuity.pass_over_to(max(newest - NUMBERS_ASKED + 1, expected + 1))

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
            self._look_back()
            self._failed_reads = 0
            raise ServiceUnavailable
        if self._failed_reads == _MALFORMED_READS:
            self._failed_reads = 0
            raise MalformedAnswer
        return newest

    def _first_asked(self, newest: int) -> int:
        continuity = self._continuity
        if newest < continuity.next:
            # The service has lost what the search behind a gap found there.
            continuity.pass_over_to(0)
        seen = continuity.last
        first = continuity.next
        if seen is not None:
            if newest < seen:
                # A wait for what is above the last one would miss what the service counts from here.
                first = continuity.around(newest)
            elif self._looks_back_to is not None:
                first = min(self._looks_back_to, continuity.overlapping())
            elif newest > seen:
                first = continuity.overlapping()
        return min(first, _HIGHEST_ASKED)

    def _read(self, first: int, stopping: threading.Event) -> tuple[Event, ...] | None:
        cancels = self._library.cancels
        if self._library.ask_for_events(first):
            self._failed_reads = 0
            with TextBuffer() as buffer:
                return tuple(Event(**fields) for fields in self._library.read(Event, buffer))
        self._look_back()
        # That nothing came tells nothing after a cancel, be it that of another call.
        if self._library.cancels == cancels:
            self._failed_reads += 1
            self._pause(stopping)
        return None

    def _look_back(self) -> None:
        overlapping = self._continuity.overlapping()
        self._looks_back_to = min(self._looks_back_to or overlapping, overlapping)

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
