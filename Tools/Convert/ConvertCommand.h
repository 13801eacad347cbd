// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Convert/ConvertOptions.h"

namespace velmora {

/// Returns the exit status. Errors in the input do not keep what could be read from being converted.
[[nodiscard]] int runConvert(const ConvertOptions& options);

} // namespace velmora
