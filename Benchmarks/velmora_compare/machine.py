# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Under what circumstances a table was measured."""

import os
from datetime import UTC, datetime


def circumstances() -> str:
    load = ", ".join(f"{each:.1f}" for each in os.getloadavg())
    return f"{datetime.now(UTC):%Y-%m-%d %H:%M} UTC, {os.cpu_count()} cores, load average {load}"
