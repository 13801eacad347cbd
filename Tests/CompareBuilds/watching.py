# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""`watch` on a pipe: the display that it shows last of a recording that the telephony service has replayed.

When refreshes come depends on the machine, so that those before are not compared: the service plays as fast as its
client takes the messages, and the display that stays is the same however they fell.
"""

import re
import subprocess
import tempfile
import time
from pathlib import Path

from .running import ADDRESS, environment

UPDATED = re.compile(rb"^Updated \d{4}-\d\d-\d\d at \d\d:\d\d:\d\d$", re.MULTILINE)
# Refreshes are 2 s apart: a display that has stayed for longer than two of them is the last.
QUIET_S = 5.0
LIMIT_S = 120.0


class Problem(Exception):
    """What keeps a display from being compared."""


def wait_for(what: str, path: Path, text: bytes) -> None:
    end = time.monotonic() + LIMIT_S
    while text not in path.read_bytes():
        if time.monotonic() > end:
            raise Problem(f"waited {LIMIT_S:.0f} s in vain for {what}: {path.read_bytes()[-500:]!r}")
        time.sleep(0.05)


def wait_until_quiet(path: Path) -> None:
    end = time.monotonic() + LIMIT_S
    size, since = -1, time.monotonic()
    while time.monotonic() - since < QUIET_S:
        if path.stat().st_size != size:
            size, since = path.stat().st_size, time.monotonic()
        if time.monotonic() > end:
            raise Problem("the display does not come to rest")
        time.sleep(0.1)


def last_display(build: Path, recording: Path) -> bytes:
    """The last display, and after it standard error and the exit status."""
    with tempfile.TemporaryDirectory(prefix="compare-builds-") as name:
        directory = Path(name)
        ports = directory / "ports"
        ports.mkdir(mode=0o700)
        told, display, errors = directory / "service", directory / "display", directory / "errors"
        own = environment(VELMORA_PORT_DIR=str(ports))
        processes: list[subprocess.Popen[bytes]] = []
        try:
            service = [str(build / "velmora-telephonyd"), "--source", f"replay:{recording},speed=max",
                       "--log-level", "5"]
            with told.open("wb") as file:
                processes.append(subprocess.Popen(service, stdout=subprocess.DEVNULL, stderr=file, env=own))
            wait_for("the service", told, b"serving ")
            with errors.open("wb") as file:
                watch = subprocess.Popen([build / "velmora-log", "watch"], stdin=subprocess.DEVNULL,
                                         stdout=subprocess.PIPE, stderr=file, env=own)
            processes.append(watch)
            with display.open("wb") as file:
                processes.append(subprocess.Popen(["cat"], stdin=watch.stdout, stdout=file))
            wait_for("the end of the recording", told, b"played to the end")
            wait_until_quiet(display)
            watch.terminate()
            status = watch.wait(30)
            processes[-1].wait(30)
        finally:
            for process in processes:
                if process.poll() is None:
                    process.kill()
                process.wait()
        shown = UPDATED.split(display.read_bytes())
        if len(shown) < 2:
            raise Problem(f"{build}: watch has shown no display of {recording}")
        return b"\n".join([shown[-1], ADDRESS.sub(b"ADDRESS", errors.read_bytes()), b"exit status %d" % status])
