// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// A row of the display as of a message.
struct DisplayRow {
    std::string path;  ///< "/GSM/Serving Cell/RxLev"
    std::string name;  ///< printable
    std::string value; ///< printable; empty for a branch
    std::size_t depth = 0;
    bool isBranch = false;
    bool isReported = false;    ///< by the message, changed or not
    bool hasChanged = false;    ///< with the message
    std::optional<Time> latest; ///< when it was last reported, where that is known
    bool isOld = false;         ///< it was last reported long before the message
};

/// The rows of a display, in its order; none of no display.
[[nodiscard]] std::vector<DisplayRow> displayRows(const Value& display);

/// Marks the rows whose value the earlier display does not have, or has another of.
void markChanges(std::vector<DisplayRow>& rows, const std::vector<DisplayRow>& earlier);

/// The leaf of a display's path, whose rows are numbers where the catalogue has "*"; null for none.
[[nodiscard]] const CatalogueField* leafOfPath(const Catalogue& catalogue, const std::string& path);

} // namespace velmora
