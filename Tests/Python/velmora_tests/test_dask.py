# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A cluster of two workers on this machine."""

from __future__ import annotations

import os
import signal
import subprocess
import tempfile
import threading
import time
import unittest
from pathlib import Path

import dask
from distributed import Client, LocalCluster

import velmora
import velmora.dask

RECORDINGS = Path(os.environ["VELMORA_RECORDINGS"])
FILES = int(os.environ.get("VELMORA_FLEET_FILES", "40"))
MESSAGES = 400
RSSI = "/GSM/GSM Serving Cell/RSSI"
SCENARIOS = ("gsm", "lte", "utran", "c2k", "ifx")


def make_fleet(directory: Path, count: int) -> list[Path]:
    make_drive = Path(os.environ["VELMORA_LOG"]).parent / "tests" / "make-drive"
    files = []
    for number in range(count):
        scenario = SCENARIOS[number % len(SCENARIOS)]
        files.append(directory / f"{number:04}-{scenario}.pcapng")
        subprocess.run([make_drive, scenario, str(number + 1), str(MESSAGES), files[-1]], check=True)
    return files


def content_of(directory: Path, *, hidden: bool = False) -> dict[str, bytes]:
    return {str(path.relative_to(directory)): path.read_bytes() for path in directory.rglob("*")
            if path.is_file() and path.name.startswith(".") == hidden}


class ClusterTest(unittest.TestCase):
    def setUp(self) -> None:
        self.directory = Path(self.enterContext(tempfile.TemporaryDirectory()))
        dask.config.set({"distributed.worker.use-file-locking": False, "temporary-directory": str(self.directory)})
        cluster = self.enterContext(LocalCluster(n_workers=2, threads_per_worker=1, processes=True,
                                                 dashboard_address=None, host="127.0.0.1"))
        self.client = self.enterContext(Client(cluster))

    def kill_one_when(self, out: Path, wanted: int) -> tuple[threading.Thread, list[int]]:
        """Kills a worker and what it runs once so many files are there. Returns what it killed."""
        processes = list(self.client.run(os.getpid).values())
        killed: list[int] = []

        def kill() -> None:
            while len(list((out / "files").rglob("*.parquet"))) < wanted:
                time.sleep(0.005)
            children = subprocess.run(["ps", "-o", "pid=", "--ppid", str(processes[0])], stdout=subprocess.PIPE,
                                      encoding="ascii", check=False).stdout.split()
            for process in (processes[0], *map(int, children)):
                try:
                    os.kill(process, signal.SIGKILL)
                    killed.append(process)
                except ProcessLookupError:
                    pass

        thread = threading.Thread(target=kill)
        thread.start()
        return thread, killed

    def test_columns_survive_the_loss_of_a_worker(self) -> None:
        files = make_fleet(self.directory, FILES)
        serial, spread = self.directory / "serial", self.directory / "spread"
        subprocess.run([os.environ["VELMORA_LOG"], "columns", "--out", serial, *files], stdout=subprocess.DEVNULL,
                       stderr=subprocess.DEVNULL, check=False)
        killer, killed = self.kill_one_when(spread, FILES // 4)
        reports = velmora.dask.columns(files, spread, client=self.client)
        killer.join()
        self.assertTrue(killed)
        self.assertEqual([report.file for report in reports], [str(path) for path in files])
        self.assertEqual([report for report in reports if not report.text.startswith(("written", "there already"))], [])
        expected = content_of(serial)
        self.assertEqual(len([name for name in expected if name.startswith("files/")]), FILES)
        found = content_of(spread)
        self.assertEqual(found.keys(), expected.keys())
        self.assertEqual([name for name in expected if found[name] != expected[name]], [])
        print(f"{FILES} files, {len(expected)} tables; killed {len(killed)} processes, "
              f"{len(content_of(spread, hidden=True))} hidden files left")

    def test_frames_are_those_of_the_files(self) -> None:
        files = [path for path in make_fleet(self.directory, 6) if "gsm" in path.name]
        frame = velmora.dask.samples(files, {"level": RSSI}, losses="warn").compute()
        single = [velmora.samples(path, {"level": RSSI}, losses="warn") for path in files]
        self.assertEqual(list(frame["level"]), [level for each in single for level in each["level"]])
        self.assertEqual(list(frame["file"]), [name for each in single for name in each["file"]])
        self.assertEqual(frame["time"].iloc[0], single[0]["time"].iloc[0])

    def test_bags_hold_the_samples(self) -> None:
        files = [path for path in make_fleet(self.directory, 6) if "gsm" in path.name]
        levels = velmora.dask.bag(files, {"level": RSSI}, losses="warn").pluck("value").compute()
        single = [velmora.samples(path, {"level": RSSI}, losses="warn") for path in files]
        self.assertEqual(levels, [level for each in single for level in each["level"]])

    def test_events_are_those_of_each_file(self) -> None:
        files = [path for path in make_fleet(self.directory, 6) if "gsm" in path.name]
        frame = velmora.dask.events(files, losses="warn").compute()
        single = [velmora.events(path, losses="warn") for path in files]
        self.assertEqual(list(frame["text"]), [text for each in single for text in each["text"]])


if __name__ == "__main__":
    unittest.main()
