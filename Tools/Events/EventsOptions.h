// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Analysis/Tracks/Track.h"
#include "Tools/Analysed/AnalysisClock.h"
#include "Tools/Events/EventSelection.h"
#include "Tools/Mask/MaskOption.h"
#include "Tools/Text/CSVText.h"

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log events`: what happened in recordings, or happens now.
struct EventsOptions {
    enum class Format { Text, JsonLines, Csv };

    std::vector<std::string> files; ///< none for the telephony service
    Format format = Format::Text;
    CSVGuard guard = CSVGuard::Off; ///< for Csv alone
    bool hasEvidence = false;       ///< for Text: the records at the end of each line
    bool hasPositions = false;      ///< for Text: where events happened or began
    std::chrono::nanoseconds maximumGap = Track::defaultGap; ///< between fixes
    EventSelection selection;
    AnalysisClock clock = AnalysisClock::Arrival;
    std::string technology; ///< overrides the files', or chooses one of several; empty for the files'
    MaskOption mask;
    /// Events as soon as they are known, and those that last at their begin too; always without files.
    bool isLive = false;
    std::vector<std::string> rules; ///< files
    bool usesStandardRules = true;  ///< the built-in ones and the user's
    std::optional<Severity> failOn;
    std::vector<std::string> program; ///< and its arguments; empty for none
    double programLimit_seconds = 10;
    std::optional<double> duration_seconds; ///< these three without files
    std::optional<std::uint64_t> count;     ///< messages
    std::optional<double> timeout_seconds;  ///< how long to wait for a service at the start
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addEvents(CLI::App& app, EventsOptions& options);

} // namespace velmora
