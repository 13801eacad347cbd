// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

class CatalogueNode;

/// A text of the display as a part of a field's name in the dissector: lower case, with "_" for each run of
/// other characters than ASCII letters and digits. "Num of Consecutive DRX Cycles of S < 0" is
/// "num_of_consecutive_drx_cycles_of_s_0".
[[nodiscard]] std::string snakeCase(std::string_view text);

/// What a technology's fields begin with, by its short name: "velmora.lte" of "Ostrel_LTE".
[[nodiscard]] std::string fieldPrefix(std::string_view technology);

/// The name of the field that shows the node's value: "velmora.lte.serving_cell_measurements.measured_rsrp".
/// The section comes first, where there is one, whatever groups the display has it in; rows of lists have no
/// part of the name.
[[nodiscard]] std::string fieldName(std::string_view technology, std::string_view section,
                                    const CatalogueNode& node);

} // namespace velmora
