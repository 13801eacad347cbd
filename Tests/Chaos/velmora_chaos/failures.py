# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Lets every allocation, read, write, sync, rename and opening of a file in decode, convert, info, record
and the application's save fail in turn - once, three times in a row, for good - and looks at what is left.

A run that says it is done has made what it makes without a failure. Any other ends by itself with status 1 and says
why on standard error. A file that was there is whole afterwards, the old one or the new; one that was not is whole
or not there, and nothing else is left beside it.

usage: failures BUILD_DIRECTORY [--all] [--sample N] [--quick] [--only WORD] [--jobs N]

Of the many allocations a sample is taken, spread evenly over the run, unless --all asks for each. --quick takes a
small one, and one error of each kind. Before all this, the programs work in places that are no good: no directory
for ports or files, a full disk, resources that cannot be written.
"""

import argparse
import errno
import os
import shutil
import struct
import subprocess
import sys
import tempfile
import threading
import time
from concurrent.futures import ThreadPoolExecutor

from velmora_chaos.sandbox import SOURCE, House, Problem, expect

RECORDINGS = os.path.join(SOURCE, "Tests", "Recordings")
MODES = {"once": 1, "three": 3, "for good": 0}
ERRORS = {
    "memory": [errno.ENOMEM],
    "read": [errno.EIO],
    "write": [errno.ENOSPC, errno.EIO],
    "sync": [errno.EIO],
    "rename": [errno.EACCES],
    "open": [errno.EACCES, errno.EMFILE],
}
LIMIT_S = 60
OLD = b"what was there before\n"


class Run:
    """What a program did with a failure injected."""

    def __init__(self, status, output, errors, calls, failed):
        self.status = status
        self.output = output
        self.errors = errors
        self.calls = calls
        self.failed = failed


class Case:
    """A program's work. `made` names the file that it writes in its directory, if any."""

    program = "velmora-log"
    kinds = ("memory", "read", "write", "open")
    environment = {}
    made = None
    had = False  # whether the file is there before
    status = 0  # without a failure

    def __init__(self, name, arguments):
        self.name = name
        self.arguments = arguments

    def prepare(self, directory):
        if self.had:
            with open(os.path.join(directory, self.made), "wb") as file:
                file.write(OLD)

    def words(self, directory):
        return [word.replace("@", directory + "/") for word in self.arguments]

    def content(self, directory):
        path = os.path.join(directory, self.made)
        if not os.path.exists(path):
            return None
        with open(path, "rb") as file:
            return file.read()

    def look(self, run, directory, reference):
        """Raises Problem for what should not be."""
        if run.status == 0:
            expect(run.output == reference.output, "said it was done, with another output")
        else:
            expect(run.status == 1, f"ended with {run.status}, wanted 0 or 1")
            expect("velmora-log: " in run.errors, "failed without a word")
        if self.made:
            left = sorted(os.listdir(directory))
            expect(left in ([], [self.made]), f"left {left}")
            self.look_at_file(run, self.content(directory), reference)

    def look_at_file(self, run, content, reference):
        if run.status == 0:
            expect(content == reference.made, "said it was done, with another file")
        else:
            allowed = [OLD if self.had else None, reference.made]
            expect(content in allowed, f"left {0 if content is None else len(content)} bytes that are neither")


class Convert(Case):
    kinds = ("memory", "read", "write", "open", "sync", "rename")

    def __init__(self, source, made, had):
        super().__init__(
            f"convert {source} to {made}{' over another' if had else ''}",
            ["convert", *(["--force"] if had else []), os.path.join(RECORDINGS, source), f"@{made}"],
        )
        self.made = made
        self.had = had
        # A drive has messages that a DLF log cannot hold.
        self.status = 1 if made.endswith(".dlf") else 0


def messages(recording):
    """The packets of a recording, in order; Problem where it does not end with a whole block."""
    found = []
    at = 0
    while at < len(recording):
        expect(at + 12 <= len(recording), "a block is cut off")
        kind, length = struct.unpack_from("<II", recording, at)
        expect(12 <= length <= len(recording) - at and length % 4 == 0, "a block is cut off")
        if kind == 6:
            size = struct.unpack_from("<I", recording, at + 20)[0]
            found.append(recording[at + 28 : at + 28 + size])
        at += length
    return found


