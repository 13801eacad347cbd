# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What can go wrong."""

from __future__ import annotations


class VelmoraError(Exception):
    """velmora-log failed. The text is what it said on standard error."""

    def __init__(self, message: str, status: int | None = None) -> None:
        super().__init__(message)
        self.status = status  #: its exit status; None where it could not be started


class UsageError(VelmoraError):
    """It was called with wrong arguments, such as a path that no display has."""


class InputError(VelmoraError):
    """Not all of a file could be read or decoded."""


class InputWarning(UserWarning):
    """The same, where the caller wants what could be read: `losses="warn"`."""
