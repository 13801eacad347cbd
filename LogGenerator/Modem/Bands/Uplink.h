// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>

namespace velmora::Bands {

/// The uplink of a band, by the centres of its lowest and highest channels; or that it has none which a
/// downlink channel is paired with.
struct Uplink {
    std::int32_t lowest_kHz;
    std::int32_t highest_kHz;

    /// The uplink channel of the downlink channel that lies so far above the downlink's lowest: by the
    /// default separation it lies as far above the uplink's. None past the highest.
    [[nodiscard]] constexpr std::optional<std::int32_t> pairedWith(std::int32_t distance_kHz) const {
        if (lowest_kHz <= 0 || lowest_kHz + distance_kHz > highest_kHz)
            return std::nullopt;
        return lowest_kHz + distance_kHz;
    }
    [[nodiscard]] constexpr bool isTimeDivision() const { return lowest_kHz < 0; }
};

inline constexpr Uplink timeDivision{-1, -1}; ///< uplink and downlink share the channel (TDD)
inline constexpr Uplink noUplink{0, 0};       ///< used for carrier aggregation only
inline constexpr Uplink severalUplinks{0, 0}; ///< which of them the network uses is not known

} // namespace velmora::Bands