class Record(Case):
    """Each run has the service to itself, and so the same drive from its beginning. All of them end by themselves:
    a recorder that cannot make its port tries again every five seconds until it is told to end."""

    kinds = ("memory", "write", "open", "sync")
    # The event loop's other library ends the program by itself where there is no memory.
    environment = {"QT_NO_GLIB": "1"}

    def __init__(self, had, name, limit):
        super().__init__(
            f"record {name}{' over another' if had else ''}",
            ["record", *(["--force"] if had else []), *limit, "@drive.pcapng"],
        )
        self.made = "drive.pcapng"
        self.had = had
        self._local = threading.local()
        self._houses = []
        self.build = None
        self.directory = None

    def house(self):
        if not hasattr(self._local, "house"):
            self._local.house = House(self.build, tempfile.mkdtemp(dir=self.directory))
            self._local.house.service("scenario:gsm,seed=1,speed=20")
            self._houses.append(self._local.house)
        return self._local.house

    def close(self):
        for house in self._houses:
            house.__exit__()

    def look(self, run, directory, reference):
        run.output = reference.output
        super().look(run, directory, reference)

    def look_at_file(self, run, content, reference):
        if content is None or content == OLD:
            expect(run.status != 0, "said it was done, without a recording")
            expect((content == OLD) == self.had, "lost the file that was there")
            return
        expect(len(content) > 0, "left an empty file")
        got = messages(content)
        wanted = messages(reference.made)
        common = min(len(got), len(wanted))
        # What is recorded is the drive from its beginning, without a gap.
        expect(got[:common] == wanted[:common], "the messages are others")
        if run.status == 0:
            expect(common > 0, "said it was done, without a message")


class Save(Case):
    program = "tests/save-once"
    kinds = ("memory", "write", "open")
    environment = {"VELMORA_FAIL_ASKED": "1"}

    def __init__(self):
        super().__init__("save", ["@"])

    def prepare(self, directory):
        with open(os.path.join(directory, "VelmoraSnapshot-1.velmora"), "wb") as file:
            file.write(OLD)

    def look(self, run, directory, reference):
        with open(os.path.join(directory, "VelmoraSnapshot-1.velmora"), "rb") as file:
            expect(file.read() == OLD, "another snapshot has changed")
        made = [name for name in os.listdir(directory) if name != "VelmoraSnapshot-1.velmora"]
        if run.status == 1:
            expect("out of memory" in run.errors, "failed without a word")
            return
        expect(run.status == 0, f"ended with {run.status}, wanted 0 or 1")
        if run.output == "saved; goes on\n":
            expect(len(made) == 1, f"left {made}")
            with open(os.path.join(directory, made[0]), encoding="utf-8") as file:
                expect(file.read().endswith("</plist>\n"), "said it was saved, but it is not whole")
        else:
            expect(run.output == "refused; goes on\n", f"said {run.output!r}")
            expect("<3>Unable to write snapshot to " in run.errors, "nothing in the log")


class Place:
    """Work in a place that is no good, and what the program makes of it. "@" is a directory of the place's own."""

    def __init__(self, name, words, status, errors, environment=None, output=None):
        self.name = name
        self.words = words
        self.status = status
        self.errors = errors
        self.environment = environment or {}
        self.output = output

    def try_it(self, build, directory):
        def placed(word):
            return word.replace("@", directory + "/")

        with open(os.path.join(directory, "file"), "wb") as file:
            file.write(OLD)
        readonly = os.path.join(directory, "resources")
        shutil.copytree(os.path.join(SOURCE, "Resources"), readonly)
        for root, _, names in os.walk(readonly):
            for name in names:
                os.chmod(os.path.join(root, name), 0o400)
            os.chmod(root, 0o500)
        house = House(build, directory)
        environment = dict(house.environment, **{key: placed(word) for key, word in self.environment.items()})
        result = os.path.join(directory, "result")
        with open(result if self.output is None else self.output, "w", encoding="utf-8") as output:
            ended = subprocess.run(
                [os.path.join(build, self.words[0]), *map(placed, self.words[1:])],
                env=environment, stdout=output, stderr=subprocess.PIPE, text=True, timeout=LIMIT_S, check=False,
            )
        said = ended.stderr
        if self.output is None:
            with open(result, encoding="utf-8") as output:
                said += output.read()
        where = f"{self.name}: "
        expect(ended.returncode == self.status, f"{where}ended with {ended.returncode}\n{ended.stderr}")
        for text in self.errors:
            expect(placed(text) in said, f"{where}did not say {placed(text)}\n{ended.stderr}")
        with open(os.path.join(directory, "file"), "rb") as file:
            expect(file.read() == OLD, f"{where}a file has changed")


