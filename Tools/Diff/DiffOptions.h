// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Analysed/AnalysisClock.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Diff/DiffInput.h"
#include "Tools/Fields/RoleSelection.h"

#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log diff`: what differs between two displays, or the statistics of two recordings.
struct DiffOptions {
    enum class Format { Text, Json };

    Format format = Format::Text;
    bool comparesDisplays = false; ///< those at the end of recordings, instead of their statistics
    NodeSelection selection;
    RoleSelection roles;
    AnalysisClock clock = AnalysisClock::Arrival;
    std::string technology; ///< overrides the files', or chooses one of several; empty for the files'
    DiffInput a;
    DiffInput b;
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addDiff(CLI::App& app, DiffOptions& options);

} // namespace velmora
