// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/NMEAWriter.h"

#include "Recording/Positions/NMEASentence.h"

#include <chrono>
#include <cmath>
#include <cstdio>
#include <numbers>
#include <optional>

namespace velmora {

namespace {

constexpr double knotsOfMetrePerSecond = 3600.0 / 1852.0;

template <class... Values>
std::string formatted(const char* format, Values... values) {
    char text[64];
    std::snprintf(text, sizeof text, format, values...);
    return text;
}

std::string optionalText(const char* format, std::optional<double> value) {
    return value ? formatted(format, *value) : std::string();
}

/// The angle in whole degrees of that width and minutes, then the hemisphere.
std::string angleText(double degrees, int width, char positive, char negative) {
    constexpr std::int64_t unitsOfMinute = 100'000;
    constexpr std::int64_t unitsOfDegree = 60 * unitsOfMinute;
    // In whole units, so that no angle has 60 minutes.
    const std::int64_t units = std::llround(std::abs(degrees) * static_cast<double>(unitsOfDegree));
    return formatted("%0*lld%02lld.%05lld,%c", width, static_cast<long long>(units / unitsOfDegree),
                     static_cast<long long>(units % unitsOfDegree / unitsOfMinute),
                     static_cast<long long>(units % unitsOfMinute), degrees < 0 ? negative : positive);
}

std::string placeText(const Fix& fix) {
    return angleText(fix.latitude, 2, 'N', 'S') + ',' + angleText(fix.longitude, 3, 'E', 'W');
}

} // namespace

std::string nmeaSentence(std::string_view content) {
    return std::string("$").append(content) + formatted("*%02X\r\n", nmeaChecksum(content));
}

std::vector<std::string> nmeaSentences(const Fix& fix) {
    using namespace std::chrono;
    const auto day = floor<days>(fix.time);
    const hh_mm_ss time(floor<milliseconds>(fix.time - day));
    const year_month_day date(day);
    const std::string clock = formatted(
        "%02d%02d%02d.%03d", static_cast<int>(time.hours().count()), static_cast<int>(time.minutes().count()),
        static_cast<int>(time.seconds().count()), static_cast<int>(time.subseconds().count()));
    const std::string place = placeText(fix);
    std::vector<std::string> sentences;
    sentences.push_back(
        nmeaSentence("GNGGA," + clock + ',' + place + ",1,," + optionalText("%.2f", fix.hdop) + ',' +
                     optionalText("%.2f", fix.altitude_m) + (fix.altitude_m ? ",M,,,," : ",,,,,")));
    const std::optional<double> knots =
        fix.speed_mps ? std::optional(*fix.speed_mps * knotsOfMetrePerSecond) : std::nullopt;
    sentences.push_back(
        nmeaSentence("GNRMC," + clock + ",A," + place + ',' + optionalText("%.2f", knots) + ',' +
                     optionalText("%.2f", fix.course_degrees) + ',' +
                     formatted("%02u%02u%02d", static_cast<unsigned>(date.day()),
                               static_cast<unsigned>(date.month()), static_cast<int>(date.year()) % 100) +
                     ",,,A"));
    if (fix.deviation_m) {
        const std::string each = formatted("%.2f", *fix.deviation_m / std::numbers::sqrt2);
        sentences.push_back(nmeaSentence("GNGST," + clock + ",,,,," + each + ',' + each + ','));
    }
    return sentences;
}

} // namespace velmora
