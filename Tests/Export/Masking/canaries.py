#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Plants random identities in drives of every technology, masks them, and searches for them in what comes out.

usage: canaries.py VELMORA_LOG MAKE_DRIVE [--seeds N] [--first N] [--scenario NAME]...

Shares nothing with the masked program: it reads and writes the blocks of a recording, property lists and encodings by
itself. Planted are the identities that SIM files, contexts, displays and a live modem's messages have, under the keys
of these and under unknown keys; in records of unknown codes, behind the end of known ones and in bytes that no
field is read from; in malformed messages; and in comments, options, host names and unknown blocks of the recording.
Each is searched for in eight encodings and as a number, in masked files and, of the first seed, in all that `browse --mask`
shows and writes. Exit status: 0 nothing found, 1 something found or a command failed, 2 usage.
"""

from __future__ import annotations

import argparse
import base64
import binascii
import re
import struct
import subprocess
import sys
import tempfile
import zlib
from pathlib import Path

from canary_planter import Planter, packed

TECHNOLOGIES = {"gsm": "Ostrel_GSM", "lte": "Ostrel_LTE", "utran": "Ostrel_UTRAN2", "c2k": "Ostrel_CDMA",
                "ifx": "IFX", "modem": "Modem"}
# So many that every kind of message is among them.
MESSAGES = {"gsm": 800, "lte": 500, "utran": 500, "c2k": 500, "ifx": 120, "modem": 500}


def encodings(value: str) -> dict[str, list[bytes]]:
    """The byte strings of which at least one is in what holds the value in that encoding."""
    text = value.encode()
    found: dict[str, list[bytes]] = {
        "ASCII": [text],
        "UTF-16LE": [value.encode("utf-16-le")],
        "UTF-16BE": [value.encode("utf-16-be")],
        "hexadecimal": [text.hex().encode(), text.hex().upper().encode()],
        "base64": [],
    }
    for before in range(3):
        encoded = base64.b64encode(b"\0" * before + text)
        found["base64"].append(encoded[-(-before * 8 // 6) : (before + len(text)) * 8 // 6])
    if value.isdigit():
        # From the first digit on, or from the second, where the first shares its byte with what is before.
        if int(value) < 1 << 63 and value[0] != "0":
            found["number"] = [int(value).to_bytes(8, "big")]
        for name, swapped in (("BCD", False), ("swapped BCD", True)):
            found[name] = [packed(part[: len(part) // 2 * 2], swapped) for part in (value, value[1:])]
    return found


# Where gzip or zlib may have begun: a second byte that makes the header a multiple of 31 (RFC 1950).
COMPRESSED = re.compile(rb"\x1f\x8b|\x78[\x01\x20\x3f\x5e\x7d\x9c\xbb\xda\xf9]")
# The one encoding that XML property lists have of their own, with blanks in it.
XML_DATA = re.compile(rb"<data>([^<]*)</data>")


def unpacked(content: bytes) -> list[bytes]:
    """The content, all that gzip or zlib have compressed in it, and the data of its property lists in XML. Those in binary
    have their texts and data as they are, and numbers as `encodings` has them."""
    parts = [content]
    view = memoryview(content)
    for found in COMPRESSED.finditer(content):
        try:
            parts.append(zlib.decompressobj(47).decompress(view[found.start() :], 1 << 24))
        except zlib.error:
            continue
    for found in XML_DATA.finditer(content):
        try:
            parts += unpacked(binascii.a2b_base64(found[1]))
        except binascii.Error:
            continue
    return parts


def packets_of(recording: bytes) -> list[tuple[int, bytes]]:
    """Time stamp and bytes of each packet; as the project's writer writes them, little-endian."""
    packets = []
    at = 0
    while at < len(recording):
        kind, length = struct.unpack_from("<II", recording, at)
        if kind == 6:
            high, low, captured = struct.unpack_from("<III", recording, at + 12)
            packets.append((high << 32 | low, recording[at + 28 : at + 28 + captured]))
        at += length
    return packets


def run(*arguments: str | Path, status: int = 0) -> str:
    done = subprocess.run([str(each) for each in arguments], capture_output=True, text=True, check=False)
    if done.returncode != status:
        raise SystemExit(f"{' '.join(map(str, arguments))}: exit status {done.returncode}, wanted {status}\n"
                         f"{done.stdout}{done.stderr}")
    return done.stdout + done.stderr


