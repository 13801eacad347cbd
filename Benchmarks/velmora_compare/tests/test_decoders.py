# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The decoders in Python."""

import importlib.util
import io
import struct
import unittest

from velmora_compare.decoders import packets, with_construct, with_struct

# Header, then version 3; E-ARFCN 1300; cell 503, priority 5; RSRP 162, 162; RSRQ 81, 23; RSSI 150; Qrxlevmin 10, P_Max
# 82, maximum power 54; Srxlev 40, cycles 3; searches 21 and 3, not updated, rules 5.
RECORD = bytes.fromhex("01 2000 7FB1 0000000000000000 03 EEEEEE 1405 F70B A244452F 9614A90D A8A11A14")
TEXTS = {
    "Version": "3", "E-ARFCN": "1300", "Physical Cell ID": "503", "Serving Layer Priority": "5",
    "Measured RSRP": "-99.50 dBm", "Average RSRP": "-99.50 dBm", "Measured RSRQ": "-9.75 dB",
    "Average RSRQ": "-24.25 dB", "Measured RSSI": "-65.00 dBm", "Qrxlevmin": "-120 dBm", "P_Max": "52 dBm",
    "Max UE Tx Power": "24 dBm", "Srxlev": "10 dBm", "Num of Consecutive DRX Cycles of S < 0": "3",
    "S Intra Search": "42 dB", "S Non Intra Search": "6 dBm", "Measurement Rules Updated": "False",
    "Measurement Rules": "5",
}
ABSENT = {  # the bits that make the value 64, 32 and 32
    "P_Max": {26: 0x00, 27: 0x20},
    "S Intra Search": {30: 0x00, 31: 0x04},
    "S Non Intra Search": {31: 0x00, 32: 0x01},
}


def with_bytes(changed: dict[int, int]) -> bytes:
    return bytes(changed.get(at, byte) for at, byte in enumerate(RECORD))


def packet(time_ns: int, message: bytes) -> bytes:
    body = struct.pack("<IIIII", 0, time_ns >> 32, time_ns & 0xFFFFFFFF, len(message), len(message))
    body += message + bytes(-len(message) % 4)
    length = struct.pack("<I", len(body) + 12)
    return struct.pack("<I", packets.PACKET) + length + body + length


class StructTest(unittest.TestCase):
    def test_a_record(self) -> None:
        self.assertEqual(with_struct.decode(RECORD), TEXTS)

    def test_one_raw_value_means_not_present(self) -> None:
        for label, changed in ABSENT.items():
            self.assertEqual(with_struct.decode(with_bytes(changed))[label], "Not Present")


@unittest.skipUnless(importlib.util.find_spec("construct"), "construct is not installed")
class ConstructTest(unittest.TestCase):
    def test_a_record(self) -> None:
        self.assertEqual(with_construct.Decoder().decode(RECORD), TEXTS)

    def test_one_raw_value_means_not_present(self) -> None:
        for label, changed in ABSENT.items():
            self.assertEqual(with_construct.Decoder().decode(with_bytes(changed))[label], "Not Present")


class LinesTest(unittest.TestCase):
    def lines_of(self, *messages: bytes) -> list[str]:
        output = io.StringIO()
        content = b"".join(packet(1_767_600_004_617_000_000, message) for message in messages)
        packets.write_lines(content, lambda record: {"Length": str(len(record))}, output)
        return output.getvalue().splitlines()

    def test_the_time_in_nanoseconds(self) -> None:
        self.assertEqual(self.lines_of(RECORD), [
            '{"time":"2026-01-05T08:00:04.617000000Z","code":45439,'
            '"sections":{"Serving Cell Measurements":{"Length":"33"}}}'])

    def test_a_short_record_shows_the_one_before(self) -> None:
        first, second = self.lines_of(RECORD, RECORD[:-1])
        self.assertEqual(second, first)

    def test_the_prefix_is_no_part_of_the_record(self) -> None:
        self.assertIn('"Length":"33"', self.lines_of(bytes([packets.PREFIX_MARKER, 0]) + RECORD)[0])
