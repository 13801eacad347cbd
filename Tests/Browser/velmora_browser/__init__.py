# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Checks the page of `velmora-log report` in real browsers."""
