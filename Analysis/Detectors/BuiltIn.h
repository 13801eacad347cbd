// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <memory>
#include <vector>

namespace velmora {

/// The detectors of the kinds that no rule finds, as far as the technology's records support them.
[[nodiscard]] std::vector<std::unique_ptr<Detector>> builtInDetectors(const Catalogue& catalogue);

} // namespace velmora
