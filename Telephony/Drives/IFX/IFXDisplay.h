// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/RadioNetwork.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// The phone of the serialized-object scenario.
struct IFXPhone {
    enum class State : std::uint8_t { Searching, Limited, Registering, Idle, Call, PacketSession };

    DriveIdentities identities;
    State state = State::Searching;
    std::optional<GSMMeasurement> serving; ///< none while it searches
    CellArea registeredArea{{1, 1}, 4101, 1};
    int contexts = 0;    ///< active packet-data contexts
    int callSeconds = 0; ///< since the call began
    double loss = 0.5;   ///< what the radio link loses, 0 (nothing) to 1
};

/// The display that such a baseband sends: only dictionaries, arrays and strings, since any other kind of
/// value would end the application. Several dictionaries have one entry, at times or always; the decoder
/// collapses them.
[[nodiscard]] Value ifxDisplay(const IFXPhone& phone, const RadioNetwork& network);

} // namespace velmora
