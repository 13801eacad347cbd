# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What `velmora-log report` does with its files."""

import os
import pty
import re
import stat
import struct
import subprocess
from collections.abc import Iterator
from pathlib import Path
from typing import Any

from . import numbers, static
from .numbers import FIGURES


class Command:
    def __init__(self, program: Path) -> None:
        self.program = program

    def run(self, *arguments: object) -> tuple[int, str]:
        done = subprocess.run([self.program, "report", *map(str, arguments)], capture_output=True, text=True, check=False)
        # The decoders' own lines begin with their urgency.
        return done.returncode, "".join(line for line in done.stderr.splitlines(True) if not line.startswith("<"))


def check_output(command: Command, drive: Path, directory: Path) -> Iterator[str]:
    page = directory / "page.html"
    mask = os.umask(0)
    status, message = command.run(drive, "-o", page)
    os.umask(mask)
    if (status, message) != (0, ""):
        yield f"a page ends with {status} and {message!r}"
    if (mode := stat.S_IMODE(page.stat().st_mode)) != 0o600:
        yield f"the page has mode {mode:o}, wanted 600"
    before = page.read_bytes()
    status, message = command.run(drive, "-o", page)
    if status != 1 or "already" not in message or page.read_bytes() != before:
        yield f"a page that exists ends with {status} and {message!r}"
    if command.run(drive, "-o", page, "--force") != (0, "") or page.read_bytes() != before:
        yield "another page of the same recording is not the same"
    content = drive.read_bytes()
    status, message = command.run(drive, "-o", drive, "--force")
    if status != 1 or "is the input" not in message or drive.read_bytes() != content:
        yield f"the input as output ends with {status} and {message!r}"
    if left := [path.name for path in directory.iterdir() if path not in (page, drive)]:
        yield f"files are left: {left}"


