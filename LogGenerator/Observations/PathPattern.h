// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/Observation.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A path of the display that may name many places: "/Serving Cell/ARFCN", "/Neighboring Cells/0", or with
/// "*" for any name or row, "/GSM/*/ARFCN". It selects what is at these places and below.
class PathPattern {
public:
    explicit PathPattern(std::string text) : _text(std::move(text)) {}

    [[nodiscard]] const std::string& text() const { return _text; }

    /// The rows that a leaf's observations must be in, the outermost first; any where a number is absent.
    using Rows = std::vector<std::optional<std::uint32_t>>;
    /// Which observations of the leaf it selects; absent for none.
    [[nodiscard]] std::optional<Rows> select(const CatalogueField& leaf) const;
    /// Whether a display of the technology can have such a place.
    [[nodiscard]] bool isPossible(const Catalogue& catalogue) const;

    /// What is left of a path after the path of a child of that name, empty for the child itself; absent
    /// where the path does not lead to it. `atRoot`: the child is one of the root's, whose own path adds
    /// nothing in front.
    [[nodiscard]] static std::optional<std::string_view> after(std::string_view path, bool atRoot,
                                                               std::string_view name);

    /// What is left of a path below a place; empty where it selects the place or what the place is in, absent
    /// where it does not lead there.
    [[nodiscard]] static std::optional<std::string_view> below(std::string_view path,
                                                               const CatalogueNode& place);

private:
    std::string _text;
};

/// Whether the observation is in such rows.
[[nodiscard]] bool isInRows(const Observation& observation, const PathPattern::Rows& rows);

/// How many characters have to be inserted, removed or replaced to make one text the other.
[[nodiscard]] std::size_t editDistance(std::string_view a, std::string_view b);

/// The paths of leaves and of what they are in that most resemble the path, the nearest first: at most
/// three of all catalogues.
[[nodiscard]] std::vector<std::string> nearestPaths(std::span<const Catalogue* const> catalogues,
                                                    std::string_view path);

} // namespace velmora
