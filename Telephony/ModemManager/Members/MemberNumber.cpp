// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberNumber.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace velmora::convert {
namespace {

constexpr std::int64_t highestRXLEV = 63;
/// RXLEV 1 begins at -110 dBm, and each step is one decibel.
constexpr std::int64_t rxlevOffset_dBm = -111;

Value decimal(std::string_view text) {
    std::int64_t number = 0;
    std::from_chars(text.data(), text.data() + text.size(), number);
    return number;
}

} // namespace

bool allDigits(std::string_view text) {
    return !text.empty() &&
           std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; });
}

std::string_view networkOf(const Value& member) {
    const std::string* text = member.asString();
    return text && (text->size() == 5 || text->size() == 6) && allDigits(*text) ? *text : std::string_view();
}

std::optional<double> within(const Value& member, double lowest, double highest) {
    const double* real = member.asReal();
    return real && *real >= lowest && *real <= highest ? std::optional(*real) : std::nullopt;
}

std::optional<std::int64_t> hexadecimal(std::string_view text, std::int64_t maximum) {
    std::uint64_t number = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number, 16);
    if (error != std::errc() || stop != end || number > static_cast<std::uint64_t>(maximum))
        return std::nullopt;
    return static_cast<std::int64_t>(number);
}

Value wholeLevel(const Value& member, int lowest, int highest) {
    const auto real = within(member, lowest, highest);
    return real ? Value(static_cast<std::int64_t>(std::lround(*real))) : Value();
}

Value halfSteps(const Value& dBm) {
    const auto real = within(dBm, -150, 0);
    return real ? Value(static_cast<std::int64_t>(std::ceil(*real / 2 - 0.5))) : Value();
}

Value halfStepsOfRXLEV(const Value& member) {
    const std::int64_t* level = member.asInteger();
    if (!level || *level < 0 || *level > highestRXLEV)
        return {};
    return halfSteps(static_cast<double>(rxlevOffset_dBm + *level));
}

Value countryCode(const Value& member) {
    const std::string_view network = networkOf(member);
    return network.empty() ? Value() : decimal(network.substr(0, 3));
}

Value networkCode(const Value& member) {
    const std::string_view network = networkOf(member);
    return network.empty() ? Value() : decimal(network.substr(3));
}

Value decimalCode(const Value& member) {
    const std::string* text = member.asString();
    return text && text->size() <= 3 && allDigits(*text) ? decimal(*text) : Value();
}

} // namespace velmora::convert
