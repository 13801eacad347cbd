# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Mutation testing of the decoders: changes them in one place at a time and checks that a test fails."""
