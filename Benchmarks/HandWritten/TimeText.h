// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <cstring>
#include <ctime>

namespace velmora {

/// Writes times as ISO 8601 with nanoseconds, UTC: 2026-01-05T08:00:04.617000000Z. A day's date is made once.
class TimeText {
public:
    TimeText() {
        for (unsigned i = 0; i < _threes.size(); ++i)
            _threes[i] = {static_cast<char>('0' + i / 100), static_cast<char>('0' + i / 10 % 10),
                          static_cast<char>('0' + i % 10)};
    }

    /// Appends 30 characters.
    char* append(char* to, std::uint64_t time_ns) {
        const std::uint64_t second = time_ns / 1'000'000'000;
        const auto nanosecond = static_cast<unsigned>(time_ns % 1'000'000'000);
        if (second / daySeconds != _day)
            setDay(second / daySeconds);
        const auto ofDay = static_cast<unsigned>(second % daySeconds);
        std::memcpy(to, _date, 11);
        putTwo(to + 11, ofDay / 3600);
        to[13] = ':';
        putTwo(to + 14, ofDay / 60 % 60);
        to[16] = ':';
        putTwo(to + 17, ofDay % 60);
        to[19] = '.';
        putThree(to + 20, nanosecond / 1'000'000);
        putThree(to + 23, nanosecond / 1000 % 1000);
        putThree(to + 26, nanosecond % 1000);
        to[29] = 'Z';
        return to + 30;
    }

private:
    static constexpr std::uint64_t daySeconds = 86400;

    void putTwo(char* to, unsigned number) const { std::memcpy(to, &_threes[number][1], 2); }
    void putThree(char* to, unsigned number) const { std::memcpy(to, _threes[number].data(), 3); }

    void setDay(std::uint64_t day) {
        _day = day;
        const auto midnight = static_cast<std::time_t>(day * daySeconds);
        std::tm date{};
        ::gmtime_r(&midnight, &date);
        std::strftime(_date, sizeof _date, "%Y-%m-%dT", &date);
    }

    std::array<std::array<char, 3>, 1000> _threes{};
    std::uint64_t _day = ~std::uint64_t{0};
    char _date[12] = {};
};

} // namespace velmora
