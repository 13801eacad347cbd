// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/TimeRange.h"

#include <string>
#include <vector>

namespace velmora {

/// The marks of an axis of time, at round local times.
struct TimeAxis {
    struct Mark {
        std::int64_t time_ns;
        std::string label; ///< "12:04", with seconds or fractions of them where the marks need them; at
                           ///< midnight a date
    };

    std::int64_t step_ns = 0;
    std::vector<Mark> marks;

    /// At most `markLimit` marks (at least 1) for the range.
    [[nodiscard]] static TimeAxis covering(const TimeRange& range, std::size_t markLimit);
};

} // namespace velmora
