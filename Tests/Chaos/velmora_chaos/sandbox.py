# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What the scripts of this folder share: the programs in a directory of their own, and waiting for them."""

import os
import queue
import subprocess
import threading
import time

SOURCE = os.path.abspath(os.path.join(os.path.dirname(__file__), "..", "..", ".."))


class Problem(Exception):
    """What a check found wrong."""


def expect(holds, what):
    if not holds:
        raise Problem(what)


def wait_for(what, condition, limit_s=30):
    """What the condition gives, once it gives something."""
    end = time.monotonic() + limit_s
    while time.monotonic() < end:
        found = condition()
        if found:
            return found
        time.sleep(0.005)
    raise Problem(f"waited {limit_s} s in vain for {what}")


def resident_kib(process):
    with open(f"/proc/{process.pid}/status", encoding="ascii") as status:
        for line in status:
            if line.startswith("VmRSS:"):
                return int(line.split()[1])
    return 0


class Lines:
    """The lines that a process writes, each with the time when it was read."""

    def __init__(self, stream):
        self.all = []
        self._fresh = queue.SimpleQueue()
        self._thread = threading.Thread(target=self._read, args=(stream,), daemon=True)
        self._thread.start()

    def _read(self, stream):
        for line in stream:
            entry = (time.monotonic(), line.rstrip("\n"))
            self.all.append(entry)
            self._fresh.put(entry)
        self._fresh.put(None)

    def join(self):
        self._thread.join()

    def next(self, limit_s):
        """The next line that has not been asked for; none when the process has ended or nothing came."""
        try:
            return self._fresh.get(timeout=max(0.001, limit_s))
        except queue.Empty:
            return None

    def count(self, text):
        return sum(text in line for _, line in self.all)


class House:
    """Where a service and its clients meet. Ends what it started."""

    def __init__(self, build, directory):
        self.build = build
        self.directory = directory
        self.ports = os.path.join(directory, "ports")
        os.makedirs(self.ports, mode=0o700, exist_ok=True)
        self.environment = dict(
            os.environ,
            VELMORA_PORT_DIR=self.ports,
            VELMORA_RESOURCES=os.path.join(SOURCE, "Resources"),
            VELMORA_REDUCED_MOTION="1",
            XDG_STATE_HOME=os.path.join(directory, "state"),
            XDG_CONFIG_HOME=os.path.join(directory, "config"),
            QT_QPA_PLATFORM="offscreen",
            QT_QPA_PLATFORMTHEME="",
        )
        for name in ("VELMORA_SYSROOT", "VELMORA_SOURCE", "VELMORA_LOG_DIRECTORY"):
            self.environment.pop(name, None)
        self._started = []

    def __enter__(self):
        return self

    def __exit__(self, *_):
        for process in self._started:
            if process.poll() is None:
                process.kill()
            process.wait()

    def start(self, program, *arguments, **options):
        process = subprocess.Popen(
            [os.path.join(self.build, program), *arguments], env=self.environment, text=True, **options
        )
        self._started.append(process)
        return process

    def port(self, name="com.velmora.vox.server"):
        return os.path.join(self.ports, name)

    def service(self, source, wait=True):
        """A running service; its lines are in `lines`."""
        service = self.start(
            "velmora-telephonyd", "--source", source, stderr=subprocess.PIPE, stdout=subprocess.DEVNULL
        )
        service.lines = Lines(service.stderr)
        if wait:
            wait_for("the service", lambda: service.lines.count("serving "))
        return service

    def screen(self):
        """The application with an observer; what that prints is in `lines`."""
        screen = self.start("tests/screen-probe", stdout=subprocess.PIPE, stderr=subprocess.DEVNULL)
        screen.lines = Lines(screen.stdout)
        return screen

    def watch(self):
        watch = self.start("velmora-log", "watch", stdout=subprocess.PIPE, stderr=subprocess.DEVNULL)
        watch.lines = Lines(watch.stdout)
        return watch


def end_cleanly(*processes):
    """Tells them to end, which they are to do well."""
    for process in processes:
        expect(process.poll() is None, f"{process.args[0]} has ended with {process.returncode}")
        process.terminate()
        expect(process.wait(30) == 0, f"{process.args[0]} ended with {process.returncode}")


def redraws(screen):
    """(when, lateness in ms, memory in KiB) of each redraw so far."""
    found = []
    for _, line in list(screen.lines.all):
        words = line.split()
        if words and words[0] == "redraw":
            found.append((float(words[1]), float(words[2]), int(words[3])))
    return found


def next_event(screen, name, limit_s, since=0):
    """When the application's next event of that name was, which must come in time; earlier ones are passed over."""
    end = time.monotonic() + limit_s
    while True:
        entry = screen.lines.next(end - time.monotonic())
        if entry is None:
            raise Problem(f"no {name} within {limit_s} s")
        words = entry[1].split()
        if words[0] == name and float(words[1]) >= since:
            return float(words[1])
