# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Events as velmora-log lists them and as make-drive knows them."""

import json
import re
from collections.abc import Iterable
from dataclasses import dataclass, field
from datetime import datetime, timezone


def seconds(text: str) -> float:
    """Seconds since 1970 of a time in UTC with up to nine digits of the second."""
    whole, _, fraction = text.removesuffix("Z").partition(".")
    moment = datetime.fromisoformat(whole).replace(tzinfo=timezone.utc)
    return moment.timestamp() + float(f"0.{fraction or 0}")


@dataclass(frozen=True)
class Event:
    """Something that happened, by either source."""

    time: float
    kind: str
    end: float | None = None
    is_hidden: bool = False
    fields: dict[str, str] = field(default_factory=dict, compare=False)


def plain(text: str) -> str:
    """The letters and digits of a text: names are written in more than one way."""
    return re.sub(r"[^a-z0-9]", "", text.lower())


def _text(value: object) -> str:
    if isinstance(value, float) and value.is_integer():
        return str(int(value))
    return str(value)


def truth_of(lines: Iterable[str]) -> list[Event]:
    """What make-drive --truth has written."""
    events = []
    for line in lines:
        parts = json.loads(line)
        moment, kind, end = parts.pop("time"), parts.pop("kind"), parts.pop("end", None)
        is_hidden = parts.pop("hidden", False)
        events.append(Event(seconds(moment), kind, seconds(end) if end else None, is_hidden, parts))
    return events


def found_of(lines: Iterable[str]) -> list[Event]:
    """What velmora-log events --format jsonl has written."""
    events = []
    for line in lines:
        parts = json.loads(line)
        end = parts.get("end")
        fields = {name: _text(value) for name, value in parts.get("fields", {}).items()}
        fields["text"] = parts.get("text", "")
        events.append(
            Event(seconds(parts["time"]), parts["kind"], seconds(end) if end else None, fields=fields)
        )
    return events
