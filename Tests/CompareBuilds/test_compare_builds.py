# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What Tests/compare-builds notices, and what it leaves out."""

import base64
import contextlib
import io
import json
import random
import tempfile
import unittest
from collections.abc import Callable
from pathlib import Path

from CompareBuilds import cases, differences, inputs, pcapng, random_records, running
from CompareBuilds.running import Case


def build(directory: Path, name: str, script: str) -> Path:
    """A build directory whose velmora-log is that shell script."""
    program = directory / name / "velmora-log"
    program.parent.mkdir()
    program.write_text("#!/bin/sh\n" + script + "\n")
    program.chmod(0o755)
    return program.parent


class BuildsTest(unittest.TestCase):
    def setUp(self) -> None:
        directory = tempfile.TemporaryDirectory()
        self.addCleanup(directory.cleanup)
        self.directory = Path(directory.name)

    def report(self, before: str, after: str, product: str | None = None) -> str:
        """What is printed of the two; empty where they do the same."""
        comparison = differences.Comparison(build(self.directory, "a", before), build(self.directory, "b", after),
                                            self.directory / "kept")
        with contextlib.redirect_stdout(io.StringIO()) as printed:
            comparison.compare(Case(("info", "x"), product))
        self.assertEqual((comparison.count, comparison.differing), (1, 1 if printed.getvalue() else 0))
        return printed.getvalue()

    def test_the_same(self) -> None:
        self.assertEqual(self.report("echo a; echo b >&2; exit 3", "echo a; echo b >&2; exit 3"), "")

    def test_one_byte_of_standard_output(self) -> None:
        printed = self.report("printf 'one\\ntwo\\n'", "printf 'one\\ntwi\\n'")
        self.assertIn("stdout:\n  line 2, byte 3:\n      one\n    - two\n    + twi\n", printed)
        self.assertEqual((self.directory / "kept/001/after.stdout").read_bytes(), b"one\ntwi\n")

    def test_a_missing_line(self) -> None:
        self.assertIn("    - two\n    + (the end)\n", self.report("printf 'one\\ntwo\\n'", "echo one"))

    def test_standard_error(self) -> None:
        self.assertIn("stderr:\n  line 1, byte 1:", self.report("echo a >&2", "echo b >&2"))

    def test_the_exit_status(self) -> None:
        self.assertIn("exit status 0, then 1", self.report("exit 0", "exit 1"))

    def test_a_signal(self) -> None:
        self.assertIn("exit status 0, then -6", self.report("exit 0", "kill -ABRT $$"))

    def test_a_file(self) -> None:
        self.assertIn("out.dlf:\n  line 1, byte 2:",
                      self.report("printf ab > out.dlf", "printf ac > out.dlf", "out.dlf"))

    def test_a_file_that_is_missing(self) -> None:
        self.assertIn("out.dlf:\n", self.report("printf ab > out.dlf", "true", "out.dlf"))

    def test_output_that_changes_from_run_to_run(self) -> None:
        once = f"mkdir {self.directory}/once 2>/dev/null && echo a || echo b"
        self.assertIn("not the same from run to run", self.report(once, "echo b"))


def snapshot(log: bytes) -> bytes:
    """As far as it matters: the log as a property list has it."""
    return b"<data>\n\t\t\t" + base64.encodebytes(log).replace(b"\n", b"\n\t\t\t") + b"</data>"


class LeftOutTest(unittest.TestCase):
    def test_addresses(self) -> None:
        self.assertEqual(running.ADDRESS.sub(b"ADDRESS", b"with 0x555f35bea760, code 0x51F4, 0x555f35bea7601"),
                         b"with ADDRESS, code 0x51F4, 0x555f35bea7601")
        self.assertEqual(running.ADDRESS.sub(b"ADDRESS", b"of 0x5500012ac0, code 0xff0000"),
                         b"of ADDRESS, code 0xff0000")

    def test_the_build_stamp_alone(self) -> None:
        report = bytes.fromhex("a100fd1f") + bytes(range(4, 161))
        for at in range(4, 161):
            other = report[:at] + b"\xff" + report[at + 1 :]
            forms: dict[str, Callable[[bytes], bytes]] = {".dlf": bytes, ".velmora": snapshot}
            for suffix, form in forms.items():
                with self.subTest(suffix=suffix, at=at):
                    same = running.without_stamp(suffix, form(report)) == running.without_stamp(suffix, form(other))
                    self.assertEqual(same, 63 <= at < 81)


class InputsTest(unittest.TestCase):
    def test_every_recording_is_compared(self) -> None:
        self.assertEqual({given.path.name for given in inputs.recordings()},
                         {path.name for path in inputs.RECORDINGS.glob("*.pcapng")})

    def test_a_packet(self) -> None:
        # Time stamp 0x18765432_89ABCDEF, five bytes and three of padding.
        self.assertEqual(pcapng.packet(0x1876543289ABCDEF, b"abcde").hex(" ", 4),
                         "06000000 28000000 00000000 32547618 efcdab89 05000000 05000000 61626364 65000000 28000000")

    def test_messages_that_are_written_are_read(self) -> None:
        with tempfile.TemporaryDirectory() as directory:
            path = Path(directory, "a.pcapng")
            pcapng.write(path, "IFX", [b"", b"a", b"abcd"])
            self.assertEqual(list(pcapng.messages_of(path)), [b"", b"a", b"abcd"])

    def test_records_of_sim_files(self) -> None:
        for message, expected in (("ff0f000000", True), ("8100ff0f000000", True), ("ff0f000100", False),
                                  ("010f000000", False), ("", False)):
            self.assertEqual(random_records.is_sim_file(bytes.fromhex(message)), expected, message)

    def test_no_unreadable_sim_file_among_random_records(self) -> None:
        sample = random_records.record(0x1234, bytes(40), random.Random(1))
        for message in random_records.records("GSM", 5000, 1, [sample], [0x1234]):
            if random_records.is_sim_file(message):
                payload = message[15 if message[0] == 0x81 else 13 :]
                self.assertTrue(payload.startswith((b"bplist00", b"<?xml")), message)

    def test_paths(self) -> None:
        shown = {"A": {"B": "1", "C": [{"D": "2"}]}, "S": {"_sorted": "_sorted", "0;7": "3"}}
        self.assertEqual(cases.columns(json.dumps({"display": shown})),
                         ["/A/B", "/A/C/0/D", "/S/7", "/A", "/S", "/A/C/4095/D"])
        self.assertEqual(list(cases.further_columns(json.dumps({"display": shown}))),
                         [["/A/B", "/A/C/0/D", "/S/7"],
                          ["/A/C", "/A/C/*/D", "/S", "/S/*"],
                          ["/A", "/A/C/0", "/S"],
                          ["/", "/S/7"],
                          ["/A/C/0/D"],
                          ["/*/B", "/A/C/0/D", "/S/7"]])


if __name__ == "__main__":
    unittest.main()
