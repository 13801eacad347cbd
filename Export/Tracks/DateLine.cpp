// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/DateLine.h"

#include <cmath>

namespace velmora {

std::vector<std::vector<LinePoint>> linesOf(const std::vector<TrackData::Point>& points) {
    std::vector<std::vector<LinePoint>> lines(1);
    for (const TrackData::Point& point : points) {
        const LinePoint next(point.fix.longitude, point.fix.latitude);
        if (!lines.back().empty() && std::abs(next.first - lines.back().back().first) > 180) {
            const LinePoint last = lines.back().back();
            const double side = last.first < 0 ? -180 : 180;
            // Both as seen from the side of the last one.
            const double east = next.first + 2 * side;
            const double part = east == last.first ? 0 : (side - last.first) / (east - last.first);
            const double latitude = std::lerp(last.second, next.second, part);
            lines.back().emplace_back(side, latitude);
            lines.push_back({{-side, latitude}});
        }
        lines.back().push_back(next);
    }
    std::erase_if(lines, [](const auto& line) { return line.size() < 2; });
    return lines;
}

} // namespace velmora
