// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/ChartText.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <ctime>

namespace velmora {

namespace {

constexpr std::int64_t second_ns = 1'000'000'000;

std::string counted(std::int64_t count, const char* unit) {
    return std::to_string(count) + ' ' + unit + (count == 1 ? "" : "s");
}

} // namespace

std::string chartNumber(double value, int decimals) {
    std::array<char, 400> text{};
    const int length = std::snprintf(text.data(), text.size(), "%.*f", std::clamp(decimals, 0, 9), value);
    std::string result(text.data(), static_cast<std::size_t>(length));
    const bool isNegative = result.front() == '-';
    if (isNegative)
        result.erase(0, 1);
    // What is rounded to zero has no sign.
    const bool isZero = result.find_first_not_of("0.") == std::string::npos;
    return isNegative && !isZero ? "\u2212" + result : result;
}

std::string chartValue(std::optional<double> value, int decimals, const std::string& unit) {
    if (!value)
        return "no value";
    return chartNumber(*value, decimals) + (unit.empty() ? "" : ' ' + unit);
}

std::string chartTime(std::int64_t time_ns, bool withMilliseconds) {
    const std::int64_t rest_ns = ((time_ns % second_ns) + second_ns) % second_ns;
    const std::time_t seconds = (time_ns - rest_ns) / second_ns;
    std::tm local{};
    (void)::localtime_r(&seconds, &local);
    std::array<char, 40> text{};
    if (withMilliseconds)
        (void)std::snprintf(text.data(), text.size(), "%02d:%02d:%02d.%03d", local.tm_hour, local.tm_min,
                            local.tm_sec, static_cast<int>(rest_ns / 1'000'000));
    else
        (void)std::snprintf(text.data(), text.size(), "%02d:%02d:%02d", local.tm_hour, local.tm_min,
                            local.tm_sec);
    return text.data();
}

std::string chartDuration(std::chrono::nanoseconds duration) {
    const std::int64_t seconds = (duration.count() + second_ns / 2) / second_ns;
    if (seconds < 120 && seconds != 60)
        return counted(seconds, "second");
    const std::int64_t minutes = (seconds + 30) / 60;
    if (minutes < 120 && minutes != 60)
        return counted(minutes, "minute");
    return counted(minutes / 60, "hour") + (minutes % 60 == 0 ? "" : ' ' + counted(minutes % 60, "minute"));
}

} // namespace velmora
