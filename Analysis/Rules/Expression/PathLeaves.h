// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/PathPattern.h"

#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// A leaf that a path names, and in which rows.
struct PathLeaf {
    const CatalogueField* leaf;
    PathPattern::Rows rows; ///< the outermost first; any where a number is absent
};

/// Whether the path names the leaf itself, not what it is in.
[[nodiscard]] std::optional<PathLeaf> leafAt(const CatalogueField& leaf, std::string_view path);

/// The leaves that the path names, several where a `*` in it is any name.
[[nodiscard]] std::vector<PathLeaf> leavesAt(const Catalogue& catalogue, std::string_view path);

/// Whether messages may name a leaf at the path that the catalogue does not have yet.
[[nodiscard]] bool canHaveFurtherLeaf(const Catalogue& catalogue, std::string_view path);

} // namespace velmora
