// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/RecordTime.h"

#include <algorithm>
#include <chrono>
#include <iterator>
#include <limits>

namespace velmora {

namespace {

using std::chrono::nanoseconds;
using std::chrono::seconds;
using namespace std::chrono_literals;

constexpr Time epoch = std::chrono::sys_days(std::chrono::year(1980) / 1 / 6);
constexpr nanoseconds unit = 1'250us;
constexpr std::int64_t chipPartsPerUnit = 49'152; // 1536 chips of 32 parts each

/// The moments from which system time has been one second further ahead of UTC.
constexpr Time leaps[] = {
    std::chrono::sys_days(std::chrono::year(1981) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1982) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1983) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1985) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1988) / 1 / 1),
    std::chrono::sys_days(std::chrono::year(1990) / 1 / 1),
    std::chrono::sys_days(std::chrono::year(1991) / 1 / 1),
    std::chrono::sys_days(std::chrono::year(1992) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1993) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1994) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1996) / 1 / 1),
    std::chrono::sys_days(std::chrono::year(1997) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(1999) / 1 / 1),
    std::chrono::sys_days(std::chrono::year(2006) / 1 / 1),
    std::chrono::sys_days(std::chrono::year(2009) / 1 / 1),
    std::chrono::sys_days(std::chrono::year(2012) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(2015) / 7 / 1),
    std::chrono::sys_days(std::chrono::year(2017) / 1 / 1),
};
static_assert(std::is_sorted(std::begin(leaps), std::end(leaps)));

} // namespace

bool isRecordTime(std::uint64_t timestamp) {
    constexpr auto end = static_cast<std::uint64_t>((Time::max() - epoch) / unit);
    return (timestamp & 0xFFFF) < std::uint64_t{chipPartsPerUnit} && timestamp >> 16 < end;
}

std::optional<Time> timeOfRecord(std::uint64_t timestamp) {
    if (!isRecordTime(timestamp))
        return std::nullopt;
    const auto units = static_cast<std::int64_t>(timestamp >> 16);
    const auto parts = static_cast<std::int64_t>(timestamp & 0xFFFF);
    const nanoseconds rest((parts * unit.count() + chipPartsPerUnit / 2) / chipPartsPerUnit);
    const Time systemTime = epoch + units * unit + rest;
    // The last leap second before the time; within the inserted second UTC stops at the leap.
    seconds ahead(std::ssize(leaps));
    for (; ahead.count() > 0; --ahead) {
        const Time leap = leaps[ahead.count() - 1];
        if (systemTime >= leap + ahead)
            break;
        const Time inserted = leap + ahead - seconds(1);
        if (systemTime >= inserted)
            return leap + (systemTime - inserted);
    }
    return systemTime - ahead;
}

std::uint64_t recordTimestamp(Time moment) {
    if (moment < epoch)
        return 0;
    const seconds ahead(std::upper_bound(std::begin(leaps), std::end(leaps), moment) - std::begin(leaps));
    // Taken apart before the lead is added, which a moment at the end of time could not take.
    const nanoseconds since = moment - epoch;
    const std::int64_t leadUnits = ahead / unit;
    std::int64_t units = since / unit + leadUnits;
    const nanoseconds rest = since % unit;
    std::int64_t parts = (rest.count() * chipPartsPerUnit + unit.count() / 2) / unit.count();
    if (parts == chipPartsPerUnit) {
        ++units;
        parts = 0;
    }
    return static_cast<std::uint64_t>(units) << 16 | static_cast<std::uint64_t>(parts);
}

} // namespace velmora
