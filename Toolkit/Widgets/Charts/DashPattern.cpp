// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/DashPattern.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace velmora {

namespace {

std::vector<double> lengthsOf(ChartLine line) {
    switch (line) {
    case ChartLine::dashed: return {8, 4};
    case ChartLine::dotted: return {2, 3};
    case ChartLine::dashDotted: return {8, 3, 2, 3};
    case ChartLine::solid: break;
    }
    return {};
}

} // namespace

DashPattern::DashPattern(ChartLine line) : _lengths(lengthsOf(line)) {
    for (const double length : _lengths)
        _period += length;
}

bool DashPattern::isDashAt(double along) const {
    if (isSolid())
        return true;
    double rest = std::fmod(along, _period);
    for (std::size_t index = 0; index < _lengths.size(); rest -= _lengths[index], ++index)
        if (rest < _lengths[index])
            return index % 2 == 0;
    return false;
}

void DashPattern::cut(std::vector<QLineF>& lines) const {
    if (isSolid())
        return;
    const std::vector<QLineF> whole = std::exchange(lines, {});
    std::size_t index = 0; // of the dash or space
    double left = _lengths[0];
    for (std::size_t number = 0; number < whole.size(); ++number) {
        const QLineF& line = whole[number];
        if (number > 0 && line.p1() != whole[number - 1].p2()) {
            index = 0;
            left = _lengths[0];
        }
        const double length = line.length();
        for (double from = 0; from < length;) {
            const double to = std::min(from + left, length);
            if (index % 2 == 0)
                lines.emplace_back(line.pointAt(from / length), line.pointAt(to / length));
            left -= to - from;
            from = to;
            if (left <= 1e-9) {
                index = (index + 1) % _lengths.size();
                left = _lengths[index];
            }
        }
    }
}

} // namespace velmora
