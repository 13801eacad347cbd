# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Random identities, and where they are planted in a drive's messages and in its recording."""

from __future__ import annotations

import base64
import gzip
import plistlib
import random
import struct
import zlib
from dataclasses import dataclass, field
from typing import Any

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


def block(kind: int, body: bytes) -> bytes:
    body += b"\0" * (-len(body) % 4)
    length = struct.pack("<I", len(body) + 12)
    return struct.pack("<I", kind) + length + body + length


def option(code: int, value: str) -> bytes:
    data = value.encode()
    return struct.pack("<HH", code, len(data)) + data + b"\0" * (-len(data) % 4)


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

    def recording(self, name: str, drive: list[tuple[int, bytes]]) -> bytes:
        """The packets of a drive of that technology, with identities in them and around them."""
        end = struct.pack("<HH", 0, 0)
        out = block(0x0A0D0D0A, struct.pack("<IHHq", 0x1A2B3C4D, 1, 0, -1) + option(1, "of " + self.name) +
                    option(2, self.secret) + option(3, self.name) + option(4, self.imei) + end)
        out += block(1, struct.pack("<HHI", 147, 0, 0) + option(2, name) + option(3, self.name) +
                     struct.pack("<HHI", 9, 1, 9) + option(12, self.secret) + option(1, self.imsi) + end)
        out += block(4, struct.pack("<HH", 1, 4 + len(self.name) + 1) + bytes(4) + self.name.encode() + b"\0")
        out += block(0x00000BAD, struct.pack("<I", 32473) + self.encoded())
        out += block(0x80001234, self.encoded())
        planted = self.messages([message for _, message in drive])
        stamp = drive[0][0]
        for number, message in enumerate(planted):
            stamp += 10_000_000
            fields = struct.pack("<IIIII", 0, stamp >> 32, stamp & 0xFFFFFFFF, len(message), len(message))
            padded = message + b"\0" * (-len(message) % 4)
            out += block(6, fields + padded + (option(1, self.name + " " + self.msisdn) + end if number % 7 == 0 else b""))
        return out + block(5, bytes(12) + option(1, self.imsi) + end)
