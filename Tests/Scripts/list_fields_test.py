#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Scripts/list-fields, given small catalogues."""

import subprocess
import sys
import tempfile
import unittest
from importlib.machinery import SourceFileLoader
from importlib.util import module_from_spec, spec_from_loader
from pathlib import Path
from types import ModuleType
from typing import Any

SCRIPT = Path(__file__).resolve().parents[2] / "Scripts" / "list-fields"


def load_script() -> ModuleType:
    """The script as a module."""
    sys.dont_write_bytecode = True
    spec = spec_from_loader("list_fields", SourceFileLoader("list_fields", str(SCRIPT)))
    assert spec and spec.loader
    module = module_from_spec(spec)
    spec.loader.exec_module(module)
    return module


list_fields = load_script()


def place(
    offset: int, width: int, bit: int = 0, signed: bool = False, big_endian: bool = False, in_entry: bool = False
) -> dict[str, Any]:
    """A place as the JSON has it."""
    return {"offset": offset, "bit": bit, "width": width, "signed": signed, "bigEndian": big_endian,
            "inEntry": in_entry}


def field(path: str, **members: Any) -> dict[str, Any]:
    """A text of GSM without log codes, but for the members that are given."""
    return {"technology": "Ostrel_GSM", "path": path, "kind": "text", "sources": [], **members}


class PlaceTest(unittest.TestCase):
    def test_a_place_names_sign_width_offset_and_what_is_unusual(self) -> None:
        for expected, where in [
            ("u8@13", place(13, 8)),
            ("i16@14", place(14, 16, signed=True)),
            ("u16be@20", place(20, 16, big_endian=True)),
            ("u32@+1", place(1, 32, in_entry=True)),
            ("u9@21.3", place(21, 9, bit=3)),
            ("u10@14.0", place(14, 10)),
            ("u8@+1.1", place(1, 8, bit=1, in_entry=True)),
            ("i8@2/10", {**place(10, 8, signed=True), "subPacket": 2}),
        ]:
            self.assertEqual(list_fields.place({"code": 1, "place": where}), expected)

    def test_a_computed_value_has_none(self) -> None:
        self.assertEqual(list_fields.place({"code": 1}), "")


class CellTest(unittest.TestCase):
    def test_records_have_their_places_and_what_makes_numbers_physical(self) -> None:
        row = field("/A", sources=[
            {"code": 0x5137, "place": place(15, 8), "physical": {"scale": -1, "offset": 0}},
            {"code": 0x5137, "place": place(15, 8), "physical": {"scale": -1, "offset": 0}},
            {"code": 0x5137, "place": place(16, 8), "physical": {"scale": 0.5, "offset": -140}},
            {"code": 0x0046, "place": place(17, 8), "physical": {"scale": 1, "offset": 3}},
            {"code": 0xFF0001, "physical": {"scale": 2, "offset": 0}},
            {"code": 0xFF0002},
        ])
        self.assertEqual(list_fields.records(row),
                         "0x5137 `u8@15` × -1, `u8@16` × 0.5 - 140; 0x0046 `u8@17` + 3; 0xFF0001 × 2; 0xFF0002")

    def test_what_only_says_why_there_is_no_value_is_absent_and_no_record(self) -> None:
        row = field("/A", absent=["", " nan dBm"], sources=[
            {"code": 7, "values": [], "others": {"before": "(unknown ", "after": ")"}, "onlyAbsent": True},
            {"code": 7, "values": [{"value": 1, "text": "none"}], "others": {"text": ""}, "onlyAbsent": True},
            {"code": 8},
        ])
        self.assertEqual(list_fields.absent(row), "(empty), `nan dBm`, `(unknown *)`, `none`")
        self.assertEqual(list_fields.records(row), "0x0008")

    def test_a_bar_in_a_label_does_not_end_its_cell(self) -> None:
        self.assertEqual(list_fields.table_row(field("/A|B"), "A|B"), "| `A\\|B` | text |  |  |  |  |  |\n")


