"""Calls that block, and the ways to end them."""

import ctypes
import os
import signal
import subprocess
import sys
import threading

import pytest
from raidinstrumentation.calls import WAKE_UP, Call, CallCancelled, prepare_wake_up
from support.interruption import meanwhile
from support.waiting import wait_until


def nothing() -> None:
    pass


def until_stopped(stopping: threading.Event) -> str:
    stopping.wait()
    return "stopped"


def test_a_call_returns_what_its_work_returns() -> None:
    assert Call(lambda stopping: 42, nothing).result() == 42


def test_a_call_raises_what_its_work_raises() -> None:
    def fail(stopping: threading.Event) -> None:
        raise ZeroDivisionError("by zero")

    with pytest.raises(ZeroDivisionError, match="by zero"):
        Call(fail, nothing).result()


def test_the_work_has_a_thread_of_its_own_that_ends_with_the_call() -> None:
    threads = threading.enumerate()
    seen = Call(lambda stopping: threading.current_thread(), nothing).result()
    assert seen not in threads
    seen.join(60)
    assert not seen.is_alive()


def test_the_threads_of_the_host_get_all_its_signals() -> None:
    blocked = Call(lambda stopping: signal.pthread_sigmask(signal.SIG_BLOCK, []), nothing).result()
    assert {signal.SIGINT, signal.SIGTERM, signal.SIGCHLD, signal.SIGUSR1} <= blocked
    assert WAKE_UP not in blocked


def test_a_call_ends_after_its_timeout() -> None:
    with pytest.raises(TimeoutError):
        Call(until_stopped, nothing).result(timeout=0.01)


def test_a_cancelled_call_has_no_result() -> None:
    call = Call(until_stopped, nothing)
    with meanwhile(call.cancel):
        with pytest.raises(CallCancelled):
            call.result()


def test_a_call_can_be_cancelled_before_it_is_made() -> None:
    call = Call(until_stopped, nothing)
    call.cancel()
    with pytest.raises(CallCancelled):
        call.result()


def test_work_that_has_not_begun_when_the_call_ends_does_not_begin(
    monkeypatch: pytest.MonkeyPatch,
) -> None:
    ended = threading.Event()
    threads: list[threading.Thread] = []
    done: list[object] = []

    def begin_late(how: int, mask: set[signal.Signals]) -> None:
        threads.append(threading.current_thread())
        ended.wait()

    monkeypatch.setattr(signal, "pthread_sigmask", begin_late)
    call = Call(done.append, nothing)
    call.cancel()
    with pytest.raises(CallCancelled):
        call.result()
    wait_until(lambda: bool(threads))
    ended.set()
    threads[0].join()
    assert done == []


def test_a_cancel_that_is_lost_is_repeated() -> None:
    cancels = threading.Semaphore(0)

    def work(stopping: threading.Event) -> None:
        for _ in range(3):
            cancels.acquire()

    with pytest.raises(TimeoutError):
        Call(work, cancels.release).result(timeout=0.01)


# The library looks whether it was cancelled when its system call ends.
def test_a_system_call_of_the_work_is_woken_up() -> None:
    def work(stopping: threading.Event) -> None:
        begun.set()
        ctypes.CDLL(None).pause()

    prepare_wake_up()
    begun = threading.Event()
    call = Call(work, nothing)
    with meanwhile(begun.wait, call.cancel):
        with pytest.raises(CallCancelled):
            call.result()


def test_what_a_signal_handler_raises_ends_the_call() -> None:
    begun = threading.Event()

    def work(stopping: threading.Event) -> None:
        begun.set()
        stopping.wait()

    def interrupt() -> None:
        begun.wait()
        os.kill(os.getpid(), signal.SIGINT)

    with meanwhile(interrupt):
        with pytest.raises(KeyboardInterrupt):
            Call(work, nothing).result()


DISPOSITION = """
import signal, threading
from raidinstrumentation.calls import WAKE_UP, prepare_wake_up

caught = []
{before}
prepare_wake_up()
signal.pthread_kill(threading.get_ident(), WAKE_UP)
with open("/proc/self/status", encoding="ascii") as status:
    (handled,) = (int(line.split()[1], 16) for line in status if line.startswith("SigCgt:"))
print(bool(handled & 1 << WAKE_UP - 1), caught)
"""


@pytest.mark.parametrize(
    ("before", "caught"),
    [
        ("", "True []"),
        ("signal.signal(WAKE_UP, signal.SIG_IGN)", "True []"),
        ("signal.signal(WAKE_UP, lambda number, frame: caught.append(int(number)))", "True [23]"),
    ],
    ids=["no handler", "ignored", "handler of the host"],
)
def test_a_handler_of_the_host_is_kept(before: str, caught: str) -> None:
    program = DISPOSITION.format(before=before)
    output = subprocess.run([sys.executable, "-c", program], capture_output=True, check=True)
    assert output.stdout.decode().strip() == caught


def test_a_second_interruption_waits_for_nothing() -> None:
    begun, released = threading.Event(), threading.Event()

    def work(stopping: threading.Event) -> None:
        begun.set()
        released.wait()

    def interrupt_twice() -> None:
        begun.wait()
        os.kill(os.getpid(), signal.SIGINT)
        assert interrupted.wait(60)
        os.kill(os.getpid(), signal.SIGINT)

    interrupted = threading.Event()
    with meanwhile(interrupt_twice):
        with pytest.raises(KeyboardInterrupt):
            Call(work, interrupted.set).result()
    released.set()
