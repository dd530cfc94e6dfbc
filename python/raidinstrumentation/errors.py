"""What can go wrong, each as an exception of its own."""

_SERVICE = "the RAID management service on 127.0.0.1 port 34572"


class RAIDError(Exception):
    """Any failure of this package."""


class LibraryUnusable(RAIDError):
    """The library cannot be loaded, or lacks something that it should export."""


class LibraryNotFound(LibraryUnusable):
    """There is no library where it was looked for."""


class ServiceUnavailable(RAIDError):
    """The service is not reached, closes without an answer, stays silent, or went away."""

    def __init__(self, problem: str = "does not answer") -> None:
        super().__init__(f"{_SERVICE} {problem}")


class MalformedAnswer(RAIDError):
    """The service answers, and the library cannot read it; its log may say where."""

    def __init__(self) -> None:
        super().__init__(f"the answer of {_SERVICE} is malformed")


class EventLogRestarted(RAIDError):
    """The service counts its events anew, so that a number says no longer what comes after it.

    It has another event with a number that was seen, or its newest event has a lower number than
    one seen before and it knows none of those seen. Whether old events are among those that it has
    now only the caller can decide.
    """

    def __init__(self, newest: int, seen: int) -> None:
        super().__init__(
            f"the service counts its events anew: the newest has number {newest},"
            f" and those up to {seen} that were seen before are gone"
        )
        self.newest = newest
        self.seen = seen
