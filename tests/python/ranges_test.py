"""The question for the events of a range, and what is read from its answer."""

import pytest
from raidinstrumentation import RAIDInstrumentation
from raidinstrumentation.ranges import numbers_in
from raidinstrumentation.records import Event
from raidinstrumentation.text import TextBuffer
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
        "<as:sequenceNumber>+005th</as:sequenceNumber>",
        "<as:sequenceNumber>5 6</as:sequenceNumber>",
    ],
)
def test_a_number_may_be_laid_out_in_any_way(element: str) -> None:
    assert numbers_in(f"{element}</ac:events>".encode()) == [5]


@pytest.mark.parametrize(
    ("content", "number"),
    [
        ("-7", -7),
        ("2147483647", 2**31 - 1),
        ("2147483648", 2**31 - 1),
        ("9" * 5000, 2**31 - 1),
        ("-" + "9" * 20, -(2**31)),
        ("x", 0),
        ("", 0),
    ],
)
def test_a_number_is_read_as_the_library_reads_it(
    raid: RAIDInstrumentation, content: str, number: int
) -> None:
    answer = events(3).replace(">3<", f">{content}<")
    assert numbers_in(answer.encode()) == [number]
    with ScriptedService(wait=("",), events=(answer,)):
        assert raid._library.ask_for_events(3)
        with TextBuffer() as buffer:
            (fields,) = raid._library.read(Event, buffer)
    assert fields["sequence_number"] == number


def test_a_number_that_cannot_be_read_makes_all_uncertain() -> None:
    five = "<as:sequenceNumber>5</as:sequenceNumber>"
    for unreadable in ("<![CDATA[3]]>", "<as:date/>", "3</as:date>"):
        element = f"<as:sequenceNumber>{unreadable}</as:sequenceNumber>"
        assert numbers_in(f"{five}{element}</ac:events>".encode()) is None
    assert numbers_in(f"{five}<as:sequenceNumber/></ac:events>".encode()) == [5, 0]


@pytest.mark.parametrize("end", ["</ac:events >", "<ac:events/>", '<ac:events xsi:type="e"/>'])
def test_an_answer_is_whole_with_the_end_of_its_events(end: str) -> None:
    assert numbers_in(end.encode()) == []


def test_what_only_begins_like_a_number_is_none() -> None:
    text = "<as:sequenceNumbers>5</as:sequenceNumbers></ac:events>"
    assert numbers_in(text.encode()) == []
