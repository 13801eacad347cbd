# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A program under test: its process, its output, its memory, how it ends."""

import re
import signal
import subprocess
from pathlib import Path
from typing import IO

from velmora_chaos.checks import expect
from velmora_chaos.lines import Lines

END_S = 30


class Program:
    """A running program; `lines` is the one stream of its output that is read."""

    def __init__(self, process: subprocess.Popen[str], stream: IO[str]) -> None:
        self.name = Path(str(process.args[0] if isinstance(process.args, list) else process.args)).name
        self.lines = Lines(stream)
        self._process = process
        self._stream = stream

    def resident_kib(self) -> int:
        """Resident memory; 0 after the program has ended."""
        return process_resident_kib(self._process.pid)

    def send_signal(self, number: signal.Signals) -> None:
        """Sends a signal to the program."""
        self._process.send_signal(number)

    def wait(self) -> int:
        """Its exit status, once it has ended by itself."""
        return self._process.wait(END_S)

    def kill(self) -> None:
        """Ends the program with SIGKILL if it still runs, and releases its process and its output."""
        if self._process.poll() is None:
            self._process.kill()
        self._process.wait()
        self.lines.join()
        self._stream.close()

    def end_cleanly(self) -> None:
        """Sends SIGTERM; raises Problem unless the program was running and then exits with status 0."""
        self.end_with(0)

    def end_with(self, wanted: int) -> None:
        """As `end_cleanly`, with another exit status."""
        status = self._process.poll()
        expect(status is None, f"{self.name} has already ended with {status}")
        self._process.terminate()
        status = self._process.wait(END_S)
        expect(status == wanted, f"{self.name} ended with {status} on SIGTERM, wanted {wanted}")

    def wait_for_end(self, wanted: int) -> None:
        """Waits until the program ends by itself; raises Problem for another exit status."""
        status = self._process.wait(END_S)
        expect(status == wanted, f"{self.name} ended with {status}, wanted {wanted}")


def process_resident_kib(pid: int) -> int:
    """Resident memory of a process; 0 for one that has ended."""
    try:
        return parse_resident_kib(Path(f"/proc/{pid}/status").read_text(encoding="ascii"))
    except (FileNotFoundError, ProcessLookupError):
        return 0


def parse_resident_kib(status: str) -> int:
    """The VmRSS line of /proc/PID/status; 0 without one, as for a zombie."""
    found = re.search(r"^VmRSS:\s*(\d+) kB$", status, re.MULTILINE)
    return int(found[1]) if found else 0
