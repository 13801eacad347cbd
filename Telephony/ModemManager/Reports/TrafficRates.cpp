// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/TrafficRates.h"

#include "LogMessages/LiveModem.h"
#include "Telephony/ModemManager/Members/MemberTable.h"
#include "Telephony/ModemManager/Reports/ModemReport.h"
#include "Telephony/ModemManager/Reports/ModemState.h"

#include <chrono>
#include <cmath>
#include <utility>

namespace velmora {
namespace {

/// By how much the clock and the connection's duration, in whole seconds, may disagree before the clock is
/// taken to have been set.
constexpr double clockTolerance_s = 2;
constexpr double bitsPerByte = 8;

std::optional<std::int64_t> numberOf(const Dictionary& members, std::string_view name) {
    const std::int64_t* number = members[name].asInteger();
    return number && *number >= 0 ? std::optional(*number) : std::nullopt;
}

/// How far a counter went. One that went back has wrapped where it has 32 bits and the step over the end is
/// less than half of its range; otherwise it was restarted, and nothing is known.
std::optional<std::int64_t> step(std::optional<std::int64_t> earlier, std::optional<std::int64_t> now) {
    constexpr std::int64_t range = std::int64_t{1} << 32;
    if (!earlier || !now)
        return std::nullopt;
    if (*now >= *earlier)
        return *now - *earlier;
    const std::int64_t wrapped = *now + range - *earlier;
    return *earlier < range && wrapped < range / 2 ? std::optional(wrapped) : std::nullopt;
}

void setRate(Dictionary& row, std::string_view key, std::optional<std::int64_t> bytes, double seconds) {
    if (bytes)
        row.set(key, static_cast<double>(*bytes) * bitsPerByte / seconds);
}

} // namespace

TrafficRates::Counters TrafficRates::read(const Dictionary& statistics, Time now) {
    return {numberOf(statistics, "rx-bytes"), numberOf(statistics, "tx-bytes"),
            numberOf(statistics, "duration"), numberOf(statistics, "start-date"), now};
}

std::optional<double> TrafficRates::secondsBetween(const Counters& earlier, const Counters& now) {
    if (earlier.start != now.start)
        return std::nullopt;
    double seconds = std::chrono::duration<double>(now.at - earlier.at).count();
    if (earlier.duration && now.duration) {
        const auto lasted = static_cast<double>(*now.duration - *earlier.duration);
        if (lasted < 0)
            return std::nullopt;
        if (std::abs(seconds - lasted) > clockTolerance_s)
            seconds = lasted;
    }
    return seconds > 0 ? std::optional(seconds) : std::nullopt;
}

void TrafficRates::setRates(Dictionary& row, const Counters& earlier, const Counters& now) {
    const auto seconds = secondsBetween(earlier, now);
    // Without a start or a duration, counters that went back may be those of another connection.
    const bool isSame = (now.start && now.start == earlier.start) || (now.duration && earlier.duration);
    const bool wentBack = (now.received && earlier.received && *now.received < *earlier.received) ||
                          (now.sent && earlier.sent && *now.sent < *earlier.sent);
    if (!seconds || (wentBack && !isSame))
        return;
    const auto down = step(earlier.received, now.received);
    const auto up = step(earlier.sent, now.sent);
    setRate(row, kVoxTrafficDownlinkRate, down, *seconds);
    setRate(row, kVoxTrafficUplinkRate, up, *seconds);
    if (down || up)
        row.set(kVoxTrafficInterval, *seconds);
}

void TrafficRates::answer(const std::string& bearer, const Dictionary& properties, Time now) {
    const Dictionary* statistics = properties["Stats"].asDictionary();
    const bool isCounted =
        properties["Connected"] == Value(true) && !(properties["ReloadStatsSupported"] == Value(false));
    DictionaryRef row = makeDictionary();
    if (statistics && isCounted)
        setKeys(*row, MemberUse::Traffic, MemberOf::Statistics, *statistics);
    if (!row->contains(kVoxTrafficReceived) && !row->contains(kVoxTrafficSent)) {
        forget(bearer);
        return;
    }
    setKeys(*row, MemberUse::Traffic, MemberOf::Bearer, properties);
    if (Value number = numberOfPath(bearer); !number.isNone())
        row->set(kVoxTrafficBearer, std::move(number));
    const Counters counters = read(*statistics, now);
    if (const auto earlier = _bearers.find(bearer); earlier != _bearers.end())
        setRates(*row, earlier->second.counters, counters);
    _bearers.insert_or_assign(bearer, Bearer{counters, row});
}

DictionaryRef TrafficRates::report(const Modem& modem, const std::vector<std::string>& bearers) const {
    DictionaryRef root = rootOf(modem);
    const ArrayRef rows = makeArray();
    for (const std::string& path : bearers)
        if (const auto bearer = _bearers.find(path); bearer != _bearers.end())
            rows->append(bearer->second.row);
    root->set(kVoxTraffic, rows);
    return root;
}

} // namespace velmora
