// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"

#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The kinds that events can be of: those that are built in, and the names of the rules.
[[nodiscard]] std::vector<std::string> kindNames(const RuleSet& rules);

/// What is wrong with the names of kinds, with the nearest ones; absent where each is one.
[[nodiscard]] std::optional<std::string> unknownKind(const std::vector<std::string>& given,
                                                     const std::vector<std::string>& known);

} // namespace velmora
