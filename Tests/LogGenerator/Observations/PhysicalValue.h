// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"

#include <string>

namespace velmora {

/// What is wrong with an observation, by its display text and what the catalogue says of its leaf; empty
/// where nothing is. The number is read from the text independently of the observer.
[[nodiscard]] std::string contradiction(const Observation& observation, const std::string& text);

} // namespace velmora
