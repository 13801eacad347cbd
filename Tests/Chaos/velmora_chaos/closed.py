# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The service and a recorder with the standard descriptors closed, attacked as with open ones."""

import random
import tempfile
from pathlib import Path

from velmora_chaos.checks import expect
from velmora_chaos.failing.recording import messages
from velmora_chaos.malformed import VARIANTS, malformed_variant
from velmora_chaos.options import Options
from velmora_chaos.raw_client import RawClient, connect, wait_for_port
from velmora_chaos.sandbox import Sandbox

ROUNDS = 20
COUNT = 200  # messages that are recorded


def run_closed(options: Options) -> None:
    """Lets both log, and checks that the service serves on and the recording holds messages alone."""
    with tempfile.TemporaryDirectory() as directory, Sandbox(options.build, Path(directory)) as sandbox:
        service = sandbox.start_closed(
            "velmora-telephonyd", "--source", "scenario:gsm,seed=1,speed=100", "--log-level", "7"
        )
        wait_for_port(sandbox.port())
        chance = random.Random(options.seed)
        for number in range(ROUNDS * VARIANTS):
            with connect(sandbox.port()) as connection:
                connection.sendall(malformed_variant(number % VARIANTS, chance))
        recording = Path(directory, "drive.pcapng")
        recorder = sandbox.start_closed("velmora-log", "record", "--count", str(COUNT), str(recording))
        status = recorder.wait()
        expect(status == 0, f"a recorder without standard descriptors ended with {status}")
        recorded = len(messages(recording.read_bytes()))
        expect(recorded == COUNT, f"recorded {recorded} messages, wanted {COUNT}")
        client = RawClient(sandbox, "client")
        client.start_streaming()
        client.close()
        service.end_cleanly()
        print(
            f"without standard descriptors: served on after {ROUNDS * VARIANTS} malformed requests, "
            f"{recorded} messages recorded"
        )
