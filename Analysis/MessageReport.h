// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Platform/Clock.h"

#include <compare>
#include <cstdint>

namespace velmora {

/// Which message of the input it is.
struct MessageNumber {
    std::uint32_t input = 0;  ///< the file, from 0
    std::uint64_t number = 0; ///< in that file, from 1

    friend auto operator<=>(const MessageNumber&, const MessageNumber&) = default;
};

/// What a message reported, as analyses get it. Valid during the call that passes it.
struct MessageReport {
    MessageNumber message;
    Time time; ///< by the clock that the analysis goes by: of arrival, or the modem's
    const ObservedMessage& observed;
};

} // namespace velmora
