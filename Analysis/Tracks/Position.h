// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Fix.h"

#include <chrono>
#include <optional>

namespace velmora {

/// Where the receiver was at a time that need not be that of a fix.
struct Position {
    /// At the asked time: interpolated between the fixes before and after it. Estimates of the error are the
    /// larger of theirs; what either of them lacks is absent.
    Fix fix;
    /// How long before that time the latest fix was.
    std::chrono::nanoseconds age{0};
};

/// The position at a time between two fixes, or at that of one. Precondition: neither is before `before` nor
/// after `after`.
[[nodiscard]] Position positionBetween(const Fix& before, const Fix& after, Time time);

/// How far the receiver went between two fixes, in metres.
[[nodiscard]] double distance_m(const Fix& from, const Fix& to);

} // namespace velmora
