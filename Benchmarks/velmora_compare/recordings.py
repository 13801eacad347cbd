# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""The recordings on which programs are compared."""

import subprocess
from dataclasses import dataclass
from pathlib import Path

RECORD = "0xB17F"
TITLES = {"gsm": "Ostrel GSM", "lte": "Ostrel LTE", "utran": "Ostrel UTRAN2", "c2k": "Ostrel CDMA", "ifx": "IFX",
          "modem": "Modem", RECORD: "LTE 0xB17F alone"}
DEFAULT = ("gsm", "lte", "utran", "c2k", RECORD)


@dataclass(frozen=True)
class Maker:
    """Makes recordings with make-drive, each once."""

    program: Path
    directory: Path
    seed: int

    def make(self, name: str, messages: int) -> Path:
        """The first messages of a scenario's drive or, of a log code, the drive's first messages that have it."""
        path = self.directory / f"{name}-{self.seed}-{messages}.pcapng"
        if not path.exists():
            scenario, only = ("lte", ["--only", RECORD]) if name == RECORD else (name, [])
            unfinished = path.with_suffix(".part")
            subprocess.run([self.program, scenario, str(self.seed), str(messages), unfinished, *only], check=True)
            unfinished.rename(path)
        return path
