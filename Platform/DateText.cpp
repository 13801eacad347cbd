// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/DateText.h"

#include <cstdio>

namespace velmora {

namespace {

void appendTwoDigits(std::string& text, unsigned number) {
    text += static_cast<char>('0' + number / 10);
    text += static_cast<char>('0' + number % 10);
}

/// "2026-11-16" + separator + "05:00:00", of the seconds as they stand.
std::string format(std::chrono::sys_seconds moment, const char* separator) {
    const auto day = std::chrono::floor<std::chrono::days>(moment);
    const std::chrono::year_month_day date(day);
    const std::chrono::hh_mm_ss time(moment - day);
    std::string text;
    text.reserve(48);
    if (const int year = static_cast<int>(date.year()); year >= 0 && year <= 9999) {
        appendTwoDigits(text, static_cast<unsigned>(year) / 100);
        appendTwoDigits(text, static_cast<unsigned>(year) % 100);
    } else {
        char yearText[16];
        std::snprintf(yearText, sizeof yearText, "%04d", year);
        text += yearText;
    }
    text += '-';
    appendTwoDigits(text, static_cast<unsigned>(date.month()));
    text += '-';
    appendTwoDigits(text, static_cast<unsigned>(date.day()));
    text += separator;
    appendTwoDigits(text, static_cast<unsigned>(time.hours().count()));
    text += ':';
    appendTwoDigits(text, static_cast<unsigned>(time.minutes().count()));
    text += ':';
    appendTwoDigits(text, static_cast<unsigned>(time.seconds().count()));
    return text;
}

} // namespace

std::string dateDescription(Time moment) {
    return format(std::chrono::floor<std::chrono::seconds>(moment), " ") + " +0000";
}

std::optional<Time> timeOfDateDescription(std::string_view text) {
    constexpr std::string_view form = "dddd-dd-dd dd:dd:dd sdddd"; // d: a digit, s: a sign
    if (text.size() != form.size())
        return std::nullopt;
    for (std::size_t i = 0; i < form.size(); ++i) {
        const char c = text[i];
        const bool fits = form[i] == 'd'   ? c >= '0' && c <= '9'
                          : form[i] == 's' ? c == '+' || c == '-'
                                           : c == form[i];
        if (!fits)
            return std::nullopt;
    }
    const auto number = [text](std::size_t offset, std::size_t width) {
        int value = 0;
        for (const char digit : text.substr(offset, width))
            value = 10 * value + (digit - '0');
        return value;
    };
    const int year = number(0, 4);
    const std::chrono::year_month_day date{std::chrono::year(year),
                                           std::chrono::month(static_cast<unsigned>(number(5, 2))),
                                           std::chrono::day(static_cast<unsigned>(number(8, 2)))};
    const std::chrono::hours hours(number(11, 2));
    const std::chrono::minutes minutes(number(14, 2));
    const std::chrono::seconds seconds(number(17, 2));
    const std::chrono::hours zoneHours(number(21, 2));
    const std::chrono::minutes zoneMinutes(number(23, 2));
    if (year < 1678 || year > 2261 || !date.ok() || hours.count() >= 24 || minutes.count() >= 60 ||
        seconds.count() >= 60 || zoneHours.count() >= 24 || zoneMinutes.count() >= 60)
        return std::nullopt;
    const std::chrono::seconds zone = zoneHours + zoneMinutes;
    return std::chrono::sys_days(date) + hours + minutes + seconds - (text[20] == '-' ? -zone : zone);
}

std::string localDateAndTime(const Clock& clock, Time moment, const char* separator) {
    return format(std::chrono::floor<std::chrono::seconds>(moment) + clock.zoneAt(moment).offset, separator);
}

} // namespace velmora
