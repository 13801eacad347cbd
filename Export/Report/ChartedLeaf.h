// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Report/SeriesBuckets.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string_view>

namespace velmora {

/// The charts of a page, which lie above each other.
enum class ReportChart : std::uint8_t { None, Level, Quality, DataRate, ErrorRate };

/// "level", "quality", "data rate", "error rate".
[[nodiscard]] std::string_view nameOf(ReportChart chart);

/// A leaf whose values a chart shows.
struct ChartedLeaf {
    const CatalogueField* leaf;
    ReportChart chart;
    bool isNeighbour;                   ///< of the rows of a message the best one alone is shown
    std::optional<std::uint32_t> input; ///< whose values these are, where two are compared
    SeriesBuckets buckets;
    std::optional<double> best = {}; ///< of the rows of the current message so far
};

/// The chart that shows the leaf: by its role, otherwise by its unit.
[[nodiscard]] ReportChart chartOf(const CatalogueField& leaf);
[[nodiscard]] bool isNeighbour(const CatalogueField& leaf);

} // namespace velmora
