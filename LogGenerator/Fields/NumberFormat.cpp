// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/NumberFormat.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstring>
#include <iterator>

namespace velmora {

namespace {

/// Measured levels and ratios count in halves, quarters, sixteenths ... of a unit. Such a number, below 2^24
/// with at most 16 binary places, is shown with integer arithmetic, in a fifth of the time.
constexpr double binaryPlaces = 65'536;
constexpr double countLimit = 1'099'511'627'776; // 2^40: times 10^6 stays below 2^60
constexpr std::uint64_t powersOfTen[] = {1, 10, 100, 1'000, 10'000, 100'000, 1'000'000};

/// As std::to_chars in the fixed form; null, and nothing written, where the number is none of those.
char* writeCount(char* to, char* end, double value, std::size_t precision) {
    const double count = std::fabs(value) * binaryPlaces;
    if (!(count < countLimit) || std::trunc(count) != count || precision >= std::size(powersOfTen))
        return nullptr;
    const std::uint64_t power = powersOfTen[precision];
    const std::uint64_t product = static_cast<std::uint64_t>(count) * power;
    std::uint64_t digits = product >> 16;
    // To the nearest, and what lies in the middle to the even digit, as printf(3) has it.
    const std::uint64_t rest = product & 0xFFFF;
    if (rest > 0x8000 || (rest == 0x8000 && digits % 2 != 0))
        ++digits;
    if (std::signbit(value))
        *to++ = '-';
    to = std::to_chars(to, end, digits / power).ptr;
    if (precision == 0)
        return to;
    *to = '.';
    std::uint64_t fraction = digits % power;
    for (std::size_t i = precision; i > 0; --i) {
        to[i] = static_cast<char>('0' + fraction % 10);
        fraction /= 10;
    }
    return to + 1 + precision;
}

} // namespace

void NumberText::format(const NumberFormat& format, std::int64_t value) {
    char* const end = _text.data() + _text.size();
    const auto result = format.conversion == 'u'
                            ? std::to_chars(_text.data(), end, static_cast<std::uint32_t>(value))
                            : std::to_chars(_text.data(), end, static_cast<std::int32_t>(value));
    _length = static_cast<std::size_t>(result.ptr - _text.data());
    finish(format);
}

void NumberText::format(const NumberFormat& format, double value) {
    char* const end = _text.data() + _text.size();
    _length = 0;
    if (const char* const after = writeCount(_text.data(), end, value, format.precision)) {
        _length = static_cast<std::size_t>(after - _text.data());
    } else if (std::isfinite(value)) {
        // 309 digits before the point, 32 after it: the largest double fits.
        const auto result =
            std::to_chars(_text.data(), end, value, std::chars_format::fixed, format.precision);
        _length = static_cast<std::size_t>(result.ptr - _text.data());
    } else {
        if (std::signbit(value))
            append("-");
        append(std::isnan(value) ? "nan" : "inf");
    }
    finish(format);
}

void NumberText::format(std::string_view before, std::int32_t value, std::string_view after) {
    set(before);
    const auto result = std::to_chars(_text.data() + _length, _text.data() + _text.size(), value);
    _length = static_cast<std::size_t>(result.ptr - _text.data());
    append(after);
}

void NumberText::set(std::string_view text) {
    _length = 0;
    append(text);
}

void NumberText::append(std::string_view text) {
    const std::size_t length = std::min(text.size(), _text.size() - _length);
    std::memcpy(_text.data() + _length, text.data(), length);
    _length += length;
}

void NumberText::insert(std::size_t count, char filler) {
    std::memmove(_text.data() + count, _text.data(), _length);
    std::memset(_text.data(), filler, count);
    _length += count;
}

void NumberText::finish(const NumberFormat& format) {
    if (format.plus && _text[0] != '-')
        insert(1, '+');
    if (_length < format.width)
        insert(format.width - _length, ' ');
    if (!format.prefix.empty()) {
        insert(format.prefix.size(), ' ');
        std::memcpy(_text.data(), format.prefix.data(), format.prefix.size());
    }
    append(format.suffix);
}

} // namespace velmora
