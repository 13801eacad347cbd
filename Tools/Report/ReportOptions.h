// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Analysed/AnalysisClock.h"
#include "Tools/Mask/MaskOption.h"

#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log report`: a page about recordings.
struct ReportOptions {
    std::vector<std::string> files;
    std::string out;
    bool force = false;
    bool hasIdentities = false;
    AnalysisClock clock = AnalysisClock::Arrival;
    MaskOption mask;
    std::vector<std::string> rules; ///< files of rules
    bool usesStandardRules = true;
    std::string technology; ///< overrides the files', or chooses one of several; empty for the files'
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addReport(CLI::App& app, ReportOptions& options);

} // namespace velmora
