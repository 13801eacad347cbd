// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "PropertyLists/Value.h"
#include "Telephony/ModemManager/ModemObjects.h"

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The traffic of bearers: their counters, and the rates over the time between two answers of the same
/// connection. Main thread only.
class TrafficRates {
public:
    /// A bearer's properties, as they have become known at `now`: an answer, whether they differ or not.
    void answer(const std::string& bearer, const Dictionary& properties, Time now);
    void forget(const std::string& bearer) { _bearers.erase(bearer); }
    void clear() { _bearers.clear(); }

    /// The message's content, with the rows of those bearers, in that order, whose counters are known.
    [[nodiscard]] DictionaryRef report(const Modem& modem, const std::vector<std::string>& bearers) const;

private:
    struct Counters {
        std::optional<std::int64_t> received; ///< bytes
        std::optional<std::int64_t> sent;
        std::optional<std::int64_t> duration; ///< seconds
        std::optional<std::int64_t> start;    ///< seconds since 1970
        Time at;
    };
    struct Bearer {
        Counters counters;
        DictionaryRef row;
    };

    [[nodiscard]] static Counters read(const Dictionary& statistics, Time now);
    /// The time between two answers of one connection; none where it is not known to be one.
    [[nodiscard]] static std::optional<double> secondsBetween(const Counters& earlier, const Counters& now);
    static void setRates(Dictionary& row, const Counters& earlier, const Counters& now);

    std::map<std::string, Bearer> _bearers; ///< by path; those that are connected and counted
};

} // namespace velmora
