// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Events/Event.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

constexpr std::array<std::string_view, 3> names{"info", "warning", "critical"};

} // namespace

std::string_view nameOf(Severity severity) {
    return names[static_cast<std::size_t>(severity)];
}

std::optional<Severity> severityNamed(std::string_view name) {
    const auto found = std::find(names.begin(), names.end(), name);
    if (found == names.end())
        return std::nullopt;
    return static_cast<Severity>(found - names.begin());
}

const EventField* Event::field(std::string_view name) const {
    const auto found =
        std::find_if(fields.begin(), fields.end(), [&](const EventField& each) { return each.name == name; });
    return found == fields.end() ? nullptr : &*found;
}

} // namespace velmora
