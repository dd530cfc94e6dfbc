"""Asking for the inventory, and telling why there is none."""

import threading
from typing import Any

from .errors import MalformedAnswer, ServiceUnavailable
from .inventory import KINDS, Inventory
from .library import Library
from .text import TextBuffer

# The service may have come up after the first.
_ATTEMPTS = 2


def read_inventory(library: Library, stopping: threading.Event) -> Inventory:
    """Asks the service for its configuration.

    Once stopping is set the result means nothing.
    """
    with library.inventory_turn(stopping):
        _ask(library, stopping)
        with TextBuffer() as buffer:
            return _published(library, buffer)


def _published(library: Library, buffer: TextBuffer) -> Inventory:
    lists: dict[str, Any] = {
        key: tuple(
            kind(position=position, **fields)
            for position, fields in enumerate(library.read(kind, buffer))
        )
        for key, kind in KINDS.items()
    }
    return Inventory(**lists)


def _ask(library: Library, stopping: threading.Event) -> None:
    attempts = 0
    while attempts < _ATTEMPTS and not stopping.is_set():
        cancels = library.cancels
        if library.ask_for_configuration():
            return
        # That nothing came tells nothing after a cancel, be it that of another call.
        if library.cancels == cancels:
            attempts += 1
            if library.newest_event(stopping) is None:
                raise ServiceUnavailable
    raise MalformedAnswer
