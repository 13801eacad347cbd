// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/NMEAValues.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstddef>

namespace velmora::nmea {

namespace {

constexpr std::size_t maximumNumberLength = 24;

bool isDigit(char character) {
    return character >= '0' && character <= '9';
}

/// Exactly that many digits at the beginning.
std::optional<int> digits(std::string_view text, std::size_t count) {
    if (text.size() < count ||
        !std::all_of(text.begin(), text.begin() + static_cast<std::ptrdiff_t>(count), isDigit))
        return std::nullopt;
    int value = 0;
    std::from_chars(text.data(), text.data() + count, value);
    return value;
}

/// Whole degrees in that many digits, then minutes.
std::optional<double> angle(std::string_view text, std::size_t degreeDigits, double limit) {
    const std::optional<int> degrees = digits(text, degreeDigits);
    // The minutes have two digits before their decimals.
    if (!degrees || !digits(text.substr(degreeDigits), 2))
        return std::nullopt;
    const std::optional<double> minutes = magnitude(text.substr(degreeDigits));
    if (!minutes || *minutes >= 60)
        return std::nullopt;
    const double value = *degrees + *minutes / 60;
    return value <= limit ? std::optional(value) : std::nullopt;
}

std::optional<std::chrono::sys_days> dateOf(int day, int month, int year) {
    const std::chrono::year_month_day date(std::chrono::year(year),
                                           std::chrono::month(static_cast<unsigned>(month)),
                                           std::chrono::day(static_cast<unsigned>(day)));
    // Such that every time of day of it can be a Time.
    constexpr int first = 1980;
    constexpr int last = 2200;
    if (!date.ok() || year < first || year > last)
        return std::nullopt;
    return std::chrono::sys_days(date);
}

} // namespace

std::optional<double> number(std::string_view text) {
    double value = 0;
    const char* const end = text.data() + text.size();
    const auto read = std::from_chars(text.data(), end, value, std::chars_format::fixed);
    if (text.empty() || text.size() > maximumNumberLength || read.ec != std::errc() || read.ptr != end ||
        !std::isfinite(value))
        return std::nullopt;
    return value;
}

std::optional<double> magnitude(std::string_view text) {
    const std::optional<double> value = number(text);
    return value && !std::signbit(*value) ? value : std::nullopt;
}

std::optional<double> latitude(std::string_view text, std::string_view hemisphere) {
    const std::optional<double> value = angle(text, 2, 90);
    if (!value || (hemisphere != "N" && hemisphere != "S"))
        return std::nullopt;
    return hemisphere == "S" ? -*value : *value;
}

std::optional<double> longitude(std::string_view text, std::string_view hemisphere) {
    const std::optional<double> value = angle(text, 3, 180);
    if (!value || (hemisphere != "E" && hemisphere != "W"))
        return std::nullopt;
    // The date line has one longitude.
    return hemisphere == "W" || *value == 180 ? -*value : *value;
}

std::optional<std::chrono::nanoseconds> timeOfDay(std::string_view text) {
    constexpr std::size_t wholeLength = 6;
    const auto hours = digits(text, 2);
    const auto minutes = hours ? digits(text.substr(2), 2) : std::nullopt;
    const auto seconds = minutes ? digits(text.substr(4), 2) : std::nullopt;
    if (!seconds || *hours > 23 || *minutes > 59 || *seconds > 60)
        return std::nullopt;
    std::chrono::nanoseconds time =
        std::chrono::hours(*hours) + std::chrono::minutes(*minutes) + std::chrono::seconds(*seconds);
    if (text.size() == wholeLength)
        return time;
    const std::string_view decimals = text.substr(wholeLength + 1);
    if (text[wholeLength] != '.' || !std::all_of(decimals.begin(), decimals.end(), isDigit))
        return std::nullopt;
    // What is finer than a nanosecond is left out.
    std::chrono::nanoseconds unit = std::chrono::milliseconds(100);
    for (const char decimal : decimals) {
        time += unit * (decimal - '0');
        unit /= 10;
    }
    return time;
}

std::optional<std::chrono::sys_days> date(std::string_view text) {
    constexpr std::size_t length = 6;
    const auto day = digits(text, 2);
    const auto month = day ? digits(text.substr(2), 2) : std::nullopt;
    const auto year = month ? digits(text.substr(4), 2) : std::nullopt;
    if (!year || text.size() != length)
        return std::nullopt;
    // The system whose time it is began in 1980.
    constexpr int firstOfCentury = 80;
    return dateOf(*day, *month, *year + (*year < firstOfCentury ? 2000 : 1900));
}

std::optional<std::chrono::sys_days> date(std::string_view day, std::string_view month,
                                          std::string_view year) {
    const auto ofMonth = digits(day, 2);
    const auto ofYear = digits(month, 2);
    const auto number = digits(year, 4);
    if (!ofMonth || !ofYear || !number || day.size() != 2 || month.size() != 2 || year.size() != 4)
        return std::nullopt;
    return dateOf(*ofMonth, *ofYear, *number);
}

} // namespace velmora::nmea
