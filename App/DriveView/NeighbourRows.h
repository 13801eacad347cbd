// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClasses.h"
#include "Analysis/Drive/DriveNow.h"
#include "Analysis/Picture/Reading.h"
#include "Toolkit/Tables/GridView.h"

#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// The columns of the neighbours of a cell of that radio technology.
[[nodiscard]] std::vector<GridColumn> neighbourColumns(std::optional<RadioTechnology> technology);
/// A row for each, in their order: channel, physical cell, level, quality, difference to the serving cell.
[[nodiscard]] std::vector<GridRow> neighbourRows(std::span<const Neighbour> neighbours, const DriveNow& now,
                                                 const LevelClasses& classes, Time time);

} // namespace velmora
