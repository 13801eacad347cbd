# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A private environment in which a telephony service and its clients run together."""

import os
import subprocess
from pathlib import Path
from types import TracebackType

from velmora_chaos.checks import wait_for
from velmora_chaos.program import Program

SOURCE = Path(__file__).resolve().parents[3]
RECORDINGS = SOURCE / "Tests" / "Recordings"
SERVER_PORT = "com.velmora.vox.server"
APPLICATION_PORT = "com.velmora.BasebandStateReport.LogChannel"
LOAD = "scenario:gsm,seed=1,speed=100"
DISPLAY = "Updated "  # begins each display of a watch


class Sandbox:
    """Directories for ports, state and configuration; leaving it kills every program that it started."""

    def __init__(self, build: Path, directory: Path) -> None:
        self._build = build
        self._started: list[Program] = []
        self._ports = directory / "ports"
        self._ports.mkdir(mode=0o700, parents=True, exist_ok=True)
        self.environment = dict(
            os.environ,
            VELMORA_PORT_DIR=str(self._ports),
            VELMORA_RESOURCES=str(SOURCE / "Resources"),
            VELMORA_REDUCED_MOTION="1",
            XDG_STATE_HOME=str(directory / "state"),
            XDG_CONFIG_HOME=str(directory / "config"),
            QT_QPA_PLATFORM="offscreen",
            QT_QPA_PLATFORMTHEME="",
        )
        for name in ("VELMORA_SYSROOT", "VELMORA_SOURCE", "VELMORA_LOG_DIRECTORY"):
            self.environment.pop(name, None)

    def __enter__(self) -> "Sandbox":
        return self

    def __exit__(
        self, kind: type[BaseException] | None, error: BaseException | None, trace: TracebackType | None
    ) -> None:
        self.close()

    def close(self) -> None:
        """Kills what still runs."""
        for program in self._started:
            program.kill()
        self._started.clear()

    def port(self, name: str = SERVER_PORT) -> Path:
        """The socket of a port."""
        return self._ports / name

    def ports(self, pattern: str = "*") -> list[Path]:
        """The sockets that exist now."""
        return sorted(self._ports.glob(pattern))

    def service(self, source: str, wait: bool = True) -> Program:
        """The telephony service; its standard error is read. With `wait`, returns once it serves."""
        service = self._start("velmora-telephonyd", "--source", source, "--log-level", "5", reads_errors=True)
        if wait:
            wait_for("the service", lambda: service.lines.count("serving "))
        return service

    def screen(self) -> Program:
        """The application with the probe that prints its redraws."""
        return self._start("tests/screen-probe")

    def watch(self) -> Program:
        """A live display on a pipe."""
        return self._start("velmora-log", "watch")

    def start_closed(self, program: str, *arguments: str) -> Program:
        """A program with the descriptors 0 to 2 closed."""
        process = subprocess.Popen(
            ["/bin/sh", "-c", 'exec "$@" <&- >&- 2>&-', "sh", str(self._build / program), *arguments],
            env=self.environment,
            text=True,
            stdout=subprocess.PIPE,
        )
        assert process.stdout is not None
        started = Program(process, process.stdout)
        self._started.append(started)
        return started

    def recorder(self, file: Path, *options: str) -> Program:
        """A recorder into that file; its standard error is read."""
        return self._start("velmora-log", "record", *options, str(file), reads_errors=True)

    def _start(self, program: str, *arguments: str, reads_errors: bool = False) -> Program:
        process = subprocess.Popen(
            [str(self._build / program), *arguments],
            env=self.environment,
            text=True,
            errors="replace",  # a killed program may have written half a character
            stdout=subprocess.DEVNULL if reads_errors else subprocess.PIPE,
            stderr=subprocess.PIPE if reads_errors else subprocess.DEVNULL,
        )
        stream = process.stderr if reads_errors else process.stdout
        assert stream is not None
        started = Program(process, stream)
        self._started.append(started)
        return started