def check_damage(command: Command, drive: Path, directory: Path) -> Iterator[str]:
    cut, page = directory / "cut.pcapng", directory / "cut.html"
    content = drive.read_bytes()
    cut.write_bytes(content[: len(content) // 2 + 1])
    status, message = command.run(cut, "-o", page)
    text = page.read_text()
    place = message.split("at offset ")[-1].split(":")[0] if "at offset " in message else None
    if status != 1 or place is None or f">{place}<" not in text:
        yield f"a truncated recording ends with {status} and {message!r}, and the page does not have that place"
    absent, page = directory / "absent.pcapng", directory / "absent.html"
    status, message = command.run(drive, absent, "-o", page)
    if status != 1 or str(absent) not in message or "Not all of absent.pcapng could be read" not in page.read_text():
        yield f"a recording that does not exist ends with {status} and {message!r}"


def without_numbers(series: dict[str, Any]) -> dict[str, Any]:
    """What is the same in a page of one file and in one of two."""
    return {key: value for key, value in series.items() if key not in ("file", "minimumAtSteps")}


def check_series(data: dict[str, Any], alone: dict[str, Any], index: int) -> Iterator[str]:
    """The series and bands of a file in a comparison are those of it alone."""
    for member in ("series", "bands"):
        got = [without_numbers(each) for each in data[member] if each["file"] == index]
        wanted = [without_numbers(each) for each in alone[member]]
        for one, other in ((each, alone[member]) for each in got if member == "series"):
            if one not in wanted:
                yield f"file {index}: the series of {one['path']} is not that of it alone, of {len(other)}"
        if len(got) != len(wanted):
            yield f"file {index}: {len(got)} {member}, wanted {len(wanted)}"


def check_comparison(command: Command, program: Path, drives: list[Path], directory: Path) -> Iterator[str]:
    """Of two files the figures and charts of each are those of it alone."""
    page = directory / "two.html"
    command.run(*drives, "-o", page)
    data = static.data_of(page.read_text())
    for index, drive in enumerate(drives):
        one = directory / "one.html"
        command.run(drive, "-o", one, "--force")
        yield from check_series(data, static.data_of(one.read_text()), index)
    roles = data["roles"]
    for index, drive in enumerate(drives):
        wanted = numbers.document(program, "stats", "--format", "json", drive)[0]["roles"]
        for role in (each for each in roles if each["file"] == index):
            other = next(each for each in wanted if each["role"] == role["role"])
            for name in FIGURES:
                if role["figures"].get(name) != other.get(name):
                    yield f"{drive.name}, {role['role']}, {name}: got {role['figures'].get(name)}, wanted {other.get(name)}"
    if {role["file"] for role in roles} != {0, 1}:
        yield "the comparison does not have both files"


CONTEXTS = re.compile(r"<caption>Contexts that were active when their first list came(.*?)</table>", re.S)


def check_start_contexts(command: Command, program: Path, maker: Path, directory: Path) -> Iterator[str]:
    """A part of a drive has the contexts at its start that came up before it and went down in it."""
    drive, part, page = (directory / name for name in ("modem-drive.pcapng", "part.pcapng", "part.html"))
    subprocess.run([maker, "modem", "3", "900s", drive], check=True)
    changes = [(numbers.nanoseconds(each["time"]), each["kind"], each["fields"]["context"])
               for each in numbers.objects(program, "events", "--kind", "context-up,context-down", "--format", "jsonl", drive)]
    # In the middle of the first context that lasts for a minute.
    lasting = ((begin, end, context) for begin, kind, context in changes for end, other, same in changes
               if (kind, other, same) == ("context-up", "context-down", context) and end - begin > 60 * 10**9)
    begin, end, context = next(lasting)
    start = f"{(begin + 20 * 10**9) / 1e9:.3f}"
    subprocess.run([program, "convert", "--from", start, drive, part], check=True, stderr=subprocess.DEVNULL)
    command.run(part, "-o", page)
    found = CONTEXTS.search(page.read_text())
    if found is None or f"<td>context {context}</td>" not in found[1]:
        yield f"the context {context}, which was active at the start, is not in {found and found[1]}"
    elif found[1].count("<tr><td>") > len({name for time, kind, name in changes if time <= end}):
        yield f"more contexts than there were at the start: {found[1]}"
    command.run(drive, "-o", page, "--force")
    if (found := CONTEXTS.search(page.read_text())) is None or "<td>context" in found[1]:
        yield f"contexts at the start of the whole drive: {found and found[1]}"


def check_progress(command: Command, drive: Path, directory: Path) -> Iterator[str]:
    """A long file's progress is shown on a terminal, and gone at the end; elsewhere there is none."""
    padded, page = directory / "padded.pcapng", directory / "padded.html"
    filler = struct.pack("<II", 0x0BAD, 8 << 20) + bytes((8 << 20) - 12) + struct.pack("<I", 8 << 20)
    padded.write_bytes(drive.read_bytes() + filler * 9)
    terminal, end = pty.openpty()
    done = subprocess.Popen([command.program, "report", padded, "-o", page], stdout=subprocess.PIPE, stderr=end)
    os.close(end)
    shown = b""
    try:
        while part := os.read(terminal, 4096):
            shown += part
    except OSError:  # the other end is closed
        pass
    output = done.communicate()[0]
    os.close(terminal)
    if done.returncode != 0 or output or not page.exists():
        yield f"on a terminal it ends with {done.returncode} and {output!r}"
    lines = [line for line in shown.decode().split("\n") if "<3>" not in line]
    if "0 %" not in shown.decode() or any(b"%" in line.encode() for line in lines[-1:] if not line.endswith(("\r", "\x1b[K"))):
        yield f"the progress on a terminal is {shown!r}"
    status, message = command.run(padded, "-o", page, "--force")
    if status != 0 or "%" in message:
        yield f"without a terminal it ends with {status} and {message!r}"


def check_identities(command: Command, maker: Path, directory: Path) -> Iterator[str]:
    """With random identities, which the maker of the drive lists."""
    for scenario in ("gsm", "lte", "modem", "ifx"):
        drive, listed, page = directory / "identities.pcapng", directory / "identities.txt", directory / "identities.html"
        subprocess.run([maker, "--identities", listed, scenario, "7", "6000", drive], check=True)
        secrets = [line.split("\t")[-1].strip() for line in listed.read_text().splitlines()]
        secrets = [each for each in secrets if len(each) >= 6]
        if not secrets:
            yield f"{scenario}: there are no identities to look for"
        command.run(drive, "-o", page, "--force")
        text = page.read_text()
        yield from (f"{scenario}: the page has {secret}" for secret in secrets if secret in text)
        drive.unlink()
        listed.unlink()


def check_command(program: Path, maker: Path, drives: list[Path], directory: Path) -> Iterator[str]:
    command = Command(program)
    for check, name in ((check_output, "output"), (check_damage, "damage")):
        place = directory / name
        place.mkdir()
        drive = place / drives[0].name
        drive.write_bytes(drives[0].read_bytes())
        yield from check(command, drive, place)
    yield from check_comparison(command, program, drives, directory)
    yield from check_identities(command, maker, directory)
    yield from check_start_contexts(command, program, maker, directory)
    yield from check_progress(command, drives[0], directory)
