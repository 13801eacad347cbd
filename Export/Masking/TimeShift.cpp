// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/TimeShift.h"

#include "LogMessages/RecordTime.h"

namespace velmora {

std::uint64_t TimeShift::shiftedStamp(std::uint64_t stamp) const {
    const std::optional<Time> time = timeOfRecord(stamp);
    if (stamp == 0 || !time)
        return 0;
    // The shift of a file that has been shifted is none, and must not round its stamps.
    return _shift.count() == 0 ? stamp : recordTimestamp(shifted(*time));
}

} // namespace velmora
