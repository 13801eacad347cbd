// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Positions/NMEASentence.h"

#include <cstdio>
#include <string>

namespace velmora {

/// The content as a sentence, with its checksum.
[[nodiscard]] inline std::string nmea0183(const std::string& content) {
    char end[8];
    std::snprintf(end, sizeof end, "*%02X\r\n", nmeaChecksum(content) & 0xFFU);
    return "$" + content + end;
}

} // namespace velmora
