// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/LeafTable.h"
#include "LogGenerator/Observations/Observation.h"

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

namespace velmora {

/// Which rows of a detector's table a leaf belongs to, by the leaf's path. Most belong to none.
class LeafRows {
public:
    using Rows = std::vector<std::uint8_t>;

    explicit LeafRows(const Catalogue& catalogue) : _rows(catalogue) {}

    /// The rows of that leaf. `matches(path, row)` says whether a leaf of that path belongs to the row;
    /// there are `count` rows.
    template <class Matches>
    [[nodiscard]] const Rows& of(const CatalogueField& leaf, std::size_t count, Matches matches) {
        return _rows.at(leaf, [count, &matches](const CatalogueField& each) {
            Rows rows;
            for (std::size_t i = 0; i < count; ++i)
                if (matches(std::string_view(each.path), i))
                    rows.push_back(static_cast<std::uint8_t>(i));
            return rows;
        });
    }

private:
    LeafTable<Rows> _rows;
};

} // namespace velmora
