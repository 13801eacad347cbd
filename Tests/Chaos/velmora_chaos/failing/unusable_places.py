# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The list of unusable places: no directory for ports or files, a full disk, read-only resources."""

from pathlib import Path

from velmora_chaos.failing.unusable_place import UnusablePlace
from velmora_chaos.sandbox import RECORDINGS, SERVER_PORT


def all_unusable_places() -> list[UnusablePlace]:
    """Every one, in the order in which they are tried."""
    gsm = str(RECORDINGS / "gsm.pcapng")
    record = ["velmora-log", "record", "--duration", "0.3"]
    no_ports = {"VELMORA_PORT_DIR": "@file/ports"}
    cannot_be_made = "port directory @file/ports cannot be made: Not a directory"
    missing = "No such file or directory"
    return [
        UnusablePlace(
            "service without a port directory",
            ["velmora-telephonyd", "--source", "scenario:gsm"],
            1,
            [cannot_be_made, f"velmora-telephonyd: cannot make the port {SERVER_PORT}"],
            no_ports,
        ),
        UnusablePlace(
            "record without a port directory",
            [*record, "@new.pcapng"],
            1,
            [cannot_be_made, "velmora-log: nothing was recorded: "],
            no_ports,
        ),
        UnusablePlace(
            "decode to a full disk",
            ["velmora-log", "decode", gsm],
            1,
            ["velmora-log: cannot write standard output: No space left on device"],
            output=Path("/dev/full"),
        ),
        UnusablePlace(
            "record to a full disk",
            [*record, "/dev/full"],
            1,
            ["velmora-log: nothing was recorded: "],
        ),
        UnusablePlace(
            "record to a missing directory",
            ["velmora-log", "record", "@none/new.pcapng"],
            1,
            [f"velmora-log: cannot create @none/new.pcapng: {missing}"],
        ),
        UnusablePlace(
            "convert to a missing directory",
            ["velmora-log", "convert", gsm, "@none/new.pcapng"],
            1,
            [f"velmora-log: @none/new.pcapng: cannot be opened for writing: {missing}"],
        ),
        UnusablePlace(
            "save to a missing directory",
            ["tests/save-once", "@none"],
            0,
            [
                "refused; goes on",
                f"Snapshot: cannot be opened for writing: {missing}",
                "<3>Unable to write snapshot to ",
            ],
        ),
        UnusablePlace(
            "decode with read-only resources",
            ["velmora-log", "decode", gsm],
            0,
            ["GSM Serving Cell"],
            {"VELMORA_RESOURCES": "@resources"},
        ),
        UnusablePlace(
            "decode without standard descriptors",
            ["velmora-log", "--log-level", "7", "--verbose", "decode", gsm],
            0,
            [],
            is_closed=True,
        ),
        UnusablePlace(
            "service with an unknown source, without standard descriptors",
            ["velmora-telephonyd", "--source", "none"],
            2,
            [],
            is_closed=True,
        ),
        UnusablePlace(
            "record without standard descriptors or a port directory",
            [*record, "@new.pcapng"],
            1,
            [],
            no_ports,
            is_closed=True,
        ),
    ]
