"""How a wait for events is ended."""

import os
import signal
import threading
from collections.abc import Callable

import pytest
from raidinstrumentation import RAIDInstrumentation
from support.documents import newest_event
from support.interruption import begun, meanwhile
from support.scripted_service import Manner, ScriptedService
from support.simulator import Simulator
from support.waiting import PATIENCE


def kill_with(number: int) -> Callable[[], None]:
    return lambda: os.kill(os.getpid(), number)


def test_another_thread_ends_the_wait(raid: RAIDInstrumentation) -> None:
    with ScriptedService(newest=(newest_event(7),), wait=(Manner.HOLD,)) as service:
        stream = raid.events()
        with meanwhile(lambda: service.wait_for("wait"), stream.cancel):
            assert not list(stream)


def test_a_wait_on_another_thread_ends(raid: RAIDInstrumentation) -> None:
    with ScriptedService(newest=(newest_event(7),), wait=(Manner.HOLD,)) as service:
        stream = raid.events()
        waited = begun(lambda: list(stream))
        service.wait_for("wait")
        stream.cancel()
        assert waited.result(PATIENCE) == []


def test_a_signal_handler_ends_the_wait(raid: RAIDInstrumentation) -> None:
    with ScriptedService(newest=(newest_event(7),), wait=(Manner.HOLD,)) as service:
        stream = raid.events()
        before = signal.signal(signal.SIGTERM, lambda number, frame: stream.cancel())
        with meanwhile(lambda: service.wait_for("wait"), kill_with(signal.SIGTERM)):
            assert not list(stream)
        signal.signal(signal.SIGTERM, before)


def test_ctrl_c_ends_the_wait(raid: RAIDInstrumentation) -> None:
    with ScriptedService(newest=(newest_event(7),), wait=(Manner.HOLD,)) as service:
        stream = raid.events()
        with meanwhile(lambda: service.wait_for("wait"), kill_with(signal.SIGINT)):
            with pytest.raises(KeyboardInterrupt):
                next(stream)


def test_the_end_of_the_block_ends_the_wait_of_another_thread() -> None:
    with ScriptedService(newest=(newest_event(7),), wait=(Manner.HOLD,)) as service:
        with RAIDInstrumentation() as raid:
            stream = raid.events()
            waited = begun(lambda: list(stream))
            service.wait_for("wait")
        assert waited.result(PATIENCE) == []


def test_a_stream_that_is_asked_for_while_the_block_ends_is_at_its_end(
    raid: RAIDInstrumentation, monkeypatch: pytest.MonkeyPatch
) -> None:
    def answer_late(stopping: threading.Event) -> int:
        raid.close()
        return 7

    monkeypatch.setattr(raid._library, "newest_event", answer_late)
    assert not list(raid.events())


def test_the_stream_goes_on_after_ctrl_c(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        stream = raid.events(0)
        with meanwhile(simulator.wait_for_waiting_client, kill_with(signal.SIGINT)):
            with pytest.raises(KeyboardInterrupt):
                next(stream)
        simulator.event("first")
        simulator.event("second")
        assert [next(stream).message_string for _ in range(2)] == ["first", "second"]


def test_a_cancelled_stream_stays_at_its_end(raid: RAIDInstrumentation) -> None:
    with Simulator("small-server.xml") as simulator:
        simulator.event("first")
        simulator.event("second")
        stream = raid.events(0)
        next(stream)
        stream.cancel()
        assert not list(stream)
        assert not list(stream)
