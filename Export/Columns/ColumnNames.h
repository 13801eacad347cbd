// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"

#include <cstddef>
#include <string>
#include <string_view>

namespace velmora {

/// Where a leaf's values are in the tables.
struct ColumnPlace {
    std::string table;  ///< "serving_cell_serving_cell_measurements"
    std::string column; ///< "measured_rsrp_dbm"; an enumeration's has no ending
    std::size_t depth;  ///< how many rows of lists lead to it

    bool operator==(const ColumnPlace&) const = default;
};

/// A label in lower case, whatever is no letter or digit of ASCII as "_": "EV-DO State" is "ev_do_state".
[[nodiscard]] std::string columnName(std::string_view label);

/// By the leaf's path, section, kind and unit alone. The ending says what the column holds, so that a name
/// never has another type or unit: "_dbm" and the like a number in that unit, none a number without, "_text"
/// a text, "_raw" the number of an enumeration, "_flag" true or false, "_data" bytes.
[[nodiscard]] ColumnPlace placeOf(const CatalogueField& leaf);

} // namespace velmora