def places():
    gsm = os.path.join(RECORDINGS, "gsm.pcapng")
    no_ports = {"VELMORA_PORT_DIR": "@file/ports"}
    cannot_be_made = "port directory @file/ports cannot be made: Not a directory"
    missing = "No such file or directory"
    yield Place("service without a port directory", ["velmora-telephonyd", "--source", "scenario:gsm"], 1,
                [cannot_be_made, "velmora-telephonyd: cannot make the port com.velmora.vox.server"], no_ports)
    yield Place("record without a port directory", ["velmora-log", "record", "--duration", "0.3", "@new.pcapng"], 1,
                [cannot_be_made, "velmora-log: nothing was recorded: "], no_ports)
    yield Place("decode to a full disk", ["velmora-log", "decode", gsm], 1,
                ["velmora-log: cannot write standard output: No space left on device"], output="/dev/full")
    yield Place("record to a full disk", ["velmora-log", "record", "--duration", "0.3", "/dev/full"], 1,
                ["velmora-log: nothing was recorded: "])
    yield Place("record to a missing directory", ["velmora-log", "record", "@none/new.pcapng"], 1,
                [f"velmora-log: cannot create @none/new.pcapng: {missing}"])
    yield Place("convert to a missing directory", ["velmora-log", "convert", gsm, "@none/new.pcapng"], 1,
                [f"velmora-log: @none/new.pcapng: cannot be opened for writing: {missing}"])
    yield Place("save to a missing directory", ["tests/save-once", "@none"], 0,
                ["refused; goes on", f"Snapshot: cannot be opened for writing: {missing}",
                 "<3>Unable to write snapshot to "])
    yield Place("decode with read-only resources", ["velmora-log", "decode", gsm], 0, ["GSM Serving Cell"],
                {"VELMORA_RESOURCES": "@resources"})


def cases():
    yield Case("decode gsm", ["decode", os.path.join(RECORDINGS, "gsm.pcapng")])
    yield Case("decode lte as json", ["decode", "--format", "json", os.path.join(RECORDINGS, "lte.pcapng")])
    every = ["decode", "--format", "jsonl", "--every", "message"]
    yield Case("decode c2k line by line", [*every, os.path.join(RECORDINGS, "c2k.pcapng")])
    yield Case("decode ifx as jsonl", ["decode", "--format", "jsonl", os.path.join(RECORDINGS, "ifx.pcapng")])
    two = [os.path.join(RECORDINGS, name) for name in ("utran.pcapng", "lte.pcapng")]
    yield Case("decode two side by side", ["decode", "--jobs", "2", *two])
    yield Case("info", ["info", os.path.join(RECORDINGS, "utran.pcapng")])
    yield Convert("gsm.pcapng", "drive.pcapng", False)
    yield Convert("gsm.pcapng", "drive.pcapng", True)
    yield Convert("c2k.pcapng", "drive.dlf", False)
    yield Convert("c2k.pcapng", "drive.dlf", True)
    yield Convert("gsm.pcapng", "drive.velmora", False)
    yield Convert("gsm.pcapng", "drive.velmora", True)
    yield Record(False, "some messages", ["--count", "40", "--duration", "3"])
    yield Record(True, "some messages", ["--count", "40", "--duration", "3"])
    yield Record(False, "a while", ["--duration", "1.3"])
    yield Save()


