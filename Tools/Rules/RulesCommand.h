// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Rules/RulesOptions.h"

namespace velmora {

class Output;

/// Returns the exit status.
[[nodiscard]] int runRules(const RulesOptions& options, Output& output);

} // namespace velmora
