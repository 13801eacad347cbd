// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Events/EventWriter.h"

#include <string>
#include <vector>

namespace velmora {

/// What a program is told of the event that it runs for, as variables of its environment ("NAME=value"):
/// VELMORA_EVENT_KIND, _STATE, _SEVERITY, _TIME, _END (empty while there is none), _TECHNOLOGY, _TEXT and
/// _EVIDENCE, and one for each field: VELMORA_EVENT_FROM, VELMORA_EVENT_TO_CHANNEL of "to.channel". Values
/// are made printable, so that they hold no zero character, line feed or other control character, and cut at
/// `longestValue` bytes.
[[nodiscard]] std::vector<std::string> eventEnvironment(const Event& event, EventState state,
                                                        const EvidenceNames& names);

inline constexpr std::string_view eventVariablePrefix = "VELMORA_EVENT_";
inline constexpr std::size_t longestValue = 4096;

} // namespace velmora
