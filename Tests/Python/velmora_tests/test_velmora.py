# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
from __future__ import annotations

import csv
import io
import os
import subprocess
import tempfile
import unittest
import warnings
from pathlib import Path
from unittest import mock

import pandas as pd

import velmora

RECORDINGS = Path(os.environ["VELMORA_RECORDINGS"])
LTE = RECORDINGS / "lte.pcapng"
GSM = RECORDINGS / "gsm.pcapng"
RSRP = "/Serving Cell/Serving Cell Measurements/Measured RSRP"
NEIGHBOURS = "/GSM/Neighboring Cells/*/RSSI"


def listed(*arguments: str) -> list[dict[str, str]]:
    """What the program lists as CSV."""
    program = os.environ["VELMORA_LOG"]
    text = subprocess.run([program, *arguments], capture_output=True, text=True, check=False).stdout
    return list(csv.DictReader(io.StringIO(text)))


class SamplesTest(unittest.TestCase):
    def setUp(self) -> None:
        warnings.simplefilter("ignore", velmora.InputWarning)

    def test_are_those_of_the_program(self) -> None:
        rows = listed("decode", "--samples", "--format=csv", f"--select={RSRP}", str(LTE))
        frame = velmora.samples(LTE, RSRP, losses="warn")
        self.assertGreater(len(rows), 10)
        self.assertEqual(list(frame[RSRP]), [float(row["value"]) for row in rows])
        self.assertEqual(list(frame["record"]), [int(row["record"]) for row in rows])
        self.assertEqual(list(frame["time"]), [pd.Timestamp(row["time"]) for row in rows])
        self.assertEqual(frame.attrs["units"], {RSRP: "dBm"})

    def test_have_a_row_for_each_value_without_a_choice(self) -> None:
        rows = listed("decode", "--samples", "--format=csv", str(LTE))
        frame = velmora.samples(LTE, losses="warn")
        self.assertEqual(list(frame["path"]), [row["path"] for row in rows])
        self.assertEqual([text or "" for text in frame["text"]], [row["text"] for row in rows])

    def test_have_a_row_for_each_row_of_a_list(self) -> None:
        rows = listed("decode", "--samples", "--format=csv", f"--select={NEIGHBOURS}", str(GSM))
        frame = velmora.samples(GSM, {"level": NEIGHBOURS}, losses="warn")
        self.assertEqual([(record, row, level) for record, row, level in zip(frame["record"], frame["row"], frame["level"])],
                         [(int(row["record"]), row["row"], float(row["value"])) for row in rows])

    def test_have_texts_of_enumerations(self) -> None:
        state = "/Registration/Process CS/MM State"
        frame = velmora.samples(GSM, {"state": state}, losses="warn")
        self.assertIn("MM_IDLE", set(frame["state"]))

    def test_of_several_files_name_them(self) -> None:
        frame = velmora.samples([LTE, GSM], losses="warn")
        self.assertEqual(list(dict.fromkeys(frame["file"])), [str(LTE), str(GSM)])


class OtherFramesTest(unittest.TestCase):
    def setUp(self) -> None:
        warnings.simplefilter("ignore", velmora.InputWarning)

    def test_events_are_those_of_the_program(self) -> None:
        rows = listed("events", "--format=csv", str(LTE))
        frame = velmora.events(LTE, losses="warn")
        self.assertEqual(list(frame["text"]), [row["text"] for row in rows])
        self.assertEqual([str(kind) for kind in frame["kind"]], [row["kind"] for row in rows])
        durations = [float(row["duration"]) if row["duration"] else None for row in rows]
        self.assertEqual([None if pd.isna(each) else each for each in frame["duration"]], durations)

    def test_fields_are_those_of_the_program(self) -> None:
        rows = listed("fields", "--format=csv", "--technology=LTE")
        self.assertEqual(list(velmora.fields("LTE")["path"]), [row["path"] for row in rows])

    def test_displays_have_the_names_of_their_paths(self) -> None:
        path = "/GSM/GSM Serving Cell/RSSI"
        rows = listed("decode", "--format=csv", f"--select=level={path}", str(GSM))
        frame = velmora.decode(GSM, {"level": path}, losses="warn")
        shown = [(str(time.isoformat()), level) for time, level in zip(frame["time"], frame["level"]) if level]
        self.assertEqual([level for _, level in shown], [row["level"] for row in rows if row["level"]])


class ErrorsTest(unittest.TestCase):
    def test_a_file_that_is_not_there(self) -> None:
        with self.assertRaisesRegex(velmora.InputError, "^/nowhere.pcapng: cannot open: No such file or directory$") as caught:
            velmora.samples("/nowhere.pcapng")
        self.assertEqual(caught.exception.status, 1)

    def test_a_path_that_there_is_not(self) -> None:
        with self.assertRaises(velmora.UsageError) as caught:
            velmora.samples(LTE, RSRP + "Q")
        self.assertIn(RSRP, str(caught.exception))

    def test_losses_raise_or_warn(self) -> None:
        with tempfile.TemporaryDirectory() as directory:
            cut = Path(directory) / "cut.pcapng"
            cut.write_bytes(LTE.read_bytes()[:-7])
            with self.assertRaises(velmora.InputError):
                velmora.samples(cut)
            with self.assertWarns(velmora.InputWarning):
                frame = velmora.samples(cut, losses="warn")
        self.assertGreater(len(frame), 100)

    def test_no_program(self) -> None:
        with mock.patch.dict(os.environ, {"VELMORA_LOG": "/nowhere/velmora-log"}):
            with self.assertRaisesRegex(velmora.VelmoraError, "cannot be started: No such file or directory"):
                velmora.samples(LTE)

    def test_no_file(self) -> None:
        with self.assertRaisesRegex(velmora.UsageError, "got no file"):
            velmora.samples([])


if __name__ == "__main__":
    unittest.main()
