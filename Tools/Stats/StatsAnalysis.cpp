// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/StatsAnalysis.h"

namespace velmora {

void StatsAnalysis::report(const MessageReport& report) {
    if (!_hasBegun) {
        _hasBegun = true;
        const Time first = _feed.first().value_or(report.time);
        const auto timeOf = [first](const std::optional<TimeBound>& bound) {
            return bound ? std::optional(TimeRange::momentOf(*bound, first)) : std::nullopt;
        };
        _statistics.setCounted({timeOf(_range.from), timeOf(_range.to)});
    }
    _statistics.report(report);
}

} // namespace velmora
