// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Damage.h"

#include <array>
#include <cstddef>

namespace velmora {

std::string_view nameOf(Damage damage) {
    static constexpr std::array<std::string_view, 6> names{"",          "no record",       "wrong type",
                                                           "too short", "missing entries", "unreadable"};
    return names[static_cast<std::size_t>(damage)];
}

} // namespace velmora
