// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Platform/Clock.h"

#include <charconv>
#include <concepts>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Writes HTML and JSON in pieces. Texts of recordings get into the page through `text` and `string` alone:
/// these escape what would be markup, and make printable what would control or hide the text around it.
class Markup {
public:
    explicit Markup(std::function<void(std::string_view)> put) : _put(std::move(put)) {}
    ~Markup() { flush(); }
    Markup(const Markup&) = delete;
    Markup& operator=(const Markup&) = delete;

    /// Our own markup, as it is.
    Markup& raw(std::string_view markup);
    /// Text between tags, or in a quoted attribute.
    Markup& text(std::string_view text);
    /// A string of JSON with its quotes, in a script element.
    Markup& string(std::string_view text);
    Markup& number(std::integral auto value) {
        char digits[24];
        const auto end = std::to_chars(digits, digits + sizeof digits, value).ptr;
        return raw({digits, static_cast<std::size_t>(end - digits)});
    }
    /// The shortest digits that are that double; "null" for what is no finite number.
    Markup& number(double value);
    /// A point with two decimals at most, of a picture.
    Markup& point(double value);
    void flush();

private:
    std::function<void(std::string_view)> _put;
    std::string _buffer;
};

/// "2026-11-16 05:00:00.250 UTC".
[[nodiscard]] std::string pageTime(Time time);
/// RFC 3339, with milliseconds.
[[nodiscard]] std::string pageStamp(Time time);
/// "9 h 59 min 59.5 s", "12.250 s".
[[nodiscard]] std::string pageDuration(std::chrono::nanoseconds duration);
/// "1,234,567".
[[nodiscard]] std::string pageCount(std::uint64_t count);
/// "-97.25"; at most three decimals.
[[nodiscard]] std::string pageFigure(double number);
/// "81.3 %"; "–" of nothing.
[[nodiscard]] std::string pageShare(std::chrono::nanoseconds part, std::chrono::nanoseconds whole);

/// Milliseconds since 1970, rounded down.
[[nodiscard]] std::int64_t millisecondsOf(Time time);

} // namespace velmora
