// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string_view>

/// How a member of ModemManager's becomes a number of the cell information array. Each function returns none
/// for a member that is missing, of another type than ModemManager documents, or out of its physical range:
/// such a member is omitted.
namespace velmora::convert {

/// An unsigned number of at most `maximum`, unchanged.
template <std::int64_t maximum>
[[nodiscard]] Value number(const Value& member) {
    const std::int64_t* number = member.asInteger();
    return number && *number >= 0 && *number <= maximum ? Value(*number) : Value();
}

/// The number of at most `maximum` that a text holds in hexadecimal, with or without leading zeros.
[[nodiscard]] std::optional<std::int64_t> hexadecimal(std::string_view text, std::int64_t maximum);
template <std::int64_t maximum>
[[nodiscard]] Value hexadecimalNumber(const Value& member) {
    const std::string* text = member.asString();
    const auto number = text ? hexadecimal(*text, maximum) : std::nullopt;
    return number ? Value(*number) : Value();
}

/// A level in dB or dBm from `lowest` to `highest`, to the nearest whole one.
[[nodiscard]] Value wholeLevel(const Value& member, int lowest, int highest);
template <int lowest, int highest>
[[nodiscard]] Value level(const Value& member) {
    return wholeLevel(member, lowest, highest);
}

/// GSM levels in the service's steps of 2 dBm; of two equally near steps the lower.
[[nodiscard]] Value halfSteps(const Value& dBm);
/// The same of an RXLEV from 0 to 63, which counts decibels up from -111 dBm.
[[nodiscard]] Value halfStepsOfRXLEV(const Value& member);

/// The country's and the network's part of "MCCMNC", five or six decimal digits.
[[nodiscard]] Value countryCode(const Value& member);
[[nodiscard]] Value networkCode(const Value& member);
/// A decimal text of at most three digits, as a number.
[[nodiscard]] Value decimalCode(const Value& member);

/// Helpers of the conversions.
[[nodiscard]] bool allDigits(std::string_view text);
/// "MCCMNC" where the member is that; empty where it is not.
[[nodiscard]] std::string_view networkOf(const Value& member);
/// The member where it is a number from `lowest` to `highest`.
[[nodiscard]] std::optional<double> within(const Value& member, double lowest, double highest);

} // namespace velmora::convert
