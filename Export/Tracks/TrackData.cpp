// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/TrackData.h"

#include "Platform/UTF8.h"

#include <charconv>
#include <cmath>
#include <cstdio>
#include <optional>

namespace velmora {

std::string decimalText(double number, int decimals) {
    char text[64];
    if (!std::isfinite(number) || std::abs(number) > 1e15)
        return {};
    std::snprintf(text, sizeof text, "%.*f", decimals, number);
    std::string shortened = text;
    if (shortened.find('.') != std::string::npos) {
        shortened.erase(shortened.find_last_not_of('0') + 1);
        if (shortened.back() == '.')
            shortened.pop_back();
    }
    return shortened == "-0" ? "0" : shortened;
}

std::string trackTime(Time time) {
    using namespace std::chrono;
    const auto day = floor<days>(time);
    const year_month_day date(day);
    const hh_mm_ss clock(floor<milliseconds>(time - day));
    char text[40];
    std::snprintf(text, sizeof text, "%04d-%02u-%02uT%02d:%02d:%02d", static_cast<int>(date.year()),
                  static_cast<unsigned>(date.month()), static_cast<unsigned>(date.day()),
                  static_cast<int>(clock.hours().count()), static_cast<int>(clock.minutes().count()),
                  static_cast<int>(clock.seconds().count()));
    std::string whole = text;
    if (clock.subseconds().count() != 0) {
        std::snprintf(text, sizeof text, ".%03d", static_cast<int>(clock.subseconds().count()));
        whole += text;
    }
    return whole + "Z";
}

std::string valueText(const TrackData::Value& value) {
    if (const auto* const number = std::get_if<double>(&value)) {
        char text[40];
        const auto result = std::to_chars(text, text + sizeof text, *number);
        return {text, result.ptr};
    }
    const auto* const words = std::get_if<std::string>(&value);
    return words ? *words : std::string();
}

std::string xmlText(std::string_view text) {
    constexpr std::string_view replacement = "\xEF\xBF\xBD";
    std::string escaped;
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t begin = at;
        const std::optional<char32_t> character = nextCharacter(text, at);
        if (!character) {
            escaped += replacement;
            ++at;
            continue;
        }
        const bool isControl =
            *character < 0x20 && *character != '\t' && *character != '\n' && *character != '\r';
        if (isControl || *character == 0xFFFE || *character == 0xFFFF)
            escaped += replacement;
        else if (*character == '&')
            escaped += "&amp;";
        else if (*character == '<')
            escaped += "&lt;";
        else if (*character == '>')
            escaped += "&gt;";
        else if (*character == '"')
            escaped += "&quot;";
        else
            escaped += text.substr(begin, at - begin);
    }
    return escaped;
}

} // namespace velmora
