# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Treats the programs badly: kills, hostile clients, floods, failing calls, long drives."""
