# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Stress tests of the programs: kills, hostile clients, floods, failing calls, hours of recorded messages."""
