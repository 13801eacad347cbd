// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Analysed/AnalysisClock.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Fields/RoleSelection.h"

namespace CLI {
class App;
}

namespace velmora {

/// What commands that analyse recordings have in common. Parsing fills what must outlive `command`.

/// Adds `--select` and `--role`.
void addChoice(CLI::App& command, NodeSelection& selection, RoleSelection& roles);
/// Adds `--clock`.
void addClock(CLI::App& command, AnalysisClock& clock);

} // namespace velmora
