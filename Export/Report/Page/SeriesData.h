// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Report/ChartedLeaf.h"
#include "Export/Report/TechnologyReport.h"

#include <cstdint>
#include <string_view>

namespace velmora {

class DriveReport;
class Markup;

/// A series of a chart as JSON, in differences of whole numbers, which are short. `base_ms`: the time that
/// times count from.
void writeSeriesData(Markup& out, const DriveReport& report, std::string_view technology,
                     const ChartedLeaf& series);
void writeBandData(Markup& out, std::string_view technology, const TechnologyReport::ShownBand& band,
                   std::int64_t base_ms);

} // namespace velmora
