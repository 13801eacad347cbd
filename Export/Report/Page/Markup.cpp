// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/Markup.h"

#include "Platform/PrintableText.h"

#include <array>
#include <cmath>
#include <cstdio>

namespace velmora {

namespace {

constexpr std::size_t pieceSize = std::size_t{1} << 16;

std::string formatted(const char* format, auto... values) {
    std::array<char, 96> buffer{};
    const int length = std::snprintf(buffer.data(), buffer.size(), format, values...);
    return {buffer.data(), static_cast<std::size_t>(std::max(length, 0))};
}

std::string calendarText(Time time, char between) {
    const auto day = std::chrono::floor<std::chrono::days>(time);
    const std::chrono::year_month_day date(day);
    const std::chrono::hh_mm_ss clock(std::chrono::floor<std::chrono::milliseconds>(time - day));
    return formatted("%04d-%02u-%02u%c%02d:%02d:%02d.%03d", static_cast<int>(date.year()),
                     static_cast<unsigned>(date.month()), static_cast<unsigned>(date.day()), between,
                     static_cast<int>(clock.hours().count()), static_cast<int>(clock.minutes().count()),
                     static_cast<int>(clock.seconds().count()), static_cast<int>(clock.subseconds().count()));
}

} // namespace

Markup& Markup::raw(std::string_view markup) {
    _buffer += markup;
    if (_buffer.size() >= pieceSize)
        flush();
    return *this;
}

Markup& Markup::text(std::string_view text) {
    const std::string safe = isPlain(text) ? std::string() : printable(text);
    for (const char each : isPlain(text) ? text : std::string_view(safe))
        switch (each) {
        case '&': raw("&amp;"); break;
        case '<': raw("&lt;"); break;
        case '>': raw("&gt;"); break;
        case '"': raw("&quot;"); break;
        case '\'': raw("&#39;"); break;
        default: raw({&each, 1});
        }
    return *this;
}

Markup& Markup::string(std::string_view text) {
    const std::string safe = isPlain(text) ? std::string() : printable(text);
    raw("\"");
    for (const char each : isPlain(text) ? text : std::string_view(safe))
        switch (each) {
        case '"': raw("\\\""); break;
        case '\\': raw("\\\\"); break;
        // Neither ends the script element nor begins a comment in it.
        case '<': raw("\\u003c"); break;
        case '>': raw("\\u003e"); break;
        case '&': raw("\\u0026"); break;
        default: raw({&each, 1});
        }
    return raw("\"");
}

Markup& Markup::number(double value) {
    if (!std::isfinite(value))
        return raw("null");
    char digits[40];
    const auto end = std::to_chars(digits, digits + sizeof digits, value).ptr;
    return raw({digits, static_cast<std::size_t>(end - digits)});
}

Markup& Markup::point(double value) {
    return number(std::round(value * 100) / 100);
}

void Markup::flush() {
    if (!_buffer.empty())
        _put(_buffer);
    _buffer.clear();
}

std::string pageTime(Time time) {
    return calendarText(time, ' ') + " UTC";
}

std::string pageStamp(Time time) {
    return calendarText(time, 'T') + 'Z';
}

std::string pageDuration(std::chrono::nanoseconds duration) {
    const double seconds = std::chrono::duration<double>(duration).count();
    if (seconds < 60)
        return formatted("%.3f s", seconds);
    const auto whole = std::chrono::duration_cast<std::chrono::seconds>(duration).count();
    if (whole < 3600)
        return formatted("%lld min %lld s", static_cast<long long>(whole / 60),
                         static_cast<long long>(whole % 60));
    return formatted("%lld h %lld min %lld s", static_cast<long long>(whole / 3600),
                     static_cast<long long>(whole / 60 % 60), static_cast<long long>(whole % 60));
}

std::string pageCount(std::uint64_t count) {
    const std::string plain = std::to_string(count);
    std::string digits;
    for (std::size_t i = 0; i < plain.size(); ++i) {
        if (i != 0 && (plain.size() - i) % 3 == 0)
            digits += ',';
        digits += plain[i];
    }
    return digits;
}

std::string pageFigure(double number) {
    std::string text = formatted("%.3f", number);
    if (text.size() > 24)
        return formatted("%g", number);
    text.erase(text.find_last_not_of('0') + 1);
    if (text.ends_with('.'))
        text.pop_back();
    return text == "-0" ? "0" : text;
}

std::string pageShare(std::chrono::nanoseconds part, std::chrono::nanoseconds whole) {
    if (whole.count() <= 0)
        return "–";
    return formatted("%.1f %%",
                     100.0 * static_cast<double>(part.count()) / static_cast<double>(whole.count()));
}

std::int64_t millisecondsOf(Time time) {
    return std::chrono::floor<std::chrono::milliseconds>(time.time_since_epoch()).count();
}

} // namespace velmora
