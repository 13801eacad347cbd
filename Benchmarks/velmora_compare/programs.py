# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What is compared: ours, lower bounds of it, and programs of others that do the same or less."""

import shutil
import subprocess
import sys
from collections.abc import Callable, Sequence
from dataclasses import dataclass
from pathlib import Path

FINAL, LINES, COPY = "final", "lines", "copy"
BY_HAND, MADE_TEXTS = "by-hand", "made-texts"
TSHARK_JSON, TSHARK_TEXT, TSHARK_BYTES = "tshark-json", "tshark-text", "tshark-bytes"
STRUCT, CONSTRUCT, JQ = "struct", "construct", "jq"
BEFORE = "-before"


@dataclass(frozen=True)
class Program:
    """One row of the table. A slow one gets fewer messages; one of a single record its recording alone."""

    name: str
    title: str
    against: str  # the program whose cost it is a multiple of
    command: Callable[[Path], list[str]]
    is_slow: bool = False
    is_of_record: bool = False
    is_default: bool = True
    is_tshark: bool = False
    missing: str = ""  # why it cannot run


def _piped(*commands: Sequence[str]) -> list[str]:
    quoted = (" ".join(f"'{word}'" for word in command) for command in commands)
    return ["bash", "-o", "pipefail", "-c", " | ".join(quoted)]


def _of_tool(tool: Path, suffix: str, against_final: str, against_lines: str) -> list[Program]:
    def runs(*arguments: str) -> Callable[[Path], list[str]]:
        return lambda recording: [str(tool), *arguments, str(recording)]

    missing = "" if tool.exists() else f"{tool} does not exist"
    before = f", {suffix[1:]}" if suffix else ""
    return [
        Program(FINAL + suffix, "`decode --format json`" + before, against_final, runs("decode", "--format", "json"),
                missing=missing),
        Program(LINES + suffix, "`decode --format jsonl --every message`" + before, against_lines,
                runs("decode", "--format", "jsonl", "--every", "message"), missing=missing),
        Program("stats" + suffix, "`stats`" + before, FINAL, runs("stats"), is_default=False, missing=missing),
        Program("events" + suffix, "`events`" + before, FINAL, runs("events"), is_default=False, missing=missing),
    ]


def _of_tshark(dissector: Path) -> list[Program]:
    found = shutil.which("tshark") is not None
    missing = "" if found else "tshark is not installed"
    missing_lua = missing or ("" if dissector.exists() else f"{dissector} does not exist")
    lua = ["-X", f"lua_script:{dissector}"]

    def runs(*arguments: str) -> Callable[[Path], list[str]]:
        return lambda recording: ["tshark", *arguments, "-r", str(recording)]

    return [
        Program(TSHARK_JSON, "`tshark -T json`, all fields", LINES, runs(*lua, "-T", "json"), is_slow=True,
                is_tshark=True, missing=missing_lua),
        Program(TSHARK_TEXT, "`tshark -V`, all fields", LINES, runs(*lua, "-V"), is_slow=True,
                is_tshark=True, missing=missing_lua),
        Program(TSHARK_BYTES, "`tshark -T json` without dissector: bytes", LINES, runs("-T", "json"), is_slow=True,
                is_tshark=True, missing=missing),
    ]


def python_with(module: str) -> str:
    """An interpreter that has the module, Debian's own where this one has it not; empty where none has."""
    for interpreter in (sys.executable, "/usr/bin/python3"):
        found = subprocess.run([interpreter, "-c", f"import {module}"], capture_output=True, check=False)
        if found.returncode == 0:
            return interpreter
    return ""


def _of_python(package: Path) -> list[Program]:
    with_construct = python_with("construct")
    interpreter = with_construct or sys.executable

    def runs(module: str) -> Callable[[Path], list[str]]:
        decoder = f"velmora_compare.decoders.{module}"
        return lambda recording: ["env", f"PYTHONPATH={package}", interpreter, "-B", "-m", decoder, str(recording)]

    return [
        Program(STRUCT, "Python, `struct`", LINES, runs("with_struct"), is_slow=True, is_of_record=True),
        Program(CONSTRUCT, "Python, `construct`", LINES, runs("with_construct"), is_slow=True, is_of_record=True,
                missing="" if with_construct else "no Python has construct (python3-construct)"),
    ]


def every(build: Path, before: Path | None, package: Path) -> dict[str, Program]:
    """All programs by name, those that are missing too."""
    tool, benchmarks = build / "velmora-log", build / "benchmarks"
    by_hand = benchmarks / "measurement-lines"

    def own(program: Path) -> str:
        return "" if program.exists() else f"{program} does not exist"

    programs = _of_tool(tool, "", COPY, BY_HAND)
    if before:
        programs += _of_tool(before / "velmora-log", BEFORE, FINAL, LINES)
    programs += [
        Program(COPY, "reading and copying", "", lambda recording: [str(benchmarks / "floor"), str(recording)],
                missing=own(benchmarks / "floor")),
        Program(BY_HAND, "the lines written by hand", COPY, lambda recording: [str(by_hand), str(recording)],
                is_of_record=True, missing=own(by_hand)),
        Program(MADE_TEXTS, "the same, all values' texts made before", COPY,
                lambda recording: [str(by_hand), "--texts", str(recording)], is_of_record=True, missing=own(by_hand)),
        *_of_tshark(build / "velmora.lua"),
        *_of_python(package),
        Program(JQ, "lines piped into `jq -c .sections`", LINES,
                lambda recording: _piped([str(tool), "decode", "--format", "jsonl", "--every", "message",
                                          str(recording)], ["jq", "-c", ".sections"]), is_slow=True,
                missing="" if shutil.which("jq") else "jq is not installed"),
    ]
    return {program.name: program for program in programs}
