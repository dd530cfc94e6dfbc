"""A service that counts its events anew, or has lost some of them."""

import pytest
from raidinstrumentation import EventLogRestarted, RAIDInstrumentation, ServiceUnavailable
from support.documents import events, newest_event
from support.interruption import meanwhile
from support.scripted_service import ScriptedService
from support.simulator import Simulator
from support.streams import AWAITED, add, take


def test_a_log_that_began_anew_is_told(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        simulator.event("first")
        simulator.event("second")
        stream = raid.events(0)
        assert take(stream, 2) == [1, 2]
    with Simulator("small-server.xml") as simulator:
        simulator.event("first of another log")
        with pytest.raises(EventLogRestarted) as told:
            next(stream)
        assert (told.value.newest, told.value.seen) == (1, 2)
        with pytest.raises(EventLogRestarted):
            raid.events(2)
        assert next(raid.events(0)).message_string == "first of another log"


def test_after_a_new_count_comes_all_that_was_not_seen(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(3), newest_event(3), newest_event(2)),
        wait=(AWAITED,),
        events=(events(2, 3), events(2, message="another"), events(1, 2, message="another")),
    ):
        stream = raid.events(0)
        assert take(stream, 2) == [2, 3]
        with pytest.raises(EventLogRestarted):
            next(stream)
        assert [next(stream).message_string for _ in range(2)] == ["another 1", "another 2"]


def test_a_new_count_is_noticed_when_it_has_caught_up(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2)
        stream = raid.events(0)
        assert take(stream, 2) == [1, 2]
    with Simulator("small-server.xml") as simulator:
        for _ in range(3):
            simulator.event("of another log")
        with pytest.raises(EventLogRestarted) as told:
            next(stream)
        assert (told.value.newest, told.value.seen) == (3, 2)
        assert take(stream, 3) == [1, 2, 3]


def test_a_new_count_is_noticed_after_an_outage(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1)
        stream = raid.events(0)
        assert take(stream, 1) == [1]
        with meanwhile(simulator.wait_for_waiting_client, simulator.kill):
            with pytest.raises(ServiceUnavailable):
                next(stream)
    with Simulator("small-server.xml") as simulator:
        simulator.event("of another log")
        with pytest.raises(EventLogRestarted):
            next(stream)
        assert next(stream).message_string == "of another log"


def test_a_new_count_is_noticed_before_the_first_event_came(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 7)
        stream = raid.events()
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1)
        with pytest.raises(EventLogRestarted):
            next(stream)
        assert take(stream, 1) == [1]


def test_a_service_that_has_lost_all_events_counts_anew(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2)
        stream = raid.events(0)
        assert take(stream, 2) == [1, 2]
        simulator.command("forget")
        with pytest.raises(EventLogRestarted):
            raid.events(2)
        with pytest.raises(EventLogRestarted):
            next(stream)
        simulator.event("new")
        assert next(stream).message_string == "new"


def test_an_answer_without_the_newest_number_is_no_new_count(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(2), newest_event(2), newest_event("?"), newest_event(3)),
        wait=(AWAITED,),
        events=(events(2), events(2, 3)),
    ):
        assert take(raid.events(), 2) == [2, 3]


def test_a_service_that_has_lost_its_last_events_counts_on(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2, 3)
        stream = raid.events(0)
        assert take(stream, 3) == [1, 2, 3]
        simulator.command("forget 1")
        happen = (simulator.wait_for_waiting_client, lambda: simulator.event("new"))
        with meanwhile(*happen):
            event = next(stream)
        assert (event.sequence_number, event.message_string) == (2, "new")


def test_a_stream_resumes_after_an_event_with_a_higher_number_than_the_newest(
    raid: RAIDInstrumentation,
) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 50, 4)
        stream = raid.events(50)
        add(simulator, 51)
        assert take(stream, 1) == [51]
