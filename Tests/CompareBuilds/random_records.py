# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Messages of every log code with random lengths and contents, the same for the same seed."""

import contextlib
import plistlib
import random
import struct
from collections.abc import Iterable, Iterator
from typing import Any

from . import property_lists

BASEBAND, EXTRA = 1, 0xFF
SIM_FILES, CELLS, CONTEXTS = 0, 1, 2
HEADER = 13
# A section's least length is met by its own records, which are changed here and there; these are for the rest.
LENGTHS = [(0, 8), (0, 48), (0, 300), (200, 260), (0, 2200)]


def codes_of(messages: Iterable[bytes]) -> set[int]:
    """The baseband log codes of a drive, which sends every one that its technology's sections want."""
    return {struct.unpack("<H", message[3:5])[0] for message in messages
            if len(message) >= HEADER and message[0] == BASEBAND}


def record(code: int, payload: bytes, chance: random.Random, kind: int = BASEBAND) -> bytes:
    length = (HEADER + len(payload)) & 0xFFFF if chance.random() < 0.95 else chance.randrange(1 << 16)
    return struct.pack("<BHHQ", kind, length, code, chance.getrandbits(64)) + payload


def contents(length: int, chance: random.Random) -> bytes:
    """Noise seldom gets through checks of versions and counts; small numbers do."""
    shape = chance.randrange(5)
    if shape == 0:
        return chance.randbytes(length)
    if shape == 1:
        return bytes(chance.choices(range(9), k=length))
    if shape == 2:
        return bytes(chance.choices([0, 1, 2, 4, 0x7F, 0x80, 0xFF], weights=[9, 3, 2, 2, 1, 1, 2], k=length))
    if shape == 3:
        return bytes(min(length, chance.randrange(1, 6)) * [chance.randrange(5)]).ljust(length, b"\0")
    return (bytes(chance.choices(range(4), k=min(length, 8))) + chance.randbytes(length))[:length]


def changed(message: bytes, chance: random.Random) -> bytes:
    """A drive's message with a few bytes, a run or its length changed; its framing stays in most."""
    found = bytearray(message)
    first = HEADER if len(found) > HEADER else 0
    for _ in range(chance.choice([1, 1, 2, 4, 16, 64])):
        if len(found) > first:
            found[chance.randrange(first, len(found))] = chance.choice([0, 1, 2, 3, 0xFF, chance.randrange(256)])
    if chance.random() < 0.2 and len(found) > first:
        at = chance.randrange(first, len(found))
        run = min(len(found) - at, chance.randrange(1, 32))
        found[at : at + run] = chance.randbytes(run)
    if chance.random() < 0.15:
        del found[chance.randrange(len(found) + 1) :]
    elif chance.random() < 0.1:
        found += chance.randbytes(chance.randrange(1, 64))
    return bytes(found)


def is_sim_file(message: bytes) -> bool:
    """An unreadable one ends the program, and that is meant: such records are in files of their own."""
    at = 2 if message[:1] == b"\x81" else 0
    return message[at : at + 1] == b"\xff" and message[at + 3 : at + 5] in (b"\0\0", b"\0", b"")


def extra(technology: str, chance: random.Random) -> bytes:
    code = chance.choice([SIM_FILES, CELLS, CELLS, CELLS, CONTEXTS])
    value = {SIM_FILES: property_lists.sim_files, CONTEXTS: property_lists.contexts}.get(code)
    payload = property_lists.serialized(chance, value(chance) if value
                                        else property_lists.cells(chance, technology))
    if code != SIM_FILES and chance.random() < 0.05:
        payload = changed(payload, chance)
    return record(code, payload, chance, EXTRA)


def records(technology: str, count: int, seed: int, samples: list[bytes], codes: list[int]) -> Iterator[bytes]:
    """`technology` is that of the cells, `samples` are a drive's messages, `codes` those of all technologies."""
    chance = random.Random(f"{technology} {seed}")
    own = sorted(codes_of(samples))
    samples = [sample for sample in samples if not is_sim_file(sample)]
    for _ in range(count):
        shape = chance.random()
        if shape < 0.4:
            message = changed(chance.choice(samples), chance)
        elif shape < 0.45:
            message = chance.randbytes(chance.randrange(21))
        elif shape < 0.55:
            message = extra(technology, chance)
        else:
            code = chance.choice(own if shape < 0.85 else codes + [chance.randrange(1 << 16)])
            message = record(code, contents(chance.randint(*chance.choice(LENGTHS)), chance), chance)
        if chance.random() < 0.03:
            message = bytes([0x81, chance.randrange(256)]) + message
        if chance.random() < 0.02 and not is_sim_file(message):
            message = bytes([chance.randrange(2, 255)]) + message[1:]
        if not is_sim_file(message) or shape >= 0.45:
            yield message


def altered(value: Any, others: list[Any], chance: random.Random) -> Any:
    """A value of a live modem's message, with other values of the same drive, or any, here and there."""
    shape = chance.random()
    if shape < 0.03:
        return chance.choice(others)
    if shape < 0.06:
        return property_lists.anything(chance)
    if isinstance(value, dict):
        return {key: altered(each, others, chance) for key, each in value.items() if chance.random() < 0.97}
    if isinstance(value, list):
        return [altered(each, others, chance) for each in value for _ in range(chance.choice([0, 1, 1, 1, 1, 1, 2]))]
    return value


def leaves(value: Any) -> Iterator[Any]:
    children = value.values() if isinstance(value, dict) else value if isinstance(value, list) else None
    if children is None:
        yield value
    else:
        for child in children:
            yield from leaves(child)


def live_modem(count: int, seed: int, samples: list[bytes], codes: list[int]) -> Iterator[bytes]:
    """A drive's accounts with values taken out, exchanged and repeated, and records of every other kind. None of
    them ends the program."""
    chance = random.Random(f"Modem {seed}")
    accounts: list[tuple[int, Any]] = []
    for sample in samples:
        with contextlib.suppress(ValueError, plistlib.InvalidFileException):
            accounts.append((struct.unpack("<H", sample[3:5])[0], plistlib.loads(sample[HEADER:])))
    others = [leaf for _, account in accounts[:500] for leaf in leaves(account)]
    for _ in range(count):
        shape = chance.random()
        if shape < 0.7:
            code, account = chance.choice(accounts)
            yield record(code, property_lists.serialized(chance, altered(account, others, chance)), chance, EXTRA)
        elif shape < 0.9:
            yield changed(chance.choice(samples), chance)
        else:
            code = chance.choice([*codes, *range(10)])
            kind = chance.choice([BASEBAND, EXTRA])
            yield record(code, contents(chance.randint(*chance.choice(LENGTHS)), chance), chance, kind)


def displays(count: int, seed: int) -> Iterator[bytes]:
    """For the technology whose messages are displays."""
    chance = random.Random(f"IFX {seed}")
    for _ in range(count):
        yield property_lists.serialized(chance, property_lists.display(chance))


def odd_displays(samples: list[bytes], seed: int) -> Iterator[bytes]:
    """One of them, between good ones, is damaged or holds what no display holds, which ends decoding there."""
    chance = random.Random(f"odd IFX {seed}")
    odd = changed(chance.choice(samples), chance)
    if chance.random() < 0.5:
        odd = property_lists.serialized(chance, {"Registration": property_lists.scalar(chance), "SIM": "1"})
    yield from samples[:60] + [odd] + samples[60:120]
