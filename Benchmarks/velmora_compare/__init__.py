# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Compares decoding with other programs and with lower bounds of it."""
