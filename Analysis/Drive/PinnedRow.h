// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "LogGenerator/Observations/PathPattern.h"

#include <string>
#include <utility>

namespace velmora {

/// A numeric row of the display that is recorded: found by its path in the catalogue of whatever decoder
/// there is.
class PinnedRow {
public:
    explicit PinnedRow(std::string path) : _path(std::move(path)) {}

    [[nodiscard]] const std::string& path() const { return _path; }
    /// Looks for the leaf in another catalogue. Whether there is one that has numbers.
    bool find(const Catalogue& catalogue);
    /// There is no catalogue any more.
    void lose() { _leaf = nullptr; }
    [[nodiscard]] const CatalogueField* leaf() const { return _leaf; }
    /// Whether the observation is of this row and has a number.
    [[nodiscard]] bool holds(const Observation& observation) const {
        return observation.leaf == _leaf && observation.kind == ObservedKind::Number &&
               isInRows(observation, _rows);
    }

private:
    std::string _path;
    const CatalogueField* _leaf = nullptr;
    PathPattern::Rows _rows;
};

} // namespace velmora
