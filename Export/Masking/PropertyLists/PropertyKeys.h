// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace velmora {

/// What the value under a key is, for masking.
enum class PropertyForm : std::uint8_t {
    Number, ///< a number or flag that identifies nothing; as a text it is unknown
    Text,   ///< a text that identifies nothing, or a number in a text
    Inner,  ///< part of what the key around it says
    Group,  ///< what many subscribers have in common, as a short text or bytes
    ICCID,
    IMSI,
    EID,
    Phone,
    ShortNumbers, ///< emergency numbers: longer ones are phone numbers
    Equipment,
    Address,
    Personal, ///< a description of a SIM file with temporary identities
    CountryCode,
    NetworkCode,
    Network, ///< both in one text
    NetworkName,
    AreaText, ///< a text with network and area codes
    LocationArea,
    TrackingArea,
    RoutingArea,
    Cell, ///< of the radio technology of the same dictionary
    System,
    NetworkID,
    BaseStation,
    Position,
    ClockTime,
    DateValue,
};

struct PropertyKey {
    std::string_view key;
    PropertyForm form;
};

/// The property lists, by what their keys are.
enum class PropertyListKind : std::uint8_t {
    SIMFiles, ///< 0xFF0000
    Cells,    ///< 0xFF0001
    Contexts, ///< 0xFF0002
    Display,  ///< the messages of IFX
    Modem,    ///< the messages of a live modem
};

/// The form of what is under the key; absent for a key that is not known.
[[nodiscard]] std::optional<PropertyForm> formOf(PropertyListKind kind, std::string_view key);

/// All keys that are known.
[[nodiscard]] std::span<const PropertyKey> keysOf(PropertyListKind kind);

} // namespace velmora
