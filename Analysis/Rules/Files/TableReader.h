// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Files/FileErrors.h"
#include "Analysis/Rules/Files/TOMLNode.h"
#include "Platform/Clock.h"

#include <optional>
#include <span>
#include <string_view>

namespace velmora {

/// Reads the keys of a table. What is missing, of another kind or unknown is a mistake.
class TableReader {
public:
    /// Notes keys that are not among these. All must outlive it.
    TableReader(const TOMLNode& table, std::span<const std::string_view> keys, FileErrors& errors);

    /// Null where the table has no such key, or where it is of another kind.
    [[nodiscard]] const TOMLNode* find(std::string_view key, TOMLNode::Kind kind);
    /// The same, but a table without it has a mistake.
    [[nodiscard]] const TOMLNode* require(std::string_view key, TOMLNode::Kind kind);
    /// A number of seconds, or a text as "5s" or "2 min"; absent where there is none.
    [[nodiscard]] std::optional<Time::duration> findSpan(std::string_view key);
    [[nodiscard]] bool has(std::string_view key) const { return _table.find(key) != nullptr; }

private:
    const TOMLNode& _table;
    FileErrors& _errors;
};

/// A time span of at most a day.
[[nodiscard]] std::optional<Time::duration> spanOf(const TOMLNode& node, FileErrors& errors);

} // namespace velmora
