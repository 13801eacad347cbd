// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Playback/MomentText.h"

#include "Platform/DateText.h"

#include <charconv>
#include <cmath>

namespace velmora {

namespace {

using namespace std::chrono;

constexpr std::string_view dateForm = "2026-11-16";
/// More could leave the range of Time.
constexpr double mostSeconds = 1e9;

/// A number of at least 0, the whole text.
std::optional<double> numberOf(std::string_view text) {
    double number = 0;
    const auto [end, error] =
        std::from_chars(text.data(), text.data() + text.size(), number, std::chars_format::fixed);
    const bool isNumber = error == std::errc() && end == text.data() + text.size() && !std::signbit(number);
    return isNumber && number <= mostSeconds ? std::optional(number) : std::nullopt;
}

/// Up to and without the colon, which is removed with it; all of it where there is none.
std::string_view takePart(std::string_view& text) {
    const std::size_t end = text.find(':');
    const std::string_view part = text.substr(0, end);
    text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
    return part;
}

nanoseconds nanosecondsOf(double seconds) {
    return nanoseconds(std::llround(seconds * 1e9));
}

/// "05:02" or "05:02:40.5".
std::optional<nanoseconds> timeOfDay(std::string_view text) {
    if (text.find(':') == std::string_view::npos)
        return std::nullopt;
    const std::optional<double> hour = numberOf(takePart(text));
    const std::optional<double> minute = numberOf(takePart(text));
    const std::optional<double> second = text.empty() ? 0 : numberOf(text);
    if (!hour || !minute || !second || *hour > 23 || *minute > 59 || *second >= 60)
        return std::nullopt;
    return nanosecondsOf(*hour * 3600 + *minute * 60 + *second);
}

} // namespace

std::optional<Time> momentNamed(std::string_view text, Time now, const Clock& clock) {
    while (text.starts_with(' '))
        text.remove_prefix(1);
    while (text.ends_with(' '))
        text.remove_suffix(1);
    if (text.starts_with('+') || text.starts_with('-')) {
        const std::optional<double> distance = numberOf(text.substr(1));
        if (!distance)
            return std::nullopt;
        return text.front() == '+' ? now + nanosecondsOf(*distance) : now - nanosecondsOf(*distance);
    }
    const seconds zone = clock.zoneAt(now).offset;
    sys_days day = floor<days>(now + zone);
    if (text.size() > dateForm.size() && text[dateForm.size()] == ' ') {
        const std::optional<sys_days> named = dayOfText(text.substr(0, dateForm.size()));
        if (!named)
            return std::nullopt;
        day = *named;
        text.remove_prefix(dateForm.size() + 1);
    }
    const std::optional<nanoseconds> time = timeOfDay(text);
    return time ? std::optional(Time(day) + *time - zone) : std::nullopt;
}

} // namespace velmora
