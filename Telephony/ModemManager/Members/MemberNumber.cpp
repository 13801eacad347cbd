// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberNumber.h"

#include <algorithm>
#include <charconv>

namespace velmora::convert {
namespace {

constexpr std::int64_t highestRXLEV = 63;
/// RXLEV 1 begins at -110 dBm, and each step is one decibel.
constexpr std::int64_t rxlevOffset_dBm = -111;

constexpr std::int64_t highestUARFCN = 16383;
/// The radio technologies' bands begin and end within these.
constexpr std::int64_t lowestFrequency_kHz = 400'000;
constexpr std::int64_t highestFrequency_kHz = 6'000'000;

/// A value above this in seconds is no plausible date.
constexpr std::int64_t lastDate = 9'000'000'000;

Value decimal(std::string_view text) {
    std::int64_t number = 0;
    std::from_chars(text.data(), text.data() + text.size(), number);
    return number;
}

/// The digits of a text that has from `shortest` to `longest` of them and nothing else.
std::string_view digitsOf(const Value& member, std::size_t shortest, std::size_t longest) {
    const std::string* text = member.asString();
    return text && text->size() >= shortest && text->size() <= longest && allDigits(*text)
               ? *text
               : std::string_view();
}

const Array* qualityOf(const Value& member) {
    const Array* pair = member.asArray();
    return pair && pair->size() == 2 && !number<100>((*pair)[0]).isNone() && (*pair)[1].asBoolean() ? pair
                                                                                                    : nullptr;
}

bool isReservedArea(std::int64_t area, std::int64_t bits) {
    return area == 0 || area == bits || area == bits - 1;
}

} // namespace

bool allDigits(std::string_view text) {
    return !text.empty() &&
           std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; });
}

std::string_view networkOf(const Value& member) {
    const std::string_view network = digitsOf(member, 5, 6);
    return network.starts_with("000") ? std::string_view() : network;
}

std::optional<std::int64_t> hexadecimal(std::string_view text, std::int64_t maximum) {
    std::uint64_t number = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number, 16);
    if (error != std::errc() || stop != end || number > static_cast<std::uint64_t>(maximum))
        return std::nullopt;
    return static_cast<std::int64_t>(number);
}

Value areaCode(const Value& member) {
    const Value area = hexadecimalNumber<0xFFFF>(member);
    return area.isNone() || isReservedArea(*area.asInteger(), 0xFFFF) ? Value() : area;
}

Value longAreaCode(const Value& member) {
    const Value area = hexadecimalNumber<0xFFFFFF>(member);
    return area.isNone() || isReservedArea(*area.asInteger(), 0xFFFF) ||
                   isReservedArea(*area.asInteger(), 0xFFFFFF)
               ? Value()
               : area;
}

Value earfcn(const Value& member) {
    const Value channel = number<262143>(member);
    return channel == Value(0xFFFF) ? Value() : channel;
}

Value levelWithin(const Value& member, double lowest, double highest) {
    // Not a number is not within anything.
    const double* real = member.asReal();
    return real && *real >= lowest && *real <= highest ? member : Value();
}

Value levelOfRXLEV(const Value& member) {
    const std::int64_t* level = member.asInteger();
    if (!level || *level < 0 || *level > highestRXLEV)
        return {};
    return static_cast<double>(rxlevOffset_dBm + *level);
}

Value latitude(const Value& member) {
    return levelWithin(member, -90, 90);
}

Value longitude(const Value& member) {
    return levelWithin(member, -180, 180);
}

Value altitude(const Value& member) {
    return levelWithin(member, -1000, 100'000);
}

Value frequency(const Value& member) {
    return numberFrom<lowestFrequency_kHz, highestFrequency_kHz>(member);
}

Value channelInFrequency(const Value& member) {
    return numberFrom<1, highestUARFCN>(member);
}

Value countryCode(const Value& member) {
    const std::string_view network = networkOf(member);
    return network.empty() ? Value() : decimal(network.substr(0, 3));
}

Value networkCode(const Value& member) {
    const std::string_view network = networkOf(member);
    return network.empty() ? Value() : decimal(network.substr(3));
}

Value networkDigits(const Value& member) {
    const std::string_view network = networkOf(member);
    return network.empty() ? Value() : Value(network.size() - 3);
}

Value countryCodeAlone(const Value& member) {
    const std::string_view code = digitsOf(member, 3, 3);
    return code.empty() || code == "000" ? Value() : decimal(code);
}

Value networkCodeAlone(const Value& member) {
    const std::string_view code = digitsOf(member, 2, 3);
    return code.empty() ? Value() : decimal(code);
}

Value networkDigitsAlone(const Value& member) {
    const std::string_view code = digitsOf(member, 2, 3);
    return code.empty() ? Value() : Value(code.size());
}

Value mask(const Value& member) {
    // All bits stand for any of them.
    return numberFrom<1, 0xFFFFFFFE>(member);
}

Value flag(const Value& member) {
    return member.asBoolean() ? member : Value();
}

Value qualityPercent(const Value& member) {
    const Array* pair = qualityOf(member);
    return pair ? (*pair)[0] : Value();
}

Value qualityIsRecent(const Value& member) {
    const Array* pair = qualityOf(member);
    return pair ? (*pair)[1] : Value();
}

Value date(const Value& member) {
    const std::int64_t* seconds = member.asInteger();
    return seconds && *seconds > 0 && *seconds <= lastDate ? Value(Date(std::chrono::seconds(*seconds)))
                                                           : Value();
}

} // namespace velmora::convert
