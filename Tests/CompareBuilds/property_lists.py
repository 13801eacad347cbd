# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The extra stream's property lists, and those of the IFX technology: valid ones of every odd kind."""

import datetime
import plistlib
import random
from typing import Any

PREFIX = "kVoxCellMonitor"
TECHNOLOGIES = ["GSM", "UMTS", "UTRAN", "LTE", "CDMA", ""]
TYPES = ["Serving", "Neighbor", "Detected", ""]
NUMBERS = ["MCC", "MNC", "LAC", "TAC", "CellId", "ARFCN", "UARFCN", "PID", "SCN", "RSSI", "RSCP", "ECN0", "BandInfo"]
SIM_FILES = ["ICCID", "MSISDN", "MBDN", "HPPLMN", "LOCI", "PSLOCI", "ACC", "AD", "FPLMN", "AHPLMN", "RATMODE", "PNN",
             "OPL", "OPLMNAcT"]
CONTEXT_KEYS = ["APN", "IP Address", "Context", "State", "QoS", "a/b", "ümlaut", ""]
DISPLAY_KEYS = ["Registration", "Neighbor Cells", "Dedicated Channel", "Packet Data", "SIM", "ARFCN", "_sorted", "a/b"]


def number(chance: random.Random) -> Any:
    return chance.choice([
        chance.randrange(-150, 0), chance.randrange(0, 512), chance.randrange(0, 1 << 16), 2**31 - 1, 2**31, -(2**31),
        -(2**31) - 1, 2**63 - 1, -(2**63), chance.randrange(-(2**40), 2**40), 0,
    ])


def text(chance: random.Random) -> str:
    letters = "0123456789abcF -./<&>\"'é€\U0001f4f6"
    return "".join(chance.choices(letters, k=chance.randrange(24)))


def scalar(chance: random.Random) -> Any:
    """A value of any kind that is no collection."""
    return chance.choice([
        number(chance), text(chance), chance.randbytes(chance.randrange(20)), chance.random() < 0.5,
        float(chance.randrange(-200, 200)), chance.uniform(-1e12, 1e12), 1e300, float("inf"), float("nan"),
        datetime.datetime(2026, 1, chance.randrange(1, 29), 8, 0, chance.randrange(60)),
    ])


def anything(chance: random.Random, depth: int = 0) -> Any:
    shape = chance.random()
    if depth < 3 and shape < 0.15:
        return [anything(chance, depth + 1) for _ in range(chance.randrange(4))]
    if depth < 3 and shape < 0.3:
        return {chance.choice(CONTEXT_KEYS): anything(chance, depth + 1) for _ in range(chance.randrange(4))}
    return scalar(chance)


def cell(chance: random.Random, technology: str) -> Any:
    """Now and then one that lacks keys, or whose values are of the wrong kinds."""
    if chance.random() < 0.03:
        return anything(chance)
    own = technology if chance.random() < 0.7 else chance.choice(TECHNOLOGIES)
    kind = "Serving" if chance.random() < 0.3 else chance.choice(TYPES)
    fields: dict[str, Any] = {
        f"{PREFIX}CellRadioAccessTechnology": f"{PREFIX}RadioAccessTechnology{own}",
        f"{PREFIX}CellType": f"{PREFIX}CellType{kind}",
    }
    fields |= {PREFIX + name: number(chance) for name in NUMBERS}
    lacks, wrong = chance.choice([(0, 0), (0, 0), (0.1, 0), (0, 0.1), (0.5, 0.2)])
    for key in list(fields):
        if chance.random() < lacks:
            del fields[key]
        elif chance.random() < wrong:
            fields[key] = anything(chance)
    if chance.random() < 0.1:
        fields[text(chance)] = anything(chance)
    keys = list(fields)
    if chance.random() < 0.5:
        chance.shuffle(keys)
    return {key: fields[key] for key in keys}


def cells(chance: random.Random, technology: str) -> Any:
    own = chance.choice(["GSM", "UMTS"]) if technology == "GSM" else technology
    return [cell(chance, own) for _ in range(chance.choice([0, 1, 1, 2, 5, 12]))]


def sim_files(chance: random.Random) -> Any:
    if chance.random() < 0.05:
        return anything(chance)
    chosen = [name for name in SIM_FILES if chance.random() < 0.8] + ["OTHER"]
    return {"kSimFile_" + name: text(chance) if chance.random() < 0.8 else anything(chance) for name in chosen}


def contexts(chance: random.Random) -> Any:
    if chance.random() < 0.1:
        return anything(chance)
    return [{key: text(chance) if chance.random() < 0.7 else anything(chance) for key in CONTEXT_KEYS}
            for _ in range(chance.randrange(4))]


def display(chance: random.Random, depth: int = 0) -> Any:
    """What the IFX technology sends: strings in dictionaries and arrays, and nothing else."""
    shape = chance.random()
    if depth == 0 or (depth < 4 and shape < 0.35):
        chosen = chance.sample(DISPLAY_KEYS, chance.randrange(1, 5))
        return {key: display(chance, depth + 1) for key in chosen}
    if depth < 4 and shape < 0.5:
        return [display(chance, depth + 1) for _ in range(chance.randrange(4))]
    return text(chance)


def serialized(chance: random.Random, value: Any) -> bytes:
    form = chance.choice([plistlib.FMT_XML, plistlib.FMT_BINARY])
    return plistlib.dumps(value, fmt=form, sort_keys=False)
