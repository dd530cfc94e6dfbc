"""What the tests of event streams have in common."""

import itertools

from raidinstrumentation import EventStream, RAIDInstrumentation

from .scripted_service import ScriptedService
from .simulator import Simulator

# The answer to a wait is not looked at.
AWAITED = "there are events"


def numbers_of(raid: RAIDInstrumentation, after: int | None, count: int) -> list[int]:
    stream = raid.events(after)
    return [event.sequence_number for event in itertools.islice(stream, count)]


def add(simulator: Simulator, *numbers: int) -> None:
    """Has a service that counts wrong add events with these numbers."""
    for number in numbers:
        simulator.event(f"event {number}", place="last", sequenceNumber=number)


def take(stream: EventStream, count: int) -> list[int]:
    return [next(stream).sequence_number for _ in range(count)]


def starts(service: ScriptedService) -> list[int]:
    """The first number of each question for events."""
    requests = service.requests("events")
    return [int(request.partition("</as:start>")[0].rpartition(">")[2]) for request in requests]
