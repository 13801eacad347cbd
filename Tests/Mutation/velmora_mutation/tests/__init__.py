# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the package: `python3 -m unittest discover -t . -s velmora_mutation` in the folder above it."""
