"""Account of the numbers of events: which were seen, which are missing, which are ahead."""

from collections import deque
from collections.abc import Iterable, Sequence
from enum import Enum, auto

from .records import Event

# So many numbers the library asks for at once.
NUMBERS_ASKED = 101
# As many events are known by their content, and as many gaps may still be filled.
_MEMORY = 10_000


class History(Enum):
    """What a batch tells of the events that were seen, as far as it has their numbers."""

    UNKNOWN = auto()
    SAME = auto()
    DIFFERENT = auto()


class Continuity:
    """Sees to it that every event is shown once, and knows which never came.

    The service may send events twice, late, in disorder or, when it counts anew, with numbers that
    it has used before.
    """

    def __init__(self, first: int, known: int | None = None) -> None:
        """Begins at the first number, or at whatever comes first where it is 0.

        An event of the known number was there before, whatever it said.
        """
        self._expected = first
        self._known = known
        self._last = known
        # Numbers below were asked for in vain.
        self._asked = 0
        self._missing: tuple[range, ...] = ()
        # The contents of each number, and in which of the service's counts each was seen last.
        self._shown: dict[int, dict[int, int]] = {}
        self._order: deque[tuple[int, int]] = deque()
        self._count = 0

    @property
    def next(self) -> int:
        """The least number that is ahead."""
        return max(self._expected, self._asked, 1)

    @property
    def last(self) -> int | None:
        """The greatest number there was."""
        return self._last

    @property
    def missing(self) -> tuple[range, ...]:
        """The numbers that were passed over and have not come since."""
        return self._missing

    def accept(self, batch: Iterable[Event]) -> list[Event | range]:
        """What is new in a batch, by its numbers; before an event the numbers that it passes over."""
        news: list[Event | range] = []
        for event in sorted(batch, key=lambda event: event.sequence_number):
            number = event.sequence_number
            is_fresh = self._is_fresh(event)
            if number >= self._expected:
                if number > self._expected > 0:
                    gap = range(self._expected, number)
                    news.append(gap)
                    self._missing = (*self._missing, gap)[-_MEMORY:]
                self._expected = number + 1
                self._last = max(self._last or 0, number)
            if is_fresh:
                news.append(event)
            if is_fresh or number == self._known or number in self._shown:
                self._remember(number, hash(event))
        return news

    def compared(self, batch: Iterable[Event]) -> History:
        """Whether the service still tells of the events up to the last what it told before."""
        sent: dict[int, set[int]] = {}
        for event in batch:
            sent.setdefault(event.sequence_number, set()).add(hash(event))
        history = History.UNKNOWN
        for number, contents in sent.items():
            if self._last is None or number > self._last:
                continue
            shown = self._seen_in_this_count(number)
            # One of several events with the same number may be new.
            if shown and shown.isdisjoint(contents):
                return History.DIFFERENT
            if shown or number == self._known:
                history = History.SAME
        return history

    def begin_anew(self) -> None:
        """The service counts anew: everything that it has is ahead."""
        self._expected = self._asked = 0
        self._known = self._last = None
        self._missing = ()
        self._count += 1

    def shrink_to(self, number: int) -> None:
        """The service has the same events as before, but none above this number."""
        self._expected = number + 1
        self._asked = 0
        self._last = number
        self._missing = tuple(gap for gap in self._missing if gap.start <= number)

    def pass_over_to(self, number: int) -> None:
        """There is nothing new below this number, although there are events from it on."""
        self._asked = number

    def overlapping(self) -> int:
        """The number to ask from when there are events ahead.

        Together with them come the last one seen, by which a service that counts anew is noticed,
        and those that went missing a short while ago.
        """
        if self._last is None or self._asked > self._expected:
            return self.next
        # From further below, nothing that is ahead would come.
        lowest = self._last - NUMBERS_ASKED + 2
        recent = (max(gap.start, lowest) for gap in self._missing if gap.stop > lowest)
        return min(next(recent, self._last), self._last)

    def around(self, newest: int) -> int:
        """The number to ask from when the newest is below the last one seen.

        The newest itself comes then, and as many of those seen as possible.
        """
        assert self._last is not None
        is_near = self._last - newest < NUMBERS_ASKED
        return max((self._last if is_near else newest) - NUMBERS_ASKED + 1, 1)

    def waits_for_late_events(self) -> bool:
        """Whether a number is missing that may still come with the next batch."""
        return self._last is not None and self.overlapping() < self._last

    def _is_fresh(self, event: Event) -> bool:
        number = event.sequence_number
        shown = self._shown.get(number)
        if shown is not None:
            return hash(event) not in shown
        return number >= self._expected or self._take_from_missing(number)

    def _take_from_missing(self, number: int) -> bool:
        for place, gap in enumerate(self._missing):
            if number in gap:
                rest = (range(gap.start, number), range(number + 1, gap.stop))
                self._replace_gap(place, [part for part in rest if part])
                return True
        return False

    def _replace_gap(self, place: int, parts: Sequence[range]) -> None:
        self._missing = (*self._missing[:place], *parts, *self._missing[place + 1 :])

    def _seen_in_this_count(self, number: int) -> set[int]:
        shown = self._shown.get(number, {})
        return {content for content, count in shown.items() if count == self._count}

    def _remember(self, number: int, content: int) -> None:
        shown = self._shown.setdefault(number, {})
        if content not in shown:
            self._order.append((number, content))
        shown[content] = self._count
        if len(self._order) > _MEMORY:
            self._forget(*self._order.popleft())

    def _forget(self, number: int, content: int) -> None:
        del self._shown[number][content]
        if not self._shown[number]:
            del self._shown[number]
