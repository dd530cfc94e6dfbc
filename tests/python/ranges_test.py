"""The question for the events of a range, and what is read from its answer."""

import pytest
from raidinstrumentation import RAIDInstrumentation
from raidinstrumentation.ranges import numbers_in
from support.documents import configuration, events
from support.scripted_service import Manner, Reply, ScriptedService
from support.simulator import Simulator


def answered(raid: RAIDInstrumentation, reply: Reply) -> list[int] | None:
    with ScriptedService(events=(reply,)):
        return raid._library.numbers_between(3, 7)


def test_both_ends_belong_to_a_range(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        for number in range(9):
            simulator.event(f"event {number + 1}")
        assert raid._library.numbers_between(3, 7) == [3, 4, 5, 6, 7]
        assert raid._library.numbers_between(10, 2**31 - 1) == []


def test_a_range_is_asked_for_as_the_library_asks(raid: RAIDInstrumentation) -> None:
    with ScriptedService(wait=("",), events=(events(),)) as service:
        raid._library.ask_for_events(3)
        raid._library.numbers_between(3, 103)
        first, second = service.requests("events")
    assert first == second


def test_what_is_outside_the_range_is_no_answer_to_it(raid: RAIDInstrumentation) -> None:
    assert answered(raid, events(2, 8, 7, 3, 9)) == [7, 3]


@pytest.mark.parametrize(
    "reply", [Manner.CLOSE, "", "<", events(5)[:-80], configuration("")], ids=repr
)
def test_an_answer_that_is_none_says_nothing_of_the_range(
    raid: RAIDInstrumentation, reply: Reply
) -> None:
    assert answered(raid, reply) is None


@pytest.mark.parametrize(
    "element",
    [
        "<as:sequenceNumber>5</as:sequenceNumber>",
        '<as:sequenceNumber xsi:type="xsd:int">\n 5 </as:sequenceNumber >',
    ],
)
def test_a_number_may_be_laid_out_in_any_way(element: str) -> None:
    assert numbers_in(f"{element}</m:getEventsResponse>".encode()) == [5]


def test_a_number_that_cannot_be_read_makes_all_uncertain() -> None:
    five = "<as:sequenceNumber>5</as:sequenceNumber>"
    for other in ("x", "", "1 2", "<![CDATA[3]]>"):
        unreadable = f"<as:sequenceNumber>{other}</as:sequenceNumber>"
        assert numbers_in(f"{five}{unreadable}</m:getEventsResponse>".encode()) is None
    assert numbers_in(f"{five}<as:sequenceNumber/></m:getEventsResponse>".encode()) is None


def test_what_only_begins_like_a_number_is_none() -> None:
    text = "<as:sequenceNumbers>5</as:sequenceNumbers></m:getEventsResponse>"
    assert numbers_in(text.encode()) == []
