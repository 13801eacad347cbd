# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Recordings whose names and texts try to get out of the page's text."""

import plistlib
from pathlib import Path

from CompareBuilds import pcapng

# Ends elements, attributes, comments and strings; turns the text's order; ends it.
NAMES = [
    "</script><script>window.hacked = 1</script>",
    "<img src=x onerror='window.hacked = 2'>",
    "\"><svg onload=window.hacked=3>",
    "'--><!--<script>",
    "]]>\\u003c/script>\\",
    "\u202egnp.exe\u2066\u200f\u2028\u2029\ufeff",
    "{{constructor}} ${window.hacked=4}",
]
LONE = "\u4242"  # stands for half a pair of surrogates, which Python does not write


def comment(text: str) -> bytes:
    content = text.encode()
    return pcapng.option(1, content)


def packet_with_comment(time_ns: int, message: bytes, text: str) -> bytes:
    plain = pcapng.packet(time_ns, message)
    body = plain[8:-4] + comment(text) + pcapng.option(0, b"")
    return pcapng.block(pcapng.PACKET, body)


def display(name: str, number: int) -> bytes:
    """A message of the technology whose messages name their own leaves."""
    values = {"RxLev": f"{-70 - number % 7} dBm", "ARFCN": str(20 + number % 3), "Band": name, name: f"{name} {number}"}
    tree = {"Serving Cell": values, "Registration": {"State": name}, name: {name: [{name: "1"}, {name: name}]},
            "PDP Contexts": [{"Context ID": name, "APN": name, "PDP Address": name}],
            "Neighbor Cells": [{"RxLev": f"{-80 - number % 5} dBm", "ARFCN": "30", "BSIC": name}]}
    return plistlib.dumps(tree, fmt=plistlib.FMT_BINARY)


def write_recording(path: Path) -> None:
    names = [*NAMES, LONE + "x"]
    with path.open("wb") as file:
        file.write(pcapng.head("IFX"))
        for number in range(600):
            name = names[number // 4 % len(names)]
            message = display(name, number).replace(LONE.encode("utf-16-be"), b"\xd8\x00")
            time_ns = pcapng.BEGINNING_NS + number * 250_000_000
            file.write(packet_with_comment(time_ns, message, name + "\0\x1b[31m") if number % 50 == 0
                       else pcapng.packet(time_ns, message))
        file.write(b"</script>")  # damage


def write_rules(path: Path) -> None:
    text = "</script><script>window.hacked = 5</script> {serving.level} \\u202e"
    path.write_text(f'[[rule]]\nname = "hostile"\nwhen = "serving.level < -72 dBm"\nseverity = "critical"\ntext = "{text}"\n')
