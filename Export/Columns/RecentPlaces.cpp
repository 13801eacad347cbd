// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/RecentPlaces.h"

namespace velmora {

void RecentPlaces::add(Time time, const DecimalDegrees& place) {
    if (_entries.size() < most)
        _entries.push_back({time, place});
    else
        _entries[_next] = {time, place};
    _next = (_next + 1) % most;
}

std::optional<DecimalDegrees> RecentPlaces::at(Time time) const {
    for (std::size_t i = 1; i <= _entries.size(); ++i)
        if (const Entry& entry = _entries[(_next + most - i) % most]; entry.time == time)
            return entry.place;
    return std::nullopt;
}

} // namespace velmora
