// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Observation.h"

#include <charconv>

namespace velmora {

void Observation::appendPath(std::string& path) const {
    std::size_t row = 0;
    const std::string_view pattern = leaf->path;
    for (std::size_t at = 0; at < pattern.size();) {
        const std::size_t star = row < rows.size() ? pattern.find("/*", at) : std::string_view::npos;
        if (star == std::string_view::npos) {
            path.append(pattern.substr(at));
            return;
        }
        path.append(pattern.substr(at, star + 1 - at));
        char digits[16];
        path.append(digits, std::to_chars(digits, digits + sizeof digits, rows[row++]).ptr);
        at = star + 2;
    }
}

std::string_view ObservedText::of(const Observation& observation) {
    switch (observation.text) {
    case Observation::Text::OfRaw:
        return _formatted.emplace(observation.source->field->format, observation.raw).view();
    case Observation::Text::OfReal:
        _number.format(observation.source->field->format.format, observation.shown);
        return _number.text();
    case Observation::Text::Given: break;
    }
    return observation.given;
}

} // namespace velmora
