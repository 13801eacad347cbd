// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/InputTable.h"
#include "Platform/Fix.h"

#include <string_view>

/// The table of the fixes of an input's receiver of positions, as they were recorded.
namespace velmora::positionsTable {

[[nodiscard]] TableLayout layout(std::string_view technology);
void add(InputTable& table, const Fix& fix);

} // namespace velmora::positionsTable
