// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Track.h"

#include "Platform/TimeSpan.h"

#include <algorithm>
#include <iterator>

namespace velmora {

namespace {

struct IsEarlier {
    bool operator()(const Fix& fix, Time time) const { return fix.time < time; }
    bool operator()(Time time, const Fix& fix) const { return time < fix.time; }
};

} // namespace

Track Track::ofFixes(std::vector<Fix> fixes, std::chrono::nanoseconds maximumGap) {
    std::stable_sort(fixes.begin(), fixes.end(), [](const Fix& a, const Fix& b) { return a.time < b.time; });
    Track track(maximumGap);
    for (const Fix& fix : fixes)
        track.add(fix);
    return track;
}

void Track::add(const Fix& fix) {
    if (_fixes.empty() || _fixes.back().time < fix.time)
        _fixes.push_back(fix);
}

std::optional<Position> Track::at(Time time) const {
    const auto next = std::lower_bound(_fixes.begin(), _fixes.end(), time, IsEarlier());
    if (next == _fixes.end())
        return std::nullopt;
    if (next->time == time)
        return Position{*next, {}};
    if (next == _fixes.begin() || timeSpan(std::prev(next)->time, next->time) > _maximumGap)
        return std::nullopt;
    return positionBetween(*std::prev(next), *next, time);
}

bool Track::isOpenAt(Time time) const {
    return !_fixes.empty() && _fixes.back().time < time && timeSpan(_fixes.back().time, time) < _maximumGap;
}

void Track::discardBefore(Time time) {
    const auto next = std::upper_bound(_fixes.begin(), _fixes.end(), time, IsEarlier());
    if (next != _fixes.begin())
        _fixes.erase(_fixes.begin(), std::prev(next));
}

double Track::length_m() const {
    double length = 0;
    for (std::size_t i = 1; i < _fixes.size(); ++i)
        if (timeSpan(_fixes[i - 1].time, _fixes[i].time) <= _maximumGap)
            length += distance_m(_fixes[i - 1], _fixes[i]);
    return length;
}

} // namespace velmora
