// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Rule.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <string>

namespace velmora {

/// Runs a test of the rule on its own. Empty where the rule makes the expected events, otherwise what it
/// makes and what was expected. The catalogue is that of the test's technology.
[[nodiscard]] std::string runRuleTest(const Rule& rule, const RuleTest& test, const Catalogue& catalogue);

} // namespace velmora
