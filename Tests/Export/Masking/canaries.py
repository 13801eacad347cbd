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
import gzip
import plistlib
import random
import re
import struct
import subprocess
import sys
import tempfile
import zlib
from dataclasses import dataclass, field
from pathlib import Path
from typing import Any

TECHNOLOGIES = {"gsm": "Ostrel_GSM", "lte": "Ostrel_LTE", "utran": "Ostrel_UTRAN2", "c2k": "Ostrel_CDMA",
                "ifx": "IFX", "modem": "Modem"}
# So many that every kind of message is among them.
MESSAGES = {"gsm": 800, "lte": 500, "utran": 500, "c2k": 500, "ifx": 120, "modem": 500}
HEADER = 13


@dataclass
class Canaries:
    """The identities of one drive."""

    dice: random.Random
    values: list[str] = field(default_factory=list)

    def digits(self, count: int, begin: str = "") -> str:
        value = begin + "".join(self.dice.choice("0123456789") for _ in range(count - len(begin)))
        # One that begins or ends like a real one is no other identity, but zeros would be found in anything.
        self.values.append(value)
        return value

    def address(self) -> str:
        value = ".".join(["10"] + [str(self.dice.randint(100, 254)) for _ in range(3)])
        self.values.append(value)
        return value

    def address6(self) -> str:
        value = "2a00:" + ":".join(f"{self.dice.randint(0x1000, 0xFFFF):x}" for _ in range(7))
        self.values.append(value)
        return value

    def hexadecimal(self, count: int) -> str:
        value = "A" + "".join(self.dice.choice("0123456789ABCDEF") for _ in range(count - 2)) + "7"
        self.values.append(value)
        return value

    def name(self) -> str:
        value = "Q" + "".join(self.dice.choice("bcdfghjkmpqvwxz") for _ in range(11))
        self.values.append(value)
        return value


def packed(digits: str, swapped: bool) -> bytes:
    padded = digits + "F" * (len(digits) % 2)
    pairs = [padded[i : i + 2] for i in range(0, len(padded), 2)]
    return bytes.fromhex("".join(pair[::-1] if swapped else pair for pair in pairs))


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


def block(kind: int, body: bytes) -> bytes:
    body += b"\0" * (-len(body) % 4)
    length = struct.pack("<I", len(body) + 12)
    return struct.pack("<I", kind) + length + body + length


def option(code: int, value: str) -> bytes:
    data = value.encode()
    return struct.pack("<HH", code, len(data)) + data + b"\0" * (-len(data) % 4)


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


def record(kind: int, code: int, payload: bytes, stamp: bytes = b"\0" * 8) -> bytes:
    return struct.pack("<BHH", kind, HEADER - 1 + len(payload), code) + stamp + payload


