// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/DecodeOptions.h"

namespace velmora {

class DecoderLines;
class Output;

/// `velmora-log decode`. The exit status. An error in one file does not prevent decoding the others.
[[nodiscard]] int runDecode(const DecodeOptions& given, DecoderLines& lines, Output& output);

} // namespace velmora
