// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/DecimalDegrees.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <optional>
#include <vector>

namespace velmora {

/// Where the latest messages arrived. An event may become known some time after the message that it began
/// with.
class RecentPlaces {
public:
    static constexpr std::size_t most = 4096;

    void add(Time time, const DecimalDegrees& place);
    /// The place of the latest message of that time; absent where there is none.
    [[nodiscard]] std::optional<DecimalDegrees> at(Time time) const;

private:
    struct Entry {
        Time time{};
        DecimalDegrees place;
    };

    std::vector<Entry> _entries; ///< a ring once it is full
    std::size_t _next = 0;
};

} // namespace velmora
