# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Reads the output of a running program on a thread of its own."""

import queue
import threading
import time
from collections.abc import Iterable
from dataclasses import dataclass


@dataclass(frozen=True)
class Line:
    """A line without its end, and the monotonic time at which it was read."""

    when_s: float
    text: str


class Lines:
    """All lines that a stream has delivered so far.

    The reader thread alone appends; the other methods may be called from one thread at a time.
    """

    def __init__(self, stream: Iterable[str]) -> None:
        self._all: list[Line] = []
        self._unread: queue.SimpleQueue[Line | None] = queue.SimpleQueue()
        self._thread = threading.Thread(target=self._read, args=(stream,), daemon=True)
        self._thread.start()

    def _read(self, stream: Iterable[str]) -> None:
        for text in stream:
            line = Line(time.monotonic(), text.rstrip("\n"))
            self._all.append(line)
            self._unread.put(line)
        self._unread.put(None)

    def join(self, limit_s: float = 5) -> None:
        """Waits until the stream has ended and all of it is read."""
        self._thread.join(limit_s)

    def all(self) -> list[Line]:
        """A copy of the lines so far."""
        return list(self._all)

    def next(self, limit_s: float) -> Line | None:
        """The next line that was not returned yet; None at the end of the stream or after the time-out."""
        try:
            return self._unread.get(timeout=max(0.001, limit_s))
        except queue.Empty:
            return None

    def count(self, text: str) -> int:
        """The number of lines so far that contain the text."""
        return sum(text in line.text for line in self.all())
