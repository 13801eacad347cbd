// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// Where something is in a file: from 1, columns in characters.
struct TextPosition {
    std::uint32_t line = 0;
    std::uint32_t column = 0;
};

/// A value of a TOML document.
struct TOMLNode {
    enum class Kind : std::uint8_t { Text, Number, Flag, Array, Table, Date };
    struct Entry;

    Kind kind = Kind::Table;
    TextPosition position;
    std::string text;
    double number = 0;
    bool flag = false;
    std::vector<TOMLNode> items;
    std::vector<Entry> entries; ///< of a table, by key

    /// Null where the table has none of that key.
    [[nodiscard]] const TOMLNode* find(std::string_view key) const;
};

struct TOMLNode::Entry {
    std::string key;
    TextPosition position;
    TOMLNode value;
};

/// "a text", "a number", "an array": for messages.
[[nodiscard]] std::string_view nameOf(TOMLNode::Kind kind);

} // namespace velmora
