// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Report/ReportOptions.h"

namespace velmora {

class DecoderLines;

/// `velmora-log report`. The exit status.
[[nodiscard]] int runReport(const ReportOptions& options, DecoderLines& lines);

} // namespace velmora
