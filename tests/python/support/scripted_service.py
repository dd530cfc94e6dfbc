"""A service that answers what a test says."""

import contextlib
import re
import socket
import threading
from collections import defaultdict
from enum import Enum, auto
from types import TracebackType

from .waiting import PATIENCE

_ADDRESS = ("127.0.0.1", 34572)
_LENGTH = re.compile(rb"Content-Length: *(\d+)")


class Manner(Enum):
    """How a connection ends on which there is no answer."""

    CLOSE = auto()
    HOLD = auto()
    """It stays open until the client closes it, or the service ends."""


Reply = str | bytes | Manner
Replies = tuple[Reply, ...]

_KINDS = {
    b"getConfig": "config",
    b"m:getNewestEvent": "newest",
    b"m:waitNextEvent": "wait",
    b"m:getEvents": "events",
}


class ScriptedService:
    """Answers each kind of request with the replies for it in turn, with the last again and again.

    A request without a reply fails the test.
    """

    def __init__(
        self,
        *,
        config: Replies = (),
        newest: Replies = (),
        wait: Replies = (),
        events: Replies = (),
    ) -> None:
        self._replies = {"config": config, "newest": newest, "wait": wait, "events": events}
        self._requests: dict[str, list[str]] = defaultdict(list)
        self._connections: list[socket.socket] = []
        self._failures: list[BaseException] = []
        self._progress = threading.Condition()
        self._listener = socket.create_server(_ADDRESS)
        self._threads = [threading.Thread(target=self._accept)]
        self._threads[0].start()

    def __enter__(self) -> "ScriptedService":
        return self

    def __exit__(
        self,
        kind: type[BaseException] | None,
        error: BaseException | None,
        traceback: TracebackType | None,
    ) -> None:
        self._listener.shutdown(socket.SHUT_RDWR)
        self._threads[0].join()
        self._listener.close()
        for connection in self._connections:
            with contextlib.suppress(OSError):
                connection.shutdown(socket.SHUT_RDWR)
        for thread in self._threads[1:]:
            thread.join()
        if kind is None:
            for failure in self._failures:
                raise failure

    def requests(self, kind: str) -> list[str]:
        """The requests of a kind that came so far."""
        with self._progress:
            return list(self._requests[kind])

    def wait_for(self, kind: str, count: int = 1) -> None:
        """Returns once so many requests of a kind have been read."""
        with self._progress:
            assert self._progress.wait_for(lambda: len(self._requests[kind]) >= count, PATIENCE)

    def _accept(self) -> None:
        # accept fails once the listener is shut down.
        with contextlib.suppress(OSError):
            while True:
                connection, _ = self._listener.accept()
                self._connections.append(connection)
                self._threads.append(threading.Thread(target=self._serve, args=[connection]))
                self._threads[-1].start()

    def _serve(self, connection: socket.socket) -> None:
        try:
            with connection:
                self._answer(connection, self._reply_to(_read_request(connection)))
        except OSError:
            pass  # the client went away
        except BaseException as failure:
            self._failures.append(failure)

    def _reply_to(self, request: bytes) -> Reply:
        kind = next(kind for mark, kind in _KINDS.items() if mark in request)
        replies = self._replies[kind]
        with self._progress:
            self._requests[kind].append(request.decode())
            self._progress.notify_all()
            assert replies, f"nobody expects {request!r}"
            return replies[min(len(self._requests[kind]), len(replies)) - 1]

    def _answer(self, connection: socket.socket, reply: Reply) -> None:
        if reply is Manner.HOLD:
            connection.recv(1)
        elif reply is not Manner.CLOSE:
            body = reply.encode() if isinstance(reply, str) else reply
            connection.sendall(b"HTTP/1.1 200 OK\nContent-Length: %d\n\n" % len(body) + body)


def _read_request(connection: socket.socket) -> bytes:
    request = b""
    while (end := _end_of_request(request)) is None or len(request) < end:
        part = connection.recv(4096)
        if not part:
            raise ConnectionError
        request += part
    return request


def _end_of_request(request: bytes) -> int | None:
    header, separator, _ = request.replace(b"\r\n", b"\n").partition(b"\n\n")
    if not separator:
        return None
    length = _LENGTH.search(header)
    return len(header) + len(separator) + int(length[1]) if length else 0
