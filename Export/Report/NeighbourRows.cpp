// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/NeighbourRows.h"

#include <functional>

namespace velmora {

std::size_t NeighbourRows::KeyHash::operator()(const Key& key) const {
    const auto hashOf = [](const std::optional<double>& number) {
        return std::hash<double>()(number.value_or(-1));
    };
    constexpr std::size_t spread = 0x9E3779B97F4A7C15; // 2^64 divided by the golden ratio
    const std::size_t technology = key.technology ? static_cast<std::size_t>(*key.technology) + 1 : 0;
    return ((hashOf(key.channel) + technology) * spread ^ hashOf(key.physicalCell)) * spread >> 20;
}

NeighbourRows::Row* NeighbourRows::rowOf(const Key& key, const MessageReport& report) {
    if (const auto found = _found.find(key); found != _found.end())
        return found->second;
    if (_rows.size() == most)
        return nullptr;
    Row& row = _rows[key];
    row.first = report.time;
    row.firstMessage = report.message;
    return _found[key] = &row;
}

void NeighbourRows::report(const MessageReport& report, const RadioPicture& picture) {
    for (const Neighbour& each : picture.neighbours()) {
        if (each.message != report.message)
            continue;
        Row* const row = rowOf({each.technology, each.channel, each.physicalCell}, report);
        if (!row) {
            ++_omitted;
            continue;
        }
        ++row->reports;
        row->isDetected = row->isDetected || each.isDetected;
        row->last = report.time;
        row->lastMessage = report.message;
        if (each.level_dBm)
            row->levels.add(*each.level_dBm);
        if (each.quality_dB)
            row->qualities.add(*each.quality_dB);
    }
}

} // namespace velmora
