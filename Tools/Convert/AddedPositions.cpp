// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/AddedPositions.h"

#include "Platform/TimeSpan.h"

#include <algorithm>
#include <chrono>

namespace velmora {

namespace {

/// How much is kept at both ends.
constexpr std::chrono::nanoseconds margin = std::chrono::seconds(10);

} // namespace

Result<Done> AddedPositions::upTo(Time message, const Add& add) {
    if (!_last)
        while (_next < _fixes.size() && _fixes[_next].time < timeAfter(message, -margin))
            ++_next;
    _last = std::max(_last.value_or(message), message);
    for (; _next < _fixes.size() && _fixes[_next].time <= message; ++_next, ++_added)
        if (Result<Done> added = add(_fixes[_next]); !added)
            return added;
    return Done{};
}

Result<Done> AddedPositions::finish(const Add& add) {
    if (_fixes.empty())
        return Done{};
    for (; _last && _next < _fixes.size() && _fixes[_next].time <= timeAfter(*_last, margin);
         ++_next, ++_added)
        if (Result<Done> added = add(_fixes[_next]); !added)
            return added;
    if (_added == 0)
        return Failure{"no fix of the track is within the time of the messages"};
    return Done{};
}

} // namespace velmora
