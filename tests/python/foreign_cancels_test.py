"""Exchanges that are cancelled in place of somebody else's, as often as it may be."""

import contextlib
import threading
from collections.abc import Iterator
from typing import Any

import pytest
from raidinstrumentation import Inventory, MalformedAnswer, ServiceUnavailable
from raidinstrumentation.configuration import read_inventory
from raidinstrumentation.events import EventStream
from raidinstrumentation.library import NEWEST_EVENT, Library
from raidinstrumentation.records import Event, Record
from raidinstrumentation.shapes import Number, Signature, Text
from raidinstrumentation.table import columns_of
from raidinstrumentation.text import TextBuffer


class DisturbedLibrary(Library):
    """A library some exchanges of which are cancelled, in turn these and those."""

    def __init__(self, disturbances: int, *, answers: bool) -> None:
        self.cancels = 0
        self._disturbances = disturbances
        self._answers = answers

    @contextlib.contextmanager
    def inventory_turn(self, stopping: threading.Event) -> Iterator[None]:
        yield

    @contextlib.contextmanager
    def event_turn(self) -> Iterator[None]:
        yield

    def _call(self, signature: Signature, *arguments: object) -> int:
        assert signature is NEWEST_EVENT
        disturbed = self._disturbances % 2 == 1 and self._is_disturbed()
        return 1 if self._answers and not disturbed else -1

    def ask_for_configuration(self) -> bool:
        return not self._is_disturbed() and self._answers

    def ask_for_events(self, first: int) -> bool:
        return not self._is_disturbed() and self._answers

    def cancel(self) -> None:
        pass

    def read(self, kind: type[Record], buffer: TextBuffer) -> Iterator[dict[str, Any]]:
        if kind is Event and self._disturbances == 0:
            values = {Number: 1, Text: "text"}
            yield {column.key: values[type(column.shape)] for column in columns_of(kind)}

    def _is_disturbed(self) -> bool:
        if self._disturbances == 0:
            return False
        self._disturbances -= 1
        self.cancels += 1
        return True


DISTURBANCES = range(8)


@pytest.mark.parametrize("disturbances", DISTURBANCES)
def test_the_inventory_is_read_all_the_same(disturbances: int) -> None:
    library = DisturbedLibrary(disturbances, answers=True)
    assert isinstance(read_inventory(library, threading.Event()), Inventory)


@pytest.mark.parametrize("disturbances", DISTURBANCES)
def test_no_event_is_lost(disturbances: int) -> None:
    stream = EventStream(DisturbedLibrary(disturbances, answers=True), 1)
    assert next(stream).sequence_number == 1


@pytest.mark.parametrize("disturbances", DISTURBANCES)
def test_the_newest_event_is_known(disturbances: int) -> None:
    library = DisturbedLibrary(disturbances, answers=True)
    assert library.newest_event(threading.Event()) == 1


@pytest.mark.parametrize("disturbances", DISTURBANCES)
def test_a_service_that_is_not_there_is_unavailable_all_the_same(disturbances: int) -> None:
    with pytest.raises(ServiceUnavailable):
        read_inventory(DisturbedLibrary(disturbances, answers=False), threading.Event())
    with pytest.raises(ServiceUnavailable):
        next(EventStream(DisturbedLibrary(disturbances, answers=False), 1))


def test_what_is_cancelled_by_its_own_caller_asks_no_more() -> None:
    stopping = threading.Event()
    stopping.set()
    with pytest.raises(MalformedAnswer):
        read_inventory(DisturbedLibrary(100, answers=True), stopping)