class Planter:
    """Changes the messages of a drive."""

    def __init__(self, scenario: str, seed: int) -> None:
        self.scenario = scenario
        self.canaries = Canaries(random.Random(f"{scenario} {seed}"))
        make = self.canaries
        self.iccid = make.digits(19, "89")
        self.imsi = make.digits(15, "26201")
        self.msisdn = make.digits(12, "49")
        self.mailbox = make.digits(11, "49")
        self.eid = make.digits(32, "89")
        self.imei = make.digits(15, "35")
        self.tmsi = make.hexadecimal(8)
        self.address, self.gateway = make.address(), make.address()
        self.address6 = make.address6()
        self.name = make.name()
        self.secret = make.digits(14)

    def sim(self, files: dict[str, Any]) -> None:
        dice = self.canaries.dice
        files["kSimFile_ICCID"] = dice.choice([self.iccid, packed(self.iccid, True)])
        files["kSimFile_MSISDN"] = dice.choice(["+" + self.msisdn, [self.name + " +" + self.msisdn]])
        files["kSimFile_LOCI"] = f"001-01, LAC 4101, TMSI {self.tmsi}, updated"
        files["kSimFile_MBDN"] = dice.choice([self.mailbox, packed(self.mailbox, True)])
        files["kSimFile_ACC"] = self.secret
        files["kSimFile_EF6F07"] = packed("9" + self.imsi, True)
        files[self.secret] = "unknown file"

    def context(self, context: dict[str, Any]) -> None:
        context["PDP Address"] = self.address
        context["Primary DNS"] = self.address6
        context["Subscriber"] = {"Name": self.name}

    def modem(self, node: Any) -> None:
        if isinstance(node, list):
            for each in node:
                self.modem(each)
        if not isinstance(node, dict):
            return
        planted = {"kSimFile_ICCID": self.iccid, "kVoxSIMIMSI": self.imsi, "kSimFile_MSISDN": ["+" + self.msisdn],
                   "kVoxSIMEID": self.eid, "kVoxModemEquipment": self.imei, "kVoxContextAddress": self.address,
                   "kVoxContextGateway": self.address6, "kVoxContextDNS": [self.gateway]}
        for key in list(node):
            if key in planted:
                node[key] = planted[key]
            else:
                self.modem(node[key])
        node["kVoxModemReason"] = f"no answer of {self.address}: subscriber {self.imsi} (+{self.msisdn})"
        node["kVoxSomethingNew"] = self.name

    def display(self, node: dict[str, Any]) -> None:
        node["SIM"] = {"ICCID": self.iccid}
        for context in node.get("Packet Data", {}).get("Contexts", []):
            context["Address"] = self.address
        node.setdefault("Registration", {})["Subscriber"] = {"IMSI": self.imsi, self.name: ["+" + self.msisdn]}
        node["Dedicated Channel"] = {"State": "Call to " + self.mailbox}

    def payload(self, code: int, payload: bytes) -> bytes:
        form = plistlib.FMT_BINARY if payload.startswith(b"bplist") else plistlib.FMT_XML
        root = plistlib.loads(payload)
        if self.scenario == "ifx":
            self.display(root)
        elif self.scenario == "modem":
            self.modem(root)
        elif code == 0:
            self.sim(root)
        elif code == 2:
            for context in root:
                self.context(context)
        elif root:
            root[0]["kVoxCellMonitorSubscriber"] = self.imsi
        return plistlib.dumps(root, fmt=form)

    def encoded(self) -> bytes:
        value = self.canaries.dice.choice([self.imsi, self.iccid, self.imei])
        forms = [value.encode(), value.encode("utf-16-le"), value.encode("utf-16-be"), packed(value, False),
                 packed(value, True), value.encode().hex().encode(), base64.b64encode(b"x" + value.encode()),
                 gzip.compress(value.encode(), mtime=0), zlib.compress(value.encode())]
        return self.canaries.dice.choice(forms)

    def messages(self, drive: list[bytes]) -> list[bytes]:
        planted = []
        for number, message in enumerate(drive):
            start = 2 if message[:1] == b"\x81" else 0
            if self.scenario == "ifx":
                message = self.payload(-1, message)
            elif message[start : start + 1] == b"\xff" and len(message) > start + HEADER:
                header = message[: start + HEADER]
                try:
                    payload = self.payload(struct.unpack_from("<H", header, start + 3)[0], message[start + HEADER :])
                except plistlib.InvalidFileException:
                    payload = message[start + HEADER :] + self.encoded()
                except Exception:  # no property list, which the drive sends at times
                    payload = self.encoded()
                body = header[start:start + 1] + struct.pack("<H", min(HEADER - 1 + len(payload), 0xFFFF))
                message = header[:start] + body + header[start + 3 :] + payload
            elif len(message) >= start + HEADER:
                # Past the end of what is read of a record.
                message += b"\0" * 64 + self.encoded()
                length = struct.pack("<H", len(message) - start - 1)
                message = message[: start + 1] + length + message[start + 3 :]
            else:
                message += self.encoded()[: HEADER - 1 - len(message)]
            planted.append(message)
            if number % 100 == 0 and self.scenario != "ifx":
                planted.append(record(1, 0x1375, self.encoded()))
                planted.append(record(2, 0x7135, self.encoded()))
                planted.append(record(0xFF, 9, self.encoded()))
                planted.append(self.encoded())
        return planted

    def recording(self, drive: bytes) -> bytes:
        stamps = packets_of(drive)
        name = TECHNOLOGIES[self.scenario]
        end = struct.pack("<HH", 0, 0)
        out = block(0x0A0D0D0A, struct.pack("<IHHq", 0x1A2B3C4D, 1, 0, -1) + option(1, "of " + self.name) +
                    option(2, self.secret) + option(3, self.name) + option(4, self.imei) + end)
        out += block(1, struct.pack("<HHI", 147, 0, 0) + option(2, name) + option(3, self.name) +
                     struct.pack("<HHI", 9, 1, 9) + option(12, self.secret) + option(1, self.imsi) + end)
        out += block(4, struct.pack("<HH", 1, 4 + len(self.name) + 1) + bytes(4) + self.name.encode() + b"\0")
        out += block(0x00000BAD, struct.pack("<I", 32473) + self.encoded())
        out += block(0x80001234, self.encoded())
        planted = self.messages([message for _, message in stamps])
        stamp = stamps[0][0]
        for number, message in enumerate(planted):
            stamp += 10_000_000
            fields = struct.pack("<IIIII", 0, stamp >> 32, stamp & 0xFFFFFFFF, len(message), len(message))
            padded = message + b"\0" * (-len(message) % 4)
            out += block(6, fields + padded + (option(1, self.name + " " + self.msisdn) + end if number % 7 == 0 else b""))
        return out + block(5, bytes(12) + option(1, self.imsi) + end)


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
    planted.write_bytes(planter.recording(original.read_bytes()))
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
