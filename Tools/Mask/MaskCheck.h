// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Mask/MaskCommandOptions.h"

namespace velmora {

class Output;

/// Reports which identities a file has, a line a finding and never a value. Returns the exit status: 1 where
/// there are any, and where the file cannot be read.
[[nodiscard]] int runMaskCheck(const MaskCommandOptions& options, Output& output);

} // namespace velmora
