# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What `velmora-log report` does with its files."""

import os
import stat
import subprocess
from collections.abc import Iterator
from pathlib import Path

from . import numbers, static
from .numbers import FIGURES


class Command:
    def __init__(self, program: Path) -> None:
        self._program = program

    def run(self, *arguments: object) -> tuple[int, str]:
        done = subprocess.run([self._program, "report", *map(str, arguments)], capture_output=True, text=True, check=False)
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


def check_comparison(command: Command, program: Path, drives: list[Path], directory: Path) -> Iterator[str]:
    """Of two files the figures of each are those of it alone."""
    page = directory / "two.html"
    command.run(*drives, "-o", page)
    roles = static.data_of(page.read_text())["roles"]
    for index, drive in enumerate(drives):
        wanted = numbers.document(program, "stats", "--format", "json", drive)[0]["roles"]
        for role in (each for each in roles if each["file"] == index):
            other = next(each for each in wanted if each["role"] == role["role"])
            for name in FIGURES:
                if role["figures"].get(name) != other.get(name):
                    yield f"{drive.name}, {role['role']}, {name}: got {role['figures'].get(name)}, wanted {other.get(name)}"
    if {role["file"] for role in roles} != {0, 1}:
        yield "the comparison does not have both files"


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
