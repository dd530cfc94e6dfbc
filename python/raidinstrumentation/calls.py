"""Calls that block in the library, made so that they can be ended at any time.

A thread that waits in the library runs no Python, so no signal handler of Python either. The call is
therefore made on a thread of its own, while the caller waits where Ctrl-C and other signals reach it.
"""

import ctypes
import math
import queue
import signal
import threading
import time
from collections.abc import Callable
from enum import Enum, auto
from typing import Generic, TypeVar

# Ends the 5 seconds for which the library looks at its connection alone. Nobody is disturbed by a
# signal that is ignored unless somebody asks for it.
WAKE_UP = signal.SIGURG
# The host's signals are for the host's threads; faults of the thread itself are its own.
_UNBLOCKED = {WAKE_UP, signal.SIGSEGV, signal.SIGBUS, signal.SIGFPE, signal.SIGILL}
_CANCEL_INTERVAL = 0.02
# A signal that arrives just before Python begins to wait has its handler run just after the wait.
_SIGNAL_INTERVAL = 1.0

Result = TypeVar("Result")


class CallCancelled(Exception):
    """The call was cancelled before it had a result."""


class _Message(Enum):
    FINISHED = auto()
    CANCELLED = auto()


class Call(Generic[Result]):
    """One call. The work gets an event that is set when it should come to its end."""

    def __init__(
        self, work: Callable[[threading.Event], Result], interrupt: Callable[[], None]
    ) -> None:
        """The interrupt is called again and again to end what the work waits for."""
        self._work = work
        self._interrupt = interrupt
        self._messages: queue.SimpleQueue[_Message] = queue.SimpleQueue()
        self._stopping = threading.Event()
        self._finished = threading.Event()
        self._state = threading.Lock()
        self._at_work = False
        self._results: list[Result] = []
        self._error: BaseException | None = None
        self._thread = threading.Thread(target=self._run, name="raidinstrumentation", daemon=True)

    def result(self, timeout: float | None = None) -> Result:
        """Makes the call and returns its result.

        Raises what the work raised, TimeoutError after so many seconds, CallCancelled after cancel,
        and whatever a signal handler raises meanwhile. In each case the work has ended then, unless
        a second exception comes while it is being ended.
        """
        try:
            self._thread.start()
            message = self._first_message(timeout)
        finally:
            self._end()
        if message is _Message.CANCELLED:
            raise CallCancelled
        if self._error is not None:
            raise self._error
        return self._results[0]

    def cancel(self) -> None:
        """Ends the call; from any thread, also in a signal handler."""
        self._messages.put(_Message.CANCELLED)

    def _first_message(self, timeout: float | None) -> _Message:
        deadline = math.inf if timeout is None else time.monotonic() + timeout
        while (left := deadline - time.monotonic()) > 0:
            try:
                return self._messages.get(timeout=min(left, _SIGNAL_INTERVAL))
            except queue.Empty:
                pass
        raise TimeoutError

    def _run(self) -> None:
        signal.pthread_sigmask(signal.SIG_SETMASK, signal.valid_signals() - _UNBLOCKED)
        with self._state:
            if self._stopping.is_set():
                return
            self._at_work = True
        try:
            self._results.append(self._work(self._stopping))
        except BaseException as error:  # whatever it is, the caller gets it
            self._error = error
        with self._state:
            self._at_work = False
        self._finished.set()
        self._messages.put(_Message.FINISHED)

    def _end(self) -> None:
        with self._state:
            self._stopping.set()
        while self._wake_up():
            self._finished.wait(_CANCEL_INTERVAL)

    def _wake_up(self) -> bool:
        """Has the work look up from its wait; tells whether there was still any."""
        with self._state:
            # Afterwards there may be no such thread any more.
            if self._at_work and self._thread.ident is not None:
                self._interrupt()
                signal.pthread_kill(self._thread.ident, WAKE_UP)
            return self._at_work


class _SignalAction(ctypes.Structure):
    _fields_ = [("handler", ctypes.c_void_p), ("rest", ctypes.c_char * 256)]


def prepare_wake_up() -> None:
    """Gives the signal a handler that does nothing, unless it has one of the host's.

    A handler in Python would need the main thread, to be installed and to run.
    """
    c_library = ctypes.CDLL(None)
    present = _SignalAction()
    c_library.sigaction(int(WAKE_UP), None, ctypes.byref(present))
    if present.handler in (None, int(signal.SIG_IGN)):
        # As far as a signal handler goes, abs does nothing.
        does_nothing = ctypes.cast(c_library.abs, ctypes.c_void_p)
        c_library.signal.argtypes = (ctypes.c_int, ctypes.c_void_p)
        c_library.signal.restype = ctypes.c_void_p
        c_library.signal(int(WAKE_UP), does_nothing)