class Search:
    """Looks for the values of one drive."""

    def __init__(self, values: list[str]) -> None:
        self.values = values
        self.forms = [(value, encoding, form) for value in values for encoding, forms in encodings(value).items()
                      for form in forms]

    def __call__(self, name: str, content: bytes) -> list[str]:
        # Between two parts is more than any value has, and nothing that it could have.
        joined = (b"\xaa" * 64).join(unpacked(content))
        return [f"{name}: {value} found: {encoding}" for value, encoding, form in self.forms if form in joined]


def check(log: Path, drive: Path, scenario: str, seed: int, first: int, folder: Path) -> list[str]:
    original, planted = folder / "drive.pcapng", folder / "planted.pcapng"
    run(drive, scenario, str(seed), str(MESSAGES[scenario]), original)
    planter = Planter(scenario, seed)
    planted.write_bytes(planter.recording(TECHNOLOGIES[scenario], packets_of(original.read_bytes())))
    values = planter.canaries.values
    known = folder / "known"
    known.write_text("".join(value + "\n" for value in values))
    problems = []
    # The search has to find what was planted, or it would find nothing anywhere.
    search = Search(values)
    before = "\n".join(search("planted", planted.read_bytes()))
    problems += [f"{value} was not planted" for value in (planter.imsi, planter.iccid) if value not in before]
    if "found" not in run(log, "mask", "--check", planted, "--known", known, status=1):
        problems.append("--known finds nothing of what was planted")
    forms = ["pcapng", "velmora"] + (["dlf"] if scenario != "ifx" else [])
    for level in ("identity", "location", "all"):
        for form in forms:
            masked = folder / f"masked.{form}"
            run(log, "--log-level", "0", "mask", "--force", "--level", level, planted, masked)
            name = f"{scenario} {seed}, {level}, {form}"
            problems += search(name, masked.read_bytes())
            output = run(log, "mask", "--check", "--level", level, "--technology", TECHNOLOGIES[scenario], masked,
                         "--known", known)
            if any(value in output for value in values):
                problems.append(f"{name}: --check prints a value")
        if seed == first:
            for part, content in browsed(log, planted, TECHNOLOGIES[scenario], level, folder):
                problems += search(f"{scenario} {seed}, {level}, browse, {part}", content)
    return problems


def browsed(log: Path, planted: Path, technology: str, level: str, folder: Path) -> list[tuple[str, bytes]]:
    """What `browse --mask` prints of every message, the bytes that it prints, and what it writes."""
    count = len(packets_of(planted.read_bytes()))
    copy = folder / "browsed.pcapng"
    copy.unlink(missing_ok=True)
    # A note needs comments to be copied; the search goes through the values of all messages.
    commands = ["m seen", *["c", "d", "x", "h", ""] * count, "l", "1", "/no message has this", f"w {copy}"]
    done = subprocess.run([log, "--log-level", "0", "browse", "--line", f"--mask={level}", "--technology", technology, planted],
                          input="\n".join(commands) + "\n", capture_output=True, text=True, check=False)
    if done.returncode != 0 or not copy.exists():
        raise SystemExit(f"browse --mask={level} of {technology}: {done.stdout[-1000:]}{done.stderr}")
    lines = done.stdout.splitlines()
    contents = [bytes.fromhex(line) for line in lines if re.fullmatch("(?:[0-9a-f]{2})+", line)]
    if len(contents) < count // 2:
        raise SystemExit(f"browse --mask={level} of {technology} shows the bytes of {len(contents)} of {count} messages")
    return [("screen", done.stdout.encode()), ("bytes", (b"\xaa" * 64).join(contents)), ("copy", copy.read_bytes())]


def main() -> int:
    parser = argparse.ArgumentParser(description=__doc__.split("\n", maxsplit=1)[0])
    parser.add_argument("velmora_log", type=Path)
    parser.add_argument("make_drive", type=Path)
    parser.add_argument("--seeds", type=int, default=1)
    parser.add_argument("--first", type=int, default=1)
    parser.add_argument("--scenario", action="append", choices=TECHNOLOGIES)
    options = parser.parse_args()
    problems = []
    with tempfile.TemporaryDirectory() as folder:
        for scenario in options.scenario or TECHNOLOGIES:
            for seed in range(options.first, options.first + options.seeds):
                problems += check(options.velmora_log.resolve(), options.make_drive.resolve(), scenario, seed, options.first,
                                  Path(folder))
    print("\n".join(problems[:50]))
    return 1 if problems else 0


if __name__ == "__main__":
    sys.exit(main())
