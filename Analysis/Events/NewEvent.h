// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Analysis/Events/EventKind.h"
#include "Analysis/Picture/CellIdentity.h"

#include <string>
#include <string_view>

namespace velmora {

class RadioPicture;

/// An event of that kind, which that message made.
[[nodiscard]] Event newEvent(EventKind kind, const MessageReport& report, const RadioPicture& picture);

/// Adds a field; a text or cell of which nothing is known is left out.
void addField(Event& event, std::string_view name, std::string text);
void addField(Event& event, std::string_view name, double number, Unit unit = Unit::None);
/// Its name, and what is known of it: "from", "from.channel".
void addField(Event& event, std::string_view name, const CellIdentity& cell);
/// Both, and the text: "RR_IDLE to RR_CELL_RESELECTION".
void addChange(Event& event, const std::string& from, const std::string& to);
/// "duration", in seconds. None is ever less than 0.
void addDuration(Event& event, Time from, Time to);
/// The messages that made it, in order; one that is there already is not added again.
void addEvidence(Event& event, MessageNumber message);

} // namespace velmora
