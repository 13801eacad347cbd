# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The list of cases. A new command gets its line here."""

from velmora_chaos.failing.case import Case
from velmora_chaos.failing.columns_case import ColumnsCase
from velmora_chaos.failing.convert_case import ConvertCase
from velmora_chaos.failing.record_case import RecordCase
from velmora_chaos.failing.report_case import ReportCase
from velmora_chaos.failing.save_case import SaveCase
from velmora_chaos.sandbox import RECORDINGS


def decode_case(name: str, arguments: list[str], *recordings: str) -> Case:
    """Decodes example recordings with such options."""
    return Case(f"decode {name}", ["decode", *arguments, *(str(RECORDINGS / each) for each in recordings)])


def all_cases() -> list[Case]:
    """Every case, in the order of the report."""
    every_message = ["--format", "jsonl", "--every", "message"]
    count = ["--count", "40", "--duration", "3"]
    return [
        decode_case("gsm", [], "gsm.pcapng"),
        decode_case("lte as json", ["--format", "json"], "lte.pcapng"),
        decode_case("c2k line by line", every_message, "c2k.pcapng"),
        decode_case("ifx as jsonl", ["--format", "jsonl"], "ifx.pcapng"),
        decode_case("two side by side", ["--jobs", "2"], "utran.pcapng", "lte.pcapng"),
        Case("info", ["info", str(RECORDINGS / "utran.pcapng")]),
        Case("fields", ["fields", "--format", "json"]),
        Case("stats", ["stats", "--by", "cell", str(RECORDINGS / "lte.pcapng")]),
        Case("diff of displays", ["diff", "--display", *(str(RECORDINGS / each) for each in ("gsm.pcapng", "lte.pcapng"))]),
        Case("diff of statistics", ["diff", str(RECORDINGS / "c2k.pcapng"), str(RECORDINGS / "lte.pcapng")]),
        ColumnsCase("lte.pcapng"),
        ConvertCase("gsm.pcapng", "drive.pcapng", had=False),
        ConvertCase("gsm.pcapng", "drive.pcapng", had=True),
        ConvertCase("c2k.pcapng", "drive.dlf", had=False),
        ConvertCase("c2k.pcapng", "drive.dlf", had=True),
        ConvertCase("gsm.pcapng", "drive.velmora", had=False),
        ConvertCase("gsm.pcapng", "drive.velmora", had=True),
        ReportCase("gsm.pcapng", had=False),
        ReportCase("lte.pcapng", had=True),
        ConvertCase("gsm.pcapng", "drive.sqlite", had=False),
        ConvertCase("gsm.pcapng", "drive.sqlite", had=True),
        RecordCase(False, "some messages", count),
        RecordCase(True, "some messages", count),
        RecordCase(False, "a while", ["--duration", "1.3"]),
        SaveCase(),
    ]
