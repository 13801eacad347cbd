# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Decoders of one record as one writes them in Python, for comparison."""
