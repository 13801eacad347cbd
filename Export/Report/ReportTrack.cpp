// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/ReportTrack.h"

#include "Platform/TimeSpan.h"

namespace velmora {

void ReportTrack::add(const Track& track) {
    _length_m += track.length_m();
    // Of a long track few enough are taken to begin with.
    const std::size_t step = track.fixes().size() / most + 1;
    bool isBegin = true;
    for (std::size_t i = 0; i < track.fixes().size(); ++i) {
        const Fix& fix = track.fixes()[i];
        isBegin = isBegin || i == 0 || timeSpan(track.fixes()[i - 1].time, fix.time) > track.maximumGap();
        if (i % step != 0)
            continue;
        _fixes.push_back(fix);
        _isBegin.push_back(isBegin);
        isBegin = false;
    }
    while (_fixes.size() > most)
        thin();
}

void ReportTrack::thin() {
    std::size_t kept = 0;
    bool isBegin = false;
    for (std::size_t i = 0; i < _fixes.size(); ++i) {
        isBegin = isBegin || _isBegin[i];
        if (i % 2 != 0)
            continue;
        _fixes[kept] = _fixes[i];
        _isBegin[kept++] = isBegin;
        isBegin = false;
    }
    _fixes.resize(kept);
    _isBegin.resize(kept);
}

} // namespace velmora
