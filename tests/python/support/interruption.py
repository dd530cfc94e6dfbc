"""Something that happens to a test while it waits."""

import signal
import threading
from collections.abc import Callable, Iterator
from concurrent.futures import Future
from contextlib import contextmanager
from typing import TypeVar

Result = TypeVar("Result")


def begun(work: Callable[[], Result]) -> Future[Result]:
    """Does the work on another thread, which a test that fails does not wait for."""
    future: Future[Result] = Future()

    def carry_out() -> None:
        try:
            future.set_result(work())
        except BaseException as failure:
            future.set_exception(failure)

    threading.Thread(target=carry_out, daemon=True).start()
    return future


@contextmanager
def meanwhile(*steps: Callable[[], object]) -> Iterator[None]:
    """Carries out the steps on another thread; a step that fails fails the test at once."""
    failures: list[BaseException] = []
    has_begun, turn, is_over = threading.Event(), threading.Lock(), False

    def carry_out() -> None:
        has_begun.wait()
        try:
            for step in steps:
                step()
        except BaseException as failure:
            failures.append(failure)
            with turn:
                # It may be waiting for what the step should have done.
                if not is_over:
                    signal.pthread_kill(threading.main_thread().ident or 0, signal.SIGINT)

    carried_out = begun(carry_out)
    try:
        has_begun.set()
        yield
        with turn:
            is_over = True
        carried_out.result()
    except BaseException:
        if not failures:
            raise
    for failure in failures:
        raise failure
