"""Something that happens to a test while it waits."""

import threading
from collections.abc import Callable, Iterator
from contextlib import contextmanager


@contextmanager
def meanwhile(*steps: Callable[[], object]) -> Iterator[None]:
    """Carries out the steps on another thread; a step that fails fails the test."""
    failures: list[BaseException] = []

    def carry_out() -> None:
        try:
            for step in steps:
                step()
        except BaseException as failure:
            failures.append(failure)

    thread = threading.Thread(target=carry_out)
    thread.start()
    try:
        yield
    finally:
        thread.join()
    for failure in failures:
        raise failure
