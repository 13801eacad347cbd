// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// What a chart shows, as text: a row for each of some times of the range, with the values that count then.
struct ChartTable {
    std::vector<std::string> columns; ///< "Time", then "Level, Serving (dBm)" and so on
    std::vector<std::vector<std::string>> rows;
    std::vector<std::int64_t> times_ns; ///< of the rows
    bool isThinned = false;             ///< there are samples between the rows
};

} // namespace velmora
