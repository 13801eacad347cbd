// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/DecodeOptions.h"

namespace velmora {

class Output;

/// `velmora-log decode`. The exit status. One file's trouble does not keep the others from being decoded.
[[nodiscard]] int runDecode(const DecodeOptions& options, Output& output);

} // namespace velmora
