// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/TimeRange.h"

#include "Platform/DateText.h"

#include <cstdint>
#include <string>

namespace velmora {

namespace {

using namespace std::chrono;

constexpr auto earliest = sys_days{year{1678} / 1 / 1};
constexpr auto latest = sys_days{year{2262} / 1 / 1};

/// Takes a text apart from its front. What is not there is not taken.
class Scanner {
public:
    explicit Scanner(std::string_view text) : _rest(text) {}

    [[nodiscard]] bool atEnd() const { return _rest.empty(); }

    bool take(char character) {
        if (!_rest.starts_with(character))
            return false;
        _rest.remove_prefix(1);
        return true;
    }

    /// As many characters as there are, at most `count`.
    std::string_view take(std::size_t count) {
        const std::string_view taken = _rest.substr(0, count);
        _rest.remove_prefix(taken.size());
        return taken;
    }

    /// Exactly `count` digits.
    std::optional<unsigned> digits(std::size_t count) {
        if (digitCount() < count)
            return std::nullopt;
        unsigned number = 0;
        for (; count > 0; --count) {
            number = number * 10 + static_cast<unsigned>(_rest.front() - '0');
            _rest.remove_prefix(1);
        }
        return number;
    }

    /// "." and one to nine digits, as nanoseconds; 0 without a ".". Absent for a "." and anything else.
    std::optional<nanoseconds> fraction() {
        if (!take('.'))
            return nanoseconds(0);
        const std::size_t count = digitCount();
        const std::optional<unsigned> number = count >= 1 && count <= 9 ? digits(count) : std::nullopt;
        if (!number)
            return std::nullopt;
        std::int64_t scaled = *number;
        for (std::size_t i = count; i < 9; ++i)
            scaled *= 10;
        return nanoseconds(scaled);
    }

    /// Digits with an optional fraction. Absent if they exceed the range of Time.
    std::optional<nanoseconds> seconds() {
        constexpr std::size_t mostDigits = 10;
        const std::size_t count = digitCount();
        if (count == 0 || count > mostDigits)
            return std::nullopt;
        std::int64_t number = 0;
        for (; digitCount() > 0; _rest.remove_prefix(1))
            number = number * 10 + (_rest.front() - '0');
        constexpr std::int64_t most = duration_cast<std::chrono::seconds>(nanoseconds::max()).count() - 1;
        const std::optional<nanoseconds> part = fraction();
        if (!part || number > most)
            return std::nullopt;
        return std::chrono::seconds(number) + *part;
    }

private:
    [[nodiscard]] std::size_t digitCount() const {
        const std::size_t end = _rest.find_first_not_of("0123456789");
        return end == std::string_view::npos ? _rest.size() : end;
    }

    std::string_view _rest;
};

std::optional<sys_days> readDate(Scanner& text) {
    const std::optional<sys_days> date = dayOfText(text.take(std::string_view("2026-11-16").size()));
    return date && *date >= earliest && *date < latest ? date : std::nullopt;
}

/// "05:00", "05:00:00" or "05:00:00.25".
std::optional<nanoseconds> readTimeOfDay(Scanner& text) {
    const std::optional<unsigned> h = text.digits(2);
    const std::optional<unsigned> m = h && text.take(':') ? text.digits(2) : std::nullopt;
    if (!m || *h > 23 || *m > 59)
        return std::nullopt;
    const nanoseconds time = hours(*h) + minutes(*m);
    if (!text.take(':'))
        return time;
    const std::optional<unsigned> s = text.digits(2);
    const std::optional<nanoseconds> part = s && *s <= 59 ? text.fraction() : std::nullopt;
    if (!part)
        return std::nullopt;
    return time + seconds(*s) + *part;
}

/// "Z", "+01:00", "-05:30", or nothing, which is UTC.
std::optional<minutes> readZone(Scanner& text) {
    if (text.take('Z') || text.take('z') || text.atEnd())
        return minutes(0);
    const bool isWest = text.take('-');
    if (!isWest && !text.take('+'))
        return std::nullopt;
    const std::optional<unsigned> h = text.digits(2);
    const std::optional<unsigned> m = h && text.take(':') ? text.digits(2) : std::nullopt;
    if (!m || *h > 23 || *m > 59)
        return std::nullopt;
    const minutes east = hours(*h) + minutes(*m);
    return isWest ? -east : east;
}

std::optional<nanoseconds> readMoment(std::string_view words) {
    Scanner text(words);
    const std::optional<sys_days> date = readDate(text);
    if (!date)
        return std::nullopt;
    const nanoseconds midnight = date->time_since_epoch();
    if (text.atEnd())
        return midnight;
    if (!text.take('T') && !text.take('t') && !text.take(' '))
        return std::nullopt;
    const std::optional<nanoseconds> time = readTimeOfDay(text);
    const std::optional<minutes> zone = time ? readZone(text) : std::nullopt;
    if (!zone || !text.atEnd())
        return std::nullopt;
    return midnight + *time - *zone;
}

std::optional<nanoseconds> readSeconds(std::string_view words) {
    Scanner text(words);
    const std::optional<nanoseconds> number = text.seconds();
    return text.atEnd() ? number : std::nullopt;
}

} // namespace

Result<TimeBound> readTimeBound(std::string_view text) {
    const bool afterFirstMessage = text.starts_with('+');
    std::optional<nanoseconds> offset = readSeconds(afterFirstMessage ? text.substr(1) : text);
    if (!offset && !afterFirstMessage)
        offset = readMoment(text);
    if (!offset)
        return Failure{
            "got " + std::string(text) +
            ", wanted a time such as 2026-11-16T05:00:00Z, seconds since 1970, or +SECONDS after the "
            "first message"};
    return TimeBound{*offset, afterFirstMessage};
}

Time TimeRange::momentOf(const TimeBound& bound, Time first) {
    if (!bound.afterFirstMessage)
        return Time(bound.offset);
    return first > Time() && bound.offset > Time::max() - first ? Time::max() : first + bound.offset;
}

} // namespace velmora
