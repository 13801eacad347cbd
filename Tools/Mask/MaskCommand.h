// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Mask/MaskCommandOptions.h"

namespace velmora {

class Output;

/// Returns the exit status. Errors in the input do not keep what could be read from being masked.
[[nodiscard]] int runMask(const MaskCommandOptions& options, Output& output);

} // namespace velmora
