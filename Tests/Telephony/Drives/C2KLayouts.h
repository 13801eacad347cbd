// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LogMessage.h"
#include "Telephony/Drives/C2K/C2KScenario.h"
#include "Tests/Telephony/Drives/ScenarioTesting.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>

/// What the tests of the CDMA2000 scenario share: its messages, and the layouts of its records.

namespace velmora::c2k {

/// Twenty minutes of seed 1: five rounds.
inline const Drive& twentyMinutes() {
    static const Drive drive = driveOf<C2KScenario>(1, std::chrono::minutes(20));
    return drive;
}

/// Where each sub-packet begins, by its id; empty where they do not fill the record just so.
inline std::map<int, std::size_t> subPackets(Bytes record) {
    std::map<int, std::size_t> places;
    std::size_t start = 17;
    for (int left = record.size() >= 17 ? record[14] : 0; left > 0; --left) {
        if (start + 4 > record.size() || u16(record, start + 2) < 4)
            return {};
        places[record[start]] = start;
        start += u16(record, start + 2);
    }
    return start == record.size() ? places : std::map<int, std::size_t>();
}

/// Whether a record of each code is as its layout says.
inline const std::map<std::uint32_t, std::function<bool(Bytes record)>> layouts = {
    {0x1183, [](Bytes r) { return r.size() == 50; }},
    {0x12B6, [](Bytes r) { return r.size() >= 25 && r.size() == 25U + 12U * r[15]; }},
    {0x108A, [](Bytes r) { return r.size() >= 23 && r.size() == 23U + 14U * r[22]; }},
    {0x119C,
     [](Bytes r) {
         const auto places = subPackets(r);
         return places.contains(1) && places.contains(2) && places.contains(3) && places.contains(4);
     }},
    {0x119D, [](Bytes r) { return subPackets(r).contains(11); }},
    {0x134F, [](Bytes r) { return r.size() >= 186 && r[13] >= 2; }},
    {0x1192, [](Bytes r) { return r.size() == 241; }},
    {0x127E, [](Bytes r) { return r.size() == 1750; }},
};

inline bool isWellFormed(const LogMessage& header) {
    const auto layout = layouts.find(header.logCode());
    return layout != layouts.end() && layout->second(header.record);
}

} // namespace velmora::c2k
