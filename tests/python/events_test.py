"""The event stream: each event once, whatever happens."""

import threading
from collections.abc import Callable
from functools import partial
from pathlib import Path
from typing import Any

import pytest
from raidinstrumentation import (
    MalformedAnswer,
    RAIDInstrumentation,
    ServiceUnavailable,
)
from support.documents import events, newest_event
from support.interruption import meanwhile
from support.scripted_service import Manner, ScriptedService
from support.simulator import Simulator
from support.streams import AWAITED, add, numbers_of, starts, take
from support.waiting import PATIENCE

# By what an event says is noticed that the service counts anew.
SAME_FOR_ALL = "date=2006-10-09T03:12:40Z"


def test_the_stream_starts_with_the_newest_event(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        simulator.event("old")
        simulator.event("newest")
        stream = raid.events()
        simulator.event("later")
        assert [next(stream).message_string for _ in range(2)] == ["newest", "later"]


def test_an_event_has_all_that_the_service_tells(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        simulator.event("R&D", type="Critical", eventCode=101, adapter=1, channel=2, deviceID=3)
        event = next(raid.events())
    assert (event.sequence_number, event.type, event.message_string) == (1, "Critical", "R&D")
    assert (event.event_code, event.adapter, event.channel, event.device_id) == (101, 1, 2, 3)
    assert (event.enclosure_id, event.logical_drive) == (0, 0)
    assert event.server_address == "127.0.0.1"
    assert event.date.endswith("Z")


def test_the_stream_resumes_after_an_event(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        for number in range(1, 6):
            simulator.event(f"event {number}")
        assert numbers_of(raid, 3, 2) == [4, 5]
        assert numbers_of(raid, 0, 5) == [1, 2, 3, 4, 5]


def test_more_events_than_are_asked_for_at_once_all_come(raid: RAIDInstrumentation) -> None:
    count = 250
    with Simulator("small-server.xml") as simulator:
        for number in range(count):
            simulator.event(f"event {number}")
        assert numbers_of(raid, 0, count) == [*range(1, count + 1)]


def test_events_that_could_not_be_read_are_not_passed_over(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(500),), wait=(AWAITED,), events=(Manner.CLOSE, events(1))
    ):
        assert numbers_of(raid, 0, 1) == [1]


def test_an_event_that_happens_while_it_is_waited_for_comes(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        stream = raid.events(0)
        happen: tuple[Callable[[], None], ...] = (
            simulator.wait_for_waiting_client,
            lambda: simulator.event("now"),
        )
        with meanwhile(*happen):
            assert next(stream).message_string == "now"


def test_events_come_once_and_each_batch_by_its_numbers(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(45),),
        wait=(AWAITED,),
        events=(events(41, 43, 42), events(42, 43, 44, 44, 45)),
    ) as service:
        assert numbers_of(raid, 40, 5) == [41, 42, 43, 44, 45]
        # With those that are new comes the last one seen.
        assert starts(service) == [40, 43]


# The library publishes the batch before it once more.
def test_nothing_comes_twice_when_a_wait_fails(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(44),),
        wait=(AWAITED, Manner.CLOSE, AWAITED),
        events=(events(41, 42), Manner.CLOSE, events(43, 44)),
    ):
        assert numbers_of(raid, 40, 4) == [41, 42, 43, 44]


def test_an_empty_and_a_malformed_batch_are_got_over(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(4),), wait=(AWAITED,), events=("<", events(), "<", events(3, 4))
    ):
        assert numbers_of(raid, 2, 2) == [3, 4]


@pytest.mark.parametrize("after", [-1, 2**31])
def test_a_number_that_no_event_has_is_refused(raid: RAIDInstrumentation, after: int) -> None:
    with pytest.raises(ValueError, match="event numbers"):
        raid.events(after)


@pytest.mark.parametrize("after", [1.5, float("nan"), "1"])
def test_what_is_no_event_number_is_refused(raid: RAIDInstrumentation, after: Any) -> None:
    with pytest.raises(TypeError):
        raid.events(after)


def test_a_service_that_is_not_there_is_unavailable(raid: RAIDInstrumentation) -> None:
    with pytest.raises(ServiceUnavailable):
        raid.events()


def test_a_silent_service_is_given_up_after_the_timeout(raid: RAIDInstrumentation) -> None:
    with ScriptedService(newest=(Manner.HOLD,)):
        with pytest.raises(ServiceUnavailable, match="0.1 seconds"):
            raid.events(timeout=0.1)


def test_twice_no_readable_batch_is_malformed(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(2),), wait=(AWAITED,), events=("<", "<", events(1, 2))
    ) as service:
        stream = raid.events(0)
        with pytest.raises(MalformedAnswer):
            next(stream)
        assert len(service.requests("events")) == 2
        assert [next(stream).sequence_number for _ in range(2)] == [1, 2]


