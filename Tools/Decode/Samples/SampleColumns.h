// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "Tools/Decode/Paths/NodeSelection.h"

#include <string>
#include <vector>

namespace velmora {

/// The columns of a table with one for each selected leaf.
class SampleColumns {
public:
    struct Column {
        std::string title; ///< its name and, in parentheses, its unit: "level (dBm)"
        std::string leaf;  ///< the leaf's path in the catalogue; empty for any that the path selects
        std::size_t path;  ///< of the selection: its index
    };

    /// Adds the columns that the selection has in this technology, in the order of selection and catalogue;
    /// those that are there already stay where they are.
    void add(const NodeSelection& selection, const Catalogue& catalogue);

    [[nodiscard]] const std::vector<Column>& columns() const { return _columns; }
    /// Whether a column is that of a list's rows.
    [[nodiscard]] bool hasRows() const;

private:
    [[nodiscard]] bool contains(std::size_t path, const std::string& leaf) const;

    std::vector<Column> _columns;
};

} // namespace velmora
