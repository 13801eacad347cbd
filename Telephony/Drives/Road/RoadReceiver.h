// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Fix.h"
#include "Telephony/Drives/Road/RoadPlace.h"

#include <chrono>
#include <optional>
#include <vector>

namespace velmora {

/// A receiver of positions in a drive's car: a fix at every full second, which is where the car was then.
class RoadReceiver {
public:
    /// `start`: the time at the scenario's start.
    explicit RoadReceiver(Time start) : _start(start) {}

    /// The fixes since the last place, up to this one, between which the car went straight.
    [[nodiscard]] std::vector<Fix> drivenTo(const RoadPlace& place);

private:
    Time _start;
    std::chrono::seconds _next{0};
    std::optional<RoadPlace> _last;
};

} // namespace velmora
