// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string_view>

/// How a member of ModemManager's becomes a number, flag or date of a live modem's messages. Each function
/// returns none for a member that is missing, of another type than ModemManager documents, unknown to the
/// modem, or out of its physical range: such a member is omitted.
namespace velmora::convert {

/// A number from `lowest` to `highest`, unchanged.
template <std::int64_t lowest, std::int64_t highest>
[[nodiscard]] Value numberFrom(const Value& member) {
    const std::int64_t* number = member.asInteger();
    return number && *number >= lowest && *number <= highest ? Value(*number) : Value();
}
/// An unsigned number of at most `maximum`, unchanged.
template <std::int64_t maximum>
[[nodiscard]] Value number(const Value& member) {
    return numberFrom<0, maximum>(member);
}

/// The number of at most `maximum` that a text holds in hexadecimal, with or without leading zeros.
[[nodiscard]] std::optional<std::int64_t> hexadecimal(std::string_view text, std::int64_t maximum);
template <std::int64_t maximum>
[[nodiscard]] Value hexadecimalNumber(const Value& member) {
    const std::string* text = member.asString();
    const auto number = text ? hexadecimal(*text, maximum) : std::nullopt;
    return number ? Value(*number) : Value();
}
/// A cell's identity; with all bits set it is unknown.
template <std::int64_t maximum>
[[nodiscard]] Value cellIdentity(const Value& member) {
    return hexadecimalNumber<maximum - 1>(member);
}
/// A location or tracking area of 16 or of 24 bits. 0 and all bits set but the last are reserved for "no area
/// is known" (3GPP TS 23.003), and modems set all bits for it; some fill 16 bits alone where 24 are wanted.
[[nodiscard]] Value areaCode(const Value& member);
[[nodiscard]] Value longAreaCode(const Value& member);
/// A channel number of E-UTRA; 65535 is the unknown one of modems that have 16 bits for it.
[[nodiscard]] Value earfcn(const Value& member);

/// A level in dB or dBm, or a percentage, from `lowest` to `highest`, unchanged.
[[nodiscard]] Value levelWithin(const Value& member, double lowest, double highest);
template <int lowest, int highest>
[[nodiscard]] Value level(const Value& member) {
    return levelWithin(member, lowest, highest);
}
/// The same of a whole number.
template <int lowest, int highest>
[[nodiscard]] Value wholeLevel(const Value& member) {
    const std::int64_t* number = member.asInteger();
    return number ? levelWithin(static_cast<double>(*number), lowest, highest) : Value();
}
/// The level in dBm of an RXLEV from 0 to 63, which counts decibels up from -111 dBm (3GPP TS 45.008).
[[nodiscard]] Value levelOfRXLEV(const Value& member);
/// Degrees and metres.
[[nodiscard]] Value latitude(const Value& member);
[[nodiscard]] Value longitude(const Value& member);
[[nodiscard]] Value altitude(const Value& member);

/// A frequency in kHz. ModemManager documents its frequencies as kHz from 0 to 16383, which is the range of
/// the channel numbers of UTRA: what is in it is one of those, and no frequency.
[[nodiscard]] Value frequency(const Value& member);
[[nodiscard]] Value channelInFrequency(const Value& member);

/// The country's and the network's part of "MCCMNC", five or six decimal digits, and how many digits the
/// network's part has. There is no country 000.
[[nodiscard]] Value countryCode(const Value& member);
[[nodiscard]] Value networkCode(const Value& member);
[[nodiscard]] Value networkDigits(const Value& member);
/// The same of codes that stand alone, as decimal texts.
[[nodiscard]] Value countryCodeAlone(const Value& member);
[[nodiscard]] Value networkCodeAlone(const Value& member);
[[nodiscard]] Value networkDigitsAlone(const Value& member);

/// A mask with some bit set.
[[nodiscard]] Value mask(const Value& member);
[[nodiscard]] Value flag(const Value& member);
/// Of (percent, recent), each of them.
[[nodiscard]] Value qualityPercent(const Value& member);
[[nodiscard]] Value qualityIsRecent(const Value& member);
/// Seconds since 1970.
[[nodiscard]] Value date(const Value& member);

/// Helpers of the conversions.
[[nodiscard]] bool allDigits(std::string_view text);
/// "MCCMNC" where the member is that; empty where it is not.
[[nodiscard]] std::string_view networkOf(const Value& member);

} // namespace velmora::convert
