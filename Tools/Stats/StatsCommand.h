// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Stats/StatsOptions.h"

namespace velmora {

class DecoderLines;
class Output;

/// `velmora-log stats`. The exit status. An error in one file does not prevent reading the others.
[[nodiscard]] int runStats(const StatsOptions& given, DecoderLines& lines, Output& output);

} // namespace velmora
