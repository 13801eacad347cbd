// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "PropertyLists/Value.h"
#include "Telephony/ModemManager/ModemObjects.h"

#include <string>
#include <string_view>

namespace velmora {

/// Whether there is a modem to report of, and why not.
struct Presence {
    ModemPresence state = ModemPresence::NoAnswer;
    std::string reason; ///< as the bus names it; empty where it names none

    friend bool operator==(const Presence&, const Presence&) = default;
};

/// The root of a message while there is no modem: nothing but why.
[[nodiscard]] DictionaryRef rootWithoutModem(const Presence& presence);
/// The root of a message about the modem, with its state; the reason says why something is missing in this
/// message, if anything is.
[[nodiscard]] DictionaryRef rootOf(const Modem& modem, std::string_view reason = {});

/// Why the modem cannot be used as it is, as a log line ends in it: "is locked (SIM PIN)". Empty where it
/// can.
[[nodiscard]] std::string obstacleOf(const Modem& modem);

} // namespace velmora
