# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Checks JSON against a schema: check-json.py SCHEMA < TEXT

One object a line, or several indented ones, one after another, if the first line is not a complete object.
Prints how many objects there were; anything that is wrong ends it with a message and status 1."""

import json
import sys

import jsonschema


def without_twice(pairs):
    keys = [key for key, value in pairs]
    if len(set(keys)) != len(keys):
        raise ValueError(f"a key stands twice: {keys}")
    return dict(pairs)


def no_constant(name):
    raise ValueError(f"{name} is no JSON")


def texts(everything):
    """The objects' texts: lines, or else whatever ends with an unindented brace."""
    lines = everything.split("\n")
    if lines.pop() != "":
        raise ValueError("the last line has no end")
    if lines and lines[0] != "{":
        return lines
    parts = "\n".join(lines).split("\n}\n{\n")
    return ["{\n" * (i > 0) + part + "\n}" * (i + 1 < len(parts)) for i, part in enumerate(parts)]


def main():
    with open(sys.argv[1], encoding="utf-8") as file:
        schema = json.load(file)
    jsonschema.Draft202012Validator.check_schema(schema)
    validator = jsonschema.Draft202012Validator(schema)
    decoder = json.JSONDecoder(object_pairs_hook=without_twice, parse_constant=no_constant)
    # As bytes, so that what is no UTF-8 is an error here.
    objects = texts(sys.stdin.buffer.read().decode("utf-8"))
    for number, text in enumerate(objects, 1):
        error = jsonschema.exceptions.best_match(validator.iter_errors(decoder.decode(text)))
        if error:
            sys.exit(f"object {number}: {error.message}\n{text}")
    print(len(objects))


main()
