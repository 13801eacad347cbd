// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/TOMLNode.h"

#include <array>
#include <cstddef>

namespace velmora {

const TOMLNode* TOMLNode::find(std::string_view key) const {
    for (const Entry& each : entries)
        if (each.key == key)
            return &each.value;
    return nullptr;
}

std::string_view nameOf(TOMLNode::Kind kind) {
    static constexpr std::array<std::string_view, 6> names{"a text",   "a number", "true or false",
                                                           "an array", "a table",  "a date or time"};
    return names[static_cast<std::size_t>(kind)];
}

} // namespace velmora
