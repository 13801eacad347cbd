// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Diff/DiffOptions.h"

namespace velmora {

class DecoderLines;
class Output;

/// `velmora-log diff`. The exit status, which does not depend on whether there are differences.
[[nodiscard]] int runDiff(const DiffOptions& options, DecoderLines& lines, Output& output);

} // namespace velmora
