// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/KeyedHash.h"

#include <cstdint>
#include <span>

namespace velmora {

/// What a pseudonym is of: values of different kinds have different permutations.
enum class PseudonymKind : std::uint8_t {
    ICCID = 1,
    IMSI,
    EID,
    Phone,
    Equipment,
    Digits,
    Hexadecimal,
    Text,
    Data,
    Address,
    Temporary, ///< TMSI, P-TMSI, UATI
    CountryCode,
    NetworkCode,
    LocationArea,
    TrackingArea,
    RoutingArea,
    RegistrationArea,
    GSMCell,
    UMTSController,
    UMTSCell,
    LTESite,
    LTESector,
    NRSite,
    NRSector,
    System,
    Network,
    BaseStation,
    Other = 64, ///< and above: numbers that no other record has
};

/// Replaces the digits, each below `radix` (2 to 64), by those that a keyed permutation of all numbers of
/// this length has for them: a balanced Feistel network of eight rounds over the two halves, with
/// HMAC-SHA-256 as its round function and addition of digits, as the format-preserving modes of NIST SP
/// 800-38G are built.
void permute(const KeyedHash& hash, PseudonymKind kind, std::span<std::uint8_t> digits, unsigned radix);

/// Digits of that radix that depend on the message; the same bytes give the same digits.
void fillKeyed(const KeyedHash& hash, Bytes message, std::span<std::uint8_t> digits, unsigned radix);

} // namespace velmora
