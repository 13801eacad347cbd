// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

/// How a member of ModemManager's becomes text for people: SIM files and the values of a bearer. As with the
/// numbers, each function returns none for a member that is missing, of another type than ModemManager
/// documents, or out of range.
namespace velmora::convert {

/// "MCCMNC" as "MCC-MNC".
[[nodiscard]] Value networkText(const Value& member);
/// A list of ("MCCMNC", access technologies) as "001-02 (LTE), 001-03".
[[nodiscard]] Value preferredNetworks(const Value& member);

/// Text for people: not empty, at most 128 bytes, and nothing in it but what can be shown.
[[nodiscard]] Value text(const Value& member);
/// A list of such texts, with ", " between them.
[[nodiscard]] Value textList(const Value& member);
/// Decimal digits alone.
[[nodiscard]] Value digits(const Value& member);
/// An address of the Internet.
[[nodiscard]] Value internetAddress(const Value& member);

/// Texts of enumerations and masks; unknown values show as numbers.
[[nodiscard]] Value modemState(const Value& member);
[[nodiscard]] Value registrationState(const Value& member);
[[nodiscard]] Value accessTechnologies(const Value& member);
[[nodiscard]] Value bearerState(const Value& member);
[[nodiscard]] Value bearerType(const Value& member);
[[nodiscard]] Value internetFamily(const Value& member);
[[nodiscard]] Value configurationMethod(const Value& member);
[[nodiscard]] Value yesOrNo(const Value& member);

/// Numbers as text, with their unit.
[[nodiscard]] Value numberText(const Value& member);
[[nodiscard]] Value byteCount(const Value& member);
[[nodiscard]] Value seconds(const Value& member);
[[nodiscard]] Value bitRate(const Value& member);  ///< bit/s as "384 kbit/s"
[[nodiscard]] Value dateText(const Value& member); ///< seconds since 1970
/// (percent, recent) as "64 %", or "64 % (not recent)".
[[nodiscard]] Value signalQuality(const Value& member);
[[nodiscard]] Value powerText(const Value& member);   ///< "-90.0 dBm"
[[nodiscard]] Value ratioText(const Value& member);   ///< "-10.5 dB"
[[nodiscard]] Value percentText(const Value& member); ///< "0.4 %"

} // namespace velmora::convert