class DocumentTest(unittest.TestCase):
    def test_fields_are_in_tables_by_technology_and_section(self) -> None:
        rows = [
            field("/GSM/Cells/*/ARFCN", section="Cells", kind="number", keys=["ARFCN"]),
            field("/GSM/Cells/*/Level", section="Cells", kind="number", unit="dBm", role="neighbour.level",
                  keys=["ARFCN"], clause="3GPP TS 45.008 8.1"),
            field("/GSM/Cells/*/Bursts/*", section="Cells", kind="number", keys=["ARFCN"]),
            field("/GSM/Cells/Pairs/*", section="Cells", keys=["One", "Other"]),
            field("/GSM/Cells/Pairs/*/Third", section="Cells", keys=["One", "Third"]),
            field("/GSM/State", section="State", kind="enumeration", sameAs="/GSM/First", identity="location"),
            field("/SIM", technology="IFX", readFromText=True),
            field("/SIM/ICCID", technology="IFX"),
        ]
        text = list_fields.document(rows, [])
        heads = "| field | kind | role | records | absent | identity | clause |\n|---|---|---|---|---|---|---|\n"
        self.assertTrue(text.startswith(list_fields.INTRODUCTION + list_fields.KEY), text)
        self.assertEqual(
            text.removeprefix(list_fields.INTRODUCTION + list_fields.KEY),
            "\n## Ostrel_GSM\n"
            "\n### GSM/Cells\n"
            "\nA row of `*` is identified by ARFCN.\n"
            "\nA row of `Pairs/*` is identified by One and Other, or by One and Third.\n\n" + heads +
            "| `*/ARFCN` | number |  |  |  |  |  |\n"
            "| `*/Level` | number, dBm | neighbour.level |  |  |  | 3GPP TS 45.008 8.1 |\n"
            "| `*/Bursts/*` | number |  |  |  |  |  |\n"
            "| `Pairs/*` | text |  |  |  |  |  |\n"
            "| `Pairs/*/Third` | text |  |  |  |  |  |\n"
            "\n### GSM/State\n\n" + heads +
            "| `/GSM/State` | enumeration | as `/GSM/First` |  |  | location |  |\n"
            "\n## IFX\n"
            "\n" + list_fields.wrapped(list_fields.TEXTS) + "\n"
            "\n### SIM\n\n" + heads +
            "| `/SIM` | text |  |  |  |  |  |\n"
            "| `ICCID` | text |  |  |  |  |  |\n")

    def test_roles_have_the_unit_of_their_fields(self) -> None:
        rows = [field("/A", role="serving.level", unit="dBm"), field("/B", role="serving.level", unit="dBm")]
        self.assertEqual("".join(list_fields.role_lines(rows, ["serving.level", "serving.cell"])),
                         f"| `serving.level` | {list_fields.ROLES['serving.level']} | dBm |\n"
                         f"| `serving.cell` | {list_fields.ROLES['serving.cell']} |  |\n")

    def test_two_units_of_a_role_are_an_error(self) -> None:
        rows = [field("/A", role="serving.level", unit="dBm"), field("/B", role="serving.level")]
        with self.assertRaisesRegex(ValueError, "serving.level have several units"):
            list(list_fields.role_lines(rows, ["serving.level"]))

    def test_paragraphs_are_wrapped_at_120_characters(self) -> None:
        lines = list_fields.wrapped("word " * 60 + "end").split("\n")
        self.assertEqual([len(line) for line in lines], [119, 119, 63])


class ProgramTest(unittest.TestCase):
    def run_with(self, *arguments: str) -> tuple[int, str]:
        """Exit status and standard error."""
        run = subprocess.run([SCRIPT, *arguments], capture_output=True, text=True, check=False)
        return run.returncode, run.stderr

    def test_wrong_arguments_are_a_usage_error(self) -> None:
        cases: list[list[str]] = [[], ["--check"], ["a", "b"], ["--wrong", "a"], ["--check", "a", "b"]]
        for arguments in cases:
            self.assertEqual(self.run_with(*arguments), (2, "usage: list-fields [--check] VELMORA_LOG\n"), arguments)

    def run_on(self, script: str) -> tuple[int, str]:
        """Exit status and standard error of a check with this shell script as velmora-log."""
        with tempfile.TemporaryDirectory() as folder:
            program = Path(folder, "velmora-log")
            program.write_text("#!/bin/sh\n" + script, encoding="utf-8")
            program.chmod(0o700)
            return self.run_with("--check", str(program))

    def test_another_catalogue_makes_the_document_out_of_date(self) -> None:
        self.assertEqual(self.run_on("echo '{\"fields\": []}'"),
                         (1, "Documentation/fields.md is out of date: build the target fields-document\n"))

    def test_a_failure_of_the_program_is_passed_on(self) -> None:
        self.assertEqual(self.run_on("echo '{\"fields\": []}'; echo no template >&2; exit 1"), (1, "no template\n"))


if __name__ == "__main__":
    unittest.main()
