// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/IndexPath.h"

#include <cstddef>
#include <optional>
#include <vector>

namespace velmora {

/// How many rows a table's sections have, and the rows counted through all sections.
class TableRows {
public:
    TableRows() = default;
    /// One count a section.
    explicit TableRows(std::vector<std::size_t> counts);

    [[nodiscard]] std::size_t sections() const { return _counts.size(); }
    /// 0 for a section that does not exist.
    [[nodiscard]] std::size_t rows(std::size_t section) const;
    [[nodiscard]] std::size_t total() const { return _total; }
    /// Null for a row past the end and for none.
    [[nodiscard]] IndexPath path(std::optional<std::size_t> row) const;
    [[nodiscard]] std::optional<std::size_t> row(const IndexPath& path) const;

private:
    std::vector<std::size_t> _counts;
    std::size_t _total = 0;
};

} // namespace velmora
