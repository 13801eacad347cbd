// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

namespace velmora {

/// What the list shows of a message.
struct MessageRow {
    std::uint64_t position = 0;
    Time time{};
    std::optional<Time::duration> difference; ///< to the one listed before it; absent for the first
    std::size_t bytes = 0;
    std::optional<std::uint32_t> code; ///< absent for what is no record
    std::string name;                  ///< of the code
    std::string note;                  ///< comments of the recording, and the user's own
    bool isMarked = false;             ///< in the range that is marked
};

} // namespace velmora
