// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Watch/WatchOptions.h"

namespace velmora {

class DecoderLines;
class Output;

/// Returns the exit status. Draws on the terminal where standard output is one, prints each refresh to
/// `output` otherwise.
[[nodiscard]] int runWatch(const WatchOptions& options, DecoderLines& lines, Output& output);

} // namespace velmora
