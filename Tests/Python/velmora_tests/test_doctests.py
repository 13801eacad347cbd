# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The examples in the documentation of each module. $VELMORA_RECORDINGS is the directory of Tests/Recordings."""

from __future__ import annotations

import doctest
import importlib
import os
import pkgutil
import unittest
import warnings
from pathlib import Path
from typing import Any

import velmora


def load_tests(_loader: unittest.TestLoader, tests: unittest.TestSuite, _pattern: str | None) -> unittest.TestSuite:
    names: dict[str, Any] = {"recordings": Path(os.environ["VELMORA_RECORDINGS"])}
    for module in pkgutil.iter_modules(velmora.__path__):
        if not module.ispkg and module.name.startswith("_"):
            tests.addTests(_examples(f"velmora.{module.name}", names))
    tests.addTests(_examples("velmora", names))
    return tests


def _examples(name: str, names: dict[str, Any]) -> unittest.TestSuite:
    def ignore_losses(_: doctest.DocTest) -> None:
        warnings.simplefilter("ignore", velmora.InputWarning)

    module = importlib.import_module(name)
    return doctest.DocTestSuite(module, extraglobs=names, setUp=ignore_losses,
                                optionflags=doctest.ELLIPSIS | doctest.IGNORE_EXCEPTION_DETAIL)
