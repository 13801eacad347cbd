// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/TextNumber.h"

#include <algorithm>
#include <charconv>

namespace velmora {

namespace {

constexpr std::ptrdiff_t mostDigits = 15; // what a double holds exactly
constexpr Unit units[] = {Unit::DBm, Unit::DB, Unit::Percent, Unit::KilobitPerSecond, Unit::Second};

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

std::optional<Unit> unitNamed(std::string_view name) {
    for (const Unit unit : units)
        if (nameOf(unit) == name)
            return unit;
    return std::nullopt;
}

} // namespace

std::optional<TextNumber> readTextNumber(std::string_view text) {
    const std::size_t blank = std::min(text.find(' '), text.size());
    std::string_view number = text.substr(0, blank);
    const std::string_view unitName = text.substr(std::min(blank + 1, text.size()));
    const std::optional<Unit> unit = blank == text.size() ? Unit::None : unitNamed(unitName);
    if (!unit)
        return std::nullopt;
    const bool isSigned = number.starts_with('-') || number.starts_with('+');
    const std::string_view digits = number.substr(isSigned ? 1 : 0);
    if (number.starts_with('+')) // which std::from_chars does not take
        number.remove_prefix(1);
    if (digits.empty() || !isDigit(digits.front()) || !isDigit(digits.back()))
        return std::nullopt;
    if (digits.size() > 1 && digits[0] == '0' && digits[1] != '.')
        return std::nullopt;
    if (std::count_if(digits.begin(), digits.end(), isDigit) > mostDigits)
        return std::nullopt;
    TextNumber result{0, *unit};
    const auto [end, error] =
        std::from_chars(number.data(), number.data() + number.size(), result.value, std::chars_format::fixed);
    if (error != std::errc() || end != number.data() + number.size())
        return std::nullopt;
    return result;
}

} // namespace velmora
