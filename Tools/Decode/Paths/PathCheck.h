// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "Tools/Decode/Paths/NodeSelection.h"

#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace velmora {

/// What is wrong with the first path of the selection that no display of these technologies can have, with
/// the paths that most resemble it; absent where every path is possible in one of them. Without a catalogue
/// nothing is wrong.
[[nodiscard]] std::optional<std::string> impossiblePath(const NodeSelection& selection,
                                                        const std::vector<const Catalogue*>& catalogues);

/// Raised where that is found out after decoding has begun, since standard input names its technology there.
class ImpossiblePath : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

} // namespace velmora
