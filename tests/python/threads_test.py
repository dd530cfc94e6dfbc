"""Inventory and events at once, and cancels in their midst."""

import os
import threading
from functools import partial

import pytest
from raidinstrumentation import RAIDInstrumentation, ServiceUnavailable
from support.interruption import begun
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
