// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// How much is masked. Each level includes those before it.
enum class MaskLevel : std::uint8_t {
    Identity, ///< subscriber, equipment, addresses, phone numbers, temporary identities
    Location, ///< area and cell identities, network codes and names too
    All,      ///< positions and times too
};

inline constexpr std::string_view maskLevelNames[] = {"identity", "location", "all"};

[[nodiscard]] constexpr std::string_view nameOf(MaskLevel level) {
    return maskLevelNames[static_cast<unsigned>(level)];
}

[[nodiscard]] constexpr std::optional<MaskLevel> maskLevelNamed(std::string_view name) {
    for (const MaskLevel level : {MaskLevel::Identity, MaskLevel::Location, MaskLevel::All})
        if (nameOf(level) == name)
            return level;
    return std::nullopt;
}

} // namespace velmora
