// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <charconv>
#include <cstdlib>
#include <cstring>
#include <string_view>

namespace velmora {

/// How a field's raw value is written: `step` times the raw value plus `offset`, as a whole number or with
/// two decimals, then the unit and the quotation mark that ends it.
struct ValueForm {
    enum class Kind : unsigned char { Whole, Hundredths, Flag };

    Kind kind = Kind::Whole;
    int step = 1; ///< in hundredths where the value has decimals, as is the offset
    int offset = 0;
    std::string_view unit{};
    unsigned absent = ~0U; ///< the raw value that says that there is none

    /// Appends at most 15 characters; returns their end.
    char* append(char* to, unsigned raw) const {
        if (raw == absent)
            return put(to, "Not Present\"");
        if (kind == Kind::Flag)
            return put(to, raw == 1 ? "True\"" : "False\"");
        const int value = step * static_cast<int>(raw) + offset;
        to = kind == Kind::Whole ? std::to_chars(to, to + 6, value).ptr : appendHundredths(to, value);
        to = put(to, unit);
        *to = '"';
        return to + 1;
    }

private:
    static char* put(char* to, std::string_view text) {
        std::memcpy(to, text.data(), text.size());
        return to + text.size();
    }

    static char* appendHundredths(char* to, int value) {
        if (value < 0)
            *to++ = '-';
        const int size = std::abs(value);
        to = std::to_chars(to, to + 6, size / 100).ptr;
        to[0] = '.';
        to[1] = static_cast<char>('0' + size / 10 % 10);
        to[2] = static_cast<char>('0' + size % 10);
        return to + 3;
    }
};

} // namespace velmora
