// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Columns/ColumnsOptions.h"

namespace velmora {

class DecoderLines;
class Output;

/// `velmora-log columns`. The exit status. An error in one file does not prevent writing the others.
[[nodiscard]] int runColumns(const ColumnsOptions& options, DecoderLines& lines, Output& output);

} // namespace velmora
