// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// The clock that an analysis goes by.
enum class AnalysisClock : std::uint8_t {
    Arrival, ///< when the message arrived
    Modem,   ///< the time stamp that the modem gave it
};

/// The times of a technology's messages by one of the clocks.
class MessageTimes {
public:
    explicit MessageTimes(AnalysisClock clock) : _clock(clock) {}

    /// Of the next message. By the modem's clock, one without a time stamp has the latest stamp plus the
    /// arrival time that has passed since, and before the first stamp its arrival time.
    [[nodiscard]] Time of(Time arrival, std::optional<Time> modem);

private:
    AnalysisClock _clock;
    std::optional<Time> _stamp; ///< the latest one
    Time _arrival;              ///< of the message that had it
};

} // namespace velmora
