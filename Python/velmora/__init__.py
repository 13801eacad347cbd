# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""What recordings of a cellular modem report, as pandas data frames.

Everything is read by the program velmora-log, which is found by $VELMORA_LOG or else in $PATH. A frame's
`attrs["units"]` has the unit of each column that has one.

>>> level = "/Serving Cell/Serving Cell Measurements/Measured RSRP"
>>> frame = samples(recordings / "lte.pcapng", select={"level": level})
>>> frame["level"].max() < 0, frame.attrs["units"]["level"]
(True, 'dBm')
"""

from ._errors import InputError, InputWarning, UsageError, VelmoraError
from ._decode import decode
from ._events import events
from ._fields import fields
from ._samples import samples

__all__ = ["InputError", "InputWarning", "UsageError", "VelmoraError", "decode", "events", "fields", "samples"]
