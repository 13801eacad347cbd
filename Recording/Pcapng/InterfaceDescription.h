// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"

#include <chrono>
#include <cstdint>
#include <limits>
#include <optional>
#include <string>

namespace velmora {

/// A pcapng section's description of one of its interfaces: the type of its packets and the unit of their
/// time stamps.
struct InterfaceDescription {
    std::uint16_t linkType = 0;
    std::uint32_t snapLength = 0;    ///< bytes kept of a packet; 0 for no limit
    std::string name;                ///< if_name, truncated to 255 bytes; empty where there is none
    std::uint8_t timeResolution = 6; ///< if_tsresol: negative power of ten, or of two with the top bit set
    std::int64_t timeOffset_seconds = 0; ///< if_tsoffset

    /// Reads the block's body; none where it is too short or an option does not fit.
    [[nodiscard]] static std::optional<InterfaceDescription> read(Bytes body, bool bigEndian);

    /// The time that a packet's time stamp denotes, rounded down to a nanosecond; none outside the range of
    /// `Time` (the years 1678 to 2262).
    [[nodiscard]] std::optional<Time> time(std::uint64_t stamp) const {
        constexpr std::uint64_t latest = std::numeric_limits<std::int64_t>::max();
        // As recordings of ours are.
        if (timeResolution == 9 && timeOffset_seconds == 0 && stamp <= latest)
            return Time(std::chrono::nanoseconds(static_cast<std::int64_t>(stamp)));
        return timeOfAny(stamp);
    }

private:
    [[nodiscard]] std::optional<Time> timeOfAny(std::uint64_t stamp) const;
};

} // namespace velmora
