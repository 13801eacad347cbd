// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Convert/ConvertOptions.h"

namespace velmora {

/// The exit status. Trouble with the input does not keep what could be read from being converted.
[[nodiscard]] int runConvert(const ConvertOptions& options);

} // namespace velmora
