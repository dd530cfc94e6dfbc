"""Inventory and events at once, and cancels in their midst."""

import os
import threading
from concurrent.futures import ThreadPoolExecutor

import pytest
from raidinstrumentation import RAIDInstrumentation, ServiceUnavailable
from support.simulator import Simulator
from support.waiting import wait_until


def test_threads_that_refresh_at_once_all_get_an_inventory(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml"), ThreadPoolExecutor(4) as threads:
        inventories = [*threads.map(lambda _: raid.refresh(), range(40))]
    assert len({inventory.disk_drives for inventory in inventories}) == 1


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

        with ThreadPoolExecutor(2) as threads:
            refreshing = threads.submit(refresh)
            for _ in range(30):
                stream = raid.events(0)
                waiting = threads.submit(lambda: list(stream))
                simulator.wait_for_waiting_client()
                stream.cancel()
                assert waiting.result() == []
            finished.set()
            refreshing.result()


def test_refreshes_that_are_given_up_lose_no_event(raid: RAIDInstrumentation) -> None:
    count = 30
    with Simulator("small-server.xml") as simulator:
        stream = raid.events(0)
        with ThreadPoolExecutor(1) as threads:
            waiting = threads.submit(lambda: [next(stream).sequence_number for _ in range(count)])
            for _ in range(count):
                simulator.arm("connection/never-answers.fault", 0)
                with pytest.raises(ServiceUnavailable, match="seconds"):
                    raid.refresh(timeout=0.01)
                simulator.event("something")
            assert waiting.result() == [*range(1, count + 1)]
