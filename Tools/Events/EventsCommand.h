// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Events/EventsOptions.h"

namespace velmora {

class DecoderLines;
class Output;

/// Returns the exit status.
[[nodiscard]] int runEvents(const EventsOptions& options, DecoderLines& lines, Output& output);

} // namespace velmora
