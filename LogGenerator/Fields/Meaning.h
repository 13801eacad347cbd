// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Role.h"
#include "LogGenerator/Fields/Unit.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// Whom a value identifies, for those who share recordings.
enum class Identity : std::uint8_t {
    None,
    Subscriber, ///< the subscriber or the SIM, temporary identities included
    Equipment,  ///< the phone
    Address,    ///< an address of the phone in the packet network
    Location,   ///< where the phone is: areas and cells
};

/// As the catalogue writes it: "subscriber"; empty for `None`.
[[nodiscard]] std::string_view nameOf(Identity identity);

/// Whether a value is signed, where the display shows it otherwise.
enum class Sign : std::uint8_t {
    AsShown,
    Signed,  ///< two's complement of the field's width, although shown as unsigned
    Unsigned ///< of the field's width, although shown as signed
};

/// What a field's value means beyond how it is shown. The default is a value that means what its format
/// shows, in the format's unit.
struct Meaning {
    Role role = Role::None;
    std::optional<Unit> unit = std::nullopt; ///< where it is not the format's
    /// Physical value = shown value * scale + offset. A level that is shown without its sign has -1.
    double scale = 1;
    double offset = 0;
    Sign sign = Sign::AsShown;
    /// At least so many digits make a decimal code, which is observed as text: an MNC of 04 is not 4. 0 for a
    /// number.
    std::uint8_t digits = 0;
    Identity identity = Identity::None;
    bool isAbsence = false; ///< it shows why there is no value
    /// What it shows where there is no value, beside the format's special text.
    std::optional<std::string_view> absent = std::nullopt;
    std::string_view clause = {}; ///< of the standard that defines the quantity: "3GPP TS 45.008 6.4"
};

/// A level that is shown without its sign.
inline constexpr double negated = -1;

} // namespace velmora
