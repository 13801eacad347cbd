// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A table for people: columns as wide as their widest cell, two blanks between, indented.
class TextTable {
public:
    enum class Align { Left, Right };

    explicit TextTable(std::vector<Align> columns) : _columns(std::move(columns)) {}

    /// A row; made printable. Precondition: as many cells as columns.
    void add(std::vector<std::string> cells);
    [[nodiscard]] bool isEmpty() const { return _rows.empty(); }
    /// Its lines, each after so many blanks.
    [[nodiscard]] std::string text(std::size_t indent) const;

private:
    std::vector<Align> _columns;
    std::vector<std::vector<std::string>> _rows;
};

} // namespace velmora
