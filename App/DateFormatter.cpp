// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DateFormatter.h"
#include "Platform/DateText.h"

#include <cstddef>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

/// A field of the pattern and where its digits lie in "2026-11-16 05:02:40".
struct DateField {
    std::string_view name;
    std::size_t offset;
};

constexpr DateField dateFields[] = {
    {"yyyy", 0}, {"MM", 5}, {"dd", 8}, {"HH", 11}, {"mm", 14}, {"ss", 17},
};

constexpr bool isLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

std::string_view shown(std::string_view field, std::string_view date) {
    for (const DateField& known : dateFields)
        if (known.name == field)
            return date.substr(known.offset, field.size());
    return field;
}

} // namespace

DateFormatter::DateFormatter(const Clock& clock, std::string pattern)
    : _clock(clock), _pattern(std::move(pattern)) {}

std::string DateFormatter::stringFromDate(Time moment) const {
    const std::string date = localDateAndTime(_clock, moment, " ");
    const std::string_view pattern = _pattern;
    std::string text;
    bool quoted = false;
    for (std::size_t i = 0; i < pattern.size();) {
        if (pattern[i] == '\'') {
            if (pattern.substr(i, 2) == "''") {
                text += '\'';
                i += 2;
            } else {
                quoted = !quoted;
                ++i;
            }
            continue;
        }
        std::size_t end = i + 1;
        if (!quoted && isLetter(pattern[i])) {
            while (end < pattern.size() && pattern[end] == pattern[i])
                ++end;
            text += shown(pattern.substr(i, end - i), date);
        } else {
            text += pattern[i];
        }
        i = end;
    }
    return text;
}

} // namespace velmora
