# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Runs programs whose calls of the C library fail, and checks what they leave."""
