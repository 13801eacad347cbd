// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/StatisticsPlan.h"
#include "Analysis/Tracks/Track.h"
#include "Tools/Analysed/AnalysisClock.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Fields/RoleSelection.h"
#include "Tools/Messages/TimeRange.h"
#include "Tools/Text/CSVText.h"

#include <chrono>
#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log stats`: statistics of what recordings report.
struct StatsOptions {
    enum class Format { Text, Json, Csv };

    Format format = Format::Text;
    StatisticsPlan::By by = StatisticsPlan::By::Nothing;
    double squareSize_m = 0;                                 ///< by squares
    std::chrono::nanoseconds maximumGap = Track::defaultGap; ///< between fixes; by squares
    NodeSelection selection;
    RoleSelection roles;
    TimeRange range;
    AnalysisClock clock = AnalysisClock::Arrival;
    bool hasHistogram = false;      ///< for Text and Json
    CSVGuard guard = CSVGuard::Off; ///< for Csv alone
    std::string technology;         ///< overrides the files', or chooses one of several; empty for the files'
    std::vector<std::string> files; ///< "-" is standard input, which is read for none, too
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addStats(CLI::App& app, StatsOptions& options);

/// What statistics are made of, as selections say it.
[[nodiscard]] LeafChoice leafChoice(const NodeSelection& selection, const RoleSelection& roles);

} // namespace velmora
