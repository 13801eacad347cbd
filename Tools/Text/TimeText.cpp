// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/TimeText.h"

#include "Platform/DateText.h"

#include <cstdint>
#include <cstring>

namespace velmora {

namespace {

/// `count` decimal digits, with leading zeros.
void putDigits(char* at, std::size_t count, std::uint64_t number) {
    for (; count > 0; number /= 10)
        at[--count] = static_cast<char>('0' + number % 10);
}

} // namespace

void TimeText::append(TextBuffer& out, Time moment) {
    using namespace std::chrono;
    const auto day = floor<days>(moment);
    if (day != _day) {
        _day = day;
        dayText(day).copy(_date, sizeof _date); // the years of a Time are 1677 to 2262: four digits
    }
    // In unsigned numbers, since the first day that a Time reaches begins before it.
    const auto sinceMidnight = static_cast<std::uint64_t>(moment.time_since_epoch().count()) -
                               static_cast<std::uint64_t>(day.time_since_epoch().count()) *
                                   static_cast<std::uint64_t>(nanoseconds(days(1)).count());
    const std::uint64_t seconds = sinceMidnight / 1'000'000'000;
    char* const at = out.room(length);
    std::memcpy(at, _date, sizeof _date);
    at[10] = 'T';
    putDigits(at + 11, 2, seconds / 3600);
    at[13] = ':';
    putDigits(at + 14, 2, seconds / 60 % 60);
    at[16] = ':';
    putDigits(at + 17, 2, seconds % 60);
    at[19] = '.';
    putDigits(at + 20, 9, sinceMidnight % 1'000'000'000);
    at[29] = 'Z';
    out.advance(length);
}

} // namespace velmora
