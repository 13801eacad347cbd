// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace velmora {

/// How a number is shown: one printf(3) conversion and the text around it, parsed at compile time. Understood
/// are "%d", "%u", and "%f"/"%lf" with an optional "+", width and precision, and "%%" right after the
/// conversion; anything else does not compile.
struct NumberFormat {
    char conversion = 'd';      ///< 'd', 'u' or 'f'
    bool plus = false;          ///< a sign also before what is not negative
    std::uint8_t width = 0;     ///< at least so many characters, filled with blanks on the left
    std::uint8_t precision = 6; ///< decimals of 'f'
    std::string_view prefix;    ///< what precedes the number
    std::string_view suffix;    ///< what follows the number

    consteval NumberFormat(const char* format) : suffix(format) {
        prefix = suffix.substr(0, suffix.find('%'));
        suffix.remove_prefix(prefix.size());
        if (suffix.empty())
            throw "a format without a conversion";
        suffix.remove_prefix(1);
        if (suffix.starts_with('+')) {
            plus = true;
            suffix.remove_prefix(1);
        }
        width = number();
        if (suffix.starts_with('.')) {
            suffix.remove_prefix(1);
            precision = number();
        }
        if (suffix.starts_with('l'))
            suffix.remove_prefix(1);
        if (suffix.empty() || std::string_view("duf").find(suffix.front()) == std::string_view::npos)
            throw "a conversion other than d, u or f";
        conversion = suffix.front();
        suffix.remove_prefix(1);
        if (suffix.starts_with("%%"))
            suffix.remove_prefix(1);
        if (suffix.find('%', 1) != std::string_view::npos)
            throw "more than one conversion";
    }

private:
    consteval std::uint8_t number() {
        unsigned value = 0;
        while (!suffix.empty() && suffix.front() >= '0' && suffix.front() <= '9') {
            value = value * 10 + static_cast<unsigned>(suffix.front() - '0');
            suffix.remove_prefix(1);
        }
        if (value > 32)
            throw "a width or precision above 32";
        return static_cast<std::uint8_t>(value);
    }
};

/// A shown number in storage of its own: long enough for every double that a record's fields can result in,
/// with up to 60 characters around it.
class NumberText {
public:
    // The storage is not initialized, which a defaulted constructor may do.
    NumberText() {} // NOLINT(modernize-use-equals-default)
    NumberText(const NumberFormat& format, std::int64_t value) { this->format(format, value); }
    NumberText(const NumberFormat& format, double value) { this->format(format, value); }

    /// As printf(3) shows `value` passed for "%d" or "%u": the low 32 bits, signed or unsigned.
    void format(const NumberFormat& format, std::int64_t value);
    /// As printf(3) shows `value` passed for "%f".
    void format(const NumberFormat& format, double value);
    /// The value between two texts.
    void format(std::string_view before, std::int32_t value, std::string_view after);
    void set(std::string_view text);

    [[nodiscard]] std::string_view text() const { return {_text.data(), _length}; }

private:
    void append(std::string_view text);
    void insert(std::size_t count, char filler);
    /// Sign and width, then the texts around.
    void finish(const NumberFormat& format);

    std::array<char, 448> _text;
    std::size_t _length = 0;
};

} // namespace velmora
