# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Decodes 0xB17F with construct: the record's layout is declared, as its bits are numbered."""

import importlib
from typing import Any

from velmora_compare.decoders.packets import HEADER_LENGTH, run
from velmora_compare.decoders.texts import texts


def layout() -> Any:
    """The payload; of each little-endian word the highest bits are named first."""
    c = importlib.import_module("construct")

    def word(*fields: Any) -> Any:
        return c.ByteSwapped(c.BitStruct(*fields))

    def bits(name: str, count: int) -> Any:
        return name / c.BitsInteger(count)

    return c.Struct(
        "version" / c.Int8ul, c.Padding(3), "channel" / c.Int16ul,
        "serving" / word(c.Padding(3), bits("priority", 4), bits("cell", 9)),
        "levels" / word(bits("average_rsrq", 7), bits("rsrq", 7), bits("average_rsrp", 9), bits("rsrp", 9)),
        "limits" / word(c.Padding(4), bits("maximum_power", 6), bits("power", 7), bits("minimum", 6), bits("rssi", 9)),
        "selection" / word(c.Padding(2), bits("rules", 4), bits("updated", 1), bits("non_intra", 6), bits("intra", 6),
                           bits("cycles", 6), bits("level", 7)),
    )


class Decoder:
    """Decodes one record after the other."""

    def __init__(self) -> None:
        self._layout = layout()

    def decode(self, record: bytes) -> dict[str, str]:
        values = self._layout.parse(record[HEADER_LENGTH:])
        for part in ("serving", "levels", "limits", "selection"):
            values.update(values[part])
        return texts(values)


if __name__ == "__main__":
    run(Decoder().decode)
