// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/FixAssembler.h"
#include "Recording/Positions/NMEASentence.h"
#include "Recording/Positions/NMEAValues.h"
#include "Recording/Positions/TrackFile.h"

#include <algorithm>
#include <chrono>

namespace velmora {

namespace {

using Day = std::chrono::sys_days;
using std::chrono::nanoseconds;

/// The lines' times: a sentence has its time of day, and the date of the latest that had one.
class SentenceDates {
public:
    /// `first`: the first date of the file, and the time of day that it came with.
    SentenceDates(Day first, nanoseconds timeOfDay) : _date(first), _timeOfDay(timeOfDay) {}

    [[nodiscard]] Time timeOf(const NMEASentence& sentence) {
        const auto date = dateOf(sentence);
        const auto timeOfDay = timeOfDayOf(sentence);
        if (timeOfDay) {
            // Past midnight, forward or, before the first date, backward.
            if (*timeOfDay - _timeOfDay < -halfDay)
                _date = std::min(_date + std::chrono::days(1), latest);
            else if (*timeOfDay - _timeOfDay > halfDay)
                _date = std::max(_date - std::chrono::days(1), earliest);
            _timeOfDay = *timeOfDay;
        }
        if (date)
            _date = *date;
        return Time(_date) + _timeOfDay;
    }

    [[nodiscard]] static std::optional<Day> dateOf(const NMEASentence& sentence) {
        if (sentence.kind() == "RMC")
            return nmea::date(sentence.field(8));
        if (sentence.kind() == "ZDA")
            return nmea::date(sentence.field(1), sentence.field(2), sentence.field(3));
        return std::nullopt;
    }
    [[nodiscard]] static std::optional<nanoseconds> timeOfDayOf(const NMEASentence& sentence) {
        const std::string_view kind = sentence.kind();
        if (kind == "GLL")
            return nmea::timeOfDay(sentence.field(4));
        if (kind == "GGA" || kind == "GNS" || kind == "RMC" || kind == "GST" || kind == "ZDA")
            return nmea::timeOfDay(sentence.field(0));
        return std::nullopt;
    }

private:
    static constexpr nanoseconds halfDay = std::chrono::hours(12);
    // Damaged files may turn the clock as often as they like.
    static constexpr Day earliest{std::chrono::year(1979) / 1 / 1};
    static constexpr Day latest{std::chrono::year(2201) / 1 / 1};

    Day _date;
    nanoseconds _timeOfDay;
};

template <class Take>
void forEachSentence(std::string_view content, Take take) {
    while (!content.empty()) {
        const std::size_t end = std::min(content.find('\n'), content.size());
        // A logger may put something of its own in front.
        std::string_view line = content.substr(0, end);
        line.remove_prefix(std::min(line.find('$'), line.size()));
        if (const auto sentence = NMEASentence::parse(line); sentence && !take(*sentence, line))
            return;
        content.remove_prefix(std::min(end + 1, content.size()));
    }
}

} // namespace

Result<std::vector<Fix>> fixesOfNMEA(std::string_view content) {
    std::optional<SentenceDates> dates;
    std::size_t sentences = 0;
    forEachSentence(content, [&](const NMEASentence& sentence, std::string_view) {
        ++sentences;
        const auto date = SentenceDates::dateOf(sentence);
        if (const auto timeOfDay = SentenceDates::timeOfDayOf(sentence); date && timeOfDay)
            dates.emplace(*date, *timeOfDay);
        return !dates;
    });
    if (sentences == 0)
        return Failure{"line " + std::to_string(lineAt(content, content.find_first_not_of(" \t\r\n"))) +
                       ": no NMEA sentence and no GPX"};
    if (!dates)
        return Failure{"no date, wanted RMC or ZDA sentences"};
    FixAssembler assembler;
    std::vector<Fix> fixes;
    const auto add = [&fixes](const std::optional<Fix>& fix) {
        if (fix)
            fixes.push_back(*fix);
    };
    forEachSentence(content, [&](const NMEASentence& sentence, std::string_view line) {
        add(assembler.add({dates->timeOf(sentence), line}));
        return true;
    });
    add(assembler.finish());
    if (fixes.empty())
        return Failure{"no fix in " + std::to_string(sentences) + " NMEA sentences"};
    return fixes;
}

} // namespace velmora
