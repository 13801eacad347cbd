// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/RuleUnit.h"

#include <algorithm>
#include <charconv>
#include <cstdio>

namespace velmora {

namespace {

constexpr RuleUnit units[] = {
    {"dBm", Unit::DBm, 1},
    {"dB", Unit::DB, 1},
    {"%", Unit::Percent, 1},
    {"kbit/s", Unit::KilobitPerSecond, 1},
    {"Mbit/s", Unit::KilobitPerSecond, 1000},
    {"s", Unit::Second, 1},
    {"ms", Unit::Second, 0.001},
    {"min", Unit::Second, 60},
    {"h", Unit::Second, 3600},
    {"MHz", Unit::Megahertz, 1},
    {"byte", Unit::Byte, 1},
    {"bytes", Unit::Byte, 1},
    {"\u00B0", Unit::Degree, 1},
    {"deg", Unit::Degree, 1},
    {"m", Unit::Metre, 1},
    {"km", Unit::Metre, 1000},
};

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool continuesName(std::string_view text) {
    return !text.empty() && (isDigit(text[0]) || (text[0] >= 'a' && text[0] <= 'z') ||
                             (text[0] >= 'A' && text[0] <= 'Z') || text[0] == '_');
}

std::size_t digitsAt(std::string_view text, std::size_t at) {
    std::size_t end = at;
    while (end < text.size() && isDigit(text[end]))
        ++end;
    return end - at;
}

} // namespace

std::optional<RuleUnit> unitAtFront(std::string_view text) {
    std::optional<RuleUnit> longest;
    for (const RuleUnit& each : units)
        if (text.starts_with(each.name) &&
            (each.name == "%" || !continuesName(text.substr(each.name.size()))) &&
            (!longest || each.name.size() > longest->name.size()))
            longest = each;
    return longest;
}

std::optional<FrontNumber> numberAtFront(std::string_view text) {
    std::size_t length = digitsAt(text, 0);
    if (length == 0)
        return std::nullopt;
    // Two dots are a range.
    if (text.substr(length).starts_with('.') && digitsAt(text, length + 1) > 0)
        length += 1 + digitsAt(text, length + 1);
    FrontNumber number{0, length};
    const auto [end, error] = std::from_chars(text.data(), text.data() + length, number.value);
    if (error != std::errc() || end != text.data() + length)
        return std::nullopt;
    return number;
}

std::optional<double> readSpan(std::string_view text) {
    const std::optional<FrontNumber> number = numberAtFront(text);
    if (!number)
        return std::nullopt;
    text.remove_prefix(number->length);
    text.remove_prefix(std::min(text.find_first_not_of(' '), text.size()));
    const std::optional<RuleUnit> unit = unitAtFront(text);
    if (!unit || unit->unit != Unit::Second || unit->name.size() != text.size())
        return std::nullopt;
    return number->value * unit->scale;
}

std::string numberWithUnit(double number, Unit unit) {
    char text[400]; // the largest double has 309 digits
    std::snprintf(text, sizeof text, "%.2f", number);
    std::string shown = text;
    shown.erase(shown.find_last_not_of('0') + 1);
    if (shown.ends_with('.'))
        shown.pop_back();
    if (shown == "-0")
        shown = "0";
    if (unit != Unit::None)
        shown.append(" ").append(nameOf(unit));
    return shown;
}

} // namespace velmora
