// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Observation.h"

#include <algorithm>
#include <charconv>

namespace velmora {

void Observation::appendPath(std::string& path) const {
    std::size_t row = 0;
    const std::string_view pattern = leaf->path;
    for (std::size_t at = 0; at < pattern.size();) {
        const std::size_t next = std::min(pattern.find('/', at + 1), pattern.size());
        const std::string_view part = pattern.substr(at, next - at);
        if (part == "/*" && row < rows.size()) {
            char digits[16];
            path.append("/").append(digits, std::to_chars(digits, digits + sizeof digits, rows[row++]).ptr);
        } else {
            path.append(part);
        }
        at = next;
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
