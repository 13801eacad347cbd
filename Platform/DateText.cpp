// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/DateText.h"

#include <cstdio>

namespace velmora {

namespace {

using namespace std::chrono;

constexpr std::string_view dayForm = "dddd-dd-dd"; // d: a digit
constexpr std::string_view timeForm = "dd:dd:dd";

void appendTwoDigits(std::string& text, unsigned number) {
    text += static_cast<char>('0' + number / 10);
    text += static_cast<char>('0' + number % 10);
}

void appendDay(std::string& text, sys_days day) {
    const year_month_day date(day);
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
}

bool hasForm(std::string_view text, std::string_view form) {
    if (text.size() != form.size())
        return false;
    for (std::size_t i = 0; i < form.size(); ++i)
        if (form[i] == 'd' ? text[i] < '0' || text[i] > '9' : text[i] != form[i])
            return false;
    return true;
}

/// Precondition: there are digits.
int numberAt(std::string_view text, std::size_t offset, std::size_t width) {
    int value = 0;
    for (const char digit : text.substr(offset, width))
        value = 10 * value + (digit - '0');
    return value;
}

/// The zone's distance from UTC, east positive, that a text such as "+0130" names.
std::optional<minutes> zoneOfText(std::string_view text) {
    if (!hasForm(text, "+dddd") && !hasForm(text, "-dddd"))
        return std::nullopt;
    const int hour = numberAt(text, 1, 2);
    const int minute = numberAt(text, 3, 2);
    if (hour > 23 || minute > 59)
        return std::nullopt;
    const minutes distance = hours(hour) + minutes(minute);
    return text.front() == '-' ? -distance : distance;
}

} // namespace

std::string dayText(sys_days day) {
    std::string text;
    appendDay(text, day);
    return text;
}

std::string dateAndTimeText(sys_seconds moment, std::string_view separator) {
    const auto day = floor<days>(moment);
    const hh_mm_ss time(moment - day);
    std::string text;
    text.reserve(48);
    appendDay(text, day);
    text += separator;
    appendTwoDigits(text, static_cast<unsigned>(time.hours().count()));
    text += ':';
    appendTwoDigits(text, static_cast<unsigned>(time.minutes().count()));
    text += ':';
    appendTwoDigits(text, static_cast<unsigned>(time.seconds().count()));
    return text;
}

std::string isoText(sys_seconds moment) {
    return dateAndTimeText(moment, "T") + "Z";
}

std::optional<sys_days> dayOfText(std::string_view text) {
    if (!hasForm(text, dayForm))
        return std::nullopt;
    const year_month_day date{year(numberAt(text, 0, 4)), month(static_cast<unsigned>(numberAt(text, 5, 2))),
                              day(static_cast<unsigned>(numberAt(text, 8, 2)))};
    return date.ok() ? std::optional(sys_days(date)) : std::nullopt;
}

std::optional<sys_seconds> momentOfText(std::string_view text, char separator) {
    if (text.size() != dayForm.size() + 1 + timeForm.size() || text[dayForm.size()] != separator)
        return std::nullopt;
    const std::optional<sys_days> day = dayOfText(text.substr(0, dayForm.size()));
    const std::string_view time = text.substr(dayForm.size() + 1);
    if (!day || !hasForm(time, timeForm))
        return std::nullopt;
    const int hour = numberAt(time, 0, 2);
    const int minute = numberAt(time, 3, 2);
    const int second = numberAt(time, 6, 2);
    if (hour > 23 || minute > 59 || second > 59)
        return std::nullopt;
    return *day + hours(hour) + minutes(minute) + seconds(second);
}

std::string dateDescription(Time moment) {
    return dateAndTimeText(floor<seconds>(moment), " ") + " +0000";
}

std::optional<Time> timeOfDateDescription(std::string_view text) {
    constexpr std::size_t zoneOffset = dayForm.size() + 1 + timeForm.size();
    constexpr auto earliest = sys_days{year{1678} / 1 / 1};
    constexpr auto end = sys_days{year{2262} / 1 / 1};
    if (text.size() <= zoneOffset || text[zoneOffset] != ' ')
        return std::nullopt;
    const std::optional<sys_seconds> moment = momentOfText(text.substr(0, zoneOffset), ' ');
    const std::optional<minutes> zone = zoneOfText(text.substr(zoneOffset + 1));
    if (!moment || !zone || *moment < earliest || *moment >= end)
        return std::nullopt;
    return *moment - *zone;
}

std::string localDateAndTime(const Clock& clock, Time moment, std::string_view separator) {
    return dateAndTimeText(floor<seconds>(moment) + clock.zoneAt(moment).offset, separator);
}

} // namespace velmora
