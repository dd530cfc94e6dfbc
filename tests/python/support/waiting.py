"""Waiting for something that nothing announces."""

import time
from collections.abc import Callable

PATIENCE = 60.0
_PAUSE = 0.01


def wait_until(condition: Callable[[], bool]) -> None:
    """Looks again and again; fails the test after a minute."""
    deadline = time.monotonic() + PATIENCE
    while not condition():
        assert time.monotonic() < deadline, "waited in vain"
        time.sleep(_PAUSE)
