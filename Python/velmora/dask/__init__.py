# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The same over a cluster, by Dask: bags and data frames of many recordings, one partition each, and their columns.

Each task is a pure function of one file, so that the scheduler may run it again where a worker was lost. Workers read
the files themselves, under the same names: they need velmora-log, and a file system that all of them have.
"""

from ._columns import Report, columns
from ._frames import bag, events, samples

__all__ = ["Report", "bag", "columns", "events", "samples"]
