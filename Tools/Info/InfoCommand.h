// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Info/InfoOptions.h"

namespace velmora {

class Output;

/// Returns the exit status.
[[nodiscard]] int runInfo(const InfoOptions& options, Output& output);

} // namespace velmora
