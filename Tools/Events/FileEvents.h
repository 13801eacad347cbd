// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "Tools/Events/EventsOptions.h"

#include <optional>

namespace velmora {

class DecoderLines;
class Output;

/// Lists the events of the files. `masking` is absent for messages as they are. Returns the exit status;
/// where programs run for events, a signal ends the process once they are ended.
[[nodiscard]] int listFileEvents(const EventsOptions& options, const RuleSet& rules,
                                 const std::optional<MaskOptions>& masking, DecoderLines& lines,
                                 Output& output);

} // namespace velmora
