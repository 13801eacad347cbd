// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Record/RecordOptions.h"

namespace velmora {

class DecoderLines;

/// Returns the exit status.
[[nodiscard]] int runRecord(const RecordOptions& options, DecoderLines& lines);

} // namespace velmora
