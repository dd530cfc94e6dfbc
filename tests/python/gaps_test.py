"""Numbers that the service passes over, be they few or millions."""

import itertools
from logging import WARNING

import pytest
from raidinstrumentation import RAIDInstrumentation
from support.documents import events, newest_event
from support.interruption import meanwhile
from support.scripted_service import Manner, ScriptedService
from support.simulator import Simulator
from support.streams import AWAITED, add, numbers_of, starts, take


def test_events_that_are_no_longer_kept_are_passed_over(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        simulator.event("oldest that is kept", sequenceNumber=5000)
        simulator.event("newest", sequenceNumber=5099)
        assert numbers_of(raid, 17, 2) == [5000, 5099]


def test_numbers_that_are_passed_over_are_told_before_the_event_behind_them(
    raid: RAIDInstrumentation, caplog: pytest.LogCaptureFixture
) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 3, 5, 9)
        stream = raid.events(2)
        assert take(stream, 1) == [3]
        assert caplog.record_tuples == []
        assert take(stream, 1) == [5]
        assert caplog.record_tuples == [("raidinstrumentation", WARNING, "event 4 is missing")]
        assert take(stream, 1) == [9]
        assert caplog.messages[1:] == ["events 6 to 8 are missing"]
        assert stream.missing == (range(4, 5), range(6, 9))


def test_what_the_service_no_longer_keeps_is_missing_only_after_a_number(
    raid: RAIDInstrumentation,
) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 7)
        from_the_oldest, resumed = raid.events(0), raid.events(4)
        assert take(from_the_oldest, 1) == take(resumed, 1) == [7]
        assert from_the_oldest.missing == ()
        assert resumed.missing == (range(5, 7),)


def test_more_numbers_than_are_asked_for_at_once_are_passed_over(
    raid: RAIDInstrumentation,
) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2)
        stream = raid.events(0)
        assert take(stream, 2) == [1, 2]
        add(simulator, 500)
        assert take(stream, 1) == [500]
        assert stream.missing == (range(3, 500),)


@pytest.fixture
def few_questions(raid: RAIDInstrumentation, monkeypatch: pytest.MonkeyPatch) -> None:
    """Fails the test when the service is asked for events again and again."""
    questions = itertools.count(1)
    ask = raid._library.ask_for_events

    def counted(first: int) -> bool:
        assert next(questions) <= 20, "too many questions"
        return ask(first)

    monkeypatch.setattr(raid._library, "ask_for_events", counted)


@pytest.mark.usefixtures("few_questions")
def test_millions_of_numbers_are_passed_over_at_once(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2)
        stream = raid.events(0)
        assert take(stream, 2) == [1, 2]
        add(simulator, 500, 70_000, 10_000_000)
        assert take(stream, 3) == [500, 70_000, 10_000_000]
        assert stream.missing == (
            range(3, 500),
            range(501, 70_000),
            range(70_001, 10_000_000),
        )


@pytest.mark.usefixtures("few_questions")
def test_the_oldest_event_may_have_any_number(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 10_000_000, 10_000_001)
        assert numbers_of(raid, 0, 2) == [10_000_000, 10_000_001]


@pytest.mark.usefixtures("few_questions")
def test_the_largest_numbers_come(raid: RAIDInstrumentation) -> None:
    largest = 2**31 - 1
    with Simulator("small-server.xml") as simulator:
        add(simulator, largest - 50)
        stream = raid.events(0)
        assert take(stream, 1) == [largest - 50]
        add(simulator, largest - 20, largest)
        assert take(stream, 2) == [largest - 20, largest]
        assert numbers_of(raid, largest - 20, 1) == [largest]


def test_behind_a_gap_the_least_number_is_asked_for(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(9000),),
        wait=(AWAITED,),
        events=(events(), events(), events(), events(9000, 7500, 8000), events(7500)),
    ) as service:
        assert numbers_of(raid, 0, 1) == [7500]
        assert starts(service) == [1, 1, 809, 7273, 7500]


def test_where_a_long_gap_cannot_be_read_it_is_walked_through(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(9000),),
        wait=(AWAITED,),
        events=(events(), "<", events(), Manner.CLOSE, events(250)),
    ) as service:
        assert numbers_of(raid, 0, 1) == [250]
        assert starts(service) == [1, 1, 102, 102, 203]


def test_a_newest_number_without_an_event_is_asked_for_all_the_same(
    raid: RAIDInstrumentation,
) -> None:
    with ScriptedService(
        newest=(newest_event(700),), wait=(AWAITED,), events=(events(), events(), events(700))
    ) as service:
        assert numbers_of(raid, 0, 1) == [700]
        assert starts(service) == [1, 1, 600]


def test_behind_a_newest_number_without_an_event_nothing_is_asked_for_twice(
    raid: RAIDInstrumentation,
) -> None:
    with ScriptedService(
        newest=(newest_event(60), newest_event(115)),
        wait=(AWAITED,),
        events=(events(10, 60), events(60), events(60), events(), events(115)),
    ) as service:
        assert numbers_of(raid, 0, 3) == [10, 60, 115]
        # What was missing is looked for twice before the search, which begins behind the last one.
        assert starts(service) == [1, 11, 11, 61, 62]


def test_what_happens_below_a_newest_number_that_was_lost_comes(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(700), newest_event(700), newest_event(5)),
        wait=(AWAITED,),
        events=(events(), events(), events(5)),
    ) as service:
        assert numbers_of(raid, 0, 1) == [5]
        assert starts(service) == [1, 1, 1]


def test_a_cancel_ends_the_search_behind_a_gap(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(10_000_000),), wait=(AWAITED,), events=(events(), Manner.HOLD)
    ) as service:
        stream = raid.events(0)
        with meanwhile(lambda: service.wait_for("events", 2), stream.cancel):
            assert not list(stream)


def test_the_largest_number_there_is_can_be_followed(raid: RAIDInstrumentation) -> None:
    largest = 2**31 - 1
    with ScriptedService(
        newest=(newest_event(largest),),
        wait=(AWAITED, AWAITED, Manner.HOLD),
        events=(events(largest),),
    ) as service:
        stream = raid.events()
        assert next(stream).sequence_number == largest
        with meanwhile(lambda: service.wait_for("wait", 3), stream.cancel):
            assert not list(stream)
        # To the end of what is asked for at once there are a hundred more.
        assert set(starts(service)) == {largest - 100}
