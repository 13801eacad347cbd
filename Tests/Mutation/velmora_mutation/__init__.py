# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tries the tests of the decoders: changes the decoders and runs the tests."""
