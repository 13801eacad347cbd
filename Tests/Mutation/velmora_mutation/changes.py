# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Every change of a source file that is worth trying."""

import re
from collections.abc import Iterator, Sequence
from dataclasses import dataclass
from typing import NamedTuple

from velmora_mutation.replacements import OPERATORS, WORDS, other_numbers

TOKEN = re.compile(
    r"""(?P<skip>//[^\n]*|/\*.*?\*/|^[ \t]*\#(?:\\\n|[^\n])*|"(?:\\.|[^"\\])*"|'(?:\\.|[^'\\])+'|\s+)
      |(?P<number>\.?\d(?:[eEpP][+-]|'(?=\w)|[\w.])*)
      |(?P<word>[A-Za-z_]\w*)
      |(?P<sign><=>|<<=|>>=|->|::|[-+*/%&|^=!<>]=|&&|\|\||\+\+|--|<<|>>|[^\w\s])""",
    re.MULTILINE | re.DOTALL | re.VERBOSE,
)
STATEMENT_STARTS_AFTER = (";", "{", "}", ")", ":", "else")
REMOVED = "{}"


class ChangeKey(NamedTuple):
    """Identifies a change without its line number: the line before and after it, with single blanks."""

    path: str
    before: str
    after: str


@dataclass(frozen=True)
class Change:
    """A part of one file replaced by another text; `path` is relative to the source."""

    path: str
    source: str
    start: int
    end: int
    text: str

    @property
    def changed(self) -> str:
        """The whole file with the change."""
        return self.source[: self.start] + self.text + self.source[self.end :]

    @property
    def line(self) -> int:
        """The number of the line, from 1."""
        return self.source.count("\n", 0, self.start) + 1

    @property
    def key(self) -> ChangeKey:
        """Identifies the change. Of a statement that fills its line the line before is a part, so that equal
        statements are told apart."""
        first = self.source.rfind("\n", 0, self.start) + 1
        if self.text == REMOVED and self.source[first : self.start].isspace():
            first = self.source.rfind("\n", 0, first - 1) + 1
        last = self.source.find("\n", self.end)
        before = self.source[first:last]
        after = self.source[first : self.start] + self.text + self.source[self.end : last]
        return ChangeKey(self.path, " ".join(before.split()), " ".join(after.split()))


def changes_of(path: str, source: str) -> Iterator[Change]:
    """The changes of a file, in the order of the text. Static assertions are left alone: they are tests."""
    tokens = [token for token in TOKEN.finditer(source) if token.lastgroup != "skip"]
    asserted_until = 0
    for i, token in enumerate(tokens):
        if token[0] == "static_assert":
            asserted_until = source.index(";", token.end())
        if token.start() < asserted_until:
            continue
        for text in replacements_of(source, tokens, i):
            yield Change(path, source, token.start(), token.end(), text)
        end = statement_end(tokens, i)
        if end:
            yield Change(path, source, token.start(), tokens[end - 1].end(), REMOVED)


def replacements_of(source: str, tokens: Sequence[re.Match[str]], i: int) -> Sequence[str]:
    """What the token at `i` may be replaced with."""
    token = tokens[i]
    text = token[0]
    if token.lastgroup == "number":
        return other_numbers(text)
    if text == "!":
        return [""]
    if text in OPERATORS:
        spaced = source[token.start() - 1].isspace() and source[token.end() : token.end() + 1].isspace()
        declares = i > 0 and tokens[i - 1][0] in ("operator", "template")
        return OPERATORS[text] if spaced and not declares else []
    return WORDS.get(text, [])


def statement_end(tokens: Sequence[re.Match[str]], i: int) -> int | None:
    """The index after a statement at `i` that can be removed: a call, or return, continue or break alone."""
    if i == 0 or tokens[i].lastgroup != "word" or tokens[i - 1][0] not in STATEMENT_STARTS_AFTER:
        return None
    if tokens[i][0] in ("return", "continue", "break") and i + 1 < len(tokens) and tokens[i + 1][0] == ";":
        return i + 2
    return call_end(tokens, i)


def call_end(tokens: Sequence[re.Match[str]], i: int) -> int | None:
    """The index after a statement at `i` that is nothing but a call."""
    while i + 2 < len(tokens) and tokens[i].lastgroup == "word" and tokens[i + 1][0] in (".", "->", "::"):
        i += 2
    if i + 1 >= len(tokens) or tokens[i].lastgroup != "word" or tokens[i + 1][0] != "(":
        return None
    depth = 0
    for j in range(i + 1, len(tokens) - 1):
        depth += {"(": 1, ")": -1}.get(tokens[j][0], 0)
        if depth == 0:
            return j + 2 if tokens[j + 1][0] == ";" else None
    return None
