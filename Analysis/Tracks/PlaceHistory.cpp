// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/PlaceHistory.h"

#include "Platform/TimeSpan.h"

namespace velmora {

namespace {

/// By how much records of merged files may be out of the order of their times.
constexpr std::chrono::nanoseconds disorder = std::chrono::seconds(1);

} // namespace

void PlaceHistory::add(const Fix& fix) {
    const auto& fixes = _track.fixes();
    if (!fixes.empty() && timeSpan(fix.time, fixes.back().time) > disorder)
        _track = Track(_track.maximumGap());
    if (fixes.size() >= mostFixes)
        _track.discardBefore(fixes[1].time);
    _track.add(fix);
}

} // namespace velmora
