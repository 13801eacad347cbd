// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/NeighbourRows.h"

namespace velmora {

void NeighbourRows::report(const MessageReport& report, const RadioPicture& picture) {
    for (const Neighbour& each : picture.neighbours()) {
        if (each.message != report.message)
            continue;
        const Key key{each.technology, each.channel, each.physicalCell};
        auto found = _rows.find(key);
        if (found == _rows.end()) {
            if (_rows.size() == most) {
                ++_omitted;
                continue;
            }
            found = _rows.try_emplace(key).first;
            found->second.first = report.time;
            found->second.firstMessage = report.message;
        }
        Row& row = found->second;
        ++row.reports;
        row.isDetected = row.isDetected || each.isDetected;
        row.last = report.time;
        row.lastMessage = report.message;
        if (each.level_dBm)
            row.levels.add(*each.level_dBm);
        if (each.quality_dB)
            row.qualities.add(*each.quality_dB);
    }
}

} // namespace velmora
