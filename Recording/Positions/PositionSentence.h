// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <cstdint>
#include <functional>
#include <string_view>

namespace velmora {

/// One NMEA 0183 sentence of a recording. Valid during the call that passes it.
struct PositionSentence {
    Time time;                ///< when it arrived
    std::string_view text;    ///< as it is in the file: the end of the line may or may not be there
    std::uint64_t number = 0; ///< among the file's records, from 1, messages included
};

using PositionSentences = std::function<void(const PositionSentence&)>;

} // namespace velmora
