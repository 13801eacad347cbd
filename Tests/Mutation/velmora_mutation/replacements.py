# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What an operator, a word or a number is replaced with."""

import re
from collections.abc import Mapping, Sequence

# Binary operators have blanks around them; the characters of templates, references and pointers do not.
OPERATORS: Mapping[str, Sequence[str]] = {
    "<": ["<=", ">="],
    "<=": ["<", ">"],
    ">": [">=", "<="],
    ">=": [">", "<"],
    "==": ["!="],
    "!=": ["=="],
    "&&": ["||"],
    "||": ["&&"],
    "+": ["-"],
    "-": ["+"],
    "*": ["/"],
    "/": ["*"],
    "%": ["/"],
    "&": ["|"],
    "|": ["&"],
    "<<": [">>"],
    ">>": ["<<"],
    "+=": ["-="],
    "-=": ["+="],
}
WORDS: Mapping[str, Sequence[str]] = {"true": ["false"], "false": ["true"]}

WHOLE = re.compile(r"(0[xX])?([0-9a-fA-F']+?)([uUlLzZ]*)")
REAL = re.compile(r"(\d+)(\.\d*f?)")


def other_numbers(text: str) -> list[str]:
    """One more and, above zero, one less; of a real number one more."""
    whole = WHOLE.fullmatch(text)
    if whole:
        prefix, digits, suffix = whole[1], whole[2].replace("'", ""), whole[3]
        if prefix or digits.isdigit():
            value = int(digits, 16 if prefix else 10)
            numbers = [value + 1] + ([value - 1] if value > 0 else [])
            return [(f"0x{number:X}" if prefix else str(number)) + suffix for number in numbers]
    real = REAL.fullmatch(text)
    return [f"{int(real[1]) + 1}{real[2]}"] if real else []
