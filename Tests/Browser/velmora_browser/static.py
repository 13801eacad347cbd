# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What holds for a page without a browser: what is there for those who have scripts off."""

import base64
import hashlib
import json
import re
from collections import Counter
from collections.abc import Iterator
from html.parser import HTMLParser
from typing import Any

DATA = re.compile(r'<script type="application/json" id="data">(.*?)</script>', re.S)
VOID = {"meta"}


class Elements(HTMLParser):
    """Counts elements and their text, and checks that they are nested."""

    def __init__(self) -> None:
        super().__init__(convert_charrefs=True)
        self.counts: Counter[str] = Counter()
        self.sources: list[tuple[str, dict[str, str | None], str]] = []  # of scripts and styles
        self.problems: list[str] = []
        self.policy = ""
        self._open: list[str] = []
        self._source: tuple[str, dict[str, str | None]] | None = None

    def handle_starttag(self, tag: str, attrs: list[tuple[str, str | None]]) -> None:
        self.counts[tag] += 1
        attributes = dict(attrs)
        self.problems += [f"<{tag}> has {name}" for name in attributes if name.startswith("on") or name == "style"]
        self.problems += [f"<{tag}> refers to {attributes[name]}" for name in ("src", "href")
                          if not (attributes.get(name) or "#").startswith("#")]
        if attributes.get("http-equiv") == "Content-Security-Policy":
            self.policy = attributes["content"] or ""
        if tag in ("script", "style"):
            self._source = (tag, attributes)
        if tag not in VOID:
            self._open.append(tag)

    def handle_endtag(self, tag: str) -> None:
        if not self._open or self._open.pop() != tag:
            self.problems.append(f"</{tag}> ends what it did not begin")

    def handle_data(self, data: str) -> None:
        if self._source:
            self.sources.append((*self._source, data))
            self._source = None

    def handle_startendtag(self, tag: str, attrs: list[tuple[str, str | None]]) -> None:
        self.handle_starttag(tag, attrs)
        if tag not in VOID:
            self._open.pop()


def data_of(page: str) -> dict[str, Any]:
    found = DATA.search(page)
    if not found:
        raise ValueError("the page has no data")
    data: dict[str, Any] = json.loads(found.group(1))
    return data


def check_static(page: str) -> Iterator[str]:
    elements = Elements()
    elements.feed(page)
    elements.close()
    yield from elements.problems
    if elements.counts["script"] != 2 or elements.counts["style"] != 1:
        yield f"got {elements.counts['script']} scripts and {elements.counts['style']} styles, wanted 2 and 1"
    if "default-src 'none'" not in elements.policy or "unsafe" in elements.policy:
        yield f"the security policy is {elements.policy!r}"
    for tag, attributes, source in elements.sources:
        digest = base64.b64encode(hashlib.sha256(source.encode()).digest()).decode()
        if "type" not in attributes and f"{tag}-src 'sha256-{digest}'" not in elements.policy:
            yield f"the security policy does not have the hash of the {tag}"
    # Without scripts there are pictures and tables.
    if elements.counts["path"] < 3 or elements.counts["table"] < 5:
        yield f"without scripts there are {elements.counts['path']} lines and {elements.counts['table']} tables"
