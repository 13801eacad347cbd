// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/Cell.h"

#include <string>
#include <vector>

namespace velmora {

/// Cells as a test shows them: [TECHNOLOGY TYPE KEY=NUMBER...] each, technology and type by their places in
/// the lists of those that are known, keys by their last word.
[[nodiscard]] std::string textOf(const std::vector<Cell>& cells);

} // namespace velmora
