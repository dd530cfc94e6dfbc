"""Inventory and events at once, and cancels in their midst."""

import os
import signal
import threading
import weakref
from collections.abc import Iterator
from functools import partial

import pytest
from raidinstrumentation import EventStream, RAIDInstrumentation, ServiceUnavailable
from support.documents import newest_event
from support.interruption import begun
from support.scripted_service import Manner, ScriptedService
from support.simulator import Simulator
from support.waiting import PATIENCE, wait_until


def test_threads_that_refresh_at_once_all_get_an_inventory(raid: RAIDInstrumentation) -> None:
    def refresh_often() -> set[object]:
        return {raid.refresh().disk_drives for _ in range(10)}

    with Simulator("small-server.xml"):
        refreshing = [begun(refresh_often) for _ in range(4)]
        assert len(set().union(*(drives.result(PATIENCE) for drives in refreshing))) == 1


def test_calls_leave_no_thread_and_no_descriptor_behind(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        simulator.event("first")
        descriptors, threads = os.listdir("/proc/self/fd"), threading.active_count()
        for _ in range(20):
            raid.refresh()
            next(raid.events())
        wait_until(lambda: threading.active_count() == threads)
        assert os.listdir("/proc/self/fd") == descriptors


# A cancel ends whatever waits, also what another thread asked.
def test_cancels_of_event_waits_fail_no_refresh(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator, RAIDInstrumentation() as other:
        finished = threading.Event()

        def refresh() -> None:
            while not finished.is_set():
                assert len(other.refresh().disk_drives) == 6

        refreshing = begun(refresh)
        for _ in range(30):
            stream = raid.events(0)
            waiting = begun(partial(list, stream))
            simulator.wait_for_waiting_client()
            stream.cancel()
            assert waiting.result(PATIENCE) == []
        finished.set()
        refreshing.result(PATIENCE)


def test_refreshes_that_are_given_up_lose_no_event(raid: RAIDInstrumentation) -> None:
    count = 30
    with Simulator("small-server.xml") as simulator:
        stream = raid.events(0)
        waiting = begun(lambda: [next(stream).sequence_number for _ in range(count)])
        for _ in range(count):
            simulator.arm("connection/never-answers.fault", 0)
            with pytest.raises(ServiceUnavailable, match="seconds"):
                raid.refresh(timeout=0.01)
            simulator.event("something")
        assert waiting.result(PATIENCE) == [*range(1, count + 1)]


class ObservedLock:
    """A lock that tells when somebody has to wait for it."""

    def __init__(self) -> None:
        self._lock = threading.RLock()
        self.is_contended = threading.Event()

    def __enter__(self) -> None:
        if not self._lock.acquire(blocking=False):
            self.is_contended.set()
            self._lock.acquire()

    def __exit__(self, *problem: object) -> None:
        self._lock.release()


def test_a_stream_that_is_asked_for_while_the_streams_are_cancelled_is_at_its_end(
    raid: RAIDInstrumentation, monkeypatch: pytest.MonkeyPatch
) -> None:
    closing = threading.Event()
    turn = ObservedLock()
    made: list[EventStream] = []

    class SlowlyListed(weakref.WeakSet[EventStream]):
        def __iter__(self) -> Iterator[EventStream]:
            for stream in super().__iter__():
                closing.set()
                assert turn.is_contended.wait(PATIENCE)
                yield stream

        def add(self, stream: EventStream) -> None:
            super().add(stream)
            # Without a lock it is added here, in the midst of the list.
            turn.is_contended.set()

    def newest_event(stopping: threading.Event) -> int:
        assert not made or closing.wait(PATIENCE)
        return 7

    monkeypatch.setattr(raid._library, "newest_event", newest_event)
    made.append(raid.events())
    monkeypatch.setattr(raid, "_streams", SlowlyListed(raid._streams))
    monkeypatch.setattr(raid, "_lock", turn, raising=False)
    turn.is_contended.clear()
    late = begun(raid.events)
    raid.close()
    assert not list(late.result(PATIENCE)) and not list(made[0])


def test_a_second_thread_does_not_keep_the_first_from_being_cancelled(
    raid: RAIDInstrumentation,
) -> None:
    with ScriptedService(newest=(newest_event(7),), wait=(Manner.HOLD,)) as service:
        stream = raid.events()
        waiting = begun(partial(list, stream))
        service.wait_for("wait")
        with pytest.raises(RuntimeError, match="another thread"):
            next(stream)
        stream.cancel()
        assert waiting.result(PATIENCE) == []


def test_a_child_process_does_not_wait_for_threads_of_its_parent(
    raid: RAIDInstrumentation,
) -> None:
    with Simulator("small-server.xml") as simulator:
        stream = raid.events(0)
        waiting = begun(partial(list, stream))
        simulator.wait_for_waiting_client()
        child = os.fork()
        if child == 0:
            try:
                events = RAIDInstrumentation().events(0)
                signal.signal(signal.SIGALRM, lambda number, frame: events.cancel())
                signal.setitimer(signal.ITIMER_REAL, 0.01, 0.01)
                os._exit(len(list(events)))
            finally:
                os._exit(1)
        assert os.waitstatus_to_exitcode(os.waitpid(child, 0)[1]) == 0
        stream.cancel()
        assert waiting.result(PATIENCE) == []