class Sweep:
    def __init__(self, options, directory):
        self.options = options
        self.directory = directory
        self.shim = os.path.join(options.build, "tests", "libfailing-calls.so")
        self.problems = []
        self.runs = 0

    def run(self, case, kind, at, times, error):
        """The run, and the directory that it has left."""
        directory = tempfile.mkdtemp(dir=self.directory)
        work = os.path.join(directory, "work")
        os.mkdir(work)
        case.prepare(work)
        house = case.house() if isinstance(case, Record) else None
        environment = dict(house.environment if house else os.environ, **case.environment)
        environment.setdefault("VELMORA_RESOURCES", os.path.join(SOURCE, "Resources"))
        environment["QT_QPA_PLATFORM"] = "offscreen"
        environment["VELMORA_REDUCED_MOTION"] = "1"
        counts = os.path.join(directory, "counts")
        with open(counts, "wb") as file:
            file.write(bytes(16))
        environment["LD_PRELOAD"] = self.shim
        environment["VELMORA_FAIL"] = f"{kind} {at} {times} {error}"
        environment["VELMORA_FAIL_COUNT"] = counts
        words = [os.path.join(self.options.build, case.program), *case.words(work)]
        try:
            ended = subprocess.run(
                words, env=environment, capture_output=True, text=True, timeout=LIMIT_S, check=False
            )
        except subprocess.TimeoutExpired:
            raise Problem(f"did not end within {LIMIT_S} s") from None
        with open(counts, "rb") as file:
            calls, failed = struct.unpack("<QQ", file.read())
        return Run(ended.returncode, ended.stdout, ended.stderr, calls, failed), directory

    def try_one(self, case, reference, kind, at, mode, error):
        where = f"{case.name}: {kind} {at} {mode}, {os.strerror(error)}"
        run = None
        try:
            run, directory = self.run(case, kind, at, MODES[mode], error)
            case.look(run, os.path.join(directory, "work"), reference)
            shutil.rmtree(directory)
        except Problem as problem:
            self.problems.append(f"{where}: {problem}\n{run.errors[-2000:] if run else ''}")

    def try_place(self, place):
        self.runs += 1
        directory = tempfile.mkdtemp(dir=self.directory)
        try:
            place.try_it(self.options.build, directory)
        except Problem as problem:
            self.problems.append(str(problem))
        shutil.rmtree(directory)

    def places(self, kind, calls):
        if kind != "memory" or self.options.all or calls <= self.options.sample:
            return range(1, calls + 1)
        # The first ones are of the start, where each is something else.
        first = self.options.sample // 4
        step = (calls - first) / (self.options.sample - first)
        return [*range(1, first + 1), *(first + 1 + int(i * step) for i in range(self.options.sample - first))]

    def sweep(self, case, pool):
        if isinstance(case, Record):
            case.build = self.options.build
            case.directory = self.directory
        pending = []
        counts = []
        for kind in case.kinds:
            reference, directory = self.run(case, kind, 0, 0, 0)
            work = os.path.join(directory, "work")
            reference.made = case.content(work) if case.made else None
            expect(reference.status == case.status, f"{case.name}: fails by itself: {reference.errors}")
            counts.append(f"{reference.calls} {kind}")
            for at in self.places(kind, reference.calls):
                for mode in MODES:
                    for error in ERRORS[kind][:1] if self.options.quick else ERRORS[kind]:
                        pending.append(
                            pool.submit(self.try_one, case, reference, kind, at, mode, error)
                        )
        for each in pending:
            each.result()
        self.runs += len(pending)
        if isinstance(case, Record):
            case.close()
        print(f"{case.name}: {', '.join(counts)}; {len(pending)} runs", flush=True)


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build")
    parser.add_argument("--all", action="store_true")
    parser.add_argument("--sample", type=int, default=24)
    parser.add_argument("--quick", action="store_true")
    parser.add_argument("--only", default="")
    parser.add_argument("--jobs", type=int, default=2 * (os.cpu_count() or 1))
    options = parser.parse_args()
    if options.quick:
        options.sample = 8
    options.build = os.path.abspath(options.build)
    begun = time.monotonic()
    with (
        tempfile.TemporaryDirectory() as directory,
        ThreadPoolExecutor(options.jobs) as pool,
        ThreadPoolExecutor(8 * options.jobs) as waiting,  # recorders do little else
    ):
        sweep = Sweep(options, directory)
        for place in places():
            if options.only in place.name:
                sweep.try_place(place)
        for case in cases():
            if options.only in case.name:
                sweep.sweep(case, waiting if isinstance(case, Record) else pool)
        for problem in sweep.problems:
            print(problem, file=sys.stderr)
    print(f"{sweep.runs} runs in {time.monotonic() - begun:.0f} s, {len(sweep.problems)} problems")
    return 1 if sweep.problems else 0
