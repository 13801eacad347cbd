// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Tools/Browse/Data/InspectedMessage.h"
#include "Tools/Browse/Data/MessageRow.h"
#include "Tools/Browse/Passes/EventPass.h"

#include <string>

namespace velmora {

/// The words in which a message, a value or an event is shown: on the screen, in the line mode, and copied.

/// "05:00:01.250", UTC.
[[nodiscard]] std::string timeOfDay(Time time);
/// "+0.250" seconds; "-0.250" where times go back.
[[nodiscard]] std::string differenceText(Time::duration difference);
/// "0x5134", "0xFF0001", "no code".
[[nodiscard]] std::string codeText(const MessageRow& row);
/// "     12  05:00:01.250  +0.250  0x5134  Serving Cell  * a note"
[[nodiscard]] std::string rowText(const MessageRow& row);
/// "/GSM/Serving Cell/RxLev = -71 dBm (bytes 19 to 20, bits 0 to 8)"; bytes count from 0.
[[nodiscard]] std::string fieldText(const ReportedField& field);
/// "bytes 19 to 20, bits 0 to 8"
[[nodiscard]] std::string placeText(const FieldPlace& place);
/// "05:00:01.250 warning handover: PCI 45 to PCI 124"
[[nodiscard]] std::string eventText(const BrowsedEvent& event);

} // namespace velmora
