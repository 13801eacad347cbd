// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Unit.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace velmora {

/// What all technologies have in common, so that what works on measurements needs to know no technology by
/// name. A closed list. The observed values of a role have one unit and one sign in every technology.
enum class Role : std::uint8_t {
    None,
    ServingCountryCode,  ///< MCC, three digits
    ServingNetworkCode,  ///< MNC, two or three digits
    ServingArea,         ///< location area or tracking area code
    ServingCell,         ///< cell identity
    ServingChannel,      ///< ARFCN, UARFCN, EARFCN, NR-ARFCN or CDMA channel number of the downlink
    ServingPhysicalCell, ///< BSIC, scrambling code, cell parameter ID, PCI or PN offset
    ServingLevel,        ///< dBm
    ServingQuality,      ///< dB
    NeighbourChannel,
    NeighbourPhysicalCell,
    NeighbourLevel,   ///< dBm
    NeighbourQuality, ///< dB
    RegistrationState,
    RadioState,
    BlockErrorRate, ///< per cent
    DataRate,       ///< kbit/s
};

/// A role as the catalogue names it, "serving.level"; the unit of its values.
struct RoleName {
    Role role;
    std::string_view name;
    Unit unit = Unit::None;
};

/// All roles but `None`, in the order of the enumeration.
[[nodiscard]] std::span<const RoleName> roleNames();
/// The name of a role; empty for `None`.
[[nodiscard]] std::string_view nameOf(Role role);
/// The role of that name, if there is one.
[[nodiscard]] std::optional<Role> roleNamed(std::string_view name);

} // namespace velmora
