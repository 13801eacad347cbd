#include "LogGenerator/NumberFormat.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstring>

namespace velmora {

NumberText::NumberText(const NumberFormat& format, std::int64_t value) {
    char* const end = _text.data() + _text.size();
    const auto result = format.conversion == 'u'
                            ? std::to_chars(_text.data(), end, static_cast<std::uint32_t>(value))
                            : std::to_chars(_text.data(), end, static_cast<std::int32_t>(value));
    _length = static_cast<std::size_t>(result.ptr - _text.data());
    finish(format);
}

NumberText::NumberText(const NumberFormat& format, double value) {
    if (std::isfinite(value)) {
        // 309 digits before the point, 32 behind it: the largest double fits.
        const auto result = std::to_chars(_text.data(), _text.data() + _text.size(), value,
                                          std::chars_format::fixed, format.precision);
        _length = static_cast<std::size_t>(result.ptr - _text.data());
    } else {
        if (std::signbit(value))
            append("-");
        append(std::isnan(value) ? "nan" : "inf");
    }
    finish(format);
}

void NumberText::append(std::string_view text) {
    const std::size_t length = std::min(text.size(), _text.size() - _length);
    std::memcpy(_text.data() + _length, text.data(), length);
    _length += length;
}

void NumberText::finish(const NumberFormat& format) {
    if (format.plus && _text[0] != '-') {
        std::memmove(_text.data() + 1, _text.data(), _length);
        _text[0] = '+';
        ++_length;
    }
    if (_length < format.width) {
        const std::size_t blanks = format.width - _length;
        std::memmove(_text.data() + blanks, _text.data(), _length);
        std::memset(_text.data(), ' ', blanks);
        _length = format.width;
    }
    append(format.suffix);
}

} // namespace velmora
