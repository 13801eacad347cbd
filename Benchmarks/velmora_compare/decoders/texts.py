# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""How the values of a serving cell measurement are shown."""

from typing import Any


def texts(values: Any) -> dict[str, str]:
    """The texts by label, of an object that has the raw values as attributes."""
    return {
        "Version": str(values.version),
        "E-ARFCN": str(values.channel),
        "Physical Cell ID": str(values.cell),
        "Serving Layer Priority": str(values.priority),
        "Measured RSRP": f"{values.rsrp / 4 - 140:.2f} dBm",
        "Average RSRP": f"{values.average_rsrp / 4 - 140:.2f} dBm",
        "Measured RSRQ": f"{values.rsrq / 4 - 30:.2f} dB",
        "Average RSRQ": f"{values.average_rsrq / 4 - 30:.2f} dB",
        "Measured RSSI": f"{values.rssi / 2 - 140:.2f} dBm",
        "Qrxlevmin": f"{values.minimum * 2 - 140} dBm",
        "P_Max": "Not Present" if values.power == 64 else f"{values.power - 30} dBm",
        "Max UE Tx Power": f"{values.maximum_power - 30} dBm",
        "Srxlev": f"{values.level - 30} dBm",
        "Num of Consecutive DRX Cycles of S < 0": str(values.cycles),
        "S Intra Search": "Not Present" if values.intra == 32 else f"{values.intra * 2} dB",
        "S Non Intra Search": "Not Present" if values.non_intra == 32 else f"{values.non_intra * 2} dBm",
        "Measurement Rules Updated": "True" if values.updated else "False",
        "Measurement Rules": str(values.rules),
    }
