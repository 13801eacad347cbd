// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"

#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <memory>
#include <span>

namespace velmora {

/// What rule files say for one technology.
struct DriveRules {
    std::unique_ptr<Detector> detector;
    LevelClasses classes;
};

/// Reads the rules of the files. Mistakes are lines of the log. The catalogue must outlive the detector.
[[nodiscard]] DriveRules driveRules(std::span<const RuleFile> files, const Catalogue& catalogue,
                                    const Clock& clock);

} // namespace velmora
