// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/RadioPicture.h"

#include <array>
#include <utility>

namespace velmora {

std::string_view nameOf(RadioTechnology technology) {
    static constexpr std::array<std::string_view, 7> names{"GSM", "UMTS",        "TD-SCDMA", "LTE",
                                                           "NR",  "CDMA2000 1x", "EV-DO"};
    return names[static_cast<std::size_t>(technology)];
}

std::string_view nameOf(RadioMode mode) {
    static constexpr std::array<std::string_view, 4> names{"off", "searching", "idle", "connected"};
    return names[static_cast<std::size_t>(mode)];
}

RadioPicture::RadioPicture(const Catalogue& catalogue)
    : _catalogue(catalogue), _roles(roleNames().size() + 1) {}

void RadioPicture::update(const MessageReport& report) {
    for (const Observation& each : report.observed.observations) {
        if (each.leaf->role == Role::None)
            continue;
        std::optional<Reading>& kept = _roles[static_cast<std::size_t>(each.leaf->role)];
        if (each.kind == ObservedKind::Absent) {
            kept.reset();
            continue;
        }
        Reading reading;
        reading.kind = each.kind;
        reading.number = each.kind == ObservedKind::Number ? each.number : static_cast<double>(each.raw);
        reading.text = each.kind == ObservedKind::Text ? each.words : each.given;
        reading.time = report.time;
        const bool isSame = kept && kept->number == reading.number && kept->text == reading.text;
        reading.since = isSame ? kept->since : report.time;
        reading.message = report.message;
        reading.leaf = each.leaf;
        kept = std::move(reading);
    }
}

void RadioPicture::clear() {
    _roles.assign(_roles.size(), std::nullopt);
    _neighbours.clear();
    _technology.reset();
    _mode.reset();
}

const Reading* RadioPicture::find(Role role) const {
    const std::optional<Reading>& kept = _roles[static_cast<std::size_t>(role)];
    return kept ? &*kept : nullptr;
}

} // namespace velmora
