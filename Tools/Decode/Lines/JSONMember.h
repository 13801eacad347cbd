// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>

namespace velmora {

class JSONNode;
class NumberTexts;

/// One member of a JSONNode: where its text is, and what it shows. An entry of an array has no label.
struct JSONMember {
    const void* source = nullptr; ///< the field or list that it shows, a constant; null for any other
    std::int64_t raw = 0;
    bool isNumber = false;   ///< the value is `raw` as the source, a field, shows it
    bool showsNode = false;  ///< the value is `node`, and follows the text
    std::uint32_t begin = 0; ///< of the comma before it
    std::uint32_t value = 0; ///< of its value
    std::uint32_t end = 0;
    NumberTexts* texts = nullptr; ///< those of the source; null before they are used
    std::string label;
    std::unique_ptr<JSONNode> node; ///< kept where it is not shown
};

} // namespace velmora