def test_a_service_that_dies_in_mid_wait_is_unavailable(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        stream = raid.events()
        with meanwhile(simulator.wait_for_waiting_client, simulator.kill):
            with pytest.raises(ServiceUnavailable):
                next(stream)
    with pytest.raises(ServiceUnavailable):
        next(stream)


def test_nothing_is_lost_or_doubled_while_the_service_restarts(
    raid: RAIDInstrumentation, tmp_path: Path
) -> None:
    lives, events_a_life = 5, 30
    total = lives * events_a_life
    collected: list[int] = []
    progress = threading.Condition()
    listens = threading.Event()

    def live_and_die(seen: int) -> None:
        # Of the log before, the newest events are kept; the first half of what is new happened
        # while nobody could ask, the other half while it is waited for.
        kept = range(max(1, seen - 10), seen + events_a_life // 2)
        (tmp_path / "log.init").write_text(
            "".join(f"event sequenceNumber={number} {SAME_FOR_ALL}\n" for number in kept)
        )
        with Simulator("small-server.xml", "--init", tmp_path / "log.init") as simulator:
            listens.set()
            for number in range(kept.stop, seen + events_a_life + 1):
                simulator.command(f"event sequenceNumber={number} {SAME_FOR_ALL}")
            with progress:
                assert progress.wait_for(lambda: seen + events_a_life in collected, PATIENCE)

    outages = 0
    with meanwhile(*(partial(live_and_die, life * events_a_life) for life in range(lives))):
        assert listens.wait(PATIENCE)
        stream = raid.events(0)
        while len(collected) < total:
            try:
                number = next(stream).sequence_number
            except ServiceUnavailable:
                outages += 1
                continue
            with progress:
                collected.append(number)
                progress.notify_all()
    assert collected == [*range(1, total + 1)]
    assert outages > 0


def test_events_in_disorder_all_come(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2, 3)
        stream = raid.events(0)
        assert take(stream, 3) == [1, 2, 3]
        add(simulator, 50, 4)
        assert take(stream, 2) == [4, 50]


def test_an_event_that_comes_late_comes_all_the_same(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2, 3, 50)
        stream = raid.events(0)
        assert take(stream, 4) == [1, 2, 3, 50]
        add(simulator, 4)
        assert take(stream, 1) == [4]
        simulator.event("the service counts from the late one on")
        assert take(stream, 1) == [5]
        assert stream.missing == (range(6, 50),)


def test_an_event_far_below_the_last_one_comes(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2, 3, 500)
        stream = raid.events(0)
        assert take(stream, 4) == [1, 2, 3, 500]
        add(simulator, 4, 5)
        assert take(stream, 2) == [4, 5]
        add(simulator, 501)
        assert take(stream, 1) == [501]


def test_what_went_missing_is_asked_for_again_when_more_comes(raid: RAIDInstrumentation) -> None:
    with ScriptedService(
        newest=(newest_event(5), newest_event(5), newest_event(7)),
        wait=(AWAITED,),
        events=(events(5), events(7), events(6, 7)),
    ) as service:
        assert take(raid.events(), 3) == [5, 7, 6]
        assert ">6</as:start>" in service.requests("events")[-1]


def test_an_event_that_repeats_the_last_number_during_a_wait_comes(
    raid: RAIDInstrumentation,
) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 45)
        stream = raid.events()
        assert take(stream, 1) == [45]
        happen: tuple[Callable[[], None], ...] = (
            simulator.wait_for_waiting_client,
            lambda: simulator.event("another", place="last", sequenceNumber=45),
            lambda: add(simulator, 46),
            simulator.wait_for_waiting_client,
            stream.cancel,
        )
        with meanwhile(*happen):
            told = [*stream]
    assert [(event.sequence_number, event.message_string) for event in told] == [
        (46, "event 46"),
        (45, "another"),
    ]


def test_another_event_with_a_number_that_was_seen_comes(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        add(simulator, 1, 2, 3)
        stream = raid.events(0)
        assert take(stream, 3) == [1, 2, 3]
        simulator.event("another", place="last", sequenceNumber=2)
        assert next(stream).message_string == "another"
        add(simulator, 4)
        assert take(stream, 1) == [4]


def test_a_second_thread_cannot_wait(raid: RAIDInstrumentation) -> None:
    with ScriptedService(newest=(newest_event(7),), wait=(Manner.HOLD,)) as service:
        first, second = raid.events(), raid.events()

        def wait_in_vain() -> None:
            service.wait_for("wait")
            with pytest.raises(RuntimeError, match="another thread"):
                next(second)
            first.cancel()

        with meanwhile(wait_in_vain):
            assert not list(first)


def test_streams_of_one_thread_do_not_disturb_each_other(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        for number in range(1, 4):
            simulator.event(f"event {number}")
        one, other = raid.events(0), raid.events(1)
        assert [next(stream).sequence_number for stream in (one, other, one, other)] == [1, 2, 2, 3]
