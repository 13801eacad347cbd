# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the frames and of malformed input."""

import plistlib
import random
import socket
import tempfile
import threading
import time
import unittest
from pathlib import Path
from typing import Any

from velmora_chaos.checks import Problem
from velmora_chaos.malformed import VARIANTS, malformed_input, malformed_variant
from velmora_chaos.raw_client import ONE_WAY, REPLY, REQUEST, call, connect, frame


def reply_with(data: bytes, request: dict[str, Any]) -> tuple[dict[str, Any], bytes]:
    """The result of a call that is answered by those bytes, and the bytes of the request."""
    ours, theirs = socket.socketpair()
    received: list[bytes] = []

    def answer() -> None:
        received.append(theirs.recv(4096))
        theirs.sendall(data)
        theirs.close()

    thread = threading.Thread(target=answer)
    thread.start()
    try:
        return call(ours, request), received[0]
    finally:
        thread.join()
        ours.close()


class FrameTest(unittest.TestCase):
    def test_header_is_little_endian_length_id_flags_serial(self) -> None:
        self.assertEqual(
            frame(ONE_WAY, b"abc", 0x01020304),
            b"\x03\0\0\0" b"\0\0\0\0" b"\x04\0\0\0" b"\x04\x03\x02\x01" b"abc",
        )


class CallTest(unittest.TestCase):
    def test_sends_a_request_and_returns_the_reply(self) -> None:
        reply, sent = reply_with(frame(REPLY, plistlib.dumps({"Port": "p.1"}), 1), {"CreateLogChannel": "n"})
        self.assertEqual(reply, {"Port": "p.1"})
        self.assertEqual(sent[8:16], bytes([REQUEST, 0, 0, 0, 1, 0, 0, 0]))
        self.assertEqual(plistlib.loads(sent[16:]), {"CreateLogChannel": "n"})

    def test_an_empty_reply_is_an_empty_dictionary(self) -> None:
        self.assertEqual(reply_with(frame(REPLY, b"", 1), {})[0], {})

    def test_a_reply_that_comes_in_pieces_is_read_whole(self) -> None:
        ours, theirs = socket.socketpair()
        ours.settimeout(10)
        data = frame(REPLY, plistlib.dumps({"Port": "p.1"}), 1)

        def answer() -> None:
            for part in (data[:5], data[5:30], data[30:]):
                theirs.sendall(part)
                time.sleep(0.02)

        thread = threading.Thread(target=answer)
        with ours, theirs:
            thread.start()
            self.assertEqual(call(ours, {}), {"Port": "p.1"})
            thread.join()

    def test_a_closed_connection_is_no_reply(self) -> None:
        with self.assertRaisesRegex(Problem, "^no reply$"):
            reply_with(b"\0" * 15, {})

    def test_a_reply_that_is_not_a_dictionary_is_reported(self) -> None:
        with self.assertRaisesRegex(Problem, "^the reply is not a dictionary$"):
            reply_with(frame(REPLY, plistlib.dumps([1]), 1), {})


class ConnectTest(unittest.TestCase):
    def setUp(self) -> None:
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.port = Path(temporary.name, "port")
        self.listening = socket.socket(socket.AF_UNIX)
        self.addCleanup(self.listening.close)
        self.listening.bind(str(self.port))
        self.listening.listen(0)
        self.waiting = connect(self.port)  # fills the queue
        self.addCleanup(self.waiting.close)

    def test_waits_while_the_queue_is_full(self) -> None:
        accepted: list[socket.socket] = []
        thread = threading.Timer(0.05, lambda: accepted.append(self.listening.accept()[0]))
        thread.start()
        connect(self.port).close()
        thread.join()
        accepted[0].close()

    def test_gives_up_after_the_limit(self) -> None:
        with self.assertRaises(BlockingIOError):
            connect(self.port, limit_s=0.02)

    def test_a_port_without_an_owner_is_refused_at_once(self) -> None:
        self.listening.close()
        with self.assertRaises(ConnectionRefusedError):
            connect(self.port)


class MalformedInputTest(unittest.TestCase):
    def test_the_same_seed_sends_the_same(self) -> None:
        first, second = random.Random(3), random.Random(3)
        self.assertEqual(
            [malformed_input(first) for _ in range(50)], [malformed_input(second) for _ in range(50)]
        )

    def test_every_variant_occurs(self) -> None:
        variants = {malformed_variant(number, random.Random(1)) for number in range(VARIANTS)}
        self.assertEqual(len(variants), VARIANTS)

    def test_the_truncated_header_is_shorter_than_a_header(self) -> None:
        self.assertEqual(len(malformed_variant(1, random.Random(1))), 12)

    def test_the_oversized_frame_announces_the_largest_length(self) -> None:
        self.assertEqual(malformed_variant(2, random.Random(1))[:4], b"\xff\xff\xff\xff")
