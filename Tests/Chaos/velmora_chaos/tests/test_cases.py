# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of what a run with a failure may leave."""

import tempfile
import unittest
from pathlib import Path

from velmora_chaos.checks import Problem
from velmora_chaos.failing.case import OLD, Case, Reference
from velmora_chaos.failing.cases import all_cases
from velmora_chaos.failing.injection import Run
from velmora_chaos.failing.record_case import RecordCase
from velmora_chaos.failing.save_case import EARLIER, SaveCase
from velmora_chaos.failing.unusable_places import all_unusable_places


def ended(status: int, output: str = "", errors: str = "") -> Run:
    return Run(status, output, errors, calls=1, failed=1)


def block(kind: int, body: bytes) -> bytes:
    length = (12 + len(body)).to_bytes(4, "little")
    return kind.to_bytes(4, "little") + length + body + length


def packet(data: bytes) -> bytes:
    size = len(data).to_bytes(4, "little")
    return block(6, bytes(12) + size + size + data + bytes(-len(data) % 4))


class WorkDirectoryTest(unittest.TestCase):
    def setUp(self) -> None:
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.work = Path(temporary.name)

    def refuses(self, problem: str, case: Case, run: Run, reference: Reference) -> None:
        with self.assertRaisesRegex(Problem, problem):
            case.check(run, self.work, reference)


class CaseTest(WorkDirectoryTest):
    REFERENCE = Reference(ended(0, "display\n"), None)
    FAILED = ended(1, errors="velmora-log: out of memory\n")

    def test_arguments_name_the_work_directory(self) -> None:
        self.assertEqual(Case("x", ["info", "@a b"]).arguments(Path("/w")), ["info", "/w/a b"])

    def test_status_0_with_the_reference_s_output(self) -> None:
        Case("decode", []).check(ended(0, "display\n"), self.work, self.REFERENCE)
        self.refuses("status 0, with another output", Case("decode", []), ended(0, "disp"), self.REFERENCE)

    def test_status_1_needs_a_message(self) -> None:
        Case("decode", []).check(self.FAILED, self.work, self.REFERENCE)
        self.refuses("without a message", Case("decode", []), ended(1, errors="oh"), self.REFERENCE)

    def test_a_signal_is_a_problem(self) -> None:
        self.refuses("ended with -11, wanted 0 or 1", Case("decode", []), ended(-11), self.REFERENCE)

    def test_a_file_is_the_old_one_or_the_new_one(self) -> None:
        case = Case("convert", [], made="new", had=True)
        reference = Reference(ended(0), b"made")
        case.prepare(self.work)
        case.check(self.FAILED, self.work, reference)
        self.refuses("status 0, with another file", case, ended(0), reference)
        (self.work / "new").write_bytes(b"made")
        case.check(self.FAILED, self.work, reference)
        case.check(ended(0), self.work, reference)
        (self.work / "new").write_bytes(b"mad")
        self.refuses("left 3 bytes that are neither", case, self.FAILED, reference)
        (self.work / "new").unlink()
        self.refuses("left 0 bytes that are neither", case, self.FAILED, reference)

    def test_nothing_else_is_left(self) -> None:
        case = Case("convert", [], made="new")
        case.check(self.FAILED, self.work, Reference(ended(0), b"made"))
        (self.work / "new.part").touch()
        self.refuses(r"left \['new.part'\]", case, self.FAILED, Reference(ended(0), b"made"))


class RecordCaseTest(WorkDirectoryTest):
    REFERENCE = Reference(ended(0), packet(b"one") + packet(b"two2"))
    FAILED = ended(1, errors="velmora-log: disk full\n")

    def recorded(self, content: bytes) -> RecordCase:
        case = RecordCase(False, "x", [])
        assert case.made
        (self.work / case.made).write_bytes(content)
        return case

    def test_the_start_of_the_drive_is_accepted(self) -> None:
        header = block(0x0A0D0D0A, bytes(16))
        self.recorded(header + packet(b"one")).check(self.FAILED, self.work, self.REFERENCE)

    def test_other_messages_are_a_problem(self) -> None:
        case = self.recorded(packet(b"two2"))
        self.refuses("the messages differ from the drive's", case, self.FAILED, self.REFERENCE)

    def test_a_block_that_is_cut_off_is_a_problem(self) -> None:
        case = self.recorded(packet(b"one")[:-1])
        self.refuses("a block is cut off at 0", case, self.FAILED, self.REFERENCE)

    def test_status_0_needs_a_recording_with_a_message(self) -> None:
        case = RecordCase(False, "x", [])
        self.refuses("status 0, without a recording", case, ended(0), self.REFERENCE)
        self.refuses("status 0, without a message", self.recorded(block(1, b"")), ended(0), self.REFERENCE)

    def test_an_empty_file_is_a_problem(self) -> None:
        self.refuses("left an empty file", self.recorded(b""), self.FAILED, self.REFERENCE)

    def test_the_file_that_was_there_stays(self) -> None:
        case = RecordCase(True, "x", [])
        case.prepare(self.work)
        case.check(self.FAILED, self.work, self.REFERENCE)
        (self.work / "drive.pcapng").unlink()
        self.refuses("lost the file that was there", case, self.FAILED, self.REFERENCE)


class SaveCaseTest(WorkDirectoryTest):
    REFERENCE = Reference(ended(0), None)

    def setUp(self) -> None:
        super().setUp()
        self.case = SaveCase()
        self.case.prepare(self.work)

    def test_saved_needs_a_whole_snapshot(self) -> None:
        saved = ended(0, "saved; goes on\n")
        self.refuses(r"left \[\]", self.case, saved, self.REFERENCE)
        snapshot = self.work / "VelmoraSnapshot-2.velmora"
        snapshot.write_text("<plist>")
        self.refuses("not whole", self.case, saved, self.REFERENCE)
        snapshot.write_text("<plist></plist>\n")
        self.case.check(saved, self.work, self.REFERENCE)

    def test_refused_needs_a_line_in_the_log(self) -> None:
        refused = ended(0, "refused; goes on\n", "<3>Unable to write snapshot to /x\n")
        self.case.check(refused, self.work, self.REFERENCE)
        self.refuses("no line in the log", self.case, ended(0, "refused; goes on\n"), self.REFERENCE)

    def test_the_earlier_snapshot_stays(self) -> None:
        (self.work / EARLIER).write_bytes(OLD[:-1])
        self.refuses("another snapshot has changed", self.case, ended(1, "", "out of memory"), self.REFERENCE)


class ListsTest(unittest.TestCase):
    def test_names_are_unique(self) -> None:
        names = [case.name for case in all_cases()] + [place.name for place in all_unusable_places()]
        self.assertEqual(len(names), len(set(names)))
